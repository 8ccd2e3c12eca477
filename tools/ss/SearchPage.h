#pragma once

#include "SearchIndex.h"

#include <string>

namespace tovimar::search {

/// The search page: one file with script and index inside, so it works from a file address and needs no
/// server. Line ends are CRLF. A query behind "?q=" or "#q=" in the page's address is searched at once.
///
/// The web help takes the form and the help line out of the page and changes the link function by text
/// replacement; those pieces are format, to the blank.
std::string SearchPageText(const SearchIndex& index);

} // namespace tovimar::search
