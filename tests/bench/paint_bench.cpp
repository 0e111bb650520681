// Speed of the painting engine on a 400 x 300 photo with painted bands: one
// roller application, the edge passes, a box repaint, undo, redo and the
// refresh command.
#include <benchmark/benchmark.h>

#include "paint/PhotoArt.h"

namespace {

using namespace painttest;

// A wall lit from the left, with a little grain so that the roller meets real
// tolerances; boxes 1..3 paint bands of it.
struct House {
    Workspace ws;
    FakeHost host{ws};
    PaintEngine engine{ws, host};
    House() {
        for (int y = 0; y < 300; ++y)
            for (int x = 0; x < 400; ++x)
                SetPhotoPixel(ws, x, y, HSLcolor::JoinColor(230 - x / 8 + (x + y) % 8, 210 - x / 8, 140 - x / 16));
        for (int box = 1; box <= 3; ++box) {
            ws.Boxes[static_cast<size_t>(box)] = {"", HSLcolor::JoinColor(80 * box, 200, 120), 0xB4A06E};
            DrawMask(ws, Art(70, std::string(400, static_cast<char>('0' + box))), box, 0, 80 * box - 70);
        }
        ws.PictureLoaded = true;
        ws.StrokeNumber = 3;
    }
};

House& Scene() { static House house; return house; }

// One application, wide (1) or narrow (0), on bare wall from a fresh seed.
void BM_Roller(benchmark::State& state) {
    Workspace& ws = Scene().ws;
    const std::vector<int16_t> mask = ws.PaintMask;
    ws.WideRoller = state.range(0) != 0;
    for (auto _ : state) {
        state.PauseTiming();
        ws.PaintMask = mask;
        DrawMask(ws, {"3"}, 1, 200, 270);
        for (int i = 0; i < 6; ++i) ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws.Plane(200, 270, i));
        state.ResumeTiming();
        Scene().engine.RollerAt(200, 270);
    }
    ws.PaintMask = mask;
}

// Mode 2 blends, mode 1 draws plain.
void BM_RenderEdges(benchmark::State& state) {
    for (auto _ : state) Scene().engine.RenderEdges(static_cast<int>(state.range(0)));
}
void BM_RepaintColor(benchmark::State& state) { for (auto _ : state) Scene().engine.RepaintColor(2); }
void BM_RefreshAll(benchmark::State& state) { for (auto _ : state) Scene().engine.RefreshAll(); }

// Undo of the last band (its redo untimed), and the redo (its undo untimed).
void BM_UndoRedo(benchmark::State& state) {
    PaintEngine& engine = Scene().engine;
    const bool timeUndo = state.range(0) != 0;
    for (auto _ : state) {
        if (!timeUndo) state.PauseTiming();
        engine.UndoStroke();
        if (!timeUndo) state.ResumeTiming(); else state.PauseTiming();
        engine.RedoStroke();
        if (timeUndo) state.ResumeTiming();
    }
}

} // namespace

BENCHMARK(BM_Roller)->Arg(1)->Arg(0)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RenderEdges)->Arg(2)->Arg(1)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RepaintColor)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_UndoRedo)->Arg(1)->Arg(0)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefreshAll)->Unit(benchmark::kMillisecond);
