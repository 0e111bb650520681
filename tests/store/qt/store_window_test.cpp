// The picture store in the window: decoding, opening, saving and deleting.
#include <QLineEdit>
#include <QTimer>
#include <QtTest>
#include <csignal>
#include <sys/resource.h>

#include "imaging/qt/PictureDecoder.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/SaveForm.h"
#include "support/FormFixture.h"

namespace {
const char* const kExts[] = {".bmp", ".bmo", ".msk", ".csc"};
// Art cells: R G B Y W, anything else brown; nothing symmetric.
const QStringList kHouse = {"RR.B", "GYYW", ".BGR"};
const QStringList kGarden = {"GGGY", "W..G", "RRBB"};

QRgb ArtColor(QChar c) {
    const QRgb colours[] = {qRgb(220, 30, 20), qRgb(20, 180, 40), qRgb(30, 40, 210), qRgb(240, 220, 30),
                            qRgb(250, 250, 245), qRgb(60, 40, 20)};
    const qsizetype i = QStringLiteral("RGBYW").indexOf(c);
    return colours[i < 0 ? 5 : i];
}

// The art encoded as a picture file, each character a cell x cell block.
QByteArray Art(const QStringList& art, int cell, const char* format = "BMP") {
    QImage image(static_cast<int>(art[0].size()) * cell, static_cast<int>(art.size()) * cell, QImage::Format_RGB32);
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x) image.setPixel(x, y, ArtColor(art[y / cell][x / cell]));
    QByteArray data;
    QBuffer buffer(&data);
    return buffer.open(QIODevice::WriteOnly) && image.save(&buffer, format, 95) ? data : QByteArray();
}

// Whether the 100-pixel cells of the work picture hold the art's colours.
bool Shows(const Picture& p, const QStringList& art) {
    for (int cell = 0; cell < 12; ++cell) {
        const QRgb c = ArtColor(art[cell / 4][cell % 4]);
        if (p.pixel(cell % 4 * 100 + 50, cell / 4 * 100 + 50) != qRed(c) + 256 * qGreen(c) + 65536 * qBlue(c)) return false;
    }
    return true;
}

bool Put(const QString& path, const QByteArray& data) {
    QFile f(path);
    return f.open(QIODevice::WriteOnly) && f.write(data) == data.size();
}

QByteArray Read(const QString& path) {
    QFile f(path);
    return f.open(QIODevice::ReadOnly) ? f.readAll() : QByteArray();
}

QStringList FilesIn(const QString& folder) { return QDir(folder).entryList(QDir::Files | QDir::Hidden, QDir::Name); }

// Clicks a file of the list (false when it is not listed).
bool Click(FormFixture& f, const QString& name) {
    f.form().rereadFileList();
    if (!f.form().File1->selectName(name)) return false;
    f.form().File1_Click();
    return true;
}

// Runs the background poll until the load ends.
bool Loaded(FormFixture& f) {
    for (int i = 0; i < 50 && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
    return f.ws().PictureLoaded;
}

// Answers the next save form with `name` and saves.
void SaveAs(FormFixture& f, const QString& name) {
    f.platform().dialogs.push_back([name](QDialog& d) {
        auto& form = dynamic_cast<SaveForm&>(d);
        form.SaveFilename->setText(name);
        form.SaveButton_Click();
        return int(QDialog::Accepted);
    });
    f.form().SaveWork();
}

// The house opened and painted: strokes 1 and 2 shown, 3 undone; box 5 named.
void PaintedHouse(FormFixture& f) {
    QVERIFY(Put(f.picsFolder() + "/front.bmp", Art(kHouse, 100)) && Click(f, "front.bmp") && Loaded(f));
    Workspace& ws = f.ws();
    ws.Stroke(10, 20) = 1;  ws.ColorPlane(10, 20) = 2;
    ws.Stroke(11, 20) = 2;  ws.ColorPlane(11, 20) = 5;
    ws.Stroke(12, 20) = -3; ws.ColorPlane(12, 20) = 5;
    ws.Boxes[5] = ColorBox{"Garage Door", 0x00A0FF, 0x808080};
    ws.PictureModified = true;
}
} // namespace

class StoreWindowTest : public QObject {
    Q_OBJECT
private slots:
    void largeJpegOpensUprightAtReducedScale();
    void newPhotoResetsReferencesAndMask();
    void newerRequestCancelsRunningLoad();
    void badFilesGetTheLoadError_data();
    void badFilesGetTheLoadError();
    void saveAndReopenWork();
    void brokenMaskOpensClearWithAWarning();
    void workBehindTheTitleScreenIsSaved();
    void missingPicsFolderIsMade();
    void overwriteRefusedOrFailedKeepsTheOldFiles();
    void unsafeNamesAreRefused_data();
    void unsafeNamesAreRefused();
    void deleteRules_data();
    void deleteRules();
};

void StoreWindowTest::largeJpegOpensUprightAtReducedScale() {
    // Stored 3200 x 1600 on its side (EXIF orientation 6), decoded at 1/8;
    // turned clockwise, the stored top-left red lies at the top right.
    const char exif[] = {'\xFF', '\xE1', 0, 34, 'E', 'x', 'i', 'f', 0, 0, 'I', 'I', 42, 0, 8, 0, 0, 0, 1, 0,
                         0x12, 0x01, 3, 0, 1, 0, 0, 0, 6, 0, 0, 0, 0, 0, 0, 0};
    const QByteArray jpeg = Art({"RR..", "...B"}, 800, "JPEG");
    const QImage image = imaging::DecodePictureData(jpeg.left(2) + QByteArray(exif, sizeof exif) + jpeg.mid(2), QSize(100, 100)).image;
    QCOMPARE(image.size(), QSize(200, 400));
    const QColor topRight = image.pixelColor(195, 5), bottomLeft = image.pixelColor(5, 395);
    QVERIFY2(topRight.red() > 180 && topRight.blue() < 80, qPrintable(topRight.name()));
    QVERIFY2(bottomLeft.blue() > 150 && bottomLeft.red() < 80, qPrintable(bottomLeft.name()));
}

void StoreWindowTest::newPhotoResetsReferencesAndMask() {
    // An upper-case .BMP in PICS is a new photo, even with a .bmo beside it.
    FormFixture f;
    QVERIFY(Put(f.picsFolder() + "/HOUSE.BMP", Art(kHouse, 200)) && Put(f.picsFolder() + "/HOUSE.bmo", Art(kGarden, 100)));
    f.ws().Boxes[3] = ColorBox{"Trim", 0x00FF00, 0x123456};
    f.ws().Stroke(7, 7) = 4;
    QVERIFY(Click(f, "HOUSE.BMP"));
    QVERIFY(Shows(f.ws().Picture1, kHouse) && !f.ws().PictureLoaded);   // the preview is shown at once
    QVERIFY(Loaded(f) && Shows(f.ws().Picture2, kHouse));
    QVERIFY(f.ws().Boxes[3].reference == 0 && f.ws().Boxes[3].color == 0x00FF00);   // colours stay
    QVERIFY(f.ws().Stroke(7, 7) == 0 && !f.ws().UndoEnabled && !f.ws().LoadingPicture);
}

void StoreWindowTest::newerRequestCancelsRunningLoad() {
    FormFixture f;
    QVERIFY(Put(f.picsFolder() + "/a.jpg", Art(kHouse, 200, "JPEG")) && Put(f.picsFolder() + "/b.bmp", Art(kGarden, 100)));
    QVERIFY(Click(f, "a.jpg"));
    // While the first load yields, the user clicks the second picture.
    QTimer::singleShot(0, &f.form(), [&] { Click(f, "b.bmp"); });
    f.form().BackgroundTimer_Timer();
    QVERIFY(!f.ws().PictureLoaded && !f.ws().LoadingPicture);
    QCOMPARE(f.form().RequestedPicturePath, f.picsFolder() + "/b.bmp");
    QVERIFY(Loaded(f) && Shows(f.ws().Picture2, kGarden));
}

void StoreWindowTest::badFilesGetTheLoadError_data() {
    QTest::addColumn<QByteArray>("data");
    QByteArray jpeg = Art(kHouse, 50, "JPEG");
    QTest::newRow("truncated") << jpeg.left(jpeg.size() * 2 / 3);
    const qsizetype sof = jpeg.indexOf(QByteArray("\xFF\xC0", 2));
    QTest::newRow("claiming 65000 x 65000") << jpeg.replace(sof + 5, 4, "\xFD\xE8\xFD\xE8", 4);
}

void StoreWindowTest::badFilesGetTheLoadError() {
    QFETCH(QByteArray, data);
    FormFixture f;
    QVERIFY(Put(f.picsFolder() + "/good.bmp", Art(kGarden, 100)) && Click(f, "good.bmp") && Loaded(f));
    QVERIFY(Put(f.picsFolder() + "/bad.jpg", data) && Click(f, "bad.jpg"));
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Error - Unable to load picture"));
    QCOMPARE(f.form().RequestedPicturePath, f.picsFolder() + "/good.bmp");   // the loaded work stays
    QVERIFY(f.ws().PictureLoaded && Shows(f.ws().Picture1, kGarden));
}

void StoreWindowTest::saveAndReopenWork() {
    FormFixture f;
    PaintedHouse(f);
    SaveAs(f, "garden.jpg");   // a typed extension is dropped
    QVERIFY(!f.ws().PictureModified);
    QCOMPARE(QFileInfo(f.picsFolder() + "/garden.bmp").size(), 360054);   // 24-bit
    QCOMPARE(QFileInfo(f.picsFolder() + "/garden.msk").size(), 482804);
    QCOMPARE(FilesIn(f.picsFolder()), QStringList({"front.bmp", "garden.bmo", "garden.bmp", "garden.csc", "garden.msk"}));
    QCOMPARE(f.form().File1->entries(), QStringList({"front.bmp", "garden.bmp"}));   // only pictures are listed
    QCOMPARE(f.form().File1->selectedName(), QString("garden.bmp"));

    QVERIFY(Put(f.picsFolder() + "/garden.bmp", Art(kGarden, 100)));   // the base photo comes from the .bmo
    for (const bool withScheme : {false, true}) {
        f.ws().Boxes[5] = ColorBox{"Other", 0x010101, 0x111111};
        f.ws().LoadWithPicture = withScheme;
        QVERIFY(Click(f, "garden.bmp") && Loaded(f) && Shows(f.ws().Picture2, kHouse));
        QCOMPARE(f.ws().Stroke(12, 20), int16_t{-3});
        QCOMPARE(f.ws().StrokeNumber, 2);
        QVERIFY(f.ws().UndoEnabled && f.ws().RedoEnabled && !f.ws().PictureModified);
        QCOMPARE(f.ws().Boxes[5].name, std::string(withScheme ? "Garage Door" : "Other"));
        QCOMPARE(f.ws().Boxes[5].reference, withScheme ? 0x808080 : 0);
    }
}

void StoreWindowTest::brokenMaskOpensClearWithAWarning() {
    FormFixture f;
    PaintedHouse(f);
    f.ws().ColorPlane(30, 30) = 13;  // no such colour box
    f.ws().Stroke(30, 30) = 1;
    SaveAs(f, "porch");
    QVERIFY(Click(f, "porch.bmp") && Loaded(f));
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Paint Mask"));
    QVERIFY(std::all_of(f.ws().PaintMask.begin(), f.ws().PaintMask.end(), [](int16_t v) { return v == 0; }));
    QVERIFY(!f.ws().UndoEnabled && !f.ws().RedoEnabled);
}

void StoreWindowTest::workBehindTheTitleScreenIsSaved() {
    FormFixture f;
    PaintedHouse(f);
    f.form().AboutMenuItem_Click();
    f.form().BackgroundTimer_Timer();  // the title screen covers the view
    QVERIFY(!Shows(f.ws().Picture1, kHouse));
    f.platform().answers.push_back(platform::Answer::Yes);
    f.platform().dialogs.push_back([](QDialog& d) {
        auto& form = dynamic_cast<SaveForm&>(d);
        form.SaveFilename->setText("front work");
        form.SaveButton_Click();
        return int(QDialog::Accepted);
    });
    QVERIFY(f.form().close());
    QVERIFY(!f.ws().PictureModified);
    const imaging::DecodedPicture saved = imaging::DecodePictureFile(f.picsFolder() + "/front work.bmp");
    QVERIFY(saved.ok());
    QCOMPARE(saved.image.pixel(150, 50), ArtColor('R'));
    QCOMPARE(saved.image.pixel(350, 150), ArtColor('W'));
}

void StoreWindowTest::missingPicsFolderIsMade() {
    FormFixture f(false);
    QVERIFY(QDir(f.picsFolder()).removeRecursively());
    f.startup();
    QVERIFY(QFileInfo(f.picsFolder()).isDir());
    QCOMPARE(f.form().Dir1->path(), f.picsFolder());
    QVERIFY(f.platform().messages.isEmpty());
}

void StoreWindowTest::overwriteRefusedOrFailedKeepsTheOldFiles() {
    FormFixture f;
    for (const char* ext : kExts) QVERIFY(Put(f.picsFolder() + "/porch" + ext, ext));
    PaintedHouse(f);
    f.platform().answers.push_back(platform::Answer::No);
    SaveAs(f, "porch");
    QCOMPARE(f.platform().messages[0].text,
             QString("Picture Name>> porch.bmp\r\n\r\nDo you want to Overwrite it?\r\n\r\n"
                     "Note: This will also overwrite the paint mask file and\r\nthe color scheme file."));
    // Answered Yes: the two bitmaps fit under the file-size limit, the mask does not.
    auto* handler = std::signal(SIGXFSZ, SIG_IGN);
    rlimit previous{};
    getrlimit(RLIMIT_FSIZE, &previous);
    const rlimit lower = {400000, previous.rlim_max};
    setrlimit(RLIMIT_FSIZE, &lower);
    SaveAs(f, "porch");
    setrlimit(RLIMIT_FSIZE, &previous);
    std::signal(SIGXFSZ, handler);
    QCOMPARE(f.platform().messages.size(), 3);
    QCOMPARE(f.platform().messages[2].title, QString("Warning - Save in PICS folder"));
    for (const char* ext : kExts) QCOMPARE(Read(f.picsFolder() + "/porch" + ext), QByteArray(ext));
    QCOMPARE(FilesIn(f.picsFolder()).size(), 5);   // no temporary left behind
    QVERIFY(f.ws().PictureModified);
}

void StoreWindowTest::unsafeNamesAreRefused_data() {
    QTest::addColumn<QString>("name");
    for (const char* name : {"../escape", "sub/house", "..\\house", "..", ".bmp"}) QTest::newRow(name) << name;
}

void StoreWindowTest::unsafeNamesAreRefused() {
    QFETCH(QString, name);
    FormFixture f;
    PaintedHouse(f);
    SaveAs(f, name);
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Save in PICS folder"));
    QCOMPARE(QDir(f.programFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), QStringList({"PICS"}));
    QCOMPARE(FilesIn(f.picsFolder()), QStringList({"front.bmp"}));
    QVERIFY(f.ws().PictureModified);
}

void StoreWindowTest::deleteRules_data() {
    QTest::addColumn<bool>("inPics");
    QTest::addColumn<QString>("selected");
    QTest::addColumn<QStringList>("companions");
    QTest::addColumn<bool>("companionsGo");
    const QStringList all = {"house.bmo", "house.csc", "house.msk"};
    QTest::newRow("work in PICS") << true << "house.bmp" << all << true;
    QTest::newRow("jpg in PICS") << true << "house.jpg" << all << false;
    QTest::newRow("bmp outside PICS") << false << "house.bmp" << all << false;
    QTest::newRow("work without its mask") << true << "house.bmp" << QStringList({"house.bmo"}) << true;
    QTest::newRow("upper-case BMP") << true << "HOUSE.BMP" << QStringList({"HOUSE.bmo"}) << false;
}

void StoreWindowTest::deleteRules() {
    QFETCH(bool, inPics);
    QFETCH(QString, selected);
    QFETCH(QStringList, companions);
    QFETCH(bool, companionsGo);
    FormFixture f;
    const QString folder = inPics ? f.picsFolder() : f.programFolder() + "/Photos";
    QVERIFY(QDir().mkpath(folder));
    for (const QString& name : companions + QStringList({selected, "other.bmp"})) QVERIFY(Put(folder + "/" + name, "x"));
    QVERIFY(f.form().Dir1->setPath(folder));
    f.form().rereadFileList();
    QVERIFY(f.form().File1->selectName(selected));
    f.form().DeletePicture();
    QCOMPARE(f.platform().messages[0].title, "Delete - " + selected);
    QCOMPARE(f.platform().messages[0].text, QString("Delete this Picture?\r\n\r\nNote: This will also delete "
                                                    "the paint mask file and\r\nthe color scheme file."));
    QCOMPARE(FilesIn(folder), (companionsGo ? QStringList() : companions) + QStringList({"other.bmp"}));
}

QTEST_MAIN(StoreWindowTest)
#include "store_window_test.moc"
