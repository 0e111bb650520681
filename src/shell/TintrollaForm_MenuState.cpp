#include <QAction>
#include <QCheckBox>
#include <QLineEdit>
#include <QUrl>

#include "paint/Tools.h"
#include "print/HelpTopics.h"
#include "shell/TintrollaForm.h"

void TintrollaForm::updateMenus() {
    const Workspace& ws = workspace();
    auto enable = [this](const char* name, bool on) {
        if (QAction* a = menuItems.value(QString::fromLatin1(name))) a->setEnabled(on);
    };
    auto check = [this](const char* name, bool on) {
        if (QAction* a = menuItems.value(QString::fromLatin1(name))) a->setChecked(on);
    };
    auto pressed = [this](const char* key) {
        const QAction* a = toolbarButtons.value(QString::fromLatin1(key));
        return a && a->isChecked();
    };
    const bool renaming = ColorNameBox && ColorNameBox->isVisibleTo(this);

    enable("ExportMenu", ws.PictureLoaded);
    enable("SaveMenuItem", ws.PictureLoaded);
    enable("PrintMenuItem", ws.PictureLoaded);
    enable("DeleteMenuItem", ws.PictureLoaded && !renaming);

    enable("UndoMenuItem", toolbarButtonEnabled(QStringLiteral("Undo")));
    enable("RedoMenuItem", toolbarButtonEnabled(QStringLiteral("Redo")));
    enable("ClearAllMenuItem", ws.StrokeNumber != 0);
    enable("BrightnessMenuItem", ws.PictureLoaded);
    enable("RefreshMenuItem", ws.PictureLoaded);
    check("AutoCropMenuItem", AutoCropCheckbox->isChecked());

    check("LoadWithPictureMenuItem", LoadwithPictureCheckbox->isChecked());

    check("RollerDryMenuItem", pressed("DryRoller"));
    check("RollerNormalMenuItem", pressed("NormalRoller"));
    check("RollerWetMenuItem", pressed("WetRoller"));
    check("RollerWideMenuItem", ws.WideRoller && !ws.ChalkLineMode);
    check("RollerNarrowMenuItem", !ws.WideRoller && !ws.ChalkLineMode);
    check("ChalkLineMenuItem", ws.ChalkLineMode);
    check("BlendEdgesMenuItem", BlendEdgesCheckbox->isChecked());
    check("ExpandEdgesMenuItem", ExpandEdgesCheckbox->isChecked());
    check("ProtectPaintedAreasMenuItem", ProtectPaintCheckbox->isChecked());
}

void TintrollaForm::RefreshMenuItem_Click() {
    if (workspace().PictureLoaded) engine().RefreshAll();
}

void TintrollaForm::VisitMoonfieldMenuItem_Click() {
    // The browser may not start; nothing is said about it.
    (void)platformLayer().openUrl(QUrl(kHomePage));
}

void TintrollaForm::HelpTopicMenuItem_Click(int topic) {
    const auto topics = HelpTopics();
    if (topic < 0 || static_cast<size_t>(topic) >= topics.size()) return;
    const HelpTopic& t = topics[static_cast<size_t>(topic)];
    const std::string text = HelpText(t);
    Ask(QString::fromUtf8(t.title.data(), static_cast<qsizetype>(t.title.size())),
        QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size())), platform::Buttons::Ok,
        platform::Icon::None);
}

// Wide and narrow leave the pickup and set-reference tools as they are.
void TintrollaForm::RollerWideMenuItem_Click() {
    SetSizeTool(workspace(), SizeTool::Wide);
    UpdatePictureCursor();
    ToolStateChanged();
}

void TintrollaForm::RollerNarrowMenuItem_Click() {
    SetSizeTool(workspace(), SizeTool::Narrow);
    UpdatePictureCursor();
    ToolStateChanged();
}

// Chalk line ends the modal tools; the roller size under it stays.
void TintrollaForm::ChalkLineMenuItem_Click() {
    workspace().ChalkLineMode = true;
    endPickupAndSetReference();
}
