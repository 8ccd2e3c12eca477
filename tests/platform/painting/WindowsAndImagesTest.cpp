#include "platform/imaging/Image.h"
#include "platform/imaging/Jpeg.h"
#include "platform/imaging/PictureSize.h"
#include "platform/painting/PaintingTest.h"

#include <cmath>

namespace tovimar::test {

using namespace platform;

namespace {

/// Two by two: red, green / blue, white.
Bitmap FourPixels() {
    Bitmap bitmap;
    bitmap.width = bitmap.height = 2;
    bitmap.pixels = {0xFF0000, 0x00FF00, 0x0000FF, 0xFFFFFF};
    return bitmap;
}

class CountingWindow : public Window {
public:
    explicit CountingWindow(std::string name) {
        className = "Counting";
        caption = std::move(name);
        rectangle = {0, 0, 2, 2};
        client = {1, 1, 2, 2};
    }
    Bitmap Paint(double) override {
        ++painted;
        return FourPixels();
    }
    int painted = 0;
};

} // namespace

TEST(Windows, CapturesCutFromOnePainting) {
    WindowSystem windows;
    auto made = std::make_unique<CountingWindow>("A");
    auto* window = made.get();
    const auto handle = windows.Open(std::move(made));
    EXPECT_EQ(windows.Capture(handle, false, 0, 0, 2, 2)->pixels, FourPixels().pixels);
    EXPECT_EQ(windows.Capture(handle, true, 0, 0, 1, 1)->pixels, Pixels{0xFFFFFF});
    EXPECT_EQ(windows.Capture(handle, false, 1, -1, 2, 2)->pixels, (Pixels{0, 0, 0x00FF00, 0}))
        << "black outside";
    EXPECT_EQ(window->painted, 1);
    windows.Invalidate(handle);
    windows.Capture(handle, false, 0, 0, 1, 1);
    EXPECT_EQ(window->painted, 2);
    EXPECT_TRUE(windows.Capture(handle, false, 0, 0, 0, 5)->Empty());
    EXPECT_EQ(windows.Capture(999, false, 0, 0, 5, 5), nullptr);
}

TEST(Windows, ALargerScaleMultipliesEveryPixelAndKeepsItsPlace) {
    DesignApplication application;
    const auto& form = application.AddForm("Shapes", R"(Begin Form
    RecordSelectors = NotDefault
    NavigationButtons = NotDefault
    ScrollBars =0
    BorderStyle =0
    Width =3000
    Begin
        Begin Section
            Height =1500
            BackColor =16768477
            Name ="Detail"
            Begin
                Begin Rectangle
                    OldBorderStyle =1
                    BorderWidth =1
                    BorderColor =255
                    BackStyle =1
                    BackColor =65280
                    Left =150
                    Top =165
                    Width =915
                    Height =600
                    Name ="Box"
                End
                Begin Rectangle
                    SpecialEffect =2
                    BackStyle =1
                    Left =1500
                    Top =165
                    Width =915
                    Height =600
                    Name ="Sunken"
                End
            End
        End
    End
End
)");
    OpenedWindow window(form, &application, access::View::Form);
    const auto area = window.windows.Find(window.object.window)->rectangle;
    const auto plain = window.Picture();
    const auto at = [&](double scale) {
        return *window.windows.Capture(window.object.window, false, 0, 0, area.Width(), area.Height(), scale);
    };
    const auto twice = at(2);
    ASSERT_EQ(twice.width, 2 * plain.width);
    ASSERT_EQ(twice.height, 2 * plain.height);
    std::size_t different = 0;
    for (int y = 0; y < twice.height; ++y)
        for (int x = 0; x < twice.width; ++x)
            different += twice.pixels[static_cast<std::size_t>(y * twice.width + x)] !=
                         plain.pixels[static_cast<std::size_t>(y / 2 * plain.width + x / 2)];
    EXPECT_EQ(different, 0U);

    EXPECT_EQ(at(1.5).width, std::lround(area.Width() * 1.5));
    const auto cut = *window.windows.Capture(window.object.window, false, 11, 12, 9, 7, 2);
    EXPECT_EQ(cut.width, 18);
    EXPECT_EQ(cut.height, 14);
    EXPECT_EQ(cut.pixels.at(0), plain.pixels[static_cast<std::size_t>(12 * plain.width + 11)]);
}

TEST(Windows, AWindowTooLargeForAScaleIsPaintedSmaller) {
    class Huge : public CountingWindow {
    public:
        Huge() : CountingWindow("Huge") { rectangle = {0, 0, 6000, 4000}; }
        Bitmap Paint(double asked) override {
            scale = asked;
            return {};
        }
        double scale = 0;
    };
    WindowSystem windows;
    auto made = std::make_unique<Huge>();
    const auto* window = made.get();
    windows.Capture(windows.Open(std::move(made)), false, 0, 0, 1, 1, 2);
    EXPECT_NEAR(window->scale * window->scale * 6000 * 4000, 48e6, 1);
}

TEST(Windows, AWindowTakesThoseBelowItWithIt) {
    WindowSystem windows;
    const auto open = [&](const char* caption, WindowHandle parent) {
        auto window = std::make_unique<CountingWindow>(caption);
        window->parent = parent;
        return windows.Open(std::move(window));
    };
    const auto main = open("Main", 0), first = open("First", main), below = open("Below", first),
               second = open("Second", main);
    EXPECT_EQ(windows.FirstChild(main), first);
    EXPECT_EQ(windows.NextSibling(first), second);
    EXPECT_EQ(windows.NextSibling(second), 0);
    EXPECT_EQ(windows.FindTopLevel("counting", "MAIN"), main);
    EXPECT_EQ(windows.FindTopLevel("counting", "First"), 0);
    windows.Close(first);
    EXPECT_EQ(windows.Find(below), nullptr);
    EXPECT_NE(windows.Find(second), nullptr);
    windows.Close(first);
}

TEST(Images, ABitmapFileHasPaddedRowsFromTheBottom) {
    const auto bytes = EncodeBmp(FourPixels());
    ASSERT_EQ(bytes.size(), 54U + 16);
    EXPECT_EQ(bytes.substr(0, 14), std::string("BM\x46\0\0\0\0\0\0\0\x36\0\0\0", 14));
    EXPECT_EQ(bytes.substr(14, 16), std::string("\x28\0\0\0\2\0\0\0\2\0\0\0\1\0\x18\0", 16));
    EXPECT_EQ(bytes.substr(54), std::string("\xFF\0\0\xFF\xFF\xFF\0\0\0\0\xFF\0\xFF\0\0\0", 16));
    EXPECT_EQ(EncodeBmp({}).size(), 54U);
}

TEST(Images, WhatWasWrittenIsReadBack) {
    const auto bytes = EncodeBmp(FourPixels());
    const Pixels opaque{0xFFFF0000U, 0xFF00FF00U, 0xFF0000FFU, 0xFFFFFFFFU};
    const auto file = DecodeImage(bytes);
    ASSERT_TRUE(file);
    EXPECT_EQ(file->pixels, opaque);
    const auto withoutFileHeader = DecodeImage(std::string_view(bytes).substr(14));
    ASSERT_TRUE(withoutFileHeader);
    EXPECT_EQ(withoutFileHeader->pixels, opaque);

    Bitmap grey = BlackBitmap(16, 9);
    grey.pixels.assign(grey.pixels.size(), 0x808080);
    std::string jpeg;
    ASSERT_EQ(EncodeJpeg(grey, 100, jpeg), JpegCode::kOk);
    const auto read = DecodeImage(jpeg);
    ASSERT_TRUE(read);
    EXPECT_EQ(read->width, 16);
    EXPECT_EQ(read->height, 9);
    EXPECT_EQ(read->pixels[20] & 0xF8F8F8U, 0x808080U);
    EXPECT_EQ(EncodeJpeg(Bitmap{}, 90, jpeg), JpegCode::kNoImage);
}

TEST(Images, ThePictureSizeComesFromTheHeaders) {
    std::string jpeg;
    ASSERT_EQ(EncodeJpeg(BlackBitmap(37, 21), 90, jpeg), JpegCode::kOk);
    EXPECT_EQ(PictureSize(jpeg), std::pair(37, 21));
    EXPECT_EQ(PictureSize(EncodeBmp(FourPixels())), std::pair(2, 2));
    for (std::size_t length = 0; length < 30; ++length)
        PictureSize(std::string_view(jpeg).substr(0, length)); // reads nothing behind the end
    EXPECT_FALSE(PictureSize(std::string_view(jpeg).substr(0, 20)));
    EXPECT_FALSE(PictureSize("GIF89a"));
}

TEST(Images, DamagedPicturesGiveNone) {
    const auto bytes = EncodeBmp(FourPixels());
    EXPECT_FALSE(DecodeImage(""));
    EXPECT_FALSE(DecodeImage("GIF89a"));
    for (std::size_t length = 0; length < bytes.size(); ++length)
        EXPECT_FALSE(DecodeImage(std::string_view(bytes).substr(0, length))) << length;
    auto huge = bytes;
    huge[20] = '\x7F'; // a width of 8 million pixels
    EXPECT_FALSE(DecodeImage(huge));
    EXPECT_FALSE(DecodeImage(std::string("\x89PNG\r\n\x1a\n", 8) + std::string(30, '\x7F')));
}

TEST(Images, TheRelationshipsWindowShowsItsTables) {
    SystemMetrics metrics;
    const auto window = access::MakeRelationshipsWindow(
        {{"Orders", {"ID", "Customer"}, {true, false}}, {"Customers", {"ID"}, {true}}},
        {{"Customers", "ID", "Orders", "Customer", false}, {"Nowhere", "ID", "Orders", "ID", false}},
        metrics);
    EXPECT_EQ(window->className, "OSysRel");
    const auto picture = window->Paint(1);
    EXPECT_EQ(picture.width, window->rectangle.Width());
    EXPECT_GT(picture.width, 200);
    EXPECT_FALSE(access::MakeRelationshipsWindow({}, {}, metrics)->Paint(1).Empty());
}

} // namespace tovimar::test
