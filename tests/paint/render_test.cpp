#include "paint/PaintFixture.h"

using namespace painttest;
using HSLcolor::HSLToRGB;
using HSLcolor::JoinColor;

namespace {

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
    EXPECT_EQ(ws.Picture1.pixel(3, 7), Swatch('Y'));
    EXPECT_TRUE(ws.PictureModified);
}

// Two parts of the first colour to one of the second, references likewise.
TEST_F(PaintTest, BlendsMixTwoPartsToOne) {
    SetPhotoPixel(ws, 12, 34, JoinColor(90, 30, 60));
    GiveBox(4, JoinColor(0, 120, 30), JoinColor(150, 150, 150));
    engine.BlendOutsidePixel(12, 34, 4);  // photo (90, 30, 60) with paint: (60, 60, 50)
    EXPECT_EQ(ws.PaintHue, HSLcolor::RGBToHSL(60, 60, 50).hue);
    EXPECT_EQ(ws.PaintLum, HSLcolor::RGBToHSL(60, 60, 50).lum);
    EXPECT_EQ(ws.RefLum, HSLcolor::RGBToHSL(90, 90, 83).lum);  // (60, 60, 50) with the reference
    GiveBox(3, JoinColor(30, 200, 90), JoinColor(90, 0, 0));
    GiveBox(5, JoinColor(240, 30, 0), 0);
    int a = -3, b = -5;
    engine.BlendBoundaryPixel(a, b);
    EXPECT_EQ(std::pair(a, b), std::pair(3, 5));
    EXPECT_EQ(ws.PaintSat, HSLcolor::RGBToHSL(100, 143, 60).sat);
    EXPECT_EQ(ws.RefLum, HSLcolor::RGBToHSL(60, 0, 0).lum);  // a missing reference counts as black
}

TEST_F(PaintTest, RefreshDrawsEveryBoxIncludingTheLast) {
    for (int i = 1; i <= 12; ++i) {
        GiveBox(i, JoinColor(20 * i, 250 - 20 * i, 90), JoinColor(200, 180, 40));
        DrawMask(ws, {"1"}, i, 10 + 3 * i, 20);
    }
    engine.RefreshAll();
    EXPECT_EQ(host.pumps, 12);
    for (int i = 1; i <= 12; ++i) {
        const int32_t drawn = ws.Picture1.pixel(10 + 3 * i, 20);
        LoadDrawColor(ws, i);
        engine.RecolorPixel(0, 0);  // what box i draws on this sunlit wall
        EXPECT_EQ(drawn, ws.Picture1.pixel(0, 0)) << "box " << i;
    }
    EXPECT_EQ(ws.Picture1.pixel(200, 200), Swatch('Y'));
}

// Boxes 3 and 5 meet box 1 paint, a chalk mark and undone paint at the corner.
TEST_F(PaintTest, PlainPassUndoesEveryBlendAndNeitherTouchesTheBorder) {
    GiveBox(3, JoinColor(30, 200, 90), JoinColor(150, 140, 60));
    GiveBox(5, JoinColor(240, 30, 0), JoinColor(220, 200, 40));
    DrawPhoto(ws, {"BBBBGGGY", "BBBRRGGY", "YYYRRYYY"});
    DrawMask(ws, {"1111", "1111", "111"}, 3);
    DrawMask(ws, {"....111", ".....1#"}, 5);
    DrawMask(ws, {"", "", "...11b"}, 1);
    for (int i = 1; i <= 12; ++i) engine.RepaintColor(i);
    const Picture plain = ws.Picture1;
    engine.RenderEdges(2);
    const Picture blended = ws.Picture1;
    EXPECT_NE(blended, plain);
    for (int i = 0; i < 400; ++i) {
        EXPECT_EQ(blended.pixel(i, 0), plain.pixel(i, 0));
        EXPECT_EQ(blended.pixel(i, 299), plain.pixel(i, 299));
        EXPECT_EQ(blended.pixel(0, i % 300), plain.pixel(0, i % 300));
        EXPECT_EQ(blended.pixel(399, i % 300), plain.pixel(399, i % 300));
    }
    engine.RenderEdges(1);
    EXPECT_EQ(ws.Picture1, plain);
    ws.BlendEdges = true;
    engine.RenderEdges(0);  // as the option says
    EXPECT_EQ(ws.Picture1, blended);
}

// The pixel (50, 50) between a left and a right neighbour after a blend pass:
// the first neighbour in order decides. Cells left, centre, right.
TEST_F(PaintTest, BlendFollowsTheFirstNeighbour) {
    GiveBox(3, JoinColor(30, 200, 90), JoinColor(150, 140, 60));
    GiveBox(5, JoinColor(240, 30, 0), JoinColor(220, 200, 40));
    const struct { const char* name; int strokes[3], boxes[3]; bool changed; } cases[] = {
        {"outside toward box 3", {1, 0, 1}, {3, 0, 5}, true},
        {"outside next to undone paint", {-2, 0, 1}, {3, 0, 5}, false},
        {"outside next to chalk only", {1, 0, 0}, {-3, 0, 0}, false},
        {"painted next to never painted", {0, 1, 1}, {0, 1, 5}, false},
        {"painted next to another box", {1, 1, 1}, {5, 1, 1}, true},
        {"painted next to undone other box", {-4, 1, 1}, {5, 1, 1}, true},
        {"the right neighbour plays no part", {1, 0, 1}, {3, 0, 3}, true}};
    std::vector<int32_t> after;
    for (const auto& c : cases) {
        for (int k = 0; k < 3; ++k) {
            ws.Stroke(49 + k, 50) = static_cast<int16_t>(c.strokes[k]);
            ws.ColorPlane(49 + k, 50) = static_cast<int16_t>(c.boxes[k]);
        }
        ws.Picture1 = ws.Picture2;
        for (int i = 1; i <= 12; ++i) engine.RepaintColor(i);
        const int32_t plain = ws.Picture1.pixel(50, 50);
        engine.RenderEdges(2);
        after.push_back(ws.Picture1.pixel(50, 50));
        EXPECT_EQ(after.back() != plain, c.changed) << c.name;
    }
    EXPECT_EQ(after.front(), after.back());
}

} // namespace
