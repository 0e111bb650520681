// Decoding and fitting photos: reduced-scale JPEGs, orientation, refusals.
#include <QTemporaryDir>
#include <QtTest>

#include "imaging/qt/BmpWriter.h"
#include "imaging/qt/PictureDecoder.h"
#include "store/qt/FitPicture.h"
#include "store/qt/StorePictures.h"

using namespace storetest;

class StoreDecoderTest : public QObject {
    Q_OBJECT
private slots:
    void largeJpegIsDecodedAtReducedScale();
    void orientationTagOpensUpright();
    void fitShowsTheArtTheRightWayRound();
    void autoCropDropsTheSides();
    void badInputIsRefused_data();
    void badInputIsRefused();
    void bitmapWriterGives24Bits();
};

void StoreDecoderTest::largeJpegIsDecodedAtReducedScale() {
    const QByteArray jpeg = Encode(FromArt(kHouse, 400), "JPEG", 90);   // 3200 x 2400
    const imaging::DecodedPicture d = imaging::DecodePictureData(jpeg);
    QVERIFY2(d.ok(), qPrintable(d.error));
    QCOMPARE(d.fullSize, QSize(3200, 2400));
    QCOMPARE(d.image.size(), QSize(800, 600));   // 1/4 keeps twice the work size
    const imaging::DecodedPicture whole = imaging::DecodePictureData(jpeg, QSize());
    QCOMPARE(whole.image.size(), QSize(3200, 2400));
}

void StoreDecoderTest::orientationTagOpensUpright() {
    // Stored 3200 x 1600 on its side; the tag turns it to 1600 x 3200.
    const QStringList art = {"RRRR....", "........", "........", "....BBBB"};
    const QByteArray jpeg = WithOrientation(Encode(FromArt(art, 400), "JPEG", 90), 6);
    const imaging::DecodedPicture d = imaging::DecodePictureData(jpeg, QSize(100, 100));
    QVERIFY2(d.ok(), qPrintable(d.error));
    QCOMPARE(d.fullSize, QSize(1600, 3200));
    QCOMPARE(d.image.width() * 2, d.image.height());
    // Turned clockwise, the stored top-left red lies at the top right.
    const QColor topRight = d.image.pixelColor(d.image.width() - 5, 5);
    QVERIFY2(topRight.red() > 180 && topRight.blue() < 80, qPrintable(topRight.name()));
    const QColor bottomLeft = d.image.pixelColor(5, d.image.height() - 5);
    QVERIFY2(bottomLeft.blue() > 150 && bottomLeft.red() < 80, qPrintable(bottomLeft.name()));
}

void StoreDecoderTest::fitShowsTheArtTheRightWayRound() {
    const imaging::DecodedPicture d = imaging::DecodedFromImage(FromArt(kHouse, 100));   // 800 x 600
    const Picture fitted = store::FitPicture(d, false);
    QCOMPARE(fitted.width(), 400);
    for (int cy = 0; cy < 6; ++cy)
        for (int cx = 0; cx < 8; ++cx)
            QCOMPARE(fitted.pixel(cx * 50 + 25, cy * 50 + 25), ArtValue(kHouse[cy][cx]));
}

void StoreDecoderTest::autoCropDropsTheSides() {
    // 16 x 6 cells of 50: 800 x 300, the middle 400 x 300 is kept (c = 200).
    const QStringList wide = {"GGGGRRRR..BBYYYY", "GGGGR..GGG.BYYYY", "GGGGR.YYYY.WYYYY",
                              "GGGG..Y..Y.WYYYY", "GGGGGG....RRYYYY", "GGGGGGBBB.RWYYYY"};
    const imaging::DecodedPicture d = imaging::DecodedFromImage(FromArt(wide, 50));
    const Picture cropped = store::FitPicture(d, true);
    for (int cy = 0; cy < 6; ++cy)
        for (int cx = 0; cx < 8; ++cx)
            QCOMPARE(cropped.pixel(cx * 50 + 25, cy * 50 + 25), ArtValue(kHouse[cy][cx]));
    const Picture squeezed = store::FitPicture(d, false);
    QCOMPARE(squeezed.pixel(10, 10), ArtValue('G'));
    QCOMPARE(squeezed.pixel(390, 10), ArtValue('Y'));
}

void StoreDecoderTest::badInputIsRefused_data() {
    QTest::addColumn<QByteArray>("data");
    const QByteArray jpeg = Encode(FromArt(kHouse, 50), "JPEG", 90);
    const QByteArray bmp = Encode(FromArt(kHouse, 50), "BMP");
    QTest::newRow("zero bytes") << QByteArray();
    QTest::newRow("text") << QByteArray("Shopping list: paint, rollers, drop sheet\n");
    QTest::newRow("truncated jpeg") << jpeg.left(jpeg.size() / 2);
    QTest::newRow("truncated bmp") << bmp.left(bmp.size() - 1000);
    QTest::newRow("jpeg claiming 65000 x 65000") << JpegClaiming(jpeg, 65000, 65000);
    QTest::newRow("bmp claiming 65000 x 65000") << BmpClaiming(65000, 65000);
}

void StoreDecoderTest::badInputIsRefused() {
    QFETCH(QByteArray, data);
    const imaging::DecodedPicture d = imaging::DecodePictureData(data);
    QVERIFY(!d.ok());
    QVERIFY(!d.error.isEmpty());
    QVERIFY(d.image.isNull());
}

void StoreDecoderTest::bitmapWriterGives24Bits() {
    Picture p(400, 300, 0x102030);
    p.setPixel(0, 0, 0x0000FF);   // red at the top left
    store::Bytes bytes;
    QString error;
    QVERIFY(imaging::EncodeBmp24(p, bytes, error));
    QCOMPARE(bytes.size(), size_t{360054});
    QCOMPARE(int(bytes[28]), 24);
    const QImage back = QImage::fromData(reinterpret_cast<const uchar*>(bytes.data()), static_cast<int>(bytes.size()));
    QCOMPARE(back.pixelColor(0, 0), QColor(255, 0, 0));
    QCOMPARE(back.pixelColor(399, 299), QColor(0x30, 0x20, 0x10));
}

QTEST_MAIN(StoreDecoderTest)
#include "store_decoder_test.moc"
