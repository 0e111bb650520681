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

void ColorNameEdit::focusOutEvent(QFocusEvent* event) {
    QLineEdit::focusOutEvent(event);
    emit commitRequested();
}

bool DoubleClickWatcher::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::MouseButtonDblClick && watched == parent()) {
        onDoubleClick_();
        return true;
    }
    return QObject::eventFilter(watched, event);
}
