#pragma once
#include <QImage>

#include "paint/Picture.h"

// Lets QPainter draw straight into a picture buffer. A picture holds
// red + 256 x green + 65536 x blue with a zero top byte; the wrapper sees the
// same memory as RGBX bytes. Drawing sets the top byte, so SealPicture must
// run once the painter is done to give the engine clean colour values again.
QImage WrapPicture(Picture& picture);
void SealPicture(Picture& picture);
