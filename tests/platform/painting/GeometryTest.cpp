#include "platform/painting/PaintingTest.h"
#include "support/Boxes.h"

#include <filesystem>
#include <fstream>
#include <sstream>

/// Every control of whole applications is painted where its hot spot is looked for.
namespace tovimar::test {

using namespace platform;
using namespace platform::access;

namespace {

namespace fs = std::filesystem;

using Made = std::unique_ptr<DesignObject>;

/// Every control of a design as a plain box in a colour of its own, tab pages but the first left out.
class Boxes {
public:
    explicit Boxes(Design& design) {
        for (auto& section : design.root->children)
            if (section->Find("Height") != nullptr || !section->children.empty())
                BoxChildren(*section);
    }

    static std::uint32_t ColorOf(const DesignObject& box) { return BoxColor(box.Integer("Number")); }

private:
    void BoxChildren(DesignObject& parent) {
        std::vector<Made> boxes;
        for (auto& child : parent.children)
            boxes.push_back(BoxOf(std::move(child), parent));
        parent.children = std::move(boxes);
    }

    Made BoxOf(Made control, DesignObject& parent) {
        auto box = std::make_unique<DesignObject>();
        box->type = "Rectangle";
        box->name = control->name;
        box->parent = &parent;
        for (const auto* property : {"Left", "Top", "Width", "Height"})
            Set(*box, property, control->Integer(property));
        Set(*box, "OldBorderStyle", 0);
        Set(*box, "Number", ++made_);
        Set(*box, "BackColor", BoxOleColor(made_));
        if (control->Is("Tab") && !control->children.empty())
            box->children = std::move(control->children.front()->children);
        else if (!control->Is("Tab"))
            box->children = std::move(control->children);
        BoxChildren(*box);
        return box;
    }

    static void Set(DesignObject& box, const char* property, int value) {
        box.properties.emplace_back(property,
                                    PropertyValue{PropertyValue::Form::Number, std::to_string(value)});
    }

    int made_ = 0;
};

/// The areas of an object filled as an image map has them: a later control covers an earlier one.
class Areas {
public:
    Areas(const OpenedWindow& window, const Rectangle& picture)
        : window_(window), width_(picture.Width()), height_(picture.Height()),
          colors_(static_cast<std::size_t>(width_) * static_cast<std::size_t>(height_)) {
        const auto& metrics = window.windows.Metrics();
        const auto heights = window.object.Sections(metrics);
        const auto frame = ComputeFrame(metrics, window.object.FrameSettings());
        for (const auto& section : window.object.design->Sections()) {
            const auto at = static_cast<std::size_t>(section.number);
            const bool shown = at < 5 ? heights.present[at] : heights.groups.count(section.number) > 0;
            if (!shown)
                continue;
            const int top = frame.ClientOffsetY() + frame.sectionBarHeight +
                            SectionOffsetY(heights, frame.sectionBarHeight, section.number);
            const int pixels = RoundToEven(section.object->Integer("Height") / 15.0);
            Add(*section.object, section.number, {0, top, width_, top + pixels});
        }
    }

    std::uint32_t At(int x, int y) const {
        return colors_[static_cast<std::size_t>(y) * static_cast<std::size_t>(width_) +
                       static_cast<std::size_t>(x)];
    }
    int outside = 0; ///< areas of controls within their section that leave the picture

private:
    void Add(const DesignObject& parent, int number, const Rectangle& clip) {
        for (const auto& control : parent.children) {
            const auto place = window_.PlaceOf(*control, number);
            const bool within =
                place.bottom <= clip.bottom && control->Integer("Left") + control->Integer("Width") <=
                                                   window_.object.design->root->Integer("Width");
            outside += within && (place.left < 0 || place.right > width_ || place.bottom > height_) ? 1 : 0;
            for (int y = std::max({0, place.top, clip.top});
                 y < std::min({place.bottom, clip.bottom, height_}); ++y)
                for (int x = std::max(0, place.left); x < std::min(place.right, width_); ++x)
                    colors_[static_cast<std::size_t>(y) * static_cast<std::size_t>(width_) +
                            static_cast<std::size_t>(x)] = Boxes::ColorOf(*control);
            Add(*control, number, clip);
        }
    }

    const OpenedWindow& window_;
    int width_, height_;
    std::vector<std::uint32_t> colors_;
};

void ExpectAreasPainted(const Design& design, View view) {
    OpenedWindow window(design, nullptr, view);
    const auto picture = window.Picture();
    const Areas areas(window, {0, 0, picture.width, picture.height});
    EXPECT_EQ(areas.outside, 0) << design.name;
    const auto frame = ComputeFrame(window.windows.Metrics(), window.object.FrameSettings());
    const auto client = window.windows.Find(window.object.window)->client;
    const int edge = client.left + RoundToEven(design.root->Integer("Width") / 15.0);
    int wrong = 0, compared = 0;
    std::string first;
    for (int y = client.top; y < client.bottom; ++y)
        for (int x = client.left + frame.recordSelectorWidth; x < client.right; ++x) {
            const auto expected = areas.At(x, y);
            // The line at the surface's edge and scroll bars lie over what a design pushes below them; a thin
            // border takes the outermost pixels.
            const bool border = x == 0 || x == picture.width - 1 || y == picture.height - 1;
            if (expected == 0 || x >= edge || border)
                continue;
            const auto painted =
                picture.pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                               static_cast<std::size_t>(x)];
            ++compared;
            if (painted != expected && wrong++ == 0)
                first = std::to_string(x) + ", " + std::to_string(y);
        }
    EXPECT_EQ(wrong, 0) << design.name << " in view " << static_cast<int>(view) << ", of " << compared
                        << ", first at " << first;
}

/// Designs without dividing lines, which would cross the controls that they touch.
std::unique_ptr<Design> BoxedDesign(const fs::path& path, ObjectKind kind) {
    std::ifstream file(path, std::ios::binary);
    std::stringstream bytes;
    bytes << file.rdbuf();
    auto design = ReadDesign(DecodeExportText(bytes.str()), kind, path.stem().string(), path.string());
    if (!design || !design->root)
        return nullptr;
    std::erase_if(design->root->properties,
                  [](const auto& property) { return property.first == "DividingLines"; });
    design->root->properties.emplace_back("DividingLines", PropertyValue{PropertyValue::Form::Number, "0"});
    Boxes boxed(*design);
    return design;
}

} // namespace

class GeometryTest : public ::testing::TestWithParam<std::string> {};

TEST_P(GeometryTest, EveryControlIsPaintedInItsArea) {
    const fs::path folder = std::string(TOVIMAR_SOURCE_DIR) + "/" + GetParam();
    if (!fs::exists(folder))
        GTEST_SKIP() << "the corpus is not beside the sources";
    int seen = 0;
    for (const auto* kind : {"forms", "reports"}) {
        const bool forms = std::string_view(kind) == "forms";
        for (const auto& entry : fs::directory_iterator(folder / kind)) {
            const auto extension = entry.path().extension();
            if (extension != ".form" && extension != ".report" && extension != ".bas")
                continue;
            const auto design = BoxedDesign(entry.path(), forms ? ObjectKind::Form : ObjectKind::Report);
            ASSERT_TRUE(design) << entry.path();
            ++seen;
            if (forms)
                ExpectAreasPainted(*design, View::Form);
            ExpectAreasPainted(*design, View::Design);
        }
    }
    EXPECT_GT(seen, 4);
}

INSTANTIATE_TEST_SUITE_P(Applications, GeometryTest,
                         ::testing::Values("samples/orchard", "../shared/corpus/sports-admin",
                                           "../shared/corpus/vcs-testing"));

TEST(Geometry, APreviewTellsWhereItPrintsASection) {
    const auto report =
        ReadDesign("Begin Report\nWidth =6000\nBegin\nBegin BreakLevel\nControlSource =\"A\"\nEnd\n"
                   "Begin PageHeader\nHeight =600\nBegin\nBegin Label\nLeft =150\nTop =75\nWidth =900\nName "
                   "=\"H\"\nEnd\nEnd\nEnd\n"
                   "Begin BreakHeader\nHeight =450\nBegin\nBegin Label\nLeft =300\nTop =90\nWidth =900\nName "
                   "=\"G\"\nEnd\nEnd\nEnd\n"
                   "Begin Section\nHeight =300\nBegin\nBegin TextBox\nLeft =450\nTop =15\nWidth =900\nName "
                   "=\"D\"\nEnd\nEnd\nEnd\n"
                   "End\nEnd\n",
                   ObjectKind::Report, "R", "R.txt");
    Boxes boxed(*report);
    OpenedWindow window(*report, nullptr, View::Preview);
    const auto picture = window.Picture();
    for (const auto& section : report->Sections())
        for (const auto& control : section.object->children) {
            const auto place = window.PlaceOf(*control, section.number);
            const auto at = [&](int x, int y) {
                return picture.pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                                      static_cast<std::size_t>(x)];
            };
            EXPECT_EQ(at(place.left, place.top), Boxes::ColorOf(*control)) << control->name;
            EXPECT_EQ(at(place.right - 1, place.bottom - 1), Boxes::ColorOf(*control)) << control->name;
            EXPECT_NE(at(place.left - 1, place.top), Boxes::ColorOf(*control)) << control->name;
            EXPECT_NE(at(place.left, place.top - 1), Boxes::ColorOf(*control)) << control->name;
        }
}

TEST(Geometry, FramesBarsSelectorsAndGroupsMoveAreasAndControlsAlike) {
    for (const int border : {0, 1, 2, 3})
        for (const bool selectors : {true, false}) {
            const auto design =
                ReadDesign("Begin Form\nDefaultView =0\nWidth =4000\nBorderStyle =" + std::to_string(border) +
                               "\nRecordSelectors =" + (selectors ? "-1" : "0") +
                               "\nBegin\nBegin FormHeader\nHeight =307\nBegin\nBegin Label\nLeft =22\nTop "
                               "=37\nWidth =353\nHeight =128\nName =\"A\"\n"
                               "End\nEnd\nEnd\nBegin Section\nHeight =1003\nBegin\nBegin OptionGroup\nLeft "
                               "=52\nTop =68\nWidth =1500\nHeight "
                               "=607\nName =\"G\"\nBegin\nBegin OptionButton\nLeft =98\nTop =203\nName "
                               "=\"O\"\nEnd\nEnd\nEnd\nEnd\nEnd\nEnd\nEnd\n",
                           ObjectKind::Form, "F", "F.txt");
            Boxes boxed(*design);
            ExpectAreasPainted(*design, View::Form);
            ExpectAreasPainted(*design, View::Design);
        }
    const auto heights = [] {
        SectionHeights all;
        all.present = {true, false, false, true, true};
        all.pixels = {100, 0, 0, 20, 10};
        all.groups = {{5, 30}, {6, 7}, {7, 40}, {8, 9}};
        return all;
    }();
    const std::map<int, int> offsets = {{3, 0},   {5, 30},  {7, 70},  {0, 120},
                                        {8, 230}, {6, 249}, {4, 266}, {9, 0}};
    for (const auto& [section, offset] : offsets)
        EXPECT_EQ(SectionOffsetY(heights, 10, section), offset) << section;
}

} // namespace tovimar::test
