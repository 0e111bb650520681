// The picture browser: lists, shortcuts, and delete with its companion rule.
#include <QtTest>

#include "store/qt/BrowserLists.h"
#include "store/qt/StorePictures.h"
#include "support/FormFixture.h"

using namespace storetest;

class StoreBrowserTest : public QObject {
    Q_OBJECT
private slots:
    void fileListShowsOnlyPictures();
    void folderActivationChangesFolder();
    void missingPicsIsMadeOrReported();
    void deleteRules_data();
    void deleteRules();
    void deleteAnsweredNoKeepsAll();
    void deleteOfVanishedFileReportsIt();
};

void StoreBrowserTest::fileListShowsOnlyPictures() {
    FormFixture f;
    for (const char* name : {"a.JPG", "b.gif", "c.bmp", "c.bmo", "c.msk", "c.csc", "d.png", "e.jpeg", "Z.Bmp"})
        QVERIFY(WriteBytes(f.picsFolder() + "/" + name, "x"));
    f.form().rereadFileList();
    QCOMPARE(f.form().File1->pattern(), QString("*.jpg;*.gif;*.bmp"));
    QCOMPARE(f.form().File1->entries(), QStringList({"a.JPG", "b.gif", "c.bmp", "Z.Bmp"}));
    QCOMPARE(f.form().File1->selectedName(), QString());
}

void StoreBrowserTest::folderActivationChangesFolder() {
    FormFixture f;
    QVERIFY(QDir(f.picsFolder()).mkdir("Old Houses"));
    QVERIFY(WriteBytes(f.picsFolder() + "/Old Houses/cottage.jpg", "x"));
    QCOMPARE(f.form().Dir1->path(), f.picsFolder());
    QCOMPARE(f.form().ExportFolder, f.picsFolder());
    FolderListBox* dir = f.form().Dir1;
    QVERIFY(dir->setPath(f.picsFolder()));   // read the new subfolder
    const QList<QListWidgetItem*> hits = dir->findItems("Old Houses", Qt::MatchEndsWith);
    QCOMPARE(hits.size(), 1);
    f.ws().PickupLabelVisible = true;
    f.ws().SetReferenceMode = true;
    emit dir->itemActivated(hits[0]);
    QCOMPARE(dir->path(), f.picsFolder() + "/Old Houses");
    QCOMPARE(f.form().File1->entries(), QStringList({"cottage.jpg"}));
    QCOMPARE(f.form().ExportFolder, f.picsFolder() + "/Old Houses");
    QVERIFY(!f.ws().PickupLabelVisible);
    QVERIFY(!f.ws().SetReferenceMode);
    // The chain leads back up: its entry for PICS opens PICS again.
    const QList<QListWidgetItem*> up = dir->findItems("PICS", Qt::MatchEndsWith);
    QCOMPARE(up.size(), 1);
    emit dir->itemActivated(up[0]);
    QCOMPARE(dir->path(), f.picsFolder());
    QVERIFY(f.platform().messages.isEmpty());
}

void StoreBrowserTest::missingPicsIsMadeOrReported() {
    {
        FormFixture f(false);
        QVERIFY(QDir(f.picsFolder()).removeRecursively());
        f.startup();
        QVERIFY(QFileInfo(f.picsFolder()).isDir());
        QCOMPARE(f.form().Dir1->path(), f.picsFolder());
        QVERIFY(f.platform().messages.isEmpty());
    }
    {
        // A file where the folder should be: it cannot be had.
        FormFixture f(false);
        QVERIFY(QDir(f.picsFolder()).removeRecursively());
        QVERIFY(WriteBytes(f.picsFolder(), "not a folder"));
        f.startup();
        QCOMPARE(f.platform().messages.size(), 1);
        QCOMPARE(f.platform().messages[0].title, QString("Warning - PICS Folder"));
        QCOMPARE(f.platform().messages[0].text, "Can't find PICS folder.\r\n" + f.picsFolder());
    }
}

void StoreBrowserTest::deleteRules_data() {
    QTest::addColumn<bool>("inPics");
    QTest::addColumn<QString>("selected");
    QTest::addColumn<QStringList>("present");
    QTest::addColumn<QStringList>("left");
    const QStringList work = {"house.bmp", "house.bmo", "house.msk", "house.csc"};
    QTest::newRow("work in PICS") << true << "house.bmp" << work << QStringList();
    QTest::newRow("jpg in PICS") << true << "house.jpg"
                                 << QStringList({"house.jpg", "house.bmo", "house.msk", "house.csc"})
                                 << QStringList({"house.bmo", "house.csc", "house.msk"});
    QTest::newRow("bmp outside PICS") << false << "house.bmp" << work
                                      << QStringList({"house.bmo", "house.csc", "house.msk"});
    QTest::newRow("work without its mask") << true << "house.bmp"
                                           << QStringList({"house.bmp", "house.bmo", "house.csc"}) << QStringList();
    QTest::newRow("upper-case BMP in PICS") << true << "HOUSE.BMP"
                                            << QStringList({"HOUSE.BMP", "HOUSE.bmo", "HOUSE.msk"})
                                            << QStringList({"HOUSE.bmo", "HOUSE.msk"});
}

void StoreBrowserTest::deleteRules() {
    QFETCH(bool, inPics);
    QFETCH(QString, selected);
    QFETCH(QStringList, present);
    QFETCH(QStringList, left);
    FormFixture f;
    const QString folder = inPics ? f.picsFolder() : f.programFolder() + "/Photos";
    QVERIFY(QDir().mkpath(folder));
    for (const QString& name : present) QVERIFY(WriteBytes(folder + "/" + name, "x"));
    QVERIFY(WriteBytes(folder + "/other.bmp", "keep"));
    QVERIFY(f.form().Dir1->setPath(folder));
    f.form().rereadFileList();
    QVERIFY(f.form().File1->selectName(selected));
    f.form().DeletePicture();
    QCOMPARE(f.platform().messages.size(), 1);
    QCOMPARE(f.platform().messages[0].title, "Delete - " + selected);
    QCOMPARE(f.platform().messages[0].text, QString("Delete this Picture?\r\n\r\nNote: This will also delete "
                                                    "the paint mask file and\r\nthe color scheme file."));
    QCOMPARE(f.platform().messages[0].buttons, platform::Buttons::YesNo);
    QStringList expected = left;
    expected << "other.bmp";
    expected.sort();
    QStringList got = QDir(folder).entryList(QDir::Files | QDir::Hidden);
    got.sort();
    QCOMPARE(got, expected);
    QVERIFY(!f.form().File1->entries().contains(selected));
}

void StoreBrowserTest::deleteAnsweredNoKeepsAll() {
    FormFixture f;
    for (const char* ext : {".bmp", ".bmo", ".msk", ".csc"}) QVERIFY(WriteBytes(f.picsFolder() + "/house" + ext, "x"));
    f.form().rereadFileList();
    f.form().DeletePicture();   // nothing selected: nothing asked
    QVERIFY(f.platform().messages.isEmpty());
    QVERIFY(f.form().File1->selectName("house.bmp"));
    f.platform().answers.push_back(platform::Answer::No);
    f.form().DeletePicture();
    QCOMPARE(QDir(f.picsFolder()).entryList(QDir::Files).size(), 4);
}

void StoreBrowserTest::deleteOfVanishedFileReportsIt() {
    FormFixture f;
    for (const char* ext : {".bmp", ".bmo"}) QVERIFY(WriteBytes(f.picsFolder() + "/house" + ext, "x"));
    f.form().rereadFileList();
    QVERIFY(f.form().File1->selectName("house.bmp"));
    QVERIFY(QFile::remove(f.picsFolder() + "/house.bmp"));   // gone behind the list's back
    f.form().DeletePicture();
    QCOMPARE(f.platform().messages.size(), 2);
    QCOMPARE(f.platform().messages[1].title, QString("Error - Unable to Delete Picture"));
    QVERIFY(QFileInfo::exists(f.picsFolder() + "/house.bmo"));   // no companion touched
}

QTEST_MAIN(StoreBrowserTest)
#include "store_browser_test.moc"
