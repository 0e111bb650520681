// Placeholder: the toolbar is built here.
#include <QAction>
#include <QToolBar>

#include "shell/TintrollaForm.h"

void TintrollaForm::buildToolbar() {}
void TintrollaForm::Toolbar1_ButtonClick(const QString&) {}

void TintrollaForm::setToolbarButtonEnabled(const QString& key, bool enabled) {
    if (QAction* a = toolbarButtons.value(key)) a->setEnabled(enabled);
}

bool TintrollaForm::toolbarButtonEnabled(const QString& key) const {
    const QAction* a = toolbarButtons.value(key);
    return a && a->isEnabled();
}

void TintrollaForm::syncToolbar() {
    setToolbarButtonEnabled(QStringLiteral("Undo"), workspace().UndoEnabled);
    setToolbarButtonEnabled(QStringLiteral("Redo"), workspace().RedoEnabled);
}
