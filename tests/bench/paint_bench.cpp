// Speed of the painting engine on a 400 x 300 house photo with painted
// areas: one roller application, the whole-picture passes and the refresh.
#include <benchmark/benchmark.h>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"
#include "store/Analysis.h"

namespace {

struct NullHost : PaintHost {
    void RefreshPicture() override {}
    void ToolStateChanged() override {}
    void Warning(const std::string&, const std::string&) override {}
    void PumpEvents() override {}
    void SelectColorBox(int) override {}
};

// Sky, a wall lit from the left with a dark window, and a lawn, with a little
// grain so that the roller meets real tolerances; boxes 1..3 rolled over them.
struct House {
    Workspace ws;
    NullHost host;
    PaintEngine engine{ws, host};
    House() {
        uint32_t seed = 12345;
        for (int y = 0; y < 300; ++y)
            for (int x = 0; x < 400; ++x) {
                seed = seed * 1664525u + 1013904223u;
                const int g = static_cast<int>(seed >> 29), light = 60 - x / 8;
                const bool window = y >= 120 && y < 180 && x >= 60 && x < 120;
                ws.Picture2.setPixel(x, y, y < 60 ? HSLcolor::JoinColor(110 + y + g, 160 + g, 230)
                                           : y >= 260 ? HSLcolor::JoinColor(60 + g, 140 - (y - 260), 50)
                                           : window ? HSLcolor::JoinColor(40 + g, 50, 70)
                                                    : HSLcolor::JoinColor(170 + light + g, 150 + light, 110 + light / 2));
            }
        store::AnalysePhoto(ws, [] { return true; });
        ws.Picture1 = ws.Image1 = ws.Picture2;
        ws.PictureLoaded = true;
        for (int box = 1; box <= 3; ++box) {
            ws.Boxes[static_cast<size_t>(box)].color = HSLcolor::JoinColor(80 * box, 200, 120);
            ws.CurrentColor = static_cast<int16_t>(box);
            LoadDrawColor(ws, box);
            for (int y = 30 + 60 * (box - 1); y < 90 + 60 * (box - 1); y += 30) {
                engine.MouseDown(kLeftButton, 10, static_cast<float>(y));
                for (int x = 10; x < 400; x += 30) engine.MouseMove(kLeftButton, static_cast<float>(x), static_cast<float>(y));
                engine.MouseUp(kLeftButton, 390, static_cast<float>(y));
            }
        }
    }
};

House& Scene() {
    static House house;
    return house;
}

// One application (wide or narrow) on the lawn from a fresh seed.
void BM_Roller(benchmark::State& state) {
    House& h = Scene();
    const std::vector<int16_t> mask = h.ws.PaintMask;
    h.ws.WideRoller = state.range(0) != 0;
    for (auto _ : state) {
        state.PauseTiming();
        h.ws.PaintMask = mask;
        h.ws.Stroke(200, 280) = static_cast<int16_t>(h.ws.StrokeNumber);
        h.ws.ColorPlane(200, 280) = h.ws.CurrentColor;
        for (int i = 0; i < 6; ++i) h.ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(h.ws.Plane(200, 280, i));
        state.ResumeTiming();
        h.engine.RollerAt(200, 280);
    }
    h.ws.PaintMask = mask;
}

void BM_RenderEdgesBlend(benchmark::State& state) { for (auto _ : state) Scene().engine.RenderEdges(2); }
void BM_RepaintColor(benchmark::State& state) { for (auto _ : state) Scene().engine.RepaintColor(1); }
void BM_RefreshAll(benchmark::State& state) { for (auto _ : state) Scene().engine.RefreshAll(); }

} // namespace

BENCHMARK(BM_Roller)->Arg(1)->Arg(0)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RenderEdgesBlend)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RepaintColor)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefreshAll)->Unit(benchmark::kMillisecond);
