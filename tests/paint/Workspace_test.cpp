#include "paint/Workspace.h"

#include <gtest/gtest.h>

#include "imaging/HSLcolor.h"

namespace {

// The mask is laid out x fastest, then y, then the plane: the byte layout of the mask file.
TEST(Workspace, ArraysHaveTheirBoundsAndLayout) {
    Workspace ws;
    ASSERT_EQ(ws.PaintMask.size(), 401u * 301u * 2u);
    ASSERT_EQ(ws.PixelPlanes.size(), 641u * 481u * 6u);
    ws.Stroke(400, 300) = 7;
    ws.ColorPlane(1, 0) = -3;
    ws.Plane(2, 1, 5) = 99;
    EXPECT_EQ(ws.PaintMask[400 + 401 * 300], 7);
    EXPECT_EQ(ws.PaintMask[1 + 401 * 301], -3);
    EXPECT_EQ(ws.PixelPlanes[2 + 641 * 1 + 641 * 481 * 5], 99);
    EXPECT_EQ(ws.WholeMaxX(), 399);
    EXPECT_EQ(ws.WholeMaxY(), 299);
}

TEST(Workspace, SetToleranceRoundsTheColourPlanesTiesToEven) {
    const std::pair<int, int32_t> table[] = {{4, 6}, {12, 18}, {30, 45}, {5, 8}, {3, 4}, {7, 10}};
    for (auto [n, colour] : table) {
        Workspace ws;
        SetTolerance(ws, n);
        EXPECT_EQ(ws.PlaneTolerance, (std::array<int32_t, 6>{colour, colour, colour, n, n, n})) << n;
    }
}

TEST(Workspace, LoadDrawColorTakesTheReferenceOnlyWhenThereIsOne) {
    Workspace ws;
    ws.RefLum = 77;
    ws.Boxes[2].color = HSLcolor::JoinColor(200, 100, 50);
    LoadDrawColor(ws, -2);  // a chalk-line index names the same box
    EXPECT_EQ(ws.PaintHue, 14);
    EXPECT_EQ(ws.PaintSat, 153);
    EXPECT_EQ(ws.PaintLum, 125);
    EXPECT_EQ(ws.RefLum, 77);
    ws.Boxes[2].reference = HSLcolor::JoinColor(255, 0, 0);
    LoadDrawColor(ws, 2);
    EXPECT_EQ(ws.RefLum, 127);
}

} // namespace
