#pragma once

#include "platform/AutomationObject.h"
#include "platform/KeyedList.h"

#include <cstdint>

namespace tovimar {

/// The controls that the form layer hands over, in the host's order and without keys.
class CControlsCollection {
public:
    const KeyedList<HostObject>& Items() const { return items_; }
    std::int32_t Count() const { return static_cast<std::int32_t>(items_.Count()); }
    void Add(HostObject TheControl) { items_.Add(std::move(TheControl)); }

    /// The controls one after the other.
    const KeyedList<HostObject>& NewEnum() const { return items_; }
    auto begin() const { return items_.begin(); }
    auto end() const { return items_.end(); }

private:
    KeyedList<HostObject> items_;
};

} // namespace tovimar
