// The title screen: background with turning hues, the window icon, the texts,
// the poll's timer, and "&About" returning to it with the work kept.
#include <QAction>
#include <QTest>
#include <QTimer>

#include "imaging/HSLcolor.h"
#include "paint/qt/PictureView.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"

namespace {
// Area of the picture that no text and no icon covers: right of the short
// line "do the rest.", above the next paragraph.
const QRect kBare(150, 140, 240, 22);

int DarkPixels(const Picture& p, const QRect& r) {
    int dark = 0;
    for (int y = r.top(); y <= r.bottom(); ++y)
        for (int x = r.left(); x <= r.right(); ++x) {
            const HSLcolor::RGB c = HSLcolor::SplitColor(p.pixel(x, y));
            if (c.red + c.green + c.blue < 200) ++dark;
        }
    return dark;
}

std::vector<int32_t> Pixels(const Picture& p, const QRect& r) {
    std::vector<int32_t> out;
    for (int y = r.top(); y <= r.bottom(); ++y)
        for (int x = r.left(); x <= r.right(); ++x) out.push_back(p.pixel(x, y));
    return out;
}
} // namespace

class TitleScreenTest : public QObject {
    Q_OBJECT
private slots:
    void drawsBackgroundIconAndTexts();
    void huesTurnAndComeRound();
    void timerOffWhileDrawing();
    void aboutReturnsAndKeepsTheWork();
    void pollStopsDrawingOncePictureOpens();
};

void TitleScreenTest::drawsBackgroundIconAndTexts() {
    FormFixture f;
    f.form().DrawTitleScreen();
    const Picture& p = f.ws().Picture1;
    // Clean colour values for the engine: nothing in the top byte.
    for (int y = 0; y < p.height(); ++y)
        for (int x = 0; x < p.width(); ++x) QCOMPARE(uint32_t(p.pixel(x, y)) >> 24, 0u);
    // The background is light all over the bare area; the lines of text are dark.
    QCOMPARE(DarkPixels(p, kBare), 0);
    QVERIFY(DarkPixels(p, QRect(110, 3, 160, 40)) > 100);   // the title
    QVERIFY(DarkPixels(p, QRect(280, 16, 60, 28)) > 20);    // the version
    for (const int y : {70, 85, 110, 125, 165, 180, 205, 220, 235})
        QVERIFY2(DarkPixels(p, QRect(10, y, 250, 12)) > 30, qPrintable(QString::number(y)));
    QVERIFY(DarkPixels(p, QRect(50, 260, 200, 15)) > 50);   // ready for the store
    QVERIFY(DarkPixels(p, QRect(10, 288, 300, 11)) > 30);   // the small print
    // No text spills left of x = 10 in the introduction.
    QCOMPARE(DarkPixels(p, QRect(0, 70, 9, 180)), 0);
    // The window icon sits at (65, 10) at its own size.
    const QImage icon = artwork::WindowIconImage().convertToFormat(QImage::Format_ARGB32);
    int matched = 0, opaque = 0;
    for (int y = 0; y < 32; ++y)
        for (int x = 0; x < 32; ++x) {
            const QRgb c = icon.pixel(x, y);
            if (qAlpha(c) < 255) continue;
            ++opaque;
            if (p.pixel(65 + x, 10 + y) == HSLcolor::JoinColor(qRed(c), qGreen(c), qBlue(c))) ++matched;
        }
    QVERIFY(opaque > 300);
    QVERIFY2(matched > opaque * 9 / 10, qPrintable(QStringLiteral("%1 of %2").arg(matched).arg(opaque)));
    // What the picture box shows is the workspace's picture.
    QCOMPARE(f.form().Picture1->image().pixel(350, 150) & 0xFFFFFF,
             QRgb(qRgb(p.pixel(350, 150) & 0xFF, (p.pixel(350, 150) >> 8) & 0xFF, (p.pixel(350, 150) >> 16) & 0xFF)) & 0xFFFFFF);
}

void TitleScreenTest::huesTurnAndComeRound() {
    FormFixture f;
    f.form().DrawTitleScreen();
    const std::vector<int32_t> first = Pixels(f.ws().Picture1, kBare);
    const int turn = f.form().TitleHueTurn;
    f.form().DrawTitleScreen();
    const std::vector<int32_t> second = Pixels(f.ws().Picture1, kBare);
    QVERIFY(first != second);
    // Small steps: the hue moves a little, the lightness stays.
    const HSLcolor::HSL a = HSLcolor::RGBToHSL(HSLcolor::SplitColor(first[0]));
    const HSLcolor::HSL b = HSLcolor::RGBToHSL(HSLcolor::SplitColor(second[0]));
    QVERIFY(std::abs(a.lum - b.lum) <= 2);
    for (int i = 0; i < 128; ++i) f.form().DrawTitleScreen();
    // 128 redraws after the second, the same picture again.
    QCOMPARE(f.form().TitleHueTurn, (turn + 2) % 256);
    QVERIFY(Pixels(f.ws().Picture1, kBare) == second);
    QCOMPARE(f.ws().Picture1, [&] {
        FormFixture g;
        g.form().DrawTitleScreen();
        g.form().DrawTitleScreen();
        return g.ws().Picture1;
    }());
}

void TitleScreenTest::timerOffWhileDrawing() {
    FormFixture f;
    f.form().BackgroundTimer->start();
    f.form().DrawTitleScreen();
    QVERIFY(f.form().BackgroundTimer->isActive());
    f.form().BackgroundTimer->stop();
    f.form().DrawTitleScreen();
    QVERIFY(!f.form().BackgroundTimer->isActive());
}

void TitleScreenTest::aboutReturnsAndKeepsTheWork() {
    FormFixture f;
    Workspace& ws = f.ws();
    ws.PictureLoaded = true;
    ws.PictureModified = true;
    ws.Boxes[3].color = 0x4060A0;
    ws.Stroke(12, 7) = 5;
    ws.ColorPlane(12, 7) = 3;
    ws.StrokeNumber = 5;
    ws.Picture1.fill(0x102030);
    f.form().CurrentPicturePath = f.form().RequestedPicturePath = f.picsFolder() + "/house.bmp";
    for (const char* key : {"Save", "Print", "Delete"}) f.form().setToolbarButtonEnabled(key, true);

    f.form().menuItems.value("AboutMenuItem")->trigger();

    QVERIFY(!ws.PictureLoaded);
    QVERIFY(f.form().CurrentPicturePath.isEmpty());
    QVERIFY(f.form().RequestedPicturePath.isEmpty());
    for (const char* key : {"Save", "Print", "Delete"}) QVERIFY2(!f.form().toolbarButtonEnabled(key), key);
    QVERIFY(f.platform().messages.isEmpty());
    // The work itself is untouched.
    QVERIFY(ws.PictureModified);
    QCOMPARE(ws.Boxes[3].color, 0x4060A0);
    QCOMPARE(ws.Stroke(12, 7), int16_t(5));
    QCOMPARE(ws.ColorPlane(12, 7), int16_t(3));
    QCOMPARE(ws.StrokeNumber, 5);
    // The next poll draws the title screen over the picture.
    f.form().BackgroundTimer_Timer();
    QVERIFY(ws.Picture1.pixel(350, 150) != 0x102030);
    // Closing still asks about the unsaved work.
    f.platform().answers.push_back(platform::Answer::Cancel);
    QVERIFY(f.form().Form_QueryUnload());
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].text, QStringLiteral("Do you want to save your work now?"));
}

void TitleScreenTest::pollStopsDrawingOncePictureOpens() {
    FormFixture f;
    f.form().BackgroundTimer_Timer();
    const int turn = f.form().TitleHueTurn;
    f.ws().PictureLoaded = true;
    f.ws().Picture1.fill(0x203040);
    f.form().BackgroundTimer_Timer();
    QCOMPARE(f.form().TitleHueTurn, turn);
    QCOMPARE(f.ws().Picture1.pixel(200, 150), 0x203040);
}

QTEST_MAIN(TitleScreenTest)
#include "TitleScreen_test.moc"
