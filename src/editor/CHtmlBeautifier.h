#pragma once

#include "editor/CHtmlStringFormatter.h"

#include <cstddef>
#include <string>

namespace tovimar {

class HtmlDocument;
class HtmlNode;

/// Writes a document as neat HTML: blocks on lines of their own, two blanks for each level, addresses
/// relative to the page's folder, nothing of the editor's own. Writing what comes of it again changes
/// nothing. Lives for one run: made, given the document, asked once, disposed.
class CHtmlBeautifier {
public:
    /// Attributes as they stand in the source, instead of as the document has them. Given before the
    /// document.
    bool UseSourceAttributes = false;

    /// The document stays the caller's; it is put into design mode.
    void SetDocument(HtmlDocument& robj);
    /// Empty without a document. A node that fails is reported and passed over.
    std::string EditModeReadyHTML();
    void Dispose();

private:
    void WriteNodes(CHtmlStringBuilder& sb, const HtmlNode& root);

    HtmlDocument* document_ = nullptr;
    CHtmlStringFormatter formatter_;
};

} // namespace tovimar
