#include <gtest/gtest.h>

#include "paint/PaintFixture.h"

using namespace painttest;
using Art = std::vector<std::string>;

namespace {

// --- The press ---------------------------------------------------------------

struct SeedCase {
    float x, y;
};

class SingleSeed : public PaintTest, public ::testing::WithParamInterface<SeedCase> {};

TEST_P(SingleSeed, PressOnALonePixelPaintsOnlyThatPixel) {
    // A blue pixel alone in a sunlit wall: ring 1 finds nothing close to blue.
    SetPhotoPixel(ws, 20, 10, Swatch('B'));
    const int32_t wall = ws.Picture1.pixel(21, 10);
    engine.MouseDown(kLeftButton, GetParam().x, GetParam().y);

    EXPECT_EQ(StrokeArt(ws, 17, 8, 6, 5), (Art{"......", "......", "...1..", "......", "......"}));
    EXPECT_EQ(ws.StrokeNumber, 1);
    EXPECT_EQ(CountStroke(ws, 1), 1);
    EXPECT_NE(ws.Picture1.pixel(20, 10), Swatch('B'));
    EXPECT_EQ(ws.Picture1.pixel(21, 10), wall);
}

// Positions are taken to the nearest pixel, ties to the even one.
INSTANTIATE_TEST_SUITE_P(Positions, SingleSeed,
                         ::testing::Values(SeedCase{20, 10}, SeedCase{20.5f, 10}, SeedCase{19.5f, 9.5f},
                                           SeedCase{20.49f, 10.5f}));

TEST_F(PaintTest, PressWithoutPaintColourWarnsAndPaintsNothing) {
    ws.Boxes[1].color = kButtonFace;
    const Picture before = ws.Picture1;
    Dab(100, 100);
    ASSERT_EQ(host.warnings.size(), 1u);
    EXPECT_EQ(host.warnings[0].first, "Warning - Painting Picture");
    EXPECT_EQ(host.warnings[0].second, "No Paint color has been set yet.");
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
    EXPECT_EQ(ws.Picture1, before);
    EXPECT_FALSE(ws.UndoEnabled);
}

struct OutsideCase {
    float x, y;
    bool inside;
};

class PressPlace : public PaintTest, public ::testing::WithParamInterface<OutsideCase> {};

TEST_P(PressPlace, OnlyPressesInsideThePictureStartAStroke) {
    ws.WideRoller = false;
    Dab(GetParam().x, GetParam().y);
    EXPECT_EQ(ws.StrokeNumber, GetParam().inside ? 1 : 0);
    EXPECT_EQ(ws.UndoEnabled, GetParam().inside);
    EXPECT_TRUE(host.warnings.empty());
}

INSTANTIATE_TEST_SUITE_P(Edges, PressPlace,
                         ::testing::Values(OutsideCase{-0.6f, 10, false}, OutsideCase{10, -0.51f, false},
                                           OutsideCase{399.5f, 10, false}, OutsideCase{10, 299.5f, false},
                                           OutsideCase{-0.5f, 10, true}, OutsideCase{399.49f, 299.49f, true},
                                           OutsideCase{5000, 5000, false}));

// --- One pixel -----------------------------------------------------------------

// A painted seed at (50, 50) and a candidate to its right whose planes are
// those of the seed, except the listed ones, which lie just outside tolerance.
class Mismatch : public PaintTest, public ::testing::WithParamInterface<std::pair<std::vector<int>, bool>> {};

TEST_P(Mismatch, OneOutOfTolerancePlaneIsForgivenTwoAreNot) {
    ws.StrokeNumber = 1;
    DrawMask(ws, {"1"}, 1, 50, 50);
    for (int i = 0; i < 6; ++i) ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws.Plane(50, 50, i));
    for (const int p : GetParam().first) ws.Plane(51, 50, p) = ws.Plane(50, 50, p) - ws.PlaneTolerance[static_cast<size_t>(p)] - 1;

    EXPECT_EQ(engine.PaintPixel(51, 50), GetParam().second);
    EXPECT_EQ(StrokeArt(ws, 49, 49, 4, 3), (Art{"....", GetParam().second ? ".11." : ".1..", "...."}));
}

INSTANTIATE_TEST_SUITE_P(Planes, Mismatch,
                         ::testing::Values(std::make_pair(std::vector<int>{}, true), std::make_pair(std::vector<int>{0}, true),
                                           std::make_pair(std::vector<int>{5}, true),
                                           std::make_pair(std::vector<int>{0, 3}, false),
                                           std::make_pair(std::vector<int>{2, 4}, false)));

struct WindowCase {
    float match;
    int value;
    bool inside;
};

class ToleranceWindow : public PaintTest, public ::testing::WithParamInterface<WindowCase> {};

// Planes 0 and 1 (tolerance 18) take the value; two mismatches reject, so the
// pixel is painted exactly when the value lies inside the window.
TEST_P(ToleranceWindow, ClampsToTheZeroTo255Range) {
    const WindowCase c = GetParam();
    ws.StrokeNumber = 1;
    DrawMask(ws, {"1"}, 1, 50, 50);
    ws.MatchColor.fill(c.match);
    for (int i = 0; i < 6; ++i) ws.Plane(51, 50, i) = static_cast<int32_t>(std::nearbyint(c.match));
    ws.Plane(51, 50, 0) = ws.Plane(51, 50, 1) = c.value;
    EXPECT_EQ(engine.PaintPixel(51, 50), c.inside) << "match " << c.match << " value " << c.value;
}

INSTANTIATE_TEST_SUITE_P(Windows, ToleranceWindow,
                         ::testing::Values(WindowCase{10, 0, true}, WindowCase{10, 28, true}, WindowCase{10, 29, false},
                                           WindowCase{250, 232, true}, WindowCase{250, 231, false},
                                           WindowCase{250, 255, true},
                                           // the match colour is taken to the nearest whole number first
                                           WindowCase{10.5f, 29, false}, WindowCase{11.5f, 30, true}));

TEST_F(PaintTest, PixelOutsideThePictureIsIgnored) {
    ws.StrokeNumber = 1;
    DrawMask(ws, {"1"}, 1, 399, 299);
    for (auto [x, y] : {std::pair{400, 299}, std::pair{399, 300}, std::pair{-1, 0}, std::pair{0, -1}})
        EXPECT_FALSE(engine.PaintPixel(x, y));
    EXPECT_EQ(ws.Stroke(400, 299), 0);
    EXPECT_EQ(ws.Stroke(399, 300), 0);
}

struct MatchCase {
    int weight;
    float expected;
};

class MatchDrift : public PaintTest, public ::testing::WithParamInterface<MatchCase> {};

TEST_P(MatchDrift, FollowsAcceptedPixelsByTheWeight) {
    ws.MatchWeight = GetParam().weight;
    ws.MatchColor.fill(100.0f);
    for (int i = 0; i < 6; ++i) ws.Plane(7, 8, i) = 151;
    engine.UpdateMatchColor(7, 8);
    for (const float m : ws.MatchColor) EXPECT_EQ(m, GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(Kinds, MatchDrift,
                         ::testing::Values(MatchCase{1, 125.5f}, MatchCase{5, 108.5f}, MatchCase{50, 101.0f}));

} // namespace
