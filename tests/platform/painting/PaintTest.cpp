#include "platform/painting/PaintingTest.h"

#include "platform/imaging/Image.h"
#include "platform/painting/SampleData.h"

#include <filesystem>
#include <fstream>
#include <sstream>

namespace tovimar::test {

using namespace platform;
using namespace platform::access;

namespace {

constexpr std::uint32_t kRed = 0xFF0000, kBlue = 0x0000FF;

/// A borderless box of one colour, which stands for a control.
std::string Box(const std::string& name, int left, int top, const std::string& more = "BackColor =255") {
    return "Begin Rectangle\n OldBorderStyle =0\n BackStyle =1\n Width =300\n Height =240\n Left =" +
           std::to_string(left) + "\n Top =" + std::to_string(top) + "\n Name =\"" + name + "\"\n " + more +
           "\nEnd\n";
}

std::string Section(const std::string& type, int height, const std::string& controls) {
    return "Begin " + type + "\nHeight =" + std::to_string(height) + "\nBackColor =16777215\nBegin\n" +
           controls + "End\nEnd\n";
}

std::string Form(const std::string& properties, const std::string& sections) {
    return "Begin Form\nWidth =6000\n" + properties + "Begin\n" + sections + "End\nEnd\n";
}

/// The place is filled with the colour to its last pixel, and the pixels round it aren't.
void ExpectExactly(OpenedWindow& window, const Rectangle& place, std::uint32_t color) {
    EXPECT_EQ(window.Pixel(place.left, place.top), color);
    EXPECT_EQ(window.Pixel(place.right - 1, place.bottom - 1), color);
    EXPECT_NE(window.Pixel(place.left - 1, place.top), color);
    EXPECT_NE(window.Pixel(place.left, place.top - 1), color);
    EXPECT_NE(window.Pixel(place.right, place.bottom - 1), color);
    EXPECT_NE(window.Pixel(place.right - 1, place.bottom), color);
}

} // namespace

TEST(Paint, ControlsLieWhereTheHotSpotsLookForThem) {
    DesignApplication application;
    const auto sections = Section("FormHeader", 472, Box("InHeader", 157, 100)) +
                          Section("Section", 1000, Box("InDetail", 52, 67)) +
                          Section("FormFooter", 500, Box("InFooter", 3001, 50));
    const auto& single = application.AddForm("Single", Form("DefaultView =0\n", sections));
    const auto& continuous = application.AddForm("Many", Form("DefaultView =1\nBorderStyle =3\n", sections));
    for (const auto* form : {&single, &continuous})
        for (const auto view : {View::Form, View::Design}) {
            OpenedWindow window(*form, &application, view);
            for (const auto* name : {"InHeader", "InDetail", "InFooter"}) {
                SCOPED_TRACE(form->name + " " + name);
                ExpectExactly(window, window.PlaceOf(name), kRed);
            }
        }
}

TEST(Paint, EveryRecordOfAContinuousFormIsPainted) {
    DesignApplication application;
    const auto& form =
        application.AddForm("F", Form("DefaultView =1\n", Section("Section", 600, Box("Mark", 300, 150))));
    OpenedWindow window(form, &application, View::Form);
    auto place = window.PlaceOf("Mark");
    for (int row = 0; row < window.object.ShownRecords(window.windows.Metrics());
         ++row, place.top += 40, place.bottom += 40)
        ExpectExactly(window, place, kRed);
}

TEST(Paint, HiddenControlsAreSeenInDesignViewOnly) {
    DesignApplication application;
    const auto& form = application.AddForm(
        "F", Form("DefaultView =0\n",
                  Section("Section", 1500, Box("Mark", 900, 150, "BackColor =255\n Visible = NotDefault"))));
    OpenedWindow shown(form, &application, View::Design), hidden(form, &application, View::Form);
    const auto there = shown.PlaceOf("Mark"), gone = hidden.PlaceOf("Mark");
    EXPECT_EQ(shown.Pixel(there.left, there.top), kRed);
    EXPECT_EQ(hidden.Pixel(gone.left, gone.top), 0xFFFFFFU);
}

TEST(Paint, LaterControlsCoverEarlierOnes) {
    DesignApplication application;
    const auto& form = application.AddForm(
        "F", Form("DefaultView =0\n",
                  Section("Section", 1500,
                          Box("Below", 900, 150) + Box("Above", 900, 150, "BackColor =16711680"))));
    OpenedWindow window(form, &application, View::Form);
    ExpectExactly(window, window.PlaceOf("Above"), kBlue);
}

TEST(Paint, ATabControlShowsItsCurrentPage) {
    DesignApplication application;
    const auto page = [](const std::string& name, const std::string& controls) {
        return "Begin Page\nLeft =300\nTop =500\nWidth =3000\nHeight =1000\nName =\"" + name + "\"\nBegin\n" +
               controls + "End\nEnd\n";
    };
    const auto& form = application.AddForm(
        "F",
        Form("DefaultView =0\n",
             Section("Section", 2500,
                     "Begin Tab\nLeft =300\nTop =150\nWidth =4000\nHeight =2000\nName =\"Tabs\"\nBegin\n" +
                         page("A", Box("OnA", 600, 900)) +
                         page("B", Box("OnB", 1500, 900, "BackColor =16711680")) + "End\nEnd\n")));
    OpenedWindow window(form, &application, View::Form);
    ExpectExactly(window, window.PlaceOf("OnA"), kRed);
    const auto other = window.PlaceOf("OnB");
    EXPECT_NE(window.Pixel(other.left, other.top), kBlue);

    // The picture follows the page without being told.
    window.object.currentPages[OpenedWindow::Find(*form.Section(0), "Tabs")] = 1;
    ExpectExactly(window, other, kBlue);
}

TEST(Paint, ASubformIsPaintedInsideItsFrame) {
    DesignApplication application;
    application.AddForm("Inner", Form("DefaultView =0\n", Section("Section", 1000, Box("Mark", 450, 300))));
    const auto frame = [](const std::string& source) {
        return "Begin Subform\nOldBorderStyle =0\nLeft =600\nTop =450\nWidth =3000\nHeight =1500\nName "
               "=\"Sub\"\nSourceObject =\"" +
               source + "\"\nEnd\n";
    };
    const auto& outer =
        application.AddForm("Outer", Form("DefaultView =0\n", Section("Section", 2500, frame("Form.Inner"))));
    OpenedWindow window(outer, &application, View::Form);
    const auto sub = window.PlaceOf("Sub");
    // Record selector, then the control's own place.
    ExpectExactly(window, {sub.left + 17 + 30, sub.top + 20, sub.left + 17 + 50, sub.top + 36}, kRed);

    const auto& itself =
        application.AddForm("Itself", Form("DefaultView =0\n", Section("Section", 2500, frame("Itself"))));
    EXPECT_FALSE(OpenedWindow(itself, &application, View::Form).Picture().Empty())
        << "a form within itself ends";
    const auto& missing =
        application.AddForm("Missing", Form("", Section("Section", 2500, frame("Nowhere"))));
    EXPECT_FALSE(OpenedWindow(missing, &application, View::Form).Picture().Empty());
}

TEST(Paint, ThemeColoursTakeTintAndShade) {
    DesignApplication application;
    application.theme = {0x000000, 0xFFFFFF, 0x111111, 0x222222, 0x4080C0};
    const auto& form = application.AddForm(
        "F", Form("DefaultView =0\n",
                  Section("Section", 1500,
                          Box("Plain", 300, 150, "BackThemeColorIndex =4") +
                              Box("Tinted", 900, 150, "BackThemeColorIndex =4\n BackTint =50.0") +
                              Box("Shaded", 1500, 150, "BackThemeColorIndex =4\n BackShade =50.0") +
                              Box("System", 2100, 150, "BackColor =-2147483633"))));
    OpenedWindow window(form, &application, View::Form);
    const std::map<std::string, std::uint32_t> colors{
        {"Plain", 0x4080C0}, {"Tinted", 0xA0C0E0}, {"Shaded", 0x204060}, {"System", 0xF0F0F0}};
    for (const auto& [name, color] : colors) {
        const auto place = window.PlaceOf(name);
        EXPECT_EQ(window.Pixel(place.left + 2, place.top + 2), color) << name;
    }
}

TEST(Paint, DatasheetHeadsStandWhereTheirHotSpotsAre) {
    DesignApplication application;
    const auto column = [](const std::string& name, int width) {
        return "Begin TextBox\nColumnWidth =" + std::to_string(width) + "\nName =\"" + name + "\"\nEnd\n";
    };
    const auto& form = application.AddForm(
        "F", Form("DefaultView =2\n", Section("Section", 900, column("A", 1000) + column("B", 2000))));
    OpenedWindow window(form, &application, View::Datasheet);
    // Columns end in a line: at 17 + 66.67 and 17 + 200 pixels of the client area, 18 pixels high.
    const int left = 8 + 17, top = 25;
    EXPECT_EQ(window.Pixel(left + 67 - 1, top + 5), 0xB4BCC6U);
    EXPECT_NE(window.Pixel(left + 67, top + 5), 0xB4BCC6U);
    EXPECT_EQ(window.Pixel(left + 200 - 1, top + 5), 0xB4BCC6U);
    EXPECT_EQ(window.Pixel(left + 30, top + 17), 0xB4BCC6U);
}

TEST(Paint, TheSamePictureComesEachTime) {
    DesignApplication application;
    const auto& form = application.AddForm(
        "F",
        Form("",
             Section("Section", 1500,
                     "Begin Label\nWidth =2000\nCaption =\"&Name of it\"\nName =\"L\"\nEnd\n" +
                         std::string(
                             "Begin TextBox\nTop =400\nControlSource =\"OrderDate\"\nName =\"T\"\nEnd\n"))));
    const auto first = OpenedWindow(form, &application, View::Form).Picture();
    EXPECT_EQ(first.pixels, OpenedWindow(form, &application, View::Form).Picture().pixels);
    EXPECT_EQ(first.width, 400 + 17 + 17 + 16);
}

TEST(Paint, DamagedDesignsAreBounded) {
    DesignApplication application;
    const auto& huge =
        application.AddForm("F", "Begin Form\nWidth =2147483647\nBegin\n" +
                                     Section("Section", 2147483647, Box("B", -2147483647, 2147483647)) +
                                     "Begin FormHeader\nHeight =2147483647\nEnd\nBegin FormFooter\nHeight "
                                     "=-2147483648\nEnd\nEnd\nEnd\n");
    for (const auto view : {View::Form, View::Design, View::Datasheet}) {
        const auto picture = OpenedWindow(huge, &application, view).Picture();
        EXPECT_FALSE(picture.Empty());
        EXPECT_LT(static_cast<std::int64_t>(picture.width) * picture.height, 64'000'000);
    }
}

TEST(Paint, AReportIsPrintedOnASheet) {
    DesignApplication application;
    const auto& report = application.Add(
        ObjectKind::Report, "R",
        "Begin Report\nWidth =6000\nBegin\n" + Section("PageHeader", 500, "") +
            Section("Section", 300, Box("Mark", 300, 30)) + Section("PageFooter", 300, "") + "End\nEnd\n");
    OpenedWindow window(report, &application, View::Preview);
    EXPECT_EQ(window.windows.Find(window.object.window)->className, "OReport");
    const auto picture = window.Picture();
    std::size_t red = 0;
    for (const auto pixel : picture.pixels)
        red += pixel == kRed ? 1 : 0;
    EXPECT_EQ(red, 14U * 20 * 16) << "fourteen records";

    auto page = MakePreviewPageWindow(window.object, window.windows.Metrics());
    page->parent = window.object.window;
    const auto handle = window.windows.Open(std::move(page));
    EXPECT_EQ(window.windows.FirstChild(window.object.window), handle);
    EXPECT_EQ(window.windows.Find(handle)->rectangle.Width(), window.object.insideWidth);
}

TEST(Paint, BoundControlsShowTheFirstRecord) {
    DesignApplication application;
    auto& orders = application.records["Orders"];
    orders.columns = {{"Customer", Records::Type::Number},
                      {"Total", Records::Type::Currency},
                      {"Paid", Records::Type::Boolean}};
    orders.rows = {{"7", "12.5", "True"}, {"8", "3", "False"}};
    auto& customers = application.records["SELECT ID, Name FROM Customers"];
    customers.columns = {{"ID", Records::Type::Number}, {"Name", Records::Type::Text}};
    customers.rows = {{"8", "Brown"}, {"7", "Miller"}};
    const auto& form = application.AddForm(
        "F",
        "Begin Form\nRecordSource =\"Orders\"\nBegin\n" +
            Section(
                "Section", 900,
                "Begin ComboBox\nColumnCount =2\nColumnWidths =\"0;2000\"\nRowSource =\"SELECT ID, Name FROM "
                "Customers\"\nControlSource =\"Customer\"\nName =\"C\"\nEnd\n"
                "Begin TextBox\nFormat =\"Currency\"\nControlSource =\"Total\"\nName =\"T\"\nEnd\n"
                "Begin CheckBox\nControlSource =\"Paid\"\nName =\"P\"\nEnd\n"
                "Begin TextBox\nControlSource =\"=\\\"Sum: \\\" & [Total] & \\\", page \\\" & [Page]\"\nName "
                "=\"E\"\nEnd\n"
                "Begin TextBox\nName =\"Unbound\"\nEnd\n") +
            "End\nEnd\n");
    const painting::SampleData sample(form, &application);
    const auto control = [&](const char* name) -> const DesignObject& {
        return *OpenedWindow::Find(*form.Section(0), name);
    };
    EXPECT_EQ(sample.RecordCount(), 2);
    EXPECT_EQ(sample.Text(control("C"), 0), "Miller");
    EXPECT_EQ(sample.Text(control("T"), 0), "$12.50");
    EXPECT_TRUE(sample.AlignsRight(control("T"), 0));
    EXPECT_TRUE(sample.Checked(control("P"), 0));
    EXPECT_FALSE(sample.Checked(control("P"), 1));
    EXPECT_EQ(sample.Text(control("E"), 1), "Sum: 3, page 1");
    EXPECT_EQ(sample.Text(control("Unbound"), 0), "");
}

/// Every control of real applications lies inside its picture in form and design view.
TEST(Paint, NothingOfTheCorpusIsCutOff) {
    const std::filesystem::path folder =
        std::string(TOVIMAR_SOURCE_DIR) + "/../shared/corpus/sports-admin/forms";
    if (!std::filesystem::exists(folder))
        GTEST_SKIP() << "the corpus is not beside the sources";
    for (const auto& entry : std::filesystem::directory_iterator(folder)) {
        std::ifstream file(entry.path(), std::ios::binary);
        std::stringstream bytes;
        bytes << file.rdbuf();
        DesignApplication application;
        const auto& form = application.AddForm(entry.path().stem().string(), DecodeExportText(bytes.str()));
        for (const auto view : {View::Form, View::Design}) {
            OpenedWindow window(form, &application, view);
            const auto picture = window.windows.Find(window.object.window)->rectangle;
            for (const auto& section : form.Sections())
                for (const auto& control : section.object->children) {
                    // Controls may be parked beyond the form's own edge.
                    const bool within =
                        control->Integer("Left") + control->Integer("Width") <= form.root->Integer("Width");
                    if (!within || !window.object.Sections(window.windows.Metrics())
                                        .present[static_cast<std::size_t>(section.number)])
                        continue;
                    const auto place = window.PlaceOf(*control, section.number);
                    EXPECT_LE(place.right, picture.Width()) << form.name << "." << control->name;
                    if (control->Integer("Top") + control->Integer("Height") <=
                        section.object->Integer("Height")) {
                        EXPECT_LE(place.bottom, picture.Height()) << form.name << "." << control->name;
                    }
                }
        }
    }
}

} // namespace tovimar::test
