#include "platform/painting/SampleData.h"
#include "platform/painting/PaintingTest.h"
#include "platform/painting/ReportPage.h"

namespace tovimar::test {

using namespace platform;
using namespace platform::access;
using painting::SampleData;

namespace {

using Type = Records::Type;

std::string Box(const std::string& name, const std::string& source, const std::string& more = {}) {
    return "Begin TextBox\nName =\"" + name + "\"\nControlSource =\"" +
           text::ReplaceAll(source, "\"", "\\\"") + "\"\n" + more + "End\n";
}

/// Orders with their lines as a subform, and a report of the lines grouped by product.
class ShopTest : public ::testing::Test {
protected:
    ShopTest() {
        application.records["Orders"] = {{{"No", Type::Number},
                                          {"Customer", Type::Number},
                                          {"Fee", Type::Currency},
                                          {"Day", Type::DateTime}},
                                         {{"8", "2", "1.5", "3/4/2024"}, {"9", "1", "", ""}}};
        application.records["Lines"] = {
            {{"No", Type::Number}, {"Product", Type::Text}, {"Price", Type::Currency}},
            {{"9", "Pear", "1"}, {"8", "Apple", "2"}, {"8", "Pear", "4"}}};
        application.records["Customers"] = {
            {{"ID", Type::Number}, {"Name", Type::Text}, {"Rebate", Type::Number}},
            {{"1", "Miller", "0"}, {"2", "Brown", "0.1"}}};
        lines = &application.AddForm(
            "Lines", "Begin Form\nRecordSource =\"Lines\"\nBegin\nBegin Section\nHeight =300\nBegin\n" +
                         Box("Price", "Price") + Box("Sum", "=Sum([Price])", "Format =\"Currency\"\n") +
                         "End\nEnd\nEnd\nEnd\n");
        orders = &application.AddForm(
            "Orders", "Begin Form\nRecordSource =\"Orders\"\nBegin\nBegin Section\nHeight =3000\nBegin\n"
                      "Begin Subform\nName =\"Sub\"\nSourceObject =\"Form.Lines\"\nLinkChildFields "
                      "=\"No\"\nLinkMasterFields =\"No\"\nEnd\n"
                      "Begin ComboBox\nName =\"Customer\"\nControlSource =\"Customer\"\nColumnCount "
                      "=2\nColumnWidths =\"0\"\nRowSource =\"Customers\"\nEnd\n" +
                          Box("Goods", "=[Sub].[Form]![Sum]") +
                          Box("Rebate", "=-[Goods]*[Customer].[Column](2)") +
                          Box("Total", "=[Goods]+[Rebate]+Nz([Fee],0)", "Format =\"Currency\"\n") +
                          Box("Day", "Day", "Format =\"Medium Date\"\n") +
                          Box("Title", "=DLookUp(\"[Name]\",\"Customers\") & DCount(\"*\",\"Customers\")") +
                          Box("Second", "=DLookUp(\"Name\",\"Customers\",\"[ID]=\" & [Customer])") +
                          Box("None", "=DCount(\"*\",\"Customers\",\"[Rebate]>1\")") +
                          Box("Loop", "=[Pool]+1") + Box("Pool", "=[Loop]+1") + "End\nEnd\nEnd\nEnd\n");
    }

    const DesignObject& Control(const Design& design, const std::string& name) const {
        return *OpenedWindow::Find(*design.root, name);
    }

    DesignApplication application;
    const Design* lines = nullptr;
    const Design* orders = nullptr;
};

} // namespace

TEST_F(ShopTest, ControlsShowWhatTheirExpressionsComeTo) {
    const SampleData sample(*orders, &application);
    const auto text = [&](const char* name, int row) { return sample.Text(Control(*orders, name), row); };
    EXPECT_EQ(text("Goods", 0), "6") << "the lines of this order alone";
    EXPECT_EQ(text("Total", 0), "$6.90");
    EXPECT_EQ(text("Customer", 1), "Miller");
    EXPECT_EQ(text("Day", 0), "04-Mar-24");
    EXPECT_EQ(text("Day", 1), "");
    EXPECT_EQ(text("Title", 0), "Miller2");
    EXPECT_EQ(text("Second", 0), "Brown") << "the customer that the condition names";
    EXPECT_EQ(text("None", 0), "0");
    EXPECT_EQ(text("Loop", 0), "") << "two that ask for each other come to an end";
    EXPECT_TRUE(sample.AlignsRight(Control(*orders, "Total"), 0));
    EXPECT_FALSE(sample.AlignsRight(Control(*orders, "Title"), 0));
}

TEST_F(ShopTest, ASubformShowsTheLinkedRecords) {
    const SampleData outer(*orders, &application);
    const auto links = outer.LinksOf(Control(*orders, "Sub"), 0);
    ASSERT_EQ(links.size(), 1U);
    EXPECT_EQ(SampleData(*lines, &application, links).RecordCount(), 2);
    EXPECT_EQ(SampleData(*lines, &application, {{"No", "77"}}).RecordCount(), 3) << "no record is linked";
    EXPECT_EQ(SampleData(*lines, nullptr).RecordCount(), -1);
}

TEST_F(ShopTest, AReportPrintsGroupsByValue) {
    const auto& report = application.Add(ObjectKind::Report, "R",
                                         "Begin Report\nRecordSource =\"Lines\"\nWidth =6000\nBegin\nBegin "
                                         "BreakLevel\nControlSource =\"Product\"\nEnd\n"
                                         "Begin BreakHeader\nHeight =300\nBegin\n" +
                                             Box("Product", "Product") +
                                             "End\nEnd\n"
                                             "Begin Section\nHeight =300\nEnd\n"
                                             "Begin BreakFooter\nHeight =300\nBegin\n" +
                                             Box("Sum", "=Sum([Price])") + "End\nEnd\nEnd\nEnd\n");
    SampleData sample(report, &application);
    const auto page = painting::PlanReportPage(report, sample, SystemMetrics{});
    std::vector<std::string> printed;
    for (const auto& section : page.sections) {
        sample.LimitAggregates(section.firstAdded, section.added);
        printed.push_back(section.object->children.empty()
                              ? "detail"
                              : sample.Text(*section.object->children[0], section.row));
    }
    EXPECT_EQ(printed, (std::vector<std::string>{"Apple", "detail", "2", "Pear", "detail", "detail", "5"}));
}

TEST_F(ShopTest, AnEmptyTableShowsWhatItsFieldsMayHold) {
    application.records["Goods"] = {{{"Lane", Type::Number}, {"Kind", Type::Text}, {"Maker", Type::Number}},
                                    {}};
    const auto combo = [](const std::string& name, const std::string& more) {
        return "Begin ComboBox\nName =\"" + name + "\"\nControlSource =\"" + name + "\"\n" + more + "End\n";
    };
    const auto& form = application.AddForm(
        "Goods",
        "Begin Form\nRecordSource =\"Goods\"\nBegin\nBegin Section\nBegin\n" +
            Box("Lane", "Lane", "Width =900\n") + Box("Plain", "Plain", "Width =3000\n") +
            Box("Told", "X1", "Width =3000\nBegin\nBegin Label\nCaption =\"&Surname:\"\nEnd\nEnd\n") +
            combo("Kind", "RowSourceTypeInt =1\nRowSource =\"\\\"Tool\\\";\\\"Toy\\\"\"\n") +
            combo("Maker", "ColumnCount =2\nColumnWidths =\"0\"\nRowSource =\"Customers\"\n") +
            "Begin ListBox\nName =\"All\"\nColumnCount =2\nColumnHeads = NotDefault\nRowSource "
            "=\"Goods\"\nEnd\n" +
            "End\nEnd\nEnd\nEnd\n");
    const SampleData sample(form, &application);
    const auto text = [&](const char* name, int row) { return sample.Text(Control(form, name), row); };
    EXPECT_EQ(text("Lane", 0) + text("Lane", 5), "16");
    EXPECT_EQ(text("Plain", 0), "") << "nothing is known of it";
    EXPECT_EQ(text("Told", 0), "Miller") << "the caption tells what it is";
    EXPECT_EQ(text("Kind", 0) + text("Kind", 1) + text("Kind", 2), "ToolToyTool");
    EXPECT_EQ(text("Maker", 1), "Brown");
    const auto list = sample.ListRows(Control(form, "All"));
    ASSERT_EQ(list.rows.size(), 1U) << "an empty list has its heads";
    EXPECT_EQ(list.rows[0], (std::vector<std::string>{"Lane", "Kind"}));
}

TEST_F(ShopTest, AFormWithoutRecordsShowsItsDetailOnce) {
    const auto& question = application.AddForm(
        "Q", "Begin Form\nDefaultView =1\nBegin\nBegin Section\nHeight =300\nEnd\nEnd\nEnd\n");
    const auto& bound =
        application.AddForm("B", "Begin Form\nDefaultView =1\nBegin\nBegin Section\nHeight =300\nBegin\n" +
                                     Box("A", "A") + "End\nEnd\nEnd\nEnd\n");
    OpenedWindow first(question, &application, View::Form), second(bound, &application, View::Form);
    EXPECT_EQ(first.object.ShownRecords(first.windows.Metrics()), 1);
    EXPECT_GT(second.object.ShownRecords(second.windows.Metrics()), 1);
}

} // namespace tovimar::test
