#include "platform/access/Fixtures.h"
#include "platform/windowing/WindowSystem.h"

namespace tovimar::platform::access {
namespace {

class AutomationTest : public ApplicationTest {
protected:
    AutomationTest() {
        Part("forms\\Orders.form", kOrdersForm);
        Part("forms\\Lines.form",
             SmallForm("Begin TextBox\r\nColumnOrder =2\r\nName =\"txtB\"\r\nEnd\r\n"
                       "Begin TextBox\r\nColumnOrder =1\r\nColumnWidth =900\r\nName =\"txtA\"\r\nEnd\r\n"
                       "Begin Label\r\nName =\"lbl\"\r\nEnd\r\n",
                       "    DefaultView =2\r\n"));
        Part("forms\\Self.form",
             SmallForm("Begin Subform\r\nName =\"me\"\r\nSourceObject =\"Form.Self\"\r\nEnd\r\n"));
        Part("forms\\Ping.form",
             SmallForm("Begin Subform\r\nName =\"s\"\r\nSourceObject =\"Form.Pong\"\r\nEnd\r\n"));
        Part("forms\\Pong.form",
             SmallForm("Begin Subform\r\nName =\"s\"\r\nSourceObject =\"Form.Ping\"\r\nEnd\r\n"));
        Part("reports\\Invoice.report",
             "Begin Report\r\nWidth =7000\r\nBegin\r\nBegin PageHeader\r\nHeight =500\r\n"
             "Name =\"ph\"\r\nEnd\r\nBegin Section\r\nHeight =300\r\nName =\"d\"\r\nEnd\r\nEnd\r\nEnd\r\n");
        application = Open();
        command = Object(application, "DoCmd");
    }
    HostObject OpenForm(const std::string& name, int view) {
        command->Call("OpenForm", {name, view});
        return Object(application, "Forms", {name});
    }
    static HostObject Control(const HostObject& form, const std::string& name) {
        return Object(form, "Controls", {name});
    }

    HostObject application;
    HostObject command;
};

TEST_F(AutomationTest, TellsOfTheProject) {
    const auto project = Object(application, "CurrentProject");
    EXPECT_EQ(Text(project, "Path"), Path("App"));
    EXPECT_EQ(Text(project, "FullName"), Path("App\\App.accdb"));
    EXPECT_EQ(Text(project, "Name"), "App.accdb");
    EXPECT_EQ(project->Get("projecttype"), Value(2));
    EXPECT_EQ(Names(Object(project, "AllForms")), "Lines,Orders,Ping,Pong,Self");
    EXPECT_EQ(Text(Object(project, "AllReports", {"invoice"}), "Name"), "Invoice");
    EXPECT_EQ(RaisedBy([&] { Object(project, "AllForms", {"None"}); }).number, 2467);
    EXPECT_EQ(Text(application, "Version"), "11.0");
    EXPECT_EQ(RaisedBy([&] { application->Get("NoSuchMember"); }).number, 438);
    const auto bar = Object(application, "CommandBars", {"Menu Bar"});
    EXPECT_EQ(Object(bar, "Controls")->Get("Count"), Value(0));
}

TEST_F(AutomationTest, ListsAllControlsWithTheirParents) {
    const auto form = OpenForm("Orders", 1);
    EXPECT_EQ(form->ClassName(), "Form_Orders");
    EXPECT_EQ(Names(Object(form, "Controls")),
              "cmd Print,txtCustomer,lblCustomer,grpState,optOpen,lblOpen,tabMain,"
              "pagFirst,chkPaid,pagSecond,subLines");
    for (const auto& [control, parent, className] :
         {std::tuple("lblCustomer", "txtCustomer", "Label"),
          std::tuple("optOpen", "grpState", "OptionButton"), std::tuple("lblOpen", "optOpen", "Label"),
          std::tuple("chkPaid", "pagFirst", "CheckBox"), std::tuple("pagFirst", "tabMain", "Page"),
          std::tuple("tabMain", "Orders", "TabControl"), std::tuple("subLines", "Orders", "SubForm")}) {
        EXPECT_EQ(Text(Object(Control(form, control), "Parent"), "Name"), parent) << control;
        EXPECT_EQ(Control(form, control)->ClassName(), className);
    }
    EXPECT_EQ(Control(form, "cmd print")->Identity(),
              Object(Object(form, "Controls"), "Item", {0})->Identity());
    EXPECT_EQ(Names(Object(Control(form, "tabMain"), "Pages")), "pagFirst,pagSecond");
    EXPECT_EQ(Names(Object(Control(form, "pagFirst"), "Controls")), "chkPaid");
    EXPECT_EQ(Names(Object(Control(form, "grpState"), "Controls")), "optOpen,lblOpen");
    EXPECT_EQ(RaisedBy([&] { Control(form, "none"); }).number, 2465);
    EXPECT_EQ(RaisedBy([&] { Object(form, "Parent"); }).number, 2452);
}

TEST_F(AutomationTest, AnswersPropertiesByLateBinding) {
    const auto form = OpenForm("Orders", 1);
    const auto button = Control(form, "cmd Print");
    EXPECT_EQ(button->Get("controltype"), Value(104));
    EXPECT_EQ(button->Get("OnClick"), Value("[Event Procedure]"));
    EXPECT_EQ(button->Get("HelpContextId"), Value(7));
    EXPECT_EQ(button->Get("Section"), Value(1));
    EXPECT_EQ(Control(form, "chkPaid")->Get("Visible"), Value(false));
    const auto box = Control(form, "txtCustomer");
    EXPECT_EQ(box->Get("Width"), Value(1701));
    EXPECT_EQ(Text(Object(Object(box, "Properties"), "Item", {"TabIndex"}), "Value"), "1");
    EXPECT_EQ(RaisedBy([&] { box->Get("Caption"); }).number, 438);
    EXPECT_EQ(RaisedBy([&] { Object(Object(box, "Properties"), "Item", {"Caption"}); }).number, 2455);
    EXPECT_EQ(RaisedBy([&] { box->Set("NoSuch", 1); }).number, 438);
    EXPECT_EQ(Text(Object(form, "Properties", {"Caption"}), "Value"), "Orders \"new\"");
    EXPECT_EQ(form->Get("HasModule"), Value(true));
    form->Set("HelpContextId", 99);
    command->Call("Close", {2, "Orders", 1});
    EXPECT_EQ(OpenForm("Orders", 1)->Get("HelpContextId"), Value(99));
}

TEST_F(AutomationTest, OpensWindowsAndClosesThem) {
    auto& windows = *environment->windows;
    const auto main = application->Get("hWndAccessApp").AsInteger();
    EXPECT_EQ(windows.FindTopLevel("OMain", ""), main);
    const auto form = OpenForm("Orders", 0);
    const auto handle = form->Get("hWnd").AsInteger();
    EXPECT_EQ(windows.FirstChild(main), handle);
    EXPECT_EQ(windows.Find(handle)->className, "OForm");
    EXPECT_EQ(form->Get("CurrentView"), Value(1));
    EXPECT_EQ(Text(Object(Object(application, "Screen"), "ActiveForm"), "Name"), "Orders");
    EXPECT_EQ(Text(application, "CurrentObjectName"), "Orders");
    const auto width = windows.Find(handle)->rectangle.Width();
    form->Set("InsideWidth", form->Get("InsideWidth").AsInteger() + 150);
    EXPECT_EQ(windows.Find(handle)->rectangle.Width(), width + 10);
    EXPECT_EQ(Object(form, "Properties", {"WindowWidth"})->Get("Value"), Value((width + 10) * 15));
    command->Call("Close", {2, "Orders", 2});
    EXPECT_EQ(windows.Find(handle), nullptr);
    EXPECT_EQ(RaisedBy([&] { form->Get("Name"); }).number, 2467);
    EXPECT_EQ(RaisedBy([&] { Object(application, "Forms", {"Orders"}); }).number, 2450);
    EXPECT_EQ(RaisedBy([&] { Object(Object(application, "Screen"), "ActiveForm"); }).number, 2475);
    command->Call("OpenForm", {"Orders", 1, {}, {}, {}, 1});
    EXPECT_EQ(Object(application, "Forms", {0})->Get("hWnd"), Value(0));
    EXPECT_EQ(RaisedBy([&] { command->Call("OpenForm", {"None"}); }).number, 2102);
    EXPECT_EQ(RaisedBy([&] { command->Call("OpenReport", {"None", 2}); }).number, 2103);
    application = nullptr;
    EXPECT_EQ(windows.Find(main), nullptr);
    EXPECT_EQ(RaisedBy([&] { command->Call("OpenForm", {"Orders"}); }).number, 2467);
}

TEST_F(AutomationTest, ForgetsDesignsOfClosedFormsButNotWhatWasWritten) {
    const auto writeForm = [&](const std::string& name, const std::string& caption) {
        Part("forms\\" + name + ".form",
             SmallForm("Begin TextBox\r\nName =\"t\"\r\nEnd\r\n", "    Caption =\"" + caption + "\"\r\n") +
                 "CodeBehindForm\r\n" + std::string(5U << 20U, '\'') + "\r\n");
    };
    writeForm("BigA", "First");
    writeForm("BigB", "Other");
    application = Open();
    command = Object(application, "DoCmd");
    const auto form = OpenForm("BigA", 1);
    form->Set("HelpContextId", 7);
    Control(form, "t")->Set("HelpContextId", 8);
    // A changed file shows that it is read again; one that is open stays as it was.
    writeForm("BigA", "Second");
    EXPECT_EQ(Text(form, "Caption"), "First");
    command->Call("Close", {2, "BigA", 2});
    OpenForm("BigB", 1);
    command->Call("Close", {2, "BigB", 2});
    const auto again = OpenForm("BigA", 1);
    EXPECT_EQ(Text(again, "Caption"), "Second");
    EXPECT_EQ(again->Get("HelpContextId"), Value(7));
    EXPECT_EQ(Control(again, "t")->Get("HelpContextId"), Value(8));
}

TEST_F(AutomationTest, ShowsTheSectionsOfTheView) {
    const auto design = OpenForm("Orders", 1);
    EXPECT_EQ(Object(design, "Section", {2})->Get("Height"), Value(300));
    EXPECT_EQ(RaisedBy([&] { Object(design, "Section", {3}); }).number, 2462);
    const auto form = OpenForm("Orders", 0);
    EXPECT_EQ(Object(form, "Section", {0})->Get("Height"), Value(4000));
    EXPECT_EQ(Text(Object(form, "Section", {1}), "Name"), "FormHeader");
    // The hidden footer takes no room, so it isn't there.
    EXPECT_EQ(RaisedBy([&] { Object(form, "Section", {2}); }).number, 2462);
    command->Call("OpenReport", {"Invoice", 1});
    const auto report = Object(application, "Reports", {"Invoice"});
    EXPECT_EQ(report->ClassName(), "Report_Invoice");
    EXPECT_EQ(Object(report, "Section", {3})->Get("Height"), Value(500));
}

TEST_F(AutomationTest, PreviewsReportsWithTheirPage) {
    command->Call("OpenReport", {"Invoice", 2});
    auto& windows = *environment->windows;
    const auto report = Object(application, "Reports", {"Invoice"});
    EXPECT_EQ(report->Get("CurrentView"), Value(5));
    EXPECT_EQ(windows.Find(windows.FirstChild(report->Get("hWnd").AsInteger()))->className, "OPrtPrevPage");
    command->Call("Close", {3, "Invoice", 2});
    EXPECT_EQ(Object(application, "Reports")->Get("Count"), Value(0));
}

TEST_F(AutomationTest, OpensNestedFormsButNoCircles) {
    const auto form = OpenForm("Orders", 0);
    const auto frame = Control(form, "subLines");
    const auto nested = Object(frame, "Form");
    EXPECT_EQ(nested->ClassName(), "Form_Lines");
    EXPECT_EQ(nested->Identity(), Object(frame, "Form")->Identity());
    EXPECT_EQ(Text(Object(nested, "Parent"), "Name"), "Orders");
    EXPECT_EQ(nested->Get("hWnd"), form->Get("hWnd"));
    EXPECT_EQ(nested->Get("CurrentView"), Value(2));
    EXPECT_EQ(RaisedBy([&] { Object(frame, "Report"); }).number, 2467);
    EXPECT_EQ(RaisedBy([&] { Object(Control(OpenForm("Self", 1), "me"), "Form"); }).number, 2467);
    const auto pong = Object(Control(OpenForm("Ping", 1), "s"), "Form");
    EXPECT_EQ(RaisedBy([&] { Object(Control(pong, "s"), "Form"); }).number, 2467);
    command->Call("Close", {2, "Orders", 2});
    EXPECT_EQ(RaisedBy([&] { nested->Get("Name"); }).number, 2467);
}

TEST_F(AutomationTest, PlacesTheColumnsOfADatasheet) {
    const auto form = OpenForm("Lines", 0);
    EXPECT_EQ(form->Get("CurrentView"), Value(2));
    EXPECT_EQ(Control(form, "txtA")->Get("ColumnOrder"), Value(1));
    EXPECT_EQ(Control(form, "txtA")->Get("ColumnWidth"), Value(900));
    EXPECT_EQ(Control(form, "txtB")->Get("ColumnOrder"), Value(2));
    EXPECT_EQ(Control(form, "txtB")->Get("ColumnWidth"), Value(1440));
    EXPECT_EQ(RaisedBy([&] { Control(form, "lbl")->Get("ColumnWidth"); }).number, 438);
    EXPECT_EQ(Control(OpenForm("Lines", 1), "txtB")->Get("ColumnWidth"), Value(-1));
}

TEST_F(AutomationTest, TurnsPages) {
    const auto form = OpenForm("Orders", 0);
    const auto tab = Control(form, "tabMain");
    EXPECT_EQ(tab->Get("Value"), Value(0));
    tab->Set("Value", 1);
    EXPECT_EQ(tab->Get("Value"), Value(1));
    for (const int absent : {2, -1, 100000}) {
        tab->Set("Value", absent);
        EXPECT_EQ(tab->Get("Value"), Value(1));
    }
    EXPECT_EQ(Control(form, "pagSecond")->Get("PageIndex"), Value(1));
    EXPECT_EQ(tab->Get("TabFixedHeight"), Value(0));
    EXPECT_EQ(RaisedBy([&] { Control(form, "lblOpen")->Get("Value"); }).number, 438);
}

TEST_F(AutomationTest, FindsTheCodeOfAProcedure) {
    const auto project = Object(Object(application, "VBE"), "VBProjects", {1});
    const auto module = Object(Object(project, "VBComponents", {"Form_Orders"}), "CodeModule");
    const auto start = module->Call("ProcStartLine", {"CMD_Print_Click", 0}).AsInteger();
    const auto body = module->Call("ProcBodyLine", {"cmd_Print_Click", 0}).AsInteger();
    const auto count = module->Call("ProcCountLines", {"cmd_Print_Click", 0}).AsInteger();
    EXPECT_EQ(start, 2);
    EXPECT_EQ(body, 4);
    EXPECT_EQ(module->Call("Lines", {body, start + count - body}),
              Value("Private Sub cmd_Print_Click()\r\n    DoCmd.OpenReport \"Invoice\", _\r\n        "
                    "acPreview\r\nEnd Sub"));
    EXPECT_EQ(module->Call("ProcBodyLine", {"Total", 0}), Value(9));
    EXPECT_EQ(module->Get("CountOfLines"), Value(10));
    EXPECT_EQ(module->Call("Lines", {500, 3}), Value(""));
    EXPECT_EQ(RaisedBy([&] { module->Call("ProcBodyLine", {"None_Click", 0}); }).number, 35);
}

TEST_F(AutomationTest, DrivesTheMeterAndWritesTexts) {
    application->Call("SysCmd", {1, "Reading", 10});
    application->Call("SysCmd", {2, 4});
    application->Call("SysCmd", {3});
    EXPECT_EQ(meter->lines, (std::vector<std::string>{"begin Reading 10", "update Reading 4", "end"}));
    application->Call("SaveAsText", {2, "Orders", Path("copy.txt")});
    EXPECT_EQ(ReadFile(Path("copy.txt")), "\xEF\xBB\xBF" + kOrdersForm);
    EXPECT_NE(RaisedBy([&] { application->Call("SaveAsText", {2, "None", Path("no.txt")}); }).number, 0);
    EXPECT_FALSE(environment->files->FileExists(Path("no.txt")));
}

} // namespace
} // namespace tovimar::platform::access
