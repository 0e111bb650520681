#pragma once
#include <array>
#include <cstdint>
#include <string>

// The colour value that stands for "no colour set": the button-face system colour.
inline constexpr int32_t kButtonFace = static_cast<int32_t>(0x8000000Fu);
inline constexpr int32_t kWhite = 0xFFFFFF;
inline constexpr int32_t kBlack = 0;
inline constexpr int kColorBoxCount = 12;

// One of the twelve colour boxes of the scheme: its name, its paint colour and
// its reference colour (the photo colour the paint is matched to; 0 = none).
struct ColorBox {
    std::string name;               // UTF-8
    int32_t color = kButtonFace;    // back colour
    int32_t reference = 0;          // the box's tag as a number

    bool hasColor() const { return color != kButtonFace; }
    bool operator==(const ColorBox&) const = default;
};

// Name text colour: black on a colour whose green is 100 or more, else white.
inline int32_t ForeColorFor(int32_t color) {
    const int32_t green = static_cast<int32_t>((static_cast<uint32_t>(color) >> 8) & 0xFFu);
    return green >= 100 ? kBlack : kWhite;
}

// Boxes are indexed 1 to 12, as the user sees them; element 0 is unused.
using ColorBoxes = std::array<ColorBox, kColorBoxCount + 1>;

// The names the boxes start with.
ColorBoxes StartupColorBoxes();
