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
// Match weight, colour tolerance and luminance tolerance of each paint kind.
const QHash<QString, QList<int>> kPaintNumbers = {{"DryRoller", {1, 6, 4}}, {"NormalRoller", {50, 18, 12}}, {"WetRoller", {5, 45, 30}}};
using C = PictureCursor;

// Each row presses one key after another (the first sets the tool state to start
// from): a toolbar button, or a menu item by its name.
// Without colour in the current box the box beside it has one: that must not count.
// The modal tools left on: "p" pickup, "r" set reference.
const struct Row { const char *name, *before; bool coloured; const char *key, *down; C cursor; const char* modal; } kRows[] = {
    {"start", "", true, "", "NormalRoller WideRoller", C::WideRoller, ""},
    {"wet keeps a narrow roller", "NarrowRoller", true, "WetRoller", "WetRoller NarrowRoller", C::NarrowRoller, ""},
    {"wide after chalk", "ChalkLine", true, "WideRoller", "NormalRoller WideRoller", C::WideRoller, ""},
    {"narrow ends pickup", "PickupColour", true, "NarrowRoller", "NormalRoller NarrowRoller", C::NarrowRoller, ""},
    {"chalk without colour", "", false, "ChalkLine", "NormalRoller ChalkLine", C::NoDrop, ""},
    {"pickup ends set-reference", "SetRefPoint", true, "PickupColour", "NormalRoller WideRoller", C::Pickup, "p"},
    {"pickup without colour", "NarrowRoller", false, "PickupColour", "NormalRoller NarrowRoller", C::Pickup, "p"},
    {"set reference keeps no-drop", "", false, "SetRefPoint", "NormalRoller WideRoller", C::NoDrop, "r"},
    {"dry again stays down", "DryRoller", true, "DryRoller", "DryRoller WideRoller", C::WideRoller, ""},
    {"set reference button again stays on", "SetRefPoint", true, "SetRefPoint", "NormalRoller WideRoller", C::SetReference, "r"},
    {"set reference item switches off", "SetRefPoint", true, "SetReferenceColourMenuItem", "NormalRoller WideRoller", C::WideRoller, ""},
    {"narrow item keeps pickup", "PickupColour", true, "RollerNarrowMenuItem", "NormalRoller NarrowRoller", C::NarrowRoller, "p"},
    {"chalk item ends pickup over a wide roller", "PickupColour", true, "ChalkLineMenuItem", "NormalRoller ChalkLine", C::ChalkLine, ""},
    {"undo ends set-reference", "SetRefPoint", true, "Undo", "NormalRoller WideRoller", C::WideRoller, ""},
};

// A cursor's pixmap keeps its pixels premultiplied; turning them back into
// straight alpha rounds differently with each SIMD path Qt picks at run time,
// so both sides are compared premultiplied, where the conversion is exact.
QImage Argb(const QImage& image) { return image.convertToFormat(QImage::Format_ARGB32_Premultiplied); }
QString Q(std::string_view text) { return QString::fromUtf8(text.data(), qsizetype(text.size())); }

// Lists a menu bar or menu as "Caption|Shortcut" rows, "-" for separators, with
// sub-menus written as "Caption>" followed by their rows indented one blank more.
QStringList Describe(const QWidget* menu, const QString& indent = QString()) {
    QStringList rows;
    for (const QAction* a : menu->actions())
        rows << indent + (a->isSeparator() ? QStringLiteral("-") : a->menu() ? a->text() + ">" : a->text() + "|" + a->shortcut().toString())
             << (a->menu() ? Describe(a->menu(), indent + " ") : QStringList());
    return rows;
}

void Open(FormFixture& f, const char* menu) { emit f.form().menus.value(QString::fromLatin1(menu))->aboutToShow(); }
QAction* Item(FormFixture& f, const QString& name) { return f.form().menuItems.value(name); }
} // namespace

class ShellCommandsTest : public QObject {
    Q_OBJECT
private slots:
    void toolbarMenusAndHelpTopics();
    void dispatch_data();
    void dispatch();
    void enablingAndOptionsAsMenusOpen();
};

void ShellCommandsTest::toolbarMenusAndHelpTopics() {
    FormFixture f;
    // Name=tool tip, "*" on the buttons that can stay down.
    QStringList seen;
    for (QAction* a : f.form().Toolbar1->actions())
        seen << (a->isSeparator() ? QStringLiteral("-") : a->objectName() + "=" + a->toolTip() + (a->isCheckable() ? "*" : ""));
    QCOMPARE(seen, QStringList({"Open=Open", "Save=Save", "PicsIcon=PICs Folder", "Desktop=Desktop Shortcut", "Delete=Delete", "Print=Print",
        "-", "Undo=Undo", "Redo=Redo", "-", "NewColour=New Color", "PickupColour=Pickup Color", "SetRefPoint=Set Referance Point", "-",
        "DryRoller=Dry Paint*", "NormalRoller=Normal Paint*", "WetRoller=Wet Paint*", "-", "WideRoller=Wide Roller*", "NarrowRoller=Narrow Roller*",
        "ChalkLine=Chalk Line*"}));
    QStringList rows = Describe(f.form().menuBar());
    // The help topics between "&Tips" and "&Visit Moonfield" follow the topic list; each
    // shows its text under its title, with an OK button and no icon.
    for (const HelpTopic& topic : HelpTopics()) {
        QCOMPARE(rows.takeAt(rows.indexOf(" &Tips>") + 1), "  " + Q(topic.caption) + "|");
        Item(f, Q(topic.control))->trigger();
        const auto& shown = f.platform().messages.back();
        QVERIFY2(shown.title == Q(topic.title) && shown.text == Q(HelpText(topic)) && shown.buttons == platform::Buttons::Ok
                 && shown.icon == platform::Icon::None, qPrintable(Q(topic.control)));
    }
    QCOMPARE(rows, QStringLiteral(
        "&File>; &Open        >;  from &Clipboard|Ctrl+V;  from &File|Ctrl+O; &Save|Ctrl+S; &Export>;  to &Clipboard|Ctrl+C;"
        "  to &File|Ctrl+E; -; &Print|Ctrl+P; &Delete|Del; -; E&xit|;&Edit>; &Undo|Ctrl+Z; &Redo|Ctrl+R; -;"
        " &Clear All|Shift+Del; -; &Adjust Brightness && Contrast|Ctrl+A; Re&fresh Picture|Ctrl+F; -;"
        " A&uto Crop Picture|Ctrl+F2;&Colors>; &New|F8; &Pickup|Ctrl+F8; Set &Reference|Shift+F8; &Clear All Colors|Ctrl+F7; -;"
        " &Load Scheme|Ctrl+F9; &Save Scheme|Shift+F9; -; L&oad Color Scheme with Picture|Ctrl+F6;&Roller>; &Paint>;  &Dry|F2;"
        "  &Normal|F3;  &Wet|F4; &Size>;  &Wide|F5;  &Narrow|F6;  Place Chalk &Line|F7; -; &Blend Edges|Ctrl+F3;"
        " &Expand Edges|Ctrl+F4; Pr&otect Painted Areas|Ctrl+F5;&Help>; &Tips>; &Visit Moonfield|Ctrl+F1; &About|").split(';'));
    Item(f, "VisitMoonfieldMenuItem")->trigger();
    QCOMPARE(f.platform().urls, QList<QUrl>{QUrl("https://www.moonfield.com.au/")});
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
    ws.Boxes[r.coloured ? 1 : 2].color = kTeal;  // box 1 is selected at start
    f.form().UpdatePictureCursor();
    for (const char* key : {r.before, r.key}) {
        // A disabled button is pressed through its handler all the same.
        if (QAction* a = f.form().menuItems.value(key, f.form().toolbarButtons.value(key)); a && a->isEnabled()) a->trigger();
        else if (*key) f.form().Toolbar1_ButtonClick(key);
    }

    // The Roller menu's items, in the same order, tick what is down; chalk line from the toolbar leaves a narrow roller.
    Open(f, "RollerMenu");
    const QList<QAction*> ticks = f.form().menus.value("RollerPaintMenu")->actions() + f.form().menus.value("RollerSizeMenu")->actions();
    QStringList down;
    for (int i = 0; i < kGroupKeys.size(); ++i) {
        if (f.form().toolbarButtons.value(kGroupKeys[i])->isChecked()) down << kGroupKeys[i];
        QCOMPARE(ticks[i]->isChecked(), down.contains(kGroupKeys[i]));
    }
    QCOMPARE(down.join(' '), QString::fromLatin1(r.down));
    QCOMPARE(ws.WideRoller, !down.contains("NarrowRoller") && QString(r.key) != "ChalkLine");
    QCOMPARE(ws.Cursor, r.cursor);
    QCOMPARE(QString(ws.PickupLabelVisible ? "p" : "") + (ws.SetReferenceMode ? "r" : ""), QString(r.modal));
    QCOMPARE(QList<int>({ws.MatchWeight, ws.PlaneTolerance[2], ws.PlaneTolerance[3]}), kPaintNumbers.value(down.first()));
    QVERIFY(ws.CurrentColor == 1 && ws.Boxes[1].color == (r.coloured ? kTeal : kButtonFace) && (*r.modal != 'p' || ws.PickupIndex == 1));
    // The picture shows the tool's icon at its hot spot; the rest of the window keeps the arrow.
    const QCursor shown = f.form().Picture1->cursor();
    QVERIFY(f.form().cursor().shape() == Qt::ArrowCursor && (r.cursor == C::NoDrop ? shown.shape() == Qt::ForbiddenCursor
            : Argb(shown.pixmap().toImage()) == Argb(artwork::CursorIcon(r.cursor)) && shown.hotSpot() == artwork::CursorHotSpot(r.cursor)));
}

void ShellCommandsTest::enablingAndOptionsAsMenusOpen() {
    // The workspace's undo and redo flags come from the words "Undo" and "Redo";
    // "Renaming" opens a box's name for editing.
    const QString all = "Export Save Print Delete Brightness Refresh";
    for (const auto& [loaded, strokes, enabled] : {std::tuple<bool, int, QString>{false, 0, ""}, {false, 7, "ClearAll Undo"}, {true, 0, all},
                                                   {true, 3, all + " ClearAll Undo"}, {true, 3, all + " ClearAll Redo"},
                                                   {true, 3, "Renaming Export Save Print Brightness Refresh ClearAll Undo Redo"}}) {
        FormFixture f;
        std::tie(f.ws().PictureLoaded, f.ws().StrokeNumber) = std::tuple(loaded, strokes);
        std::tie(f.ws().UndoEnabled, f.ws().RedoEnabled) = std::pair(enabled.contains("Undo"), enabled.contains("Redo"));
        f.form().ToolStateChanged();  // the toolbar shows them; the menus follow the toolbar
        if (enabled.contains("Renaming")) f.form().ColorNameBox->show();
        for (const char* menu : {"FileMenu", "EditMenu"}) Open(f, menu);
        for (const QString word : {"Export", "Save", "Print", "Delete", "Undo", "Redo", "ClearAll", "Brightness", "Refresh"})
            QVERIFY2(Item(f, word + (word == "Export" ? "Menu" : "MenuItem"))->isEnabled() == enabled.contains(word), qPrintable(enabled + ": " + word));
    }
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
        const Workspace before = f.ws();
        for (const bool on : {!(before.*row.mirror), before.*row.mirror}) {
            f.form().Toolbar1_ButtonClick("PickupColour");
            Item(f, row.item)->trigger();
            Open(f, row.menu);
            QVERIFY2(Item(f, row.item)->isChecked() == on && f.form().findChild<QCheckBox*>(row.box)->isChecked() == on, row.item);
            for (const auto& other : rows) QCOMPARE(f.ws().*other.mirror, &other == &row ? on : before.*other.mirror);
            QVERIFY2(f.ws().PickupLabelVisible == row.keeps && f.ws().Cursor == (row.keeps ? C::Pickup : C::NoDrop), row.item);
        }
    }
    // A picture opens without any menu being opened; a shortcut still finds
    // the menus as they would open now.
    FormFixture f;
    f.form().show();
    QVERIFY(QTest::qWaitForWindowActive(&f.form()));
    f.ws().PictureLoaded = true;
    QTest::keyClick(&f.form(), Qt::Key_F3, Qt::ControlModifier);
    QVERIFY(!f.form().BlendEdgesCheckbox->isChecked() && Item(f, "SaveMenuItem")->isEnabled());
}

QTEST_MAIN(ShellCommandsTest)
#include "ShellCommands_test.moc"
