#include <QTimer>

#include "paint/Tools.h"
#include "shell/TintrollaForm.h"
#include "store/qt/BrowserLists.h"

void TintrollaForm::Form_Load() {
    setWindowTitle(kCaption);
    StartupTimer->start();
    DrawTitleScreen();
}

void TintrollaForm::StartupTimer_Timer() {
    StartupTimer->stop();
    Workspace& ws = workspace();
    ws.CurrentColor = 1;
    ShowPicsFolder();
    ExportFolder = Dir1->path();
    platform_.processEvents(1000);
    SelectNormalPaint(ws);
    syncToolbar();
    applyPictureCursor();
    platform_.processEvents(1000);
    ws.WideRoller = true;  // the "WideRoller" button down
    syncToolbar();
    platform_.processEvents(1000);
    ws.WideRoller = true;
    ws.ChalkLineMode = false;
    ws.MaxY = static_cast<float>(Workspace::kHeight - 1);
    ws.MaxX = static_cast<float>(Workspace::kWidth - 1);
    ws.ChalkStartX = ws.ChalkStartY = -1;
    ws.ChalkEndX = ws.ChalkEndY = 0;
    ws.StrokeLeft = ws.StrokeTop = ws.StrokeRight = ws.StrokeBottom = 0;
    ws.PickupLabelVisible = false;
    ws.SetReferenceMode = false;
    ws.IgnoreUntilMouseUp = false;
    ws.PictureLoaded = false;
    ws.LoadingPicture = false;
    CurrentPicturePath.clear();
    RequestedPicturePath.clear();
    QString folder = ProgramFolder;
    if (folder.endsWith('/') && folder.size() > 1) folder.chop(1);
    SchemeFileName = folder + QStringLiteral("/NoName.csc");
    UpdatePictureCursor();
    ToolStateChanged();
    BackgroundTimer->start();
    ws.PictureModified = false;
    SetFileListPattern();
    startupDone_ = true;
}

void TintrollaForm::BackgroundTimer_Timer() {
    const Workspace& ws = workspace();
    if (ws.LoadingPicture) return;
    if (RequestedPicturePath != CurrentPicturePath)
        OpenPicture();
    else if (!ws.PictureLoaded)
        DrawTitleScreen();
}

void TintrollaForm::Form_Click() { endPickupAndSetReference(); }

void TintrollaForm::endPickupAndSetReference() {
    EndModalTools(workspace());
    UpdatePictureCursor();
    ToolStateChanged();
}

bool TintrollaForm::Form_QueryUnload() {
    if (!workspace().PictureModified) return false;
    const platform::Answer answer = Ask(QStringLiteral("Warning - Not Saved"),
                                        QStringLiteral("Do you want to save your work now?"),
                                        platform::Buttons::YesNoCancel);
    if (answer == platform::Answer::Cancel) return true;
    if (answer == platform::Answer::Yes) {
        SaveWork();
        // A save that failed or was called off would lose the work: stay open.
        return workspace().PictureModified;
    }
    return false;
}

void TintrollaForm::ExitMenuItem_Click() { close(); }
