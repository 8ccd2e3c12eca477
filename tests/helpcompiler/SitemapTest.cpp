#include "helpcompiler/Sitemap.h"
#include "helpcompiler/LanguageCodePage.h"

#include <gtest/gtest.h>

using namespace tovimar::helpcompiler;
using tovimar::text::CodePage;

namespace {

Sitemap Read(std::string_view bytes) {
    return ReadSitemap(bytes, CodePage(1252));
}

/// "level name target, target"
std::vector<std::string> Lines(const Sitemap& map) {
    std::vector<std::string> lines;
    for (const SitemapEntry& entry : map.entries) {
        lines.push_back(std::to_string(entry.level) + " " + entry.Name());
        for (const SitemapTarget& target : TargetsOf(entry))
            lines.back() += " " + target.title + "=" + target.url;
    }
    return lines;
}

} // namespace

TEST(SitemapTest, ReadsContentsAndIndex) {
    const Sitemap map =
        Read("<OBJECT type=\"text/site properties\"><param name=\"ImageType\" value=\"Folder\">"
             "</OBJECT><UL>\n<LI><OBJECT type=\"text/sitemap\"><param name=\"Name\" "
             "value=\"R&amp;D &#233;\"><param name=Local value='a\\b.htm'></OBJECT>\n<ul>"
             "<li><object type=text/sitemap><param name=name value=key><param name=name value=One>"
             "<param name=local value=1.htm><param name=name value=Two><param name=local "
             "value=2.htm></ul><object type=text/sitemap><param name=name value=Last></ul>");
    EXPECT_TRUE(map.UsesFolderIcons());
    EXPECT_EQ(Lines(map), (std::vector<std::string>{"1 R&D \xE9 R&D \xE9=a/b.htm",
                                                    "2 key One=1.htm Two=2.htm", "1 Last"}));
    EXPECT_EQ(map.entries[0].line, 2);
    EXPECT_TRUE(map.unheld.empty());
}

TEST(SitemapTest, ReportsNamesThatTheCodePageCannotHold) {
    const Sitemap map = Read("\n<object type=text/sitemap>\n<param name=Name value='&#322;'>");
    ASSERT_EQ(map.unheld.size(), 1U);
    EXPECT_EQ(map.unheld[0].line, 3);
    EXPECT_EQ(map.unheld[0].value, "&#322;");
    EXPECT_EQ(map.entries[0].Name(), "&#322;");
}

TEST(SitemapTest, SurvivesWhateverItIsGiven) {
    EXPECT_EQ(Lines(Read("</ul></ul><object type=text/sitemap><param name=name value=x>")),
              std::vector<std::string>{"0 x"});
    EXPECT_TRUE(Read("<object type=text/sitemap></object><param name=Name value=x>").entries.empty());
    std::string deep;
    for (int i = 0; i < 100000; ++i)
        deep += "<ul>";
    EXPECT_EQ(Read(deep + "<object type=text/sitemap><param name=name value=x>").entries[0].level,
              kDeepestSitemapLevel);
    EXPECT_TRUE(Read("<object type=\"text/sitemap").entries.empty());
}

TEST(LanguageTest, GivesItsCodePage) {
    EXPECT_EQ(LanguageOf("0x419 Russian"), 0x419U);
    EXPECT_EQ(LanguageOf("1033"), 0x409U);
    EXPECT_EQ(LanguageOf(""), kDefaultLanguage);
    EXPECT_EQ(LanguageOf("0x0"), kDefaultLanguage);
    const std::pair<std::uint32_t, int> pages[] = {{0x407, 1252}, {0x415, 1250}, {0x419, 1251}, {0x408, 1253},
                                                   {0x41F, 1254}, {0x40D, 1255}, {0x411, 932},  {0x404, 950},
                                                   {0x804, 936},  {0x81A, 1250}, {0xC1A, 1251}, {0x7F, 1252}};
    for (const auto& [language, page] : pages)
        EXPECT_EQ(CodePageOfLanguage(language), page) << language;
}
