#include <gtest/gtest.h>

#include "paint/PaintFixture.h"
#include "paint/Tools.h"

using namespace painttest;
using HSLcolor::JoinColor;

namespace {

// --- Pickup --------------------------------------------------------------------

struct PickupCase {
    const char* name;
    int start;
    std::vector<int> referenced;  // boxes that hold a reference
    bool stillOn;
    int next;
};

class Pickup : public PaintTest, public ::testing::WithParamInterface<PickupCase> {};

TEST_P(Pickup, FillsTheBoxAndMovesOnToTheNextEmptyOne) {
    const PickupCase c = GetParam();
    ws.Boxes[1].reference = 0;
    for (const int i : c.referenced) GiveBox(i, JoinColor(10 * i, 100, 200), JoinColor(90, 90, 90));
    DrawPhoto(ws, {"RR", "RR"}, 30, 40);
    ws.CurrentColor = static_cast<int16_t>(c.start);
    StartPickup(ws);

    engine.MouseMove(0, 30.4f, 40.2f);
    EXPECT_EQ(ws.PickupLabelColor, Swatch('R'));
    engine.MouseDown(kLeftButton, 30.4f, 40.2f);
    EXPECT_EQ(ws.Boxes[static_cast<size_t>(c.start)].color, Swatch('R'));
    EXPECT_EQ(host.selected, std::vector<int>{c.start});
    EXPECT_EQ(ws.CurrentColor, c.start);
    EXPECT_EQ(ws.PickupLabelVisible, c.stillOn);
    if (c.stillOn) {
        EXPECT_EQ(ws.PickupIndex, c.next);
        EXPECT_EQ(ws.PickupLabelColor, ws.Boxes[static_cast<size_t>(c.next)].color);
    }
    // The release only ends the click: no stroke, no Undo.
    engine.MouseMove(kLeftButton, 31, 41);
    engine.MouseUp(kLeftButton, 31, 41);
    EXPECT_FALSE(ws.IgnoreUntilMouseUp);
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
}

INSTANTIATE_TEST_SUITE_P(Advance, Pickup,
                         ::testing::Values(PickupCase{"SkipsReferencedBoxes", 2, {1, 2, 3, 4}, true, 5},
                                           PickupCase{"StopsAtTen", 10, {}, false, 0},
                                           PickupCase{"ElevenToEmptyTwelve", 11, {}, true, 12},
                                           PickupCase{"ElevenNeverPastTwelve", 11, {12}, false, 0},
                                           PickupCase{"NineToTenThenStop", 9, {10}, false, 0},
                                           PickupCase{"TwelveEnds", 12, {}, false, 0}),
                         [](const auto& info) { return std::string(info.param.name); });

TEST_F(PaintTest, PickupPreviewKeepsItsColourOutsideThePicture) {
    DrawPhoto(ws, {"B"}, 0, 299);
    StartPickup(ws);
    engine.MouseMove(0, 0, 299);
    EXPECT_EQ(ws.PickupLabelColor, Swatch('B'));
    for (auto [x, y] : {std::pair{-0.6f, 299.0f}, std::pair{0.0f, 299.6f}, std::pair{-900.0f, 9000.0f}}) {
        engine.MouseMove(0, x, y);
        EXPECT_EQ(ws.PickupLabelColor, Swatch('B'));
    }
}

TEST_F(PaintTest, RightPressEndsTheModalToolsWithoutErasing) {
    DrawMask(ws, {"1"}, 1, 50, 50);
    ws.StrokeNumber = 1;
    StartPickup(ws);
    engine.MouseDown(kRightButton, 50, 50);
    EXPECT_FALSE(ws.PickupLabelVisible);
    EXPECT_EQ(ws.Cursor, PictureCursor::WideRoller);
    EXPECT_EQ(ws.Stroke(50, 50), 1);
}

TEST_F(PaintTest, RightButtonErasesWithTheEraserCursor) {
    DrawMask(ws, {"111"}, 1, 50, 50);
    ws.StrokeNumber = 1;
    engine.MouseDown(kRightButton, 50, 50);
    EXPECT_EQ(ws.Cursor, PictureCursor::Eraser);
    engine.MouseMove(kRightButton, 56, 50);
    engine.MouseUp(kRightButton, 56, 50);
    EXPECT_EQ(ws.Cursor, PictureCursor::WideRoller);
    EXPECT_EQ(CountStroke(ws, -2), 3);
}

// --- Reference -----------------------------------------------------------------

TEST_F(PaintTest, FirstPressTakesTheReferenceAndASecondKeepsIt) {
    ws.Boxes[1].reference = 0;
    engine.MouseDown(kLeftButton, 120, 80);
    // An even wall: the cross is five equal pixels, saturation passed as hue.
    const int32_t expected = JoinColor(HSLcolor::HSLToRGB(static_cast<float>(ws.Plane(120, 80, 5)),
                                                          static_cast<float>(ws.Plane(120, 80, 4)),
                                                          static_cast<float>(ws.Luma(120, 80))));
    EXPECT_EQ(ws.Boxes[1].reference, expected);
    EXPECT_EQ(ws.RefLum, static_cast<float>(ws.Luma(120, 80)));
    EXPECT_GT(CountStroke(ws, 1), 1);  // painted in the same press
    engine.MouseUp(kLeftButton, 120, 80);

    DrawPhoto(ws, {"BBB", " B "}, 199, 99);
    engine.MouseDown(kLeftButton, 200, 100);
    EXPECT_EQ(ws.Boxes[1].reference, expected);
}

TEST_F(PaintTest, SetReferenceOnAnotherBoxesPaintGivesBothBoxesTheReference) {
    GiveBox(3, JoinColor(200, 30, 90), JoinColor(10, 10, 10));
    DrawPhoto(ws, {"RRR", "RRR", "RRR"}, 59, 59);
    DrawMask(ws, {"111", "111", "111"}, 3, 59, 59);
    ws.StrokeNumber = 1;
    ToggleSetReference(ws);

    engine.MouseDown(kLeftButton, 60, 60);
    const int32_t reference = ws.Boxes[1].reference;
    EXPECT_NE(reference, JoinColor(200, 180, 40));
    EXPECT_EQ(ws.Boxes[3].reference, reference);
    EXPECT_NE(ws.Picture1.pixel(60, 60), Swatch('R'));  // box 3 redrawn at once
    EXPECT_TRUE(ws.SetReferenceMode);
    EXPECT_TRUE(ws.IgnoreUntilMouseUp);
    engine.MouseMove(kLeftButton, 80, 80);
    engine.MouseUp(kLeftButton, 80, 80);
    EXPECT_FALSE(ws.IgnoreUntilMouseUp);
    EXPECT_EQ(ws.StrokeNumber, 1);
    EXPECT_FALSE(ws.UndoEnabled);
}

TEST_F(PaintTest, SetReferenceOnUnpaintedPixelOnlyWarns) {
    ToggleSetReference(ws);
    engine.MouseDown(kLeftButton, 60, 60);
    ASSERT_EQ(host.warnings.size(), 1u);
    EXPECT_EQ(host.warnings[0].first, "Warning - Set Reference");
    EXPECT_EQ(host.warnings[0].second, "This area is not re-painted.");
    EXPECT_EQ(ws.Boxes[1].reference, JoinColor(200, 180, 40));
    engine.MouseUp(kLeftButton, 60, 60);
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
}

// --- Positions outside the picture --------------------------------------------------

TEST_F(PaintTest, DragsOutsideThePictureStayInsideTheArrays) {
    ws.ExpandEdges = true;
    ws.BlendEdges = true;
    engine.MouseDown(kLeftButton, 395, 295);
    for (auto [x, y] : {std::pair{1000.0f, 1000.0f}, std::pair{-1000.0f, 5.0f}, std::pair{5.0f, -1000.0f},
                        std::pair{399.4f, 5000.0f}, std::pair{1e9f, -1e9f}})
        engine.MouseMove(kLeftButton, x, y);
    engine.MouseUp(kLeftButton, 1e9f, 1e9f);
    for (int y = 0; y <= 300; ++y) EXPECT_EQ(ws.Stroke(400, y), 0);
    for (int x = 0; x <= 400; ++x) EXPECT_EQ(ws.Stroke(x, 300), 0);
    EXPECT_TRUE(ws.UndoEnabled);
}

TEST_F(PaintTest, ReleaseWithoutABegunStrokeOrLineDoesNothing) {
    ws.Boxes[1].color = kButtonFace;
    for (const bool chalk : {false, true}) {
        ws.ChalkLineMode = chalk;
        engine.MouseDown(kLeftButton, 50, 50);
        engine.MouseUp(kLeftButton, 80, 60);
    }
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
}

} // namespace
