#pragma once

#include "platform/imaging/Image.h"
#include "platform/windowing/WindowSystem.h"

#include <cstdint>
#include <memory>

typedef struct _cairo cairo_t;

/// Painting on a picture. Straight shapes are written into the pixels; text and slanted lines go through
/// Cairo. Colours are 0x00RRGGBB. Everything stays inside the clip. All positions are in pixels of the
/// window; on a picture of another scale they are brought to its pixels at the last moment, so that every
/// edge falls between two of them.
namespace tovimar::platform::painting {

using Color = std::uint32_t;

class Canvas {
public:
    /// The bitmap must outlive the canvas and keep its size; `scale` is its pixels per pixel of the window.
    explicit Canvas(Bitmap& bitmap, double scale = 1);
    ~Canvas();
    Canvas(const Canvas&) = delete;
    Canvas& operator=(const Canvas&) = delete;

    const Rectangle& Clip() const { return clip_; }
    bool Visible(const Rectangle& area) const;

    void Fill(const Rectangle& area, Color color);
    /// From the first colour at the top to the second at the bottom.
    void FillGradient(const Rectangle& area, Color top, Color bottom);
    /// A border of that width inside the area.
    void Border(const Rectangle& area, Color color, int width = 1);
    /// A border of one pixel inside the area: left and top in one colour, right and bottom in the other.
    void Edge(const Rectangle& area, Color leftTop, Color rightBottom);
    /// Every other pixel of a border, or of a line when the area has no extent one way.
    void DottedBorder(const Rectangle& area, Color color);
    void Line(double x1, double y1, double x2, double y2, Color color, double width = 1);
    /// A filled, smooth-edged polygon of three points.
    void Triangle(double x1, double y1, double x2, double y2, double x3, double y3, Color color);
    void Disc(double x, double y, double radius, Color color);
    void Ring(double x, double y, double radius, Color color);
    void Draw(const Image& image, const Rectangle& target);

    /// Cairo's context with the clip in force.
    cairo_t* Context();

private:
    friend class ClipTo;
    /// To pixels of the picture.
    int Device(int value) const;
    Rectangle Device(const Rectangle& area) const;
    /// A line's thickness in pixels of the picture: the same for all lines of one width, and never 0.
    int Thickness(int width) const;
    /// Pixels of the picture, inside the clip.
    void FillDevice(const Rectangle& area, Color color);
    void SetClip(const Rectangle& clip);

    Bitmap& bitmap_;
    double scale_;
    Rectangle clip_;
    Rectangle deviceClip_;
    bool clipPending_ = true;
    cairo_t* context_ = nullptr;
};

/// Narrows the clip to an area as long as it lives.
class ClipTo {
public:
    ClipTo(Canvas& canvas, const Rectangle& area);
    ~ClipTo();
    ClipTo(const ClipTo&) = delete;
    ClipTo& operator=(const ClipTo&) = delete;

private:
    Canvas& canvas_;
    Rectangle former_;
};

/// A picture of the window's size times `scale`, its pixels unset.
Bitmap UnpaintedPicture(const Rectangle& window, double scale);

Rectangle Moved(const Rectangle& area, int x, int y);
Rectangle Shrunk(const Rectangle& area, int by);
Rectangle Common(const Rectangle& left, const Rectangle& right);

} // namespace tovimar::platform::painting
