#include "host/access/AccessProject.h"

#include "host/access/LateBound.h"
#include "platform/Error.h"
#include "platform/text/Text.h"

namespace tovimar::access_project {
namespace {

constexpr std::int32_t kServerClient = 1;
constexpr std::int32_t kLocalDatabase = 2;

/// 0 when the host doesn't tell.
std::int32_t ProjectType(const HostObject& app) {
    try {
        return late::Integer(late::Object(app, "CurrentProject"), "ProjectType");
    } catch (const RaisedError&) {
        return 0;
    }
}

} // namespace

std::string FullName(const HostObject& app) {
    return late::TextOrEmpty(late::ObjectOrNull(app, "CurrentProject"), "FullName");
}

bool IsMDEorADE(const HostObject& app) {
    const char* owner = ProjectType(app) == kLocalDatabase ? "CurrentDb" : "CurrentProject";
    const Value mark = late::PropertyOrNull(late::ObjectOrNull(app, owner), "MDE");
    return mark.IsString() && text::EqualsIgnoringCase(mark.AsString(), "T");
}

bool IsADPorADE(const HostObject& app) {
    return ProjectType(app) == kServerClient;
}

} // namespace tovimar::access_project
