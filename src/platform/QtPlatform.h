#pragma once
#include <memory>

#include "platform/Platform.h"

class QFileDialog;
class QMessageBox;

namespace platform {

// The real desktop: Qt's message boxes and dialogs.
class QtPlatform : public Platform {
public:
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

// "Text|*.a;*.b|All|*.*" as Qt filter strings ("Text (*.a *.b)").
QStringList QtFilters(const QString& filter);

// The message box QtPlatform shows for `message`, not yet shown. Once shown
// it is wide enough for the longest line of the text, so that no line wraps
// inside itself while the screen has room.
std::unique_ptr<QMessageBox> MakeMessageBox(QWidget* parent, const Message& message);

// Every open, save and export dialog passes through here before it is shown:
// Qt's own dialog opens at a size where names, sizes and dates can be read.
// The desktop's dialog is used wherever the platform theme offers one.
void PrepareFileDialog(QFileDialog& dialog);

} // namespace platform
