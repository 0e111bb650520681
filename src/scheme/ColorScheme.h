#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "paint/Workspace.h"

// The twelve colour boxes as the engine sees them: Workspace::Boxes holds each
// box's name, paint colour and reference; the window only shows them.

// Gives box |index| the paint colour `rgb` and loads that colour's hue,
// saturation and luminance into the drawing colour, whichever box it is.
// The reference is not touched; the name's colour follows ForeColorFor().
void SetNewColor(Workspace& ws, int32_t rgb, int index);

// Makes box i the selected one: drawing colour from its paint colour, RefLum
// from its reference only when it has one, pickup and set-reference ended,
// cursor brought up to date. The window ends a running rename first.
void SelectBox(Workspace& ws, int i);

// Empties every box's colour and reference. Names, the selected box and the
// drawing colour stay as they are.
void ClearAllColors(Workspace& ws);

// Decodes a scheme file's bytes and takes them over only when the whole file
// is sound: box 1 to 12 in order, name, reference, then SetNewColor (so the
// drawing colour ends up as box 12's). On failure the boxes are untouched and
// `problem` says why.
bool LoadScheme(Workspace& ws, const std::vector<uint8_t>& bytes, std::string& problem);
