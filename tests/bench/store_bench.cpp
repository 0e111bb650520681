// Opening a large camera photo: decoding at reduced scale, fitting and
// analysing, beside decoding the same photo at full size.
#include <benchmark/benchmark.h>

#include <QCoreApplication>
#include <QTemporaryDir>

#include "store/Analysis.h"
#include "store/qt/FitPicture.h"

// A 6000 x 4000 JPEG with some structure, made once per run.
static QString LargeJpeg() {
    static int argc = 1;
    static char* argv[] = {const_cast<char*>("store_bench"), nullptr};
    if (!QCoreApplication::instance()) static QCoreApplication app(argc, argv);   // finds the image plugins
    static QTemporaryDir dir;
    static const QString path = [] {
        QImage image(6000, 4000, QImage::Format_RGB32);
        for (int y = 0; y < 4000; ++y)
            for (int x = 0; x < 6000; ++x) image.setPixel(x, y, qRgb(x / 24 % 256, 120 + y / 40, (x / 150 % 2) * 90 + y / 50));
        return image.save(dir.path() + "/large.jpg", "JPEG", 90) ? dir.path() + "/large.jpg" : QString();
    }();
    return path;
}

static void BM_OpenLargeJpeg(benchmark::State& state) {
    static Workspace ws;
    for (auto _ : state) {
        ws.Picture2 = store::FitPicture(imaging::DecodePictureFile(LargeJpeg()), false);
        store::AnalysePhoto(ws, nullptr);
    }
}
BENCHMARK(BM_OpenLargeJpeg)->Unit(benchmark::kMillisecond);

// Decoding alone: at the reduced scale the open uses (1), and at full size (0),
// as a plain reader would.
static void BM_DecodeLargeJpeg(benchmark::State& state) {
    const QSize reduceFor = state.range(0) ? QSize(400, 300) : QSize();
    for (auto _ : state) benchmark::DoNotOptimize(imaging::DecodePictureFile(LargeJpeg(), reduceFor));
}
BENCHMARK(BM_DecodeLargeJpeg)->Arg(1)->Arg(0)->Unit(benchmark::kMillisecond);
