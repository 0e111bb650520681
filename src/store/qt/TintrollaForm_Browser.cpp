// The picture browser: drive, folder and file lists, the PICS and desktop
// shortcuts, and deleting a picture with its companion files.
#include <QDir>
#include <QFile>
#include <QStandardPaths>

#include "paint/Tools.h"
#include "shell/TintrollaForm.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/QtPaths.h"

namespace {
const QString kPattern = QStringLiteral("*.jpg;*.gif;*.bmp");
const QString kCrLf = QStringLiteral("\r\n");
} // namespace

void TintrollaForm::buildBrowser() {
    connect(Drive1, &DriveListBox::driveChosen, this, &TintrollaForm::Drive1_Change);
    connect(Dir1, &FolderListBox::pathChanged, this, &TintrollaForm::Dir1_Change);
    connect(File1, &FileListBox::fileClicked, this, &TintrollaForm::File1_Click);
    File1->setPattern(kPattern);
    Drive1->setAlwaysListed(ProgramFolder);
}

void TintrollaForm::SetFileListPattern() { File1->setPattern(kPattern); }

bool TintrollaForm::showFolder(const QString& folder) {
    if (folder.isEmpty() || !QDir(folder).exists()) return false;
    Drive1->setDriveOf(folder);
    // A highlighted entry is opened first, as the folder list does on its own.
    const QString highlighted = Dir1->highlightedPath();
    if (!highlighted.isEmpty()) Dir1->setPath(highlighted);
    if (!Dir1->setPath(folder)) return false;
    File1->setEnabled(true);
    return true;
}

void TintrollaForm::ShowPicsFolder() {
    PicsPath = store::StripTrailingBackslash(ProgramFolder) + QStringLiteral("/PICS");
    // A missing PICS folder is made where it can be: saving needs it.
    if (!QDir(PicsPath).exists()) QDir().mkpath(PicsPath);
    if (!showFolder(PicsPath))
        Ask(QStringLiteral("Warning - PICS Folder"), QStringLiteral("Can't find PICS folder.") + kCrLf + PicsPath,
            platform::Buttons::Ok);
}

void TintrollaForm::ShowDesktopFolder() {
    QString folder = QStandardPaths::writableLocation(QStandardPaths::DesktopLocation);
    if (!folder.isEmpty() && !folder.endsWith('/')) folder += '/';
    // Many Linux desktops have no desktop folder: home is the nearest place.
    if (showFolder(folder) || showFolder(QDir::homePath())) return;
    Ask(QStringLiteral("Warning - Shortcut to Desktop"), QStringLiteral("Can't find Windows Desktop.") + kCrLf + folder,
        platform::Buttons::Ok);
}

void TintrollaForm::Dir1_Change() {
    SetFileListPattern();
    File1->setEnabled(true);
    File1->setPath(Dir1->path());
    ExportFolder = Dir1->path();
    endPickupAndSetReference();
}

void TintrollaForm::Drive1_Change() {
    Dir1->setPath(Drive1->drive());  // a drive that cannot be opened changes nothing
    endPickupAndSetReference();
}

void TintrollaForm::rereadFileList() { File1->setPath(Dir1->path()); }

void TintrollaForm::DeletePicture() {
    const QString name = File1->selectedName();
    if (name.isEmpty()) return;
    const QString question = QStringLiteral("Delete this Picture?") + kCrLf + kCrLf +
                             QStringLiteral("Note: This will also delete the paint mask file and") + kCrLf +
                             QStringLiteral("the color scheme file.");
    if (Ask(QStringLiteral("Delete - ") + name, question, platform::Buttons::YesNo) != platform::Answer::Yes) return;

    const QString folder = store::StripTrailingBackslash(File1->path());
    QFile file(folder + '/' + name);
    if (!file.remove()) {
        Ask(QStringLiteral("Error - Unable to Delete Picture"), file.errorString(), platform::Buttons::Ok);
        File1->reread();
        return;
    }
    File1->reread();
    // Only a work in PICS (a lower-case ".bmp") takes its companions along;
    // companions already gone are simply skipped.
    if (folder == store::StripTrailingBackslash(PicsPath) && name == store::StripExtension(name) + QStringLiteral(".bmp")) {
        const QString base = folder + '/' + store::StripExtension(name);
        for (const char* ext : {".bmo", ".msk", ".csc"}) QFile::remove(base + QLatin1String(ext));
    }
}
