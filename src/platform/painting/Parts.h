#pragma once

#include "platform/access/FormLayout.h"
#include "platform/painting/Palette.h"
#include "platform/painting/TextPainter.h"

#include <string>
#include <string_view>

/// The parts that windows and controls share: edges, buttons, marks, bars and the frame of a window.
namespace tovimar::platform::painting {

/// Border of a control as its design has it. Numbers are the design's own.
struct BorderLook {
    int effect = 0; ///< 0 flat, 1 raised, 2 sunken, 3 etched, 4 shadowed, 5 chiseled
    int style = 1;  ///< 0 none, 1 solid, 2 to 7 dashed and dotted
    int width = 1;  ///< pixels
    Color color = 0;
};
/// Gives the pixels that the border takes inside each side.
int PaintBorder(Canvas& canvas, const Rectangle& area, const BorderLook& look);

enum class Arrow { Up, Down, Left, Right };
void PaintArrow(Canvas& canvas, const Rectangle& area, Arrow arrow, Color color);
/// Face of a button without its caption.
void PaintButtonFace(Canvas& canvas, const Rectangle& area, bool pressed = false);
void PaintArrowButton(Canvas& canvas, const Rectangle& area, Arrow arrow);
void PaintScrollBar(Canvas& canvas, const Rectangle& area, bool vertical);
void PaintCheckMark(Canvas& canvas, const Rectangle& area, bool checked, bool sunken);
void PaintOptionMark(Canvas& canvas, const Rectangle& area, bool chosen);
/// The bar at the left of a record; the current one has an arrow.
void PaintRecordSelector(Canvas& canvas, const Rectangle& area, bool current);
/// "Record: 1 of n" with its buttons, at the foot of a form. `records` below 0 stands for unknown.
void PaintNavigationBar(Canvas& canvas, const Rectangle& area, int records);
void PaintSectionBar(Canvas& canvas, const Rectangle& area, std::string_view title);
void PaintColumnHead(Canvas& canvas, const Rectangle& area, std::string_view title);

struct WindowFrame {
    access::Frame frame;
    std::string caption;
    bool controlBox = true;
    bool minButton = true;
    bool maxButton = true;
    bool closeButton = true;
    bool outlined = true; ///< a frame of no width still has a line around its client area
};
/// Everything of a window but its client area.
void PaintWindowFrame(Canvas& canvas, const Rectangle& window, const WindowFrame& look);

} // namespace tovimar::platform::painting
