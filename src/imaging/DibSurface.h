#pragma once
#include <cstdint>
#include <memory>

#include "paint/Picture.h"

// A 24-bit device-independent bitmap held in memory, laid out the way JPEG
// and bitmap codecs take it: three bytes a pixel in the order blue, green,
// red; rows bottom-up (the first row in memory is the picture's bottom row);
// every row padded to a multiple of 4 bytes. The pixel at column x of memory
// row r starts at byte r * BytesPerScanLine() + 3 * x.
//
// A surface is empty until Create makes it live; ClearUp empties it again.
// Width, Height and BytesPerScanLine describe the last requested size, also
// on an empty surface. Block transfers use the picture's own coordinates
// (origin top left), so they turn rows over as they copy.
class DibSurface {
public:
    DibSurface() = default;
    DibSurface(const DibSurface&) = delete;
    DibSurface& operator=(const DibSurface&) = delete;
    DibSurface(DibSurface&&) = default;
    DibSurface& operator=(DibSurface&&) = default;
    ~DibSurface() { ClearUp(); }

    // Releases what the surface holds, then makes a zeroed block of the size.
    // False when the size is not positive or the memory cannot be had (the
    // size is kept even then). A stride (3 x width + 3) or image size outside
    // the signed 32-bit range throws std::overflow_error: nothing is
    // allocated and the surface is left empty with its old size.
    bool Create(int32_t lWidth, int32_t lHeight);
    // Creates a surface of the picture's size and copies the picture in.
    void CreateFromPicture(const Picture& picThis);

    int32_t Width() const { return width_; }
    int32_t Height() const { return height_; }
    // (3 x Width + 3) with its two lowest bits cleared.
    int32_t BytesPerScanLine() const { return (width_ * 3 + 3) & ~3; }
    // Height x BytesPerScanLine, as the bitmap header holds it.
    int32_t ImageSize() const { return imageSize_; }
    // The first pixel byte (of the bottom row); null while the surface is empty.
    uint8_t* DIBSectionBitsPtr() { return bits_.get(); }
    const uint8_t* DIBSectionBitsPtr() const { return bits_.get(); }
    bool live() const { return bits_ != nullptr; }

    // Copies a block of `src` from (lSrcLeft, lSrcTop) to this surface's top
    // left corner. A negative width or height means this surface's own;
    // whatever lies outside either picture is left out.
    void LoadPictureBlt(const Picture& src, int32_t lSrcLeft = 0, int32_t lSrcTop = 0, int32_t lSrcWidth = -1,
                        int32_t lSrcHeight = -1);
    void LoadPictureBlt(const DibSurface& src, int32_t lSrcLeft = 0, int32_t lSrcTop = 0, int32_t lSrcWidth = -1,
                        int32_t lSrcHeight = -1);
    // Copies a block of this surface from (lSrcLeft, lSrcTop) into `dest` at
    // (lDestLeft, lDestTop); negative sizes mean this surface's own.
    void PaintPicture(Picture& dest, int32_t lDestLeft = 0, int32_t lDestTop = 0, int32_t lDestWidth = -1,
                      int32_t lDestHeight = -1, int32_t lSrcLeft = 0, int32_t lSrcTop = 0) const;

    // Noise from a generator seeded by the clock: grey (three equal bytes)
    // with bGray, else blue 0 with random green and red. Padding stays as it is.
    void RandomiseBits(bool bGray = false);

    // Frees the pixel block. The size stays as it was.
    void ClearUp() { bits_.reset(); }

    // A new surface of the given size (height first) holding this one's
    // pixels: an exact copy at the same size, else the bilinear interpolation
    // over memory rows. Null when the new surface cannot be made.
    std::unique_ptr<DibSurface> Resample(int32_t lNewHeight, int32_t lNewWidth) const;

private:
    // The header and the block for a new size (Create's allocation step).
    // Unless `zeroed`, only the padding is cleared: the caller fills the rest.
    bool CreateDIB(int32_t lWidth, int32_t lHeight, bool zeroed = true);
    void ResampleInto(DibSurface& target) const;
    // The pixel at (x, y) in picture coordinates, top row first.
    uint8_t* At(int32_t x, int32_t y) {
        return bits_.get() + static_cast<size_t>(height_ - 1 - y) * static_cast<size_t>(BytesPerScanLine()) +
               3 * static_cast<size_t>(x);
    }
    const uint8_t* At(int32_t x, int32_t y) const { return const_cast<DibSurface*>(this)->At(x, y); }

    int32_t width_ = 0;
    int32_t height_ = 0;
    int32_t imageSize_ = 0;
    std::unique_ptr<uint8_t[]> bits_;
};
