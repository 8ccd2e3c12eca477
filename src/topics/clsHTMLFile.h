#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

/// A page that is read from a template or an earlier page, filled in and written. The old file stands until
/// the new one is finished, also when the program is ended in between. Made for one page: loaded, given its
/// properties, saved.
class clsHTMLFile {
public:
    std::string Title;       ///< text of the `title` element
    std::string Caption;     ///< text of the first `h1` element
    std::string CSSFullPath; ///< style sheet
    std::string ZoomFactor;  ///< screen zoom; empty for none
    std::string Charset;     ///< empty takes the run's
    std::string Body;        ///< replaces "{{BODY}}"
    std::string HTML;        ///< the whole page

    const std::string& FullPath() const { return fullPath_; }

    /// Reads the page, its title and its caption. 0; 0x80040001 for an empty path, 0x80040002 for a missing
    /// file, else the number of a reported failure.
    ResultCode Load(const std::string& vstrFullPath);
    /// Takes the text that stands, or will stand, at a path.
    ResultCode LoadText(const std::string& vstrFullPath, std::string text);
    /// Fills the page in and writes it; the path given or the last one. 0; 0x80040001 without a path; else
    /// the number of a reported failure, with the old file as it was and a message that says so.
    ResultCode Save(const std::string& vstrFullPath = {});

private:
    ResultCode SetAttributes();
    void FillTags();
    void PutScreenshotsMessage();
    void TellNotSaved(bool originalStands) const;

    std::string fullPath_;
};

} // namespace tovimar
