#include "project/BackupPages.h"

#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>
#include <cctype>
#include <unordered_set>

namespace tovimar {
namespace {

constexpr std::size_t kDateDigits = 8;

/// The name without its date and counter; empty for one that has no date.
std::string UndatedName(const std::string& name) {
    const std::string base = platform::BaseNameOf(name);
    const auto dash = base.rfind('_');
    if (dash == std::string::npos || base.size() - dash - 1 < kDateDigits)
        return {};
    const auto isDigit = [](char c) { return std::isdigit(static_cast<unsigned char>(c)) != 0; };
    if (!std::all_of(base.begin() + static_cast<std::ptrdiff_t>(dash) + 1, base.end(), isDigit))
        return {};
    const int month = std::stoi(base.substr(dash + 5, 2));
    const int day = std::stoi(base.substr(dash + 7, 2));
    if (month < 1 || month > 12 || day < 1 || day > 31)
        return {};
    return base.substr(0, dash) + platform::ExtensionOf(name);
}

} // namespace

std::vector<std::string> BackupPages(const CHelpPrjTree& tree, const std::vector<std::string>& names) {
    std::unordered_set<std::string> known;
    for (const auto& name : names)
        known.insert(text::FoldCase(name));
    std::vector<std::string> backups;
    for (const auto& name : names) {
        const std::string original = UndatedName(name);
        if (original.empty() || !known.contains(text::FoldCase(original)))
            continue;
        if (tree.Root() == nullptr || tree.Index().FilesNamed(*tree.Root(), name) == 0)
            backups.push_back(name);
    }
    return backups;
}

} // namespace tovimar
