// Renders the program's artwork into resources/ as PNG files, each at 1x
// ("name.png") and 2x ("name@2x.png"), and the 80 x 60 title background.
// Run from the source tree:  artgen <path to resources>
#include <QDir>
#include <QGuiApplication>
#include <QImage>
#include <cstdio>

#include "Art.h"

void Outlined(QPainter& p, const QPainterPath& path, const QColor& fill, qreal width) {
    p.setPen(QPen(ink::outline, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.setBrush(fill);
    p.drawPath(path);
}

void Line(QPainter& p, QPointF a, QPointF b, const QColor& color, qreal width) {
    p.setPen(QPen(color, width, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    p.drawLine(a, b);
}

QPainterPath Polygon(std::initializer_list<QPointF> points) {
    QPainterPath path;
    bool first = true;
    for (const QPointF& pt : points) {
        if (first) path.moveTo(pt); else path.lineTo(pt);
        first = false;
    }
    path.closeSubpath();
    return path;
}

QPainterPath RoundRect(qreal x, qreal y, qreal w, qreal h, qreal r) {
    QPainterPath path;
    path.addRoundedRect(QRectF(x, y, w, h), r, r);
    return path;
}

QImage TitleBackground();

namespace {
bool Render(const QString& root, const Art& art, int scale) {
    QImage image(art.size * scale, art.size * scale, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    {
        QPainter p(&image);
        p.setRenderHint(QPainter::Antialiasing);
        p.scale(scale, scale);
        art.draw(p);
    }
    QDir(root).mkpath(art.folder);
    const QString suffix = scale == 1 ? QString() : QStringLiteral("@%1x").arg(scale);
    const QString path = QStringLiteral("%1/%2/%3%4.png").arg(root, art.folder, art.name, suffix);
    if (!image.save(path)) {
        std::fprintf(stderr, "cannot write %s\n", qPrintable(path));
        return false;
    }
    return true;
}
} // namespace

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication app(argc, argv);
    if (argc != 2) {
        std::fprintf(stderr, "usage: artgen <resources folder>\n");
        return 2;
    }
    const QString root = QString::fromLocal8Bit(argv[1]);
    std::vector<Art> all = ToolbarArt();
    for (auto& list : {CursorArt(), WindowArt()}) all.insert(all.end(), list.begin(), list.end());
    bool ok = true;
    for (const Art& art : all) ok = Render(root, art, 1) && Render(root, art, 2) && ok;
    QDir(root).mkpath(QStringLiteral("title"));
    ok = TitleBackground().save(root + QStringLiteral("/title/TitleBackground.png")) && ok;
    std::printf("%zu pictures at 1x and 2x, and the title background\n", all.size());
    return ok ? 0 : 1;
}
