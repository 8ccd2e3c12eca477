#pragma once

#include "platform/access/FormLayout.h"

#include <vector>

namespace tovimar::platform::access {
class DesignObject;
}

/// The tabs of a tab control as its design has them.
namespace tovimar::platform::painting {

/// Pages in their order, hidden ones too.
std::vector<const access::DesignObject*> PagesOf(const access::DesignObject& tab);
/// What `TabRectangle` needs of a tab control whose top left corner lies there, in pixels.
access::TabInput TabInputOf(const access::DesignObject& tab, int left, int top);
/// How far the last tab reaches to the right of the control's left edge: natural tabs may be broader
/// together than their control.
int TabStripWidth(const access::DesignObject& tab, const SystemMetrics& metrics);

} // namespace tovimar::platform::painting
