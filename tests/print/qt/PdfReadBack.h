#pragma once
// Reads back the little that the printout tests need from a PDF file that Qt
// wrote: how many pages it has and its pictures (8-bit RGB, deflated, as the
// sheet sends them lossless).
#include <QFile>
#include <QImage>
#include <QList>
#include <QRegularExpression>
#include <QtEndian>

namespace printtest {

struct PdfContent {
    bool read = false;
    int pages = 0;
    QList<QImage> images;
};

inline PdfContent ReadPdf(const QString& path) {
    PdfContent out;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) return out;
    const QByteArray pdf = file.readAll();
    out.read = pdf.startsWith("%PDF");
    out.pages = static_cast<int>(pdf.count("/Type /Page\n"));

    static const QRegularExpression image(QStringLiteral("/Subtype /Image\\s*/Width (\\d+)\\s*/Height (\\d+)\\s*"
                                                         "/BitsPerComponent 8\\s*/ColorSpace /DeviceRGB[^>]*/Filter /FlateDecode"));
    const QString text = QString::fromLatin1(pdf);
    for (auto m = image.globalMatch(text); m.hasNext();) {
        const auto found = m.next();
        const int width = found.captured(1).toInt(), height = found.captured(2).toInt();
        const qsizetype start = pdf.indexOf("stream\n", found.capturedEnd()) + 7;
        const qsizetype end = pdf.indexOf("endstream", start);
        if (start < 7 || end < 0) continue;
        // qUncompress wants the unpacked size in front.
        QByteArray packed(4, '\0');
        qToBigEndian<quint32>(static_cast<quint32>(width * height * 3), packed.data());
        packed += pdf.mid(start, end - start);
        const QByteArray rgb = qUncompress(packed);
        if (rgb.size() != width * height * 3) continue;
        QImage picture(width, height, QImage::Format_RGB32);
        for (int y = 0; y < height; ++y)
            for (int x = 0; x < width; ++x) {
                const auto* p = reinterpret_cast<const uchar*>(rgb.constData()) + 3 * (x + width * y);
                picture.setPixel(x, y, qRgb(p[0], p[1], p[2]));
            }
        out.images.append(picture);
    }
    return out;
}

} // namespace printtest
