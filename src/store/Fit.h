#pragma once
#include <cstdint>

#include "paint/Picture.h"

// Fitting a photo to the work picture: the auto-crop arithmetic and a smooth
// area-averaging resampler over plain pixel buffers.
namespace store {

// A source rectangle in pixels of the photo as the user sees it (upright).
struct SourceRect {
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    bool operator==(const SourceRect&) const = default;
};

// The part of a W x H photo drawn into the Dw x Dh work picture. Stretched:
// the whole photo. Auto crop: the ratios are single precision; the wider
// side loses c = Int(((W / rH + 0.5 - Dw) / 2) * rH + 0.5) pixels at each end
// (likewise for the taller side), never less than 0 and never so many that
// nothing is left.
SourceRect FitSource(int W, int H, int Dw, int Dh, bool autoCrop);

// Pixels as 0xAARRGGBB words (the alpha byte is ignored), rows `stride`
// words apart.
struct PixelBuffer {
    const uint32_t* pixels = nullptr;
    int width = 0;
    int height = 0;
    int stride = 0;
};

// Draws the source rectangle (x0, y0, w, h in buffer pixels, fractions
// allowed) into a dw x dh picture: each target pixel is the mean of the
// source area it covers, partly covered source pixels weighted by the part
// covered. The result holds colour values (red + 256 green + 65536 blue).
Picture ResampleArea(const PixelBuffer& source, double x0, double y0, double w, double h, int dw, int dh);

} // namespace store
