#include "platform/painting/Canvas.h"

#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <cstring>
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

Canvas::Canvas(Bitmap& bitmap, double scale)
    : bitmap_(bitmap), scale_(scale), clip_{0, 0, static_cast<int>(std::ceil(bitmap.width / scale)),
                                            static_cast<int>(std::ceil(bitmap.height / scale))},
      deviceClip_{0, 0, bitmap.width, bitmap.height} {
    auto* surface = cairo_image_surface_create_for_data(
        reinterpret_cast<unsigned char*>(bitmap.pixels.data()), CAIRO_FORMAT_RGB24, bitmap.width,
        bitmap.height, bitmap.width * 4);
    context_ = cairo_create(surface);
    cairo_surface_destroy(surface);
    if (scale != 1)
        cairo_scale(context_, scale, scale);
}

Canvas::~Canvas() {
    cairo_destroy(context_);
}

bool Canvas::Visible(const Rectangle& area) const {
    const auto seen = Common(area, clip_);
    return seen.Width() > 0 && seen.Height() > 0;
}

int Canvas::Device(int value) const {
    return scale_ == 1 ? value : static_cast<int>(std::lround(value * scale_));
}

Rectangle Canvas::Device(const Rectangle& area) const {
    return {Device(area.left), Device(area.top), Device(area.right), Device(area.bottom)};
}

int Canvas::Thickness(int width) const {
    return scale_ == 1 ? width : std::max(1, static_cast<int>(width * scale_));
}

void Canvas::FillDevice(const Rectangle& area, Color color) {
    const auto seen = Common(area, deviceClip_);
    if (seen.left >= seen.right)
        return;
    const auto row = [&](int y) {
        return bitmap_.pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(bitmap_.width) +
               seen.left;
    };
    if (seen.top >= seen.bottom)
        return;
    // The first row stays near at hand while it is copied to the others.
    std::fill_n(row(seen.top), seen.Width(), color);
    const auto bytes = static_cast<std::size_t>(seen.Width()) * sizeof(std::uint32_t);
    for (int y = seen.top + 1; y < seen.bottom; ++y)
        std::memcpy(row(y), row(seen.top), bytes);
}

void Canvas::Fill(const Rectangle& area, Color color) {
    FillDevice(Device(area), color);
}

void Canvas::FillGradient(const Rectangle& area, Color top, Color bottom) {
    const auto device = Device(area);
    const auto seen = Common(device, deviceClip_);
    for (int y = seen.top; y < seen.bottom; ++y)
        FillDevice({device.left, y, device.right, y + 1},
                   Between(top, bottom, y - device.top, device.Height() - 1));
}

void Canvas::Border(const Rectangle& area, Color color, int width) {
    const auto all = Device(area);
    const int thick = Thickness(width);
    if (all.Width() <= 2 * thick || all.Height() <= 2 * thick)
        return FillDevice(all, color);
    FillDevice({all.left, all.top, all.right, all.top + thick}, color);
    FillDevice({all.left, all.bottom - thick, all.right, all.bottom}, color);
    FillDevice({all.left, all.top + thick, all.left + thick, all.bottom - thick}, color);
    FillDevice({all.right - thick, all.top + thick, all.right, all.bottom - thick}, color);
}

void Canvas::Edge(const Rectangle& area, Color leftTop, Color rightBottom) {
    const auto all = Device(area);
    const int thick = Thickness(1);
    FillDevice({all.left, all.top, all.right - thick, all.top + thick}, leftTop);
    FillDevice({all.left, all.top, all.left + thick, all.bottom - thick}, leftTop);
    FillDevice({all.left, all.bottom - thick, all.right, all.bottom}, rightBottom);
    FillDevice({all.right - thick, all.top, all.right, all.bottom}, rightBottom);
}

void Canvas::DottedBorder(const Rectangle& area, Color color) {
    const auto all = Device(area);
    const int dot = Thickness(1);
    for (int x = all.left; x < all.right; x += 2 * dot) {
        const int end = std::min(x + dot, all.right);
        FillDevice({x, all.top, end, all.top + dot}, color);
        if (all.Height() > dot)
            FillDevice({x, all.bottom - dot, end, all.bottom}, color);
    }
    for (int y = all.top; y < all.bottom; y += 2 * dot) {
        const int end = std::min(y + dot, all.bottom);
        FillDevice({all.left, y, all.left + dot, end}, color);
        if (all.Width() > dot)
            FillDevice({all.right - dot, y, all.right, end}, color);
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
        // In pixels of the picture: a clip between two of them would blur, and cost far more.
        cairo_matrix_t scaled;
        cairo_get_matrix(context_, &scaled);
        cairo_identity_matrix(context_);
        cairo_rectangle(context_, deviceClip_.left, deviceClip_.top, std::max(0, deviceClip_.Width()),
                        std::max(0, deviceClip_.Height()));
        cairo_clip(context_);
        cairo_set_matrix(context_, &scaled);
        clipPending_ = false;
    }
    return context_;
}

void Canvas::SetClip(const Rectangle& clip) {
    clip_ = clip;
    deviceClip_ = Common(Device(clip), {0, 0, bitmap_.width, bitmap_.height});
    clipPending_ = true;
}

ClipTo::ClipTo(Canvas& canvas, const Rectangle& area) : canvas_(canvas), former_(canvas.clip_) {
    canvas_.SetClip(Common(former_, area));
}

ClipTo::~ClipTo() {
    canvas_.SetClip(former_);
}

Bitmap UnpaintedPicture(const Rectangle& window, double scale) {
    Bitmap bitmap;
    bitmap.width = static_cast<int>(std::lround(window.Width() * scale));
    bitmap.height = static_cast<int>(std::lround(window.Height() * scale));
    bitmap.pixels.resize(static_cast<std::size_t>(bitmap.width) * static_cast<std::size_t>(bitmap.height));
    return bitmap;
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
