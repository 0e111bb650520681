// The colour boxes in the window: layout, selection, new colours, clearing.
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QtTest>

#include "scheme/qt/ColorBoxLabel.h"
#include "support/FormFixture.h"

class ColorBoxesTest : public QObject {
    Q_OBJECT

private:
    static ColorBoxLabel* box(FormFixture& f, int i) { return f.form().PictureColor[static_cast<size_t>(i)]; }
    static QColor shownBack(ColorBoxLabel* b) { return b->palette().color(QPalette::Window); }
    static QColor shownFore(ColorBoxLabel* b) { return b->palette().color(QPalette::WindowText); }

private slots:
    void startupLayout_data() {
        QTest::addColumn<int>("index");
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("top");
        const char* names[] = {"Ceiling", "Cornice", "Upper Wall", "Picture Rail", "Lower Wall", "Skirting Board",
                               "Door Frames", "Floor", "Extra 1", "Extra 2", "Extra 3", "Extra 4"};
        // 280 + 360 (i - 1) twips, to the nearest pixel
        const int tops[] = {19, 43, 67, 91, 115, 139, 163, 187, 211, 235, 259, 283};
        for (int i = 1; i <= 12; ++i)
            QTest::addRow("box %d", i) << i << QString::fromLatin1(names[i - 1]) << tops[i - 1];
    }

    void startupLayout() {
        QFETCH(int, index);
        QFETCH(QString, name);
        QFETCH(int, top);
        FormFixture f;
        ColorBoxLabel* b = box(f, index);
        QVERIFY(b);
        QCOMPARE(b->parentWidget(), f.form().ColorSchemeFrame);
        QCOMPARE(b->geometry(), QRect(8, top, 89, 17));
        QCOMPARE(b->text(), name);
        QCOMPARE(shownBack(b), f.form().ColorSchemeFrame->palette().color(QPalette::Button));
        QCOMPARE(shownFore(b), QColor(Qt::white));
        QCOMPARE(b->isFlat(), index == 1);
        QCOMPARE(f.ws().Boxes[static_cast<size_t>(index)].reference, 0);
        QVERIFY(!f.form().ColorNameBox->isVisibleTo(f.form().ColorSchemeFrame));
        QVERIFY(!f.form().PickupColorLabel->isVisibleTo(f.form().ColorSchemeFrame));
    }

    void pressSelectsWithAnyButton_data() {
        QTest::addColumn<int>("button");
        QTest::newRow("left") << int(Qt::LeftButton);
        QTest::newRow("right") << int(Qt::RightButton);
        QTest::newRow("middle") << int(Qt::MiddleButton);
    }

    void pressSelectsWithAnyButton() {
        QFETCH(int, button);
        FormFixture f;
        f.ws().PickupLabelVisible = true;
        f.ws().PickupIndex = 1;
        f.ws().SetReferenceMode = true;
        f.form().ToolStateChanged();
        QVERIFY(f.form().PickupColorLabel->isVisibleTo(f.form().ColorSchemeFrame));
        QTest::mousePress(box(f, 5), Qt::MouseButton(button));
        QCOMPARE(f.ws().CurrentColor, int16_t{5});
        for (int i = 1; i <= 12; ++i) QCOMPARE(box(f, i)->isFlat(), i == 5);
        QVERIFY(!f.ws().SetReferenceMode);
        QVERIFY(!f.form().PickupColorLabel->isVisibleTo(f.form().ColorSchemeFrame));
        QCOMPARE(f.ws().Cursor, PictureCursor::NoDrop);  // box 5 has no colour
    }

    void referenceLoadsRefLumOnlyWhenSet() {
        FormFixture f;
        f.ws().Boxes[3].reference = 0x0000FF;  // pure red: luminance 127
        f.ws().RefLum = 40.0f;
        QTest::mousePress(box(f, 2), Qt::LeftButton);
        QCOMPARE(f.ws().RefLum, 40.0f);
        QTest::mousePress(box(f, 3), Qt::LeftButton);
        QCOMPARE(f.ws().RefLum, 127.0f);
        QTest::mousePress(box(f, 4), Qt::LeftButton);
        QCOMPARE(f.ws().RefLum, 127.0f);
    }

    void nameColourFollowsGreen_data() {
        QTest::addColumn<int>("color");
        QTest::addColumn<QColor>("fore");
        QTest::newRow("green 99") << 0x006300 << QColor(Qt::white);
        QTest::newRow("green 100") << 0x006400 << QColor(Qt::black);
        QTest::newRow("green 99, red and blue full") << 0xFF63FF << QColor(Qt::white);
        QTest::newRow("green 100 with blue") << 0xC86432 << QColor(Qt::black);
    }

    void nameColourFollowsGreen() {
        QFETCH(int, color);
        QFETCH(QColor, fore);
        FormFixture f;
        QTest::mousePress(box(f, 4), Qt::LeftButton);
        f.platform().colors.push_back(color);
        f.form().NewColourMenuItem_Click();
        QCOMPARE(f.platform().colorStarts, QList<int32_t>{kButtonFace});
        QCOMPARE(f.ws().Boxes[4].color, color);
        QCOMPARE(shownBack(box(f, 4)), QColor(color & 0xFF, (color >> 8) & 0xFF, (color >> 16) & 0xFF));
        QCOMPARE(shownFore(box(f, 4)), fore);
        QCOMPARE(shownFore(box(f, 3)), QColor(Qt::white));
        QVERIFY(!f.ws().Boxes[3].hasColor());
        QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
    }

    void cancelledColourDialogStillEndsTheTools() {
        FormFixture f;
        f.ws().Boxes[1].color = 0x336699;
        f.form().ToolStateChanged();
        f.ws().PickupLabelVisible = true;
        f.ws().PickupIndex = 1;
        f.ws().SetReferenceMode = true;
        f.platform().colors.push_back(std::nullopt);
        f.form().NewColourMenuItem_Click();
        QCOMPARE(f.platform().colorStarts, QList<int32_t>{0x336699});
        QCOMPARE(f.ws().Boxes[1].color, 0x336699);
        QVERIFY(!f.ws().PickupLabelVisible);
        QVERIFY(!f.ws().SetReferenceMode);
        QVERIFY(!f.form().PickupColorLabel->isVisibleTo(f.form().ColorSchemeFrame));
    }

    void doubleClickAsksForTheClickedBoxColour() {
        FormFixture f;
        f.ws().Boxes[9].color = 0x0A0B0C;
        f.platform().colors.push_back(0x00FF00);
        // As the window system delivers it: press, release, then the second press as a double click.
        QTest::mouseClick(box(f, 9), Qt::LeftButton);
        QTest::mouseDClick(box(f, 9), Qt::LeftButton);
        QCOMPARE(f.ws().CurrentColor, int16_t{9});
        QCOMPARE(f.platform().colorStarts, QList<int32_t>{0x0A0B0C});
        QCOMPARE(f.ws().Boxes[9].color, 0x00FF00);
    }

    void clearAllColours_data() {
        QTest::addColumn<bool>("yes");
        QTest::newRow("Yes") << true;
        QTest::newRow("No") << false;
    }

    void clearAllColours() {
        QFETCH(bool, yes);
        FormFixture f;
        for (int i = 1; i <= 12; ++i) f.ws().Boxes[static_cast<size_t>(i)] = {"Box " + std::to_string(i), 0x00C000 + i, i};
        QTest::mousePress(box(f, 6), Qt::LeftButton);
        const float lum = f.ws().PaintLum;
        f.platform().answers.push_back(yes ? platform::Answer::Yes : platform::Answer::No);
        f.form().ClearAllColorsMenuItem_Click();
        QCOMPARE(f.platform().messages.size(), 1);
        QCOMPARE(f.platform().messages[0].title, QStringLiteral("Clear All Colors"));
        QCOMPARE(f.platform().messages[0].text, QStringLiteral("Are you Sure?"));
        QCOMPARE(f.platform().messages[0].buttons, platform::Buttons::YesNo);
        for (int i = 1; i <= 12; ++i) {
            const ColorBox& b = f.ws().Boxes[static_cast<size_t>(i)];
            QCOMPARE(b.name, "Box " + std::to_string(i));
            QCOMPARE(b.hasColor(), !yes);
            QCOMPARE(b.reference, yes ? 0 : i);
            QCOMPARE(shownFore(box(f, i)), yes ? QColor(Qt::white) : QColor(Qt::black));
            QCOMPARE(box(f, i)->text(), QString::fromStdString(b.name));
        }
        QCOMPARE(f.ws().CurrentColor, int16_t{6});
        QCOMPARE(f.ws().PaintLum, lum);
    }

    void pickupLabelLiesOverItsBox() {
        FormFixture f;
        f.ws().Boxes[7].color = 0x00FF00;
        f.ws().PickupIndex = 7;
        f.ws().PickupLabelVisible = true;
        f.ws().PickupLabelColor = 0x0000FF;
        f.form().ToolStateChanged();
        QLabel* label = f.form().PickupColorLabel;
        QVERIFY(label->isVisibleTo(f.form().ColorSchemeFrame));
        QCOMPARE(label->geometry(), box(f, 7)->geometry());
        QCOMPARE(label->text(), QStringLiteral("Door Frames"));
        QCOMPARE(label->palette().color(QPalette::Window), QColor(255, 0, 0));
        QCOMPARE(label->palette().color(QPalette::WindowText), QColor(Qt::black));
        QCOMPARE(shownBack(box(f, 7)), QColor(0, 255, 0));  // the box itself is unchanged
    }
};

QTEST_MAIN(ColorBoxesTest)
#include "ColorBoxes_test.moc"
