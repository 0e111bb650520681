// Placeholder: the menus are built here.
#include "shell/TintrollaForm.h"

void TintrollaForm::buildMenus() {}
void TintrollaForm::updateMenus() {}
