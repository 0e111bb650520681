// The title screen redraws on every 100 ms poll while no picture is open:
// one redraw (hues, stretched background, icon, texts) must take a small part of that.
#include <benchmark/benchmark.h>

#include <QApplication>
#include <QTemporaryDir>
#include <QTimer>

#include "platform/ScriptedPlatform.h"
#include "shell/TintrollaForm.h"

static void BM_DrawTitleScreen(benchmark::State& state) {
    static int argc = 1;
    static char* argv[] = {const_cast<char*>("shell_bench"), nullptr};
    qputenv("QT_QPA_PLATFORM", "offscreen");
    static QApplication app(argc, argv);
    QTemporaryDir dir;
    platform::ScriptedPlatform platform;
    TintrollaForm form(platform, dir.path());
    form.StartupTimer->stop();
    for (auto _ : state) {
        form.DrawTitleScreen();
        benchmark::DoNotOptimize(form.workspace().Picture1.data());
    }
}
BENCHMARK(BM_DrawTitleScreen)->Unit(benchmark::kMillisecond);
