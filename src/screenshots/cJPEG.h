#pragma once

#include "platform/imaging/Bitmap.h"

#include <cstdint>
#include <string>
#include <vector>

namespace tovimar {

/// A picture as a 24-bit section: bytes blue, green, red, rows from the bottom, each padded to 4 bytes.
class cJPEG {
public:
    bool PictureLoaded() const { return pictureLoaded_; }
    void SetPictureLoaded(bool loaded) { pictureLoaded_ = loaded; }
    const std::uint8_t* DIBSectionBitsPtr() const { return bits_.empty() ? nullptr : bits_.data(); }
    std::int32_t Height() const { return height_; }
    std::int32_t Width() const { return width_; }
    /// Bytes of a row with its padding.
    std::int32_t BytesPerScanLine() const { return (width_ * 3 + 3) & ~3; }

    /// A section of that size, black. False for a size that can't be had.
    bool Create(std::int32_t lWidth, std::int32_t lHeight);
    bool CreateFromPicture(const platform::Bitmap& PictureSource);
    /// Copies from a picture's place into the section's top left corner; a width or height below 0 is the
    /// section's own. False without a section.
    bool LoadPictureBlt(const platform::Bitmap& source, std::int32_t lSrcLeft = 0, std::int32_t lSrcTop = 0,
                        std::int32_t lSrcWidth = -1, std::int32_t lSrcHeight = -1);
    /// Copies the section from its place into a picture; sizes as for `LoadPictureBlt`.
    bool PaintPicture(platform::Bitmap& target, std::int32_t lDestLeft = 0, std::int32_t lDestTop = 0,
                      std::int32_t lDestWidth = -1, std::int32_t lDestHeight = -1, std::int32_t lSrcLeft = 0,
                      std::int32_t lSrcTop = 0) const;
    void ClearUp();

private:
    std::vector<std::uint8_t> bits_;
    std::int32_t width_ = 0;
    std::int32_t height_ = 0;
    bool pictureLoaded_ = false;
};

/// Writes the picture as a JPEG file. `quality` is held between 1 and 100. With `confirm` an existing file
/// is replaced only on Yes; another answer gives True and leaves it. False leaves number and text of the
/// failure, without a message to the user.
bool JPEG_Save(const cJPEG& picture, const std::string& path, std::int32_t quality, bool confirm,
               std::int32_t& ErrNum, std::string& ErrMsg);

/// Text of a result code of the JPEG writer; empty for 0 to 2.
std::string JPEG_ErrorText(std::int32_t code);

} // namespace tovimar
