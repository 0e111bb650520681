// The seventeen 16 x 16 toolbar pictures.
#include "Art.h"

namespace {

void Folder(QPainter& p, bool open) {
    if (open) {
        Outlined(p, Polygon({{1.5, 3.5}, {6, 3.5}, {7.5, 5}, {13.5, 5}, {13.5, 12.5}, {1.5, 12.5}}), ink::folderDark);
        Outlined(p, Polygon({{1.5, 12.5}, {3.5, 7.5}, {15.5, 7.5}, {13.5, 12.5}}), ink::folder);
    } else {
        Outlined(p, Polygon({{1.5, 2.5}, {6, 2.5}, {7.5, 4}, {14.5, 4}, {14.5, 13.5}, {1.5, 13.5}}), ink::folder);
        Line(p, {2.5, 5.5}, {13.5, 5.5}, ink::folderDark);
    }
}

// A paint roller: cylinder at the top, wire frame, handle below.
void Roller(QPainter& p, qreal left, qreal width) {
    p.setBrush(Qt::NoBrush);
    p.setPen(QPen(ink::outline, 1, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.drawPolyline(QPolygonF({{left + width, 4}, {14.5, 4}, {14.5, 8.5}, {8, 8.5}, {8, 10.5}}));
    Outlined(p, RoundRect(left, 1.5, width, 5, 1.5), ink::paint);
    Line(p, {left + 1.5, 3}, {left + width - 1.5, 3}, ink::paintLight);
    Outlined(p, RoundRect(6.5, 10.5, 3, 5, 1), ink::handle);
}

QPainterPath Drop() {
    QPainterPath path;
    path.moveTo(8, 1.5);
    path.cubicTo(10, 5, 12.5, 7, 12.5, 10);
    path.cubicTo(12.5, 12.8, 10.5, 14.5, 8, 14.5);
    path.cubicTo(5.5, 14.5, 3.5, 12.8, 3.5, 10);
    path.cubicTo(3.5, 7, 6, 5, 8, 1.5);
    return path;
}

// A paint drop filled from `level` down: the wetter the paint, the fuller.
void PaintDrop(QPainter& p, qreal level, bool splash) {
    const QPainterPath drop = Drop();
    p.setPen(Qt::NoPen);
    p.setBrush(ink::paper);
    p.drawPath(drop);
    p.save();
    p.setClipPath(drop);
    p.fillRect(QRectF(0, level, 16, 16 - level), ink::blue);
    p.restore();
    if (level < 9) Line(p, {5.6, 9}, {5.6, 11.5}, ink::blueLight);
    p.setBrush(Qt::NoBrush);
    p.setPen(QPen(ink::outline, 1));
    p.drawPath(drop);
    if (splash) {
        Outlined(p, RoundRect(12.5, 1.5, 2.5, 2.5, 1.25), ink::blue, 0.8);
        Outlined(p, RoundRect(1.5, 4.5, 2, 2, 1), ink::blue, 0.8);
    }
}

void Arrow(QPainter& p) {
    QPainterPath shaft;
    shaft.moveTo(5, 5.5);
    shaft.lineTo(9, 5.5);
    shaft.arcTo(QRectF(5, 5.5, 8, 8), 90, -180);
    shaft.lineTo(6, 13.5);
    p.setBrush(Qt::NoBrush);
    p.setPen(QPen(ink::outline, 3.5, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.drawPath(shaft);
    p.setPen(QPen(ink::blue, 1.8, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.drawPath(shaft);
    Outlined(p, Polygon({{1.5, 5.5}, {6, 1.5}, {6, 9.5}}), ink::blue);
}

void Dropper(QPainter& p) {
    p.save();
    p.translate(8, 8);
    p.rotate(45);
    Outlined(p, Polygon({{-1.5, -3}, {1.5, -3}, {1.5, 4}, {0.4, 9}, {-0.4, 9}, {-1.5, 4}}), ink::paper, 0.9);
    p.save();
    p.setClipRect(QRectF(-3, 1, 6, 9));
    Outlined(p, Polygon({{-1.5, -3}, {1.5, -3}, {1.5, 4}, {0.4, 9}, {-0.4, 9}, {-1.5, 4}}), ink::blue, 0.9);
    p.restore();
    Outlined(p, RoundRect(-3, -4.5, 6, 1.8, 0.5), ink::metal, 0.9);
    Outlined(p, RoundRect(-2.3, -10, 4.6, 5.5, 2), ink::red, 0.9);
    p.restore();
}

} // namespace

std::vector<Art> ToolbarArt() {
    const QString dir = QStringLiteral("toolbar");
    return {
        {dir, "Open", 16, [](QPainter& p) { Folder(p, true); }},
        {dir, "Save", 16, [](QPainter& p) {
             Outlined(p, Polygon({{1.5, 1.5}, {12.5, 1.5}, {14.5, 3.5}, {14.5, 14.5}, {1.5, 14.5}}), ink::blue);
             Outlined(p, Polygon({{4.5, 1.5}, {11.5, 1.5}, {11.5, 6.5}, {4.5, 6.5}}), ink::metalLight);
             p.fillRect(QRectF(9, 2.5, 1.5, 3), ink::outline);
             Outlined(p, Polygon({{3.5, 9.5}, {12.5, 9.5}, {12.5, 14.5}, {3.5, 14.5}}), ink::paper);
             Line(p, {5, 11.5}, {11, 11.5}, ink::blueLight);
         }},
        {dir, "Delete", 16, [](QPainter& p) {
             for (const auto& [color, width] : {std::pair{ink::outline, 4.6}, std::pair{ink::red, 2.6}}) {
                 Line(p, {4, 4}, {12, 12}, color, width);
                 Line(p, {12, 4}, {4, 12}, color, width);
             }
         }},
        {dir, "Undo", 16, [](QPainter& p) { Arrow(p); }},
        {dir, "Redo", 16, [](QPainter& p) { p.translate(16, 0); p.scale(-1, 1); Arrow(p); }},
        {dir, "SmRollerT", 16, [](QPainter& p) { Roller(p, 5.5, 6); }},
        {dir, "LgRollerT", 16, [](QPainter& p) { Roller(p, 1.5, 11); }},
        {dir, "Print", 16, [](QPainter& p) {
             Outlined(p, Polygon({{4.5, 1.5}, {11.5, 1.5}, {11.5, 7}, {4.5, 7}}), ink::paper);
             Outlined(p, RoundRect(1.5, 6.5, 13, 6, 1.5), ink::metalLight);
             Outlined(p, Polygon({{4.5, 10.5}, {11.5, 10.5}, {11.5, 14.5}, {4.5, 14.5}}), ink::paper);
             Line(p, {6, 12.5}, {10, 12.5}, ink::metal);
             p.setPen(Qt::NoPen);
             p.setBrush(ink::green);
             p.drawEllipse(QPointF(12.5, 8.5), 0.9, 0.9);
         }},
        {dir, "NewColourT", 16, [](QPainter& p) {
             const QColor wedges[6] = {QColor(0xe0, 0x3c, 0x3c), QColor(0xf2, 0xc1, 0x2e), QColor(0x4c, 0xb0, 0x4a),
                                       QColor(0x2e, 0xb8, 0xc9), QColor(0x3d, 0x6e, 0xdb), QColor(0xb0, 0x4c, 0xc8)};
             p.setPen(Qt::NoPen);
             for (int i = 0; i < 6; ++i) {
                 p.setBrush(wedges[i]);
                 p.drawPie(QRectF(1.5, 1.5, 13, 13), (90 + 60 * i) * 16, 60 * 16);
             }
             p.setBrush(Qt::NoBrush);
             p.setPen(QPen(ink::outline, 1));
             p.drawEllipse(QRectF(1.5, 1.5, 13, 13));
             Outlined(p, RoundRect(5.5, 5.5, 5, 5, 2.5), ink::paper);
         }},
        {dir, "DropperT", 16, [](QPainter& p) { Dropper(p); }},
        {dir, "SetRefPointT", 16, [](QPainter& p) {
             const QColor grey(0x30, 0x30, 0x30);
             p.setPen(Qt::NoPen);
             p.setBrush(QColor(0x50, 0x50, 0x50));
             p.drawPie(QRectF(3.5, 3.5, 9, 9), 90 * 16, 180 * 16);
             p.setBrush(QColor(0xe0, 0xe0, 0xe0));
             p.drawPie(QRectF(3.5, 3.5, 9, 9), 270 * 16, 180 * 16);
             p.setBrush(Qt::NoBrush);
             p.setPen(QPen(grey, 1));
             p.drawEllipse(QRectF(3.5, 3.5, 9, 9));
             for (const auto& [a, b] : {std::pair{QPointF(8, 0.5), QPointF(8, 3.5)}, std::pair{QPointF(8, 12.5), QPointF(8, 15.5)},
                                        std::pair{QPointF(0.5, 8), QPointF(3.5, 8)}, std::pair{QPointF(12.5, 8), QPointF(15.5, 8)}})
                 Line(p, a, b, grey);
         }},
        {dir, "DryRollerT1", 16, [](QPainter& p) { PaintDrop(p, 11.5, false); }},
        {dir, "NormalRollerT", 16, [](QPainter& p) { PaintDrop(p, 8, false); }},
        {dir, "WetRollerT1", 16, [](QPainter& p) { PaintDrop(p, 0, true); }},
        {dir, "ChalkLineT", 16, [](QPainter& p) {
             Line(p, {2, 8.5}, {10, 8.5}, ink::outline);
             p.setPen(QPen(ink::blue, 1.5, Qt::DashLine, Qt::FlatCap));
             p.drawLine(QPointF(1, 13), QPointF(15, 13));
             Outlined(p, RoundRect(9.5, 4.5, 6, 7, 1.5), ink::blue);
             Outlined(p, RoundRect(11.5, 6.5, 2, 2, 1), ink::paper, 0.8);
             Outlined(p, RoundRect(0.5, 7, 3, 3, 1.5), ink::metal, 0.8);
         }},
        {dir, "PicsIconT", 16, [](QPainter& p) {
             Folder(p, false);
             Outlined(p, Polygon({{4.5, 6.5}, {11.5, 6.5}, {11.5, 11.5}, {4.5, 11.5}}), ink::blueLight);
             p.setPen(Qt::NoPen);
             p.setBrush(ink::green);
             p.drawPath(Polygon({{5, 11}, {7, 8.5}, {8.8, 10.2}, {9.8, 9.2}, {11, 11}}));
             p.setBrush(QColor(0xff, 0xd2, 0x3f));
             p.drawEllipse(QPointF(9.8, 8), 0.9, 0.9);
         }},
        {dir, "DeskIconT", 16, [](QPainter& p) {
             Outlined(p, Polygon({{6.5, 11.5}, {9.5, 11.5}, {10.5, 14.5}, {5.5, 14.5}}), ink::metal);
             Outlined(p, RoundRect(1.5, 2.5, 13, 9, 1), ink::metalLight);
             p.fillRect(QRectF(3, 4, 10, 6), ink::blue);
             p.fillRect(QRectF(4, 5, 2, 1.5), ink::paper);
             p.fillRect(QRectF(4, 7.5, 2, 1.5), ink::folder);
         }},
    };
}
