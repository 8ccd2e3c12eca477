#include "cli/OptionValues.h"

#include "generation/CAddInSettings.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <numeric>
#include <vector>

namespace tovimar::cli {
namespace {

/// Single-character edits between two texts, without regard to case.
std::size_t EditDistance(std::string_view left, std::string_view right) {
    const std::string a = text::FoldCase(left);
    const std::string b = text::FoldCase(right);
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t{0});
    for (std::size_t i = 1; i <= a.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            const std::size_t replaced = diagonal + (a[i - 1] == b[j - 1] ? 0 : 1);
            diagonal = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, replaced});
        }
    }
    return row[b.size()];
}

/// Names within three edits, or that hold what was typed; the nearest first, at most three.
std::vector<std::string> Suggestions(const std::string& name) {
    constexpr std::size_t kMostEdits = 3;
    constexpr std::size_t kMostSuggestions = 3;
    std::vector<std::pair<std::size_t, std::string>> found;
    if (name.size() > 100)
        return {};
    for (const OptionDescription& option : OptionDescriptions()) {
        const std::size_t edits = EditDistance(name, option.name);
        if (edits <= kMostEdits || (name.size() > 3 && text::ContainsIgnoringCase(option.name, name)))
            found.emplace_back(edits, option.name);
    }
    std::stable_sort(found.begin(), found.end(),
                     [](const auto& left, const auto& right) { return left.first < right.first; });
    std::vector<std::string> names;
    for (std::size_t i = 0; i < std::min(found.size(), kMostSuggestions); ++i)
        names.push_back(found[i].second);
    return names;
}

std::string UnknownName(const std::string& name) {
    std::string complaint = "there is no option '" + name + "'";
    if (const auto names = Suggestions(name); !names.empty())
        complaint += "; did you mean " + text::Join(names, " or ") + "?";
    return complaint + "\nRun \"tovimar options\" for all of them.";
}

/// The value as the option spells it; empty when the option doesn't take it.
std::string Fitting(const OptionDescription& option, const std::string& value) {
    if (std::string_view(option.values) == "1 to 9")
        return value.size() == 1 && value[0] >= '1' && value[0] <= '9' ? value : std::string();
    for (const std::string& word : text::Split(option.values, "|"))
        if (text::EqualsIgnoringCase(word, value))
            return word;
    return {};
}

/// Names of files and folders that the run makes must stay within their folder.
bool IsPlainName(const std::string& value) {
    const std::string name =
        value.ends_with('\\') || value.ends_with('/') ? value.substr(0, value.size() - 1) : value;
    return !name.empty() && name != "." && name != ".." && name.size() <= 150 &&
           name.find_first_of("\\/:*?\"<>|") == std::string::npos &&
           std::none_of(name.begin(), name.end(), [](char c) { return static_cast<unsigned char>(c) < 32; });
}

/// Null for an unknown name.
const OptionDescription* Described(const std::string& name) {
    const auto& all = OptionDescriptions();
    const auto option = std::find_if(all.begin(), all.end(), [&](const OptionDescription& candidate) {
        return text::EqualsIgnoringCase(candidate.name, name);
    });
    return option == all.end() ? nullptr : &*option;
}

std::string ComplaintAboutText(const std::string& name, const std::string& value) {
    const bool namesFile = name == "HelpProjectName" || name == "SubFolderForScreenshots";
    if (!text::IsValidUtf8(value))
        return "the value of " + name + " isn't UTF-8";
    if (namesFile && !IsPlainName(value))
        return "'" + value + "' can't be the name of a file, as " + name + " needs it";
    return {};
}

} // namespace

OptionAssignment FindOption(const std::string& name) {
    OptionAssignment found;
    if (const auto* option = Described(name))
        found.name = option->name;
    else
        found.complaint = UnknownName(name);
    return found;
}

OptionAssignment ParseOption(const std::string& assignment) {
    const auto sign = assignment.find('=');
    if (sign != std::string::npos && sign > 0)
        return ParseOption(assignment.substr(0, sign), assignment.substr(sign + 1));
    OptionAssignment parsed;
    parsed.complaint = "--option needs NAME=VALUE, not '" + assignment + "'";
    return parsed;
}

OptionAssignment ParseOption(const std::string& name, const std::string& value) {
    OptionAssignment parsed = FindOption(name);
    if (!parsed.complaint.empty())
        return parsed;
    const OptionDescription& option = *Described(name);
    parsed.value = value;
    if (std::string_view(option.values).empty())
        parsed.complaint = ComplaintAboutText(parsed.name, value);
    else if (const std::string fitting = Fitting(option, value); !fitting.empty())
        parsed.value = fitting;
    else
        parsed.complaint = "'" + value + "' is no value of " + parsed.name + ", which takes " +
                           text::ReplaceAll(option.values, "|", " or ");
    return parsed;
}

} // namespace tovimar::cli
