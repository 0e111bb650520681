#include "imaging/DibSurface.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstring>
#include <limits>
#include <new>
#include <random>
#include <stdexcept>
#include <string>

namespace {
constexpr int64_t kMax32 = std::numeric_limits<int32_t>::max();
constexpr int64_t kMin32 = std::numeric_limits<int32_t>::min();

bool Fits32(int64_t v) { return v >= kMin32 && v <= kMax32; }

// A channel value from one interpolation step: nearest, ties to even.
int32_t Nearest(double v) { return static_cast<int32_t>(std::nearbyint(v)); }

// The overlap of a block of w x h at (sx, sy) in a source of sw x sh placed
// at (dx, dy) in a target of dw x dh. Leaves w or h at 0 when nothing is left.
struct Block {
    int64_t sx, sy, dx, dy, w, h;
};
Block Clip(Block b, int64_t sw, int64_t sh, int64_t dw, int64_t dh) {
    auto clipAxis = [](int64_t& s, int64_t& d, int64_t& n, int64_t sn, int64_t dn) {
        const int64_t shift = std::max<int64_t>({0, -s, -d});
        s += shift;
        d += shift;
        n -= shift;
        n = std::min({n, sn - s, dn - d});
        if (n < 0) n = 0;
    };
    clipAxis(b.sx, b.dx, b.w, sw, dw);
    clipAxis(b.sy, b.dy, b.h, sh, dh);
    return b;
}
} // namespace

bool DibSurface::Create(int32_t lWidth, int32_t lHeight) {
    ClearUp();
    return CreateDIB(lWidth, lHeight);
}

bool DibSurface::CreateDIB(int32_t lWidth, int32_t lHeight, bool zeroed) {
    const int64_t stride = (int64_t{lWidth} * 3 + 3) & ~int64_t{3};
    const int64_t image = stride * lHeight;
    if (!Fits32(int64_t{lWidth} * 3 + 3) || !Fits32(image))
        throw std::overflow_error("A picture of " + std::to_string(lWidth) + " x " + std::to_string(lHeight) +
                                  " pixels is too large to hold.");
    width_ = lWidth;
    height_ = lHeight;
    imageSize_ = static_cast<int32_t>(image);
    if (lWidth <= 0 || lHeight <= 0) return false;
    bits_.reset(new (std::nothrow) uint8_t[static_cast<size_t>(image)]);
    if (!bits_) return false;
    if (zeroed) {
        std::memset(bits_.get(), 0, static_cast<size_t>(image));
    } else {
        const size_t pixels = 3 * static_cast<size_t>(lWidth);
        for (int32_t r = 0; r < lHeight; ++r)
            std::memset(bits_.get() + static_cast<size_t>(r) * static_cast<size_t>(stride) + pixels, 0,
                        static_cast<size_t>(stride) - pixels);
    }
    return true;
}

void DibSurface::CreateFromPicture(const Picture& picThis) {
    ClearUp();
    // Every pixel is written next, so only the padding needs clearing.
    if (!CreateDIB(picThis.width(), picThis.height(), false)) return;
    LoadPictureBlt(picThis);
}

void DibSurface::LoadPictureBlt(const Picture& src, int32_t lSrcLeft, int32_t lSrcTop, int32_t lSrcWidth,
                                int32_t lSrcHeight) {
    if (!live()) return;
    const Block b = Clip({lSrcLeft, lSrcTop, 0, 0, lSrcWidth < 0 ? width_ : lSrcWidth, lSrcHeight < 0 ? height_ : lSrcHeight},
                         src.width(), src.height(), width_, height_);
    for (int64_t j = 0; j < b.h; ++j) {
        uint8_t* out = At(static_cast<int32_t>(b.dx), static_cast<int32_t>(b.dy + j));
        const int32_t* in = src.data() + (b.sy + j) * src.width() + b.sx;
        for (int64_t i = 0; i < b.w; ++i, out += 3) {
            const auto v = static_cast<uint32_t>(in[i]);
            out[0] = static_cast<uint8_t>(v >> 16);
            out[1] = static_cast<uint8_t>(v >> 8);
            out[2] = static_cast<uint8_t>(v);
        }
    }
}

void DibSurface::LoadPictureBlt(const DibSurface& src, int32_t lSrcLeft, int32_t lSrcTop, int32_t lSrcWidth,
                                int32_t lSrcHeight) {
    if (!live() || !src.live()) return;
    const Block b = Clip({lSrcLeft, lSrcTop, 0, 0, lSrcWidth < 0 ? width_ : lSrcWidth, lSrcHeight < 0 ? height_ : lSrcHeight},
                         src.width_, src.height_, width_, height_);
    for (int64_t j = 0; j < b.h; ++j)
        std::copy_n(src.At(static_cast<int32_t>(b.sx), static_cast<int32_t>(b.sy + j)), 3 * b.w,
                    At(static_cast<int32_t>(b.dx), static_cast<int32_t>(b.dy + j)));
}

void DibSurface::PaintPicture(Picture& dest, int32_t lDestLeft, int32_t lDestTop, int32_t lDestWidth,
                              int32_t lDestHeight, int32_t lSrcLeft, int32_t lSrcTop) const {
    if (!live()) return;
    const Block b = Clip({lSrcLeft, lSrcTop, lDestLeft, lDestTop, lDestWidth < 0 ? width_ : lDestWidth,
                          lDestHeight < 0 ? height_ : lDestHeight},
                         width_, height_, dest.width(), dest.height());
    for (int64_t j = 0; j < b.h; ++j) {
        const uint8_t* in = At(static_cast<int32_t>(b.sx), static_cast<int32_t>(b.sy + j));
        for (int64_t i = 0; i < b.w; ++i, in += 3)
            dest.setPixel(static_cast<int>(b.dx + i), static_cast<int>(b.dy + j), in[2] + 256 * in[1] + 65536 * in[0]);
    }
}

void DibSurface::RandomiseBits(bool bGray) {
    if (!live()) return;
    std::mt19937 generator(static_cast<uint32_t>(std::chrono::system_clock::now().time_since_epoch().count()));
    std::uniform_real_distribution<double> unit(0.0, 1.0);
    auto value = [&] { return static_cast<uint8_t>(std::clamp(Nearest(unit(generator) * 255.0), 0, 255)); };
    const size_t stride = static_cast<size_t>(BytesPerScanLine());
    if (bGray) {
        for (int32_t r = 0; r < height_; ++r)
            for (int32_t x = 0; x < width_; ++x) {
                uint8_t* p = bits_.get() + r * stride + 3 * static_cast<size_t>(x);
                p[0] = p[1] = p[2] = value();
            }
    } else {
        for (int32_t x = 0; x < width_; ++x)
            for (int32_t r = 0; r < height_; ++r) {
                uint8_t* p = bits_.get() + r * stride + 3 * static_cast<size_t>(x);
                p[0] = 0;
                p[1] = value();
                p[2] = value();
            }
    }
}

std::unique_ptr<DibSurface> DibSurface::Resample(int32_t lNewHeight, int32_t lNewWidth) const {
    auto target = std::make_unique<DibSurface>();
    if (!target->Create(lNewWidth, lNewHeight)) return nullptr;
    if (lNewWidth == width_ && lNewHeight == height_)
        target->LoadPictureBlt(*this);
    else
        ResampleInto(*target);
    return target;
}

// Bilinear over the four neighbours, in memory rows. The scales divide by the
// new size itself, so the right and lower neighbours stay inside the source;
// a source of one column or row (which nothing resamples) reads its edge twice.
void DibSurface::ResampleInto(DibSurface& target) const {
    if (!live()) return;
    const float xScale = static_cast<float>(static_cast<double>(width_ - 1) / target.width_);
    const float yScale = static_cast<float>(static_cast<double>(height_ - 1) / target.height_);
    const size_t stride = static_cast<size_t>(BytesPerScanLine());
    const size_t targetStride = static_cast<size_t>(target.BytesPerScanLine());
    for (int32_t y = 0; y < target.height_; ++y) {
        const float sy = static_cast<float>(static_cast<double>(yScale) * y);
        const auto yi = static_cast<int32_t>(std::floor(sy));
        const float fy = static_cast<float>(static_cast<double>(sy) - yi);
        const int32_t yn = std::min(yi + 1, height_ - 1);
        for (int32_t x = 0; x < target.width_; ++x) {
            const float sx = static_cast<float>(static_cast<double>(xScale) * x);
            const auto xi = static_cast<int32_t>(std::floor(sx));
            const float fx = static_cast<float>(static_cast<double>(sx) - xi);
            const int32_t xn = std::min(xi + 1, width_ - 1);
            const uint8_t* p00 = bits_.get() + static_cast<size_t>(yi) * stride + 3 * static_cast<size_t>(xi);
            const uint8_t* p10 = bits_.get() + static_cast<size_t>(yi) * stride + 3 * static_cast<size_t>(xn);
            const uint8_t* p01 = bits_.get() + static_cast<size_t>(yn) * stride + 3 * static_cast<size_t>(xi);
            const uint8_t* p11 = bits_.get() + static_cast<size_t>(yn) * stride + 3 * static_cast<size_t>(xn);
            uint8_t* out = target.bits_.get() + static_cast<size_t>(y) * targetStride + 3 * static_cast<size_t>(x);
            for (int c = 0; c < 3; ++c) {
                const int32_t left = Nearest((1.0 - fy) * p00[c] + static_cast<double>(fy) * p01[c]);
                const int32_t right = Nearest((1.0 - fy) * p10[c] + static_cast<double>(fy) * p11[c]);
                const int32_t value = Nearest((1.0 - fx) * left + static_cast<double>(fx) * right);
                out[c] = static_cast<uint8_t>(std::clamp(value, 0, 255));
            }
        }
    }
}
