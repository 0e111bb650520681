// Exporting a 400 x 300 picture as a JPEG file, beside a bare libjpeg-turbo
// compression of the same pixels into memory: what the writer adds (the
// surface, the file beside the old one flushed to disk, the times carried
// over) should stay small next to the compression itself. The file goes to
// the temporary folder (TMPDIR): on a RAM disk the run shows the writer's own
// cost, on a real disk the flush and the file system's bookkeeping as well.
#include <benchmark/benchmark.h>

#include <filesystem>
#include <turbojpeg.h>
#include <unistd.h>

#include "imaging/HSLcolor.h"
#include "imaging/JpegWriter.h"

namespace {

// A wall lit from the left with some grain, as a photo would give the codec.
const Picture& Wall() {
    static const Picture picture = [] {
        Picture p(400, 300);
        for (int y = 0; y < 300; ++y)
            for (int x = 0; x < 400; ++x)
                p.setPixel(x, y, HSLcolor::JoinColor(230 - x / 8 + (x * 7 + y * 13) % 11, 210 - x / 8 - y / 20, 140 - x / 16 + (x + y) % 5));
        return p;
    }();
    return picture;
}

// Exports over the file of the run before, as a user exporting again does.
void BM_ExportJpeg(benchmark::State& state) {
    const std::filesystem::path dir = std::filesystem::temp_directory_path() / ("export_bench_" + std::to_string(::getpid()));
    std::filesystem::create_directories(dir);
    const std::string target = (dir / "house.jpg").string();
    for (auto _ : state) benchmark::DoNotOptimize(imaging::SaveJPGpicture(Wall(), target));
    std::filesystem::remove_all(dir);
}
BENCHMARK(BM_ExportJpeg)->Unit(benchmark::kMillisecond);

// The same pixels, already blue-green-red and top-down, compressed alike.
void BM_BareTurboJpeg(benchmark::State& state) {
    std::vector<unsigned char> bgr(400 * 300 * 3);
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) {
            const HSLcolor::RGB c = HSLcolor::SplitColor(Wall().pixel(x, y));
            unsigned char* p = &bgr[static_cast<size_t>(3 * (x + 400 * y))];
            p[0] = static_cast<unsigned char>(c.blue);
            p[1] = static_cast<unsigned char>(c.green);
            p[2] = static_cast<unsigned char>(c.red);
        }
    tjhandle codec = tjInitCompress();
    for (auto _ : state) {
        unsigned char* jpeg = nullptr;
        unsigned long size = 0;
        tjCompress2(codec, bgr.data(), 400, 1200, 300, TJPF_BGR, &jpeg, &size, TJSAMP_420, 90, 0);
        benchmark::DoNotOptimize(size);
        tjFree(jpeg);
    }
    tjDestroy(codec);
}
BENCHMARK(BM_BareTurboJpeg)->Unit(benchmark::kMillisecond);

} // namespace
