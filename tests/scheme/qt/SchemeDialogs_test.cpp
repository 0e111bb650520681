// Loading and saving colour schemes through the dialogs, and bad files.
#include <QFile>
#include <QGroupBox>
#include <QtTest>

#include "scheme/SchemeFile.h"
#include "scheme/qt/ColorBoxLabel.h"
#include "store/qt/BrowserLists.h"
#include "support/FormFixture.h"

namespace {

platform::FileChoice Chosen(const QString& name) {
    platform::FileChoice c;
    c.cancelled = false;
    c.fileName = name;
    return c;
}

void Paint(Workspace& ws) {
    ws.Boxes[1] = {"Sky", 0xF0D0A0, 0x808080};
    ws.Boxes[4] = {"Dado Rail", 0x0000FF, 0};
    ws.Boxes[9] = {"Porte-fenêtre", 0x00FF00, 0x102030};
    ws.Boxes[12].color = 0x000001;
}

void WriteBytes(const QString& path, const QByteArray& bytes) {
    QFile file(path);
    QVERIFY(file.open(QIODevice::WriteOnly));
    QCOMPARE(file.write(bytes), bytes.size());
}

QByteArray ValidFile() {
    ColorBoxes boxes = StartupColorBoxes();
    for (int i = 1; i <= kColorBoxCount; ++i) boxes[static_cast<size_t>(i)] = {"Other", 0x0A0B0C, 0x0C0B0A};
    const std::vector<uint8_t> b = SchemeFile::Encode(boxes);
    return QByteArray(reinterpret_cast<const char*>(b.data()), static_cast<qsizetype>(b.size()));
}

} // namespace

class SchemeDialogsTest : public QObject {
    Q_OBJECT

private slots:
    void loadDialogAsksAsTheProgramDoesAndCancelChangesNothing() {
        FormFixture f;
        Paint(f.ws());
        f.form().ToolStateChanged();
        const ColorBoxes before = f.ws().Boxes;
        f.form().LoadSchemeMenuItem_Click();
        QCOMPARE(f.platform().openRequests.size(), 1);
        const platform::FileRequest& r = f.platform().openRequests[0];
        QCOMPARE(r.title, QStringLiteral("Select Colour Scheme"));
        QCOMPARE(r.filter, QStringLiteral("Colour Schemes (*.CSC)| *.CSC|All files (*.*)|*.*"));
        QCOMPARE(r.flags, 4);
        QCOMPARE(r.defaultExtension, QStringLiteral("*"));
        QCOMPARE(r.fileName, f.programFolder() + QStringLiteral("/NoName.csc"));
        QCOMPARE(r.initialFolder, f.form().Dir1->path());
        QVERIFY(f.ws().Boxes == before);
        QVERIFY(f.platform().messages.isEmpty());
        QVERIFY(!QFile::exists(f.programFolder() + QStringLiteral("/NoName.csc")));
    }

    void saveDialogAsksAsTheProgramDoes() {
        FormFixture f;
        f.form().SaveSchemeMenuItem_Click();
        QCOMPARE(f.platform().saveRequests.size(), 1);
        const platform::FileRequest& r = f.platform().saveRequests[0];
        QCOMPARE(r.title, QStringLiteral("Save Colour Scheme to"));
        QCOMPARE(r.filter, QStringLiteral("Colour Scheme (*.CSC)| *.csc"));
        QCOMPARE(r.flags, 4);
        QCOMPARE(r.fileName, f.programFolder() + QStringLiteral("/NoName.csc"));
        QCOMPARE(f.form().SchemeFileName, f.programFolder() + QStringLiteral("/NoName.csc"));
    }

    void emptyNameFromTheDialogChangesNothing() {
        FormFixture f;
        f.platform().openChoices.push_back(Chosen(QString()));
        f.platform().saveChoices.push_back(Chosen(QString()));
        f.form().LoadSchemeMenuItem_Click();
        f.form().SaveSchemeMenuItem_Click();
        QVERIFY(f.platform().messages.isEmpty());
        QCOMPARE(QDir(f.picsFolder()).entryList(QDir::Files).size(), 0);
    }

    void saveThenLoadRoundTrip() {
        FormFixture f;
        Paint(f.ws());
        f.form().ToolStateChanged();
        const ColorBoxes painted = f.ws().Boxes;
        const QString chosen = f.picsFolder() + QStringLiteral("/my.house.bmp");
        const QString written = f.picsFolder() + QStringLiteral("/my.house.csc");
        f.platform().saveChoices.push_back(Chosen(chosen));
        f.form().SaveSchemeMenuItem_Click();
        QVERIFY(QFile::exists(written));
        QVERIFY(!QFile::exists(chosen));
        QCOMPARE(f.form().SchemeFileName, written);

        f.ws().Boxes = StartupColorBoxes();
        f.form().ToolStateChanged();
        f.platform().openChoices.push_back(Chosen(written));
        f.form().LoadSchemeMenuItem_Click();
        QVERIFY(f.platform().messages.isEmpty());
        QCOMPARE(f.platform().openRequests[0].fileName, written);
        for (int i = 1; i <= kColorBoxCount; ++i)
            QVERIFY2(f.ws().Boxes[static_cast<size_t>(i)] == painted[static_cast<size_t>(i)], qPrintable(QString::number(i)));
        QCOMPARE(f.form().PictureColor[9]->text(), QStringLiteral("Porte-fenêtre"));
        QCOMPARE(f.form().PictureColor[9]->backColor(), 0x00FF00);
        QCOMPARE(f.form().PictureColor[12]->foreColor(), kWhite);

        f.form().SaveSchemeMenuItem_Click();  // cancelled; offers the saved file first
        QCOMPARE(f.platform().saveRequests.last().fileName, written);
    }

    void frameDoubleClickOpensTheLoadDialog() {
        FormFixture f;
        QTest::mouseDClick(f.form().ColorSchemeFrame, Qt::LeftButton, {}, QPoint(100, 150));
        QCOMPARE(f.platform().openRequests.size(), 1);
        QVERIFY(f.platform().colorStarts.isEmpty());
    }

    void badFileChangesNoBox_data() {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("problem");
        const QByteArray valid = ValidFile();
        QTest::newRow("empty") << QByteArray() << "The file is empty.";
        QTest::newRow("five records") << valid.left(15 * 5) << "The file holds only 5 of the 12 colour boxes.";
        QTest::newRow("cut inside record 12") << valid.left(valid.size() - 1) << "The file ends inside the record of box 12.";
        QByteArray negative = valid;
        negative[15] = char(0xFF);  // box 2's name length; each "Other" record is 15 bytes
        negative[16] = char(0xFF);
        QTest::newRow("negative name length") << negative << "The name of box 2 has a negative length (-1).";
        QByteArray longName = valid;
        longName[15] = char(0xFF);
        longName[16] = char(0x7F);
        QTest::newRow("name past the end") << longName << "The name of box 2 runs past the end of the file.";
    }

    void badFileChangesNoBox() {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, problem);
        FormFixture f;
        Paint(f.ws());
        f.form().ToolStateChanged();
        const ColorBoxes before = f.ws().Boxes;
        const QString path = f.picsFolder() + QStringLiteral("/bad.csc");
        WriteBytes(path, bytes);
        f.platform().openChoices.push_back(Chosen(path));
        f.form().LoadSchemeMenuItem_Click();
        QVERIFY(f.ws().Boxes == before);
        QCOMPARE(f.form().PictureColor[4]->text(), QStringLiteral("Dado Rail"));
        QCOMPARE(f.platform().messages.size(), 1);
        const platform::Message& m = f.platform().messages[0];
        QCOMPARE(m.title, QStringLiteral("Error - Load Colour Scheme"));
        QVERIFY2(m.text.contains(path), qPrintable(m.text));
        QVERIFY2(m.text.contains(problem), qPrintable(m.text));
    }

    void missingFileIsNotCreated() {
        FormFixture f;
        const QString path = f.picsFolder() + QStringLiteral("/nowhere.bmp");
        f.platform().openChoices.push_back(Chosen(path));
        f.form().LoadSchemeMenuItem_Click();
        QVERIFY(!QFile::exists(f.picsFolder() + QStringLiteral("/nowhere.csc")));
        QCOMPARE(f.platform().messages.size(), 1);
        QVERIFY(f.platform().messages[0].text.contains(QStringLiteral("The file does not exist.")));
        QVERIFY(f.ws().Boxes == StartupColorBoxes());
    }

    void quietReadLeavesTheMessageToTheCaller() {
        FormFixture f;
        QString problem;
        QVERIFY(!f.form().ReadColorScheme(f.picsFolder() + QStringLiteral("/house.bmo"), false, &problem));
        QCOMPARE(problem, QStringLiteral("The file does not exist."));
        QVERIFY(f.platform().messages.isEmpty());
    }

    void failedSaveKeepsTheSchemeName() {
        FormFixture f;
        f.platform().saveChoices.push_back(Chosen(f.programFolder() + QStringLiteral("/gone/x.csc")));
        f.form().SaveSchemeMenuItem_Click();
        QCOMPARE(f.platform().messages.size(), 1);
        QCOMPARE(f.platform().messages[0].title, QStringLiteral("Error - Save Colour Scheme"));
        QCOMPARE(f.form().SchemeFileName, f.programFolder() + QStringLiteral("/NoName.csc"));
    }
};

QTEST_MAIN(SchemeDialogsTest)
#include "SchemeDialogs_test.moc"
