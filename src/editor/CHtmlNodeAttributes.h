#pragma once

#include "editor/CHtmlAttribute.h"
#include "editor/PageAddress.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace tovimar {

class HtmlNode;

/// Reads the attributes of an element from its start tag, entities and all, as they were written.
class CHtmlNodeAttributes {
public:
    PageAddress Page;

    /// In the order of the source. White space outside quotes is joined; one without a value has "".
    /// "href" and "src" become relative to the page's folder.
    std::vector<CHtmlAttribute> GetNodeAttributes(const HtmlNode& node) const;

private:
    std::string ValueOf(std::string_view name, std::string_view written) const;
};

} // namespace tovimar
