#pragma once

#include "platform/windowing/WindowSystem.h"

#include <array>
#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

/// Where things lie in an open form's or report's window, in pixels. The painter and the geometry of hot
/// spots both ask these functions, so a hot spot lies on its control to the pixel.
namespace tovimar::platform::access {

/// Numbers are the host's CurrentView.
enum class View { Design = 0, Form = 1, Datasheet = 2, Preview = 5 };

/// To the nearest whole number, a tie to the even neighbour: how a number is stored in an integer.
int RoundToEven(double value);

/// Frame of the window around its client area.
struct FrameInput {
    View view = View::Design;
    int borderStyle = 2; ///< 0 none, 1 thin, 2 sizable, 3 dialog
    bool recordSelectors = false;
    bool rulerOn = false; ///< design view shows its rulers
};
struct Frame {
    int frame = 0;
    int titleHeight = 0;
    int extraTop = 0;
    int extraLeft = 0;
    int recordSelectorWidth = 0;
    int sectionBarHeight = 0; ///< title bar of each section; 0 in form view
    int ClientOffsetX() const { return frame + extraLeft; }
    int ClientOffsetY() const { return frame + extraTop + titleHeight; }
};
Frame ComputeFrame(const SystemMetrics& metrics, const FrameInput& input);

/// Section numbers: 0 detail, 1 header, 2 footer, 3 page header, 4 page footer.
/// A height of -503 or less, or none, means that the section is absent.
struct SectionHeights {
    std::array<int, 5> pixels{}; ///< 0 where absent
    std::array<bool, 5> present{};
    /// Group sections of a report by their numbers from 5 on, absent ones left out. Headers lie above the
    /// detail from the outermost in, footers below it from the innermost out.
    std::map<int, int> groups;
    /// Where a preview prints the first of each section, left and top within the client area; set by whoever
    /// asks for places in a preview.
    std::map<int, std::pair<int, int>> printed;
};
/// Order from the top: header, page header, detail, page footer, footer.
inline constexpr std::array<int, 5> kSectionOrder{1, 3, 0, 4, 2};
/// Does a view show a section at all? `visible` is the section's own property.
constexpr bool SectionIsShown(View view, int section, bool visible) {
    switch (view) {
    case View::Datasheet:
        return section == 0;
    case View::Form:
        return visible && section <= 2;
    case View::Preview:
        return visible;
    case View::Design:
        break;
    }
    return true;
}
/// What lies above a section within the client area: bars and heights of the sections above it.
int SectionOffsetY(const SectionHeights& heights, int sectionBarHeight, int section);
/// 0 but on a printed sheet.
int SectionOffsetX(const SectionHeights& heights, int section);

/// A control's place, relative to the client area's origin (add the frame's client offset for the place
/// in the window's picture). Twips in, pixels out. `sectionOffset` and `sectionBarHeight` are those of its
/// section.
Rectangle ControlRectangle(const SystemMetrics& metrics, const Frame& frame, int sectionOffset, double left,
                           double top, double width, double height);

/// Head of a datasheet's column, relative to the client area's origin; twips in. Each side is rounded by
/// itself, so neighbours may share a pixel or leave one between them.
Rectangle ColumnRectangle(const SystemMetrics& metrics, double left, double width);

/// A tab control's tabs, in one row.
struct TabInput {
    int controlLeft = 0, controlTop = 0;    ///< as ControlRectangle gave them
    double fixedWidth = 0, fixedHeight = 0; ///< twips, 0 for natural
    double fontSize = 8;
    int fontWeight = 400;
    std::vector<std::string> captions; ///< of all pages, names where captions are empty
};
/// Of every tab; the pages' frame begins below it.
int TabHeight(const SystemMetrics& metrics, const TabInput& input);
/// Rectangle of the tab of page `index` (from 0).
Rectangle TabRectangle(const SystemMetrics& metrics, const TabInput& input, int index);

} // namespace tovimar::platform::access
