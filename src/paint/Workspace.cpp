#include "paint/Workspace.h"

#include <cmath>
#include <cstdlib>

#include "imaging/HSLcolor.h"

Workspace::Workspace()
    : PaintMask(static_cast<size_t>(kMaskPlane) * 2, 0),
      PixelPlanes(static_cast<size_t>(kPlaneSize) * kPlaneCount, 0),
      PixelLuma(static_cast<size_t>(kPlaneSize), 0),
      Boxes(StartupColorBoxes()) {}

void Workspace::ClearMask() { std::fill(PaintMask.begin(), PaintMask.end(), int16_t{0}); }

ColorBoxes StartupColorBoxes() {
    static const char* const names[kColorBoxCount] = {
        "Ceiling", "Cornice", "Upper Wall", "Picture Rail", "Lower Wall", "Skirting Board",
        "Door Frames", "Floor", "Extra 1", "Extra 2", "Extra 3", "Extra 4"};
    ColorBoxes boxes;
    for (int i = 1; i <= kColorBoxCount; ++i) boxes[i].name = names[i - 1];
    return boxes;
}

void LoadDrawColor(Workspace& ws, int i) {
    i = std::abs(i);
    if (i < 1 || i > kColorBoxCount) return;
    const ColorBox& box = ws.Boxes[i];
    const HSLcolor::HSL paint = HSLcolor::RGBToHSL(HSLcolor::SplitColor(box.color));
    ws.PaintHue = paint.hue;
    ws.PaintSat = paint.sat;
    ws.PaintLum = paint.lum;
    if (box.reference != 0) ws.RefLum = HSLcolor::RGBToHSL(HSLcolor::SplitColor(box.reference)).lum;
}

void SetTolerance(Workspace& ws, int n) {
    const auto wide = static_cast<int32_t>(std::lrint(1.5 * n));
    ws.PlaneTolerance = {wide, wide, wide, n, n, n};
}
