#include "platform/access/DesignValues.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <charconv>

namespace tovimar::platform::access {

namespace {

struct Kind {
    std::string_view type;
    std::string_view className;
    std::int32_t number;
};

constexpr std::array kKinds = {
    Kind{"label", "Label", 100},
    Kind{"rectangle", "Rectangle", 101},
    Kind{"line", "Line", 102},
    Kind{"image", "Image", 103},
    Kind{"commandbutton", "CommandButton", 104},
    Kind{"optionbutton", "OptionButton", 105},
    Kind{"checkbox", "CheckBox", 106},
    Kind{"optiongroup", "OptionGroup", 107},
    Kind{"boundobjectframe", "BoundObjectFrame", 108},
    Kind{"textbox", "TextBox", 109},
    Kind{"listbox", "ListBox", 110},
    Kind{"combobox", "ComboBox", 111},
    Kind{"subform", "SubForm", 112},
    Kind{"chart", "ObjectFrame", 114},
    Kind{"unboundobjectframe", "ObjectFrame", 114},
    Kind{"pagebreak", "PageBreak", 118},
    Kind{"customcontrol", "CustomControl", 119},
    Kind{"togglebutton", "ToggleButton", 122},
    Kind{"tab", "TabControl", 123},
    Kind{"page", "Page", 124},
    Kind{"attachment", "Attachment", 126},
    Kind{"emptycell", "EmptyCell", 127},
    Kind{"webbrowser", "WebBrowserControl", 128},
    Kind{"navigationcontrol", "NavigationControl", 129},
    Kind{"navigationbutton", "NavigationButton", 130},
    Kind{"edgebrowser", "EdgeBrowserControl", 134},
};

const Kind* FindKind(std::string_view type) {
    using Table = std::unordered_map<std::string_view, const Kind*, text::CaselessHash, text::CaselessEqual>;
    static const Table byType = [] {
        Table table;
        for (const Kind& kind : kKinds)
            table.emplace(kind.type, &kind);
        return table;
    }();
    const auto found = byType.find(type);
    return found == byType.end() ? nullptr : found->second;
}

Value NumberValue(std::string_view digits) {
    const auto* end = digits.data() + digits.size();
    std::int32_t whole = 0;
    if (const auto result = std::from_chars(digits.data(), end, whole);
        result.ec == std::errc() && result.ptr == end)
        return whole;
    double number = 0;
    if (const auto result = std::from_chars(digits.data(), end, number);
        result.ec == std::errc() && result.ptr == end)
        return number;
    return std::string(digits);
}

bool IsFlag(const std::optional<std::string_view>& builtIn) {
    return builtIn && (*builtIn == "True" || *builtIn == "False");
}

std::string_view NameInExport(const DesignObject& object, std::string_view property) {
    if (text::EqualsIgnoringCase(property, "BorderStyle") && ControlTypeNumber(object.type) != 0)
        return "OldBorderStyle";
    return property;
}

} // namespace

std::string ControlClassName(std::string_view type) {
    const auto* kind = FindKind(type);
    return std::string(kind ? kind->className : type);
}

std::int32_t ControlTypeNumber(std::string_view type) {
    const auto* kind = FindKind(type);
    return kind ? kind->number : 0;
}

std::optional<Value> EffectiveValue(const DesignObject& object, std::string_view property) {
    const auto name = NameInExport(object, property);
    const auto builtIn = BuiltInDefault(object.type, name);
    const auto* value = object.Find(name);
    if (!value && !builtIn)
        return std::nullopt;
    if (IsFlag(builtIn) || (value && value->form == PropertyValue::Form::NotDefault))
        return Value(object.Flag(name));
    if (value && value->form != PropertyValue::Form::Number)
        return Value(value->text);
    const std::string_view digits = value ? std::string_view(value->text) : *builtIn;
    return digits.empty() ? Value(std::string()) : NumberValue(digits);
}

std::vector<std::string> PropertyNames(const DesignObject& object) {
    DefaultTable names = BuiltInDefaults(object.type);
    for (const auto* source = &object; source; source = source->prototype)
        for (const auto& [name, value] : source->properties)
            names.try_emplace(name, DefaultEntry{name, {}});
    std::vector<std::string> sorted;
    sorted.reserve(names.size());
    for (const auto& [key, entry] : names)
        sorted.push_back(entry.name);
    std::sort(sorted.begin(), sorted.end(), [](const std::string& left, const std::string& right) {
        return text::CompareIgnoringCase(left, right) < 0;
    });
    return sorted;
}

} // namespace tovimar::platform::access
