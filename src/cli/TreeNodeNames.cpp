#include "cli/TreeNodeNames.h"

#include "cli/Stop.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"

#include <algorithm>
#include <string_view>
#include <vector>

namespace tovimar::cli {
namespace {

using Nodes = std::vector<CHelpPrjTreeNode*>;

bool IsNumber(const std::string& typed) {
    return !typed.empty() && typed.find_first_not_of("0123456789.") == std::string::npos;
}

/// Walks the tree until nothing is left of the number.
void FindByNumber(CHelpPrjTreeNode& node, const std::string& number, const std::string& wanted,
                  Nodes& found) {
    if (number == wanted)
        found.push_back(&node);
    const bool onTheWay = number == "0" || wanted.starts_with(number + ".");
    if (!onTheWay)
        return;
    std::size_t place = 0;
    for (const auto& child : node.Children())
        if (HasNumber(*child))
            FindByNumber(*child, ChildNumber(number, ++place), wanted, found);
}

std::string PageOf(const CHelpPrjTreeNode& node) {
    const std::string bookmark = node.Bookmark();
    return bookmark.empty() ? node.GeneratedHTMLFile() : node.GeneratedHTMLFile() + "#" + bookmark;
}

template <typename Matches> void FindAnywhere(CHelpPrjTreeNode& node, const Matches& matches, Nodes& found) {
    if (!node.HasSerializer() && matches(node))
        found.push_back(&node);
    for (const auto& child : node.Children())
        FindAnywhere(*child, matches, found);
}

/// Titles may hold a slash themselves, so each one is tried as a whole.
void FindByPath(const CHelpPrjTreeNode& parent, std::string_view path, Nodes& found) {
    for (const auto& child : parent.Children()) {
        const std::string title = child->ContentsText();
        if (child->HasSerializer() || title.empty() || !text::StartsWithIgnoringCase(path, title))
            continue;
        const auto rest = path.substr(title.size());
        if (rest.empty())
            found.push_back(child.get());
        else if (rest.front() == '/')
            FindByPath(*child, rest.substr(1), found);
    }
}

std::string Listed(const Nodes& nodes) {
    std::string lines;
    for (const auto* node : nodes)
        lines += "\n" + (HasNumber(*node) ? NodeNumber(*node) : node->Key()) + "  " + node->ContentsText() +
                 "  " + PageOf(*node);
    return lines;
}

Nodes Candidates(const CHelpPrjTree& tree, const std::string& typed) {
    auto& root = *tree.Root();
    Nodes found;
    if (IsNumber(typed))
        FindByNumber(root, "0", typed, found);
    if (found.empty())
        FindAnywhere(
            root, [&](const auto& node) { return text::EqualsIgnoringCase(PageOf(node), typed); }, found);
    if (found.empty())
        FindByPath(root, typed, found);
    if (found.empty())
        FindAnywhere(
            root, [&](const auto& node) { return text::EqualsIgnoringCase(node.ContentsText(), typed); },
            found);
    if (auto* byKey = found.empty() ? tree.MapItem(typed) : nullptr)
        found.push_back(byKey);
    return found;
}

} // namespace

bool HasNumber(const CHelpPrjTreeNode& node) {
    return !node.HasSerializer() && !node.IsControl && !node.IsMenu;
}

std::string ChildNumber(const std::string& parentNumber, std::size_t place) {
    return (parentNumber == "0" ? std::string() : parentNumber + ".") + std::to_string(place);
}

std::string NodeNumber(const CHelpPrjTreeNode& node) {
    if (node.Parent == nullptr)
        return "0";
    std::size_t place = 0;
    for (const auto& sibling : node.Parent->Children()) {
        if (HasNumber(*sibling))
            ++place;
        if (sibling.get() == &node)
            break;
    }
    return ChildNumber(NodeNumber(*node.Parent), place);
}

CHelpPrjTreeNode& FindNode(const CHelpPrjTree& tree, const std::string& typed) {
    Nodes found = Candidates(tree, typed);
    if (found.empty())
        throw Stop{"the contents have no '" + typed +
                   "'\nName it by its titles (\"Forms/Orders\"), its page, or the number that \"tovimar "
                   "contents --numbers\" shows."};
    // A form's entry is meant before a button that opens it.
    if (std::any_of(found.begin(), found.end(), [](const auto* node) { return HasNumber(*node); }))
        std::erase_if(found, [](const auto* node) { return !HasNumber(*node); });
    if (found.size() > 1)
        throw Stop{"the contents have several '" + typed + "'; which one?" + Listed(found)};
    return *found.front();
}

} // namespace tovimar::cli
