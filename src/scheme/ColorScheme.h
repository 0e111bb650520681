#pragma once
#include <cstdint>

#include "paint/Workspace.h"

// Gives box |index| the paint colour `rgb` and makes it the drawing colour's
// hue, saturation and luminance. The reference is not touched.
void SetNewColor(Workspace& ws, int32_t rgb, int index);
// Makes box i the selected one (the window ends a running rename first).
void SelectBox(Workspace& ws, int i);
// Empties every box's colour and reference; names stay.
void ClearAllColors(Workspace& ws);
