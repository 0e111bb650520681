// The main window: its layout, the start-up sequence and the close question.
#include <QCheckBox>
#include <QGroupBox>
#include <QDialog>
#include <QFileInfo>
#include <QLabel>
#include <QLineEdit>
#include <QTest>
#include <QTimer>

#include "paint/qt/PictureView.h"
#include "store/qt/BrowserLists.h"
#include "support/FormFixture.h"

class MainWindowTest : public QObject {
    Q_OBJECT
private slots:
    void captionAndClientArea();
    void controlsSitAtTheirPlaces_data();
    void controlsSitAtTheirPlaces();
    void startupSetsTheDefaults();
    void startupArmsThePoll();
    void closingUnmodifiedAsksNothing();
    void closeQuestion_data();
    void closeQuestion();
    void bareWindowClickEndsPickupAndSetReference();
};

void MainWindowTest::captionAndClientArea() {
    FormFixture f;
    QCOMPARE(f.form().windowTitle(), QStringLiteral(" Tint-Rolla  v1.03"));
    QCOMPARE(f.form().client->size(), QSize(671, 375));
}

// Places in twips from the client area's corner, at 15 twips a pixel.
void MainWindowTest::controlsSitAtTheirPlaces_data() {
    QTest::addColumn<QString>("name");
    QTest::addColumn<QRect>("geometry");
    QTest::addColumn<bool>("visible");
    QTest::newRow("Picture1") << "Picture1" << QRect(144, 40, 404, 304) << true;
    QTest::newRow("Picture2") << "Picture2" << QRect(72, 384, 404, 304) << false;
    QTest::newRow("ColorSchemeFrame") << "ColorSchemeFrame" << QRect(560, 32, 105, 313) << true;
    QTest::newRow("File1") << "File1" << QRect(8, 184, 129, 162) << true;
}

void MainWindowTest::controlsSitAtTheirPlaces() {
    QFETCH(QString, name);
    QFETCH(QRect, geometry);
    QFETCH(bool, visible);
    FormFixture f;
    f.form().show();
    auto* w = f.form().client->findChild<QWidget*>(name);
    QVERIFY2(w, qPrintable(name));
    QCOMPARE(w->geometry(), geometry);
    QCOMPARE(w->isVisible(), visible);
}

void MainWindowTest::startupSetsTheDefaults() {
    FormFixture f;
    const Workspace& ws = f.ws();
    QCOMPARE(int(ws.CurrentColor), 1);
    QVERIFY(ws.WideRoller && !ws.ChalkLineMode);
    QCOMPARE(ws.Kind, PaintKind::Normal);
    QCOMPARE(ws.PlaneTolerance, (std::array<int32_t, 6>{18, 18, 18, 12, 12, 12}));
    QVERIFY(!ws.PictureLoaded && !ws.PictureModified && !ws.SetReferenceMode && !ws.PickupLabelVisible);
    QVERIFY(f.form().RequestedPicturePath.isEmpty());
    QCOMPARE(f.form().SchemeFileName, f.programFolder() + "/NoName.csc");
    QCOMPARE(ws.Cursor, PictureCursor::NoDrop);  // box 1 has no colour yet
    QVERIFY(!f.form().AutoCropCheckbox->isChecked());
    QVERIFY(f.form().BlendEdgesCheckbox->isChecked() && f.form().ExpandEdgesCheckbox->isChecked());
    QVERIFY(f.form().ProtectPaintCheckbox->isChecked() && f.form().LoadwithPictureCheckbox->isChecked());
    QVERIFY(f.platform().messages.isEmpty());
}

void MainWindowTest::startupArmsThePoll() {
    FormFixture f(false);
    QVERIFY(f.form().StartupTimer->isActive());
    QCOMPARE(f.form().StartupTimer->interval(), 500);
    QVERIFY(!f.form().BackgroundTimer->isActive());
    QTRY_VERIFY_WITH_TIMEOUT(f.form().startupDone(), 5000);
    QVERIFY(!f.form().StartupTimer->isActive());
    QVERIFY(f.form().BackgroundTimer->isActive());
    QCOMPARE(f.form().BackgroundTimer->interval(), 100);
}

void MainWindowTest::closingUnmodifiedAsksNothing() {
    FormFixture f;
    f.form().show();
    QVERIFY(f.form().close());
    QVERIFY(f.platform().messages.isEmpty());
}

void MainWindowTest::closeQuestion_data() {
    QTest::addColumn<int>("answer");
    QTest::addColumn<QString>("saveAs");   // the name typed into the save form; empty = cancelled
    QTest::addColumn<bool>("closes");
    QTest::newRow("Cancel keeps the window") << int(platform::Answer::Cancel) << "" << false;
    QTest::newRow("No closes") << int(platform::Answer::No) << "" << true;
    QTest::newRow("Yes saves, then closes") << int(platform::Answer::Yes) << "kept" << true;
    QTest::newRow("Yes, save called off, stays") << int(platform::Answer::Yes) << "" << false;
}

void MainWindowTest::closeQuestion() {
    QFETCH(int, answer);
    QFETCH(QString, saveAs);
    QFETCH(bool, closes);
    FormFixture f;
    f.form().show();
    f.ws().PictureLoaded = true;
    f.ws().PictureModified = true;
    f.ws().Stroke(10, 20) = 1;
    f.platform().answers.push_back(static_cast<platform::Answer>(answer));
    f.platform().dialogs.push_back([saveAs](QDialog& d) {
        auto* name = d.findChild<QLineEdit*>();
        if (saveAs.isEmpty() || !name) return int(QDialog::Rejected);
        name->setText(saveAs);
        return int(QDialog::Accepted);
    });
    QCOMPARE(f.form().close(), closes);
    QCOMPARE(f.platform().messages.size(), 1);
    const platform::Message& asked = f.platform().messages.first();
    QCOMPARE(asked.title, QStringLiteral("Warning - Not Saved"));
    QCOMPARE(asked.text, QStringLiteral("Do you want to save your work now?"));
    QCOMPARE(asked.buttons, platform::Buttons::YesNoCancel);
    QCOMPARE(asked.icon, platform::Icon::None);
    QCOMPARE(QFileInfo::exists(f.picsFolder() + "/kept.msk"), !saveAs.isEmpty());
    if (!closes) {
        QVERIFY(f.form().isVisible());
        QVERIFY(f.ws().PictureModified);
        QCOMPARE(int(f.ws().Stroke(10, 20)), 1);
    }
}

void MainWindowTest::bareWindowClickEndsPickupAndSetReference() {
    FormFixture f;
    f.form().show();
    f.ws().Boxes[1].color = 0x0000FF;
    f.ws().PickupLabelVisible = true;
    f.ws().SetReferenceMode = true;
    f.ws().Cursor = PictureCursor::Pickup;
    // A press on the client area's bare space, away from every control.
    QTest::mouseClick(f.form().client, Qt::LeftButton, {}, QPoint(660, 360));
    QVERIFY(!f.ws().PickupLabelVisible);
    QVERIFY(!f.ws().SetReferenceMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
}

QTEST_MAIN(MainWindowTest)
#include "mainwindow_test.moc"
