// The edge tools, pickup and reference, and recolour rendering.
#include "paint/PaintFixture.h"
#include "paint/Tools.h"

using namespace painttest;
using HSLcolor::HSLToRGB;
using HSLcolor::JoinColor;

namespace {

// Stroke 2 in the bottom-right corner beside undone paint ('a') and an earlier
// stroke: the growth is one pixel, never diagonal, never onto the border or
// over earlier paint.
TEST_F(PaintTest, ExpansionGrowsOnePixelInsideTheBorder) {
    DrawMask(ws, {".....", ".....", "...a.", "..122", "...22"}, 1, 395, 295);
    ws.StrokeNumber = 2;
    ws.StrokeLeft = ws.StrokeRight = 398;  // the stroke box is widened by one
    ws.StrokeTop = ws.StrokeBottom = 298;
    engine.ExpandEdges();
    EXPECT_EQ(MaskArt(ws, 0, 395, 295, 5, 5), (Art{".....", ".....", "...2.", "..122", "...22"}));
    EXPECT_EQ(ws.ColorPlane(398, 297), 1);
}

// The eraser clears a 7 x 7 square clipped to the picture and shows the photo
// there; on unpainted pixels it changes no mask value but still restores them.
TEST_F(PaintTest, EraserClearsASquareClippedToThePicture) {
    ws.Picture1.setPixel(20, 20, 0x123456);  // a blend tint, say
    engine.EraseAt(21, 22);
    EXPECT_EQ(std::pair(ws.Picture1 == ws.Picture2, ws.RedoEnabled), std::pair(true, false));
    DrawMask(ws, Art(300, std::string(400, '1')), 1);
    ws.StrokeNumber = 1;
    engine.RepaintColor(1);
    for (auto [x, y] : {std::pair{1, 1}, {399, 299}, {-3, 100}}) engine.EraseAt(x, y);
    EXPECT_EQ(MaskArt(ws, 0, 0, 0, 6, 6), (Art{"bbbbb1", "bbbbb1", "bbbbb1", "bbbbb1", "bbbbb1", "111111"}));
    EXPECT_EQ(MaskArt(ws, 0, 395, 295, 5, 5), (Art{"11111", "1bbbb", "1bbbb", "1bbbb", "1bbbb"}));
    EXPECT_EQ(MaskArt(ws, 0, 0, 96, 1, 9), (Art{"1", "b", "b", "b", "b", "b", "b", "b", "1"}));
    EXPECT_EQ(CountStroke(ws, -2), 25 + 16 + 7);
    EXPECT_EQ(ws.Picture1.pixel(0, 100), Swatch('Y'));  // erased: the photo
    EXPECT_NE(ws.Picture1.pixel(1, 100), Swatch('Y'));  // the paint beside stays
}

// The line follows y = whole(x / 2) from (0, 0) to (4, 2): whole(0.5) = 0 and
// whole(1.5) = 2. It is stored as chalk only on release.
TEST_F(PaintTest, ChalkLineIsARubberBandUntilReleased) {
    ws.ChalkLineMode = true;
    engine.MouseDown(kLeftButton, 0, 0);
    engine.MouseMove(kLeftButton, 3, 3);  // a band the next move takes away
    engine.MouseMove(kLeftButton, 4, 2);
    EXPECT_EQ(ws.Picture1.pixel(2, 1), ~Swatch('Y') & 0xFFFFFF);
    EXPECT_EQ(std::pair(ws.Picture1.pixel(3, 3), CountStroke(ws, 0)), std::pair(Swatch('Y'), 401 * 301));
    engine.MouseUp(kLeftButton, 4, 2);
    EXPECT_EQ(MaskArt(ws, 1, 0, 0, 6, 4), (Art{"aa....", "..a...", "...aa.", "......"}));
    EXPECT_NE(ws.Picture1.pixel(2, 1), Swatch('Y'));
    engine.UndoStroke();
    EXPECT_EQ(ws.Picture1, ws.Picture2);
    Dab(10, 10);  // a line of no length stores nothing
    // Ends outside the picture are clamped to it.
    engine.MouseDown(kLeftButton, 2, 299);
    engine.MouseUp(kLeftButton, -5, 310);
    EXPECT_EQ(MaskArt(ws, 0, 0, 298, 4, 3), (Art{"....", "222.", "...."}));
    EXPECT_EQ(CountStroke(ws, 1) + CountStroke(ws, 2), 3);
}

// --- Pickup and reference --------------------------------------------------------

TEST_F(PaintTest, PickupFillsTheBoxAndMovesOnToTheNextEmptyOne) {
    const struct { int start; std::vector<int> referenced; int next; } cases[] = {
        {2, {1, 2, 3, 4}, 5}, {10, {}, 0}, {11, {}, 12}, {11, {12}, 0}, {12, {}, 0}};  // 0: the tool ends
    DrawPhoto(ws, {"RR", "RR"}, 30, 40);
    for (const auto& c : cases) {
        for (const int i : c.referenced) ws.Boxes[static_cast<size_t>(i)] = {"", JoinColor(10 * i, 100, 200), 0x5A5A5A};
        ws.CurrentColor = static_cast<int16_t>(c.start);
        StartPickup(ws);
        engine.MouseMove(0, 30.4f, 40.2f);
        engine.MouseMove(0, -0.6f, 299.6f);  // outside: the preview stays
        EXPECT_EQ(ws.PickupLabelColor, Swatch('R'));
        Dab(30.4f, 40.2f);
        EXPECT_EQ(ws.Boxes[static_cast<size_t>(c.start)].color, Swatch('R'));
        EXPECT_EQ(host.selected.back(), c.start);
        EXPECT_EQ(ws.PickupLabelVisible ? ws.PickupIndex : 0, c.next) << c.start;
    }
    // The releases only ended the clicks: no stroke, no Undo.
    EXPECT_EQ(std::tuple(ws.StrokeNumber, ws.UndoEnabled, ws.IgnoreUntilMouseUp), std::tuple(0, false, false));
}

TEST_F(PaintTest, FirstPressTakesTheReferenceAndASecondKeepsIt) {
    ws.Boxes[1].reference = 0;
    engine.MouseDown(kLeftButton, 120, 80);
    // An even wall: the cross is five equal pixels, saturation passed as hue.
    const int32_t expected = JoinColor(HSLcolor::HSLToRGB(static_cast<float>(ws.Plane(120, 80, 5)),
                                                          static_cast<float>(ws.Plane(120, 80, 4)),
                                                          static_cast<float>(ws.Luma(120, 80))));
    EXPECT_EQ(ws.Boxes[1].reference, expected);
    EXPECT_GT(CountStroke(ws, 1), 1);  // painted in the same press
    engine.MouseUp(kLeftButton, 120, 80);
    DrawPhoto(ws, {"BBB", ".B."}, 199, 99);
    Dab(200, 100);
    EXPECT_EQ(ws.Boxes[1].reference, expected);
}

// Set reference on box 3 paint while box 1 is selected: both boxes take it.
TEST_F(PaintTest, SetReferenceTagsBothBoxesOrWarnsOnUnpaintedPixels) {
    ws.Boxes[3] = {"", JoinColor(200, 30, 90), JoinColor(10, 10, 10)};
    DrawPhoto(ws, {"RRR", "RRR", "RRR"}, 59, 59);
    DrawMask(ws, {"111", "111", "111"}, 3, 59, 59);
    ws.StrokeNumber = 1;
    ToggleSetReference(ws);
    Dab(20, 20);
    EXPECT_EQ(host.warnings, Art{"Warning - Set Reference|This area is not re-painted."});
    EXPECT_EQ(ws.Boxes[1].reference, JoinColor(200, 180, 40));
    engine.MouseDown(kLeftButton, 60, 60);
    EXPECT_EQ(ws.Boxes[3].reference, ws.Boxes[1].reference);  // both changed
    EXPECT_NE(ws.Picture1.pixel(60, 60), Swatch('R'));  // box 3 redrawn at once
    engine.MouseMove(kLeftButton, 80, 80);
    engine.MouseUp(kLeftButton, 80, 80);
    EXPECT_EQ(std::tuple(CountStroke(ws, 1), ws.UndoEnabled, ws.IgnoreUntilMouseUp), std::tuple(9, false, false));
}

// Reference luminance 120; paint hue 20, saturation 200, luminance 100.
TEST_F(PaintTest, RecolourKeepsTheLightOfThePhoto) {
    const std::pair<int, int32_t> cases[] = {
        {120, JoinColor(HSLToRGB(20, 197, 100))},        // as bright as the reference
        {160, JoinColor(HSLToRGB(20, 255, 169.5615f))},  // 40^1.15 + 100, saturation clamped
        {60, JoinColor(HSLToRGB(20, 49, 40))},           // darker: -60 + 100
        {0, 0},                                          // black stays black
        {255, 0xFFFFFF}};                                // luminance clamped at 255
    ws.PaintHue = 20;
    ws.PaintSat = 200;
    ws.PaintLum = 100;
    ws.RefLum = 120;
    for (const auto& [luma, expected] : cases) {
        ws.Luma(7, 3) = luma;
        engine.RecolorPixel(7, 3);
        EXPECT_EQ(ws.Picture1.pixel(7, 3), expected) << luma;
    }
}

TEST_F(PaintTest, RefreshDrawsEveryBoxIncludingTheLast) {
    for (int i = 1; i <= 12; ++i) {
        ws.Boxes[static_cast<size_t>(i)] = {"", JoinColor(20 * i, 250 - 20 * i, 90), Swatch('Y')};
        DrawMask(ws, {"1"}, i, 10 + 2 * i, 20);
    }
    engine.RefreshAll();
    EXPECT_EQ(host.pumps, 12);
    for (int i = 1; i <= 12; ++i) EXPECT_NE(ws.Picture1.pixel(10 + 2 * i, 20), Swatch('Y')) << i;
}

// The pixel (50, 50) between a left and a right neighbour after a blend pass:
// the first neighbour in order decides (cells left, centre, right). The same
// cells across row 0, row 299, column 0 and column 399 are never touched, and
// a plain pass puts back every pixel the blend changed.
TEST_F(PaintTest, BlendFollowsTheFirstNeighbourInsideTheBorder) {
    ws.Boxes[3] = {"", JoinColor(30, 200, 90), JoinColor(150, 140, 60)};
    ws.Boxes[5] = {"", JoinColor(240, 30, 0), JoinColor(220, 200, 40)};
    const struct { const char* name; int strokes[3], boxes[3]; bool changed; } cases[] = {
        {"outside toward box 3", {1, 0, 1}, {3, 0, 5}, true},
        {"outside next to undone paint", {-2, 0, 1}, {3, 0, 5}, false},
        {"outside next to chalk only", {1, 0, 0}, {-3, 0, 0}, false},
        {"painted next to never painted", {0, 1, 1}, {0, 1, 5}, false},
        {"painted next to another box", {1, 1, 1}, {5, 1, 1}, true},
        {"the right neighbour plays no part", {1, 0, 1}, {3, 0, 3}, true}};
    std::vector<int32_t> after;
    for (const auto& c : cases) {
        for (int k = 0; k < 3; ++k)
            for (auto [x, y] : {std::pair{49 + k, 50}, {k, 0}, {397 + k, 299}, {0, 149 + k}, {399, 149 + k}}) {
                ws.Stroke(x, y) = static_cast<int16_t>(c.strokes[k]);
                ws.ColorPlane(x, y) = static_cast<int16_t>(c.boxes[k]);
            }
        ws.Picture1 = ws.Picture2;
        for (int i = 1; i <= 12; ++i) engine.RepaintColor(i);
        const Picture plain = ws.Picture1;
        engine.RenderEdges(2);
        after.push_back(ws.Picture1.pixel(50, 50));
        EXPECT_EQ(after.back() != plain.pixel(50, 50), c.changed) << c.name;
        for (auto [x, y] : {std::pair{1, 0}, {398, 299}, {0, 150}, {399, 150}})
            EXPECT_EQ(ws.Picture1.pixel(x, y), plain.pixel(x, y)) << c.name << " " << x << "," << y;
        engine.RenderEdges(1);
        EXPECT_EQ(ws.Picture1, plain) << c.name;
    }
    EXPECT_EQ(after.front(), after.back());
}

} // namespace
