// The toolbar and the menus: buttons and items in order, what each does to the
// tool state, the cursor the picture then shows, enabling and check marks as a
// menu opens, the option items and their check boxes, the help topics.
#include <QCheckBox>
#include <QLineEdit>
#include <QMenuBar>
#include <QTest>
#include <QToolBar>

#include "paint/qt/PictureView.h"
#include "print/HelpTopics.h"
#include "shell/Artwork.h"
#include "support/FormFixture.h"

namespace {
constexpr int32_t kTeal = 0x9A8C20;  // blue 0x9A, green 0x8C, red 0x20
const QStringList kGroupKeys = {"DryRoller", "NormalRoller", "WetRoller", "WideRoller", "NarrowRoller", "ChalkLine"};
const QStringList kGroupItems = {"RollerDryMenuItem", "RollerNormalMenuItem", "RollerWetMenuItem", "RollerWideMenuItem",
                                 "RollerNarrowMenuItem", "ChalkLineMenuItem"};
// Match weight, colour tolerance and luminance tolerance of each paint kind.
const QHash<QString, QList<int>> kPaintNumbers = {{"DryRoller", {1, 6, 4}}, {"NormalRoller", {50, 18, 12}}, {"WetRoller", {5, 45, 30}}};
using C = PictureCursor;

// Each row presses one key after another (the first sets the tool state to start
// from): a toolbar button, or a menu item by its name.
// Without colour in the current box the box beside it has one: that must not count.
const struct Row {
    const char *name, *before; bool coloured; const char* key;
    const char* down; C cursor; const char* modal;   // "p" pickup, "r" set reference
} kRows[] = {
    {"start", "", true, "", "NormalRoller WideRoller", C::WideRoller, ""},
    {"dry ends pickup", "PickupColour", true, "DryRoller", "DryRoller WideRoller", C::WideRoller, ""},
    {"wet keeps a narrow roller", "NarrowRoller", true, "WetRoller", "WetRoller NarrowRoller", C::NarrowRoller, ""},
    {"wide after chalk", "ChalkLine", true, "WideRoller", "NormalRoller WideRoller", C::WideRoller, ""},
    {"narrow ends pickup", "PickupColour", true, "NarrowRoller", "NormalRoller NarrowRoller", C::NarrowRoller, ""},
    {"chalk ends set-reference", "SetRefPoint", true, "ChalkLine", "NormalRoller ChalkLine", C::ChalkLine, ""},
    {"chalk without colour", "", false, "ChalkLine", "NormalRoller ChalkLine", C::NoDrop, ""},
    {"pickup ends set-reference", "SetRefPoint", true, "PickupColour", "NormalRoller WideRoller", C::Pickup, "p"},
    {"pickup without colour", "NarrowRoller", false, "PickupColour", "NormalRoller NarrowRoller", C::Pickup, "p"},
    {"set reference ends pickup", "PickupColour", true, "SetRefPoint", "NormalRoller WideRoller", C::SetReference, "r"},
    {"set reference keeps no-drop", "", false, "SetRefPoint", "NormalRoller WideRoller", C::NoDrop, "r"},
    {"dry again stays down", "DryRoller", true, "DryRoller", "DryRoller WideRoller", C::WideRoller, ""},
    {"set reference button again stays on", "SetRefPoint", true, "SetRefPoint", "NormalRoller WideRoller", C::SetReference, "r"},
    {"set reference item switches on", "", true, "SetReferenceColourMenuItem", "NormalRoller WideRoller", C::SetReference, "r"},
    {"set reference item switches off", "SetRefPoint", true, "SetReferenceColourMenuItem", "NormalRoller WideRoller", C::WideRoller, ""},
    {"narrow item keeps pickup", "PickupColour", true, "RollerNarrowMenuItem", "NormalRoller NarrowRoller", C::NarrowRoller, "p"},
    {"chalk item ends pickup over a wide roller", "PickupColour", true, "ChalkLineMenuItem", "NormalRoller ChalkLine", C::ChalkLine, ""},
    {"undo ends set-reference", "SetRefPoint", true, "Undo", "NormalRoller WideRoller", C::WideRoller, ""},
};

QImage Argb(const QImage& image) { return image.convertToFormat(QImage::Format_ARGB32); }
QString Q(std::string_view text) { return QString::fromUtf8(text.data(), qsizetype(text.size())); }

// Lists a menu as "Name|Caption|Shortcut" rows, "-" for separators, with
// sub-menus written as "Name>" followed by their rows indented one blank more.
QStringList Describe(const QMenu* menu, const QString& indent = QString()) {
    QStringList rows;
    for (const QAction* a : menu->actions()) {
        if (a->isSeparator()) rows << indent + "-";
        else if (a->menu()) rows << indent + a->menu()->objectName() + "|" + a->text() + ">" << Describe(a->menu(), indent + " ");
        else rows << indent + a->objectName() + "|" + a->text() + "|" + a->shortcut().toString();
    }
    return rows;
}

void Open(FormFixture& f, const char* menu) { emit f.form().menus.value(QString::fromLatin1(menu))->aboutToShow(); }
QAction* Item(FormFixture& f, const QString& name) { return f.form().menuItems.value(name); }
} // namespace

class ShellCommandsTest : public QObject {
    Q_OBJECT
private slots:
    void toolbarAndMenusInOrder();
    void dispatch_data();
    void dispatch();
    void enabling();
    void optionItems();
    void helpItems();
    void shortcutSeesCurrentEnabling();
};

void ShellCommandsTest::toolbarAndMenusInOrder() {
    FormFixture f;
    QStringList seen;
    for (QAction* a : f.form().Toolbar1->actions())
        seen << (a->isSeparator() ? QStringLiteral("-") : a->objectName() + "=" + a->toolTip() + "=" + a->data().toString());
    QCOMPARE(seen, QStringList({"Open=Open=Open", "Save=Save=Save", "PicsIcon=PICs Folder=PicsIconT", "Desktop=Desktop Shortcut=DeskIconT",
                                "Delete=Delete=Delete", "Print=Print=Print", "-", "Undo=Undo=Undo", "Redo=Redo=Redo", "-",
                                "NewColour=New Color=NewColourT", "PickupColour=Pickup Color=DropperT",
                                "SetRefPoint=Set Referance Point=SetRefPointT", "-", "DryRoller=Dry Paint=DryRollerT1",
                                "NormalRoller=Normal Paint=NormalRollerT", "WetRoller=Wet Paint=WetRollerT1", "-",
                                "WideRoller=Wide Roller=LgRollerT", "NarrowRoller=Narrow Roller=SmRollerT", "ChalkLine=Chalk Line=ChalkLineT"}));
    // Exactly the six group buttons can stay down.
    for (auto it = f.form().toolbarButtons.cbegin(); it != f.form().toolbarButtons.cend(); ++it)
        QCOMPARE(it.value()->isCheckable(), kGroupKeys.contains(it.key()));
    QStringList rows;
    for (const QAction* a : f.form().menuBar()->actions()) rows << a->menu()->objectName() + "|" + a->text() + ">" << Describe(a->menu(), " ");
    // The help topics between "&Tips" and "&Visit Moonfield" have their own test.
    rows.remove(rows.indexOf(" HelpTipsMenu|&Tips>") + 1, 14);
    QCOMPARE(rows, QStringLiteral(
        "FileMenu|&File>; OpenMenuItem|&Open        >;  OpenFromClipboardMenuItem|from &Clipboard|Ctrl+V;  OpenFromFileMenuItem|from &File|Ctrl+O;"
        " SaveMenuItem|&Save|Ctrl+S; ExportMenu|&Export>;  ToClipboardMenuItem|to &Clipboard|Ctrl+C;  ExportToFileMenuItem|to &File|Ctrl+E; -;"
        " PrintMenuItem|&Print|Ctrl+P; DeleteMenuItem|&Delete|Del; -; ExitMenuItem|E&xit|;EditMenu|&Edit>; UndoMenuItem|&Undo|Ctrl+Z;"
        " RedoMenuItem|&Redo|Ctrl+R; -; ClearAllMenuItem|&Clear All|Shift+Del; -; BrightnessMenuItem|&Adjust Brightness && Contrast|Ctrl+A;"
        " RefreshMenuItem|Re&fresh Picture|Ctrl+F; -; AutoCropMenuItem|A&uto Crop Picture|Ctrl+F2;ColoursMenu|&Colors>; NewColourMenuItem|&New|F8;"
        " PickupColourMenuItem|&Pickup|Ctrl+F8; SetReferenceColourMenuItem|Set &Reference|Shift+F8; ClearAllColorsMenuItem|&Clear All Colors|Ctrl+F7;"
        " -; LoadSchemeMenuItem|&Load Scheme|Ctrl+F9; SaveSchemeMenuItem|&Save Scheme|Shift+F9; -;"
        " LoadWithPictureMenuItem|L&oad Color Scheme with Picture|Ctrl+F6;RollerMenu|&Roller>; RollerPaintMenu|&Paint>;  RollerDryMenuItem|&Dry|F2;"
        "  RollerNormalMenuItem|&Normal|F3;  RollerWetMenuItem|&Wet|F4; RollerSizeMenu|&Size>;  RollerWideMenuItem|&Wide|F5;"
        "  RollerNarrowMenuItem|&Narrow|F6;  ChalkLineMenuItem|Place Chalk &Line|F7; -; BlendEdgesMenuItem|&Blend Edges|Ctrl+F3;"
        " ExpandEdgesMenuItem|&Expand Edges|Ctrl+F4; ProtectPaintedAreasMenuItem|Pr&otect Painted Areas|Ctrl+F5;HelpMenu|&Help>;"
        " HelpTipsMenu|&Tips>; VisitMoonfieldMenuItem|&Visit Moonfield|Ctrl+F1; AboutMenuItem|&About|").split(';'));
}

void ShellCommandsTest::dispatch_data() {
    QTest::addColumn<int>("row");
    for (int i = 0; i < int(std::size(kRows)); ++i) QTest::newRow(kRows[i].name) << i;
}

void ShellCommandsTest::dispatch() {
    QFETCH(int, row);
    const Row& r = kRows[row];
    FormFixture f;
    Workspace& ws = f.ws();
    const int16_t box = ws.CurrentColor;
    ws.Boxes[r.coloured ? box : box + 1].color = kTeal;
    f.form().UpdatePictureCursor();
    for (const char* key : {r.before, r.key}) {
        // A disabled button is pressed through its handler all the same.
        QAction* a = f.form().menuItems.value(key, f.form().toolbarButtons.value(key));
        if (a && a->isEnabled()) a->trigger();
        else if (*key) f.form().Toolbar1_ButtonClick(key);
    }

    QStringList down;
    for (const QString& k : kGroupKeys)
        if (f.form().toolbarButtons.value(k)->isChecked()) down << k;
    QCOMPARE(down.join(' '), QString::fromLatin1(r.down));
    // The Roller menu ticks what is down; chalk line from the toolbar leaves a narrow roller.
    Open(f, "RollerMenu");
    for (int i = 0; i < kGroupKeys.size(); ++i) QCOMPARE(Item(f, kGroupItems[i])->isChecked(), down.contains(kGroupKeys[i]));
    QCOMPARE(ws.WideRoller, !down.contains("NarrowRoller") && QString(r.key) != "ChalkLine");
    QCOMPARE(ws.Cursor, r.cursor);
    QCOMPARE(QString(ws.PickupLabelVisible ? "p" : "") + (ws.SetReferenceMode ? "r" : ""), QString(r.modal));
    QCOMPARE(QList<int>({ws.MatchWeight, ws.PlaneTolerance[2], ws.PlaneTolerance[3]}), kPaintNumbers.value(down.first()));
    QVERIFY(ws.CurrentColor == box && ws.Boxes[box].color == (r.coloured ? kTeal : kButtonFace) && (*r.modal != 'p' || ws.PickupIndex == box));
    // The picture shows the tool's icon; the rest of the window keeps the arrow.
    const QCursor shown = f.form().Picture1->cursor();
    if (r.cursor == C::NoDrop) {
        QCOMPARE(shown.shape(), Qt::ForbiddenCursor);
    } else {
        const QImage icon = Argb(artwork::CursorIcon(r.cursor));
        QCOMPARE(Argb(shown.pixmap().toImage()), icon);
        QCOMPARE(shown.hotSpot(), artwork::CursorHotSpot(r.cursor));
        // The tool touches the picture at the hot spot: drawn there, or right beside it.
        int opaque = 0;
        for (int i = 0; i < 9; ++i) opaque += qAlpha(icon.valid(shown.hotSpot() + QPoint(i % 3 - 1, i / 3 - 1)) ? icon.pixel(shown.hotSpot() + QPoint(i % 3 - 1, i / 3 - 1)) : 0) > 128;
        QVERIFY2(icon.valid(shown.hotSpot()) && opaque > 0, "hot spot in empty space");
    }
    QCOMPARE(f.form().cursor().shape(), Qt::ArrowCursor);
}

void ShellCommandsTest::enabling() {
    // The workspace's undo and redo flags come from the words "Undo" and "Redo";
    // "Renaming" opens a box's name for editing.
    const QString all = "Export Save Print Delete Brightness Refresh";
    for (const auto& [loaded, strokes, enabled] : {std::tuple<bool, int, QString>{false, 0, ""}, {false, 7, "ClearAll Undo"}, {true, 0, all},
                                                   {true, 3, all + " ClearAll Undo"}, {true, 3, all + " ClearAll Redo"},
                                                   {true, 3, "Renaming Export Save Print Brightness Refresh ClearAll Undo Redo"}}) {
        FormFixture f;
        f.ws().PictureLoaded = loaded;
        f.ws().StrokeNumber = strokes;
        f.ws().UndoEnabled = enabled.contains("Undo");
        f.ws().RedoEnabled = enabled.contains("Redo");
        f.form().ToolStateChanged();
        if (enabled.contains("Renaming")) f.form().ColorNameBox->show();
        for (const char* menu : {"FileMenu", "EditMenu"}) Open(f, menu);
        for (const QString word : {"Export", "Save", "Print", "Delete", "Undo", "Redo", "ClearAll", "Brightness", "Refresh"})
            QVERIFY2(Item(f, word + (word == "Export" ? "Menu" : "MenuItem"))->isEnabled() == enabled.contains(word), qPrintable(enabled + ": " + word));
        for (const QString key : {"Undo", "Redo"}) QCOMPARE(f.form().toolbarButtonEnabled(key), enabled.contains(key));
    }
}

void ShellCommandsTest::optionItems() {
    // Each item is chosen twice with the pickup tool on: it flips its check box
    // and the engine's copy, and ends the pickup unless the option is read only later.
    const struct { const char *menu, *item, *box; bool Workspace::*mirror; bool keeps; } rows[] = {
        {"RollerMenu", "BlendEdgesMenuItem", "BlendEdgesCheckbox", &Workspace::BlendEdges, false},
        {"RollerMenu", "ExpandEdgesMenuItem", "ExpandEdgesCheckbox", &Workspace::ExpandEdges, false},
        {"RollerMenu", "ProtectPaintedAreasMenuItem", "ProtectPaintCheckbox", &Workspace::ProtectPaint, false},
        {"ColoursMenu", "LoadWithPictureMenuItem", "LoadwithPictureCheckbox", &Workspace::LoadWithPicture, true},
        {"EditMenu", "AutoCropMenuItem", "AutoCropCheckbox", &Workspace::AutoCrop, true}};
    for (const auto& row : rows) {
        FormFixture f;
        f.ws().Boxes[1].color = kTeal;
        const Workspace before = f.ws();
        const QCheckBox* box = f.form().findChild<QCheckBox*>(row.box);
        for (int round = 1; round <= 2; ++round) {
            f.form().Toolbar1_ButtonClick("PickupColour");
            Item(f, row.item)->trigger();
            Open(f, row.menu);
            const bool on = before.*row.mirror != (round == 1);
            QVERIFY2(Item(f, row.item)->isChecked() == on && box->isChecked() == on, row.item);
            for (const auto& other : rows) QCOMPARE(f.ws().*other.mirror, &other == &row ? on : before.*other.mirror);
            QVERIFY2(f.ws().PickupLabelVisible == row.keeps && f.ws().Cursor == (row.keeps ? C::Pickup : C::WideRoller), row.item);
        }
    }
}

void ShellCommandsTest::helpItems() {
    FormFixture f;
    const QList<QAction*> items = f.form().menus.value("HelpTipsMenu")->actions();
    QCOMPARE(items.size(), 14);
    for (qsizetype i = 0; i < items.size(); ++i) {
        const HelpTopic& topic = HelpTopics()[size_t(i)];
        items[i]->trigger();
        const auto& shown = f.platform().messages.back();
        QCOMPARE(items[i]->text() + "|" + shown.title + "|" + shown.text, Q(topic.caption) + "|" + Q(topic.title) + "|" + Q(HelpText(topic)));
        QVERIFY(shown.buttons == platform::Buttons::Ok && shown.icon == platform::Icon::None);
    }
    Item(f, "VisitMoonfieldMenuItem")->trigger();
    QCOMPARE(f.platform().urls, QList<QUrl>{QUrl("https://www.moonfield.com.au/")});
    QCOMPARE(f.platform().messages.size(), 14);
}

void ShellCommandsTest::shortcutSeesCurrentEnabling() {
    FormFixture f;
    f.form().show();
    f.form().activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&f.form()));
    QVERIFY(!Item(f, "SaveMenuItem")->isEnabled());
    // A picture opens without any menu being opened; a shortcut still finds
    // the menus as they would open now.
    f.ws().PictureLoaded = true;
    QTest::keyClick(&f.form(), Qt::Key_F3, Qt::ControlModifier);
    QVERIFY(!f.form().BlendEdgesCheckbox->isChecked() && Item(f, "SaveMenuItem")->isEnabled());
}

QTEST_MAIN(ShellCommandsTest)
#include "ShellCommands_test.moc"
