// Opening a picture: the quick preview of a click, the open dialog, the
// clipboard, and the full load that the background poll starts.
#include <QClipboard>
#include <QDir>
#include <QFileInfo>
#include <QGuiApplication>

#include "imaging/qt/PictureDecoder.h"
#include "paint/qt/PictureView.h"
#include "shell/TintrollaForm.h"
#include "store/Analysis.h"
#include "store/MaskFile.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/FitPicture.h"
#include "store/qt/QtPaths.h"

namespace {
const QString kLoadError = QStringLiteral("Error - Unable to load picture");
const QString kCrLf = QStringLiteral("\r\n");
} // namespace

void TintrollaForm::File1_Click() {
    const QString name = File1->selectedName();
    if (name.isEmpty()) return;
    Workspace& ws = workspace();
    // A work still being built has nothing of the user's to save yet.
    if (ws.PictureModified && !ws.LoadingPicture) {
        if (Ask(QStringLiteral("Warning - Not Saved"), QStringLiteral("Do you want to save your work now?"),
                platform::Buttons::YesNo) == platform::Answer::Yes) {
            SaveWork();
            // A save that failed or was called off keeps the work open.
            if (ws.PictureModified) return;
        }
    }
    ws.PictureModified = false;
    ws.PickupLabelVisible = false;
    ws.SetReferenceMode = false;

    const QString path = store::StripTrailingBackslash(File1->path()) + '/' + name;
    const imaging::DecodedPicture photo = imaging::DecodePictureFile(path);
    if (!photo.ok()) {
        UpdatePictureCursor();
        ToolStateChanged();
        Ask(kLoadError, photo.error, platform::Buttons::Ok, platform::Icon::Exclamation);
        return;
    }
    ws.Picture1 = store::FitPicture(photo, ws.AutoCrop);
    RefreshPicture();
    ws.PictureLoaded = false;
    CurrentPicturePath.clear();
    RequestedPicturePath = path;
    UpdatePictureCursor();
    ToolStateChanged();
}

void TintrollaForm::OpenFromFileMenuItem_Click() {
    platform::FileRequest request;
    request.defaultExtension = QStringLiteral("*");
    request.initialFolder = Dir1->path();
    request.filter = QStringLiteral("Picture files (BMP, JPG, GIF)| *.BMP;*.JPG;*.GIF|") + QStringLiteral("All files (*.*)|*.*");
    request.fileName = QString();
    request.title = QStringLiteral("Select a Picture");
    request.flags = 4;
    const platform::FileChoice choice = platformLayer().openFile(this, request);
    if (choice.cancelled || choice.fileName.isEmpty()) return;

    const QString folder = store::FolderOf(choice.fileName);
    const QString name = store::FileNameOf(choice.fileName);
    if (folder.isEmpty()) return;
    Drive1->setDriveOf(folder);
    Dir1->setPath(folder);
    File1->setEnabled(true);
    File1->setPath(QDir::cleanPath(folder));
    File1->selectName(name);
    File1_Click();
    File1->setFocus();
}

void TintrollaForm::OpenFromClipboardMenuItem_Click() {
    const QImage image = QGuiApplication::clipboard()->image();
    if (image.isNull()) {
        platformLayer().beep();
        Ask(QStringLiteral("Open - from Clipboard"), QStringLiteral("The Clipbaord doesn't contain an Image"),
            platform::Buttons::Ok, platform::Icon::Exclamation);
        return;
    }
    File1->setCurrentRow(-1);
    const imaging::DecodedPicture photo = imaging::DecodedFromImage(image);
    if (!photo.ok()) {
        Ask(kLoadError, photo.error, platform::Buttons::Ok, platform::Icon::Exclamation);
        return;
    }
    workspace().Picture1 = store::FitPicture(photo, false);  // the preview is never cropped
    RefreshPicture();
    RequestedPicturePath = kClipboardRequest;
}

bool TintrollaForm::loadAbandoned() {
    platformLayer().processEvents(1);
    if (RequestedPicturePath != CurrentPicturePath || CurrentPicturePath.isEmpty()) {
        workspace().LoadingPicture = false;
        return true;
    }
    return false;
}

void TintrollaForm::failLoad(const QString& error) {
    Workspace& ws = workspace();
    ws.LoadingPicture = false;
    ws.PictureLoaded = false;
    unsetCursor();
    UpdatePictureCursor();
    ToolStateChanged();
    Ask(kLoadError, error, platform::Buttons::Ok, platform::Icon::Exclamation);
}

bool TintrollaForm::isPreviousWork(const QString& path) const {
    const QString stem = store::StripExtension(path);
    return path == stem + QStringLiteral(".bmp") && store::FolderOf(path) == PicsPath + '/' &&
           QFileInfo(stem + QStringLiteral(".bmo")).isFile();
}

void TintrollaForm::OpenPicture() {
    Workspace& ws = workspace();
    ws.PictureLoaded = false;
    ws.LoadingPicture = true;
    setCursor(Qt::WaitCursor);
    Picture1->setCursor(Qt::WaitCursor);

    imaging::DecodedPicture photo;
    bool work = false;
    if (RequestedPicturePath == kClipboardRequest) {
        const QString path = store::StripTrailingBackslash(PicsPath) + QStringLiteral("/From Clipboard.xyz");
        RequestedPicturePath = path;
        CurrentPicturePath = path;
        photo = imaging::DecodedFromImage(QGuiApplication::clipboard()->image());
        if (photo.image.isNull() && photo.fullSize.isEmpty())
            photo.error = QStringLiteral("The clipboard no longer holds a picture.");
    } else {
        CurrentPicturePath = RequestedPicturePath;
        work = isPreviousWork(CurrentPicturePath);
        if (work) {
            const QString bmo = store::StripExtension(CurrentPicturePath) + QStringLiteral(".bmo");
            photo = imaging::DecodePictureFile(bmo, QSize());
            if (photo.ok() && photo.image.size() != QSize(Workspace::kWidth, Workspace::kHeight))
                photo.error = QStringLiteral("The saved photo of this picture is not %1 x %2 pixels:").arg(Workspace::kWidth).arg(Workspace::kHeight) + kCrLf + bmo;
        } else {
            photo = imaging::DecodePictureFile(CurrentPicturePath);
        }
    }
    if (!photo.ok()) {
        failLoad(photo.error.isEmpty() ? QStringLiteral("The picture cannot be decoded.") : photo.error);
        return;
    }
    ws.Picture2 = store::FitPicture(photo, ws.AutoCrop);
    photo = imaging::DecodedPicture();  // the full photo is not needed any more

    if (!store::AnalysePhoto(ws, [this] { return !loadAbandoned(); })) return;
    ToolStateChanged();
    if (loadAbandoned()) return;

    ws.Picture1 = ws.Picture2;
    ws.Image1 = ws.Picture2;
    for (int i = 1; i <= kColorBoxCount; ++i) ws.Boxes[i].reference = 0;
    RefreshPicture();

    if (work) {
        const QString bmo = store::StripExtension(CurrentPicturePath) + QStringLiteral(".bmo");
        if (store::ReadPaintMask(ws, store::LocalPath(bmo)) == store::MaskRead::Broken)
            Ask(QStringLiteral("Warning - Paint Mask"),
                QStringLiteral("The paint mask file of this picture is damaged:") + kCrLf +
                    store::StripExtension(bmo) + QStringLiteral(".msk") + kCrLf +
                    QStringLiteral("The picture opens without its paint."),
                platform::Buttons::Ok, platform::Icon::Exclamation);
        // A work without its scheme file keeps the colour boxes as they are.
        if (ws.LoadWithPicture && QFileInfo(store::StripExtension(bmo) + QStringLiteral(".csc")).isFile())
            ReadColorScheme(bmo);

        ws.StrokeNumber = 0;
        bool undone = false;
        for (int x = 0; x <= ws.WholeMaxX(); ++x) {
            if (loadAbandoned()) return;
            for (int y = 0; y <= ws.WholeMaxY(); ++y) {
                const int32_t v = ws.Stroke(x, y);
                if (v > ws.StrokeNumber) ws.StrokeNumber = v;
                if (v < 0) undone = true;
            }
        }
        ws.UndoEnabled = ws.StrokeNumber > 0;
        ws.RedoEnabled = undone;
        syncToolbar();
        for (int i = 1; i <= kColorBoxCount; ++i) {
            if (loadAbandoned()) return;
            engine().RepaintColor(i);
        }
        engine().RenderEdges(0);
    }

    ws.LoadingPicture = false;
    UpdatePictureCursor();
    ToolStateChanged();
    unsetCursor();
    ws.PictureLoaded = true;
    ws.PictureModified = false;
    for (const char* key : {"Save", "Print", "Delete"}) setToolbarButtonEnabled(QLatin1String(key), true);
    RefreshPicture();
}
