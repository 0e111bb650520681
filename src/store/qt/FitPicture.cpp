#include "store/qt/FitPicture.h"

#include "store/Fit.h"

namespace store {

Picture FitPicture(const imaging::DecodedPicture& photo, bool autoCrop, int width, int height) {
    const QImage& image = photo.image;
    if (image.isNull()) return Picture(width, height);
    const QSize full = photo.fullSize.isValid() ? photo.fullSize : image.size();
    const SourceRect r = FitSource(full.width(), full.height(), width, height, autoCrop);
    // The crop is worked out on the full size; a reduced-scale decode is the
    // same photo with fewer pixels.
    const double sx = static_cast<double>(image.width()) / full.width();
    const double sy = static_cast<double>(image.height()) / full.height();
    const PixelBuffer buffer{reinterpret_cast<const uint32_t*>(image.constBits()), image.width(), image.height(),
                             static_cast<int>(image.bytesPerLine() / 4)};
    return ResampleArea(buffer, r.x * sx, r.y * sy, r.width * sx, r.height * sy, width, height);
}

} // namespace store
