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
}

// Photo (90, 30, 60) two parts to paint (0, 120, 30) one part: (60, 60, 50);
// that twice with the reference (150, 150, 150) gives (90, 90, 83).
TEST_F(PaintTest, OutsideBlendMixesTwoPartsPhotoToOnePartPaint) {
    SetPhotoPixel(ws, 12, 34, JoinColor(90, 30, 60));
    GiveBox(4, JoinColor(0, 120, 30), JoinColor(150, 150, 150));
    engine.BlendOutsidePixel(12, 34, 4);
    const HSLcolor::HSL mix = HSLcolor::RGBToHSL(60, 60, 50);
    EXPECT_EQ(std::tuple(ws.PaintHue, ws.PaintSat, ws.PaintLum), std::tuple(mix.hue, mix.sat, mix.lum));
    EXPECT_EQ(ws.RefLum, HSLcolor::RGBToHSL(90, 90, 83).lum);
}

TEST_F(PaintTest, RefreshDrawsEveryBoxIncludingTheLast) {
    for (int i = 1; i <= 12; ++i) {
        GiveBox(i, JoinColor(20 * i, 250 - 20 * i, 90), Swatch('Y'));
        DrawMask(ws, {"1"}, i, 10 + i, 20);
    }
    engine.RefreshAll();
    EXPECT_EQ(host.pumps, 12);
    for (int i = 1; i <= 12; ++i) {
        EXPECT_NE(ws.Picture1.pixel(10 + i, 20), Swatch('Y')) << i;
        EXPECT_NE(ws.Picture1.pixel(10 + i, 20), ws.Picture1.pixel(9 + i, 20)) << i;
    }
}

class EdgePass : public PaintTest {
protected:
    EdgePass() {
        GiveBox(3, JoinColor(30, 200, 90), JoinColor(150, 140, 60));
        GiveBox(5, JoinColor(240, 30, 0), JoinColor(220, 200, 40));
    }
    void DrawPlain() {
        ws.Picture1 = ws.Picture2;
        for (int i = 1; i <= 12; ++i) engine.RepaintColor(i);
    }
};

// Boxes 3 and 5 meet box 1 paint, a chalk mark and undone paint in the corner.
TEST_F(EdgePass, PlainPassUndoesEveryBlendAndNeitherTouchesTheBorder) {
    DrawPhoto(ws, {"BBBBGGGY", "BBBRRGGY", "YYYRRYYY"});
    DrawMask(ws, {"1111", "1111", "111"}, 3);
    DrawMask(ws, {"....111", ".....1#"}, 5);
    DrawMask(ws, {"", "", "...11b"}, 1);
    DrawPlain();
    const Picture plain = ws.Picture1;
    engine.RenderEdges(2);
    const Picture blended = ws.Picture1;
    EXPECT_NE(blended, plain);
    for (int i = 0; i < 400; ++i)
        for (auto [x, y] : {std::pair{i, 0}, {i, 299}, {0, i % 300}, {399, i % 300}})
            EXPECT_EQ(blended.pixel(x, y), plain.pixel(x, y)) << x << "," << y;
    engine.RenderEdges(1);
    EXPECT_EQ(ws.Picture1, plain);
    ws.BlendEdges = true;
    engine.RenderEdges(0);  // as the option says
    EXPECT_EQ(ws.Picture1, blended);
}

// The pixel (50, 50) between a left and a right neighbour after a blend pass:
// the first neighbour in order decides. Cells left, centre, right.
TEST_F(EdgePass, BlendFollowsTheFirstNeighbour) {
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
        DrawPlain();
        const int32_t plain = ws.Picture1.pixel(50, 50);
        engine.RenderEdges(2);
        after.push_back(ws.Picture1.pixel(50, 50));
        EXPECT_EQ(after.back() != plain, c.changed) << c.name;
    }
    EXPECT_EQ(after.front(), after.back());
}

} // namespace
