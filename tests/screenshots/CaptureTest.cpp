#include "foundation/CTraceLog.h"
#include "foundation/Session.h"
#include "host/server/CTovimarServer.h"
#include "host/server/CXmlCommand.h"
#include "platform/MessageBoxAnswers.h"
#include "platform/windowing/WindowSystem.h"
#include "screenshots/CFormBitmapCapture.h"
#include "screenshots/Screenshot.h"
#include "screenshots/cJPEG.h"
#include "support/FakeEnvironment.h"
#include "uimodel/CXmlControl.h"
#include "uimodel/CXmlForm.h"

#include <algorithm>

namespace tovimar::test {

namespace {

/// 20 by 10 pixels; each tells its place: column in the low byte, row above it.
class PlaceWindow : public platform::Window {
public:
    explicit PlaceWindow(const std::string& title) {
        className = "OForm";
        caption = title;
        rectangle = {100, 100, 120, 110};
        client = {3, 4, 18, 9};
    }
    platform::Bitmap Paint(double) override {
        auto bitmap = platform::BlackBitmap(20, 10);
        for (std::size_t i = 0; i < bitmap.pixels.size(); ++i)
            bitmap.pixels[i] = static_cast<std::uint32_t>(i % 20 + i / 20 * 256);
        return bitmap;
    }
};

class Capture : public EnvironmentTest {
protected:
    platform::WindowHandle Open(const std::string& caption, platform::WindowHandle parent = 0) {
        auto window = std::make_unique<PlaceWindow>(caption);
        window->parent = parent;
        return environment->windows->Open(std::move(window));
    }
    bool Exists(const std::string& path) { return environment->files->FileExists(path); }
    CFormBitmapCapture capture;
};

/// Width of a bitmap file, height behind it; rows of a file stand upside down.
std::pair<int, int> BmpSize(const std::string& bytes) {
    return {static_cast<unsigned char>(bytes.at(18)), static_cast<unsigned char>(bytes.at(22))};
}
/// Column and row, within the window, that the picture's top left pixel shows.
std::pair<int, int> BmpOrigin(const std::string& bytes) {
    const auto [width, height] = BmpSize(bytes);
    const auto at = 54 + static_cast<std::size_t>((width * 3 + 3) / 4 * 4 * (height - 1));
    return {static_cast<unsigned char>(bytes.at(at)), static_cast<unsigned char>(bytes.at(at + 1))};
}

using Pair = std::pair<int, int>;

cJPEG Loaded(int width = 8, int height = 8) {
    cJPEG picture;
    picture.CreateFromPicture(platform::BlackBitmap(width, height));
    return picture;
}

} // namespace

TEST_F(Capture, WindowsAreFoundByCaptionAndClass) {
    const auto main = Open("Main"), first = Open("Orders", main), inner = Open("Lines", first);
    Open("Other", main);
    EXPECT_EQ(capture.hwndForm(main, "oRDERS"), first);
    EXPECT_EQ(capture.hwndForm(main, "Lines"), inner);
    EXPECT_EQ(capture.hwndForm(main, std::string("Lines\0garbage", 13)), inner);
    EXPECT_EQ(capture.hwndForm(main, "Main"), 0) << "only what lies below";
    EXPECT_EQ(capture.hwndForm(main, "None"), 0);
    EXPECT_EQ(capture.GetIDEChildWindowHwndByWinClassName(main, "OFORM"), first);
    EXPECT_EQ(capture.GetWindowHwnd(main, "Orders", 77), 77);
    EXPECT_EQ(capture.GetWindowHwnd(main, "Orders"), first);

    auto thunder = std::make_unique<PlaceWindow>("Running");
    thunder->className = "ThunderForm";
    const auto running = environment->windows->Open(std::move(thunder));
    EXPECT_EQ(capture.hwndForm(main, "running"), running);
}

TEST_F(Capture, FormsAreTakenWithTheirFrameAndControlsFromTheClientArea) {
    const auto main = Open("Main"), form = Open("Orders", main);
    ASSERT_TRUE(capture.CaptureForm("bmp", Path("form.bmp"), main, "orders", 0, 20, 10));
    EXPECT_EQ(BmpSize(ReadFile(Path("form.bmp"))), Pair(20, 10));
    EXPECT_EQ(BmpOrigin(ReadFile(Path("form.bmp"))), Pair(0, 0));
    ASSERT_TRUE(capture.CaptureControl("BMP", Path("control.bmp"), main, "", form, 2, 1, 5, 3));
    EXPECT_EQ(BmpSize(ReadFile(Path("control.bmp"))), Pair(5, 3));
    EXPECT_EQ(BmpOrigin(ReadFile(Path("control.bmp"))), Pair(5, 5));
    EXPECT_FALSE(capture.CaptureForm("bmp", Path("none.bmp"), main, "Nowhere", 0, 20, 10));
    EXPECT_FALSE(Exists(Path("none.bmp")));

    ASSERT_TRUE(capture.CaptureForm("bmp", Path("gone.bmp"), main, "", 4711, 20, 10))
        << "a window that is gone leaves black";
    EXPECT_EQ(BmpSize(ReadFile(Path("gone.bmp"))), Pair(20, 10));
}

TEST_F(Capture, AWholeWindowGoesIntoAFileOfEitherKind) {
    const auto window = Open("Main");
    EXPECT_TRUE(capture.CaptureWindowScreenshot(window, "jpg", Path("a.jpg")));
    EXPECT_EQ(ReadFile(Path("a.jpg")).substr(0, 3), "\xFF\xD8\xFF");
    EXPECT_FALSE(capture.CaptureWindowScreenshot(0, "bmp", Path("b.bmp")));
    EXPECT_FALSE(Exists(Path("b.bmp")));
    EXPECT_TRUE(capture.CaptureWindowScreenshot(window, "bmp", "")) << "an empty path writes nothing";

    const auto picture = modScreenCapture::CaptureWindowByHWND(window);
    EXPECT_EQ(capture.SavePictureErr(picture, Path("c.BMP"), 2), 2);
    EXPECT_TRUE(Exists(Path("c.jpg")));
    EXPECT_EQ(capture.SavePictureErr(picture, Path("d.bmp"), 1), 1);
    EXPECT_EQ(ReadFile(Path("d.bmp")).substr(0, 2), "BM");
    EXPECT_EQ(capture.SavePictureErr(nullptr, Path("e.bmp"), 1), -1);
    EXPECT_EQ(capture.SavePictureErr(picture, Path("nowhere\\e.bmp"), 2), -1);
}

TEST_F(Capture, AnUnwritableFileIsReported) {
    const auto window = Open("Main");
    WriteFile("folder.bmp\\inside.txt", "");
    modScreenCapture::WritePictureToFile(modScreenCapture::CaptureWindowByHWND(window), "bmp",
                                         Path("folder.bmp"));
    ASSERT_FALSE(boxes->shown.empty());
    EXPECT_NE(boxes->shown.front().text.find("folder.bmp"), std::string::npos) << boxes->shown.front().text;
}

TEST_F(Capture, AJpegSectionHasPaddedRowsFromTheBottom) {
    cJPEG picture;
    EXPECT_FALSE(picture.Create(0, 4));
    EXPECT_FALSE(picture.Create(1 << 30, 1 << 30));
    auto bitmap = platform::BlackBitmap(5, 2);
    bitmap.pixels[0] = 0x112233;
    ASSERT_TRUE(picture.CreateFromPicture(bitmap));
    EXPECT_TRUE(picture.PictureLoaded());
    EXPECT_EQ(picture.BytesPerScanLine(), 16);
    const auto* top = picture.DIBSectionBitsPtr() + 16;
    EXPECT_EQ(std::vector<int>(top, top + 3), (std::vector<int>{0x33, 0x22, 0x11}));
    auto copy = platform::BlackBitmap(5, 2);
    ASSERT_TRUE(picture.PaintPicture(copy));
    EXPECT_EQ(copy.pixels, bitmap.pixels);
    picture.ClearUp();
    EXPECT_FALSE(picture.PictureLoaded());
    EXPECT_FALSE(picture.PaintPicture(copy));
}

TEST_F(Capture, JpegSaveKeepsItsRules) {
    std::int32_t number = 1;
    std::string message;
    EXPECT_FALSE(JPEG_Save(cJPEG(), Path("a.jpg"), 80, false, number, message));
    EXPECT_EQ(number, 0);
    EXPECT_EQ(message, "No picture loaded to save.");

    ASSERT_TRUE(JPEG_Save(Loaded(), Path("a.jpg"), 0, true, number, message));
    const auto worst = ReadFile(Path("a.jpg"));
    ASSERT_TRUE(JPEG_Save(Loaded(), Path("a.jpg"), 101, false, number, message));
    EXPECT_NE(ReadFile(Path("a.jpg")), worst) << "replaced without a question";
    EXPECT_TRUE(boxes->shown.empty());

    const auto old = ReadFile(Path("a.jpg"));
    boxes->answers = {platform::kAnswerNo};
    EXPECT_TRUE(JPEG_Save(Loaded(), Path("a.jpg"), 1, true, number, message));
    EXPECT_EQ(number, 0);
    EXPECT_EQ(ReadFile(Path("a.jpg")), old);
    ASSERT_EQ(boxes->shown.size(), 1U);
    EXPECT_EQ(boxes->shown[0].title, "  Confirm File Overwrite");
    boxes->answers = {platform::kAnswerYes};
    EXPECT_TRUE(JPEG_Save(Loaded(), Path("a.jpg"), 1, true, number, message));
    EXPECT_EQ(ReadFile(Path("a.jpg")), worst);

    WriteFile("f.jpg\\x", "");
    EXPECT_FALSE(JPEG_Save(Loaded(), Path("f.jpg"), 80, false, number, message));
    EXPECT_EQ(number, -23);
    EXPECT_EQ(message, "ijlWrite Error - File Error");
    EXPECT_EQ(JPEG_ErrorText(2), "");
    EXPECT_EQ(JPEG_ErrorText(-9), "An error occored while closing the file");
    EXPECT_EQ(JPEG_ErrorText(-99), "Reserved");
    EXPECT_EQ(JPEG_ErrorText(-50), "Unknown Error");
}

namespace {

std::unique_ptr<CXmlControl> Control(const char* type, const char* name, int left, int top, int width,
                                     int height, const std::string& picture = {}) {
    auto control = std::make_unique<CXmlControl>();
    control->SetControlType(type);
    control->Name = name;
    control->Left = left;
    control->Top = top;
    control->Width = width;
    control->Height = height;
    control->PicFullPath = picture;
    return control;
}

/// A host that opens one window and notes what it is told.
class ScreenshotTest : public Capture {
protected:
    ScreenshotTest() : window(Open("Orders")) {
        server.Connect();
        server.TovimarClientCallBack = [this](const std::string& text) {
            CXmlCommand command;
            command.Deserialize(text);
            std::string line = command.Name();
            if (command.ParamDefined("ControlFullPath"))
                line += " " + command.GetParamValue("ControlFullPath");
            commands.push_back(line);
            command.AddParamValue("RetValue",
                                  command.Name() == "ActivateComponent" ? std::to_string(window) : "True");
            return command.Serialize();
        };
    }
    ~ScreenshotTest() override { server.Disconnect(); }

    std::string Definition() {
        CXmlForm form;
        form.Name = "Orders";
        form.Text = "Orders";
        form.SourceProjectType = "MS ACCESS";
        form.Width = 20;
        form.Height = 10;
        form.SetPicFullPath(Path("images\\Orders.bmp"));
        auto tab = Control("TabControl", "tab", 1, 2, 9, 3);
        auto page = Control("Page", "tab_0", 1, 2, 9, 3, Path("images\\Orders_tab_0.bmp"));
        page->TabPageIndex = 0;
        page->Controls.Add(Control("TextBox", "txt", 2, 3, 4, 1), "txt");
        auto second = Control("Page", "tab_1", 1, 2, 9, 3, Path("images\\Orders_tab_1.bmp"));
        second->TabPageIndex = 1;
        tab->Controls.Add(std::move(page), "tab_0");
        tab->Controls.Add(std::move(second), "tab_1");
        form.Controls.Add(std::move(tab), "tab");
        return form.XMLSTr();
    }

    platform::WindowHandle window;
    CTovimarServer server;
    std::vector<std::string> commands;
};

} // namespace

TEST_F(ScreenshotTest, TakesTheFormAndEachPage) {
    environment->files->MakeFolders(Path("pics"));
    Screenshot screenshot;
    ASSERT_EQ(screenshot.LocateObjectsAndTakeScreenshots("bmp", window, Definition(), Path("pics")), 0)
        << screenshot.LastErrStr();
    EXPECT_EQ(commands, (std::vector<std::string>{"ActivateComponent", "CorrectInsideWidthAndHeigh",
                                                  "ActivateControl Form.Orders.TabControl.tab.Page.tab_0.[0]",
                                                  "ActivateControl Form.Orders.TabControl.tab.Page.tab_1.[1]",
                                                  "ActivateControl Form.Orders.TabControl.tab.Page.tab.[0]",
                                                  "ResetInsideWidthAndHeigh"}));
    EXPECT_EQ(BmpSize(ReadFile(Path("pics\\Orders.bmp"))), Pair(20, 10));
    EXPECT_EQ(screenshot.TakenImageFullPath(), Path("pics\\Orders.bmp"));
    // Two pixels above the page show the frame's line; the client area begins at 3, 4.
    const auto page = ReadFile(Path("pics\\Orders_tab_0.bmp"));
    EXPECT_EQ(BmpSize(page), Pair(9, 5));
    EXPECT_EQ(BmpOrigin(page), Pair(4, 4));
    EXPECT_TRUE(Exists(Path("pics\\Orders_tab_1.bmp")));
}

TEST_F(ScreenshotTest, ADefinitionThatCantBeReadIsReported) {
    Screenshot screenshot;
    EXPECT_NE(screenshot.LocateObjectsAndTakeScreenshots("bmp", window, "<Form"), 0);
    EXPECT_EQ(screenshot.LastErrDscr(), "Error parsing XML form string");
    EXPECT_EQ(std::count(commands.begin(), commands.end(), "ActivateComponent"), 0) << "nothing is opened";
}

TEST_F(ScreenshotTest, AWindowsArgumentsAreCheckedInOrder) {
    Screenshot screenshot;
    EXPECT_EQ(screenshot.TakeWindowScreenshot(window, 3, "", ""), MakeResultCode(0x80040001U));
    EXPECT_EQ(screenshot.LastErrDscr(), "Pictype can be only equal to 1(Bitmap) or 2(Jpeg)");
    EXPECT_EQ(screenshot.TakeWindowScreenshot(window, 1, "", ""), MakeResultCode(0x80040002U));
    EXPECT_EQ(screenshot.TakeWindowScreenshot(window, 1, Folder(), ""), MakeResultCode(0x80040003U));
    EXPECT_EQ(screenshot.TakeWindowScreenshot(window, 2, Folder(), "w.jpg"), 0);
    EXPECT_EQ(screenshot.LastErrStr(), "");
    EXPECT_TRUE(Exists(Path("w.jpg")));
    EXPECT_EQ(screenshot.TakeWindowScreenshot(0, 1, Folder(), "w.bmp"), kGeneralFailure);
    EXPECT_EQ(screenshot.LastErrDscr(), "Unexpected error whille taking window screenshot.");
}

} // namespace tovimar::test
