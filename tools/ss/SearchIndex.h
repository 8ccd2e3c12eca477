#pragma once

#include "TopicText.h"

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace tovimar::search {

/// A page as the result list shows it.
struct Page {
    std::string file; ///< name without folder
    std::string title;
    std::string summary; ///< the page's first words
};

/// Pages and, by word, where it stands. Everything is in a fixed order, so the same folder gives the same
/// search page.
class SearchIndex {
public:
    /// What a hit in the title counts more than one in the text, and the most that hits in the text count:
    /// a title always wins.
    static constexpr int kTitleWeight = 10000;
    static constexpr int kMostTextWeight = 999;

    using Hits = std::vector<std::pair<std::size_t, int>>; ///< page number from 0, weight

    void AddPage(const std::string& file, const TopicText& topic);
    const std::vector<Page>& Pages() const { return pages_; }
    const std::map<std::string, Hits>& Words() const { return words_; }

private:
    std::vector<Page> pages_;
    std::map<std::string, Hits> words_;
};

} // namespace tovimar::search
