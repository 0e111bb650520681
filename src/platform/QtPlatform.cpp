#include "platform/QtPlatform.h"

#include <QApplication>
#include <QColorDialog>
#include <QCoreApplication>
#include <QDesktopServices>
#include <QDialog>
#include <QFileDialog>
#include <QHeaderView>
#include <QLabel>
#include <QLayout>
#include <QMessageBox>
#include <QPalette>
#include <QPrintDialog>
#include <QPrinter>
#include <QScreen>
#include <QTreeView>
#include <algorithm>
#include <cmath>

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

namespace {

// A message box that keeps each line of its text on one line. Qt sizes a
// box to at most about half the screen and wraps what is longer; the help
// topics have lines beyond that.
class LineKeepingMessageBox : public QMessageBox {
public:
    using QMessageBox::QMessageBox;

protected:
    void showEvent(QShowEvent* event) override {
        QMessageBox::showEvent(event);  // Qt's own sizing first
        auto* label = findChild<QLabel*>(QStringLiteral("qt_msgbox_label"));
        if (!label || !layout()) return;
        // The longest line as the label's font lays it out, in whole pixels
        // rounded up, plus the label's own margins and two letters of air.
        const QFontMetricsF fm(label->font());
        qreal longest = 0;
        for (const QString& line : text().split('\n')) longest = std::max(longest, fm.horizontalAdvance(line));
        const QMargins margins = label->contentsMargins();
        const int needed = static_cast<int>(std::ceil(longest + 2 * fm.averageCharWidth())) + margins.left() + margins.right() + 2 * label->margin();
        // Only a screen too narrow for the line makes it wrap.
        const int room = screen() ? screen()->availableGeometry().width() * 9 / 10 : width();
        // The icon, the spacing and the box's margins beside the label.
        const int others = layout()->totalMinimumSize().width() - label->minimumSizeHint().width();
        label->setMinimumWidth(std::min(needed, room - others));
        const int wide = std::max(width(), layout()->totalMinimumSize().width());
        const int high = layout()->hasHeightForWidth() ? layout()->totalHeightForWidth(wide)
                                                        : layout()->totalMinimumSize().height();
        setFixedSize(wide, high);
    }
};

} // namespace

std::unique_ptr<QMessageBox> MakeMessageBox(QWidget* parent, const Message& m) {
    auto box = std::make_unique<LineKeepingMessageBox>(parent);
    box->setWindowTitle(m.title);
    // The program's texts are plain ("<Enter>" is a key, not a tag); lines
    // are joined by CR LF, which Qt shows as one break.
    box->setTextFormat(Qt::PlainText);
    box->setText(QString(m.text).replace(QStringLiteral("\r\n"), QStringLiteral("\n")));
    switch (m.icon) {
    case Icon::None: box->setIcon(QMessageBox::NoIcon); break;
    case Icon::Exclamation: box->setIcon(QMessageBox::Warning); break;
    case Icon::Question: box->setIcon(QMessageBox::Question); break;
    case Icon::Information: box->setIcon(QMessageBox::Information); break;
    case Icon::Critical: box->setIcon(QMessageBox::Critical); break;
    }
    switch (m.buttons) {
    case Buttons::Ok: box->setStandardButtons(QMessageBox::Ok); break;
    case Buttons::OkCancel: box->setStandardButtons(QMessageBox::Ok | QMessageBox::Cancel); break;
    case Buttons::YesNo: box->setStandardButtons(QMessageBox::Yes | QMessageBox::No); break;
    case Buttons::YesNoCancel:
        box->setStandardButtons(QMessageBox::Yes | QMessageBox::No | QMessageBox::Cancel);
        break;
    }
    return box;
}

Answer QtPlatform::message(QWidget* parent, const Message& m) {
    const std::unique_ptr<QMessageBox> box = MakeMessageBox(parent, m);
    switch (box->exec()) {
    case QMessageBox::Yes: return Answer::Yes;
    case QMessageBox::No: return Answer::No;
    case QMessageBox::Ok: return Answer::Ok;
    default: return Answer::Cancel;
    }
}

void PrepareFileDialog(QFileDialog& dialog) {
    dialog.setViewMode(QFileDialog::Detail);
    // Room for a long picture name beside its size, type and date, and for
    // a screenful of names; never more than the screen.
    const QFontMetrics fm = dialog.fontMetrics();
    const int letter = fm.horizontalAdvance(QLatin1Char('n'));  // a lower-case letter, as names mostly are
    QSize size(letter * 120, fm.lineSpacing() * 32);
    if (const QScreen* screen = dialog.screen())
        size = size.boundedTo(screen->availableGeometry().size() * 9 / 10);
    dialog.resize(size.expandedTo(dialog.minimumSizeHint()));
    // Qt's own dialog: name, size, type and date columns wide enough to read.
    if (auto* files = dialog.findChild<QTreeView*>(QStringLiteral("treeView"))) {
        const int widths[] = {46, 11, 22, 24};
        for (int column = 0; column < 4; ++column) files->header()->resizeSection(column, widths[column] * letter);
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
    PrepareFileDialog(dialog);
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
