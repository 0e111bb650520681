// Opening a large camera photo: the whole open at reduced scale against a
// plain full-size decode of the same JPEG.
#include <benchmark/benchmark.h>

#include <QCoreApplication>
#include <QFile>
#include <QImage>
#include <QImageReader>
#include <QPainter>
#include <QTemporaryDir>
#include <memory>

#include "imaging/qt/PictureDecoder.h"
#include "paint/Workspace.h"
#include "store/Analysis.h"
#include "store/qt/FitPicture.h"

namespace {

// Image plugins are found through the application object.
void EnsureApplication() {
    static int argc = 1;
    static char name[] = "store_bench";
    static char* argv[] = {name, nullptr};
    if (!QCoreApplication::instance()) static QCoreApplication app(argc, argv);
}

// A 6000 x 4000 JPEG with some structure, made once per run.
const QString& LargeJpeg() {
    static std::unique_ptr<QTemporaryDir> dir;
    static QString path;
    if (path.isEmpty()) {
        EnsureApplication();
        dir = std::make_unique<QTemporaryDir>();
        path = dir->path() + QStringLiteral("/large.jpg");
        QImage image(6000, 4000, QImage::Format_RGB32);
        QPainter p(&image);
        QLinearGradient sky(0, 0, 0, 4000);
        sky.setColorAt(0, QColor(120, 170, 230));
        sky.setColorAt(1, QColor(210, 200, 180));
        p.fillRect(image.rect(), sky);
        for (int i = 0; i < 40; ++i)
            p.fillRect(150 * i, 1500 + (i % 7) * 60, 120, 2000, QColor(40 + i * 5, 90, 200 - i * 4));
        p.end();
        image.save(path, "JPEG", 90);
    }
    return path;
}

void BM_OpenLargeJpeg(benchmark::State& state) {
    const QString& path = LargeJpeg();
    auto ws = std::make_unique<Workspace>();
    for (auto _ : state) {
        const imaging::DecodedPicture photo = imaging::DecodePictureFile(path);
        if (!photo.ok()) state.SkipWithError("decode failed");
        ws->Picture2 = store::FitPicture(photo, false);
        store::AnalysePhoto(*ws, [] { return true; });
        benchmark::DoNotOptimize(ws->PixelPlanes.data());
    }
}
BENCHMARK(BM_OpenLargeJpeg)->Unit(benchmark::kMillisecond);

void BM_DecodeLargeJpegFullSize(benchmark::State& state) {
    const QString& path = LargeJpeg();
    for (auto _ : state) {
        QImageReader reader(path);
        reader.setAutoTransform(true);
        QImage image = reader.read();
        if (image.isNull()) state.SkipWithError("decode failed");
        benchmark::DoNotOptimize(image.constBits());
    }
}
BENCHMARK(BM_DecodeLargeJpegFullSize)->Unit(benchmark::kMillisecond);

void BM_AnalysePhoto(benchmark::State& state) {
    auto ws = std::make_unique<Workspace>();
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) ws->Picture2.setPixel(x, y, (x * 3 % 256) + 256 * (y % 256) + 65536 * ((x + y) % 256));
    for (auto _ : state) store::AnalysePhoto(*ws, [] { return true; });
}
BENCHMARK(BM_AnalysePhoto)->Unit(benchmark::kMillisecond);

} // namespace
