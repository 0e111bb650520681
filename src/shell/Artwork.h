#pragma once
#include <QCursor>
#include <QIcon>
#include <QImage>
#include <QPoint>
#include <QString>

#include "paint/Workspace.h"

// The program's own pictures, kept as resources: toolbar images, the
// work picture's cursor icons, the window icon and the title background.
namespace artwork {

// A toolbar image by key ("Open", "SmRollerT", ...), with its 2x rendering.
QIcon ToolbarImage(const QString& key);

// The icon of a custom cursor and where the tool touches (its hot spot),
// in 32 x 32 icon pixels. Null for Default and NoDrop, which are system shapes.
QImage CursorIcon(PictureCursor cursor);
QPoint CursorHotSpot(PictureCursor cursor);
// The pointer the work picture shows for a cursor state.
QCursor PictureCursorShape(PictureCursor cursor);

QIcon WindowIcon();
// The 32 x 32 window icon as drawn on the title screen.
QImage WindowIconImage();
// The 80 x 60 title background, 24-bit.
QImage TitleBackgroundImage();

} // namespace artwork
