#include "cli/Commands.h"
#include "cli/ContextIdTarget.h"
#include "cli/HelpFiles.h"
#include "cli/ProjectSource.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/CTovimarCompiler.h"
#include "generation/FolderOperations.h"
#include "generation/RunProgress.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

namespace tovimar::cli {
namespace {

using Objects = std::vector<RegenerationReport::Object>;

std::string Count(std::size_t count) {
    return std::to_string(count) + (count == 1 ? " object" : " objects");
}

void List(const char* what, const Objects& objects, const char* note) {
    for (const auto& object : objects)
        PrintResult(what + text::ToLower(object.kind) + " \"" + object.name + "\"" + note + object.page);
}

/// One command run: the steps in order, each stops the run by raising.
class Regeneration {
public:
    Regeneration(const Arguments& arguments, Surroundings& surroundings)
        : arguments_(arguments), surroundings_(surroundings), source_(arguments, surroundings) {}

    int Run() {
        surroundings_.Boxes().warningsStop = true;
        source_.Open();
        RunData().LoadSettings();
        if (!LookForNewObjects())
            return TellNothingNew();
        LoadProject();
        return Make();
    }

private:
    bool LookForNewObjects();
    void CheckApplication(const CHelpPrjTree& tree) const;
    int TellNothingNew();
    void LoadProject();
    int Make();
    void Tell(const RegenerationReport& report) const;
    void RefuseLoading() const;

    const Arguments& arguments_;
    Surroundings& surroundings_;
    // Outlives the application.
    ContextIdTarget contextIds_;
    ProjectSource source_;
    CTovimarCompiler compiler_;
};

void Regeneration::RefuseLoading() const {
    // Whatever is wrong has been told by then.
    throw Stop{surroundings_.Boxes().errors > 0
                   ? std::string()
                   : "the project '" + source_.ProjectFile() + "' can't be loaded"};
}

/// Loading a project for work backs it up and renews its definitions. A look at the tree alone writes
/// nothing.
bool Regeneration::LookForNewObjects() {
    if (RunData().ReLoadSettings(source_.ProjectFile(), /*vfLoadSettingsFromTvpFile=*/true) != kSuccess)
        throw Stop{"the options of '" + source_.ProjectFile() + "' can't be read"};
    auto& generator = RunData().Generator();
    if (generator.HelpProjectTree().Load(source_.ProjectFile()) != kSuccess ||
        generator.HelpProjectTree().Root() == nullptr)
        RefuseLoading();
    CheckApplication(generator.HelpProjectTree());
    const bool found = compiler_.FindNewObjects();
    StopIfInterrupted();
    if (compiler_.SearchResult() != kSuccess)
        throw Stop{{}};
    generator.UnLoadTreviewForActiveProject();
    return found;
}

/// Every object of another application would be a new one. Objects that were never documented name none.
void Regeneration::CheckApplication(const CHelpPrjTree& tree) const {
    std::vector<CHelpPrjTreeNode*> nodes;
    tree.CollectObjectNodes(nodes);
    const std::string name = HostAgent().CurrentSourceProjectName();
    std::string other;
    for (const auto* node : nodes) {
        const std::string ofNode = node->SourceProjectName();
        if (text::EqualsIgnoringCase(ofNode, name))
            return;
        if (!ofNode.empty())
            other = ofNode;
    }
    if (!other.empty())
        throw Stop{"the help was made from the application '" + other + "', and this is '" + name +
                   "'; nothing was written"};
}

int Regeneration::TellNothingNew() {
    surroundings_.Progress().Clear();
    PrintResult("There are no new objects in the source project.");
    Tell(compiler_.Report());
    return kDone;
}

void Regeneration::LoadProject() {
    if (TheServer().ReloadTovimarProject(source_.ProjectFile()) != kSuccess)
        RefuseLoading();
    StopIfInterrupted();
    const auto& project = *Session::CurrentProject();
    if (!platform::Env().files->FileExists(project.HHCFullPath()))
        throw Stop{"the help of '" + source_.ProjectFile() +
                   "' wasn't generated yet\n\"tovimar generate\" writes its pages."};
    if (!TestFolderWritable(project.Folder))
        throw Stop{"no write access to '" + project.Folder + "'"};
    if (arguments_.writeBack)
        Session::Parameters()->SaveApplicationChanges = true;
    contextIds_.Attach(arguments_, source_.Application(), SourceChanges::Earlier::Keep);
}

int Regeneration::Make() {
    surroundings_.Boxes().warningsStop = false;
    surroundings_.Progress().Phase("Adding " + Count(compiler_.Report().added.size()) + " to the help");
    RunData().Generator().NodeStarted = [this](const NodeProgress& node) {
        surroundings_.Progress().Object(node.kind, node.name, node.position, node.maximum);
    };
    compiler_.RegenerateHelpProject();
    surroundings_.Progress().Clear();
    StopIfInterrupted();
    Tell(compiler_.Report());
    contextIds_.Tell(arguments_, source_.Source());
    ShowWebHelpAndProject();
    if (!compiler_.Report().complete || surroundings_.Boxes().errors > 0)
        return kFailed;
    // One that came from elsewhere is known from now on.
    Session::Projects()->Save();
    PrintHint("\"tovimar recompile\" compiles the help with its new pages.");
    return kDone;
}

void Regeneration::Tell(const RegenerationReport& report) const {
    List("New:           ", report.added, " in ");
    List("Gone:          ", report.gone, " isn't in the application any more; its page stays: ");
    PrintResult("Kept:          " + Count(report.kept) + " with the pages as they are");
}

} // namespace

int Regenerate(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Regeneration(arguments, surroundings).Run(); });
}

} // namespace tovimar::cli
