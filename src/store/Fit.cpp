#include "store/Fit.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace store {

namespace {
// The crop of one side: c = Int(((size / r + 0.5 - target) / 2) * r + 0.5).
int CropOf(int size, float r, int target) {
    const double c = std::floor(((size / static_cast<double>(r) + 0.5 - target) / 2) * r + 0.5);
    const int most = (size - 1) / 2;  // keep at least one pixel
    return static_cast<int>(std::clamp(c, 0.0, static_cast<double>(most)));
}

// For each target cell along one axis: the source pixels it covers and how much.
struct Tap {
    int first = 0;
    std::vector<double> weights;
};

std::vector<Tap> Taps(double start, double length, int limit, int count) {
    std::vector<Tap> taps(static_cast<size_t>(count));
    const double step = length / count;
    for (int i = 0; i < count; ++i) {
        double a = start + i * step;
        double b = a + step;
        a = std::clamp(a, 0.0, static_cast<double>(limit));
        b = std::clamp(b, 0.0, static_cast<double>(limit));
        int first = static_cast<int>(std::floor(a));
        int last = static_cast<int>(std::ceil(b)) - 1;
        first = std::clamp(first, 0, limit - 1);
        last = std::clamp(last, first, limit - 1);
        Tap& t = taps[static_cast<size_t>(i)];
        t.first = first;
        double total = 0;
        for (int s = first; s <= last; ++s) {
            const double cover = std::min(b, s + 1.0) - std::max(a, static_cast<double>(s));
            t.weights.push_back(std::max(cover, 0.0));
            total += t.weights.back();
        }
        if (total <= 0) {
            // A cell narrower than rounding: take the nearest source pixel.
            t.weights.assign(t.weights.size(), 0.0);
            t.weights[0] = 1.0;
            total = 1.0;
        }
        for (double& w : t.weights) w /= total;
    }
    return taps;
}
} // namespace

SourceRect FitSource(int W, int H, int Dw, int Dh, bool autoCrop) {
    if (!autoCrop || W <= 0 || H <= 0) return SourceRect{0, 0, W, H};
    const auto rW = static_cast<float>(static_cast<double>(W) / Dw);
    const auto rH = static_cast<float>(static_cast<double>(H) / Dh);
    if (rW >= rH) {
        const int c = CropOf(W, rH, Dw);
        return SourceRect{c, 0, W - 2 * c, H};
    }
    const int c = CropOf(H, rW, Dh);
    return SourceRect{0, c, W, H - 2 * c};
}

Picture ResampleArea(const PixelBuffer& source, double x0, double y0, double w, double h, int dw, int dh) {
    Picture out(dw, dh);
    if (source.width <= 0 || source.height <= 0 || w <= 0 || h <= 0) return out;
    const std::vector<Tap> xs = Taps(x0, w, source.width, dw);
    const std::vector<Tap> ys = Taps(y0, h, source.height, dh);

    // Horizontal pass into a float row buffer per source row used, then vertical.
    const int rowFirst = ys.front().first;
    const int rowLast = ys.back().first + static_cast<int>(ys.back().weights.size()) - 1;
    std::vector<float> rows(static_cast<size_t>(rowLast - rowFirst + 1) * dw * 3);
    for (int sy = rowFirst; sy <= rowLast; ++sy) {
        const uint32_t* line = source.pixels + static_cast<size_t>(sy) * source.stride;
        float* dst = rows.data() + static_cast<size_t>(sy - rowFirst) * dw * 3;
        for (int i = 0; i < dw; ++i) {
            const Tap& t = xs[static_cast<size_t>(i)];
            double r = 0, g = 0, b = 0;
            for (size_t k = 0; k < t.weights.size(); ++k) {
                const uint32_t p = line[t.first + static_cast<int>(k)];
                r += t.weights[k] * ((p >> 16) & 0xFFu);
                g += t.weights[k] * ((p >> 8) & 0xFFu);
                b += t.weights[k] * (p & 0xFFu);
            }
            dst[3 * i] = static_cast<float>(r);
            dst[3 * i + 1] = static_cast<float>(g);
            dst[3 * i + 2] = static_cast<float>(b);
        }
    }
    for (int j = 0; j < dh; ++j) {
        const Tap& t = ys[static_cast<size_t>(j)];
        for (int i = 0; i < dw; ++i) {
            double c[3] = {0, 0, 0};
            for (size_t k = 0; k < t.weights.size(); ++k) {
                const float* src = rows.data() + (static_cast<size_t>(t.first + static_cast<int>(k) - rowFirst) * dw + i) * 3;
                for (int ch = 0; ch < 3; ++ch) c[ch] += t.weights[k] * src[ch];
            }
            auto byte = [](double v) { return static_cast<int32_t>(std::clamp(std::nearbyint(v), 0.0, 255.0)); };
            out.setPixel(i, j, byte(c[0]) + 256 * byte(c[1]) + 65536 * byte(c[2]));
        }
    }
    return out;
}

} // namespace store
