#include <QAction>
#include <QActionGroup>
#include <QToolBar>
#include <exception>

#include "paint/Tools.h"
#include "shell/Artwork.h"
#include "shell/TintrollaForm.h"

namespace {
struct ToolbarButton {
    const char* key;
    const char* tooltip;
    const char* image;
    bool separatorBefore;
};

// The buttons in toolbar order; each shows an image of the image list by key.
constexpr ToolbarButton kButtons[] = {
    {"Open", "Open", "Open", false},
    {"Save", "Save", "Save", false},
    {"PicsIcon", "PICs Folder", "PicsIconT", false},
    {"Desktop", "Desktop Shortcut", "DeskIconT", false},
    {"Delete", "Delete", "Delete", false},
    {"Print", "Print", "Print", false},
    {"Undo", "Undo", "Undo", true},
    {"Redo", "Redo", "Redo", false},
    {"NewColour", "New Color", "NewColourT", true},
    {"PickupColour", "Pickup Color", "DropperT", false},
    {"SetRefPoint", "Set Referance Point", "SetRefPointT", false},
    {"DryRoller", "Dry Paint", "DryRollerT1", true},
    {"NormalRoller", "Normal Paint", "NormalRollerT", false},
    {"WetRoller", "Wet Paint", "WetRollerT1", false},
    {"WideRoller", "Wide Roller", "LgRollerT", true},
    {"NarrowRoller", "Narrow Roller", "SmRollerT", false},
    {"ChalkLine", "Chalk Line", "ChalkLineT", false},
};

const char* const kPaintGroup[] = {"DryRoller", "NormalRoller", "WetRoller"};
const char* const kSizeGroup[] = {"WideRoller", "NarrowRoller", "ChalkLine"};
} // namespace

void TintrollaForm::buildToolbar() {
    setWindowIcon(artwork::WindowIcon());
    auto* paintGroup = new QActionGroup(Toolbar1);
    auto* sizeGroup = new QActionGroup(Toolbar1);
    // Both groups are exclusive (the default): one button down in each.
    for (const ToolbarButton& b : kButtons) {
        const QString key = QString::fromLatin1(b.key);
        if (b.separatorBefore) Toolbar1->addSeparator();
        QAction* action = Toolbar1->addAction(artwork::ToolbarImage(QString::fromLatin1(b.image)), QString());
        action->setObjectName(key);
        action->setToolTip(QString::fromLatin1(b.tooltip));
        action->setData(QString::fromLatin1(b.image));
        for (const char* member : kPaintGroup)
            if (key == QLatin1String(member)) paintGroup->addAction(action)->setCheckable(true);
        for (const char* member : kSizeGroup)
            if (key == QLatin1String(member)) sizeGroup->addAction(action)->setCheckable(true);
        connect(action, &QAction::triggered, this, [this, key] { Toolbar1_ButtonClick(key); });
        toolbarButtons.insert(key, action);
    }
    // Nothing to save, print or delete, and nothing to undo, until a picture opens.
    for (const char* key : {"Save", "Print", "Delete", "Undo", "Redo"})
        setToolbarButtonEnabled(QString::fromLatin1(key), false);
    syncToolbar();
}

void TintrollaForm::Toolbar1_ButtonClick(const QString& key) {
    Workspace& ws = workspace();
    EndModalTools(ws);
    // A failure inside the operation a button starts ends that operation only.
    try {
        if (key == QLatin1String("Open")) OpenFromFileMenuItem_Click();
        else if (key == QLatin1String("Save")) SaveWork();
        else if (key == QLatin1String("PicsIcon")) ShowPicsFolder();
        else if (key == QLatin1String("Desktop")) ShowDesktopFolder();
        else if (key == QLatin1String("Delete")) DeletePicture();
        else if (key == QLatin1String("Print")) PrintMenuItem_Click();
        else if (key == QLatin1String("Undo")) engine().UndoStroke();
        else if (key == QLatin1String("Redo")) engine().RedoStroke();
        else if (key == QLatin1String("NewColour")) NewColourMenuItem_Click();
        else if (key == QLatin1String("PickupColour")) {
            StartPickup(ws);
            ToolStateChanged();
            return;
        } else if (key == QLatin1String("SetRefPoint")) {
            // The first step ended set-reference, so this always switches it on.
            ToggleSetReference(ws);
            ToolStateChanged();
            return;
        }
        else if (key == QLatin1String("DryRoller")) SelectDryPaint(ws);
        else if (key == QLatin1String("NormalRoller")) SelectNormalPaint(ws);
        else if (key == QLatin1String("WetRoller")) SelectWetPaint(ws);
        else if (key == QLatin1String("WideRoller")) SetSizeTool(ws, SizeTool::Wide);
        else if (key == QLatin1String("NarrowRoller")) SetSizeTool(ws, SizeTool::Narrow);
        else if (key == QLatin1String("ChalkLine")) SetSizeTool(ws, SizeTool::ChalkLine);
    } catch (const std::exception&) {
    }
    ::UpdatePictureCursor(ws);
    ToolStateChanged();
}

void TintrollaForm::setToolbarButtonEnabled(const QString& key, bool enabled) {
    if (QAction* a = toolbarButtons.value(key)) a->setEnabled(enabled);
}

bool TintrollaForm::toolbarButtonEnabled(const QString& key) const {
    const QAction* a = toolbarButtons.value(key);
    return a && a->isEnabled();
}

void TintrollaForm::syncToolbar() {
    const Workspace& ws = workspace();
    setToolbarButtonEnabled(QStringLiteral("Undo"), ws.UndoEnabled);
    setToolbarButtonEnabled(QStringLiteral("Redo"), ws.RedoEnabled);
    auto press = [this](const char* key, bool down) {
        if (QAction* a = toolbarButtons.value(QString::fromLatin1(key))) a->setChecked(down);
    };
    press("DryRoller", ws.Kind == PaintKind::Dry);
    press("NormalRoller", ws.Kind == PaintKind::Normal);
    press("WetRoller", ws.Kind == PaintKind::Wet);
    const SizeTool size = CurrentSizeTool(ws);
    press("WideRoller", size == SizeTool::Wide);
    press("NarrowRoller", size == SizeTool::Narrow);
    press("ChalkLine", size == SizeTool::ChalkLine);
}
