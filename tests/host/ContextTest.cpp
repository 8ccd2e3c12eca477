#include "foundation/Session.h"
#include "host/FakeAccess.h"
#include "host/access/CN_IDEAccContext.h"
#include "host/server/CXmlCommand.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

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
