#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/clsAccCmdBarControls.h"
#include "platform/MessageBoxAnswers.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

namespace tovimar {
namespace {

using test::AddControl;
using test::Fake;
using test::MakeFake;
using test::MakeList;

class FormProcessorTest : public test::EnvironmentTest {
protected:
    FormProcessorTest() {
        Session::SetParameters(&parameters);
        processor.SetIdeAppInstance(access.app);
        form = access.AddForm("Orders");
        form->With("currentview", 1);
    }
    ~FormProcessorTest() override { Session::SetParameters(nullptr); }

    std::vector<std::string> Names(const CControlsCollection& controls) {
        std::vector<std::string> names;
        for (const HostObject& control : controls)
            names.push_back(control->Get("Name").AsString());
        return names;
    }
    HostObject OpenOrders(bool hidden = false, bool forceDesign = false) {
        return processor.FindActualFormOfComponent(MakeFake("AccessObject", "Orders"), hidden, forceDesign);
    }
    std::string Rectangle(const HostObject& control) {
        std::int32_t left = 0, top = 0, width = 0, height = 0;
        processor.GetControlRectangleInTwips(nullptr, control, left, top, width, height);
        return std::to_string(left) + "," + std::to_string(top) + "," + std::to_string(width) + "," +
               std::to_string(height);
    }

    CTovimarParameters parameters;
    test::FakeAccess access;
    CN_IDEAccFormProcessor processor;
    Fake form;
};

using Strings = std::vector<std::string>;

/// Each press changes the state over.
void MakeToggle(const Fake& button) {
    button->On("Execute", [state = button.get()](const auto&) {
        state->With("State", state->Get("State").AsInteger() == 0 ? -1 : 0);
        return Value();
    });
}

TEST_F(FormProcessorTest, CaptionOfAControl) {
    const Fake box = AddControl(form, form, "TextBox", "txtCity");
    EXPECT_EQ(processor.ControlCaptionGet(box), "City");
    AddControl(form, box, "Label", "lbl1")->With("Caption", "Town:");
    const Fake button = AddControl(form, form, "CommandButton", "cmdOK");
    button->With("Caption", "&Fine");
    EXPECT_EQ(processor.ControlCaptionGet(button), "&Fine");
    // What was asked of the form before is kept until a form is opened or closed.
    processor.ActualFormClose(nullptr, form);
    EXPECT_EQ(processor.ControlCaptionGet(box), "Town:");
    processor.ActualFormClose(nullptr, form);
    AddControl(form, box, "Label", "lbl2")->With("Caption", "Last wins");
    EXPECT_EQ(processor.ControlCaptionGet(box), "Last wins");

    const std::pair<const char*, const char*> cleaned[] = {{"txtCustomerName", "CustomerName"},
                                                           {"customer", "customer"},
                                                           {"id", "id"},
                                                           {"Plain", "Plain"},
                                                           {"aB", "B"},
                                                           {"x1Y", "Y"},
                                                           {"übÄ", "Ä"},
                                                           {"a12", "a12"},
                                                           {"B12", "B12"},
                                                           {"aB12", "B12"}};
    for (const auto& [name, caption] : cleaned)
        EXPECT_EQ(processor.ControlCaptionGet(AddControl(form, form, "TextBox", name)), caption) << name;
    EXPECT_EQ(processor.ControlNameGet(nullptr), "");
}

TEST_F(FormProcessorTest, CaptionOfAForm) {
    form->With("Caption", "Orders 2026");
    EXPECT_EQ(processor.ComponentCaptionGet(form), "Orders 2026");
    AddControl(form, form, "Label", "lblFree")->With("Caption", "Free text");
    form->With("Caption", "  ");
    EXPECT_EQ(processor.ComponentCaptionGet(form), "Orders");
    EXPECT_EQ(processor.ComponentTypeName(form), "Form");
    EXPECT_EQ(processor.ComponentTypeName(MakeFake("Report_X")), "Report");
}

TEST_F(FormProcessorTest, ListedControls) {
    const Fake box = AddControl(form, form, "TextBox", "txtA");
    AddControl(form, box, "Label", "lblA");
    AddControl(form, form, "Line", "line");
    AddControl(form, form, "rectangle", "box");
    const Fake group = AddControl(form, form, "OptionGroup", "grp");
    AddControl(form, group, "OptionButton", "opt");
    AddControl(form, form, "TextBox", "txtHidden")->With("Visible", false);
    EXPECT_EQ(Names(processor.ControlsCollectionGet(form)), (Strings{"txtA", "lblA", "grp", "txtHidden"}));
    EXPECT_EQ(Names(processor.ControlsCollectionGet(group)), Strings{"opt"});
    EXPECT_EQ(Names(processor.ControlsCollectionGet(box)), Strings{});
    parameters.SkipInvisibleControls = true;
    EXPECT_EQ(Names(processor.ControlsCollectionGet(form)), (Strings{"txtA", "lblA", "grp"}));
    EXPECT_EQ(processor.GetLabelControlParentName(form->Get("Controls", {"lblA"}).AsObject()), "txtA");
    EXPECT_EQ(processor.GetLabelControlParentName(box), "");

    EXPECT_TRUE(CN_IDEAccFormProcessor::IsSkippedControlType("PageBreak", 2));
    EXPECT_FALSE(CN_IDEAccFormProcessor::IsSkippedControlType("TabControl", 2));
    EXPECT_TRUE(CN_IDEAccFormProcessor::IsSkippedControlType("Page", 3));
}

TEST_F(FormProcessorTest, Subforms) {
    const Fake frame = AddControl(form, form, "SubForm", "subItems");
    const Fake inner = access.AddForm("Items");
    inner->With("Parent", HostObject(form));
    AddControl(inner, inner, "TextBox", "txtItem");
    frame->With("Form", HostObject(inner)).With("SourceObject", "Form.Items");
    EXPECT_EQ(Names(processor.ControlsCollectionGet(frame)), Strings{"txtItem"});
    for (const char* source : {"", "Table.Orders", "query.Q"}) {
        frame->With("SourceObject", source);
        EXPECT_EQ(processor.ControlsCollectionGet(frame).Count(), 0) << source;
    }
    frame->With("SourceObject", "Form.Orders").With("Form", HostObject(form));
    EXPECT_EQ(processor.ControlsCollectionGet(frame).Count(), 0) << "a form inside itself";
    frame->values.erase("form");
    frame->On("Form", [](const auto&) -> Value { throw RaisedError(2467, "closed", "Host"); });
    EXPECT_EQ(processor.ControlsCollectionGet(frame).Count(), 0);
    EXPECT_EQ(Session::Run().runErrorCount, 0);

    const Fake report = access.AddReport("Sales");
    const Fake inReport = AddControl(report, report, "SubForm", "sub");
    EXPECT_EQ(processor.ObjectTypeName(inReport), "SubReport");
    EXPECT_EQ(processor.ObjectTypeName(frame), "SubForm");
}

TEST_F(FormProcessorTest, TabPages) {
    const Fake tab = AddControl(form, form, "TabControl", "tab&Main", 300, 600, 3000, 2000);
    std::vector<Fake> pages;
    for (const char* name : {"pgOne", "pgTwo"}) {
        pages.push_back(AddControl(form, tab, "Page", name));
        AddControl(form, pages.back(), "TextBox", std::string("txt") + name)->With("Visible", false);
    }
    pages[0]->With("Visible", false).With("Caption", "&First");
    tab->With("Pages", HostObject(MakeList(pages))).With("Value", 5);
    parameters.SkipInvisibleControls = true;

    processor.SetFirstPageVisibleForTabControls(form);
    EXPECT_EQ(tab->Get("Value"), Value(1));
    EXPECT_EQ(processor.TabPageActivate(form, tab, 0), nullptr);
    EXPECT_EQ(tab->Get("Value"), Value(1));
    EXPECT_EQ(processor.TabPageActivate(form, tab, 1), pages[1]);
    EXPECT_EQ(Names(processor.TabPageControlsCollectionGet(tab, 1)), Strings{"txtpgTwo"});
    EXPECT_EQ(processor.TabPageCaptionGet(tab, 0), "First");
    EXPECT_EQ(processor.TabPageCaptionGet(tab, 1), "pgTwo");
    EXPECT_EQ(processor.TabControlCaptionGet(tab), "TAB:tabMain");
    EXPECT_EQ(processor.TabControlPagesQtyGet(tab), 2);

    form->With("currentview", 0);
    EXPECT_EQ(processor.TabPageActivate(form, tab, 0), pages[0]);
    EXPECT_EQ(access.calls.back(), "RunCommand 40");

    const auto tabRectangle = [&](std::int32_t index) {
        std::int32_t left = 0, top = 0, width = 0, height = 0;
        processor.GetTabPageTabRectangleInTwips(index, nullptr, tab, left, top, width, height);
        return Strings{std::to_string(left), std::to_string(width), std::to_string(height)};
    };
    form->With("currentview", 1);
    processor.ActualFormClose(nullptr, form);
    tab->With("TabFixedWidth", 1500).With("TabFixedHeight", 0).With("FontSize", 8).With("FontWeight", 400);
    EXPECT_EQ(tabRectangle(0), (Strings{"20", "100", "19"}));
    EXPECT_EQ(tabRectangle(1), (Strings{"120", "100", "19"}));
    // Without a fixed width a tab is as wide as its caption needs: 167 twips for a letter of 8 points.
    tab->With("TabFixedWidth", 0).With("TabFixedHeight", 300);
    processor.ActualFormClose(nullptr, form);
    EXPECT_EQ(tabRectangle(0), (Strings{"20", "50", "20"})) << "&First";
    EXPECT_EQ(tabRectangle(1), (Strings{"70", "42", "20"})) << "pgTwo";
    tab->With("FontSize", 10).With("FontWeight", 700);
    processor.ActualFormClose(nullptr, form);
    EXPECT_EQ(tabRectangle(1), (Strings{"93", "61", "20"}));
}

TEST_F(FormProcessorTest, Rectangles) {
    const Fake box = AddControl(form, form, "TextBox", "txtA", 150, 308, 1500, 247);
    // Halves go to the even neighbour: 307.5 / 15 = 20.5 gives 20.
    const Fake half = AddControl(form, form, "TextBox", "txtB", 0, 0, 1500, 0);
    half->With("Height", 307.5);
    EXPECT_EQ(Rectangle(box), "10,21,100,16");
    EXPECT_EQ(Rectangle(half), "0,0,100,20");

    processor.ActualFormClose(nullptr, form);
    form->With("currentview", 2);
    AddControl(form, box, "Label", "lblA", 10, 10, 100, 100);
    box->With("ColumnOrder", 2).With("ColumnWidth", 1500);
    half->With("ColumnOrder", 1).With("ColumnWidth", 900);
    EXPECT_EQ(Rectangle(half), "17,0,60,18");
    EXPECT_EQ(Rectangle(box), "77,0,100,18");
}

TEST_F(FormProcessorTest, OpeningForms) {
    EXPECT_NE(OpenOrders(), nullptr);
    EXPECT_EQ(access.calls, Strings{"OpenForm Orders 1"});
    EXPECT_NE(OpenOrders(), nullptr) << "an open form stays as it is";
    EXPECT_EQ(access.calls.size(), 1U);
    processor.ActualFormClose(nullptr, form, true);
    EXPECT_EQ(access.calls.back(), "Close 2 Orders 1");

    access.calls.clear();
    OpenOrders(/*hidden=*/true);
    EXPECT_EQ(access.calls, Strings{"OpenForm Orders 1 - - - 1"});
    processor.ActualFormClose(nullptr, form);

    access.calls.clear();
    parameters.MakeNormalViewScreenshots = true;
    form->With("DefaultView", 2);
    OpenOrders();
    EXPECT_EQ(access.calls, (Strings{"OpenForm Orders 0", "Close 2 Orders 2", "OpenForm Orders 3"}));
    processor.ActualFormClose(nullptr, form);

    access.calls.clear();
    access.database->With("MDE", "t");
    form->With("DefaultView", 0);
    OpenOrders(false, /*forceDesign=*/true);
    EXPECT_EQ(access.calls, Strings{"OpenForm Orders 0"}) << "a compiled database has no design view";
}

TEST_F(FormProcessorTest, FailingToOpen) {
    access.openFailures = {2501, 2501};
    boxes->answers = {platform::kAnswerRetry, platform::kAnswerCancel};
    EXPECT_EQ(OpenOrders(), nullptr);
    ASSERT_EQ(boxes->shown.size(), 2U);
    EXPECT_EQ(boxes->shown[0].text,
              "OpenForm action was cancelled for [Orders] form, would you like to retry?");
    EXPECT_EQ(boxes->shown[0].flags, 37U);
    EXPECT_EQ(access.calls.back(), "Close 2 Orders 2");
    EXPECT_EQ(Session::Run().runErrorCount, 0);

    // Boxes that always press their default button must not keep the run for ever.
    access.openFailures.assign(100, 3071);
    EXPECT_EQ(OpenOrders(), nullptr);
    EXPECT_GT(access.openFailures.size(), 50U);

    access.openFailures = {kFailure1};
    boxes->shown.clear();
    EXPECT_EQ(OpenOrders(), nullptr);
    EXPECT_EQ(Session::Run().runErrorCount, 1);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(boxes->shown[0].text.find("Orders.form, line 7: no End"), std::string::npos);
}

TEST_F(FormProcessorTest, ReportWithoutPreview) {
    access.AddReport("Sales");
    const Fake entry = MakeFake("AccessObject", "Sales");
    parameters.MakeNormalViewScreenshots = true;
    access.openFailures = {2213};
    EXPECT_EQ(processor.FindActualReportOfComponent(entry), nullptr);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text,
              "Making a screenshot of report Sales was not successful\r\n"
              "You can make this screenshot later using the Tovimar’s screenshot tool.");
    access.openFailures = {2501};
    EXPECT_EQ(processor.FindActualReportOfComponent(entry, /*vfHidden=*/true), nullptr);
    EXPECT_EQ(boxes->shown.size(), 1U) << "hidden reports ask nothing";
    access.openFailures = {2501, 3071};
    boxes->answers = {platform::kAnswerRetry, platform::kAnswerCancel};
    EXPECT_EQ(processor.FindActualReportOfComponent(entry), nullptr);
    ASSERT_EQ(boxes->shown.size(), 3U);
    EXPECT_EQ(boxes->shown[2].text,
              "OpenReport action was cancelled for [Sales] report, would you like to retry?");
    EXPECT_EQ(boxes->shown[2].title, "Tovimar Add-In");
    EXPECT_EQ(access.calls.back(), "Close 3 Sales 2");
}

TEST_F(FormProcessorTest, WindowIsEnlargedForThePicture) {
    form->With("currentview", 0);
    form->On("Section", [](const auto& arguments) -> Value {
        const std::int32_t number = arguments.at(0).AsInteger();
        if (number > 2)
            throw RaisedError(2462, "no such section", "Host");
        const Fake section = MakeFake("Section");
        section->With("Height", 1000 * (number + 1));
        return HostObject(section);
    });
    processor.CorrectInsideWidthAndHeight(2, form, /*vfCompIsInDesignView=*/true);
    EXPECT_EQ(form->Get("InsideWidth"), Value(6040));
    EXPECT_EQ(form->Get("InsideHeight"), Value(6000 + 3 * 255 + 60));
    processor.ResetInsideWidthAndHeight(2, form, true);
    EXPECT_EQ(form->Get("InsideWidth"), Value(100));
    EXPECT_EQ(form->Get("InsideHeight"), Value(200));
    parameters.MakeNormalViewScreenshots = true;
    processor.CorrectInsideWidthAndHeight(2, form, true);
    EXPECT_EQ(form->Get("InsideWidth"), Value(100));
}

TEST_F(FormProcessorTest, ViewTogglesAreBroughtUpAndPutBack) {
    std::vector<Fake> toggles;
    for (const std::int32_t id : {966, 556, 1}) {
        toggles.push_back(MakeFake("CommandBarButton"));
        toggles.back()->With("ID", id).With("State", -1);
        MakeToggle(toggles.back());
    }
    const Fake menu = MakeFake("CommandBarPopup");
    menu->With("ID", 30004).With("Controls", HostObject(MakeList(toggles)));
    const Fake bar = MakeFake("CommandBar", "Menu bar");
    bar->With("Controls", HostObject(MakeList({menu})));
    access.app->With("CommandBars", HostObject(MakeList({bar})));
    const auto states = [&] {
        Strings all;
        for (const Fake& toggle : toggles)
            all.push_back(toggle->Get("State").AsString());
        return all;
    };
    processor.CorrectInsideWidthAndHeight(3, form, false);
    EXPECT_EQ(states(), (Strings{"0", "-1", "-1"}));
    processor.ResetInsideWidthAndHeight(3, form, false);
    EXPECT_EQ(states(), (Strings{"-1", "-1", "-1"}));

    clsAccCmdBarControls bars;
    bars.Init(access.app);
    EXPECT_TRUE(bars.ControlDefined(556));
    EXPECT_FALSE(bars.ControlDefined(1));
    toggles[0]->With("State", 0);
    bars.Down();
    EXPECT_EQ(states(), (Strings{"-1", "-1", "-1"}));
    access.app->values.erase("commandbars");
    bars.Init(access.app);
    bars.Up();
    bars.RestoreState();
    EXPECT_FALSE(bars.ControlDefined(966));
    EXPECT_EQ(states(), (Strings{"-1", "-1", "-1"}));
}

TEST_F(FormProcessorTest, FieldsOfTablesAndQueries) {
    const Fake table = access.AddPlain("TableDefs", "Orders");
    const Fake id = MakeFake("Field", "ID");
    id->With("OrdinalPosition", 0).With("Description", "Number of the order");
    table->With("Fields", HostObject(MakeList({id, MakeFake("Field", "City")})));
    const CControlsCollection fields = processor.FieldsCollectionGet("Orders", "table");
    ASSERT_EQ(fields.Count(), 2);
    EXPECT_EQ(processor.PropertyValue(fields.Items().At(1), "Description"), Value("Number of the order"));
    EXPECT_EQ(processor.PropertyValue(fields.Items().At(2), "Caption"), Value("City"));
    EXPECT_FALSE(processor.HasProperty(fields.Items().At(2), "Left"));
    EXPECT_EQ(processor.FieldsCollectionGet("Orders", "Macro").Count(), 0);
}

TEST_F(FormProcessorTest, SmallAnswers) {
    const Fake box = AddControl(form, form, "TextBox", "txtA");
    box->With("ControlTipText", "Tip");
    EXPECT_EQ(processor.ControlSeedTextGet(form, box), "Tip");
    box->With("StatusBarText", "Status");
    EXPECT_EQ(processor.ControlSeedTextGet(form, box), "Status");
    std::int32_t tabIndex = 7, index = 7;
    processor.GetControlIndexes(box, tabIndex, index);
    EXPECT_EQ(tabIndex, -1);
    box->With("TabIndex", 3);
    processor.GetControlIndexes(box, tabIndex, index);
    EXPECT_EQ(tabIndex, 3);
    EXPECT_EQ(index, -1);
    processor.Terminate();
    processor.Terminate();
}

} // namespace
} // namespace tovimar
