#include "foundation/CXmlMessages.h"
#include "foundation/Session.h"
#include "host/FakeAccess.h"
#include "host/access/CDoCmdParser.h"
#include "host/access/CN_IDEAccFormProcessor.h"
#include "host/access/EmbeddedMacro.h"
#include "host/access/EventCode.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"
#include "project/CHelpPrjTree.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

namespace tovimar {
namespace {

using Strings = std::vector<std::string>;

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
        {"DoCmd.OpenQuery \"Sales, by month\", 0", "DoCmd.Open", "Query", "Sales, by month"},
        {"DoCmd.OpenForm Pick(1, \"A\"), 0", "DoCmd.Open", "Form", "Pick(1, A)"},
        {"DoCmd.OpenForm DataMode:=0, FormName:=\"Orders\"", "DoCmd.Open", "Form", "Orders"},
        {"DoCmd.Close ObjectName:=Me.Name, ObjectType:=acForm", "DoCmd.Close", "Form", "Me.Name"},
        {"DoCmd.OpenForm \"a:=b\"", "DoCmd.Open", "Form", "a:=b"},
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

TEST(EventCode, StatementsOfALine) {
    const struct {
        const char* code;
        std::vector<std::string> statements;
    } cases[] = {
        {"a: b ' c: d", {"a", "b"}},
        {"Rem a: b\r\n' a\r\nx = \"'\": Rem y", {"x = \"'\""}},
        {"f A:=1, B:=\"x:y\"", {"f A:=1, B:=\"x:y\""}},
        {"If a Then b: c Else d", {"b", "c", "d"}},
        {"If a Then\r\nb\r\nElseIf c Then d\r\nElse: e\r\nEnd If", {"b", "d", "Else", "e", "End If"}},
        {"If \" Then \" = x Then y = \" Else \"", {"y = \" Else \""}},
        {"Call f(1, 2): Call g", {"f 1, 2", "g"}},
        {"f _\r\n  1, _\r\n\r\n 2", {"f  1,  2"}},
        {"If", {"If"}},
        {"\"", {"\""}},
    };
    for (const auto& line : cases)
        EXPECT_EQ(EventStatements(line.code), line.statements) << line.code;
}

TEST(EventCode, NamesThatStandForTexts) {
    TextNames names;
    for (const char* statement :
         {"stDocName = \"Orders\"", "Private Const Detail As String = \"Lines\"", "Const C=\"x\"", "n = 1",
          "a.b = \"no\"", "t = \"a\" & \"b\"", "STDOCNAME = \"Customers\"", "= \"none\"", "u = \""})
        names.Take(statement);
    ASSERT_NE(names.Find("stdocname"), nullptr);
    EXPECT_EQ(*names.Find("stDocName"), "Customers");
    ASSERT_NE(names.Find("Detail"), nullptr);
    EXPECT_EQ(*names.Find("Detail"), "Lines");
    EXPECT_NE(names.Find("C"), nullptr);
    for (const char* other : {"n", "a.b", "t", "", "u"})
        EXPECT_EQ(names.Find(other), nullptr) << other;
}

TEST(EmbeddedMacro, BothKinds) {
    const std::string xml =
        "Begin\r\n  Comment =\"_AXL:<?xml version=\\\"1.0\\\" encoding=\\\"UTF-16\\\" "
        "?>\\015\\012<UserInterf\"\r\n"
        "    \"aceMacro xmlns=\\\"urn:x\\\"><Statements><ConditionalBlock><If><Statements>\"\r\nEnd\r\n"
        "Begin\r\n  Comment =\"_AXL:<Action Collapsed=\\\"true\\\" Name=\\\"OpenForm\\\"><Argument "
        "Name=\\\"FormName\\\">A &amp; B</Argument><Argument Name=\\\"FilterName\\\">F</Argument></Action>"
        "</Statements></If></ConditionalBlock><Action Name=\\\"CloseWindow\\\"><Argument "
        "Name=\\\"ObjectName\\\">X</Argument><Argument Name=\\\"ObjectType\\\">Report</Argument></Action>"
        "<Action Name=\\\"CloseWindow\\\"/><Action "
        "Name=\\\"Beep\\\"/></Statements></UserInterfaceMacro>\"\r\n"
        "End\r\n";
    EXPECT_EQ(CommandsOfEmbeddedMacro("Version =196611\r\n" + xml),
              (Strings{"DoCmd.OpenForm \"A & B\"", "DoCmd.Close acReport, \"X\"", "DoCmd.Close , \"\"",
                       "DoCmd.Beep"}));
    // The rows tell the same as the XML behind them.
    EXPECT_EQ(
        CommandsOfEmbeddedMacro("ColumnsShown =10\nBegin\n Action =\"OpenReport\"\n Argument =\"R, S\"\n"
                                " Argument =\"2\"\nEnd\nBegin\n Condition =\"x\"\n Action =\"Close\"\n"
                                " Argument =\"2\"\n Argument =\"F\"\n Argument =\"0\"\nEnd\n" +
                                xml),
        (Strings{"DoCmd.OpenReport \"R, S\"", "DoCmd.Close 2, \"F\""}));
    for (const char* nothing :
         {"", "x", "Begin\nComment =\"_AXL:<Action\"\nEnd", "Begin\nArgument =\"A\"\nEnd"})
        EXPECT_EQ(CommandsOfEmbeddedMacro(nothing), Strings{}) << nothing;
}

/// The sentences that the program is installed with.
class SentencesTest : public test::EnvironmentTest {
protected:
    SentencesTest() {
        messages.Load(
            environment->files->FromNative(SourceFolder() + "install/Templates/Localized/EN/Messages.xml"));
    }
    CXmlMessages messages;
};

TEST_F(SentencesTest, EveryCommandHasOne) {
    Strings codes{"DoCmd.Run acmacro", "DoCmd.PrintOut", "DoCmd.Close", "DoCmd.Save"};
    for (const char* type :
         {"Table", "Query", "Form", "Report", "Macro", "Module", "DataAccessPage", "View", "StoredProcedure"})
        for (const char* code : {"DoCmd.Open ac?", "DoCmd.Close ac?", "DoCmd.Save ac?",
                                 "DoCmd.Close ac? Me.Name", "DoCmd.Save ac? Me.Name"})
            codes.push_back(text::ReplaceAll(code, "?", type));
    for (const std::string& code : codes) {
        const std::string sentence = messages.GetMessageWithParams(code, {"<A>X</A>"});
        EXPECT_TRUE(sentence.ends_with(".") && sentence[0] >= 'A' && sentence[0] <= 'Z') << code;
        const bool namesObject = code.find(" ac") != std::string::npos && !code.ends_with("Me.Name");
        EXPECT_EQ(sentence.find("<A>X</A>") != std::string::npos, namesObject) << code << ": " << sentence;
    }
    EXPECT_EQ(messages.GetMessageWithParams("DoCmd.Open acForm", {"Orders"}), "Opens the form Orders.");
    EXPECT_EQ(messages.GetMessageWithParams("DoCmd.Close acReport Me.Name", {}), "Closes this report.");
}

class OnClickTest : public test::EnvironmentTest {
protected:
    OnClickTest() {
        messages.Load(WriteFile("Messages.xml",
                                "<Messages><m Code=\"DoCmd.Open acForm\" Text=\"Opens {1}.\"/>"
                                "<m Code=\"DoCmd.Open acReport\" Text=\"Prints {1}.\"/>"
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
        const auto line = [](const auto& a, int number) -> Value {
            if (a.at(0).AsString() != "cmd_Go_1_Click")
                throw RaisedError(35, "Sub or Function not defined", "CodeModule");
            return number;
        };
        module->On("ProcStartLine", [line](const auto& a) { return line(a, 10); });
        module->On("ProcBodyLine", [line](const auto& a) { return line(a, 12); });
        module->On("ProcCountLines", [line](const auto& a) { return line(a, 9); });
        module->With("CountOfLines", 40);
        module->On("Lines", [this](const auto& a) -> Value {
            if (a.at(0) == Value(1))
                return declarations;
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
    std::string declarations; ///< of the module
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

TEST_F(OnClickTest, NamesOfObjects) {
    declarations = "Option Explicit\r\nPrivate Const PriceList As String = \"Price List\" ' printed\r\n"
                   "other = \"no\"";
    code =
        "Private Sub cmd_Go_1_Click()\r\nDim stDocName As String: stDocName = \"R&D <1>\"\r\n"
        "If Me.Dirty Then DoCmd.OpenForm stDocName, , , \"a, b\" Else DoCmd.OpenReport PriceList\r\n"
        "' DoCmd.OpenForm \"Comment\"\r\nRem DoCmd.OpenForm \"Comment\"\r\n"
        "DoCmd.OpenForm \"PriceList\" ' a comment\r\nDoCmd.OpenForm other\r\nDoCmd.Close acForm\r\nEnd Sub";
    EXPECT_EQ(Description(), "Opens R&D <1>.<BR>\r\nPrints Price List.<BR>\r\nOpens PriceList.<BR>\r\n"
                             "Opens other.<BR>\r\nCloses this form.");
}

TEST_F(OnClickTest, EmbeddedMacrosNeedNoModule) {
    form->With("hasmodule", false);
    button->With("onclick", "[Embedded Macro]");
    EXPECT_EQ(Description(), "");
    button->With("OnClickEmMacro", "Begin\nAction =\"OpenForm\"\nArgument =\"Customers\"\nEnd\n"
                                   "Begin\nAction =\"Close\"\nArgument =\"-1\"\nArgument =\"\"\nEnd\n"
                                   "Begin\nAction =\"RunMacro\"\nArgument =\"Daily.Print\"\nEnd\n");
    EXPECT_EQ(Description(), "Opens Customers.<BR>\r\nCloses [].<BR>\r\nRuns Daily.Print.");
    EXPECT_EQ(Session::Run().runErrorCount, 0);
    button->With("OnClickEmMacro", "Begin\nAction =\"OpenForm");
    EXPECT_EQ(Description(), "");
    EXPECT_EQ(Session::Run().runErrorCount, 1);
}

TEST_F(OnClickTest, LinksToTopics) {
    CHelpPrjTree tree;
    Session::SetHelpProjectTree(&tree);
    tree.Load("", false, false,
              "<Project><FORM key='f' Name='Customers' caption='Our customers' GeneratedHTMLFile='c.htm'/>"
              "<MACRO key='m' Name='Daily' caption='Daily' GeneratedHTMLFile='d.htm'/></Project>");
    code = "DoCmd.OpenForm \"customers\"\r\nDoCmd.OpenReport \"Customers\"\r\n"
           "DoCmd.RunMacro \"Daily.Print <all>\"\r\nDoCmd.RunMacro \"Other.Print\"";
    EXPECT_EQ(Description(), "Opens <a href=\"c.htm\">Our customers</a>.<BR>\r\nPrints Customers.<BR>\r\n"
                             "Runs <a href=\"d.htm\">Daily</a>.Print <all>.<BR>\r\nRuns Other.Print.");
    button->With("onclick", "Daily");
    EXPECT_EQ(Description(), "Runs <a href=\"d.htm\">Daily</a>.");
    Session::SetHelpProjectTree(nullptr);
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
