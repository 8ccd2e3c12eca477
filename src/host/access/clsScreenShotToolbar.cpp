#include "host/access/clsScreenShotToolbar.h"

#include "host/access/LateBound.h"

namespace tovimar {

namespace {

constexpr std::int32_t kButton = 1;
constexpr std::int32_t kCaptionOnly = 2;
/// Below the host's own toolbars.
constexpr std::int32_t kRow = 2;

HostObject Find(const HostObject& rapp, const std::string& name) {
    return late::ObjectOrNull(rapp, "CommandBars", {Value(name)});
}

HostObject Make(const HostObject& rapp, const std::string& name) {
    const HostObject bar = late::Call(late::Object(rapp, "CommandBars"), "Add", {Value(name)}).AsObject();
    late::Set(bar, "Left", 0);
    late::Set(bar, "Top", 0);
    late::Set(bar, "RowIndex", kRow);
    const HostObject button = late::Call(late::Object(bar, "Controls"), "Add", {kButton}).AsObject();
    late::Set(button, "Style", kCaptionOnly);
    late::Set(button, "Caption", "&Screenshot");
    return bar;
}

} // namespace

void clsScreenShotToolbar::Show(const HostObject& rapp, const std::string& vstrToolbarName) {
    HostObject bar = Find(rapp, vstrToolbarName);
    if (bar == nullptr)
        bar = Make(rapp, vstrToolbarName);
    late::Set(bar, "Visible", true);
}

void clsScreenShotToolbar::Delete(const HostObject& rapp, const std::string& vstrToolbarName) {
    if (const HostObject bar = Find(rapp, vstrToolbarName))
        late::Call(bar, "Delete");
}

} // namespace tovimar
