// The colour boxes in the window: selecting, new colours, clearing, renaming
// in place, and the scheme load and save dialogs.
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QtTest>

#include "scheme/qt/ColorBoxLabel.h"
#include "store/qt/BrowserLists.h"
#include "support/FormFixture.h"

namespace {

ColorBoxLabel* Box(FormFixture& f, int i) { return f.form().PictureColor[static_cast<size_t>(i)]; }
QColor Shown(QWidget* w, QPalette::ColorRole role = QPalette::Window) { return w->palette().color(role); }
bool Visible(QWidget* w) { return w->isVisibleTo(w->parentWidget()); }

void RightClick(FormFixture& f, int i) {
    QTest::mousePress(Box(f, i), Qt::RightButton);
    QTest::mouseRelease(Box(f, i), Qt::RightButton);
}

} // namespace

class ColorBoxesTest : public QObject {
    Q_OBJECT

private slots:
    void boxesStandInAColumnAndAnyButtonSelects() {
        FormFixture f;
        const int tops[] = {19, 43, 67, 91, 115, 139, 163, 187, 211, 235, 259, 283};  // 280 + 360 (i - 1) twips
        for (int i = 1; i <= 12; ++i) QCOMPARE(Box(f, i)->geometry(), QRect(8, tops[i - 1], 89, 17));
        QCOMPARE(Shown(Box(f, 1)), Shown(f.form().ColorSchemeFrame, QPalette::Button));
        f.ws().PickupLabelVisible = true;
        f.ws().PickupIndex = 7;
        f.form().ToolStateChanged();
        QLabel* label = f.form().PickupColorLabel;
        QCOMPARE(label->geometry(), Box(f, 7)->geometry());
        QCOMPARE(label->text(), QStringLiteral("Door Frames"));
        QTest::mousePress(Box(f, 5), Qt::MiddleButton);
        QCOMPARE(f.ws().CurrentColor, int16_t{5});
        QVERIFY(Box(f, 5)->isFlat() && !Box(f, 1)->isFlat() && !Visible(label));
    }

    void newColourIsShownAndCancelStillEndsTheTools() {
        FormFixture f;
        f.platform().colors = {0xC86432, std::nullopt};
        QTest::mouseClick(Box(f, 4), Qt::LeftButton);
        QTest::mouseDClick(Box(f, 4), Qt::LeftButton);  // as the window system delivers it
        QCOMPARE(Shown(Box(f, 4)), QColor(0x32, 0x64, 0xC8));
        QCOMPARE(Shown(Box(f, 4), QPalette::WindowText), QColor(Qt::black));
        f.ws().PickupLabelVisible = f.ws().SetReferenceMode = true;
        f.form().NewColourMenuItem_Click();
        QCOMPARE(f.platform().colorStarts, (QList<int32_t>{kButtonFace, 0xC86432}));
        QCOMPARE(f.ws().Boxes[4].color, 0xC86432);
        QVERIFY(!f.ws().PickupLabelVisible && !f.ws().SetReferenceMode);
    }

    void clearAllColoursAsksFirst() {
        for (const bool yes : {true, false}) {
            FormFixture f;
            f.ws().Boxes[6] = {"Shed", 0x00C000, 5};
            f.platform().answers.push_back(yes ? platform::Answer::Yes : platform::Answer::No);
            f.form().ClearAllColorsMenuItem_Click();
            const platform::Message m = f.platform().messages.value(0);
            QCOMPARE(QStringList({m.title, m.text}), QStringList({"Clear All Colors", "Are you Sure?"}));
            QCOMPARE(m.buttons, platform::Buttons::YesNo);
            QCOMPARE(f.ws().Boxes[6], (yes ? ColorBox{"Shed", kButtonFace, 0} : ColorBox{"Shed", 0x00C000, 5}));
        }
    }

    void nameIsKeptToFifteenCharacters() {
        struct Row { QString start; int caret; QString input; QString result; int caretAfter; };
        const Row rows[] = {{"Skirting BoardX", 3, "Z", "SkiZrting Board", 4},
                            {"Floor", 2, "0123456789ABCDEFGHIJ", "Fl0123456789ABC", 15},
                            {"Floor", 2, "ab", "Flaboor", 4}};
        FormFixture f;
        QLineEdit* edit = f.form().ColorNameBox;
        for (const Row& r : rows) {
            RightClick(f, 6);
            edit->setText(r.start);
            edit->setCursorPosition(r.caret);
            edit->insert(r.input);  // as typed or pasted
            QCOMPARE(edit->text(), r.result);
            QCOMPARE(edit->cursorPosition(), r.caretAfter);
            QTest::keyClick(edit, Qt::Key_Return);
            QCOMPARE(Box(f, 6)->text(), r.result);
        }
    }

    void renameEndsAsTheUserLeavesIt() {
        FormFixture f;
        QLineEdit* edit = f.form().ColorNameBox;
        RightClick(f, 8);
        QCOMPARE(edit->geometry(), Box(f, 8)->geometry());
        QTest::keyClicks(edit, " Tiles");
        QTest::keyClick(edit, Qt::Key_Escape);
        f.form().commitRename();  // nothing left to commit
        QCOMPARE(f.ws().Boxes[8].name, std::string("Floor"));
        RightClick(f, 2);
        edit->setText(QStringLiteral("Coving"));
        QFocusEvent popup(QEvent::FocusOut, Qt::PopupFocusReason);  // a menu opening
        QCoreApplication::sendEvent(edit, &popup);
        QVERIFY(Visible(edit));
        QTest::mousePress(Box(f, 7), Qt::LeftButton);
        QCOMPARE(f.ws().Boxes[2].name, std::string("Coving"));
        RightClick(f, 5);
        edit->setText(QStringLiteral("Dado"));
        QFocusEvent tab(QEvent::FocusOut, Qt::TabFocusReason);
        QCoreApplication::sendEvent(edit, &tab);
        QCOMPARE(f.ws().Boxes[5].name, std::string("Dado"));
        QVERIFY(!Visible(edit));
    }

    void schemeSavedBesideThePictureLoadsBack() {
        FormFixture f;
        f.ws().Boxes[9] = {"Porte-fenêtre", 0x00FF00, 0x102030};
        const ColorBoxes painted = f.ws().Boxes;
        const QString written = f.picsFolder() + QStringLiteral("/my.house.csc");
        f.platform().saveChoices.push_back({false, f.picsFolder() + QStringLiteral("/my.house.bmp")});
        f.form().SaveSchemeMenuItem_Click();
        f.ws().Boxes = StartupColorBoxes();
        f.platform().openChoices.push_back({false, written});
        QTest::mouseDClick(f.form().ColorSchemeFrame, Qt::LeftButton, {}, QPoint(100, 150));
        QVERIFY(f.ws().Boxes == painted);
        const platform::FileRequest save = f.platform().saveRequests.value(0);
        const platform::FileRequest load = f.platform().openRequests.value(0);
        QCOMPARE(save.title + save.filter, "Save Colour Scheme toColour Scheme (*.CSC)| *.csc");
        QCOMPARE(load.title + load.filter, "Select Colour SchemeColour Schemes (*.CSC)| *.CSC|All files (*.*)|*.*");
        QCOMPARE(save.fileName, f.programFolder() + QStringLiteral("/NoName.csc"));
        QCOMPARE(load.fileName, written);  // the scheme last saved
        for (const platform::FileRequest& r : {load, save})
            QVERIFY(r.flags == 4 && r.defaultExtension == "*" && r.initialFolder == f.form().Dir1->path());
    }

    void failuresAreReportedAndKeepTheSchemeName() {
        FormFixture f;
        f.platform().openChoices.push_back({false, f.picsFolder() + "/nowhere.bmp"});
        f.platform().saveChoices.push_back({false, f.programFolder() + "/gone/x.csc"});
        f.form().LoadSchemeMenuItem_Click();
        f.form().SaveSchemeMenuItem_Click();
        QCOMPARE(f.form().SchemeFileName, f.programFolder() + "/NoName.csc");
        QCOMPARE(f.platform().messages.size(), 2);
        QCOMPARE(f.platform().messages[0].title, "Error - Load Colour Scheme");
        QVERIFY(f.platform().messages[0].text.contains(f.picsFolder() + "/nowhere.csc\n"));
        QCOMPARE(f.platform().messages[1].title, "Error - Save Colour Scheme");
    }
};

QTEST_MAIN(ColorBoxesTest)
#include "ColorBoxes_test.moc"
