// The title screen: background with turning hues, the window icon, the texts,
// the poll's timer, and "&About" returning to it with the work kept.
#include <QAction>
#include <QTest>
#include <QTimer>

#include "imaging/HSLcolor.h"
#include "paint/Tools.h"
#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"


class TitleScreenTest : public QObject {
    Q_OBJECT
private slots:
    void drawsBackgroundIconAndTexts();
    void huesComeRoundAndTheTimerIsLeftAsFound();
    void aboutReturnsAndKeepsTheWork();
};

void TitleScreenTest::drawsBackgroundIconAndTexts() {
    FormFixture f;
    f.form().DrawTitleScreen();
    const Picture& p = f.ws().Picture1;
    auto darkPixels = [&p](const QRect& r) {
        int dark = 0;
        for (int y = r.top(); y <= r.bottom(); ++y)
            for (int x = r.left(); x <= r.right(); ++x) dark += (p.pixel(x, y) & 0xFF) + (p.pixel(x, y) >> 8 & 0xFF) + (p.pixel(x, y) >> 16 & 0xFF) < 200;
        return dark;
    };
    // Clean colour values for the engine: nothing in the top byte.
    for (int y = 0; y < p.height(); ++y)
        for (int x = 0; x < p.width(); ++x) QCOMPARE(uint32_t(p.pixel(x, y)) >> 24, 0u);
    // Light where nothing is written (right of "do the rest.", left of the texts); dark on
    // the title, the version, the introduction's lines, the store line and the small print.
    QCOMPARE(darkPixels(QRect(150, 140, 240, 22)) + darkPixels(QRect(0, 70, 9, 180)), 0);
    for (const QRect& r : {QRect(110, 3, 160, 40), QRect(280, 16, 60, 28), QRect(10, 70, 250, 12), QRect(10, 235, 250, 12),
                           QRect(50, 260, 200, 15), QRect(10, 288, 300, 11)})
        QVERIFY2(darkPixels(r) > 20, qPrintable(QString::number(r.y())));
    // The window icon sits at (65, 10): its middle pixel.
    const QRgb middle = artwork::WindowIconImage().pixel(16, 16);
    QCOMPARE(p.pixel(81, 26), HSLcolor::JoinColor(qRed(middle), qGreen(middle), qBlue(middle)));
}

void TitleScreenTest::huesComeRoundAndTheTimerIsLeftAsFound() {
    FormFixture f;
    f.form().DrawTitleScreen();
    const Picture first = f.ws().Picture1;
    // Each redraw turns the first drawing's hues; the 128th comes full circle.
    // A running poll runs on afterwards, a stopped one stays stopped.
    for (int redraw = 1; redraw <= 128; ++redraw) {
        redraw % 2 ? f.form().BackgroundTimer->start() : f.form().BackgroundTimer->stop();
        f.form().DrawTitleScreen();
        QVERIFY(f.form().BackgroundTimer->isActive() == redraw % 2 && (f.ws().Picture1 == first) == (redraw == 128));
    }
}

void TitleScreenTest::aboutReturnsAndKeepsTheWork() {
    FormFixture f;
    Workspace& ws = f.ws();
    ws.PictureLoaded = ws.PictureModified = true;
    ws.Boxes[1].color = 0x4060A0;
    ws.StrokeNumber = ws.Stroke(12, 7) = 5;
    ws.Picture1.fill(0x102030);
    f.form().UpdatePictureCursor();
    f.form().CurrentPicturePath = f.form().RequestedPicturePath = f.picsFolder() + "/house.bmp";
    for (const char* key : {"Save", "Print", "Delete"}) f.form().setToolbarButtonEnabled(key, true);
    // While a picture is open the poll leaves it alone.
    f.form().BackgroundTimer_Timer();
    QCOMPARE(ws.Picture1.pixel(350, 150), 0x102030);

    f.form().menuItems.value("AboutMenuItem")->trigger();

    QVERIFY(!ws.PictureLoaded && f.form().CurrentPicturePath.isEmpty() && f.form().RequestedPicturePath.isEmpty() && f.platform().messages.isEmpty());
    for (const char* key : {"Save", "Print", "Delete"}) QVERIFY2(!f.form().toolbarButtonEnabled(key), key);
    // The plain pointer over the title, even with set-reference on.
    ToggleSetReference(ws);
    QVERIFY(ws.Cursor == PictureCursor::Default && f.form().Picture1->cursor().shape() == Qt::ArrowCursor);
    // The work itself is untouched, and the next poll draws the title over the picture.
    QVERIFY(ws.PictureModified && ws.Boxes[1].color == 0x4060A0 && ws.Stroke(12, 7) == 5 && ws.StrokeNumber == 5);
    f.form().BackgroundTimer_Timer();
    QVERIFY(ws.Picture1.pixel(350, 150) != 0x102030);
}

QTEST_MAIN(TitleScreenTest)
#include "TitleScreen_test.moc"
