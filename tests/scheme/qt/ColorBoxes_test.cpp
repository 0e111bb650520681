// The colour boxes in the window: selecting, new colours, clearing, renaming
// in place, and the scheme load and save dialogs.
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QtTest>

#include "scheme/qt/ColorBoxLabel.h"
#include "store/qt/BrowserLists.h"
#include "support/FormFixture.h"

static ColorBoxLabel* Box(FormFixture& f, int i) { return f.form().PictureColor[static_cast<size_t>(i)]; }
static QColor Shown(QWidget* w, QPalette::ColorRole role = QPalette::Window) { return w->palette().color(role); }
static bool Visible(QWidget* w) { return w->isVisibleTo(w->parentWidget()); }
static void RightClick(FormFixture& f, int i) { QTest::mouseClick(Box(f, i), Qt::RightButton); }

class ColorBoxesTest : public QObject {
    Q_OBJECT

private slots:
    void boxesStandInAColumnAndAnyButtonSelects() {
        FormFixture f;
        const int tops[] = {19, 43, 67, 91, 115, 139, 163, 187, 211, 235, 259, 283};  // 280 + 360 (i - 1) twips
        for (int i = 1; i <= 12; ++i) QCOMPARE(Box(f, i)->geometry(), QRect(8, tops[i - 1], 89, 17));
        f.ws().PickupLabelVisible = true;
        f.ws().PickupIndex = 7;
        f.form().ToolStateChanged();
        QLabel* label = f.form().PickupColorLabel;  // over box 7, with its name
        QVERIFY(label->geometry() == Box(f, 7)->geometry() && label->text() == "Door Frames");
        QTest::mousePress(Box(f, 5), Qt::MiddleButton);
        QVERIFY(f.ws().CurrentColor == 5 && Box(f, 5)->isFlat() && !Box(f, 1)->isFlat() && !Visible(label));
    }

    void newColourIsShownAndClearAllAsksFirst() {
        FormFixture f;
        f.platform().colors = {0xC86432, std::nullopt};
        f.platform().answers = {platform::Answer::No, platform::Answer::Yes};
        QTest::mouseClick(Box(f, 4), Qt::LeftButton);
        QTest::mouseDClick(Box(f, 4), Qt::LeftButton);  // as the window system delivers it
        QVERIFY(Shown(Box(f, 4)) == QColor(0x32, 0x64, 0xC8) && Shown(Box(f, 4), QPalette::WindowText) == Qt::black);
        f.ws().PickupLabelVisible = f.ws().SetReferenceMode = true;
        f.form().NewColourMenuItem_Click();  // cancelled, yet the tools end
        QVERIFY(!f.ws().PickupLabelVisible && !f.ws().SetReferenceMode);
        QCOMPARE(f.platform().colorStarts, (QList<int32_t>{kButtonFace, 0xC86432}));
        for (const int32_t left : {0xC86432, kButtonFace}) {  // after No, then Yes
            f.form().ClearAllColorsMenuItem_Click();
            QCOMPARE(f.ws().Boxes[4].color, left);
        }
        // Without colour the name takes the theme's button text, readable on the button face.
        const QColor buttonText = f.form().ColorSchemeFrame->palette().color(QPalette::ButtonText);
        QVERIFY(Shown(Box(f, 4), QPalette::WindowText) == buttonText && Shown(Box(f, 9), QPalette::WindowText) == buttonText);
        f.ws().Boxes[9].color = 0x206350;  // green 99: white, as ever
        f.form().ToolStateChanged();
        QCOMPARE(Shown(Box(f, 9), QPalette::WindowText), QColor(Qt::white));
        const platform::Message m = f.platform().messages.value(1);
        QVERIFY(m.title == "Clear All Colors" && m.text == "Are you Sure?" && m.buttons == platform::Buttons::YesNo);
    }

    // Typed or pasted names are kept to 15 characters, caret kept; the rename
    // ends on Return, Escape (dropped), another box or Tab, not on a menu opening.
    void renameKeepsFifteenCharactersAndEndsAsTheUserLeaves() {
        FormFixture f;
        QLineEdit* edit = f.form().ColorNameBox;
        const struct { QString start; int caret; QString input, result; int caretAfter; } rows[] = {
            {"Skirting BoardX", 3, "Z", "SkiZrting Board", 4}, {"Floor", 2, "0123456789ABCDEFGHIJ", "Fl0123456789ABC", 15}};
        for (const auto& r : rows) {
            RightClick(f, 6);
            edit->setText(r.start);
            edit->setCursorPosition(r.caret);
            edit->insert(r.input);
            QCOMPARE(std::pair(edit->text(), edit->cursorPosition()), std::pair(r.result, r.caretAfter));
            QTest::keyClick(edit, Qt::Key_Return);
            QCOMPARE(Box(f, 6)->text(), r.result);
        }
        RightClick(f, 8);
        QTest::keyClicks(edit, " Tiles");
        QTest::keyClick(edit, Qt::Key_Escape);
        f.form().commitRename();  // nothing left to commit
        RightClick(f, 2);
        edit->setText(QStringLiteral("Coving"));
        QFocusEvent popup(QEvent::FocusOut, Qt::PopupFocusReason);
        QCoreApplication::sendEvent(edit, &popup);
        QVERIFY(Visible(edit));
        QTest::mousePress(Box(f, 7), Qt::LeftButton);
        QVERIFY(f.ws().Boxes[8].name == "Floor" && f.ws().Boxes[2].name == "Coving");
        RightClick(f, 5);
        edit->setText(QStringLiteral("Dado"));
        QFocusEvent tab(QEvent::FocusOut, Qt::TabFocusReason);
        QCoreApplication::sendEvent(edit, &tab);
        QVERIFY(f.ws().Boxes[5].name == "Dado" && !Visible(edit));
    }

    // A failed load or save is reported and keeps the scheme name; a scheme
    // saved beside the picture loads back by a double click on the frame.
    void schemeFailuresAreReportedAndASavedSchemeLoadsBack() {
        FormFixture f;
        const QString pics = f.picsFolder(), noName = f.programFolder() + "/NoName.csc";
        f.platform().openChoices = {{false, pics + "/nowhere.bmp"}, {false, pics + "/my.house.csc"}};
        f.platform().saveChoices = {{false, f.programFolder() + "/gone/x.csc"}, {false, pics + "/my.house.bmp"}};
        f.form().LoadSchemeMenuItem_Click();
        f.form().SaveSchemeMenuItem_Click();
        const QList<platform::Message>& m = f.platform().messages;
        QVERIFY(m.size() == 2 && m[0].text.contains(pics + "/nowhere.csc\n"));
        QCOMPARE(QStringList({m[0].title, m[1].title}), QStringList({"Error - Load Colour Scheme", "Error - Save Colour Scheme"}));
        f.ws().Boxes[9] = {"Porch", 0x00FF00, 0x102030};
        const ColorBoxes painted = f.ws().Boxes;
        f.form().SaveSchemeMenuItem_Click();
        f.ws().Boxes = StartupColorBoxes();
        QTest::mouseDClick(f.form().ColorSchemeFrame, Qt::LeftButton, {}, QPoint(100, 150));
        QVERIFY(f.ws().Boxes == painted);
        const platform::FileRequest save = f.platform().saveRequests.value(1), load = f.platform().openRequests.value(1);
        QCOMPARE(save.title + save.filter, "Save Colour Scheme toColour Scheme (*.CSC)| *.csc");
        QCOMPARE(load.title + load.filter, "Select Colour SchemeColour Schemes (*.CSC)| *.CSC|All files (*.*)|*.*");
        QCOMPARE(QStringList({save.fileName, load.fileName}), QStringList({noName, pics + "/my.house.csc"}));
        for (const auto& r : {load, save}) QVERIFY(r.flags == 4 && r.defaultExtension == "*" && r.initialFolder == f.form().Dir1->path());
    }
};

QTEST_MAIN(ColorBoxesTest)
#include "ColorBoxes_test.moc"
