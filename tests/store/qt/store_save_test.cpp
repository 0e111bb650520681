// Saving a work into PICS and opening it again; the overwrite question,
// unsafe names, failed writes and the close question.
#include <QDirIterator>
#include <QLineEdit>
#include <QtTest>
#include <csignal>
#include <sys/resource.h>

#include "store/qt/BrowserLists.h"
#include "store/qt/SaveForm.h"
#include "store/qt/StorePictures.h"
#include "support/FormFixture.h"

using namespace storetest;

namespace {
bool PollUntilLoaded(FormFixture& f) {
    for (int i = 0; i < 50 && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
    return f.ws().PictureLoaded;
}

void Open(FormFixture& f, const QString& name) {
    f.form().rereadFileList();
    QVERIFY(f.form().File1->selectName(name));
    f.form().File1_Click();
    QVERIFY(PollUntilLoaded(f));
}

// Answers the save form with `name` (Save), or cancels it when `name` is null.
void ScriptSaveForm(FormFixture& f, const QString& name, QString* offered = nullptr) {
    f.platform().dialogs.push_back([name, offered](QDialog& d) {
        auto& form = dynamic_cast<SaveForm&>(d);
        if (offered) *offered = form.SaveFilename->text();
        if (name.isNull()) {
            form.CancelButton_Click();
            return int(QDialog::Rejected);
        }
        form.SaveFilename->setText(name);
        form.SaveButton_Click();
        return int(QDialog::Accepted);
    });
}

// A painted work: strokes 1 and 2 shown, stroke 3 undone; boxes 2 and 5 coloured.
void Paint(Workspace& ws) {
    ws.Stroke(10, 20) = 1;  ws.ColorPlane(10, 20) = 2;
    ws.Stroke(11, 20) = 2;  ws.ColorPlane(11, 20) = 5;
    ws.Stroke(12, 20) = -3; ws.ColorPlane(12, 20) = 5;
    ws.Boxes[2].color = 0x3060C0;
    ws.Boxes[2].reference = 0x808080;
    ws.Boxes[5].color = 0x00A0FF;
    ws.Boxes[5].name = "Garage Door";
    ws.PictureModified = true;
}

QStringList Hidden(const QString& folder) {
    return QDir(folder).entryList(QDir::Files | QDir::Hidden | QDir::System).filter(QRegularExpression("^[.~]"));
}

const char* const kExts[] = {".bmp", ".bmo", ".msk", ".csc"};
} // namespace

class StoreSaveTest : public QObject {
    Q_OBJECT
private slots:
    void saveAndReopenWork_data();
    void saveAndReopenWork();
    void overwriteAnsweredNoTouchesNothing();
    void unsafeNamesAreRefused_data();
    void unsafeNamesAreRefused();
    void failedWriteKeepsThePreviousFiles();
    void closeQuestionYesReallySaves();
    void cancelledSaveWritesNothing();
};

void StoreSaveTest::saveAndReopenWork_data() {
    QTest::addColumn<bool>("withScheme");
    QTest::newRow("scheme ticked") << true;
    QTest::newRow("scheme unticked") << false;
}

void StoreSaveTest::saveAndReopenWork() {
    QFETCH(bool, withScheme);
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.jpg", Encode(FromArt(kHouse, 50), "JPEG", 95)));
    Open(f, "front.jpg");
    Paint(f.ws());
    QString offered;
    ScriptSaveForm(f, "garden.jpg", &offered);   // a typed extension is dropped
    f.form().SaveWork();
    QCOMPARE(offered, QString("front"));
    QVERIFY(!f.ws().PictureModified);
    const QString base = f.picsFolder() + "/garden";
    QCOMPARE(QFileInfo(base + ".bmp").size(), 360054);
    QCOMPARE(QFileInfo(base + ".bmo").size(), 360054);
    QCOMPARE(QFileInfo(base + ".msk").size(), 482804);
    QVERIFY(QFileInfo(base + ".csc").size() > 0);
    QCOMPARE(f.form().SchemeFileName, base + ".csc");
    QCOMPARE(f.form().File1->entries(), QStringList({"front.jpg", "garden.bmp"}));   // no .bmo/.msk/.csc
    QCOMPARE(f.form().File1->selectedName(), QString("garden.bmp"));
    QVERIFY(Hidden(f.picsFolder()).isEmpty());
    QCOMPARE(f.form().CurrentPicturePath, f.picsFolder() + "/front.jpg");   // saving does not rename

    // Change everything, then reopen the work.
    const ColorBoxes saved = f.ws().Boxes;
    for (int i = 1; i <= 12; ++i) f.ws().Boxes[i] = ColorBox{"Other", 0x010101 * i, 0};
    const ColorBoxes changed = f.ws().Boxes;
    f.ws().LoadWithPicture = withScheme;
    Open(f, "garden.bmp");
    QCOMPARE(f.ws().Stroke(10, 20), int16_t{1});
    QCOMPARE(f.ws().Stroke(12, 20), int16_t{-3});
    QCOMPARE(f.ws().ColorPlane(11, 20), int16_t{5});
    QCOMPARE(f.ws().StrokeNumber, 2);
    QVERIFY(f.ws().UndoEnabled);
    QVERIFY(f.ws().RedoEnabled);
    QVERIFY(!f.ws().PictureModified);
    if (withScheme) {
        QCOMPARE(f.ws().Boxes[5].name, std::string("Garage Door"));
        QCOMPARE(f.ws().Boxes[2].color, saved[2].color);
        QCOMPARE(f.ws().Boxes[2].reference, 0x808080);
    } else {
        QCOMPARE(f.ws().Boxes[5].name, std::string("Other"));
        QCOMPARE(f.ws().Boxes[2].color, changed[2].color);
        QCOMPARE(f.ws().Boxes[2].reference, 0);   // references reset for the reopened photo
    }
}

void StoreSaveTest::overwriteAnsweredNoTouchesNothing() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.bmp", Encode(FromArt(kHouse, 50), "BMP")));
    QVERIFY(WriteBytes(f.picsFolder() + "/porch.bmp", QByteArray("old view")));
    QVERIFY(WriteBytes(f.picsFolder() + "/porch.bmo", QByteArray("old photo")));
    QVERIFY(WriteBytes(f.picsFolder() + "/porch.msk", QByteArray("old mask")));
    QVERIFY(WriteBytes(f.picsFolder() + "/porch.csc", QByteArray("old scheme")));
    Open(f, "front.bmp");
    Paint(f.ws());
    ScriptSaveForm(f, "porch");
    f.platform().answers.push_back(platform::Answer::No);
    f.form().SaveWork();
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Picture Already Exists in PICS Folder"));
    QCOMPARE(f.platform().messages[0].text,
             QString("Picture Name>> porch.bmp\r\n\r\nDo you want to Overwrite it?\r\n\r\n"
                     "Note: This will also overwrite the paint mask file and\r\nthe color scheme file."));
    QCOMPARE(f.platform().messages[0].buttons, platform::Buttons::YesNo);
    QCOMPARE(ReadBytes(f.picsFolder() + "/porch.bmp"), QByteArray("old view"));
    QCOMPARE(ReadBytes(f.picsFolder() + "/porch.bmo"), QByteArray("old photo"));
    QCOMPARE(ReadBytes(f.picsFolder() + "/porch.msk"), QByteArray("old mask"));
    QCOMPARE(ReadBytes(f.picsFolder() + "/porch.csc"), QByteArray("old scheme"));
    QVERIFY(f.ws().PictureModified);

    ScriptSaveForm(f, "porch");
    f.platform().answers.push_back(platform::Answer::Yes);
    f.form().SaveWork();
    QCOMPARE(QFileInfo(f.picsFolder() + "/porch.msk").size(), 482804);
    QVERIFY(!f.ws().PictureModified);
}

void StoreSaveTest::unsafeNamesAreRefused_data() {
    QTest::addColumn<QString>("name");
    QTest::newRow("parent folder") << "../escape";
    QTest::newRow("sub folder") << "sub/house";
    QTest::newRow("absolute") << "/tmp/house";
    QTest::newRow("backslash") << "..\\house";
    QTest::newRow("dot") << ".";
    QTest::newRow("dot dot") << "..";
    QTest::newRow("only an extension") << ".bmp";
    QTest::newRow("three dots") << "...";
}

void StoreSaveTest::unsafeNamesAreRefused() {
    QFETCH(QString, name);
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.bmp", Encode(FromArt(kHouse, 50), "BMP")));
    Open(f, "front.bmp");
    Paint(f.ws());
    const QStringList before = QDir(f.programFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
    const QStringList picsBefore = QDir(f.picsFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot);
    ScriptSaveForm(f, name);
    f.form().SaveWork();
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Save in PICS folder"));
    QVERIFY(f.platform().messages[0].text.contains(name));
    QCOMPARE(QDir(f.programFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), before);
    QCOMPARE(QDir(f.picsFolder()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot), picsBefore);
    QVERIFY(!QFileInfo::exists("/tmp/house.bmp") || QFileInfo("/tmp/house.bmp").lastModified().secsTo(QDateTime::currentDateTime()) > 60);
    QVERIFY(f.ws().PictureModified);
}

void StoreSaveTest::failedWriteKeepsThePreviousFiles() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.bmp", Encode(FromArt(kHouse, 50), "BMP")));
    Open(f, "front.bmp");
    Paint(f.ws());
    ScriptSaveForm(f, "deck");
    f.form().SaveWork();
    QByteArray old[4];
    for (int i = 0; i < 4; ++i) old[i] = ReadBytes(f.picsFolder() + "/deck" + kExts[i]);
    QVERIFY(!old[2].isEmpty());

    f.ws().Stroke(200, 150) = 3;
    f.ws().ColorPlane(200, 150) = 2;
    f.ws().Picture1.fill(0x0000FF);
    f.ws().PictureModified = true;
    ScriptSaveForm(f, "deck");
    f.platform().answers.push_back(platform::Answer::Yes);
    {
        // The two bitmaps fit under the limit, the mask does not: it fails partway.
        auto* previousHandler = std::signal(SIGXFSZ, SIG_IGN);
        rlimit previous{};
        getrlimit(RLIMIT_FSIZE, &previous);
        rlimit lower = previous;
        lower.rlim_cur = 400000;
        setrlimit(RLIMIT_FSIZE, &lower);
        f.form().SaveWork();
        setrlimit(RLIMIT_FSIZE, &previous);
        std::signal(SIGXFSZ, previousHandler);
    }
    for (int i = 0; i < 4; ++i) QCOMPARE(ReadBytes(f.picsFolder() + "/deck" + kExts[i]), old[i]);
    QCOMPARE(f.platform().messages.size(), 2);
    QCOMPARE(f.platform().messages[1].title, QString("Warning - Save in PICS folder"));
    QVERIFY(f.ws().PictureModified);
    QVERIFY2(Hidden(f.picsFolder()).isEmpty(), qPrintable(Hidden(f.picsFolder()).join(',')));
}

void StoreSaveTest::closeQuestionYesReallySaves() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.bmp", Encode(FromArt(kHouse, 50), "BMP")));
    Open(f, "front.bmp");
    Paint(f.ws());
    f.platform().answers.push_back(platform::Answer::Yes);
    ScriptSaveForm(f, "closing");
    QVERIFY(!f.form().Form_QueryUnload());
    QCOMPARE(f.platform().messages[0].title, QString("Warning - Not Saved"));
    for (const char* ext : kExts) QVERIFY(QFileInfo::exists(f.picsFolder() + "/closing" + ext));
    QVERIFY(!f.ws().PictureModified);
}

void StoreSaveTest::cancelledSaveWritesNothing() {
    FormFixture f;
    QVERIFY(WriteBytes(f.picsFolder() + "/front.bmp", Encode(FromArt(kHouse, 50), "BMP")));
    Open(f, "front.bmp");
    Paint(f.ws());
    ScriptSaveForm(f, QString());
    f.form().SaveWork();
    QCOMPARE(QDir(f.picsFolder()).entryList(QDir::Files | QDir::Hidden), QStringList({"front.bmp"}));
    QVERIFY(f.ws().PictureModified);
    QVERIFY(f.platform().messages.isEmpty());
}

QTEST_MAIN(StoreSaveTest)
#include "store_save_test.moc"
