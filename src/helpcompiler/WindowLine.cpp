#include "helpcompiler/WindowLine.h"

#include "helpcompiler/ProjectFolder.h"

#include <algorithm>
#include <charconv>
#include <string>
#include <vector>

namespace tovimar::helpcompiler {
namespace {

std::vector<std::string> Fields(std::string_view line) {
    std::vector<std::string> fields(1);
    bool quoted = false;
    int brackets = 0;
    for (const char c : line) {
        quoted = quoted != (c == '"');
        brackets += quoted ? 0 : (c == '[') - (c == ']');
        if (c == ',' && !quoted && brackets <= 0)
            fields.emplace_back();
        else if (c != '"' && (quoted || c != ' '))
            fields.back().push_back(c);
    }
    return fields;
}

WindowDefinition::Number NumberIn(std::string_view field) {
    const bool hexadecimal = field.starts_with("0x") || field.starts_with("0X");
    field.remove_prefix(hexadecimal ? 2 : 0);
    const bool negative = field.starts_with('-');
    field.remove_prefix(negative ? 1 : 0);
    std::uint32_t number = 0;
    const auto result =
        std::from_chars(field.data(), field.data() + field.size(), number, hexadecimal ? 16 : 10);
    if (result.ec != std::errc())
        return {};
    return {negative ? 0U - number : number, true};
}

void TakeRectangle(WindowDefinition& window, const std::string& field) {
    if (!field.starts_with('['))
        return;
    const auto sides = Fields(std::string_view(field).substr(1, field.size() - 2));
    for (std::size_t i = 0; i < std::min<std::size_t>(sides.size(), 4); ++i)
        window.rectangle[i] = NumberIn(sides[i]).value;
    window.hasRectangle = true;
}

} // namespace

std::optional<WindowDefinition> ParseWindowLine(std::string_view line) {
    const std::size_t sign = line.find('=');
    if (sign == std::string_view::npos || sign == 0)
        return std::nullopt;
    const auto fields = Fields(line.substr(sign + 1));
    const auto field = [&](std::size_t i) { return i < fields.size() ? fields[i] : std::string(); };
    WindowDefinition window;
    window.name = line.substr(0, line.find_last_not_of(" \t", sign - 1) + 1);
    window.caption = field(0);
    window.contentsFile = WithSlashes(field(1));
    window.indexFile = WithSlashes(field(2));
    window.defaultTopic = WithSlashes(field(3));
    window.home = WithSlashes(field(4));
    window.jumpUrls = {WithSlashes(field(5)), WithSlashes(field(7))};
    window.jumpTexts = {field(6), field(8)};
    window.paneStyle = NumberIn(field(9));
    window.navigationWidth = NumberIn(field(10));
    window.buttons = NumberIn(field(11));
    TakeRectangle(window, field(12));
    window.style = NumberIn(field(13));
    window.extendedStyle = NumberIn(field(14));
    window.showState = NumberIn(field(15));
    window.closed = NumberIn(field(16));
    window.tab = NumberIn(field(17));
    window.tabPosition = NumberIn(field(18));
    window.notify = NumberIn(field(19));
    return window;
}

} // namespace tovimar::helpcompiler
