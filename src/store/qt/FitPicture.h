#pragma once
#include "imaging/qt/PictureDecoder.h"
#include "paint/Picture.h"

namespace store {

// The decoded photo drawn into a 400 x 300 work picture: stretched, or
// auto-cropped to 4:3 by the crop arithmetic on the photo's full size, with
// smooth area averaging.
Picture FitPicture(const imaging::DecodedPicture& photo, bool autoCrop, int width = 400, int height = 300);

} // namespace store
