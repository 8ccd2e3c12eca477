#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace tovimar {

/// A fault in a text that was to be XML: where, in bytes from 0, and what.
struct XmlFault {
    std::size_t offset = 0;
    std::string reason;
};

/// Limits of a document, so that no file can take the memory or the stack.
constexpr std::size_t kMaxXmlBytes = std::size_t{64} << 20;
constexpr int kMaxXmlDepth = 512;

/// Checks that a UTF-8 text is a well-formed document within the limits. The library that builds the tree
/// lets much pass (bare ampersands, several roots, attributes twice), which its callers must not see.
/// Numeric references to control characters pass: captions of applications hold them.
std::optional<XmlFault> CheckXml(std::string_view text);

} // namespace tovimar
