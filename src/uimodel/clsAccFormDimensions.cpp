#include "uimodel/clsAccFormDimensions.h"

#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "uimodel/HostProperty.h"

#include <array>

namespace tovimar {

using platform::access::Frame;
using platform::access::View;

namespace {

/// By the host's numbers.
constexpr std::array<const char*, 5> kSectionNames{"Detail", "Header", "Footer", "PageHeader", "PageFooter"};
constexpr std::int32_t kHeader = 1;
constexpr std::int32_t kPageHeader = 3;
/// Headers and footers of a report's ten levels of groups by turns.
constexpr int kFirstGroupSection = 5, kLastGroupSection = 24;
/// Section heights down to here mean that the section isn't there.
constexpr double kAbsentHeight = -503;
/// Containers nest less deeply; a way up that is longer runs in a circle.
constexpr int kLongestWayUp = 100;

const platform::SystemMetrics& Metrics() {
    return platform::Env().windows->Metrics();
}

View ViewOf(const HostObject& form) {
    switch (HostProperty::Integer(form, "CurrentView", -1)) {
    case 1:
        return View::Form;
    case 2:
        return View::Datasheet;
    case 5:
        return View::Preview;
    default:
        return View::Design;
    }
}

Frame FrameOf(const HostObject& form, View view, bool rulerOn) {
    platform::access::FrameInput input;
    input.view = view;
    input.borderStyle = HostProperty::Integer(form, "BorderStyle", input.borderStyle);
    input.recordSelectors = view == View::Datasheet || HostProperty::Flag(form, "RecordSelectors");
    input.rulerOn = rulerOn;
    return platform::access::ComputeFrame(Metrics(), input);
}

/// A host that prints sections elsewhere than its design has them tells where.
void TakePrintedPlaces(const HostObject& form, platform::access::SectionHeights& heights) {
    for (int section = 0; section <= kLastGroupSection; ++section) {
        const HostObject object = HostProperty::Object(form, "Section", {section});
        if (object != nullptr && HostProperty::Readable(object, "PrintedTop"))
            heights.printed[section] = {HostProperty::Integer(object, "PrintedLeft"),
                                        HostProperty::Integer(object, "PrintedTop")};
    }
}

platform::access::SectionHeights HeightsOf(const HostObject& form, View view) {
    platform::access::SectionHeights heights;
    for (const int section : platform::access::kSectionOrder) {
        const HostObject object = HostProperty::Object(form, "Section", {section});
        const double height = HostProperty::Number(object, "Height", kAbsentHeight);
        const auto index = static_cast<std::size_t>(section);
        // What a view doesn't show takes no room in it, whatever its height says.
        const bool visible =
            !HostProperty::Readable(object, "Visible") || HostProperty::Flag(object, "Visible");
        heights.present[index] =
            height > kAbsentHeight && platform::access::SectionIsShown(view, section, visible);
        if (heights.present[index])
            heights.pixels[index] = platform::access::RoundToEven(height / Metrics().twipsPerPixelY);
    }
    if (view == View::Preview)
        TakePrintedPlaces(form, heights);
    if (form != nullptr && text::StartsWithIgnoringCase(form->ClassName(), "Report_"))
        for (int section = kFirstGroupSection; section <= kLastGroupSection; ++section) {
            const HostObject object = HostProperty::Object(form, "Section", {section});
            const double height = HostProperty::Number(object, "Height", kAbsentHeight);
            const bool visible = object != nullptr && HostProperty::Flag(object, "Visible");
            if (height > kAbsentHeight && platform::access::SectionIsShown(view, section, visible))
                heights.groups[section] = platform::access::RoundToEven(height / Metrics().twipsPerPixelY);
        }
    return heights;
}

std::int32_t SectionNumber(const HostObject& control) {
    return HostProperty::Integer(control, "Section", 0);
}

bool IsFormOrReport(const HostObject& object) {
    const std::string className = object->ClassName();
    return text::StartsWithIgnoringCase(className, "Form_") ||
           text::StartsWithIgnoringCase(className, "Report_");
}

} // namespace

HostObject clsAccFormDimensions::FormOf(const HostObject& control) {
    HostObject object = control;
    for (int steps = 0; object != nullptr && steps < kLongestWayUp; ++steps) {
        if (IsFormOrReport(object))
            return object;
        object = HostProperty::Object(object, "Parent");
    }
    return nullptr;
}

void clsAccFormDimensions::Forget() {
    form_ = nullptr;
}

const clsAccFormDimensions::Answer& clsAccFormDimensions::Of(const HostObject& form, bool vfRulerOn) {
    const bool known = form_ != nullptr && form != nullptr && form_->Identity() == form->Identity();
    if (known && rulerOn_ == vfRulerOn)
        return answer_;
    form_ = form;
    rulerOn_ = vfRulerOn;
    answer_.view = ViewOf(form);
    answer_.frame = FrameOf(form, answer_.view, vfRulerOn);
    answer_.heights = HeightsOf(form, answer_.view);
    return answer_;
}

const clsAccFormDimensions::Answer& clsAccFormDimensions::OfControl(const HostObject& control,
                                                                    bool vfRulerOn) {
    return Of(FormOf(control), vfRulerOn);
}

std::int32_t clsAccFormDimensions::FormClientAreaOffsetX(IClientFormProcessor& /*processor*/,
                                                         const HostObject& form, bool vfRulerOn) {
    return Of(form, vfRulerOn).frame.ClientOffsetX();
}

std::int32_t clsAccFormDimensions::FormClientAreaOffsetY(IClientFormProcessor& /*processor*/,
                                                         const HostObject& form, bool vfRulerOn) {
    return Of(form, vfRulerOn).frame.ClientOffsetY();
}

std::int32_t clsAccFormDimensions::FormRecordSelectorWidth(IClientFormProcessor& /*processor*/,
                                                           const HostObject& control, bool vfRulerOn) {
    return OfControl(control, vfRulerOn).frame.recordSelectorWidth;
}

std::string clsAccFormDimensions::ControlSectionName(IClientFormProcessor& /*processor*/,
                                                     const HostObject& control, bool /*vfRulerOn*/) {
    const auto number = static_cast<std::size_t>(SectionNumber(control));
    return number < kSectionNames.size() ? kSectionNames[number] : "";
}

std::int32_t clsAccFormDimensions::ControlSectionOffsetX(IClientFormProcessor& /*processor*/,
                                                         const HostObject& /*control*/, bool /*vfRulerOn*/) {
    return 0;
}

std::int32_t clsAccFormDimensions::ControlSectionOffsetY(IClientFormProcessor& /*processor*/,
                                                         const HostObject& control, bool vfRulerOn) {
    const Answer& answer = OfControl(control, vfRulerOn);
    return platform::access::SectionOffsetY(answer.heights, answer.frame.sectionBarHeight,
                                            SectionNumber(control));
}

std::int32_t clsAccFormDimensions::ControlSectionTitleHeight(IClientFormProcessor& /*processor*/,
                                                             const HostObject& control, bool vfRulerOn) {
    return OfControl(control, vfRulerOn).frame.sectionBarHeight;
}

std::string clsAccFormDimensions::SectionsXML(IClientFormProcessor& /*processor*/, const HostObject& form,
                                              bool vfRulerOn) {
    const Answer& answer = Of(form, vfRulerOn);
    const auto& present = answer.heights.present;
    const std::int32_t bar = answer.frame.sectionBarHeight;
    std::string xml;
    for (const int section : platform::access::kSectionOrder) {
        // Sections come in pairs: the header speaks for the footer as well.
        const bool outer = section == kHeader || section == 2;
        if (section != 0 && !present[static_cast<std::size_t>(outer ? kHeader : kPageHeader)])
            continue;
        const auto index = static_cast<std::size_t>(section);
        xml.append("<Section Name=\"").append(kSectionNames[index]).append("\" ClientAreaOffset = \"0, ");
        xml.append(std::to_string(platform::access::SectionOffsetY(answer.heights, bar, section)));
        if (answer.frame.recordSelectorWidth != 0)
            xml.append("\" FormRecordSelectorWidth=\"")
                .append(std::to_string(answer.frame.recordSelectorWidth));
        xml.append("\" Height=\"").append(std::to_string(answer.heights.pixels[index]));
        xml.append("\" DesignTimeHeaderHeight = \"").append(std::to_string(bar)).append("\"/>\r\n");
    }
    return xml;
}

std::int32_t clsAccFormDimensions::DatasheetFormRecordSelectorWidth() {
    return Metrics().scrollWidth;
}

std::int32_t clsAccFormDimensions::DatasheetFormTitleHeight() {
    return Metrics().captionHeight;
}

platform::Rectangle clsAccFormDimensions::ControlRectangle(const HostObject& control, bool vfRulerOn) {
    const Answer& answer = OfControl(control, vfRulerOn);
    const int offset = platform::access::SectionOffsetY(answer.heights, answer.frame.sectionBarHeight,
                                                        SectionNumber(control));
    auto place = platform::access::ControlRectangle(
        Metrics(), answer.frame, offset, HostProperty::Number(control, "Left"),
        HostProperty::Number(control, "Top"), HostProperty::Number(control, "Width"),
        HostProperty::Number(control, "Height"));
    const int right = platform::access::SectionOffsetX(answer.heights, SectionNumber(control));
    place.left += right;
    place.right += right;
    return place;
}

platform::access::TabInput clsAccFormDimensions::ReadTabs(const HostObject& tabControl) {
    platform::access::TabInput input;
    input.fixedWidth = HostProperty::Number(tabControl, "TabFixedWidth");
    input.fixedHeight = HostProperty::Number(tabControl, "TabFixedHeight");
    input.fontSize = HostProperty::Number(tabControl, "FontSize", input.fontSize);
    input.fontWeight = HostProperty::Integer(tabControl, "FontWeight", input.fontWeight);
    const std::int32_t pages = HostProperty::Integer(HostProperty::Object(tabControl, "Pages"), "Count");
    for (std::int32_t i = 0; i < pages; ++i) {
        const HostObject page = HostProperty::Object(tabControl, "Pages", {i});
        const std::string caption = HostProperty::Text(page, "Caption");
        input.captions.push_back(caption.empty() ? HostProperty::Text(page, "Name") : caption);
    }
    return input;
}

platform::Rectangle clsAccFormDimensions::TabRectangle(const HostObject& tabControl, std::int32_t index,
                                                       bool vfRulerOn) {
    const platform::Rectangle control = ControlRectangle(tabControl, vfRulerOn);
    platform::access::TabInput input = ReadTabs(tabControl);
    input.controlLeft = control.left;
    input.controlTop = control.top;
    return platform::access::TabRectangle(Metrics(), input, index);
}

bool clsAccFormDimensions::IsDatasheet(const HostObject& control) {
    return OfControl(control, false).view == View::Datasheet;
}

} // namespace tovimar
