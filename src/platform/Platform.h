#pragma once
#include <QString>
#include <QUrl>
#include <functional>
#include <optional>

class QDialog;
class QPrinter;
class QWidget;

// Everything that waits for the user or talks to the desktop goes through
// this interface: message boxes, the common dialogs, our own modal forms,
// the browser and the event pump. The program uses QtPlatform; tests answer
// from a script (ScriptedPlatform) so no real modal window ever opens.
namespace platform {

enum class Buttons { Ok, OkCancel, YesNo, YesNoCancel };
enum class Icon { None, Exclamation, Question, Information, Critical };
enum class Answer { Ok, Cancel, Yes, No };

struct Message {
    QString title;
    QString text;
    Buttons buttons = Buttons::Ok;
    Icon icon = Icon::None;
};

// An open or save dialog. `filter` is written as "Text|*.a;*.b|Text|*.*";
// `flags` keeps the dialog flags the program asks for (4 = hide read-only).
struct FileRequest {
    QString title;
    QString filter;
    QString initialFolder;
    QString fileName;
    QString defaultExtension;
    int flags = 0;
};

// Cancel is a result, never an exception.
struct FileChoice {
    bool cancelled = true;
    QString fileName;
    int filterIndex = 1;  // 1-based, as the filter lists them
};

class Platform {
public:
    virtual ~Platform() = default;

    virtual Answer message(QWidget* parent, const Message& message) = 0;
    virtual FileChoice openFile(QWidget* parent, const FileRequest& request) = 0;
    virtual FileChoice saveFile(QWidget* parent, const FileRequest& request) = 0;
    // The colour dialog, opened on `start` with the custom-colour part shown.
    // nullopt when cancelled.
    virtual std::optional<int32_t> chooseColor(QWidget* parent, int32_t start) = 0;
    // The printer dialog; false when cancelled. `flags` as the program asks.
    virtual bool choosePrinter(QWidget* parent, QPrinter& printer, int flags) = 0;
    // Shows one of the program's own modal forms and returns its result code.
    virtual int execDialog(QDialog& dialog) = 0;
    // Hands a web address to the desktop's browser; false when that failed.
    virtual bool openUrl(const QUrl& url) = 0;
    virtual void beep() = 0;
    // Lets pending window events run, `rounds` times.
    virtual void processEvents(int rounds = 1) = 0;
};

} // namespace platform
