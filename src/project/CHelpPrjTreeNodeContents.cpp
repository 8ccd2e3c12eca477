#include "foundation/ErrorTrap.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjCheckSums.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ComponentFileName.h"
#include "project/ContentsStyle.h"
#include "project/ObjectContents.h"
#include "project/SitemapText.h"
#include "uimodel/CXmlForm.h"

#include <unordered_set>
#include <utility>
#include <vector>

/// The node in the contents file and in the web help's contents. Both list an object's controls from its
/// definition, and both renew the definition only when the topic changed.
namespace tovimar {

namespace {

std::string Indent(std::int32_t level) {
    return std::string(static_cast<std::size_t>(8 * level), ' ');
}

/// Entries of the contents file: a sitemap object per node.
class SitemapStyle : public ContentsStyle {
public:
    explicit SitemapStyle(bool skipSerializers) : skipSerializers_(skipSerializers) {}

    void AppendEntry(std::string& out, std::int32_t level, const std::string& link,
                     const std::string& caption) override {
        const auto indent = Indent(level);
        const auto inner = Indent(level + 1);
        out += indent + "<LI>  <OBJECT type=\"text/sitemap\">" + kCrLf;
        out += inner + "<param name=\"Name\" value=\"" + HhcCaption(caption) + "\">" + kCrLf;
        out += inner + "<param name=\"Local\" value=\"" + link + "\">" + kCrLf;
        out += inner + "</OBJECT>" + kCrLf;
    }
    bool LeafHasList() const override { return true; }
    bool RootHasEntry() const override { return true; }
    bool SkipSerializers() const override { return skipSerializers_; }

private:
    bool skipSerializers_;
};

/// Entries of the web help, and the option lines of its index.
class WebStyle : public ContentsStyle {
public:
    WebStyle(bool skipSerializers, std::string& options)
        : skipSerializers_(skipSerializers), options_(options) {}

    void AppendEntry(std::string& out, std::int32_t level, const std::string& link,
                     const std::string& caption) override {
        out += Indent(level) + "<li>  <a href=\"" + link + "\" target=\"right\">" + HhcCaption(caption) +
               "</a> </li>" + kCrLf;
    }
    void NoteNode(CHelpPrjTreeNode& node) override {
        const auto link = node.ContentsLink();
        AppendOption(link, HhcCaption(node.ContentsText()));
        for (const auto& word : node.IndexesCollection())
            AppendOption(link, text::ReplaceAll(text::ReplaceAll(word, "<", "&lt;"), ">", "&gt;"));
    }
    bool LeafHasList() const override { return false; }
    bool RootHasEntry() const override { return false; }
    bool SkipSerializers() const override { return skipSerializers_; }

private:
    void AppendOption(const std::string& link, const std::string& caption) {
        options_ += "        <option value=\"" + link + "\">" + caption + "</option>" + kCrLf;
    }

    bool skipSerializers_;
    std::string& options_;
};

} // namespace

std::string CHelpPrjTreeNode::ContentsLink() const {
    auto link = GeneratedHTMLFile();
    if (IsControl || IsMenu)
        link += '#' +
                GetComponentAnchor(Parent ? Parent->Name() : platform::BaseNameOf(XmlFormFileName()), Name());
    return text::ReplaceAll(link, "\"", "&quot;");
}

std::string CHelpPrjTreeNode::HHCStr(std::int32_t vlngLevel, bool vfSkipSerializers,
                                     bool /*vfForceContentsRebuild*/) {
    std::string out;
    Trapped("CHelpPrjTreeNode", "HHCStr", [&] {
        SitemapStyle style(vfSkipSerializers);
        AppendContents(out, vlngLevel, style);
    });
    return out;
}

std::string CHelpPrjTreeNode::TreeStr(std::int32_t vlngLevel, std::string& rstrIndexes,
                                      bool vfSkipSerializers, bool /*vfForceContentsRebuild*/) {
    std::string out;
    WebStyle style(vfSkipSerializers, rstrIndexes);
    AppendContents(out, vlngLevel, style);
    return out;
}

void CHelpPrjTreeNode::AppendContents(std::string& out, std::int32_t level, ContentsStyle& style) {
    if (style.SkipSerializers() && HasSerializer())
        return;
    if (level > 1 || style.RootHasEntry()) {
        style.AppendEntry(out, level, ContentsLink(), ContentsText());
        style.NoteNode(*this);
    }
    if (IsObjectNode()) {
        AppendObjectChildren(out, level, style);
        return;
    }
    if (children_.Empty() && !style.LeafHasList())
        return;
    out += Indent(level) + "<UL>" + kCrLf;
    for (const auto& child : children_)
        if (child->HasContentsEntry())
            child->AppendContents(out, level + 1, style);
    out += Indent(level) + "</UL>" + kCrLf;
}

bool CHelpPrjTreeNode::HasContentsEntry() const {
    return !text::EqualsIgnoringCase(Tag, "Label") && !Skipped();
}

void CHelpPrjTreeNode::AppendObjectChildren(std::string& out, std::int32_t level, ContentsStyle& style) {
    LeaveIfInterrupted();
    // What the contents file has renewed a moment ago needn't be renewed for the web help.
    auto contents =
        HelpPrjTree == nullptr ? nullptr : HelpPrjTree->Definitions().KnownContents(XmlFormFullPath());
    bool renew = false;
    if (contents == nullptr)
        renew = RenewDefinition();
    std::string childText;
    std::vector<std::pair<std::string, std::string>> controlTexts;
    const bool running = Session::Run().generationInProgress;
    for (const auto& child : children_) {
        if (!child->HasContentsEntry())
            continue;
        if (!child->IsControl && !child->IsMenu) {
            child->AppendContents(childText, level + 1, style);
        } else if (running) {
            controlTexts.emplace_back(child->Name(), std::string());
            child->AppendContents(controlTexts.back().second, level + 1, style);
        }
    }
    if (contents == nullptr)
        contents = ReadContents(renew);
    if (contents == nullptr)
        return;
    out += Indent(level) + "<UL>" + kCrLf;
    std::unordered_set<std::string> listed;
    for (const auto& entry : contents->entries) {
        style.AppendEntry(out, level + 1, GeneratedHTMLFile() + '#' + entry.anchor, entry.caption);
        listed.insert(text::FoldCase(entry.controlName));
    }
    // A control that the definition lists already has its entry.
    for (const auto& [name, text] : controlTexts)
        if (listed.count(text::FoldCase(name)) == 0)
            out += text;
    out += childText + Indent(level) + "</UL>" + kCrLf;
}

/// True when the control nodes must be made anew. An unchanged topic doesn't cost a parse of its HTML on
/// every build of the contents. A generation has just written its topics, and counts them as changed even
/// where the bytes came out as before: the second run into a folder gives what the first one gave.
bool CHelpPrjTreeNode::RenewDefinition() {
    if (HelpPrjTree == nullptr)
        return false;
    const bool running = Session::Run().generationInProgress;
    bool fileChanged = true;
    bool defsChanged = false;
    if (const auto* checkSum = HelpPrjTree->GetCheckSumObject(GeneratedHTMLFileFullPath()))
        fileChanged = running || checkSum->CheckSumChanged();
    if (fileChanged)
        HelpPrjTree->MakeXmlFormControlDefs(*this, /*external=*/false, {}, defsChanged);
    if (defsChanged)
        DropChildrenControls();
    return (running || defsChanged) && fileChanged;
}

/// Null without a definition.
std::shared_ptr<const ObjectContents> CHelpPrjTreeNode::ReadContents(bool renewControls) {
    const auto form = renewControls ? RenewControls() : LoadXmlForm();
    if (form == nullptr)
        return nullptr;
    const bool incomplete = form->DocumentedControls.Empty() && form->DocumentedMenus.Empty();
    if (incomplete) {
        if (platform::FileNameOf(form->HtmlFullPath()).empty())
            form->SetHtmlFullPath(GeneratedHTMLFileFullPath());
        if (platform::Env().files->FileExists(form->HtmlFullPath()))
            form->MakeDefs(form->HtmlFullPath(), /*vfDoNotReplaceDefsIfTheSame=*/false);
    }
    auto contents = ContentsOf(*form);
    // What was made in memory alone is no part of the definition that the index reads.
    if (HelpPrjTree != nullptr && incomplete)
        HelpPrjTree->Definitions().Forget(XmlFormFullPath());
    if (HelpPrjTree != nullptr && !incomplete)
        return HelpPrjTree->Definitions().NoteContents(XmlFormFullPath(), std::move(contents));
    return std::make_shared<const ObjectContents>(std::move(contents));
}

std::shared_ptr<CXmlForm> CHelpPrjTreeNode::RenewControls() {
    // Control nodes of an earlier load would stand in the way of the new ones with their keys.
    DropChildrenControls();
    auto level = Level;
    auto form = HelpPrjTree->AddControls(*this, level, /*external=*/false, {});
    if (TreeView != nullptr)
        DisplayInTreeview(TreeView, HelpPrjTree, /*vfSkipSerializers=*/true, nullptr, nullptr, nullptr, false,
                          false, /*vfDisplayChildrenOnly=*/true);
    return form;
}

std::string CHelpPrjTreeNode::ContentsHTML(std::int32_t vlngLevel, bool vfSkipControlsNodes) {
    std::string out;
    Trapped("CHelpPrjTreeNode", "ContentsHTML",
            [&] { AppendContentsHtml(out, vlngLevel, vfSkipControlsNodes); });
    return out;
}

void CHelpPrjTreeNode::AppendContentsHtml(std::string& out, std::int32_t level,
                                          bool skipControlsNodes) const {
    const std::string indent(static_cast<std::size_t>(4 * (level - 1)), ' ');
    if (!HasSerializer() && !Skipped())
        out += indent + "<LI><A href=\"" + GeneratedHTMLFile() + "\">" + Caption() + "</A></LI>" + kCrLf;
    bool listOpen = false;
    for (const auto& child : children_) {
        if (child->HasSerializer() || child->Skipped() ||
            (skipControlsNodes && (child->IsControl || child->IsMenu)))
            continue;
        if (!listOpen)
            out += indent + "<UL>" + kCrLf;
        listOpen = true;
        child->AppendContentsHtml(out, level + 1, /*skipControlsNodes=*/true);
    }
    if (listOpen)
        out += indent + "</UL>" + kCrLf;
}

} // namespace tovimar
