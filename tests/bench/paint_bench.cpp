// Speed of the painting engine on a 400 x 300 house photo with painted
// areas: one roller application, the whole-picture passes and the refresh.
#include <benchmark/benchmark.h>

#include "paint/PhotoArt.h"

namespace {

using namespace painttest;
using HSLcolor::JoinColor;

// Sky and a wall lit from the left with a dark window, with a little grain so
// that the roller meets real tolerances; boxes 1..3 paint bands of it.
struct House {
    Workspace ws;
    FakeHost host{ws};
    PaintEngine engine{ws, host};
    House() {
        uint32_t seed = 12345;
        for (int y = 0; y < 300; ++y)
            for (int x = 0; x < 400; ++x) {
                seed = seed * 1664525u + 1013904223u;
                const int g = static_cast<int>(seed >> 29), light = 60 - x / 8;
                const bool window = y >= 120 && y < 180 && x >= 60 && x < 120;
                SetPhotoPixel(ws, x, y, y < 60   ? JoinColor(110 + y + g, 160 + g, 230)
                                        : window ? JoinColor(40 + g, 50, 70)
                                                 : JoinColor(170 + light + g, 150 + light, 110 + light / 2));
            }
        ws.PictureLoaded = true;
        for (int box = 1; box <= 3; ++box) {
            ws.Boxes[static_cast<size_t>(box)] = {"", JoinColor(80 * box, 200, 120), JoinColor(180, 160, 110)};
            DrawMask(ws, Art(70, std::string(400, static_cast<char>('0' + box))), box, 0, 80 * box - 70);
        }
        ws.StrokeNumber = 3;
        engine.RefreshAll();
    }
};

House& Scene() {
    static House house;
    return house;
}

// One application, wide (1) or narrow (0), on the wall from a fresh seed.
void BM_Roller(benchmark::State& state) {
    Workspace& ws = Scene().ws;
    const std::vector<int16_t> mask = ws.PaintMask;
    ws.WideRoller = state.range(0) != 0;
    for (auto _ : state) {
        state.PauseTiming();
        ws.PaintMask = mask;
        DrawMask(ws, {"9"}, 1, 200, 270);
        for (int i = 0; i < 6; ++i) ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws.Plane(200, 270, i));
        state.ResumeTiming();
        Scene().engine.RollerAt(200, 270);
    }
    ws.PaintMask = mask;
}

void BM_RenderEdgesBlend(benchmark::State& state) { for (auto _ : state) Scene().engine.RenderEdges(2); }
void BM_RepaintColor(benchmark::State& state) { for (auto _ : state) Scene().engine.RepaintColor(1); }
void BM_RefreshAll(benchmark::State& state) { for (auto _ : state) Scene().engine.RefreshAll(); }

} // namespace

BENCHMARK(BM_Roller)->Arg(1)->Arg(0)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RenderEdgesBlend)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RepaintColor)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefreshAll)->Unit(benchmark::kMillisecond);
