#pragma once
#include "paint/Workspace.h"

// The tool state behind the toolbar, the menus and the work picture's cursor.
// Each changes only the workspace; the window shows the result.

// The cursor for the current tool: no-drop while the selected box has no colour,
// else chalk line, narrow roller or wide roller.
void UpdatePictureCursor(Workspace& ws);
// Switches the pickup tool on over the selected box (ends set-reference).
void StartPickup(Workspace& ws);
// Switches the set-reference tool on when off (ending pickup), off when on.
void ToggleSetReference(Workspace& ws);
// The three paint kinds: match weight and tolerances, the modal tools ended,
// the paint-kind button down, the cursor brought up to date.
void SelectDryPaint(Workspace& ws);
void SelectNormalPaint(Workspace& ws);
void SelectWetPaint(Workspace& ws);
// Ends the pickup and set-reference tools.
void EndModalTools(Workspace& ws);

// The second button group: one of wide roller, narrow roller and chalk line
// is down. Chalk line wins over the roller size it leaves behind.
enum class SizeTool { Wide, Narrow, ChalkLine };
SizeTool CurrentSizeTool(const Workspace& ws);
// Sets WideRoller and ChalkLineMode as the toolbar's size buttons do
// (chalk line leaves a narrow roller behind). The cursor is not touched.
void SetSizeTool(Workspace& ws, SizeTool tool);
