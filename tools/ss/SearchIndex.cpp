#include "SearchIndex.h"

#include "Folding.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>

namespace tovimar::search {

namespace {

constexpr char kFirstKept = 48;
constexpr std::size_t kMostKept = 127 - 48;

/// What a topic's anchors begin with: what stands before the caption in the first one that ends with it,
/// else all of the first one up to its last "_".
std::string Beginning(const std::vector<Section>& sections) {
    for (const auto& [anchor, caption] : sections) {
        const auto own = '_' + AnchorOfCaption(caption);
        if (anchor.size() >= own.size() && anchor.compare(anchor.size() - own.size(), own.size(), own) == 0)
            return anchor.substr(0, anchor.size() - own.size() + 1);
    }
    for (const auto& section : sections)
        if (!section.anchor.empty())
            return section.anchor.substr(0, section.anchor.rfind('_') + 1);
    return {};
}

std::string AnchorLine(const Section& section, const std::string& beginning) {
    if (section.anchor.empty())
        return "\t";
    if (section.anchor.compare(0, beginning.size(), beginning) != 0 || section.anchor == beginning)
        return '\t' + section.anchor;
    const auto rest = section.anchor.substr(beginning.size());
    return rest == AnchorOfCaption(section.caption) ? "" : rest;
}

void AppendNumber(std::string& out, std::size_t number) {
    for (; number >= 64; number >>= 5U)
        out += static_cast<char>(32 + (number & 31U));
    out += static_cast<char>(64 + number);
}

/// The word behind the characters that it shares with the one before.
std::string FrontCoded(const std::string& before, const std::string& word) {
    const auto last = text::ToCodePoints(before);
    const auto now = text::ToCodePoints(word);
    const auto shared = std::mismatch(last.begin(), last.end(), now.begin(), now.end()).second - now.begin();
    const auto kept = std::min(static_cast<std::size_t>(shared), kMostKept);
    return static_cast<char>(kFirstKept + static_cast<char>(kept)) +
           text::FromCodePoints(std::u32string_view(now).substr(kept));
}

} // namespace

std::string AnchorOfCaption(const std::string& caption) {
    std::string anchor;
    for (const char c : caption) {
        const bool plain =
            (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c & 0x80) != 0;
        if (plain)
            anchor += c;
        else if (anchor.empty() || anchor.back() != '_')
            anchor += '_';
    }
    return anchor;
}

void SearchIndex::AddSections(const TopicText& topic) {
    const auto beginning = Beginning(topic.sections);
    if (!topic.sections.empty())
        anchors_ += beginning + '\n';
    for (const auto& section : topic.sections) {
        captions_ += section.caption + '\n';
        anchors_ += AnchorLine(section, beginning) + '\n';
    }
    captions_ += '\n';
}

void SearchIndex::AddPage(const std::string& file, const TopicText& topic) {
    files_ += file + '\n';
    const auto title = topic.title.empty() ? file : topic.title;
    titles_ += title + '\n';
    AddSections(topic);
    std::unordered_map<std::string, int> counts;
    for (auto& word : WordsOf(topic.body))
        ++counts[std::move(word)];
    for (const auto& word : WordsOf(title))
        counts.erase(word);
    for (const auto& section : topic.sections)
        for (const auto& word : WordsOf(section.caption))
            counts.erase(word);
    for (const auto& [word, count] : counts)
        words_[word].push_back({topics_, count >= kOften});
    ++topics_;
}

std::string SearchIndex::Text() const {
    std::string vocabulary;
    std::string hits;
    std::string before;
    for (const auto& [word, list] : words_) {
        vocabulary += FrontCoded(before, word) + '\n';
        before = word;
        std::size_t next = 0;
        for (const auto& hit : list) {
            AppendNumber(hits, 2 * (hit.topic + 1 - next) + (hit.often ? 1 : 0));
            next = hit.topic + 1;
        }
        hits += '\n';
    }
    return text::Join({files_, titles_, captions_, anchors_, vocabulary, hits}, "\x01");
}

} // namespace tovimar::search
