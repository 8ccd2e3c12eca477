#pragma once

#include "generation/NewObjects.h"
#include "platform/Error.h"

#include <array>
#include <memory>
#include <string>
#include <unordered_set>
#include <vector>

namespace tovimar {

class CAddInProject;
class CHelpPrjTreeNode;
class IHelpPrjSourceProject;
class IXmlSerializer;

/// What a regeneration found, in the order of the kinds.
struct RegenerationReport {
    struct Object {
        std::string kind; ///< "Form", "Table", ...
        std::string name;
        std::string page; ///< file name
    };
    std::vector<Object> added;
    /// Nodes whose object isn't in the application any more; they stay with their pages. Of the kinds that
    /// the project covers.
    std::vector<Object> gone;
    /// Nodes that have their object, and those of kinds that are left out.
    std::size_t kept = 0;
    /// The run came to its end without an error.
    bool complete = false;
};

/// Turns the folder of a help project into a compiled help file beside the source application, and brings new
/// objects of the application into the project. Made for each action.
class CTovimarCompiler {
public:
    CTovimarCompiler();
    ~CTovimarCompiler();
    CTovimarCompiler(const CTovimarCompiler&) = delete;
    CTovimarCompiler& operator=(const CTovimarCompiler&) = delete;

    /// Runs the help compiler on the current project when that is asked for and a compiler is installed.
    /// Always true: what came out is judged by whether the help file stands.
    bool CompileHtmlHelp();
    /// Copies the compiled file, if it stands, over `GetCopiedHelpFullPath`. True unless the copy failed.
    bool CopyCompiledHelp();
    /// Beside the source project, under the compiled file's name.
    std::string GetCopiedHelpFullPath() const;
    /// False when a copied help file stands that can't be written over.
    bool TestHelpFileWritable();

    /// Makes the help of the current project again from its tree and pages: project file, contents, index,
    /// web help, and the compiled file unless `vfSkipCHMCompilation`. Tells how it went; without
    /// `vfSkipOpeningOfRecompiledHelp` it asks whether to open the help. 0, also behind failures, which are
    /// reported and stand in the run's error count; 0x80040001 when no source project is open.
    ResultCode RecompileHelpProject(bool vfSkipOpeningOfRecompiledHelp = false,
                                    bool vfSkipCHMCompilation = false);
    ResultCode RecompileHelpProject1(bool vfSkipOpeningOfRecompiledHelp, bool vfSkipCHMCompilation);

    /// Brings the objects that the current project doesn't have yet into it: nodes below the list nodes,
    /// links on the list pages, topics, contents and index. Nothing that stands is rendered again, nothing is
    /// compiled, and the help isn't opened. Without a new object the user is told, and no file is touched. A
    /// run without errors loads the project again. 0, or the number of a reported failure.
    ResultCode RegenerateHelpProject(bool vfSkipOpeningOfRecompiledHelp = false);
    /// The search of a regeneration alone, over the current tree; nothing is changed. True when there is a
    /// new object.
    bool FindNewObjects();
    /// 0, or why the last search didn't come to its end; it is reported.
    ResultCode SearchResult() const { return searchResult_; }
    /// Of the last search.
    const RegenerationReport& Report() const { return report_; }

private:
    using NewNodes = std::vector<std::unique_ptr<CHelpPrjTreeNode>>;

    void SearchSourceProjects();
    ResultCode FindNewSourceObjects();
    void MakeNodes(const IHelpPrjSourceProject& objects);
    void MakeNodes(NewNodes& nodes, IXmlSerializer& serializer, const IHelpPrjSourceProject& objects);
    void AssignToProject(CHelpPrjTreeNode& node, const std::string& name);
    void CompareWithTree();
    bool NewObjectFound() const;
    void FindListNodes(CHelpPrjTreeNode* start = nullptr);
    void FallBackOnOtherLists();
    void AddNewFormsAndReports();
    void AddToList(CHelpPrjTreeNode& list, NewNodes& nodes);
    void RunRegeneration();
    void DropLists();

    std::array<NewNodes, kObjectKinds> newNodes_;
    /// Folded file names of their pages.
    std::unordered_set<std::string> newPages_;
    /// Where new objects of a kind go; not owned.
    std::array<CHelpPrjTreeNode*, kObjectKinds> listNodes_{};
    SourceObjects found_;
    RegenerationReport report_;
    ResultCode searchResult_ = kSuccess;

    void WriteProjectFiles(CAddInProject& project);
    void CompileAgain(bool skipOpening);
};

} // namespace tovimar
