#pragma once

#include "platform/Value.h"

#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

/// A late-bound object of the host. Member names compare without regard to case.
/// An unknown member raises error 438 "Object doesn't support this property or method"; the host's own
/// failures carry the host's numbers (2501 cancelled, 2450 form not found, 2467 object closed, ...).
class AutomationObject : public std::enable_shared_from_this<AutomationObject> {
public:
    using Arguments = std::vector<Value>;

    virtual ~AutomationObject() = default;

    /// Run-time class name as the host gives it: "Form_Orders", "Report_Sales", "TextBox", "TabControl", ...
    virtual std::string ClassName() const = 0;

    /// Reads a property; with arguments an indexed one: Get("Pages", {0}), Get("Forms", {"Orders"}).
    virtual Value Get(std::string_view member, const Arguments& arguments = {}) = 0;
    /// Writes a property. Raises 438 for one that can't be written.
    virtual void Set(std::string_view member, const Value& value) = 0;
    /// Calls a method; missing trailing arguments take the host's defaults.
    virtual Value Call(std::string_view member, const Arguments& arguments = {}) = 0;

    /// Reads a property where that may well fail: none instead of an error. Most objects answer without
    /// raising one inside, which is what makes asking every control for a property that few have cheap.
    virtual std::optional<Value> Find(std::string_view member, const Arguments& arguments = {});
    /// The value of an entry of `Properties`, none where there isn't one.
    virtual std::optional<Value> FindProperty(const std::string& name);

    /// Identity of the object behind the reference: two references to one control are the same.
    virtual const void* Identity() const { return this; }
};

} // namespace tovimar
