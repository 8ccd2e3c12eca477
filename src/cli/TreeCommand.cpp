#include "cli/AnsweredStep.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "cli/KeptIcons.h"
#include "cli/ProjectFile.h"
#include "cli/ProjectReading.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "cli/TouchedFiles.h"
#include "cli/TreeNodeNames.h"
#include "cli/TreeSteps.h"
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/InputBox.h"
#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "platform/xml/XmlDocument.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ListTreeView.h"
#include "project/clsTreeViewManipulator.h"
#include "project/frmHHCEntryIndexKeywords.h"

#include <algorithm>
#include <nlohmann/json.hpp>

namespace tovimar::cli {
namespace {

using Manipulation = void (clsTreeViewManipulator::*)();

bool ShowsIndex(const TreeStep& step) {
    return step.operation == "index" && step.arguments.size() == 1;
}

bool OnlyShows(const TreeStep& step) {
    return step.operation == "xml" || ShowsIndex(step);
}

/// One command run: the steps in order, saved together behind the last one.
class TreeRun {
public:
    explicit TreeRun(const Arguments& arguments)
        : arguments_(arguments), steps_(TreeStepsOf(arguments.words)),
          file_(FindProjectFile(arguments.project)), reading_(file_) {}
    ~TreeRun() {
        SetInputBox({});
        frmHHCEntryIndexKeywords::ShowDialog = {};
        manipulator_.Terminate();
    }
    TreeRun(const TreeRun&) = delete;
    TreeRun& operator=(const TreeRun&) = delete;

    int Run() {
        Load();
        for (const TreeStep& step : steps_) {
            StopIfInterrupted();
            Perform(step);
        }
        if (changed_)
            Save();
        touched_.Keep();
        if (arguments_.json)
            PrintJson(results_);
        return kDone;
    }

private:
    CHelpPrjTree& Tree() const { return RunData().Generator().HelpProjectTree(); }
    void Load();
    void KeepIdentifiers() const;
    void KeepPicturesFolder() const;
    void Perform(const TreeStep& step);
    void RememberFiles(const TreeStep& step, const CHelpPrjTreeNode& node);
    void Operate(const TreeStep& step);
    void Simply(Manipulation operation) { (manipulator_.*operation)(); }
    void Delete();
    void SetSkipped(CHelpPrjTreeNode& node, bool skipped);
    void Index(const TreeStep& step);
    void ShowIndex(const KeyedList<std::string>& entries);
    void Tell(const TreeStep& step);
    void Save();

    const Arguments& arguments_;
    std::vector<TreeStep> steps_;
    std::string file_;
    /// Before the reading: the tree that this frees takes its nodes from the view.
    ListTreeView view_;
    ProjectReading reading_;
    clsTreeViewManipulator manipulator_;
    std::optional<KeptIcons> icons_;
    /// Pages and definitions: a step that can't be done must leave nothing of those before it.
    TouchedFiles touched_;
    nlohmann::ordered_json results_ = nlohmann::ordered_json::array();
    std::vector<std::string> shownEntries_;
    bool changed_ = false;
};

void TreeRun::Load() {
    if (!std::all_of(steps_.begin(), steps_.end(), OnlyShows) && !TheServer().BackUpHelpProjectFile(file_))
        throw Stop{{}};
    if (RunData().Generator().LoadTreviewForActiveProject() != kSuccess || Tree().Root() == nullptr)
        throw Stop{{}};
    icons_.emplace(Tree());
    Tree().DisplayInTreeview(&view_);
    manipulator_.Init(&view_, &Tree());
    KeepIdentifiers();
    KeepPicturesFolder();
}

/// As the project file spells it, with or without a backslash.
void TreeRun::KeepPicturesFolder() const {
    auto& project = *Session::CurrentProject();
    const std::string spelled = Tree().Root()->PicsSubfolderName();
    if (platform::WithTrailingBackslash(spelled) ==
        platform::WithTrailingBackslash(project.PicsSubfolderName))
        project.PicsSubfolderName = spelled;
}

/// A project that the catalogue doesn't know has them in its file alone.
void TreeRun::KeepIdentifiers() const {
    auto& project = *Session::CurrentProject();
    XmlDocument document;
    if (!project.SUID.empty() || !document.load(file_))
        return;
    const XmlNode root = document.selectSingleNode("//TovimarProject/Project");
    project.SUID = root.attribute("SUID");
    project.HUID = root.attribute("HUID");
}

void TreeRun::Perform(const TreeStep& step) {
    if (!step.arguments.empty()) {
        auto& node = FindNode(Tree(), step.arguments.front());
        if (node.TreeViewNode == nullptr)
            throw Stop{"'" + step.arguments.front() + "' can't be worked on"};
        node.TreeViewNode->SetSelected(true);
        RememberFiles(step, node);
    }
    manipulator_.RetCode = kGeneralFailure;
    Operate(step);
    if (manipulator_.RetCode != kSuccess)
        throw Stop{"\"" + step.operation + (step.arguments.empty() ? "" : " " + step.arguments.front()) +
                   "\" can't be done; nothing was saved"};
    changed_ = changed_ || !OnlyShows(step);
    Tell(step);
}

void TreeRun::RememberFiles(const TreeStep& step, const CHelpPrjTreeNode& node) {
    const std::string folder = platform::WithTrailingBackslash(Session::CurrentProject()->Folder);
    if (step.operation == "delete")
        touched_.Remember(node.GeneratedHTMLFileFullPath());
    else if (step.operation == "index" && step.arguments.size() > 1)
        touched_.Remember(node.XmlFormFullPath());
    else if (step.operation == "new")
        touched_.Remember(folder + NormalizeName(step.arguments[1]) + ".htm");
    else if (step.operation == "add")
        touched_.Remember(
            folder + platform::FileNameOf(platform::Env().files->FromNative(FullPath(step.arguments[1]))));
}

void TreeRun::Operate(const TreeStep& step) {
    using Manipulator = clsTreeViewManipulator;
    const std::vector<std::pair<const char*, Manipulation>> simple = {
        {"up", &Manipulator::Up},       {"down", &Manipulator::Down},
        {"left", &Manipulator::Left},   {"right", &Manipulator::Right},
        {"cut", &Manipulator::Cut},     {"copy", &Manipulator::Copy},
        {"paste", &Manipulator::Paste}, {"paste-special", &Manipulator::PasteSpecial},
        {"undo", &Manipulator::Undo}};
    for (const auto& [name, operation] : simple)
        if (step.operation == name)
            return Simply(operation);
    auto* selected = Tree().MapItem(view_.SelectedItem()->Key());
    if (step.operation == "delete")
        Delete();
    else if (step.operation == "skip" || step.operation == "unskip")
        SetSkipped(*selected, step.operation == "skip");
    else if (step.operation == "index")
        Index(step);
    else if (step.operation == "xml")
        PrintRaw(manipulator_.GetXML() + "\n");
    else if (step.operation == "move")
        manipulator_.MoveNode(FindNode(Tree(), step.arguments[1]).TreeViewNode, selected->TreeViewNode);
    else if (step.operation == "add")
        manipulator_.AddSelected(platform::Env().files->FromNative(FullPath(step.arguments[1])));
    else {
        // A title whose page exists is refused; there is no other one to offer then.
        SetInputBox([asked = false](const auto&, const auto&, const std::string& title) mutable {
            return std::exchange(asked, true) ? std::string() : title;
        });
        std::string title;
        manipulator_.AddNew(step.arguments[1], title);
    }
}

void TreeRun::Delete() {
    if (arguments_.pages == Arguments::Pages::Ask) {
        manipulator_.Delete();
        if (manipulator_.RetCode != kSuccess)
            throw Stop{"nothing was deleted\n--delete-page and --keep-page say what becomes of the page."};
        return;
    }
    const AnsweredStep answered(arguments_.pages == Arguments::Pages::Delete ? platform::kAnswerYes
                                                                             : platform::kAnswerNo);
    manipulator_.Delete();
}

void TreeRun::SetSkipped(CHelpPrjTreeNode& node, bool skipped) {
    if (node.Parent == nullptr || !HasNumber(node))
        throw Stop{"'" + node.ContentsText() + "' can't be left out by itself"};
    if (node.Skipped() != skipped)
        manipulator_.ToggleSkippedFlag();
    manipulator_.RetCode = node.Skipped() == skipped ? kSuccess : kGeneralFailure;
}

void TreeRun::Index(const TreeStep& step) {
    const bool shows = ShowsIndex(step);
    frmHHCEntryIndexKeywords::ShowDialog = [&](frmHHCEntryIndexKeywords& dialog) {
        if (shows) {
            ShowIndex(dialog.IndexesCollection());
            return;
        }
        dialog.SetIndexesCollection({});
        for (std::size_t word = 1; word < step.arguments.size(); ++word) {
            dialog.EntryChange(step.arguments[word]);
            dialog.AddClick();
        }
        dialog.OKClick();
    };
    manipulator_.EditIndex();
    if (!shows && manipulator_.RetCode != kSuccess)
        throw Stop{"'" + step.arguments.front() + "' keeps its index entries: it needs one at least"};
    if (shows)
        manipulator_.RetCode = kSuccess;
}

void TreeRun::ShowIndex(const KeyedList<std::string>& entries) {
    shownEntries_.clear();
    for (const std::string& entry : entries) {
        shownEntries_.push_back(entry);
        if (!arguments_.json)
            PrintResult(entry);
    }
}

/// Of the entry that the step leaves selected.
void TreeRun::Tell(const TreeStep& step) {
    const auto* selected = view_.SelectedItem();
    const auto* node = selected == nullptr ? nullptr : Tree().MapItem(selected->Key());
    if (step.operation == "xml" || node == nullptr)
        return;
    const std::string number = HasNumber(*node) ? NodeNumber(*node) : std::string();
    const bool shows = ShowsIndex(step);
    if (arguments_.json) {
        nlohmann::ordered_json result{{"operation", step.operation},
                                      {"number", number},
                                      {"caption", node->ContentsText()},
                                      {"page", node->GeneratedHTMLFile()},
                                      {"key", node->Key()}};
        if (shows)
            result["index"] = shownEntries_;
        results_.push_back(std::move(result));
    } else if (!shows && step.operation != "cut" && step.operation != "delete" && step.operation != "copy") {
        PrintResult(number + "  " + node->ContentsText() + "  " + node->GeneratedHTMLFile());
    }
}

void TreeRun::Save() {
    // The neighbours in the view are of no use to a file without one.
    Tree().LeaveTreeview();
    icons_->PutBack(Tree());
    if (Session::Projects()->Save(file_) != kSuccess)
        throw Stop{{}};
    Tree().WasChanged = false;
    if (!arguments_.json)
        PrintHint("\"tovimar recompile\" makes contents, index and help again.");
}

} // namespace

int EditTree(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] {
        if (!arguments.words.empty())
            return TreeRun(arguments).Run();
        auto shown = arguments;
        shown.leftOut = shown.numbers = true;
        return ShowContents(shown, surroundings);
    });
}

} // namespace tovimar::cli
