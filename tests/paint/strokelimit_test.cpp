#include <gtest/gtest.h>

#include <functional>

#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// Every way of taking a new stroke number, tried at the largest number the
// 16-bit stroke plane holds.
struct LimitCase {
    const char* name;
    std::function<void(PaintEngine&, Workspace&)> act;
};

class StrokeLimit : public PaintTest, public ::testing::WithParamInterface<LimitCase> {};

TEST_P(StrokeLimit, RefusesWithAMessageAndWritesNoWrappedValue) {
    ws.Stroke(100, 100) = Workspace::kMaxStrokeNumber;
    ws.ColorPlane(100, 100) = 1;
    ws.Stroke(300, 200) = -32768;  // a redo step that could never be taken
    ws.ColorPlane(300, 200) = 1;
    ws.StrokeNumber = Workspace::kMaxStrokeNumber;
    engine.RepaintColor(1);
    const Picture before = ws.Picture1;
    const std::vector<int16_t> mask = ws.PaintMask;

    GetParam().act(engine, ws);

    ASSERT_EQ(host.warnings.size(), 1u);
    EXPECT_EQ(host.warnings[0].first, "Warning - Painting Picture");
    EXPECT_EQ(host.warnings[0].second, kTooManyStrokesText);
    EXPECT_EQ(ws.StrokeNumber, Workspace::kMaxStrokeNumber);
    EXPECT_EQ(ws.PaintMask, mask);
    EXPECT_EQ(ws.Picture1, before);
}

INSTANTIATE_TEST_SUITE_P(
    Ways, StrokeLimit,
    ::testing::Values(
        LimitCase{"RollerPress",
                  [](PaintEngine& e, Workspace&) {
                      e.MouseDown(kLeftButton, 100, 101);
                      e.MouseMove(kLeftButton, 104, 101);
                      e.MouseUp(kLeftButton, 104, 101);
                  }},
        LimitCase{"ChalkLine",
                  [](PaintEngine& e, Workspace& ws) {
                      ws.ChalkLineMode = true;
                      e.MouseDown(kLeftButton, 90, 90);
                      e.MouseMove(kLeftButton, 110, 95);
                      e.MouseUp(kLeftButton, 110, 95);
                  }},
        LimitCase{"Eraser",
                  [](PaintEngine& e, Workspace&) {
                      e.MouseDown(kRightButton, 100, 100);
                      e.MouseMove(kRightButton, 101, 100);
                      e.MouseUp(kRightButton, 101, 100);
                  }},
        LimitCase{"Redo", [](PaintEngine& e, Workspace&) { e.RedoStroke(); }}),
    [](const auto& info) { return std::string(info.param.name); });

TEST_F(PaintTest, LastStrokeNumberIsStillPainted) {
    ws.StrokeNumber = Workspace::kMaxStrokeNumber - 1;
    ws.WideRoller = false;
    Dab(100, 100);
    EXPECT_TRUE(host.warnings.empty());
    EXPECT_EQ(ws.Stroke(100, 100), Workspace::kMaxStrokeNumber);
    EXPECT_EQ(CountStroke(ws, Workspace::kMaxStrokeNumber), 121);
    engine.UndoStroke();
    EXPECT_EQ(CountStroke(ws, -Workspace::kMaxStrokeNumber), 121);
    engine.RedoStroke();
    EXPECT_EQ(CountStroke(ws, Workspace::kMaxStrokeNumber), 121);
}

} // namespace
