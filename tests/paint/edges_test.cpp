// The edge pass over boxes that cannot be drawn: a box without a colour or
// without a reference shows the photo, at its edges too.
#include <cstdint>
#include <tuple>

#include "paint/PaintFixture.h"

using namespace painttest;
using HSLcolor::JoinColor;

namespace {

constexpr int kLeft = 30, kTop = 20;

// Three boxes meeting, with undone paint of box 2 ('u') on the right. In
// pass order (left, right, up, down) box 1 meets 2 and 3, box 2 meets 1
// and 3, and the undone cell is blended toward box 2 though it counts as
// paint for its neighbours.
const Art kMask = {
    "........",
    ".1122...",
    ".1122u..",
    ".1133...",
    "........"};
const Art kPhoto = {
    "YRRBBYRY",
    "RYRBBRYB",
    "YRYBRBYY",
    "BYRRBYRY",
    "YBYRYRBY"};

void PaintBoxes(Workspace& ws, const Art& art) {
    for (size_t j = 0; j < art.size(); ++j)
        for (size_t i = 0; i < art[j].size(); ++i) {
            const char c = art[j][i];
            if (c == '.') continue;
            const int x = kLeft + static_cast<int>(i), y = kTop + static_cast<int>(j);
            ws.Stroke(x, y) = static_cast<int16_t>(c == 'u' ? -1 : 1);
            ws.ColorPlane(x, y) = static_cast<int16_t>(c == 'u' ? 2 : c - '0');
        }
}

// FNV-1a over every pixel: the whole picture in one number.
uint64_t Fingerprint(const Picture& p) {
    uint64_t h = 14695981039346656037ull;
    for (int i = 0; i < p.width() * p.height(); ++i) {
        h ^= static_cast<uint32_t>(p.data()[i]);
        h *= 1099511628211ull;
    }
    return h;
}

class EdgePass : public PaintTest {
protected:
    EdgePass() {
        DrawPhoto(ws, kPhoto, kLeft, kTop);
        PaintBoxes(ws, kMask);
        ws.Boxes[1] = {"", JoinColor(60, 120, 200), JoinColor(200, 180, 40)};
        ws.Boxes[2] = {"", JoinColor(240, 30, 0), Swatch('R')};
        ws.Boxes[3] = {"", JoinColor(30, 200, 90), JoinColor(150, 140, 60)};
    }
    // The work picture after the refresh command, plain or blended.
    Picture Refreshed(bool blend) {
        ws.BlendEdges = blend;
        engine.RefreshAll();
        return ws.Picture1;
    }
    // `base` with the cells marked 'p' in `art` put back to the photo.
    Picture WithPhotoAt(Picture base, const Art& art) {
        for (size_t j = 0; j < art.size(); ++j)
            for (size_t i = 0; i < art[j].size(); ++i)
                if (art[j][i] == 'p') {
                    const int x = kLeft + static_cast<int>(i), y = kTop + static_cast<int>(j);
                    base.setPixel(x, y, ws.Picture2.pixel(x, y));
                }
        return base;
    }
};

// With every box drawable the pass renders exactly what it always has.
TEST_F(EdgePass, BoxesWithColourAndReferenceRenderAsBefore) {
    const Picture plain = Refreshed(false), blended = Refreshed(true);
    EXPECT_EQ(Fingerprint(plain), 15238898894313052487u);
    EXPECT_EQ(Fingerprint(blended), 11172230786550176145u);
}

// One box made undrawable after the refresh, then one pass: the cells marked
// 'p' are the photo again, every other pixel is what the pass with all boxes
// drawable gives (the interior of the box keeps what it showed).
TEST_F(EdgePass, AnUndrawableBoxLeavesItsEdgesAsThePhoto) {
    const struct { const char* name; int box; int32_t color, reference; Art blend, plain; } rows[] = {
        {"box 2 coloured, no reference", 2, JoinColor(240, 30, 0), 0,
         {"...pp...", "..pp.p..", "..pppp..", "........", "........"},
         {"........", "...p....", "...pp...", "........", "........"}},
        {"box 3 cleared", 3, kButtonFace, 0,
         {"........", "........", "....p...", "..pp.p..", "...pp..."},
         {"........", "........", "........", "...p....", "........"}},
        {"box 1 with a reference, no colour", 1, kButtonFace, JoinColor(200, 180, 40),
         {".pp.....", "p.pp....", "p.pp....", "p.pp....", ".pp....."},
         {"........", "..p.....", "..p.....", "..p.....", "........"}}};
    for (const auto& row : rows) {
        for (const int mode : {1, 2}) {
            const Picture before = Refreshed(mode == 2);
            ColorBox& box = ws.Boxes[static_cast<size_t>(row.box)];
            const ColorBox kept = box;
            std::tie(box.color, box.reference) = std::tuple(row.color, row.reference);
            engine.RenderEdges(mode);
            EXPECT_TRUE(ws.Picture1 == WithPhotoAt(before, mode == 2 ? row.blend : row.plain)) << row.name << ", mode " << mode;
            box = kept;
        }
    }
}

// A work reopened without its scheme, or after clearing all colours: no box
// can be drawn, so the refresh shows the bare photo, blended or not.
TEST_F(EdgePass, NoDrawableBoxShowsThePhoto) {
    for (const bool cleared : {false, true}) {
        for (int i = 1; i <= 3; ++i) {
            ws.Boxes[static_cast<size_t>(i)].reference = 0;
            if (cleared) ws.Boxes[static_cast<size_t>(i)].color = kButtonFace;
        }
        for (const bool blend : {true, false}) EXPECT_TRUE(Refreshed(blend) == ws.Picture2) << "cleared " << cleared << ", blend " << blend;
    }
}

} // namespace
