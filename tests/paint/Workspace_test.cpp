#include "paint/Workspace.h"

#include <gtest/gtest.h>

#include "imaging/HSLcolor.h"

namespace {

TEST(Workspace, StartsAsTheProgramDoes) {
    Workspace ws;
    EXPECT_EQ(ws.PaintMask.size(), 401u * 301u * 2u);
    EXPECT_EQ(ws.PixelPlanes.size(), 641u * 481u * 6u);
    EXPECT_EQ(ws.PixelLuma.size(), 641u * 481u);
    EXPECT_EQ(ws.Picture1.width(), 400);
    EXPECT_EQ(ws.Picture1.height(), 300);
    EXPECT_EQ(ws.WholeMaxX(), 399);
    EXPECT_EQ(ws.WholeMaxY(), 299);
    EXPECT_EQ(ws.CurrentColor, 1);
    EXPECT_TRUE(ws.WideRoller);
    EXPECT_FALSE(ws.ChalkLineMode);
    EXPECT_EQ(ws.ChalkStartX, -1);
    EXPECT_EQ(ws.ChalkStartY, -1);
    EXPECT_EQ(ws.MatchWeight, 50);
    EXPECT_EQ(ws.PlaneTolerance, (std::array<int32_t, 6>{18, 18, 18, 12, 12, 12}));
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.PictureLoaded);
    EXPECT_FALSE(ws.PictureModified);
    EXPECT_TRUE(ws.BlendEdges && ws.ExpandEdges && ws.ProtectPaint && ws.LoadWithPicture);
    EXPECT_FALSE(ws.AutoCrop);
    EXPECT_EQ(ws.Boxes[1].name, "Ceiling");
    EXPECT_EQ(ws.Boxes[6].name, "Skirting Board");
    EXPECT_EQ(ws.Boxes[12].name, "Extra 4");
    for (int i = 1; i <= kColorBoxCount; ++i) {
        EXPECT_FALSE(ws.Boxes[i].hasColor()) << i;
        EXPECT_EQ(ws.Boxes[i].reference, 0) << i;
    }
}

// The mask is laid out x fastest, then y, then the plane: the byte layout of the mask file.
TEST(Workspace, MaskLayoutIsXFastestPlaneZeroFirst) {
    Workspace ws;
    ws.Stroke(400, 300) = 7;
    ws.ColorPlane(1, 0) = -3;
    EXPECT_EQ(ws.PaintMask[400 + 401 * 300], 7);
    EXPECT_EQ(ws.PaintMask[1 + 401 * 301], -3);
    ws.Plane(2, 1, 5) = 99;
    EXPECT_EQ(ws.PixelPlanes[2 + 641 * 1 + 641 * 481 * 5], 99);
}

struct ToleranceCase {
    int n;
    int32_t colour;
};

class SetToleranceTable : public ::testing::TestWithParam<ToleranceCase> {};

TEST_P(SetToleranceTable, ColourPlanesGetOneAndAHalfTimesTiesToEven) {
    Workspace ws;
    SetTolerance(ws, GetParam().n);
    const int32_t c = GetParam().colour, n = GetParam().n;
    EXPECT_EQ(ws.PlaneTolerance, (std::array<int32_t, 6>{c, c, c, n, n, n}));
}

INSTANTIATE_TEST_SUITE_P(Kinds, SetToleranceTable, ::testing::Values(
    ToleranceCase{4, 6}, ToleranceCase{12, 18}, ToleranceCase{30, 45},
    ToleranceCase{5, 8},     // 7.5 goes to the even 8
    ToleranceCase{3, 4},     // 4.5 goes to the even 4
    ToleranceCase{7, 10}));  // 10.5 goes to the even 10

TEST(LoadDrawColor, TakesThePaintColourAndTheReferenceLuminance) {
    Workspace ws;
    ws.Boxes[3].color = HSLcolor::JoinColor(200, 100, 50);
    ws.Boxes[3].reference = HSLcolor::JoinColor(50, 100, 200);
    LoadDrawColor(ws, 3);
    EXPECT_EQ(ws.PaintHue, 14);
    EXPECT_EQ(ws.PaintSat, 153);
    EXPECT_EQ(ws.PaintLum, 125);
    EXPECT_EQ(ws.RefLum, 125);
}

TEST(LoadDrawColor, KeepsRefLumWhenTheBoxHasNoReference) {
    Workspace ws;
    ws.RefLum = 77;
    ws.Boxes[2].color = HSLcolor::JoinColor(255, 0, 0);
    LoadDrawColor(ws, 2);
    EXPECT_EQ(ws.PaintHue, 0);
    EXPECT_EQ(ws.PaintSat, 255);
    EXPECT_EQ(ws.PaintLum, 127);
    EXPECT_EQ(ws.RefLum, 77);
    LoadDrawColor(ws, -2);  // a chalk-line index names the same box
    EXPECT_EQ(ws.PaintLum, 127);
}

} // namespace
