// Placeholder: the colour boxes, renaming and scheme files.
#include "shell/TintrollaForm.h"

void TintrollaForm::buildColorBoxes() {}
void TintrollaForm::syncColorBoxes() {}
void TintrollaForm::PictureColor_MouseDown(int, int) {}
void TintrollaForm::PictureColor_MouseUp(int, int) {}
void TintrollaForm::PictureColor_DblClick(int) {}
void TintrollaForm::NewColourMenuItem_Click() {}
void TintrollaForm::ClearAllColorsMenuItem_Click() {}
void TintrollaForm::commitRename() {}
void TintrollaForm::cancelRename() {}
void TintrollaForm::LoadSchemeMenuItem_Click() {}
void TintrollaForm::SaveSchemeMenuItem_Click() {}
bool TintrollaForm::ReadColorScheme(const QString&) { return false; }
bool TintrollaForm::WriteColorScheme(const QString&) { return false; }
