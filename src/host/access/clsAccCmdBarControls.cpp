#include "host/access/clsAccCmdBarControls.h"

#include "host/access/LateBound.h"

#include <algorithm>
#include <array>

namespace tovimar {
namespace {

constexpr std::int32_t kViewMenuId = 30004;
constexpr std::array<std::int32_t, 8> kToggles{966, 967, 548, 501, 556, 557, 574, 222};
constexpr std::array<std::int32_t, 3> kLeftAlone{556, 557, 574};

template <std::size_t Size> bool Holds(const std::array<std::int32_t, Size>& ids, std::int32_t id) {
    return std::find(ids.begin(), ids.end(), id) != ids.end();
}

HostObject FindViewMenu(const HostObject& app) {
    const HostObject bar = late::ObjectOrNull(app, "CommandBars", {Value("Menu bar")});
    const HostObject controls = bar ? late::ObjectOrNull(bar, "Controls") : nullptr;
    HostObject menu;
    if (controls)
        late::ForEach(controls, [&menu](const HostObject& control) {
            if (!menu && late::Integer(control, "ID") == kViewMenuId)
                menu = control;
        });
    return menu;
}

} // namespace

void clsAccCmdBarControls::Init(const HostObject& app) {
    controls_.Clear();
    const HostObject menu = FindViewMenu(app);
    if (!menu)
        return;
    late::ForEach(late::Object(menu, "Controls"), [this](const HostObject& control) {
        const std::int32_t id = late::Integer(control, "ID");
        if (Holds(kToggles, id) && !ControlDefined(id))
            controls_.Add({control, id, late::Integer(control, "State")}, std::to_string(id));
    });
}

void clsAccCmdBarControls::Up() {
    BringTo(0);
}

void clsAccCmdBarControls::Down() {
    BringTo(-1);
}

void clsAccCmdBarControls::BringTo(std::int32_t state) {
    for (const clsAccCmdBarControl& toggle : controls_)
        if (!Holds(kLeftAlone, toggle.Kind) && late::Integer(toggle.control, "State") != state)
            late::Call(toggle.control, "Execute");
}

void clsAccCmdBarControls::RestoreState() {
    for (const clsAccCmdBarControl& toggle : controls_)
        if (late::Integer(toggle.control, "State") != toggle.State)
            late::Call(toggle.control, "Execute");
}

} // namespace tovimar
