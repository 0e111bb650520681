#include <gtest/gtest.h>

#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// 20 x 20 blocks of door blue, hedge green and brick on a sunlit wall: one
// wide press in a block paints exactly that block.
struct Block {
    int x, y;
};
constexpr Block A{10, 10}, B{50, 10}, C{90, 10}, D{130, 10}, E{170, 10};

class Undo : public PaintTest {
protected:
    Undo() {
        const std::pair<Block, char> blocks[] = {{A, 'B'}, {B, 'G'}, {C, 'R'}, {D, 'B'}, {E, 'G'}};
        for (const auto& [b, c] : blocks)
            DrawPhoto(ws, std::vector<std::string>(20, std::string(20, c)), b.x, b.y);
    }
    void Paint(Block b) { Dab(static_cast<float>(b.x + 10), static_cast<float>(b.y + 10)); }
    // Every pixel of the block holds stroke value v (and nothing around it does).
    bool Holds(Block b, int v) {
        for (int y = b.y; y < b.y + 20; ++y)
            for (int x = b.x; x < b.x + 20; ++x)
                if (ws.Stroke(x, y) != v) return false;
        return ws.Stroke(b.x - 1, b.y) == 0 && ws.Stroke(b.x + 20, b.y + 19) == 0;
    }
    bool ShowsPhoto(Block b) {
        for (int y = b.y; y < b.y + 20; ++y)
            for (int x = b.x; x < b.x + 20; ++x)
                if (ws.Picture1.pixel(x, y) != ws.Picture2.pixel(x, y)) return false;
        return true;
    }
};

TEST_F(Undo, TwoUndosThenTwoRedosWalkTheChain) {
    Paint(A);
    Paint(B);
    Paint(C);
    const Picture painted = ws.Picture1;
    EXPECT_TRUE(ws.UndoEnabled);

    engine.UndoStroke();
    engine.UndoStroke();
    EXPECT_EQ(ws.StrokeNumber, 1);
    EXPECT_TRUE(Holds(A, 1) && Holds(B, -2) && Holds(C, -3));
    EXPECT_TRUE(ShowsPhoto(B) && ShowsPhoto(C) && !ShowsPhoto(A));
    EXPECT_TRUE(ws.UndoEnabled);
    EXPECT_TRUE(ws.RedoEnabled);

    engine.RedoStroke();
    EXPECT_TRUE(Holds(B, 2) && Holds(C, -3));
    EXPECT_TRUE(ws.RedoEnabled);  // -3 is still waiting
    engine.RedoStroke();
    EXPECT_TRUE(Holds(C, 3));
    EXPECT_FALSE(ws.RedoEnabled);
    EXPECT_EQ(ws.StrokeNumber, 3);
    EXPECT_EQ(ws.Picture1, painted);
}

TEST_F(Undo, ClearAllThenRedosBringStrokesBackInOrder) {
    Paint(A);
    Paint(B);
    Paint(C);
    ws.PictureModified = false;
    engine.ClearAll();
    EXPECT_TRUE(Holds(A, -1) && Holds(B, -2) && Holds(C, -3));
    EXPECT_EQ(ws.Picture1, ws.Picture2);
    EXPECT_EQ(ws.StrokeNumber, 0);
    EXPECT_FALSE(ws.UndoEnabled);
    EXPECT_TRUE(ws.RedoEnabled);
    EXPECT_FALSE(ws.PictureModified);

    engine.RedoStroke();
    EXPECT_TRUE(Holds(A, 1) && Holds(B, -2) && Holds(C, -3));
    engine.RedoStroke();
    EXPECT_TRUE(Holds(B, 2) && Holds(C, -3));
    engine.RedoStroke();
    EXPECT_TRUE(Holds(C, 3));
    EXPECT_FALSE(ws.RedoEnabled);
}

TEST_F(Undo, NewStrokeJoinsTheUndoneStrokeOfItsNumber) {
    Paint(A);
    Paint(B);
    engine.UndoStroke();
    Paint(C);  // number 2 again
    EXPECT_FALSE(ws.RedoEnabled);
    engine.UndoStroke();
    EXPECT_TRUE(Holds(B, -2) && Holds(C, -2));
    engine.RedoStroke();
    EXPECT_TRUE(Holds(A, 1) && Holds(B, 2) && Holds(C, 2));
}

TEST_F(Undo, LeftoversBetweenZeroAndTheLevelAreCleared) {
    Paint(A);
    Paint(B);
    Paint(C);
    engine.UndoStroke();
    engine.UndoStroke();
    Paint(D);  // new stroke 2
    Paint(E);  // new stroke 3
    engine.UndoStroke();
    EXPECT_TRUE(Holds(A, 1) && Holds(B, 0) && Holds(C, -3) && Holds(D, 2) && Holds(E, -3));
    EXPECT_EQ(ws.ColorPlane(B.x, B.y), 1);  // the box stays with the pixel
}

TEST_F(Undo, NothingToUndoOrClearChangesNothing) {
    const std::vector<int16_t> mask = ws.PaintMask;
    engine.UndoStroke();
    engine.ClearAll();
    EXPECT_EQ(ws.PaintMask, mask);
    EXPECT_EQ(host.toolChanges, 0);
    EXPECT_EQ(host.refreshes, 0);
}

TEST_F(Undo, UndoOverOtherPaintShowsThePhoto) {
    Paint(A);
    GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
    ws.CurrentColor = 2;
    LoadDrawColor(ws, 2);
    ws.ProtectPaint = false;
    Paint(A);
    engine.UndoStroke();
    EXPECT_TRUE(Holds(A, -2));
    EXPECT_TRUE(ShowsPhoto(A));
}

TEST_F(Undo, ErasedPaintReturnsAsAStrokeOfItsOwn) {
    Paint(A);
    Paint(B);
    engine.EraseAt(B.x + 10, B.y + 10);
    EXPECT_EQ(CountStroke(ws, -3), 49);
    EXPECT_TRUE(ws.RedoEnabled);
    engine.RedoStroke();
    EXPECT_EQ(ws.StrokeNumber, 3);
    EXPECT_EQ(CountStroke(ws, 3), 49);
    EXPECT_EQ(CountStroke(ws, 2), 400 - 49);
}

TEST_F(Undo, ErasedPixelsJoinTheNextUndoneStroke) {
    Paint(A);
    engine.EraseAt(A.x + 10, A.y + 10);  // -2
    Paint(B);                            // stroke 2
    engine.UndoStroke();
    EXPECT_EQ(CountStroke(ws, -2), 49 + 400);
    engine.RedoStroke();
    EXPECT_TRUE(Holds(B, 2));
    EXPECT_EQ(CountStroke(ws, 1), 400 - 49);
    EXPECT_EQ(CountStroke(ws, 2), 49 + 400);
}

TEST_F(Undo, ChalkLineAfterUndoKeepsRedo) {
    Paint(A);
    Paint(B);
    engine.UndoStroke();
    ws.ChalkLineMode = true;
    engine.MouseDown(kLeftButton, 250, 100);
    engine.MouseMove(kLeftButton, 260, 104);
    engine.MouseUp(kLeftButton, 260, 104);
    EXPECT_TRUE(ws.RedoEnabled);
    EXPECT_EQ(ws.StrokeNumber, 2);
    EXPECT_EQ(ws.Stroke(250, 100), 2);
    EXPECT_EQ(ws.ColorPlane(250, 100), -1);
    EXPECT_TRUE(Holds(B, -2));
}

} // namespace
