#include "project/ProjectTest.h"

#include "platform/text/Text.h"
#include "project/clsHHCLoader.h"

#include <utility>

namespace tovimar::test {
namespace {

using LoaderTest = ProjectTest;

const char* const kForeign =
    "<!DOCTYPE HTML PUBLIC \"-//IETF//DTD HTML//EN\">\r\n<HTML>\r\n<HEAD>\r\n"
    "<meta name=\"GENERATOR\" content=\"x\">\r\n</HEAD>\r\n<BODY>\r\n<UL>\r\n"
    "\t<LI> <OBJECT type=\"text/sitemap\">\r\n"
    "\t<param name=\"Name\" value=\"Help\">\r\n"
    "\t<param name=\"Comment\" value=\"Tovimar: Version=2;SourceApp=x;\">\r\n"
    "\t<param name=\"Local\" value=\"index.htm\">\r\n\t</OBJECT>\r\n<UL>\r\n"
    "<LI> <OBJECT type=\"text/sitemap\">\r\n<param name=\"Name\" value=\"Forms\">\r\n"
    "<param name=\"Local\" value=\"forms.htm\">\r\n</OBJECT>\r\n<UL>\r\n"
    "<LI> <OBJECT type=\"text/sitemap\">\r\n<param name=\"Name\" value=\"Orders\">\r\n"
    "<param name=\"Local\" value=\"o.htm\">\r\n</OBJECT>\r\n"
    "</UL>\r\n</UL>\r\n</UL>\r\n</BODY>\r\n</HTML>\r\n";

TEST_F(LoaderTest, AForeignContentsFileBecomesAProject) {
    clsHHCLoader loader;
    ASSERT_EQ(loader.Load(WriteFile("f.hhc", kForeign)), 0);
    ASSERT_NE(loader.Root(), nullptr) << loader.ErrorReason();
    EXPECT_EQ(loader.Root()->SourceApp(), "x");
    ExpectGolden("foreign.xml", loader.GetXMLStr());
    ExpectGolden("foreign.hhc", loader.Root()->HHCStr());
}

TEST_F(LoaderTest, WhatIsNoSitemapGivesNothing) {
    clsHHCLoader loader;
    EXPECT_EQ(loader.Load(WriteFile("f.hhc", "<HTML><BODY>")), 0);
    EXPECT_NE(loader.ErrorCode(), 0);
    EXPECT_EQ(loader.Root(), nullptr);
}

std::string Entry(const std::string& name) {
    return "<LI><OBJECT type=\"text/sitemap\"><param name=\"Name\" value=\"" + name +
           "\"><param name=\"Local\" value=\"t.htm\"></OBJECT>";
}

/// The outline of what was read: names, children in brackets.
std::string Outline(const clsHHCObjectEntry& entry) {
    std::string out = entry.Name();
    for (const auto& child : entry.Children)
        out += "(" + Outline(*child) + ")";
    return out;
}

TEST_F(LoaderTest, MarkupOfOtherToolsIsRepaired) {
    const std::pair<std::string, std::string> cases[] = {
        {"<UL>" + Entry("a") + "<UL>" + Entry("b") + Entry("c") + "</UL></UL>", "a(b)(c)"},
        {"<ul><li><object type='text/sitemap'><param value='R & D' name='Name'></object></li>"
         "<ul><li><object type=text/sitemap><param name=Name value=b></object></ul>",
         "R & D(b)"},
        {"<BODY><OBJECT type=\"text/site properties\">\r\n<param name=\"Window Styles\" "
         "value=\"0x800025\">\r\n"
         "</OBJECT>\r\n<UL>" +
             Entry("a") + "</UL></BODY>",
         "a"},
        {"</UL></UL><UL>" + Entry("a &lt;b&gt; &quot;c&quot;") + "<UL><UL>" + Entry("d") + "</UL>" +
             Entry("e"),
         "a <b> \"c\"(d)(e)"},
        {"<BODY>" + Entry("no list") + "<!-- > --><UL>" + Entry("a"), "no list"},
        {"\xEF\xBB\xBF<UL>" + Entry("gr\xC3\xBCn"), "gr\xC3\xBCn"},
        {"<UL>" + Entry("gr\xFCn"), "gr\xC3\xBCn"},
        {std::string("\xFF\xFE", 2) +
             text::ReplaceAll("<~U~L~>~<~o~b~j~e~c~t~>~<~p~a~r~a~m~ ~n~a~m~e~=~n~a~m~e~ "
                              "~v~a~l~u~e~=~x~>~<~/~o~b~j~e~c~t~>~",
                              "~", std::string(1, '\0')),
         "x"},
    };
    for (const auto& [markup, outline] : cases) {
        clsHHCLoader loader;
        loader.LoadBytes(markup);
        ASSERT_NE(loader.Root(), nullptr) << markup << ": " << loader.ErrorReason();
        EXPECT_EQ(Outline(*loader.Root()), outline) << markup;
        EXPECT_EQ(tree.Load({}, false, false, loader.GetXMLStr()), 0) << loader.GetXMLStr();
    }
}

TEST_F(LoaderTest, WhatCantBeReadIsNamedWithItsPlace) {
    std::string deep;
    for (int i = 0; i < 10000; ++i)
        deep += "<UL>\n" + Entry("x");
    const std::pair<std::string, std::string> cases[] = {
        {"<HTML>\n<BODY>\n</BODY>\n</HTML>\n", ": There is no list of topics in the file"},
        {"<UL>\n<LI><OBJECT>\n<param name=\"Name\" value=\"a>", ", line 3: A value is not closed"},
        {"<UL>\n<LI><OBJECT>\n<param name=\"Name\" value=\"a\">", ", line 2: An entry is not closed"},
        {"<UL>\n<!-- " + Entry("a"), ", line 2: A comment is not closed"},
        {"<UL>\n" + Entry("a") + "<LI", ", line 2: A tag is not closed"},
        {deep, ", line 401: The lists are nested too deeply"},
    };
    for (const auto& [markup, expected] : cases) {
        const auto path = WriteFile("f.hhc", markup);
        std::string projectText, message;
        EXPECT_FALSE(clsHHCLoader::Convert(path, projectText, message));
        EXPECT_EQ(message, path + expected);
        EXPECT_EQ(projectText, "");
    }
}

TEST_F(LoaderTest, ManyEntriesAndOnesBesideTheFirst) {
    std::string many = "<UL>" + Entry("top") + "<UL>";
    for (int i = 0; i < 100000; ++i)
        many += "\n" + Entry("e");
    std::string projectText, message;
    ASSERT_TRUE(clsHHCLoader::Convert(WriteFile("f.hhc", many), projectText, message)) << message;
    clsHHCLoader loader;
    loader.LoadBytes(many);
    EXPECT_EQ(loader.Root()->Children.size(), 100000U);
    loader.LoadBytes("<UL>" + Entry("a") + Entry("beside") + "</UL>");
    EXPECT_EQ(loader.DroppedEntries(), 1U);
}

} // namespace
} // namespace tovimar::test
