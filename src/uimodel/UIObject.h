#pragma once

#include "platform/Value.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// What a control or section asks of the object it stands in: a definition's form or another control.
class UIObject {
public:
    virtual ~UIObject() = default;

    /// True at the top of the tree.
    virtual bool IsForm() const = 0;
    /// From the window's top left corner to its client area, pixels.
    virtual std::int32_t ClientOffsetX() const = 0;
    virtual std::int32_t ClientOffsetY() const = 0;
    /// Where a section begins within the client area; 0 for an empty or unknown name.
    virtual std::int32_t ControlSectionOffsetX(const std::string& sectionName) const = 0;
    virtual std::int32_t ControlSectionOffsetY(const std::string& sectionName) const = 0;
};

} // namespace tovimar
