// The six 32 x 32 cursor icons, the window icon and the title background.
// Hot spots (kept beside the cursors in the program): rollers (13, 2), the
// middle of the roller's top edge; chalk (3, 28), its point; set reference
// (15, 15), the centre; eraser (3, 20), the left corner of the rubber end;
// pickup (2, 29), the dropper's tip.
#include <QImage>
#include <cmath>

#include "Art.h"

namespace {

void Roller32(QPainter& p, qreal left, qreal width) {
    p.setBrush(Qt::NoBrush);
    p.setPen(QPen(ink::outline, 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.drawPolyline(QPolygonF({{left + width, 7}, {28.5, 7}, {28.5, 15.5}, {15.5, 15.5}, {15.5, 20}}));
    Outlined(p, RoundRect(left, 2.5, width, 9, 3), ink::paint);
    Line(p, {left + 3, 5}, {left + width - 3, 5}, ink::paintLight, 1.5);
    Outlined(p, RoundRect(12.5, 19.5, 6, 11, 2), ink::handle);
    Line(p, {14.5, 22}, {14.5, 28}, QColor(0x8a, 0x70, 0x55));
}

} // namespace

std::vector<Art> CursorArt() {
    const QString dir = QStringLiteral("cursors");
    return {
        {dir, "WideRollerIcon", 32, [](QPainter& p) { Roller32(p, 2.5, 22); }},
        {dir, "NarrowRollerIcon", 32, [](QPainter& p) { Roller32(p, 8.5, 10); }},
        {dir, "ChalkLineIcon", 32, [](QPainter& p) {
             p.translate(16, 16);
             p.rotate(45);
             const QPainterPath chalk = Polygon({{-3.5, -15}, {3.5, -15}, {3.5, 11}, {0.6, 18}, {-0.6, 18}, {-3.5, 11}});
             Outlined(p, chalk, ink::paper);
             p.save();
             p.setClipRect(QRectF(-5, 11, 10, 9));
             Outlined(p, chalk, ink::blueLight);
             p.restore();
             Line(p, {-1.5, -12}, {-1.5, 8}, ink::metalLight);
         }},
        {dir, "SetReferenceColorIcon", 32, [](QPainter& p) {
             const QColor grey(0x30, 0x30, 0x30);
             const QRectF ring(8.5, 8.5, 14, 14);
             p.setPen(Qt::NoPen);
             p.setBrush(QColor(0x50, 0x50, 0x50));
             p.drawPie(ring, 90 * 16, 180 * 16);
             p.setBrush(QColor(0xe0, 0xe0, 0xe0));
             p.drawPie(ring, 270 * 16, 180 * 16);
             p.setBrush(Qt::NoBrush);
             p.setPen(QPen(grey, 1));
             p.drawEllipse(ring);
             for (const auto& [a, b] : {std::pair{QPointF(15.5, 1.5), QPointF(15.5, 7.5)}, std::pair{QPointF(15.5, 23.5), QPointF(15.5, 29.5)},
                                        std::pair{QPointF(1.5, 15.5), QPointF(7.5, 15.5)}, std::pair{QPointF(23.5, 15.5), QPointF(29.5, 15.5)}})
                 Line(p, a, b, grey);
             p.setPen(Qt::NoPen);
             p.setBrush(grey);
             p.drawRect(QRectF(15, 15, 1, 1));
         }},
        {dir, "EraserIcon", 32, [](QPainter& p) {
             p.translate(16, 16);
             p.rotate(45);
             Outlined(p, RoundRect(-6, 2, 12, 10, 1), QColor(0xf4, 0xa7, 0xb9));
             Outlined(p, RoundRect(-6, -13, 12, 15, 1), ink::blue);
             Line(p, {-3.5, -10}, {-3.5, -1}, ink::blueLight, 1.5);
         }},
        {dir, "PickupColorIcon", 32, [](QPainter& p) {
             p.translate(16, 16);
             p.rotate(45);
             const QPainterPath tube = Polygon({{-2.5, -5}, {2.5, -5}, {2.5, 8}, {0.8, 18.5}, {-0.8, 18.5}, {-2.5, 8}});
             Outlined(p, tube, ink::paper);
             p.save();
             p.setClipRect(QRectF(-4, 3, 8, 17));
             Outlined(p, tube, ink::blue);
             p.restore();
             Outlined(p, RoundRect(-5, -8, 10, 3, 1), ink::metal);
             Outlined(p, RoundRect(-3.5, -17.5, 7, 10, 3.5), ink::red);
         }},
    };
}

std::vector<Art> WindowArt() {
    return {
        {QStringLiteral("icons"), "tintrolla", 32, [](QPainter& p) {
             // A house half repainted, with the roller still at work.
             const QPainterPath wall = Polygon({{5.5, 14.5}, {26.5, 14.5}, {26.5, 29.5}, {5.5, 29.5}});
             p.setPen(Qt::NoPen);
             p.setBrush(ink::paper);
             p.drawPath(wall);
             p.fillRect(QRectF(16, 14.5, 10.5, 15), QColor(0x4f, 0xb3, 0xa9));
             p.setBrush(Qt::NoBrush);
             p.setPen(QPen(ink::outline, 1));
             p.drawPath(wall);
             Outlined(p, Polygon({{2.5, 15.5}, {16, 4.5}, {29.5, 15.5}}), ink::red);
             Outlined(p, Polygon({{7.5, 17.5}, {11.5, 17.5}, {11.5, 21.5}, {7.5, 21.5}}), ink::blueLight);
             Outlined(p, Polygon({{20.5, 17.5}, {24.5, 17.5}, {24.5, 21.5}, {20.5, 21.5}}), ink::blueLight);
             Outlined(p, RoundRect(13.5, 21.5, 5, 8, 1), ink::handle);
             p.setBrush(Qt::NoBrush);
             p.setPen(QPen(ink::outline, 1, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
             p.drawPolyline(QPolygonF({{29, 3.5}, {30.5, 3.5}, {30.5, 7.5}, {26.5, 7.5}, {26.5, 10.5}}));
             Outlined(p, RoundRect(21.5, 1.5, 8, 4, 1.5), QColor(0x4f, 0xb3, 0xa9));
             Outlined(p, RoundRect(25.5, 10.5, 2, 4, 0.8), ink::handle, 0.8);
         }},
    };
}

// 80 x 60: a soft sky over a meadow with a pale sun and a few clouds, light
// enough for black text; the title screen turns its hues as it redraws.
QImage TitleBackground() {
    QImage image(80, 60, QImage::Format_RGB32);
    auto smooth = [](double e0, double e1, double x) {
        const double t = std::clamp((x - e0) / (e1 - e0), 0.0, 1.0);
        return t * t * (3 - 2 * t);
    };
    for (int y = 0; y < 60; ++y) {
        for (int x = 0; x < 80; ++x) {
            const double horizon = 40 + 4 * std::sin(x / 9.0);
            const double meadow = smooth(horizon - 3, horizon + 3, y);
            double hue = 0.58 - 0.03 * y / 60.0;
            hue = hue * (1 - meadow) + (0.26 + 0.02 * std::sin(x / 5.0)) * meadow;
            double light = 0.80 + 0.04 * y / 60.0;
            double sat = 0.55 - 0.1 * meadow;
            const double sun = std::hypot(x - 62.0, y - 12.0);
            const double glow = 1 - smooth(5, 12, sun);
            hue = hue * (1 - glow) + 1.13 * glow;  // warm through pink, not green
            light += 0.08 * glow;
            for (const auto& [cx, cy, r] : {std::tuple{18.0, 14.0, 7.0}, std::tuple{30.0, 10.0, 5.0}, std::tuple{44.0, 22.0, 6.0}}) {
                const double cloud = 1 - smooth(r * 0.5, r, std::hypot((x - cx) * 0.6, y - cy));
                light += 0.08 * cloud * (1 - meadow);
                sat -= 0.2 * cloud * (1 - meadow);
            }
            image.setPixelColor(x, y, QColor::fromHslF(std::fmod(hue + 1, 1.0), std::clamp(sat, 0.0, 1.0),
                                                       std::clamp(light, 0.0, 0.93)));
        }
    }
    return image;
}
