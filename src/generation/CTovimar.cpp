#include "generation/CTovimar.h"

#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/CTraceLog.h"
#include "foundation/ErrorTrap.h"
#include "foundation/Paths.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "foundation/ShowMessage.h"
#include "generation/CTovimarCompiler.h"
#include "generation/FolderOperations.h"
#include "generation/HelpUtilities.h"
#include "generation/IHelpWizardForm.h"
#include "generation/RunProgress.h"
#include "generation/clsFrmRptHelpContextIds.h"
#include "generation/clsHtmlHelp.h"
#include "host/access/CHelpPrjTreeCF.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/clsHHK.h"

namespace tovimar {
namespace {

constexpr const char* kClass = "CTovimar";

bool Interrupted() {
    return Session::Run().generationInterrupted;
}

bool FileExists(const std::string& path) {
    return !path.empty() && platform::Env().files->FileExists(path);
}

/// A program without windows has none, and then asks nothing about it.
bool HasEditor() {
    return Session::Server() != nullptr && Session::Server()->MakeHelpEditorForm;
}

constexpr const char* kErrorsQuestion =
    "Errors have been detected during help generation. \r\n"
    "You can either try to make changes in the source project \r\n"
    "and regenerate or you may ignore the errors and \r\n"
    "start the Help Editor. Starting the Help Editor \r\n"
    "could result in new error messages because the generated \r\n"
    "help project may be broken.\r\n"
    "\r\n"
    "Note: in most cases the generated help project will NOT be broken.\r\n"
    "\r\n"
    "Would you like to open Help Editor?";

} // namespace

/// Where one run writes.
struct CTovimar::RunPaths {
    std::string folder;
    std::string compiledFile;
    std::string copiedFile;
};

CTovimar::CTovimar()
    : parameters_(std::make_unique<CTovimarParameters>()), helpIndex_(std::make_unique<clsHHK>()) {
    Session::SetGenerator(this);
    Session::SetParameters(parameters_.get());
}

CTovimar::~CTovimar() {
    Terminate();
    if (Session::Generator() != this)
        return;
    Session::SetGenerator(nullptr);
    Session::SetParameters(nullptr);
}

void CTovimar::Terminate() {
    if (terminated_)
        return;
    terminated_ = true;
    if (helpContextIds_ != nullptr)
        helpContextIds_->Terminate();
    helpContextIds_.reset();
    UnLoadTreviewForActiveProject();
    SetHelpProjectTree(nullptr);
}

void CTovimar::SetParameters(std::unique_ptr<CTovimarParameters> parameters) {
    parameters_ = std::move(parameters);
    Session::SetParameters(parameters_.get());
}

CHelpPrjTree& CTovimar::HelpProjectTree() {
    if (tree_ == nullptr)
        SetHelpProjectTree(std::make_unique<CHelpPrjTree>());
    return *tree_;
}

void CTovimar::SetHelpProjectTree(std::unique_ptr<CHelpPrjTree> tree) {
    tree_ = std::move(tree);
    Session::SetHelpProjectTree(tree_.get());
}

clsFrmRptHelpContextIds& CTovimar::HelpContextIds() {
    if (helpContextIds_ == nullptr)
        helpContextIds_ = std::make_unique<clsFrmRptHelpContextIds>();
    return *helpContextIds_;
}

void CTovimar::Generate() {
    GenerateHelpProject(/*vfCompile=*/true, /*vfBackup=*/false, parameters_->SaveApplicationChanges,
                        parameters_->OpenHTMLHelp, /*vfRegenerate=*/false);
}

void CTovimar::GenerateHelpProject(bool vfCompile, bool vfBackup, bool vfSaveChanges, bool vfOpenHelp,
                                   bool vfRegenerate) {
    RunPaths paths;
    int step = 0;
    Trapped(
        kClass, "GenerateHelpProject",
        [&] {
            const auto* project = Session::CurrentProject();
            if (vfRegenerate && project != nullptr) {
                paths = {project->Folder, project->CHMFullPath(), {}};
                parameters_->SetFolderForGeneratedHelp(project->Folder);
            } else {
                paths = {parameters_->FolderForGeneratedHelp(), parameters_->CompiledHelpFullPath(), {}};
            }
            auto& run = Session::Run();
            run.generationInterrupted = false;
            run.runErrorCount = 0;
            step = 1;
            if (vfBackup)
                MakeBackupForFolder(paths.folder);
            GenerateHTMLForProject(vfCompile, vfRegenerate);
            if (!run.generationInterrupted && run.runErrorCount == 0)
                CompleteGeneration(paths, vfSaveChanges, vfOpenHelp, step);
            else if (run.runErrorCount > 0 && parameters_->OpenHTMLEditor)
                OfferEditorAfterErrors();
        },
        [&] {
            if (step < 1 || step > 4)
                return std::string();
            return "Step = " + std::to_string(step) + "\r\nFolderForGeneratedHelp = " + paths.folder +
                   "\r\nCompiledHelpFileFullPath = " + paths.compiledFile +
                   "\r\nCopiedHelpFileFullPath = " + paths.copiedFile;
        });
    PassOver([] { RunData().ProgressBarDispose(); });
}

void CTovimar::CompleteGeneration(RunPaths& paths, bool vfSaveChanges, bool vfOpenHelp, int& step) {
    auto& host = HostAgent();
    RunData().ProgressBarInit("Completing help generation", 5);
    if (FileExists(paths.compiledFile)) {
        paths.copiedFile = CTovimarCompiler().GetCopiedHelpFullPath();
        step = 2;
        if (vfSaveChanges) {
            RunData().ProgressBarUpdate("Setting HTML help for current source project...", 1);
            host.SetHelpFileForCurrentSourceProject(paths.copiedFile);
        }
    }
    step = 3;
    RunData().ProgressBarUpdate("Saving changes of the source project", 2);
    host.SaveMakeRun(vfSaveChanges, /*makeApp=*/false, /*runApp=*/false);
    step = 4;
    if (vfOpenHelp &&
        text::EqualsIgnoringCase(host.CurrentSourceProjectTypeName(), SourceProjectKind::kAspNet)) {
        Session::Server()->OpenWebHelpOfActiveProject();
    } else if (vfOpenHelp && FileExists(paths.compiledFile)) {
        RunData().ProgressBarUpdate("Opening generated and compiled HTML help...", 3);
        RunData().HtmlHelp().OpenTOC(paths.compiledFile, 0);
    }
    if (parameters_->OpenHTMLEditor)
        OpenEditor();
}

void CTovimar::OfferEditorAfterErrors() {
    if (!HasEditor())
        return;
    const int answer = ShowMessage(kErrorsQuestion, kMsgYesNo | kMsgDefaultSecond, kApplicationTitle);
    if (answer != platform::kAnswerYes)
        return;
    auto& run = Session::Run();
    // Below zero the error limit can't fire while the editor works.
    run.runErrorCount = -run.runErrorCount;
    run.generationInterrupted = false;
    OpenEditor();
}

void CTovimar::OpenEditor() {
    if (!HasEditor())
        return;
    platform::Env().doEvents();
    RunData().ProgressBarUpdate("Opening HTML help editor form...", 4);
    Session::Server()->OpenHelpEditorForm();
    Session::Server()->SetFocusToHTMLEditor();
}

ResultCode CTovimar::GenerateHTMLForProject(bool /*vfCompile*/, bool vfRegenerate) {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "GenerateHTMLForProject", [&] {
        const Hourglass hourglass;
        const HostMeter meter("Starting help Generation...", 3);
        helpIndex_->Terminate();
        helpIndex_ = std::make_unique<clsHHK>();
        CompilerOutput.clear();
        CompilerExitCode = 0;
        CreateFolderPath(parameters_->FolderForGeneratedImages());
        for (const auto& folder :
             {parameters_->FolderForGeneratedHelp(), parameters_->FolderForGeneratedImages(),
              platform::Join(parameters_->FolderForGeneratedHelp(), "xml")})
            RemoveUnfinishedFiles(folder);
        // Pages, context ids, contents and index of one run all ask for the same definitions.
        const DefinitionCache::Holder definitions(HelpProjectTree().Definitions());

        TraceTimestamp("Creating HTML Files.");
        result = CreateHtmlFiles(vfRegenerate);
        if (Interrupted() || result != kSuccess)
            return;
        TraceTimestamp("Creating HHC and HHK Files.");
        result = CreateHHCandHHKFiles();
        if (Interrupted() || result != kSuccess)
            return;
        TraceTimestamp("Creating HHO and related Files.");
        result = CreateHHPAndRelatedFiles({});
        if (Interrupted())
            return;
        if (result != kSuccess)
            ShowMessage("Errors occurred during help generation - check the Folder:\r\n\r\n" +
                            parameters_->FolderForGeneratedHelp(),
                        kMsgCritical, {});
        else if (!vfRegenerate)
            // New pages are looked over first; the help is compiled when the writer says so.
            result = CompileAndCopy();
    });
    return trapped != kSuccess ? trapped : result;
}

ResultCode CTovimar::CompileAndCopy() {
    TraceTimestamp("Compiling HTML Help.");
    CTovimarCompiler compiler;
    ProgressWindow progress("Processing generated HTML Help...", 4);
    progress.Update("Compiling HTML Help...", 1);
    compiler.CompileHtmlHelp();
    if (Interrupted())
        return kGeneralFailure;
    progress.Update("Copying compiled HTML Help...", 1);
    HostAgent().ProgressMeterUpdate(2);
    return compiler.CopyCompiledHelp() ? kSuccess : kGeneralFailure;
}

ResultCode CTovimar::CreateHtmlFiles(bool vfRegenerate) {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "CreateHtmlFiles", [&] {
        const Hourglass hourglass;
        auto* project = Session::CurrentProject();
        auto* root = HelpProjectTree().Root();
        if (project == nullptr || root == nullptr) {
            result = kGeneralFailure;
            return;
        }
        if (!vfRegenerate) {
            project->Name = parameters_->HelpProjectName();
            project->FileName = project->Name;
            project->Folder = parameters_->FolderForGeneratedHelp();
            project->PicsSubfolderName = parameters_->NameOfFolderForGeneratedImages();
        }
        const std::string sourceProject = HostAgent().CurrentSourceProjectName();
        HelpProjectTree().SyncGenerateFlagsFromTree();
        std::int32_t counter = 0;
        ProcessHelpTreeAndGenerateHelp(0, *root, /*vfShowProgress=*/true, HelpProjectTree().NodesQty(),
                                       counter, vfRegenerate);
        // The pass may have gone through the source projects of a group.
        if (!sourceProject.empty())
            HostAgent().SetCurrentSourceProject(sourceProject);
        if (Interrupted())
            result = kGeneralFailure;
    });
    return trapped != kSuccess ? trapped : result;
}

ResultCode CTovimar::CreateHHCandHHKFiles() {
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "CreateHHCandHHKFiles", [&] {
        const Hourglass hourglass;
        ProgressWindow progress("Generating HTML help contents and index files...", 5);
        auto* project = Session::CurrentProject();
        if (project == nullptr || Session::Projects() == nullptr) {
            result = kGeneralFailure;
            return;
        }
        auto& tree = HelpProjectTree();
        progress.Update("Saving project...", 1);
        project = Session::Projects()->ListCurrentProject();
        Session::Projects()->Save(project->TvpFullPath());
        progress.Update("Generating contents...", 2);
        tree.SaveHHC(project->HHCFullPath(), /*vfForceContentsRebuild=*/false);
        progress.Update("Generating index...", 3);
        tree.MakeAndSaveHHK(project->HHKFullPath());
        progress.Update("Generating Java help...", 3);
        progress.Update("Generating and saving checksums...", 4);
        tree.RecalcCheckSums();
        tree.SaveCheckSums(/*vfSaveCurrentCheckSum=*/true);
        tree.MakeJavaHelp(*project);
        tree.WasChanged = false;
        tree.NewHtmlHelpProject = false;
    });
    return trapped != kSuccess ? trapped : result;
}

ResultCode CTovimar::LoadTreviewForActiveProject(bool vfSkipIfLoaded, const IHelpWizardForm* objWizard) {
    if (vfSkipIfLoaded && tree_ != nullptr && tree_->Root() != nullptr)
        return kSuccess;
    ResultCode result = kSuccess;
    const ResultCode trapped = Trapped(kClass, "LoadTreviewForActiveProject", [&] {
        if (tree_ != nullptr)
            tree_->Terminate();
        SetHelpProjectTree(nullptr);
        const auto* project = Session::CurrentProject();
        const std::string contents = project == nullptr ? std::string() : project->HHCFullPath();
        const std::string file = project == nullptr ? std::string() : project->TvpFullPath();
        HelpContextIds().Reset();
        if (Interrupted()) {
            result = kGeneralFailure;
            return;
        }
        HelpProjectTree().Reset();
        if (!contents.empty() && FileExists(file))
            result = LoadProjectFile(file, !FileExists(contents));
        else
            LoadNewProject(!contents.empty() || !file.empty(), objWizard);
    });
    return trapped != kSuccess ? trapped : result;
}

ResultCode CTovimar::LoadProjectFile(const std::string& path, bool newProject) {
    HostMeter meter("Loading TOC treeview...", 2);
    meter.Update(1);
    return HelpProjectTree().Load(path, newProject, /*vfLoadingExternalProject=*/false, /*vstrXml=*/{},
                                  /*vfLoadControls=*/true);
}

void CTovimar::LoadNewProject(bool hasPaths, const IHelpWizardForm* wizard) {
    // Between the steps the user may have closed the wizard that shows the tree.
    const auto closed = [wizard] { return wizard != nullptr && !wizard->Visible(); };
    std::unique_ptr<IHelpPrjSourceProject> source;
    if (closed())
        return;
    {
        HostMeter meter("Parsing source project...", 2);
        meter.Update(1);
        source = HostAgent().ParseSourceProject();
    }
    if (closed())
        return;
    {
        HostMeter meter("Loading TOC treeview...", 2);
        meter.Update(1);
        const std::string initial = hasPaths
                                        ? GlobalSettingsFile()
                                        : ParameterizedFile(std::string(kProductFileName) + "Contents.xml");
        HelpProjectTree().Load(initial, /*vfNewHtmlHelpProject=*/true, /*vfLoadingExternalProject=*/false,
                               /*vstrXml=*/{}, /*vfLoadControls=*/true);
    }
    if (closed())
        return;
    HostMeter meter("Expanding serializer nodes...", 2);
    meter.Update(1);
    CHelpPrjTreeCF factory;
    HelpProjectTree().ExpandSerializerNodes(factory, source.get());
}

void CTovimar::UnLoadTreviewForActiveProject() {
    if (tree_ == nullptr || tree_->Root() == nullptr)
        return;
    tree_->Terminate();
    SetHelpProjectTree(nullptr);
}

} // namespace tovimar
