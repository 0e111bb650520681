#include "scheme/qt/ColorNameEdit.h"

#include <QKeyEvent>

void ColorNameEdit::keyPressEvent(QKeyEvent* event) {
    switch (event->key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        event->accept();
        emit commitRequested();
        return;
    case Qt::Key_Escape:
        event->accept();
        emit cancelRequested();
        return;
    default:
        QLineEdit::keyPressEvent(event);
    }
}

// A menu or the text box's own context menu opening, or another program
// becoming active, is not the user leaving the name.
void ColorNameEdit::focusOutEvent(QFocusEvent* event) {
    QLineEdit::focusOutEvent(event);
    if (event->reason() == Qt::PopupFocusReason || event->reason() == Qt::ActiveWindowFocusReason) return;
    emit commitRequested();
}

bool DoubleClickWatcher::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::MouseButtonDblClick && watched == parent()) {
        onDoubleClick_();
        return true;
    }
    return QObject::eventFilter(watched, event);
}
