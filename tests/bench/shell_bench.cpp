// The title screen redraws every 100 ms poll while no picture is open: one
// redraw must take a small part of that.
#include <benchmark/benchmark.h>

#include <QApplication>
#include <QDir>
#include <QTemporaryDir>
#include <QTimer>
#include <memory>
#include <vector>

#include "imaging/HSLcolor.h"
#include "imaging/TitleHue.h"
#include "platform/ScriptedPlatform.h"
#include "shell/TintrollaForm.h"

namespace {
QApplication& App() {
    static int argc = 1;
    static char name[] = "shell_bench";
    static char* argv[] = {name, nullptr};
    static std::unique_ptr<QApplication> app = [] {
        qputenv("QT_QPA_PLATFORM", "offscreen");
        return std::make_unique<QApplication>(argc, argv);
    }();
    return *app;
}
} // namespace

// The hue turn of the 80 x 60 background alone.
static void BM_TitleHueTurn(benchmark::State& state) {
    std::vector<int32_t> original(80 * 60);
    for (size_t i = 0; i < original.size(); ++i)
        original[i] = HSLcolor::JoinColor(150 + static_cast<int>(i % 80), 190, 230 - static_cast<int>(i / 80));
    std::vector<int32_t> shown(original.size());
    int turn = 0;
    for (auto _ : state) {
        turn = TitleHue::NextTurn(turn);
        TitleHue::TurnHues(original.data(), shown.data(), shown.size(), turn);
        benchmark::DoNotOptimize(shown.data());
    }
}
BENCHMARK(BM_TitleHueTurn)->Unit(benchmark::kMicrosecond);

// A whole redraw: hues, the stretched background, the icon and every text.
static void BM_DrawTitleScreen(benchmark::State& state) {
    App();
    QTemporaryDir dir;
    QDir(dir.path()).mkpath(QStringLiteral("PICS"));
    platform::ScriptedPlatform platform;
    TintrollaForm form(platform, dir.path());
    form.StartupTimer->stop();
    for (auto _ : state) {
        form.DrawTitleScreen();
        benchmark::DoNotOptimize(form.workspace().Picture1.data());
    }
    form.BackgroundTimer->stop();
}
BENCHMARK(BM_DrawTitleScreen)->Unit(benchmark::kMillisecond);
