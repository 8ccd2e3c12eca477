#pragma once

#include <string>
#include <vector>

namespace tovimar::cli {

/// One step of "tovimar tree": an operation and what it works on.
struct TreeStep {
    std::string operation;
    std::vector<std::string> arguments;
};

/// The words of a command line, taken apart at "then". Raises `Stop` for an operation that isn't known, for
/// too few or too many words, and for something that is cut or copied and never pasted.
std::vector<TreeStep> TreeStepsOf(const std::vector<std::string>& words);

/// The operations and their words, a line each, for the command's help.
std::string TreeOperationsText();

} // namespace tovimar::cli
