#pragma once

#include <string>
#include <string_view>

namespace tovimar {

class HtmlNode;

/// Writes nodes as markup: as they were written where they weren't changed.
class HtmlWriter {
public:
    explicit HtmlWriter(std::string& out) : out_(out) {}

    /// The node with all below it.
    void Write(const HtmlNode& node);
    void WriteChildren(const HtmlNode& parent);
    void WriteStart(const HtmlNode& node);

private:
    void WriteEnd(const HtmlNode& node);
    void WriteText(const HtmlNode& node);
    void WriteOther(const HtmlNode& node);

    std::string& out_;
};

/// "&", "<" and ">" as entities, and the blank that doesn't break; with `quotes`, which is for attributes,
/// the double quote instead of that blank. Control characters beyond ASCII, which readers take for faults, as
/// numbers.
void AppendEncoded(std::string& out, std::string_view text, bool quotes);

/// The name under which an element is written: nothing can stand behind a PLAINTEXT.
std::string_view WrittenName(const HtmlNode& node);

} // namespace tovimar
