#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "shell/TintrollaForm.h"

// The work picture shows the pointer of the tool state: the system no-drop
// pointer while the selected box has no colour, the tool's own icon (hot spot
// where the tool touches the picture) otherwise, the eraser while the right
// button is held, and the plain pointer on the title screen.
void TintrollaForm::applyPictureCursor() {
    if (!Picture1) return;
    const PictureCursor cursor = workspace().Cursor;
    if (cursor == PictureCursor::Default)
        Picture1->unsetCursor();
    else
        Picture1->setCursor(artwork::PictureCursorShape(cursor));
}
