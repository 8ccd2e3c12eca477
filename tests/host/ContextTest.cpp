#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/server/CXmlCommand.h"
#include "platform/windowing/WindowSystem.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace tovimar {
namespace {

using test::Fake;
using test::MakeFake;
using test::MakeList;

class ContextTest : public test::EnvironmentTest {
protected:
    ContextTest() { context.Connect(access.app); }

    CXmlCommand Run(const std::string& name, CommandParameters parameters = {}) {
        return CXmlCommand().Deserialize(
            context.ProcessCallBack(CXmlCommand().Build(name, parameters).Serialize()));
    }
    std::string Ask(const std::string& name, CommandParameters parameters = {}) {
        const CXmlCommand answer = Run(name, parameters);
        return answer.ParamDefined("RetValue") ? answer.GetParamValue("RetValue") : "(none)";
    }

    test::FakeAccess access;
    CN_IDEAccContext context;
};

TEST_F(ContextTest, QuestionsAboutTheProject) {
    EXPECT_EQ(Ask("CURRENTSOURCEPROJECTFULLPATH"), "C:\\Data\\Orders.accdb");
    EXPECT_EQ(Ask("CurrentSourceProjectName"), "Orders");
    EXPECT_EQ(Ask("CurrentSourceProjectLocation"), "C:\\Data\\");
    EXPECT_EQ(Ask("CurrentSourceProjectTypeName"), "MS ACCESS");
    EXPECT_EQ(Ask("CurrentSourceProjectIsMDEorADE"), "False");
    EXPECT_EQ(Ask("CurrentSourceProjectIsADPorADE"), "False");
    EXPECT_EQ(Ask("GetSourceProjectsList"), "Orders");
    EXPECT_EQ(Ask("CurrentSourceProjectIsDirty"), "False");
    EXPECT_EQ(Ask("HostAppMainWindowHWnd"), "4711");
    EXPECT_EQ(Ask("QueryNamePrefix"), "qry");
    EXPECT_EQ(Ask("SaveMakeRun", {{"SaveAppChanges", true}, {"MakeApp", false}, {"RunApp", false}}),
              "(none)");
    access.AddForm("Orders");
    EXPECT_EQ(Ask("ComponentExistsTest", {{"CompType", 2}, {"CompName", "orders"}}), "True");
    EXPECT_EQ(Ask("ComponentExistsTest", {{"CompType", 3}, {"CompName", "orders"}}), "False");
    EXPECT_EQ(Ask("ComponentExistsTest", {{"CompType", 0}, {"CompName", "gone"}}), "True");
    access.project->With("ProjectType", 1);
    EXPECT_EQ(Ask("CurrentSourceProjectIsADPorADE"), "True");
    EXPECT_EQ(Ask("GetSourceQueriesList"), "");
    access.project->With("FullName", "");
    EXPECT_EQ(Ask("AreThereAnySourceProjectsOpened"), "False");
    EXPECT_EQ(Ask("GetSourceProjectsList"), "");
}

TEST_F(ContextTest, Lists) {
    for (const char* name : {"zebra", "Apple", "MSysObjects", "apple", "Bar|Foo", "msysx"})
        access.AddPlain("AllTables", name);
    EXPECT_EQ(Ask("GetSourceTablesList"), "Apple|apple|Bar&#124;Foo|zebra");
    access.AddPlain("AllReports", "MSysReport");
    EXPECT_EQ(Ask("GetSourceReportsList"), "MSysReport");
    EXPECT_EQ(Ask("GetSourceMacrosList"), "");
}

TEST_F(ContextTest, Descriptions) {
    access.AddPlain("TableDefs", "Orders")->With("Description", "All \"orders\"");
    EXPECT_EQ(Ask("GetComponentDescription", {{"CompName", "Orders"}}), "All \"orders\"");
    EXPECT_EQ(Ask("GetComponentDescription", {{"CompName", "Gone"}}), "");
    EXPECT_EQ(Ask("GetMacroDescription", {{"CompName", "Gone"}}), "");
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(ContextTest, QueryXml) {
    const Fake query = access.AddPlain("QueryDefs", "Totals");
    const auto field = [](const char* name, const char* sourceField, const char* sourceTable) {
        Fake made = MakeFake("Field", name);
        made->With("SourceField", sourceField).With("SourceTable", sourceTable);
        return made;
    };
    query->With("Fields", HostObject(MakeList({field("Town", "City", "Orders"), field("Sum", "", ""),
                                               field("Who", "Name", "R&D"), field("No", "ID", "Orders")})));
    query->With("Description", "Per town");
    EXPECT_EQ(
        Ask("GetQueryXmlStr", {{"QueryName", "Totals"}}),
        "<?xml version=\"1.0\" encoding=\"utf-8\"?>\r\n"
        "<Query Name=\"Totals\" Type=\"Query\" Description=\"Per town\">\r\n"
        "<InheritedFields Title=\"{{FieldsFromTables}}\">\r\n"
        "<Table Name=\"Orders\">\r\n<Field Name=\"Town|City\"/>\r\n<Field Name=\"No|ID\"/>\r\n</Table>\r\n"
        "<Table Name=\"R&amp;D\">\r\n<Field Name=\"Who|Name\"/>\r\n</Table>\r\n"
        "</InheritedFields>\r\n"
        "<CalculatedFields Title=\"{{CalculatedFields}}\">\r\n<Field Name=\"Sum\"/>\r\n"
        "</CalculatedFields>\r\n</Query>\r\n");
}

TEST_F(ContextTest, RelationsList) {
    EXPECT_EQ(Ask("ScreenshotDatamodelWindow"), "");
    EXPECT_TRUE(access.calls.empty());
    const auto relation = [](int attributes, std::vector<const char*> fields) {
        std::vector<Fake> list;
        for (const char* name : fields) {
            list.push_back(MakeFake("Field"));
            list.back()->With("ForeignName", name);
        }
        Fake made = MakeFake("Relation");
        made->With("Table", "Customers").With("ForeignTable", "R&D").With("Attributes", attributes);
        made->With("Fields", HostObject(MakeList(list)));
        return made;
    };
    access.lists["Relations"]->items = {relation(0, {"ID", "Part"}), relation(1, {"ID"})};
    EXPECT_EQ(Ask("ScreenshotDatamodelWindow"), "<H2>Customers -> R&amp;D (1:N, ID, Part)</H2>\r\n"
                                                "<H2>Customers -> R&amp;D (1:1, ID)</H2>");
    EXPECT_EQ(access.calls, std::vector<std::string>{"RunCommand 133"});
}

/// A window that is all black.
class BlankWindow : public platform::Window {
public:
    platform::Bitmap Paint(double) override { return platform::BlackBitmap(20, 10); }
};

TEST_F(ContextTest, PictureOfTheRelations) {
    access.lists["Relations"]->items = {MakeFake("Relation")};
    access.lists["Relations"]->items[0]->With("Table", "A").With("ForeignTable", "B").With("Attributes", 0);
    access.lists["Relations"]->items[0]->With("Fields", HostObject(MakeList()));
    const std::string list = "<H2>A -> B (1:N, )</H2>";
    const auto answering = [this](std::function<void()> open) {
        std::dynamic_pointer_cast<test::FakeObject>(access.app->Get("DoCmd").AsObject())
            ->On("RunCommand", [open = std::move(open)](const auto&) {
                open();
                return Value();
            });
        boxes->shown.clear();
        return Ask("ScreenshotDatamodelWindow");
    };
    EXPECT_EQ(answering([] { throw RaisedError(2046, "not now", "DoCmd"); }), list);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text, "The command or action 'Relationships' isn't available now (Err# 2046).");
    EXPECT_EQ(Session::Run().runErrorCount, 0);
    EXPECT_EQ(answering([] { throw RaisedError(2501, "cancelled", "DoCmd"); }), list);
    EXPECT_EQ(Session::Run().runErrorCount, 1);

    // The window is found below the host's, and goes even when its picture can't be written.
    CTovimarParameters parameters;
    Session::SetParameters(&parameters);
    auto& windows = *environment->windows;
    const std::int32_t main = windows.Open(std::make_unique<BlankWindow>());
    access.app->With("hWndAccessApp", main);
    EXPECT_EQ(answering([&] {
                  auto window = std::make_unique<BlankWindow>();
                  window->className = "OSysRel";
                  window->parent = main;
                  window->rectangle = {0, 0, 20, 10};
                  windows.Open(std::move(window));
              }),
              list);
    EXPECT_EQ(windows.FirstChild(main), 0);
    Session::SetParameters(nullptr);
}

TEST_F(ContextTest, SmallCommands) {
    int events = 0;
    environment->doEvents = [&events] { ++events; };
    for (const char* command : {"Doevents", "HideIDEWindows", "ResetIDEWindows", "ParseSourceProject"})
        EXPECT_EQ(Ask(command), "(none)") << command;
    EXPECT_EQ(events, 1);
    for (const char* command : {"CurrentSourceProjectIsNewUnsaved", "CurrentSourceProjectCodeIsDisabled"})
        EXPECT_EQ(Ask(command), "False") << command;
    EXPECT_EQ(Ask("IDEDisplayModelIsMDI"), "True");
    EXPECT_EQ(Ask("SetUseProjectGroupAsSourceFlag", {{"UseProjectGroupAsSourceFlag", true}}), "(none)");
    EXPECT_EQ(Ask("SetCurrentSourceProject", {{"ProjectName", "Orders"}}), "(none)");

    EXPECT_EQ(Ask("UnhideDbWindow"), "(none)");
    EXPECT_TRUE(access.calls.empty());
    access.app->With("Version", "9.0");
    Run("UnhideDbWindow");
    EXPECT_EQ(access.calls, std::vector<std::string>{"SelectObject 0  True"});

    EXPECT_EQ(Ask("ActiveObjectName"), "");
    const Fake screen = MakeFake("Screen");
    screen->With("ActiveReport", HostObject(MakeFake("Report_R", "R")));
    access.app->With("Screen", HostObject(screen))
        .With("CurrentObjectName", "T")
        .With("CurrentObjectType", 0);
    EXPECT_EQ(Ask("ActiveObjectName"), "R");
    screen->With("ActiveForm", HostObject(MakeFake("Form_F", "F")));
    EXPECT_EQ(Ask("ActiveObjectName") + Ask("CurrentObjectName") + Ask("CurrentObjectType"), "FT0");

    std::string saved;
    access.saveAsText = [&saved](const std::string& name, const std::string& path) { saved = name + path; };
    EXPECT_EQ(Ask("SaveAsText", {{"ObjType", 2}, {"ObjName", "F"}, {"FullPath", "C:\\f.txt"}}), "(none)");
    EXPECT_EQ(saved, "FC:\\f.txt");
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(ContextTest, DescriptionsOnAServer) {
    access.project->With("ProjectType", 1);
    const Fake connected = MakeFake("Connection");
    connected->With("ConnectionString", "Provider=X");
    access.project->With("Connection", HostObject(connected));
    std::vector<std::string> asked;
    const auto rows = [](std::vector<std::pair<std::string, std::string>> pairs) {
        const Fake set = MakeFake("Recordset");
        const auto at = std::make_shared<std::size_t>(0);
        set->On("EOF", [=](const auto&) { return Value(*at >= pairs.size()); });
        set->On("MoveNext", [=](const auto&) {
            ++*at;
            return Value();
        });
        set->On("Fields", [=](const auto& a) {
            const Fake field = MakeFake("Field");
            const auto& [name, value] = pairs.at(*at);
            field->With("Value", a.at(0).AsString() == "name" ? name : value);
            return Value(HostObject(field));
        });
        return set;
    };
    access.app->On("CreateObject", [&](const auto& kind) {
        const Fake object = MakeFake(kind.at(0).AsString());
        for (const char* member : {"Open", "Close"})
            object->On(member, [&asked, member](const auto& a) {
                asked.push_back(a.empty() ? member : std::string(member) + " " + a[0].AsString());
                return Value();
            });
        object->On("Execute", [&](const auto& a) {
            asked.push_back(a.at(0).AsString());
            return Value(HostObject(rows({{"Caption", "no"}, {"ms_description", "All orders"}})));
        });
        const Fake table = MakeFake("Table", "O'Neil");
        table->With("Columns", HostObject(MakeList({MakeFake("Column", "ID"), MakeFake("Column", "City")})));
        object->With("Tables", HostObject(MakeList({table})));
        return Value(HostObject(object));
    });
    EXPECT_EQ(Ask("GetComponentDescription", {{"CompName", "O'Neil"}}), "All orders");
    EXPECT_EQ(asked, (std::vector<std::string>{
                         "Open Provider=X",
                         "SELECT * FROM ::fn_listextendedproperty (null, 'user', 'dbo', 'table', 'O''Neil', "
                         "default, default)",
                         "Close"}));
    EXPECT_EQ(Ask("GetQueryDescription", {{"CompName", "Q"}}), "");
    EXPECT_EQ(Ask("GetMacroDescription", {{"CompName", "M"}}), "");

    asked.clear();
    CN_IDEAccFormProcessor processor;
    processor.SetIdeAppInstance(access.app);
    const CControlsCollection fields = processor.FieldsCollectionGet("O'Neil", "Table");
    ASSERT_EQ(fields.Count(), 2);
    EXPECT_EQ(processor.PropertyValue(fields.Items().At(2), "Name"), Value("City"));
    EXPECT_EQ(processor.PropertyValue(fields.Items().At(2), "TabIndex"), Value(1));
    EXPECT_EQ(processor.PropertyValue(fields.Items().At(2), "Description"), Value("All orders"));
    EXPECT_EQ(std::count(asked.begin(), asked.end(),
                         "SELECT * FROM ::fn_listextendedproperty (null, 'user', 'dbo', 'table', 'O''Neil', "
                         "'column', 'City')"),
              1);
    EXPECT_EQ(std::count(asked.begin(), asked.end(), "Close"), 3) << "no connection stays open";
    EXPECT_EQ(processor.FieldsCollectionGet("Q", "Query").Count(), 0);
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(ContextTest, MeterAndPointer) {
    Run("ProgressMeterUpdate", {{"CurrentValue", 1}});
    Run("ProgressMeterInit", {{"Message", "Forms"}, {"MaxVal", 9}});
    Run("ProgressMeterUpdate", {{"CurrentValue", 4}});
    Run("ProgressMeterToggle", {{"OnFlag", false}});
    Run("ProgressMeterUpdate", {{"CurrentValue", 6}});
    Run("ProgressMeterToggle", {{"OnFlag", false}});
    Run("ProgressMeterRemove");
    Run("ProgressMeterToggle", {{"OnFlag", true}});
    EXPECT_EQ(access.calls, (std::vector<std::string>{"SysCmd 1 Forms 9", "SysCmd 2 4", "SysCmd 3",
                                                      "SysCmd 1 Forms 9", "SysCmd 2 4", "SysCmd 3"}));
    access.calls.clear();
    for (const char* command :
         {"HourglassOn", "HourglassOn", "HourglassOff", "HourglassOff", "HourglassOn", "HourglassOffFinal"})
        Run(command);
    EXPECT_EQ(access.calls, (std::vector<std::string>{"Hourglass True", "Hourglass False", "Hourglass True",
                                                      "Hourglass False"}));
}

TEST_F(ContextTest, ObjectsOpenCloseAndTakeTheirHelp) {
    const Fake form = access.AddForm("Orders");
    EXPECT_EQ(Ask("ActivateComponent", {{"ObjType", 2},
                                        {"ObjName", "Orders"},
                                        {"ForceOpenInDesignView", false},
                                        {"ForceOpenAsHidden", false}}),
              "77");
    Run("SetComponentHelpContextId", {{"ObjType", 2}, {"ObjName", "Orders"}, {"HelpContextId", 120}});
    EXPECT_EQ(form->Get("HelpContextId"), Value(120));
    EXPECT_EQ(form->Get("HelpFile"), Value(".chm")) << "the project has no name";
    Run("CloseComponent", {{"ObjType", 2}, {"ObjName", "Orders"}, {"SaveComponentFlag", true}});
    Run("CloseComponent", {{"ObjType", 2}, {"ObjName", "Orders"}, {"SaveComponentFlag", true}});
    EXPECT_EQ(access.calls, (std::vector<std::string>{"OpenForm Orders 1", "Close 2 Orders 1"}));
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(ContextTest, ControlByItsPath) {
    const Fake form = access.AddForm("Orders");
    std::vector<std::string> focus;
    const auto focusable = [&focus](const Fake& control) {
        control->On("SetFocus", [&focus, name = control->Get("Name").AsString()](const auto&) {
            focus.push_back(name);
            return Value();
        });
        return control;
    };
    const Fake tab = focusable(test::AddControl(form, form, "TabControl", "tab"));
    const Fake page = test::AddControl(form, tab, "Page", "pg");
    tab->With("Pages", HostObject(MakeList({page, page, page}))).With("Value", 0);
    const Fake frame = focusable(test::AddControl(form, page, "SubForm", "sub"));
    const Fake inner = access.AddForm("Items");
    focusable(test::AddControl(inner, inner, "TextBox", "txt"));
    frame->With("Form", HostObject(inner));
    const auto activate = [this] {
        return Ask("ActivateControl",
                   {{"ControlFullPath", "Form.Orders.TabControl.tab.Page.pg.[2].Subform.sub.TextBox.txt"},
                    {"RuntimeFlag", true},
                    {"SetFocusFlag", true}});
    };
    EXPECT_EQ(activate(), "True");
    EXPECT_EQ(tab->Get("Value"), Value(2));
    EXPECT_EQ(focus, (std::vector<std::string>{"tab", "sub", "txt"}));
    // A hidden page changes nothing, the rest of the path counts all the same.
    tab->With("Value", 0);
    page->With("Visible", false);
    form->With("currentview", 1);
    EXPECT_EQ(activate(), "True");
    EXPECT_EQ(tab->Get("Value"), Value(0));
    EXPECT_EQ(focus.size(), 6U);

    // In design view every page can be shown, and the host is told to draw it.
    form->With("currentview", 0);
    access.calls.clear();
    EXPECT_EQ(activate(), "True");
    EXPECT_EQ(tab->Get("Value"), Value(2));
    EXPECT_EQ(access.calls, std::vector<std::string>{"RunCommand 40"});
    const auto path = [this](const char* controls, bool runtime) {
        return Ask("ActivateControl", {{"ControlFullPath", std::string("Form.Orders.") + controls},
                                       {"RuntimeFlag", runtime},
                                       {"SetFocusFlag", true}});
    };
    focus.clear();
    EXPECT_EQ(path("Frame.sub", true), "True");
    EXPECT_EQ(path("Subform.sub.TextBox.txt", false), "True");
    EXPECT_TRUE(focus.empty()) << "a frame takes no focus, and a design none at all";
    EXPECT_EQ(path("TextBox.gone", true), "False");
    EXPECT_EQ(Session::Run().runErrorCount, 1);
}

TEST_F(ContextTest, FailuresStayInside) {
    EXPECT_EQ(Ask("NoSuchCommand"), "(none)");
    EXPECT_EQ(Session::Run().runErrorCount, 1);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_NE(boxes->shown[0].text.find("Undefined callback command [NoSuchCommand]"), std::string::npos);
    Session::Run().generationInterrupted = true;
    EXPECT_NE(
        context.ProcessCallBack("<cmd name=\"CurrentObjectName\"><params /></cmd>").find("RetValue=\"0\""),
        std::string::npos);
    Session::Run().generationInterrupted = false;
    context.Disconnect();
    context.Disconnect();
    EXPECT_EQ(Ask("CurrentSourceProjectName"), "0");
}

TEST_F(ContextTest, DescribingWhatIsNotThere) {
    const auto describe = [this](int type) {
        boxes->shown.clear();
        const CXmlCommand answer = Run("ProcessComponent", {{"ObjectType", type},
                                                            {"ComponentName", "Gone"},
                                                            {"HostAppIDEHwnd", 0},
                                                            {"CaptureRptPreviewAreaOnly", false},
                                                            {"SourceProjectTypeName", "MS ACCESS"},
                                                            {"KeepSourceObjectOpened", true}});
        EXPECT_EQ(answer.Text, "");
        return boxes->shown.empty() ? std::string() : boxes->shown[0].text;
    };
    EXPECT_NE(describe(7).find("Undefined object type code - 7"), std::string::npos);
    access.project->With("ProjectType", 1);
    EXPECT_NE(describe(1).find("Error processing source project component [Gone]"), std::string::npos);
}

} // namespace
} // namespace tovimar
