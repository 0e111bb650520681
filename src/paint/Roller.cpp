// The roller: square rings around the mouse, walked from the inside out; a
// pixel takes paint only next to paint of the same box and close to the
// running match colour.
#include <cmath>

#include "paint/PaintEngine.h"

namespace {
constexpr int kWideRings = 20;
constexpr int kNarrowRings = 5;
constexpr int kMismatchesAllowed = 1;
} // namespace

void PaintEngine::RollerAt(int x, int y) {
    const int rings = ws_.WideRoller ? kWideRings : kNarrowRings;
    int left = x, right = x, top = y, bottom = y;
    for (int ring = 1; ring <= rings; ++ring) {
        left = left - 1 < 0 ? 0 : left - 1;
        right = right + 1 > maxX() ? maxX() : right + 1;
        top = top - 1 < 0 ? 0 : top - 1;
        bottom = bottom + 1 > maxY() ? maxY() : bottom + 1;
        // Clockwise from the top-left corner; corners come twice.
        for (int i = left; i <= right; ++i) PaintPixel(i, top);
        for (int j = top; j <= bottom; ++j) PaintPixel(right, j);
        for (int i = right; i >= left; --i) PaintPixel(i, bottom);
        for (int j = bottom; j >= top; --j) PaintPixel(left, j);
    }
    host_.RefreshPicture();
}

bool PaintEngine::PaintPixel(int x, int y) {
    if (!Inside(x, y)) return false;
    const int at = x + Workspace::kMaskWidth * y;
    int16_t* stroke = ws_.PaintMask.data();
    int16_t* color = stroke + Workspace::kMaskPlane;

    if (ws_.ProtectPaint && stroke[at] > 0) {
        // Paint of this very stroke still steers the match colour.
        if (stroke[at] == ws_.StrokeNumber) UpdateMatchColor(x, y);
        return false;
    }

    // Chalk pixels hold the negative box index and so never pass on paint.
    const int16_t box = ws_.CurrentColor;
    auto paintedWithBox = [&](int n) { return color[n] == box && stroke[n] > 0; };
    const bool touches = (x > 0 && paintedWithBox(at - 1)) || (x < maxX() && paintedWithBox(at + 1)) ||
                         (y > 0 && paintedWithBox(at - Workspace::kMaskWidth)) ||
                         (y < maxY() && paintedWithBox(at + Workspace::kMaskWidth));
    if (!touches) return false;

    const int planeAt = x + Workspace::kPlaneWidth * y;
    int mismatches = 0;
    for (int i = 0; i < Workspace::kPlaneCount; ++i) {
        const int32_t m = static_cast<int32_t>(std::nearbyint(ws_.MatchColor[static_cast<size_t>(i)]));
        const int32_t t = ws_.PlaneTolerance[static_cast<size_t>(i)];
        const int32_t low = m > t ? m - t : 0;
        const int32_t high = m < 255 - t ? m + t : 255;
        const int32_t v = ws_.PixelPlanes[static_cast<size_t>(planeAt + Workspace::kPlaneSize * i)];
        if ((v < low || v > high) && ++mismatches > kMismatchesAllowed) return false;
    }

    stroke[at] = static_cast<int16_t>(ws_.StrokeNumber);
    color[at] = box;
    UpdateMatchColor(x, y);
    RecolorPixel(x, y);
    if (x < ws_.StrokeLeft) ws_.StrokeLeft = static_cast<int16_t>(x);
    if (x > ws_.StrokeRight) ws_.StrokeRight = static_cast<int16_t>(x);
    if (y < ws_.StrokeTop) ws_.StrokeTop = static_cast<int16_t>(y);
    if (y > ws_.StrokeBottom) ws_.StrokeBottom = static_cast<int16_t>(y);
    return true;
}

void PaintEngine::UpdateMatchColor(int x, int y) {
    const double weight = ws_.MatchWeight;
    for (int i = 0; i < Workspace::kPlaneCount; ++i) {
        float& m = ws_.MatchColor[static_cast<size_t>(i)];
        m = static_cast<float>((m * weight + ws_.Plane(x, y, i)) / (weight + 1.0));
    }
}
