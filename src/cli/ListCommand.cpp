#include "cli/Columns.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "platform/access/AccessApplication.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <array>
#include <nlohmann/json.hpp>
#include <tuple>

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

constexpr std::array<std::tuple<ObjectKind, const char*, const char*>, 6> kKinds{
    {{ObjectKind::Form, "Forms", "form"},
     {ObjectKind::Report, "Reports", "report"},
     {ObjectKind::Table, "Tables", "table"},
     {ObjectKind::Query, "Queries", "query"},
     {ObjectKind::Macro, "Macros", "macro"},
     {ObjectKind::Module, "Modules", "module"}}};

void ShowAsJson(const ApplicationSummary& application) {
    nlohmann::ordered_json json{{"name", application.name}};
    auto& objects = json["objects"] = nlohmann::ordered_json::array();
    for (const auto& [kind, heading, word] : kKinds)
        for (const ObjectSummary& object : application.objects)
            if (object.kind == kind)
                objects.push_back({{"kind", word},
                                   {"name", object.name},
                                   {"caption", object.caption},
                                   {"nameOnly", !object.designKnown},
                                   {"error", object.error}});
    PrintJson(json);
}

} // namespace

int List(const Arguments& arguments) {
    const ApplicationSummary application = platform::access::SummarizeApplication(arguments.source);
    if (arguments.json)
        ShowAsJson(application);
    else {
        PrintResult(application.name);
        for (const auto& [kind, heading, word] : kKinds)
            ShowKind(application, kind, heading);
    }
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
