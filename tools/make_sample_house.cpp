// Draws the sample photo that new users find in PICS: a house front with
// walls, windows, a door, a roof and sky, in a gentle light gradient with a
// little noise, as a camera would give it.
//
// Build and run (from the repository root):
//   g++ -std=c++20 -fPIC tools/make_sample_house.cpp -o /tmp/make_sample_house \
//       $(pkg-config --cflags --libs Qt6Gui)
//   QT_QPA_PLATFORM=offscreen /tmp/make_sample_house pics/Sample House.jpg
#include <QGuiApplication>
#include <QImage>
#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>
#include <QRandomGenerator>
#include <algorithm>
#include <cstdio>

namespace {

void Window(QPainter& p, QRectF r) {
    p.fillRect(r.adjusted(-8, -8, 8, 8), QColor(245, 243, 236));            // frame
    QLinearGradient glass(r.topLeft(), r.bottomRight());
    glass.setColorAt(0, QColor(70, 95, 120));
    glass.setColorAt(1, QColor(30, 40, 55));
    p.fillRect(r, glass);
    p.fillRect(QRectF(r.center().x() - 3, r.top(), 6, r.height()), QColor(245, 243, 236));   // mullion
    p.fillRect(QRectF(r.left(), r.center().y() - 3, r.width(), 6), QColor(245, 243, 236));
    p.fillRect(QRectF(r.left() - 14, r.bottom() + 8, r.width() + 28, 12), QColor(225, 222, 214));  // sill
}

} // namespace

int main(int argc, char** argv) {
    QGuiApplication app(argc, argv);
    const QString out = argc > 1 ? QString::fromLocal8Bit(argv[1]) : QStringLiteral("Sample House.jpg");
    QImage image(1200, 900, QImage::Format_RGB32);
    QPainter p(&image);
    p.setRenderHint(QPainter::Antialiasing);

    QLinearGradient sky(0, 0, 0, 330);
    sky.setColorAt(0, QColor(92, 148, 214));
    sky.setColorAt(1, QColor(190, 214, 236));
    p.fillRect(0, 0, 1200, 900, sky);
    p.fillRect(0, 760, 1200, 140, QColor(78, 128, 60));                       // lawn
    p.fillRect(0, 745, 1200, 18, QColor(150, 145, 135));                      // path edge

    // Walls: warm render, lit from the left.
    QLinearGradient wall(150, 0, 1050, 0);
    wall.setColorAt(0, QColor(226, 200, 160));
    wall.setColorAt(1, QColor(188, 160, 124));
    p.fillRect(QRectF(150, 330, 900, 420), wall);
    p.fillRect(QRectF(150, 700, 900, 50), QColor(120, 104, 92));              // base course

    // Roof: dark tiles with a lighter ridge and a fascia board.
    QPainterPath roof;
    roof.moveTo(110, 340);
    roof.lineTo(600, 120);
    roof.lineTo(1090, 340);
    roof.closeSubpath();
    QLinearGradient tiles(0, 120, 0, 340);
    tiles.setColorAt(0, QColor(120, 52, 40));
    tiles.setColorAt(1, QColor(86, 36, 30));
    p.fillPath(roof, tiles);
    p.setPen(QPen(QColor(240, 238, 232), 12));
    p.drawLine(QPointF(110, 340), QPointF(1090, 340));
    p.setPen(Qt::NoPen);
    p.fillRect(QRectF(820, 150, 60, 130), QColor(140, 70, 55));               // chimney

    Window(p, QRectF(230, 420, 170, 190));
    Window(p, QRectF(800, 420, 170, 190));
    Window(p, QRectF(520, 220, 160, 80));

    // Door with its frame and a step.
    p.fillRect(QRectF(520, 470, 160, 280), QColor(245, 243, 236));
    p.fillRect(QRectF(535, 485, 130, 265), QColor(36, 72, 58));
    p.fillRect(QRectF(640, 610, 10, 10), QColor(212, 180, 80));               // knob
    p.fillRect(QRectF(500, 745, 200, 16), QColor(170, 165, 155));
    p.end();

    // Soft light falling off to the right and downward, and sensor noise.
    QRandomGenerator noise(20240611);
    for (int y = 0; y < image.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < image.width(); ++x) {
            const double light = 1.06 - 0.12 * x / image.width() - 0.06 * y / image.height();
            auto ch = [&](int v) {
                const int n = static_cast<int>(noise.bounded(9)) - 4;
                return std::clamp(static_cast<int>(v * light) + n, 0, 255);
            };
            const QRgb c = line[x];
            line[x] = qRgb(ch(qRed(c)), ch(qGreen(c)), ch(qBlue(c)));
        }
    }
    if (!image.save(out, "JPEG", 88)) {
        std::fprintf(stderr, "Unable to write %s\n", qPrintable(out));
        return 1;
    }
    return 0;
}
