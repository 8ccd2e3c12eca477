#include "support/BoxedPicture.h"

#include <algorithm>
#include <set>

namespace tovimar::test {

namespace {

/// Lines of a tab, of the chosen one's top, and of the head of a datasheet's column.
constexpr std::uint32_t kTabLine = 0x9A9A9A, kChosenTab = 0x6C9BD2, kColumnLine = 0xB4BCC6;

} // namespace

BoxedPicture::BoxedPicture(const BoxedExports& boxes, platform::Image picture, std::vector<Spot> spots,
                           int container, bool normal)
    : boxes_(boxes), picture_(std::move(picture)), spots_(std::move(spots)), container_(container),
      normal_(normal) {
    if (!spots_.empty())
        design_ = boxes_.Of(spots_.front().number).design;
}

std::uint32_t BoxedPicture::At(int x, int y) const {
    if (x < 0 || y < 0 || x >= picture_.width || y >= picture_.height)
        return 0;
    return picture_.pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(picture_.width) +
                           static_cast<std::size_t>(x)] &
           0xFFFFFFU;
}

void BoxedPicture::Fault(const Spot& spot, const std::string& text) {
    const auto& place = spot.place;
    faults_.push_back("c" + std::to_string(spot.number) +
                      (spot.tab < 0 ? "" : " tab " + std::to_string(spot.tab)) + " at " +
                      std::to_string(place.left) + "," + std::to_string(place.top) + "," +
                      std::to_string(place.right) + "," + std::to_string(place.bottom) + ": " + text);
}

std::vector<std::string> BoxedPicture::Faults() {
    faults_.clear();
    for (const Spot& spot : spots_)
        CheckInside(spot);
    if (!faults_.empty())
        return faults_;
    Spread();
    CheckPixels();
    for (const Spot& spot : spots_)
        if (spot.tab >= 0)
            CheckTab(spot);
        else if (IsColumn(spot))
            CheckColumn(spot);
    return faults_;
}

void BoxedPicture::CheckInside(const Spot& spot) {
    const auto& place = spot.place;
    if (place.left < 0 || place.top < 0 || place.right < place.left || place.bottom < place.top ||
        place.right > picture_.width || place.bottom > picture_.height)
        Fault(spot, "leaves the picture of " + std::to_string(picture_.width) + " by " +
                        std::to_string(picture_.height));
}

/// Boxes are numbered as they are painted.
void BoxedPicture::Spread() {
    top_.assign(picture_.pixels.size(), -1);
    std::vector<int> order;
    for (std::size_t i = 0; i < spots_.size(); ++i)
        if (spots_[i].tab < 0)
            order.push_back(static_cast<int>(i));
    const auto number = [&](int i) { return spots_[static_cast<std::size_t>(i)].number; };
    std::stable_sort(order.begin(), order.end(),
                     [&](int left, int right) { return number(left) < number(right); });
    for (const int i : order) {
        const auto& place = spots_[static_cast<std::size_t>(i)].place;
        for (int y = place.top; y < place.bottom; ++y) {
            const auto row = top_.begin() + static_cast<std::ptrdiff_t>(y) * picture_.width;
            std::fill(row + place.left, row + place.right, i);
        }
    }
}

bool BoxedPicture::LiesWithin(int number, int outer) const {
    for (; number != 0; number = boxes_.Of(number).parent)
        if (number == outer)
            return true;
    return false;
}

bool BoxedPicture::IsColumn(const Spot& spot) const {
    return normal_ && boxes_.Of(spot.number).column;
}

bool BoxedPicture::OnEdge(int x, int y) const {
    return x == 0 || y == 0 || x == picture_.width - 1 || y == picture_.height - 1;
}

/// A later control beside the container lies over it, and so does the line of a frame further out.
bool BoxedPicture::LiesOver(const Spot& top, int number) const {
    if (container_ == 0 || number == 0 || LiesWithin(number, container_))
        return false;
    const Box& box = boxes_.Of(number);
    const int outer = boxes_.Of(container_).design;
    return box.design == outer ? number > container_
                               : box.kind == Box::Kind::Frame && box.design != boxes_.Of(top.number).design;
}

/// May a pixel within a spot show that box, or with 0 none?
bool BoxedPicture::Fits(int x, int y, const Spot& top, int number) const {
    const Box& box = boxes_.Of(top.number);
    const bool label = number > top.number && boxes_.Of(number).kind == Box::Kind::Label;
    if (number == top.number || label || LiesOver(top, number))
        return true;
    // A frame's line and a thin border take the outermost pixels.
    if (OnEdge(x, y) && (number == 0 || number == container_))
        return true;
    if (IsColumn(top))
        return number == 0;
    const auto& place = top.place;
    const bool line = x == place.left || x == place.right - 1 || y == place.top || y == place.bottom - 1;
    if (box.kind == Box::Kind::Frame)
        return !line && (number == 0 || boxes_.Of(number).design != box.design);
    if (box.kind == Box::Kind::Tab)
        return number == 0 || LiesWithin(number, top.number);
    return number != 0 && LiesWithin(number, top.number);
}

/// May a pixel beside all spots show that box?
bool BoxedPicture::MayStandAlone(int y, int number) const {
    const Box& box = boxes_.Of(number);
    // A container's picture shows what lies over it and around it too.
    const bool foreign = container_ != 0 && !LiesWithin(number, container_) && box.design != design_;
    const bool beside =
        container_ != 0 && !LiesWithin(number, container_) && box.design == boxes_.Of(container_).design;
    if (box.kind == Box::Kind::Label || foreign || beside || number == container_)
        return true;
    // The records below the first are no part of the map.
    return normal_ && box.repeated && std::any_of(spots_.begin(), spots_.end(), [&](const Spot& spot) {
               return LiesWithin(number, spot.number) && y >= spot.place.bottom;
           });
}

void BoxedPicture::CheckPixels() {
    std::set<int> told;
    for (int y = 0; y < picture_.height; ++y)
        for (int x = 0; x < picture_.width; ++x) {
            const int seen = BoxNumber(At(x, y));
            const int number = seen > boxes_.Last() ? 0 : seen;
            const int at = top_[static_cast<std::size_t>(y) * static_cast<std::size_t>(picture_.width) +
                                static_cast<std::size_t>(x)];
            if (at >= 0) {
                const Spot& spot = spots_[static_cast<std::size_t>(at)];
                if (!Fits(x, y, spot, number) && told.insert(at).second)
                    Fault(spot, "shows c" + std::to_string(number) + " at " + std::to_string(x) + "," +
                                    std::to_string(y));
            } else if (number != 0 && !MayStandAlone(y, number) && told.insert(-number).second) {
                Fault({{x, y, x, y}, number, -1}, "is painted where no area is");
            }
        }
}

void BoxedPicture::CheckTab(const Spot& spot) {
    if (boxes_.Of(spot.number).headless)
        return;
    const auto& place = spot.place;
    const auto isLine = [&](int x, int y) {
        return OnEdge(x, y) || At(x, y) == kTabLine || At(x, y) == kChosenTab;
    };
    bool right = true;
    for (int y = place.top; y < place.bottom; ++y)
        right = right && isLine(place.left, y) && isLine(place.right - 1, y);
    for (int x = place.left; x < place.right; ++x)
        right = right && isLine(x, place.top) && At(x, place.top - 1) != kTabLine;
    if (!right)
        Fault(spot, "isn't the tab that is painted");
}

/// Hidden columns have no width; what a frame cuts off has no line at the cut. A column begins behind the
/// line of the one before it, or a rounded pixel to either side.
void BoxedPicture::CheckColumn(const Spot& spot) {
    const auto& place = spot.place;
    if (place.Width() == 0)
        return;
    const auto isLine = [&](int x, int y) { return OnEdge(x, y) || At(x, y) == kColumnLine; };
    bool right = true;
    for (int y = place.top; y < place.bottom - 1; ++y)
        right = right && isLine(place.right - 1, y) &&
                (isLine(place.left - 2, y) || isLine(place.left - 1, y) || isLine(place.left, y));
    for (int x = place.left; x < place.right; ++x)
        right = right && isLine(x, place.bottom - 1);
    if (!right)
        Fault(spot, "isn't the head of a column");
}

} // namespace tovimar::test
