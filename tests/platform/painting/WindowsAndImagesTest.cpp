#include "platform/imaging/Image.h"
#include "platform/imaging/Jpeg.h"
#include "platform/painting/PaintingTest.h"

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
    Bitmap Paint() override {
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
    EXPECT_EQ(windows.Capture(handle, false, 0, 0, 2, 2).pixels, FourPixels().pixels);
    EXPECT_EQ(windows.Capture(handle, true, 0, 0, 1, 1).pixels, Pixels{0xFFFFFF});
    EXPECT_EQ(windows.Capture(handle, false, 1, -1, 2, 2).pixels, (Pixels{0, 0, 0x00FF00, 0}))
        << "black outside";
    EXPECT_EQ(window->painted, 1);
    windows.Invalidate(handle);
    windows.Capture(handle, false, 0, 0, 1, 1);
    EXPECT_EQ(window->painted, 2);
    EXPECT_TRUE(windows.Capture(handle, false, 0, 0, 0, 5).Empty());
    EXPECT_TRUE(windows.Capture(999, false, 0, 0, 5, 5).Empty());
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
    const auto picture = window->Paint();
    EXPECT_EQ(picture.width, window->rectangle.Width());
    EXPECT_GT(picture.width, 200);
    EXPECT_FALSE(access::MakeRelationshipsWindow({}, {}, metrics)->Paint().Empty());
}

} // namespace tovimar::test
