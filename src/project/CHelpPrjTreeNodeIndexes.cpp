#include "foundation/CAddInProject.h"
#include "foundation/Session.h"
#include "foundation/TextEncodings.h"
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
/// A chunk that is longer than this is written before the next word.
constexpr std::size_t kChunkCharacters = 80;

} // namespace

KeyedList<std::string>& CHelpPrjTreeNode::IndexesCollection() {
    if (!indexesLoaded_)
        LoadIndexes();
    return indexes_;
}

void CHelpPrjTreeNode::SetIndexesCollection(KeyedList<std::string> words) {
    indexes_ = std::move(words);
    indexesLoaded_ = true;
}

void CHelpPrjTreeNode::LoadIndexes() {
    indexesLoaded_ = true;
    AddIndexesText(properties_.ReadAttribute("Indexes"));
    for (int number = 1; number <= kMostKeywordAttributes; ++number) {
        const auto text = properties_.ReadAttribute("Indexes" + std::to_string(number));
        if (text.empty())
            return;
        AddIndexesText(text);
    }
}

void CHelpPrjTreeNode::AddIndexesText(std::string_view text) {
    for (const auto& word : text::Split(text, "|"))
        if (!word.empty() && !indexes_.Contains(word))
            indexes_.Add(word, word);
}

std::string CHelpPrjTreeNode::IndexesXmlStr() {
    std::string out;
    std::string chunk;
    int number = 0;
    const auto writeChunk = [&] {
        out += "  Indexes" + (number == 0 ? std::string() : std::to_string(number)) + " = \"" + chunk + "\" ";
        chunk.clear();
        ++number;
    };
    for (const auto& word : IndexesCollection()) {
        if (text::Length(chunk) > kChunkCharacters)
            writeChunk();
        if (!chunk.empty())
            chunk += '|';
        chunk += EncodeSpecialChars(word);
    }
    if (!chunk.empty())
        writeChunk();
    return out;
}

void CHelpPrjTreeNode::AddIndexLinks(clsHHK& robjIndex) {
    if (Skipped())
        return;
    const auto* project = Session::CurrentProject();
    if (IsObjectNode() && project != nullptr && HelpPrjTree != nullptr &&
        platform::Env().files->FolderExists(project->XmlFormsFolder())) {
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
