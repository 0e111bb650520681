// The picture browser on a Linux desktop: the desktop shortcut without a
// desktop folder, the drive list, and a file list that follows its folder.
#include <QStorageInfo>
#include <QtTest>

#include "store/qt/BrowserLists.h"
#include "support/FormFixture.h"

namespace {

bool PutPicture(const QString& path, QRgb colour) {
    QImage image(40, 30, QImage::Format_RGB32);
    image.fill(colour);
    return image.save(path, "BMP");
}

// HOME and the user-dirs file are read where the test points them.
class HomeAt {
public:
    explicit HomeAt(const QString& home)
        : home_(qgetenv("HOME")), config_(qgetenv("XDG_CONFIG_HOME")), hadConfig_(qEnvironmentVariableIsSet("XDG_CONFIG_HOME")) {
        qputenv("HOME", home.toLocal8Bit());
        qunsetenv("XDG_CONFIG_HOME");
    }
    ~HomeAt() {
        qputenv("HOME", home_);
        if (hadConfig_) qputenv("XDG_CONFIG_HOME", config_);
    }

private:
    QByteArray home_, config_;
    bool hadConfig_;
};

} // namespace

class BrowserTest : public QObject {
    Q_OBJECT
private slots:
    void desktopFallsBackToHome() {
        // Desktop folder, home folder, what the folder list shows (empty: it stays at PICS).
        const struct { bool desktop, home; const char* shown; } rows[] = {
            {true, true, "/Desktop"}, {false, true, ""}, {false, false, nullptr}};
        for (const auto& row : rows) {
            QTemporaryDir dir;
            const QString home = dir.path() + "/anna";
            if (row.home) QVERIFY(QDir().mkpath(home));
            if (row.desktop) QVERIFY(QDir().mkpath(home + "/Desktop"));
            FormFixture f;
            const HomeAt at(home);
            f.form().ShowDesktopFolder();
            if (row.shown) {
                QCOMPARE(f.form().Dir1->path(), home + row.shown);
                QVERIFY(f.platform().messages.isEmpty());
            } else {
                QCOMPARE(f.form().Dir1->path(), f.picsFolder());
                QCOMPARE(f.platform().messages.size(), 1);
                QCOMPARE(f.platform().messages[0].title, QString("Warning - Shortcut to Desktop"));
                QCOMPARE(f.platform().messages[0].text, "Can't find Windows Desktop.\r\n" + home + "/Desktop/");
            }
        }
    }

    void driveListHoldsTheProgramVolumeAndNoSystemMounts() {
        FormFixture f;
        const DriveListBox* drives = f.form().Drive1;
        QStringList roots;
        for (int i = 0; i < drives->count(); ++i) roots << drives->itemData(i).toString();
        QVERIFY2(roots.contains(QStorageInfo(f.programFolder()).rootPath()), qPrintable(roots.join(' ')));
        QVERIFY(roots.contains("/"));
        for (const QString& root : roots)
            for (const char* system : {"/proc", "/sys", "/dev", "/run/user", "/boot", "/snap"})
                QVERIFY2(!root.startsWith(system), qPrintable(root));
        QCOMPARE(drives->drive(), QStorageInfo(f.picsFolder()).rootPath());  // start-up shows PICS
    }

    void fileListFollowsTheFolder() {
        FormFixture f;
        const QString pics = f.picsFolder();
        QVERIFY(PutPicture(pics + "/front.bmp", qRgb(200, 40, 30)) && PutPicture(pics + "/old.jpg", qRgb(30, 60, 190)));
        f.form().rereadFileList();
        QVERIFY(f.form().File1->selectName("front.bmp"));
        f.form().File1_Click();
        for (int i = 0; i < 50 && !f.ws().PictureLoaded; ++i) f.form().BackgroundTimer_Timer();
        QVERIFY(f.ws().PictureLoaded);
        f.ws().Stroke(10, 10) = 1;
        f.ws().PictureModified = true;

        // Another program copies a picture in, drops a non-picture beside it
        // and removes one: the list follows, the open work and its choice stay.
        QVERIFY(PutPicture(pics + "/garden.gif.bmp", qRgb(20, 180, 40)));
        QFile(pics + "/notes.txt").open(QIODevice::WriteOnly);
        QTRY_COMPARE(f.form().File1->entries(), QStringList({"front.bmp", "garden.gif.bmp", "old.jpg"}));
        QVERIFY(QFile::remove(pics + "/old.jpg"));
        QTRY_COMPARE(f.form().File1->entries(), QStringList({"front.bmp", "garden.gif.bmp"}));
        QCOMPARE(f.form().File1->selectedName(), QString("front.bmp"));
        QVERIFY(f.ws().PictureLoaded && f.ws().PictureModified && f.ws().Stroke(10, 10) == 1);
        QCOMPARE(f.form().CurrentPicturePath, f.form().RequestedPicturePath);
        QVERIFY(f.platform().messages.isEmpty());

        // The chosen picture itself removed: nothing is chosen, the work stays.
        QVERIFY(QFile::remove(pics + "/front.bmp"));
        QTRY_COMPARE(f.form().File1->entries(), QStringList({"garden.gif.bmp"}));
        QVERIFY(f.form().File1->selectedName().isEmpty() && f.ws().PictureLoaded && f.ws().Stroke(10, 10) == 1);

        // Another folder shown: changes in the first one no longer reach the list.
        const QString other = f.programFolder() + "/Photos";
        QVERIFY(QDir().mkpath(other) && PutPicture(other + "/porch.jpg", qRgb(240, 220, 30)));
        QVERIFY(f.form().Dir1->setPath(other));
        QCOMPARE(f.form().File1->entries(), QStringList({"porch.jpg"}));
        QVERIFY(PutPicture(other + "/yard.bmp", qRgb(60, 40, 20)) && PutPicture(pics + "/lost.bmp", qRgb(60, 40, 20)));
        QTRY_COMPARE(f.form().File1->entries(), QStringList({"porch.jpg", "yard.bmp"}));
    }
};

QTEST_MAIN(BrowserTest)
#include "browser_test.moc"
