#include "cli/Columns.h"
#include "cli/Commands.h"
#include "cli/Console.h"
#include "cli/Json.h"
#include "cli/ProjectFile.h"
#include "cli/ProjectReading.h"
#include "cli/Stop.h"
#include "cli/Surroundings.h"
#include "cli/TreeNodeNames.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "project/CHelpPrjTreeNode.h"
#include "project/ComponentFileName.h"
#include "topics/CFormHTMLControlDef.h"
#include "uimodel/CXmlForm.h"

#include <algorithm>
#include <nlohmann/json.hpp>
#include <vector>

namespace tovimar::cli {
namespace {

/// What is shown of a node, or of a control that an object's definition documents.
struct Entry {
    std::string number; ///< empty for a control
    std::string caption;
    std::string kind;
    std::string name;
    std::string page;
    std::string key;
    bool skipped = false;
    std::vector<Entry> children;
};

std::string Kind(const CHelpPrjTreeNode& node) {
    if (node.IsRootNode)
        return "project";
    if (node.IsObjectNode())
        return text::ToLower(node.NodeComponentTypeName());
    return node.ProcessCode() > 0 ? "group" : "page";
}

/// The definition is only read: controls are no nodes of a saved tree.
void AddControls(const CHelpPrjTreeNode& node, Entry& entry) {
    const auto form = node.LoadXmlForm();
    if (form == nullptr)
        return;
    const auto add = [&](const CFormHTMLControlDef& control, const char* kind) {
        entry.children.push_back({{},
                                  control.TopicCaption,
                                  kind,
                                  control.ControlName,
                                  entry.page + "#" + GetComponentAnchor(form->Name, control.ControlName),
                                  entry.key + "." + control.BookmarkName,
                                  entry.skipped,
                                  {}});
    };
    for (const auto& menu : form->DocumentedMenus)
        add(*menu, "menu");
    for (const auto& control : form->DocumentedControls)
        add(*control, "control");
}

/// What is shown besides the entries of the help.
struct Shown {
    bool leftOut = false;
    bool controls = false;
};

Entry Described(const CHelpPrjTreeNode& node, const Shown& shown, const std::string& number = "0") {
    Entry entry{number,     node.ContentsText(), Kind(node), node.Name(), node.GeneratedHTMLFile(),
                node.Key(), node.Skipped(),      {}};
    if (shown.controls && node.IsObjectNode())
        AddControls(node, entry);
    std::size_t place = 0;
    for (const auto& child : node.Children()) {
        if (!HasNumber(*child))
            continue;
        ++place;
        if (shown.leftOut || !child->Skipped())
            entry.children.push_back(Described(*child, shown, ChildNumber(number, place)));
    }
    return entry;
}

nlohmann::ordered_json AsJson(const Entry& entry) {
    nlohmann::ordered_json json{{"number", entry.number},  {"caption", entry.caption}, {"kind", entry.kind},
                                {"name", entry.name},      {"page", entry.page},       {"key", entry.key},
                                {"skipped", entry.skipped}};
    auto& children = json["children"] = nlohmann::ordered_json::array();
    for (const Entry& child : entry.children)
        children.push_back(AsJson(child));
    return json;
}

/// The numbers stand in front of the captions.
void TakeNumbers(Entry& entry) {
    if (!entry.number.empty())
        entry.caption = entry.number + "  " + entry.caption;
    for (Entry& child : entry.children)
        TakeNumbers(child);
}

std::size_t WidthOf(const Entry& entry, std::size_t indent) {
    constexpr std::size_t kWidest = 56;
    std::size_t width = std::min(indent + text::Length(entry.caption), kWidest);
    for (const Entry& child : entry.children)
        width = std::max(width, WidthOf(child, indent + 2));
    return width;
}

void AppendText(std::string& out, const Entry& entry, std::size_t indent, std::size_t width) {
    const std::string caption = std::string(indent, ' ') + entry.caption;
    out += entry.page.empty() ? caption : PaddedTo(caption, width) + "  " + entry.page;
    out += entry.skipped ? "  (left out)\n" : "\n";
    for (const Entry& child : entry.children)
        AppendText(out, child, indent + 2, width);
}

int Show(const Arguments& arguments) {
    const std::string file = FindProjectFile(arguments.project);
    const ProjectReading reading(file);
    CHelpPrjTree tree;
    if (tree.Load(file) != kSuccess || tree.Root() == nullptr)
        throw Stop{{}, kFailed};
    Entry root = Described(*tree.Root(), {arguments.all || arguments.leftOut, arguments.all});
    std::string text;
    if (arguments.json)
        PrintJson(AsJson(root));
    else {
        if (arguments.numbers)
            TakeNumbers(root);
        AppendText(text, root, 0, WidthOf(root, 0));
        PrintResult(text);
    }
    tree.Terminate();
    return kDone;
}

} // namespace

int ShowContents(const Arguments& arguments, Surroundings& surroundings) {
    return RunToStop(surroundings, [&] { return Show(arguments); });
}

} // namespace tovimar::cli
