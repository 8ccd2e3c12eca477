#pragma once

#include "platform/access/OpenObject.h"

#include <string>
#include <vector>

/// How an object's sections and records are laid out in a view: asked by the painter, by the window's size
/// and by the object model.
namespace tovimar::platform::painting {

bool IsContinuous(const access::Design& design, access::View view);
/// Is a section part of the picture in this view?
bool IsSectionShown(const access::Design& design, const access::SectionRef& section, access::View view);
/// Does a form show controls below its records?
bool HasFooter(const access::Design& design, access::View view);
access::FrameInput FrameSettingsOf(const access::Design& design, access::View view);
/// Records below each other that fit into a client area of that height; a choice of its own for height 0.
int ShownRecordsOf(const access::Design& design, access::View view, int insideHeight,
                   const SystemMetrics& metrics);
/// With the heights of so many records for the detail.
access::SectionHeights HeightsOf(const access::Design& design, access::View view, int records,
                                 const SystemMetrics& metrics);

/// A section where it stands in the client area; its bar, if the view has bars, lies above its content.
struct PlacedSection {
    int number = 0;
    const access::DesignObject* object = nullptr;
    int offset = 0; ///< of the bar
    int height = 0; ///< of the content
};
/// From the top, where the hot spots expect them.
std::vector<PlacedSection> PlacedSections(const access::Design& design, access::View view,
                                          const access::SectionHeights& heights, int barHeight);
/// "Detail", "Form Header", "Category Footer", ...
std::string SectionTitle(const access::Design& design, int number);

/// A width or height of the design in pixels, bounded against damaged designs.
int PixelsOf(const access::DesignObject& object, std::string_view property, int twipsPerPixel);
/// Height of a form's navigation buttons with their line, 0 without them.
int NavigationHeight(const access::Design& design, const SystemMetrics& metrics);
/// Width of a form's vertical scroll bar at the right of its client area and height of its navigation buttons
/// at the foot, 0 without them. A frame that leaves them no room goes without, as they must not cover a
/// control.
struct FormBars {
    int scroll = 0;
    int navigation = 0;
};
FormBars FormBarsOf(const access::Design& design, access::View view, int insideWidth, int insideHeight,
                    const SystemMetrics& metrics);
/// Height of a record of a datasheet.
inline constexpr int kDatasheetRow = 18;

} // namespace tovimar::platform::painting
