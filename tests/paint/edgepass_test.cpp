#include <gtest/gtest.h>

#include "paint/PaintFixture.h"

using namespace painttest;
using HSLcolor::JoinColor;

namespace {

class EdgePass : public PaintTest {
protected:
    EdgePass() {
        GiveBox(3, JoinColor(30, 200, 90), JoinColor(150, 140, 60));
        GiveBox(5, JoinColor(240, 30, 0), JoinColor(220, 200, 40));
        // A photo with a door and a hedge at the top-left corner, touching the border.
        DrawPhoto(ws, {"BBBBGGGY",
                       "BBBBGGGY",
                       "BBBRRGGY",
                       "YYYRRYYY",
                       "YYYYYYYY"});
    }
    // Photo back, then every box drawn plain: the view without blending.
    void DrawPlain() {
        ws.Picture1 = ws.Picture2;
        for (int i = 1; i <= 12; ++i) engine.RepaintColor(i);
    }
};

TEST_F(EdgePass, PlainPassUndoesEveryBlendAndNeverTouchesTheBorder) {
    // Boxes 3 and 5 meet box 1 paint, a chalk mark of box 5 and undone box 1 paint.
    DrawMask(ws, {"1111", "1111", "111"}, 3);
    DrawMask(ws, {"....111", "....111", ".....1#"}, 5);
    DrawMask(ws, {"", "", "...11", "...11b"}, 1);
    DrawPlain();
    const Picture plain = ws.Picture1;

    engine.RenderEdges(2);
    const Picture blended = ws.Picture1;
    EXPECT_NE(blended, plain);
    for (int x = 0; x < 400; ++x) {
        EXPECT_EQ(blended.pixel(x, 0), plain.pixel(x, 0));
        EXPECT_EQ(blended.pixel(x, 299), plain.pixel(x, 299));
    }
    for (int y = 0; y < 300; ++y) {
        EXPECT_EQ(blended.pixel(0, y), plain.pixel(0, y));
        EXPECT_EQ(blended.pixel(399, y), plain.pixel(399, y));
    }
    engine.RenderEdges(1);
    EXPECT_EQ(ws.Picture1, plain);
    // Mode 0 follows the option.
    ws.BlendEdges = true;
    engine.RenderEdges(0);
    EXPECT_EQ(ws.Picture1, blended);
}

// The pixel (50, 50) between a left and a right neighbour, after a blend pass.
struct NeighbourCase {
    const char* name;
    int centreStroke, centreBox;
    int leftStroke, leftBox;
    int rightStroke, rightBox;
    enum { Untouched, LikeLeftOnly, Changed } outcome;
};

class BlendNeighbours : public EdgePass, public ::testing::WithParamInterface<NeighbourCase> {
protected:
    int32_t BlendedCentre(const NeighbourCase& c, int rightBox) {
        ws.Stroke(50, 50) = static_cast<int16_t>(c.centreStroke);
        ws.ColorPlane(50, 50) = static_cast<int16_t>(c.centreBox);
        ws.Stroke(49, 50) = static_cast<int16_t>(c.leftStroke);
        ws.ColorPlane(49, 50) = static_cast<int16_t>(c.leftBox);
        ws.Stroke(51, 50) = static_cast<int16_t>(c.rightStroke);
        ws.ColorPlane(51, 50) = static_cast<int16_t>(rightBox);
        DrawPlain();
        engine.RenderEdges(2);
        return ws.Picture1.pixel(50, 50);
    }
};

TEST_P(BlendNeighbours, FirstNeighbourInOrderDecides) {
    const NeighbourCase c = GetParam();
    const int32_t after = BlendedCentre(c, c.rightBox);
    const int32_t plain = [&] { DrawPlain(); return ws.Picture1.pixel(50, 50); }();
    switch (c.outcome) {
    case NeighbourCase::Untouched: EXPECT_EQ(after, plain); break;
    case NeighbourCase::Changed: EXPECT_NE(after, plain); break;
    case NeighbourCase::LikeLeftOnly:
        EXPECT_NE(after, plain);
        EXPECT_EQ(after, BlendedCentre(c, c.leftBox));  // the right neighbour plays no part
        break;
    }
}

INSTANTIATE_TEST_SUITE_P(
    Cases, BlendNeighbours,
    ::testing::Values(NeighbourCase{"OutsideTowardLeftBox", 0, 0, 1, 3, 1, 5, NeighbourCase::LikeLeftOnly},
                      NeighbourCase{"OutsideNextToUndonePaint", 0, 0, -2, 3, 1, 5, NeighbourCase::Untouched},
                      NeighbourCase{"OutsideNextToChalkOnly", 0, 0, 1, -3, 0, 0, NeighbourCase::Untouched},
                      NeighbourCase{"PaintedNextToNeverPainted", 1, 1, 0, 0, 1, 5, NeighbourCase::Untouched},
                      NeighbourCase{"PaintedNextToOtherBox", 1, 1, 1, 5, 1, 1, NeighbourCase::Changed},
                      NeighbourCase{"PaintedNextToUndoneOtherBox", 1, 1, -4, 5, 1, 1, NeighbourCase::Changed}),
    [](const auto& info) { return std::string(info.param.name); });

} // namespace
