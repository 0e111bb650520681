// Opening pictures in the window: the click, the poll, cancelling, bad files.
#include <QClipboard>
#include <QGuiApplication>
#include <QTimer>
#include <QtTest>

#include "store/MaskFile.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/StorePictures.h"
#include "support/FormFixture.h"

using namespace storetest;

namespace {
// Runs the background poll until the load ends (or the tries run out).
bool PollUntilLoaded(FormFixture& f, int tries = 50) {
    for (int i = 0; i < tries && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
    return f.ws().PictureLoaded;
}

void Click(FormFixture& f, const QString& name) {
    f.form().rereadFileList();
    QVERIFY2(f.form().File1->selectName(name), qPrintable(name));
    f.form().File1_Click();
}
} // namespace

class StoreOpenTest : public QObject {
    Q_OBJECT
private slots:
    void clickPreviewsAndPollLoads();
    void newerRequestCancelsRunningLoad();
    void badFilesGetTheLoadError_data();
    void badFilesGetTheLoadError();
    void brokenMaskOpensClear();
    void wrongSizedBmoIsALoadError();
    void upperCaseBmpIsANewPhoto();
    void clipboardOpensOrSaysItIsEmpty();
    void openDialogAsksAsItShould();
};

void StoreOpenTest::clickPreviewsAndPollLoads() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/house.bmp", Encode(FromArt(kHouse, 100), "BMP")));
    f.ws().Boxes[3].reference = 0x123456;
    f.ws().Boxes[3].color = 0x00FF00;
    f.ws().Stroke(7, 7) = 4;
    Click(f, "house.bmp");
    const QString path = f.picsFolder() + "/house.bmp";
    QCOMPARE(f.form().RequestedPicturePath, path);
    QVERIFY(f.form().CurrentPicturePath.isEmpty());
    QVERIFY(!f.ws().PictureLoaded);
    QCOMPARE(f.ws().Picture1.pixel(25, 25), ArtValue('R'));   // the preview is shown at once

    QVERIFY(PollUntilLoaded(f));
    QCOMPARE(f.form().CurrentPicturePath, path);
    QVERIFY(!f.ws().LoadingPicture);
    QVERIFY(!f.ws().PictureModified);
    for (int cy = 0; cy < 6; ++cy)
        for (int cx = 0; cx < 8; ++cx) {
            QCOMPARE(f.ws().Picture2.pixel(cx * 50 + 25, cy * 50 + 25), ArtValue(kHouse[cy][cx]));
            QCOMPARE(f.ws().Picture1.pixel(cx * 50 + 25, cy * 50 + 25), ArtValue(kHouse[cy][cx]));
        }
    QVERIFY(f.ws().Image1 == f.ws().Picture2);
    QCOMPARE(f.ws().Boxes[3].reference, 0);          // references reset
    QCOMPARE(f.ws().Boxes[3].color, 0x00FF00);       // colours kept
    QCOMPARE(f.ws().Stroke(7, 7), int16_t{0});       // a new photo starts unpainted
    QVERIFY(!f.ws().UndoEnabled);
    for (const char* key : {"Save", "Print", "Delete"})
        if (f.form().toolbarButtons.contains(key)) QVERIFY(f.form().toolbarButtonEnabled(key));
    QCOMPARE(f.form().cursor().shape(), Qt::ArrowCursor);
}

void StoreOpenTest::newerRequestCancelsRunningLoad() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/a.jpg", Encode(FromArt(kHouse, 100), "JPEG", 95)));
    QVERIFY(WriteBytes(f.picsFolder() + "/b.bmp", Encode(FromArt(kGarden, 50), "BMP")));
    Click(f, "a.jpg");
    // While the first load yields, the user clicks the second picture.
    bool clicked = false;
    QTimer::singleShot(0, &f.form(), [&] {
        f.form().File1->selectName("b.bmp");
        f.form().File1_Click();
        clicked = true;
    });
    f.form().BackgroundTimer_Timer();
    QVERIFY(clicked);
    QVERIFY(!f.ws().PictureLoaded);
    QVERIFY(!f.ws().LoadingPicture);
    QCOMPARE(f.form().RequestedPicturePath, f.picsFolder() + "/b.bmp");
    QVERIFY(PollUntilLoaded(f));
    QCOMPARE(f.form().CurrentPicturePath, f.picsFolder() + "/b.bmp");
    QCOMPARE(f.ws().Picture2.pixel(25, 25), ArtValue('G'));
    QCOMPARE(f.ws().Picture2.pixel(125, 125), ArtValue('W'));
}

void StoreOpenTest::badFilesGetTheLoadError_data() {
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("data");
    const QByteArray jpeg = Encode(FromArt(kHouse, 50), "JPEG", 90);
    QTest::newRow("zero-byte jpg") << "empty.jpg" << QByteArray();
    QTest::newRow("text named jpg") << "notes.jpg" << QByteArray("buy paint\r\n");
    QTest::newRow("truncated jpeg") << "cut.jpg" << jpeg.left(jpeg.size() * 2 / 3);
    QTest::newRow("bmp claiming 65000 x 65000") << "huge.bmp" << BmpClaiming(65000, 65000);
    QTest::newRow("jpeg claiming 65000 x 65000") << "huge.jpg" << JpegClaiming(jpeg, 65000, 65000);
}

void StoreOpenTest::badFilesGetTheLoadError() {
    QFETCH(QString, name);
    QFETCH(QByteArray, data);
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/good.bmp", Encode(FromArt(kGarden, 50), "BMP")));
    Click(f, "good.bmp");
    QVERIFY(PollUntilLoaded(f));
    QVERIFY(WriteBytes(f.picsFolder() + "/" + name, data));
    Click(f, name);
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Error - Unable to load picture"));
    QVERIFY(!f.platform().messages[0].text.isEmpty());
    // The request is not set; the loaded work stays.
    QCOMPARE(f.form().RequestedPicturePath, f.picsFolder() + "/good.bmp");
    QVERIFY(f.ws().PictureLoaded);
    QCOMPARE(f.ws().Picture1.pixel(25, 25), ArtValue('G'));
}

void StoreOpenTest::brokenMaskOpensClear() {
    FormFixture f;
    const QString base = f.picsFolder() + "/porch";
    QVERIFY(WriteBytes(base + ".bmp", Encode(FromArt(kHouse, 50), "BMP")));
    QVERIFY(WriteBytes(base + ".bmo", Encode(FromArt(kGarden, 50), "BMP")));
    Workspace painted;
    painted.Stroke(10, 10) = 2;
    painted.ColorPlane(10, 10) = 13;   // names no box
    std::string error;
    QVERIFY(store::WritePaintMask(painted, (base + ".msk").toStdString(), error));
    Click(f, "porch.bmp");
    QVERIFY(PollUntilLoaded(f));
    QCOMPARE(f.ws().Stroke(10, 10), int16_t{0});
    QCOMPARE(f.ws().ColorPlane(10, 10), int16_t{0});
    QCOMPARE(f.ws().StrokeNumber, 0);
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Paint Mask"));
    QCOMPARE(f.ws().Picture2.pixel(25, 25), ArtValue('G'));   // the photo came from the .bmo
}

void StoreOpenTest::wrongSizedBmoIsALoadError() {
    FormFixture f;
    const QString base = f.picsFolder() + "/shed";
    QVERIFY(WriteBytes(base + ".bmp", Encode(FromArt(kHouse, 50), "BMP")));
    QVERIFY(WriteBytes(base + ".bmo", Encode(FromArt(kGarden, 10), "BMP")));   // 80 x 60
    Click(f, "shed.bmp");
    for (int i = 0; i < 5; ++i) f.form().BackgroundTimer_Timer();
    QVERIFY(!f.ws().PictureLoaded);
    QVERIFY(!f.ws().LoadingPicture);
    QCOMPARE(f.platform().messages.size(), 1);   // reported once, not at every poll
    QCOMPARE(f.platform().messages[0].title, QString("Error - Unable to load picture"));
}

void StoreOpenTest::upperCaseBmpIsANewPhoto() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/HOUSE.BMP", Encode(FromArt(kHouse, 50), "BMP")));
    QVERIFY(WriteBytes(f.picsFolder() + "/HOUSE.bmo", Encode(FromArt(kGarden, 50), "BMP")));
    Click(f, "HOUSE.BMP");
    QVERIFY(PollUntilLoaded(f));
    QCOMPARE(f.ws().Picture2.pixel(25, 25), ArtValue('R'));   // the .BMP itself, not the .bmo
}

void StoreOpenTest::clipboardOpensOrSaysItIsEmpty() {
    FormFixture f;
    QGuiApplication::clipboard()->clear();
    f.form().OpenFromClipboardMenuItem_Click();
    QCOMPARE(f.platform().beeps, 1);
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Open - from Clipboard"));
    QCOMPARE(f.platform().messages[0].text, QString("The Clipbaord doesn't contain an Image"));
    QVERIFY(f.form().RequestedPicturePath.isEmpty());

    QGuiApplication::clipboard()->setImage(FromArt(kGarden, 25));
    f.form().OpenFromClipboardMenuItem_Click();
    QCOMPARE(f.form().RequestedPicturePath, QString(".GET-FROM-CLIPBOARD."));
    QVERIFY(PollUntilLoaded(f));
    QCOMPARE(f.form().CurrentPicturePath, f.picsFolder() + "/From Clipboard.xyz");
    QCOMPARE(f.form().RequestedPicturePath, f.form().CurrentPicturePath);
    QCOMPARE(f.ws().Picture2.pixel(125, 125), ArtValue('W'));
}

void StoreOpenTest::openDialogAsksAsItShould() {
    FormFixture f;
    QTemporaryDir elsewhere;
    QVERIFY(WriteBytes(elsewhere.path() + "/Kitchen.JPG", Encode(FromArt(kHouse, 50), "JPEG", 95)));
    f.platform().openChoices.push_back(platform::FileChoice{false, elsewhere.path() + "/kitchen.jpg", 1});
    f.form().OpenFromFileMenuItem_Click();
    QCOMPARE(f.platform().openRequests.size(), 1);
    const platform::FileRequest& r = f.platform().openRequests[0];
    QCOMPARE(r.title, QString("Select a Picture"));
    QCOMPARE(r.filter, QString("Picture files (BMP, JPG, GIF)| *.BMP;*.JPG;*.GIF|All files (*.*)|*.*"));
    QCOMPARE(r.flags, 4);
    QCOMPARE(r.initialFolder, f.picsFolder());
    QCOMPARE(f.form().Dir1->path(), QDir(elsewhere.path()).absolutePath());
    QCOMPARE(f.form().File1->selectedName(), QString("Kitchen.JPG"));   // found ignoring case
    QCOMPARE(f.form().RequestedPicturePath, QDir(elsewhere.path()).absolutePath() + "/Kitchen.JPG");

    f.form().OpenFromFileMenuItem_Click();   // cancelled: nothing changes
    QCOMPARE(f.form().RequestedPicturePath, QDir(elsewhere.path()).absolutePath() + "/Kitchen.JPG");
}

QTEST_MAIN(StoreOpenTest)
#include "store_open_test.moc"
