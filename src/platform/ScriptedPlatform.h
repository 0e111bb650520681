#pragma once
#include <QList>
#include <deque>
#include <functional>

#include "platform/Platform.h"

namespace platform {

// A platform for tests: every question is recorded and answered from a
// script queued beforehand. An unscripted message gets its first button
// (Ok or Yes); an unscripted dialog is cancelled.
class ScriptedPlatform : public Platform {
public:
    // --- what to answer ---
    std::deque<Answer> answers;
    std::deque<FileChoice> openChoices;
    std::deque<FileChoice> saveChoices;
    std::deque<std::optional<int32_t>> colors;
    std::deque<bool> printers;
    // Runs against the real dialog object (fill its fields, then return
    // QDialog::Accepted or Rejected).
    std::deque<std::function<int(QDialog&)>> dialogs;
    // Called by choosePrinter before it answers, e.g. to print to a PDF file.
    std::function<void(QPrinter&)> preparePrinter;

    // --- what was asked ---
    QList<Message> messages;
    QList<FileRequest> openRequests;
    QList<FileRequest> saveRequests;
    QList<int32_t> colorStarts;
    QList<QUrl> urls;
    int printerRequests = 0;
    QList<int> printerFlags;
    int dialogCount = 0;
    int beeps = 0;
    int eventRounds = 0;

    Answer message(QWidget* parent, const Message& message) override;
    FileChoice openFile(QWidget* parent, const FileRequest& request) override;
    FileChoice saveFile(QWidget* parent, const FileRequest& request) override;
    std::optional<int32_t> chooseColor(QWidget* parent, int32_t start) override;
    bool choosePrinter(QWidget* parent, QPrinter& printer, int flags) override;
    int execDialog(QDialog& dialog) override;
    bool openUrl(const QUrl& url) override;
    void beep() override;
    void processEvents(int rounds) override;
};

} // namespace platform
