#pragma once
#include <cstddef>
#include <cstddef>
#include <cstdint>
#include <vector>

// A picture held as colour values (red + 256 x green + 65536 x blue), one per
// pixel, rows top to bottom. The engine reads and writes single pixels; the
// window shows Picture1 as it stands.
class Picture {
public:
    Picture() = default;
    Picture(int width, int height, int32_t fill = 0)
        : width_(width), height_(height), pixels_(static_cast<size_t>(width) * height, fill) {}

    int width() const { return width_; }
    int height() const { return height_; }
    bool contains(int x, int y) const { return x >= 0 && y >= 0 && x < width_ && y < height_; }

    int32_t pixel(int x, int y) const { return pixels_[static_cast<size_t>(x) + static_cast<size_t>(width_) * y]; }
    void setPixel(int x, int y, int32_t color) {
        pixels_[static_cast<size_t>(x) + static_cast<size_t>(width_) * y] = color;
    }

    const int32_t* data() const { return pixels_.data(); }
    int32_t* data() { return pixels_.data(); }
    void fill(int32_t color) { pixels_.assign(pixels_.size(), color); }

    bool operator==(const Picture&) const = default;

private:
    int width_ = 0;
    int height_ = 0;
    std::vector<int32_t> pixels_;
};
