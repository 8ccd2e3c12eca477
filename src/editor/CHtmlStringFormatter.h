#pragma once

#include "editor/CHtmlStringBuilder.h"
#include "editor/PageAddress.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <unordered_set>

namespace tovimar {

class HtmlNode;
struct HtmlAttribute;

/// Writes the chunks of a page: tags on lines of their own with two blanks for each level, attributes in
/// double quotes, entities. A line end is put only where a blank shows nothing or stands anyhow, so that a
/// word with a bold letter in it stays one word; preformatted text stays as it is. For one page.
class CHtmlStringFormatter {
public:
    PageAddress Page;
    /// Attributes are taken from the start tags as they were written.
    bool UseSourceAttributes = false;

    enum class Chunk {
        Open,    ///< its children come next, then its end tag
        Finished ///< all of it is written
    };
    /// Writes an element's start tag, or all of another node. Levels begin at 1.
    Chunk AddChunk(CHtmlStringBuilder& sb, std::size_t level, const HtmlNode& node);
    /// Writes an element's end tag, unless it has none or it is written already.
    void addClosedChunk(CHtmlStringBuilder& sb, std::size_t level, const HtmlNode& node);

private:
    void WriteText(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node);
    void WriteComment(CHtmlStringBuilder& sb, const HtmlNode& node);
    void WriteIsland(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node);
    void WriteElement(CHtmlStringBuilder& sb, std::size_t level, const HtmlNode& node);
    void BeginIsIndex(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& form,
                      const HtmlNode& input);
    void WriteOpening(CHtmlStringBuilder& sb, const std::string& indent, std::string_view name);
    void WriteAttributes(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node);
    void WriteAttribute(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node,
                        const HtmlAttribute& attribute);
    std::string ValueOf(const HtmlNode& node, const HtmlAttribute& attribute) const;
    void WriteContent(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node);
    void WriteClosing(CHtmlStringBuilder& sb, const std::string& indent, const HtmlNode& node);
    std::string ShownText(const HtmlNode& node) const;
    bool MayBreak(const CHtmlStringBuilder& sb) const;
    static void BreakLine(CHtmlStringBuilder& sb);
    void NoteEdge(const HtmlNode& node);

    std::string lastNode_;      ///< name of the node that was written last
    bool lastWasBlank_ = false; ///< it was a text of one blank
    bool atEdge_ = true;        ///< nothing shows yet on the line that stands here when the page is shown
    int preformatted_ = 0;      ///< levels of elements whose white space shows
    const HtmlNode* isIndex_ = nullptr; ///< the form that an ISINDEX is written for
    std::unordered_set<std::string> closed_;
};

} // namespace tovimar
