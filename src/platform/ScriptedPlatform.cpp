#include "platform/ScriptedPlatform.h"

#include <QCoreApplication>
#include <QDialog>

namespace platform {

namespace {
template <typename T>
T TakeOr(std::deque<T>& queue, T fallback) {
    if (queue.empty()) return fallback;
    T value = std::move(queue.front());
    queue.pop_front();
    return value;
}
} // namespace

Answer ScriptedPlatform::message(QWidget*, const Message& m) {
    messages.append(m);
    const Answer first = (m.buttons == Buttons::YesNo || m.buttons == Buttons::YesNoCancel) ? Answer::Yes : Answer::Ok;
    return TakeOr(answers, first);
}

FileChoice ScriptedPlatform::openFile(QWidget*, const FileRequest& r) {
    openRequests.append(r);
    return TakeOr(openChoices, FileChoice{});
}

FileChoice ScriptedPlatform::saveFile(QWidget*, const FileRequest& r) {
    saveRequests.append(r);
    return TakeOr(saveChoices, FileChoice{});
}

std::optional<int32_t> ScriptedPlatform::chooseColor(QWidget*, int32_t start) {
    colorStarts.append(start);
    return TakeOr(colors, std::optional<int32_t>{});
}

bool ScriptedPlatform::choosePrinter(QWidget*, QPrinter& printer, int flags) {
    ++printerRequests;
    printerFlags.append(flags);
    if (preparePrinter) preparePrinter(printer);
    return TakeOr(printers, false);
}

int ScriptedPlatform::execDialog(QDialog& dialog) {
    ++dialogCount;
    auto script = TakeOr(dialogs, std::function<int(QDialog&)>{});
    return script ? script(dialog) : static_cast<int>(QDialog::Rejected);
}

bool ScriptedPlatform::openUrl(const QUrl& url) {
    urls.append(url);
    return true;
}

void ScriptedPlatform::beep() { ++beeps; }

void ScriptedPlatform::processEvents(int rounds) {
    eventRounds += rounds;
    QCoreApplication::processEvents();
}

} // namespace platform
