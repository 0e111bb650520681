// Printing from the window: the printer dialog through the platform layer, the
// blended view on paper and the plain one back on screen, the hourglass, and
// what the sheet is given to print.
#include <QAction>
#include <QCheckBox>
#include <QClipboard>
#include <QLineEdit>
#include <QLocale>
#include <QPageSize>
#include <QPrinter>
#include <QtTest>

#include "paint/PhotoArt.h"
#include "paint/qt/PictureView.h"
#include "print/qt/PdfReadBack.h"
#include "support/FormFixture.h"

using namespace painttest;

namespace {

// A sunlit wall with a blue door, its left part painted with box 2 and its
// right part with box 5, drawn plain.
void PaintedDoor(FormFixture& f, std::initializer_list<int> moreBoxes = {}) {
    Workspace& ws = f.ws();
    DrawPhoto(ws, Art(300, std::string(400, 'Y')));
    DrawPhoto(ws, Art(40, std::string(60, 'B')), 100, 100);
    DrawMask(ws, Art(40, std::string(30, '1')), 2, 100, 100);
    DrawMask(ws, Art(40, std::string(30, '2')), 5, 130, 100);
    ws.Boxes[2].color = HSLcolor::JoinColor(200, 60, 30);
    ws.Boxes[5].color = HSLcolor::JoinColor(30, 160, 90);
    for (int i : moreBoxes) ws.Boxes[static_cast<size_t>(i)].color = HSLcolor::JoinColor(10 * i, 100, 200);
    for (int i = 1; i <= kColorBoxCount; ++i)
        if (ws.Boxes[static_cast<size_t>(i)].hasColor()) ws.Boxes[static_cast<size_t>(i)].reference = Swatch('B');
    ws.StrokeNumber = 2;
    f.form().engine().RepaintColor(2);
    f.form().engine().RepaintColor(5);
    ws.PictureLoaded = true;
    f.form().CurrentPicturePath = f.picsFolder() + QStringLiteral("/front.bmp");
}

void SetBlendEdges(FormFixture& f, bool on) {
    f.form().BlendEdgesCheckbox->setChecked(on);
    f.form().BlendEdgesCheckbox_Click();
}

// Answers the printer dialog (with a PDF file on `paper`, or cancelled) and prints.
QString Print(FormFixture& f, bool accept, const QString& file = QStringLiteral("sheet.pdf"),
              QPageSize::PageSizeId paper = QPageSize::Letter) {
    const QString path = f.programFolder() + '/' + file;
    f.platform().preparePrinter = [path, paper](QPrinter& printer) {
        printer.setOutputFormat(QPrinter::PdfFormat);
        printer.setOutputFileName(path);
        printer.setPageSize(QPageSize(paper));
    };
    f.platform().printers.push_back(accept);
    f.form().PrintMenuItem_Click();
    return path;
}

// The cursor shapes a widget is given, in order.
class CursorWatch : public QObject {
public:
    explicit CursorWatch(QWidget* widget) { widget->installEventFilter(this); }
    QList<Qt::CursorShape> shapes;
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == QEvent::CursorChange) shapes.append(static_cast<QWidget*>(watched)->cursor().shape());
        return false;
    }
};

} // namespace

class PrintWindowTest : public QObject {
    Q_OBJECT
private slots:
    void blendEdgesOffPrintsTheBlendedViewAndShowsThePlainOneAgain() {
        FormFixture f;
        PaintedDoor(f);
        SetBlendEdges(f, false);
        Workspace& ws = f.ws();
        const Picture plain = ws.Picture1;
        f.form().engine().RenderEdges(2);
        const Picture blended = ws.Picture1;
        f.form().engine().RenderEdges(1);
        QVERIFY(blended != plain);
        QCOMPARE(ws.Picture1, plain);

        CursorWatch form(&f.form()), picture(f.form().Picture1);
        const printtest::PdfContent pdf = printtest::ReadPdf(Print(f, true));
        QVERIFY(pdf.read);
        QCOMPARE(pdf.pages, 1);
        QCOMPARE(pdf.images.size(), 1);
        QCOMPARE(pdf.images[0], ToQImage(blended));
        QCOMPARE(ws.Picture1, plain);
        QCOMPARE(f.form().Picture1->image(), ToQImage(plain));
        QCOMPARE(f.platform().printerFlags, QList<int>({0x10000C}));
        QVERIFY(f.platform().messages.isEmpty());

        // The hourglass came and went.
        QVERIFY(form.shapes.contains(Qt::WaitCursor) && picture.shapes.contains(Qt::WaitCursor));
        QCOMPARE(f.form().cursor().shape(), Qt::ArrowCursor);
        QVERIFY(f.form().Picture1->cursor().shape() != Qt::WaitCursor);
    }

    void blendEdgesOnLeavesTheScreenAsItIs() {
        FormFixture f;
        PaintedDoor(f);
        Workspace& ws = f.ws();
        f.form().engine().RenderEdges(2);
        // A pixel on the border between the boxes that any edge pass would redraw.
        ws.Picture1.setPixel(129, 120, 0x00FF00);
        f.form().RefreshPicture();
        const Picture shown = ws.Picture1;

        const printtest::PdfContent pdf = printtest::ReadPdf(Print(f, true));
        QCOMPARE(pdf.images.size(), 1);
        QCOMPARE(pdf.images[0], ToQImage(shown));
        QCOMPARE(ws.Picture1, shown);
    }

    void aCancelledDialogPrintsNothing() {
        FormFixture f;
        PaintedDoor(f);
        SetBlendEdges(f, false);
        const Picture shown = f.ws().Picture1;
        const QString path = Print(f, false);
        QCOMPARE(f.platform().printerRequests, 1);
        QVERIFY(!QFile::exists(path));
        QCOMPARE(f.ws().Picture1, shown);
        QVERIFY(f.platform().messages.isEmpty());
        QVERIFY(f.form().Picture1->cursor().shape() != Qt::WaitCursor);
    }

    void aPrinterThatFailsIsToldAndTheViewAndCursorComeBack() {
        FormFixture f;
        PaintedDoor(f);
        SetBlendEdges(f, false);
        const Picture shown = f.ws().Picture1;
        Print(f, true, QStringLiteral("no such folder/sheet.pdf"));
        QCOMPARE(f.platform().messages.size(), 1);
        QCOMPARE(f.platform().messages[0].title, QStringLiteral("Warning - Print"));
        QVERIFY(f.platform().messages[0].text.startsWith(QStringLiteral("Unable to print the Paint Choice sheet.\r\n")));
        QCOMPARE(f.ws().Picture1, shown);
        QCOMPARE(f.form().cursor().shape(), Qt::ArrowCursor);
        QVERIFY(f.form().Picture1->cursor().shape() != Qt::WaitCursor);
    }

    void menuItemAndToolbarButtonPrintOnceAPictureIsOpen() {
        FormFixture f;
        f.form().PrintMenuItem_Click();
        QCOMPARE(f.platform().printerRequests, 0);
        PaintedDoor(f);
        f.form().updateMenus();  // as opening the File menu does
        f.form().menuItems.value(QStringLiteral("PrintMenuItem"))->trigger();
        f.form().setToolbarButtonEnabled(QStringLiteral("Print"), true);
        f.form().toolbarButtons.value(QStringLiteral("Print"))->trigger();
        QCOMPARE(f.platform().printerRequests, 2);
    }

    void everyBoxInUseGoesOnToASecondPage() {
        FormFixture f;
        PaintedDoor(f, {1, 3, 4, 6, 7, 8, 9, 10, 11, 12});
        const printtest::PdfContent pdf = printtest::ReadPdf(Print(f, true));
        QCOMPARE(pdf.pages, 2);
        QCOMPARE(pdf.images.size(), 1);
    }

    void aClipboardPictureWithARenamedBoxAndTheDay() {
        FormFixture f;
        QImage photo(80, 60, QImage::Format_RGB32);
        photo.fill(qRgb(200, 180, 40));
        QGuiApplication::clipboard()->setImage(photo);
        f.form().OpenFromClipboardMenuItem_Click();
        for (int i = 0; i < 50 && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
        QVERIFY(f.ws().PictureLoaded);

        f.form().PictureColor_MouseUp(3, kRightButton);
        f.form().ColorNameBox->setText(QStringLiteral("Porch Rail"));
        f.form().commitRename();
        f.ws().Boxes[3].reference = 0x808080;
        f.ws().Boxes[1].reference = 0x808080;
        f.ws().Boxes[2].color = 0x4080C0;  // a colour but no reference
        f.form().Today = [] { return QDate(1999, 12, 31); };

        const print::SheetContent content = f.form().paintChoiceContent();
        QCOMPARE(QString::fromStdString(content.pictureName), QStringLiteral("From Clipboard"));
        QCOMPARE(QString::fromStdString(content.date), QLocale().toString(QDate(1999, 12, 31), QLocale::LongFormat));
        const print::SheetFont font{300.0, 100.0, [](const std::string& s) { return 100.0 * static_cast<double>(s.size()); }};
        const print::PaintChoiceSheet sheet = print::LayoutPaintChoiceSheet(content, {12240.0, 11880.0, 15120.0}, font);
        QCOMPARE(sheet.rows.size(), size_t(2));
        QCOMPARE(sheet.rows[0].name.text, std::string("Ceiling"));
        QCOMPARE(sheet.rows[1].name.text, std::string("Porch Rail"));
    }
};

QTEST_MAIN(PrintWindowTest)
#include "print_window_test.moc"
