#pragma once

#include "platform/Error.h"

#include <string>

namespace tovimar {

/// OnDisk: the file survives a power cut once it is saved. For the few files that nobody can make again.
enum class Durability { Ordinary, OnDisk };

/// Writes text files. A file is replaced by a finished one; an existing read-only file is a failure.
class CUTF8FileWriter {
public:
    /// Lets the collected text go.
    void Dispose() { ClearText(); }
    void ClearText() { text_.clear(); }
    void AddText(const std::string& vstrText) { text_ += vstrText; }
    /// Writes `vstrText`, or the collected text when that is empty. UTF-8, with the three header bytes when
    /// asked for. With `vfSaveAsUsualTextFileIfNotUTF8` a text without a UTF-8 mark goes out in the ANSI
    /// code page; what the page can't hold becomes a numeric reference in HTML and "?" elsewhere.
    /// 0; kGeneralFailure for an empty path; other failures are reported and their number returned.
    ResultCode SaveFile(const std::string& vstrFileFullPath, const std::string& vstrText = {},
                        bool vfAddUTF8FileHeader = false, bool vfSaveAsUsualTextFileIfNotUTF8 = false,
                        Durability durability = Durability::Ordinary);

private:
    std::string text_;
};

/// Bytes of a plain text file in the ANSI code page, as SaveFile writes them.
std::string EncodePlainText(std::string text);

} // namespace tovimar
