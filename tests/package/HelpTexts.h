#pragma once

#include "cli/Program.h"

#include <set>

namespace tovimar::test {

/// What the help of one command names.
struct CommandHelp {
    /// "settings get"; empty for the program's own.
    std::string command;
    std::vector<std::string> commands;
    /// With what they take: "--yes", "--output DIR".
    std::set<std::string> options;
    std::vector<std::string> arguments;

    std::vector<std::string> OptionNames() const;
};

/// Tests that hold texts against the program's own help.
class HelpTextsTest : public ProgramTest {
protected:
    /// The program's own first, then every command with its commands behind it.
    std::vector<CommandHelp> AllHelp();

private:
    CommandHelp Help(const std::string& command);
};

} // namespace tovimar::test
