// Projects of development tools: small real ones of each kind in tests/host/projects.
#include "foundation/Session.h"
#include "generation/CTovimarParameters.h"
#include "host/FakeAccess.h"
#include "host/contract/IHelpPrjSourceProject.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CXmlCommand.h"
#include "host/sources/CHelpPrjSourceItem.h"
#include "host/sources/CHelpPrjSourceProject.h"
#include "support/FakeEnvironment.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <map>

namespace tovimar {
namespace {

class ProjectFilesTest : public test::EnvironmentTest {
protected:
    ProjectFilesTest() {
        std::filesystem::copy(SourceFolder() + "tests/host/projects", NativeFolder(),
                              std::filesystem::copy_options::recursive);
    }
    /// One line per form: "name|caption|subtype|object type"; "invalid" for a project that isn't read.
    std::string Forms(const std::string& kind, const std::string& file) {
        if (project.Init(kind, Path(file)) != kSuccess)
            return "invalid";
        EXPECT_TRUE(project.IsValid());
        std::string lines;
        for (const auto& item : project.Forms())
            lines += item->FormName + "|" + item->FormCaption + "|" + item->SubType + "|" +
                     std::to_string(item->ObjType()) + "\n";
        return lines;
    }

    CHelpPrjSourceProject project;
    std::map<std::string, std::string> answers; ///< of a host, by command
    std::string messages;                       ///< of its progress meter
};

TEST_F(ProjectFilesTest, VisualBasic6) {
    EXPECT_EQ(Forms("vb6", "vb6\\Shop.vbp"), "frmOrders|Aufträge für \"heute\"||0\n"
                                             "frmMain|Shop||0\n"
                                             "frmPlain|||0\n"
                                             "DatePicker||UserControl|0\n"
                                             "Tour||UserDocument|0\n");
    EXPECT_EQ(project.ProjectType(), "VB6");
    EXPECT_EQ(project.Name(), "Shop");
    EXPECT_FALSE(project.CouldHaveTables() || project.CouldHaveReports());
    const CHelpPrjSourceItem& orders = **project.Forms().Find("FRMORDERS");
    EXPECT_EQ(orders.FileName, Path("vb6\\Forms\\frmOrders.frm"));
    EXPECT_EQ(orders.ProjectName, "Shop");
    EXPECT_FALSE(orders.IsVSProjectItem);

    // A path with a drive is taken whole, wherever the project lies.
    WriteFile("far\\Far.vbp",
              "Form=" + Path("vb6\\frmMain.frm") + "\nForm=\nForm=Quoted.frm\nForm=Other.frm\n");
    WriteFile("far\\Quoted.frm", "Begin VB.Form frm\"1\"\n Caption = \"x\"\nEnd\n");
    WriteFile("far\\Other.frm", "Begin VB.Formula frmNot\n");
    EXPECT_EQ(Forms("VB6", "far\\Far.vbp"), "frmMain|Shop||0\n");
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text,
              "Source Form skipped frm\"1\".\r\nPlease remove double quotes from its name.");
    EXPECT_EQ(boxes->shown[0].title, "Tovimar Add-In");
}

TEST_F(ProjectFilesTest, ClassicXmlProjects) {
    EXPECT_EQ(Forms("C#", "csharp\\Shop.csproj"), "frmOrders|Orders & more – “today”|Form|2\n"
                                                  "PricePanel|PricePanel|UserControl|0\n"
                                                  "AboutBox|Über den Laden|Form|2\n");
    const CHelpPrjSourceItem& linked = **project.Forms().Find("AboutBox");
    EXPECT_EQ(linked.Link, "Linked\\AboutBox.cs");
    EXPECT_EQ(linked.RelativePath, "AboutForm.cs");
    EXPECT_EQ(linked.BuildAction, "Compile");
    EXPECT_EQ(linked.FileName, Path("csharp\\Linked\\AboutBox.cs"));
    EXPECT_TRUE(linked.IsVSProjectItem);
    EXPECT_EQ(linked.FormNameNormalized(), "AboutBox");

    EXPECT_EQ(Forms("VB.NET", "vbnet\\Shop.vbproj"), "frmCustomers|Customers|Form|2\n"
                                                     "Filter|Filter|UserControl|0\n");
    EXPECT_EQ(Forms("J#", "jsharp\\Shop.vjsproj"), "frmInvoice|Invoice|Form|2\n");
    // A header file's class need not bear the name that the code gives its window.
    EXPECT_EQ(Forms("C++", "cpp\\Shop.vcproj"), "Form1|Shop window|Form|2\nDial|Dial|UserControl|0\n");
    EXPECT_EQ(project.ProjectType(), "C++");
    for (const char* other : {"VB.NET", "J#", "C++", "VB6 ", "Pascal"})
        EXPECT_EQ(Forms(other, "csharp\\Shop.csproj"), "invalid") << other;
    EXPECT_EQ(Session::Run().runErrorCount, 0);
}

TEST_F(ProjectFilesTest, BuildProjects) {
    EXPECT_EQ(Forms("C#", "csharp-build\\Store.csproj"), "MainForm|The store|Form|2\n"
                                                         "Splash|Splash|Form|2\n"
                                                         "Grid|Grid of goods|UserControl|0\n"
                                                         "Lone|Alone|Form|2\n");
    EXPECT_EQ((*project.Forms().Find("Grid"))->RelativePath, "Views\\Grid.Designer.cs");
    EXPECT_EQ(Forms("VB.NET", "vbnet-build\\Store.vbproj"), "Main|Main window|Form|2\n");
    WriteFile("p\\Prefixed.csproj",
              "<m:Project xmlns:m=\"http://schemas.microsoft.com/developer/msbuild/2003\">"
              "<m:ItemGroup><m:Compile Include=\"..\\csharp-build\\Form1.Designer.cs\">"
              "<m:DependentUpon>Form1.cs</m:DependentUpon></m:Compile></m:ItemGroup>"
              "</m:Project>");
    EXPECT_EQ(Forms("C#", "p\\Prefixed.csproj"), "MainForm|The store|Form|2\n");
    EXPECT_EQ(Forms("C++", "p\\Prefixed.csproj"), "invalid");
}

TEST_F(ProjectFilesTest, WebProjects) {
    EXPECT_EQ(Forms("asp.net", "aspnet\\Web.csproj"), "Default|Default|Form|2\n"
                                                      "Contact|Contact|Form|2\n"
                                                      "Header|Header|UserControl|0\n");
    EXPECT_EQ(project.ProjectType(), "ASP.NET");
    EXPECT_EQ(project.Name(), "Web");
    EXPECT_EQ(Forms("ASP.NET", "aspnet\\WebBuild.csproj"), "Default|Default|Form|2\n");
    EXPECT_TRUE(environment->files->ListFiles(Path("aspnet"), "*.tmp").empty());
}

TEST_F(ProjectFilesTest, DesignerTwins) {
    EXPECT_EQ(DesignerTwinOf("C:\\P.Designer\\Form1.cs"), "C:\\P.Designer\\Form1.Designer.cs");
    EXPECT_EQ(DesignerTwinOf("C:\\P\\Form1.designer.vb"), "C:\\P\\Form1.vb");
    CHelpPrjSourceItem item;
    item.Parse(Path("csharp-build\\Form1.cs"), "C#");
    EXPECT_EQ(item.FormName + "|" + item.FormCaption, "MainForm|The store");
    item.Parse(Path("csharp-build\\Form1.cs"), "C#", /*vfParseDesignerFile=*/false);
    EXPECT_EQ(item.FormName + "|" + item.FormCaption, "Form1|Form1");
    item.Parse(Path("csharp-build\\Form1.Designer.cs"), "J#");
    EXPECT_EQ(item.FormName + "|" + item.FormCaption, "Form1|Form1");
    // A marker counts behind white space or a semicolon alone; one that doesn't is no end of the search.
    WriteFile("a.cs", "x.this.Name = \"no\";this.Name = \"yes\"\nthis.Text = \"open");
    item.Parse(Path("a.cs"), "c#");
    EXPECT_EQ(item.FormName + "|" + item.FormCaption, "yes|a");
    item.Terminate();
    EXPECT_EQ(item.FormName, "");
}

TEST_F(ProjectFilesTest, WhatCannotBeRead) {
    WriteFile("bad.csproj", "<VisualStudioProject>\n<CSHARP>");
    for (const char* kind : {"C#", "ASP.NET"}) {
        boxes->shown.clear();
        EXPECT_EQ(Forms(kind, "bad.csproj"), "invalid") << kind;
        ASSERT_EQ(boxes->shown.size(), 1U) << kind;
        EXPECT_NE(boxes->shown[0].text.find("bad.csproj"), std::string::npos) << boxes->shown[0].text;
        EXPECT_NE(boxes->shown[0].text.find("IHelpPrjSourceProject_Init"), std::string::npos);
        EXPECT_EQ(Forms(kind, "gone.csproj"), "invalid") << kind;
    }
    EXPECT_TRUE(environment->files->ListFiles(Folder(), "*.tmp").empty());
    EXPECT_EQ(Forms("VB6", "gone.vbp"), "invalid");

    // One file that is no source file doesn't stop the others.
    std::filesystem::resize_file(NativeFolder() + "/csharp/OrdersForm.cs", std::uintmax_t{17} << 20U);
    std::filesystem::resize_file(NativeFolder() + "/vb6/frmMain.frm", std::uintmax_t{17} << 20U);
    boxes->shown.clear();
    EXPECT_EQ(Forms("C#", "csharp\\Shop.csproj").substr(0, 29), "OrdersForm|OrdersForm|Form|2\n");
    EXPECT_EQ(Forms("VB6", "vb6\\Shop.vbp").find("frmMain"), std::string::npos);
    ASSERT_EQ(boxes->shown.size(), 2U);
    EXPECT_NE(boxes->shown[0].text.find("OrdersForm.cs: the file is larger than 16 MiB."), std::string::npos)
        << boxes->shown[0].text;
}

TEST_F(ProjectFilesTest, WithoutHelpForForms) {
    CTovimarParameters parameters;
    Session::SetParameters(&parameters);
    parameters.GenerateHelpForForms = false;
    for (const char* kind : {"VB6", "C#", "VB.NET", "J#", "C++", "ASP.NET"})
        EXPECT_EQ(Forms(kind, "gone.csproj"), "") << kind;
    Session::SetParameters(nullptr);
    project.Terminate();
    project.Terminate();
}

TEST_F(ProjectFilesTest, SpreadsheetsOfTheHost) {
    CTovimarClient client;
    test::FakeAccess access;
    client.Connect(access.app);
    Session::Server()->TovimarClientCallBack = [this](const std::string& text) {
        CXmlCommand command;
        command.Deserialize(text);
        if (command.ParamDefined("Message"))
            messages += command.GetParamValue("Message") + "\n";
        const auto answer = answers.find(command.Name());
        if (answer != answers.end())
            command.AddParamValue("RetValue", answer->second);
        if (command.Name() == "SaveAsText")
            environment->files->WriteFile(command.GetParamValue("FullPath"),
                                          "VERSION 5.00\nBegin {C62A69F0} frmAsk\n Caption = \"Ask me\"\n"
                                          " Begin X\n  SourceObject = \".frmTell\"\nEnd\nEnd\n");
        return command.Serialize();
    };
    answers = {{"GetSourceWorksheetsList", "Prices|12&#34; pipes"},
               {"GetSourceChartsList", "Turnover"},
               {"GetSourceFormsList", "frmAsk|frmTell"}};
    EXPECT_EQ(Forms("MS Excel", "Shop.xls"), "frmAsk|Ask me|Form|2\nfrmTell|Ask me|Form|2\n");
    ASSERT_EQ(project.Worksheets().Count(), 1U);
    EXPECT_EQ(project.Worksheets().At(1)->FormName, "Prices");
    EXPECT_EQ(project.Worksheets().At(1)->ObjType(), 81);
    EXPECT_EQ(project.Charts().At(1)->ObjType(), 82);
    EXPECT_TRUE(project.CouldHaveMacros());
    EXPECT_TRUE(project.Tables().Empty());
    EXPECT_FALSE((*project.Forms().Find("frmTell"))->Skipped);
    EXPECT_EQ(messages, "Loading worksheets...\nProcessing worksheet [Prices]...\n"
                        "Processing worksheet [12\" pipes]...\nLoading charts...\n"
                        "Processing chart [Turnover]...\nLoading forms...\nProcessing form [frmAsk]...\n"
                        "Processing form [frmTell]...\n");
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].text,
              "Source worksheet skipped 12\" pipes.\r\nPlease remove double quotes from its name.");
    client.Disconnect();
}

} // namespace
} // namespace tovimar
