/// A help project that lives on: new objects of its application come in, and all that stands stays.
#include "foundation/CAddInProject.h"
#include "foundation/CTraceLog.h"
#include "foundation/CXMLFile.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarCompiler.h"
#include "generation/RunProgress.h"
#include "host/access/CHelpPrjTreeCF.h"
#include "host/contract/IXmlSerializer.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "topics/CFormHTMLManipulator.h"

#include <algorithm>

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimarCompiler";
constexpr std::size_t kForms = 0;

CHelpPrjTree& Tree() {
    return RunData().Generator().HelpProjectTree();
}

/// False for a kind that the writer left out: it isn't asked for, so nothing is known of its objects.
bool IsAskedFor(const std::string& tag, const CTovimarParameters& parameters) {
    const std::array<std::pair<const char*, bool>, 5> flags = {{{"Form", parameters.GenerateHelpForForms},
                                                                {"Report", parameters.GenerateHelpForReports},
                                                                {"Table", parameters.GenerateHelpForTables},
                                                                {"Query", parameters.GenerateHelpForQueries},
                                                                {"Macro", parameters.GenerateHelpForMacros}}};
    return std::all_of(flags.begin(), flags.end(), [&](const auto& flag) {
        return flag.second || !text::EqualsIgnoringCase(flag.first, tag);
    });
}

bool IsListOf(const ObjectKind& kind, const CHelpPrjTreeNode& node) {
    return node.ProcessCode() == kind.listProcessCode &&
           std::any_of(kind.listTags.begin(), kind.listTags.end(),
                       [&](const char* tag) { return text::EqualsIgnoringCase(node.Tag, tag); });
}

RegenerationReport::Object Described(const CHelpPrjTreeNode& node, const std::string& kind) {
    return {kind, node.Name(), node.GeneratedHTMLFile()};
}

void TellNothingNew() {
    ShowMessage("There are no new objects in the source project", kMsgExclamation, kApplicationTitle, {}, 0,
                "CTovimarCompiler.RegenerateHelpProject");
    if (auto* server = Session::Server())
        server->SetFocusOnHelpEditorForm();
}

/// The list page of a project, open for new links. A run that was stopped may have written some of them.
class ListPage {
public:
    explicit ListPage(const std::string& path) {
        auto& files = *platform::Env().files;
        if (path.empty() || !files.FileExists(path))
            return;
        text_ = files.ReadFile(path);
        open_ = page_.LoadHtmlDocument(path) == kSuccess;
    }
    void Add(const CHelpPrjTreeNode& node) {
        if (!open_ || text::ContainsIgnoringCase(text_, "\"" + node.GeneratedHTMLFile() + "\""))
            return;
        page_.AddHTMLElementToBody("LI", node.HTMLFileRef(/*vfBold=*/true));
        changed_ = true;
    }
    void Save() {
        if (changed_)
            page_.SaveDoc();
        page_.Terminate();
    }

private:
    CFormHTMLManipulator page_;
    std::string text_;
    bool open_ = false;
    bool changed_ = false;
};

} // namespace

ResultCode CTovimarCompiler::RegenerateHelpProject(bool /*vfSkipOpeningOfRecompiledHelp*/) {
    const ResultCode result = Trapped(kClass, "RegenerateHelpProject", [this] {
        const bool found = FindNewObjects();
        TraceText([&] {
            return std::string("CTovimarCompiler.RegenerateHelpProject, NewObjectFound = ") +
                   (found ? "True" : "False");
        });
        if (!found) {
            if (searchResult_ == kSuccess)
                TellNothingNew();
            return;
        }
        FindListNodes();
        FallBackOnOtherLists();
        AddNewFormsAndReports();
        RunRegeneration();
    });
    DropLists();
    return result != kSuccess ? result : searchResult_;
}

bool CTovimarCompiler::FindNewObjects() {
    DropLists();
    report_ = {};
    found_ = {};
    searchResult_ = kSuccess;
    SearchSourceProjects();
    CompareWithTree();
    return NewObjectFound();
}

void CTovimarCompiler::SearchSourceProjects() {
    auto* project = Session::CurrentProject();
    if (!Session::Parameters()->UseProjectGroupAsSource || project == nullptr) {
        searchResult_ = FindNewSourceObjects();
        return;
    }
    project->RefreshSourceProjectsList();
    const std::string list = project->SourceProjectsList();
    TraceText([&] { return "RegenerateHelpProject: SourceProjectsList = " + list; });
    auto& host = HostAgent();
    const std::string remembered = host.CurrentSourceProjectName();
    for (const std::string& name : text::Split(list, "|")) {
        host.SetCurrentSourceProject(name);
        Tree().ForgetSourceProject();
        if (const ResultCode result = FindNewSourceObjects(); result != kSuccess)
            searchResult_ = result;
    }
    host.SetCurrentSourceProject(remembered);
    Tree().ForgetSourceProject();
}

ResultCode CTovimarCompiler::FindNewSourceObjects() {
    return Trapped(kClass, "FindNewSourceObjects", [this] {
        auto& tree = Tree();
        const KnownObjects known(tree);
        tree.SyncGenerateFlagsFromTree();
        const auto source = HostAgent().ParseSourceProject();
        if (source == nullptr)
            return;
        found_.Add(*source);
        const NewSourceObjects objects(*source, known);
        if (!objects.Empty())
            MakeNodes(objects);
    });
}

void CTovimarCompiler::MakeNodes(const IHelpPrjSourceProject& objects) {
    CHelpPrjTreeCF factory;
    for (std::size_t kind = 0; kind < kObjectKinds; ++kind) {
        std::unique_ptr<IXmlSerializer> serializer;
        (factory.*ObjectKinds()[kind].makeSerializer)(serializer);
        if (serializer != nullptr)
            MakeNodes(newNodes_[kind], *serializer, objects);
    }
}

void CTovimarCompiler::MakeNodes(NewNodes& nodes, IXmlSerializer& serializer,
                                 const IHelpPrjSourceProject& objects) {
    for (const std::string& fragment : serializer.XmlCollection(Tree(), objects)) {
        auto document = std::make_shared<XmlDocument>();
        CXMLFile file;
        if (const ResultCode result = file.LoadXml(fragment, *document); result != kSuccess)
            throw RaisedError(result, file.XmlParseError.reason + " in " + text::Left(fragment, 200));
        auto node = std::make_unique<CHelpPrjTreeNode>();
        node->Build(1, document, document->documentElement());
        node->NewUIObject = true;
        if (Session::Parameters()->UseProjectGroupAsSource)
            AssignToProject(*node, HostAgent().CurrentSourceProjectName());
        nodes.push_back(std::move(node));
    }
}

/// Where several applications are open an object is looked for in its own, and two that have one name have a
/// page each: the tree doesn't know yet what the others brought.
void CTovimarCompiler::AssignToProject(CHelpPrjTreeNode& node, const std::string& name) {
    node.SetSourceProjectName(name);
    const std::string file = node.GeneratedHTMLFile();
    std::string page = file;
    for (int number = 1; !newPages_.insert(text::FoldCase(page)).second; ++number)
        page = name + "_" + (number == 1 ? std::string() : std::to_string(number) + "_") + file;
    node.SetGeneratedHTMLFile(page);
}

void CTovimarCompiler::CompareWithTree() {
    for (std::size_t kind = 0; kind < kObjectKinds; ++kind)
        for (const auto& node : newNodes_[kind])
            report_.added.push_back(Described(*node, ObjectKinds()[kind].tag));
    std::vector<CHelpPrjTreeNode*> nodes;
    Tree().CollectObjectNodes(nodes);
    for (const auto& kind : ObjectKinds())
        for (const auto* node : nodes) {
            if (!text::EqualsIgnoringCase(node->Tag, kind.tag))
                continue;
            if (!IsAskedFor(kind.tag, *Session::Parameters()) || found_.Holds(*node))
                ++report_.kept;
            else
                report_.gone.push_back(Described(*node, kind.tag));
        }
}

bool CTovimarCompiler::NewObjectFound() const {
    return std::any_of(newNodes_.begin(), newNodes_.end(),
                       [](const NewNodes& nodes) { return !nodes.empty(); });
}

/// The later of two that match stands.
void CTovimarCompiler::FindListNodes(CHelpPrjTreeNode* start) {
    auto* from = start != nullptr ? start : Tree().Root();
    if (start == nullptr)
        listNodes_ = {};
    if (from == nullptr)
        return;
    for (const auto& child : from->Children()) {
        for (std::size_t kind = 0; kind < kObjectKinds; ++kind)
            if (IsListOf(ObjectKinds()[kind], *child)) {
                listNodes_[kind] = child.get();
                break;
            }
        FindListNodes(child.get());
    }
}

/// The writer may have taken a list node out.
void CTovimarCompiler::FallBackOnOtherLists() {
    if (listNodes_[kForms] == nullptr)
        listNodes_[kForms] = Tree().Root();
    for (auto& node : listNodes_)
        if (node == nullptr)
            node = listNodes_[kForms];
}

void CTovimarCompiler::AddNewFormsAndReports() {
    Trapped(kClass, "AddNewFormsAndReports", [this] {
        for (std::size_t kind = 0; kind < kObjectKinds; ++kind)
            if (!newNodes_[kind].empty() && listNodes_[kind] != nullptr)
                AddToList(*listNodes_[kind], newNodes_[kind]);
    });
}

void CTovimarCompiler::AddToList(CHelpPrjTreeNode& list, NewNodes& nodes) {
    auto& tree = Tree();
    ListPage page(list.GeneratedHTMLFileFullPath());
    for (auto& made : std::exchange(nodes, NewNodes())) {
        auto& node = *made;
        // A node that was copied in the tree may have the key of this object's kind and name.
        if (tree.MapItem(node.Key()) != nullptr) {
            const std::string source = node.SourceProjectName();
            node.SetKey(tree.GetNewKeyIfGivenExists(
                node.Key(), source.empty() ? HostAgent().CurrentSourceProjectName() : source));
        }
        node.Level = list.Level + 1;
        node.SetSkipped(false);
        node.RegenerateHelpFiles = true;
        tree.addItem(&list, std::move(made));
        page.Add(node);
    }
    page.Save();
}

void CTovimarCompiler::RunRegeneration() {
    auto& parameters = *Session::Parameters();
    const bool openEditor = std::exchange(parameters.OpenHTMLEditor, false);
    RunData().Generator().GenerateHelpProject(/*vfCompile=*/false, /*vfBackup=*/false, /*vfSaveChanges=*/true,
                                              /*vfOpenHelp=*/false, /*vfRegenerate=*/true);
    auto* server = Session::Server();
    if (server != nullptr)
        server->CloseEditor();
    HostAgent().Doevents();
    Session::Parameters()->OpenHTMLEditor = openEditor;
    auto& run = Session::Run();
    report_.complete = !run.generationInterrupted && run.runErrorCount == 0;
    if (report_.complete && server != nullptr && Session::CurrentProject() != nullptr)
        server->ReloadTovimarProject(Session::CurrentProject()->TvpFullPath());
    run.generationInterrupted = false;
    run.runErrorCount = 0;
}

void CTovimarCompiler::DropLists() {
    for (auto& nodes : newNodes_)
        nodes.clear();
    newPages_.clear();
    listNodes_ = {};
}

} // namespace tovimar
