#pragma once

#include <filesystem>
#include <string>

namespace hhc {

/// Compiles with `chmcmd` instead: hands over a copy of the project that it can read, runs it in the
/// project's folder and sets right what it leaves there. Gives the program's exit code.
int CompileWithChmcmd(const std::filesystem::path& project);

/// Prints "hhc: error: ..." and gives the code back.
int Fail(int code, const std::string& text);

} // namespace hhc
