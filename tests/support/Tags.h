#pragma once

#include <map>
#include <string>
#include <vector>

namespace tovimar::test {

/// A tag with its attributes, names in lower case.
struct Tag {
    std::string name;
    std::map<std::string, std::string> attributes;
    std::string Attribute(const std::string& attribute) const;
};
std::vector<Tag> TagsOf(const std::string& html);

} // namespace tovimar::test
