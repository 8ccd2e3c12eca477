#pragma once

#include <string>

namespace tovimar {

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
};

} // namespace tovimar
