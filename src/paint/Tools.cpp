#include "paint/Tools.h"

void UpdatePictureCursor(Workspace& ws) {
    if (!ws.Boxes[ws.CurrentColor].hasColor())
        ws.Cursor = PictureCursor::NoDrop;
    else if (ws.ChalkLineMode)
        ws.Cursor = PictureCursor::ChalkLine;
    else if (!ws.WideRoller)
        ws.Cursor = PictureCursor::NarrowRoller;
    else
        ws.Cursor = PictureCursor::WideRoller;
}

void StartPickup(Workspace& ws) {
    ws.Cursor = PictureCursor::Pickup;
    ws.PickupIndex = ws.CurrentColor;
    ws.PickupLabelVisible = true;
    ws.PickupLabelColor = ws.Boxes[ws.PickupIndex].color;
    ws.SetReferenceMode = false;
}

void ToggleSetReference(Workspace& ws) {
    if (!ws.SetReferenceMode) {
        // Only the icon of a custom pointer changes: the no-drop pointer of a
        // box without colour, and the plain default pointer, stay as they are.
        if (ws.Cursor != PictureCursor::NoDrop && ws.Cursor != PictureCursor::Default)
            ws.Cursor = PictureCursor::SetReference;
        ws.SetReferenceMode = true;
        ws.PickupLabelVisible = false;
    } else {
        ws.SetReferenceMode = false;
        UpdatePictureCursor(ws);
    }
}

void EndModalTools(Workspace& ws) {
    ws.PickupLabelVisible = false;
    ws.SetReferenceMode = false;
}

namespace {
void SelectPaint(Workspace& ws, PaintKind kind, int weight, int tolerance) {
    ws.MatchWeight = weight;
    SetTolerance(ws, tolerance);
    EndModalTools(ws);
    ws.Kind = kind;  // the paint-kind button down
    UpdatePictureCursor(ws);
}
} // namespace

void SelectDryPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Dry, 1, 4); }
void SelectNormalPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Normal, 50, 12); }
void SelectWetPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Wet, 5, 30); }

SizeTool CurrentSizeTool(const Workspace& ws) {
    if (ws.ChalkLineMode) return SizeTool::ChalkLine;
    return ws.WideRoller ? SizeTool::Wide : SizeTool::Narrow;
}

void SetSizeTool(Workspace& ws, SizeTool tool) {
    ws.ChalkLineMode = tool == SizeTool::ChalkLine;
    ws.WideRoller = tool == SizeTool::Wide;
}
