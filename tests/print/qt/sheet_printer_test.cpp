// The sheet drawn on a recording: every box, line, picture and text lands at
// its twips, whatever the device's resolution and the face's measures.
#include <QFontMetricsF>
#include <QPageSize>
#include <QPrinter>
#include <QtTest>

#include "print/qt/SheetPrinter.h"
#include "print/qt/SheetRecorder.h"

using namespace print;
using printtest::Drawn;

namespace {

SheetContent Content(std::initializer_list<int> used) {
    SheetContent c{"front", "6 March 2026", StartupColorBoxes()};
    for (int i = 1; i <= kColorBoxCount; ++i) c.boxes[static_cast<size_t>(i)].color = 0x2040C0 + i;
    for (int i : used) c.boxes[static_cast<size_t>(i)].reference = 0x707070;
    return c;
}

// A picture nobody could mistake for another: left half red, right half blue, one green row.
QImage WorkPicture() {
    QImage image(400, 300, QImage::Format_RGB32);
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) image.setPixel(x, y, y == 7 ? qRgb(0, 200, 0) : x < 200 ? qRgb(210, 20, 30) : qRgb(20, 30, 220));
    return image;
}

SheetPage PageOf(QPageSize::PageSizeId size) {
    QPrinter printer(QPrinter::HighResolution);
    printer.setOutputFormat(QPrinter::PdfFormat);
    printer.setPageSize(QPageSize(size));
    return SheetPageOf(printer);
}

bool Near(double a, double b, double tolerance = 0.5) { return std::abs(a - b) <= tolerance; }

QString Twips(const QRectF& r) {
    return QStringLiteral("%1,%2 %3x%4").arg(r.left(), 0, 'f', 1).arg(r.top(), 0, 'f', 1).arg(r.width(), 0, 'f', 1).arg(r.height(), 0, 'f', 1);
}
QString Twips(const SheetRect& r) { return Twips(QRectF(r.left, r.top, r.width(), r.height())); }

} // namespace

class SheetPrinterTest : public QObject {
    Q_OBJECT
private slots:
    void pictureShadowFrameAndRowsInTwips_data() {
        QTest::addColumn<int>("size");
        QTest::addColumn<double>("paperWidth");
        QTest::addColumn<QString>("picture");
        QTest::addColumn<QString>("shadow");
        QTest::newRow("Letter") << int(QPageSize::Letter) << 12240.0 << "800.0,800.0 8078.4x6053.7" << "900.0,900.0 8078.4x6053.7";
        QTest::newRow("A4") << int(QPageSize::A4) << 11905.5 << "800.0,800.0 7857.6x5888.3" << "900.0,900.0 7857.6x5888.3";
    }
    void pictureShadowFrameAndRowsInTwips() {
        QFETCH(int, size);
        QFETCH(double, paperWidth);
        QFETCH(QString, picture);
        QFETCH(QString, shadow);
        const SheetPage page = PageOf(QPageSize::PageSizeId(size));
        QVERIFY(Near(page.width, paperWidth, 0.1));
        QVERIFY(page.printableWidth < page.width && page.printableWidth > 0.8 * page.width);

        QPicture recording;
        QPainter painter(&recording);
        painter.setFont(SheetFace(painter));
        const QFont face = painter.font();
        const PaintChoiceSheet sheet = LayoutPaintChoiceSheet(Content({7, 4}), page, SheetFontOn(face, recording));
        const QImage image = WorkPicture();
        DrawPaintChoiceSheet(painter, sheet, image, {});
        painter.end();
        QList<Drawn> drawn = printtest::Replay(recording);

        const double k = 1440.0 / recording.logicalDpiX();
        auto twips = [k](const QRectF& r) { return QRectF(r.topLeft() * k, r.size() * k); };
        QList<Drawn> rects, images, lines, texts;
        for (const Drawn& d : drawn)
            (d.kind == Drawn::Rect ? rects : d.kind == Drawn::Image ? images : d.kind == Drawn::Line ? lines : texts).append(d);

        // Shadow, then the picture stretched over it, then the black frame.
        QCOMPARE(rects.size(), 1 + 1 + 2);
        QCOMPARE(Twips(twips(rects[0].rect)), shadow);
        QCOMPARE(rects[0].brush.color(), QColor(0xA0, 0xA0, 0xA0));
        QCOMPARE(images.size(), 1);
        QCOMPARE(Twips(twips(images[0].rect)), picture);
        QCOMPARE(images[0].image.convertToFormat(QImage::Format_RGB32), image);
        QCOMPARE(Twips(twips(rects[1].rect)), picture);
        QCOMPARE(rects[1].pen.color(), QColor(Qt::black));
        QCOMPARE(rects[1].brush.style(), Qt::NoBrush);
        QString kinds;
        for (const Drawn& d : drawn) kinds += QStringLiteral("RLIT")[int(d.kind)];
        kinds.remove('T');
        QCOMPARE(kinds, QStringLiteral("RIRRLRL"));

        // Boxes 4 and 7, in that order: swatch in the box's colour with a
        // black outline, and the writing line along its bottom edge.
        QCOMPARE(sheet.rows.size(), size_t(2));
        for (int i = 0; i < 2; ++i) {
            const SheetRow& row = sheet.rows[static_cast<size_t>(i)];
            QCOMPARE(row.box, i == 0 ? 4 : 7);
            QCOMPARE(Twips(twips(rects[2 + i].rect)), Twips(row.swatch));
            QCOMPARE(rects[2 + i].brush.color(), QColor(0xC0 + row.box, 0x40, 0x20));
            QCOMPARE(rects[2 + i].pen.color(), QColor(Qt::black));
            const QLineF line(lines[i].line.p1() * k, lines[i].line.p2() * k);
            QVERIFY(Near(line.x1(), 5350.0) && Near(line.x2(), 10100.0));
            QVERIFY(Near(line.y1(), row.swatch.bottom) && Near(line.y2(), row.swatch.bottom));
        }

        // Every text in the 12 pt face, its cell's top-left corner where the layout put it.
        QStringList order;
        std::vector<SheetText> expected{sheet.pictureName, sheet.date};
        expected.insert(expected.end(), sheet.headings.begin(), sheet.headings.end());
        for (const SheetRow& row : sheet.rows) expected.push_back(row.name);
        QCOMPARE(texts.size(), qsizetype(expected.size()));
        const double ascent = QFontMetricsF(face, &recording).ascent();
        for (const Drawn& t : texts) {
            order << t.text;
            const auto at = std::find_if(expected.begin(), expected.end(), [&](const SheetText& e) { return QString::fromStdString(e.text) == t.text; });
            QVERIFY2(at != expected.end(), qPrintable(t.text));
            // Text may sit on a whole device pixel.
            QVERIFY2(Near(t.at.x() * k, at->x, k) && Near((t.at.y() - ascent) * k, at->y, k), qPrintable(t.text));
            QCOMPARE(t.font.pointSizeF(), 12.0);
            QCOMPARE(t.font.family(), face.family());
        }
        QCOMPARE(order, QStringList({"front", "6 March 2026", "COLOR", "ITEM", "PAINT CHOICE", "======", "====",
                                     "============", "Picture Rail", "Door Frames"}));

        // Tab stops are whole columns from the left edge; a column is the
        // face's average character, between a narrow and a wide letter.
        const double column = sheet.headings[1].x / 30.0;
        QVERIFY(Near(sheet.headings[2].x, 50.0 * column, 1e-6));
        QVERIFY(Near(sheet.rows[0].name.x, 30.0 * column, 1e-6));
        const QFontMetricsF metrics(face, &recording);
        QVERIFY(column > metrics.horizontalAdvance('i') * k && column < metrics.horizontalAdvance('W') * k);
    }

    void laterPagesOnlyAfterANewPage() {
        const SheetPage page = PageOf(QPageSize::Letter);
        QPicture recording;
        QPainter painter(&recording);
        painter.setFont(SheetFace(painter));
        const PaintChoiceSheet sheet =
            LayoutPaintChoiceSheet(Content({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12}), page, SheetFontOn(painter.font(), recording));
        QCOMPARE(sheet.pages, 2);
        int asked = 0;
        DrawPaintChoiceSheet(painter, sheet, WorkPicture(), [&] { return ++asked, false; });
        painter.end();
        QCOMPARE(asked, 1);
        // The printer refused the second page: nothing of it is drawn.
        int rowsDrawn = 0;
        for (const Drawn& d : printtest::Replay(recording))
            for (const SheetRow& row : sheet.rows)
                if (d.kind == Drawn::Text && d.text == QString::fromStdString(row.name.text)) {
                    QCOMPARE(row.page, 0);
                    ++rowsDrawn;
                }
        QVERIFY(rowsDrawn >= 1 && rowsDrawn < 12);
    }
};

QTEST_MAIN(SheetPrinterTest)
#include "sheet_printer_test.moc"
