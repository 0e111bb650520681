#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// 20 x 20 blocks A..E of door blue, hedge green and brick on a sunlit wall:
// one wide press in a block paints exactly that block.
class Undo : public PaintTest {
protected:
    Undo() {
        for (int b = 0; b < 5; ++b) DrawPhoto(ws, Art(20, std::string(20, "BGRBG"[b])), 10 + 40 * b, 10);
    }
    // A..E paint a block, u undoes, r redoes, c clears all.
    void Run(const std::string& script) {
        for (const char s : script) {
            if (s == 'u') engine.UndoStroke();
            else if (s == 'r') engine.RedoStroke();
            else if (s == 'c') engine.ClearAll();
            else Dab(static_cast<float>(20 + 40 * (s - 'A')), 20);
        }
    }
    // The stroke value every pixel of block b holds, or 99 when they differ;
    // a block shows paint exactly while its value is positive.
    int Block(int b) {
        const int x0 = 10 + 40 * b, v = ws.Stroke(x0, 10);
        for (int y = 9; y <= 30; ++y)
            for (int x = x0 - 1; x <= x0 + 20; ++x) {
                const bool inside = x >= x0 && x < x0 + 20 && y >= 10 && y < 30;
                if (ws.Stroke(x, y) != (inside ? v : 0)) return 99;
                if (inside && (ws.Picture1.pixel(x, y) != ws.Picture2.pixel(x, y)) != (v > 0)) return 99;
            }
        return v;
    }
};

TEST_F(Undo, ScriptsWalkTheChain) {
    const struct { const char* script; std::array<int, 5> blocks; int level; bool undo, redo; } cases[] = {
        {"uc", {0, 0, 0, 0, 0}, 0, false, false},  // nothing to undo or clear
        {"ABCuu", {1, -2, -3, 0, 0}, 1, true, true},
        {"ABCuur", {1, 2, -3, 0, 0}, 2, true, true},  // -3 is still waiting
        {"ABCuurr", {1, 2, 3, 0, 0}, 3, true, false},
        {"ABCc", {-1, -2, -3, 0, 0}, 0, false, true},
        {"ABCcr", {1, -2, -3, 0, 0}, 1, true, true},
        {"ABCcrrr", {1, 2, 3, 0, 0}, 3, true, false},
        {"ABuC", {1, -2, 2, 0, 0}, 2, true, false},  // a new stroke disables Redo
        {"ABuCu", {1, -2, -2, 0, 0}, 1, true, true},
        {"ABuCur", {1, 2, 2, 0, 0}, 2, true, false},
        {"ABCuuDEu", {1, 0, -3, 2, -3}, 2, true, true}};  // leftovers between 0 and the level go
    for (const auto& c : cases) {
        ws.ClearMask();
        ws.StrokeNumber = 0;
        ws.Picture1 = ws.Picture2;
        ws.UndoEnabled = ws.RedoEnabled = false;
        Run(c.script);
        std::array<int, 5> blocks{};
        for (int b = 0; b < 5; ++b) blocks[static_cast<size_t>(b)] = Block(b);
        EXPECT_EQ(blocks, c.blocks) << c.script;
        EXPECT_EQ(ws.StrokeNumber, c.level) << c.script;
        EXPECT_EQ(ws.UndoEnabled, c.undo) << c.script;
        EXPECT_EQ(ws.RedoEnabled, c.redo) << c.script;
    }
    EXPECT_EQ(ws.ColorPlane(50, 10), 1);  // a cleared leftover keeps its box
}

TEST_F(Undo, UndoOverOtherPaintShowsThePhoto) {
    Run("A");
    GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
    ws.CurrentColor = 2;
    LoadDrawColor(ws, 2);
    ws.ProtectPaint = false;
    Run("Au");
    EXPECT_EQ(Block(0), -2);
}

// Erased pixels take -(level + 1): the next redo brings them back as a stroke
// of their own, or they join the next stroke painted and undone.
TEST_F(Undo, ErasedPaintReturnsByRedo) {
    Run("AB");
    engine.EraseAt(60, 20);
    EXPECT_EQ(CountStroke(ws, -3), 49);
    Run("r");
    EXPECT_EQ(ws.StrokeNumber, 3);
    EXPECT_EQ(CountStroke(ws, 3), 49);
    ws.ClearMask();
    ws.StrokeNumber = 0;
    Run("A");
    engine.EraseAt(20, 20);
    Run("Bu");
    EXPECT_EQ(CountStroke(ws, -2), 49 + 400);
    Run("r");
    EXPECT_EQ(CountStroke(ws, 2), 49 + 400);
}

TEST_F(Undo, ChalkLineAfterUndoKeepsRedo) {
    Run("ABu");
    ws.ChalkLineMode = true;
    engine.MouseDown(kLeftButton, 250, 100);
    engine.MouseUp(kLeftButton, 260, 104);
    EXPECT_TRUE(ws.RedoEnabled);
    EXPECT_EQ(MaskArt(ws, 1, 250, 100, 2, 1), (Art{"aa"}));
    EXPECT_EQ(Block(1), -2);
}

} // namespace
