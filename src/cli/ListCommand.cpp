#include "cli/Columns.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "platform/access/AccessApplication.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>

namespace tovimar::cli {
namespace {

using platform::access::ApplicationSummary;
using platform::access::ObjectKind;
using platform::access::ObjectSummary;

void ShowKind(const ApplicationSummary& application, ObjectKind kind, const char* heading) {
    std::vector<const ObjectSummary*> objects;
    std::size_t width = 0;
    for (const ObjectSummary& object : application.objects)
        if (object.kind == kind) {
            objects.push_back(&object);
            width = std::max(width, text::Length(object.name));
        }
    if (objects.empty())
        return;
    PrintResult(std::string(heading) + " (" + std::to_string(objects.size()) + ")");
    constexpr std::size_t kWidest = 40;
    for (const ObjectSummary* object : objects) {
        const std::string note = object->designKnown ? object->caption : "(known by name only)";
        PrintResult("  " + (note.empty() ? object->name
                                         : PaddedTo(object->name, std::min(width, kWidest)) + "  " + note));
    }
}

} // namespace

int List(const Arguments& arguments) {
    const ApplicationSummary application = platform::access::SummarizeApplication(arguments.source);
    PrintResult(application.name);
    constexpr std::array<std::pair<ObjectKind, const char*>, 6> kHeadings{{{ObjectKind::Form, "Forms"},
                                                                           {ObjectKind::Report, "Reports"},
                                                                           {ObjectKind::Table, "Tables"},
                                                                           {ObjectKind::Query, "Queries"},
                                                                           {ObjectKind::Macro, "Macros"},
                                                                           {ObjectKind::Module, "Modules"}}};
    for (const auto& [kind, heading] : kHeadings)
        ShowKind(application, kind, heading);
    for (const std::string& note : application.notes)
        PrintWarning(note);
    bool sound = true;
    for (const ObjectSummary& object : application.objects)
        if (!object.error.empty()) {
            PrintError(object.error);
            sound = false;
        }
    return sound ? kDone : kFailed;
}

} // namespace tovimar::cli
