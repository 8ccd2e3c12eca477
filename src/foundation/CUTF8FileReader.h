#pragma once

#include "platform/Error.h"

#include <cstdint>
#include <string>

namespace tovimar {

/// A text file that may be UTF-8. It is when it begins with the bytes 239, 187, 191 or when one of the marks
/// of `HasUtf8Mark` stands in its first 2048 characters; otherwise it is text of the ANSI code page.
class CUTF8FileReader {
public:
    /// Lets the text go.
    void Dispose();
    /// 0; kGeneralFailure for an empty path; other failures are reported and their number returned.
    ResultCode LoadFile(const std::string& vstrFileFullPath);
    /// Of the file, in bytes.
    std::int32_t Length() const { return length_; }
    bool IsUTF8() const { return isUtf8_; }
    bool HasUTF8Header() const { return hasHeader_; }
    /// UTF-8 without the header; ill-formed bytes become U+FFFD.
    const std::string& Text() const { return text_; }

private:
    void Read(const std::string& path);

    std::int32_t length_ = 0;
    bool isUtf8_ = false;
    bool hasHeader_ = false;
    std::string text_;
};

/// True when the text says of itself that it is UTF-8: `content="text/html; charset=utf-8"` or
/// `encoding="utf-8"`, without regard to case.
bool HasUtf8Mark(const std::string& text);

} // namespace tovimar
