#pragma once

#include "platform/AutomationObject.h"
#include "platform/Error.h"
#include "platform/text/Text.h"

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

/// A late-bound application made of a few tables: enough to ask everything that the host side asks.
namespace tovimar::test {

/// Members by name, without regard to case. `Properties(name)` reads them too.
class FakeObject : public AutomationObject {
public:
    using Method = std::function<Value(const Arguments&)>;

    explicit FakeObject(std::string className) : className_(std::move(className)) {}

    std::string ClassName() const override { return className_; }
    Value Get(std::string_view member, const Arguments& arguments = {}) override;
    void Set(std::string_view member, const Value& value) override { values[Key(member)] = value; }
    Value Call(std::string_view member, const Arguments& arguments = {}) override {
        return Get(member, arguments);
    }

    FakeObject& With(std::string_view member, Value value) {
        values[Key(member)] = std::move(value);
        return *this;
    }
    FakeObject& On(std::string_view member, Method method) {
        methods[Key(member)] = std::move(method);
        return *this;
    }

    std::map<std::string, Value> values;
    std::map<std::string, Method> methods;

private:
    static std::string Key(std::string_view member) { return text::FoldCase(member); }
    Value PropertyCalled(const std::string& name);

    std::string className_;
};
using Fake = std::shared_ptr<FakeObject>;

/// `Count` and `Item(position from 0, or name)`.
class FakeList : public AutomationObject {
public:
    std::string ClassName() const override { return "Collection"; }
    Value Get(std::string_view member, const Arguments& arguments = {}) override;
    void Set(std::string_view, const Value&) override {}
    Value Call(std::string_view member, const Arguments& arguments = {}) override {
        return Get(member, arguments);
    }

    std::vector<Fake> items;
    /// Raised for an item that isn't there.
    ResultCode missing = 9;
};

Fake MakeFake(const std::string& className, const std::string& name = {});
std::shared_ptr<FakeList> MakeList(std::vector<Fake> items = {});

/// A control on a form, a page, an option group, or a label on its control; twips.
Fake AddControl(const Fake& form, const Fake& parent, const std::string& className, const std::string& name,
                int left = 0, int top = 0, int width = 0, int height = 0);

/// The application with a database open. Opening puts a form or report from `designs` into the open ones.
class FakeAccess {
public:
    FakeAccess();

    Fake AddForm(const std::string& name);
    Fake AddReport(const std::string& name);
    Fake AddPlain(const char* catalogue, const std::string& name);

    Fake app;
    Fake project;
    Fake database;
    std::map<std::string, std::shared_ptr<FakeList>> lists; ///< "AllForms", ..., "Forms", "Reports"
    /// What was asked of `DoCmd`, `SysCmd` and `SaveAsText`: "OpenForm Orders 1".
    std::vector<std::string> calls;
    /// Raised at the next openings.
    std::vector<ResultCode> openFailures;
    std::function<void(const std::string& name, const std::string& path)> saveAsText;

private:
    void Log(const std::string& member, const AutomationObject::Arguments& arguments);
    Fake AddDesign(const char* prefix, const char* catalogue, const std::string& name);
    Value Open(const char* openList, const std::string& prefix, const AutomationObject::Arguments& arguments);

    std::map<std::string, Fake> designs_; ///< by class name
};

} // namespace tovimar::test
