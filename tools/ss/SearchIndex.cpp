#include "SearchIndex.h"

#include "platform/text/Text.h"

#include <algorithm>

namespace tovimar::search {

namespace {

constexpr std::size_t kSummaryCharacters = 160;

std::string Summary(const std::string& body) {
    const auto head = text::Left(body, kSummaryCharacters);
    return head.size() == body.size() ? head : head + "...";
}

} // namespace

void SearchIndex::AddPage(const std::string& file, const TopicText& topic) {
    const auto number = pages_.size();
    pages_.push_back({file, topic.title.empty() ? file : topic.title, Summary(topic.body)});
    std::map<std::string, int> weights;
    for (const auto& word : WordsOf(topic.body)) {
        auto& weight = weights[word];
        weight = std::min(weight + 1, kMostTextWeight);
    }
    for (const auto& word : WordsOf(topic.title)) {
        auto& weight = weights[word];
        if (weight < kTitleWeight)
            weight += kTitleWeight;
    }
    for (const auto& [word, weight] : weights)
        words_[word].emplace_back(number, weight);
}

} // namespace tovimar::search
