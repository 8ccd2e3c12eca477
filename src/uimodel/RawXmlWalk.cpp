#include "uimodel/RawXmlWalk.h"

#include "host/contract/IClientFormProcessor.h"
#include "platform/text/Text.h"
#include "uimodel/HostProperty.h"
#include "uimodel/RawXmlText.h"

#include <algorithm>

namespace tovimar {

namespace {

/// Deeper than hosts nest subforms: a design that shows itself in a subform ends here.
constexpr std::int32_t kDeepestLevel = 40;

bool IsAnyOf(const std::string& word, std::initializer_list<const char*> words) {
    return std::any_of(words.begin(), words.end(),
                       [&](const char* known) { return text::EqualsIgnoringCase(word, known); });
}

bool IsContainer(const std::string& type) {
    return IsAnyOf(type, {"Subform", "Subreport", "GroupBox", "Frame", "OptionGroup", "PictureBox", "Panel"});
}

bool IsTabControl(const std::string& type) {
    return IsAnyOf(type, {"TabControl", "SSTab"});
}

} // namespace

RawXmlWalk::RawXmlWalk(IClientFormProcessor& processor, const HostObject& component, const HostObject& form)
    : processor_(processor), component_(component), form_(form) {}

std::string RawXmlWalk::ControlXml(const HostObject& control, std::int32_t level) {
    RawControl raw;
    raw.name = processor_.ControlNameGet(control);
    raw.caption = processor_.ControlCaptionGet(control);
    raw.type = processor_.ObjectTypeName(control);
    if (raw.caption == "-" && IsAnyOf(raw.type, {"menu", "mainmenu"}))
        return {};
    raw.level = level;
    raw.originalClassName = control->ClassName();
    Elements children;
    const bool tabControl = IsTabControl(raw.type);
    if (tabControl) {
        raw.type = "TabControl";
        children = Pages(control, raw.name, level);
    } else if (IsContainer(raw.type)) {
        children = Children(control, level);
    } else if (IsAnyOf(raw.type, {"Toolbar"})) {
        children = Buttons(control, raw.name, level);
    }
    if (!tabControl)
        raw.text = processor_.ControlSeedTextGet(form_, control);
    raw.description = raw.text;
    Measure(raw, control);
    std::string xml;
    AppendRawControl(xml, raw, children);
    return xml;
}

void RawXmlWalk::Measure(RawControl& raw, const HostObject& control) {
    processor_.GetControlIndexes(control, raw.tabIndex, raw.index);
    processor_.GetControlRectangleInTwips(component_, control, raw.left, raw.top, raw.width, raw.height);
    raw.sectionName = processor_.ControlSectionName(control);
    raw.parentControlName = processor_.GetLabelControlParentName(control);
    raw.helpContextId = processor_.GetControlHelpContextId(control);
}

void RawXmlWalk::AddElement(Elements& elements, const HostObject& control, std::int32_t level) {
    if (level > kDeepestLevel)
        return;
    std::string element = ControlXml(control, level);
    if (!element.empty())
        elements.push_back(std::move(element));
}

RawXmlWalk::Elements RawXmlWalk::Children(const HostObject& control, std::int32_t level) {
    Elements elements;
    for (const HostObject& child : processor_.ControlsCollectionGet(control))
        AddElement(elements, child, level + 1);
    return elements;
}

RawXmlWalk::Elements RawXmlWalk::Pages(const HostObject& control, const std::string& name,
                                       std::int32_t level) {
    Elements elements;
    const std::int32_t pages = processor_.TabControlPagesQtyGet(control);
    std::int32_t first = 0;
    for (std::int32_t i = 0; i < pages; ++i)
        if (const HostObject page = processor_.TabPageActivate(form_, control, i)) {
            if (elements.empty())
                first = i;
            elements.push_back(PageXml(control, page, name, i, level + 1));
        }
    // Where page 0 is hidden the picture shows the first page that the map tells of.
    if (first > 0)
        processor_.TabPageActivate(form_, control, first);
    return elements;
}

std::string RawXmlWalk::PageXml(const HostObject& control, const HostObject& page, const std::string& name,
                                std::int32_t index, std::int32_t level) {
    RawControl raw;
    raw.type = "Page";
    raw.name = name + "_" + std::to_string(index);
    raw.level = level;
    raw.caption = processor_.TabPageCaptionGet(control, index, /*vfSetTabAsActive=*/false);
    const Elements children = ControlsOnPage(control, index, level + 1);
    processor_.TabPageActivate(form_, control, 0);
    raw.text = processor_.ControlSeedTextGet(form_, page);
    raw.description = raw.text;
    Measure(raw, page);
    std::int32_t left = 0, top = 0, width = 0, height = 0;
    processor_.GetTabPageTabRectangleInTwips(index, component_, control, left, top, width, height);
    raw.tabPageTab = std::to_string(left) + ", " + std::to_string(top) + ", " + std::to_string(width) + ", " +
                     std::to_string(height);
    raw.tabPageIndex = index;
    raw.originalClassName = page->ClassName();
    std::string xml;
    AppendRawControl(xml, raw, children);
    return xml;
}

RawXmlWalk::Elements RawXmlWalk::ControlsOnPage(const HostObject& control, std::int32_t index,
                                                std::int32_t level) {
    Elements elements;
    for (const HostObject& child : processor_.TabPageControlsCollectionGet(control, index))
        if (processor_.HasProperty(child, "Left") && processor_.PropertyValue(child, "Left").AsInteger() >= 0)
            AddElement(elements, child, level);
    return elements;
}

RawXmlWalk::Elements RawXmlWalk::Buttons(const HostObject& control, const std::string& name,
                                         std::int32_t level) {
    Elements elements;
    const std::int32_t buttons = processor_.ToolbarButtonsQtyGet(control);
    for (std::int32_t i = 1; i <= buttons; ++i) {
        const HostObject button = HostProperty::Object(control, "Buttons", {i});
        RawControl raw;
        raw.type = "ToolbarButton";
        raw.name = name + "_" + std::to_string(i);
        raw.caption = processor_.PropertyValue(button, "Caption").AsString();
        raw.text = processor_.ControlSeedTextGet(form_, button);
        raw.description = raw.text;
        raw.sectionName = processor_.ControlSectionName(button);
        processor_.GetToolbarButtonRectangleInTwips(i, component_, control, raw.left, raw.top, raw.width,
                                                    raw.height);
        raw.originalClassName = "ToolbarButton";
        raw.level = level + 1;
        std::string element;
        AppendRawControl(element, raw, {});
        elements.push_back(std::move(element));
    }
    return elements;
}

} // namespace tovimar
