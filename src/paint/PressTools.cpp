// Steps of a press that sample the picture (reference, pickup) and the
// chalk line's drag and commit.
#include <cstdint>
#include <cstdlib>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"
#include "paint/Tools.h"
#include "scheme/ColorScheme.h"

namespace {
constexpr int kLastAutoPickupBox = 10;  // the pickup's automatic advance stops here
} // namespace

bool PaintEngine::ReferenceStep(int x, int y) {
    if (ws_.SetReferenceMode && ws_.Stroke(x, y) <= 0) {
        host_.Warning(kSetReferenceTitle, kNotRepaintedText);
        return false;
    }
    // A cross of five pixels: the point and its four edge neighbours.
    const int cross[5][2] = {{x, y}, {x - 1, y}, {x + 1, y}, {x, y - 1}, {x, y + 1}};
    int64_t luma = 0, wave = 0, sat = 0;
    for (const auto& p : cross) {
        luma += ws_.Luma(p[0], p[1]);
        wave += ws_.Plane(p[0], p[1], 4);
        sat += ws_.Plane(p[0], p[1], 5);
    }
    const float l = static_cast<float>(static_cast<double>(luma) / 5.0);
    const float w = static_cast<float>(static_cast<double>(wave) / 5.0);
    const float s = static_cast<float>(static_cast<double>(sat) / 5.0);
    ws_.RefLum = l;
    // Only the luminance is used when drawing, but the value is stored with
    // the scheme exactly as formed here: saturation in as hue, wave as saturation.
    const int32_t reference = HSLcolor::JoinColor(HSLcolor::HSLToRGB(s, w, l));
    ws_.Boxes[static_cast<size_t>(ws_.CurrentColor)].reference = reference;
    if (!ws_.SetReferenceMode) {
        host_.ToolStateChanged();
        return true;
    }
    const int k = std::abs(ws_.ColorPlane(x, y));
    if (k >= 1 && k <= kColorBoxCount) {
        ws_.Boxes[static_cast<size_t>(k)].reference = reference;
        RepaintColor(k);
    }
    ws_.IgnoreUntilMouseUp = true;
    host_.ToolStateChanged();
    return false;
}

void PaintEngine::PickupClick(int x, int y) {
    const int index = ws_.PickupIndex;
    if (index < 1 || index > kColorBoxCount) {
        EndModalTools(ws_);
        UpdatePictureCursor(ws_);
        host_.ToolStateChanged();
        return;
    }
    // The colour under the mouse, also when no move has shown it yet.
    ws_.PickupLabelColor = ws_.Picture1.pixel(x, y);
    SetNewColor(ws_, ws_.PickupLabelColor, index);
    RepaintColor(index);
    ws_.IgnoreUntilMouseUp = true;
    host_.SelectColorBox(index);
    ws_.PickupLabelVisible = false;
    StartPickup(ws_);

    // On to the next box without a reference, but not past box 10 (or 12
    // when the pickup was started beyond it).
    int n = ws_.PickupIndex;
    for (;;) {
        if (n == kLastAutoPickupBox || n >= kColorBoxCount || n < 0) {
            ws_.PickupLabelVisible = false;
            UpdatePictureCursor(ws_);
            host_.ToolStateChanged();
            return;
        }
        ++n;
        if (BoxReference(n) == 0) break;
    }
    ws_.PickupIndex = static_cast<int16_t>(n);
    ws_.PickupLabelColor = ws_.Boxes[static_cast<size_t>(n)].color;
    host_.ToolStateChanged();
}

void PaintEngine::FollowChalkLine(int x, int y) {
    if (ws_.ChalkStartX < 0 || ws_.ChalkStartY < 0) {
        ws_.ChalkStartX = static_cast<int16_t>(x);
        ws_.ChalkStartY = static_cast<int16_t>(y);
    }
    DrawChalkLine(true, false);
    ws_.ChalkEndX = static_cast<int16_t>(x);
    ws_.ChalkEndY = static_cast<int16_t>(y);
    DrawChalkLine(false, false);
    host_.RefreshPicture();
}

void PaintEngine::CommitChalkLine(int x, int y) {
    if (ws_.StrokeNumber >= Workspace::kMaxStrokeNumber) {
        DrawChalkLine(true, false);
        host_.RefreshPicture();
        ws_.ChalkStartX = ws_.ChalkStartY = -1;
        RoomForAnotherStroke();  // tells the user
        return;
    }
    ws_.UndoEnabled = true;
    ++ws_.StrokeNumber;
    DrawChalkLine(true, false);
    ws_.ChalkEndX = static_cast<int16_t>(x);
    ws_.ChalkEndY = static_cast<int16_t>(y);
    DrawChalkLine(false, true);
    host_.RefreshPicture();
    ws_.ChalkStartX = ws_.ChalkStartY = -1;
    host_.ToolStateChanged();
}
