#include "helpcompiler/KeywordIndex.h"

#include "helpcompiler/Bytes.h"
#include "platform/text/Text.h"

#include <algorithm>
#include <unordered_map>
#include <utility>

namespace tovimar::helpcompiler {
namespace {

constexpr std::size_t kHeaderSize = 76;
constexpr std::size_t kBlockSize = 2048;
constexpr std::size_t kLeafHead = 12;
constexpr std::size_t kNodeHead = 8;
constexpr std::uint32_t kNone = 0xFFFFFFFFU;
/// In code units. A block must hold two entries at least, or the tree would have no end.
constexpr std::size_t kLongestKeyword = 240;
constexpr std::size_t kMostTopics = 100;
constexpr std::uint32_t kDataOfKeyword = 13;

} // namespace

KeywordIndex::KeywordIndex(const HelpDescription& help, const TopicTables& topics)
    : codePage_(help.codePage), language_(help.language) {
    Gather(help, topics);
    Sort();
}

void KeywordIndex::Gather(const HelpDescription& help, const TopicTables& topics) {
    const text::CodePage page(help.codePage);
    std::vector<std::u16string> above;
    std::unordered_map<std::string, std::size_t> byName;
    std::vector<std::pair<std::size_t, std::string>> references;
    for (const SitemapEntry& entry : help.index.entries) {
        const auto level = std::min(static_cast<std::size_t>(std::max(entry.level - 1, 0)), above.size());
        above.resize(level);
        Keyword keyword;
        for (const std::u16string& part : above)
            keyword.text += part + u", ";
        const std::u16string own = text::ToUtf16(page.Decode(entry.Name()));
        keyword.lastPart = keyword.text.size();
        keyword.text += own;
        keyword.level = static_cast<int>(level);
        above.push_back(own);
        if (keyword.text.size() > kLongestKeyword)
            continue;
        for (const SitemapTarget& target : TargetsOf(entry))
            if (const std::int32_t number = topics.NumberOf(target.url);
                number >= 0 && keyword.topics.size() < kMostTopics)
                keyword.topics.push_back(static_cast<std::uint32_t>(number));
        byName.emplace(entry.Name(), keywords_.size());
        if (keyword.topics.empty() && !entry.Value("See Also").empty())
            references.emplace_back(keywords_.size(), entry.Value("See Also"));
        keywords_.push_back(std::move(keyword));
    }
    for (const auto& [number, name] : references)
        if (const auto found = byName.find(name); found != byName.end())
            keywords_[number].topics = keywords_[found->second].topics;
}

void KeywordIndex::Sort() {
    std::vector<std::pair<std::string, Keyword>> keyed;
    keyed.reserve(keywords_.size());
    for (Keyword& keyword : keywords_)
        keyed.emplace_back(text::FoldCase(text::FromUtf16(keyword.text)), std::move(keyword));
    std::stable_sort(keyed.begin(), keyed.end(),
                     [](const auto& left, const auto& right) { return left.first < right.first; });
    for (std::size_t i = 0; i < keyed.size(); ++i)
        keywords_[i] = std::move(keyed[i].second);
}

/// Lays keywords out in blocks: leaves first, then level by level the nodes that lead to them, the root last.
class KeywordTree {
public:
    explicit KeywordTree(const KeywordIndex& index) : index_(index) {
        WriteLeaves();
        lastLeaf_ = static_cast<std::uint32_t>(level_.size() - 1);
        WriteMap();
        for (; level_.size() > 1; ++depth_)
            WriteLevel();
    }

    std::string Tree() const {
        std::string out("\x3B\x29", 2);
        PutU16(out, 0x104);
        PutU16(out, kBlockSize);
        out += "X44";
        out.append(13, '\0');
        for (const std::uint32_t number : {0U, lastLeaf_, level_.front().block, kNone, Blocks()})
            PutU32(out, number);
        PutU16(out, depth_);
        for (const std::uint32_t number :
             {static_cast<std::uint32_t>(index_.keywords_.size()),
              static_cast<std::uint32_t>(index_.codePage_), index_.language_, 1U, 0x272FU})
            PutU32(out, number);
        out.resize(kHeaderSize, '\0');
        return out + blocks_;
    }

    const std::string& Map() const { return map_; }

private:
    /// A block with the first keyword below it.
    struct Child {
        std::size_t keyword;
        std::uint32_t block;
    };

    std::uint32_t Blocks() const { return static_cast<std::uint32_t>(blocks_.size() / kBlockSize); }

    /// What leaves and nodes hold alike.
    std::string EntryOf(std::size_t number) const {
        const KeywordIndex::Keyword& keyword = index_.keywords_[number];
        std::string out;
        for (const char16_t unit : keyword.text)
            PutU16(out, unit);
        PutU16(out, 0);
        PutU16(out, 0); // refers to no other keyword
        PutU16(out, static_cast<std::uint32_t>(keyword.level));
        PutU32(out, static_cast<std::uint32_t>(keyword.lastPart));
        PutU32(out, 0);
        PutU32(out, static_cast<std::uint32_t>(keyword.topics.size()));
        for (const std::uint32_t topic : keyword.topics)
            PutU32(out, topic);
        return out;
    }

    void WriteLeaves() {
        std::string entries;
        std::size_t first = 0;
        for (std::size_t i = 0; i < index_.keywords_.size(); ++i) {
            std::string entry = EntryOf(i);
            PutU32(entry, 1);
            PutU32(entry, kDataOfKeyword * static_cast<std::uint32_t>(i));
            if (kLeafHead + entries.size() + entry.size() > kBlockSize) {
                WriteLeaf(entries, first, i, false);
                first = i;
            }
            entries += entry;
        }
        WriteLeaf(entries, first, index_.keywords_.size(), true);
    }

    void WriteLeaf(std::string& entries, std::size_t first, std::size_t end, bool last) {
        const std::uint32_t block = Blocks();
        level_.push_back({first, block});
        PutHead(entries.size() + kLeafHead, end - first);
        PutU32(blocks_, block == 0 ? kNone : block - 1);
        PutU32(blocks_, last ? kNone : block + 1);
        FinishBlock(entries);
    }

    void PutHead(std::size_t used, std::size_t entries) {
        PutU16(blocks_, static_cast<std::uint32_t>(kBlockSize - used));
        PutU16(blocks_, static_cast<std::uint32_t>(entries));
    }

    void FinishBlock(std::string& entries) {
        blocks_ += entries;
        entries.clear();
        blocks_.resize((blocks_.size() + kBlockSize - 1) / kBlockSize * kBlockSize, '\0');
    }

    void WriteMap() {
        PutU16(map_, static_cast<std::uint32_t>(level_.size()));
        for (const Child& leaf : level_) {
            PutU32(map_, static_cast<std::uint32_t>(leaf.keyword));
            PutU32(map_, leaf.block);
        }
    }

    void WriteLevel() {
        const std::vector<Child> children = std::exchange(level_, {});
        for (std::size_t i = 0; i < children.size();) {
            const Child first = children[i++];
            std::string entries;
            std::size_t count = 0;
            for (; i < children.size(); ++i, ++count) {
                std::string entry = EntryOf(children[i].keyword);
                PutU32(entry, children[i].block);
                if (kNodeHead + entries.size() + entry.size() > kBlockSize)
                    break;
                entries += entry;
            }
            level_.push_back({first.keyword, Blocks()});
            PutHead(entries.size() + kNodeHead, count);
            PutU32(blocks_, first.block);
            FinishBlock(entries);
        }
    }

    const KeywordIndex& index_;
    std::string blocks_;
    std::string map_;
    std::vector<Child> level_;
    std::uint32_t lastLeaf_ = 0;
    std::uint32_t depth_ = 1;
};

std::vector<InternalFile> KeywordIndex::Files() const {
    const std::string folder = "/$WWKeywordLinks/";
    if (IsEmpty())
        return {{folder + "Property", std::string(4, '\0')}};
    const KeywordTree tree(*this);
    std::string data;
    for (std::size_t i = 0; i < keywords_.size(); ++i) {
        for (const std::uint32_t number : {0U, 5U, 0x80U})
            PutU32(data, number);
        data.push_back('\0');
    }
    std::string property;
    for (const std::uint32_t number : {0U, 0U, 0U, 12U, 1U, 1U, 0U, 0U})
        PutU32(property, number);
    return {{folder + "BTree", tree.Tree()},
            {folder + "Data", data},
            {folder + "Map", tree.Map()},
            {folder + "Property", property}};
}

} // namespace tovimar::helpcompiler
