#include "imaging/qt/SurfaceClipboard.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>

#include "paint/qt/PictureView.h"

namespace imaging {

bool CopyToClipboard(const DibSurface& surface, platform::Platform& platform, QWidget* parent, bool bAsDIB) {
    QClipboard* clipboard = QGuiApplication::clipboard();
    if (!clipboard) return false;
    if (bAsDIB) {
        platform.message(parent, {QCoreApplication::applicationName(),
                                  QStringLiteral("I don't know how to put a DIB on the clipboard! Copy as bitmap instead!!!"),
                                  platform::Buttons::Ok, platform::Icon::None});
        return false;
    }
    if (!surface.live()) return false;
    Picture picture(surface.Width(), surface.Height());
    surface.PaintPicture(picture);
    const QImage image = ToQImage(picture);
    if (image.isNull()) return false;
    clipboard->clear();
    clipboard->setImage(image);
    return true;
}

} // namespace imaging
