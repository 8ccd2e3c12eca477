#include "helpcompiler/Bytes.h"
#include "helpcompiler/InternalFiles.h"
#include "helpcompiler/KeywordIndex.h"
#include "helpcompiler/WindowLine.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>

using namespace tovimar::helpcompiler;

namespace {

std::uint32_t Number(const std::string& bytes, std::size_t offset, std::size_t size = 4) {
    std::uint32_t number = 0;
    for (std::size_t i = size; i-- > 0;)
        number = number << 8 | static_cast<unsigned char>(bytes.at(offset + i));
    return number;
}

std::string TextAt(const std::string& bytes, std::size_t offset) {
    return bytes.substr(offset, bytes.find('\0', offset) - offset);
}

SitemapEntry Entry(const std::string& name, const std::string& url, int level = 1) {
    return {level, 1, {{"Name", name}, {"Local", url}}};
}

Topic Page(const std::string& url, const std::string& title = {}) {
    return {url, title, !title.empty(), true, false};
}

std::map<std::uint32_t, std::string> Records(const std::string& system) {
    std::map<std::uint32_t, std::string> records;
    for (std::size_t at = 4; at < system.size(); at += 4 + Number(system, at + 2, 2))
        records[Number(system, at, 2)] = system.substr(at + 4, Number(system, at + 2, 2));
    return records;
}

/// Looks a keyword up from the root down, as a viewer does. Its topics; nothing when it isn't there.
std::vector<std::uint32_t> FindKeyword(const std::string& tree, const std::u16string& wanted) {
    const auto block = [&](std::uint32_t number) {
        return tree.substr(76 + 2048 * std::size_t{number}, 2048);
    };
    const auto read = [](const std::string& bytes, std::size_t& at, std::vector<std::uint32_t>& topics) {
        std::u16string text;
        for (; Number(bytes, at, 2) != 0; at += 2)
            text.push_back(static_cast<char16_t>(Number(bytes, at, 2)));
        const std::uint32_t count = Number(bytes, at + 14);
        at += 18;
        topics.clear();
        for (std::uint32_t i = 0; i < count; ++i, at += 4)
            topics.push_back(Number(bytes, at));
        return text;
    };
    std::uint32_t number = Number(tree, 30);
    std::vector<std::uint32_t> topics;
    for (std::uint32_t depth = Number(tree, 42, 2); depth > 1; --depth) {
        const std::string node = block(number);
        number = Number(node, 4);
        std::size_t at = 8;
        for (std::uint32_t left = Number(node, 2, 2); left > 0; --left, at += 4) {
            if (read(node, at, topics) > wanted)
                break;
            number = Number(node, at);
        }
    }
    const std::string leaf = block(number);
    std::size_t at = 12;
    for (std::uint32_t left = Number(leaf, 2, 2); left > 0; --left, at += 8)
        if (read(leaf, at, topics) == wanted)
            return topics;
    return {};
}

} // namespace

TEST(TopicTablesTest, NumberPagesFirstAndOtherPlacesBehindThem) {
    HelpDescription help;
    help.pages = {Page("b.htm", "B"), Page("A.htm")};
    help.contents.entries = {Entry("first", "a.HTM"), Entry("place", "b.htm#x")};
    help.index.entries = {Entry("key", "other.htm")};
    const TopicTables tables(help);
    EXPECT_EQ(tables.NumberOf("B.HTM"), 0);
    EXPECT_EQ(tables.NumberOf("nowhere.htm"), -1);
    StringTable strings;
    const auto streams = tables.Write(strings);
    ASSERT_EQ(streams.topics.size(), 4 * 16U);
    const std::pair<std::string, std::uint32_t> expected[] = {
        {"b.htm", 2}, {"A.htm", 6}, {"b.htm#x", 4}, {"other.htm", 0}};
    for (std::size_t i = 0; i < 4; ++i) {
        const std::uint32_t url = Number(streams.topics, 16 * i + 8);
        EXPECT_EQ(Number(streams.urls, url + 4), i);
        EXPECT_EQ(TextAt(streams.texts, Number(streams.urls, url + 8) + 8), expected[i].first);
        EXPECT_EQ(Number(streams.urls, url), HashOfUrl(expected[i].first));
        EXPECT_EQ(Number(streams.topics, 16 * i + 12, 2), expected[i].second);
    }
    EXPECT_EQ(TextAt(strings.Bytes(), Number(streams.topics, 4)), "B");
    EXPECT_EQ(Number(streams.topics, 16 + 4), 0xFFFFFFFFU) << "no title";
}

TEST(TopicTablesTest, KeepToPages) {
    HelpDescription help;
    for (int i = 0; i < 1000; ++i)
        help.pages.push_back(Page("folder/page" + std::to_string(i) + ".htm", "Title " + std::to_string(i)));
    StringTable strings;
    const auto streams = TopicTables(help).Write(strings);
    std::uint32_t last = 0;
    for (std::size_t at = 0, i = 0; at + 12 <= streams.urls.size(); at += 12, ++i) {
        if (i > 0 && i % 341 == 0) {
            EXPECT_EQ(Number(streams.urls, at), 4096U);
            at += 4;
        }
        EXPECT_GE(Number(streams.urls, at), last);
        last = Number(streams.urls, at);
        const std::size_t text = Number(streams.urls, at + 8);
        EXPECT_EQ(text / 4096, (text + 8 + TextAt(streams.texts, text + 8).size()) / 4096);
    }
    EXPECT_EQ(TextAt(strings.Bytes(), strings.Add("Title 999")), "Title 999");
}

TEST(StreamsTest, SystemTellsOfTheHelp) {
    HelpDescription help;
    help.language = 0x419;
    help.fullTextSearch = true;
    help.title = "T";
    help.defaultTopic = "a.htm";
    help.contentsFile = "p.hhc";
    help.indexFile = "p.hhk";
    help.compiledFile = "out/My Help.chm";
    help.defaultWindow = "MAIN";
    help.time = 1;
    StringTable strings;
    const std::string header = IndexHeaderStream(help, 7, strings);
    ASSERT_EQ(header.size(), 4096U);
    EXPECT_EQ(Number(header, 0x0C), 7U);
    auto records = Records(SystemStream(help, header, false));
    EXPECT_EQ(records[0], std::string("p.hhc\0", 6));
    EXPECT_EQ(records[1], std::string("p.hhk\0", 6));
    EXPECT_EQ(records[2], std::string("a.htm\0", 6));
    EXPECT_EQ(records[6], std::string("my help\0", 8));
    EXPECT_EQ(Number(records[4], 0), 0x419U);
    EXPECT_EQ(Number(records[4], 8), 1U);
    EXPECT_EQ(records[13], header);
    EXPECT_FALSE(records.contains(7));

    help.windows = {
        *ParseWindowLine("Main=\"A, b\",\"w.hhc\",\"w.hhk\",\"a.htm\",,,,,,0x23520,[1],0x184e,[10,-20,300,"
                         "400],,,,1,,,0")};
    records = Records(SystemStream(help, header, true));
    EXPECT_FALSE(records.contains(0)) << "the window names its own contents";
    EXPECT_EQ(Number(records[7], 0), HashOfUrl("p.hhk"));
}

TEST(StreamsTest, WindowsAndContexts) {
    const auto window =
        ParseWindowLine("main = \"A, b\",\"t\\w.hhc\",,\"a.htm\",\"h.htm\",\"u.htm\",\"Jump\",,,0x23520,"
                        "222,0x184e,[10,-20,300,400],0x100,,1,0,,2,0");
    ASSERT_TRUE(window);
    EXPECT_FALSE(ParseWindowLine("no name"));
    StringTable strings;
    const std::string bytes = WindowsStream({*window}, strings);
    ASSERT_EQ(bytes.size(), 8 + 0xC4U);
    const auto field = [&](std::size_t offset) { return Number(bytes, 8 + offset); };
    const auto text = [&](std::size_t offset) { return TextAt(strings.Bytes(), field(offset)); };
    EXPECT_EQ(text(0x08), "main");
    EXPECT_EQ(text(0x14), "A, b");
    EXPECT_EQ(text(0x60), "t/w.hhc");
    EXPECT_EQ(text(0x64), "");
    EXPECT_EQ(text(0x6C), "h.htm");
    EXPECT_EQ(text(0x9C), "Jump");
    EXPECT_EQ(text(0xA4), "u.htm");
    EXPECT_EQ(field(0x0C), 0x776U) << "all that are given";
    EXPECT_EQ(field(0x24), static_cast<std::uint32_t>(-20));
    EXPECT_EQ(field(0x4C), 222U);
    EXPECT_EQ(field(0x70), 0x184EU);

    const std::string contexts = ContextStream({{20, "a.htm"}, {30, "b.htm"}}, strings);
    EXPECT_EQ(Number(contexts, 0), 16U);
    EXPECT_EQ(Number(contexts, 12), 30U);
    EXPECT_EQ(TextAt(strings.Bytes(), Number(contexts, 16)), "b.htm");
}

TEST(StreamsTest, StopWordsStandInTheObjectStream) {
    HelpDescription help;
    help.language = 0x419;
    help.codePage = 1251;
    const std::string plain = ObjectStream(help);
    EXPECT_EQ(Number(plain, 24 + 0x18), 1251U);
    help.stopWords = {"the"};
    const std::string stream = ObjectStream(help);
    EXPECT_EQ(stream.size(), plain.size() + 0x28 + 5 + 2);
    EXPECT_NE(stream.find(std::string("\3\0the\0\0", 7)), std::string::npos);
}

TEST(KeywordIndexTest, EveryKeywordIsFoundFromTheRoot) {
    HelpDescription help;
    help.codePage = 1251;
    help.pages = {Page("a.htm"), Page("b.htm")};
    for (int i = 0; i < 5000; ++i)
        help.index.entries.push_back(Entry("key " + std::to_string(i), i % 2 == 0 ? "a.htm" : "B.htm"));
    help.index.entries.push_back(Entry("orders", "a.htm"));
    help.index.entries.push_back(Entry("\xEF\xE5\xF7\xE0\xF2\xFC", "b.htm", 2));
    help.index.entries.push_back({1, 1, {{"Name", "elsewhere"}, {"See Also", "orders"}}});
    const KeywordIndex index(help, TopicTables(help));
    const auto files = index.Files();
    ASSERT_EQ(files[0].name, "/$WWKeywordLinks/BTree");
    const std::string& tree = files[0].bytes;
    EXPECT_EQ(Number(tree, 44), 5003U);
    EXPECT_GE(Number(tree, 42, 2), 3U) << "levels";
    EXPECT_EQ(files[1].bytes.size(), 13 * 5003U);
    for (int i = 0; i < 5000; i += 7) {
        const std::string name = "key " + std::to_string(i);
        EXPECT_EQ(FindKeyword(tree, {name.begin(), name.end()}),
                  std::vector<std::uint32_t>{static_cast<std::uint32_t>(i % 2)})
            << name;
    }
    EXPECT_EQ(FindKeyword(tree, u"orders, печать"), std::vector<std::uint32_t>{1});
    EXPECT_EQ(FindKeyword(tree, u"elsewhere"), std::vector<std::uint32_t>{0});
    EXPECT_EQ(KeywordIndex().Files().size(), 1U);
}
