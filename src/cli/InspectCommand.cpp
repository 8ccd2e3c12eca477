#include "cli/Columns.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "platform/access/database/DatabaseDesigns.h"
#include "platform/access/database/Inspection.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <nlohmann/json.hpp>

namespace tovimar::cli {
namespace {

using platform::access::DatabaseDesigns;
using platform::access::InspectedObject;
using platform::access::InspectedProperty;
using platform::access::Inspection;
using platform::access::KindWord;
using platform::access::ObjectKind;

nlohmann::ordered_json AsJson(const InspectedObject& object) {
    nlohmann::ordered_json json{{"type", object.type}, {"name", object.name}};
    auto& properties = json["properties"] = nlohmann::ordered_json::array();
    for (const InspectedProperty& property : object.properties)
        properties.push_back({{"name", property.name},
                              {"value", property.value},
                              {"code", property.code},
                              {"slot", property.slot},
                              {"known", property.isKnown}});
    auto& children = json["children"] = nlohmann::ordered_json::array();
    for (const InspectedObject& child : object.children)
        children.push_back(AsJson(child));
    return json;
}

nlohmann::ordered_json AsJson(const Inspection& object, bool whole) {
    nlohmann::ordered_json json{{"kind", KindWord(object.kind)}, {"name", object.name},
                                {"bytes", object.bytes},         {"encoding", object.version},
                                {"objects", object.objects},     {"unknown", object.unknown},
                                {"faults", object.faults}};
    if (whole && object.text.empty())
        json["design"] = AsJson(object.root);
    else if (whole)
        json["text"] = object.text;
    return json;
}

/// A text's line ends would break the lines of the listing.
std::string OneLine(const std::string& value) {
    return text::ReplaceAll(text::ReplaceAll(value, "\r", "\\r"), "\n", "\\n");
}

void ShowTree(const InspectedObject& object, std::size_t indent) {
    const std::string blanks(indent, ' ');
    PrintResult(blanks + object.type + (object.name.empty() ? "" : " " + object.name));
    for (const InspectedProperty& property : object.properties)
        PrintResult(blanks + "  ." + property.name +
                    (property.isKnown ? ""
                                      : " (code " + std::to_string(property.code) + ", slot " +
                                            std::to_string(property.slot) + ")") +
                    " = " + OneLine(property.value));
    for (const InspectedObject& child : object.children)
        ShowTree(child, indent + 2);
}

std::string Summary(const Inspection& object) {
    std::string line =
        PaddedTo(KindWord(object.kind), 7) + object.name + "  " + std::to_string(object.bytes) + " bytes";
    if (object.objects > 0)
        line += ", " + std::to_string(object.objects) + " objects";
    if (object.unknown > 0)
        line += ", " + std::to_string(object.unknown) + " unknown properties";
    return line;
}

void Show(const std::vector<Inspection>& objects, bool whole) {
    for (const Inspection& object : objects) {
        PrintResult(Summary(object));
        if (whole && object.text.empty())
            ShowTree(object.root, 2);
        else if (whole)
            PrintResult(object.text);
    }
}

std::vector<Inspection> Asked(DatabaseDesigns& designs, const Arguments& arguments) {
    auto objects = InspectAll(designs);
    std::erase_if(objects, [&](const Inspection& object) {
        const bool otherKind =
            (arguments.objectKind == Arguments::ObjectKind::Form && object.kind != ObjectKind::Form) ||
            (arguments.objectKind == Arguments::ObjectKind::Report && object.kind != ObjectKind::Report);
        return otherKind ||
               (!arguments.object.empty() && !text::EqualsIgnoringCase(object.name, arguments.object));
    });
    if (objects.empty() && !arguments.object.empty())
        throw Stop{"'" + arguments.source + "' holds no design of '" + arguments.object + "'"};
    return objects;
}

int Inspect(const Arguments& arguments) {
    DatabaseDesigns designs(FullPath(arguments.source));
    const auto objects = Asked(designs, arguments);
    const bool whole = !arguments.object.empty();
    if (arguments.json) {
        auto json = nlohmann::ordered_json::array();
        for (const Inspection& object : objects)
            json.push_back(AsJson(object, whole));
        PrintJson(json);
    } else {
        Show(objects, whole);
    }
    bool agrees = designs.Code().faults.empty();
    for (const std::string& fault : designs.Code().faults)
        PrintError("code module " + fault);
    for (const Inspection& object : objects)
        for (const std::string& fault : object.faults) {
            PrintError(std::string(KindWord(object.kind)) + " " + object.name + ": " + fault);
            agrees = false;
        }
    return agrees ? kDone : kFailed;
}

} // namespace

int InspectDatabase(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Inspect(arguments); });
}

} // namespace tovimar::cli
