#include "topics/CFormHtmlTemplates.h"
#include "topics/TopicNames.h"

#include "platform/text/Text.h"
#include "support/Golden.h"
#include "topics/TopicTest.h"

#include <filesystem>
#include <fstream>
#include <sstream>

namespace tovimar {
namespace {

class TemplatesTest : public test::TopicTest {
protected:
    std::string Built(CXmlForm& form, const std::string& templateFile = {}, const std::string& zoom = {}) {
        return CFormHtmlTemplates().FileTemplate(form, true, true, true, true, true, true, templateFile, zoom,
                                                 /*vfUseLocalImagePath=*/true, "", "");
    }
    CFormHtmlTemplates templates;
};

TEST_F(TemplatesTest, TheBuiltInLayoutFromFirstToLastLine) {
    auto form = Orders();
    test::ExpectGolden("topics/orders_builtin.htm", Built(*form, "", "0.8"));
}

TEST_F(TemplatesTest, PlainListsAndNamesInsteadOfCaptions) {
    auto form = Orders();
    parameters.BulletMenusControls = false;
    parameters.IdentifyControls = 1;
    form->NamePrefix = "App 1";
    const std::string prefix = FormBookmarkPrefix(*form);
    EXPECT_EQ("<P>\r\n\r\n<a href=\"#" + prefix + "_mnuFile\">mnuFile</a>\r\n<BR/>\r\n</P>\r\n",
              templates.MenusList(*form));
    EXPECT_EQ("<!-- + FORM TITLE + -->\r\n<H1>Orders</H1>\r\n<!-- - FORM TITLE - -->\r\n",
              templates.FormTitle(*form));
    const std::string all =
        templates.SubControlsList(*form, *form->GetControl("p0"), /*vfListSubControls=*/true);
    EXPECT_NE(std::string::npos, all.find(">la</a>"));
    EXPECT_EQ("", templates.MenusList(*Loaded("<Form Name='F'/>")));
    EXPECT_EQ("", templates.ControlsList(*Loaded("<Form Name='F'/>")));
}

TEST_F(TemplatesTest, AcceleratorsLeaveTheCaption) {
    for (const auto& [caption, plain] :
         std::vector<std::pair<std::string, std::string>>{{"&File", "File"},
                                                          {"Save && Exit", "Save & Exit"},
                                                          {"R&", "R"},
                                                          {"&#65;", "&#65;"},
                                                          {"A &#38;&#38; B", "A &#38; B"},
                                                          {"&#38;Open", "Open"},
                                                          {"&#38; &#38;x", "&#38; x"},
                                                          {"", ""}})
        EXPECT_EQ(plain, StripAccelerators(caption)) << caption;
    EXPECT_EQ("&#38;Open", StripAccelerators("&#38;Open", /*vfEncoded=*/false));
}

TEST_F(TemplatesTest, AreasInAControlsPictureAreRelativeToItsFrame) {
    auto form = Loaded(
        "<Form Name='F' HasMap='True' SourceProjectType='MS ACCESS' ClientAreaOffset='8, 29'><Controls>"
        "<OptionGroup Name='g' Location='10, 20' Size='90, 90' PicFileName='g.jpg'><Controls>"
        "<OptionButton Name='o' Text='O' Location='15, 30' Size='9, 9'/></Controls></OptionGroup>"
        "<TabControl Name='t' Location='100, 100'><Controls><Page Name='p' Location='3, 3' "
        "TabPageTab='-1,-1,1,1'>"
        "<Controls><TextBox Name='x' Location='110, 120' Size='5, "
        "5'/></Controls></Page></Controls></TabControl>"
        "</Controls></Form>");
    const auto area = [&](const char* name, const char* parent) {
        return templates.ControlArea("F", *form, *form->GetControl(name), form->GetControl(parent), false);
    };
    EXPECT_EQ("<AREA SHAPE=\"RECT\" COORDS=\"5,18,14,27\" HREF=\"#F_o\" FRAME=\"\" alt=\"O\" />",
              area("o", "g"));
    EXPECT_NE(std::string::npos, area("x", "p").find("\"10,22,15,27\""));
    // A page without a tab has no area; the picture's map still has what stands on it.
    EXPECT_EQ(std::string::npos, templates.ControlsMap(*form).find("#F_p\""));
    form->HasMap = false;
    EXPECT_EQ("", templates.ControlsMap(*form));
    EXPECT_EQ("", templates.ControlsMapOfControl(*form, *form->GetControl("g")));
    EXPECT_EQ("<!-- + CONTROL IMAGE + -->\r\n<IMG SRC=\"images\\g.jpg\" BORDER=0 \r\n/>\r\n<!-- - CONTROL "
              "IMAGE - -->\r\n",
              templates.ControlImage(*form, *form->GetControl("g"), true, ""));
}

TEST_F(TemplatesTest, PicturesOfAnotherScaleSayHowLargeTheyAreShown) {
    auto form = Loaded("<Form Name='F' SourceProjectType='MS ACCESS' WindowSize='300, 200'><Controls>"
                       "<OptionGroup Name='g' Size='90, 60' PicFileName='g.jpg'/>"
                       "<Subform Name='s' Size='70, 50' PicFileName='s.jpg'/></Controls></Form>");
    const auto image = [&](const char* name) {
        return templates.ControlImage(*form, *form->GetControl(name), true, "");
    };
    EXPECT_EQ(std::string::npos, image("g").find("WIDTH"));
    Session::Parameters()->ImagesScale = 1.5;
    EXPECT_NE(std::string::npos, image("s").find("\r\nWIDTH=\"70\" HEIGHT=\"50\" />"));
    EXPECT_NE(std::string::npos, image("g").find("WIDTH=\"90\" HEIGHT=\"68\" ")) << "with the frame's title";
}

TEST_F(TemplatesTest, PagesNameEachPictureAndArea) {
    auto form = Loaded(
        "<Form Name='F' Text='Say \"Hi\" &amp;&amp; go' HasMap='True'><Controls>"
        "<TextBox Name='txtBare' Location='1, 1'/>"
        "<Frame Name='g' Text='A &lt;b&gt; \"c\"' PicFileName='g.jpg'><Controls><TextBox Name='x' Text='X'/>"
        "</Controls></Frame></Controls></Form>");
    form->SetPicFullPath(WriteFile("images\\F.jpg", "x"));
    const std::string page = Built(*form, WriteFile("t.htm", "{{MAP}}{{IMAGE}}{{Controls}}wbh"));
    for (const char* part :
         {"<IMG SRC=\"images\\F.jpg\" BORDER=0 \r\nUSEMAP=\"#F\" ALT=\"Say &#34;Hi&#34; &#38; go\" />",
          "USEMAP=\"#F_g\" ALT=\"A &#60;b&#62; &#34;c&#34;\" />",
          "HREF=\"#F_txtBare\" FRAME=\"\" alt=\"txtBare\" />",
          "HREF=\"#F_g\" FRAME=\"\" alt=\"A &lt;b&gt; &quot;c&quot;\" />",
          "<H2><a name=\"F_g\">A &lt;b&gt; \"c\"</a></H2>"})
        EXPECT_NE(std::string::npos, page.find(part)) << part << page;
    // The pieces on their own are what earlier versions wrote.
    EXPECT_EQ(std::string::npos, templates.MainImage(*form, true, "").find("ALT"));
    EXPECT_NE(std::string::npos, templates.ControlsMap(*form).find("#F_txtBare\" FRAME=\"\" alt=\"\" />"));
}

TEST_F(TemplatesTest, PicturesByPathAreRelativeToTheTopicWhereTheyLieBelowIt) {
    auto form = Orders();
    EXPECT_NE(std::string::npos, templates.MainImage(*form, false, "").find("SRC=\"images\\Orders.jpg\""));
    WriteFile("other\\Orders.jpg", "x");
    EXPECT_NE(std::string::npos,
              templates.MainImage(*form, false, Path("other")).find("SRC=\"other\\Orders.jpg\""));
    form->SetHtmlFullPath("C:\\elsewhere\\Orders.htm");
    EXPECT_NE(std::string::npos,
              templates.MainImage(*form, false, "").find("SRC=\"" + Path("images\\Orders.jpg") + "\""));
    form->SetPicFullPath(Path("missing.jpg"));
    EXPECT_EQ("", templates.MainImage(*form, true, ""));
}

TEST_F(TemplatesTest, ATemplateLosesTheRegionsThatArentShown) {
    const std::string page = WriteFile(
        "t.htm",
        "{{StyleSheetLinkHtml}}{{htmltopiccaption}}[{{MAP}}{{IMAGE}}]<!-- + MENUS LIST + -->{{MenusList}}"
        "<!-- - MENUS LIST - --><!-- + MENUS + -->{{Menus}}<!-- - MENUS - -->|<!-- + CONTROLS LIST + -->"
        "{{ControlsList}}<!-- - CONTROLS LIST - -->|<!-- + controls + -->{{Controls}}{{Fields}}<!-- - "
        "CONTROLS - -->"
        "{{HtmlTovimarExcludeList}}wBh{{FormName}}");
    auto form = Orders();
    const auto filled = [&](bool menusList, bool menus, bool list, bool controls) {
        return templates.FileTemplate(*form, false, false, menusList, menus, list, controls, page, "", true,
                                      "", "");
    };
    EXPECT_EQ("{{StyleSheetLinkHtml}}Orders[]||wBhOrders", filled(false, false, false, false));
    EXPECT_EQ("{{StyleSheetLinkHtml}}Orders[]<!-- + MENUS LIST + -->" + templates.MenusList(*form) +
                  "<!-- - MENUS LIST - -->" + templates.Menus(*form) + "|<!-- + CONTROLS LIST + -->" +
                  templates.ControlsList(*form) + "<!-- - CONTROLS LIST - -->|" +
                  templates.Controls(*form, false, false, true, "") + "wBhOrders",
              filled(true, true, true, true));
    auto plain = Loaded("<Form Name='N' Text='T'/>");
    EXPECT_EQ("{{StyleSheetLinkHtml}}\r\n<style type=\"text/css\" media=\"screen\">\r\nbody {zoom: "
              "2}\r\n</style>\r\n"
              "T[]|<!-- + CONTROLS LIST + --><!-- - CONTROLS LIST - -->|wBhN",
              Built(*plain, page, "2"));
    // The markers the wrong way round keep what is between them.
    EXPECT_EQ("x<!-- + MENUS LIST + -->wbh",
              Built(*plain, WriteFile("u.htm", "<!-- - MENUS - -->x<!-- + MENUS LIST + -->wbh")));
    EXPECT_EQ("\r\n\r\n" + WebHelpScript(), Built(*plain, Path("missing.htm")));
    EXPECT_TRUE(boxes->shown.empty());
}

TEST_F(TemplatesTest, FieldsOfAQueryLinkToTheirTables) {
    const std::string fields = [] {
        std::string text;
        for (const char* name : {"a", "b", "c", "d", "e", "F label|f"})
            text += "<Field Name='" + std::string(name) + "'/>";
        return text;
    }();
    const std::string html = templates.GenerateQueryFieldsHTML(
        "qry", "<Query Name='q'><InheritedFields Title='From &lt;tables&gt;'><Table Name='tbl'>" + fields +
                   "</Table></InheritedFields><CalculatedFields Title='Calculated'><Field Name='Sum'/><Field "
                   "Name='Avg'/>"
                   "</CalculatedFields></Query>");
    EXPECT_EQ(
        "<H2>From &#60;tables&#62;</H2>\r\n<P><A href=\"tbl.htm#tbl_a\">a</A>, <A "
        "href=\"tbl.htm#tbl_b\">b</A>, "
        "<A href=\"tbl.htm#tbl_c\">c</A>, <A href=\"tbl.htm#tbl_d\">d</A>, <A href=\"tbl.htm#tbl_e\">e</A>, "
        "<BR>"
        "<A href=\"tbl.htm#tbl_f\">F label</A>&nbsp;from <A href=\"tbl.htm\">tbl</A>&nbsp;table.</P>\r\n"
        "<H2>Calculated</H2><P></P>\r\n<H3><A name=\"qry_Sum\">Sum</A></H3>\r\n<H3><A "
        "name=\"qry_Avg\">Avg</A></H3>",
        html);
    EXPECT_EQ("", templates.GenerateQueryFieldsHTML("qry", "<Query><InheritedFields Title='x'/></Query>"));
    EXPECT_EQ("", templates.GenerateQueryFieldsHTML("qry", "<Query"));
    EXPECT_EQ(1U, boxes->shown.size());
}

/// As the database stores names.
std::string Wide(const std::string& ascii) {
    std::string wide;
    for (const char c : ascii)
        wide.append({c, '\0'});
    return wide;
}

/// A name in a table's definition, its length in front.
std::string ColumnName(const std::string& name) {
    return std::string{static_cast<char>(name.size() * 2), '\0'} + Wide(name);
}

TEST_F(TemplatesTest, DescriptionsComeFromADatabaseByTheirKey) {
    const std::filesystem::path source(TOVIMAR_SOURCE_DIR "/../shared/corpus/access-forms/Reports.accdb");
    if (!std::filesystem::exists(source))
        GTEST_SKIP() << "the corpus is absent: " << source;
    std::ostringstream read;
    read << std::ifstream(source, std::ios::binary).rdbuf();
    // A real database whose table and columns get names of the same lengths.
    std::string bytes = text::ReplaceAll(read.str(), Wide("CustomerLabels"), Wide("tblDescription"));
    bytes = text::ReplaceAll(bytes, ColumnName("City") + ColumnName("State"),
                             ColumnName("Key") + ColumnName("States"));
    bytes = text::ReplaceAll(bytes, ColumnName("AddressType"), ColumnName("Description"));
    WriteFile("real\\Descriptions.mdb", bytes);
    for (const auto& [key, description] : std::vector<std::pair<std::string, std::string>>{
             {"East City", "HO"}, {"east CITY", "HO"}, {"West City", "HQ"}, {"East City ", ""}, {"it's", ""}})
        EXPECT_EQ(description, templates.GetDescription(key, Path("real"))) << key;
}

TEST_F(TemplatesTest, DescriptionsComeFromTheControlWhereTheFileHasNone) {
    EXPECT_EQ("", templates.GetDescription("Orders_a", Folder()));
    WriteFile("descriptions\\Descriptions.mdb", "no database");
    EXPECT_EQ("", templates.GetDescription("Orders_a", Path("descriptions")));
    SetInstallation(Folder());
    parameters.InsertExternalDescriptions = true;
    auto form = Orders();
    const std::string section =
        templates.SubControls(*form, *form->GetControl("First Name"), true, true, true, "");
    EXPECT_NE(std::string::npos, section.find("<p>Who <b>pays</b>.</p>\r\n"));
    EXPECT_EQ("", templates.Charset(""));
    EXPECT_EQ("<meta http-equiv=\"Content-Type\" content=\"text/html; charset=utf-8\">\r\n",
              templates.Charset("utf-8"));
}

} // namespace
} // namespace tovimar
