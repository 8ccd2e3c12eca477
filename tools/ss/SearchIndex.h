#pragma once

#include "TopicText.h"

#include <cstddef>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace tovimar::search {

/// What the search page knows of the topics, as one text.
///
/// Six blocks, parted by U+0001, of lines, parted by line feeds:
///  1. file names, one a topic;
///  2. titles, in the same order;
///  3. captions of a topic's sections, an empty line behind each topic;
///  4. anchors of the sections that block 3 names: a topic with sections has a line with what its anchors
///     begin with and a line for each, what follows that: empty where it is the caption with "_" for what
///     isn't a letter or digit; a tab before an anchor that begins otherwise, a tab alone where no link
///     leads to the section;
///  5. words that stand in texts, sorted: a character that tells how many characters of the word before are
///     kept (from 48 for none), then the rest;
///  6. a line per word of block 5: the topics that hold it. A number is twice the distance from the topic
///     before (the first topic from -1), and one more where the word stands often. It goes in digits of 5
///     bits from 32, the lowest first, and a last one of 6 bits from 64.
/// A word that a topic's title or sections hold isn't noted for that topic's text once more: the page finds
/// it there and ranks it higher. That keeps the index near an eighth of the topics' text, against the half
/// that plain lists need.
class SearchIndex {
public:
    /// A word stands often in a topic from this number of times.
    static constexpr int kOften = 3;

    void AddPage(const std::string& file, const TopicText& topic);
    std::string Text() const;

private:
    struct Hit {
        std::size_t topic;
        bool often;
    };
    void AddSections(const TopicText& topic);

    std::size_t topics_ = 0;
    std::string files_, titles_, captions_, anchors_;
    std::map<std::string, std::vector<Hit>> words_;
};

/// A caption as anchors are made of it.
std::string AnchorOfCaption(const std::string& caption);

} // namespace tovimar::search
