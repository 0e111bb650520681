// Placeholder: the picture browser, opening, saving and deleting.
#include "shell/TintrollaForm.h"

void TintrollaForm::buildBrowser() {}
void TintrollaForm::ShowPicsFolder() {}
void TintrollaForm::ShowDesktopFolder() {}
void TintrollaForm::SetFileListPattern() {}
void TintrollaForm::Dir1_Change() {}
void TintrollaForm::Drive1_Change() {}
void TintrollaForm::File1_Click() {}
void TintrollaForm::OpenFromFileMenuItem_Click() {}
void TintrollaForm::OpenFromClipboardMenuItem_Click() {}
void TintrollaForm::OpenPicture() {}
void TintrollaForm::SaveWork() {}
void TintrollaForm::DeletePicture() {}
