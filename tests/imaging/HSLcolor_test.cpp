#include "imaging/HSLcolor.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace HSLcolor;

namespace {

struct ToHslCase {
    int r, g, b;
    float hue, sat, lum;
};

class RgbToHsl : public ::testing::TestWithParam<ToHslCase> {};

TEST_P(RgbToHsl, GivesWorkedValues) {
    const auto& c = GetParam();
    const HSL out = RGBToHSL(c.r, c.g, c.b);
    EXPECT_EQ(out.hue, c.hue);
    EXPECT_EQ(out.sat, c.sat);
    EXPECT_EQ(out.lum, c.lum);
}

INSTANTIATE_TEST_SUITE_P(Examples, RgbToHsl, ::testing::Values(
    ToHslCase{255, 0, 0, 0, 255, 127},
    ToHslCase{0, 255, 0, 85, 255, 127},
    ToHslCase{0, 0, 255, 170, 255, 127},
    ToHslCase{255, 255, 0, 42, 255, 127},
    ToHslCase{0, 255, 255, 127, 255, 127},
    ToHslCase{255, 0, 255, 213, 255, 127},
    ToHslCase{255, 0, 1, 255, 255, 127},   // negative h wraps to 255, not 254
    ToHslCase{200, 100, 50, 14, 153, 125},
    ToHslCase{50, 100, 200, 155, 153, 125},
    ToHslCase{255, 255, 255, 0, 0, 255},
    ToHslCase{0, 0, 0, 0, 0, 0}));

struct ToRgbCase {
    float hue, sat, lum;
    int r, g, b;
};

class HslToRgb : public ::testing::TestWithParam<ToRgbCase> {};

TEST_P(HslToRgb, GivesWorkedValues) {
    const auto& c = GetParam();
    const RGB out = HSLToRGB(c.hue, c.sat, c.lum);
    EXPECT_EQ(out.red, c.r);
    EXPECT_EQ(out.green, c.g);
    EXPECT_EQ(out.blue, c.b);
}

INSTANTIATE_TEST_SUITE_P(Examples, HslToRgb, ::testing::Values(
    ToRgbCase{0, 255, 127, 254, 0, 0},       // pure red loses one step there and back
    ToRgbCase{14, 153, 125, 200, 99, 50},
    ToRgbCase{155, 153, 125, 50, 103, 200},
    ToRgbCase{0, 0, 255, 255, 255, 255}));

TEST(HSLcolor, EveryGreyGoesThereAndBackExactly) {
    for (int v = 0; v <= 255; ++v) {
        const HSL hsl = RGBToHSL(v, v, v);
        ASSERT_EQ(hsl.hue, 0) << v;
        ASSERT_EQ(hsl.sat, 0) << v;
        ASSERT_EQ(hsl.lum, v) << v;
        const RGB back = HSLToRGB(hsl);
        ASSERT_EQ(back.red, v);
        ASSERT_EQ(back.green, v);
        ASSERT_EQ(back.blue, v);
    }
}

TEST(HSLcolor, Hue255IsHue0) {
    for (float sat : {40.0f, 128.0f, 255.0f})
        for (float lum : {30.0f, 127.0f, 128.0f, 220.0f}) {
            const RGB a = HSLToRGB(0, sat, lum);
            const RGB b = HSLToRGB(255, sat, lum);
            EXPECT_EQ(JoinColor(a), JoinColor(b)) << sat << " " << lum;
        }
}

// The whole colour cube, in steps that still reach every byte value on each
// axis: every result must be a whole number in range, both ways.
TEST(HSLcolor, WholeCubeStaysWholeAndInRange) {
    auto whole = [](float v) { return v == std::floor(v) && v >= 0 && v <= 255; };
    for (int r = 0; r < 256; ++r)
        for (int g = 0; g < 256; ++g)
            for (int b = 0; b < 256; b += (g % 17 == 0 ? 1 : 15)) {
                const HSL hsl = RGBToHSL(r, g, b);
                ASSERT_TRUE(whole(hsl.hue) && whole(hsl.sat) && whole(hsl.lum)) << r << "," << g << "," << b;
                const RGB back = HSLToRGB(hsl);
                ASSERT_TRUE(back.red >= 0 && back.red <= 255 && back.green >= 0 && back.green <= 255 &&
                            back.blue >= 0 && back.blue <= 255)
                    << r << "," << g << "," << b;
            }
}

TEST(HSLcolor, Max3AndMin3) {
    const float cases[][5] = {{1, 2, 3, 3, 1}, {3, 2, 1, 3, 1}, {2, 3, 1, 3, 1}, {0.5f, 0.25f, 0.5f, 0.5f, 0.25f}};
    for (const auto& t : cases) {
        EXPECT_EQ(Max3(t[0], t[1], t[2]), t[3]);
        EXPECT_EQ(Min3(t[0], t[1], t[2]), t[4]);
    }
    EXPECT_EQ(JoinColor(SplitColor(0x00336699)), 0x00336699);
    EXPECT_EQ(SplitColor(0x00336699).red, 0x99);
}

} // namespace
