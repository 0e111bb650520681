#pragma once
#include "paint/Workspace.h"

// The tool state behind the toolbar, the menus and the work picture's cursor.
// Each changes only the workspace; the window shows the result.

// The cursor for the current tool: no-drop while the selected box has no colour.
void UpdatePictureCursor(Workspace& ws);
// Switches the pickup tool on over the selected box.
void StartPickup(Workspace& ws);
// Switches the set-reference tool on when off, off when on.
void ToggleSetReference(Workspace& ws);
// The three paint kinds (each ends the pickup and set-reference tools).
void SelectDryPaint(Workspace& ws);
void SelectNormalPaint(Workspace& ws);
void SelectWetPaint(Workspace& ws);
// Ends the pickup and set-reference tools.
void EndModalTools(Workspace& ws);
