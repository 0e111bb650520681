#pragma once
// Pictures for the picture-store tests, drawn from ASCII art so a flipped
// axis or a red/blue swap shows.
#include <QBuffer>
#include <QByteArray>
#include <QColor>
#include <QFile>
#include <QImage>
#include <QStringList>

namespace storetest {

inline QColor ArtColor(QChar c) {
    switch (c.toLatin1()) {
    case 'R': return QColor(220, 30, 20);
    case 'G': return QColor(20, 180, 40);
    case 'B': return QColor(30, 40, 210);
    case 'Y': return QColor(240, 220, 30);
    case 'W': return QColor(250, 250, 245);
    default: return QColor(60, 40, 20);   // '.' brown
    }
}

// Each character becomes a cell x cell block.
inline QImage FromArt(const QStringList& art, int cell) {
    QImage image(static_cast<int>(art.first().size()) * cell, static_cast<int>(art.size()) * cell, QImage::Format_RGB32);
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x) image.setPixelColor(x, y, ArtColor(art[y / cell][x / cell]));
    return image;
}

// 8 x 6 cells, nothing symmetric.
inline const QStringList kHouse = {
    "RRRR..BB",
    "R..GGG.B",
    "R.YYYY.W",
    "..Y..Y.W",
    "GG....RR",
    "GGBBB.RW",
};
inline const QStringList kGarden = {
    "GGGGGGGG",
    "G.....YG",
    "G.WWW..G",
    "G.W.W.BG",
    "G.....BG",
    "GRRRRRRG",
};

// The colour value (red + 256 green + 65536 blue) of an art cell.
inline int32_t ArtValue(QChar c) {
    const QColor q = ArtColor(c);
    return q.red() + 256 * q.green() + 65536 * q.blue();
}

inline QByteArray Encode(const QImage& image, const char* format, int quality = -1) {
    QByteArray data;
    QBuffer buffer(&data);
    buffer.open(QIODevice::WriteOnly);
    image.save(&buffer, format, quality);
    return data;
}

inline bool WriteBytes(const QString& path, const QByteArray& data) {
    QFile f(path);
    return f.open(QIODevice::WriteOnly) && f.write(data) == data.size();
}

inline QByteArray ReadBytes(const QString& path) {
    QFile f(path);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}

// A JPEG whose frame header claims another size than it holds.
inline QByteArray JpegClaiming(const QByteArray& jpeg, int width, int height) {
    QByteArray out = jpeg;
    const int sof = static_cast<int>(out.indexOf(QByteArray("\xFF\xC0", 2)));
    if (sof < 0) return out;
    out[sof + 5] = static_cast<char>(height >> 8);
    out[sof + 6] = static_cast<char>(height & 0xFF);
    out[sof + 7] = static_cast<char>(width >> 8);
    out[sof + 8] = static_cast<char>(width & 0xFF);
    return out;
}

// A BMP header claiming width x height 24-bit pixels, with little data.
inline QByteArray BmpClaiming(int width, int height) {
    QByteArray b(54 + 64, '\0');
    b[0] = 'B';
    b[1] = 'M';
    b[10] = 54;
    b[14] = 40;
    for (int i = 0; i < 4; ++i) {
        b[18 + i] = static_cast<char>((width >> (8 * i)) & 0xFF);
        b[22 + i] = static_cast<char>((height >> (8 * i)) & 0xFF);
    }
    b[26] = 1;
    b[28] = 24;
    return b;
}

// The same JPEG with an EXIF orientation tag (6 = turn 90 degrees clockwise).
inline QByteArray WithOrientation(const QByteArray& jpeg, int orientation) {
    QByteArray exif("Exif\0\0", 6);
    const char tiff[] = {'I', 'I', 42, 0, 8, 0, 0, 0, 1, 0, 0x12, 0x01, 3, 0, 1, 0, 0, 0,
                         static_cast<char>(orientation), 0, 0, 0, 0, 0, 0, 0};
    exif.append(tiff, sizeof tiff);
    QByteArray segment("\xFF\xE1", 2);
    const int length = static_cast<int>(exif.size()) + 2;
    segment.append(static_cast<char>(length >> 8));
    segment.append(static_cast<char>(length & 0xFF));
    segment.append(exif);
    return jpeg.left(2) + segment + jpeg.mid(2);
}

} // namespace storetest
