// Placeholder: the option check boxes' click handlers.
#include "shell/TintrollaForm.h"

void TintrollaForm::AutoCropCheckbox_Click() {}
void TintrollaForm::BlendEdgesCheckbox_Click() {}
void TintrollaForm::ExpandEdgesCheckbox_Click() {}
void TintrollaForm::ProtectPaintCheckbox_Click() {}
