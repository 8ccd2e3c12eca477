#pragma once

#include "platform/access/OpenObject.h"
#include "platform/painting/Canvas.h"
#include "platform/painting/Palette.h"
#include "platform/painting/SampleData.h"

#include <map>
#include <vector>

namespace tovimar::platform::painting {

/// Subforms within subforms are painted to this depth.
inline constexpr std::size_t kDeepestSubform = 4;

/// What is painted, for whom and on what. Lives as long as one object is being painted.
struct PaintContext {
    Canvas& canvas;
    const SystemMetrics& metrics;
    const access::Design& design;
    access::ApplicationSource* application = nullptr; ///< not owned, may be null
    access::View view = access::View::Form;
    /// Pages shown by the tab controls of the window, subforms' included; absent ones show their first.
    const std::map<const access::DesignObject*, int>* pages = nullptr;
    /// The designs around this one, the window's own first.
    std::vector<const access::Design*> outer;
    /// What the records shown have in common with the record around them.
    std::vector<RecordLink> links;

    bool Designing() const { return view == access::View::Design; }
    const std::vector<std::uint32_t>& Theme() const {
        static const std::vector<std::uint32_t> none;
        return application == nullptr ? none : application->ThemeColors();
    }
};

} // namespace tovimar::platform::painting
