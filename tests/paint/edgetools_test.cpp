#include "paint/PaintFixture.h"
#include "paint/Tools.h"

using namespace painttest;
using HSLcolor::JoinColor;

namespace {

// Stroke 2 in the bottom-right corner beside undone paint ('a') and an earlier
// stroke: the growth is one pixel, never diagonal, never onto the border or
// over earlier paint.
TEST_F(PaintTest, ExpansionGrowsOnePixelInsideTheBorder) {
    DrawMask(ws, {".....", ".....", "...a.", "..122", "...22"}, 1, 395, 295);
    ws.StrokeNumber = 2;
    ws.StrokeLeft = 398;
    ws.StrokeTop = 298;
    ws.StrokeRight = 399;
    ws.StrokeBottom = 299;
    engine.ExpandEdges();
    EXPECT_EQ(MaskArt(ws, 0, 395, 295, 5, 5), (Art{".....", ".....", "...2.", "..122", "...22"}));
    EXPECT_EQ(ws.ColorPlane(398, 297), 1);
    EXPECT_EQ(host.refreshes, 1);
}

// The eraser clears a 7 x 7 square clipped to the picture and shows the photo
// there; on unpainted pixels it changes no mask value but still restores them.
TEST_F(PaintTest, EraserClearsASquareClippedToThePicture) {
    ws.Picture1.setPixel(20, 20, 0x123456);  // a blend tint, say
    engine.EraseAt(21, 22);
    EXPECT_EQ(ws.Picture1, ws.Picture2);
    EXPECT_FALSE(ws.RedoEnabled);
    DrawMask(ws, Art(300, std::string(400, '1')), 1);
    ws.StrokeNumber = 1;
    engine.RepaintColor(1);
    const Picture painted = ws.Picture1;
    const struct { int x, y, x1, y1, x2, y2; } cases[] = {
        {1, 1, 0, 0, 4, 4}, {399, 299, 396, 296, 399, 299}, {-3, 100, 0, 97, 0, 103}};
    for (const auto& c : cases) engine.EraseAt(c.x, c.y);
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) {
            bool inside = false;
            for (const auto& c : cases) inside = inside || (x >= c.x1 && x <= c.x2 && y >= c.y1 && y <= c.y2);
            ASSERT_EQ(ws.Stroke(x, y), inside ? -2 : 1) << x << "," << y;
            ASSERT_EQ(ws.Picture1.pixel(x, y), (inside ? ws.Picture2 : painted).pixel(x, y)) << x << "," << y;
        }
    EXPECT_TRUE(ws.RedoEnabled);
}

// The line follows y = whole(x / 2) from (0, 0) to (4, 2): whole(0.5) = 0 and
// whole(1.5) = 2. It is stored as chalk only on release.
TEST_F(PaintTest, ChalkLineIsARubberBandUntilReleased) {
    ws.ChalkLineMode = true;
    const Picture photo = ws.Picture1;
    engine.MouseDown(kLeftButton, 0, 0);
    engine.MouseMove(kLeftButton, 3, 3);  // a band the next move takes away
    engine.MouseMove(kLeftButton, 4, 2);
    EXPECT_EQ(ws.Picture1.pixel(2, 1), ~Swatch('Y') & 0xFFFFFF);
    EXPECT_EQ(ws.Picture1.pixel(3, 3), Swatch('Y'));
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
    engine.MouseUp(kLeftButton, 4, 2);
    EXPECT_EQ(MaskArt(ws, 1, 0, 0, 6, 4), (Art{"aa....", "..a...", "...aa.", "......"}));
    EXPECT_NE(ws.Picture1.pixel(2, 1), Swatch('Y'));
    engine.UndoStroke();
    EXPECT_EQ(ws.Picture1, photo);
    Dab(10, 10);  // a line of no length stores nothing
    // Ends outside the picture are clamped to it.
    engine.MouseDown(kLeftButton, 2, 299);
    engine.MouseUp(kLeftButton, -5, 310);
    EXPECT_EQ(MaskArt(ws, 0, 0, 298, 4, 3), (Art{"....", "222.", "...."}));
    EXPECT_EQ(CountStroke(ws, 2), 3);
}

// --- Pickup and reference --------------------------------------------------------

TEST_F(PaintTest, PickupFillsTheBoxAndMovesOnToTheNextEmptyOne) {
    const struct { int start; std::vector<int> referenced; int next; } cases[] = {
        {2, {1, 2, 3, 4}, 5}, {10, {}, 0}, {11, {}, 12}, {11, {12}, 0}, {12, {}, 0}};  // 0: the tool ends
    DrawPhoto(ws, {"RR", "RR"}, 30, 40);
    for (const auto& c : cases) {
        for (int i = 1; i <= 12; ++i) ws.Boxes[static_cast<size_t>(i)].reference = 0;
        for (const int i : c.referenced) GiveBox(i, JoinColor(10 * i, 100, 200), JoinColor(90, 90, 90));
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
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled || ws.IgnoreUntilMouseUp);
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
    GiveBox(3, JoinColor(200, 30, 90), JoinColor(10, 10, 10));
    DrawPhoto(ws, {"RRR", "RRR", "RRR"}, 59, 59);
    DrawMask(ws, {"111", "111", "111"}, 3, 59, 59);
    ws.StrokeNumber = 1;
    ToggleSetReference(ws);
    Dab(20, 20);
    EXPECT_EQ(host.warnings, std::vector<std::string>{"Warning - Set Reference|This area is not re-painted."});
    EXPECT_EQ(ws.Boxes[1].reference, JoinColor(200, 180, 40));
    engine.MouseDown(kLeftButton, 60, 60);
    EXPECT_NE(ws.Boxes[1].reference, JoinColor(200, 180, 40));
    EXPECT_EQ(ws.Boxes[3].reference, ws.Boxes[1].reference);
    EXPECT_NE(ws.Picture1.pixel(60, 60), Swatch('R'));  // box 3 redrawn at once
    engine.MouseMove(kLeftButton, 80, 80);
    engine.MouseUp(kLeftButton, 80, 80);
    EXPECT_EQ(CountStroke(ws, 1), 9);
    EXPECT_FALSE(ws.UndoEnabled || ws.IgnoreUntilMouseUp);
}

TEST_F(PaintTest, DragsOutsideThePictureStayInsideTheArrays) {
    ws.ExpandEdges = ws.BlendEdges = true;
    engine.MouseDown(kLeftButton, 395, 295);
    for (auto [x, y] : {std::pair{1000.0f, 1000.0f}, {-1000.0f, 5.0f}, {399.4f, 5000.0f}, {1e9f, -1e9f}})
        engine.MouseMove(kLeftButton, x, y);
    engine.MouseUp(kLeftButton, 1e9f, 1e9f);
    EXPECT_EQ(MaskArt(ws, 0, 400, 0, 1, 301), Art(301, "."));
    EXPECT_EQ(MaskArt(ws, 0, 0, 300, 401, 1), Art{std::string(401, '.')});
    EXPECT_TRUE(ws.UndoEnabled);
}

} // namespace
