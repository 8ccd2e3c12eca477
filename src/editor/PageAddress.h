#pragma once

#include <string>
#include <string_view>

namespace tovimar {

/// Where a page stands: its addresses are written relative to its folder.
struct PageAddress {
    std::string FileName;   ///< "page.htm"
    std::string BaseFolder; ///< with "/" at its end; empty when it isn't known

    /// From the page's path or address, and from the BASE element's address unless that is empty.
    static PageAddress Of(const std::string& url, const std::string& base);

    /// An address within the folder becomes relative to it, and one to a place in the page itself "#name".
    /// Others stay whole. All are URL-decoded.
    std::string Relative(std::string_view address) const;
    /// The same for an attribute that is taken from a start tag: only a folder in front is cut, and an
    /// address to the page itself keeps its name.
    std::string RelativeAsWritten(std::string_view address) const;
};

/// Takes "file:///" and "file://" out.
std::string WithoutFileScheme(std::string_view address);
/// "\" becomes "/", and the escapes of blank, "#", "&", "^", "[", "]", "{", "}" and "%" their characters;
/// then
/// "&amp;" becomes "&". A "%25" in front of two hexadecimal digits stays: decoding what comes of this again
/// must change nothing.
std::string DecodeUrl(std::string_view address);

} // namespace tovimar
