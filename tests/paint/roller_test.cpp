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

TEST_F(PaintTest, PressesOutsideThePictureOrWithoutColourPaintNothing) {
    for (auto [x, y] : {std::pair{-0.6f, 10.0f}, {10.0f, 299.5f}, {5000.0f, 5000.0f}}) Dab(x, y);
    EXPECT_TRUE(host.warnings.empty());
    ws.Boxes[1].color = kButtonFace;
    for (const bool chalk : {false, true}) {
        ws.ChalkLineMode = chalk;
        engine.MouseDown(kLeftButton, 50, 50);
        engine.MouseUp(kLeftButton, 80, 60);
    }
    EXPECT_EQ(host.warnings, Art(2, "Warning - Painting Picture|No Paint color has been set yet."));
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_EQ(ws.Picture1, ws.Picture2);
}

// The candidate (51, 50) beside a painted seed, with MatchColor all `match`:
// tolerance 18 for planes 0..2 and 12 for 3..5, windows clipped to 0..255;
// one plane outside its window is forgiven, two are not.
TEST_F(PaintTest, ColourTestWindows) {
    const struct { float match; std::array<int32_t, 6> planes; bool painted; } cases[] = {
        {100, {81, 100, 100, 100, 100, 100}, true}, {100, {100, 100, 100, 100, 100, 87}, true},
        {100, {81, 100, 100, 87, 100, 100}, false}, {100, {100, 100, 119, 100, 113, 100}, false},
        {10, {0, 28, 10, 10, 10, 10}, true},        {10, {29, 29, 10, 10, 10, 10}, false},
        {250, {232, 255, 250, 250, 250, 250}, true}, {250, {231, 231, 250, 250, 250, 250}, false},
        // the match colour is taken to the nearest whole number first
        {10.5f, {29, 29, 10, 10, 10, 10}, false},   {11.5f, {30, 30, 12, 12, 12, 12}, true}};
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
    for (auto [x, y] : {std::pair{400, 299}, {399, 300}, {-1, 0}, {0, -1}}) EXPECT_FALSE(engine.PaintPixel(x, y));
}

TEST_F(PaintTest, MatchColourFollowsAcceptedPixelsByTheWeight) {
    for (auto [weight, expected] : {std::pair{1, 125.5f}, {5, 108.5f}, {50, 101.0f}}) {
        ws.MatchWeight = weight;
        ws.MatchColor.fill(100.0f);
        for (int i = 0; i < 6; ++i) ws.Plane(7, 8, i) = 151;
        engine.UpdateMatchColor(7, 8);
        EXPECT_EQ(ws.MatchColor, (std::array<float, 6>{expected, expected, expected, expected, expected, expected}));
    }
}

// On an even wall one press fills the roller's square, clipped, refreshing once.
TEST_F(PaintTest, OnePressFillsTheRollerSquare) {
    const struct { bool wide; int x, y, left, top, right, bottom; } cases[] = {
        {false, 200, 150, 195, 145, 205, 155}, {true, 2, 3, 0, 0, 22, 23}, {false, 399, 299, 394, 294, 399, 299}};
    for (const auto& c : cases) {
        ws.WideRoller = c.wide;
        engine.MouseDown(kLeftButton, static_cast<float>(c.x), static_cast<float>(c.y));
        EXPECT_EQ(CountStroke(ws, ws.StrokeNumber), (c.right - c.left + 1) * (c.bottom - c.top + 1));
        EXPECT_EQ(ws.Stroke(c.left, c.top) + ws.Stroke(c.right, c.bottom), 2 * ws.StrokeNumber) << c.x;
    }
    EXPECT_EQ(host.refreshes, 3);
}

TEST_F(PaintTest, RightMostColumnPaintsAndTakesTheReferenceOneInward) {
    // Column 399 in shade: the cross around (398, 100) holds one shaded pixel and four sunlit.
    DrawPhoto(ws, Art(300, "y"), 399, 0);
    ws.Boxes[1].reference = 0;
    engine.MouseDown(kLeftButton, 399, 100);
    EXPECT_EQ(ws.RefLum, static_cast<float>((4.0 * ws.Luma(10, 10) + ws.Luma(399, 10)) / 5.0));
    EXPECT_EQ(MaskArt(ws, 0, 398, 100, 2, 1), (Art{".1"}));  // sun is too far from shade
}

// Box 2 paint at x 190..194 and a chalk line of box 1 down column 205. A press
// on box 2 still starts a stroke; with protection it keeps its box and nothing
// spreads from it, and a press at x = 200 stops at the chalk.
class Protect : public PaintTest, public ::testing::WithParamInterface<bool> {};

TEST_P(Protect, DecidesWhatTheRollerMayRepaint) {
    ws.ProtectPaint = GetParam();
    GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
    DrawMask(ws, Art(21, "11111"), 2, 190, 140);
    DrawMask(ws, Art(300, "#"), 1, 205, 0);
    ws.StrokeNumber = 1;
    ws.RedoEnabled = true;
    Dab(192, 150);
    EXPECT_EQ(ws.StrokeNumber, 2);
    EXPECT_FALSE(ws.RedoEnabled);
    EXPECT_EQ(CountStroke(ws, 2), GetParam() ? 0 : 41 * 41);
    Dab(200, 150);
    EXPECT_EQ(MaskArt(ws, 1, 188, 150, 20, 1), (Art{GetParam() ? "11222221111111111a.." : "11111111111111111111"}));
}

INSTANTIATE_TEST_SUITE_P(Options, Protect, ::testing::Bool());

// At the largest number the 16-bit stroke plane holds, every way of taking a
// new number refuses with a message and writes nothing.
TEST_F(PaintTest, StrokeNumberNeverWraps) {
    ws.StrokeNumber = Workspace::kMaxStrokeNumber - 1;
    Dab(100, 100);  // the last number is still painted
    EXPECT_EQ(CountStroke(ws, Workspace::kMaxStrokeNumber), 41 * 41);
    ws.Stroke(300, 200) = -32768;  // a redo step that could never be taken
    const Picture picture = ws.Picture1;
    const std::vector<int16_t> mask = ws.PaintMask;
    Dab(100, 100);
    for (auto [button, chalk] : {std::pair{kLeftButton, true}, {kRightButton, false}}) {  // chalk line, eraser
        ws.ChalkLineMode = chalk;
        engine.MouseDown(button, 100, 100);
        engine.MouseMove(button, 104, 102);
        engine.MouseUp(button, 104, 102);
    }
    engine.RedoStroke();
    EXPECT_EQ(host.warnings, Art(4, std::string(kPaintingTitle) + "|" + kTooManyStrokesText));
    EXPECT_EQ(ws.StrokeNumber, Workspace::kMaxStrokeNumber);
    EXPECT_EQ(ws.PaintMask, mask);
    EXPECT_EQ(ws.Picture1, picture);
}

} // namespace
