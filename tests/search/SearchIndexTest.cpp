#include "SearchIndex.h"
#include "Folding.h"
#include "Packing.h"
#include "SearchPage.h"
#include "TopicText.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <vector>
#include <zlib.h>

namespace tovimar::search {
namespace {

using Strings = std::vector<std::string>;

TEST(FoldingTest, AccentsCaseAndJoinedLettersDontPartWords) {
    const std::pair<const char*, Strings> cases[] = {
        {"Größe der STRASSE", {"grosse", "der", "strasse"}},
        {"Łódź, Ærø; Þór", {"lodz", "aero", "thor"}},
        {"Ρώμη ΚΌΣΜΟΣ", {"ρωμη", "κοσμοσ"}},
        {"Ёлка Éte\xCC\x81", {"елка", "ete"}},
        {"ﬁle №5 İstanbul", {"file", "no5", "istanbul"}},
        {"Form_Orders.OrderNo-2", {"form", "orders", "orderno", "2"}},
        {"受注 カード", {"受", "注", "カ", "ー", "ト\xE3\x82\x99"}},
        {"don't", {"don", "t"}},
        {"", {}},
        {"\xff & _", {}},
    };
    for (const auto& [text, words] : cases) {
        auto found = WordsOf(text);
        if (words.size() == 5) // the sound mark of kana is a word of its own, here as in the page
            found = {found[0], found[1], found[2], found[3], found[4] + found[5]};
        EXPECT_EQ(found, words) << text;
    }
    EXPECT_EQ(WordsOf(std::string(500, 'a')), Strings{std::string(kLongestWord, 'a')});
}

std::string Outline(const std::string& page) {
    const auto topic = ReadTopic(page);
    std::string out = topic.title + " [";
    for (const auto& section : topic.sections)
        out += section.caption + '#' + section.anchor + ';';
    return out + "] " + topic.body;
}

TEST(TopicTextTest, WhatAReaderSees) {
    EXPECT_EQ(
        Outline("<html><title>A &amp; B</title><body><h1>Head</h1>x<!-- no --><script>no()</script>"
                "<style>no</style><H2><a name=\"F_x\">One <i>t</i>wo</a></H2><p>text&nbsp;&#65;&#x42;&bad;"
                "<h3 id=three>3</h3></body></html>"),
        "A & B [One two#F_x;3#three;] Head x One two text AB&bad; 3");
    EXPECT_EQ(
        Outline("<h1>Only head</h1><a name='far'></a><h2>Near</h2><a name='x'></a>text<h2>Far</h2><h2></h2>"),
        "Only head [Near#far;Far#;] Only head Near text Far");
    EXPECT_EQ(Outline("<meta charset=\"windows-1251\"><h2>\xcf\xf0</h2>"),
              " [\xd0\x9f\xd1\x80#;] \xd0\x9f\xd1\x80");
    EXPECT_EQ(Outline("\xEF\xBB\xBF<title></title>\xC3\xA9\xff"), " [] \xC3\xA9\xEF\xBF\xBD");
}

TEST(TopicTextTest, BrokenPagesAreReadToTheirEnd) {
    EXPECT_EQ(Outline("<title>never closed"), " [] ");
    EXPECT_EQ(Outline("a<h2>open <a name=\"x"), " [open#;] a open");
    EXPECT_EQ(Outline("a<!-- <b>"), " [] a");
    EXPECT_EQ(Outline("a<script>"), " [] a");
    EXPECT_EQ(Outline("<h2><a name=\"tab\there\">t</a></h2>&#xD800;&#;&#x;&#99999999999;"),
              " [t#;] t &#;&#x;&#99999999999;");
    std::string nested;
    for (int i = 0; i < 100000; ++i)
        nested += "<h2><a name=x>";
    EXPECT_EQ(Outline(nested), " [] ");
    EXPECT_EQ(ReadTopic("<h2>" + std::string(100000, 'x') + "</h2>").sections.at(0).caption.size(),
              kLongestCaption);
}

TEST(SearchIndexTest, TextNamesTopicsSectionsAndTheWordsThatOnlyTextsHold) {
    SearchIndex index;
    index.AddPage("a.htm", {"Orders",
                            {{"Orders_Ship_to", "Ship to"}, {"Orders_cmdOK", "Close"}, {"", "None"}},
                            "Orders zeta zeta zeta Close zebra"});
    index.AddPage("b.htm", {"", {}, "zebra"});
    index.AddPage("c.htm", {"Last", {{"x", "Alone"}}, "zebra"});
    EXPECT_EQ(index.Text(), "a.htm\nb.htm\nc.htm\n"
                            "\x01"
                            "Orders\nb.htm\nLast\n"
                            "\x01"
                            "Ship to\nClose\nNone\n\n\nAlone\n\n"
                            "\x01"
                            "Orders_\n\ncmdOK\n\t\n\nx\n"
                            "\x01"
                            "0zebra\n2ta\n"
                            "\x01"
                            "BBB\nC\n");
    EXPECT_EQ(SearchIndex().Text(), "\x01\x01\x01\x01\x01");
}

TEST(SearchIndexTest, DistancesTakeAsManyDigitsAsTheyNeed) {
    SearchIndex index;
    for (int i = 0; i < 1100; ++i)
        index.AddPage("t", {"t", {}, i == 31 || i == 1099 ? "far" : ""});
    const auto text = index.Text();
    // 2 * 32 = 64 is 0 + 2 * 32; 2 * 1068 = 2136 is 24 + 2 * 32 + 2 * 1024.
    EXPECT_EQ(text.substr(text.rfind('\x01') + 1), " B8\"B\n");
}

/// What the page's script does.
std::string Unpack(const std::string& packed) {
    std::string bytes;
    for (std::size_t at = 0; at < packed.size(); at += 5) {
        std::uint32_t value = 0;
        for (std::size_t i = at; i < at + 5; ++i)
            value = value * 85 +
                    (i < packed.size() ? static_cast<std::uint32_t>(kPackingLetters.find(packed[i])) : 84);
        for (std::size_t i = 0; i < 4 && at + i + 1 < packed.size(); ++i)
            bytes += static_cast<char>(value >> (24 - 8 * i));
    }
    std::string text(1 << 20, '\0');
    z_stream stream{};
    EXPECT_EQ(inflateInit2(&stream, -15), Z_OK);
    stream.next_in = reinterpret_cast<Bytef*>(bytes.data());
    stream.avail_in = static_cast<uInt>(bytes.size());
    stream.next_out = reinterpret_cast<Bytef*>(text.data());
    stream.avail_out = static_cast<uInt>(text.size());
    EXPECT_EQ(inflate(&stream, Z_FINISH), Z_STREAM_END);
    text.resize(stream.total_out);
    inflateEnd(&stream);
    return text;
}

TEST(PackingTest, TextsComeBack) {
    std::string text;
    for (int length = 0; length < 300; ++length) {
        EXPECT_EQ(Unpack(Pack(text)), text) << length;
        text += static_cast<char>(length * length * 31 % 251);
    }
    for (const char c : {'"', '\\', '<', '&', '\''})
        EXPECT_EQ(kPackingLetters.find(c), std::string::npos) << c;
}

TEST(SearchPageTest, HoldsThePiecesThatTheWebHelpReplaces) {
    const auto page = SearchPageText({});
    for (const char* piece :
         {"\r\n| <a href=\"#howto\">Help</a> |\r\n",
          "<form>\r\n<table width=100% cellpadding=5 style=\"background-color:#EFF;border:2px solid "
          "#069\"><tr><td align=center>\r\n"
          "<em>Site Search</em><br>\r\n"
          "<input type=text name=\"s\" size=24 onKeyDown=\"if(event.keyCode==13)return NS()\">&nbsp;<input "
          "type=\"Button\" value=\"Go!\" onClick=\"return NS()\">\r\n"
          "</td></tr></table>\r\n</form>",
          "function C(l){\r\n if(BW && !BW.closed) {BW.location.href=l;BW.focus();}\r\n else "
          "BW=window.open(l,\"\");"})
        EXPECT_NE(page.find(piece), std::string::npos) << piece;
    EXPECT_EQ(page.find("{{"), std::string::npos);
}

} // namespace
} // namespace tovimar::search
