#include <QCheckBox>

#include "shell/TintrollaForm.h"

// The check boxes hold the options; their values reach the workspace through
// their toggled signal before these handlers run.

void TintrollaForm::AutoCropCheckbox_Click() {
    // Opens the selected picture again, now cut or stretched as chosen.
    File1_Click();
}

void TintrollaForm::BlendEdgesCheckbox_Click() {
    endPickupAndSetReference();
    engine().RenderEdges(0);  // blend or restore by the check box
}

void TintrollaForm::ExpandEdgesCheckbox_Click() {
    endPickupAndSetReference();
}

void TintrollaForm::ProtectPaintCheckbox_Click() {
    endPickupAndSetReference();
}
