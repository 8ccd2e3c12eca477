#include "platform/painting/Canvas.h"

#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <numbers>

namespace tovimar::platform::painting {

namespace {

void SetColor(cairo_t* context, Color color) {
    const auto part = [&](unsigned shift) { return static_cast<double>((color >> shift) & 0xFFU) / 255.0; };
    cairo_set_source_rgb(context, part(16), part(8), part(0));
}

Color Between(Color from, Color to, int step, int steps) {
    Color result = 0;
    for (const unsigned shift : {16U, 8U, 0U}) {
        const int a = static_cast<int>((from >> shift) & 0xFFU);
        const int b = static_cast<int>((to >> shift) & 0xFFU);
        result |= static_cast<Color>(a + (b - a) * step / std::max(1, steps)) << shift;
    }
    return result;
}

} // namespace

Canvas::Canvas(Bitmap& bitmap) : bitmap_(bitmap), clip_{0, 0, bitmap.width, bitmap.height} {
    auto* surface = cairo_image_surface_create_for_data(
        reinterpret_cast<unsigned char*>(bitmap.pixels.data()), CAIRO_FORMAT_RGB24, bitmap.width,
        bitmap.height, bitmap.width * 4);
    context_ = cairo_create(surface);
    cairo_surface_destroy(surface);
}

Canvas::~Canvas() {
    cairo_destroy(context_);
}

bool Canvas::Visible(const Rectangle& area) const {
    const auto seen = Common(area, clip_);
    return seen.Width() > 0 && seen.Height() > 0;
}

void Canvas::Row(int left, int right, int y, Color color) {
    if (y < clip_.top || y >= clip_.bottom)
        return;
    left = std::max(left, clip_.left);
    right = std::min(right, clip_.right);
    if (left >= right)
        return;
    auto* row = bitmap_.pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(bitmap_.width);
    std::fill(row + left, row + right, color);
}

void Canvas::Fill(const Rectangle& area, Color color) {
    const auto seen = Common(area, clip_);
    for (int y = seen.top; y < seen.bottom; ++y)
        Row(seen.left, seen.right, y, color);
}

void Canvas::FillGradient(const Rectangle& area, Color top, Color bottom) {
    const auto seen = Common(area, clip_);
    for (int y = seen.top; y < seen.bottom; ++y)
        Row(seen.left, seen.right, y, Between(top, bottom, y - area.top, area.Height() - 1));
}

void Canvas::Border(const Rectangle& area, Color color, int width) {
    if (area.Width() <= 2 * width || area.Height() <= 2 * width)
        return Fill(area, color);
    Fill({area.left, area.top, area.right, area.top + width}, color);
    Fill({area.left, area.bottom - width, area.right, area.bottom}, color);
    Fill({area.left, area.top + width, area.left + width, area.bottom - width}, color);
    Fill({area.right - width, area.top + width, area.right, area.bottom - width}, color);
}

void Canvas::Edge(const Rectangle& area, Color leftTop, Color rightBottom) {
    Fill({area.left, area.top, area.right - 1, area.top + 1}, leftTop);
    Fill({area.left, area.top, area.left + 1, area.bottom - 1}, leftTop);
    Fill({area.left, area.bottom - 1, area.right, area.bottom}, rightBottom);
    Fill({area.right - 1, area.top, area.right, area.bottom}, rightBottom);
}

void Canvas::DottedBorder(const Rectangle& area, Color color) {
    for (int x = area.left; x < area.right; x += 2) {
        Row(x, x + 1, area.top, color);
        if (area.Height() > 1)
            Row(x, x + 1, area.bottom - 1, color);
    }
    for (int y = area.top; y < area.bottom; y += 2) {
        Row(area.left, area.left + 1, y, color);
        if (area.Width() > 1)
            Row(area.right - 1, area.right, y, color);
    }
}

void Canvas::Line(double x1, double y1, double x2, double y2, Color color, double width) {
    auto* context = Context();
    SetColor(context, color);
    cairo_set_line_width(context, width);
    cairo_move_to(context, x1, y1);
    cairo_line_to(context, x2, y2);
    cairo_stroke(context);
}

void Canvas::Triangle(double x1, double y1, double x2, double y2, double x3, double y3, Color color) {
    auto* context = Context();
    SetColor(context, color);
    cairo_move_to(context, x1, y1);
    cairo_line_to(context, x2, y2);
    cairo_line_to(context, x3, y3);
    cairo_close_path(context);
    cairo_fill(context);
}

void Canvas::Disc(double x, double y, double radius, Color color) {
    auto* context = Context();
    SetColor(context, color);
    cairo_arc(context, x, y, radius, 0, 2 * std::numbers::pi);
    cairo_fill(context);
}

void Canvas::Ring(double x, double y, double radius, Color color) {
    auto* context = Context();
    SetColor(context, color);
    cairo_set_line_width(context, 1);
    cairo_arc(context, x, y, radius, 0, 2 * std::numbers::pi);
    cairo_stroke(context);
}

void Canvas::Draw(const Image& image, const Rectangle& target) {
    if (image.Empty() || target.Width() <= 0 || target.Height() <= 0 || !Visible(target))
        return;
    auto* context = Context();
    // Cairo only reads from the surface.
    auto* pixels = const_cast<std::uint32_t*>(image.pixels.data());
    auto* surface =
        cairo_image_surface_create_for_data(reinterpret_cast<unsigned char*>(pixels), CAIRO_FORMAT_ARGB32,
                                            image.width, image.height, image.width * 4);
    cairo_save(context);
    cairo_rectangle(context, target.left, target.top, target.Width(), target.Height());
    cairo_clip(context);
    cairo_translate(context, target.left, target.top);
    cairo_scale(context, static_cast<double>(target.Width()) / image.width,
                static_cast<double>(target.Height()) / image.height);
    cairo_set_source_surface(context, surface, 0, 0);
    cairo_pattern_set_extend(cairo_get_source(context), CAIRO_EXTEND_PAD);
    const bool sameSize = target.Width() == image.width && target.Height() == image.height;
    cairo_pattern_set_filter(cairo_get_source(context),
                             sameSize ? CAIRO_FILTER_NEAREST : CAIRO_FILTER_BILINEAR);
    cairo_paint(context);
    cairo_restore(context);
    cairo_surface_destroy(surface);
}

cairo_t* Canvas::Context() {
    // Pixels may have been written behind Cairo's back.
    cairo_surface_mark_dirty(cairo_get_target(context_));
    if (clipPending_) {
        cairo_reset_clip(context_);
        cairo_new_path(context_);
        cairo_rectangle(context_, clip_.left, clip_.top, std::max(0, clip_.Width()),
                        std::max(0, clip_.Height()));
        cairo_clip(context_);
        clipPending_ = false;
    }
    return context_;
}

void Canvas::SetClip(const Rectangle& clip) {
    clip_ = clip;
    clipPending_ = true;
}

ClipTo::ClipTo(Canvas& canvas, const Rectangle& area) : canvas_(canvas), former_(canvas.clip_) {
    canvas_.SetClip(Common(former_, area));
}

ClipTo::~ClipTo() {
    canvas_.SetClip(former_);
}

Rectangle Moved(const Rectangle& area, int x, int y) {
    return {area.left + x, area.top + y, area.right + x, area.bottom + y};
}

Rectangle Shrunk(const Rectangle& area, int by) {
    return {area.left + by, area.top + by, area.right - by, area.bottom - by};
}

Rectangle Common(const Rectangle& left, const Rectangle& right) {
    return {std::max(left.left, right.left), std::max(left.top, right.top), std::min(left.right, right.right),
            std::min(left.bottom, right.bottom)};
}

} // namespace tovimar::platform::painting
