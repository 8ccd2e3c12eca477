#include "screenshots/cJPEG.h"

#include "foundation/ShowMessage.h"
#include "platform/Environment.h"
#include "platform/imaging/Jpeg.h"

#include <algorithm>
#include <array>

namespace tovimar {

namespace {

constexpr std::int32_t kLargestSide = 32767;
constexpr std::int64_t kMostPixels = 64'000'000;

struct CodeText {
    std::int32_t code;
    const char* text;
};
constexpr std::array<CodeText, 31> kTexts{{{0, ""},
                                           {1, ""},
                                           {2, ""},
                                           {-1, "Exception detected"},
                                           {-2, "Invalid encoder"},
                                           {-3, "Unsupported subsampling"},
                                           {-4, "Unsupported bytes per pixel"},
                                           {-5, "Memory Error"},
                                           {-6, "Bad huffman table"},
                                           {-7, "Bad quant table"},
                                           {-8, "Invalid JPEG properties specified"},
                                           {-9, "An error occored while closing the file"},
                                           {-10, "Invalid file name"},
                                           {-11, "EOF Error"},
                                           {-12, "Prog Not Supported"},
                                           {-13, "Error - NOT JPEG"},
                                           {-14, "Error - COMP"},
                                           {-15, "Error - SOF"},
                                           {-16, "Error - DNL"},
                                           {-17, "Error - NO HUF"},
                                           {-18, "Error - NO QUAN"},
                                           {-19, "Error - NO FRAME"},
                                           {-20, "Error - MULT FRAME"},
                                           {-21, "Error - DATA"},
                                           {-22, "Error - NO IMAGE"},
                                           {-23, "File Error"},
                                           {-24, "Internal Error"},
                                           {-25, "Bad RST Marker"},
                                           {-26, "Thumbnail - DIB Too Small"},
                                           {-27, "Thumbnail - DIB Wrong Color"},
                                           {-99, "Reserved"}}};

/// Compresses and writes; a result code of the writer.
int WriteJpegFile(const cJPEG& picture, const std::string& path, int quality) {
    std::string bytes;
    const platform::DibSection section{picture.DIBSectionBitsPtr(), picture.Width(), picture.Height(),
                                       picture.BytesPerScanLine()};
    const int code = platform::EncodeJpeg(section, quality, bytes);
    if (code != platform::JpegCode::kOk)
        return code;
    try {
        platform::Env().files->WriteFile(path, bytes);
    } catch (const RaisedError&) {
        return platform::JpegCode::kFileError;
    }
    return platform::JpegCode::kOk;
}

bool MayReplace(const std::string& path) {
    const auto question = "This file already exists.\r\n\r\n" + path + "\r\n\r\nReplace existing file?";
    return ShowMessage(question, kMsgYesNo | kMsgExclamation, "  Confirm File Overwrite") ==
           platform::kAnswerYes;
}

} // namespace

bool cJPEG::Create(std::int32_t lWidth, std::int32_t lHeight) {
    ClearUp();
    if (lWidth <= 0 || lHeight <= 0 || lWidth > kLargestSide || lHeight > kLargestSide ||
        static_cast<std::int64_t>(lWidth) * lHeight > kMostPixels)
        return false;
    width_ = lWidth;
    height_ = lHeight;
    bits_.resize(static_cast<std::size_t>(BytesPerScanLine()) * static_cast<std::size_t>(height_));
    return true;
}

bool cJPEG::CreateFromPicture(const platform::Bitmap& PictureSource) {
    if (!Create(PictureSource.width, PictureSource.height))
        return false;
    LoadPictureBlt(PictureSource);
    pictureLoaded_ = true;
    return true;
}

bool cJPEG::LoadPictureBlt(const platform::Bitmap& source, std::int32_t lSrcLeft, std::int32_t lSrcTop,
                           std::int32_t lSrcWidth, std::int32_t lSrcHeight) {
    if (bits_.empty())
        return false;
    const int width = std::min(lSrcWidth < 0 ? width_ : lSrcWidth, width_);
    const int height = std::min(lSrcHeight < 0 ? height_ : lSrcHeight, height_);
    for (int y = 0; y < height; ++y) {
        const int fromY = lSrcTop + y;
        if (fromY < 0 || fromY >= source.height)
            continue;
        auto* row = bits_.data() +
                    static_cast<std::size_t>(height_ - 1 - y) * static_cast<std::size_t>(BytesPerScanLine());
        const auto* pixels =
            source.pixels.data() + static_cast<std::size_t>(fromY) * static_cast<std::size_t>(source.width);
        for (int x = std::max(0, -lSrcLeft); x < width && lSrcLeft + x < source.width; ++x) {
            const auto pixel = pixels[lSrcLeft + x];
            row[3 * x] = static_cast<std::uint8_t>(pixel);
            row[3 * x + 1] = static_cast<std::uint8_t>(pixel >> 8U);
            row[3 * x + 2] = static_cast<std::uint8_t>(pixel >> 16U);
        }
    }
    return true;
}

bool cJPEG::PaintPicture(platform::Bitmap& target, std::int32_t lDestLeft, std::int32_t lDestTop,
                         std::int32_t lDestWidth, std::int32_t lDestHeight, std::int32_t lSrcLeft,
                         std::int32_t lSrcTop) const {
    if (bits_.empty())
        return false;
    const int width = lDestWidth < 0 ? width_ : lDestWidth, height = lDestHeight < 0 ? height_ : lDestHeight;
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x) {
            const int fromX = lSrcLeft + x, fromY = lSrcTop + y, toX = lDestLeft + x, toY = lDestTop + y;
            if (fromX < 0 || fromY < 0 || fromX >= width_ || fromY >= height_ || toX < 0 || toY < 0 ||
                toX >= target.width || toY >= target.height)
                continue;
            const auto* pixel =
                bits_.data() +
                static_cast<std::size_t>(height_ - 1 - fromY) * static_cast<std::size_t>(BytesPerScanLine()) +
                3 * static_cast<std::size_t>(fromX);
            target.pixels[static_cast<std::size_t>(toY) * static_cast<std::size_t>(target.width) +
                          static_cast<std::size_t>(toX)] = static_cast<std::uint32_t>(pixel[2]) << 16U |
                                                           static_cast<std::uint32_t>(pixel[1]) << 8U |
                                                           pixel[0];
        }
    return true;
}

void cJPEG::ClearUp() {
    bits_.clear();
    width_ = 0;
    height_ = 0;
    pictureLoaded_ = false;
}

std::string JPEG_ErrorText(std::int32_t code) {
    for (const auto& entry : kTexts)
        if (entry.code == code)
            return entry.text;
    return "Unknown Error";
}

bool JPEG_Save(const cJPEG& picture, const std::string& path, std::int32_t quality, bool confirm,
               std::int32_t& ErrNum, std::string& ErrMsg) {
    ErrNum = 0;
    ErrMsg.clear();
    if (!picture.PictureLoaded()) {
        ErrMsg = "No picture loaded to save.";
        return false;
    }
    try {
        auto& files = *platform::Env().files;
        if (files.FileExists(path)) {
            if (confirm && !MayReplace(path))
                return true;
            files.DeleteFile(path);
        }
        ErrNum = WriteJpegFile(picture, path, std::clamp(quality, 1, 100));
        if (ErrNum != 0)
            ErrMsg = "ijlWrite Error - " + JPEG_ErrorText(ErrNum);
    } catch (const RaisedError& failure) {
        ErrNum = failure.Number();
        ErrMsg = "JPEG_Save: ErrNum = " + std::to_string(ErrNum) + ", ErrDesc = " + failure.what() +
                 ", ErrLine# = 0";
    }
    return ErrNum == 0;
}

} // namespace tovimar
