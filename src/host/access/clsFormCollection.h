#pragma once

#include "host/access/LateBound.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// Forms in the order in which they were added.
class clsFormCollection {
public:
    const KeyedList<HostObject>& Items() const { return items_; }
    std::int32_t Count() const { return static_cast<std::int32_t>(items_.Count()); }
    static std::string Caption(const HostObject& form) { return late::Property(form, "Caption").AsString(); }
    void Add(HostObject form) { items_.Add(std::move(form)); }
    const KeyedList<HostObject>& NewEnum() const { return items_; }
    auto begin() const { return items_.begin(); }
    auto end() const { return items_.end(); }

private:
    KeyedList<HostObject> items_;
};

} // namespace tovimar
