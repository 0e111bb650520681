#include "platform/QtPlatform.h"

#include <QApplication>
#include <QColorDialog>
#include <QCoreApplication>
#include <QDesktopServices>
#include <QDialog>
#include <QFileDialog>
#include <QMessageBox>
#include <QPalette>
#include <QPrintDialog>
#include <QPrinter>

namespace platform {

QStringList QtFilters(const QString& filter) {
    QStringList out;
    const QStringList parts = filter.split('|');
    for (int i = 0; i + 1 < parts.size(); i += 2) {
        QString patterns = parts[i + 1].trimmed();
        patterns.replace(';', ' ');
        // "JPEG Picture Format (*.jpg)" already names its patterns: not twice.
        const QString text = parts[i].trimmed();
        out << (text.endsWith(QStringLiteral("(%1)").arg(patterns)) ? text : QStringLiteral("%1 (%2)").arg(text, patterns));
    }
    return out;
}

Answer QtPlatform::message(QWidget* parent, const Message& m) {
    QMessageBox box(parent);
    box.setWindowTitle(m.title);
    box.setText(m.text);
    switch (m.icon) {
    case Icon::None: box.setIcon(QMessageBox::NoIcon); break;
    case Icon::Exclamation: box.setIcon(QMessageBox::Warning); break;
    case Icon::Question: box.setIcon(QMessageBox::Question); break;
    case Icon::Information: box.setIcon(QMessageBox::Information); break;
    case Icon::Critical: box.setIcon(QMessageBox::Critical); break;
    }
    switch (m.buttons) {
    case Buttons::Ok: box.setStandardButtons(QMessageBox::Ok); break;
    case Buttons::OkCancel: box.setStandardButtons(QMessageBox::Ok | QMessageBox::Cancel); break;
    case Buttons::YesNo: box.setStandardButtons(QMessageBox::Yes | QMessageBox::No); break;
    case Buttons::YesNoCancel:
        box.setStandardButtons(QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
        break;
    }
    switch (box.exec()) {
    case QMessageBox::Yes: return Answer::Yes;
    case QMessageBox::No: return Answer::No;
    case QMessageBox::Ok: return Answer::Ok;
    default: return Answer::Cancel;
    }
}

namespace {
FileChoice RunFileDialog(QWidget* parent, const FileRequest& r, QFileDialog::AcceptMode mode) {
    QFileDialog dialog(parent, r.title, r.initialFolder);
    dialog.setAcceptMode(mode);
    dialog.setFileMode(mode == QFileDialog::AcceptOpen ? QFileDialog::ExistingFile : QFileDialog::AnyFile);
    const QStringList filters = QtFilters(r.filter);
    dialog.setNameFilters(filters);
    if (mode == QFileDialog::AcceptSave) dialog.setOption(QFileDialog::DontConfirmOverwrite, true);
    if (!r.fileName.isEmpty()) dialog.selectFile(r.fileName);
    FileChoice choice;
    if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty()) return choice;
    choice.cancelled = false;
    choice.fileName = dialog.selectedFiles().constFirst();
    choice.filterIndex = std::max<int>(1, static_cast<int>(filters.indexOf(dialog.selectedNameFilter())) + 1);
    return choice;
}
} // namespace

FileChoice QtPlatform::openFile(QWidget* parent, const FileRequest& r) {
    return RunFileDialog(parent, r, QFileDialog::AcceptOpen);
}

FileChoice QtPlatform::saveFile(QWidget* parent, const FileRequest& r) {
    return RunFileDialog(parent, r, QFileDialog::AcceptSave);
}

std::optional<int32_t> QtPlatform::chooseColor(QWidget* parent, int32_t start) {
    // A box without colour holds the button-face value: start from that colour.
    const bool none = start == static_cast<int32_t>(0x8000000Fu);
    const QColor initial = none ? QPalette().color(QPalette::Button)
                                : QColor(start & 0xFF, (start >> 8) & 0xFF, (start >> 16) & 0xFF);
    QColorDialog dialog(initial, parent);
    if (dialog.exec() != QDialog::Accepted) return std::nullopt;
    const QColor c = dialog.selectedColor();
    return c.red() + 256 * c.green() + 65536 * c.blue();
}

bool QtPlatform::choosePrinter(QWidget* parent, QPrinter& printer, int flags) {
    QPrintDialog dialog(&printer, parent);
    // &H4 hides the selection, &H8 the page numbers. The hide-print-to-file
    // flag (&H100000) is about a raw printer file, which Qt's dialog does not
    // offer; its "Print to File (PDF)" stays, as many desktops have no printer.
    dialog.setOption(QAbstractPrintDialog::PrintSelection, (flags & 0x4) == 0);
    dialog.setOption(QAbstractPrintDialog::PrintPageRange, (flags & 0x8) == 0);
    dialog.setOption(QAbstractPrintDialog::PrintCurrentPage, false);
    dialog.setOption(QAbstractPrintDialog::PrintToFile, true);
    return dialog.exec() == QDialog::Accepted;
}

int QtPlatform::execDialog(QDialog& dialog) { return dialog.exec(); }

bool QtPlatform::openUrl(const QUrl& url) { return QDesktopServices::openUrl(url); }

void QtPlatform::beep() { QApplication::beep(); }

void QtPlatform::processEvents(int rounds) {
    for (int i = 0; i < rounds; ++i) QCoreApplication::processEvents();
}

} // namespace platform
