#pragma once

#include "editor/CStringBuilder.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace tovimar {

/// The text of a page while it is written, with a look at its end.
class CHtmlStringBuilder {
public:
    /// Size of the buffer and by how much it grows; 0 takes the size.
    void Init(std::size_t vlngInitBufSize, std::size_t vlngBufExt = 0);
    /// Appends; with `vfAddCrLf` on a line of its own, unless the text is empty.
    void AddString(std::string_view vstr, bool vfAddCrLf = false);
    /// In characters.
    std::size_t CurrentLen() const { return builder_.Length(); }
    bool IsEmpty() const { return builder_.TheString().empty(); }
    std::string Value() const { return builder_.ToString(); }
    bool LastTokenIsCrLf() const { return builder_.TheString().ends_with("\r\n"); }
    /// The text so far ends in a blank or a line end.
    bool EndsInSpace() const;
    void RemoveTrailingVbCrLf();
    void RemoveTrailingBlank();
    /// Trims the lines, drops the empty ones and puts `vstrPref` in front of each but the first. An empty
    /// first line stays.
    static void formatString(std::string& rstr, std::string_view vstrPref);

private:
    CStringBuilder builder_;
};

} // namespace tovimar
