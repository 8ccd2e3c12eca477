#include "uimodel/clsAccFormColumn.h"

#include "uimodel/HostProperty.h"

namespace tovimar {

bool clsAccFormColumn::Init(const HostObject& rctl) {
    Name = HostProperty::Text(rctl, "Name");
    ColumnWidth = HostProperty::Integer(rctl, "ColumnWidth");
    ColumnOrder = HostProperty::Integer(rctl, "ColumnOrder");
    return HostProperty::Readable(rctl, "ColumnWidth") && HostProperty::Readable(rctl, "ColumnOrder");
}

} // namespace tovimar
