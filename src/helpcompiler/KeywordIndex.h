#pragma once

#include "helpcompiler/HelpDescription.h"
#include "helpcompiler/TopicTables.h"

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar::helpcompiler {

/// The binary index: the keywords of the index file in alphabetical order, as a tree of blocks in which a
/// viewer finds a keyword without reading all of them.
class KeywordIndex {
public:
    KeywordIndex() = default;
    /// Keywords below others are named with them: "Orders, printing". An entry that refers to another keyword
    /// leads where that one leads.
    KeywordIndex(const HelpDescription& help, const TopicTables& topics);

    bool IsEmpty() const { return keywords_.empty(); }
    /// `$WWKeywordLinks`; of an empty index `Property` alone.
    std::vector<InternalFile> Files() const;

private:
    struct Keyword {
        std::u16string text;      ///< with the keywords above it
        std::size_t lastPart = 0; ///< where its own text starts
        int level = 0;            ///< from 0
        std::vector<std::uint32_t> topics;
    };

    void Gather(const HelpDescription& help, const TopicTables& topics);
    void Sort();

    std::vector<Keyword> keywords_;
    int codePage_ = 1252;
    std::uint32_t language_ = 0;

    friend class KeywordTree;
};

} // namespace tovimar::helpcompiler
