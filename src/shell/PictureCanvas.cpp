#include "shell/PictureCanvas.h"

#include <bit>

static_assert(std::endian::native == std::endian::little,
              "a colour value's bytes are red, green, blue in memory order");

QImage WrapPicture(Picture& picture) {
    return QImage(reinterpret_cast<uchar*>(picture.data()), picture.width(), picture.height(),
                  static_cast<qsizetype>(picture.width()) * 4, QImage::Format_RGBX8888);
}

void SealPicture(Picture& picture) {
    int32_t* p = picture.data();
    const size_t count = static_cast<size_t>(picture.width()) * static_cast<size_t>(picture.height());
    for (size_t i = 0; i < count; ++i) p[i] &= 0xFFFFFF;
}
