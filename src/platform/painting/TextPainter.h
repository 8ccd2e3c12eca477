#pragma once

#include "platform/painting/Canvas.h"

#include <string>
#include <string_view>

/// Text in the fonts of designs. Families that this machine lacks are replaced by those that run as wide;
/// sizes are points at 96 dpi. The same text gives the same pixels on every machine with the same fonts.
namespace tovimar::platform::painting {

struct TextStyle {
    std::string family = "MS Sans Serif";
    int size = 8;     ///< points
    int weight = 400; ///< 100 to 900
    bool italic = false;
    bool underline = false;
    Color color = 0;
};

enum class Align { Left, Center, Right };
enum class VerticalAlign { Top, Middle };

struct TextPlace {
    Rectangle area; ///< text is clipped to it
    Align align = Align::Left;
    VerticalAlign vertical = VerticalAlign::Top;
    bool wrap = false;
    /// "&" marks the access key, which is underlined; "&&" is one "&".
    bool accelerator = false;
};

/// Draws at most the first 4000 characters.
void DrawText(Canvas& canvas, std::string_view text, const TextStyle& style, const TextPlace& place);

struct TextSize {
    int width = 0;
    int height = 0;
};
/// Of one line, in pixels.
TextSize MeasureText(std::string_view text, const TextStyle& style);

} // namespace tovimar::platform::painting
