#pragma once
#include "platform/Platform.h"

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

} // namespace platform
