#include <QCheckBox>
#include <QLocale>
#include <QPrinter>
#include <exception>

#include "paint/qt/PictureView.h"
#include "print/qt/SheetPrinter.h"
#include "shell/TintrollaForm.h"
#include "store/qt/QtPaths.h"

namespace {
// No selection, no page numbers, no print to file. The last meant a raw
// printer file; Qt's dialog offers none, and its PDF file stays available,
// as many desktops here have no printer at all.
constexpr int kPrinterDialogFlags = 0x10000C;

const QString kPrintTitle = QStringLiteral("Warning - Print");
const QString kCrLf = QStringLiteral("\r\n");

// The hourglass over the window and the work picture while it lives; the
// window's pointer and the tool's cursor come back however printing ends.
class Hourglass {
public:
    explicit Hourglass(TintrollaForm& form) : form_(form) {
        form_.setCursor(Qt::WaitCursor);
        form_.Picture1->setCursor(Qt::WaitCursor);
    }
    ~Hourglass() {
        form_.unsetCursor();
        form_.UpdatePictureCursor();
    }
    Hourglass(const Hourglass&) = delete;
    Hourglass& operator=(const Hourglass&) = delete;

private:
    TintrollaForm& form_;
};
} // namespace

print::SheetContent TintrollaForm::paintChoiceContent() const {
    print::SheetContent content;
    content.pictureName = print::SheetPictureName(CurrentPicturePath.toStdString());
    content.date = QLocale().toString(Today(), QLocale::LongFormat).toStdString();
    content.boxes = ws_->Boxes;
    content.maxX = ws_->MaxX;
    content.maxY = ws_->MaxY;
    return content;
}

void TintrollaForm::PrintMenuItem_Click() {
    Workspace& ws = workspace();
    // A picture still being built (the toolbar button stays enabled through
    // a load) is not printed half done.
    if (!ws.PictureLoaded || ws.LoadingPicture) {
        UpdatePictureCursor();
        return;
    }
    QPrinter printer(QPrinter::HighResolution);
    if (!platformLayer().choosePrinter(this, printer, kPrinterDialogFlags)) {
        UpdatePictureCursor();
        return;
    }

    bool printed = false;
    {
        const Hourglass hourglass(*this);
        // The sheet always shows the blended view; the screen goes back to plain after.
        const bool plain = !BlendEdgesCheckbox->isChecked();
        try {
            if (plain) engine().RenderEdges(2);
            printed = print::PrintPaintChoiceSheet(printer, paintChoiceContent(), ToQImage(ws.Picture1));
        } catch (const std::exception&) {
            printed = false;
        }
        if (plain) engine().RenderEdges(1);
    }
    // A sheet that never reached the printer or its file is not passed over in silence.
    if (!printed) {
        const QString where = printer.outputFileName().isEmpty() ? printer.printerName() : printer.outputFileName();
        Ask(kPrintTitle, QStringLiteral("Unable to print the Paint Choice sheet.") + (where.isEmpty() ? QString() : kCrLf + where),
            platform::Buttons::Ok, platform::Icon::Exclamation);
    }
}
