#include "imaging/qt/BmpWriter.h"

#include <QBuffer>
#include <QImage>
#include <QImageWriter>

namespace imaging {

bool EncodeBmp24(const Picture& picture, store::Bytes& bytes, QString& error) {
    QImage image(picture.width(), picture.height(), QImage::Format_RGB32);
    for (int y = 0; y < picture.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < picture.width(); ++x) {
            const auto v = static_cast<uint32_t>(picture.pixel(x, y));
            line[x] = qRgb(static_cast<int>(v & 0xFFu), static_cast<int>((v >> 8) & 0xFFu),
                           static_cast<int>((v >> 16) & 0xFFu));
        }
    }
    QByteArray data;
    QBuffer buffer(&data);
    buffer.open(QIODevice::WriteOnly);
    QImageWriter writer(&buffer, "BMP");
    if (!writer.write(image)) {
        error = writer.errorString();
        return false;
    }
    // Qt writes RGB32 pictures with 24 bits a pixel; check rather than trust.
    if (data.size() < 54 || static_cast<unsigned char>(data[28]) != 24) {
        error = QStringLiteral("The bitmap writer did not produce a 24-bit picture.");
        return false;
    }
    bytes.assign(reinterpret_cast<const uint8_t*>(data.constData()),
                 reinterpret_cast<const uint8_t*>(data.constData()) + data.size());
    return true;
}

} // namespace imaging
