#include "shell/Artwork.h"

#include <QPixmap>

// The resources live in a static library: register them before first use.
static void InitArtworkResources() {
    static const bool done = [] {
        Q_INIT_RESOURCE(tintrolla);
        return true;
    }();
    (void)done;
}

namespace artwork {

namespace {
struct CursorArt {
    const char* name;
    QPoint hotSpot;
};

// Hot spots where each tool touches the picture: the middle of the roller's
// top edge, the chalk's point, the centre of the reference sight, the left
// corner of the eraser's rubber end, the dropper's tip.
CursorArt CursorArtFor(PictureCursor cursor) {
    switch (cursor) {
    case PictureCursor::WideRoller: return {"WideRollerIcon", QPoint(13, 2)};
    case PictureCursor::NarrowRoller: return {"NarrowRollerIcon", QPoint(13, 2)};
    case PictureCursor::ChalkLine: return {"ChalkLineIcon", QPoint(3, 28)};
    case PictureCursor::SetReference: return {"SetReferenceColorIcon", QPoint(15, 15)};
    case PictureCursor::Eraser: return {"EraserIcon", QPoint(3, 20)};
    case PictureCursor::Pickup: return {"PickupColorIcon", QPoint(2, 29)};
    case PictureCursor::Default:
    case PictureCursor::NoDrop: break;
    }
    return {nullptr, QPoint()};
}
} // namespace

QIcon ToolbarImage(const QString& key) {
    InitArtworkResources();
    // QIcon finds "name@2x.png" beside "name.png" by itself.
    return QIcon(QStringLiteral(":/toolbar/%1.png").arg(key));
}

QImage CursorIcon(PictureCursor cursor) {
    InitArtworkResources();
    const CursorArt art = CursorArtFor(cursor);
    if (!art.name) return QImage();
    return QImage(QStringLiteral(":/cursors/%1.png").arg(QLatin1String(art.name)));
}

QPoint CursorHotSpot(PictureCursor cursor) { return CursorArtFor(cursor).hotSpot; }

QCursor PictureCursorShape(PictureCursor cursor) {
    switch (cursor) {
    case PictureCursor::Default: return QCursor(Qt::ArrowCursor);
    case PictureCursor::NoDrop: return QCursor(Qt::ForbiddenCursor);
    default: break;
    }
    InitArtworkResources();
    const CursorArt art = CursorArtFor(cursor);
    // Loading through QPixmap picks the 2x icon on a high-density screen (and
    // is cached by Qt); the hot spot stays in icon pixels.
    const QPixmap pixmap(QStringLiteral(":/cursors/%1.png").arg(QLatin1String(art.name)));
    return QCursor(pixmap, art.hotSpot.x(), art.hotSpot.y());
}

QIcon WindowIcon() {
    InitArtworkResources();
    return QIcon(QStringLiteral(":/icons/tintrolla.png"));
}

QImage WindowIconImage() {
    InitArtworkResources();
    return QImage(QStringLiteral(":/icons/tintrolla.png"));
}

QImage TitleBackgroundImage() {
    InitArtworkResources();
    return QImage(QStringLiteral(":/title/TitleBackground.png")).convertToFormat(QImage::Format_RGB32);
}

} // namespace artwork
