#include "shell/MenuShortcutWatcher.h"

#include <QCoreApplication>
#include <QEvent>
#include <QWindow>

MenuShortcutWatcher::MenuShortcutWatcher(QWidget* window, std::function<void()> update)
    : QObject(window), window_(window), update_(std::move(update)) {
    QCoreApplication::instance()->installEventFilter(this);
}

bool MenuShortcutWatcher::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() != QEvent::ShortcutOverride) return false;
    bool ours = false;
    if (auto* widget = qobject_cast<QWidget*>(watched))
        ours = widget->window() == window_;
    else if (auto* window = qobject_cast<QWindow*>(watched))
        ours = window == window_->windowHandle();
    if (ours) update_();
    return false;
}
