#include "helpcompiler/PageReader.h"
#include "helpcompiler/CodePageText.h"

#include <gtest/gtest.h>

#include <algorithm>

using namespace tovimar::helpcompiler;
using tovimar::text::CodePage;

namespace {

const CodePage& Western() {
    static const CodePage page(1252);
    return page;
}

/// Words with blanks between.
std::string WordsOf(std::string_view page, int codePage = 1252) {
    std::string words = ReadPage(page, CodePage(codePage)).words.text;
    std::replace(words.begin(), words.end(), '\0', ' ');
    return words;
}

std::vector<std::string> TargetsOf(const PageContent& content) {
    std::vector<std::string> targets;
    for (const PageReference& reference : content.references)
        targets.push_back((reference.kind == PageReference::Kind::Needed ? "+" : "") + reference.target +
                          ":" + std::to_string(reference.line));
    return targets;
}

} // namespace

TEST(PageReaderTest, TakesTitleAndVisibleText) {
    const std::string page =
        "<HTML><head><TITLE> Orders\r\n &amp; <b>more </TITLE><style>p {color: red}</style>"
        "<script>if (a<b) write('<p>hidden')</script></head>"
        "<body title=hidden><!-- hidden <b> --><p>One<b>two</b> 1 < 2"
        "<noscript>shown</noscript></body>";
    const PageContent content = ReadPage(page, Western());
    EXPECT_EQ(content.title, "Orders & <b>more");
    EXPECT_EQ(content.words.titleWords, 3U);
    EXPECT_EQ(WordsOf(page), "orders b more one two 1 2 shown ");
}

TEST(PageReaderTest, DecodesReferences) {
    EXPECT_EQ(WordsOf("a&nbsp;b&lt;c &Auml;rger caf&eacute; &#x41;b &#65c x&#8211;y"),
              "a b c arger cafe ab ac x y ");
    EXPECT_EQ(WordsOf("R&D a&b; &; &#; &#x; &#99999999; &#0; &"), "r d a b x 99999999 0 ");
    EXPECT_EQ(WordsOf("&#1079;&#1072;", 1251), WordsOf("\xE7\xE0", 1251));
    EXPECT_EQ(ReadPage("<title>&#322;&eacute;</title>", Western()).title, "&#322;\xE9");
}

TEST(PageReaderTest, ListsReferencesWithTheirLines) {
    const PageContent content =
        ReadPage("<link rel=StyleSheet href='a.css'><link rel=next href=n.htm>\n"
                 "<a href=\" b.htm#x&amp;y \" name=top>x</a>\n<img SRC=pics\\c.png>"
                 "<p id=\"here\" style='background:url( \"d.gif\" )'>\n"
                 "<style>/* url(no.png) */\n@import 'e.css'; p {b: url(f.png)}</style>"
                 "<a href=>none</a>",
                 Western());
    EXPECT_EQ(TargetsOf(content), (std::vector<std::string>{"+a.css:1", "b.htm#x&y:2", "+pics\\c.png:3",
                                                            "+d.gif:3", "+e.css:5", "+f.png:5"}));
}

TEST(PageReaderTest, EndsWithWhateverStandsOpen) {
    EXPECT_EQ(WordsOf("a <p title=\"open > b"), "a ");
    EXPECT_EQ(WordsOf("a <!-- b"), "a ");
    EXPECT_EQ(WordsOf("a <script> b"), "a ");
    EXPECT_EQ(WordsOf("a <title> b"), "b a ");
    EXPECT_EQ(WordsOf("a <"), "a ");
    EXPECT_EQ(WordsOf("a </"), "a ");
    EXPECT_EQ(WordsOf("a <x ="), "a ");
    EXPECT_EQ(WordsOf(""), "");
    EXPECT_EQ(WordsOf(std::string(200000, '<')), "");
}

TEST(CodePageTextTest, BringsUnicodePagesToTheCodePage) {
    const std::string page = "<head><meta http-equiv=\"Content-Type\" content=\"text/html; charset=UTF-8\">"
                             "<style>p:before {content: '→'}</style><script>x = '→😀'</script></head>"
                             "<body title='→'>é → ß";
    EXPECT_EQ(
        InCodePage(page, Western()),
        "<head><meta http-equiv=\"Content-Type\" content=\"text/html; charset=windows-1252\">"
        "<style>p:before {content: '\\2192 '}</style><script>x = '\\u2192\\uD83D\\uDE00'</script></head>"
        "<body title='&#8594;'>\xE9 &#8594; \xDF");
    EXPECT_EQ(InCodePage("<meta charset='utf-8'>注文é", CodePage(932)),
              "<meta charset='shift_jis'>\x92\x8D\x95\xB6&#233;");
    EXPECT_EQ(
        InCodePage("\xEF\xBB\xBF<head></head>й", CodePage(1251)),
        "<head><meta http-equiv=\"Content-Type\" content=\"text/html; charset=windows-1251\"></head>\xE9");
    EXPECT_EQ(InCodePage(std::string("\xFF\xFE<\0p\0>\0\xE9\0", 10), Western()), "<p>\xE9");
    EXPECT_EQ(InCodePage("<?xml version=\"1.0\" encoding=\"utf-8\"?>ł", CodePage(1250)),
              "<?xml version=\"1.0\" encoding=\"windows-1250\"?>\xB3");
}

TEST(CodePageTextTest, LeavesOtherPagesAsTheyAre) {
    for (const std::string page :
         {"<meta charset=windows-1252>\xE9", "\xE9", "", "<body>é<meta charset=utf-8>"})
        EXPECT_EQ(InCodePage(page, Western()), page);
}
