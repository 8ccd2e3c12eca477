#pragma once

#include "platform/Value.h"

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

class IClientFormProcessor;
struct RawControl;

/// Walks the controls of one open object of the host and writes each as a raw element, its children in it.
class RawXmlWalk {
public:
    RawXmlWalk(IClientFormProcessor& processor, const HostObject& component, const HostObject& form);

    /// The element; empty for a menu separator. Levels count from 1.
    std::string ControlXml(const HostObject& control, std::int32_t level);

private:
    using Elements = std::vector<std::string>;

    Elements Children(const HostObject& control, std::int32_t level);
    Elements Pages(const HostObject& control, const std::string& name, std::int32_t level);
    std::string PageXml(const HostObject& control, const HostObject& page, const std::string& name,
                        std::int32_t index, std::int32_t level);
    Elements ControlsOnPage(const HostObject& control, std::int32_t index, std::int32_t level);
    Elements Buttons(const HostObject& control, const std::string& name, std::int32_t level);
    void AddElement(Elements& elements, const HostObject& control, std::int32_t level);
    void Measure(RawControl& raw, const HostObject& control);

    IClientFormProcessor& processor_;
    const HostObject& component_;
    const HostObject& form_;
};

} // namespace tovimar
