#pragma once
#include <QString>

#include "paint/Picture.h"
#include "store/SafeFile.h"

namespace imaging {

// The picture as a 24-bit Windows bitmap file, through Qt's BMP writer.
// False (with `error`) when the writer fails or does not give 24 bits.
bool EncodeBmp24(const Picture& picture, store::Bytes& bytes, QString& error);

} // namespace imaging
