#pragma once

#include <string>

namespace tovimar::cli {

struct Arguments;

/// What the commands that make a help check before and tell behind. All of the current project.

/// Raises `Stop` when the compiler is asked for and isn't installed.
void CheckCompiler();
/// Makes the folder of --copy-to. Says why the copy of the compiled help can't be written; empty when it can.
std::string CopyComplaint(const Arguments& arguments);
/// Tells what the help compiler complained about. False when the compiled help is missing or doubtful.
bool CompilerSucceeded(bool verbose);
/// Compiled help and its copy; web help and project; each as far as it is there.
void ShowCompiledHelp();
void ShowWebHelpAndProject();

} // namespace tovimar::cli
