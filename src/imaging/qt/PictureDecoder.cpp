#include "imaging/qt/PictureDecoder.h"

#include <QBuffer>
#include <QCoreApplication>
#include <QFile>
#include <QImageIOHandler>
#include <QImageReader>

#include "store/PictureCheck.h"

namespace imaging {

namespace {
QString Tr(const char* text) { return QString::fromUtf8(text); }

QString TooLarge(QSize size) {
    return QStringLiteral("The picture is too large to open (%1 x %2 pixels).").arg(size.width()).arg(size.height());
}

bool WithinLimit(QSize size) {
    return size.width() > 0 && size.height() > 0 &&
           static_cast<qint64>(size.width()) * size.height() <= kMaxPicturePixels;
}

QImage ReadImage(const QByteArray& data, QSize scaled, QString& error) {
    QBuffer buffer;
    buffer.setData(data);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer);
    reader.setAutoTransform(true);
    if (scaled.isValid()) reader.setScaledSize(scaled);
    QImage image = reader.read();
    if (image.isNull()) error = reader.errorString();
    return image;
}
} // namespace

int ReductionFor(QSize upright, QSize reduceFor) {
    if (!reduceFor.isValid() || reduceFor.isEmpty()) return 1;
    for (int k : {8, 4, 2}) {
        const int w = (upright.width() + k - 1) / k;
        const int h = (upright.height() + k - 1) / k;
        if (w >= 2 * reduceFor.width() && h >= 2 * reduceFor.height()) return k;
    }
    return 1;
}

DecodedPicture DecodePictureData(const QByteArray& data, QSize reduceFor) {
    DecodedPicture out;
    // A reading limit for the pictures we accept (4 bytes a pixel).
    if (QImageReader::allocationLimit() < 512) QImageReader::setAllocationLimit(512);

    QBuffer buffer;
    buffer.setData(data);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer);
    reader.setAutoTransform(true);
    if (data.isEmpty() || !reader.canRead()) {
        out.error = Tr("The file is not a picture that can be opened (BMP, JPG or GIF).");
        return out;
    }
    const QSize stored = reader.size();
    if (!stored.isValid() || stored.isEmpty()) {
        out.error = Tr("The picture's size cannot be read.");
        return out;
    }
    const bool turned = reader.transformation() & QImageIOHandler::TransformationRotate90;
    const QSize upright = turned ? stored.transposed() : stored;
    out.fullSize = upright;
    if (!WithinLimit(upright)) {
        out.error = TooLarge(upright);
        return out;
    }
    const QByteArray format = reader.format();
    const std::string incomplete = store::CheckComplete(
        std::span<const uint8_t>(reinterpret_cast<const uint8_t*>(data.constData()), static_cast<size_t>(data.size())));
    if (!incomplete.empty()) {
        out.error = QString::fromStdString(incomplete);
        return out;
    }

    // Large JPEGs are decoded at reduced scale; the reader takes the scaled
    // size in the stored orientation and turns the result upright afterwards.
    const int k = (format == "jpeg" && reader.supportsOption(QImageIOHandler::ScaledSize)) ? ReductionFor(upright, reduceFor) : 1;
    QImage image;
    if (k > 1) {
        const QSize scaled((stored.width() + k - 1) / k, (stored.height() + k - 1) / k);
        const QSize expected = turned ? scaled.transposed() : scaled;
        QString ignored;
        image = ReadImage(data, scaled, ignored);
        if (image.size() != expected) image = QImage();  // a reader that turns first: read whole
    }
    if (image.isNull()) image = ReadImage(data, QSize(), out.error);
    if (image.isNull()) {
        if (out.error.isEmpty()) out.error = Tr("The picture cannot be decoded.");
        return out;
    }
    out.error.clear();
    out.image = image.convertToFormat(QImage::Format_RGB32);
    return out;
}

DecodedPicture DecodePictureFile(const QString& path, QSize reduceFor) {
    DecodedPicture out;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        out.error = file.errorString();
        return out;
    }
    if (file.size() > kMaxPictureFileBytes) {
        out.error = Tr("The picture file is too large to open.");
        return out;
    }
    const QByteArray data = file.readAll();
    if (file.error() != QFileDevice::NoError) {
        out.error = file.errorString();
        return out;
    }
    return DecodePictureData(data, reduceFor);
}

DecodedPicture DecodedFromImage(const QImage& image) {
    DecodedPicture out;
    out.fullSize = image.size();
    if (image.isNull()) {
        out.error = Tr("There is no picture to open.");
        return out;
    }
    if (!WithinLimit(image.size())) {
        out.error = TooLarge(image.size());
        return out;
    }
    out.image = image.convertToFormat(QImage::Format_RGB32);
    return out;
}

} // namespace imaging
