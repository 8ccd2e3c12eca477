#include "generation/NewObjects.h"

#include "host/contract/IClassFactory.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>

namespace tovimar {
namespace {

std::string NameAndKind(const std::string& name, const std::string& tag) {
    return text::FoldCase(name) + '\n' + text::FoldCase(tag);
}

std::string InProject(const std::string& nameAndKind, const std::string& project) {
    return nameAndKind + '\n' + text::FoldCase(project);
}

} // namespace

const std::array<ObjectKind, kObjectKinds>& ObjectKinds() {
    using Source = IHelpPrjSourceProject;
    using Factory = IClassFactory;
    static const std::array<ObjectKind, kObjectKinds> kinds = {{
        {"Form", {"Dialogs", "Forms"}, 1, &Source::Forms, &Factory::CreateFormsListObject},
        {"Report", {"Reports", ""}, 2, &Source::Reports, &Factory::CreateReportsListObject},
        {"Table", {"Tables", ""}, 3, &Source::Tables, &Factory::CreateTablesListObject},
        {"Query", {"Queries", ""}, 4, &Source::Queries, &Factory::CreateQueriesListObject},
        {"Macro", {"Macros", ""}, 5, &Source::Macros, &Factory::CreateMacrosListObject},
        {"Worksheet", {"Worksheets", ""}, 81, &Source::Worksheets, &Factory::CreateWorksheetsListObject},
        {"Chart", {"Charts", ""}, 82, &Source::Charts, &Factory::CreateChartsListObject},
    }};
    return kinds;
}

KnownObjects::KnownObjects(const CHelpPrjTree& tree) {
    std::vector<CHelpPrjTreeNode*> nodes;
    tree.CollectObjectNodes(nodes);
    for (const auto* node : nodes)
        projects_[NameAndKind(node->Name(), node->Tag)].push_back(text::FoldCase(node->SourceProjectName()));
}

bool KnownObjects::NodeExists(const std::string& name, const std::string& tag,
                              const std::string& sourceProjectName) const {
    const auto found = projects_.find(NameAndKind(name, tag));
    if (found == projects_.end())
        return false;
    const std::string project = text::FoldCase(sourceProjectName);
    return std::any_of(found->second.begin(), found->second.end(),
                       [&](const std::string& ofNode) { return ofNode.empty() || ofNode == project; });
}

NewSourceObjects::NewSourceObjects(const IHelpPrjSourceProject& source, const KnownObjects& known)
    : SourceProjectLists("NewSourceObjects", "") {
    const std::array<SourceItems*, kObjectKinds> lists = {&forms_,  &reports_,    &tables_, &queries_,
                                                          &macros_, &worksheets_, &charts_};
    for (std::size_t kind = 0; kind < kObjectKinds; ++kind)
        for (const auto& item : (source.*ObjectKinds()[kind].items)())
            if (!known.NodeExists(item->FormName, ObjectKinds()[kind].tag, item->ProjectName))
                Add(*lists[kind], std::make_unique<CHelpPrjSourceItem>(*item));
}

bool NewSourceObjects::Empty() const {
    return std::all_of(ObjectKinds().begin(), ObjectKinds().end(),
                       [this](const ObjectKind& kind) { return (this->*kind.items)().Empty(); });
}

void SourceObjects::Add(const IHelpPrjSourceProject& source) {
    for (const auto& kind : ObjectKinds())
        for (const auto& item : (source.*kind.items)()) {
            const std::string object = NameAndKind(item->FormName, kind.tag);
            objects_.insert(InProject(object, item->ProjectName));
            objects_.insert(InProject(object, {}));
        }
}

bool SourceObjects::Holds(const CHelpPrjTreeNode& node) const {
    return objects_.contains(InProject(NameAndKind(node.Name(), node.Tag), node.SourceProjectName()));
}

} // namespace tovimar
