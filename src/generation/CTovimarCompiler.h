#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

class CAddInProject;

/// Turns the folder of a help project into a compiled help file beside the source application. Made for each
/// action; holds nothing.
class CTovimarCompiler {
public:
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

private:
    void WriteProjectFiles(CAddInProject& project);
    void CompileAgain(bool skipOpening);
};

} // namespace tovimar
