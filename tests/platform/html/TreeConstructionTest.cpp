#include "platform/html/HtmlDocument.h"

#include "platform/Error.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

namespace tovimar {
namespace {

namespace fs = std::filesystem;

struct Case {
    std::string data;
    std::string fragment;
    std::string expected;
    bool scripted = false;
};

/// Cases stand behind each other: "#data", "#errors", perhaps "#document-fragment", "#document".
std::vector<Case> ReadCases(const fs::path& file) {
    std::ifstream in(file, std::ios::binary);
    std::vector<Case> cases;
    std::string section;
    for (std::string line; std::getline(in, line);) {
        if (line == "#data") {
            cases.emplace_back();
            section = line;
        } else if (line.starts_with('#') && !cases.empty() && section != "#text") {
            section = line;
            cases.back().scripted |= line == "#script-on";
        } else if (!cases.empty()) {
            if (section == "#data")
                cases.back().data += line + "\n";
            else if (section == "#document-fragment")
                cases.back().fragment = line;
            else if (section == "#document")
                cases.back().expected += line + "\n";
        }
    }
    for (Case& one : cases) {
        one.data.resize(one.data.size() - std::min<std::size_t>(1, one.data.size()));
        while (one.expected.ends_with("\n\n"))
            one.expected.pop_back();
    }
    return cases;
}

/// The form in which the cases give a tree.
class Dump {
public:
    std::string Of(const HtmlNode& root) {
        for (const HtmlNode* child : root.childNodes())
            Add(*child, 0);
        return out_;
    }

private:
    void Line(std::size_t depth, const std::string& text) {
        out_ += "| " + std::string(depth * 2, ' ') + text + "\n";
    }
    static std::string NameOf(const HtmlNode& node) {
        if (!node.IsForeign())
            return node.name();
        for (const HtmlNode* above = &node; above != nullptr; above = above->parentNode())
            if (above->name() == "math" || above->name() == "svg")
                return above->name() + " " + node.name();
        return node.name();
    }
    void Add(const HtmlNode& node, std::size_t depth) {
        switch (node.kind()) {
        case HtmlNode::Kind::Doctype:
            Line(depth, "<!DOCTYPE>");
            return;
        case HtmlNode::Kind::Comment:
            Line(depth, "<!-- " + node.nodeValue() + " -->");
            return;
        case HtmlNode::Kind::Text:
            Line(depth, "\"" + node.nodeValue() + "\"");
            return;
        default:
            break;
        }
        Line(depth, "<" + NameOf(node) + ">");
        std::map<std::string, std::string> sorted;
        for (const HtmlAttribute& attribute : node.attributes())
            sorted[attribute.name] = attribute.value;
        for (const auto& [name, value] : sorted)
            Line(depth + 1, name + "=\"" + value + "\"");
        const bool isTemplate = node.Is("template") && !node.IsForeign();
        if (isTemplate)
            Line(depth + 1, "content");
        for (const HtmlNode* child : node.childNodes())
            Add(*child, depth + (isTemplate ? 2U : 1U));
    }
    std::string out_;
};

/// The tree's document type holds the tag as it was written, the cases give its parts; "xlink:href" is ours.
std::string Comparable(std::string tree) {
    std::string out;
    std::istringstream lines(tree);
    for (std::string line; std::getline(lines, line);) {
        if (line.starts_with("| <!DOCTYPE"))
            line = "| <!DOCTYPE>";
        for (const char* prefix : {"xlink ", "xml ", "xmlns "})
            if (const auto at = line.find_first_not_of("| ");
                at != std::string::npos && line[at] != '"' &&
                line.compare(at, std::string(prefix).size(), prefix) == 0)
                line[at + std::string(prefix).size() - 1] = ':';
        out += line + "\n";
    }
    return out;
}

std::string Read(const Case& one) {
    if (one.fragment.empty())
        return Dump().Of(HtmlDocument(one.data).Root());
    HtmlDocument document;
    HtmlNode& context = document.createElement(one.fragment);
    context.setInnerHTML(one.data);
    return Dump().Of(context);
}

bool Passes(const Case& one) {
    try {
        return Comparable(Read(one)) == Comparable(one.expected);
    } catch (const RaisedError&) {
        return false;
    }
}

/// What the parser, which is older than some of the cases, reads otherwise; cases for pages with scripts
/// that run, and fragments of drawings, aren't asked of it.
std::string KindOf(const Case& one) {
    const auto holds = [&](const char* text) {
        return one.data.find(text) != std::string::npos || one.fragment.find(text) != std::string::npos;
    };
    if (holds("</body>") || holds("</html>"))
        return "behind the body's end";
    for (const char* kind : {"template", "select", "ruby", "menuitem", "isindex", "search", "<dialog", "svg",
                             "math", "table", "frameset", "nobr", "input", "keygen"})
        if (holds(kind))
            return kind;
    return "other";
}

TEST(TreeConstructionTest, ThePublicCasesAreReadAsFarAsTheParserReadsThem) {
    const fs::path folder = fs::path(TOVIMAR_SOURCE_DIR) / "../shared/corpus/html5lib/tree-construction";
    if (!fs::exists(folder))
        GTEST_SKIP() << "no cases in " << folder;
    int all = 0;
    int passed = 0;
    std::map<std::string, int> failed;
    const char* wanted = std::getenv("TOVIMAR_SHOW_CASES");
    for (const auto& entry : fs::directory_iterator(folder)) {
        if (entry.path().extension() != ".dat")
            continue;
        for (const Case& one : ReadCases(entry.path())) {
            if (one.scripted || one.fragment.find(' ') != std::string::npos)
                continue;
            ++all;
            if (Passes(one)) {
                ++passed;
                continue;
            }
            ++failed[KindOf(one)];
            if (wanted != nullptr && KindOf(one) == wanted)
                std::cout << entry.path().filename() << ": " << one.data << "\n--- wanted\n"
                          << Comparable(one.expected) << "--- read\n"
                          << Comparable(Read(one)) << "\n";
        }
    }
    std::cout << passed << " of " << all << " cases pass; not:";
    for (const auto& [kind, count] : failed)
        std::cout << " " << kind << " " << count;
    std::cout << "\n";
    EXPECT_EQ(1674, all);
    EXPECT_EQ(1633, passed);
}

} // namespace
} // namespace tovimar
