#pragma once

#include "helpcompiler/HelpDescription.h"
#include "helpcompiler/StringTable.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace tovimar::helpcompiler {

/// Every address that the viewer has a number for: first the pages of the archive, in the order in which they
/// are given, then what contents and index name besides (other pages, places of a page).
class TopicTables {
public:
    /// Marks the pages that the contents name.
    explicit TopicTables(const HelpDescription& help);

    const std::vector<Topic>& Topics() const { return topics_; }
    /// Number of an address, which is looked up without regard to case; -1 for one that isn't known.
    std::int32_t NumberOf(std::string_view url) const;

    struct Streams {
        std::string topics; ///< `#TOPICS`
        std::string urls;   ///< `#URLTBL`
        std::string texts;  ///< `#URLSTR`
    };
    /// Titles go into `strings`.
    Streams Write(StringTable& strings) const;

private:
    void AddTargets(const Sitemap& map, bool contents);

    std::vector<Topic> topics_;
    std::unordered_map<std::string, std::uint32_t> numbers_;
};

/// The viewer's key of an address.
std::uint32_t HashOfUrl(std::string_view url);

} // namespace tovimar::helpcompiler
