#include "imaging/TitleHue.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

#include "imaging/HSLcolor.h"

namespace {
// A small background: each letter a colour, laid out unevenly so that a
// swapped axis or channel shows.
//   R red-orange  G meadow green  B sky blue  P pink  Y pale yellow  W near white  K dark grey
const char* const kArt[] = {
    "BBBBBBPY",
    "BBWWBBPY",
    "BBBBBGGG",
    "GGRGGGGK",
};

int32_t ColourOf(char c) {
    switch (c) {
    case 'R': return HSLcolor::JoinColor(230, 110, 60);
    case 'G': return HSLcolor::JoinColor(150, 205, 140);
    case 'B': return HSLcolor::JoinColor(160, 195, 235);
    case 'P': return HSLcolor::JoinColor(240, 170, 200);
    case 'Y': return HSLcolor::JoinColor(245, 235, 170);
    case 'W': return HSLcolor::JoinColor(245, 247, 250);
    default: return HSLcolor::JoinColor(60, 60, 64);
    }
}

std::vector<int32_t> Background() {
    std::vector<int32_t> pixels;
    for (const char* row : kArt)
        for (const char* c = row; *c; ++c) pixels.push_back(ColourOf(*c));
    return pixels;
}

HSLcolor::HSL Hsl(int32_t color) { return HSLcolor::RGBToHSL(HSLcolor::SplitColor(color)); }

int HueDistance(float a, float b) {
    const int d = std::abs(static_cast<int>(a) - static_cast<int>(b)) % 256;
    return std::min(d, 256 - d);
}
} // namespace

TEST(TitleHue, OneStepTurnsHueByTwoKeepingSaturationAndLuminance) {
    // Pure red sits at hue 0, so two steps on it is hue 2: a touch of green.
    const int32_t turned = TitleHue::TurnHue(HSLcolor::JoinColor(255, 0, 0), 2);
    const HSLcolor::RGB rgb = HSLcolor::SplitColor(turned);
    EXPECT_GE(rgb.red, 250);
    EXPECT_EQ(rgb.blue, 0);
    EXPECT_GT(rgb.green, 0);
    EXPECT_LT(rgb.green, 20);
    for (const int32_t color : Background()) {
        const HSLcolor::HSL before = Hsl(color);
        const HSLcolor::HSL after = Hsl(TitleHue::TurnHue(color, 2));
        if (before.sat > 20) {
            // The way back floors the hue: two steps, give or take one.
            const int moved = (static_cast<int>(after.hue) - static_cast<int>(before.hue) + 256) % 256;
            EXPECT_GE(moved, 1) << std::hex << color;
            EXPECT_LE(moved, 3) << std::hex << color;
        }
        // Near white a single unit of red, green or blue is many units of
        // saturation, so saturation is only held where it is well defined.
        if (before.lum < 230) { EXPECT_NEAR(after.sat, before.sat, 2) << std::hex << color; }
        EXPECT_NEAR(after.lum, before.lum, 1) << std::hex << color;
    }
}

TEST(TitleHue, TurnWrapsAtTheTopOfTheScale) {
    EXPECT_EQ(TitleHue::NextTurn(0), 2);
    EXPECT_EQ(TitleHue::NextTurn(254), 0);
    // Hue 254 plus two is hue 0 again: red.
    const int32_t color = HSLcolor::JoinColor(HSLcolor::HSLToRGB(254.0f, 255.0f, 127.0f));
    const HSLcolor::RGB back = HSLcolor::SplitColor(TitleHue::TurnHue(color, 2));
    EXPECT_EQ(back.red, 254);
    EXPECT_EQ(back.green, 0);
    EXPECT_EQ(back.blue, 0);
}

TEST(TitleHue, BackgroundComesRoundAfter128Redraws) {
    const std::vector<int32_t> original = Background();
    std::vector<int32_t> shown(original.size());
    int turn = 0;
    std::vector<std::vector<int32_t>> frames;
    for (int redraw = 0; redraw < 256; ++redraw) {
        turn = TitleHue::NextTurn(turn);
        TitleHue::TurnHues(original.data(), shown.data(), shown.size(), turn);
        frames.push_back(shown);
    }
    // Redraw 128 turns a whole circle: the starting hues, up to the conversions'
    // rounding; and every frame repeats exactly one cycle later.
    for (size_t i = 0; i < original.size(); ++i) {
        const HSLcolor::RGB start = HSLcolor::SplitColor(original[i]);
        const HSLcolor::RGB round = HSLcolor::SplitColor(frames[127][i]);
        EXPECT_NEAR(round.red, start.red, 2) << i;
        EXPECT_NEAR(round.green, start.green, 2) << i;
        EXPECT_NEAR(round.blue, start.blue, 2) << i;
    }
    for (int k = 0; k < 128; ++k) EXPECT_EQ(frames[static_cast<size_t>(k)], frames[static_cast<size_t>(k + 128)]) << k;
    // Half way round every coloured pixel sits opposite its start.
    for (size_t i = 0; i < original.size(); ++i)
        if (Hsl(original[i]).sat > 20) { EXPECT_GE(HueDistance(Hsl(frames[63][i]).hue, Hsl(original[i]).hue), 125) << i; }
}

TEST(TitleHue, GreysStayGrey) {
    for (const int32_t grey : {HSLcolor::JoinColor(0, 0, 0), HSLcolor::JoinColor(128, 128, 128),
                               HSLcolor::JoinColor(255, 255, 255)}) {
        std::vector<int32_t> out(1);
        for (int turn = 2; turn < 256; turn += 2) {
            TitleHue::TurnHues(&grey, out.data(), 1, turn);
            const HSLcolor::RGB c = HSLcolor::SplitColor(out[0]);
            EXPECT_EQ(c.red, c.green);
            EXPECT_EQ(c.green, c.blue);
            EXPECT_NEAR(c.red, HSLcolor::SplitColor(grey).red, 1);
        }
    }
}
