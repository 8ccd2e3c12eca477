#pragma once

#include <string_view>

namespace tovimar {

/// Looks over a page before it is parsed and raises kFailure1 for one that is longer than 64 MiB, nests more
/// than 2,000 levels or has a tag with more than 1,000 attributes: the parser's time grows with the square of
/// either. Only roughly a parser itself; a page by hand or by any tool stays far below.
void CheckHtmlBounds(std::string_view html);

} // namespace tovimar
