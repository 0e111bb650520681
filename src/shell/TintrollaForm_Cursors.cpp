// Placeholder: the work picture's cursors are set here.
#include "shell/TintrollaForm.h"

void TintrollaForm::applyPictureCursor() {}
