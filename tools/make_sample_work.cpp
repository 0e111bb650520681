// Paints the sample work that new users find in PICS: opens the sample house
// photo in a hidden main window, gives five renamed colour boxes their paint,
// rolls them onto walls, roof, door, trim and base, and saves the four files
// through the program's own save.
//
// Build and run (from the repository root, after a build into build/):
//   cmake --build build --target make_sample_work
//   QT_QPA_PLATFORM=offscreen build/make_sample_work pics
#include <QApplication>
#include <QDialog>
#include <QDir>
#include <QFile>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTimer>
#include <cstdio>
#include <vector>

#include "imaging/HSLcolor.h"
#include "platform/ScriptedPlatform.h"
#include "paint/Tools.h"
#include "scheme/ColorScheme.h"
#include "shell/TintrollaForm.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/SaveForm.h"

namespace {

using Path = std::vector<std::pair<int, int>>;

struct Area {
    const char* name;
    int r, g, b;
    void (*kind)(Workspace&);
    std::vector<Path> strokes;
};

// A stroke along a path of points, one roller application every few pixels.
void Roll(TintrollaForm& form, const Path& path) {
    PaintEngine& engine = form.engine();
    engine.MouseDown(kLeftButton, float(path.front().first), float(path.front().second));
    for (size_t i = 1; i < path.size(); ++i) {
        const auto [x0, y0] = path[i - 1];
        const auto [x1, y1] = path[i];
        const int steps = std::max(std::abs(x1 - x0), std::abs(y1 - y0)) / 6 + 1;
        for (int s = 1; s <= steps; ++s)
            engine.MouseMove(kLeftButton, float(x0 + (x1 - x0) * s / steps), float(y0 + (y1 - y0) * s / steps));
    }
    engine.MouseUp(kLeftButton, float(path.back().first), float(path.back().second));
}

Path Rows(int left, int right, int top, int bottom, int step) {
    Path path;
    bool forward = true;
    for (int y = top; y <= bottom; y += step) {
        path.emplace_back(forward ? left : right, y);
        path.emplace_back(forward ? right : left, y);
        forward = !forward;
    }
    return path;
}

} // namespace

int main(int argc, char** argv) {
    QApplication app(argc, argv);
    if (argc < 2) {
        std::fprintf(stderr, "usage: make_sample_work <pics folder>\n");
        return 2;
    }
    const QString pics = QDir(QString::fromLocal8Bit(argv[1])).absolutePath();
    QTemporaryDir program;
    QDir(program.path()).mkpath(QStringLiteral("PICS"));
    const QString photo = QStringLiteral("Sample House.jpg");
    if (!QFile::copy(pics + '/' + photo, program.path() + QStringLiteral("/PICS/") + photo)) {
        std::fprintf(stderr, "no %s in %s\n", qPrintable(photo), qPrintable(pics));
        return 1;
    }

    platform::ScriptedPlatform platform;
    TintrollaForm form(platform, program.path());
    form.StartupTimer_Timer();
    form.BackgroundTimer->stop();
    form.File1->selectName(photo);
    form.File1_Click();
    for (int i = 0; i < 1000 && !form.workspace().PictureLoaded; ++i) form.BackgroundTimer_Timer();
    Workspace& ws = form.workspace();
    if (!ws.PictureLoaded) {
        std::fprintf(stderr, "the sample photo did not open\n");
        return 1;
    }

    // Trim, door and roof first: with painted areas protected, the walls
    // then stop at them.
    const std::vector<Area> areas = {
        {"Walls", 163, 177, 138, SelectNormalPaint, {Rows(55, 345, 122, 228, 8)}},
        {"Roof", 72, 84, 102, SelectNormalPaint,
         {{{200, 62}, {170, 78}, {230, 78}, {140, 92}, {260, 92}, {90, 104}, {310, 104}, {55, 108}, {345, 108}}}},
        {"Front Door", 140, 32, 38, SelectWetPaint, {Rows(185, 215, 166, 244, 5)}},
        {"Trim", 240, 234, 214, SelectNormalPaint,
         {{{76, 138}, {135, 138}, {135, 205}, {76, 205}, {76, 138}},
          {{266, 138}, {325, 138}, {325, 205}, {266, 205}, {266, 138}},
          {{176, 160}, {224, 160}, {224, 248}, {176, 248}, {176, 160}},
          {{100, 113}, {300, 113}, {360, 113}, {40, 113}}}},
        {"Base", 74, 72, 70, SelectWetPaint, {{{60, 238}, {170, 238}}, {{340, 238}, {230, 238}}}},
    };
    for (int box : {4, 3, 2, 5, 1}) {
        const Area& area = areas[static_cast<size_t>(box - 1)];
        ws.Boxes[box].name = area.name;
        SetNewColor(ws, HSLcolor::JoinColor(area.r, area.g, area.b), box);
        form.SelectColorBox(box);
        area.kind(ws);
        for (const Path& path : area.strokes) Roll(form, path);
    }
    SelectNormalPaint(ws);
    form.SelectColorBox(1);

    platform.dialogs.push_back([](QDialog& dialog) {
        auto& save = static_cast<SaveForm&>(dialog);
        save.SaveFilename->setText(QStringLiteral("Sample House - Painted"));
        save.SaveButton_Click();
        return int(QDialog::Accepted);
    });
    form.SaveWork();
    if (ws.PictureModified) {
        std::fprintf(stderr, "the save did not complete\n");
        return 1;
    }
    for (const char* ext : {".bmp", ".bmo", ".msk", ".csc"}) {
        const QString name = QStringLiteral("Sample House - Painted") + QLatin1String(ext);
        QFile::remove(pics + '/' + name);
        if (!QFile::copy(program.path() + QStringLiteral("/PICS/") + name, pics + '/' + name)) return 1;
    }
    std::printf("painted %d strokes; saved into %s\n", ws.StrokeNumber, qPrintable(pics));
    return 0;
}
