// The work picture's mouse handlers: Qt positions in, engine calls out.
#include "paint/qt/PictureView.h"
#include "shell/TintrollaForm.h"

void TintrollaForm::Picture1_MouseDown(int button, float x, float y) { engine().MouseDown(button, x, y); }
void TintrollaForm::Picture1_MouseMove(int buttons, float x, float y) { engine().MouseMove(buttons, x, y); }
void TintrollaForm::Picture1_MouseUp(int button, float x, float y) { engine().MouseUp(button, x, y); }
