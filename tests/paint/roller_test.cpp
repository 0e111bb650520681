#include <algorithm>
#include <array>

#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// A blue pixel alone in a sunlit wall: ring 1 finds nothing close to blue, so
// only the seed is painted. Positions go to the nearest pixel, ties to even.
TEST_F(PaintTest, PressOnALonePixelPaintsOnlyThatPixel) {
    SetPhotoPixel(ws, 20, 10, Swatch('B'));
    for (auto [x, y] : {std::pair{20.0f, 10.0f}, {20.5f, 10.0f}, {19.5f, 9.5f}, {20.49f, 10.5f}}) {
        ws.ClearMask();
        engine.MouseDown(kLeftButton, x, y);
        EXPECT_EQ(MaskArt(ws, 1, 18, 9, 5, 3), (Art{".....", "..1..", "....."})) << x << "," << y;
        EXPECT_EQ(CountStroke(ws, ws.StrokeNumber), 1);
    }
    EXPECT_NE(ws.Picture1.pixel(20, 10), Swatch('B'));
    EXPECT_EQ(ws.Picture1.pixel(21, 10), Swatch('Y'));
}

TEST_F(PaintTest, OnlyPressesInsideThePictureStartAStroke) {
    const struct { float x, y; bool inside; } presses[] = {
        {-0.6f, 10, false}, {10, 299.5f, false}, {5000, 5000, false}, {-0.5f, 10, true}, {399.49f, 299.49f, true}};
    int strokes = 0;
    for (const auto& p : presses) {
        Dab(p.x, p.y);
        EXPECT_EQ(ws.StrokeNumber, strokes += p.inside) << p.x << "," << p.y;
    }
    EXPECT_TRUE(host.warnings.empty());
}

// The candidate (51, 50) beside a painted seed, with MatchColor all `match`:
// the tolerances are 18 for planes 0..2 and 12 for 3..5, clipped to 0..255,
// and one plane out of its window is forgiven, two are not.
TEST_F(PaintTest, ColourTestWindows) {
    const struct { float match; std::array<int32_t, 6> planes; bool painted; } cases[] = {
        {100, {100, 100, 100, 100, 100, 100}, true}, {100, {81, 100, 100, 100, 100, 100}, true},
        {100, {100, 100, 100, 100, 100, 87}, true},  {100, {81, 100, 100, 87, 100, 100}, false},
        {100, {100, 100, 119, 100, 113, 100}, false}, {10, {0, 28, 10, 10, 10, 10}, true},
        {10, {29, 29, 10, 10, 10, 10}, false},        {250, {232, 255, 250, 250, 250, 250}, true},
        {250, {231, 231, 250, 250, 250, 250}, false},
        // the match colour is taken to the nearest whole number first
        {10.5f, {29, 29, 10, 10, 10, 10}, false},     {11.5f, {30, 30, 12, 12, 12, 12}, true}};
    ws.StrokeNumber = 1;
    DrawMask(ws, {"1"}, 1, 50, 50);
    for (const auto& c : cases) {
        ws.Stroke(51, 50) = 0;
        ws.MatchColor.fill(c.match);
        for (int p = 0; p < 6; ++p) ws.Plane(51, 50, p) = c.planes[static_cast<size_t>(p)];
        EXPECT_EQ(engine.PaintPixel(51, 50), c.painted) << c.match << " " << c.planes[0] << " " << c.planes[5];
        EXPECT_EQ(MaskArt(ws, 0, 50, 49, 3, 3), (Art{"...", c.painted ? "11." : "1..", "..."}));
    }
    DrawMask(ws, {"1"}, 1, 399, 299);
    for (auto [x, y] : {std::pair{400, 299}, std::pair{399, 300}, std::pair{-1, 0}, std::pair{0, -1}})
        EXPECT_FALSE(engine.PaintPixel(x, y));
    EXPECT_EQ(ws.Stroke(400, 299) + ws.Stroke(399, 300), 0);
}

TEST_F(PaintTest, MatchColourFollowsAcceptedPixelsByTheWeight) {
    for (auto [weight, expected] : {std::pair{1, 125.5f}, std::pair{5, 108.5f}, std::pair{50, 101.0f}}) {
        ws.MatchWeight = weight;
        ws.MatchColor.fill(100.0f);
        for (int i = 0; i < 6; ++i) ws.Plane(7, 8, i) = 151;
        engine.UpdateMatchColor(7, 8);
        for (const float m : ws.MatchColor) EXPECT_EQ(m, expected);
    }
}

// On an even wall one press fills the roller's square (clipped) and no more,
// refreshing once per application.
TEST_F(PaintTest, OnePressFillsTheRollerSquare) {
    const struct { bool wide; int x, y, left, top, right, bottom; } cases[] = {
        {false, 200, 150, 195, 145, 205, 155}, {true, 2, 3, 0, 0, 22, 23}, {false, 399, 299, 394, 294, 399, 299}};
    for (const auto& c : cases) {
        ws.WideRoller = c.wide;
        ws.ClearMask();
        const int refreshes = host.refreshes;
        engine.MouseDown(kLeftButton, static_cast<float>(c.x), static_cast<float>(c.y));
        EXPECT_EQ(host.refreshes, refreshes + 1);
        EXPECT_EQ(CountStroke(ws, ws.StrokeNumber), (c.right - c.left + 1) * (c.bottom - c.top + 1));
        for (auto [x, y] : {std::pair{c.left, c.top}, std::pair{c.right, c.bottom}})
            EXPECT_EQ(ws.Stroke(x, y), ws.StrokeNumber) << c.x;
    }
}

TEST_F(PaintTest, RightMostColumnPaintsAndTakesTheReferenceOneInward) {
    // Column 399 in shade: the cross around (398, 100) holds one shaded pixel and four sunlit.
    DrawPhoto(ws, Art(300, "y"), 399, 0);
    ws.Boxes[1].reference = 0;
    engine.MouseDown(kLeftButton, 399, 100);
    EXPECT_EQ(ws.RefLum, static_cast<float>((4.0 * ws.Luma(10, 10) + ws.Luma(399, 10)) / 5.0));
    EXPECT_EQ(MaskArt(ws, 0, 398, 100, 2, 1), (Art{".1"}));  // sun is too far from shade
}

// A chalk line of box 1 down column 205 against a wide press at x = 200.
class ChalkBarrier : public PaintTest, public ::testing::WithParamInterface<bool> {};

TEST_P(ChalkBarrier, HoldsWhileProtectedAndOpensWhenNot) {
    ws.ProtectPaint = GetParam();
    DrawMask(ws, Art(300, "#"), 1, 205, 0);
    ws.StrokeNumber = 1;
    engine.MouseDown(kLeftButton, 200, 150);
    EXPECT_EQ(MaskArt(ws, 0, 203, 148, 5, 1), (Art{GetParam() ? "221.." : "22222"}));
    EXPECT_EQ(MaskArt(ws, 1, 203, 148, 5, 1), (Art{GetParam() ? "11a.." : "11111"}));
    EXPECT_EQ(ws.ColorPlane(205, 0), -1);  // beyond the roller's reach
}

// A press on box 2 paint: with protection the pixel keeps box 2 and nothing of
// box 1 is there to spread from; without, box 1 takes it over.
TEST_P(ChalkBarrier, PressOnOtherPaintStillStartsAStroke) {
    ws.ProtectPaint = GetParam();
    GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
    DrawMask(ws, Art(21, "11111"), 2, 195, 140);
    ws.StrokeNumber = 1;
    ws.RedoEnabled = true;
    engine.MouseDown(kLeftButton, 197, 150);
    EXPECT_EQ(ws.StrokeNumber, 2);
    EXPECT_FALSE(ws.RedoEnabled);
    EXPECT_EQ(MaskArt(ws, 1, 193, 150, 9, 1), (Art{GetParam() ? "..22222.." : "111111111"}));
}

INSTANTIATE_TEST_SUITE_P(Protect, ChalkBarrier, ::testing::Bool());

// At the largest number the 16-bit stroke plane holds, every way of taking a
// new number refuses with a message and writes nothing.
TEST_F(PaintTest, StrokeNumberNeverWraps) {
    ws.StrokeNumber = Workspace::kMaxStrokeNumber - 1;
    Dab(100, 100);  // the last number is still painted
    EXPECT_EQ(CountStroke(ws, Workspace::kMaxStrokeNumber), 41 * 41);
    DrawMask(ws, {"a"}, 1, 300, 200);
    ws.Stroke(300, 200) = -32768;  // a redo step that could never be taken
    const Picture picture = ws.Picture1;
    const std::vector<int16_t> mask = ws.PaintMask;
    // A roller press, a chalk line, the eraser, and a redo.
    for (auto [button, chalk] : {std::pair{kLeftButton, false}, {kLeftButton, true}, {kRightButton, false}}) {
        ws.ChalkLineMode = chalk;
        engine.MouseDown(button, 100, 100);
        if (chalk || button == kRightButton) engine.MouseMove(button, 104, 102);
        engine.MouseUp(button, 104, 102);
    }
    engine.RedoStroke();
    EXPECT_EQ(host.warnings, std::vector<std::string>(4, std::string(kPaintingTitle) + "|" + kTooManyStrokesText));
    EXPECT_EQ(ws.StrokeNumber, Workspace::kMaxStrokeNumber);
    EXPECT_EQ(ws.PaintMask, mask);
    EXPECT_EQ(ws.Picture1, picture);
}

} // namespace
