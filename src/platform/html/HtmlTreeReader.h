#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace tovimar {

class HtmlDocument;
class HtmlNode;

/// Builds the tree of a text: the parser reads, its nodes become ours with the places in the source that they
/// were read from.
class HtmlTreeReader {
public:
    /// `source` is kept by the document.
    HtmlTreeReader(HtmlDocument& document, std::string_view source) : document_(document), source_(source) {}

    void ReadDocument(HtmlNode& root);
    /// What stands in an element `context`, put behind `parent`'s children.
    void ReadFragment(HtmlNode& parent, const HtmlNode& context);

private:
    /// The parser's nodes, whose types are its own.
    struct Parsed;
    void Copy(const void* parsedParent, HtmlNode& parent);
    HtmlNode& NodeOf(const void* parsed);
    void FillElement(HtmlNode& node, const void* parsed);
    void FillAttributes(HtmlNode& node, const void* parsed);
    void FillText(HtmlNode& node, const void* parsed);
    void AddDoctype(HtmlNode& root);
    static void CheckTexts(const HtmlNode& root);
    void PutTailBehindBody();
    static std::string CutSpaces(HtmlNode& node, std::size_t most);
    std::string_view Checked(std::string_view part) const;

    HtmlDocument& document_;
    std::string_view source_;
};

} // namespace tovimar
