// Speed of the painting engine on a 400 x 300 synthetic house photo with
// several painted areas: roller applications, the whole-picture passes,
// undo and redo, and the refresh command.
#include <benchmark/benchmark.h>

#include <cstdint>
#include <memory>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"
#include "paint/Workspace.h"
#include "store/Analysis.h"

namespace {

class NullHost : public PaintHost {
public:
    void RefreshPicture() override {}
    void ToolStateChanged() override {}
    void Warning(const std::string&, const std::string&) override {}
    void PumpEvents() override {}
    void SelectColorBox(int) override {}
};

// Sky, roof, a side-lit wall with two windows and a door, and a lawn, with a
// little grain so that the roller meets real tolerances.
int32_t HousePixel(int x, int y, uint32_t& seed) {
    seed = seed * 1664525u + 1013904223u;
    const int grain = static_cast<int>((seed >> 24) % 9) - 4;
    auto clamp = [](int v) { return v < 0 ? 0 : (v > 255 ? 255 : v); };
    auto rgb = [&](int r, int g, int b) {
        return HSLcolor::JoinColor(clamp(r + grain), clamp(g + grain), clamp(b + grain));
    };
    const bool window = y >= 120 && y < 180 && ((x >= 60 && x < 120) || (x >= 260 && x < 320));
    const bool frame = y >= 115 && y < 185 && ((x >= 55 && x < 125) || (x >= 255 && x < 325));
    if (y < 60) return rgb(110 + y, 160 + y / 2, 230);
    if (y < 90) return rgb(150, 50 + (x % 20 == 0 ? 30 : 0), 40);
    if (y < 260) {
        if (window) return rgb(40, 50, 70);
        if (frame) return rgb(235, 235, 225);
        if (x >= 170 && x < 220 && y >= 150) return rgb(110, 60, 30);
        const int light = 60 - x / 8;  // lit from the left
        return rgb(170 + light, 150 + light, 110 + light / 2);
    }
    return rgb(60, 140 - (y - 260), 50);
}

struct Painted {
    std::unique_ptr<Workspace> ws = std::make_unique<Workspace>();
    NullHost host;
    PaintEngine engine{*ws, host};

    Painted() {
        uint32_t seed = 12345;
        for (int y = 0; y < Workspace::kHeight; ++y)
            for (int x = 0; x < Workspace::kWidth; ++x) ws->Picture2.setPixel(x, y, HousePixel(x, y, seed));
        store::AnalysePhoto(*ws, [] { return true; });
        ws->Picture1 = ws->Picture2;
        ws->Image1 = ws->Picture2;
        ws->PictureLoaded = true;
        ws->BlendEdges = false;
        const int32_t colors[] = {HSLcolor::JoinColor(230, 200, 120), HSLcolor::JoinColor(40, 90, 160),
                                  HSLcolor::JoinColor(120, 30, 30), HSLcolor::JoinColor(250, 250, 245)};
        for (int i = 1; i <= 4; ++i) ws->Boxes[static_cast<size_t>(i)].color = colors[i - 1];
        // Wall, door, roof and frames, each rolled over in rows of strokes.
        Roll(1, 10, 95, 390, 255, 30);
        Roll(2, 175, 155, 215, 255, 15);
        Roll(3, 5, 65, 395, 85, 20);
        Roll(4, 57, 117, 123, 183, 6);
        ws->BlendEdges = true;
        engine.RefreshAll();
    }

    void Roll(int box, int x0, int y0, int x1, int y1, int step) {
        ws->CurrentColor = static_cast<int16_t>(box);
        LoadDrawColor(*ws, box);
        for (int y = y0; y <= y1; y += step) {
            engine.MouseDown(kLeftButton, static_cast<float>(x0), static_cast<float>(y));
            for (int x = x0; x <= x1; x += step) engine.MouseMove(kLeftButton, static_cast<float>(x), static_cast<float>(y));
            engine.MouseUp(kLeftButton, static_cast<float>(x1), static_cast<float>(y));
        }
        ws->CurrentColor = 1;
        LoadDrawColor(*ws, 1);
    }
};

Painted& Scene() {
    static Painted scene;
    return scene;
}

// A fresh wide or narrow application on unpainted lawn next to a seed.
void RollerFresh(benchmark::State& state, bool wide) {
    Painted& s = Scene();
    Workspace& ws = *s.ws;
    const std::vector<int16_t> mask = ws.PaintMask;
    ws.WideRoller = wide;
    ws.CurrentColor = 1;
    int painted = 0;
    for (auto _ : state) {
        state.PauseTiming();
        ws.PaintMask = mask;
        ws.Stroke(200, 280) = static_cast<int16_t>(ws.StrokeNumber);
        ws.ColorPlane(200, 280) = 1;
        for (int i = 0; i < 6; ++i) ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws.Plane(200, 280, i));
        state.ResumeTiming();
        s.engine.RollerAt(200, 280);
    }
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) painted += ws.Stroke(x, y) != mask[static_cast<size_t>(x + 401 * y)];
    state.counters["painted"] = painted;
    ws.PaintMask = mask;
    ws.WideRoller = true;
}
void BM_RollerWideFresh(benchmark::State& state) { RollerFresh(state, true); }
void BM_RollerNarrowFresh(benchmark::State& state) { RollerFresh(state, false); }

// Protection off over painted wall: every one of the 1,760 tests repaints.
void BM_RollerWideRepaint(benchmark::State& state) {
    Painted& s = Scene();
    Workspace& ws = *s.ws;
    const std::vector<int16_t> mask = ws.PaintMask;
    const Picture picture = ws.Picture1;
    ws.ProtectPaint = false;
    for (int i = 0; i < 6; ++i) ws.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws.Plane(300, 220, i));
    for (auto _ : state) s.engine.RollerAt(300, 220);
    ws.ProtectPaint = true;
    ws.PaintMask = mask;
    ws.Picture1 = picture;
}

void BM_RenderEdgesBlend(benchmark::State& state) {
    for (auto _ : state) Scene().engine.RenderEdges(2);
}

void BM_RenderEdgesPlain(benchmark::State& state) {
    for (auto _ : state) Scene().engine.RenderEdges(1);
}

void BM_RepaintColor(benchmark::State& state) {
    for (auto _ : state) Scene().engine.RepaintColor(1);
}

// Undo and redo of the last stroke, alternately; `blend` adds the edge
// passes that run around them when Blend Edges is ticked.
void UndoRedo(benchmark::State& state, bool undo) {
    Painted& s = Scene();
    s.ws->BlendEdges = state.range(0) != 0;
    for (auto _ : state) {
        if (undo) {
            s.engine.UndoStroke();
            state.PauseTiming();
            s.engine.RedoStroke();
            state.ResumeTiming();
        } else {
            state.PauseTiming();
            s.engine.UndoStroke();
            state.ResumeTiming();
            s.engine.RedoStroke();
        }
    }
    s.ws->BlendEdges = true;
}
void BM_Undo(benchmark::State& state) { UndoRedo(state, true); }
void BM_Redo(benchmark::State& state) { UndoRedo(state, false); }

void BM_RefreshCommand(benchmark::State& state) {
    for (auto _ : state) Scene().engine.RefreshAll();
    int painted = 0;
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) painted += Scene().ws->Stroke(x, y) > 0;
    state.counters["painted%"] = painted / 1200.0;
}

} // namespace

BENCHMARK(BM_RollerWideFresh)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RollerNarrowFresh)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RollerWideRepaint)->Unit(benchmark::kMicrosecond);
BENCHMARK(BM_RenderEdgesBlend)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RenderEdgesPlain)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RepaintColor)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Undo)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_Redo)->Arg(0)->Arg(1)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RefreshCommand)->Unit(benchmark::kMillisecond);
