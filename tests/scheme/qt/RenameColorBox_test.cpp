// Renaming a colour box in place.
#include <QClipboard>
#include <QGroupBox>
#include <QGuiApplication>
#include <QLineEdit>
#include <QtTest>

#include "paint/qt/PictureView.h"
#include "scheme/qt/ColorBoxLabel.h"
#include "support/FormFixture.h"

class RenameColorBoxTest : public QObject {
    Q_OBJECT

private:
    static ColorBoxLabel* box(FormFixture& f, int i) { return f.form().PictureColor[static_cast<size_t>(i)]; }
    static void rightClick(FormFixture& f, int i) {
        QTest::mousePress(box(f, i), Qt::RightButton);
        QTest::mouseRelease(box(f, i), Qt::RightButton);
    }
    static bool renaming(FormFixture& f) { return f.form().ColorNameBox->isVisibleTo(f.form().ColorSchemeFrame); }

private slots:
    void rightClickSelectsAndOpensTheNameBoxOverTheBox() {
        FormFixture f;
        rightClick(f, 4);
        QCOMPARE(f.ws().CurrentColor, int16_t{4});
        QVERIFY(renaming(f));
        QLineEdit* edit = f.form().ColorNameBox;
        QCOMPARE(edit->geometry(), box(f, 4)->geometry());
        QCOMPARE(edit->text(), QStringLiteral("Picture Rail"));
        QCOMPARE(f.form().ColorNameBoxTag, QStringLiteral("4"));
        QCOMPARE(edit->palette().color(QPalette::Text), QColor(Qt::black));
        QCOMPARE(edit->palette().color(QPalette::Base), QColor(Qt::white));
    }

    void leftClickOpensNoNameBox() {
        FormFixture f;
        QTest::mouseClick(box(f, 4), Qt::LeftButton);
        QVERIFY(!renaming(f));
        QVERIFY(f.form().ColorNameBoxTag.isEmpty());
    }

    void nameIsKeptToFifteenCharacters_data() {
        QTest::addColumn<QString>("start");
        QTest::addColumn<int>("caret");
        QTest::addColumn<QString>("typed");
        QTest::addColumn<QString>("pasted");
        QTest::addColumn<QString>("result");
        QTest::addColumn<int>("caretAfter");
        QTest::newRow("16th character typed at the end")
            << "Skirting Board" << 14 << "XY" << "" << "Skirting BoardX" << 15;
        QTest::newRow("character typed into a full name")
            << "Skirting BoardX" << 3 << "Z" << "" << "SkiZrting Board" << 4;
        QTest::newRow("long paste into an empty name")
            << "" << 0 << "" << "0123456789ABCDEFGHIJ" << "0123456789ABCDE" << 15;
        QTest::newRow("long paste in the middle")
            << "Floor" << 2 << "" << "0123456789ABCDEFGHIJ" << "Fl0123456789ABC" << 15;
        QTest::newRow("short paste keeps the caret")
            << "Floor" << 2 << "" << "ab" << "Flaboor" << 4;
    }

    void nameIsKeptToFifteenCharacters() {
        QFETCH(QString, start);
        QFETCH(int, caret);
        QFETCH(QString, typed);
        QFETCH(QString, pasted);
        QFETCH(QString, result);
        QFETCH(int, caretAfter);
        FormFixture f;
        rightClick(f, 6);
        QLineEdit* edit = f.form().ColorNameBox;
        edit->setText(start);
        edit->setCursorPosition(caret);
        if (!typed.isEmpty()) QTest::keyClicks(edit, typed);
        if (!pasted.isEmpty()) {
            QGuiApplication::clipboard()->setText(pasted);
            edit->paste();
        }
        QCOMPARE(edit->text(), result);
        QCOMPARE(edit->cursorPosition(), caretAfter);
        QTest::keyClick(edit, Qt::Key_Return);
        QCOMPARE(f.ws().Boxes[6].name, result.toStdString());
    }

    void enterCommitsAndIsNotTyped() {
        FormFixture f;
        f.ws().Boxes[2].color = 0x00FF00;  // black name text stays black
        rightClick(f, 2);
        QLineEdit* edit = f.form().ColorNameBox;
        edit->clear();
        QTest::keyClicks(edit, "Hall");
        QTest::keyClick(edit, Qt::Key_Return);
        QCOMPARE(f.ws().Boxes[2].name, std::string("Hall"));
        QCOMPARE(box(f, 2)->text(), QStringLiteral("Hall"));
        QCOMPARE(box(f, 2)->palette().color(QPalette::WindowText), QColor(Qt::black));
        QVERIFY(!renaming(f));
        QVERIFY(f.form().ColorNameBoxTag.isEmpty());
        QCOMPARE(f.ws().Boxes[1].name, std::string("Ceiling"));
        QCOMPARE(f.ws().Boxes[3].name, std::string("Upper Wall"));
    }

    void escapeKeepsTheOldName() {
        FormFixture f;
        rightClick(f, 8);
        QTest::keyClicks(f.form().ColorNameBox, " Tiles");
        QTest::keyClick(f.form().ColorNameBox, Qt::Key_Escape);
        QCOMPARE(f.ws().Boxes[8].name, std::string("Floor"));
        QCOMPARE(box(f, 8)->text(), QStringLiteral("Floor"));
        QVERIFY(!renaming(f));
        QVERIFY(f.form().ColorNameBoxTag.isEmpty());
        // A later commit has nothing left to commit.
        f.form().commitRename();
        QCOMPARE(f.ws().Boxes[8].name, std::string("Floor"));
    }

    void pressOnAnotherBoxCommitsFirst() {
        FormFixture f;
        rightClick(f, 2);
        f.form().ColorNameBox->setText(QStringLiteral("Coving"));
        QTest::mousePress(box(f, 7), Qt::LeftButton);
        QCOMPARE(f.ws().Boxes[2].name, std::string("Coving"));
        QCOMPARE(box(f, 2)->text(), QStringLiteral("Coving"));
        QCOMPARE(f.ws().Boxes[7].name, std::string("Door Frames"));
        QCOMPARE(f.ws().CurrentColor, int16_t{7});
        QVERIFY(!renaming(f));
    }

    void rightClickOnAnotherBoxMovesTheRename() {
        FormFixture f;
        rightClick(f, 10);
        f.form().ColorNameBox->setText(QStringLiteral("Fence"));
        rightClick(f, 11);
        QCOMPARE(f.ws().Boxes[10].name, std::string("Fence"));
        QCOMPARE(f.form().ColorNameBoxTag, QStringLiteral("11"));
        QCOMPARE(f.form().ColorNameBox->text(), QStringLiteral("Extra 3"));
    }

    void openingAMenuDoesNotCommit() {
        FormFixture f;
        rightClick(f, 5);
        f.form().ColorNameBox->setText(QStringLiteral("Lower Wal"));
        QFocusEvent popup(QEvent::FocusOut, Qt::PopupFocusReason);
        QCoreApplication::sendEvent(f.form().ColorNameBox, &popup);
        QVERIFY(renaming(f));
        QCOMPARE(f.ws().Boxes[5].name, std::string("Lower Wall"));
        QFocusEvent tab(QEvent::FocusOut, Qt::TabFocusReason);
        QCoreApplication::sendEvent(f.form().ColorNameBox, &tab);
        QVERIFY(!renaming(f));
        QCOMPARE(f.ws().Boxes[5].name, std::string("Lower Wal"));
    }

    void losingTheFocusCommits() {
        FormFixture f;
        f.form().show();
        f.form().activateWindow();
        QVERIFY(QTest::qWaitForWindowActive(&f.form()));
        rightClick(f, 12);
        QTRY_VERIFY(f.form().ColorNameBox->hasFocus());
        f.form().ColorNameBox->setText(QStringLiteral("Garage"));
        f.form().Picture1->setFocusPolicy(Qt::StrongFocus);
        f.form().Picture1->setFocus();
        QTRY_COMPARE(f.ws().Boxes[12].name, std::string("Garage"));
        QVERIFY(!renaming(f));
    }
};

QTEST_MAIN(RenameColorBoxTest)
#include "RenameColorBox_test.moc"
