#pragma once

#include "platform/imaging/Image.h"
#include "platform/windowing/WindowSystem.h"
#include "support/Boxes.h"

#include <string>
#include <vector>

namespace tovimar::test {

/// Where an image map says that a box lies, or one of a tab control's tabs.
struct Spot {
    platform::Rectangle place;
    int number = 0;
    int tab = -1; ///< from 0
};

/// Holds a picture of boxes against the spots of its map.
class BoxedPicture {
public:
    /// `container` is the box that the picture is of, 0 for the whole window; `normal` tells form view from
    /// design view.
    BoxedPicture(const BoxedExports& boxes, platform::Image picture, std::vector<Spot> spots, int container,
                 bool normal);

    /// One line for each spot that leaves the picture, that isn't filled by its box, and whose box is painted
    /// beside it; what covers a spot in the design may cover it in the picture.
    std::vector<std::string> Faults();

private:
    void CheckInside(const Spot& spot);
    void Spread();
    void CheckPixels();
    void CheckTab(const Spot& spot);
    void CheckColumn(const Spot& spot);
    bool Fits(int x, int y, const Spot& top, int number) const;
    bool LiesOver(const Spot& top, int number) const;
    bool MayStandAlone(int y, int number) const;
    bool LiesWithin(int number, int outer) const;
    bool IsColumn(const Spot& spot) const;
    bool OnEdge(int x, int y) const;
    std::uint32_t At(int x, int y) const;
    void Fault(const Spot& spot, const std::string& text);

    const BoxedExports& boxes_;
    platform::Image picture_;
    std::vector<Spot> spots_;
    int container_;
    bool normal_;
    int design_ = 0;       ///< of the spots
    std::vector<int> top_; ///< index of the topmost spot by pixel, -1 for none
    std::vector<std::string> faults_;
};

} // namespace tovimar::test
