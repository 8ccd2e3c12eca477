#include "project/ProjectTest.h"

#include "foundation/CAddInSettingsXmlFile.h"
#include "foundation/Session.h"
#include "platform/text/Text.h"

#include <memory>

namespace tovimar::test {
namespace {

const char* const kSmallProject = R"xml(
<Project name="Sales" title="Sales help" GeneratedHtmlFile="Title.htm">
 <Introduction KEY="intro" Caption="Read &#34;this&#34; first" genhtml="sub\Intro.htm" html="Intro.htm"
   Indexes="start|Start|welcome" Indexes1="first steps" Indexes3="never read"/>
 <Forms key="forms" caption="Forms" ProcessCode="1" TemplateHtmlFile="Forms.htm" GeneratedHtmlFile="Forms.htm">
  <AllForms key="all" serializer="GetAccFormsXml" skipped="-1"/>
  <FORM Name="Orders" Key="Sales.Form_Orders" caption="Orders &amp; lines" icon="form" ProcessCode="999"
    GeneratedHTMLFile="Sales_Form_Orders.htm" TemplateHTMLFile="Form.htm" title="Orders" type="2" Skipped="0"/>
  <FORM Name="Old" Key="Sales.Form_Old" caption="Old" ProcessCode="999" GeneratedHTMLFile="Old.htm" type="2"
    Skipped="true"><Page key="below" caption="Below a skipped node" GeneratedHtmlFile="below.htm"/></FORM>
 </Forms>
 <Label key="label" caption="No entry"/>
</Project>)xml";

class TreeFileTest : public ProjectTest {
protected:
    std::string SavedText() {
        const auto path = Path("Saved.tvp");
        EXPECT_EQ(
            tree.SaveXml(path, /*vfSkipSerializers=*/true, "Name = \"Sales\" SUID = \"s\" HUID = \"h\" "), 0)
            << LastBox();
        return ReadFile(path);
    }
};

TEST_F(TreeFileTest, WritesProjectContentsAndIndexByteForByte) {
    LoadTree(kSmallProject);
    ExpectGolden("small.tvp", SavedText());
    ASSERT_EQ(tree.SaveHHC(Path("s.hhc"), false), 0);
    ExpectGolden("small.hhc", ReadFile(Path("s.hhc")));
    ASSERT_EQ(tree.MakeAndSaveHHK(Path("s.hhk")), 0);
    ExpectGolden("small.hhk", ReadFile(Path("s.hhk")));
    std::string options;
    const auto list = tree.GetTreeStr(options);
    ExpectGolden("small.tree.txt", list + options);
    ExpectGolden("small.contents.txt", tree.Root()->ContentsHTML(1, true));
}

TEST_F(TreeFileTest, LoadedAgainTheFileIsTheSame) {
    LoadTree(kSmallProject);
    const auto first = SavedText();
    ASSERT_EQ(tree.Load(Path("Saved.tvp")), 0);
    EXPECT_EQ(SavedText(), first);
    EXPECT_EQ(tree.NodesQty(), 6) << "the placeholder isn't in the file";
}

TEST_F(TreeFileTest, ProjectFileHoldsNoFolderOfTheMachine) {
    CAddInSettingsXmlFile settings;
    settings.SetOptionValue("FolderForGeneratedHelp", "Z:\\here\\");
    settings.SetOptionValue("LastUsedFolderForGeneratedHelp", "Z:\\here\\");
    settings.SetOptionValue("Author", "tester");
    Session::SetSettings(&settings);
    LoadTree("<Project/>");
    const auto text = SavedText();
    EXPECT_NE(text.find("    <Option Name = \"FolderForGeneratedHelp\" Value = \"{Project Location}CHM\" />"),
              std::string::npos)
        << text;
    EXPECT_EQ(text.find("here"), std::string::npos) << text;
    EXPECT_EQ(text.find("\r\n\r\n"), std::string::npos);
    EXPECT_EQ(tree.Root()->Name(), "Sales") << "an empty name takes that of the parameters";
    Session::SetSettings(nullptr);
}

TEST_F(TreeFileTest, KeywordsComeBackInTheirOrder) {
    std::string words;
    std::vector<std::string> expected;
    for (int i = 0; i < 40; ++i) {
        expected.push_back("keyword number " + std::to_string(i));
        words += (i == 0 ? "" : "|") + expected.back();
    }
    LoadTree("<Project><P key='p' Indexes='" + words + "'/></Project>");
    const auto text = SavedText();
    EXPECT_NE(text.find("   Indexes = \"keyword number 0|"), std::string::npos) << text;
    EXPECT_NE(text.find("   Indexes6 = \""), std::string::npos) << text;
    ASSERT_EQ(tree.Load(Path("Saved.tvp")), 0);
    std::vector<std::string> read;
    for (const auto& word : Node("p").IndexesCollection())
        read.push_back(word);
    EXPECT_EQ(read, expected);
}

TEST_F(TreeFileTest, RepairsTakenKeysAndReportsWhatCantBeRepaired) {
    LoadTree("<Project><A key='x'/><B key='X'/><C/></Project>");
    EXPECT_EQ(Node("x1").Tag, "B");
    EXPECT_EQ(Node("C").Tag, "C") << "the tag stands for an empty key";
    EXPECT_TRUE(boxes->shown.empty());

    std::string many = "<Project>";
    for (int i = 0; i < 1002; ++i)
        many += "<A key='same'/>";
    LoadTree(many + "</Project>");
    EXPECT_EQ(tree.NodesQty(), 1001);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(LastBox().find("Duplicate node key value 'same'."), std::string::npos) << LastBox();
    EXPECT_NE(LastBox().find("in CHelpPrjTree.addItem"), std::string::npos) << LastBox();
}

TEST_F(TreeFileTest, HostileValuesDontBreakTheFile) {
    LoadTree("<Project><P name='R&amp;amp;D' key='a&lt;\"b&amp;lt;' caption='&lt;&quot;&amp;&gt;' "
             "GeneratedHtmlFile='x&quot;&amp;.htm'/></Project>");
    const auto text = SavedText();
    ASSERT_EQ(tree.Load(Path("Saved.tvp")), 0) << text;
    const auto& node = *tree.Root()->Children().At(1);
    EXPECT_EQ(node.GeneratedHTMLFile(), "x\"&.htm");
    EXPECT_EQ(node.Key(), "a<\"b&lt;");
    EXPECT_EQ(node.Name(), "R&amp;D");
    EXPECT_EQ(node.Caption(), "<\"&>");
}

TEST_F(TreeFileTest, WarnsOfAFileThatDoesntParse) {
    const auto path = WriteFile("bad.tvp", "<TovimarProject><Project></TovimarProject>");
    EXPECT_NE(tree.Load(path), 0);
    EXPECT_FALSE(tree.Loaded());
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(LastBox().find(" - "), std::string::npos) << LastBox();
    EXPECT_EQ(tree.Load(WriteFile("none.tvp", "<TovimarProject/>")), 0) << "no project is an empty tree";
    EXPECT_EQ(tree.Root(), nullptr);
}

TEST_F(TreeFileTest, LeavesOutTheGroupsThatTheOptionsSwitchOff) {
    parameters.GenerateHelpForTables = false;
    LoadTree("<Project><Tables key='t'><TABLE key='u'/></Tables><Queries key='q'/></Project>");
    EXPECT_EQ(tree.MapItem("t"), nullptr);
    EXPECT_EQ(tree.MapItem("u"), nullptr);
    EXPECT_EQ(tree.NodesQty(), 1);
}

TEST_F(TreeFileTest, ReadOnlyFileIsReportedAsSuch) {
    LoadTree("<Project/>");
    EXPECT_NE(tree.SaveXml(Path("no\\such\\folder\\x.tvp")), 0);
    EXPECT_NE(LastBox().find("READ_ONLY = False"), std::string::npos) << LastBox();
}

TEST_F(TreeFileTest, TwentyThousandNodesUnderOneParent) {
    std::string xml = "<Project>";
    for (int i = 0; i < 20000; ++i) {
        const auto number = std::to_string(i);
        xml += "<Topic key='k" + number + "' caption='Topic " + number + "' GeneratedHtmlFile='t" + number +
               ".htm' Indexes='word " + std::to_string(i % 7) + "'/>";
    }
    LoadTree(xml + "</Project>");
    EXPECT_EQ(tree.NodesQty(), 20000);
    EXPECT_TRUE(tree.Root()->NodeFileNameDefined("T19999.HTM"));
    SavedText();
    EXPECT_EQ(tree.MakeAndSaveHHK(Path("s.hhk")), 0);
    tree.Root()->Children().At(10000)->Terminate();
    EXPECT_EQ(tree.MapItem("k9999"), nullptr);
    EXPECT_FALSE(tree.Root()->NodeFileNameDefined("t9999.htm"));
    tree.Terminate();
    EXPECT_EQ(tree.Root(), nullptr);
}

} // namespace
} // namespace tovimar::test
