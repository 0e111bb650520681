#include <QApplication>
#include <QDir>
#include <cstdio>
#include <cstdlib>

#include "platform/QtPlatform.h"
#include "shell/TintrollaForm.h"

namespace {
bool HaveDisplay() {
    auto set = [](const char* name) {
        const char* v = std::getenv(name);
        return v && *v;
    };
    return set("DISPLAY") || set("WAYLAND_DISPLAY") || set("QT_QPA_PLATFORM");
}
} // namespace

int main(int argc, char** argv) {
    if (!HaveDisplay()) {
        std::fprintf(stderr,
                     "Tint-Rolla needs a desktop to show its window, and no display was found.\n"
                     "Start it from a desktop session (DISPLAY or WAYLAND_DISPLAY set).\n");
        return 2;
    }
    QApplication app(argc, argv);
    QApplication::setApplicationName(QStringLiteral("Tint-Rolla"));
    platform::QtPlatform platform;
    TintrollaForm form(platform, QDir(QCoreApplication::applicationDirPath()).absolutePath());
    form.show();
    return QApplication::exec();
}
