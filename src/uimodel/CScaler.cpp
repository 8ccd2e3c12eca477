#include "uimodel/CScaler.h"

#include "foundation/ErrorTrap.h"
#include "host/contract/IClientFormProcessor.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "uimodel/HostProperty.h"

namespace tovimar {

using platform::access::RoundToEven;

namespace {

constexpr int kLongestWayUp = 100;

const platform::SystemMetrics& Metrics() {
    return platform::Env().windows->Metrics();
}

bool IsHostForm(const HostObject& object) {
    return object != nullptr && text::EqualsIgnoringCase(object->ClassName(), "VBForm");
}

/// Value of one of a control's `Properties`, which hosts with tab components of their own offer.
double NumberInProperties(const HostObject& control, const char* name) {
    return HostProperty::Number(HostProperty::Object(control, "Properties", {name}), "Value");
}

} // namespace

void CScaler::Init(IClientFormProcessor& processor, const HostObject& form, const HostObject& control,
                   bool vfAddContainers, bool vfCalcTabs, clsAccFormDimensions* dimensions) {
    Trapped("CScaler", "Inti", [&] {
        dimensions_ = dimensions == nullptr ? &own_ : dimensions;
        IsMSAccess = processor.IsMSAccess();
        scaleMode_ = processor.ScaleMode(form);
        control_ = control;
        CalcScaleMultipliers();
        const auto read = [&](const char* name) {
            return static_cast<float>(HostProperty::Number(control, name));
        };
        source_ = {read("Left"), read("Top"), read("Width"), read("Height")};
        if (IsMSAccess)
            ReadOnAccess();
        else
            ReadElsewhere(vfAddContainers);
        if (vfCalcTabs)
            CalcTabsHotSpots();
    });
}

void CScaler::ReadOnAccess() {
    const auto& answer = dimensions_->OfControl(control_, /*vfRulerOn=*/false);
    // The record selector is no part of this rectangle.
    platform::access::Frame frame = answer.frame;
    frame.recordSelectorWidth = 0;
    const int offset = platform::access::SectionOffsetY(answer.heights, frame.sectionBarHeight,
                                                        HostProperty::Integer(control_, "Section"));
    const platform::Rectangle place = platform::access::ControlRectangle(
        Metrics(), frame, offset, static_cast<double>(source_.left), static_cast<double>(source_.top),
        static_cast<double>(source_.width), static_cast<double>(source_.height));
    result_ = {static_cast<float>(place.left), static_cast<float>(place.top),
               static_cast<float>(place.Width()), static_cast<float>(place.Height())};
}

void CScaler::ReadElsewhere(bool addContainers) {
    containerIsForm_ = IsHostForm(Container(control_));
    // Within another container the host counts in twips.
    const bool scaled = !addContainers || containerIsForm_;
    const double x = (scaled ? constX_ : 1.0) / Metrics().twipsPerPixelX;
    const double y = (scaled ? constY_ : 1.0) / Metrics().twipsPerPixelY;
    const auto times = [](float value, double factor) {
        return static_cast<float>(static_cast<double>(value) * factor);
    };
    result_ = {times(source_.left, x), times(source_.top, y), times(source_.width, x),
               times(source_.height, y)};
    if (!scaled)
        AddContainers();
}

void CScaler::AddContainers() {
    HostObject container = Container(control_);
    for (int steps = 0; container != nullptr && !IsHostForm(container) && steps < kLongestWayUp; ++steps) {
        const HostObject next = Container(container);
        const bool onForm = IsHostForm(next);
        const double x = (onForm ? constX_ : 1.0) / Metrics().twipsPerPixelX;
        const double y = (onForm ? constY_ : 1.0) / Metrics().twipsPerPixelY;
        result_.left += static_cast<float>(HostProperty::Number(container, "Left") * x);
        result_.top += static_cast<float>(HostProperty::Number(container, "Top") * y);
        container = next;
    }
}

HostObject CScaler::Container(const HostObject& robj) const {
    return HostProperty::Object(robj, "Container");
}

std::int32_t CScaler::Top() const {
    return RoundToEven(static_cast<double>(result_.top));
}
std::int32_t CScaler::Left() const {
    return RoundToEven(static_cast<double>(result_.left));
}
std::int32_t CScaler::Height() const {
    return RoundToEven(static_cast<double>(result_.height));
}
std::int32_t CScaler::Width() const {
    return RoundToEven(static_cast<double>(result_.width));
}

void CScaler::CalcScaleMultipliers() {
    const auto set = [&](double x, double y) {
        constX_ = x;
        constY_ = y;
    };
    switch (scaleMode_) {
    case 0:
    case 1:
        return set(1, 1);
    case 2:
        return set(20, 20);
    case 3:
        return set(Metrics().twipsPerPixelX, Metrics().twipsPerPixelY);
    case 4:
        return set(120, 240);
    case 5:
        return set(1440, 1440);
    case 6:
        return set(56.69, 56.69);
    case 7:
        return set(566.9, 566.9);
    default:
        return set(0, 0);
    }
}

void CScaler::CalcTabsHotSpots() {
    Trapped("CScaler", "CalcTabsHotSpots", [&] {
        if (IsMSAccess)
            CalcTabsOnAccess();
        else
            CalcTabsElsewhere();
    });
}

void CScaler::CalcTabsOnAccess() {
    tabInput_ = clsAccFormDimensions::ReadTabs(control_);
    tabInput_.controlLeft = Left();
    tabInput_.controlTop = Top();
    tabsQty_ = static_cast<std::int32_t>(tabInput_.captions.size());
    tabsPerRow_ = tabsQty_;
}

void CScaler::CalcTabsElsewhere() {
    tabsQty_ = RoundToEven(NumberInProperties(control_, "Tabs"));
    tabsPerRow_ = RoundToEven(NumberInProperties(control_, "TabsPerRow"));
    const double height = NumberInProperties(control_, "TabHeight") * constY_ / Metrics().twipsPerPixelY;
    const float width = tabsPerRow_ < 1 ? 0.0F : result_.width / static_cast<float>(tabsPerRow_);
    tab_ = {result_.left, result_.top, width, static_cast<float>(height)};
}

std::int32_t CScaler::TabIndexInRow(std::int32_t vlngTabIdx) const {
    return tabsPerRow_ < 1 ? 0 : vlngTabIdx % tabsPerRow_;
}

std::int32_t CScaler::RowOf(std::int32_t tabIndex) const {
    // The last tabs lie in the topmost row.
    return tabsPerRow_ < 1 ? 0 : (tabsQty_ - 1) / tabsPerRow_ - tabIndex / tabsPerRow_;
}

platform::Rectangle CScaler::TabOnAccess(std::int32_t tabIndex) const {
    return platform::access::TabRectangle(Metrics(), tabInput_, tabIndex);
}

std::int32_t CScaler::TabLeft(std::int32_t vlngTabIdx) const {
    if (IsMSAccess)
        return TabOnAccess(vlngTabIdx).left;
    const auto index = static_cast<float>(TabIndexInRow(vlngTabIdx));
    return RoundToEven(static_cast<double>(tab_.left + index * tab_.width));
}

std::int32_t CScaler::TabTop(std::int32_t vlngTabIdx) const {
    if (IsMSAccess)
        return TabOnAccess(vlngTabIdx).top;
    return RoundToEven(static_cast<double>(tab_.top + static_cast<float>(RowOf(vlngTabIdx)) * tab_.height));
}

std::int32_t CScaler::TabWidth(std::int32_t vlngTabIdx) const {
    return IsMSAccess ? TabOnAccess(vlngTabIdx).Width() : RoundToEven(static_cast<double>(tab_.width));
}

std::int32_t CScaler::TabHeight(std::int32_t vlngTabIdx) const {
    return IsMSAccess ? TabOnAccess(vlngTabIdx).Height() : RoundToEven(static_cast<double>(tab_.height));
}

} // namespace tovimar
