#include "foundation/NameEncoding.h"
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/access/CHelpPrjTreeCF.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/CHelpPrjSourceProject.h"
#include "host/sources/DesignTextCopy.h"
#include "platform/Environment.h"
#include "project/CHelpPrjTree.h"
#include "support/FakeEnvironment.h"
#include "support/Golden.h"

#include <gtest/gtest.h>

#include <map>
#include <set>

namespace tovimar {
namespace {

TEST(DesignTextCopy, CaptionAndSubforms) {
    const DesignTextCopy copy = ParseDesignTextCopy("Version =20\r\nBegin Form\r\n"
                                                    "    CaptionFont =\"no\"\r\n"
                                                    "    Caption =\" All \\\"orders\\\"\\015\\012of \"\r\n"
                                                    "        \"the year \"\r\n"
                                                    "    SourceObject =\"Form.NotHere\"\r\n"
                                                    "    PrtMip = Begin\r\n        0x00\r\n    End\r\n"
                                                    "    Begin\r\n        Caption =\"Label\"\r\n"
                                                    "        Begin Subform\r\n"
                                                    "            SourceObject =\"Form.Items\"\r\n"
                                                    "            SourceObject =\"Report.Other\"\r\n"
                                                    "            SourceObject =\"Table.T\"\r\n"
                                                    "            SourceObject =\"Form.\"\r\n"
                                                    "        End\r\n    End\r\nEnd\r\nCodeBehindForm\r\n"
                                                    "SourceObject =\"Form.InCode\"\r\n",
                                                    "Form");
    EXPECT_EQ(copy.caption, "All \"orders\"\r\nof the year");
    EXPECT_EQ(copy.subforms, std::vector<std::string>{"Items"});
    EXPECT_EQ(ParseDesignTextCopy("Begin Report\nCaption =\"R\"\n", "Form").caption, "");
    for (const char* text :
         {"", "Begin Form", "Begin Form\nCaption =\"", "Begin Form\nCaption =", "Begin Form\nCaption =\"a\\"})
        ParseDesignTextCopy(text, "Form");
}

class SourceProjectTest : public test::EnvironmentTest {
protected:
    SourceProjectTest() {
        client.Connect(access.app);
        access.saveAsText = [this](const std::string& name, const std::string& path) {
            copies.push_back(path);
            if (designs.count(name) != 0)
                environment->files->WriteFile(path, designs[name]);
            else
                throw RaisedError(kFailure1, "C:\\Data\\" + name + ".form, line 3: no End", "Application");
        };
    }
    static std::string Design(const char* type, const char* caption, std::vector<const char*> shown = {}) {
        std::string text = std::string("Begin ") + type + "\r\n Caption =\"" + caption + "\"\r\n Begin\r\n";
        for (const char* name : shown)
            text += std::string("  SourceObject =\"") + type + "." + name + "\"\r\n";
        return text + " End\r\nEnd\r\n";
    }
    static std::string Listed(const SourceItems& items) {
        std::string text;
        for (const auto& item : items)
            text += item->FormName + "=" + item->FormCaption + (item->Skipped ? " skipped; " : "; ");
        return text;
    }

    test::FakeAccess access;
    CTovimarClient client;
    std::map<std::string, std::string> designs;
    std::vector<std::string> copies;
};

TEST_F(SourceProjectTest, ReadsTheOpenDatabase) {
    designs = {{"Orders", Design("Form", "All orders", {"Items", "Orders"})},
               {"Items", Design("Form", "  ")},
               {"Self", Design("Form", "Self", {"Self"})},
               {"RoundA", Design("Form", "A", {"RoundB"})},
               {"RoundB", Design("Form", "B", {"RoundA"})},
               {"Sales", Design("Report", "Sales", {"Detail"})},
               {"Detail", Design("Report", "Detail")}};
    for (const char* name : {"Orders", "Items", "Self", "RoundA", "RoundB", "Broken"})
        access.AddForm(name);
    for (const char* name : {"Sales", "Detail"})
        access.AddReport(name);
    access.AddPlain("AllTables", "sysOwn");
    access.AddPlain("AllTables", "12\" pipes");
    access.AddPlain("AllMacros", "R&D");

    const auto project = Session::ServerAgent()->ParseSourceProject();
    ASSERT_NE(project, nullptr);
    EXPECT_EQ(project->Name(), "Orders");
    EXPECT_EQ(Listed(project->Forms()), "Broken=Broken; Items=Items skipped; Orders=All orders; RoundA=A; "
                                        "RoundB=B; Self=Self; ");
    EXPECT_EQ(Listed(project->Reports()), "Detail=Detail skipped; Sales=Sales; ");
    EXPECT_EQ(Listed(project->Tables()), "sysOwn=sysOwn; ");
    EXPECT_EQ(Listed(project->Macros()), "R&D=R&D; ");
    EXPECT_EQ(Listed(project->Charts()), "");
    EXPECT_EQ(project->Forms().At(1)->ObjType(), 2);
    ASSERT_FALSE(boxes->shown.empty());
    EXPECT_EQ(boxes->shown[0].text,
              "Source table skipped 12\" pipes.\r\nPlease remove double quotes from its name.");

    // Nothing is left of the text copies, and the failing one is told of when the form is opened.
    EXPECT_EQ(Session::Run().runErrorCount, 0);
    EXPECT_EQ(copies.size(), 8U);
    EXPECT_EQ(std::set<std::string>(copies.begin(), copies.end()).size(), copies.size());
    for (const std::string& path : copies)
        EXPECT_FALSE(environment->files->FileExists(path)) << path;
    EXPECT_EQ(access.calls.back(), "Hourglass False");
}

TEST_F(SourceProjectTest, OnlyWhatIsAskedFor) {
    access.AddForm("Orders");
    Session::Parameters()->GenerateHelpForForms = false;
    EXPECT_TRUE(Session::ServerAgent()->ParseSourceProject()->Forms().Empty());
    EXPECT_TRUE(copies.empty());
    CHelpPrjSourceProject other;
    EXPECT_EQ(other.Init("Pascal", "C:\\x.dpr"), kFailure1);
    EXPECT_FALSE(other.IsValid());
    EXPECT_TRUE(other.Forms().Empty());
    other.Terminate();
}

TEST_F(SourceProjectTest, SystemTablesOfAServerClientStayOut) {
    access.project->With("ProjectType", 1);
    for (const char* name : {"sys", "SysObjects", "dtProperties", "Own"})
        access.AddPlain("AllTables", name);
    EXPECT_EQ(Listed(Session::ServerAgent()->ParseSourceProject()->Tables()), "Own=Own; sys=sys; ");
}

TEST_F(SourceProjectTest, FragmentsOfTheTree) {
    Session::Parameters()->SetHelpProjectName("Sales");
    Session::Parameters()->IdentifyControls = 1;
    designs = {{"Orders", Design("Form", "Orders & \\\"more\\\"", {"A-B"})},
               {"A-B", Design("Form", "Ä Ω é")},
               {"a b", Design("Form", "{x}")}};
    for (const char* name : {"Orders", "A-B", "a b"})
        access.AddForm(name);
    access.AddPlain("AllTables", "R&amp;D");
    access.AddPlain("TableDefs", "R&amp;D")->With("Description", "Research <1>");
    access.AddPlain("AllMacros", "Run Me");
    const auto project = Session::ServerAgent()->ParseSourceProject();
    CHelpPrjTree tree;
    std::string text;
    for (const char* name : {"GetAccFormsXml", "GetAccTablesXml", "GetAccQueriesXml", "GetAccMacrosXml"}) {
        std::unique_ptr<IXmlSerializer> list;
        CHelpPrjTreeCF().CreateObject(name, list);
        ASSERT_NE(list, nullptr) << name;
        list->XmlCollection(tree, *project);
        text += list->XmlText();
        list->Reset();
        EXPECT_EQ(list->XmlText(), "");
    }
    test::ExpectGolden("host/fragments.txt", text);
    std::unique_ptr<IXmlSerializer> none;
    CHelpPrjTreeCF().CreateObject("getaccformsxml", none);
    EXPECT_EQ(none, nullptr);
}

TEST_F(SourceProjectTest, FileNamesStayApart) {
    SetInstallation(Folder());
    WriteFile("Settings\\ObjectNameEncoding.xml",
              "<EncodingTable><c u=\"0020\" t=\"_\"/><c u=\"002D\" t=\"_\"/><c u=\"002B\" t=\"_\"/>"
              "<c u=\"002E\" t=\"_\"/></EncodingTable>");
    ForgetNameEncodingTable();
    Session::Parameters()->SetHelpProjectName("P");
    for (const char* name : {"A B", "A-B", "A+B", "A.B"})
        access.AddPlain("AllMacros", name);
    const auto project = Session::ServerAgent()->ParseSourceProject();
    std::unique_ptr<IXmlSerializer> list;
    CHelpPrjTreeCF().CreateMacrosListObject(list);
    CHelpPrjTree tree;
    std::vector<std::string> files;
    for (const std::string& fragment : list->XmlCollection(tree, *project)) {
        const auto start = fragment.find("GeneratedHTMLFile = \"") + 21;
        files.push_back(fragment.substr(start, fragment.find('"', start) - start));
    }
    EXPECT_EQ(files, (std::vector<std::string>{"P_Macro_A_B.htm", "Orders_P_Macro_A_B.htm",
                                               "P_Macro_A_B_030405.htm", "P_Macro_A_B_030405_2.htm"}));
    ForgetNameEncodingTable();
}

} // namespace
} // namespace tovimar
