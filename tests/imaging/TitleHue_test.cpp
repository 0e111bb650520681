#include "imaging/TitleHue.h"

#include <gtest/gtest.h>

#include <vector>

#include "imaging/HSLcolor.h"

namespace {
using HSLcolor::JoinColor;
// Orange, meadow green, sky blue, pink, near white, mid grey: unequal
// channels so that a swapped channel shows.
const std::vector<int32_t> kBackground = {JoinColor(230, 110, 60),  JoinColor(150, 205, 140), JoinColor(160, 195, 235),
                                          JoinColor(240, 170, 200), JoinColor(245, 247, 250), JoinColor(128, 128, 128)};
} // namespace

TEST(TitleHue, TurnsFromRedAndWrapsAtTheTopOfTheScale) {
    // Hue 0 (pure red) two steps on takes a touch of green, no blue.
    const HSLcolor::RGB red = HSLcolor::SplitColor(TitleHue::TurnHue(JoinColor(255, 0, 0), 2));
    EXPECT_TRUE(red.red >= 250 && red.green > 0 && red.green < 20 && red.blue == 0) << red.red << "," << red.green << "," << red.blue;
    EXPECT_EQ(TitleHue::NextTurn(254), 0);
    // Hue 254 plus two is hue 0 again.
    const int32_t from254 = JoinColor(HSLcolor::HSLToRGB(254.0f, 255.0f, 127.0f));
    EXPECT_EQ(TitleHue::TurnHue(from254, 2), JoinColor(254, 0, 0));
}

TEST(TitleHue, BackgroundComesRoundAfter128RedrawsAndGreysStayGrey) {
    std::vector<std::vector<int32_t>> frames;
    for (int redraw = 0, turn = 0; redraw < 256; ++redraw) {
        turn = TitleHue::NextTurn(turn);
        frames.emplace_back(kBackground.size());
        TitleHue::TurnHues(kBackground.data(), frames.back().data(), kBackground.size(), turn);
    }
    for (size_t k = 0; k < 128; ++k) EXPECT_EQ(frames[k], frames[k + 128]) << k;
    for (size_t i = 0; i < kBackground.size(); ++i) {
        // A whole turn gives the start back, up to the conversions' rounding;
        // the lightness holds on every frame.
        for (const int shift : {0, 8, 16}) EXPECT_NEAR(frames[127][i] >> shift & 0xFF, kBackground[i] >> shift & 0xFF, 2) << i;
        for (const auto& frame : frames)
            EXPECT_NEAR(HSLcolor::RGBToHSL(HSLcolor::SplitColor(frame[i])).lum,
                        HSLcolor::RGBToHSL(HSLcolor::SplitColor(kBackground[i])).lum, 1) << i;
    }
    EXPECT_EQ(frames[63].back(), kBackground.back());
}
