#include "platform/painting/ControlPainter.h"

#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>

namespace tovimar::platform::painting {

using access::DesignObject;

namespace {

/// Buttons of the days of 16 colours were drawn on this ground.
constexpr std::uint32_t kClassicGround = 0xFFC0C0C0U;

std::string PictureBytes(const DesignObject& object, access::ApplicationSource* application) {
    for (const auto* property : {"ImageData", "PictureData"})
        if (const auto* value = object.Find(property);
            value != nullptr && value->form == access::PropertyValue::Form::Bytes)
            return value->text;
    const auto name = object.Text("Picture");
    const bool shared = object.Integer("PictureType", 0) == 2;
    return shared && application != nullptr && !name.empty() ? application->FindPicture(name) : std::string();
}

} // namespace

std::optional<Image> PictureOf(const DesignObject& object, access::ApplicationSource* application,
                               bool forButton) {
    const auto bytes = PictureBytes(object, application);
    if (bytes.empty())
        return std::nullopt;
    auto image = DecodeImage(bytes);
    if (image && forButton)
        for (auto& pixel : image->pixels)
            if (pixel == kClassicGround)
                pixel = 0;
    return image;
}

Rectangle PicturePlace(const Image& image, const Rectangle& area, int sizeMode, int alignment) {
    if (sizeMode == 1 || image.Empty())
        return area;
    double scale = 1;
    if (sizeMode == 3)
        scale = std::min(static_cast<double>(area.Width()) / image.width,
                         static_cast<double>(area.Height()) / image.height);
    const int width = std::max(1, access::RoundToEven(image.width * scale));
    const int height = std::max(1, access::RoundToEven(image.height * scale));
    // 0 top left, 1 top right, 2 centre, 3 bottom left, 4 bottom right
    const bool right = alignment == 1 || alignment == 4, bottom = alignment == 3 || alignment == 4;
    int left = right ? area.right - width : area.left;
    int top = bottom ? area.bottom - height : area.top;
    if (alignment == 2) {
        left = area.left + (area.Width() - width) / 2;
        top = area.top + (area.Height() - height) / 2;
    }
    return {left, top, left + width, top + height};
}

namespace {

// How a button's picture and caption stand: 0 picture alone, 2 caption below, 3 caption above, 1 and 4 the
// caption to the right of the picture, 5 to its left.
constexpr int kCaptionBelow = 2, kCaptionAbove = 3, kCaptionLeft = 5;
constexpr int kPictureGap = 4;

/// Picture and caption are centred together.
Rectangle ButtonPicturePlace(const Image& image, const Rectangle& inner, int arrangement, TextSize caption) {
    auto place = PicturePlace(image, inner, 0, 2);
    if (arrangement == 0)
        return place;
    const int side = (std::min(caption.width, inner.Width() - image.width) + kPictureGap) / 2;
    const int rise = (caption.height + kPictureGap) / 2;
    if (arrangement == kCaptionBelow || arrangement == kCaptionAbove)
        return Moved(place, 0, arrangement == kCaptionBelow ? -rise : rise);
    return Moved(place, arrangement == kCaptionLeft ? side : -side, 0);
}

Rectangle BesidePicture(const Rectangle& inner, const Rectangle& picture, int arrangement) {
    auto room = inner;
    if (arrangement == kCaptionBelow)
        room.top = picture.bottom;
    else if (arrangement == kCaptionAbove)
        room.bottom = picture.top;
    else if (arrangement == kCaptionLeft)
        room.right = picture.left - kPictureGap;
    else
        room.left = picture.right + kPictureGap;
    // What is left at the far end of the row is the margin that the picture has at its own.
    if (arrangement == 1 || arrangement == 4)
        room.right = std::max(room.left, inner.right - std::max(0, picture.left - inner.left));
    return room;
}

} // namespace

void ControlPainter::PaintThemedFace(const Object& control, const Rectangle& area) {
    const auto face = DesignColor(control, "Back", SystemColor::kFace, context_.Theme());
    const bool gradient = control.Integer("Gradient", 0) != 0;
    canvas_.FillGradient(area, gradient ? Tinted(face, 75, 100) : face,
                         gradient ? Tinted(face, 100, 96) : face);
    if (control.Integer("OldBorderStyle", 1) != 0)
        canvas_.Border(area, DesignColor(control, "Border", SystemColor::kShadow, context_.Theme()));
    // Corners of one pixel make the box look rounded.
    if (control.Integer("Shape", 0) != 0)
        for (const int x : {area.left, area.right - 1})
            for (const int y : {area.top, area.bottom - 1})
                canvas_.Fill({x, y, x + 1, y + 1}, place_.ground);
}

void ControlPainter::PaintButton(const Object& control, const Rectangle& area) {
    if (control.Flag("Transparent")) {
        if (context_.Designing())
            canvas_.DottedBorder(area, SystemColor::kShadow);
        return;
    }
    if (control.Integer("UseTheme", 0) != 0 || control.Is("NavigationButton"))
        PaintThemedFace(control, area);
    else
        PaintButtonFace(canvas_, area);

    auto inner = Shrunk(area, 2);
    const auto image = PictureOf(control, context_.application, true);
    const int arrangement = control.Integer("PictureCaptionArrangement", 0);
    auto style = StyleOf(control);
    if (!context_.Designing() && !control.Flag("Enabled"))
        style.color = SystemColor::kGrayText;
    if (image) {
        const auto place =
            ButtonPicturePlace(*image, inner, arrangement, MeasureText(control.Text("Caption"), style));
        const ClipTo clip(canvas_, inner);
        canvas_.Draw(*image, place);
        if (arrangement == 0)
            return;
        inner = BesidePicture(inner, place, arrangement);
    }
    TextPlace place{inner, Align::Center, VerticalAlign::Middle, true, true};
    DrawText(canvas_, control.Text("Caption"), style, place);
}

void ControlPainter::PaintPicture(const Object& control, const Rectangle& area) {
    const auto inner = PaintBox(control, area);
    const auto image = PictureOf(control, context_.application);
    if (!image)
        return;
    const ClipTo clip(canvas_, inner);
    canvas_.Draw(*image, PicturePlace(*image, inner, control.Integer("SizeMode", 0),
                                      control.Integer("PictureAlignment", 2)));
}

void ControlPainter::PaintForeign(const Object& control, const Rectangle& area) {
    if (control.Is("EmptyCell")) {
        if (context_.Designing())
            canvas_.DottedBorder(area, SystemColor::kGridLine);
        return;
    }
    if (control.Is("NavigationControl"))
        return;
    PaintPicture(control, area);
    if (control.Is("Image"))
        return;
    const auto kind = control.Text("Class") + control.Text("OLEClass");
    if (control.Is("Chart") || text::ContainsIgnoringCase(kind, "Graph") ||
        text::ContainsIgnoringCase(kind, "Chart"))
        return PaintChart(area);
    if (control.Is("BoundObjectFrame") || control.Is("Attachment") ||
        !PictureBytes(control, context_.application).empty())
        return;
    canvas_.Border(area, SystemColor::kShadow);
    auto title = control.Text("OLEClass");
    if (title.empty())
        title = control.Text("Class", control.name);
    TextStyle style;
    style.color = SystemColor::kDarkShadow;
    DrawText(canvas_, title.empty() ? control.name : title, style,
             {Shrunk(area, 3), Align::Center, VerticalAlign::Middle, true});
}

void ControlPainter::PaintChart(const Rectangle& area) {
    const auto plot = Shrunk(area, std::max(4, std::min(area.Width(), area.Height()) / 8));
    if (plot.Width() < 30 || plot.Height() < 20)
        return;
    canvas_.Fill(Shrunk(area, 1), SystemColor::kWindow);
    for (int line = 1; line <= 4; ++line) {
        const int y = plot.bottom - plot.Height() * line / 4;
        canvas_.Fill({plot.left, y, plot.right, y + 1}, SystemColor::kSoftLight);
    }
    constexpr int kBars = 4;
    constexpr int kHeights[kBars][2] = {{55, 40}, {80, 62}, {45, 70}, {92, 58}};
    const int step = plot.Width() / kBars;
    for (int bar = 0; bar < kBars; ++bar)
        for (int series = 0; series < 2; ++series) {
            const int left = plot.left + step * bar + step / 6 + series * step / 3;
            const int top = plot.bottom - plot.Height() * kHeights[bar][series] / 100;
            canvas_.Fill({left, top, left + step / 3 - 1, plot.bottom}, series == 0 ? 0x6C8EBF : 0xB9C9DF);
        }
    canvas_.Fill({plot.left, plot.top, plot.left + 1, plot.bottom}, SystemColor::kDarkShadow);
    canvas_.Fill({plot.left, plot.bottom, plot.right, plot.bottom + 1}, SystemColor::kDarkShadow);
}

} // namespace tovimar::platform::painting
