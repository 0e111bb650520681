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
        // Only the icon changes: a box without colour keeps the no-drop pointer.
        if (ws.Cursor != PictureCursor::NoDrop) ws.Cursor = PictureCursor::SetReference;
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
    ws.Kind = kind;
    UpdatePictureCursor(ws);
}
} // namespace

void SelectDryPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Dry, 1, 4); }
void SelectNormalPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Normal, 50, 12); }
void SelectWetPaint(Workspace& ws) { SelectPaint(ws, PaintKind::Wet, 5, 30); }
