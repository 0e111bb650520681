#include "shell/PictureCanvas.h"

#include <QImage>

void PaintPicture(Picture& picture, const QRect& wanted, const std::function<void(QPainter&)>& draw) {
    const QRect region = wanted.intersected(QRect(0, 0, picture.width(), picture.height()));
    if (region.isEmpty()) return;
    QImage canvas(region.size(), QImage::Format_RGB32);
    for (int y = 0; y < region.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(canvas.scanLine(y));
        for (int x = 0; x < region.width(); ++x) {
            const auto v = static_cast<uint32_t>(picture.pixel(region.left() + x, region.top() + y));
            line[x] = qRgb(v & 0xFF, (v >> 8) & 0xFF, (v >> 16) & 0xFF);
        }
    }
    {
        QPainter painter(&canvas);
        painter.translate(-region.topLeft());
        draw(painter);
    }
    for (int y = 0; y < region.height(); ++y) {
        const auto* line = reinterpret_cast<const QRgb*>(canvas.constScanLine(y));
        for (int x = 0; x < region.width(); ++x)
            picture.setPixel(region.left() + x, region.top() + y,
                             qRed(line[x]) + 256 * qGreen(line[x]) + 65536 * qBlue(line[x]));
    }
}
