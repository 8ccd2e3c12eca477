#pragma once

#include "platform/Error.h"

#include <memory>
#include <string>

namespace tovimar {

class HtmlDocument;
class HtmlNode;

/// Adds to a saved page, which is the writer's: all that isn't added stays as it was written, to the byte.
/// The file is replaced by a finished one, and nothing on the disk changes before `SaveDoc`.
class CFormHTMLManipulator {
public:
    CFormHTMLManipulator();
    ~CFormHTMLManipulator();
    CFormHTMLManipulator(const CFormHTMLManipulator&) = delete;
    CFormHTMLManipulator& operator=(const CFormHTMLManipulator&) = delete;

    /// Reads a page, without the web help's script behind its end. With `rdoc`, that document is used; it
    /// stays the caller's. 0; kGeneralFailure for an empty path; else the number of a reported failure.
    ResultCode LoadHtmlDocument(const std::string& vstrURLorFullPath, HtmlDocument* rdoc = nullptr);
    /// Appends an element at the end of the body, on lines of its own. kGeneralFailure without a document.
    ResultCode AddHTMLElementToBody(const std::string& vstrHTMLTag, const std::string& vstrInnerHtml);
    /// Writes the page back, script included; the old file stands beside it under a backup name.
    /// 0; kGeneralFailure without a path; else the number of a reported failure, with the old file as it was.
    ResultCode SaveDoc();
    /// Lets the document go.
    void Terminate();

    /// Null before a page is loaded.
    HtmlDocument* Document() const { return document_; }

private:
    struct Page;
    void Load(const std::string& path);
    void Append(HtmlNode& element);
    std::string Text() const;
    ResultCode Replace(const std::string& finished) const;

    std::string path_;
    std::unique_ptr<HtmlDocument> own_;
    HtmlDocument* document_ = nullptr;
    std::unique_ptr<Page> page_;
};

} // namespace tovimar
