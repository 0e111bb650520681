#pragma once
#include <QObject>
#include <QWidget>
#include <functional>

// Menu enabling is worked out when a menu opens. A shortcut reaches its item
// without opening the menu, so this watcher runs the same work just before
// Qt looks a shortcut up (the shortcut-override step of a key press) in the
// window it belongs to: a shortcut then acts exactly when its item would be
// enabled in the opened menu.
class MenuShortcutWatcher : public QObject {
public:
    MenuShortcutWatcher(QWidget* window, std::function<void()> update);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* window_;
    std::function<void()> update_;
};
