#include <gtest/gtest.h>

#include <algorithm>

#include "paint/PaintFixture.h"

using namespace painttest;
using Art = std::vector<std::string>;

namespace {

struct Extent {
    int left = 1000, top = 1000, right = -1, bottom = -1, count = 0;
    bool operator==(const Extent&) const = default;
};

Extent PaintedExtent(const Workspace& ws, int stroke) {
    Extent e;
    for (int y = 0; y <= 300; ++y)
        for (int x = 0; x <= 400; ++x)
            if (ws.Stroke(x, y) == stroke) {
                e.left = std::min(e.left, x);
                e.right = std::max(e.right, x);
                e.top = std::min(e.top, y);
                e.bottom = std::max(e.bottom, y);
                ++e.count;
            }
    return e;
}

struct ReachCase {
    bool wide;
    int x, y;
    Extent expected;
};

class Reach : public PaintTest, public ::testing::WithParamInterface<ReachCase> {};

// On an even wall one press fills the whole square of the roller and no more.
TEST_P(Reach, OnePressFillsTheRollerSquare) {
    const ReachCase c = GetParam();
    ws.WideRoller = c.wide;
    engine.MouseDown(kLeftButton, static_cast<float>(c.x), static_cast<float>(c.y));
    EXPECT_EQ(PaintedExtent(ws, 1), c.expected);
}

INSTANTIATE_TEST_SUITE_P(Sizes, Reach,
                         ::testing::Values(ReachCase{false, 200, 150, {195, 145, 205, 155, 121}},
                                           ReachCase{true, 200, 150, {180, 130, 220, 170, 1681}},
                                           ReachCase{true, 2, 3, {0, 0, 22, 23, 23 * 24}},
                                           ReachCase{false, 399, 299, {394, 294, 399, 299, 36}}));

TEST_F(PaintTest, EachApplicationRefreshesOnce) {
    engine.MouseDown(kLeftButton, 100, 100);
    EXPECT_EQ(host.refreshes, 1);
    for (int i = 1; i <= 3; ++i) engine.MouseMove(kLeftButton, 100.0f + 10 * i, 100);
    EXPECT_EQ(host.refreshes, 4);
}

TEST_F(PaintTest, RightMostColumnPaintsAndTakesTheReferenceOneInward) {
    // Column 399 in shade, the rest in sun: the cross around (398, 100) holds
    // one shaded and four sunlit pixels.
    for (int y = 0; y < 300; ++y) SetPhotoPixel(ws, 399, y, Swatch('y'));
    ws.Boxes[1].reference = 0;
    engine.MouseDown(kLeftButton, 399, 100);

    const double sun = ws.Luma(10, 10), shade = ws.Luma(399, 10);
    ASSERT_NE(sun, shade);
    EXPECT_EQ(ws.RefLum, static_cast<float>((4 * sun + shade) / 5.0));
    EXPECT_NE(ws.Boxes[1].reference, 0);
    EXPECT_EQ(ws.Stroke(399, 100), 1);
    EXPECT_EQ(ws.Stroke(398, 100), 0);  // sun is too far from shade
}

// A chalk line of box 1 down column 205 against a wide press at x = 200.
class ChalkBarrier : public PaintTest, public ::testing::WithParamInterface<bool> {};

TEST_P(ChalkBarrier, HoldsWhileProtectedAndOpensWhenNot) {
    const bool protect = GetParam();
    ws.ProtectPaint = protect;
    for (int y = 0; y < 300; ++y) DrawMask(ws, {"#"}, 1, 205, y);
    ws.StrokeNumber = 1;
    engine.MouseDown(kLeftButton, 200, 150);

    const Extent e = PaintedExtent(ws, 2);
    if (protect) {
        EXPECT_EQ(e.right, 204);
        EXPECT_EQ(ColorArt(ws, 203, 148, 5, 1), (Art{"11#.."}));
        EXPECT_EQ(StrokeArt(ws, 203, 148, 5, 1), (Art{"221.."}));
    } else {
        EXPECT_EQ(e.right, 220);
        EXPECT_EQ(ColorArt(ws, 203, 148, 5, 1), (Art{"11111"}));
        EXPECT_EQ(StrokeArt(ws, 203, 148, 5, 1), (Art{"22222"}));
    }
    EXPECT_EQ(ws.ColorPlane(205, 0), -1);  // beyond the roller's reach
}

INSTANTIATE_TEST_SUITE_P(Protect, ChalkBarrier, ::testing::Bool());

// Box 2 paint from stroke 1 in a block at x 195..199, rows 140..160.
class Protect : public PaintTest, public ::testing::WithParamInterface<bool> {
protected:
    void SetUp() override {
        ws.ProtectPaint = GetParam();
        GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
        for (int y = 140; y <= 160; ++y) DrawMask(ws, {"11111"}, 2, 195, y);
        ws.StrokeNumber = 1;
    }
};

TEST_P(Protect, DecidesWhetherOtherPaintIsRepainted) {
    engine.MouseDown(kLeftButton, 185, 150);
    const char* expected = GetParam() ? "1112222211" : "1111111111";
    EXPECT_EQ(ColorArt(ws, 192, 150, 10, 1), (Art{expected}));
}

TEST_P(Protect, PressOnPaintStillStartsAStroke) {
    ws.RedoEnabled = true;
    engine.MouseDown(kLeftButton, 197, 150);
    EXPECT_EQ(ws.StrokeNumber, 2);
    EXPECT_FALSE(ws.RedoEnabled);
    if (GetParam()) {
        // The pressed pixel keeps box 2, so nothing of box 1 is there to spread from.
        EXPECT_EQ(ws.ColorPlane(197, 150), 2);
        EXPECT_EQ(CountStroke(ws, 2), 0);
    } else {
        EXPECT_EQ(ws.ColorPlane(197, 150), 1);
        EXPECT_EQ(ws.Stroke(197, 150), 2);
    }
}

INSTANTIATE_TEST_SUITE_P(Options, Protect, ::testing::Bool());

} // namespace
