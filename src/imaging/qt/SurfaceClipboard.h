#pragma once

#include "imaging/DibSurface.h"
#include "platform/Platform.h"

class QWidget;

namespace imaging {

// Puts the surface on the clipboard as an image (the clipboard is emptied
// first). Only the bitmap form is offered: with bAsDIB the user is told so
// and the clipboard stays as it was. True when the image went on.
bool CopyToClipboard(const DibSurface& surface, platform::Platform& platform, QWidget* parent, bool bAsDIB = false);

} // namespace imaging
