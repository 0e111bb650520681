#include <array>

#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// 20 x 20 blocks A..E of door blue, hedge green and brick on a sunlit wall:
// one wide press in a block paints exactly that block.
class Undo : public PaintTest {
protected:
    Undo() {
        for (int b = 0; b < 5; ++b) DrawPhoto(ws, Art(20, std::string(20, "BGRBG"[b])), 10 + 40 * b, 10);
        GiveBox(2, HSLcolor::JoinColor(200, 30, 90), HSLcolor::JoinColor(200, 180, 40));
    }
    // A..E paint a block, u undoes, r redoes, c clears all, L draws a chalk
    // line, P turns protection off and goes on with box 2.
    void Run(const std::string& script) {
        for (const char s : script) {
            ws.ChalkLineMode = s == 'L';
            if (s == 'u') engine.UndoStroke();
            else if (s == 'r') engine.RedoStroke();
            else if (s == 'c') engine.ClearAll();
            else if (s == 'P') { host.SelectColorBox(2); ws.ProtectPaint = false; }
            else if (s == 'L') { engine.MouseDown(kLeftButton, 250, 100); engine.MouseUp(kLeftButton, 260, 104); }
            else Dab(static_cast<float>(20 + 40 * (s - 'A')), 20);
        }
    }
    // The stroke value all pixels of block b hold (99 when they differ); a
    // block shows paint exactly while its value is positive.
    int Block(int b) {
        const int x0 = 10 + 40 * b, v = ws.Stroke(x0, 10);
        for (int y = 10; y < 30; ++y)
            for (int x = x0; x < x0 + 20; ++x)
                if (ws.Stroke(x, y) != v || (ws.Picture1.pixel(x, y) != ws.Picture2.pixel(x, y)) != (v > 0)) return 99;
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
        {"ABuL", {1, -2, 0, 0, 0}, 2, true, true},   // a chalk line does not
        {"ABuCu", {1, -2, -2, 0, 0}, 1, true, true},
        {"ABuCur", {1, 2, 2, 0, 0}, 2, true, false},
        {"ABCuuDEu", {1, 0, -3, 2, -3}, 2, true, true},  // leftovers between 0 and the level go
        {"APAu", {-2, 0, 0, 0, 0}, 1, true, true}};       // the older paint under it does not return
    for (const auto& c : cases) {
        ws.ClearMask();
        ws.StrokeNumber = 0;
        ws.Picture1 = ws.Picture2;
        ws.UndoEnabled = ws.RedoEnabled = false;
        Run(c.script);
        std::array<int, 5> blocks{};
        for (int b = 0; b < 5; ++b) blocks[static_cast<size_t>(b)] = Block(b);
        EXPECT_EQ(blocks, c.blocks) << c.script;
        EXPECT_EQ(std::tuple(ws.StrokeNumber, ws.UndoEnabled, ws.RedoEnabled), std::tuple(c.level, c.undo, c.redo))
            << c.script;
    }
}

// Erased pixels take -(level + 1): the next redo brings them back as a stroke
// of their own, or they join the next stroke painted and undone.
TEST_F(Undo, ErasedPaintReturnsByRedo) {
    Run("AB");
    engine.EraseAt(60, 20);
    EXPECT_EQ(CountStroke(ws, -3), 49);
    Run("r");
    EXPECT_EQ(std::pair(ws.StrokeNumber, CountStroke(ws, 3)), std::pair(3, 49));
    ws.ClearMask();
    ws.StrokeNumber = 0;
    Run("A");
    engine.EraseAt(20, 20);
    Run("Bu");
    EXPECT_EQ(CountStroke(ws, -2), 49 + 400);
    Run("r");
    EXPECT_EQ(CountStroke(ws, 2), 49 + 400);
}

} // namespace
