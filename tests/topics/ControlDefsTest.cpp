#include "topics/CFormHTMLControlDefs.h"

#include "foundation/Paths.h"
#include "platform/text/Text.h"
#include "topics/TopicTest.h"

namespace tovimar {
namespace {

class ControlDefsTest : public test::TopicTest {
protected:
    static std::string Page(const std::string& version, const std::string& body,
                            const std::string& exclude = {}) {
        return "<head><meta name=\"TOVIMAR-FORM-NAME\" content=\"Orders\" >\r\n<meta content=\"" + exclude +
               "\" name=\"HTML-TOVIMAR-TOC-EXCLUDE-LIST\" />" +
               (version.empty() ? "" : "<META NAME=\"TOVIMAR-VERSION\" CONTENT=\"" + version + "\" >") +
               "</head>" + body;
    }
    /// "bookmark=caption" of each control, "*" before menus.
    static std::string Read(const std::string& page) {
        CFormHTMLControlDefs defs;
        EXPECT_EQ(kSuccess, defs.ParseText(page));
        std::vector<std::string> found;
        for (const auto& def : defs.Controls)
            found.push_back(def->BookmarkName + "=" + def->TopicCaption);
        for (const auto& def : defs.Menus)
            found.push_back("*" + def->BookmarkName + "=" + def->TopicCaption);
        return text::Join(found, " ");
    }
};

constexpr const char* kHeadings =
    "<H2><a name=\"Orders_a\">A &amp; B</a></H2>\r\n<h2><A NAME=\"Orders_b\"\r\n>B</A></h2>"
    "<h2>by hand</h2><H2><a name=\"Other_c\">C</a></H2>";
constexpr const char* kAnchors =
    "<a name=\"Orders_x\"><h2>X</h2></a><a name=Orders_y><h2>Y</h2></a><a name=\"Orders_z\">no heading</a>";
constexpr const char* kMarked =
    "<!-- + CONTROL [Orders] [First] --><a name=\"Orders_First\">\r\n<h2>First &lt;1&gt;</h2></a><!-- - "
    "CONTROL [Orders] [First] -->"
    "<!-- + CONTROL [Orders] [Lost] --><a name=\"Orders_Lost\"><h2>Lost</h2>"
    "<!-- + CONTROL [Orders] [Second] --> <a name=\"Orders_Second\"><h2>Second</h2></a><!-- - CONTROL "
    "[Orders] [Second] -->"
    "<!-- + MENU [Orders] [File] --><a name=\"Orders_File\"><h2>File</h2></a><!-- - MENU [Orders] [File] -->"
    "<!-- + CONTROL [Orders] [Open] --><a name=\"Orders_Open\"><h2>Open</h2></a>";

TEST_F(ControlDefsTest, TheVersionChoosesTheReader) {
    const std::string all = std::string(kHeadings) + kAnchors + kMarked;
    const std::string marked = "First=First <1> Second=Second *File=File";
    EXPECT_EQ(marked, Read(Page("", all)));
    EXPECT_EQ(marked, Read(Page("2.0.5.1 [x]", all)));
    EXPECT_EQ("x=X y=Y", Read(Page("2.1.0.48 [x]", std::string(kHeadings) + kAnchors)));
    EXPECT_EQ("a=A & B b=B", Read(Page("2.1.0.49 [x]", std::string(kHeadings) + kAnchors)));
    EXPECT_EQ("x=X y=Y", Read(Page("2.1.0.49 [x]", kAnchors))); // no heading found
    EXPECT_EQ(marked, Read(Page("3.5.0.1", all)));              // without a blank the numbers stay
}

TEST_F(ControlDefsTest, ValuesInSingleQuotes) {
    const std::string page = "<meta name='HTML-TOVIMAR-FORM-NAME' content='Orders'><meta content='q|y' "
                             "name='TOVIMAR-TOC-EXCLUDE-LIST'>";
    const std::string version = "<meta name='TOVIMAR-VERSION' content='2.1.0.48 [x]'/>";
    EXPECT_EQ("x=X",
              Read(page + version + "<a name='Orders_x'><h2>X</h2></a><a name='Orders_y'><h2>Y</h2></a>"));
    EXPECT_EQ("First=One",
              Read(page + "<!-- + CONTROL [Orders] [First] --><a name='Orders_First'><h2>One</h2></a>"
                          "<!-- - CONTROL [Orders] [First] -->"));
}

TEST_F(ControlDefsTest, HeadingsByTheOptionsTagsLessTheExcluded) {
    parameters.ListOfTagsToParseContentsFrom = "h3;H2";
    const std::string body = std::string(kHeadings) + "<h3><a name=\"Orders_d\">D</a></h3><h3>open";
    EXPECT_EQ("d=D b=B", Read(Page("2.5 [x]", body, "q|A")));
}

TEST_F(ControlDefsTest, OneHeading) {
    const auto read = [](const char* heading, const char* form = "Orders") {
        CFormHTMLControlDef def;
        const ResultCode code = def.ParseHTML2(heading, form);
        return code != kSuccess ? std::string("failed")
                                : def.FormName + "|" + def.ControlName + "|" + def.TopicCaption;
    };
    EXPECT_EQ("Orders|a|A", read("<h2><a name=\"Orders_a\" class=\"x y\">A</a></h2>"));
    EXPECT_EQ("Orders|a|A", read("<h2><a name='Orders_a'>A</a></h2>"));
    EXPECT_EQ("Orders|a|A", read("<h2><a name='Orders_a' class='x y'>A</a></h2>"));
    EXPECT_EQ("Orders|a|more", read("<h2><a name=\"Orders_a\">A<b>more</b></a></h2>"));
    EXPECT_EQ("Orders|a|???", read("<h2><a name=\"Orders_a\"><img src=x></a></h2>"));
    EXPECT_EQ("Orders|a|", read("<h2><a name=\"Orders_a\"></a>A</h2>"));
    EXPECT_EQ("My|form_a|A", read("<h2><a name=\"My_form_a\">A</a></h2>", ""));
    EXPECT_EQ("||", read("<h2><a name=\"Orders_a\">Controls:</a></h2>"));
    EXPECT_EQ("||", read("<h2>plain</h2>"));
    EXPECT_EQ("failed", read("<h2><a name=\"Other_a\">A</a></h2>"));
    EXPECT_EQ("failed", read("<h2><a name=\"Orders\">A</a></h2>"));
}

TEST_F(ControlDefsTest, ItemsAreWrittenAndReadAndComparedByThreeTexts) {
    CFormHTMLControlDef def;
    ASSERT_EQ(kSuccess,
              def.ParseXML("<Item  Name=\"a&amp;\" Bmk=\"b\" Caption=\"C &#60;\" IsMenu = \"TRUE\"  />"));
    EXPECT_EQ("<Item  Name=\"a&amp;\" Bmk=\"b\" Caption=\"C &#60;\" IsMenu = \"True\"  />", def.XMLSTr());
    EXPECT_FALSE(def.IsValid());
    CFormHTMLControlDef other = def;
    other.IsMenu = false;
    EXPECT_TRUE(def.EqualTo(other));
    other.TopicCaption = "c <";
    EXPECT_FALSE(def.EqualTo(other));
    EXPECT_NE(kSuccess, def.ParseXML("<Item"));
    EXPECT_TRUE(def.XmlParseError.has_value());
}

TEST_F(ControlDefsTest, HostileTextsEndSoon) {
    std::string many;
    for (int i = 0; i < 20000; ++i)
        many += "<!-- + CONTROL [<a name=<h2>";
    EXPECT_EQ("", Read(Page("", many)));
    EXPECT_EQ("", Read(Page("2.5 [x]", many)));
    for (const char* text :
         {"", "<", "TOVIMAR-VERSION", "<meta TOVIMAR-VERSION", "<!-- + CONTROL [ --><!-- - CONTROL -->"})
        EXPECT_EQ("", Read(text));
}

TEST_F(ControlDefsTest, AFormReadsItsTopicBackAndTellsASameOne) {
    parameters.AddControlsSectionForForm = true;
    auto form = Orders();
    SetInstallation(Folder());
    WriteFile("Templates\\Parameterized\\form.htm",
              "<head><meta http-equiv=\"Content-Type\" content=\"text/html; "
              "charset={{charset}}\">{{StyleSheetLinkHtml}}\r\n"
              "<meta name=\"TOVIMAR-VERSION\" content=\"2.5 [x]\"><meta name=\"TOVIMAR-FORM-NAME\" "
              "content=\"{{FormName}}\"></head>"
              "{{Controls}}<!-- wbh -->");
    ASSERT_EQ(kSuccess, form->SaveHTMLEx(Path("Orders.htm"), /*HtmlOfReport=*/false));
    const std::string topic = ReadFile(Path("Orders.htm"));
    EXPECT_EQ(0U, topic.find("<head><meta http-equiv=\"Content-Type\" content=\"text/html; charset=utf-8\">"
                             "<link href=\"Office10.css\" type=\"text/css\" rel=\"stylesheet\" >\r\n"));
    std::string bookmarks;
    for (const auto& def : form->DocumentedControls)
        bookmarks += def->BookmarkName + " ";
    EXPECT_EQ("First_Name tab p0 a p1 b sub q ", bookmarks);
    EXPECT_EQ(1, form->MakeDefs(Path("Orders.htm"), true));
    WriteFile("Orders.htm", text::ReplaceAll(topic, ">Qty<", ">Quantity<"));
    EXPECT_EQ(kSuccess, form->MakeDefs(Path("Orders.htm"), true));
    EXPECT_EQ("Quantity", form->DocumentedControls.At(8)->TopicCaption);

    form->Charset = "windows-1252";
    ASSERT_EQ(kSuccess, form->SaveHTMLEx(Path("Orders.htm"), false));
    EXPECT_EQ(8U, form->DocumentedControls.Count());
    EXPECT_EQ(kSuccess, form->SaveHTMLEx("", false));
}

TEST_F(ControlDefsTest, TablesAndWorksheetsFillTheirOwnTags) {
    SetInstallation(Folder());
    WriteFile("Templates\\Parameterized\\chart.htm", "{{Description}}|{{objects}}|wbh");
    auto form = Loaded("<Chart Name='C' Text='C' Description='About'/>");
    ASSERT_EQ(kSuccess, form->SaveHTML4Table(Path("t.htm"), "chart.htm", true));
    EXPECT_EQ("About|{{objects}}|wbh", ReadFile(Path("t.htm")));
    ASSERT_EQ(kSuccess,
              form->SaveHTML4Worksheet(Path("t.htm"), "chart.htm", true, false, true, "", "", "<table>"));
    EXPECT_EQ("About|<table>|wbh", ReadFile(Path("t.htm")));
}

TEST_F(ControlDefsTest, EachKindHasATemplateThatIsFilledIn) {
    SetInstallation(environment->files->FromNative(TOVIMAR_SOURCE_DIR "/install"));
    CXmlMessages messages;
    ASSERT_EQ(kSuccess, messages.Load(LocalizedFile("Messages.xml")));
    Session::SetMessages(&messages);
    for (const char* kind : {"Table", "Query", "Macro", "Worksheet", "Chart"}) {
        auto form = Loaded("<" + std::string(kind) +
                           " Name='Kind' Text='Kinds' Charset='utf-8' Description='About'/>");
        ASSERT_EQ(kSuccess, form->SaveHTML4Worksheet(Path("k.htm"), text::ToLower(kind) + ".htm", false,
                                                     false, true, "", "", "<table></table>"));
        const std::string page = ReadFile(Path("k.htm"));
        EXPECT_NE(std::string::npos, page.find("<h1>Kinds</h1>")) << kind;
        EXPECT_NE(std::string::npos, page.find(">About</div>")) << kind;
        EXPECT_EQ(std::string::npos, page.find("{{")) << kind << page;
    }
    EXPECT_NE(std::string::npos, ReadFile(Path("k.htm")).find("<table></table>"));
}

} // namespace
} // namespace tovimar
