#pragma once

#include "generation/CTovimarParameters.h"
#include "platform/Error.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace tovimar {

class CHelpPrjTree;
class CHelpPrjTreeNode;
class CXmlForm;
class IHelpWizardForm;
class clsFrmRptHelpContextIds;
class clsHHK;

/// The node that a pass has come to, for a program's own display.
struct NodeProgress {
    std::string kind; ///< "Form", "Table", ...; empty for pages
    std::string name; ///< of the object, or the page's caption
    std::int32_t position = 0;
    std::int32_t maximum = 0;
};

/// One generation: the parameters of the run, the project tree, the index and the help context ids, and the
/// way from settled options to the compiled help beside the source project. One per connection; the server
/// data owns it. Failures are reported under the class's name; a run is judged by `RunState` alone.
class CTovimar {
public:
    CTovimar();
    ~CTovimar();
    CTovimar(const CTovimar&) = delete;
    CTovimar& operator=(const CTovimar&) = delete;

    /// The whole run with the parameters as they stand.
    void Generate();
    void GenerateHelpProject(bool vfCompile, bool vfBackup, bool vfSaveChanges, bool vfOpenHelp,
                             bool vfRegenerate);
    ResultCode GenerateHTMLForProject(bool vfCompile, bool vfRegenerate);
    ResultCode CreateHtmlFiles(bool vfRegenerate);
    ResultCode CreateHHCandHHKFiles();
    /// Writes the compiler's project file and its companion; an empty path is the current project's.
    ResultCode CreateHHPAndRelatedFiles(const std::string& vstrFullPath);
    void CreateHTextFile();

    /// Loads the tree of the current project: its file when it stands, else the contents template with the
    /// objects of the source project. 0, or 0x8003FE09 for a stopped run, or the tree's failure.
    /// The steps of a new project end silently once the window of `objWizard` isn't visible any more.
    ResultCode LoadTreviewForActiveProject(bool vfSkipIfLoaded = false,
                                           const IHelpWizardForm* objWizard = nullptr);
    void UnLoadTreviewForActiveProject();

    CTovimarParameters& Parameters() { return *parameters_; }
    void SetParameters(std::unique_ptr<CTovimarParameters> parameters);
    clsHHK& HelpIndex() { return *helpIndex_; }
    /// Made at the first read.
    CHelpPrjTree& HelpProjectTree();
    /// Unload a live tree first: it is replaced without being terminated.
    void SetHelpProjectTree(std::unique_ptr<CHelpPrjTree> tree);
    clsFrmRptHelpContextIds& HelpContextIds();

    /// The topic pass: one file per node, then what needs the whole tree. `counter` runs over the nodes.
    void ProcessHelpTreeAndGenerateHelp(std::int32_t level, CHelpPrjTreeNode& node, bool vfShowProgress,
                                        std::int32_t maxNodes, std::int32_t& counter, bool vfRegenerate);
    ResultCode ProcessHelpTreeAndGenerateHelp1(std::int32_t level, CHelpPrjTreeNode& node,
                                               bool vfShowProgress, std::int32_t maxNodes,
                                               std::int32_t& counter, bool vfRegenerate);
    void ProcessHelpTreeAndGenerateHelp2(CHelpPrjTreeNode& node, bool vfRegenerate);

    /// The host's raw description of an object.
    std::string CreateXmlDefForComponent(std::int32_t objType, const std::string& name, std::int32_t hostHwnd,
                                         bool vfInDesignView, bool vfReplaceHtml, std::int32_t picType,
                                         const std::string& picFullPath, const std::string& htmlFullPath,
                                         bool vfPreviewAreaOnly, const std::string& sourceTypeName,
                                         bool vfKeepOpened);
    /// The definition in pixels of the picture. Picture type, source type, host window and preview flag are
    /// taken from the parameters and the host, whatever the caller passes.
    std::unique_ptr<CXmlForm> CreateNormalizedXmlDef(std::int32_t objType, const std::string& name,
                                                     std::int32_t hostHwnd, bool vfInDesignView,
                                                     bool vfReplaceHtml, std::int32_t picType,
                                                     const std::string& picFullPath,
                                                     const std::string& htmlFullPath, bool vfPreviewAreaOnly,
                                                     const std::string& sourceTypeName, bool vfKeepOpened);

    /// Called for every node of a pass before it is made; not for placeholders, which make nothing.
    std::function<void(const NodeProgress&)> NodeStarted;
    /// Called before the help compiler runs.
    std::function<void()> CompilerStarted;
    /// What the help compiler of the last run printed, and its exit code; empty and 0 when it didn't run.
    std::string CompilerOutput;
    int CompilerExitCode = 0;
    double CompilerSeconds = 0;

    /// Once only: ends the help context ids and the tree.
    void Terminate();

private:
    struct RunPaths;
    void CompleteGeneration(RunPaths& paths, bool vfSaveChanges, bool vfOpenHelp, int& step);
    void OfferEditorAfterErrors();
    void OpenEditor();
    ResultCode CompileAndCopy();
    ResultCode LoadProjectFile(const std::string& path, bool newProject);
    void LoadNewProject(bool hasPaths, const IHelpWizardForm* wizard);

    std::unique_ptr<CTovimarParameters> parameters_;
    std::unique_ptr<clsHHK> helpIndex_;
    std::unique_ptr<CHelpPrjTree> tree_;
    std::unique_ptr<clsFrmRptHelpContextIds> helpContextIds_;
    bool terminated_ = false;
};

} // namespace tovimar
