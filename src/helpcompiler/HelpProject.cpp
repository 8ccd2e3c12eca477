#include "helpcompiler/HelpProject.h"

#include "helpcompiler/LanguageCodePage.h"
#include "helpcompiler/Markup.h"
#include "helpcompiler/WindowLine.h"
#include "platform/files/NativeFile.h"
#include "platform/text/ByteOrderMark.h"
#include "platform/text/Text.h"

#include <charconv>
#include <fcntl.h>
#include <map>
#include <optional>
#include <sstream>
#include <unordered_map>

namespace tovimar::helpcompiler {
namespace {

constexpr int kDeepestInclude = 8;

std::string Unquoted(std::string text) {
    text = text::TrimWhitespace(text);
    if (text.size() >= 2 && (text.front() == '"' || text.front() == '<'))
        return text.substr(1, text.size() - 2);
    return text;
}

bool IsYes(const std::string& value) {
    return EqualsCaseless(value, "yes") || value == "1" || EqualsCaseless(value, "true");
}

struct Assignment {
    std::string name;
    std::string value;
};

std::optional<Assignment> SplitAssignment(const std::string& line) {
    const std::size_t sign = line.find('=');
    if (sign == std::string::npos)
        return std::nullopt;
    return Assignment{text::TrimWhitespace(line.substr(0, sign)),
                      text::TrimWhitespace(line.substr(sign + 1))};
}

/// The language stands in the text whose code page depends on it; its line is plain ASCII.
std::uint32_t LanguageIn(std::string_view bytes) {
    std::istringstream lines{std::string(bytes)};
    for (std::string line; std::getline(lines, line);)
        if (const auto option = SplitAssignment(line); option && EqualsCaseless(option->name, "language"))
            return LanguageOf(option->value);
    return kDefaultLanguage;
}

class ProjectReader {
public:
    ProjectReader(const std::string& name, ProjectFolder& folder, const Tell& tell)
        : name_(name), folder_(folder), tell_(tell) {}

    HelpProject Read(std::string_view bytes) {
        const std::uint32_t language = LanguageIn(bytes);
        project_.help.language = language;
        project_.help.binaryIndex = true; // unless the project says No
        project_.help.codePage = CodePageOfLanguage(language);
        page_.emplace(project_.help.codePage);
        std::istringstream lines(Text(bytes));
        for (std::string line; std::getline(lines, line);) {
            ++line_;
            TakeLine(text::TrimWhitespace(line));
        }
        Finish();
        return std::move(project_);
    }

private:
    void Warn(const std::string& text) { tell_({Message::Kind::Warning, name_, line_, text}); }

    std::string Text(std::string_view bytes) const {
        if (auto marked = text::DecodeMarked(bytes))
            return *marked;
        return text::IsValidUtf8(bytes) ? std::string(bytes) : page_->Decode(bytes);
    }

    void TakeLine(const std::string& line) {
        if (line.starts_with('[')) {
            section_ = text::ToLower(line.substr(0, line.find(']')));
        } else if (line.empty() || line.starts_with(';')) {
            return;
        } else if (section_ == "[options") {
            TakeOption(line);
        } else if (section_ == "[files") {
            project_.files.push_back(Unquoted(line));
            project_.lines.try_emplace(project_.files.back(), line_);
        } else if (section_ == "[alias") {
            TakeAlias(line);
        } else if (section_ == "[map") {
            TakeMapLine(line, 0);
        } else if (section_ == "[windows") {
            if (auto window = ParseWindowLine(page_->Encode(line)))
                project_.help.windows.push_back(std::move(*window));
        } else if (section_ == "[merge files") {
            project_.help.mergedFiles.push_back(page_->Encode(line));
        }
    }

    void TakeOption(const std::string& line) {
        const auto option = SplitAssignment(line);
        if (!option)
            return;
        HelpDescription& help = project_.help;
        const std::map<std::string, std::string*, std::less<>> texts{{"title", &help.title},
                                                                     {"default window", &help.defaultWindow},
                                                                     {"default font", &help.defaultFont}};
        const std::map<std::string, std::string*, std::less<>> files{
            {"compiled file", &project_.compiledFile},
            {"contents file", &project_.contentsFile},
            {"index file", &project_.indexFile},
            {"default topic", &help.defaultTopic},
            {"full text search stop list file", &project_.stopListFile}};
        const std::map<std::string, bool*, std::less<>> switches{{"full-text search", &help.fullTextSearch},
                                                                 {"binary index", &help.binaryIndex}};
        const std::string name = text::ToLower(option->name);
        if (const auto text = texts.find(name); text != texts.end())
            *text->second = page_->Encode(option->value);
        else if (const auto file = files.find(name); file != files.end())
            project_.lines.try_emplace(*file->second = WithSlashes(option->value), line_);
        else if (const auto yes = switches.find(name); yes != switches.end())
            *yes->second = IsYes(option->value);
    }

    void TakeAlias(const std::string& line) {
        const auto alias = SplitAssignment(line.substr(0, line.find(';')));
        if (!alias)
            return;
        const auto [first, isNew] = aliases_.try_emplace(alias->name, Alias{alias->value, line_});
        if (!isNew)
            Warn("the alias " + alias->name + " stands for '" + first->second.page +
                 "' already, since line " + std::to_string(first->second.line));
    }

    /// "#define IDH_ORDERS 20", or an included file of such lines.
    void TakeMapLine(const std::string& line, int depth) {
        std::istringstream words(line);
        std::string keyword;
        std::string symbol;
        std::string number;
        words >> keyword;
        if (EqualsCaseless(keyword, "#include")) {
            Include(Unquoted(line.substr(keyword.size())), depth);
            return;
        }
        if (!EqualsCaseless(keyword, "#define") || !(words >> symbol >> number))
            return;
        const bool hexadecimal = number.starts_with("0x") || number.starts_with("0X");
        std::uint32_t id = 0;
        const char* start = number.data() + (hexadecimal ? 2 : 0);
        if (std::from_chars(start, number.data() + number.size(), id, hexadecimal ? 16 : 10).ec ==
            std::errc())
            numbers_.emplace_back(symbol, id);
    }

    void Include(const std::string& name, int depth) {
        const auto found = folder_.Find(name);
        if (depth == kDeepestInclude) {
            Warn("'" + name + "' is included by files that include each other");
            return;
        }
        if (!found) {
            Warn("'" + name + "' isn't on the disk");
            return;
        }
        std::istringstream lines(
            Text(platform::NativeFile(folder_.PathOf(*found).string(), O_RDONLY).ReadAll()));
        for (std::string line; std::getline(lines, line);)
            TakeMapLine(text::TrimWhitespace(line), depth + 1);
    }

    /// Numbers whose symbol has no page lead nowhere and are left out.
    void Finish() {
        HelpDescription& help = project_.help;
        line_ = 0;
        for (const auto& [symbol, id] : numbers_)
            if (const auto alias = aliases_.find(symbol); alias != aliases_.end())
                help.contexts.push_back(
                    {id, page_->Encode(WithSlashes(alias->second.page)), alias->second.line});
        if (project_.compiledFile.empty())
            project_.compiledFile = name_.substr(0, name_.find_last_of('.')) + ".chm";
        help.compiledFile = page_->Encode(project_.compiledFile);
        help.defaultTopic = page_->Encode(help.defaultTopic);
    }

    std::string name_;
    ProjectFolder& folder_;
    const Tell& tell_;
    HelpProject project_;
    std::optional<text::CodePage> page_;
    std::string section_;
    int line_ = 0;
    struct Alias {
        std::string page;
        int line = 0;
    };
    std::unordered_map<std::string, Alias> aliases_;
    std::vector<std::pair<std::string, std::uint32_t>> numbers_;
};

} // namespace

HelpProject ReadHelpProject(std::string_view bytes, const std::string& name, ProjectFolder& folder,
                            const Tell& tell) {
    return ProjectReader(name, folder, tell).Read(bytes);
}

} // namespace tovimar::helpcompiler
