#include "platform/painting/Palette.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <string>

namespace tovimar::platform::painting {

namespace {

/// By the number in a system colour's low byte. From 31 on they are the host's own: texts, backgrounds,
/// lines, alternate rows, highlight.
constexpr std::array<Color, 41> kSystemColors{
    0xC8C8C8, 0x3A6EA5, 0x99B4D1, 0xBFCDDB, 0xF0F0F0, 0xFFFFFF, 0x646464, 0x000000, 0x000000,
    0x000000, 0xB4B4B4, 0xF4F7FC, 0xABABAB, 0x3875B7, 0xFFFFFF, 0xF0F0F0, 0xA0A0A0, 0x6D6D6D,
    0x000000, 0x434E54, 0xFFFFFF, 0x696969, 0xE3E3E3, 0x000000, 0xFFFFE1, 0xF0F0F0, 0x0066CC,
    0xB9D1EA, 0xD7E4F2, 0x3399FF, 0xF0F0F0, 0x000000, 0xFFFFFF, 0x1F497D, 0x7F7F7F, 0xFFFFFF,
    0xE3E9F1, 0xC9D6E6, 0xA6A6A6, 0xF2F5F9, 0xFFE699};

/// The office theme, for applications that bring none.
constexpr std::array<Color, 12> kOfficeTheme{0x000000, 0xFFFFFF, 0x44546A, 0xE7E6E6, 0x5B9BD5, 0xED7D31,
                                             0xA5A5A5, 0xFFC000, 0x4472C4, 0x70AD47, 0x0563C1, 0x954F72};

double Percent(const access::DesignObject& object, const std::string& property) {
    const auto text = object.Text(property, "100");
    double value = 100;
    const auto result = std::from_chars(text.data(), text.data() + text.size(), value);
    return result.ec == std::errc() ? std::clamp(value, 0.0, 100.0) : 100.0;
}

} // namespace

Color FromOleColor(std::int32_t color) {
    const auto bits = static_cast<std::uint32_t>(color);
    if ((bits & 0x80000000U) != 0) {
        const auto index = bits & 0xFFU;
        return index < kSystemColors.size() ? kSystemColors[index] : SystemColor::kFace;
    }
    return ((bits & 0xFFU) << 16U) | (bits & 0xFF00U) | ((bits >> 16U) & 0xFFU);
}

Color Tinted(Color color, double tint, double shade) {
    Color result = 0;
    for (const unsigned shift : {16U, 8U, 0U}) {
        const double part = static_cast<double>((color >> shift) & 0xFFU);
        const double lighter = 255 - (255 - part) * tint / 100;
        result |= static_cast<Color>(std::clamp(lighter * shade / 100 + 0.5, 0.0, 255.0)) << shift;
    }
    return result;
}

Color DesignColor(const access::DesignObject& object, std::string_view family, Color absent,
                  const std::vector<std::uint32_t>& themeColors) {
    const std::string name(family);
    const auto index = object.Integer(name + "ThemeColorIndex", -1);
    if (index >= 0 && static_cast<std::size_t>(index) < kOfficeTheme.size()) {
        const auto at = static_cast<std::size_t>(index);
        const Color base = at < themeColors.size() ? themeColors[at] : kOfficeTheme[at];
        return Tinted(base, Percent(object, name + "Tint"), Percent(object, name + "Shade"));
    }
    // -2 stands for "from the theme" where the theme's number is missing.
    const auto number = object.Integer(name + "Color", -2);
    return number == -2 ? absent : FromOleColor(number);
}

} // namespace tovimar::platform::painting
