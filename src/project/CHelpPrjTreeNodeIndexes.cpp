#include "foundation/CAddInProject.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ObjectContents.h"
#include "project/clsHHK.h"
#include "uimodel/CXmlForm.h"

/// Keywords of a node.
namespace tovimar {

namespace {

constexpr int kMostKeywordAttributes = 100;

void AddWords(KeyedList<std::string>& list, std::string_view text) {
    for (const auto& word : text::Split(text, "|"))
        if (!word.empty() && !list.Contains(word))
            list.Add(word, word);
}

} // namespace

KeyedList<std::string>& CHelpPrjTreeNode::IndexesCollection() {
    if (indexes_ == nullptr)
        LoadIndexes();
    return *indexes_;
}

void CHelpPrjTreeNode::SetIndexesCollection(KeyedList<std::string> words) {
    indexes_ = std::make_unique<KeyedList<std::string>>(std::move(words));
}

void CHelpPrjTreeNode::LoadIndexes() {
    indexes_ = std::make_unique<KeyedList<std::string>>();
    AddWords(*indexes_, properties_.ReadAttribute("Indexes"));
    for (int number = 1; number <= kMostKeywordAttributes; ++number) {
        const auto text = properties_.ReadAttribute("Indexes" + std::to_string(number));
        if (text.empty())
            return;
        AddWords(*indexes_, text);
    }
}

void CHelpPrjTreeNode::AddIndexLinks(clsHHK& robjIndex) {
    if (Skipped())
        return;
    const auto* project = Session::CurrentProject();
    if (IsObjectNode() && project != nullptr && HelpPrjTree != nullptr &&
        platform::Env().files->FolderExists(project->XmlFormsFolder())) {
        LeaveIfInterrupted();
        auto& definitions = HelpPrjTree->Definitions();
        if (const auto known = definitions.KnownContents(XmlFormFullPath()))
            robjIndex.AddLinks(known->links, known->topicFile);
        else if (const auto form = definitions.Load(XmlFormFullPath()))
            robjIndex.AddXmlFormLinks(*form, GeneratedHTMLFile());
    }
    for (const auto& word : IndexesCollection())
        robjIndex.AddCustomLink(Caption(), word, GeneratedHTMLFile(), {});
    for (const auto& child : children_)
        child->AddIndexLinks(robjIndex);
}

} // namespace tovimar
