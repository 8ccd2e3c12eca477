#pragma once

#include "platform/access/Design.h"
#include "platform/painting/Canvas.h"

#include <cstdint>
#include <vector>

/// Colours of designs and of the window system.
namespace tovimar::platform::painting {

/// Colours of this window system's own parts.
namespace SystemColor {
inline constexpr Color kWindow = 0xFFFFFF;
inline constexpr Color kText = 0x000000;
inline constexpr Color kGrayText = 0x8A8A8A;
inline constexpr Color kFace = 0xF0F0F0;
inline constexpr Color kLight = 0xFFFFFF;
inline constexpr Color kSoftLight = 0xE3E3E3;
inline constexpr Color kShadow = 0xA0A0A0;
inline constexpr Color kDarkShadow = 0x696969;
inline constexpr Color kDesk = 0xABABAB;
inline constexpr Color kHighlight = 0x3875B7;
inline constexpr Color kHighlightText = 0xFFFFFF;
inline constexpr Color kFrame = 0xB7C4D3;
inline constexpr Color kFrameLine = 0x6B7C90;
inline constexpr Color kTitleTop = 0xDCE6F1;
inline constexpr Color kTitleBottom = 0xB7C4D3;
inline constexpr Color kTitleText = 0x1E2B3A;
inline constexpr Color kGridLine = 0xD0D0D0;
inline constexpr Color kField = 0xABADB3;
} // namespace SystemColor

/// A colour number as designs hold it: red in the low byte, or with the top bit set a system colour.
Color FromOleColor(std::int32_t color);

/// Percent towards white (tint) and towards black (shade); 100 leaves the colour as it is.
Color Tinted(Color color, double tint, double shade);

/// A colour property of a design object: "Back", "Fore", "Border" and so on name the family of properties
/// (`BackColor`, `BackThemeColorIndex`, `BackTint`, `BackShade`). The theme wins where it is named.
Color DesignColor(const access::DesignObject& object, std::string_view family, Color absent,
                  const std::vector<std::uint32_t>& themeColors);

} // namespace tovimar::platform::painting
