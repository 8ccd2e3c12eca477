#include "host/access/AccObjectsList.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <cstdio>

namespace tovimar {
namespace {

bool IsKept(char32_t character) {
    return character == 32 || character == 33 || (character >= 35 && character <= 37) ||
           (character >= 40 && character <= 44) || character == 46 || (character >= 48 && character <= 58) ||
           character == 61 || (character >= 63 && character <= 91) || character == 93 || character == 95 ||
           (character >= 97 && character <= 125) || (character >= 0x410 && character <= 0x44F) ||
           character == 0x401 || character == 0x451 || (character >= 225 && character <= 239);
}

/// The escaping of the system's own files, but every character by its code point and no entity taken for
/// one: the name that is read back is the object's name whatever letters it holds.
std::string Encoded(const std::string& text) {
    std::string encoded;
    encoded.reserve(text.size());
    for (const char32_t character : text::ToCodePoints(text)) {
        if (IsKept(character))
            encoded += text::FromCodePoint(character);
        else if (character >= 32 || character == '\t' || character == '\r' || character == '\n')
            encoded.append("&#").append(std::to_string(static_cast<std::uint32_t>(character))).append(";");
    }
    return encoded;
}

std::string TimeOfDay() {
    const platform::DateTime now = platform::Env().clock->Now();
    char digits[16];
    std::snprintf(digits, sizeof digits, "%02d%02d%02d", now.hour % 100, now.minute % 100, now.second % 100);
    return digits;
}

/// None for forms and reports.
std::string DescriptionOf(std::int32_t objectType, const std::string& name) {
    CTovimarServerAgent* agent = Session::ServerAgent();
    if (agent == nullptr)
        return {};
    switch (objectType) {
    case ObjectType::kTable:
        return agent->GetComponentDescription(name);
    case ObjectType::kQuery:
        return agent->GetQueryDescription(name);
    case ObjectType::kMacro:
        return agent->GetMacroDescription(name);
    default:
        return {};
    }
}

} // namespace

std::string AccObjectsList::XmlText() {
    std::string text;
    for (const std::string& fragment : fragments_)
        text.append(fragment).append("\r\n");
    return text;
}

const KeyedList<std::string>& AccObjectsList::XmlCollection(CHelpPrjTree& robjTree,
                                                            const IHelpPrjSourceProject& rprj) {
    Trapped(kind_.className, "IXmlSerializer_XmlCollection", [&] {
        given_.clear();
        for (const auto& item : (rprj.*kind_.items)()) {
            LeaveIfInterrupted();
            fragments_.Add(Fragment(robjTree, *item));
        }
    });
    return fragments_;
}

std::string AccObjectsList::Fragment(CHelpPrjTree& tree, const CHelpPrjSourceItem& item) {
    const CTovimarParameters& parameters = *Session::Parameters();
    const std::string project = Encoded(parameters.HelpProjectName());
    const std::string name = Encoded(item.FormName);
    const std::string display = parameters.IdentifyControls == 0 ? name : Encoded(item.FormCaption);
    const bool canBeSkipped =
        kind_.objectType == ObjectType::kForm || kind_.objectType == ObjectType::kReport;
    const std::string description = DescriptionOf(kind_.objectType, item.FormName);

    std::string fragment = "<";
    fragment.append(kind_.element).append(" Name=\"").append(name);
    fragment.append("\" Key=\"").append(project).append(".").append(kind_.word).append(name);
    fragment.append("\" caption=\"").append(display);
    fragment.append("\" icon = \"form\" ProcessCode=\"999\" GeneratedHTMLFile = \"");
    fragment.append(Encoded(FreeFileName(tree, parameters.HelpProjectName(), item.FormNameNormalized())));
    fragment.append("\" TemplateHTMLFile = \"Form.htm\" title = \"").append(Encoded(item.FormCaption));
    fragment.append("\" type = \"").append(std::to_string(kind_.objectType));
    fragment.append("\" Skipped = \"").append(canBeSkipped && item.Skipped ? "-1" : "0");
    fragment.append("\" ExtraValue = \"\"");
    if (!description.empty())
        fragment.append(" Description = \"").append(Encoded(description)).append("\"");
    return fragment += "/>";
}

bool AccObjectsList::Taken(CHelpPrjTree& tree, const std::string& file) const {
    if (given_.count(text::FoldCase(file)) != 0)
        return true;
    return tree.Root() != nullptr && tree.Root()->NodeFileNameDefined(file);
}

// Objects whose names normalise to the same text are told apart by the source project's name, then by the
// time of day, then by a number.
std::string AccObjectsList::FreeFileName(CHelpPrjTree& tree, const std::string& project,
                                         const std::string& base) {
    const std::string stem = project + "_" + kind_.word + base;
    std::string file = stem + ".htm";
    if (Taken(tree, file)) {
        CTovimarServerAgent* agent = Session::ServerAgent();
        file = (agent == nullptr ? std::string() : agent->CurrentSourceProjectName()) + "_" + file;
        const std::string timed = stem + "_" + TimeOfDay();
        for (int number = 1; Taken(tree, file); ++number)
            file = timed + (number == 1 ? std::string() : "_" + std::to_string(number)) + ".htm";
    }
    given_.insert(text::FoldCase(file));
    return file;
}

clsAccFormsList::clsAccFormsList()
    : AccObjectsList({"clsAccFormsList", "FORM", "Form_", ObjectType::kForm, &IHelpPrjSourceProject::Forms}) {
}

clsAccReportsList::clsAccReportsList()
    : AccObjectsList(
          {"clsAccReportsList", "REPORT", "Report_", ObjectType::kReport, &IHelpPrjSourceProject::Reports}) {}

clsAccTablesList::clsAccTablesList()
    : AccObjectsList(
          {"clsAccTablesList", "TABLE", "Table_", ObjectType::kTable, &IHelpPrjSourceProject::Tables}) {}

clsAccQueriesList::clsAccQueriesList()
    : AccObjectsList(
          {"clsAccQueriesList", "QUERY", "Query_", ObjectType::kQuery, &IHelpPrjSourceProject::Queries}) {}

clsAccMacrosList::clsAccMacrosList()
    : AccObjectsList(
          {"clsAccMacrosList", "MACRO", "Macro_", ObjectType::kMacro, &IHelpPrjSourceProject::Macros}) {}

} // namespace tovimar
