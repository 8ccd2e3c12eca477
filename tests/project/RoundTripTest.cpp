#include "project/ProjectTest.h"

#include "foundation/ErrorTrap.h"
#include "project/CHelpPrjCheckSums.h"

namespace tovimar::test {
namespace {

/// Every kind of node and every attribute that a project file keeps, with values that other formats trip
/// over.
const char* const kFullProject = R"xml(
<Project name="Sales" title="Sales &amp; more" GeneratedHtmlFile="Title.htm" Charset="windows-1252">
 <Welcome key="w" caption="Gr&#252;&#223;e, &#8220;quoted&#8221; &lt;b&gt; &#1046;" html="Welcome.htm" htm="unread.htm"
   genhtml="Welcome.htm" CSSFullPath="Z:\styles\own.css" PicsSubfolderName="pics" extraValue="a;b=&quot;c&quot;"
   Indexes="Z&#252;rich|caf&#233;|CAF&#201;|&#1046;uk" Indexes1="a &amp; b|'single'" title="&#220;ber uns" icon="document"/>
 <Forms key="f" caption="Forms" ProcessCode="1" TemplateHtmlFile="Forms.htm" GeneratedHtmlFile="Forms.htm">
  <AllForms key="all" serializer="GetAccFormsXml" skipped="-1"/>
  <FORM name="O&quot;Brien &amp; sons" key="Sales.Form_O&quot;Brien &amp; sons" caption="O'Brien" type="2" ProcessCode="999"
    GeneratedHtmlFile="o.htm" SourceProjectType="mdb" SourceProjectName="Sales" icon="form">
   <Notes key="n1" caption="Level four"><Deep key="n2" caption="Level five" skipped="1"/></Notes>
  </FORM>
  <FORM name="Gone" key="Sales.Form_Gone" caption="Gone" type="2" ProcessCode="999" GeneratedHtmlFile="gone.htm"
    Skipped="true" OriginalKey="Form_Gone" POriginalKey="f"/>
 </Forms>
 <Reports key="r" ProcessCode="2"><REPORT key="r1" name="R" type="3" ProcessCode="999" GeneratedHtmlFile="r.htm"/></Reports>
 <Tables key="t" ProcessCode="3"><TABLE key="t1" name="T" type="0" ProcessCode="999" GeneratedHtmlFile="t.htm"/></Tables>
 <Queries key="q" ProcessCode="4"><QUERY key="q1" name="Q" ObjectType="1" ProcessCode="999"/></Queries>
 <Macros key="m" ProcessCode="5"><MACRO key="m1" name="M" type="4" ProcessCode="999"/></Macros>
 <Sheets key="s" ProcessCode="81"><Worksheet key="s1" name="S" type="81" ProcessCode="999"/></Sheets>
 <Charts key="c" ProcessCode="82"><Chart key="c1" name="C" type="82" ProcessCode="999"/></Charts>
 <Label key="l" caption="No entry"/>
</Project>)xml";

class RoundTripTest : public ProjectTest {
protected:
    std::string Saved(const std::string& name) {
        const auto path = Path(name);
        EXPECT_EQ(
            tree.SaveXml(path, /*vfSkipSerializers=*/true, "Name = \"Sales\" SUID = \"s\" HUID = \"h\" "), 0);
        EXPECT_EQ(tree.SaveHHC(path + ".hhc", false), 0);
        EXPECT_EQ(tree.MakeAndSaveHHK(path + ".hhk"), 0);
        return ReadFile(path);
    }
};

TEST_F(RoundTripTest, EveryKindOfNodeComesBack) {
    LoadTree(kFullProject);
    const auto first = Saved("one.tvp");
    ExpectGolden("full.tvp", first);
    ExpectGolden("full.hhc", ReadFile(Path("one.tvp.hhc")));
    ExpectGolden("full.hhk", ReadFile(Path("one.tvp.hhk")));

    ASSERT_EQ(tree.Load(Path("one.tvp")), 0) << LastBox();
    EXPECT_EQ(Saved("two.tvp"), first);
    EXPECT_EQ(ReadFile(Path("two.tvp.hhc")), ReadFile(Path("one.tvp.hhc")));
    EXPECT_EQ(ReadFile(Path("two.tvp.hhk")), ReadFile(Path("one.tvp.hhk")));
    EXPECT_EQ(Node("Sales.Form_O\"Brien & sons").Name(), "O\"Brien & sons");
    EXPECT_EQ(Node("w").Caption(), "Gr\xC3\xBC\xC3\x9F"
                                   "e, \xE2\x80\x9Cquoted\xE2\x80\x9D <b> \xD0\x96");
    EXPECT_EQ(Node("w").IndexesCollection().Count(), 5U) << "a word in another case is the same word";
    EXPECT_EQ(Node("q1").ObjectType(), 1);
    EXPECT_TRUE(Node("n2").Skipped());
}

/// A tree on display notes the neighbours of each entry; nothing else in the file changes, and the marks go
/// again with the view.
TEST_F(RoundTripTest, NeighboursAreWrittenOfATreeOnDisplay) {
    LoadTree("<Project key='p'><A key='a'/><B key='b\"&lt;' caption='long caption that fills its own text'/>"
             "<C key='c' Indexes='one|two'/></Project>");
    tree.DisplayInTreeview(&view);
    EXPECT_EQ(tree.GetXMLStr(true),
              "  <Project level = \"1\" \r\n          key=\"p\" \r\n          icon=\"hlpclose\"  >\r\n"
              "    <A level = \"2\" \r\n            key=\"a\" \r\n            pkey=\"p\" \r\n"
              "            nnodekey=\"b&#34;&#60;\" \r\n            icon=\"helptopic\"  />\r\n"
              "    <B level = \"2\"  caption = \"long caption that fills its own text\" \r\n"
              "            key=\"b&#34;&#60;\" \r\n            pkey=\"p\" \r\n            pnodekey=\"a\" \r\n"
              "            nnodekey=\"c\" \r\n            icon=\"helptopic\"  />\r\n"
              "    <C level = \"2\" \r\n            key=\"c\" \r\n            pkey=\"p\" \r\n"
              "            pnodekey=\"b&#34;&#60;\" \r\n            icon=\"helptopic\"   Indexes = "
              "\"one|two\"  />\r\n"
              "  </Project>\r\n");
    EXPECT_EQ(Node("c").PreviousNodeKey(), "b\"<");
}

TEST_F(RoundTripTest, ChecksumFile) {
    WriteFile("a.htm", "abc");
    WriteFile("empty.htm", "");
    WriteFile("longer.htm", std::string(1000, 'x'));
    CHelpPrjCheckSums sums;
    ASSERT_EQ(sums.Init(Folder(), Folder(), "Sales"), 0);
    ASSERT_EQ(sums.Recalc(), 0);
    ASSERT_EQ(sums.Save(), 0);
    const auto first = ReadFile(Path("SalesCS.txt"));
    ExpectGolden("SalesCS.txt", first);
    CHelpPrjCheckSums again;
    ASSERT_EQ(again.Init(Folder(), Folder(), "Sales"), 0);
    ASSERT_EQ(again.Recalc(), 0);
    EXPECT_TRUE(again.ChangedFiles().empty());
    ASSERT_EQ(again.Save(), 0);
    EXPECT_EQ(ReadFile(Path("SalesCS.txt")), first);
}

/// Keys come and go in the order of adding, however many were taken out before.
TEST_F(RoundTripTest, KeyMapKeepsItsOrder) {
    std::vector<std::unique_ptr<CHelpPrjTreeNode>> nodes;
    NodeMap map;
    EXPECT_EQ(map.Find("none"), nullptr);
    EXPECT_FALSE(map.Remove("none"));
    for (int i = 0; i < 1000; ++i) {
        nodes.push_back(std::make_unique<CHelpPrjTreeNode>());
        ASSERT_TRUE(map.Add(nodes.back().get(), "Key \xC3\x84" + std::to_string(i)));
        if (i % 3 != 0) {
            ASSERT_TRUE(map.Remove("kEY \xC3\xA4" + std::to_string(i)));
        }
    }
    EXPECT_EQ(map.Count(), 334U);
    EXPECT_FALSE(map.Add(nodes[1].get(), "key \xC3\xA4"
                                         "999"))
        << "taken";
    ASSERT_TRUE(map.Remove("key \xC3\xA4"
                           "0"));
    EXPECT_FALSE(map.Remove("key \xC3\xA4"
                            "0"));
    ASSERT_TRUE(map.Add(nodes[0].get(), "key \xC3\xA4"
                                        "0"));
    std::size_t expected = 3;
    for (const auto* node : map) {
        EXPECT_EQ(node, expected > 999 ? nodes[0].get() : nodes[expected].get());
        expected += 3;
    }
    EXPECT_EQ(map.Find("KEY \xC3\x84"
                       "0"),
              nodes[0].get());
}

} // namespace
} // namespace tovimar::test
