#include "package/HelpTexts.h"

#include "platform/text/Text.h"

#include <regex>

namespace tovimar::test {
namespace {

void TakeLine(CommandHelp& help, const std::string& section, const std::string& line) {
    static const std::regex pattern("^  (?:-h,)?([A-Za-z-]+)( [A-Z=]+(?= |$))?.*");
    std::smatch parts;
    if (!std::regex_match(line, parts, pattern))
        return;
    if (section == "Commands:")
        help.commands.push_back(parts[1]);
    else if (section == "Arguments:")
        help.arguments.push_back(parts[1]);
    else if (section == "Options:")
        help.options.insert(parts[1].str() + parts[2].str());
}

} // namespace

std::vector<std::string> CommandHelp::OptionNames() const {
    std::vector<std::string> names;
    for (const std::string& option : options)
        names.push_back(option.substr(0, option.find(' ')));
    return names;
}

CommandHelp HelpTextsTest::Help(const std::string& command) {
    std::vector<std::string> words;
    if (!command.empty())
        words = text::Split(command, " ");
    words.push_back("--help");
    const Outcome outcome = Run(words).ExpectExit(0);
    CommandHelp help;
    help.command = command;
    std::string section;
    for (const std::string& line : text::Split(outcome.output, "\n"))
        if (line.starts_with("  "))
            TakeLine(help, section, line);
        else
            section = line;
    return help;
}

std::vector<CommandHelp> HelpTextsTest::AllHelp() {
    std::vector<CommandHelp> all;
    std::vector<std::string> open{""};
    while (!open.empty()) {
        const CommandHelp help = Help(open.back());
        open.pop_back();
        for (const std::string& name : help.commands)
            open.push_back(help.command.empty() ? name : help.command + " " + name);
        all.push_back(help);
    }
    EXPECT_GT(all.size(), 10U);
    return all;
}

} // namespace tovimar::test
