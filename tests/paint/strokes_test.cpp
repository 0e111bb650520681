// The roller, the stroke counter's limit, and undo and redo.
#include <array>
#include <utility>

#include "paint/PaintFixture.h"

using namespace painttest;

namespace {

// Presses without a paint colour warn (their releases end no stroke or line,
// so they enable no Undo); drags and releases outside the picture never reach
// the arrays.
TEST_F(PaintTest, PressesThatStartNothingAndPositionsOutsideThePicture) {
    const int32_t paint = std::exchange(ws.Boxes[1].color, kButtonFace);
    ws.ChalkLineMode = true;
    engine.MouseDown(kLeftButton, 50, 50);
    engine.MouseUp(kLeftButton, 80, 60);
    ws.ChalkLineMode = false;
    Dab(50, 50);
    EXPECT_EQ(host.warnings, Art(2, "Warning - Painting Picture|No Paint color has been set yet."));
    EXPECT_EQ(std::pair(CountStroke(ws, 0), ws.UndoEnabled), std::pair(401 * 301, false));
    ws.Boxes[1].color = paint;
    ws.ExpandEdges = ws.BlendEdges = true;
    engine.MouseDown(kLeftButton, 395, 295);
    for (auto [x, y] : {std::pair{1000.0f, 1000.0f}, {-1000.0f, 5.0f}, {399.4f, 5000.0f}, {1e9f, -1e9f}})
        engine.MouseMove(kLeftButton, x, y);
    engine.MouseUp(kLeftButton, 1e9f, 1e9f);
    EXPECT_EQ(MaskArt(ws, 0, 400, 0, 1, 301), Art(301, "."));
    EXPECT_EQ(MaskArt(ws, 0, 0, 300, 401, 1), Art{std::string(401, '.')});
}

// The candidate (51, 50) beside a painted seed, with MatchColor all `match`:
// tolerance 18 for planes 0..2 and 12 for 3..5, windows clipped to 0..255;
// one plane outside its window is forgiven, two are not.
TEST_F(PaintTest, ColourTestWindows) {
    const struct { float match; std::array<int32_t, 6> planes; bool painted; } cases[] = {
        {100, {81, 100, 100, 100, 100, 100}, true}, {100, {100, 100, 100, 100, 100, 87}, true},
        {100, {81, 100, 100, 87, 100, 100}, false}, {100, {100, 100, 119, 100, 113, 100}, false},
        {10, {0, 28, 10, 10, 10, 10}, true},        {10, {29, 29, 10, 10, 10, 10}, false},
        {250, {232, 255, 250, 250, 250, 250}, true}, {250, {231, 231, 250, 250, 250, 250}, false},
        // the match colour is taken to the nearest whole number first
        {10.5f, {29, 29, 10, 10, 10, 10}, false},   {11.5f, {30, 30, 12, 12, 12, 12}, true}};
    ws.StrokeNumber = 1;
    DrawMask(ws, {"1"}, 1, 50, 50);
    for (const auto& c : cases) {
        ws.Stroke(51, 50) = 0;
        ws.MatchColor.fill(c.match);
        for (int p = 0; p < 6; ++p) ws.Plane(51, 50, p) = c.planes[static_cast<size_t>(p)];
        EXPECT_EQ(engine.PaintPixel(51, 50), c.painted) << c.match << " " << c.planes[0] << " " << c.planes[5];
    }
}

// A press lands on the nearest pixel, ties to even: a blue pixel alone in the
// wall is painted alone, as ring 1 finds nothing close to blue. On the wall the
// narrow roller's square is clipped at the corner. Each press refreshes once.
TEST_F(PaintTest, OnePressFillsTheRollerSquareOfMatchingPixels) {
    SetPhotoPixel(ws, 100, 200, Swatch('B'));
    for (auto [x, y] : {std::pair{100.5f, 200.0f}, {99.5f, 199.5f}, {100.49f, 200.5f}}) {
        ws.ClearMask();
        engine.MouseDown(kLeftButton, x, y);
        EXPECT_EQ(MaskArt(ws, 1, 99, 199, 3, 3), (Art{"...", ".1.", "..."})) << x << "," << y;
    }
    ws.WideRoller = false;
    engine.MouseDown(kLeftButton, 399, 299);
    EXPECT_EQ(std::pair(CountStroke(ws, ws.StrokeNumber), host.refreshes), std::pair(6 * 6, 4));
}

// Box 2 paint at x 190..194 and a chalk line of box 1 down column 205. A press
// on protected box 2 paint still starts a stroke, but it keeps its box and
// nothing spreads from it; a press at x = 200 stops at the chalk.
TEST_F(PaintTest, ProtectedPaintKeepsItsBoxAndChalkStopsTheRoller) {
    DrawMask(ws, Art(21, "11111"), 2, 190, 140);
    DrawMask(ws, Art(300, "#"), 1, 205, 0);
    ws.StrokeNumber = 1;
    ws.RedoEnabled = true;
    Dab(192, 150);
    EXPECT_EQ(std::tuple(ws.StrokeNumber, ws.RedoEnabled, CountStroke(ws, 2)), std::tuple(2, false, 0));
    Dab(200, 150);
    EXPECT_EQ(MaskArt(ws, 1, 188, 150, 20, 1), (Art{"11222221111111111a.."}));
    // Without protection the roller takes over box 2 paint and the chalk, and
    // so crosses where the line was.
    ws.ProtectPaint = false;
    Dab(192, 150);
    EXPECT_EQ(MaskArt(ws, 1, 188, 150, 20, 1), (Art{"11111111111111111111"}));
}

// At the largest number the 16-bit stroke plane holds, a roller press, a chalk
// line, the eraser and a redo each refuse with a message and write nothing.
TEST_F(PaintTest, StrokeNumberNeverWraps) {
    ws.StrokeNumber = Workspace::kMaxStrokeNumber - 1;
    Dab(100, 100);  // the last number is still painted
    ws.Stroke(300, 200) = -32768;  // a redo step that could never be taken
    const Workspace was = ws;
    Dab(100, 100);
    for (auto [button, chalk] : {std::pair{kLeftButton, true}, {kRightButton, false}}) {
        ws.ChalkLineMode = chalk;
        engine.MouseDown(button, 100, 100);
        engine.MouseUp(button, 104, 102);
    }
    engine.RedoStroke();
    EXPECT_EQ(host.warnings, Art(4, std::string(kPaintingTitle) + "|" + kTooManyStrokesText));
    EXPECT_EQ(std::tuple(ws.StrokeNumber, ws.PaintMask, ws.Picture1), std::tuple(32767, was.PaintMask, was.Picture1));
    EXPECT_EQ(CountStroke(ws, 32767), 41 * 41);
}

// --- Undo and redo over 7 x 7 blocks A..E of door blue and brick on the
// wall: one wide press in a block paints exactly that block, and the eraser
// at its centre clears exactly that block.
class Undo : public PaintTest {
protected:
    Undo() { for (int b = 0; b < 5; ++b) DrawPhoto(ws, Art(7, std::string(7, "BRBRB"[b])), 10 + 40 * b, 10); }
    // A..E paint a block and a..e erase it, u undoes, r redoes, c clears all.
    void Run(const std::string& script) {
        for (const char s : script) {
            if (s == 'u') engine.UndoStroke();
            else if (s == 'r') engine.RedoStroke();
            else if (s == 'c') engine.ClearAll();
            else if (s >= 'a') engine.EraseAt(13 + 40 * (s - 'a'), 13);
            else Dab(static_cast<float>(13 + 40 * (s - 'A')), 13);
        }
    }
    // The stroke value at block b's corner; a block shows paint exactly while
    // its value is positive (99 when it does not).
    int Block(int b) {
        const int x = 10 + 40 * b, v = ws.Stroke(x, 10);
        return (ws.Picture1.pixel(x, 10) != ws.Picture2.pixel(x, 10)) == (v > 0) ? v : 99;
    }
};

TEST_F(Undo, ScriptsWalkTheChain) {
    const struct { const char* script; std::array<int, 5> blocks; int level; bool undo, redo; } cases[] = {
        {"uc", {0, 0, 0, 0, 0}, 0, false, false},  // nothing to undo or clear
        {"ABCuu", {1, -2, -3, 0, 0}, 1, true, true},  {"ABCuur", {1, 2, -3, 0, 0}, 2, true, true},
        {"ABCc", {-1, -2, -3, 0, 0}, 0, false, true}, {"ABCcrrr", {1, 2, 3, 0, 0}, 3, true, false},
        // a new stroke disables Redo; its redo brings back what shares its number
        {"ABuC", {1, -2, 2, 0, 0}, 2, true, false}, {"ABuCur", {1, 2, 2, 0, 0}, 2, true, false},
        {"ABCuuDEu", {1, 0, -3, 2, -3}, 2, true, true},  // leftovers between 0 and the level go
        // erased paint waits as the next redo, or joins the next stroke undone
        {"ABb", {1, -3, 0, 0, 0}, 2, true, true},  {"ABbr", {1, 3, 0, 0, 0}, 3, true, false},
        {"AaBu", {-2, -2, 0, 0, 0}, 1, true, true}, {"AaBur", {2, 2, 0, 0, 0}, 2, true, false}};
    for (const auto& c : cases) {
        ws.ClearMask();
        ws.StrokeNumber = 0;
        ws.Picture1 = ws.Picture2;
        Run(c.script);
        std::array<int, 5> blocks{};
        for (int b = 0; b < 5; ++b) blocks[static_cast<size_t>(b)] = Block(b);
        EXPECT_EQ(std::tuple(blocks, ws.StrokeNumber, ws.UndoEnabled, ws.RedoEnabled),
                  std::tuple(c.blocks, c.level, c.undo, c.redo)) << c.script;
    }
}

} // namespace
