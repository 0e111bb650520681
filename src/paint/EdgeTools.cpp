// Tools that change the paint mask outside the roller's colour test: edge
// expansion, the eraser and the chalk line.
#include <algorithm>
#include <cmath>
#include <cstdlib>

#include "paint/PaintEngine.h"

void PaintEngine::ExpandEdges() {
    const int n = ws_.StrokeNumber;
    if (n < 1) return;  // no stroke to grow, and 0 would match every unpainted pixel

    // One pixel wider, but never the outermost rows and columns.
    const int lastX = innerMaxX();
    const int lastY = innerMaxY();
    ws_.StrokeLeft = static_cast<int16_t>(std::max(ws_.StrokeLeft - 1, 1));
    ws_.StrokeRight = static_cast<int16_t>(std::min(ws_.StrokeRight + 1, lastX));
    ws_.StrokeTop = static_cast<int16_t>(std::max(ws_.StrokeTop - 1, 1));
    ws_.StrokeBottom = static_cast<int16_t>(std::min(ws_.StrokeBottom + 1, lastY));

    // Added pixels get their stroke number only after the pass, so they do
    // not count as stroke pixels for their neighbours: the growth is exactly
    // one pixel. (Keeping them aside also avoids a marker beyond the largest
    // stroke number.)
    if (grown_.capacity() == 0) grown_.reserve(static_cast<size_t>(Workspace::kWidth) * Workspace::kHeight);
    grown_.clear();
    int16_t* stroke = ws_.PaintMask.data();
    int16_t* color = stroke + Workspace::kMaskPlane;
    constexpr int W = Workspace::kMaskWidth;
    for (int x = ws_.StrokeLeft; x <= ws_.StrokeRight; ++x) {
        for (int y = ws_.StrokeTop; y <= ws_.StrokeBottom; ++y) {
            const int at = x + W * y;
            if (stroke[at] > 0) continue;
            if (stroke[at - 1] == n || stroke[at + 1] == n || stroke[at - W] == n || stroke[at + W] == n) {
                grown_.push_back(at);
                color[at] = ws_.CurrentColor;
                RecolorPixel(x, y);
            }
        }
    }
    for (const int at : grown_) stroke[at] = static_cast<int16_t>(n);
    host_.RefreshPicture();
}

void PaintEngine::EraseAt(int x, int y) {
    // Erased paint waits as the next redo step, whose number must still fit.
    if (ws_.StrokeNumber >= Workspace::kMaxStrokeNumber) return;
    const int x1 = std::max(x - 3, 0);
    const int x2 = std::min(x + 3, maxX());
    const int y1 = std::max(y - 3, 0);
    const int y2 = std::min(y + 3, maxY());
    const auto erased = static_cast<int16_t>(-(ws_.StrokeNumber + 1));
    bool erasedPaint = false;
    for (int j = y1; j <= y2; ++j) {
        for (int i = x1; i <= x2; ++i) {
            int16_t& s = ws_.Stroke(i, j);
            if (s > 0) {
                s = erased;
                erasedPaint = true;
            }
            ws_.Picture1.setPixel(i, j, ws_.Picture2.pixel(i, j));
        }
    }
    host_.RefreshPicture();
    ws_.PictureModified = true;
    if (erasedPaint && !ws_.RedoEnabled) {
        ws_.RedoEnabled = true;
        host_.ToolStateChanged();
    }
}

void PaintEngine::DrawChalkLine(bool erase, bool commit) {
    auto clamp = [](int16_t& v, int high) {
        if (v < 0) v = 0;
        if (v > high) v = static_cast<int16_t>(high);
    };
    clamp(ws_.ChalkStartX, maxX());
    clamp(ws_.ChalkEndX, maxX());
    clamp(ws_.ChalkStartY, maxY());
    clamp(ws_.ChalkEndY, maxY());
    const int x0 = ws_.ChalkStartX, y0 = ws_.ChalkStartY;
    const int x1 = ws_.ChalkEndX, y1 = ws_.ChalkEndY;
    if (x0 == x1 && y0 == y1) return;

    const int sx = x0 > x1 ? -1 : 1;
    const int sy = y0 > y1 ? -1 : 1;
    const int dx = std::abs(x0 - x1);
    const int dy = std::abs(y0 - y1);
    int last = ws_.CurrentColor;

    auto treat = [&](int x, int y) {
        if (erase) {
            // Put back what the mask says the pixel is.
            if (ws_.Stroke(x, y) < 1) {
                ws_.Picture1.setPixel(x, y, ws_.Picture2.pixel(x, y));
                return;
            }
            const int k = std::abs(ws_.ColorPlane(x, y));
            if (k != last) {
                last = k;
                LoadDrawColor(ws_, k);
            }
            RecolorPixel(x, y);
        } else if (commit) {
            ws_.Stroke(x, y) = static_cast<int16_t>(ws_.StrokeNumber);
            ws_.ColorPlane(x, y) = static_cast<int16_t>(-ws_.CurrentColor);
            RecolorPixel(x, y);
        } else {
            ws_.Picture1.setPixel(x, y, ~ws_.Picture1.pixel(x, y) & 0xFFFFFF);
        }
    };

    // One pixel per row for steep lines, per column for flat ones.
    auto step = [](int from, int k, double slope) {
        return static_cast<int>(std::nearbyint(slope * std::abs(k - from)));
    };
    if (dx <= dy) {
        const double slope = static_cast<double>(dx) / dy;
        for (int y = y0;; y += sy) {
            treat(x0 + sx * step(y0, y, slope), y);
            if (y == y1) break;
        }
    } else {
        const double slope = static_cast<double>(dy) / dx;
        for (int x = x0;; x += sx) {
            treat(x, y0 + sy * step(x0, x, slope));
            if (x == x1) break;
        }
    }
    LoadDrawColor(ws_, ws_.CurrentColor);
}
