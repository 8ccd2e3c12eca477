#include "host/sources/HostSourceProject.h"

#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Session.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/DesignTextCopy.h"
#include "platform/Environment.h"
#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"

#include <cstdio>
#include <unordered_map>
#include <unordered_set>

namespace tovimar {
namespace {

/// Time of day and a fresh identifier: two programs may read at the same moment.
std::string MakeStamp() {
    const platform::DateTime now = platform::Env().clock->Now();
    char digits[16];
    std::snprintf(digits, sizeof digits, "%02d%02d%02d", now.hour % 100, now.minute % 100, now.second % 100);
    const std::string guid = platform::Env().identifiers->NewGuid();
    return digits + ("_" + guid.substr(1, guid.find('-') - 1));
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

HostSourceProject::Pass HostSourceProject::PlainPass(SourceItems& items, const char* subType,
                                                     KeyedList<std::string> names) {
    const std::string word = text::ToLower(subType);
    return {items,
            subType,
            std::move(names),
            "Loading " + (word == "query" ? "queries" : word + "s") + "...",
            "Processing " + word + " [",
            "]...",
            "Source " + word + " skipped ",
            /*readsDesign=*/false,
            "",
            "",
            ObjectTypeOfText(subType)};
}

bool HostSourceProject::IsPassedOver(CTovimarServerAgent&, const std::string&) {
    return false;
}

bool HostSourceProject::Read(const std::string&) {
    CTovimarServerAgent* agent = Session::ServerAgent();
    if (agent == nullptr || Session::Parameters() == nullptr)
        return false;
    const ResultCode failure = Trapped(ClassName(), "IHelpPrjSourceProject_Init", [&] {
        agent->HourglassOn();
        stamp_ = MakeStamp();
        const std::vector<Pass> passes = Passes(*agent);
        for (const Pass& pass : passes)
            maximum_ += static_cast<std::int32_t>(pass.names.Count());
        for (const Pass& pass : passes)
            ReadPass(*agent, pass);
    });
    agent->ProgressMeterRemove();
    agent->HourglassOff();
    return failure == kSuccess;
}

void HostSourceProject::ReadPass(CTovimarServerAgent& agent, const Pass& pass) {
    agent.ProgressMeterInit(pass.loading, maximum_);
    Uses uses;
    for (const std::string& name : pass.names) {
        LeaveIfInterrupted();
        agent.ProgressMeterInit(pass.processing + name + pass.behindName, maximum_);
        agent.ProgressMeterUpdate(++position_);
        const bool own = pass.readsDesign || !IsPassedOver(agent, name);
        if (own && IsUsableName(pass.skipped, name))
            ReadObject(agent, pass, name, uses);
    }
    MarkUsed(pass.items, uses);
}

void HostSourceProject::ReadObject(CTovimarServerAgent& agent, const Pass& pass, const std::string& name,
                                   Uses& uses) {
    std::string caption = name;
    if (pass.readsDesign)
        Trapped(ClassName(), "IHelpPrjSourceProject_Init",
                [&] { caption = ReadTextCopy(agent, pass, name, uses); });
    auto item = std::make_unique<CHelpPrjSourceItem>();
    item->InitFromHost(Name(), name, text::Trim(caption).empty() ? name : caption, pass.subType);
    Add(pass.items, std::move(item));
}

/// The caption; empty when no copy could be made.
std::string HostSourceProject::ReadTextCopy(CTovimarServerAgent& agent, const Pass& pass,
                                            const std::string& name, Uses& uses) const {
    platform::FileSystem& files = *platform::Env().files;
    const std::string path =
        PassingFolder() + pass.filePrefix + stamp_ + "_" + std::to_string(position_) + ".txt";
    agent.SaveAsText(pass.objectType, name, path);
    if (!files.FileExists(path))
        return {};
    std::string bytes;
    const ResultCode failure = Trapped(ClassName(), "ReadTextCopy", [&] { bytes = files.ReadFile(path); });
    files.DeleteFile(path);
    if (failure != kSuccess)
        return {};
    DesignTextCopy copy = ParseDesignTextCopy(platform::access::DecodeExportText(bytes), pass.designWord);
    for (std::string& used : copy.subforms)
        uses.emplace_back(name, std::move(used));
    return std::move(copy.caption);
}

// An object that is shown inside another one gets no topic of its own. Itself, or one that it shows inside
// itself, is no such other one: then neither would have a topic.
void HostSourceProject::MarkUsed(SourceItems& items, const Uses& uses) {
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
