// Saving a work into the PICS folder as its four files.
#include <QCoreApplication>
#include <QFileInfo>
#include <QLineEdit>
#include <QRandomGenerator>

#include "imaging/qt/BmpWriter.h"
#include "shell/TintrollaForm.h"
#include "store/MaskFile.h"
#include "store/SafeFile.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/QtPaths.h"
#include "store/qt/SaveForm.h"

namespace {
const QString kSaveTitle = QStringLiteral("Warning - Save in PICS folder");
const QString kCrLf = QStringLiteral("\r\n");

// A name that stays inside PICS: no folder separators, no control
// characters, and something left once the extension is dropped.
bool IsPlainName(const QString& name) {
    for (const QChar c : name)
        if (c == '/' || c == '\\' || c.unicode() < 0x20 || c.unicode() == 0x7F) return false;
    const QString stem = store::StripExtension(name);
    return !stem.isEmpty() && stem != QStringLiteral(".") && stem != QStringLiteral("..");
}
} // namespace

void TintrollaForm::SaveWork() {
    Workspace& ws = workspace();
    // Only a whole work is saved: not a preview, not a load half done. After
    // "About" the work is still held, under the title screen.
    const bool behindTitle = !ws.PictureLoaded && ws.PictureModified;
    if ((!ws.PictureLoaded && !behindTitle) || ws.LoadingPicture) return;

    SaveForm form(this);
    form.SaveFilename->setText(store::FileNameOf(store::StripExtension(CurrentPicturePath)));
    const bool saved = platformLayer().execDialog(form) == QDialog::Accepted;
    const QString name = saved ? form.SaveFilename->text() : QString();
    if (name.isEmpty()) return;
    if (!IsPlainName(name)) {
        Ask(kSaveTitle,
            QStringLiteral("\"%1\" can't be used as the name of a picture.").arg(name) + kCrLf +
                QStringLiteral("Type a plain name: no \"/\" or \"\\\", and not empty, \".\" or \"..\"."),
            platform::Buttons::Ok, platform::Icon::Exclamation);
        return;
    }

    const QString base = store::StripTrailingBackslash(PicsPath) + '/' + store::StripExtension(name);
    if (QFileInfo::exists(base + QStringLiteral(".bmp"))) {
        const QString question = QStringLiteral("Picture Name>> ") + store::FileNameOf(base) + QStringLiteral(".bmp") +
                                 kCrLf + kCrLf + QStringLiteral("Do you want to Overwrite it?") + kCrLf + kCrLf +
                                 QStringLiteral("Note: This will also overwrite the paint mask file and") + kCrLf +
                                 QStringLiteral("the color scheme file.");
        if (Ask(QStringLiteral("Warning - Picture Already Exists in PICS Folder"), question, platform::Buttons::YesNo) !=
            platform::Answer::Yes)
            return;
    }

    commitRename();  // a box name being typed belongs to the saved scheme
    if (behindTitle) {
        // The title screen covers the view: draw the work again from the
        // photo and the mask, save it, and leave the title screen to the poll.
        ws.PictureLoaded = true;
        engine().RefreshAll();
        ws.PictureLoaded = false;
    }
    RefreshPicture();
    QString error;
    if (!writeWorkFiles(base, error)) {
        Ask(kSaveTitle, error, platform::Buttons::Ok);
        return;
    }
    rereadFileList();
    ws.PictureModified = false;
    if (store::StripTrailingBackslash(File1->path()) == store::StripTrailingBackslash(PicsPath))
        File1->selectName(store::FileNameOf(base) + QStringLiteral(".bmp"));
}

bool TintrollaForm::writeWorkFiles(const QString& base, QString& error) {
    Workspace& ws = workspace();
    store::Bytes view;
    store::Bytes photo;
    if (!imaging::EncodeBmp24(ws.Picture1, view, error) || !imaging::EncodeBmp24(ws.Picture2, photo, error)) return false;

    const QString targets[4] = {base + QStringLiteral(".bmp"), base + QStringLiteral(".bmo"),
                                base + QStringLiteral(".msk"), base + QStringLiteral(".csc")};
    store::StagedFile staged[4];
    auto discardAll = [&staged] {
        for (store::StagedFile& s : staged) store::DiscardStaged(s);
    };
    std::string reason;
    if (!store::StageFile(store::LocalPath(targets[0]), view, staged[0], reason) ||
        !store::StageFile(store::LocalPath(targets[1]), photo, staged[1], reason) ||
        !store::StageFile(store::LocalPath(targets[2]), store::EncodePaintMask(ws.PaintMask), staged[2], reason)) {
        discardAll();
        error = QString::fromStdString(reason);
        return false;
    }

    // The scheme writer names its own file: give it a temporary name without
    // any dot, so it writes "<name>.csc", and move that into place with the rest.
    const QString schemeTemp = store::StripTrailingBackslash(PicsPath) + QStringLiteral("/~scheme-%1-%2")
                                   .arg(QCoreApplication::applicationPid())
                                   .arg(QRandomGenerator::global()->generate(), 8, 16, QLatin1Char('0'));
    const QString previousScheme = SchemeFileName;
    QString problem;
    if (!WriteColorScheme(schemeTemp, false, &problem) || !QFileInfo(schemeTemp + QStringLiteral(".csc")).isFile()) {
        discardAll();
        QFile::remove(schemeTemp + QStringLiteral(".csc"));
        SchemeFileName = previousScheme;
        error = QStringLiteral("Unable to write %1").arg(targets[3]) + (problem.isEmpty() ? QString() : kCrLf + problem);
        return false;
    }
    staged[3] = store::StagedFile{store::LocalPath(schemeTemp + QStringLiteral(".csc")), store::LocalPath(targets[3])};

    for (store::StagedFile& s : staged) {
        if (!store::CommitStaged(s, reason)) {
            discardAll();
            SchemeFileName = previousScheme;
            error = QString::fromStdString(reason);
            return false;
        }
    }
    SchemeFileName = targets[3];
    return true;
}
