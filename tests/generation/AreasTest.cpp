#include "foundation/CAddInProject.h"
#include "foundation/CAddInProjects.h"
#include "foundation/Session.h"
#include "generation/CTovimar.h"
#include "generation/RunProgress.h"
#include "host/contract/ObjectTypes.h"
#include "host/server/CTovimarClient.h"
#include "host/server/CTovimarServerAgent.h"
#include "host/server/CTovimarServerData.h"
#include "platform/Environment.h"
#include "platform/access/AccessApplication.h"
#include "platform/access/ExportReader.h"
#include "platform/text/Text.h"
#include "screenshots/Screenshot.h"
#include "support/BoxedPicture.h"
#include "support/FakeEnvironment.h"
#include "support/Tags.h"
#include "topics/CFormHtmlTemplates.h"
#include "uimodel/CXmlForm.h"

#include <filesystem>
#include <fstream>
#include <map>
#include <regex>
#include <set>
#include <sstream>
#include <tuple>

/// Every area of every picture of a topic lies where the picture shows its control: real applications go the
/// whole way from the host to the page, their controls painted as boxes.
namespace tovimar::test {
namespace {

namespace fs = std::filesystem;
using platform::access::ObjectKind;

enum class Shown { Design, Normal };

class AreasTest : public EnvironmentTest {
protected:
    void AddForm(const std::string& name, const std::string& exportText) {
        const auto design = platform::access::ReadDesign(platform::access::DecodeExportText(exportText),
                                                         ObjectKind::Form, name, name);
        const std::string text = design ? exports_.Write(*design) : std::string();
        ASSERT_FALSE(text.empty()) << name;
        WriteFile("app\\forms\\" + name + ".form", text);
    }

    void Connect(Shown shown) {
        ASSERT_EQ(client_.Connect(platform::access::OpenAccessApplication(NativeFolder() + "/app")),
                  kSuccess);
        Session::SetProjects(&projects_);
        projects_.Init(Path("projects.xml"));
        auto project = std::make_unique<CAddInProject>();
        project->Name = project->FileName = "Areas";
        project->Folder = Path("help\\");
        projects_.SetCurrentProject(std::move(project));
        environment->files->MakeFolders(Path("help\\images\\"));
        auto& parameters = RunData().Generator().Parameters();
        parameters.SetFolderForGeneratedHelp(Path("help\\"));
        parameters.SetHelpProjectName("Areas");
        parameters.ImagesFormat = 1;
        parameters.HotSpots = true;
        // What a hidden section holds isn't to be seen.
        parameters.SkipInvisibleControls = true;
        parameters.MakeNormalViewScreenshots = shown == Shown::Normal;
        normal_ = shown == Shown::Normal;
    }

    /// Definition, pictures and page of a form as a run makes them, each map held against its picture.
    void ExpectAreas(const std::string& name) {
        auto& host = *Session::ServerAgent();
        const std::string picture = Path("help\\images\\Areas.bmp");
        const auto form = RunData().Generator().CreateNormalizedXmlDef(
            ObjectType::kForm, name, 0, /*vfInDesignView=*/true, /*vfReplaceHtml=*/false, 0, picture,
            Path("help\\Areas.htm"), /*vfPreviewAreaOnly=*/false, {}, /*vfKeepOpened=*/true);
        const auto window = host.ActivateComponent(ObjectType::kForm, name, /*forceOpenInDesignView=*/false,
                                                   /*forceOpenAsHidden=*/false);
        ASSERT_EQ(Screenshot().LocateObjectsAndTakeScreenshots("bmp", window, *form), kSuccess);
        const std::string page = CFormHtmlTemplates().FileTemplate(
            *form, /*vfMainImage=*/true, /*vfControlsMap=*/true, /*vfMenusList=*/false, /*vfMenus=*/false,
            /*vfControlsList=*/false, /*vfControls=*/true, {}, {}, /*vfUseLocalImagePath=*/false, {}, {});
        host.CloseComponent(ObjectType::kForm, name, /*saveComponentFlag=*/false);
        ExpectPicturesOf(name, TagsOf(page));
    }

    void ExpectPicturesOf(const std::string& form, const std::vector<Tag>& tags) {
        std::map<std::string, std::vector<Spot>> maps;
        std::string map;
        for (const Tag& tag : tags)
            if (tag.name == "map")
                maps[map = tag.Attribute("name")];
            else if (tag.name == "area")
                maps[map].push_back(SpotOf(tag));
            else if (tag.name == "img")
                ExpectPicture(form, tag, maps[tag.Attribute("usemap").substr(1)]);
    }

    void ExpectPicture(const std::string& form, const Tag& image, const std::vector<Spot>& spots) {
        const std::string path = Path("help\\" + image.Attribute("src"));
        auto picture = platform::DecodeImage(ReadFile(path));
        ASSERT_TRUE(picture) << form << " " << path;
        const int container = NumberIn(image.Attribute("usemap")).first;
        areas += static_cast<int>(spots.size());
        ++pictures;
        for (const std::string& fault :
             BoxedPicture(exports_, std::move(*picture), spots, container, normal_).Faults())
            ADD_FAILURE() << form << (normal_ ? " in form view, " : " in design view, ")
                          << image.Attribute("usemap") << ": " << fault;
    }

    /// Number of the box that a name ends with, and of the tab or -1. A number behind the "x" makes a name
    /// unique.
    static std::pair<int, int> NumberIn(const std::string& name) {
        static const std::regex number("_c(\\d+)x\\d*(?:_(\\d+))?$");
        std::smatch found;
        if (!std::regex_search(name, found, number))
            return {0, -1};
        return {std::stoi(found[1]), found[2].matched ? std::stoi(found[2]) : -1};
    }

    static Spot SpotOf(const Tag& area) {
        Spot spot;
        std::istringstream numbers(text::ReplaceAll(area.Attribute("coords"), ",", " "));
        numbers >> spot.place.left >> spot.place.top >> spot.place.right >> spot.place.bottom;
        std::tie(spot.number, spot.tab) = NumberIn(area.Attribute("href"));
        EXPECT_NE(spot.number, 0) << area.Attribute("href");
        return spot;
    }

    int areas = 0, pictures = 0;

private:
    CTovimarClient client_;
    CAddInProjects projects_;
    BoxedExports exports_;
    bool normal_ = false;
};

class ApplicationAreasTest : public AreasTest,
                             public ::testing::WithParamInterface<std::tuple<const char*, Shown>> {};

TEST_P(ApplicationAreasTest, LieOnTheirControls) {
    const fs::path folder = SourceFolder() + std::get<0>(GetParam());
    if (!fs::exists(folder))
        GTEST_SKIP() << "the corpus is not beside the sources";
    std::set<std::string> names;
    for (const auto& entry : fs::directory_iterator(folder / "forms"))
        if (entry.path().extension() == ".form" || entry.path().extension() == ".bas") {
            std::ifstream file(entry.path(), std::ios::binary);
            std::stringstream bytes;
            bytes << file.rdbuf();
            AddForm(entry.path().stem().string(), bytes.str());
            names.insert(entry.path().stem().string());
        }
    Connect(std::get<1>(GetParam()));
    for (const std::string& name : names)
        ExpectAreas(name);
    EXPECT_GT(areas, 10);
    for (const auto& box : boxes->shown)
        ADD_FAILURE() << box.text;
}

INSTANTIATE_TEST_SUITE_P(Applications, ApplicationAreasTest,
                         ::testing::Combine(::testing::Values("samples/orchard",
                                                              "../shared/corpus/sports-admin",
                                                              "../shared/corpus/vcs-testing"),
                                            ::testing::Values(Shown::Design, Shown::Normal)));

/// Blocks of an export.
std::string Block(const std::string& type, const std::string& lines, const std::string& inner = {}) {
    return "Begin " + type + "\n" + lines + (inner.empty() ? "" : "Begin\n" + inner + "End\n") + "End\n";
}
std::string Placed(int left, int top, int width, int height) {
    return "Left =" + std::to_string(left) + "\nTop =" + std::to_string(top) +
           "\nWidth =" + std::to_string(width) + "\nHeight =" + std::to_string(height) + "\n";
}
std::string TextBox(int left, int top) {
    return Block("TextBox", Placed(left, top, 907, 233));
}
std::string Pages(int count, const std::string& caption) {
    std::string pages;
    for (int i = 0; i < count; ++i)
        pages += Block("Page", "Caption =\"" + caption + std::to_string(i) + "\"\n",
                       TextBox(300 + 97 * i, 900) + Block("OptionGroup", Placed(301, 1253, 1500, 700),
                                                          Block("CheckBox", Placed(377, 1402, 260, 240))));
    return pages;
}
/// `lines` of the form, `header` and `detail` controls.
std::string Form(const std::string& lines, const std::string& detail, const std::string& header = {}) {
    return Block("Form", "Width =6007\n" + lines,
                 (header.empty() ? "" : Block("FormHeader", "Height =607\n", header)) +
                     Block("Section", "Height =3311\n", detail) +
                     (header.empty() ? "" : Block("FormFooter", "Height =403\n", header)));
}

class DesignAreasTest : public AreasTest, public ::testing::WithParamInterface<Shown> {
protected:
    void ExpectAreasOfAll() {
        Connect(GetParam());
        for (const std::string& name : names_)
            ExpectAreas(name);
        EXPECT_GT(areas, 0);
    }
    void Add(const std::string& name, const std::string& exportText) {
        AddForm(name, exportText);
        names_.push_back(name);
    }

private:
    std::vector<std::string> names_;
};

TEST_P(DesignAreasTest, OfTabsInRowsOfFixedAndNaturalWidth) {
    const std::string place = Placed(97, 68, 5203, 2993);
    Add("Rows", Form({}, Block("Tab", place + "MultiRow = NotDefault\n", Pages(14, "Long caption "))));
    Add("Fixed", Form({}, Block("Tab", place + "TabFixedWidth =1111\nTabFixedHeight =397\n", Pages(3, "P"))));
    Add("Beyond", Form("AutoResize =0\nRight =3000\n",
                       Block("Tab", place + "FontSize =12\nFontWeight =700\n", Pages(6, "A wide page "))));
    Add("Buttons", Form("BorderStyle =0\n", Block("Tab", place + "Style =1\n", Pages(2, "B"))));
    ExpectAreasOfAll();
}

TEST_P(DesignAreasTest, OfTabsWithHiddenPages) {
    const std::string hidden =
        Block("Page", "Visible = NotDefault\nCaption =\"Hidden\"\n", TextBox(202, 1900));
    const std::string place = Placed(97, 68, 5203, 2993);
    Add("First", Form({}, Block("Tab", place, hidden + Pages(2, "P"))));
    Add("Second", Form({}, Block("Tab", place, Pages(1, "P") + hidden + Pages(1, "Q"))));
    Add("Last", Form({}, Block("Tab", place, Pages(2, "P") + hidden)));
    ExpectAreasOfAll();
}

TEST_P(DesignAreasTest, OfFramesWithinFrames) {
    const std::string group =
        Block("OptionGroup", Placed(203, 307, 1407, 802), Block("OptionButton", Placed(301, 400, 260, 240)));
    AddForm("Inmost", Form("DefaultView =1\nRecordSelectors =-1\n", TextBox(53, 52) + TextBox(2900, 52),
                           TextBox(22, 37)));
    AddForm("Sheet", Form("DefaultView =2\n", Block("TextBox", "ColumnOrder =2\nColumnWidth =1007\n") +
                                                  Block("TextBox", "ColumnOrder =1\nColumnWidth =652\n") +
                                                  Block("ComboBox", "ColumnHidden = NotDefault\n")));
    AddForm("Middle",
            Form("DefaultView =0\nRecordSelectors =-1\n",
                 group + Block("Subform", Placed(1700, 203, 3507, 1507) + "SourceObject =\"Inmost\"\n") +
                     TextBox(103, 2900),
                 TextBox(31, 67)));
    for (const char* inner : {"Middle", "Sheet", "Inmost"})
        Add(std::string("Around ") + inner,
            Form({}, TextBox(52, 52) + Block("Subform", Placed(157, 397, 5302, 2802) +
                                                            "SourceObject =\"Form." + inner + "\"\n")));
    ExpectAreasOfAll();
}

TEST_P(DesignAreasTest, OfEveryBorderWithBarsAndSelectors) {
    for (const int border : {0, 1, 2, 3})
        for (const char* selectors : {"-1", "0"})
            for (const char* view : {"0", "1"})
                Add("Border " + std::to_string(border) + selectors + view,
                    Form("BorderStyle =" + std::to_string(border) + "\nDefaultView =" + view +
                             "\nRecordSelectors =" + selectors + "\nNavigationButtons =" + selectors + "\n",
                         TextBox(0, 0) + TextBox(5100, 3078), TextBox(22, 37)));
    ExpectAreasOfAll();
}

TEST_P(DesignAreasTest, OfADatasheet) {
    Add("Sheet", Form("DefaultView =2\nRecordSelectors =0\n",
                      Block("TextBox", "ColumnOrder =3\nColumnWidth =2502\n") +
                          Block("ComboBox", "ColumnOrder =1\nColumnWidth =-1\n") +
                          Block("CheckBox", "ColumnOrder =2\nColumnWidth =607\n"),
                      TextBox(22, 37)));
    ExpectAreasOfAll();
}

INSTANTIATE_TEST_SUITE_P(Views, DesignAreasTest, ::testing::Values(Shown::Design, Shown::Normal));

} // namespace
} // namespace tovimar::test
