// Recolouring: painted pixels keep the photo's light and shade relative to
// the box's reference luminance; the edge pass blends or un-blends borders.
#include <cmath>
#include <cstdlib>
#include <cstring>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"

namespace {

constexpr float kBrighten = 1.15f;  // exponent for pixels brighter than the reference

// Pixel colour for a photo luma under a drawing colour. Each step is a float
// formed once from a double expression, as the colour model expects.
int32_t ComputeRecolor(int32_t lum, float hue, float sat, float paintLum, float refLum) {
    const float d = static_cast<float>(lum - static_cast<double>(refLum));
    const double e = d > 0.0f ? static_cast<double>(kBrighten) : 1.0;
    const double sign = d > 0.0f ? 1.0 : (d < 0.0f ? -1.0 : 0.0);
    float l = static_cast<float>(sign * std::pow(std::fabs(static_cast<double>(d)), e) + paintLum);
    if (l > 255.0f) l = 255.0f;
    if (l < 0.0f) l = 0.0f;

    const double ratio = lum / (static_cast<double>(refLum) + 1.0);
    const double s = std::nearbyint(std::pow(ratio, 2.0) * sat);
    int32_t si = 0;
    if (!(s <= 255.0))
        si = 255;
    else if (s > 0.0)
        si = static_cast<int32_t>(s);
    return HSLcolor::JoinColor(HSLcolor::HSLToRGB(hue, static_cast<float>(si), l));
}

// Per channel nearest((2 x own + other) / 3).
HSLcolor::RGB Mix(const HSLcolor::RGB& own, const HSLcolor::RGB& other) {
    auto one = [](int32_t a, int32_t b) { return static_cast<int32_t>(std::nearbyint((2.0 * a + b) / 3.0)); };
    return {one(own.red, other.red), one(own.green, other.green), one(own.blue, other.blue)};
}

} // namespace

int32_t PaintEngine::BoxColor(int i) const {
    return i >= 1 && i <= kColorBoxCount ? ws_.Boxes[static_cast<size_t>(i)].color : kButtonFace;
}

int32_t PaintEngine::BoxReference(int i) const {
    return i >= 1 && i <= kColorBoxCount ? ws_.Boxes[static_cast<size_t>(i)].reference : 0;
}

bool PaintEngine::Drawable(int i) const {
    i = std::abs(i);
    return BoxColor(i) != kButtonFace && BoxReference(i) != 0;
}

int32_t PaintEngine::RecolorValue(int32_t lum) {
    if (lum < 0 || lum > 255) return ComputeRecolor(lum, ws_.PaintHue, ws_.PaintSat, ws_.PaintLum, ws_.RefLum);
    const std::array<float, 4> key{ws_.PaintHue, ws_.PaintSat, ws_.PaintLum, ws_.RefLum};
    if (std::memcmp(key.data(), cache_.key.data(), sizeof key) != 0) {
        cache_.key = key;
        ++cache_.generation;
    }
    const auto idx = static_cast<size_t>(lum);
    if (cache_.stamp[idx] != cache_.generation) {
        cache_.color[idx] = ComputeRecolor(lum, key[0], key[1], key[2], key[3]);
        cache_.stamp[idx] = cache_.generation;
    }
    return cache_.color[idx];
}

void PaintEngine::RecolorPixel(int x, int y) {
    if (!ws_.Picture1.contains(x, y)) return;
    ws_.Picture1.setPixel(x, y, RecolorValue(ws_.Luma(x, y)));
    ws_.PictureModified = true;
}

void PaintEngine::RepaintColor(int i) {
    if (i == 0) return;
    i = std::abs(i);
    if (i > kColorBoxCount || BoxReference(i) == 0) return;
    LoadDrawColor(ws_, i);
    // Each pixel's colour depends on nothing but its own luma, so the rows
    // can be walked in memory order.
    const int16_t* stroke = ws_.PaintMask.data();
    const int16_t* color = stroke + Workspace::kMaskPlane;
    for (int y = 0; y <= maxY(); ++y) {
        const int row = Workspace::kMaskWidth * y;
        for (int x = 0; x <= maxX(); ++x)
            if (stroke[row + x] > 0 && std::abs(color[row + x]) == i) RecolorPixel(x, y);
    }
    host_.RefreshPicture();
    LoadDrawColor(ws_, ws_.CurrentColor);
    ws_.PictureModified = true;
}

void PaintEngine::BlendOutsidePixel(int x, int y, int i) {
    const HSLcolor::RGB m = Mix(HSLcolor::SplitColor(ws_.Picture2.pixel(x, y)), HSLcolor::SplitColor(BoxColor(i)));
    const HSLcolor::HSL paint = HSLcolor::RGBToHSL(m);
    ws_.PaintHue = paint.hue;
    ws_.PaintSat = paint.sat;
    ws_.PaintLum = paint.lum;
    const int32_t reference = BoxReference(i);
    if (reference == 0) return;
    ws_.RefLum = HSLcolor::RGBToHSL(Mix(m, HSLcolor::SplitColor(reference))).lum;
}

void PaintEngine::BlendBoundaryPixel(int& a, int& b) {
    a = std::abs(a);
    b = std::abs(b);
    const HSLcolor::HSL paint =
        HSLcolor::RGBToHSL(Mix(HSLcolor::SplitColor(BoxColor(a)), HSLcolor::SplitColor(BoxColor(b))));
    ws_.PaintHue = paint.hue;
    ws_.PaintSat = paint.sat;
    ws_.PaintLum = paint.lum;
    ws_.RefLum = HSLcolor::RGBToHSL(
                     Mix(HSLcolor::SplitColor(BoxReference(a)), HSLcolor::SplitColor(BoxReference(b))))
                     .lum;
}

void PaintEngine::RefreshAll() {
    if (!ws_.PictureLoaded) return;
    ws_.Picture1 = ws_.Picture2;
    host_.RefreshPicture();
    for (int i = 1; i <= kColorBoxCount; ++i) {
        host_.PumpEvents();
        RepaintColor(i);
    }
    RenderEdges(0);
    host_.RefreshPicture();
}
