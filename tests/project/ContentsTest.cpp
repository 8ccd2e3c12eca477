#include "project/ProjectTest.h"

#include "foundation/Session.h"
#include "project/CHelpPrjCheckSums.h"

namespace tovimar::test {
namespace {

const char* const kOrders = R"xml(
<Project caption="Sales" GeneratedHtmlFile="Title.htm">
 <FORM Name="Orders" Key="Sales.Form_Orders" caption="Orders" ProcessCode="999" type="2"
   GeneratedHTMLFile="Orders.htm"/>
</Project>)xml";

const char* const kDefinition = R"xml(<?xml version="1.0" encoding="utf-8" ?>
<Form Name = "Orders" Text = "Orders" WindowSize = "10, 10" ClientAreaOffset = "0, 0" BorderStyle = "2" HtmlFileName="Orders.htm" Indexes = "Orders|sales" >
<Controls>
<TextBox Name = "City" Text = "City:" Location = "1, 1" Size = "1, 1" Indexes = "city|place" />
<TextBox Name = "Zip" Text = "Zip" Location = "1, 1" Size = "1, 1" Indexes = "place" />
</Controls>
<Documented>
<Controls>
<Item  Name="City" Bmk="City" Caption="City"  />
</Controls>
</Documented>
</Form>
)xml";

const char* const kTopic =
    "<html><head><meta name=\"TOVIMAR-VERSION\" content=\"2.1.0.100 [x]\" >"
    "<meta name=\"TOVIMAR-FORM-NAME\" content=\"Orders\" ></head><body>"
    "<H2><a name=\"Orders_City\">City</a></H2><H2><a name=\"Orders_Zip\">Zip \"code\"</a></H2>"
    "</body></html>";

class ContentsTest : public ProjectTest {
protected:
    ContentsTest() {
        WriteFile("xml\\Orders.xml", kDefinition);
        WriteFile("Orders.htm", kTopic);
    }
};

TEST_F(ContentsTest, AnEditedTopicRenewsItsControls) {
    LoadTree(kOrders, /*loadControls=*/true);
    EXPECT_EQ(tree.NodesQty(), 3) << "the topic documents one control more than the definition said";
    ASSERT_NE(tree.MapItem("Sales.Form_Orders.Zip"), nullptr);
    EXPECT_EQ(Node("Sales.Form_Orders.Zip").Bookmark(), "Orders_Zip");
    EXPECT_TRUE(Node("Sales.Form_Orders.Zip").IsControl);
    const auto contents = tree.GetHHCStr(false);
    ExpectGolden("controls.hhc", contents);
    EXPECT_EQ(contents, tree.GetHHCStr(false)) << "a second build gives the same";
}

TEST_F(ContentsTest, DuringAGenerationNoControlStandsTwice) {
    LoadTree(kOrders, /*loadControls=*/true);
    const auto contents = tree.GetHHCStr(false);
    Session::Run().generationInProgress = true;
    EXPECT_EQ(tree.GetHHCStr(false), contents);
    EXPECT_EQ(tree.NodesQty(), 3);
    EXPECT_TRUE(boxes->shown.empty()) << LastBox();
    tree.SaveCheckSums(true);
    std::string options;
    ExpectGolden("controls.tree.txt", tree.GetTreeStr(options) + options);
}

TEST_F(ContentsTest, IndexOfAnObjectAndItsControls) {
    LoadTree(kOrders, /*loadControls=*/true);
    ASSERT_EQ(tree.MakeAndSaveHHK(Path("s.hhk")), 0);
    ExpectGolden("controls.hhk", ReadFile(Path("s.hhk")));
}

TEST_F(ContentsTest, AnObjectWithoutADefinitionHasNoList) {
    environment->files->DeleteFile(Path("xml\\Orders.xml"));
    LoadTree(kOrders, /*loadControls=*/true);
    const auto contents = tree.GetHHCStr(false);
    EXPECT_EQ(contents.find("<UL>", contents.find("Orders.htm")), std::string::npos) << contents;
    EXPECT_TRUE(boxes->shown.empty()) << LastBox();
}

TEST_F(ContentsTest, CheckSumOfBytes) {
    EXPECT_EQ(CheckSumOfBytes("abc"), "61636500");
    EXPECT_EQ(CheckSumOfBytes(""), "00000000");
    EXPECT_NE(CheckSumOfBytes("abcdefgh"), CheckSumOfBytes("efghabcd"));
    EXPECT_EQ(CalcTextFileCheckSum(Path("absent.htm")), "");
    EXPECT_EQ(CheckSumOfBytes(std::string(258, '\0')), "00010000") << "the position counts with 8 bits";
}

TEST_F(ContentsTest, CheckSumsRememberWhatTheLastGenerationWrote) {
    CHelpPrjCheckSums sums;
    EXPECT_EQ(sums.Init({}, {}, "x"), kFailure1);
    EXPECT_EQ(sums.Save(), kFailure1);
    ASSERT_EQ(sums.Init(Folder(), Folder(), "Sales"), 0);
    sums.Recalc();
    auto* page = sums.GetItem(Path("orders.HTM"));
    ASSERT_NE(page, nullptr);
    EXPECT_TRUE(page->CheckSumChanged());
    EXPECT_FALSE(page->PreviousCheckSumChanged());
    ASSERT_EQ(sums.Save(), 0);
    EXPECT_EQ(ReadFile(Path("SalesCS.txt")), "Version=1.0\r\nOrders.htm=" + CheckSumOfBytes(kTopic) + "\r\n");

    WriteFile("Orders.htm", "abc");
    CHelpPrjCheckSums again;
    ASSERT_EQ(again.Init(Folder(), Folder(), "Sales"), 0);
    page = again.GetItem(Path("Orders.htm"));
    ASSERT_NE(page, nullptr);
    EXPECT_FALSE(page->CheckSumChanged()) << "nothing counts as changed before the pages are looked at";
    again.Recalc();
    EXPECT_TRUE(page->CheckSumChanged());
    again.Save(false);
    EXPECT_EQ(again.ChangedFiles().size(), 1U);
    again.Save(true);
    EXPECT_EQ(ReadFile(Path("SalesCS.txt")), "Version=1.0\r\nOrders.htm=61636500\r\n");
}

TEST_F(ContentsTest, CheckSumFileDropsLinesItCantRead) {
    WriteFile("SalesCS.txt", "Version=1.0\r\na=b.htm=00\r\nno equals\r\n x.htm = 61636500 \r\n");
    CHelpPrjCheckSums sums;
    ASSERT_EQ(sums.Init(Folder(), Folder(), "Sales"), 0);
    EXPECT_EQ(sums.Files().Count(), 1U);
    ASSERT_NE(sums.GetItem(Path("x.htm")), nullptr);
    sums.Save();
    EXPECT_EQ(ReadFile(Path("SalesCS.txt")), "Version=1.0\r\nx.htm=61636500\r\n");
}

} // namespace
} // namespace tovimar::test
