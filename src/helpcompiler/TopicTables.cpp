#include "helpcompiler/TopicTables.h"

#include "helpcompiler/Bytes.h"
#include "platform/text/Caseless.h"

#include <algorithm>
#include <numeric>

namespace tovimar::helpcompiler {
namespace {

constexpr std::uint32_t kInArchive = 2;
constexpr std::uint32_t kInContents = 4;
constexpr std::size_t kUrlsOfPage = 341; ///< twelve bytes each, four left over

std::string KeyOf(std::string_view url) {
    std::string key(url);
    std::transform(key.begin(), key.end(), key.begin(), text::CaselessAscii);
    return key;
}

std::uint32_t OffsetOfUrl(std::size_t position) {
    return static_cast<std::uint32_t>(position / kUrlsOfPage * kTablePage + position % kUrlsOfPage * 12);
}

} // namespace

std::uint32_t HashOfUrl(std::string_view url) {
    std::uint32_t hash = 0;
    for (const char c : url) {
        const char upper = c >= 'a' && c <= 'z' ? static_cast<char>(c - 32) : c;
        std::uint32_t value = static_cast<std::uint8_t>(upper) - 0x30U;
        if (c == '/')
            value = 0x2C;
        else if (c == '_')
            value = 0x0F;
        hash = hash * 43 + value;
    }
    return hash;
}

TopicTables::TopicTables(const HelpDescription& help) : topics_(help.pages) {
    for (std::size_t i = 0; i < topics_.size(); ++i)
        numbers_.emplace(KeyOf(topics_[i].url), static_cast<std::uint32_t>(i));
    AddTargets(help.contents, true);
    AddTargets(help.index, false);
}

void TopicTables::AddTargets(const Sitemap& map, bool contents) {
    for (const SitemapEntry& entry : map.entries)
        for (const SitemapTarget& target : TargetsOf(entry)) {
            const auto number = static_cast<std::uint32_t>(topics_.size());
            const auto [known, added] = numbers_.try_emplace(KeyOf(target.url), number);
            if (added)
                topics_.push_back({target.url, target.title, !target.title.empty(), false, contents});
            else if (contents)
                topics_[known->second].inContents = true;
        }
}

std::int32_t TopicTables::NumberOf(std::string_view url) const {
    const auto found = numbers_.find(KeyOf(url));
    return found == numbers_.end() ? -1 : static_cast<std::int32_t>(found->second);
}

TopicTables::Streams TopicTables::Write(StringTable& strings) const {
    std::vector<std::uint32_t> hashes;
    for (const Topic& topic : topics_)
        hashes.push_back(HashOfUrl(topic.url));
    std::vector<std::uint32_t> order(topics_.size());
    std::iota(order.begin(), order.end(), 0U);
    std::stable_sort(order.begin(), order.end(),
                     [&](std::uint32_t left, std::uint32_t right) { return hashes[left] < hashes[right]; });

    Streams streams;
    streams.texts.push_back('\0');
    std::vector<std::uint32_t> urlOffsets(topics_.size());
    for (std::size_t position = 0; position < order.size(); ++position) {
        const std::uint32_t number = order[position];
        if (position > 0 && position % kUrlsOfPage == 0)
            PutU32(streams.urls, kTablePage);
        urlOffsets[number] = OffsetOfUrl(position);
        const std::string& url = topics_[number].url;
        StartPageFor(streams.texts, 8 + url.size() + 1);
        PutU32(streams.urls, hashes[number]);
        PutU32(streams.urls, number);
        PutU32(streams.urls, static_cast<std::uint32_t>(streams.texts.size()));
        PutU64(streams.texts, 0);
        streams.texts.append(url).push_back('\0');
    }
    for (std::size_t i = 0; i < topics_.size(); ++i) {
        const Topic& topic = topics_[i];
        PutU32(streams.topics, 0);
        PutU32(streams.topics, topic.hasTitle ? strings.Add(topic.title) : 0xFFFFFFFFU);
        PutU32(streams.topics, urlOffsets[i]);
        PutU16(streams.topics, (topic.inArchive ? kInArchive : 0) | (topic.inContents ? kInContents : 0));
        PutU16(streams.topics, 0);
    }
    return streams;
}

} // namespace tovimar::helpcompiler
