// Exporting the repainted picture: the save dialog's proposal, the file
// formats, the blended view whatever the option says, failures, the clipboard.
#include <QCheckBox>
#include <QClipboard>
#include <QGuiApplication>
#include <QtTest>
#include <sys/stat.h>

#include "imaging/DibSurface.h"
#include "imaging/qt/SurfaceClipboard.h"
#include "platform/QtPlatform.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/QtPaths.h"
#include "support/FormFixture.h"

namespace {
constexpr int32_t kMarker = 0x123456;   // planted beside the paint, where any edge pass draws
const QPoint kMarkerAt(99, 150);

// A photo with four bands across and light falling off downward: no two
// corners alike, red never equal to blue.
QImage Photo() {
    QImage image(400, 300, QImage::Format_RGB32);
    const QRgb bands[] = {qRgb(200, 60, 30), qRgb(40, 170, 60), qRgb(230, 210, 40), qRgb(50, 70, 200)};
    for (int y = 0; y < 300; ++y)
        for (int x = 0; x < 400; ++x) {
            const QRgb c = bands[x / 100];
            const int dim = y / 6;
            image.setPixel(x, y, qRgb(std::max(0, qRed(c) - dim), std::max(0, qGreen(c) - dim), std::max(0, qBlue(c) - dim)));
        }
    return image;
}

Picture FromImage(const QImage& image) {
    Picture p(image.width(), image.height());
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x) {
            const QRgb c = image.pixel(x, y);
            p.setPixel(x, y, qRed(c) + 256 * qGreen(c) + 65536 * qBlue(c));
        }
    return p;
}

// Mean difference per channel between two pictures of one size.
double MeanError(const Picture& a, const Picture& b) {
    double total = 0;
    for (int y = 0; y < a.height(); ++y)
        for (int x = 0; x < a.width(); ++x)
            for (int shift : {0, 8, 16}) total += std::abs((a.pixel(x, y) >> shift & 0xFF) - (b.pixel(x, y) >> shift & 0xFF));
    return total / (3.0 * a.width() * a.height());
}

QByteArray ReadAll(const QString& path) {
    QFile f(path);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}
QStringList FilesIn(const QString& folder) { return QDir(folder).entryList(QDir::Files | QDir::Hidden, QDir::Name); }

// A work reopened from PICS/house.bmp (or the clipboard's picture), painted
// with boxes 2 and 4 side by side. `blended` and `plain` are its two views;
// the window shows the one the option asks for, with the marker beside the paint.
struct Scene {
    mutable FormFixture f;
    Picture blended, plain;
    QString out;

    explicit Scene(bool blend, bool fromClipboard = false) {
        out = f.programFolder() + "/out";
        QDir().mkpath(out);
        if (fromClipboard) {
            QGuiApplication::clipboard()->setImage(Photo());
            f.form().OpenFromClipboardMenuItem_Click();
        } else {
            for (const char* ext : {".bmp", ".bmo"}) Photo().save(f.picsFolder() + "/house" + ext, "BMP");
            f.form().rereadFileList();
            f.form().File1->selectName("house.bmp");
            f.form().File1_Click();
        }
        for (int i = 0; i < 50 && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
        Workspace& ws = f.ws();
        ws.Boxes[2] = ColorBox{"Door", 0x2060C0, 0x3050A0};
        ws.Boxes[4] = ColorBox{"Trim", 0xE0E0F0, 0x20A0E0};
        for (int y = 100; y < 200; ++y)
            for (int x = 100; x < 260; ++x) {
                ws.Stroke(x, y) = x < 200 ? 1 : 2;
                ws.ColorPlane(x, y) = x < 200 ? 2 : 4;
            }
        ws.StrokeNumber = 2;
        f.form().engine().RepaintColor(2);
        f.form().engine().RepaintColor(4);
        f.form().engine().RenderEdges(2);
        blended = ws.Picture1;
        f.form().engine().RenderEdges(1);
        plain = ws.Picture1;
        f.form().BlendEdgesCheckbox->setChecked(blend);
        if (blend) f.form().engine().RenderEdges(2);
        ws.Picture1.setPixel(kMarkerAt.x(), kMarkerAt.y(), kMarker);
    }
    // The view with the marker still in it: nothing was drawn again.
    Picture untouched() const {
        Picture p = f.ws().BlendEdges ? blended : plain;
        p.setPixel(kMarkerAt.x(), kMarkerAt.y(), kMarker);
        return p;
    }
    // What an export must show, and what the window must show afterwards.
    Picture exported() const { return f.ws().BlendEdges ? untouched() : blended; }
    Picture shownAfter() const { return f.ws().BlendEdges ? untouched() : plain; }

    void choose(const QString& path, int filterIndex) {
        f.platform().saveChoices.push_back(platform::FileChoice{false, path, filterIndex});
    }
};
} // namespace

class ExportWindowTest : public QObject {
    Q_OBJECT
private slots:
    void proposalAndCancel_data() {
        QTest::addColumn<bool>("fromClipboard");
        QTest::addColumn<QString>("name");
        QTest::newRow("reopened work") << false << "house.jpg";
        QTest::newRow("clipboard picture") << true << "From Clipboard.jpg";
    }
    void proposalAndCancel() {
        QFETCH(bool, fromClipboard);
        QFETCH(QString, name);
        for (const bool blend : {false, true}) {
            Scene s(blend, fromClipboard);
            QVERIFY(s.blended != s.plain);
            s.f.form().ExportFolder = s.out + "/";
            const QStringList pics = FilesIn(s.f.picsFolder());
            s.f.form().ExportToFileMenuItem_Click();   // unscripted: cancelled
            QCOMPARE(s.f.platform().saveRequests.size(), 1);
            const platform::FileRequest& r = s.f.platform().saveRequests[0];
            QCOMPARE(r.fileName, s.out + "/" + name);
            QCOMPARE(r.title, QString("Export Painted Picture to"));
            QCOMPARE(r.filter, QString("JPEG Picture Format (*.jpg)|*.jpg|Bitmap Picture Format (*.bmp)|*.bmp"));
            QCOMPARE(r.initialFolder, s.f.form().Dir1->path());
            QCOMPARE(r.defaultExtension, QString("*"));
            QCOMPARE(r.flags, 4);
            // Nothing written, nothing drawn again, the folder kept.
            QVERIFY(FilesIn(s.out).isEmpty() && FilesIn(s.f.picsFolder()) == pics);
            QVERIFY(s.f.ws().Picture1 == s.untouched());
            QCOMPARE(s.f.form().ExportFolder, s.out + "/");
            QVERIFY(s.f.platform().messages.isEmpty());
        }
    }

    void exportWritesTheBlendedView_data() {
        QTest::addColumn<bool>("blend");
        QTest::addColumn<int>("filter");
        QTest::addColumn<QString>("chosen");
        QTest::addColumn<QString>("written");
        QTest::newRow("jpeg, blend off") << false << 1 << "out/pic.jpg" << "out/pic.jpg";
        QTest::newRow("jpeg without extension, blend on") << true << 1 << "out/pic" << "out/pic.jpg";
        QTest::newRow("bitmap entry over a .jpg name") << false << 2 << "out/pic.jpg" << "out/pic.bmp";
        QTest::newRow("bitmap, blend on") << true << 2 << "out/pic.bmp" << "out/pic.bmp";
        QTest::newRow("bitmap into the shown folder") << false << 2 << "PICS/pic.png" << "PICS/pic.bmp";
    }
    void exportWritesTheBlendedView() {
        QFETCH(bool, blend);
        QFETCH(int, filter);
        QFETCH(QString, chosen);
        QFETCH(QString, written);
        Scene s(blend);
        const QString folder = s.f.programFolder() + "/" + store::FolderOf(written);
        const QStringList before = FilesIn(folder);
        s.choose(s.f.programFolder() + "/" + chosen, filter);
        s.f.form().ExportToFileMenuItem_Click();
        QVERIFY(s.f.platform().messages.isEmpty());
        QStringList expected = before;
        expected << store::FileNameOf(written);
        expected.sort();
        QCOMPARE(FilesIn(folder), expected);
        const QImage image(s.f.programFolder() + "/" + written);
        QCOMPARE(image.size(), QSize(400, 300));
        if (filter == 2) {
            QCOMPARE(ReadAll(s.f.programFolder() + "/" + written).at(28), char(24));   // 24 bits a pixel
            QVERIFY(FromImage(image) == s.exported());
        } else {
            QVERIFY(MeanError(FromImage(image), s.exported()) < 3.0);
        }
        QVERIFY(s.f.ws().Picture1 == s.shownAfter());
        QCOMPARE(s.f.form().ExportFolder, folder);
        QVERIFY(s.f.form().File1->entries().contains("pic.bmp") == written.startsWith("PICS"));
    }

    void failedWritesSayAndKeepTheOldFile_data() {
        QTest::addColumn<int>("filter");
        QTest::addColumn<QString>("chosen");
        QTest::addColumn<QString>("text");
        QTest::newRow("read-only jpeg") << 1 << "old.jpg" << "Unable to Write JPEG file.";
        QTest::newRow("read-only bitmap") << 2 << "old.bmp" << "Unable to Write Bitmap file.\r\n";
        QTest::newRow("jpeg into a missing folder") << 1 << "gone/new.jpg" << "Unable to Write JPEG file.";
        QTest::newRow("bitmap into a missing folder") << 2 << "gone/new.bmp" << "Unable to Write Bitmap file.\r\n";
    }
    void failedWritesSayAndKeepTheOldFile() {
        QFETCH(int, filter);
        QFETCH(QString, chosen);
        QFETCH(QString, text);
        Scene s(false);
        for (const char* name : {"old.jpg", "old.bmp"}) {
            QFile f(s.out + "/" + name);
            QVERIFY(f.open(QIODevice::WriteOnly) && f.write("old picture") == 11);
            f.close();
            QVERIFY(::chmod(QFile::encodeName(f.fileName()).constData(), 0444) == 0);
        }
        s.choose(s.out + "/" + chosen, filter);
        s.f.form().ExportToFileMenuItem_Click();
        QCOMPARE(s.f.platform().messages.size(), 1);
        QCOMPARE(s.f.platform().messages[0].title, QString("Warning - Export to File"));
        QVERIFY2(s.f.platform().messages[0].text.startsWith(text), qPrintable(s.f.platform().messages[0].text));
        QCOMPARE(s.f.platform().messages[0].buttons, platform::Buttons::Ok);
        QCOMPARE(FilesIn(s.out), QStringList({"old.bmp", "old.jpg"}));   // no half-written file beside them
        for (const char* name : {"old.jpg", "old.bmp"}) QCOMPARE(ReadAll(s.out + "/" + name), QByteArray("old picture"));
        QVERIFY(s.f.ws().Picture1 == s.plain);   // the plain view is back
    }

    void clipboardHoldsTheBlendedView() {
        for (const bool blend : {false, true}) {
            Scene s(blend);
            QGuiApplication::clipboard()->setText("earlier");
            s.f.form().ToClipboardMenuItem_Click();
            QVERIFY(FromImage(QGuiApplication::clipboard()->image()) == s.exported());
            QVERIFY(s.f.ws().Picture1 == s.shownAfter());
            QVERIFY(s.f.platform().messages.isEmpty());
        }
    }

    void dialogFiltersNameEachPatternOnce() {
        QCOMPARE(platform::QtFilters("JPEG Picture Format (*.jpg)|*.jpg|Bitmap Picture Format (*.bmp)|*.bmp"),
                 QStringList({"JPEG Picture Format (*.jpg)", "Bitmap Picture Format (*.bmp)"}));
        QCOMPARE(platform::QtFilters("Picture files (BMP, JPG, GIF)| *.BMP;*.JPG;*.GIF|All files (*.*)|*.*"),
                 QStringList({"Picture files (BMP, JPG, GIF) (*.BMP *.JPG *.GIF)", "All files (*.*)"}));
    }

    void surfaceOffersOnlyABitmap() {
        FormFixture f;
        DibSurface surface;
        surface.CreateFromPicture(FromImage(Photo()));
        QGuiApplication::clipboard()->setText("earlier");
        QVERIFY(!imaging::CopyToClipboard(surface, f.platform(), &f.form(), true));
        QCOMPARE(f.platform().messages.size(), 1);
        QCOMPARE(f.platform().messages[0].title, QCoreApplication::applicationName());
        QCOMPARE(f.platform().messages[0].text, QString("I don't know how to put a DIB on the clipboard! Copy as bitmap instead!!!"));
        QCOMPARE(QGuiApplication::clipboard()->text(), QString("earlier"));
        QVERIFY(QGuiApplication::clipboard()->image().isNull());
        QVERIFY(imaging::CopyToClipboard(surface, f.platform(), &f.form()));
        QVERIFY(FromImage(QGuiApplication::clipboard()->image()) == FromImage(Photo()));
    }
};

QTEST_MAIN(ExportWindowTest)
#include "export_window_test.moc"
