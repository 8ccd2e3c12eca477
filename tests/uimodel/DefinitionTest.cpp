#include "uimodel/CXmlForm.h"

#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "platform/text/Text.h"
#include "support/FakeEnvironment.h"
#include "support/Golden.h"

namespace tovimar {
namespace {

class DefinitionTest : public test::EnvironmentTest {
protected:
    DefinitionTest() { Session::SetParameters(&parameters); }

    static std::unique_ptr<CXmlForm> Loaded(const std::string& xml) {
        auto form = std::make_unique<CXmlForm>();
        EXPECT_EQ(kSuccess, form->LoadXml(xml));
        return form;
    }
    static std::string WithControls(const std::string& controls) {
        return "<Form Name='F' Text='F'><Controls>" + controls + "</Controls></Form>";
    }

    CTovimarParameters parameters;
};

constexpr const char* kOrders =
    "<Form Name='Orders' Text='Customer &amp; Orders: \"all\"' AutoScaleBaseSize='5,13' WindowSize='400,300' "
    "ClientAreaOffset='8, 29' BorderStyle='2' HasMap='True' Charset='utf-8' Description='All &lt;orders&gt;' "
    "Language='English' Stylesheet='C:\\help\\Office10.css' NamePrefix='App' "
    "PicFullPath='C:\\h\\images\\Orders.jpg' "
    "HtmlFullPath='C:\\h\\Orders.htm' HelpContextId='-1' NewHelpContextIdsCount='3' SourceProjectType='MS "
    "ACCESS' "
    "SourceProjectName='R&amp;D &quot;Shop&quot;' OriginalClassName='Form_Orders' GUIObjectSubType='x' "
    "HWND='65537'>"
    "<Sections><Section Name='Detail' ClientAreaOffset='0, 10' FormRecordSelectorWidth='17' Height='200' "
    "DesignTimeHeaderHeight='18'/></Sections>"
    "<Menu><MenuEntry Name='mnuFile' Text='&amp;File'/></Menu>"
    "<Controls>"
    "<TextBox Name='First Name' Caption='First name:' OriginalClassName='textbox' Location='10, 20' "
    "Size='100,19' "
    "TabIndex='0' HelpContextId='7' Visible='False' SectionName='Detail'/>"
    "<TabControl Name='tab' ClassName='SSTab' Location='-1, 0' Size='1, 1' Index='2'><Controls>"
    "<Page Name='p' Text='Page' Location='0, 0' Size='50, 50' TabPageTab='1,2,3,4' TabPageIndex='0'>"
    "<Controls><Label Name='first name' ParentControlName='First Name' Text='a&amp;b'/></Controls></Page>"
    "</Controls></TabControl>"
    "</Controls>"
    "<Documented><Menus><Item Name='mnuFile' Bmk='mnuFile' Caption='File' IsMenu='true'/></Menus>"
    "<Controls><Item Name='a' Bmk='a' Caption='A &amp; B'/><Item Name='a2' Bmk='A' Caption='again'/><Item "
    "Name='b&lt;' Bmk='b' Caption='B'/></Controls>"
    "</Documented></Form>";

TEST_F(DefinitionTest, WritesTheFixedFormatAndReadsItsOwnTextToTheSameBytes) {
    auto form = Loaded(kOrders);
    const std::string written = form->XMLSTr();
    test::ExpectGolden("uimodel/orders.xml", written);
    EXPECT_EQ(written, form->XMLSTr());

    // The pictures' folder goes with the file name, as the current project knows it.
    EXPECT_EQ(Path("Orders.xml"), form->SaveXml(Folder()));
    CXmlForm again;
    ASSERT_EQ(kSuccess, again.Load(Path("Orders.xml")));
    EXPECT_EQ(written, again.XMLSTr());
    EXPECT_EQ("<?xml version=\"1.0\" encoding=\"utf-8\" ?>\r\n" + written, ReadFile(Path("Orders.xml")));
}

/// Each attribute with its condition met, then a control for which none is.
constexpr const char* kAllOfAControl =
    "<Frame Name='n&amp;amp;' Text='T &lt;' Description='D \"' ClassName='GroupBox' "
    "OriginalClassName='Frame1' "
    "Location='1, 2' Size='3,4' TabIndex='5' Index='6' HelpContextId='7' PicFileName='p.jpg' Visible='False' "
    "HotSpot='9,9,9,9' TabPageTab='1, 2, 3, 4' SectionName='S&amp;1' ParentControlName='P&amp;lt;' Level='2' "
    "TabPageIndex='0' BookmarkName='read anew' Indexes='k &amp; w'/>"
    "<Frame Name='N&amp;amp;' OriginalClassName='FRAME' Location='-1, -1' TabIndex='-1' Index='0' "
    "HelpContextId='0' Visible='True' TabPageTab='-1,0,0,0'/>"
    "<Frame Name='bare'/>";

TEST_F(DefinitionTest, WritesEachAttributeOfAControlUnderItsCondition) {
    auto form = Loaded(WithControls(kAllOfAControl));
    const std::string written = form->XMLSTr();
    test::ExpectGolden("uimodel/control_attributes.xml", written);
    auto again = Loaded(written);
    // A tab index of -1 isn't written, so it reads as 0; from then on nothing changes.
    const std::string stable = again->XMLSTr();
    EXPECT_EQ(text::ReplaceAll(written, "\"0, 0\" BookmarkName", "\"0, 0\" TabIndex = \"0\" BookmarkName"),
              stable);
    EXPECT_EQ(stable, Loaded(stable)->XMLSTr());
    // An entity in a name is part of the name.
    EXPECT_EQ("n&amp;", again->Controls.At(1)->Name);
    EXPECT_EQ("P&lt;", again->Controls.At(1)->ParentControlName);
}

TEST_F(DefinitionTest, TheElementTellsTheKind) {
    for (const auto& [kind, type] : std::vector<std::pair<std::string, std::int32_t>>{{"Form", 2},
                                                                                      {"Report", 3},
                                                                                      {"Table", 0},
                                                                                      {"Query", 1},
                                                                                      {"Macro", 4},
                                                                                      {"Worksheet", 81},
                                                                                      {"Chart", 82}}) {
        auto form = Loaded("<" + kind + " Name='A &amp;amp; B'/>");
        EXPECT_EQ(kind, form->Type_());
        EXPECT_EQ(type, form->SourceObjectType);
        const std::string xaml = form->MyXaml();
        CXmlForm inXaml;
        EXPECT_EQ(kSuccess, inXaml.LoadXml(xaml)) << xaml;
        EXPECT_EQ("A &amp; B", inXaml.Name);
    }
}

TEST_F(DefinitionTest, PropertiesAnswerByTheirNames) {
    auto form = Loaded(
        "<Form Name='F' Text='T' HelpContextId='5'><Menu><MenuEntry Name='m' Text='M'/></Menu></Form>");
    EXPECT_EQ("T", form->Properties("Caption").AsString());
    EXPECT_EQ(5, form->Properties("HelpContextId").AsInteger());
    EXPECT_TRUE(form->Properties("caption").IsNull());
    const CXmlMenu& menu = *form->Menus.At(1);
    EXPECT_EQ("M", menu.Properties("Text").AsString());
    EXPECT_EQ("M", menu.Properties("Caption").AsString());
    EXPECT_TRUE(menu.Properties("text").IsNull());
}

TEST_F(DefinitionTest, AFormWithNothingKeepsWhatIsAlwaysWritten) {
    auto form = Loaded("<Report Name='R'/>");
    EXPECT_EQ("<Report Name = \"R\" Text = \"\" WindowSize = \"0, 0\" ClientAreaOffset = \"0, 0\" "
              "BorderStyle = \"-1\" >\r\n<Documented>\r\n</Documented>\r\n</Report>\r\n",
              form->XMLSTr());
    EXPECT_EQ(3, form->SourceObjectType);
    EXPECT_TRUE(form->DocumentedControls.Empty());
    EXPECT_EQ(
        0U, form->MyXaml().find("<?xml version=\"1.0\" encoding=\"utf-8\" standalone=\"no\"?>\r\n<MyXaml "));
}

TEST_F(DefinitionTest, IndexesDefaultToTheFirst32CharactersAndStay) {
    const std::string exact(32, 'x');
    EXPECT_EQ(exact, Loaded("<Form Name='N' Text='" + exact + "'/>")->Indexes);
    auto form = Loaded("<Form Name='N' Text='" + exact + "y'/>");
    EXPECT_EQ(exact + "...", form->Indexes);
    form->Text = "other";
    form->XMLSTr();
    EXPECT_EQ(exact + "...", form->Indexes);

    parameters.IdentifyControls = 1;
    EXPECT_EQ("N", Loaded("<Form Name='N' Text='T'/>")->Indexes);
    auto controls = Loaded(WithControls("<Button Name='a&amp;b' Text='T'/><Label Name='l' Text='L'/>"));
    EXPECT_EQ("ab", controls->Controls.At(1)->Indexes);
    EXPECT_EQ("", controls->Controls.At(2)->Indexes);
    controls->XMLSTr();
    EXPECT_EQ("l", controls->Controls.At(2)->Indexes);
}

TEST_F(DefinitionTest, TakenNamesGetAnUnderscoreAtTheTopAndEndTheReadingBelow) {
    auto form = Loaded(WithControls("<A Name='x'/><A Name='X'/><A Name='x'/>"));
    EXPECT_EQ("X", form->Controls.Find("x_")->get()->Name);
    EXPECT_TRUE(form->Controls.Contains("x__"));

    CXmlForm broken;
    EXPECT_EQ(
        457, broken.LoadXml(WithControls("<G Name='g'><Controls><A Name='x'/><A Name='x'/></Controls></G>")));
    EXPECT_EQ(1U, boxes->shown.size());
}

TEST_F(DefinitionTest, BookmarksAreUniqueInTheWholeTreeWithoutRegardToCase) {
    auto form = Loaded(WithControls("<A Name='a'/><A Name='A '/><Page Name='p'><Controls><A Name='A'/>"
                                    "<A Name='a1'/></Controls></Page><A Name='First Name'/>"));
    std::vector<std::string> bookmarks;
    for (CXmlControl* control : form->AllControls())
        bookmarks.push_back(control->HtmlBookMarkName());
    EXPECT_EQ((std::vector<std::string>{"a", "A_", "p", "A1", "a11", "First_Name"}), bookmarks);
    EXPECT_EQ("p", form->AllControls()[3]->ParentControl()->Name);
}

TEST_F(DefinitionTest, LooksUpTheFirstControlInTheOrderOfTheWalk) {
    auto form = Loaded(WithControls("<G Name='g'><Controls><A Name='x' Text='inner'/></Controls></G>"
                                    "<A Name='x' Text='outer'/>"));
    EXPECT_EQ("inner", form->GetControl("x")->Text());
    EXPECT_EQ(nullptr, form->GetControl("X"));
    EXPECT_EQ("inner", form->GetControl("x", form->GetControl("g"))->Text());
    form->Controls.TakeAt(1);
    form->ControlsChanged();
    EXPECT_EQ("outer", form->GetControl("x")->Text());
}

TEST_F(DefinitionTest, SortsByTabIndexAndKeepsTheOrderOfEqualOnes) {
    auto form =
        Loaded(WithControls("<A Name='c' TabIndex='2'/><A Name='a' TabIndex='1'/><A Name='b' TabIndex='1'/>"
                            "<A Name='d' TabIndex='0'><Controls><A Name='f' TabIndex='5'/>"
                            "<A Name='e' TabIndex='4'/></Controls></A>"));
    form->SortControlsUsingTabIndex();
    std::string order;
    for (CXmlControl* control : form->AllControls())
        order += control->Name;
    EXPECT_EQ("defabc", order);
}

TEST_F(DefinitionTest, HotSpotsAddTheClientAreaAndEndAtTheGreatestNumber) {
    auto form = Loaded("<Form Name='F' ClientAreaOffset='8, 29'><Controls><G Name='g'><Controls>"
                       "<A Name='a' Location='10, 20' Size='100, 19'/></Controls></G>"
                       "<A Name='huge' Location='2147483647, 0' Size='10, 10'/></Controls></Form>");
    CXmlControl& control = *form->GetControl("a");
    EXPECT_EQ("18,49,118,68", control.Properties("hotspot").AsString());
    EXPECT_EQ(10, control.HotSpotLeft(/*vfNoClientAreaOffset=*/true));
    EXPECT_EQ(2147483647, form->GetControl("huge")->HotSpotRight());
    control.Left = -1;
    EXPECT_TRUE(control.Properties("HotSpot").IsNull());
    EXPECT_TRUE(control.Properties("TabPageTab").IsNull());
    EXPECT_EQ("a", control.Properties("BOOKMARKNAME").AsString());
}

TEST_F(DefinitionTest, WhatIsSavedLoadsAgainWhateverItsAttributesHold) {
    for (const std::string& xml :
         {std::string("<Form Name='F' Text='F' HtmlFileName='a&#6;b&#10;.htm' Charset='&#1;\t'/>"),
          WithControls("<ListBo: Name='a'/><x:1 Name='b'/><Text:Box Name='c'/>")}) {
        const std::string saved = Loaded(xml)->XMLSTr();
        EXPECT_EQ(Loaded(saved)->XMLSTr(), saved);
    }
    EXPECT_EQ(Loaded(WithControls("<ListBo: Name='a'/>"))->Controls.At(1)->ElementName(), "ListBo:");
}

TEST_F(DefinitionTest, CaptionsLoseTheirColon) {
    CXmlControl control;
    for (const auto& [text, caption] : std::vector<std::pair<std::string, std::string>>{
             {"Name:", "Name"}, {"  Name: ", "Name"}, {":", ":"}, {"", ""}, {"a::", "a:"}}) {
        control.SetText(text);
        EXPECT_EQ(caption, control.Caption());
    }
}

TEST_F(DefinitionTest, BrokenInputIsToldByCodeAndReport) {
    CXmlForm form;
    EXPECT_NE(kSuccess, form.LoadXml("<Form Name='F'>"));
    ASSERT_TRUE(form.XmlParseError.has_value());
    EXPECT_FALSE(form.XmlParseError->reason.empty());
    EXPECT_EQ(kFailure1, form.LoadXml("<Other/>"));
    EXPECT_TRUE(boxes->shown.empty());
    EXPECT_EQ(kFailure2, form.Parse("<Other/>"));

    const std::string path = WriteFile("other.xml", "<Other/>");
    EXPECT_EQ(kFailure1, form.Load(path));
    ASSERT_EQ(2U, boxes->shown.size());
    EXPECT_NE(std::string::npos, boxes->shown[1].text.find("Error parsing XML definition of '"));
    EXPECT_EQ(9, form.LoadXml("<Form Name='F' WindowSize='400'/>"));
    EXPECT_EQ(13, form.LoadXml(WithControls("<A Name='a' TabIndex='many'/>")));
    // A level is foreign input and makes no endless indent.
    EXPECT_LT(Loaded(WithControls("<A Name='a' Level='2000000000'/>"))->XMLSTr().size(), 5000U);
}

TEST_F(DefinitionTest, AControlWithoutANameGetsOneOfTheTime) {
    EXPECT_EQ("11045_3", Loaded(WithControls("<A TabIndex='3'/>"))->Controls.At(1)->Name);
}

} // namespace
} // namespace tovimar
