#include "store/Analysis.h"

#include <cmath>

#include "imaging/HSLcolor.h"

namespace store {

namespace {

int32_t Nearest(double v) { return static_cast<int32_t>(std::nearbyint(v)); }

// Sums that every visited pixel adds to; RefLum is summed in single precision.
struct Sums {
    float refLum = 0.0f;
    int32_t count = 0;
    int32_t red = 0;
    int32_t green = 0;
    int32_t blue = 0;
};

// The per-pixel bookkeeping shared by the three passes.
HSLcolor::RGB Visit(Workspace& ws, Sums& sums, int x, int y) {
    const HSLcolor::RGB c = HSLcolor::SplitColor(ws.Picture2.pixel(x, y));
    ws.Stroke(x, y) = 0;
    ws.ColorPlane(x, y) = 0;
    const int32_t luma = Nearest(c.green * 0.5882 + c.red * 0.298 + c.blue * 0.1098);
    ws.Luma(x, y) = luma;
    sums.refLum = static_cast<float>(static_cast<double>(sums.refLum) + luma);
    sums.count += 1;
    sums.red += c.red;
    sums.green += c.green;
    sums.blue += c.blue;
    return c;
}

// Planes 3..5 from the smoothed colour in planes 0..2.
void DeriveTonePlanes(Workspace& ws, int x, int y) {
    const HSLcolor::HSL hsl = HSLcolor::RGBToHSL(ws.Plane(x, y, 0), ws.Plane(x, y, 1), ws.Plane(x, y, 2));
    ws.Plane(x, y, 3) = Nearest(hsl.lum);
    ws.Plane(x, y, 5) = Nearest(hsl.sat);
    ws.Plane(x, y, 4) = HueWave(hsl.hue, hsl.lum);
}

void SetSmoothed(Workspace& ws, int x, int y, int32_t r, int32_t g, int32_t b) {
    ws.Plane(x, y, 0) = r;
    ws.Plane(x, y, 1) = g;
    ws.Plane(x, y, 2) = b;
    DeriveTonePlanes(ws, x, y);
}

// An edge pixel: the mean of its own raw colour and its smoothed inner
// neighbour (nx, ny).
void SmoothEdge(Workspace& ws, Sums& sums, int x, int y, int nx, int ny) {
    const HSLcolor::RGB c = Visit(ws, sums, x, y);
    auto mean2 = [&](int p, int32_t own) { return Nearest((ws.Plane(nx, ny, p) + own) / 2.0); };
    SetSmoothed(ws, x, y, mean2(0, c.red), mean2(1, c.green), mean2(2, c.blue));
}

// The contrast step: for x and y from 1 up, planes 0..2 become
// (2 v - a + 256) mod 256 around the averages; row 0 and column 0 stay, and
// planes 3..5 keep the values taken before this step.
bool ApplyContrastStep(Workspace& ws, const PhotoAverages& averages, const std::function<bool()>& yieldAndContinue) {
    const int32_t avg[3] = {averages.red, averages.green, averages.blue};
    for (int x = 1; x <= ws.WholeMaxX(); ++x) {
        if (yieldAndContinue && !yieldAndContinue()) return false;
        for (int y = 1; y <= ws.WholeMaxY(); ++y)
            for (int p = 0; p < 3; ++p) ws.Plane(x, y, p) = (2 * ws.Plane(x, y, p) - avg[p] + 256) % 256;
    }
    return true;
}

} // namespace

int32_t HueWave(float hue, float lum) {
    const double angle = static_cast<double>(hue) / 256 * 360 * 3.14159 / 180;
    return Nearest((std::sin(angle) * 127 + 128) * (1 - (1 / (static_cast<double>(lum) + 1)) / 1000));
}

bool AnalysePhoto(Workspace& ws, const std::function<bool()>& yieldAndContinue, PhotoAverages* averages) {
    const int maxX = ws.WholeMaxX();
    const int maxY = ws.WholeMaxY();
    Sums sums;

    // The interior pass reads row 0 and column 0 before they are rebuilt:
    // start them from 0 so the result depends on this photo alone.
    for (int p = 0; p < 3; ++p) {
        for (int x = 0; x <= maxX; ++x) ws.Plane(x, 0, p) = 0;
        for (int y = 0; y <= maxY; ++y) ws.Plane(0, y, p) = 0;
    }

    // Pass A, the interior: each colour is the mean of its left and upper
    // smoothed neighbours and its own raw value.
    for (int x = 1; x <= maxX; ++x) {
        if (yieldAndContinue && !yieldAndContinue()) return false;
        for (int y = 1; y <= maxY; ++y) {
            const HSLcolor::RGB c = Visit(ws, sums, x, y);
            auto mean3 = [&](int p, int32_t own) {
                return Nearest((ws.Plane(x - 1, y, p) + own + ws.Plane(x, y - 1, p)) / 3.0);
            };
            SetSmoothed(ws, x, y, mean3(0, c.red), mean3(1, c.green), mean3(2, c.blue));
        }
    }
    // Pass B, the top row, from the row below; pass C, the left column, from
    // the column to its right: (0, 0) is visited a second time and counted twice.
    for (int x = 0; x <= maxX; ++x) SmoothEdge(ws, sums, x, 0, x, 1);
    for (int y = 0; y <= maxY; ++y) SmoothEdge(ws, sums, 0, y, 1, y);

    const double count = sums.count;
    ws.RefLum = static_cast<float>(std::floor(static_cast<double>(sums.refLum) / count));
    const PhotoAverages result{sums.count, Nearest(sums.red / count), Nearest(sums.green / count), Nearest(sums.blue / count)};
    ws.StrokeNumber = 0;
    ws.UndoEnabled = false;
    ws.RedoEnabled = false;
    if (averages) *averages = result;
    return ApplyContrastStep(ws, result, yieldAndContinue);
}

} // namespace store
