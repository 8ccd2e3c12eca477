#pragma once

#include "platform/painting/PaintContext.h"
#include "platform/painting/Parts.h"
#include "platform/painting/TextPainter.h"

#include <optional>
#include <string>

/// Paints the controls of one section.
namespace tovimar::platform::painting {

/// Where a section's controls lie and which record they show.
struct SectionPlace {
    access::Frame frame; ///< of the object that holds the section
    int originX = 0;     ///< of its client area in the picture
    int originY = 0;
    int offsetY = 0;         ///< of the section within the client area
    int row = 0;             ///< record, from 0
    Color ground = 0xFFFFFF; ///< the section's colour
    int growth = 0;          ///< pixels that subreports gain
};

class ControlPainter {
public:
    ControlPainter(const PaintContext& context, const SampleData& sample, const SectionPlace& place)
        : context_(context), canvas_(context.canvas), sample_(sample), place_(place) {}

    /// The children of a section or page with all below them, in their order.
    void PaintChildren(const access::DesignObject& parent);
    /// In pixels of the picture.
    Rectangle PlaceOf(const access::DesignObject& control) const;

private:
    using Object = access::DesignObject;

    bool IsShown(const Object& control) const;
    void Paint(const Object& control);
    void PaintKind(const Object& control, const Rectangle& area);
    bool PaintButtonKind(const Object& control, const Rectangle& area);
    bool PaintContainer(const Object& control, const Rectangle& area);
    void PaintLabel(const Object& control, const Rectangle& area);
    void PaintTextBox(const Object& control, const Rectangle& area);
    void PaintComboBox(const Object& control, const Rectangle& area);
    void PaintListBox(const Object& control, const Rectangle& area);
    void PaintListRow(const std::vector<std::string>& cells, const std::vector<int>& widths,
                      const Rectangle& area, const TextStyle& style);
    void PaintCheck(const Object& control, const Rectangle& area);
    void PaintButton(const Object& control, const Rectangle& area);
    void PaintThemedFace(const Object& control, const Rectangle& area);
    void PaintGroup(const Object& control, const Rectangle& area);
    void PaintTab(const Object& control, const Rectangle& area);
    void PaintTabHeads(const Object& control, const Rectangle& area, std::size_t current);
    void PaintSubform(const Object& control, const Rectangle& area);
    void PaintPicture(const Object& control, const Rectangle& area);
    void PaintLine(const Object& control, const Rectangle& area);
    void PaintForeign(const Object& control, const Rectangle& area);
    void PaintChart(const Rectangle& area);
    void PaintPageBreak(const Rectangle& area);

    /// Background and border; gives what is left inside.
    Rectangle PaintBox(const Object& control, const Rectangle& area);
    TextStyle StyleOf(const Object& control) const;
    std::string ContentOf(const Object& control) const;
    void Write(const Object& control, const Rectangle& inner, const std::string& text, bool multiline);
    std::size_t CurrentPage(const Object& tab) const;

    const PaintContext& context_;
    Canvas& canvas_;
    const SampleData& sample_;
    SectionPlace place_;
};

/// Width of a control's border in pixels, 1 for a hairline.
int BorderPixels(const access::DesignObject& control);

/// The picture that a control, form or report holds: embedded bytes or a shared picture of the application.
/// None where there is none that can be decoded. For buttons the classic grey ground is see-through.
std::optional<Image> PictureOf(const access::DesignObject& object, access::ApplicationSource* application,
                               bool forButton = false);
/// Where a picture lies in its area: sizes 0 as it is, 1 stretched, 3 as large as fits.
Rectangle PicturePlace(const Image& image, const Rectangle& area, int sizeMode, int alignment);

} // namespace tovimar::platform::painting
