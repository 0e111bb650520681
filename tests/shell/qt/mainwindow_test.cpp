// The main window: its layout, the start-up sequence and the close question.
#include <QCheckBox>
#include <QDialog>
#include <QFileInfo>
#include <QLineEdit>
#include <QTest>
#include <QTimer>

#include "support/FormFixture.h"

class MainWindowTest : public QObject {
    Q_OBJECT
private slots:
    void layout();
    void startupSetsTheDefaults();
    void startupArmsThePoll();
    void closeQuestion_data();
    void closeQuestion();
    void bareWindowClickEndsPickupAndSetReference();
};

// Places in twips from the client area's corner, at 15 twips a pixel.
void MainWindowTest::layout() {
    FormFixture f;
    f.form().show();
    QCOMPARE(f.form().windowTitle(), QStringLiteral(" Tint-Rolla  v1.03"));
    QCOMPARE(f.form().client->size(), QSize(671, 375));
    const struct { const char* name; QRect geometry; bool visible; } controls[] = {
        {"Picture1", {144, 40, 404, 304}, true},
        {"Picture2", {72, 384, 404, 304}, false},
        {"ColorSchemeFrame", {560, 32, 105, 313}, true},
        {"File1", {8, 184, 129, 162}, true},
    };
    for (const auto& c : controls) {
        auto* w = f.form().client->findChild<QWidget*>(c.name);
        QVERIFY2(w && w->geometry() == c.geometry && w->isVisible() == c.visible, c.name);
    }
}

void MainWindowTest::startupSetsTheDefaults() {
    FormFixture f;
    const Workspace& ws = f.ws();
    QCOMPARE(int(ws.CurrentColor), 1);
    QVERIFY(ws.WideRoller && !ws.ChalkLineMode);
    QCOMPARE(ws.Kind, PaintKind::Normal);
    QCOMPARE(ws.PlaneTolerance, (std::array<int32_t, 6>{18, 18, 18, 12, 12, 12}));
    QVERIFY(!ws.PictureLoaded && !ws.PictureModified && !ws.SetReferenceMode && !ws.PickupLabelVisible);
    QCOMPARE(f.form().SchemeFileName, f.programFolder() + "/NoName.csc");
    QCOMPARE(ws.Cursor, PictureCursor::NoDrop);  // box 1 has no colour yet
    QVERIFY(!f.form().AutoCropCheckbox->isChecked() && f.form().BlendEdgesCheckbox->isChecked());
    QVERIFY(f.form().ProtectPaintCheckbox->isChecked() && f.form().LoadwithPictureCheckbox->isChecked());
    QVERIFY(f.platform().messages.isEmpty());
}

void MainWindowTest::startupArmsThePoll() {
    FormFixture f(false);
    QCOMPARE(f.form().StartupTimer->interval(), 500);
    QVERIFY(f.form().StartupTimer->isActive() && !f.form().BackgroundTimer->isActive());
    QTRY_VERIFY_WITH_TIMEOUT(f.form().startupDone(), 5000);
    QVERIFY(!f.form().StartupTimer->isActive() && f.form().BackgroundTimer->isActive());
    QCOMPARE(f.form().BackgroundTimer->interval(), 100);
}

void MainWindowTest::closeQuestion_data() {
    QTest::addColumn<bool>("modified");
    QTest::addColumn<int>("answer");
    QTest::addColumn<QString>("saveAs");   // the name typed into the save form; empty = cancelled
    QTest::addColumn<bool>("closes");
    QTest::newRow("unmodified, nothing asked") << false << 0 << "" << true;
    QTest::newRow("Cancel keeps the window") << true << int(platform::Answer::Cancel) << "" << false;
    QTest::newRow("No closes") << true << int(platform::Answer::No) << "" << true;
    QTest::newRow("Yes saves, then closes") << true << int(platform::Answer::Yes) << "kept" << true;
    QTest::newRow("Yes, save called off, stays") << true << int(platform::Answer::Yes) << "" << false;
}

void MainWindowTest::closeQuestion() {
    QFETCH(bool, modified);
    QFETCH(int, answer);
    QFETCH(QString, saveAs);
    QFETCH(bool, closes);
    FormFixture f;
    f.form().show();
    f.ws().PictureLoaded = true;
    f.ws().PictureModified = modified;
    f.ws().Stroke(10, 20) = 1;
    f.platform().answers.push_back(static_cast<platform::Answer>(answer));
    f.platform().dialogs.push_back([saveAs](QDialog& d) {
        auto* name = d.findChild<QLineEdit*>();
        if (saveAs.isEmpty() || !name) return int(QDialog::Rejected);
        name->setText(saveAs);
        return int(QDialog::Accepted);
    });
    QCOMPARE(f.form().close(), closes);
    QCOMPARE(f.platform().messages.size(), modified ? 1 : 0);
    if (modified) {
        const platform::Message& asked = f.platform().messages.first();
        QCOMPARE(asked.title, QStringLiteral("Warning - Not Saved"));
        QCOMPARE(asked.text, QStringLiteral("Do you want to save your work now?"));
        QCOMPARE(asked.buttons, platform::Buttons::YesNoCancel);
        QCOMPARE(asked.icon, platform::Icon::None);
    }
    QCOMPARE(QFileInfo::exists(f.picsFolder() + "/kept.msk"), !saveAs.isEmpty());
    if (!closes) QVERIFY(f.form().isVisible() && f.ws().PictureModified && f.ws().Stroke(10, 20) == 1);
}

void MainWindowTest::bareWindowClickEndsPickupAndSetReference() {
    FormFixture f;
    f.form().show();
    f.ws().Boxes[1].color = 0x0000FF;
    f.ws().PickupLabelVisible = true;
    f.ws().SetReferenceMode = true;
    f.ws().Cursor = PictureCursor::Pickup;
    QTest::mouseClick(f.form().client, Qt::LeftButton, {}, QPoint(660, 360));  // away from every control
    QVERIFY(!f.ws().PickupLabelVisible && !f.ws().SetReferenceMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
}

QTEST_MAIN(MainWindowTest)
#include "mainwindow_test.moc"
