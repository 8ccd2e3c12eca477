#pragma once

#include "host/contract/IClientFormProcessor.h"
#include "platform/Error.h"

#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace tovimar::test {

/// A host object of which a test tells the properties; indexed ones by "Name(index)".
class FakeObject : public AutomationObject {
public:
    explicit FakeObject(std::string className, std::map<std::string, Value> properties = {})
        : className_(std::move(className)), properties_(std::move(properties)) {}

    std::string ClassName() const override { return className_; }
    Value Get(std::string_view member, const Arguments& arguments = {}) override {
        ++reads;
        std::string name(member);
        if (!arguments.empty())
            name += "(" + arguments.front().AsString() + ")";
        const auto found = properties_.find(name);
        if (found == properties_.end())
            throw RaisedError(438, "Object doesn't support this property or method", "FakeObject");
        return found->second;
    }
    void Set(std::string_view member, const Value& value) override {
        properties_[std::string(member)] = value;
    }
    Value Call(std::string_view, const Arguments& = {}) override { return {}; }

    std::vector<HostObject> children;
    std::vector<std::vector<HostObject>> pages; ///< controls of each page
    int reads = 0;

private:
    std::string className_;
    std::map<std::string, Value> properties_;
};

inline std::shared_ptr<FakeObject> MakeObject(std::string className,
                                              std::map<std::string, Value> properties = {}) {
    return std::make_shared<FakeObject>(std::move(className), std::move(properties));
}

/// Answers from fake objects; `calls` has the questions in their order.
class FakeProcessor : public IClientFormProcessor {
public:
    HostObject open;
    std::vector<std::string> calls;
    bool access = true;
    std::int32_t scaleMode = 3;
    std::string sectionsXml;
    std::vector<HostObject> fields;

    HostObject FindActualFormOfComponent(const HostObject&, bool, bool) override {
        return Called("open", open);
    }
    HostObject FindActualReportOfComponent(const HostObject&, bool, bool) override {
        return Called("open report", open);
    }
    void ActualFormClose(const HostObject&, const HostObject&, bool) override { calls.push_back("close"); }
    void ActualReportClose(const HostObject&, const HostObject&, bool) override {
        calls.push_back("close report");
    }
    void myDoevents() override { calls.push_back("events"); }
    bool HasProperty(const HostObject& object, const std::string& name) override {
        try {
            object->Get(name);
            return true;
        } catch (const RaisedError&) {
            return false;
        }
    }
    Value PropertyValue(const HostObject& object, const std::string& name) override {
        return object->Get(name);
    }
    std::string ComponentCaptionGet(const HostObject& object) override {
        return Called("caption", Text(object, "Caption"));
    }
    std::string ComponentTypeName(const HostObject& object) override { return object->ClassName(); }
    std::string ControlNameGet(const HostObject& object) override { return Text(object, "Name"); }
    std::string ControlCaptionGet(const HostObject& object) override { return Text(object, "Caption"); }
    std::string ObjectTypeName(const HostObject& object) override {
        return object == open ? Called("type", object->ClassName()) : object->ClassName();
    }
    void SetFirstPageVisibleForTabControls(const HostObject&) override { calls.push_back("first pages"); }
    std::int32_t ScaleMode(const HostObject&) override { return scaleMode; }
    CControlsCollection ControlsCollectionGet(const HostObject& object) override {
        return Listed(Fake(object).children);
    }
    bool FormHasMenus(const HostObject&) override { return false; }
    std::string ControlSeedTextGet(const HostObject&, const HostObject& object) override {
        return Text(object, "StatusBarText");
    }
    std::string ComponentWindowCaptionGet(const HostObject&) override { return {}; }
    HostObject TabPageActivate(const HostObject&, const HostObject& tab, std::int32_t index) override {
        calls.push_back("page " + std::to_string(index));
        return tab->Get("Pages", {index}).AsObject();
    }
    std::string TabPageCaptionGet(const HostObject& tab, std::int32_t index, bool) override {
        return Text(tab->Get("Pages", {index}).AsObject(), "Caption");
    }
    std::string TabControlCaptionGet(const HostObject&) override { return {}; }
    std::int32_t TabControlPagesQtyGet(const HostObject& tab) override {
        return static_cast<std::int32_t>(Fake(tab).pages.size());
    }
    CControlsCollection TabPageControlsCollectionGet(const HostObject& tab, std::int32_t index) override {
        return Listed(Fake(tab).pages.at(static_cast<std::size_t>(index)));
    }
    bool IsCorrectTypeForAForm(std::int32_t) override { return true; }
    std::int32_t DisplayModel() override { return 1; }
    void CorrectInsideWidthAndHeight(std::int32_t, const HostObject&, bool) override {}
    void ResetInsideWidthAndHeight(std::int32_t, const HostObject&, bool) override {}
    void Terminate() override {}
    std::string FormNamePrefix() override { return {}; }
    std::string ReportNamePrefix() override { return {}; }
    std::string TableNamePrefix() override { return {}; }
    std::string QueryNamePrefix() override { return {}; }
    std::string MacroNamePrefix() override { return {}; }
    std::int32_t BorderStyle(const HostObject&) override { return Called("border", 2); }
    void SetIdeAppInstance(HostObject) override {}
    std::int32_t ControlSectionOffsetY(const HostObject&) override { return 0; }
    std::int32_t ControlSectionOffsetX(const HostObject&) override { return 0; }
    std::int32_t ControlSectionTitleHeight(const HostObject&) override { return 0; }
    std::string ControlSectionName(const HostObject&) override { return "Detail"; }
    bool IsMSAccess() override { return access; }
    void GetComponentWidthAndHeightInTwips(const HostObject&, const HostObject&, std::int32_t& width,
                                           std::int32_t& height, bool) override {
        calls.push_back("size");
        width = 400;
        height = 300;
    }
    std::int32_t FormClientAreaOffsetX(const HostObject&) override { return Called("offset x", 8); }
    std::int32_t FormClientAreaOffsetY(const HostObject&) override { return Called("offset y", 29); }
    std::string FormSectionsXML(const HostObject&) override { return Called("sections", sectionsXml); }
    void GetControlIndexes(const HostObject& object, std::int32_t& tabIndex, std::int32_t& index) override {
        tabIndex = HasProperty(object, "TabIndex") ? object->Get("TabIndex").AsInteger() : -1;
        index = -1;
    }
    std::string GetLabelControlParentName(const HostObject& object) override {
        return Text(object, "Labels");
    }
    void GetControlRectangleInTwips(const HostObject&, const HostObject& object, std::int32_t& left,
                                    std::int32_t& top, std::int32_t& width, std::int32_t& height) override {
        left = object->Get("Left").AsInteger();
        top = object->Get("Top").AsInteger();
        width = object->Get("Width").AsInteger();
        height = object->Get("Height").AsInteger();
    }
    void GetTabPageTabRectangleInTwips(std::int32_t index, const HostObject&, const HostObject&,
                                       std::int32_t& left, std::int32_t& top, std::int32_t& width,
                                       std::int32_t& height) override {
        left = 10 + index * 50;
        top = 100;
        width = 50;
        height = 19;
    }
    std::int32_t GetComponentHwnd(std::int32_t, const HostObject&, const HostObject&) override {
        return Called("window", 65537);
    }
    void SetComponentHelpContextId(const HostObject&, const HostObject&, std::int32_t) override {}
    std::int32_t GetComponentHelpContextId(const HostObject&, const HostObject&) override {
        return Called("help id", -1);
    }
    std::int32_t GetControlHelpContextId(const HostObject&) override { return 0; }
    std::int32_t ActivateComponent(const HostObject&) override { return 0; }
    std::string FormMenusXML(const HostObject&) override { return Called("menus", std::string()); }
    std::int32_t ToolbarButtonsQtyGet(const HostObject&) override { return 1; }
    CControlsCollection ToolbarButtonsCollectionGet(const HostObject&) override { return {}; }
    void GetToolbarButtonRectangleInTwips(std::int32_t, const HostObject&, const HostObject&,
                                          std::int32_t& left, std::int32_t& top, std::int32_t& width,
                                          std::int32_t& height) override {
        left = top = 1;
        width = height = 16;
    }
    CControlsCollection FieldsCollectionGet(const std::string& name, const std::string& typeName) override {
        calls.push_back("fields " + name + " " + typeName);
        return Listed(fields);
    }

private:
    template <typename T> T Called(const char* name, T answer) {
        calls.push_back(name);
        return answer;
    }
    static FakeObject& Fake(const HostObject& object) { return dynamic_cast<FakeObject&>(*object); }
    std::string Text(const HostObject& object, const std::string& name) {
        return HasProperty(object, name) ? object->Get(name).AsString() : std::string();
    }
    static CControlsCollection Listed(const std::vector<HostObject>& objects) {
        CControlsCollection list;
        for (const HostObject& object : objects)
            list.Add(object);
        return list;
    }
};

} // namespace tovimar::test
