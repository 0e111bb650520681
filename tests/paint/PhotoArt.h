#pragma once
// Small hand-drawn photos for the painting tests, and the paint mask read
// back as ASCII art.
#include <cmath>
#include <string>
#include <vector>

#include "imaging/HSLcolor.h"
#include "paint/Workspace.h"

namespace painttest {

using Art = std::vector<std::string>;

// Photo colours: none grey, none symmetric in red and blue.
inline int32_t Swatch(char c) {
    switch (c) {
    case 'R': return HSLcolor::JoinColor(200, 40, 30);   // brick
    case 'B': return HSLcolor::JoinColor(30, 60, 190);   // blue door
    case 'G': return HSLcolor::JoinColor(40, 160, 60);   // hedge
    case 'y': return HSLcolor::JoinColor(150, 135, 25);  // the wall in shade
    default: return HSLcolor::JoinColor(220, 200, 40);   // sunlit wall
    }
}

// Sets one photo pixel everywhere the engine reads it: the pictures, the six
// analysis planes (unsmoothed) and the luma.
inline void SetPhotoPixel(Workspace& ws, int x, int y, int32_t color) {
    ws.Picture1.setPixel(x, y, color);
    ws.Picture2.setPixel(x, y, color);
    ws.Image1.setPixel(x, y, color);
    const HSLcolor::RGB c = HSLcolor::SplitColor(color);
    const HSLcolor::HSL h = HSLcolor::RGBToHSL(c);
    const double wave = (std::sin(h.hue / 256.0 * 360.0 * 3.14159 / 180.0) * 127.0 + 128.0) *
                        (1.0 - (1.0 / (h.lum + 1.0)) / 1000.0);
    const int32_t planes[] = {c.red, c.green, c.blue, static_cast<int32_t>(h.lum),
                              static_cast<int32_t>(std::nearbyint(wave)), static_cast<int32_t>(h.sat)};
    for (int p = 0; p < 6; ++p) ws.Plane(x, y, p) = planes[p];
    ws.Luma(x, y) = static_cast<int32_t>(std::nearbyint(c.green * 0.5882 + c.red * 0.298 + c.blue * 0.1098));
}

// Rows of swatch letters with their top-left corner at (left, top).
inline void DrawPhoto(Workspace& ws, const Art& rows, int left = 0, int top = 0) {
    for (size_t j = 0; j < rows.size(); ++j)
        for (size_t i = 0; i < rows[j].size(); ++i)
            SetPhotoPixel(ws, left + static_cast<int>(i), top + static_cast<int>(j), Swatch(rows[j][i]));
}

inline void FillPhoto(Workspace& ws, char c) {
    DrawPhoto(ws, Art(Workspace::kHeight, std::string(Workspace::kWidth, c)));
}

// Mask cells from art, all with `box`: '.' leaves the cell, a digit n is
// stroke n, a letter a..i stroke -1..-9, '#' chalk (stroke 1, colour -box).
inline void DrawMask(Workspace& ws, const Art& rows, int box, int left = 0, int top = 0) {
    for (size_t j = 0; j < rows.size(); ++j)
        for (size_t i = 0; i < rows[j].size(); ++i) {
            const int x = left + static_cast<int>(i), y = top + static_cast<int>(j);
            const char c = rows[j][i];
            if (c == '.') continue;
            const bool chalk = c == '#';
            ws.Stroke(x, y) = static_cast<int16_t>(chalk ? 1 : c <= '9' ? c - '0' : 'a' - c - 1);
            ws.ColorPlane(x, y) = static_cast<int16_t>(chalk ? -box : box);
        }
}

// A mask plane (0 strokes, 1 colour boxes) as art: '.' = 0, '1'..'9',
// 'a'..'i' = -1..-9, '+' above 9, '-' below -9.
inline Art MaskArt(const Workspace& ws, int plane, int left, int top, int width, int height) {
    Art rows(static_cast<size_t>(height));
    for (int y = top; y < top + height; ++y)
        for (int x = left; x < left + width; ++x) {
            const int v = plane == 0 ? ws.Stroke(x, y) : ws.ColorPlane(x, y);
            rows[static_cast<size_t>(y - top)] +=
                v == 0 ? '.' : v > 9 ? '+' : v > 0 ? static_cast<char>('0' + v) : v >= -9 ? static_cast<char>('a' - v - 1) : '-';
        }
    return rows;
}

inline int CountStroke(const Workspace& ws, int value) {
    int n = 0;
    for (int y = 0; y < Workspace::kMaskHeight; ++y)
        for (int x = 0; x < Workspace::kMaskWidth; ++x) n += ws.Stroke(x, y) == value;
    return n;
}

} // namespace painttest
