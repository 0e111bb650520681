// Placeholder: the colour-cycling title screen is drawn here.
#include "shell/TintrollaForm.h"

void TintrollaForm::DrawTitleScreen() {}
void TintrollaForm::PrintAt(int, int, const QString&) {}
void TintrollaForm::AboutMenuItem_Click() {}
