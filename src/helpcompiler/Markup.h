#pragma once

#include "platform/text/Text.h"

#include <string>
#include <string_view>
#include <vector>

/// Walks over the markup of pages, contents and index files, whatever they hold: a tag that isn't closed ends
/// with the file, and no place of the file is looked at more than a few times.
namespace tovimar::helpcompiler {

struct MarkupAttribute {
    std::string_view name; ///< as written
    std::string_view value;
};

struct MarkupToken {
    enum class Kind { Text, RawText, OpenTag, CloseTag, Comment };
    Kind kind = Kind::Text;
    /// Of tags all from "<" to ">", of texts the text. Raw text is what a script or style sheet holds.
    std::string_view source;
    std::string name; ///< of a tag, in lower case; of raw text that of the tag around it
    std::vector<MarkupAttribute> attributes;

    /// Empty without the attribute; names go without regard to case.
    std::string_view Attribute(std::string_view wanted) const;
};

class MarkupScanner {
public:
    explicit MarkupScanner(std::string_view text) : text_(text) {}
    /// False at the end. The token's views live as long as the text.
    bool Next(MarkupToken& token);
    /// The line in which a piece of the text begins, from 1. Asked for places that only grow.
    int LineOf(std::string_view piece);

private:
    void ReadTag(MarkupToken& token);
    void ReadAttributes(MarkupToken& token);
    std::string_view ReadValue();
    void SkipBlanks();
    void ReadRawText(MarkupToken& token);
    void ReadDeclaration(MarkupToken& token);
    std::size_t FindClosing(std::string_view name) const;

    std::string_view text_;
    std::size_t place_ = 0;
    std::string rawName_; ///< a script or the like is open
    std::size_t counted_ = 0;
    int line_ = 1;
};

/// What becomes of a character reference that the code page has no byte for.
enum class Unheld { Keep, Blank };

/// Text with its character references decoded, in the bytes of the code page.
std::string DecodeReferences(std::string_view text, const text::CodePage& page, Unheld unheld);

/// Equal without regard to the case of ASCII letters.
bool EqualsCaseless(std::string_view left, std::string_view right);

} // namespace tovimar::helpcompiler
