#include "GenerationTest.h"

#include "generation/clsFrmRptHelpContextIds.h"
#include "support/Golden.h"
#include "uimodel/CXmlForm.h"

namespace tovimar::test {
namespace {

class ContextIdsTest : public GenerationTest {
protected:
    /// Saves a definition and shows it to the table, as the pass does.
    void See(const std::string& name, const std::string& attributes, const std::string& controls = {}) {
        const std::string xml =
            "<Form Name=\"" + name + "\" Text=\"x\" WindowSize=\"1, 1\" ClientAreaOffset=\"0, 0\" " +
            attributes + " HtmlFileName=\"" + name + ".htm\"><Controls>" + controls + "</Controls></Form>";
        WriteFile("help\\xml\\" + name + ".xml", xml);
        CXmlForm form;
        ASSERT_EQ(kSuccess, form.LoadXml(xml));
        ids.ExtractUsedHelpContextIds(form);
    }
    std::int32_t IdOf(const std::string& name) {
        CXmlForm form;
        form.Load(project->Folder + "xml\\" + name + ".xml");
        return form.HelpContextId;
    }
    static std::string Button(const std::string& name, const std::string& rest = "/>") {
        return "<CommandButton Name=\"" + name + "\" Left=\"0\" Top=\"0\" Width=\"9\" Height=\"9\" " + rest;
    }

    clsFrmRptHelpContextIds ids;
};

TEST_F(ContextIdsTest, FreeIdsAreTensRoundTheUsedOnes) {
    See("A", "HelpContextId=\"10\"", Button("b", "HelpContextId=\"30\"/>"));
    EXPECT_TRUE(ids.IsIdUsed(30));
    EXPECT_EQ(20, ids.NextFreeId(true));
    EXPECT_EQ(40, ids.NextFreeId(false));
    EXPECT_EQ(50, ids.NextFreeId(true)) << "a number that was looked at isn't looked at again";
    ids.Reset();
    EXPECT_EQ(60, ids.NextFreeId(true)) << "the last number survives";
}

TEST_F(ContextIdsTest, DuplicatesKeepTheirNumber) {
    See("A", "HelpContextId=\"7\"", Button("b", "HelpContextId=\"7\"/>"));
    EXPECT_EQ(std::vector<std::string>{"A*b*7"}, ids.Duplicates());
    See("A", "HelpContextId=\"7\"");
    EXPECT_EQ(1U, ids.Duplicates().size()) << "each object counts once";
}

TEST_F(ContextIdsTest, WhatHasNoIdGetsOneAndTheHeaderNamesObjects) {
    See("Orders", "HelpContextId=\"10\"", Button("ok"));
    See("Order_Items", "", Button("tab", "><Controls>" + Button("inner") + "</Controls></CommandButton>"));
    See("Part", "GUIObjectSubType=\"UserControl\"", Button("c"));
    WriteFile("help\\HelpContextIds.h", "#define MINE 5\r\n");
    ids.AssignHelpContextIds();
    ids.SetHelpContextIds();
    EXPECT_EQ(10, IdOf("Orders"));
    EXPECT_EQ(30, IdOf("Order_Items"));
    EXPECT_EQ(0, IdOf("Part"));
    ExpectGolden("generation/Shop.h", HelpFile("Shop.h"));
    EXPECT_EQ(0, Sent("ActivateComponent")) << "the application isn't changed unless asked for";

    const std::string before = HelpFile("xml\\Order_Items.xml");
    EXPECT_NE(std::string::npos, before.find("NewHelpContextIdsCount = \"1\""));
    ids.AssignHelpContextIds();
    EXPECT_EQ(30, IdOf("Order_Items"));
    EXPECT_EQ(before, HelpFile("xml\\Order_Items.xml")) << "nothing new, nothing written";
}

TEST_F(ContextIdsTest, NewIdsGoIntoTheApplicationHidden) {
    Parameters().SaveApplicationChanges = true;
    See("Orders", "HelpContextId=\"10\"");
    See("Items", "");
    ids.AssignHelpContextIds();
    sent.clear();
    ids.SetHelpContextIds();
    EXPECT_EQ(1, Sent("ActivateComponent"));
    EXPECT_EQ(1, Sent("SetComponentHelpContextId"));
    EXPECT_EQ(1, Sent("CloseComponent"));
}

TEST_F(ContextIdsTest, ATableIsNotWrittenIntoTheFormOfItsName) {
    Parameters().SaveApplicationChanges = true;
    const std::string xml = "<Table Name=\"Orders\" Text=\"x\" HtmlFileName=\"T.htm\"></Table>";
    WriteFile("help\\xml\\T.xml", xml);
    CXmlForm table;
    ASSERT_EQ(kSuccess, table.LoadXml(xml));
    ids.ExtractUsedHelpContextIds(table);
    ids.AssignHelpContextIds();
    sent.clear();
    ids.SetHelpContextIds();
    EXPECT_EQ(0, Sent("SetComponentHelpContextId"));
    EXPECT_NE(std::string::npos, HelpFile("Shop.h").find("#define IDH_T  10\r\n"));
}

TEST_F(ContextIdsTest, EarlierIdsComeBackUnlessTheApplicationUsesThem) {
    const auto pass = [&] {
        See("Items", "",
            Button("ok") + Button("tab", "><Controls>" + Button("in") + "</Controls></CommandButton>"));
        See("Orders", "");
        See("Gone", "");
    };
    pass();
    ids.AssignHelpContextIds();
    EXPECT_EQ(10, IdOf("Items"));
    EXPECT_EQ(50, IdOf("Orders"));
    EXPECT_EQ(60, IdOf("Gone"));

    // A run that makes the project anew: "New" comes first, "Gone" is gone, a button of "Orders" took the
    // number of one of "Items".
    clsFrmRptHelpContextIds second;
    second.LoadEarlierIds(project->Folder + "xml\\");
    const auto seeAnew = [&](const std::string& name, const std::string& controls) {
        See(name, "", controls);
        CXmlForm form;
        form.Load(project->Folder + "xml\\" + name + ".xml");
        second.ExtractUsedHelpContextIds(form);
        second.RecallEarlierIds(form);
        form.SaveXml("", project->Folder + "xml\\" + name + ".xml");
    };
    seeAnew("New", {});
    seeAnew("Items",
            Button("ok") + Button("tab", "><Controls>" + Button("in") + "</Controls></CommandButton>"));
    EXPECT_EQ(10, IdOf("Items")) << "a run that is stopped here has forgotten nothing";
    seeAnew("Orders", Button("mine", "HelpContextId=\"20\"/>"));
    second.AssignHelpContextIds();
    EXPECT_EQ(70, IdOf("New")) << "the number of what is gone isn't given again";
    EXPECT_EQ(10, IdOf("Items"));
    EXPECT_EQ(50, IdOf("Orders"));
    CXmlForm items;
    items.Load(project->Folder + "xml\\Items.xml");
    EXPECT_EQ(80, items.Controls.At(1)->HelpContextId) << "the application's own number wins";
    EXPECT_EQ(30, items.Controls.At(2)->HelpContextId);
    EXPECT_EQ(40, items.Controls.At(2)->Controls.At(1)->HelpContextId);
    EXPECT_EQ(1, items.NewHelpContextIdsCount) << "the application doesn't know it yet";
}

TEST_F(ContextIdsTest, CompiledApplicationGetsNoHeader) {
    See("Orders", "");
    answers["CurrentSourceProjectIsMDEorADE"] = "True";
    ids.AssignHelpContextIds();
    ids.SetHelpContextIds();
    EXPECT_EQ(10, IdOf("Orders"));
    EXPECT_FALSE(HelpFileExists("Shop.h"));
}

} // namespace
} // namespace tovimar::test
