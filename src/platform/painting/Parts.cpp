#include "platform/painting/Parts.h"

#include <algorithm>
#include <array>

namespace tovimar::platform::painting {

namespace {

void Sunken(Canvas& canvas, const Rectangle& area) {
    canvas.Edge(area, SystemColor::kShadow, SystemColor::kLight);
    canvas.Edge(Shrunk(area, 1), SystemColor::kDarkShadow, SystemColor::kSoftLight);
}

void Etched(Canvas& canvas, const Rectangle& area) {
    canvas.Edge({area.left, area.top, area.right - 1, area.bottom - 1}, SystemColor::kShadow,
                SystemColor::kShadow);
    canvas.Edge({area.left + 1, area.top + 1, area.right, area.bottom}, SystemColor::kLight,
                SystemColor::kLight);
    canvas.Edge({area.left, area.top, area.right - 1, area.bottom - 1}, SystemColor::kShadow,
                SystemColor::kShadow);
}

void Shadowed(Canvas& canvas, const Rectangle& area, const BorderLook& look) {
    constexpr int kDepth = 2;
    canvas.Fill({area.left + kDepth, area.bottom, area.right + kDepth, area.bottom + kDepth},
                SystemColor::kDarkShadow);
    canvas.Fill({area.right, area.top + kDepth, area.right + kDepth, area.bottom + kDepth},
                SystemColor::kDarkShadow);
    canvas.Border(area, look.color, look.width);
}

TextStyle PartStyle(Color color = SystemColor::kText) {
    TextStyle style;
    style.family = "Tahoma";
    style.color = color;
    return style;
}

} // namespace

int PaintBorder(Canvas& canvas, const Rectangle& area, const BorderLook& look) {
    switch (look.effect) {
    case 1:
        canvas.Edge(area, SystemColor::kLight, SystemColor::kDarkShadow);
        return 1;
    case 2:
        Sunken(canvas, area);
        return 2;
    case 3:
        Etched(canvas, area);
        return 2;
    case 4:
        Shadowed(canvas, area, look);
        return look.width;
    case 5:
        canvas.Fill({area.left, area.bottom - 2, area.right, area.bottom - 1}, SystemColor::kShadow);
        canvas.Fill({area.left, area.bottom - 1, area.right, area.bottom}, SystemColor::kLight);
        return 2;
    default:
        break;
    }
    if (look.style == 0)
        return 0;
    if (look.style > 1)
        canvas.DottedBorder(area, look.color);
    else
        canvas.Border(area, look.color, look.width);
    return look.width;
}

void PaintArrow(Canvas& canvas, const Rectangle& area, Arrow arrow, Color color) {
    const int x = (area.left + area.right) / 2, y = (area.top + area.bottom) / 2;
    // Rows of pixels keep small arrows sharp.
    for (int i = 0; i < 4; ++i) {
        switch (arrow) {
        case Arrow::Down:
            canvas.Fill({x - 3 + i, y - 2 + i, x + 4 - i, y - 1 + i}, color);
            break;
        case Arrow::Up:
            canvas.Fill({x - i, y - 2 + i, x + 1 + i, y - 1 + i}, color);
            break;
        case Arrow::Right:
            canvas.Fill({x - 2 + i, y - 3 + i, x - 1 + i, y + 4 - i}, color);
            break;
        case Arrow::Left:
            canvas.Fill({x - 2 + i, y - i, x - 1 + i, y + 1 + i}, color);
            break;
        }
    }
}

void PaintButtonFace(Canvas& canvas, const Rectangle& area, bool pressed) {
    if (area.Width() < 3 || area.Height() < 3)
        return canvas.Fill(area, SystemColor::kFace);
    canvas.FillGradient(Shrunk(area, 1), pressed ? 0xD8DEE6 : 0xF6F6F6, pressed ? 0xE6EAF0 : 0xE1E1E1);
    canvas.Border(area, 0x8E8F8F);
    if (!pressed)
        canvas.Edge(Shrunk(area, 1), 0xFCFCFC, 0xCFCFCF);
}

void PaintArrowButton(Canvas& canvas, const Rectangle& area, Arrow arrow) {
    canvas.FillGradient(area, 0xF6F6F6, 0xE1E1E1);
    canvas.Border(area, 0xB0B0B0);
    PaintArrow(canvas, area, arrow, 0x404040);
}

void PaintScrollBar(Canvas& canvas, const Rectangle& area, bool vertical) {
    canvas.Fill(area, 0xEDEDED);
    const int side = vertical ? area.Width() : area.Height();
    const int length = vertical ? area.Height() : area.Width();
    if (side < 5 || length < 2 * side)
        return;
    const int thumb = std::max(side, (length - 2 * side) / 3);
    const auto part = [&](int from, int to) {
        return vertical ? Rectangle{area.left, area.top + from, area.right, area.top + to}
                        : Rectangle{area.left + from, area.top, area.left + to, area.bottom};
    };
    PaintArrowButton(canvas, part(0, side), vertical ? Arrow::Up : Arrow::Left);
    PaintArrowButton(canvas, part(length - side, length), vertical ? Arrow::Down : Arrow::Right);
    if (length > 2 * side + thumb) {
        canvas.Fill(part(side + 1, side + thumb), 0xCDCDCD);
        canvas.Border(part(side + 1, side + thumb), 0xB0B0B0);
    }
}

void PaintCheckMark(Canvas& canvas, const Rectangle& area, bool checked, bool sunken) {
    const int side = std::clamp(std::min(area.Width(), area.Height()), 5, 13);
    const int left = area.left, top = area.top + std::max(0, (area.Height() - side) / 2);
    const Rectangle box{left, top, left + side, top + side};
    canvas.Fill(box, SystemColor::kWindow);
    if (sunken && side > 8)
        Sunken(canvas, box);
    else
        canvas.Border(box, SystemColor::kDarkShadow);
    if (!checked)
        return;
    const double unit = side / 13.0;
    canvas.Line(left + 3 * unit, top + 6.5 * unit, left + 5.5 * unit, top + 9 * unit, 0x202020, 1.8);
    canvas.Line(left + 5.2 * unit, top + 9.2 * unit, left + 10 * unit, top + 3.8 * unit, 0x202020, 1.8);
}

void PaintOptionMark(Canvas& canvas, const Rectangle& area, bool chosen) {
    const double side = std::clamp(std::min(area.Width(), area.Height()), 5, 13);
    const double x = area.left + side / 2, y = area.top + area.Height() / 2.0;
    canvas.Disc(x, y, side / 2, SystemColor::kWindow);
    canvas.Ring(x, y, side / 2 - 0.5, SystemColor::kDarkShadow);
    if (chosen)
        canvas.Disc(x, y, side / 2 - 3.5, 0x202020);
}

void PaintRecordSelector(Canvas& canvas, const Rectangle& area, bool current) {
    canvas.Fill(area, SystemColor::kFace);
    canvas.Edge(area, SystemColor::kLight, SystemColor::kShadow);
    if (current)
        PaintArrow(canvas, {area.left, area.top, area.right, area.top + std::min(area.Height(), 20)},
                   Arrow::Right, 0x202020);
}

void PaintNavigationBar(Canvas& canvas, const Rectangle& area, int records) {
    canvas.Fill(area, SystemColor::kFace);
    canvas.Fill({area.left, area.top, area.right, area.top + 1}, SystemColor::kShadow);
    const int middle = area.top + 1;
    const auto style = PartStyle();
    int x = area.left + 4;
    const auto write = [&](const std::string& text, int width) {
        DrawText(canvas, text, style,
                 {{x, middle, x + width, area.bottom}, Align::Left, VerticalAlign::Middle});
        x += width;
    };
    const auto arrow = [&](Arrow direction, bool toEnd) {
        const Rectangle place{x, middle, x + 16, area.bottom};
        PaintArrow(canvas, place, direction, 0x404040);
        const int bar = direction == Arrow::Left ? x + 4 : x + 11;
        if (toEnd)
            canvas.Fill({bar, (middle + area.bottom) / 2 - 3, bar + 1, (middle + area.bottom) / 2 + 4},
                        0x404040);
        x += 16;
    };
    write("Record:", MeasureText("Record:", style).width + 4);
    arrow(Arrow::Left, true);
    arrow(Arrow::Left, false);
    const auto count = records < 0 ? std::string("1") : "1 of " + std::to_string(records);
    const int width = std::max(50, MeasureText(count, style).width + 10);
    const Rectangle box{x, area.top + 2, x + width, area.bottom - 1};
    canvas.Fill(box, SystemColor::kWindow);
    canvas.Border(box, SystemColor::kShadow);
    DrawText(canvas, count, style, {box, Align::Center, VerticalAlign::Middle});
    x += width;
    arrow(Arrow::Right, false);
    arrow(Arrow::Right, true);
}

void PaintSectionBar(Canvas& canvas, const Rectangle& area, std::string_view title) {
    canvas.FillGradient(area, 0xE9ECEF, 0xD5DAE0);
    canvas.Fill({area.left, area.top, area.right, area.top + 1}, 0xB4BCC6);
    canvas.Fill({area.left, area.bottom - 1, area.right, area.bottom}, 0xB4BCC6);
    PaintArrow(canvas, {area.left + 2, area.top, area.left + 14, area.bottom}, Arrow::Down, 0x505A66);
    DrawText(canvas, title, PartStyle(0x2A333D),
             {{area.left + 17, area.top, area.right, area.bottom}, Align::Left, VerticalAlign::Middle});
}

void PaintColumnHead(Canvas& canvas, const Rectangle& area, std::string_view title) {
    canvas.FillGradient(area, 0xF7F8FA, 0xE4E8ED);
    canvas.Fill({area.right - 1, area.top, area.right, area.bottom}, 0xB4BCC6);
    canvas.Fill({area.left, area.bottom - 1, area.right, area.bottom}, 0xB4BCC6);
    DrawText(canvas, title, PartStyle(),
             {{area.left + 4, area.top, area.right - 2, area.bottom}, Align::Left, VerticalAlign::Middle});
}

namespace {

/// A small form with lines: the mark of a database window.
void PaintWindowMark(Canvas& canvas, int left, int top) {
    const Rectangle mark{left, top, left + 14, top + 14};
    canvas.Fill(mark, SystemColor::kWindow);
    canvas.Border(mark, 0x4A6B8A);
    canvas.Fill({left + 1, top + 1, left + 13, top + 4}, 0x5B87B2);
    for (const int row : {6, 9})
        canvas.Fill({left + 3, top + row, left + 11, top + row + 1}, 0x8AA0B5);
}

void PaintTitleButton(Canvas& canvas, const Rectangle& area, int kind, bool enabled) {
    const Color color = enabled ? 0x33414F : 0x9AA7B5;
    const int x = area.left + area.Width() / 2, y = area.top + area.Height() / 2;
    canvas.Border(area, enabled ? 0x9DADBF : 0xB3C0CE);
    if (kind == 0)
        canvas.Fill({x - 4, y + 2, x + 4, y + 4}, color);
    if (kind == 1) {
        canvas.Border({x - 4, y - 4, x + 4, y + 4}, color);
        canvas.Fill({x - 4, y - 4, x + 4, y - 2}, color);
    }
    if (kind == 2) {
        canvas.Line(x - 3.5, y - 3.5, x + 3.5, y + 3.5, color, 1.7);
        canvas.Line(x + 3.5, y - 3.5, x - 3.5, y + 3.5, color, 1.7);
    }
}

int PaintTitleButtons(Canvas& canvas, const Rectangle& title, const WindowFrame& look) {
    constexpr int kWidth = 20, kGap = 2;
    const int height = std::max(4, title.Height() - 6);
    int right = title.right - 4;
    const auto place = [&](int kind, bool enabled) {
        PaintTitleButton(canvas, {right - kWidth, title.top + 3, right, title.top + 3 + height}, kind,
                         enabled);
        right -= kWidth + kGap;
    };
    place(2, look.closeButton);
    if (look.minButton || look.maxButton) {
        place(1, look.maxButton);
        place(0, look.minButton);
    }
    return right;
}

} // namespace

void PaintWindowFrame(Canvas& canvas, const Rectangle& window, const WindowFrame& look) {
    const int top = look.frame.frame + look.frame.titleHeight;
    if (look.frame.frame == 0 && look.frame.titleHeight == 0)
        return;
    const int side = look.frame.ClientOffsetX();
    canvas.Fill({window.left, window.top, window.left + side, window.bottom}, SystemColor::kFrame);
    canvas.Fill({window.right - side, window.top, window.right, window.bottom}, SystemColor::kFrame);
    canvas.Fill({window.left, window.bottom - side, window.right, window.bottom}, SystemColor::kFrame);
    canvas.FillGradient({window.left, window.top, window.right, window.top + top}, SystemColor::kTitleTop,
                        SystemColor::kTitleBottom);

    Rectangle title{window.left + side, window.top + look.frame.frame, window.right - std::max(0, side - 4),
                    window.top + top};
    int textLeft = title.left + 4;
    int textRight = title.right - 4;
    if (look.controlBox) {
        PaintWindowMark(canvas, title.left + 2, title.top + (title.Height() - 14) / 2);
        textLeft += 17;
        textRight = PaintTitleButtons(canvas, title, look);
    }
    auto style = PartStyle(SystemColor::kTitleText);
    DrawText(canvas, look.caption, style,
             {{textLeft, title.top, textRight, title.bottom}, Align::Left, VerticalAlign::Middle});
    canvas.Border(window, SystemColor::kFrameLine);
    if (side > 1)
        canvas.Border(
            {window.left + side - 1, window.top + top - 1, window.right - side + 1, window.bottom - side + 1},
            SystemColor::kFrameLine);
}

} // namespace tovimar::platform::painting
