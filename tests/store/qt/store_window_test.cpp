// The picture store in the window: decoding, opening, saving and deleting.
#include <QLineEdit>
#include <QtTest>
#include <csignal>
#include <sys/resource.h>

#include "imaging/qt/PictureDecoder.h"
#include "store/qt/BrowserLists.h"
#include "store/qt/SaveForm.h"
#include "support/FormFixture.h"

namespace {
// Art cells: R G B Y W, anything else brown; nothing symmetric.
const QStringList kHouse = {"RR.B", "GYYW", ".BGR"};
const QStringList kGarden = {"GGGY", "W..G", "RRBB"};

QRgb ArtColor(QChar c) {
    const QRgb colours[] = {qRgb(220, 30, 20), qRgb(20, 180, 40), qRgb(30, 40, 210), qRgb(240, 220, 30),
                            qRgb(250, 250, 245), qRgb(60, 40, 20)};
    return colours[(QStringLiteral("RGBYW").indexOf(c) + 6) % 6];
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

// Answers the next save form with `name`; saves at once unless told not to.
void SaveAs(FormFixture& f, const QString& name, bool now = true) {
    f.platform().dialogs.push_back([name](QDialog& d) {
        dynamic_cast<SaveForm&>(d).SaveFilename->setText(name);
        dynamic_cast<SaveForm&>(d).SaveButton_Click();
        return int(QDialog::Accepted);
    });
    if (now) f.form().SaveWork();
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
    void largeJpegOpensUprightAtReducedScale() {
        // Stored 3200 x 1600 on its side (EXIF orientation 6), decoded at 1/8;
        // turned clockwise, the stored top-left red lies at the top right.
        const char exif[] = {'\xFF', '\xE1', 0, 34, 'E', 'x', 'i', 'f', 0, 0, 'I', 'I', 42, 0, 8, 0, 0, 0, 1, 0,
                             0x12, 0x01, 3, 0, 1, 0, 0, 0, 6, 0, 0, 0, 0, 0, 0, 0};
        const QByteArray jpeg = Art({"RR..", "...B"}, 800, "JPEG");
        const QImage image = imaging::DecodePictureData(jpeg.left(2) + QByteArray(exif, sizeof exif) + jpeg.mid(2), QSize(100, 100)).image;
        QCOMPARE(image.size(), QSize(200, 400));
        const QColor topRight = image.pixelColor(195, 5), bottomLeft = image.pixelColor(5, 395);
        QVERIFY(topRight.red() > 180 && topRight.blue() < 80 && bottomLeft.blue() > 150 && bottomLeft.red() < 80);
    }

    void newerRequestCancelsRunningLoadAndNewPhotoStartsClear() {
        // An upper-case .BMP in PICS is a new photo, even with a .bmo beside it.
        FormFixture f;
        for (const auto& [name, data] : {std::pair{"a.jpg", Art(kHouse, 200, "JPEG")}, {"B.BMP", Art(kGarden, 100)}, {"B.bmo", Art(kHouse, 100)}})
            QVERIFY(Put(f.picsFolder() + "/" + name, data));
        f.ws().Boxes[3] = ColorBox{"Trim", 0x00FF00, 0x123456};  f.ws().Stroke(7, 7) = 4;
        QVERIFY(Click(f, "a.jpg"));
        QTimer::singleShot(0, &f.form(), [&] { Click(f, "B.BMP"); });   // clicked while the first load yields
        f.form().BackgroundTimer_Timer();
        QVERIFY(!f.ws().PictureLoaded && !f.ws().LoadingPicture && Shows(f.ws().Picture1, kGarden));   // preview at once
        QVERIFY(Loaded(f) && Shows(f.ws().Picture2, kGarden));
        QVERIFY(f.ws().Boxes[3].reference == 0 && f.ws().Stroke(7, 7) == 0 && !f.ws().UndoEnabled);
        QCOMPARE(f.ws().Boxes[3].color, 0x00FF00);   // colours stay
    }

    void hugeJpegGetsTheLoadError() {
        QByteArray jpeg = Art(kHouse, 50, "JPEG");
        jpeg.replace(jpeg.indexOf(QByteArray("\xFF\xC0", 2)) + 5, 4, "\xFD\xE8\xFD\xE8", 4);   // claims 65000 x 65000
        FormFixture f;
        QVERIFY(Put(f.picsFolder() + "/good.bmp", Art(kGarden, 100)) && Click(f, "good.bmp") && Loaded(f));
        QVERIFY(Put(f.picsFolder() + "/bad.jpg", jpeg) && Click(f, "bad.jpg"));
        QVERIFY(f.platform().messages.size() == 1 && f.platform().messages[0].title == "Error - Unable to load picture");
        QVERIFY(f.ws().PictureLoaded && Shows(f.ws().Picture1, kGarden));   // the loaded work stays
    }

    void saveAndReopenWork() {
        FormFixture f;
        PaintedHouse(f);
        SaveAs(f, "garden.jpg");   // a typed extension is dropped
        QCOMPARE(QFileInfo(f.picsFolder() + "/garden.bmp").size(), 360054);   // 24-bit
        QCOMPARE(FilesIn(f.picsFolder()), QStringList({"front.bmp", "garden.bmo", "garden.bmp", "garden.csc", "garden.msk"}));
        QCOMPARE(f.form().File1->entries(), QStringList({"front.bmp", "garden.bmp"}));   // only pictures are listed
        QVERIFY(Put(f.picsFolder() + "/garden.bmp", Art(kGarden, 100)));   // the base photo comes from the .bmo
        for (const bool withScheme : {false, true}) {
            f.ws().Boxes[5] = ColorBox{"Other", 0x010101, 0x111111};
            f.ws().LoadWithPicture = withScheme;
            QVERIFY(Click(f, "garden.bmp") && Loaded(f) && Shows(f.ws().Picture2, kHouse) && !f.ws().PictureModified);
            QVERIFY(f.ws().Stroke(12, 20) == -3 && f.ws().StrokeNumber == 2 && f.ws().UndoEnabled && f.ws().RedoEnabled);
            QVERIFY(f.ws().Boxes[5].name == (withScheme ? "Garage Door" : "Other") && f.ws().Boxes[5].reference == (withScheme ? 0x808080 : 0));
            // Without its scheme no box can be drawn: the photo shows, edges too.
            QCOMPARE(f.ws().Picture1 == f.ws().Picture2, !withScheme);
        }
    }

    void brokenMaskOpensClearWithAWarning() {
        FormFixture f;
        PaintedHouse(f);
        f.ws().ColorPlane(30, 30) = 13;  // no such colour box
        f.ws().Stroke(30, 30) = 1;
        SaveAs(f, "porch");
        QVERIFY(Click(f, "porch.bmp") && Loaded(f));
        QVERIFY(f.platform().messages.size() == 1 && f.platform().messages[0].title == "Warning - Paint Mask");
        QVERIFY(std::all_of(f.ws().PaintMask.begin(), f.ws().PaintMask.end(), [](int16_t v) { return v == 0; }));
        QVERIFY(!f.ws().UndoEnabled && !f.ws().RedoEnabled);
    }

    void workBehindTheTitleScreenIsSaved() {
        FormFixture f;
        PaintedHouse(f);
        f.form().AboutMenuItem_Click();
        f.form().BackgroundTimer_Timer();  // the title screen covers the view
        QVERIFY(!Shows(f.ws().Picture1, kHouse));
        f.platform().answers.push_back(platform::Answer::Yes);
        SaveAs(f, "front work", false);
        QVERIFY(f.form().close() && !f.ws().PictureModified);
        const QImage saved = imaging::DecodePictureFile(f.picsFolder() + "/front work.bmp").image;
        QVERIFY(saved.pixel(150, 50) == ArtColor('R') && saved.pixel(350, 150) == ArtColor('W'));
    }

    void missingPicsFolderIsMade() {
        FormFixture f(false);
        QVERIFY(QDir(f.picsFolder()).removeRecursively());
        f.startup();
        QVERIFY(QFileInfo(f.picsFolder()).isDir() && f.platform().messages.isEmpty());
        QCOMPARE(f.form().Dir1->path(), f.picsFolder());
    }

    void overwriteRefusedOrFailedKeepsTheOldFiles() {
        FormFixture f;
        for (const char* ext : {".bmp", ".bmo", ".msk", ".csc"}) QVERIFY(Put(f.picsFolder() + "/porch" + ext, ext));
        PaintedHouse(f);
        f.platform().answers.push_back(platform::Answer::No);
        SaveAs(f, "porch");
        QCOMPARE(f.platform().messages[0].text,
                 QString("Picture Name>> porch.bmp\r\n\r\nDo you want to Overwrite it?\r\n\r\n"
                         "Note: This will also overwrite the paint mask file and\r\nthe color scheme file."));
        // Answered Yes: the two bitmaps fit under the file-size limit, the mask does not.
        std::signal(SIGXFSZ, SIG_IGN);
        rlimit previous{};
        getrlimit(RLIMIT_FSIZE, &previous);
        const rlimit lower = {400000, previous.rlim_max};
        setrlimit(RLIMIT_FSIZE, &lower);
        SaveAs(f, "porch");
        setrlimit(RLIMIT_FSIZE, &previous);
        QCOMPARE(f.platform().messages.size(), 3);
        QCOMPARE(f.platform().messages[2].title, QString("Warning - Save in PICS folder"));
        for (const char* ext : {".bmp", ".bmo", ".msk", ".csc"}) QCOMPARE(QFileInfo(f.picsFolder() + "/porch" + ext).size(), 4);   // the old four bytes
        QCOMPARE(FilesIn(f.picsFolder()).size(), 5);   // no temporary left behind
        QVERIFY(f.ws().PictureModified);
    }

    void unsafeNamesAreRefused() {
        for (const char* name : {"../escape", "sub/house", "..\\house", "..", ".bmp"}) {
            FormFixture f;
            PaintedHouse(f);
            SaveAs(f, name);
            QVERIFY2(f.platform().messages.size() == 1 && f.platform().messages[0].title == "Warning - Save in PICS folder", name);
            QCOMPARE(QDir(f.programFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), QStringList({"PICS"}));
            QVERIFY(FilesIn(f.picsFolder()) == QStringList({"front.bmp"}) && f.ws().PictureModified);
        }
    }

    void deleteRules() {
        // Folder under the program folder, the picture chosen, files beside it, whether those go too.
        const struct { const char* folder; QString selected; QStringList companions; bool companionsGo; } rows[] = {
            {"PICS", "house.bmp", {"house.bmo", "house.csc", "house.msk"}, true},
            {"PICS", "house.jpg", {"house.bmo", "house.csc", "house.msk"}, false},
            {"Photos", "house.bmp", {"house.bmo", "house.csc", "house.msk"}, false},
            {"PICS", "house.bmp", {"house.bmo"}, true},   // work without its mask
            {"PICS", "HOUSE.BMP", {"HOUSE.bmo"}, false}};
        for (const auto& row : rows) {
            FormFixture f;
            const QString folder = f.programFolder() + "/" + row.folder;
            QVERIFY(QDir().mkpath(folder) && f.form().Dir1->setPath(folder));
            for (const QString& name : row.companions + QStringList({row.selected, "other.bmp"})) QVERIFY(Put(folder + "/" + name, "x"));
            f.form().rereadFileList();
            QVERIFY(f.form().File1->selectName(row.selected));
            f.form().DeletePicture();
            QCOMPARE(f.platform().messages[0].title, "Delete - " + row.selected);
            QCOMPARE(f.platform().messages[0].text, QString("Delete this Picture?\r\n\r\nNote: This will also delete "
                                                            "the paint mask file and\r\nthe color scheme file."));
            QCOMPARE(FilesIn(folder), (row.companionsGo ? QStringList() : row.companions) + QStringList({"other.bmp"}));
        }
    }
};

QTEST_MAIN(StoreWindowTest)
#include "store_window_test.moc"
