#pragma once

#include "platform/AutomationObject.h"

namespace tovimar::platform::access {

/// `CommandBars`: the menu bar, which has no controls, and the toolbars that are added: `Add(name)`,
/// `Item(name)`, on a bar `Name`, `Visible`, `Left`, `Top`, `RowIndex`, `Controls` with `Add`, and `Delete`.
/// A name that isn't there raises 5, one that is taken too.
HostObject MakeCommandBars();

} // namespace tovimar::platform::access
