// Exporting the repainted picture as a JPEG or bitmap file, or to the
// clipboard. Both always give the blended view.
#include <QCheckBox>

#include "imaging/DibSurface.h"
#include "imaging/JpegWriter.h"
#include "imaging/qt/BmpWriter.h"
#include "imaging/qt/SurfaceClipboard.h"
#include "shell/TintrollaForm.h"
#include "store/ReplaceFile.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/QtPaths.h"

namespace {
const QString kExportTitle = QStringLiteral("Warning - Export to File");
const QString kCrLf = QStringLiteral("\r\n");
} // namespace

void TintrollaForm::ExportToFileMenuItem_Click() {
    Workspace& ws = workspace();
    if (!ws.PictureLoaded || ws.LoadingPicture) return;

    platform::FileRequest request;
    request.defaultExtension = QStringLiteral("*");
    request.initialFolder = Dir1->path();
    request.fileName = store::StripTrailingBackslash(ExportFolder) + '/' +
                       store::StripExtension(store::FileNameOf(CurrentPicturePath)) + QStringLiteral(".jpg");
    request.filter = QStringLiteral("JPEG Picture Format (*.jpg)|*.jpg|Bitmap Picture Format (*.bmp)|*.bmp");
    request.title = QStringLiteral("Export Painted Picture to");
    request.flags = 4;  // no read-only box; an existing file is replaced without asking
    const platform::FileChoice choice = platformLayer().saveFile(this, request);
    if (choice.cancelled || choice.fileName.isEmpty()) return;

    ExportFolder = store::FolderOf(choice.fileName);
    // The export shows the edges blended whatever the option says.
    const bool plainView = !BlendEdgesCheckbox->isChecked();
    if (plainView) engine().RenderEdges(2);

    // The name's extension always follows the chosen format.
    const QString stem = store::StripExtension(choice.fileName);
    if (choice.filterIndex == 1) {
        bool written = false;
        try {
            written = imaging::SaveJPGpicture(ws.Picture1, store::LocalPath(stem + QStringLiteral(".jpg")));
        } catch (const std::exception&) {
            written = false;
        }
        if (!written) Ask(kExportTitle, QStringLiteral("Unable to Write JPEG file."), platform::Buttons::Ok);
    } else {
        // A bitmap that was not written is said so, as the JPEG is.
        store::Bytes bytes;
        QString error;
        std::string reason;
        bool written = imaging::EncodeBmp24(ws.Picture1, bytes, error);
        if (written) {
            written = store::ReplaceFileWith(store::LocalPath(stem + QStringLiteral(".bmp")), bytes, false, reason);
            error = QString::fromLocal8Bit(reason.c_str());
        }
        if (!written) Ask(kExportTitle, QStringLiteral("Unable to Write Bitmap file.") + kCrLf + error, platform::Buttons::Ok);
    }

    if (plainView) engine().RenderEdges(1);
    // A picture exported into the folder on show appears in the list.
    rereadFileList();
}

void TintrollaForm::ToClipboardMenuItem_Click() {
    Workspace& ws = workspace();
    if (!ws.PictureLoaded || ws.LoadingPicture) return;
    const bool plainView = !BlendEdgesCheckbox->isChecked();
    if (plainView) engine().RenderEdges(2);
    DibSurface surface;
    surface.CreateFromPicture(ws.Picture1);
    imaging::CopyToClipboard(surface, platformLayer(), this);
    if (plainView) engine().RenderEdges(1);
}
