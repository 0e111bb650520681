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
// there.
TEST_F(PaintTest, EraserClearsASquareClippedToThePicture) {
    DrawMask(ws, Art(300, std::string(400, '1')), 1);
    ws.StrokeNumber = 1;
    engine.RepaintColor(1);
    for (auto [x, y] : {std::pair{1, 1}, {399, 299}, {-3, 100}}) engine.EraseAt(x, y);
    EXPECT_EQ(MaskArt(ws, 0, 0, 0, 6, 6), (Art{"bbbbb1", "bbbbb1", "bbbbb1", "bbbbb1", "bbbbb1", "111111"}));
    EXPECT_EQ(MaskArt(ws, 0, 395, 295, 5, 5), (Art{"11111", "1bbbb", "1bbbb", "1bbbb", "1bbbb"}));
    EXPECT_EQ(CountStroke(ws, -2), 25 + 16 + 7);
    EXPECT_EQ(ws.Picture1.pixel(0, 100), Swatch('Y'));  // erased: the photo
}

// The line follows y = whole(x / 2) from (0, 0) to (4, 2): whole(0.5) = 0 and
// whole(1.5) = 2. It is stored as chalk only on release.
TEST_F(PaintTest, ChalkLineIsARubberBandUntilReleased) {
    ws.ChalkLineMode = true;
    engine.MouseDown(kLeftButton, 0, 0);
    engine.MouseMove(kLeftButton, 3, 3);  // a band the next move takes away
    engine.MouseMove(kLeftButton, 4, 2);
    EXPECT_EQ(std::tuple(ws.Picture1.pixel(2, 1), ws.Picture1.pixel(3, 3), CountStroke(ws, 0)),
              std::tuple(~Swatch('Y') & 0xFFFFFF, Swatch('Y'), 401 * 301));
    engine.MouseUp(kLeftButton, 4, 2);
    EXPECT_EQ(MaskArt(ws, 1, 0, 0, 6, 4), (Art{"aa....", "..a...", "...aa.", "......"}));
    Dab(10, 10);  // a line of no length stores nothing
    // Ends outside the picture are clamped to it.
    engine.MouseDown(kLeftButton, 2, 299);
    engine.MouseUp(kLeftButton, -5, 310);
    EXPECT_EQ(MaskArt(ws, 0, 0, 298, 4, 3), (Art{"....", "333.", "...."}));
    EXPECT_EQ(std::pair(CountStroke(ws, 1), CountStroke(ws, 2)), std::pair(5, 0));
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
        const int32_t preview = ws.PickupLabelColor;
        Dab(30.4f, 40.2f);
        EXPECT_EQ(std::tuple(preview, ws.Boxes[static_cast<size_t>(c.start)].color, ws.CurrentColor,
                             ws.PickupLabelVisible ? ws.PickupIndex : 0),
                  std::tuple(Swatch('R'), Swatch('R'), c.start, c.next)) << c.start;
    }
    EXPECT_EQ(ws.StrokeNumber, 0);  // the releases only ended the clicks
}

// The reference is sampled on a cross of five pixels kept one inside the
// picture: at the brick right-most column, around (398, 100), one brick pixel
// and four of wall. It is stored with saturation in as hue. The first press
// takes it and a second keeps it; Set Reference warns on unpainted pixels and,
// on box 3 paint while box 1 is selected, tags both boxes and paints nothing.
TEST_F(PaintTest, ReferenceIsTakenByTheFirstPressOrSetOnPaint) {
    DrawPhoto(ws, Art(300, "R"), 399, 0);
    ws.Boxes[1].reference = 0;
    Dab(399, 100);
    const auto at = [&](int p, int x) { return p == 6 ? ws.Luma(x, 10) : ws.Plane(x, 10, p); };  // 6: luma
    const auto mean = [&](int p) { return static_cast<float>((4.0 * at(p, 10) + at(p, 399)) / 5.0); };
    const int32_t taken = JoinColor(HSLToRGB(mean(5), mean(4), mean(6)));
    EXPECT_EQ(std::pair(ws.Boxes[1].reference, ws.RefLum), std::pair(taken, mean(6)));
    EXPECT_EQ(MaskArt(ws, 0, 398, 100, 2, 1), (Art{".1"}));  // painted in the same press
    Dab(200, 100);
    ws.Boxes[3] = {"", JoinColor(200, 30, 90), JoinColor(10, 10, 10)};
    DrawMask(ws, Art(3, "111"), 3, 59, 59);
    ToggleSetReference(ws);
    Dab(20, 20);
    EXPECT_EQ(std::pair(host.warnings, ws.Boxes[1].reference),
              std::pair(Art{"Warning - Set Reference|This area is not re-painted."}, taken));
    engine.MouseDown(kLeftButton, 60, 60);
    engine.MouseUp(kLeftButton, 80, 80);
    EXPECT_NE(ws.Boxes[1].reference, taken);
    EXPECT_EQ(std::tuple(ws.Boxes[3].reference, ws.StrokeNumber, ws.IgnoreUntilMouseUp),
              std::tuple(ws.Boxes[1].reference, 2, false));
    EXPECT_NE(ws.Picture1.pixel(60, 60), Swatch('Y'));  // box 3 redrawn at once
}

// Reference luminance 120; paint hue 20, saturation 200, luminance 100.
TEST_F(PaintTest, RecolourKeepsTheLightOfThePhoto) {
    const std::pair<int, int32_t> cases[] = {
        {120, JoinColor(HSLToRGB(20, 197, 100))},        // as bright as the reference
        {160, JoinColor(HSLToRGB(20, 255, 169.5615f))},  // 40^1.15 + 100, saturation clamped
        {60, JoinColor(HSLToRGB(20, 49, 40))},           // darker: -60 + 100
        {0, 0}, {255, 0xFFFFFF}};                        // black stays black; luminance clamped at 255
    std::tie(ws.PaintHue, ws.PaintSat, ws.PaintLum, ws.RefLum) = std::tuple(20.0f, 200.0f, 100.0f, 120.0f);
    for (const auto& [luma, expected] : cases) {
        ws.Luma(7, 3) = luma;
        engine.RecolorPixel(7, 3);
        EXPECT_EQ(ws.Picture1.pixel(7, 3), expected) << luma;
    }
}

// The pixel (50, 50) between a left and a right neighbour after a blend pass:
// the first neighbour in order decides (cells left, centre, right), so
// undone paint on the left hides box 5 on the right. The same
// cells across row 0, row 299, column 0 and column 399 are never touched, and
// a plain pass puts back every pixel the blend changed. The refresh redraws
// every box, the last one too.
TEST_F(PaintTest, BlendFollowsTheFirstNeighbourInsideTheBorder) {
    ws.Boxes[3] = {"", JoinColor(30, 200, 90), JoinColor(150, 140, 60)};
    ws.Boxes[5] = {"", JoinColor(240, 30, 0), JoinColor(220, 200, 40)};
    ws.Boxes[12] = {"", JoinColor(20, 250, 90), Swatch('Y')};
    DrawMask(ws, {"1"}, 12, 300, 200);
    const struct { const char* name; int strokes[3], boxes[3]; bool changed; } cases[] = {
        {"outside toward box 3", {1, 0, 1}, {3, 0, 5}, true},
        {"outside next to undone paint", {-2, 0, 1}, {3, 0, 5}, false},
        {"outside next to chalk only", {1, 0, 0}, {-3, 0, 0}, false},
        {"painted next to never painted", {0, 1, 1}, {0, 1, 5}, false},
        {"painted next to another box", {1, 1, 1}, {5, 1, 1}, true}};
    for (const auto& c : cases) {
        for (int k = 0; k < 3; ++k)
            for (auto [x, y] : {std::pair{49 + k, 50}, {k, 0}, {397 + k, 299}, {0, 149 + k}, {399, 149 + k}}) {
                ws.Stroke(x, y) = static_cast<int16_t>(c.strokes[k]);
                ws.ColorPlane(x, y) = static_cast<int16_t>(c.boxes[k]);
            }
        engine.RefreshAll();
        const Picture plain = ws.Picture1;
        EXPECT_NE(plain.pixel(300, 200), Swatch('Y'));
        engine.RenderEdges(2);
        EXPECT_EQ(ws.Picture1.pixel(50, 50) != plain.pixel(50, 50), c.changed) << c.name;
        for (auto [x, y] : {std::pair{1, 0}, {398, 299}, {0, 150}, {399, 150}})
            EXPECT_EQ(ws.Picture1.pixel(x, y), plain.pixel(x, y)) << c.name << " " << x << "," << y;
        engine.RenderEdges(1);
        EXPECT_EQ(ws.Picture1, plain) << c.name;
    }
    EXPECT_EQ(host.pumps, 12 * 5);
}

} // namespace
