#pragma once

#include "platform/AutomationObject.h"
#include "platform/access/FormLayout.h"
#include "uimodel/clsAccFormDimensions.h"

#include <cstdint>
#include <vector>

namespace tovimar {

class IClientFormProcessor;

/// Converts one control's rectangle from the host's unit to pixels and works out the tabs of a tab control.
class CScaler {
public:
    bool IsMSAccess = false;

    /// Reads the control. With `vfAddContainers`, on hosts other than Access, the places of the containers
    /// up to the form are added. Failures are reported and leave the rectangle as far as it came.
    /// The dimensions serve Access; without them an own object does.
    void Init(IClientFormProcessor& processor, const HostObject& form, const HostObject& control,
              bool vfAddContainers, bool vfCalcTabs, clsAccFormDimensions* dimensions = nullptr);

    HostObject Container(const HostObject& robj) const;
    std::int32_t Top() const;
    std::int32_t Left() const;
    std::int32_t Height() const;
    std::int32_t Width() const;
    /// Value by the constant: twips.
    double ScaleX(double value) const { return value * constX_; }
    double ScaleY(double value) const { return value * constY_; }
    void CalcScaleMultipliers();
    void CalcTabsHotSpots();

    std::int32_t TabIndexInRow(std::int32_t vlngTabIdx) const;
    std::int32_t TabsQTy() const { return tabsQty_; }
    std::int32_t TabsPerRow() const { return tabsPerRow_; }
    std::int32_t TabLeft(std::int32_t vlngTabIdx) const;
    std::int32_t TabTop(std::int32_t vlngTabIdx) const;
    std::int32_t TabWidth(std::int32_t vlngTabIdx) const;
    std::int32_t TabHeight(std::int32_t vlngTabIdx) const;

    /// Twips per unit of the host.
    double ConstToMultiplyX() const { return constX_; }
    double ConstToMultiplyY() const { return constY_; }

private:
    void ReadOnAccess();
    void ReadElsewhere(bool addContainers);
    void AddContainers();
    void CalcTabsOnAccess();
    void CalcTabsElsewhere();
    std::int32_t RowOf(std::int32_t tabIndex) const;
    platform::Rectangle TabOnAccess(std::int32_t tabIndex) const;

    clsAccFormDimensions* dimensions_ = nullptr;
    clsAccFormDimensions own_;
    std::int32_t scaleMode_ = 0;
    HostObject control_;
    struct Box {
        float left = 0, top = 0, width = 0, height = 0;
    };
    Box source_; ///< unit of the host
    Box result_; ///< pixels
    Box tab_;    ///< pixels, of the first tab
    platform::access::TabInput tabInput_;
    std::int32_t tabsQty_ = 0;
    std::int32_t tabsPerRow_ = 0;
    bool containerIsForm_ = false;
    double constX_ = 0;
    double constY_ = 0;
};

} // namespace tovimar
