#pragma once

#include "platform/Value.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// A column of a form that is shown as a datasheet.
class clsAccFormColumn {
public:
    std::string Name;
    std::int32_t ColumnWidth = 0; ///< twips
    std::int32_t ColumnOrder = 0;

    /// False when the control is no column: it lacks width or order.
    bool Init(const HostObject& rctl);
};

} // namespace tovimar
