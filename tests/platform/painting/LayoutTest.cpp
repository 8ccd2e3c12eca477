#include "platform/painting/PaintingTest.h"

namespace tovimar::test {

using namespace platform;
using namespace platform::access;

namespace {

const SystemMetrics kMetrics;

OpenObject OpenedForm(const Design& form, DesignApplication& application) {
    OpenObject object;
    object.design = &form;
    object.application = &application;
    return object;
}

SectionHeights Heights(std::vector<std::pair<int, int>> sections) {
    SectionHeights heights;
    for (const auto& [section, pixels] : sections) {
        heights.present[static_cast<std::size_t>(section)] = true;
        heights.pixels[static_cast<std::size_t>(section)] = pixels;
    }
    return heights;
}

} // namespace

TEST(Layout, RoundsTiesToTheEvenNeighbour) {
    EXPECT_EQ(RoundToEven(2.5), 2);
    EXPECT_EQ(RoundToEven(3.5), 4);
    EXPECT_EQ(RoundToEven(-2.5), -2);
    EXPECT_EQ(RoundToEven(-0.6), -1);
    EXPECT_EQ(RoundToEven(7.49), 7);
    EXPECT_EQ(RoundToEven(1e300), 0) << "a damaged number is no position";
}

TEST(Layout, FrameFollowsViewAndBorderStyle) {
    struct Case {
        View view;
        int borderStyle;
        bool selectors, ruler;
        int offsetX, offsetY, bar, selector;
    };
    for (const auto& it :
         {Case{View::Design, 0, true, false, 8, 25, 18, 0}, Case{View::Form, 0, false, false, 0, 0, 0, 0},
          Case{View::Form, 1, false, false, 0, 21, 0, 0}, Case{View::Form, 2, true, false, 8, 25, 0, 17},
          Case{View::Form, 3, true, false, 0, 21, 0, 17}, Case{View::Form, 9, false, false, 8, 25, 0, 0},
          Case{View::Datasheet, 3, true, false, 8, 25, 18, 0},
          Case{View::Design, 2, false, true, 25, 47, 18, 0}}) {
        const auto frame = ComputeFrame(kMetrics, {it.view, it.borderStyle, it.selectors, it.ruler});
        EXPECT_EQ(frame.ClientOffsetX(), it.offsetX) << it.borderStyle;
        EXPECT_EQ(frame.ClientOffsetY(), it.offsetY) << it.borderStyle;
        EXPECT_EQ(frame.sectionBarHeight, it.bar) << it.borderStyle;
        EXPECT_EQ(frame.recordSelectorWidth, it.selector) << it.borderStyle;
    }
}

TEST(Layout, SectionsStandBelowTheOnesAbove) {
    const auto all = Heights({{1, 10}, {3, 20}, {0, 100}, {4, 30}, {2, 5}});
    EXPECT_EQ(SectionOffsetY(all, 18, 1), 0);
    EXPECT_EQ(SectionOffsetY(all, 18, 3), 28);
    EXPECT_EQ(SectionOffsetY(all, 18, 0), 66);
    EXPECT_EQ(SectionOffsetY(all, 18, 4), 184);
    EXPECT_EQ(SectionOffsetY(all, 18, 2), 232);
    const auto plain = Heights({{1, 10}, {0, 100}, {2, 5}});
    EXPECT_EQ(SectionOffsetY(plain, 0, 0), 10);
    EXPECT_EQ(SectionOffsetY(plain, 18, 2), 28 + 118);
    EXPECT_EQ(SectionOffsetY(Heights({{0, 100}}), 18, 0), 0);
}

TEST(Layout, ControlsRoundTheirSumsOnce) {
    const auto frame = ComputeFrame(kMetrics, {View::Form, 2, true, false});
    // 52 twips are 3.47 pixels, 67.5 twips 4.5.
    EXPECT_EQ(ControlRectangle(kMetrics, frame, 10, 52, 67.5, 150, 307.5), (Rectangle{20, 14, 30, 34}));
    const auto design = ComputeFrame(kMetrics, {View::Design, 2, true, false});
    EXPECT_EQ(ControlRectangle(kMetrics, design, 28, 0, 0, 15, 15), (Rectangle{0, 46, 1, 47}));
}

TEST(Layout, TabsStandInOneRow) {
    TabInput input;
    input.controlLeft = 100;
    input.controlTop = 50;
    input.captions = {"One", "Three", "Äö"};
    // A caption of 3 letters in 8 points: 167 * 3 * 0.75 / 15 = 25.05 pixels.
    EXPECT_EQ(TabRectangle(kMetrics, input, 0), (Rectangle{100, 50, 125, 69}));
    EXPECT_EQ(TabRectangle(kMetrics, input, 1), (Rectangle{125, 50, 167, 69}));
    EXPECT_EQ(TabRectangle(kMetrics, input, 2), (Rectangle{167, 50, 184, 69})) << "letters count, not bytes";
    input.fontWeight = 600;
    EXPECT_EQ(TabRectangle(kMetrics, input, 0).Width(), 29);
    input.fixedWidth = 1500;
    input.fixedHeight = 300;
    EXPECT_EQ(TabRectangle(kMetrics, input, 2), (Rectangle{300, 50, 400, 70}));
    EXPECT_EQ(TabRectangle(kMetrics, input, 3), Rectangle{});
}

TEST(Layout, HiddenAndPageSectionsTakeNoRoomInAForm) {
    DesignApplication application;
    const auto& form = application.AddForm("F", R"(Begin Form
    DefaultView =0
    Begin
        Begin FormHeader
            Visible = NotDefault
            Height =300
        End
        Begin PageHeader
            Height =150
        End
        Begin Section
            Height =1500
        End
        Begin PageFooter
            Height =150
        End
        Begin FormFooter
            DisplayWhen =1
            Height =450
        End
    End
End
)");
    auto object = OpenedForm(form, application);
    EXPECT_EQ(object.Sections(kMetrics).present, (std::array<bool, 5>{true, false, false, false, false}));
    object.view = View::Design;
    EXPECT_EQ(object.Sections(kMetrics).pixels, (std::array<int, 5>{100, 20, 30, 10, 10}));
}

TEST(Layout, AContinuousFormCountsItsRecords) {
    DesignApplication application;
    const auto& form = application.AddForm("F", R"(Begin Form
    NavigationButtons = NotDefault
    DefaultView =1
    RecordSource ="Orders"
    Begin
        Begin Section
            Height =310
        End
    End
End
)");
    auto object = OpenedForm(form, application);
    EXPECT_EQ(object.ShownRecords(kMetrics), 6);
    object.insideHeight = 100;
    EXPECT_EQ(object.ShownRecords(kMetrics), 4);
    EXPECT_EQ(object.Sections(kMetrics).pixels[0], 83)
        << "records of 20.67 pixels don't add up rounding errors";
    object.view = View::Design;
    EXPECT_EQ(object.Sections(kMetrics).pixels[0], 21);
}

TEST(Layout, DatasheetColumnsFollowTheirOrder) {
    DesignApplication application;
    const auto& form = application.AddForm("F", R"(Begin Form
    DefaultView =2
    Begin
        Begin Section
            Height =900
            Begin
                Begin TextBox
                    ColumnWidth =3000
                    ColumnOrder =2
                    Name ="Second"
                End
                Begin CommandButton
                    Name ="NoColumn"
                End
                Begin ComboBox
                    ColumnOrder =1
                    Name ="First"
                End
                Begin TextBox
                    ColumnHidden = NotDefault
                    ColumnOrder =3
                    Name ="Hidden"
                End
            End
        End
    End
End
)");
    const auto columns = DatasheetColumns(form);
    ASSERT_EQ(columns.size(), 3U);
    EXPECT_EQ(columns[0]->name, "First");
    EXPECT_EQ(columns[1]->name, "Second");
    EXPECT_EQ(DatasheetColumnWidth(*columns[0]), 1440);
    EXPECT_EQ(DatasheetColumnWidth(*columns[1]), 3000);
    EXPECT_EQ(DatasheetColumnWidth(*columns[2]), 0);
}

} // namespace tovimar::test
