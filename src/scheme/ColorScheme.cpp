#include "scheme/ColorScheme.h"

#include <cstdlib>

#include "imaging/HSLcolor.h"
#include "paint/Tools.h"
#include "scheme/SchemeFile.h"

namespace {
// Box number from an index that may carry a sign; 0 when out of range.
int BoxNumber(int index) {
    const long i = std::labs(static_cast<long>(index));
    return (i >= 1 && i <= kColorBoxCount) ? static_cast<int>(i) : 0;
}
} // namespace

void SetNewColor(Workspace& ws, int32_t rgb, int index) {
    const int i = BoxNumber(index);
    if (i == 0) return;
    const HSLcolor::HSL paint = HSLcolor::RGBToHSL(HSLcolor::SplitColor(rgb));
    ws.PaintHue = paint.hue;
    ws.PaintSat = paint.sat;
    ws.PaintLum = paint.lum;
    ws.Boxes[i].color = rgb;
}

void SelectBox(Workspace& ws, int i) {
    i = BoxNumber(i);
    if (i == 0) return;
    LoadDrawColor(ws, i);
    ws.CurrentColor = static_cast<int16_t>(i);
    EndModalTools(ws);
    UpdatePictureCursor(ws);
}

void ClearAllColors(Workspace& ws) {
    for (int i = 1; i <= kColorBoxCount; ++i) {
        ws.Boxes[i].color = kButtonFace;
        ws.Boxes[i].reference = 0;
    }
}

bool LoadScheme(Workspace& ws, const std::vector<uint8_t>& bytes, std::string& problem) {
    const SchemeFile::Decoded decoded = SchemeFile::Decode(bytes);
    if (!decoded.ok) {
        problem = decoded.problem;
        return false;
    }
    for (int i = 1; i <= kColorBoxCount; ++i) {
        ws.Boxes[i].name = decoded.boxes[i].name;
        ws.Boxes[i].reference = decoded.boxes[i].reference;
        SetNewColor(ws, decoded.boxes[i].color, i);
    }
    return true;
}
