#pragma once
#include <QLineEdit>
#include <functional>

class QEvent;

// The text box laid over a colour box while it is renamed. Enter commits and
// Escape cancels (neither reaches the text); losing the focus commits.
class ColorNameEdit : public QLineEdit {
    Q_OBJECT
public:
    using QLineEdit::QLineEdit;

signals:
    void commitRequested();
    void cancelRequested();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
};

// Calls `onDoubleClick` when the watched widget itself is double-clicked.
class DoubleClickWatcher : public QObject {
public:
    DoubleClickWatcher(QObject* parent, std::function<void()> onDoubleClick)
        : QObject(parent), onDoubleClick_(std::move(onDoubleClick)) {}

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    std::function<void()> onDoubleClick_;
};
