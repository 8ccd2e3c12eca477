#pragma once

#include "platform/AutomationObject.h"
#include "platform/KeyedList.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// One toggle of the host's View menu, with the state in which it was found.
struct clsAccCmdBarControl {
    HostObject control;
    std::int32_t Kind = 0; ///< the control's id
    std::int32_t State = 0;
};

/// The toggles of the host's View menu that change how an object's window looks: they are brought up (off)
/// before a picture and put back behind it. Without the menu every operation does nothing.
class clsAccCmdBarControls {
public:
    void Init(const HostObject& app);
    void Terminate() { controls_.Clear(); }

    /// Switches off what is on; the toggles 556, 557 and 574 are left alone.
    void Up();
    /// Switches on what is off, with the same exceptions.
    void Down();
    void RestoreState();
    bool ControlDefined(std::int32_t id) const { return controls_.Contains(std::to_string(id)); }

private:
    void BringTo(std::int32_t state);

    KeyedList<clsAccCmdBarControl> controls_;
};

} // namespace tovimar
