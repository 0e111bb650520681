// The toolbar: its buttons, the two button groups and what each key does to
// the tool state, the modal tools and the work picture's cursor.
#include <QAction>
#include <QTest>
#include <QToolBar>

#include "paint/Tools.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"

namespace {
constexpr int32_t kTeal = 0x9A8C20;  // blue 0x9A, green 0x8C, red 0x20

// Tool states a row starts from.
enum class Start { Plain, Pickup, SetReference, Narrow, Chalk };

void Prepare(FormFixture& f, Start start, bool coloured) {
    Workspace& ws = f.ws();
    if (coloured) ws.Boxes[ws.CurrentColor].color = kTeal;
    f.form().UpdatePictureCursor();
    switch (start) {
    case Start::Plain: break;
    case Start::Pickup: StartPickup(ws); break;
    case Start::SetReference: ToggleSetReference(ws); break;
    case Start::Narrow: SetSizeTool(ws, SizeTool::Narrow); break;
    case Start::Chalk: SetSizeTool(ws, SizeTool::ChalkLine); break;
    }
    f.form().ToolStateChanged();
}

QStringList Checked(FormFixture& f, const QStringList& keys) {
    QStringList down;
    for (const QString& k : keys)
        if (f.form().toolbarButtons.value(k)->isChecked()) down << k;
    return down;
}

const QStringList kPaintKeys = {"DryRoller", "NormalRoller", "WetRoller"};
const QStringList kSizeKeys = {"WideRoller", "NarrowRoller", "ChalkLine"};
} // namespace

Q_DECLARE_METATYPE(Start)
Q_DECLARE_METATYPE(PictureCursor)

class ShellToolbarTest : public QObject {
    Q_OBJECT
private slots:
    void buttonsInOrderWithTooltipsAndImages();
    void imageListOrder();
    void startState();
    void dispatch_data();
    void dispatch();
    void clickReachesHandler();
    void setReferenceButtonAlwaysSwitchesOn();
    void undoRedoFollowWorkspace();
};

void ShellToolbarTest::buttonsInOrderWithTooltipsAndImages() {
    FormFixture f;
    QStringList seen;
    for (QAction* a : f.form().Toolbar1->actions())
        seen << (a->isSeparator() ? QStringLiteral("-") : a->objectName() + "=" + a->toolTip() + "=" + a->data().toString());
    const QStringList expected = {
        "Open=Open=Open", "Save=Save=Save", "PicsIcon=PICs Folder=PicsIconT", "Desktop=Desktop Shortcut=DeskIconT",
        "Delete=Delete=Delete", "Print=Print=Print", "-", "Undo=Undo=Undo", "Redo=Redo=Redo", "-",
        "NewColour=New Color=NewColourT", "PickupColour=Pickup Color=DropperT",
        "SetRefPoint=Set Referance Point=SetRefPointT", "-", "DryRoller=Dry Paint=DryRollerT1",
        "NormalRoller=Normal Paint=NormalRollerT", "WetRoller=Wet Paint=WetRollerT1", "-",
        "WideRoller=Wide Roller=LgRollerT", "NarrowRoller=Narrow Roller=SmRollerT", "ChalkLine=Chalk Line=ChalkLineT"};
    QCOMPARE(seen, expected);
    QCOMPARE(f.form().toolbarButtons.size(), 17);
    // Exactly the six group buttons can stay down.
    for (auto it = f.form().toolbarButtons.cbegin(); it != f.form().toolbarButtons.cend(); ++it)
        QCOMPARE(it.value()->isCheckable(), kPaintKeys.contains(it.key()) || kSizeKeys.contains(it.key()));
}

void ShellToolbarTest::imageListOrder() {
    QCOMPARE(artwork::ToolbarImageKeys(),
             QStringList({"Open", "Save", "Delete", "Undo", "Redo", "SmRollerT", "LgRollerT", "Print", "NewColourT",
                          "DropperT", "SetRefPointT", "DryRollerT1", "NormalRollerT", "WetRollerT1", "ChalkLineT",
                          "PicsIconT", "DeskIconT"}));
    for (const QString& key : artwork::ToolbarImageKeys()) {
        const QIcon icon = artwork::ToolbarImage(key);
        QVERIFY2(!icon.isNull(), qPrintable(key));
        QCOMPARE(icon.pixmap(QSize(16, 16), 1.0).size(), QSize(16, 16));
        QCOMPARE(icon.pixmap(QSize(16, 16), 2.0).deviceIndependentSize(), QSizeF(16, 16));
    }
    FormFixture f;
    QVERIFY(!f.form().windowIcon().isNull());
}

void ShellToolbarTest::startState() {
    FormFixture f;
    // Nothing to save, print, delete, undo or redo before a picture opens.
    for (const char* key : {"Save", "Print", "Delete", "Undo", "Redo"})
        QVERIFY2(!f.form().toolbarButtonEnabled(QString::fromLatin1(key)), key);
    for (const char* key : {"Open", "PicsIcon", "Desktop", "NewColour", "PickupColour", "SetRefPoint", "WetRoller", "ChalkLine"})
        QVERIFY2(f.form().toolbarButtonEnabled(QString::fromLatin1(key)), key);
    QCOMPARE(Checked(f, kPaintKeys), QStringList{"NormalRoller"});
    QCOMPARE(Checked(f, kSizeKeys), QStringList{"WideRoller"});
}

void ShellToolbarTest::dispatch_data() {
    QTest::addColumn<QString>("key");
    QTest::addColumn<Start>("start");
    QTest::addColumn<bool>("coloured");
    QTest::addColumn<QString>("paintDown");
    QTest::addColumn<QString>("sizeDown");
    QTest::addColumn<PictureCursor>("cursor");
    QTest::addColumn<bool>("pickup");
    QTest::addColumn<bool>("setReference");
    QTest::addColumn<int>("weight");
    QTest::addColumn<int>("colourTolerance");
    QTest::addColumn<int>("otherTolerance");

    using C = PictureCursor;
    QTest::newRow("dry ends pickup") << "DryRoller" << Start::Pickup << true << "DryRoller" << "WideRoller" << C::WideRoller << false << false << 1 << 6 << 4;
    QTest::newRow("normal ends set-reference") << "NormalRoller" << Start::SetReference << true << "NormalRoller" << "WideRoller" << C::WideRoller << false << false << 50 << 18 << 12;
    QTest::newRow("wet on a narrow roller") << "WetRoller" << Start::Narrow << true << "WetRoller" << "NarrowRoller" << C::NarrowRoller << false << false << 5 << 45 << 30;
    QTest::newRow("wet without colour") << "WetRoller" << Start::Plain << false << "WetRoller" << "WideRoller" << C::NoDrop << false << false << 5 << 45 << 30;
    QTest::newRow("wide after chalk") << "WideRoller" << Start::Chalk << true << "NormalRoller" << "WideRoller" << C::WideRoller << false << false << 50 << 18 << 12;
    QTest::newRow("narrow ends pickup") << "NarrowRoller" << Start::Pickup << true << "NormalRoller" << "NarrowRoller" << C::NarrowRoller << false << false << 50 << 18 << 12;
    QTest::newRow("chalk ends set-reference") << "ChalkLine" << Start::SetReference << true << "NormalRoller" << "ChalkLine" << C::ChalkLine << false << false << 50 << 18 << 12;
    QTest::newRow("chalk without colour") << "ChalkLine" << Start::Plain << false << "NormalRoller" << "ChalkLine" << C::NoDrop << false << false << 50 << 18 << 12;
    QTest::newRow("pickup") << "PickupColour" << Start::SetReference << true << "NormalRoller" << "WideRoller" << C::Pickup << true << false << 50 << 18 << 12;
    QTest::newRow("pickup without colour") << "PickupColour" << Start::Narrow << false << "NormalRoller" << "NarrowRoller" << C::Pickup << true << false << 50 << 18 << 12;
    QTest::newRow("set reference ends pickup") << "SetRefPoint" << Start::Pickup << true << "NormalRoller" << "WideRoller" << C::SetReference << false << true << 50 << 18 << 12;
    QTest::newRow("set reference keeps no-drop") << "SetRefPoint" << Start::Plain << false << "NormalRoller" << "WideRoller" << C::NoDrop << false << true << 50 << 18 << 12;
    QTest::newRow("print ends pickup") << "Print" << Start::Pickup << true << "NormalRoller" << "WideRoller" << C::WideRoller << false << false << 50 << 18 << 12;
    QTest::newRow("undo ends set-reference") << "Undo" << Start::SetReference << true << "NormalRoller" << "WideRoller" << C::WideRoller << false << false << 50 << 18 << 12;
}

void ShellToolbarTest::dispatch() {
    QFETCH(QString, key);
    QFETCH(Start, start);
    QFETCH(bool, coloured);
    QFETCH(QString, paintDown);
    QFETCH(QString, sizeDown);
    QFETCH(PictureCursor, cursor);
    QFETCH(bool, pickup);
    QFETCH(bool, setReference);
    QFETCH(int, weight);
    QFETCH(int, colourTolerance);
    QFETCH(int, otherTolerance);
    FormFixture f;
    Prepare(f, start, coloured);
    const int16_t box = f.ws().CurrentColor;

    f.form().Toolbar1_ButtonClick(key);

    const Workspace& ws = f.ws();
    QCOMPARE(Checked(f, kPaintKeys), QStringList{paintDown});
    QCOMPARE(Checked(f, kSizeKeys), QStringList{sizeDown});
    QCOMPARE(ws.Cursor, cursor);
    QCOMPARE(ws.PickupLabelVisible, pickup);
    QCOMPARE(ws.SetReferenceMode, setReference);
    QCOMPARE(ws.MatchWeight, weight);
    QCOMPARE(ws.PlaneTolerance[0], colourTolerance);
    QCOMPARE(ws.PlaneTolerance[2], colourTolerance);
    QCOMPARE(ws.PlaneTolerance[3], otherTolerance);
    QCOMPARE(ws.PlaneTolerance[5], otherTolerance);
    if (pickup) QCOMPARE(ws.PickupIndex, box);
    QCOMPARE(ws.CurrentColor, box);
    QCOMPARE(ws.Boxes[box].color, coloured ? kTeal : kButtonFace);
}

void ShellToolbarTest::clickReachesHandler() {
    FormFixture f;
    f.ws().Boxes[1].color = kTeal;
    f.form().toolbarButtons.value("ChalkLine")->trigger();
    QVERIFY(f.ws().ChalkLineMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::ChalkLine);
    QCOMPARE(Checked(f, kSizeKeys), QStringList{"ChalkLine"});
    f.form().toolbarButtons.value("DryRoller")->trigger();
    QCOMPARE(f.ws().Kind, PaintKind::Dry);
    QCOMPARE(Checked(f, kPaintKeys), QStringList{"DryRoller"});
    // Pressing the button that is already down keeps it down.
    f.form().toolbarButtons.value("DryRoller")->trigger();
    QCOMPARE(Checked(f, kPaintKeys), QStringList{"DryRoller"});
    // A disabled button does nothing at all.
    StartPickup(f.ws());
    f.form().toolbarButtons.value("Undo")->trigger();
    QVERIFY(f.ws().PickupLabelVisible);
}

void ShellToolbarTest::setReferenceButtonAlwaysSwitchesOn() {
    FormFixture f;
    f.ws().Boxes[1].color = kTeal;
    f.form().UpdatePictureCursor();
    QAction* button = f.form().toolbarButtons.value("SetRefPoint");
    QAction* item = f.form().menuItems.value("SetReferenceColourMenuItem");
    QVERIFY(button && item);
    for (int i = 0; i < 3; ++i) {
        button->trigger();
        QVERIFY2(f.ws().SetReferenceMode, qPrintable(QString::number(i)));
        QCOMPARE(f.ws().Cursor, PictureCursor::SetReference);
    }
    // The menu item toggles: off, on, off, with the roller back when off.
    item->trigger();
    QVERIFY(!f.ws().SetReferenceMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
    item->trigger();
    QVERIFY(f.ws().SetReferenceMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::SetReference);
    item->trigger();
    QVERIFY(!f.ws().SetReferenceMode);
}

void ShellToolbarTest::undoRedoFollowWorkspace() {
    FormFixture f;
    f.ws().UndoEnabled = true;
    f.form().ToolStateChanged();
    QVERIFY(f.form().toolbarButtonEnabled("Undo"));
    QVERIFY(!f.form().toolbarButtonEnabled("Redo"));
    f.ws().UndoEnabled = false;
    f.ws().RedoEnabled = true;
    f.form().ToolStateChanged();
    QVERIFY(!f.form().toolbarButtonEnabled("Undo"));
    QVERIFY(f.form().toolbarButtonEnabled("Redo"));
    // Save, Print and Delete are left to opening a picture and the title screen.
    QVERIFY(!f.form().toolbarButtonEnabled("Save"));
}

QTEST_MAIN(ShellToolbarTest)
#include "ShellToolbar_test.moc"
