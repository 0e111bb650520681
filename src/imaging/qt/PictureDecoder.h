#pragma once
#include <QByteArray>
#include <QImage>
#include <QSize>
#include <QString>

// Turns picture files (BMP, JPEG, GIF) and clipboard images into upright
// RGB32 images, refusing broken, cut-off and absurdly large pictures before
// they cost a crash, a hang or a huge allocation.
namespace imaging {

// Larger pictures are refused: about 100 megapixels.
inline constexpr qint64 kMaxPicturePixels = 100'000'000;
// Files larger than this are not read at all.
inline constexpr qint64 kMaxPictureFileBytes = 512LL * 1024 * 1024;

struct DecodedPicture {
    QImage image;    // upright, RGB32; may be a reduced-scale copy
    QSize fullSize;  // the upright size the picture really has
    QString error;   // empty when decoded
    bool ok() const { return error.isEmpty() && !image.isNull(); }
};

// Decodes a file. With `reduceFor` valid, a JPEG much larger than it is
// decoded at 1/2, 1/4 or 1/8 scale, keeping at least twice `reduceFor` in
// each direction; other kinds are decoded at full size.
DecodedPicture DecodePictureFile(const QString& path, QSize reduceFor = QSize(400, 300));
DecodedPicture DecodePictureData(const QByteArray& data, QSize reduceFor = QSize(400, 300));

// A picture already in memory (the clipboard's), under the same size limit.
DecodedPicture DecodedFromImage(const QImage& image);

// The reduction chosen for an upright size: 1, 2, 4 or 8.
int ReductionFor(QSize upright, QSize reduceFor);

} // namespace imaging
