#include "helpcompiler/SearchIndex.h"
#include "helpcompiler/CodePageText.h"
#include "helpcompiler/PageReader.h"
#include "helpcompiler/WordTable.h"
#include "support/SearchReader.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>

using namespace tovimar::helpcompiler;
using tovimar::text::CodePage;

namespace {

std::vector<std::string> WordsOf(std::string_view text, int codePage = 1252) {
    std::vector<std::string> words;
    SplitWords(text, codePage, [&](std::string_view word) { words.emplace_back(word); });
    return words;
}

using Words = std::vector<std::string>;

PageWords Page(std::initializer_list<std::string_view> words, std::uint32_t titleWords = 0) {
    PageWords page;
    for (const std::string_view word : words)
        page.Add(word);
    page.titleWords = titleWords;
    return page;
}

/// The references that the pages use most; an empty text for a page with others.
std::string WithoutReferences(std::string page) {
    for (const auto& [name, character] :
         {std::pair{"&nbsp;", "\xA0"}, {"&lt;", " "}, {"&gt;", " "}, {"&quot;", " "}, {"&amp;", " "}})
        page = tovimar::text::ReplaceAll(page, name, character);
    return page.find('&') == std::string::npos ? page : std::string();
}

/// The visible words of a page by the plainest means: tags out, the rest split.
std::set<std::string> PlainScan(const std::string& page, int codePage) {
    std::set<std::string> words;
    std::string text;
    const auto finish = [&] {
        for (const std::string& word : WordsOf(text, codePage))
            words.insert(word);
        text.clear();
    };
    std::string hidden;
    for (std::size_t i = 0; i < page.size(); ++i) {
        if (page[i] != '<') {
            text += page[i];
            continue;
        }
        finish();
        const bool comment = page.compare(i, 4, "<!--") == 0;
        for (const char* name : {"script", "style"})
            if (page.compare(i + 1, std::strlen(name), name) == 0)
                hidden = std::string("</") + name;
        std::size_t end = i;
        if (comment)
            end = page.find("-->", i) + 2;
        else if (!hidden.empty())
            end = page.find('>', page.find(hidden, i));
        else
            for (char quote = 0; end < page.size() && (page[end] != '>' || quote != 0); ++end)
                if (page[end] == '"')
                    quote = quote == 0 ? '"' : '\0';
        hidden.clear();
        i = end;
    }
    finish();
    return words;
}

std::string Bytes(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace

TEST(WordsTest, AreSplitAndFoldedAsTheViewerLooksThemUp) {
    EXPECT_EQ(WordsOf("Hello, World! snake_case a-b"), (Words{"hello", "world", "snake_case", "a", "b"}));
    EXPECT_EQ(WordsOf("don't rock'n'roll 'quoted'"), (Words{"dont", "rocknroll", "quoted"}));
    EXPECT_EQ(WordsOf("1,234.50 3.14. 2.bin v2.0 5'6"),
              (Words{"1234.50", "3.14", "2.bin", "v2", "0", "5", "6"}));
    EXPECT_EQ(WordsOf("\xC4rger \xC9t\xC9 stra\xDF"
                      "e \xC6sop \x9Cuvre Nu\xF1o"),
              (Words{"arger", "ete", "strasse", "aesop", "oeuvre", "nuno"}));
    EXPECT_EQ(WordsOf("\x8Akoda \x9Akola \x9Fves \xF0 \xDE\xFE"),
              (Words{"skoda", "skola", "yves", "o", "\xDE\xFE"}));
    EXPECT_EQ(WordsOf("a\xA0"
                      "b\x97"
                      "c\xD7"
                      "d"),
              (Words{"a", "b", "c", "d"}));
    EXPECT_EQ(WordsOf(". , ' ..."), Words{});
    EXPECT_EQ(WordsOf(std::string(600, 'x')), Words{std::string(kLongestWord, 'x')});
}

TEST(WordsTest, BytesOfAllSingleByteCodePagesGoThroughOneTable) {
    const std::string russian = CodePage(1251).Encode("Заказ");
    EXPECT_EQ(WordsOf(russian, 1251), Words{"caeac"});
    EXPECT_EQ(WordsOf(CodePage(932).Encode("注文 Orders 一覧"), 932), Words{"orders"});
}

TEST(SearchIndexTest, FindsWordsWithTheirPlacesInTextsAndTitles) {
    SearchIndex index;
    index.Add(2, Page({"orders", "list", "of", "orders"}, 2));
    index.Add(7, Page({"orders"}));
    const SearchReader reader(index.Bytes(1252, 0x409));
    const auto hits = reader.Find("orders");
    ASSERT_EQ(hits.size(), 2U);
    ASSERT_EQ(hits.at(2).size(), 2U);
    EXPECT_FALSE(hits.at(2)[0].title);
    EXPECT_EQ(hits.at(2)[0].places, std::vector<std::uint32_t>{3});
    EXPECT_TRUE(hits.at(2)[1].title);
    EXPECT_EQ(hits.at(2)[1].places, std::vector<std::uint32_t>{0});
    EXPECT_EQ(reader.Words(), (Words{"list", "of", "orders", "orders"}));
    EXPECT_TRUE(reader.Find("order").empty());
    EXPECT_TRUE(reader.Find("zebra").empty());
    EXPECT_EQ(reader.Number(0x04), 2U);
    EXPECT_EQ(reader.Number(0x7A), 1252U);
    EXPECT_EQ(SearchIndex().Bytes(1252, 0x409), "");
}

TEST(SearchIndexTest, StandsOnSeveralLevelsWithManyPages) {
    SearchIndex index;
    const auto wordOf = [](std::uint32_t number) {
        return std::to_string(number * 7919 % 60000) + std::string(50, 'x');
    };
    for (std::uint32_t page = 0; page < 3000; ++page) {
        PageWords words;
        for (std::uint32_t i = 0; i < 20; ++i)
            words.Add(wordOf(page * 20 + i));
        words.Add("everywhere");
        index.Add(page * 3, words);
    }
    const SearchReader reader(index.Bytes(1252, 0x409));
    EXPECT_GE(reader.Number(0x18, 2), 3U);
    for (std::uint32_t number = 0; number < 60000; number += 97)
        ASSERT_EQ(reader.Topics(wordOf(number)), std::set<std::uint32_t>{number / 20 * 3}) << number;
    EXPECT_EQ(reader.Topics("everywhere").size(), 3000U);
    EXPECT_EQ(reader.Find("everywhere").at(8997)[0].places, std::vector<std::uint32_t>{20});
    const auto words = reader.Words();
    EXPECT_EQ(words.size(), 60001U);
    EXPECT_TRUE(std::is_sorted(words.begin(), words.end()));
}

/// Every word of every page of the folders is found in exactly the pages in which a plain scan finds it.
TEST(SearchIndexTest, FindsWhatAPlainScanFindsInRealPages) {
    std::vector<std::filesystem::path> files;
    for (const char* folder : {"/tests/golden", "/samples", "/../shared/corpus"})
        if (const std::string root = TOVIMAR_SOURCE_DIR + std::string(folder); std::filesystem::exists(root))
            for (const auto& entry : std::filesystem::recursive_directory_iterator(root))
                if (const auto extension = entry.path().extension();
                    extension == ".htm" || extension == ".html")
                    files.push_back(entry.path());
    ASSERT_FALSE(files.empty());
    const CodePage page(1252);
    SearchIndex index;
    std::map<std::string, std::set<std::uint32_t>> expected;
    for (std::uint32_t number = 0; number < files.size(); ++number) {
        const std::string bytes = InCodePage(Bytes(files[number]), page);
        const std::string plain = WithoutReferences(bytes);
        if (plain.empty())
            continue;
        index.Add(number, ReadPage(bytes, page).words);
        for (const std::string& word : PlainScan(plain, 1252))
            expected[word].insert(number);
    }
    const SearchReader reader(index.Bytes(1252, 0x409));
    auto words = reader.Words();
    words.erase(std::unique(words.begin(), words.end()), words.end());
    EXPECT_EQ(words.size(), expected.size());
    for (const auto& [word, topics] : expected)
        EXPECT_EQ(reader.Topics(word), topics) << word;
}
