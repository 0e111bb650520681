#include <gtest/gtest.h>

#include "paint/PaintFixture.h"

using namespace painttest;
using HSLcolor::HSLToRGB;
using HSLcolor::JoinColor;

namespace {

struct RecolorCase {
    int luma;
    int32_t expected;
};

class Recolor : public PaintTest, public ::testing::WithParamInterface<RecolorCase> {};

// Reference luminance 120, paint luminance 100, saturation 200, hue 20.
TEST_P(Recolor, KeepsTheLightOfThePhoto) {
    ws.PaintHue = 20;
    ws.PaintSat = 200;
    ws.PaintLum = 100;
    ws.RefLum = 120;
    ws.Luma(7, 3) = GetParam().luma;
    ws.PictureModified = false;
    engine.RecolorPixel(7, 3);
    EXPECT_EQ(ws.Picture1.pixel(7, 3), GetParam().expected);
    EXPECT_EQ(ws.Picture1.pixel(3, 7), Swatch('Y'));
    EXPECT_TRUE(ws.PictureModified);
}

INSTANTIATE_TEST_SUITE_P(
    Examples, Recolor,
    ::testing::Values(RecolorCase{120, JoinColor(HSLToRGB(20, 197, 100))},        // as bright as the reference
                      RecolorCase{160, JoinColor(HSLToRGB(20, 255, 169.5615f))},  // 40^1.15 + 100, saturation clamped
                      RecolorCase{60, JoinColor(HSLToRGB(20, 49, 40))},           // darker: -60 + 100
                      RecolorCase{0, 0},                                          // black stays black
                      RecolorCase{255, 0xFFFFFF}));                               // luminance clamped at 255

struct OutsideCase {
    int32_t reference;
    float refLum;
};

class OutsideBlend : public PaintTest, public ::testing::WithParamInterface<OutsideCase> {};

// Photo (90, 30, 60) two parts to paint (0, 120, 30) one part: (60, 60, 50).
TEST_P(OutsideBlend, MixesTwoPartsPhotoWithOnePartPaint) {
    SetPhotoPixel(ws, 12, 34, JoinColor(90, 30, 60));
    GiveBox(4, JoinColor(0, 120, 30), GetParam().reference);
    ws.RefLum = 77;
    engine.BlendOutsidePixel(12, 34, 4);
    const HSLcolor::HSL m = HSLcolor::RGBToHSL(60, 60, 50);
    EXPECT_EQ(ws.PaintHue, m.hue);
    EXPECT_EQ(ws.PaintSat, m.sat);
    EXPECT_EQ(ws.PaintLum, m.lum);
    EXPECT_EQ(ws.RefLum, GetParam().refLum);
}

INSTANTIATE_TEST_SUITE_P(References, OutsideBlend,
                         ::testing::Values(OutsideCase{0, 77.0f},  // no reference: RefLum stays
                                           // (60,60,50) twice with (150,150,150): (90, 90, 83)
                                           OutsideCase{JoinColor(150, 150, 150), HSLcolor::RGBToHSL(90, 90, 83).lum}));

TEST_F(PaintTest, BoundaryBlendTakesAbsoluteBoxes) {
    GiveBox(3, JoinColor(30, 200, 90), JoinColor(90, 0, 0));
    GiveBox(5, JoinColor(240, 30, 0), 0);
    int a = -3, b = -5;
    engine.BlendBoundaryPixel(a, b);
    EXPECT_EQ(a, 3);
    EXPECT_EQ(b, 5);
    // (30,200,90) x2 + (240,30,0) = (100, 143, 60); references (90,0,0) x2 + black = (60, 0, 0).
    const HSLcolor::HSL m = HSLcolor::RGBToHSL(100, 143, 60);
    EXPECT_EQ(ws.PaintHue, m.hue);
    EXPECT_EQ(ws.PaintLum, m.lum);
    EXPECT_EQ(ws.RefLum, HSLcolor::RGBToHSL(60, 0, 0).lum);
}

TEST_F(PaintTest, RepaintColorSkipsABoxWithoutReference) {
    DrawMask(ws, {"11", "11"}, 1, 30, 30);
    ws.Boxes[1].reference = 0;
    engine.RepaintColor(1);
    EXPECT_EQ(ws.Picture1.pixel(30, 30), Swatch('Y'));
    EXPECT_EQ(host.refreshes, 0);
    ws.Boxes[1].reference = JoinColor(200, 180, 40);
    engine.RepaintColor(-1);  // the sign is ignored
    EXPECT_NE(ws.Picture1.pixel(30, 30), Swatch('Y'));
    EXPECT_EQ(ws.Picture1.pixel(32, 30), Swatch('Y'));
    EXPECT_EQ(host.refreshes, 1);
}

TEST_F(PaintTest, RefreshDrawsEveryBoxIncludingTheLast) {
    for (int i = 1; i <= 12; ++i) {
        GiveBox(i, JoinColor(20 * i, 250 - 20 * i, 90), JoinColor(200, 180, 40));
        DrawMask(ws, {"1"}, i, 10 + 3 * i, 20);
    }
    engine.RefreshAll();
    EXPECT_EQ(host.pumps, 12);
    for (int i = 1; i <= 12; ++i) {
        ws.Picture1.setPixel(0, 0, Swatch('Y'));
        LoadDrawColor(ws, i);
        const int32_t drawn = ws.Picture1.pixel(10 + 3 * i, 20);
        engine.RecolorPixel(0, 0);  // what box i draws on this sunlit wall
        EXPECT_EQ(drawn, ws.Picture1.pixel(0, 0)) << "box " << i;
    }
    EXPECT_EQ(ws.Picture1.pixel(200, 200), Swatch('Y'));
}

TEST_F(PaintTest, RefreshWithoutPictureDoesNothing) {
    ws.PictureLoaded = false;
    DrawMask(ws, {"1"}, 1, 30, 30);
    engine.RefreshAll();
    EXPECT_EQ(host.pumps, 0);
    EXPECT_EQ(ws.Picture1.pixel(30, 30), Swatch('Y'));
}

} // namespace
