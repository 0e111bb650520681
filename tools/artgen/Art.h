#pragma once
#include <QColor>
#include <QPainter>
#include <QPainterPath>
#include <QString>
#include <functional>
#include <vector>

// One piece of artwork, drawn in its own unit grid (16 or 32 units) and
// rendered at 1x and 2x. Strokes of width 1 sit on half units so that both
// renderings land on whole pixels.
struct Art {
    QString folder;   // under resources/
    QString name;     // file name without ".png"
    int size;         // units (pixels at 1x)
    std::function<void(QPainter&)> draw;
};

// The shared palette: one outline colour, flat fills, a light edge.
namespace ink {
inline const QColor outline(0x2b, 0x2f, 0x36);
inline const QColor paper(0xfb, 0xfb, 0xf8);
inline const QColor folder(0xf2, 0xc1, 0x4e);
inline const QColor folderDark(0xd6, 0x9c, 0x2a);
inline const QColor blue(0x3d, 0x7e, 0xdb);
inline const QColor blueLight(0x9c, 0xc3, 0xf2);
inline const QColor red(0xd6, 0x45, 0x41);
inline const QColor green(0x3f, 0xa3, 0x4d);
inline const QColor paint(0xe8, 0x74, 0x4f);      // the roller's fresh paint
inline const QColor paintLight(0xf6, 0xb8, 0x9c);
inline const QColor metal(0x8a, 0x8f, 0x98);
inline const QColor metalLight(0xc9, 0xcd, 0xd3);
inline const QColor handle(0x5a, 0x46, 0x32);
} // namespace ink

// Helpers used by every drawing.
void Outlined(QPainter& p, const QPainterPath& path, const QColor& fill, qreal width = 1.0);
void Line(QPainter& p, QPointF a, QPointF b, const QColor& color, qreal width = 1.0);
QPainterPath Polygon(std::initializer_list<QPointF> points);
QPainterPath RoundRect(qreal x, qreal y, qreal w, qreal h, qreal r);

std::vector<Art> ToolbarArt();
std::vector<Art> CursorArt();
std::vector<Art> WindowArt();
