#pragma once

namespace CLI {
class App;
}

namespace tovimar::cli {

struct Arguments;

/// The commands' words: what may be typed, and the help on it. Each fills the arguments when its command is
/// the one that was typed.
void AddGenerationSyntax(CLI::App& app,
                         Arguments& parsed);             ///< new, generate, regenerate, recompile, screenshot
void AddProjectSyntax(CLI::App& app, Arguments& parsed); ///< open, projects, contents, tree, settings
void AddSourceSyntax(CLI::App& app, Arguments& parsed);  ///< list, options, convert-contents

} // namespace tovimar::cli
