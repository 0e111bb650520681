#include <gtest/gtest.h>

#include <set>

#include "paint/PaintFixture.h"

using namespace painttest;
using Art = std::vector<std::string>;

namespace {

// --- Edge expansion ------------------------------------------------------------

struct GrowCase {
    const char* name;
    int left, top;          // where the art lies
    Art before;             // stroke 2 is the current stroke; 1 an earlier one; 'a' undone
    int boxLeft, boxTop, boxRight, boxBottom;
    Art after;
};

class Expand : public PaintTest, public ::testing::WithParamInterface<GrowCase> {};

TEST_P(Expand, GrowsExactlyOnePixelInsideTheBorder) {
    const GrowCase c = GetParam();
    DrawMask(ws, c.before, 1, c.left, c.top);
    ws.StrokeNumber = 2;
    ws.StrokeLeft = static_cast<int16_t>(c.boxLeft);
    ws.StrokeTop = static_cast<int16_t>(c.boxTop);
    ws.StrokeRight = static_cast<int16_t>(c.boxRight);
    ws.StrokeBottom = static_cast<int16_t>(c.boxBottom);
    const int width = static_cast<int>(c.before[0].size()), height = static_cast<int>(c.before.size());
    engine.ExpandEdges();
    EXPECT_EQ(StrokeArt(ws, c.left, c.top, width, height), c.after);
    for (int y = c.top; y < c.top + height; ++y)
        for (int x = c.left; x < c.left + width; ++x)
            if (ws.Stroke(x, y) == 2) {
                EXPECT_EQ(ws.ColorPlane(x, y), 1) << x << "," << y;
            }
    EXPECT_EQ(host.refreshes, 1);
}

INSTANTIATE_TEST_SUITE_P(
    Borders, Expand,
    ::testing::Values(
        GrowCase{"TopLeftCorner", 0, 0,
                 {"22....",
                  "22a...",
                  "21....",
                  "......"},
                 0, 0, 1, 2,
                 {"22....",
                  "222...",
                  "21....",
                  "......"}},
        GrowCase{"BottomRightCorner", 395, 295,
                 {".....",
                  ".....",
                  ".....",
                  "...22",
                  "...22"},
                 398, 298, 399, 299,
                 {".....",
                  ".....",
                  "...2.",
                  "..222",
                  "...22"}},
        GrowCase{"NoDiagonalsNoSecondRing", 47, 47,
                 {".......",
                  ".......",
                  ".......",
                  "...2...",
                  ".......",
                  ".......",
                  "......."},
                 50, 50, 50, 50,
                 {".......",
                  ".......",
                  "...2...",
                  "..222..",
                  "...2...",
                  ".......",
                  "......."}}),
    [](const auto& info) { return std::string(info.param.name); });

// --- Eraser --------------------------------------------------------------------

struct EraseCase {
    int x, y;
    int x1, y1, x2, y2;  // the square that must be erased
};

class Eraser : public PaintTest, public ::testing::WithParamInterface<EraseCase> {};

TEST_P(Eraser, ClearsASevenSquareClippedToThePicture) {
    const EraseCase c = GetParam();
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) DrawMask(ws, {"1"}, 1, x, y);
    ws.StrokeNumber = 1;
    engine.RepaintColor(1);
    const int32_t paint = ws.Picture1.pixel(200, 150);

    engine.EraseAt(c.x, c.y);
    EXPECT_EQ(CountStroke(ws, -2), (c.x2 - c.x1 + 1) * (c.y2 - c.y1 + 1));
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) {
            const bool inside = x >= c.x1 && x <= c.x2 && y >= c.y1 && y <= c.y2;
            ASSERT_EQ(ws.Stroke(x, y), inside ? -2 : 1) << x << "," << y;
            ASSERT_EQ(ws.Picture1.pixel(x, y), inside ? Swatch('Y') : paint) << x << "," << y;
            ASSERT_EQ(ws.ColorPlane(x, y), 1);
        }
    EXPECT_TRUE(ws.RedoEnabled);
    EXPECT_TRUE(ws.PictureModified);
}

INSTANTIATE_TEST_SUITE_P(Places, Eraser,
                         ::testing::Values(EraseCase{1, 1, 0, 0, 4, 4}, EraseCase{399, 299, 396, 296, 399, 299},
                                           EraseCase{200, 150, 197, 147, 203, 153}, EraseCase{-3, 100, 0, 97, 0, 103}));

TEST_F(PaintTest, ErasingUnpaintedPixelsOnlyRestoresThePhoto) {
    ws.Picture1.setPixel(20, 20, 0x123456);  // a blend tint, say
    engine.EraseAt(21, 22);
    EXPECT_EQ(ws.Picture1.pixel(20, 20), Swatch('Y'));
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);
    EXPECT_FALSE(ws.RedoEnabled);
}

// --- Chalk line ----------------------------------------------------------------

using Points = std::set<std::pair<int, int>>;

struct LineCase {
    int x0, y0, x1, y1;
    Points points;
};

class ChalkLine : public PaintTest, public ::testing::WithParamInterface<LineCase> {};

TEST_P(ChalkLine, StoresOnePixelPerRowOrColumn) {
    const LineCase c = GetParam();
    ws.StrokeNumber = 4;
    ws.ChalkStartX = static_cast<int16_t>(c.x0);
    ws.ChalkStartY = static_cast<int16_t>(c.y0);
    ws.ChalkEndX = static_cast<int16_t>(c.x1);
    ws.ChalkEndY = static_cast<int16_t>(c.y1);
    engine.DrawChalkLine(false, true);
    Points stored;
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x)
            if (ws.Stroke(x, y) != 0) {
                stored.insert({x, y});
                EXPECT_EQ(ws.Stroke(x, y), 4);
                EXPECT_EQ(ws.ColorPlane(x, y), -1);
            }
    EXPECT_EQ(stored, c.points);
}

INSTANTIATE_TEST_SUITE_P(
    Lines, ChalkLine,
    ::testing::Values(
        // y = whole(x / 2): whole(0.5) = 0 and whole(1.5) = 2
        LineCase{0, 0, 4, 2, {{0, 0}, {1, 0}, {2, 1}, {3, 2}, {4, 2}}},
        LineCase{4, 2, 0, 0, {{4, 2}, {3, 2}, {2, 1}, {1, 0}, {0, 0}}},
        LineCase{10, 10, 12, 15, {{10, 10}, {10, 11}, {11, 12}, {11, 13}, {12, 14}, {12, 15}}},
        LineCase{10, 10, 10, 10, {}},
        // points outside are clamped to the picture first
        LineCase{-5, 310, 2, 299, {{0, 299}, {1, 299}, {2, 299}}}));

TEST_F(PaintTest, ChalkDragShowsARubberBandAndReleaseStoresTheLine) {
    ws.ChalkLineMode = true;
    const Picture photo = ws.Picture1;
    engine.MouseDown(kLeftButton, 100, 100);
    engine.MouseMove(kLeftButton, 104, 102);
    const Points band{{100, 100}, {101, 100}, {102, 101}, {103, 102}, {104, 102}};
    for (int y = 98; y < 110; ++y)
        for (int x = 98; x < 110; ++x) {
            const int32_t expected = band.count({x, y}) ? (~Swatch('Y') & 0xFFFFFF) : Swatch('Y');
            ASSERT_EQ(ws.Picture1.pixel(x, y), expected) << x << "," << y;
        }
    EXPECT_EQ(CountStroke(ws, 0), 401 * 301);  // the band is not paint

    engine.MouseMove(kLeftButton, 100, 103);  // the old band goes, a new one comes
    EXPECT_EQ(ws.Picture1.pixel(104, 102), Swatch('Y'));
    EXPECT_EQ(ws.Picture1.pixel(100, 103), ~Swatch('Y') & 0xFFFFFF);

    engine.MouseUp(kLeftButton, 100, 103);
    EXPECT_EQ(StrokeArt(ws, 99, 99, 3, 6), (Art{"...", ".1.", ".1.", ".1.", ".1.", "..."}));
    EXPECT_EQ(ws.ChalkStartX, -1);
    EXPECT_TRUE(ws.UndoEnabled);
    EXPECT_NE(ws.Picture1.pixel(100, 102), ~Swatch('Y') & 0xFFFFFF);
    EXPECT_NE(ws.Picture1.pixel(100, 102), Swatch('Y'));
    engine.UndoStroke();
    EXPECT_EQ(ws.Picture1, photo);
}

} // namespace
