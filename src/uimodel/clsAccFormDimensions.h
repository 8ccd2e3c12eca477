#pragma once

#include "platform/AutomationObject.h"
#include "platform/access/FormLayout.h"

#include <cstdint>
#include <string>

namespace tovimar {

class IClientFormProcessor;

/// The frame of an Access form's or report's window and the place of its sections, in pixels. Properties
/// are read late-bound; one that can't be read counts as absent or False. The frame and the section heights
/// of the last form are kept until `Forget`: whoever opens, resizes or closes a form calls it.
class clsAccFormDimensions {
public:
    std::int32_t FormClientAreaOffsetX(IClientFormProcessor& processor, const HostObject& form,
                                       bool vfRulerOn);
    std::int32_t FormClientAreaOffsetY(IClientFormProcessor& processor, const HostObject& form,
                                       bool vfRulerOn);
    /// Of the form that the control stands on; the form itself will do.
    std::int32_t FormRecordSelectorWidth(IClientFormProcessor& processor, const HostObject& control,
                                         bool vfRulerOn);
    /// "Detail", "Header", "Footer", "PageHeader", "PageFooter"; empty for another section.
    std::string ControlSectionName(IClientFormProcessor& processor, const HostObject& control,
                                   bool vfRulerOn);
    std::int32_t ControlSectionOffsetX(IClientFormProcessor& processor, const HostObject& control,
                                       bool vfRulerOn);
    std::int32_t ControlSectionOffsetY(IClientFormProcessor& processor, const HostObject& control,
                                       bool vfRulerOn);
    std::int32_t ControlSectionTitleHeight(IClientFormProcessor& processor, const HostObject& control,
                                           bool vfRulerOn);
    /// One `Section` element a line; empty without sections.
    std::string SectionsXML(IClientFormProcessor& processor, const HostObject& form, bool vfRulerOn);
    std::int32_t DatasheetFormRecordSelectorWidth();
    std::int32_t DatasheetFormTitleHeight();

    /// A control's rectangle within the client area, record selector and section bar counted in: what the
    /// painter draws. Not for a datasheet, whose columns the form processor lays out.
    platform::Rectangle ControlRectangle(const HostObject& control, bool vfRulerOn);
    /// Rectangle of the tab of page `index` (from 0) of a tab control.
    platform::Rectangle TabRectangle(const HostObject& tabControl, std::int32_t index, bool vfRulerOn);
    /// Is the control's form shown as a datasheet?
    bool IsDatasheet(const HostObject& control);

    /// The form or report at the top of the control's parents; null when there is none.
    static HostObject FormOf(const HostObject& control);
    /// Drops what is kept of the last form.
    void Forget();

    /// What is known of a form.
    struct Answer {
        platform::access::View view = platform::access::View::Design;
        platform::access::Frame frame;
        platform::access::SectionHeights heights;
    };
    const Answer& Of(const HostObject& form, bool vfRulerOn);
    /// Of the form that the control stands on.
    const Answer& OfControl(const HostObject& control, bool vfRulerOn);
    /// What `TabRectangle` reads of a tab control.
    static platform::access::TabInput ReadTabs(const HostObject& tabControl);

private:
    HostObject form_; ///< keeps the identity from being used anew
    bool rulerOn_ = false;
    Answer answer_;
};

} // namespace tovimar
