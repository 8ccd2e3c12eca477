#include "platform/access/ApplicationFolder.h"
#include "platform/access/ApplicationModel.h"
#include "platform/access/Fixtures.h"
#include "platform/text/Text.h"
#include "platform/windowing/WindowSystem.h"

namespace tovimar::platform::access {
namespace {

std::string NamesOf(const ApplicationSummary& summary, ObjectKind kind) {
    std::string names;
    for (const auto& object : summary.objects)
        if (object.kind == kind)
            names += (names.empty() ? "" : ",") + object.name;
    return names;
}

TEST(ObjectNames, AreDecodedFromFileNames) {
    EXPECT_EQ(DecodeObjectName("Special %5C%5C..%2F%2F Popup"), "Special \\\\..// Popup");
    EXPECT_EQ(DecodeObjectName("Overall%"), "Overall%");
    EXPECT_EQ(DecodeObjectName("Stats_%_Pts"), "Stats_%_Pts");
    EXPECT_EQ(DecodeObjectName("100%25"), "100%");
    EXPECT_EQ(DecodeObjectName("a%41%zz%2"), "a%41%zz%2");
}

TEST_F(ApplicationTest, FindsPartsByContentAndName) {
    Part("forms\\Orders.bas", kOrdersForm);
    Part("forms\\Broken.bas", "Begin Form\r\n  Begin\r\n");
    Part("forms\\Orders.cls.txt", "notes of somebody");
    Part("stray\\Elsewhere.txt", SmallForm(""));
    Part("queries\\All.bas", "dbMemo \"SQL\" =\"SELECT * FROM T\"\r\n");
    Part("queries\\New.sql", "SELECT T.a FROM T;");
    Part("macros\\AutoExec.bas", "Version =0\r\nColumnsShown =0\r\n");
    Part("tbldef\\T.sql", "CREATE TABLE [T] (\r\n  [a] LONG\r\n)\r\n");
    Part("tables\\T.txt", "a\r\n1\r\n");
    Part("modules\\m.bas", "Attribute VB_Name = \"m\"\r\nOption Compare Database\r\n");
    Part("readme.md", "Begin Form");
    const auto summary = SummarizeApplication(NativeApplication());
    EXPECT_EQ(summary.name, "App");
    EXPECT_EQ(NamesOf(summary, ObjectKind::Form), "Broken,Elsewhere,Orders,Orders.cls");
    EXPECT_EQ(NamesOf(summary, ObjectKind::Query), "All,New");
    EXPECT_EQ(NamesOf(summary, ObjectKind::Macro), "AutoExec");
    EXPECT_EQ(NamesOf(summary, ObjectKind::Table), "T");
    EXPECT_EQ(NamesOf(summary, ObjectKind::Module), "m");
    EXPECT_EQ(summary.notes, std::vector<std::string>{"2 forms can't be read."});
}

TEST_F(ApplicationTest, TakesCodeAndPropertiesFromFilesBeside) {
    Part("src\\forms\\Main.form", SmallForm(""));
    Part("src\\forms\\Main.cls", "Attribute VB_Exposed = False\r\nDim total\r\n");
    Part("src\\modules\\clsOwn.cls", "VERSION 1.0 CLASS\r\nBEGIN\r\nEND\r\nDim own\r\n");
    Part("src\\queries\\q.sql", "SELECT 1 AS One");
    Part("src\\queries\\q.json", R"({"Info":{"Class":"clsDbQuery"},"Items":{"Description":"One row."}})");
    Part(
        "src\\documents.json",
        R"({"Info":{"Class":"clsDbDocument"},"Items":{"Scripts":{"Go":{"Description":{"Value":"Starts."}}}}})");
    Part("src\\macros\\Go.macro", "Version =196611\r\nColumnsShown =0\r\n");
    Part("src\\images\\logo.png", "PNG!");
    Part("src\\vbe-project.json", R"({"Info":{"Class":"clsDbVbeProject"},"Items":{"Name":"Shop"}})");
    const auto application = Open();
    const auto database = Object(application, "CurrentDb");
    EXPECT_EQ(Text(Object(Object(database, "QueryDefs", {"Q"}), "Properties", {"Description"}), "Value"),
              "One row.");
    EXPECT_EQ(Text(Object(Object(Object(Object(database, "Containers", {"Scripts"}), "Documents", {"go"}),
                                 "Properties"),
                          "Item", {"Description"}),
                   "Value"),
              "Starts.");
    const auto project =
        Object(Object(application, "VBE"), "VBProjects", {application->Call("GetOption", {"Project Name"})});
    EXPECT_EQ(Text(project, "Name"), "Shop");
    EXPECT_EQ(Object(Object(project, "VBComponents", {"Form_Main"}), "CodeModule")->Call("Lines", {1, 9}),
              Value("Dim total"));
    EXPECT_EQ(RaisedBy([&] { Object(project, "VBComponents", {"Form_None"}); }).number, 9);
    EXPECT_EQ(ApplicationModel(NativeApplication()).FindPicture("LOGO"), "PNG!");
    application->Call("SaveAsText", {2, "Main", Path("out.txt")});
    EXPECT_NE(ReadFile(Path("out.txt")).find("CodeBehindForm\r\nAttribute VB_Exposed"), std::string::npos);
}

TEST_F(ApplicationTest, RefusesWhatIsNoApplication) {
    Part("notes.txt", "nothing");
    EXPECT_EQ(RaisedBy([&] { Open(); }).text, "No Access application found in " + NativeApplication() + ".");
    EXPECT_EQ(RaisedBy([&] { OpenAccessApplication(NativeFolder() + "/absent"); }).number, kFailure1);
    Part("bad.accdb", std::string(10000, 'x'));
    EXPECT_EQ(RaisedBy([&] { OpenAccessApplication(NativeApplication() + "/bad.accdb"); }).text,
              NativeApplication() + "/bad.accdb: the file is no Access database.");
    // The right signature over rubbish.
    std::string rubbish(100000, '\x7F');
    rubbish.replace(0, 19, std::string("\0\1\0\0Standard ACE DB", 19));
    Part("worse.accdb", rubbish);
    const auto failure = RaisedBy([&] { OpenAccessApplication(NativeApplication() + "/worse.accdb"); });
    EXPECT_EQ(failure.number, kFailure1);
    EXPECT_NE(failure.text.find("/worse.accdb"), std::string::npos);
    // Beside sound exports a damaged database only lacks its data.
    Part("forms\\Main.bas", SmallForm(""));
    EXPECT_EQ(NamesOf(SummarizeApplication(NativeApplication()), ObjectKind::Form), "Main");
}

TEST_F(ApplicationTest, TellsOfADamagedFormWhenItIsOpened) {
    Part("forms\\Broken.bas", "Version =20\r\nBegin Form\r\n  Caption =\"x\r\n");
    const auto application = Open();
    const auto command = Object(application, "DoCmd");
    for (int i = 0; i < 2; ++i)
        EXPECT_EQ(RaisedBy([&] { command->Call("OpenForm", {"Broken"}); }).text,
                  NativeApplication() + "/forms/Broken.bas, line 3: a text has no closing quote.");
    EXPECT_EQ(Object(application, "Forms")->Get("Count"), Value(0));
}

TEST_F(ApplicationTest, KeepsOddNames) {
    const std::string longName(200, 'n');
    const std::vector<std::string> names = {"..%5C..%5Cx", "O'Brien", "50% #1", "Заказы & люди", longName};
    for (const auto& name : names)
        Part("forms\\" + name + ".form", SmallForm("Begin TextBox\r\nName =\"a\"\r\nEnd\r\n"));
    const auto application = Open();
    EXPECT_EQ(Object(Object(application, "CurrentProject"), "AllForms")->Get("Count"), Value(5));
    for (const auto* name : {"..\\..\\x", "o'brien", "50% #1", "ЗАКАЗЫ & ЛЮДИ", longName.c_str()}) {
        Object(application, "DoCmd")->Call("OpenForm", {name, 1});
        const auto form = Object(application, "Forms", {name});
        EXPECT_TRUE(text::EqualsIgnoringCase(form->ClassName(), std::string("Form_") + name));
        Object(application, "DoCmd")->Call("Close", {2, name, 2});
    }
}

TEST_F(ApplicationTest, GivesRecordsOfTablesAndPlainQueries) {
    Part("forms\\Main.bas", SmallForm(""));
    Part("tbldef\\T.sql", "CREATE TABLE [T] ([id] LONG, [paid] BIT, [note] VARCHAR (9))");
    Part("tables\\T.txt", "id\tpaid\tnote\r\n1\tTrue\tfirst\r\n2\tFalse\tsecond\r\n");
    Part("tbldef\\Bare.sql", "CREATE TABLE [Bare] ([when] DATETIME)");
    ApplicationModel model(NativeApplication());
    const auto* table = model.FindRecords("[t]", 1);
    ASSERT_NE(table, nullptr);
    EXPECT_EQ(table->rows.size(), 1U);
    EXPECT_EQ(table->columns[1].type, Records::Type::Boolean);
    EXPECT_EQ(model.FindRecords("SELECT note AS n, id FROM T;", 5)->rows[1],
              (std::vector<std::string>{"second", "2"}));
    EXPECT_EQ(model.FindRecords("SELECT note FROM T WHERE id=2", 5)->rows,
              (std::vector<std::vector<std::string>>{{"second"}}));
    EXPECT_EQ(model.FindRecords("Bare", 5)->columns[0].type, Records::Type::DateTime);
    EXPECT_EQ(model.FindRecords("Nowhere", 5), nullptr);
    EXPECT_EQ(model.FindRecords("", 5), nullptr);
}

TEST_F(ApplicationTest, ListsDataAndRelations) {
    Part("forms\\Main.bas", SmallForm(""));
    Part("tbldefs\\A.sql",
         "CREATE TABLE [A] ([ID] AUTOINCREMENT CONSTRAINT [PrimaryKey] PRIMARY KEY, [x] LONG)");
    Part("tbldefs\\B.sql", "CREATE TABLE [B] ([aID] LONG)");
    Part("queries\\q.sql", "SELECT A.x, x+1 AS y FROM A");
    Part("relations\\AB.json", R"({"Items":{"Name":"AB","Attributes":0,"Table":"A","ForeignTable":"B",
"Fields":[{"Name":"ID","ForeignName":"aID"}]}})");
    const auto application = Open();
    const auto data = Object(application, "CurrentData");
    EXPECT_EQ(Names(Object(data, "AllTables")), "A,B");
    EXPECT_EQ(Names(Object(data, "AllQueries")), "q");
    const auto database = Object(application, "CurrentDb");
    const auto fields = Object(Object(database, "QueryDefs", {"q"}), "Fields");
    EXPECT_EQ(Text(Object(fields, "Item", {0}), "SourceTable") +
                  Text(Object(fields, "Item", {"x"}), "SourceField"),
              "Ax");
    EXPECT_EQ(Text(Object(fields, "Item", {1}), "SourceField"), "");
    EXPECT_EQ(Object(Object(database, "TableDefs", {"a"}), "Fields", {1})->Get("OrdinalPosition"), Value(1));
    EXPECT_EQ(
        RaisedBy([&] { Object(Object(database, "TableDefs", {"A"}), "Properties", {"Description"}); }).number,
        3270);
    EXPECT_EQ(RaisedBy([&] { Object(database, "TableDefs", {"none"}); }).number, 3265);
    EXPECT_EQ(RaisedBy([&] { Object(database, "Properties", {"MDE"}); }).number, 3270);
    const auto relation = Object(database, "Relations", {0});
    EXPECT_EQ(Text(Object(relation, "Fields", {0}), "ForeignName"), "aID");
    auto& windows = *environment->windows;
    const auto main = application->Get("hWndAccessApp").AsInteger();
    Object(application, "DoCmd")->Call("RunCommand", {133});
    Object(application, "DoCmd")->Call("RunCommand", {133});
    const auto relations = windows.FirstChild(main);
    EXPECT_EQ(windows.Find(relations)->className, "OSysRel");
    EXPECT_EQ(windows.NextSibling(relations), 0);
}

} // namespace
} // namespace tovimar::platform::access
