#include "project/BackupPages.h"

#include "platform/files/Paths.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>
#include <unordered_set>

namespace tovimar {
namespace {

constexpr std::size_t kDateDigits = 8;

/// "a.htm" of "a_20001017.htm" and "a_200010171.htm"; empty for other names.
std::string NameWithoutDate(const std::string& name) {
    const std::string extension = platform::ExtensionOf(name);
    const std::string base = name.substr(0, name.size() - extension.size());
    const auto line = base.rfind('_');
    if (line == std::string::npos || base.size() - line <= kDateDigits)
        return {};
    const bool digits = std::all_of(base.begin() + static_cast<std::ptrdiff_t>(line) + 1, base.end(),
                                    [](char c) { return c >= '0' && c <= '9'; });
    return digits ? base.substr(0, line) + extension : std::string();
}

} // namespace

std::set<std::string> BackupPages(const CHelpPrjTree& tree, const std::vector<std::string>& pages) {
    const std::unordered_set<std::string> all(pages.begin(), pages.end());
    std::set<std::string> backups;
    for (const auto& page : pages)
        if (all.contains(NameWithoutDate(page)))
            backups.insert(page);
    if (backups.empty())
        return backups;
    for (const auto* node : tree.MapItems())
        std::erase_if(backups, [page = node->GeneratedHTMLFile()](const std::string& backup) {
            return text::EqualsIgnoringCase(backup, page);
        });
    return backups;
}

} // namespace tovimar
