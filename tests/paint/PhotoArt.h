#pragma once
// Small hand-drawn photos for the painting tests: photos drawn as ASCII art
// into the workspace, and the paint mask read back as ASCII art.
#include <cmath>
#include <string>
#include <vector>

#include "imaging/HSLcolor.h"
#include "paint/Workspace.h"

namespace painttest {

// Photo colours of the fixtures: none of them grey, none symmetric in red and blue.
inline int32_t Swatch(char c) {
    switch (c) {
    case 'R': return HSLcolor::JoinColor(200, 40, 30);    // brick
    case 'B': return HSLcolor::JoinColor(30, 60, 190);    // blue door
    case 'G': return HSLcolor::JoinColor(40, 160, 60);    // hedge
    case 'Y': return HSLcolor::JoinColor(220, 200, 40);   // sunlit wall
    case 'y': return HSLcolor::JoinColor(150, 135, 25);   // the same wall in shade
    case 'K': return HSLcolor::JoinColor(0, 0, 0);
    default: return HSLcolor::JoinColor(120, 90, 200);    // violet
    }
}

// Sets one photo pixel everywhere the engine reads it: both pictures, Image1,
// the six analysis planes (unsmoothed) and the luma.
inline void SetPhotoPixel(Workspace& ws, int x, int y, int32_t color) {
    ws.Picture1.setPixel(x, y, color);
    ws.Picture2.setPixel(x, y, color);
    ws.Image1.setPixel(x, y, color);
    const HSLcolor::RGB c = HSLcolor::SplitColor(color);
    const HSLcolor::HSL h = HSLcolor::RGBToHSL(c);
    ws.Plane(x, y, 0) = c.red;
    ws.Plane(x, y, 1) = c.green;
    ws.Plane(x, y, 2) = c.blue;
    ws.Plane(x, y, 3) = static_cast<int32_t>(h.lum);
    const double wave = (std::sin(h.hue / 256.0 * 360.0 * 3.14159 / 180.0) * 127.0 + 128.0) *
                        (1.0 - (1.0 / (h.lum + 1.0)) / 1000.0);
    ws.Plane(x, y, 4) = static_cast<int32_t>(std::nearbyint(wave));
    ws.Plane(x, y, 5) = static_cast<int32_t>(h.sat);
    ws.Luma(x, y) = static_cast<int32_t>(std::nearbyint(c.green * 0.5882 + c.red * 0.298 + c.blue * 0.1098));
}

inline void FillPhoto(Workspace& ws, char c) {
    for (int y = 0; y < Workspace::kHeight; ++y)
        for (int x = 0; x < Workspace::kWidth; ++x) SetPhotoPixel(ws, x, y, Swatch(c));
}

// Draws rows of swatch letters with their top-left corner at (left, top).
inline void DrawPhoto(Workspace& ws, const std::vector<std::string>& rows, int left = 0, int top = 0) {
    for (size_t j = 0; j < rows.size(); ++j)
        for (size_t i = 0; i < rows[j].size(); ++i)
            SetPhotoPixel(ws, left + static_cast<int>(i), top + static_cast<int>(j), Swatch(rows[j][i]));
}

// Sets mask cells from art: '.' leaves the cell, a digit n paints stroke n
// with `box`, a letter a..i marks stroke -1..-9 with `box`, '#' is chalk of
// `box` (stroke `chalkStroke`, colour -box).
inline void DrawMask(Workspace& ws, const std::vector<std::string>& rows, int box, int left = 0, int top = 0,
                     int chalkStroke = 1) {
    for (size_t j = 0; j < rows.size(); ++j) {
        for (size_t i = 0; i < rows[j].size(); ++i) {
            const int x = left + static_cast<int>(i), y = top + static_cast<int>(j);
            const char c = rows[j][i];
            if (c >= '1' && c <= '9') {
                ws.Stroke(x, y) = static_cast<int16_t>(c - '0');
                ws.ColorPlane(x, y) = static_cast<int16_t>(box);
            } else if (c >= 'a' && c <= 'i') {
                ws.Stroke(x, y) = static_cast<int16_t>(-(c - 'a' + 1));
                ws.ColorPlane(x, y) = static_cast<int16_t>(box);
            } else if (c == '#') {
                ws.Stroke(x, y) = static_cast<int16_t>(chalkStroke);
                ws.ColorPlane(x, y) = static_cast<int16_t>(-box);
            }
        }
    }
}

// The stroke plane as art: '.' = 0, '1'..'9' painted, 'a'..'i' = -1..-9,
// '+' above 9, '-' below -9.
inline std::vector<std::string> StrokeArt(const Workspace& ws, int left, int top, int width, int height) {
    std::vector<std::string> rows;
    for (int y = top; y < top + height; ++y) {
        std::string row;
        for (int x = left; x < left + width; ++x) {
            const int s = ws.Stroke(x, y);
            if (s == 0) row += '.';
            else if (s > 0) row += s <= 9 ? static_cast<char>('0' + s) : '+';
            else row += s >= -9 ? static_cast<char>('a' - s - 1) : '-';
        }
        rows.push_back(row);
    }
    return rows;
}

// The colour plane as art: '.' = 0, '1'..'9' and 'A'..'C' for boxes 1..12, '#' chalk.
inline std::vector<std::string> ColorArt(const Workspace& ws, int left, int top, int width, int height) {
    std::vector<std::string> rows;
    for (int y = top; y < top + height; ++y) {
        std::string row;
        for (int x = left; x < left + width; ++x) {
            const int c = ws.ColorPlane(x, y);
            if (c == 0) row += '.';
            else if (c < 0) row += '#';
            else row += c <= 9 ? static_cast<char>('0' + c) : static_cast<char>('A' + c - 10);
        }
        rows.push_back(row);
    }
    return rows;
}

inline int CountStroke(const Workspace& ws, int value) {
    int n = 0;
    for (int y = 0; y <= 300; ++y)
        for (int x = 0; x <= 400; ++x) n += ws.Stroke(x, y) == value;
    return n;
}

} // namespace painttest
