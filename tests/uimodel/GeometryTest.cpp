#include "uimodel/CNonClientMetrics.h"
#include "uimodel/CScaler.h"
#include "uimodel/HotSpots.h"
#include "uimodel/clsAccFormColumn.h"
#include "uimodel/clsAccFormDimensions.h"

#include "support/FakeEnvironment.h"
#include "uimodel/FakeHost.h"

namespace tovimar {
namespace {

using test::FakeProcessor;
using test::MakeObject;

class GeometryTest : public test::EnvironmentTest {
protected:
    /// Header of 300 twips, page header of 150, detail of 3000.
    static std::shared_ptr<test::FakeObject> Form(std::int32_t view, std::map<std::string, Value> more = {}) {
        more["CurrentView"] = view;
        const auto section = [&](int number, std::int32_t height) {
            more["Section(" + std::to_string(number) + ")"] =
                HostObject(MakeObject("Section", {{"Height", height}}));
        };
        section(0, 3000);
        section(1, 300);
        section(2, -503);
        section(3, 150);
        return MakeObject("Form_Orders", std::move(more));
    }
    static std::shared_ptr<test::FakeObject> Control(const HostObject& form,
                                                     std::map<std::string, Value> more = {}) {
        more.insert({{"Parent", form},
                     {"Section", 0},
                     {"Left", 152},
                     {"Top", 307},
                     {"Width", 1500},
                     {"Height", 285}});
        return MakeObject("TextBox", std::move(more));
    }

    FakeProcessor processor;
    clsAccFormDimensions dimensions;
};

TEST_F(GeometryTest, DesignViewHasAFrameATitleAndABarOverEachSection) {
    const HostObject form = Form(0);
    const HostObject control = Control(form);
    EXPECT_EQ(8, dimensions.FormClientAreaOffsetX(processor, form, false));
    EXPECT_EQ(25, dimensions.FormClientAreaOffsetY(processor, form, false));
    EXPECT_EQ(8 + 17, dimensions.FormClientAreaOffsetX(processor, form, true));
    EXPECT_EQ(25 + 18 + 4, dimensions.FormClientAreaOffsetY(processor, form, true));
    EXPECT_EQ(18, dimensions.ControlSectionTitleHeight(processor, control, false));
    EXPECT_EQ(18 + 20 + 18 + 10, dimensions.ControlSectionOffsetY(processor, control, false));
    EXPECT_EQ("Detail", dimensions.ControlSectionName(processor, control, false));
    // A tie goes to the even neighbour; 307 twips are 20.47 pixels.
    EXPECT_EQ((platform::Rectangle{10, 104, 110, 123}), dimensions.ControlRectangle(control, false));
    EXPECT_EQ("<Section Name=\"Header\" ClientAreaOffset = \"0, 0\" Height=\"20\" DesignTimeHeaderHeight = "
              "\"18\"/>\r\n"
              "<Section Name=\"PageHeader\" ClientAreaOffset = \"0, 38\" Height=\"10\" "
              "DesignTimeHeaderHeight = \"18\"/>\r\n"
              "<Section Name=\"Detail\" ClientAreaOffset = \"0, 66\" Height=\"200\" DesignTimeHeaderHeight = "
              "\"18\"/>\r\n"
              "<Section Name=\"PageFooter\" ClientAreaOffset = \"0, 284\" Height=\"0\" "
              "DesignTimeHeaderHeight = \"18\"/>\r\n"
              "<Section Name=\"Footer\" ClientAreaOffset = \"0, 302\" Height=\"0\" DesignTimeHeaderHeight = "
              "\"18\"/>\r\n",
              dimensions.SectionsXML(processor, form, false));
}

TEST_F(GeometryTest, FormViewHasARecordSelectorAndNoBars) {
    const HostObject form = Form(1, {{"BorderStyle", 0}, {"RecordSelectors", true}});
    const HostObject control = Control(form);
    EXPECT_EQ(0, dimensions.FormClientAreaOffsetX(processor, form, false));
    EXPECT_EQ(0, dimensions.FormClientAreaOffsetY(processor, form, false));
    EXPECT_EQ(17, dimensions.FormRecordSelectorWidth(processor, control, false));
    // The page header isn't shown, so it takes no room.
    EXPECT_EQ((platform::Rectangle{27, 40, 127, 59}), dimensions.ControlRectangle(control, false));
    EXPECT_EQ(17, dimensions.DatasheetFormRecordSelectorWidth());
    EXPECT_EQ(18, dimensions.DatasheetFormTitleHeight());
}

TEST_F(GeometryTest, BordersAndViewsMakeTheFrame) {
    struct Case {
        std::int32_t view, borderStyle, x, y;
    };
    // Metrics: border 1, caption 18, scroll bars 17.
    for (const Case& it : {Case{1, 0, 0, 0},
                           {1, 1, 0, 21},
                           {1, 2, 8, 25},
                           {1, 3, 0, 21},
                           {1, 9, 8, 25},
                           {2, 0, 8, 25},
                           {0, 0, 8, 25}}) {
        const HostObject form = Form(it.view, {{"BorderStyle", it.borderStyle}});
        EXPECT_EQ(it.x, dimensions.FormClientAreaOffsetX(processor, form, false))
            << it.view << it.borderStyle;
        EXPECT_EQ(it.y, dimensions.FormClientAreaOffsetY(processor, form, false))
            << it.view << it.borderStyle;
    }
    // A report without a view counts as open in design.
    const HostObject report = MakeObject("Report_R");
    EXPECT_EQ(8, dimensions.FormClientAreaOffsetX(processor, report, false));
    EXPECT_EQ("<Section Name=\"Detail\" ClientAreaOffset = \"0, 0\" Height=\"0\" DesignTimeHeaderHeight = "
              "\"18\"/>\r\n",
              dimensions.SectionsXML(processor, report, false));
}

TEST_F(GeometryTest, TitlesOfOtherHostsGoByTheBorderStyle) {
    CNonClientMetrics metrics;
    metrics.SearchMetrics();
    const std::vector<std::int32_t> expected{0, 18, 18, 18, 17, 17, 0};
    for (std::int32_t style = 0; style < 7; ++style)
        EXPECT_EQ(expected[static_cast<std::size_t>(style)], metrics.GetFormNCM(style)) << style;
    EXPECT_EQ(0, metrics.GetFormNCM(-1));
}

TEST_F(GeometryTest, UnitsOfOtherHosts) {
    processor.access = false;
    const HostObject form = MakeObject("VBForm");
    const HostObject control = MakeObject("TextBox", {{"Container", form}, {"Left", 60}, {"Top", 60}});
    const std::vector<std::pair<double, double>> twips{
        {1, 1}, {1, 1}, {20, 20}, {15, 15}, {120, 240}, {1440, 1440}, {56.69, 56.69}, {566.9, 566.9}};
    for (std::size_t mode = 0; mode < twips.size(); ++mode) {
        processor.scaleMode = static_cast<std::int32_t>(mode);
        CScaler scaler;
        scaler.Init(processor, form, control, /*vfAddContainers=*/true, false);
        EXPECT_EQ(twips[mode], std::pair(scaler.ConstToMultiplyX(), scaler.ConstToMultiplyY())) << mode;
        EXPECT_EQ(platform::access::RoundToEven(60 * twips[mode].first / 15), scaler.Left()) << mode;
        EXPECT_EQ(platform::access::RoundToEven(60 * twips[mode].second / 15), scaler.Top()) << mode;
    }
}

TEST_F(GeometryTest, TabsOfOtherHostsStandInRowsWithTheLastOnTop) {
    processor.access = false;
    processor.scaleMode = 1;
    const auto property = [](std::int32_t value) {
        return HostObject(MakeObject("Property", {{"Value", value}}));
    };
    const HostObject form = MakeObject("VBForm");
    const auto tab = MakeObject("SSTab", {{"Container", form},
                                          {"Left", 150},
                                          {"Top", 300},
                                          {"Width", 4500},
                                          {"Height", 3000},
                                          {"Properties(Tabs)", property(5)},
                                          {"Properties(TabsPerRow)", property(3)},
                                          {"Properties(TabHeight)", property(300)}});
    CScaler scaler;
    scaler.Init(processor, form, tab, /*vfAddContainers=*/true, /*vfCalcTabs=*/true);
    EXPECT_EQ(5, scaler.TabsQTy());
    EXPECT_EQ(100, scaler.TabWidth(0));
    EXPECT_EQ(20, scaler.TabHeight(0));
    EXPECT_EQ(20 + 20, scaler.TabTop(2)); // first row, below
    EXPECT_EQ(20, scaler.TabTop(3));      // second row, on top
    EXPECT_EQ(10 + 100, scaler.TabLeft(4));
    tab->Set("Properties(TabsPerRow)", property(0));
    scaler.Init(processor, form, tab, true, true);
    EXPECT_EQ(0, scaler.TabIndexInRow(4));
    EXPECT_EQ(20, scaler.TabTop(4));
}

TEST_F(GeometryTest, AFormIsReadOnceForAllItsControls) {
    const auto form = Form(0);
    const HostObject control = Control(form);
    dimensions.ControlRectangle(control, false);
    const int reads = form->reads;
    for (int i = 0; i < 100; ++i)
        dimensions.ControlSectionOffsetY(processor, control, false);
    EXPECT_EQ(reads, form->reads);

    form->Set("Section(1)", HostObject(MakeObject("Section", {{"Height", 600}})));
    EXPECT_EQ(66, dimensions.ControlSectionOffsetY(processor, control, false));
    dimensions.Forget();
    EXPECT_EQ(86, dimensions.ControlSectionOffsetY(processor, control, false));
}

TEST_F(GeometryTest, TabsOfAccessStandInOneRow) {
    const HostObject form = Form(0);
    const auto page = [](const char* caption) {
        return HostObject(MakeObject("Page", {{"Caption", caption}, {"Name", "Page9"}}));
    };
    std::map<std::string, Value> tab{{"Pages", HostObject(MakeObject("Pages", {{"Count", 3}}))},
                                     {"Pages(0)", page("One")},
                                     {"Pages(1)", page("")},
                                     {"Pages(2)", page("Third")},
                                     {"FontSize", 8},
                                     {"FontWeight", 400}};
    CScaler scaler;
    scaler.Init(processor, form, Control(form, tab), false, true, &dimensions);
    EXPECT_EQ(3, scaler.TabsQTy());
    EXPECT_EQ(10, scaler.TabLeft(0));
    EXPECT_EQ(25, scaler.TabWidth(0)); // 167 x 3 x 0.75 / 15
    EXPECT_EQ(35, scaler.TabLeft(1));
    EXPECT_EQ(42, scaler.TabWidth(1)); // by the name
    EXPECT_EQ(scaler.TabTop(0), scaler.TabTop(2));
    EXPECT_EQ(19, scaler.TabHeight(2)); // 284 twips where none is fixed
    tab["TabFixedWidth"] = 900;
    tab["TabFixedHeight"] = 300;
    scaler.Init(processor, form, Control(form, tab), false, true, &dimensions);
    EXPECT_EQ(130, scaler.TabLeft(2));
    EXPECT_EQ(20, scaler.TabHeight(0));
    EXPECT_EQ(2, scaler.TabIndexInRow(2));
}

TEST_F(GeometryTest, OtherHostsScaleByTheirUnitAndAddContainers) {
    processor.access = false;
    processor.scaleMode = 2;
    const HostObject form = MakeObject("VBForm");
    const HostObject frame = MakeObject("Frame", {{"Container", form}, {"Left", 30}, {"Top", 15}});
    const HostObject control = MakeObject(
        "TextBox", {{"Container", frame}, {"Left", 150}, {"Top", 300}, {"Width", 450}, {"Height", 15}});
    CScaler scaler;
    scaler.Init(processor, form, control, /*vfAddContainers=*/true, false);
    EXPECT_EQ(10 + 40, scaler.Left()); // twips in the frame; the frame itself in points
    EXPECT_EQ(20 + 20, scaler.Top());
    EXPECT_EQ(30, scaler.Width());
    scaler.Init(processor, form, control, /*vfAddContainers=*/false, false);
    EXPECT_EQ(200, scaler.Left());
    EXPECT_EQ(400.0, scaler.ScaleX(20));
    EXPECT_EQ(0, scaler.TabIndexInRow(5));
}

TEST_F(GeometryTest, HotSpotsAreCorrectedByWindowsVersionAndHost) {
    EXPECT_EQ((FrameCorrection{0, 0}), CorrectionOfFrames(5, "MS ACCESS"));
    EXPECT_EQ((FrameCorrection{-26, -11}), CorrectionOfFrames(6, "ms access"));
    EXPECT_EQ((FrameCorrection{-11, -11}), CorrectionOfFrames(10, "C#"));
    EXPECT_EQ((FrameCorrection{0, 0}), CorrectionOfFrames(10, "MS EXCEL"));
}

TEST_F(GeometryTest, AColumnNeedsItsWidthAndOrder) {
    clsAccFormColumn column;
    EXPECT_TRUE(
        column.Init(MakeObject("TextBox", {{"Name", "City"}, {"ColumnWidth", 900}, {"ColumnOrder", 2}})));
    EXPECT_EQ(2, column.ColumnOrder);
    EXPECT_FALSE(column.Init(MakeObject("Label", {{"Name", "City"}})));
}

} // namespace
} // namespace tovimar
