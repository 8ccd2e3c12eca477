#include "project/ProjectTest.h"

#include "platform/text/Text.h"
#include "project/clsHHK.h"

namespace tovimar::test {
namespace {

struct Link {
    const char* caption;
    const char* keyword;
    const char* file;
    const char* bookmark;
};

/// The lines between the lists' ends, as "name=value" pairs, entries in square brackets.
std::string Shape(const std::string& contents) {
    std::string out;
    for (const auto& line : text::Split(contents, "\r\n")) {
        const auto trimmed = text::Trim(line);
        if (trimmed.rfind("<LI>", 0) == 0)
            out += '[';
        else if (trimmed == "</OBJECT>")
            out += ']';
        else if (trimmed == "<UL>" && line[0] == ' ')
            out += '(';
        else if (trimmed == "</UL>" && line[0] == ' ')
            out += ')';
        else if (trimmed.rfind("<param", 0) == 0) {
            const auto parts = text::Split(trimmed, "\"");
            out += parts[1].substr(0, 1) + '=' + parts[3] + ' ';
        }
    }
    return out;
}

class IndexTest : public ProjectTest {};

TEST_F(IndexTest, GroupsAndTheirLinks) {
    const struct {
        const char* what;
        std::vector<Link> links;
        const char* shape;
    } cases[] = {
        {"an empty index is one entry without parameters", {}, "[]"},
        {"one link", {{"Orders", "sales", "dir\\o.htm", ""}}, "[n=sales L=o.htm ]"},
        {"a bookmark", {{"Orders", "sales", "o.htm", "o_City"}}, "[n=sales L=o.htm#o_City ]"},
        {"two topics: pairs in order, then the list",
         {{"Orders", "sales", "o.htm", ""}, {"Items", "sales", "i.htm", ""}},
         "[n=sales N=Items L=i.htm N=Orders L=o.htm ]([N=Items L=i.htm ][N=Orders L=o.htm ])]"},
        {"the first link of a caption wins",
         {{"Orders", "sales", "o.htm", ""}, {"ORDERS", "sales", "other.htm", ""}},
         "[n=sales L=o.htm ]"},
        {"keywords that differ in case are one group",
         {{"A", "Key", "a.htm", ""}, {"B", "KEY", "b.htm", ""}},
         "[n=Key N=A L=a.htm N=B L=b.htm ]([N=A L=a.htm ][N=B L=b.htm ])]"},
        {"groups are sorted without regard to case",
         {{"A", "b", "a.htm", ""}, {"A", "C", "a.htm", ""}, {"A", "a", "a.htm", ""}},
         "[n=a L=a.htm ][n=b L=a.htm ][n=C L=a.htm ]"},
        {"a caption that is the keyword",
         {{"sales", "Sales", "s.htm", ""}, {"x", "sales", "x.htm", ""}},
         "[n=Sales N=sales L=s.htm N=x L=x.htm ]([N=sales L=s.htm ][N=x L=x.htm ])]"},
        {"quotes go, entities are encoded anew",
         {{"A", "say \"hi\" &amp; go", "a.htm", ""}},
         "[n=say hi &#38; go L=a.htm ]"},
    };
    for (const auto& test : cases) {
        clsHHK index;
        for (const auto& link : test.links)
            index.AddCustomLink(link.caption, link.keyword, link.file, link.bookmark);
        EXPECT_EQ(Shape(index.HHKContents()), test.shape) << test.what;
    }
}

TEST_F(IndexTest, TheOptionLeavesAnEmptyList) {
    parameters.FillIndexFromAppObjectsAndControls = false;
    clsHHK index;
    index.AddCustomLink("A", "b", "c.htm", "");
    EXPECT_EQ(index.HHKContents(),
              "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n<HTML>\r\n<HEAD>\r\n"
              "<!-- Sitemap 1.0 -->\r\n<!-- Put Java help object tag here -->\r\n</HEAD>\r\n"
              "<BODY>\r\n<UL>\r\n</UL>\r\n</BODY>\r\n</HTML>\r\n");
}

TEST_F(IndexTest, CaptionsOfManyWordsAreCut) {
    const std::string forty(40, 'x');
    const std::pair<std::string, std::string> cases[] = {
        {"", ""},
        {forty, forty},
        {"two  words", "two words"},
        {"sixteen letters_ sixteen letters", "sixteen letters_ sixteen letters"},
        {"sixteen letters_ sixteen letters1", "sixteen letters_ sixteen letters..."},
        {forty + " y", std::string(32, 'x') + "..."},
    };
    for (const auto& [text, cut] : cases)
        EXPECT_EQ(clsHHK::TruncateCaption(text), cut) << text;
}

} // namespace
} // namespace tovimar::test
