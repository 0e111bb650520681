// The menus: items, captions and shortcuts in order, enabling and check marks
// as a menu opens, the option items and their check boxes, the help topics.
#include <QAction>
#include <QCheckBox>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QTest>

#include "paint/Tools.h"
#include "print/HelpTopics.h"
#include "support/FormFixture.h"

namespace {
constexpr int32_t kOchre = 0x2A8ACC;

// Lists a menu as "Name|Caption|Shortcut" rows, "-" for separators, with
// sub-menus written as "Name>" followed by their rows indented.
QStringList Describe(const QMenu* menu, const QString& indent = QString()) {
    QStringList rows;
    for (const QAction* a : menu->actions()) {
        if (a->isSeparator()) {
            rows << indent + "-";
        } else if (a->menu()) {
            rows << indent + a->menu()->objectName() + "|" + a->text() + ">";
            rows << Describe(a->menu(), indent + "  ");
        } else {
            rows << indent + a->objectName() + "|" + a->text() + "|" + a->shortcut().toString();
        }
    }
    return rows;
}

void Open(FormFixture& f, const char* menu) { emit f.form().menus.value(QString::fromLatin1(menu))->aboutToShow(); }

bool Enabled(FormFixture& f, const char* item) { return f.form().menuItems.value(QString::fromLatin1(item))->isEnabled(); }
bool Ticked(FormFixture& f, const char* item) { return f.form().menuItems.value(QString::fromLatin1(item))->isChecked(); }
} // namespace

class ShellMenusTest : public QObject {
    Q_OBJECT
private slots:
    void menuBarAndItems();
    void helpTopicsInOrder();
    void enabling_data();
    void enabling();
    void rollerChecks_data();
    void rollerChecks();
    void optionItemsToggleTheirCheckBoxes_data();
    void optionItemsToggleTheirCheckBoxes();
    void optionItemsEndModalTools();
    void wideAndNarrowKeepModalTools();
    void helpTopicShowsItsMessage();
    void visitMoonfieldOpensHomePage();
    void shortcutSeesCurrentEnabling();
};

void ShellMenusTest::menuBarAndItems() {
    FormFixture f;
    QStringList top;
    for (const QAction* a : f.form().menuBar()->actions()) top << a->menu()->objectName() + "|" + a->text();
    QCOMPARE(top, QStringList({"FileMenu|&File", "EditMenu|&Edit", "ColoursMenu|&Colors", "RollerMenu|&Roller", "HelpMenu|&Help"}));
    QCOMPARE(Describe(f.form().menus.value("FileMenu")),
             QStringList({"OpenMenuItem|&Open        >", "  OpenFromClipboardMenuItem|from &Clipboard|Ctrl+V",
                          "  OpenFromFileMenuItem|from &File|Ctrl+O", "SaveMenuItem|&Save|Ctrl+S", "ExportMenu|&Export>",
                          "  ToClipboardMenuItem|to &Clipboard|Ctrl+C", "  ExportToFileMenuItem|to &File|Ctrl+E", "-",
                          "PrintMenuItem|&Print|Ctrl+P", "DeleteMenuItem|&Delete|Del", "-", "ExitMenuItem|E&xit|"}));
    QCOMPARE(Describe(f.form().menus.value("EditMenu")),
             QStringList({"UndoMenuItem|&Undo|Ctrl+Z", "RedoMenuItem|&Redo|Ctrl+R", "-", "ClearAllMenuItem|&Clear All|Shift+Del",
                          "-", "BrightnessMenuItem|&Adjust Brightness && Contrast|Ctrl+A",
                          "RefreshMenuItem|Re&fresh Picture|Ctrl+F", "-", "AutoCropMenuItem|A&uto Crop Picture|Ctrl+F2"}));
    QCOMPARE(Describe(f.form().menus.value("ColoursMenu")),
             QStringList({"NewColourMenuItem|&New|F8", "PickupColourMenuItem|&Pickup|Ctrl+F8",
                          "SetReferenceColourMenuItem|Set &Reference|Shift+F8", "ClearAllColorsMenuItem|&Clear All Colors|Ctrl+F7",
                          "-", "LoadSchemeMenuItem|&Load Scheme|Ctrl+F9", "SaveSchemeMenuItem|&Save Scheme|Shift+F9", "-",
                          "LoadWithPictureMenuItem|L&oad Color Scheme with Picture|Ctrl+F6"}));
    QCOMPARE(Describe(f.form().menus.value("RollerMenu")),
             QStringList({"RollerPaintMenu|&Paint>", "  RollerDryMenuItem|&Dry|F2", "  RollerNormalMenuItem|&Normal|F3",
                          "  RollerWetMenuItem|&Wet|F4", "RollerSizeMenu|&Size>", "  RollerWideMenuItem|&Wide|F5",
                          "  RollerNarrowMenuItem|&Narrow|F6", "  ChalkLineMenuItem|Place Chalk &Line|F7", "-",
                          "BlendEdgesMenuItem|&Blend Edges|Ctrl+F3", "ExpandEdgesMenuItem|&Expand Edges|Ctrl+F4",
                          "ProtectPaintedAreasMenuItem|Pr&otect Painted Areas|Ctrl+F5"}));
    const QStringList help = Describe(f.form().menus.value("HelpMenu"));
    QCOMPARE(help.first(), QStringLiteral("HelpTipsMenu|&Tips>"));
    QCOMPARE(help.mid(15), QStringList({"VisitMoonfieldMenuItem|&Visit Moonfield|Ctrl+F1", "AboutMenuItem|&About|"}));
    // The menu bar lies outside the 671 x 375 client area.
    QVERIFY(f.form().menuBar()->parentWidget() == &f.form());
    QVERIFY(!f.form().client->isAncestorOf(f.form().menuBar()));
}

void ShellMenusTest::helpTopicsInOrder() {
    FormFixture f;
    const QList<QAction*> items = f.form().menus.value("HelpTipsMenu")->actions();
    QCOMPARE(items.size(), 14);
    QCOMPARE(items[0]->text(), QStringLiteral("Using Tint-Rolla"));
    QCOMPARE(items[5]->text(), QStringLiteral("What is the \"Set Referance\" tool?"));
    QCOMPARE(items[9]->objectName(), QStringLiteral("WhyPictureSquashedStrecthedMenuItem"));
    QCOMPARE(items[13]->text(), QStringLiteral("Why is my printout a slightly different color?"));
}

void ShellMenusTest::enabling_data() {
    QTest::addColumn<bool>("loaded");
    QTest::addColumn<bool>("renaming");
    QTest::addColumn<int>("strokes");
    QTest::addColumn<bool>("undo");
    QTest::addColumn<bool>("redo");
    QTest::addColumn<QString>("enabled");   // the items of the rules that are enabled
    const QString all = "Export Save Print Delete Brightness Refresh";
    QTest::newRow("title screen") << false << false << 0 << false << false << "";
    QTest::newRow("title screen, work kept") << false << false << 7 << true << false << "ClearAll Undo";
    QTest::newRow("picture open") << true << false << 0 << false << false << all;
    QTest::newRow("painted") << true << false << 3 << true << false << all + " ClearAll Undo";
    QTest::newRow("undone") << true << false << 3 << false << true << all + " ClearAll Redo";
    QTest::newRow("renaming a box") << true << true << 3 << true << true << "Export Save Print Brightness Refresh ClearAll Undo Redo";
}

void ShellMenusTest::enabling() {
    QFETCH(bool, loaded);
    QFETCH(bool, renaming);
    QFETCH(int, strokes);
    QFETCH(bool, undo);
    QFETCH(bool, redo);
    QFETCH(QString, enabled);
    FormFixture f;
    f.ws().PictureLoaded = loaded;
    f.ws().StrokeNumber = strokes;
    f.ws().UndoEnabled = undo;
    f.ws().RedoEnabled = redo;
    f.form().ToolStateChanged();
    if (renaming) {
        QVERIFY(f.form().ColorNameBox);
        f.form().ColorNameBox->show();
    }
    Open(f, "FileMenu");
    Open(f, "EditMenu");
    const QStringList expected = enabled.split(' ', Qt::SkipEmptyParts);
    const std::pair<const char*, const char*> rules[] = {
        {"Export", "ExportMenu"}, {"Save", "SaveMenuItem"}, {"Print", "PrintMenuItem"}, {"Delete", "DeleteMenuItem"},
        {"Undo", "UndoMenuItem"}, {"Redo", "RedoMenuItem"}, {"ClearAll", "ClearAllMenuItem"},
        {"Brightness", "BrightnessMenuItem"}, {"Refresh", "RefreshMenuItem"}};
    for (const auto& [word, item] : rules)
        QVERIFY2(Enabled(f, item) == expected.contains(QString::fromLatin1(word)), item);
    // Items without a rule stay enabled whatever the state.
    for (const char* item : {"OpenMenuItem", "OpenFromFileMenuItem", "OpenFromClipboardMenuItem", "ExitMenuItem",
                             "AutoCropMenuItem", "ToClipboardMenuItem", "ExportToFileMenuItem"})
        QVERIFY2(Enabled(f, item), item);
}

void ShellMenusTest::rollerChecks_data() {
    QTest::addColumn<QString>("choose");    // a menu item or a toolbar key
    QTest::addColumn<QString>("checked");   // of the six tool items
    QTest::newRow("start") << "" << "RollerNormalMenuItem RollerWideMenuItem";
    QTest::newRow("chalk from the menu") << "ChalkLineMenuItem" << "RollerNormalMenuItem ChalkLineMenuItem";
    QTest::newRow("chalk from the toolbar") << "ChalkLine" << "RollerNormalMenuItem ChalkLineMenuItem";
    QTest::newRow("narrow") << "RollerNarrowMenuItem" << "RollerNormalMenuItem RollerNarrowMenuItem";
    QTest::newRow("dry") << "RollerDryMenuItem" << "RollerDryMenuItem RollerWideMenuItem";
    QTest::newRow("wet from the toolbar") << "WetRoller" << "RollerWetMenuItem RollerWideMenuItem";
}

void ShellMenusTest::rollerChecks() {
    QFETCH(QString, choose);
    QFETCH(QString, checked);
    FormFixture f;
    if (QAction* item = f.form().menuItems.value(choose)) item->trigger();
    else if (!choose.isEmpty()) f.form().Toolbar1_ButtonClick(choose);
    Open(f, "RollerMenu");
    const QStringList expected = checked.split(' ');
    for (const char* item : {"RollerDryMenuItem", "RollerNormalMenuItem", "RollerWetMenuItem", "RollerWideMenuItem",
                             "RollerNarrowMenuItem", "ChalkLineMenuItem"})
        QVERIFY2(Ticked(f, item) == expected.contains(QString::fromLatin1(item)), item);
    // The options are all ticked at start.
    for (const char* item : {"BlendEdgesMenuItem", "ExpandEdgesMenuItem", "ProtectPaintedAreasMenuItem"})
        QVERIFY2(Ticked(f, item), item);
}

void ShellMenusTest::optionItemsToggleTheirCheckBoxes_data() {
    QTest::addColumn<QString>("menu");
    QTest::addColumn<QString>("item");
    QTest::addColumn<QString>("box");
    QTest::newRow("blend") << "RollerMenu" << "BlendEdgesMenuItem" << "BlendEdgesCheckbox";
    QTest::newRow("expand") << "RollerMenu" << "ExpandEdgesMenuItem" << "ExpandEdgesCheckbox";
    QTest::newRow("protect") << "RollerMenu" << "ProtectPaintedAreasMenuItem" << "ProtectPaintCheckbox";
    QTest::newRow("load with picture") << "ColoursMenu" << "LoadWithPictureMenuItem" << "LoadwithPictureCheckbox";
    QTest::newRow("auto crop") << "EditMenu" << "AutoCropMenuItem" << "AutoCropCheckbox";
}

void ShellMenusTest::optionItemsToggleTheirCheckBoxes() {
    QFETCH(QString, menu);
    QFETCH(QString, item);
    QFETCH(QString, box);
    FormFixture f;
    auto* check = f.form().findChild<QCheckBox*>(box);
    QVERIFY(check);
    const bool start = check->isChecked();
    const Workspace before = f.ws();
    for (int round = 1; round <= 3; ++round) {
        emit f.form().menus.value(menu)->aboutToShow();
        QCOMPARE(f.form().menuItems.value(item)->isChecked(), round % 2 == 1 ? start : !start);
        f.form().menuItems.value(item)->trigger();
        QCOMPARE(check->isChecked(), round % 2 == 1 ? !start : start);
    }
    // The engine's copy follows the box; the other options stay.
    const Workspace& ws = f.ws();
    QCOMPARE(ws.BlendEdges, box == "BlendEdgesCheckbox" ? !before.BlendEdges : before.BlendEdges);
    QCOMPARE(ws.ExpandEdges, box == "ExpandEdgesCheckbox" ? !before.ExpandEdges : before.ExpandEdges);
    QCOMPARE(ws.ProtectPaint, box == "ProtectPaintCheckbox" ? !before.ProtectPaint : before.ProtectPaint);
    QCOMPARE(ws.LoadWithPicture, box == "LoadwithPictureCheckbox" ? !before.LoadWithPicture : before.LoadWithPicture);
    QCOMPARE(ws.AutoCrop, box == "AutoCropCheckbox" ? !before.AutoCrop : before.AutoCrop);
}

void ShellMenusTest::optionItemsEndModalTools() {
    FormFixture f;
    f.ws().Boxes[1].color = kOchre;
    for (const char* item : {"BlendEdgesMenuItem", "ExpandEdgesMenuItem", "ProtectPaintedAreasMenuItem"}) {
        StartPickup(f.ws());
        f.form().ToolStateChanged();
        f.form().menuItems.value(item)->trigger();
        QVERIFY2(!f.ws().PickupLabelVisible, item);
        QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
        ToggleSetReference(f.ws());
        f.form().menuItems.value(item)->trigger();
        QVERIFY2(!f.ws().SetReferenceMode, item);
    }
    // Loading the scheme with the picture is only read later: the tool stays.
    StartPickup(f.ws());
    f.form().menuItems.value("LoadWithPictureMenuItem")->trigger();
    QVERIFY(f.ws().PickupLabelVisible);
}

void ShellMenusTest::wideAndNarrowKeepModalTools() {
    FormFixture f;
    f.ws().Boxes[1].color = kOchre;
    StartPickup(f.ws());
    f.form().menuItems.value("RollerNarrowMenuItem")->trigger();
    QVERIFY(f.ws().PickupLabelVisible);
    QVERIFY(!f.ws().WideRoller);
    QCOMPARE(f.ws().Cursor, PictureCursor::NarrowRoller);
    ToggleSetReference(f.ws());
    f.form().menuItems.value("RollerWideMenuItem")->trigger();
    QVERIFY(f.ws().SetReferenceMode);
    QCOMPARE(f.ws().Cursor, PictureCursor::WideRoller);
    // Chalk line from the menu ends them, and keeps the roller size under it.
    f.form().menuItems.value("ChalkLineMenuItem")->trigger();
    QVERIFY(!f.ws().SetReferenceMode);
    QVERIFY(f.ws().ChalkLineMode);
    QVERIFY(f.ws().WideRoller);
    QCOMPARE(f.ws().Cursor, PictureCursor::ChalkLine);
}

void ShellMenusTest::helpTopicShowsItsMessage() {
    FormFixture f;
    const Workspace before = f.ws();
    const QList<QAction*> items = f.form().menus.value("HelpTipsMenu")->actions();
    for (int i = 0; i < items.size(); ++i) items[i]->trigger();
    const auto& messages = f.platform().messages;
    QCOMPARE(messages.size(), 14);
    QCOMPARE(messages[1].title, QStringLiteral("What is a Color Scheme?"));
    QCOMPARE(messages[1].text, QStringLiteral("This is your chosen group of colors for repainting the photo.\r\n"
                                              "You can choose a NEW color or PICKUP a color from the photo.\r\n"
                                              "You can rename a color by clicking the right mouse button.\r\n"
                                              "The Color Scheme is SAVED with the edited photo."));
    QCOMPARE(messages[6].title, QStringLiteral("What is the PICS folder ?"));
    for (int i = 0; i < messages.size(); ++i) {
        const HelpTopic& topic = HelpTopics()[static_cast<size_t>(i)];
        QCOMPARE(messages[i].title, QString::fromUtf8(topic.title.data(), qsizetype(topic.title.size())));
        QCOMPARE(messages[i].text, QString::fromStdString(HelpText(topic)));
        QCOMPARE(messages[i].buttons, platform::Buttons::Ok);
        QCOMPARE(messages[i].icon, platform::Icon::None);
    }
    QCOMPARE(f.ws().Cursor, before.Cursor);
    QCOMPARE(f.ws().Kind, before.Kind);
}

void ShellMenusTest::visitMoonfieldOpensHomePage() {
    FormFixture f;
    f.form().menuItems.value("VisitMoonfieldMenuItem")->trigger();
    QCOMPARE(f.platform().urls.size(), 1);
    QCOMPARE(f.platform().urls[0].scheme(), QStringLiteral("https"));
    QVERIFY(f.platform().urls[0].host().contains("moonfield"));
    QVERIFY(f.platform().messages.isEmpty());
}

void ShellMenusTest::shortcutSeesCurrentEnabling() {
    FormFixture f;
    f.form().show();
    f.form().activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&f.form()));
    Open(f, "FileMenu");
    QVERIFY(!Enabled(f, "SaveMenuItem"));
    // A picture opens without any menu being opened; a shortcut still finds
    // the menus as they would open now.
    f.ws().PictureLoaded = true;
    QVERIFY(f.form().BlendEdgesCheckbox->isChecked());
    QTest::keyClick(&f.form(), Qt::Key_F3, Qt::ControlModifier);
    QVERIFY(!f.form().BlendEdgesCheckbox->isChecked());
    QVERIFY(Enabled(f, "SaveMenuItem"));
    QTest::keyClick(&f.form(), Qt::Key_F3, Qt::ControlModifier);
    QVERIFY(f.form().BlendEdgesCheckbox->isChecked());
}

QTEST_MAIN(ShellMenusTest)
#include "ShellMenus_test.moc"
