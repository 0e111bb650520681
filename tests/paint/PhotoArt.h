#pragma once
// Hand-drawn photos for the painting tests and benchmarks, the paint mask
// read back as ASCII art, and a fake window that records what the engine asks.
#include <algorithm>
#include <cmath>
#include <string>
#include <vector>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"
#include "store/Analysis.h"

namespace painttest {

using Art = std::vector<std::string>;

// Photo colours: none grey, none symmetric in red and blue.
// 'R' brick, 'B' blue door, anything else sunlit wall.
inline int32_t Swatch(char c) {
    return c == 'R' ? HSLcolor::JoinColor(200, 40, 30) : c == 'B' ? HSLcolor::JoinColor(30, 60, 190) : HSLcolor::JoinColor(220, 200, 40);
}

// One photo pixel everywhere the engine reads it: the pictures, the six
// analysis planes (unsmoothed) and the luma.
inline void SetPhotoPixel(Workspace& ws, int x, int y, int32_t color) {
    ws.Picture1.setPixel(x, y, color);
    ws.Picture2.setPixel(x, y, color);
    ws.Image1.setPixel(x, y, color);
    const HSLcolor::RGB c = HSLcolor::SplitColor(color);
    const HSLcolor::HSL h = HSLcolor::RGBToHSL(c);
    const int32_t planes[] = {c.red, c.green, c.blue, static_cast<int32_t>(h.lum), store::HueWave(h.hue, h.lum),
                              static_cast<int32_t>(h.sat)};
    for (int p = 0; p < 6; ++p) ws.Plane(x, y, p) = planes[p];
    ws.Luma(x, y) = static_cast<int32_t>(std::nearbyint(c.green * 0.5882 + c.red * 0.298 + c.blue * 0.1098));
}

// Rows of swatch letters with their top-left corner at (left, top).
inline void DrawPhoto(Workspace& ws, const Art& rows, int left = 0, int top = 0) {
    for (size_t j = 0; j < rows.size(); ++j)
        for (size_t i = 0; i < rows[j].size(); ++i)
            SetPhotoPixel(ws, left + static_cast<int>(i), top + static_cast<int>(j), Swatch(rows[j][i]));
}

// Mask cells of `box`: '.' leaves the cell, a digit n is stroke n, a letter
// a..i stroke -1..-9, '#' chalk (stroke 1, colour -box).
inline void DrawMask(Workspace& ws, const Art& rows, int box, int left = 0, int top = 0) {
    for (size_t j = 0; j < rows.size(); ++j)
        for (size_t i = 0; i < rows[j].size(); ++i) {
            const int x = left + static_cast<int>(i), y = top + static_cast<int>(j), c = rows[j][i];
            if (c == '.') continue;
            ws.Stroke(x, y) = static_cast<int16_t>(c == '#' ? 1 : c <= '9' ? c - '0' : 'a' - c - 1);
            ws.ColorPlane(x, y) = static_cast<int16_t>(c == '#' ? -box : box);
        }
}

// A mask plane (0 strokes, 1 colour boxes) in the same letters.
inline Art MaskArt(const Workspace& ws, int plane, int left, int top, int width, int height) {
    Art rows(static_cast<size_t>(height));
    for (int y = top; y < top + height; ++y)
        for (int x = left; x < left + width; ++x) {
            const int v = plane == 0 ? ws.Stroke(x, y) : ws.ColorPlane(x, y);
            rows[static_cast<size_t>(y - top)] += static_cast<char>(v == 0 ? '.' : v > 0 ? '0' + v : 'a' - v - 1);
        }
    return rows;
}

inline int CountStroke(const Workspace& ws, int value) {
    return static_cast<int>(std::count(ws.PaintMask.begin(), ws.PaintMask.begin() + Workspace::kMaskPlane, value));
}

struct FakeHost : PaintHost {
    explicit FakeHost(Workspace& workspace) : ws(workspace) {}
    void RefreshPicture() override { ++refreshes; }
    void ToolStateChanged() override {}
    void Warning(const std::string& title, const std::string& text) override { warnings.push_back(title + "|" + text); }
    void PumpEvents() override { ++pumps; }
    void SelectColorBox(int index) override { ws.CurrentColor = static_cast<int16_t>(index); LoadDrawColor(ws, index); }
    Workspace& ws;
    int refreshes = 0, pumps = 0;
    std::vector<std::string> warnings;  // "title|text"
};

} // namespace painttest
