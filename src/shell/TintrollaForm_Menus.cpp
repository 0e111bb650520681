#include <QAction>
#include <QCheckBox>
#include <QMenu>
#include <QMenuBar>

#include "paint/Tools.h"
#include "print/HelpTopics.h"
#include "shell/MenuShortcutWatcher.h"
#include "shell/TintrollaForm.h"

namespace {
QMenu* AddMenu(QHash<QString, QMenu*>& menus, QHash<QString, QAction*>& items, QWidget* parent,
               const char* name, const QString& caption) {
    auto* menu = new QMenu(caption, parent);
    menu->setObjectName(QString::fromLatin1(name));
    menus.insert(menu->objectName(), menu);
    items.insert(menu->objectName(), menu->menuAction());
    return menu;
}
} // namespace

void TintrollaForm::buildMenus() {
    QMenuBar* bar = menuBar();
    auto topMenu = [&](const char* name, const QString& caption) {
        QMenu* menu = AddMenu(menus, menuItems, bar, name, caption);
        bar->addMenu(menu);
        // Enabling and check marks are worked out as the menu opens.
        connect(menu, &QMenu::aboutToShow, this, &TintrollaForm::updateMenus);
        return menu;
    };
    auto subMenu = [&](QMenu* parent, const char* name, const QString& caption) {
        QMenu* menu = AddMenu(menus, menuItems, parent, name, caption);
        parent->addMenu(menu);
        return menu;
    };
    auto item = [&](QMenu* menu, const char* name, const QString& caption, const QKeySequence& shortcut,
                    auto handler, bool checkable = false) {
        QAction* action = menu->addAction(caption);
        action->setObjectName(QString::fromLatin1(name));
        action->setShortcut(shortcut);
        action->setCheckable(checkable);
        connect(action, &QAction::triggered, this, handler);
        menuItems.insert(action->objectName(), action);
        return action;
    };
    const auto none = QKeySequence();
    auto key = [](QKeyCombination k) { return QKeySequence(k); };
    auto tools = [this](auto change) {
        return [this, change] {
            change(workspace());
            ToolStateChanged();
        };
    };
    // An option item: its own check mark was just inverted; the check box
    // follows it and then runs its click handler.
    auto option = [this](const char* name, QCheckBox* TintrollaForm::*box, void (TintrollaForm::*handler)()) {
        return [this, name, box, handler] {
            (this->*box)->setChecked(menuItems.value(QString::fromLatin1(name))->isChecked());
            if (handler) (this->*handler)();
        };
    };

    QMenu* file = topMenu("FileMenu", QStringLiteral("&File"));
    QMenu* open = subMenu(file, "OpenMenuItem", QStringLiteral("&Open        "));
    item(open, "OpenFromClipboardMenuItem", QStringLiteral("from &Clipboard"), key(Qt::CTRL | Qt::Key_V),
         &TintrollaForm::OpenFromClipboardMenuItem_Click);
    item(open, "OpenFromFileMenuItem", QStringLiteral("from &File"), key(Qt::CTRL | Qt::Key_O),
         &TintrollaForm::OpenFromFileMenuItem_Click);
    item(file, "SaveMenuItem", QStringLiteral("&Save"), key(Qt::CTRL | Qt::Key_S), &TintrollaForm::SaveWork);
    QMenu* exportMenu = subMenu(file, "ExportMenu", QStringLiteral("&Export"));
    item(exportMenu, "ToClipboardMenuItem", QStringLiteral("to &Clipboard"), key(Qt::CTRL | Qt::Key_C),
         &TintrollaForm::ToClipboardMenuItem_Click);
    item(exportMenu, "ExportToFileMenuItem", QStringLiteral("to &File"), key(Qt::CTRL | Qt::Key_E),
         &TintrollaForm::ExportToFileMenuItem_Click);
    file->addSeparator();
    item(file, "PrintMenuItem", QStringLiteral("&Print"), key(Qt::CTRL | Qt::Key_P), &TintrollaForm::PrintMenuItem_Click);
    item(file, "DeleteMenuItem", QStringLiteral("&Delete"), key(Qt::Key_Delete), &TintrollaForm::DeletePicture);
    file->addSeparator();
    item(file, "ExitMenuItem", QStringLiteral("E&xit"), none, &TintrollaForm::ExitMenuItem_Click);

    QMenu* edit = topMenu("EditMenu", QStringLiteral("&Edit"));
    item(edit, "UndoMenuItem", QStringLiteral("&Undo"), key(Qt::CTRL | Qt::Key_Z), [this] { engine().UndoStroke(); ToolStateChanged(); });
    item(edit, "RedoMenuItem", QStringLiteral("&Redo"), key(Qt::CTRL | Qt::Key_R), [this] { engine().RedoStroke(); ToolStateChanged(); });
    edit->addSeparator();
    item(edit, "ClearAllMenuItem", QStringLiteral("&Clear All"), key(Qt::SHIFT | Qt::Key_Delete), [this] { engine().ClearAll(); ToolStateChanged(); });
    edit->addSeparator();
    item(edit, "BrightnessMenuItem", QStringLiteral("&Adjust Brightness && Contrast"), key(Qt::CTRL | Qt::Key_A), [] {});
    item(edit, "RefreshMenuItem", QStringLiteral("Re&fresh Picture"), key(Qt::CTRL | Qt::Key_F), &TintrollaForm::RefreshMenuItem_Click);
    edit->addSeparator();
    item(edit, "AutoCropMenuItem", QStringLiteral("A&uto Crop Picture"), key(Qt::CTRL | Qt::Key_F2), [this] {
        AutoCropCheckbox->setChecked(!AutoCropCheckbox->isChecked());
        AutoCropCheckbox_Click();
    }, true);

    QMenu* colours = topMenu("ColoursMenu", QStringLiteral("&Colors"));
    item(colours, "NewColourMenuItem", QStringLiteral("&New"), key(Qt::Key_F8), &TintrollaForm::NewColourMenuItem_Click);
    item(colours, "PickupColourMenuItem", QStringLiteral("&Pickup"), key(Qt::CTRL | Qt::Key_F8), tools(StartPickup));
    item(colours, "SetReferenceColourMenuItem", QStringLiteral("Set &Reference"), key(Qt::SHIFT | Qt::Key_F8), tools(ToggleSetReference));
    item(colours, "ClearAllColorsMenuItem", QStringLiteral("&Clear All Colors"), key(Qt::CTRL | Qt::Key_F7), &TintrollaForm::ClearAllColorsMenuItem_Click);
    colours->addSeparator();
    item(colours, "LoadSchemeMenuItem", QStringLiteral("&Load Scheme"), key(Qt::CTRL | Qt::Key_F9), &TintrollaForm::LoadSchemeMenuItem_Click);
    item(colours, "SaveSchemeMenuItem", QStringLiteral("&Save Scheme"), key(Qt::SHIFT | Qt::Key_F9), &TintrollaForm::SaveSchemeMenuItem_Click);
    colours->addSeparator();
    item(colours, "LoadWithPictureMenuItem", QStringLiteral("L&oad Color Scheme with Picture"), key(Qt::CTRL | Qt::Key_F6),
         option("LoadWithPictureMenuItem", &TintrollaForm::LoadwithPictureCheckbox, nullptr), true);

    QMenu* roller = topMenu("RollerMenu", QStringLiteral("&Roller"));
    QMenu* paint = subMenu(roller, "RollerPaintMenu", QStringLiteral("&Paint"));
    item(paint, "RollerDryMenuItem", QStringLiteral("&Dry"), key(Qt::Key_F2), tools(SelectDryPaint), true);
    item(paint, "RollerNormalMenuItem", QStringLiteral("&Normal"), key(Qt::Key_F3), tools(SelectNormalPaint), true);
    item(paint, "RollerWetMenuItem", QStringLiteral("&Wet"), key(Qt::Key_F4), tools(SelectWetPaint), true);
    QMenu* size = subMenu(roller, "RollerSizeMenu", QStringLiteral("&Size"));
    item(size, "RollerWideMenuItem", QStringLiteral("&Wide"), key(Qt::Key_F5), &TintrollaForm::RollerWideMenuItem_Click, true);
    item(size, "RollerNarrowMenuItem", QStringLiteral("&Narrow"), key(Qt::Key_F6), &TintrollaForm::RollerNarrowMenuItem_Click, true);
    item(size, "ChalkLineMenuItem", QStringLiteral("Place Chalk &Line"), key(Qt::Key_F7), &TintrollaForm::ChalkLineMenuItem_Click, true);
    roller->addSeparator();
    item(roller, "BlendEdgesMenuItem", QStringLiteral("&Blend Edges"), key(Qt::CTRL | Qt::Key_F3),
         option("BlendEdgesMenuItem", &TintrollaForm::BlendEdgesCheckbox, &TintrollaForm::BlendEdgesCheckbox_Click), true);
    item(roller, "ExpandEdgesMenuItem", QStringLiteral("&Expand Edges"), key(Qt::CTRL | Qt::Key_F4),
         option("ExpandEdgesMenuItem", &TintrollaForm::ExpandEdgesCheckbox, &TintrollaForm::ExpandEdgesCheckbox_Click), true);
    item(roller, "ProtectPaintedAreasMenuItem", QStringLiteral("Pr&otect Painted Areas"), key(Qt::CTRL | Qt::Key_F5),
         option("ProtectPaintedAreasMenuItem", &TintrollaForm::ProtectPaintCheckbox, &TintrollaForm::ProtectPaintCheckbox_Click), true);

    QMenu* help = topMenu("HelpMenu", QStringLiteral("&Help"));
    QMenu* tips = subMenu(help, "HelpTipsMenu", QStringLiteral("&Tips"));
    const auto topics = HelpTopics();
    for (size_t i = 0; i < topics.size(); ++i) {
        QAction* action = tips->addAction(QString::fromUtf8(topics[i].caption.data(), static_cast<qsizetype>(topics[i].caption.size())));
        action->setObjectName(QString::fromUtf8(topics[i].control.data(), static_cast<qsizetype>(topics[i].control.size())));
        connect(action, &QAction::triggered, this, [this, i] { HelpTopicMenuItem_Click(static_cast<int>(i)); });
        menuItems.insert(action->objectName(), action);
    }
    item(help, "VisitMoonfieldMenuItem", QStringLiteral("&Visit Moonfield"), key(Qt::CTRL | Qt::Key_F1),
         &TintrollaForm::VisitMoonfieldMenuItem_Click);
    item(help, "AboutMenuItem", QStringLiteral("&About"), none, &TintrollaForm::AboutMenuItem_Click);

    // A shortcut works out the menus first, as opening them would.
    new MenuShortcutWatcher(this, [this] { updateMenus(); });
    updateMenus();
}
