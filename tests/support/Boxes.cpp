#include "support/Boxes.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::test {

using namespace platform::access;

namespace {

constexpr std::int32_t kFirstColor = 0x200000;
/// Neighbours differ by more than one.
constexpr std::int32_t kStep = 3;

bool IsAnyOf(const DesignObject& object, std::initializer_list<const char*> types) {
    return std::any_of(types.begin(), types.end(), [&](const char* type) { return object.Is(type); });
}

bool IsUntold(const DesignObject& control) {
    return IsAnyOf(control, {"Line", "Rectangle", "Image", "BoundObjectFrame", "UnboundObjectFrame", "Chart",
                             "PageBreak", "EmptyCell"});
}

Box::Kind KindOf(const DesignObject& control) {
    if (control.Is("Label"))
        return Box::Kind::Label;
    if (control.Is("OptionGroup"))
        return Box::Kind::Group;
    if (control.Is("Subform"))
        return Box::Kind::Frame;
    return control.Is("Tab") ? Box::Kind::Tab : Box::Kind::Plain;
}

std::string TypeOf(const DesignObject& control) {
    if (IsAnyOf(control, {"Label", "OptionGroup", "Subform", "Tab", "Page"}))
        return control.type;
    return IsUntold(control) ? "Rectangle" : "TextBox";
}

} // namespace

std::int32_t BoxOleColor(int number) {
    return kFirstColor + kStep * number;
}

std::uint32_t BoxColor(int number) {
    const auto ole = static_cast<std::uint32_t>(BoxOleColor(number));
    return (ole & 0xFFU) << 16U | (ole & 0xFF00U) | (ole >> 16U & 0xFFU);
}

int BoxNumber(std::uint32_t color) {
    const auto ole =
        static_cast<std::int32_t>((color & 0xFFU) << 16U | (color & 0xFF00U) | (color >> 16U & 0xFFU));
    const std::int32_t above = ole - kFirstColor;
    return above > 0 && above < 0x10000 && above % kStep == 0 ? above / kStep : 0;
}

void BoxedExports::Line(const std::string& name, const std::string& value) {
    out_.append(name).append(" =").append(value).append("\r\n");
}

void BoxedExports::WriteNumbers(const DesignObject& object, std::initializer_list<const char*> names) {
    for (const char* name : names)
        if (object.Find(name) != nullptr || BuiltInDefault(object.type, name).has_value())
            Line(name, std::to_string(object.Integer(name)));
}

/// Numbers and flags as they stand; texts of a design say nothing about places.
void BoxedExports::WriteOwn(const DesignObject& object) {
    for (const auto& [name, value] : object.properties)
        if (value.form == PropertyValue::Form::NotDefault)
            Line(name, "NotDefault");
        else if (value.form == PropertyValue::Form::Number && name != "DividingLines")
            Line(name, value.text);
}

std::string BoxedExports::Write(const Design& design) {
    out_.clear();
    if (!design.root)
        return out_;
    ++designs_;
    out_ = design.root->type == "Report" ? "Begin Report\r\n" : "Begin Form\r\n";
    WriteRoot(*design.root);
    out_ += "End\r\n";
    return out_;
}

void BoxedExports::WriteRoot(const DesignObject& root) {
    WriteOwn(root);
    // A line between records would cross the controls that touch it.
    Line("DividingLines", "0");
    if (!root.Text("RecordSource").empty())
        Line("RecordSource", "\"x\"");
    Box box;
    box.design = designs_;
    box.repeated = root.Integer("DefaultView", 1) == 1;
    box.column = root.Integer("DefaultView", 1) == 2;
    out_ += "Begin\r\n";
    for (const auto& section : root.children) {
        if (section->Find("Height") == nullptr && section->children.empty())
            continue;
        out_ += "Begin " + section->type + "\r\n";
        WriteOwn(*section);
        WriteChildren(*section, box);
        out_ += "End\r\n";
    }
    out_ += "End\r\n";
}

void BoxedExports::WriteChildren(const DesignObject& parent, Box box) {
    if (parent.children.empty())
        return;
    out_ += "Begin\r\n";
    for (const auto& child : parent.children)
        WriteControl(*child, box);
    out_ += "End\r\n";
}

void BoxedExports::WriteControl(const DesignObject& control, Box box) {
    box.kind = KindOf(control);
    box.headless = control.Integer("Style") == 2;
    // What paints nothing has a number that is seen nowhere.
    boxes_.push_back(box);
    const int number = Last();
    out_ += "Begin " + TypeOf(control) + "\r\n";
    Line("Name", "\"c" + std::to_string(number) + "x\"");
    WriteNumbers(control,
                 {"Left", "Top", "Width", "Height", "TabIndex", "TabFixedWidth", "TabFixedHeight", "FontSize",
                  "FontWeight", "MultiRow", "Style", "ColumnWidth", "ColumnOrder", "ColumnHidden"});
    const bool untold = IsUntold(control);
    const bool frame = box.kind == Box::Kind::Frame;
    Line("SpecialEffect", "0");
    Line("BorderWidth", "0");
    Line("OldBorderStyle", frame ? "1" : "0");
    Line("BackStyle", untold ? "0" : "1");
    Line("Visible", control.Is("Page") && !control.Flag("Visible") ? "0" : "-1");
    for (const char* part : {"Back", "Fore", "Border"}) {
        Line(std::string(part) + "ThemeColorIndex", "-1");
        // A tab's caption is written outside the boxes.
        const bool caption = control.Is("Tab") && std::string_view(part) == "Fore";
        Line(std::string(part) + "Color", caption ? "0" : std::to_string(BoxOleColor(number)));
    }
    if (const auto source = control.Text("SourceObject"); frame && !source.empty())
        Line("SourceObject", "\"" + source + "\"");
    if (const auto source = control.Text("ControlSource"); !source.empty() && !source.starts_with('='))
        Line("ControlSource", "\"x\"");
    if (control.Is("Page"))
        Line("Caption", "\"" + std::string(text::Length(control.Text("Caption", control.name)), 'x') + "\"");
    box.parent = number;
    WriteChildren(control, box);
    out_ += "End\r\n";
}

} // namespace tovimar::test
