#include "host/sources/CSourceProjectMSAccess.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarParameters.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/DesignTextCopy.h"
#include "platform/Environment.h"
#include "platform/access/ExportReader.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"

#include <cstdio>
#include <unordered_map>
#include <unordered_set>

namespace tovimar {
namespace {

constexpr const char* kClass = "CSourceProjectMSAccess";

/// Time of day and a fresh identifier: two programs may read at the same moment.
std::string MakeStamp() {
    const platform::DateTime now = platform::Env().clock->Now();
    char digits[16];
    std::snprintf(digits, sizeof digits, "%02d%02d%02d", now.hour % 100, now.minute % 100, now.second % 100);
    const std::string guid = platform::Env().identifiers->NewGuid();
    return digits + ("_" + guid.substr(1, guid.find('-') - 1));
}

bool IsServerSystemTable(const std::string& name) {
    return (text::Length(name) > 3 && text::StartsWithIgnoringCase(name, "sys")) ||
           text::EqualsIgnoringCase(name, "dtproperties");
}

/// Does `start` show `target` inside itself, at whatever depth?
bool Reaches(const std::unordered_multimap<std::string, std::string>& uses, const std::string& start,
             const std::string& target) {
    std::unordered_set<std::string> seen{start};
    std::vector<std::string> open{start};
    while (!open.empty()) {
        const std::string user = open.back();
        open.pop_back();
        const auto [from, to] = uses.equal_range(user);
        for (auto used = from; used != to; ++used) {
            if (used->second == target)
                return true;
            if (seen.insert(used->second).second)
                open.push_back(used->second);
        }
    }
    return false;
}

} // namespace

/// One of the five lists and its words.
struct CSourceProjectMSAccess::Pass {
    SourceItems& items;
    const char* subType;
    std::int32_t objectType;
    const char* loading;    ///< "Loading tables..."
    std::string processing; ///< "Processing table [", with the name and `behindName` behind it
    const char* behindName;
    const char* skipped;    ///< "Source table skipped "
    const char* filePrefix; ///< of text copies
};

CSourceProjectMSAccess::CSourceProjectMSAccess() = default;
CSourceProjectMSAccess::~CSourceProjectMSAccess() = default;

std::string CSourceProjectMSAccess::ProjectType() const {
    return SourceProjectKind::kMSAccess;
}

ResultCode CSourceProjectMSAccess::Init(const std::string& vstrSourceProjectTypeName,
                                        const std::string& vstrProjectFileFullPath) {
    if (!text::EqualsIgnoringCase(vstrSourceProjectTypeName, SourceProjectKind::kMSAccess))
        return kFailure1;
    CTovimarServerAgent* agent = Session::ServerAgent();
    if (agent == nullptr || Session::Parameters() == nullptr)
        return kFailure1;
    name_ = platform::BaseNameOf(vstrProjectFileFullPath);
    const ResultCode failure = Trapped(kClass, "IHelpPrjSourceProject_Init", [&] { Read(*agent); });
    agent->ProgressMeterRemove();
    agent->HourglassOff();
    if (failure != kSuccess)
        return kFailure1;
    isValid_ = true;
    return kSuccess;
}

void CSourceProjectMSAccess::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    for (const SourceItems* items : {&forms_, &reports_, &tables_, &queries_, &macros_})
        for (const auto& item : *items)
            item->Terminate();
}

void CSourceProjectMSAccess::Read(CTovimarServerAgent& agent) {
    const CTovimarParameters& parameters = *Session::Parameters();
    agent.HourglassOn();
    location_ = agent.CurrentSourceProjectLocation();
    stamp_ = MakeStamp();
    const Names forms = parameters.GenerateHelpForForms ? agent.GetSourceFormsList() : Names();
    const Names reports = parameters.GenerateHelpForReports ? agent.GetSourceReportsList() : Names();
    const Names tables = parameters.GenerateHelpForTables ? agent.GetSourceTablesList() : Names();
    const Names queries = parameters.GenerateHelpForQueries ? agent.GetSourceQueriesList() : Names();
    const Names macros = parameters.GenerateHelpForMacros ? agent.GetSourceMacrosList() : Names();
    maximum_ = static_cast<std::int32_t>(forms.Count() + reports.Count() + tables.Count() + queries.Count() +
                                         macros.Count());

    ReadPlain(agent,
              {tables_, "Table", ObjectType::kTable, "Loading tables...", "Processing table [", "]...",
               "Source table skipped ", ""},
              tables);
    ReadPlain(agent,
              {queries_, "Query", ObjectType::kQuery, "Loading queries...", "Processing query [", "]...",
               "Source query skipped ", ""},
              queries);
    ReadPlain(agent,
              {macros_, "Macro", ObjectType::kMacro, "Loading macros...", "Processing macro [", "]...",
               "Source macro skipped ", ""},
              macros);
    ReadDesigned(agent,
                 {forms_, "Form", ObjectType::kForm, "Loading forms...", "Processing form [", "]...",
                  "Source Form skipped ", "~f_"},
                 forms);
    ReadDesigned(agent,
                 {reports_, "Report", ObjectType::kReport, "Loading reports...", "Processing report ", "...",
                  "Source report skipped ", "~r_"},
                 reports);
}

/// Shows the object at hand. False for a name that can't be taken, of which the user is told.
bool CSourceProjectMSAccess::Begin(CTovimarServerAgent& agent, const Pass& pass, const std::string& name) {
    agent.ProgressMeterInit(pass.processing + name + pass.behindName, maximum_);
    agent.ProgressMeterUpdate(++position_);
    if (name.find('"') == std::string::npos)
        return true;
    ShowMessage(pass.skipped + name + ".\r\nPlease remove double quotes from its name.", kMsgExclamation,
                kApplicationTitle);
    return false;
}

void CSourceProjectMSAccess::AddItem(const Pass& pass, const std::string& name, const std::string& caption) {
    auto item = std::make_unique<CHelpPrjSourceItem>();
    item->InitFromHost(location_, name, caption, pass.subType);
    // Of two names that differ in case only, the first is found by its name.
    pass.items.Add(std::move(item), pass.items.Contains(name) ? std::string() : name);
}

void CSourceProjectMSAccess::ReadPlain(CTovimarServerAgent& agent, const Pass& pass, const Names& names) {
    agent.ProgressMeterInit(pass.loading, maximum_);
    const bool serverClient = !names.Empty() && agent.CurrentSourceProjectIsADPorADE();
    for (const std::string& name : names)
        if (Begin(agent, pass, name) && !(serverClient && IsServerSystemTable(name)))
            AddItem(pass, name, name);
}

void CSourceProjectMSAccess::ReadDesigned(CTovimarServerAgent& agent, const Pass& pass, const Names& names) {
    agent.ProgressMeterInit(pass.loading, maximum_);
    Uses uses;
    for (const std::string& name : names) {
        if (!Begin(agent, pass, name))
            continue;
        std::string caption;
        Trapped(kClass, "IHelpPrjSourceProject_Init",
                [&] { caption = ReadTextCopy(agent, pass, name, uses); });
        AddItem(pass, name, text::Trim(caption).empty() ? name : caption);
    }
    MarkUsed(pass.items, uses);
}

/// The caption; empty when no copy could be made.
std::string CSourceProjectMSAccess::ReadTextCopy(CTovimarServerAgent& agent, const Pass& pass,
                                                 const std::string& name, Uses& uses) {
    platform::FileSystem& files = *platform::Env().files;
    const std::string path =
        TemporaryFolder() + pass.filePrefix + stamp_ + "_" + std::to_string(position_) + ".txt";
    agent.SaveAsText(pass.objectType, name, path);
    if (!files.FileExists(path))
        return {};
    std::string bytes;
    const ResultCode failure = Trapped(kClass, "ReadTextCopy", [&] { bytes = files.ReadFile(path); });
    files.DeleteFile(path);
    if (failure != kSuccess)
        return {};
    DesignTextCopy copy = ParseDesignTextCopy(platform::access::DecodeExportText(bytes), pass.subType);
    for (std::string& used : copy.subforms)
        uses.emplace_back(name, std::move(used));
    return std::move(copy.caption);
}

// An object that is shown inside another one gets no topic of its own. Itself, or one that it shows inside
// itself, is no such other one: then neither would have a topic.
void CSourceProjectMSAccess::MarkUsed(SourceItems& items, const Uses& uses) {
    std::unordered_multimap<std::string, std::string> byUser;
    for (const auto& [user, used] : uses)
        byUser.emplace(text::FoldCase(user), text::FoldCase(used));
    for (const auto& [user, used] : uses) {
        const auto* item = items.Find(used);
        if (item != nullptr && !(*item)->Skipped &&
            !Reaches(byUser, text::FoldCase(used), text::FoldCase(user)) &&
            !text::EqualsIgnoringCase(user, used))
            (*item)->Skipped = true;
    }
}

} // namespace tovimar
