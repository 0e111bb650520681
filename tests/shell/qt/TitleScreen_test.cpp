// The title screen: background with turning hues, the window icon, the texts,
// the poll's timer, and "&About" returning to it with the work kept.
#include <QAction>
#include <QFontDatabase>
#include <QFontInfo>
#include <QTest>
#include <QTimer>
#include <algorithm>

#include "imaging/HSLcolor.h"
#include "paint/Tools.h"
#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"

class TitleScreenTest : public QObject {
    Q_OBJECT
private slots:
    void drawnAtStartAndAfterAbout();
};

void TitleScreenTest::drawnAtStartAndAfterAbout() {
    // The texts below are looked for where the faces setup.sh installs put them.
    for (const QString family : {"Liberation Serif", "Liberation Sans"})
        QVERIFY2(QFontDatabase::hasFamily(family), qPrintable(family + " is not installed: run scripts/setup.sh"));
    FormFixture f;
    f.form().DrawTitleScreen();
    QCOMPARE(QFontInfo(f.form().Picture1->font()).family(), QStringLiteral("Liberation Sans"));  // the last text's face
    const Picture p = f.ws().Picture1;
    // Clean colour values for the engine: nothing in the top byte.
    QVERIFY(std::all_of(p.data(), p.data() + p.width() * p.height(), [](int32_t c) { return c >> 24 == 0; }));
    auto darkPixels = [&p](const QRect& r) {
        int dark = 0;
        for (int y = r.top(); y <= r.bottom(); ++y)
            for (int x = r.left(); x <= r.right(); ++x) dark += qRed(p.pixel(x, y)) + qGreen(p.pixel(x, y)) + qBlue(p.pixel(x, y)) < 200;
        return dark;
    };
    // Light where nothing is written (right of "do the rest.", left of the texts); dark on
    // the title, the version, the introduction's lines, the store line and the small print.
    QCOMPARE(darkPixels(QRect(150, 140, 240, 22)) + darkPixels(QRect(0, 70, 9, 180)), 0);
    for (const QRect& r : {QRect(110, 3, 160, 40), QRect(280, 16, 60, 28), QRect(10, 70, 250, 12), QRect(10, 235, 250, 12),
                           QRect(50, 260, 200, 15), QRect(10, 288, 300, 11)})
        QVERIFY2(darkPixels(r) > 20, qPrintable(QString::number(r.y())));
    // The window icon sits at (65, 10): its middle pixel.
    const QRgb middle = artwork::WindowIconImage().pixel(16, 16);
    QCOMPARE(p.pixel(81, 26), HSLcolor::JoinColor(qRed(middle), qGreen(middle), qBlue(middle)));
    // A redraw turns the hues. A stopped poll stays stopped, a running one runs on.
    QVERIFY(!f.form().BackgroundTimer->isActive());
    f.form().BackgroundTimer->start();
    f.form().DrawTitleScreen();
    QVERIFY(f.form().BackgroundTimer->isActive() && !(f.ws().Picture1 == p));

    // Then with a picture open and painted on, "&About" brings the title back.
    Workspace& ws = f.ws();
    ws.PictureLoaded = ws.PictureModified = true;
    ws.StrokeNumber = ws.Stroke(12, 7) = 5;
    f.form().CurrentPicturePath = f.form().RequestedPicturePath = f.picsFolder() + "/house.bmp";
    for (const char* key : {"Save", "Print", "Delete"}) f.form().setToolbarButtonEnabled(key, true);
    f.form().menuItems.value("AboutMenuItem")->trigger();

    QVERIFY(!ws.PictureLoaded && f.form().CurrentPicturePath.isEmpty() && f.form().RequestedPicturePath.isEmpty() && f.platform().messages.isEmpty());
    for (const char* key : {"Save", "Print", "Delete"}) QVERIFY2(!f.form().toolbarButtonEnabled(key), key);
    // The plain pointer over the title, even with set-reference on.
    ToggleSetReference(ws);
    QVERIFY(ws.Cursor == PictureCursor::Default && f.form().Picture1->cursor().shape() == Qt::ArrowCursor);
    // The work itself is untouched.
    QVERIFY(ws.PictureModified && ws.Stroke(12, 7) == 5 && ws.StrokeNumber == 5);
}

QTEST_MAIN(TitleScreenTest)
#include "TitleScreen_test.moc"
