#include "platform/painting/ReportPage.h"
#include "platform/painting/PageSetup.h"
#include "platform/painting/PaintingTest.h"
#include "platform/painting/SampleData.h"

#include <cstdio>

namespace tovimar::test {

using namespace platform;
using namespace platform::access;
using painting::SampleData;

namespace {

using Type = Records::Type;

/// Printer settings as an export has them: numbers of 32 bits, least byte first.
std::string Settings(const std::vector<unsigned>& numbers) {
    std::string bytes;
    for (const unsigned number : numbers)
        for (int shift = 0; shift < 32; shift += 8) {
            char byte[3];
            std::snprintf(byte, sizeof byte, "%02x", number >> shift & 0xFF);
            bytes += byte;
        }
    return "PrtMip = Begin\n0x" + bytes + "\nEnd\n";
}
/// Two columns of 2000 twips, 300 apart; `order` 1953 along rows, 1954 down columns.
std::string TwoColumns(unsigned order) {
    return Settings({600, 600, 600, 600, 0, 2000, 900, 0, 2, 300, 0, order, 1, 0});
}

std::string Text(const std::string& name, const std::string& source, const std::string& more = {}) {
    return "Begin TextBox\nName =\"" + name + "\"\nControlSource =\"" + source + "\"\n" + more + "End\n";
}

class ReportPageTest : public ::testing::Test {
protected:
    ReportPageTest() {
        application.records["Heats"] = {{{"Event", Type::Text}, {"Lane", Type::Number}}, {}};
        for (int lane = 1; lane <= 5; ++lane)
            for (const auto* event : {"Run", "Jump"})
                application.records["Heats"].rows.push_back({event, std::to_string(lane)});
    }

    const Design& Report(const std::string& name, const std::string& head, const std::string& sections) {
        return application.Add(ObjectKind::Report, name,
                               "Begin Report\nRecordSource =\"Heats\"\nWidth =4500\n" + head + "Begin\n" +
                                   sections + "End\nEnd\n");
    }
    std::vector<painting::PrintedSection> Printed(const Design& report) {
        return painting::PlanReportPage(report, SampleData(report, &application), metrics).sections;
    }

    DesignApplication application;
    SystemMetrics metrics;
};

const std::string kEventGroup = "Begin BreakLevel\nGroupHeader = NotDefault\nControlSource =\"Event\"\nEnd\n";

} // namespace

TEST_F(ReportPageTest, ColumnsAreFilledAsTheSettingsSay) {
    const std::string detail = "Begin Section\nHeight =900\nEnd\n";
    const auto across = Printed(Report("Across", TwoColumns(1953), detail));
    ASSERT_GE(across.size(), 3U);
    const int gap = (2000 / 15) + 300 / 15;
    EXPECT_EQ(across[1].left, gap);
    EXPECT_EQ(across[1].top, across[0].top) << "the second stands beside the first";
    EXPECT_EQ(across[2].left, 0);
    EXPECT_EQ(across[2].top, across[0].top + across[0].height);

    const auto down = Printed(Report("Down", TwoColumns(1954), detail));
    ASSERT_EQ(down.size(), 10U);
    EXPECT_EQ(down[1].left, 0);
    EXPECT_EQ(down[1].top, down[0].top + down[0].height);
    EXPECT_EQ(down.back().left, gap);
    EXPECT_EQ(down[7].top, down[0].top) << "a full column is followed by the next one from its top";
}

TEST_F(ReportPageTest, DamagedSettingsGiveASheet) {
    for (const auto& head : {Settings({0xFFFFFFFFU, 0, 7, 0x7FFFFFFFU}),
                             Settings({1, 1, 1, 1, 0, 0, 0, 0, 0xFFFFFFFFU, 0xFFFFFFFFU, 0, 7}),
                             std::string(), std::string("PrtMip = Begin\n0x00\nEnd\n")}) {
        const auto& report = Report("Bad", head, "Begin Section\nHeight =300\nEnd\n");
        const auto setup = painting::PageSetupOf(report, metrics);
        EXPECT_GE(setup.columns, 1);
        EXPECT_LT(setup.BodyWidth(), 8000);
        EXPECT_LT(setup.left + setup.top + setup.right + setup.bottom, 400);
        EXPECT_FALSE(Printed(report).empty());
    }
}

TEST_F(ReportPageTest, ASubreportTakesTheHeightOfItsRecords) {
    Report("Lanes", TwoColumns(1953), "Begin Section\nHeight =300\nEnd\n");
    const auto section = [](const std::string& more, const std::string& below) {
        return kEventGroup +
               "Begin BreakHeader\nCanGrow = NotDefault\nHeight =450\nBegin\nBegin Subform\nTop =75\nHeight "
               "=300\nSourceObject =\"Report.Lanes\"\nLinkChildFields =\"Event\"\nLinkMasterFields "
               "=\"Event\"\n" +
               more + "End\n" + below + "End\nEnd\n";
    };
    // Five lanes in two columns are three rows of 20 pixels; the design has room for one.
    EXPECT_EQ(Printed(Report("Grows", {}, section({}, {})))[0].growth, 40);
    EXPECT_EQ(Printed(Report("Fixed", {}, section("CanGrow = NotDefault\n", {})))[0].growth, 0);
    EXPECT_EQ(Printed(Report("Tied", {}, section({}, Text("T", "Lane", "Top =375\n"))))[0].growth, 0);
    // A report within itself comes to an end.
    EXPECT_FALSE(Printed(Report("Loop", {}, text::ReplaceAll(section({}, {}), "Lanes", "Loop"))).empty());
}

TEST_F(ReportPageTest, AGroupOnAPageOfItsOwnEndsThePage) {
    const auto& report = Report("Pages", {},
                                kEventGroup +
                                    "Begin BreakHeader\nForceNewPage =1\nHeight =0\nEnd\n"
                                    "Begin Section\nHeight =300\nBegin\n" +
                                    Text("Event", "Event") + "End\nEnd\n");
    const SampleData sample(report, &application);
    const auto printed = Printed(report);
    EXPECT_EQ(printed.size(), 5U) << "all of the first group";
    for (const auto& section : printed)
        EXPECT_EQ(sample.Text(*section.object->children[0], section.row), "Jump");
}

TEST_F(ReportPageTest, RunningSumsBeginAgainWithTheirGroup) {
    const auto& report =
        Report("Sums", {},
               kEventGroup +
                   "Begin BreakLevel\nControlSource =\"Lane\"\nEnd\nBegin "
                   "Section\nHeight =300\nBegin\n" +
                   Text("Count", "=1", "RunningSum =1\n") + Text("Group", "Lane", "RunningSum =1\n") +
                   Text("All", "=[Lane]*2", "RunningSum =2\n") + "End\nEnd\n");
    const SampleData sample(report, &application);
    const auto text = [&](std::size_t control, int row) {
        return sample.Text(*report.Section(0)->children[control], row);
    };
    EXPECT_EQ(text(0, 4), "5");
    EXPECT_EQ(text(0, 6), "2") << "the second of the second group";
    EXPECT_EQ(text(1, 6), "3");
    EXPECT_EQ(text(2, 6), "36");
}

TEST_F(ReportPageTest, ASubreportWithoutItsRecordsPrintsNothing) {
    const auto& lanes = Report("Lanes", {}, "Begin Section\nHeight =300\nEnd\n");
    EXPECT_TRUE(
        painting::PlanPrintedBody(lanes, SampleData(lanes, &application, {{"Event", "Swim"}}), metrics)
            .empty());
    const auto& outer = Report("Outer", {},
                               "Begin Section\nHeight =600\nBegin\n" + Text("Kind", "=\\\"Run\\\"") +
                                   "Begin Subform\nSourceObject =\"Report.Lanes\"\nLinkChildFields "
                                   "=\"Event\"\nLinkMasterFields =\"Kind\"\nEnd\nEnd\nEnd\n");
    const auto links = SampleData(outer, &application).LinksOf(*outer.Section(0)->children[1], 0);
    EXPECT_EQ(SampleData(lanes, &application, links).RecordCount(), 5)
        << "a control's constant links as well";
}

} // namespace tovimar::test
