#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "host/FakeAccess.h"
#include "host/access/CDoCmdParser.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

namespace tovimar {
namespace {

TEST(DoCmdParser, KnownLines) {
    const struct {
        const char* line;
        const char* msgCode;
        const char* typeName;
        const char* objName;
    } cases[] = {
        {"DoCmd.OpenForm \"Order Details\", acNormal, , \"ID=1\"", "DoCmd.Open", "Form", "Order Details"},
        {"  docmd.openreport\tstrName ", "DoCmd.Open", "Report", "strName"},
        {"DoCmd.Close acForm, Me.Name", "DoCmd.Close", "Form", "Me.Name"},
        {"DoCmd.Close 3, \"R\"", "DoCmd.Close", "Report", "R"},
        {"DoCmd.Close", "DoCmd.Close", "", ""},
        {"DoCmd.Save acModule", "DoCmd.Save", "Module", ""},
        {"DoCmd.Save acNothing, \"X\"", "DoCmd.Save", "", "X"},
        {"DoCmd.RunMacro \"M\"", "DoCmd.Run", "macro", "M"},
        {"DoCmd.PrintOut acPages, 1, 2", "DoCmd.PrintOut", "", ""},
        {"DoCmd.OpenStoredProcedure \"P\"", "DoCmd.Open", "StoredProcedure", "P"},
    };
    for (const auto& known : cases) {
        CDoCmdParser parser;
        EXPECT_EQ(parser.Parse(known.line), kSuccess) << known.line;
        EXPECT_EQ(parser.MsgCode(), known.msgCode) << known.line;
        EXPECT_EQ(parser.ObjTypeName(), known.typeName) << known.line;
        EXPECT_EQ(parser.ObjTypeCode(), std::string("ac") + known.typeName) << known.line;
        EXPECT_EQ(parser.ObjName(), known.objName) << known.line;
    }
}

TEST(DoCmdParser, OtherLines) {
    for (const char* line :
         {"", "DoCmd.", "DoCmd. OpenForm", "DoCmd.Beep", "x = DoCmd.OpenForm", "DoCmdOpenForm"})
        EXPECT_EQ(CDoCmdParser().Parse(line), MakeResultCode(0x8003FE07U)) << line;
}

class OnClickTest : public test::EnvironmentTest {
protected:
    OnClickTest() {
        messages.Load(WriteFile("Messages.xml",
                                "<Messages><m Code=\"DoCmd.Open acForm\" Text=\"Opens {1}.\"/>"
                                "<m Code=\"DoCmd.Close acForm Me.Name\" Text=\"Closes this form.\"/>"
                                "<m Code=\"DoCmd.Close\" Text=\"Closes [{1}].\"/>"
                                "<m Code=\"DoCmd.Run acMacro\" Text=\"Runs {1}.\"/></Messages>"));
        Session::SetMessages(&messages);
        processor.SetIdeAppInstance(access.app);
        form = access.AddForm("Orders");
        form->With("hasmodule", true);
        button = test::AddControl(form, form, "CommandButton", "cmd Go-1");
        button->With("ControlType", 104).With("onclick", "[event Procedure]");
        MakeModule();
    }
    ~OnClickTest() override { Session::SetMessages(nullptr); }

    void MakeModule() {
        const test::Fake module = test::MakeFake("CodeModule");
        const auto line = [this](const auto& a, int number) -> Value {
            if (a.at(0).AsString() != "cmd_Go_1_Click")
                throw RaisedError(35, "Sub or Function not defined", "CodeModule");
            return number;
        };
        module->On("ProcStartLine", [line](const auto& a) { return line(a, 10); });
        module->On("ProcBodyLine", [line](const auto& a) { return line(a, 12); });
        module->On("ProcCountLines", [line](const auto& a) { return line(a, 9); });
        module->On("Lines", [this](const auto& a) -> Value {
            EXPECT_EQ(a.at(0), Value(12));
            EXPECT_EQ(a.at(1), Value(7));
            return code;
        });
        const test::Fake component = test::MakeFake("VBComponent", "Form_Orders");
        component->With("CodeModule", HostObject(module));
        const test::Fake project = test::MakeFake("VBProject", "OrdersProject");
        project->With("VBComponents", HostObject(test::MakeList({component})));
        const test::Fake editor = test::MakeFake("VBE");
        editor->With("VBProjects", HostObject(test::MakeList({project})));
        access.app->With("VBE", HostObject(editor)).On("GetOption", [](const auto&) -> Value {
            return "OrdersProject";
        });
    }
    std::string Description() { return processor.GetOnClickActionDescription(access.app, form, button); }

    CXmlMessages messages;
    test::FakeAccess access;
    CN_IDEAccFormProcessor processor;
    test::Fake form, button;
    std::string code;
};

TEST_F(OnClickTest, SentencesOfAProcedure) {
    code = "Private Sub cmd_Go_1_Click()\r\n\r\n    DoCmd.OpenForm _\r\n        \"Customers\", acNormal\r\n"
           "    DoCmd.Beep\r\n    DoCmd.Close acForm, Me.Name\r\n    DoCmd.Close\r\nEnd Sub";
    EXPECT_EQ(Description(), "Opens Customers.<BR>\r\nCloses this form.<BR>\r\nCloses [].");
    button->With("StatusBarText", "Go");
    EXPECT_EQ(processor.ControlSeedTextGet(form, button),
              "Go<BR><BR>Opens Customers.<BR>\r\nCloses this form.<BR>\r\nCloses [].");
    code = "Private Sub cmd_Go_1_Click()\r\nMsgBox 1\r\nEnd Sub";
    EXPECT_EQ(Description(), "");
}

TEST_F(OnClickTest, MacrosExpressionsAndNothing) {
    button->With("onclick", " Nightly ");
    EXPECT_EQ(Description(), "Runs Nightly.");
    for (const Value& nothing : {Value(), Value(""), Value("=Go()")}) {
        button->With("onclick", nothing);
        EXPECT_EQ(Description(), "");
    }
    button->With("onclick", "Nightly");
    form->With("hasmodule", false);
    EXPECT_EQ(Description(), "");
    form->With("hasmodule", true);
    button->With("ControlType", 109);
    EXPECT_EQ(Description(), "");
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(OnClickTest, MissingProcedureIsReported) {
    button->With("Name", "other");
    EXPECT_EQ(Description(), "");
    EXPECT_EQ(Session::Run().runErrorCount, 1);
    button->With("EventProcPrefix", "cmd_Go_1");
    code = "DoCmd.OpenForm \"A\"";
    EXPECT_EQ(Description(), "Opens A.");
}

} // namespace
} // namespace tovimar
