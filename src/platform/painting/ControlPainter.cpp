#include "platform/painting/ControlPainter.h"

#include "platform/painting/PrintedGrowth.h"
#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::platform::painting {

using access::DesignObject;

namespace {

/// Twips of the margins that a design may set within a control.
int Margin(const DesignObject& control, std::string_view property, int twipsPerPixel) {
    return std::clamp(control.Integer(property, 0), 0, 5000) / twipsPerPixel;
}

constexpr int kPrintOnly = 1, kScreenOnly = 2;

Rectangle Lengthened(Rectangle area, int pixels) {
    area.bottom += pixels;
    return area;
}

} // namespace

int BorderPixels(const DesignObject& control) {
    // The design counts in points.
    return std::max(1, std::clamp(control.Integer("BorderWidth", 0), 0, 6) * 96 / 72);
}

Rectangle ControlPainter::PlaceOf(const Object& control) const {
    const auto own =
        access::ControlRectangle(context_.metrics, place_.frame, place_.offsetY, control.Integer("Left"),
                                 control.Integer("Top"), control.Integer("Width"), control.Integer("Height"));
    return Moved(own, place_.originX, place_.originY);
}

bool ControlPainter::IsShown(const Object& control) const {
    if (context_.Designing())
        return true;
    const int when = control.Integer("DisplayWhen", 0);
    const bool printing = context_.view == access::View::Preview;
    return control.Flag("Visible") && when != (printing ? kScreenOnly : kPrintOnly);
}

void ControlPainter::PaintChildren(const Object& parent) {
    for (const auto& child : parent.children)
        Paint(*child);
}

void ControlPainter::Paint(const Object& control) {
    if (!IsShown(control))
        return;
    const auto area = PlaceOf(control);
    if (!PaintContainer(control, area)) {
        // A control out of sight may have a label that is in sight.
        if (canvas_.Visible({area.left - 2, area.top - 2, area.right + 3, area.bottom + 3}))
            PaintKind(control, area);
        PaintChildren(control);
    }
}

bool ControlPainter::PaintContainer(const Object& control, const Rectangle& area) {
    if (!control.Is("Tab"))
        return false;
    PaintTab(control, area);
    return true;
}

void ControlPainter::PaintKind(const Object& control, const Rectangle& area) {
    if (control.Is("Label"))
        PaintLabel(control, area);
    else if (control.Is("TextBox"))
        PaintTextBox(control, area);
    else if (control.Is("ComboBox"))
        PaintComboBox(control, area);
    else if (control.Is("ListBox"))
        PaintListBox(control, area);
    else if (PaintButtonKind(control, area))
        return;
    else if (control.Is("OptionGroup"))
        PaintGroup(control, area);
    else if (control.Is("Subform"))
        PaintSubform(control, MayGrow(control) ? Lengthened(area, place_.growth) : area);
    else if (control.Is("Line"))
        PaintLine(control, area);
    else if (control.Is("Rectangle"))
        PaintBox(control, area);
    else if (control.Is("PageBreak"))
        PaintPageBreak(area);
    else
        PaintForeign(control, area);
}

bool ControlPainter::PaintButtonKind(const Object& control, const Rectangle& area) {
    if (control.Is("CheckBox") || control.Is("OptionButton"))
        PaintCheck(control, area);
    else if (control.Is("CommandButton") || control.Is("ToggleButton") || control.Is("NavigationButton"))
        PaintButton(control, area);
    else
        return false;
    return true;
}

Rectangle ControlPainter::PaintBox(const Object& control, const Rectangle& area) {
    if (control.Integer("BackStyle", 1) != 0)
        canvas_.Fill(area, DesignColor(control, "Back", SystemColor::kWindow, context_.Theme()));
    BorderLook look;
    look.effect = control.Integer("SpecialEffect", 0);
    look.style = control.Integer("OldBorderStyle", control.Integer("BorderStyle", 1));
    look.width = BorderPixels(control);
    look.color = DesignColor(control, "Border", SystemColor::kText, context_.Theme());
    return Shrunk(area, PaintBorder(canvas_, area, look));
}

TextStyle ControlPainter::StyleOf(const Object& control) const {
    TextStyle style;
    style.family = control.Text("FontName", "MS Sans Serif");
    style.size = control.Integer("FontSize", 8);
    style.weight = control.Integer("FontWeight", 400);
    style.italic = control.Flag("FontItalic");
    style.underline = control.Flag("FontUnderline");
    style.color = DesignColor(control, "Fore", SystemColor::kText, context_.Theme());
    return style;
}

std::string ControlPainter::ContentOf(const Object& control) const {
    if (!context_.Designing())
        return sample_.Text(control, place_.row);
    const auto source = control.Text("ControlSource");
    return source.empty() ? "Unbound" : source;
}

void ControlPainter::Write(const Object& control, const Rectangle& inner, const std::string& text,
                           bool multiline) {
    TextPlace place;
    place.area = {inner.left + Margin(control, "LeftMargin", context_.metrics.twipsPerPixelX),
                  inner.top + Margin(control, "TopMargin", context_.metrics.twipsPerPixelY), inner.right,
                  inner.bottom};
    const int align = control.Integer("TextAlign", 0);
    const bool right =
        align == 3 || (align == 0 && !context_.Designing() && sample_.AlignsRight(control, place_.row));
    place.align = align == 2 ? Align::Center : right ? Align::Right : Align::Left;
    place.wrap = multiline;
    auto style = StyleOf(control);
    const bool grey = !context_.Designing() && !control.Flag("Enabled") && !control.Flag("Locked");
    if (grey)
        style.color = SystemColor::kGrayText;
    DrawText(canvas_, text, style, place);
}

void ControlPainter::PaintLabel(const Object& control, const Rectangle& area) {
    const auto inner = PaintBox(control, area);
    TextPlace place;
    place.area = {inner.left + 1 + Margin(control, "LeftMargin", context_.metrics.twipsPerPixelX),
                  inner.top + Margin(control, "TopMargin", context_.metrics.twipsPerPixelY), inner.right,
                  inner.bottom};
    const int align = control.Integer("TextAlign", 0);
    place.align = align == 2 ? Align::Center : align == 3 ? Align::Right : Align::Left;
    place.wrap = true;
    place.accelerator = true;
    DrawText(canvas_, control.Text("Caption"), StyleOf(control), place);
}

void ControlPainter::PaintTextBox(const Object& control, const Rectangle& area) {
    auto inner = PaintBox(control, area);
    const int bars = control.Integer("ScrollBars", 0);
    if ((bars == 2 || bars == 3) && !context_.Designing() &&
        inner.Height() > 2 * context_.metrics.scrollHeight) {
        const int left = inner.right - context_.metrics.scrollWidth;
        PaintScrollBar(canvas_, {left, inner.top, inner.right, inner.bottom}, true);
        inner.right = left;
    }
    const Rectangle text{inner.left + 2, inner.top + 1, inner.right - 1, inner.bottom};
    const int line = std::max(8, control.Integer("FontSize", 8)) * 3 / 2;
    Write(control, text, ContentOf(control), text.Height() > 2 * line);
}

void ControlPainter::PaintComboBox(const Object& control, const Rectangle& area) {
    auto inner = PaintBox(control, area);
    if (context_.view != access::View::Preview) {
        const int width = std::min(context_.metrics.scrollWidth, inner.Width() / 2);
        PaintArrowButton(canvas_, {inner.right - width, inner.top, inner.right, inner.bottom}, Arrow::Down);
        inner.right -= width;
    }
    Write(control, {inner.left + 2, inner.top + 1, inner.right - 1, inner.bottom}, ContentOf(control), false);
}

void ControlPainter::PaintCheck(const Object& control, const Rectangle& area) {
    const auto* group =
        control.parent != nullptr && control.parent->Is("OptionGroup") ? control.parent : nullptr;
    bool on = false;
    if (!context_.Designing())
        on = group != nullptr ? sample_.GroupValue(*group, place_.row) == control.Text("OptionValue")
                              : sample_.Checked(control, place_.row);
    if (control.Is("OptionButton"))
        PaintOptionMark(canvas_, area, on);
    else
        PaintCheckMark(canvas_, area, on, control.Integer("SpecialEffect", 0) == 2);
}

void ControlPainter::PaintGroup(const Object& control, const Rectangle& area) {
    PaintBox(control, area);
    // The frame's line would run through a label that lets its ground through.
    for (const auto& child : control.children) {
        if (!child->Is("Label") || child->Integer("BackStyle", 1) != 0 || !IsShown(*child))
            continue;
        const auto label = PlaceOf(*child);
        if (label.top <= area.top && label.bottom > area.top)
            canvas_.Fill({label.left, area.top, label.right, area.top + 2}, place_.ground);
    }
}

void ControlPainter::PaintLine(const Object& control, const Rectangle& area) {
    BorderLook look;
    look.style = control.Integer("OldBorderStyle", control.Integer("BorderStyle", 1));
    look.width = BorderPixels(control);
    look.color = DesignColor(control, "Border", SystemColor::kText, context_.Theme());
    if (look.style == 0 && control.Integer("SpecialEffect", 0) == 0)
        return;
    if (area.Width() > 0 && area.Height() > 0) {
        const bool rising = control.Flag("LineSlant");
        canvas_.Line(area.left, rising ? area.bottom : area.top, area.right, rising ? area.top : area.bottom,
                     look.color, look.width);
        return;
    }
    const bool flat = area.Height() <= 0;
    const Rectangle strip{area.left, area.top, flat ? area.right : area.left + look.width,
                          flat ? area.top + look.width : area.bottom};
    if (look.style > 1 && look.width == 1)
        canvas_.DottedBorder(strip, look.color);
    else
        canvas_.Fill(strip, look.color);
}

void ControlPainter::PaintPageBreak(const Rectangle& area) {
    if (context_.Designing())
        for (int i = 0; i < 6; ++i)
            canvas_.Fill({area.left + 4 * i, area.top, area.left + 4 * i + 2, area.top + 2},
                         SystemColor::kDarkShadow);
}

} // namespace tovimar::platform::painting
