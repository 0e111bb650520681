// Whole-stroke undo and redo on the stroke plane: undone paint keeps its
// number negated, so redo needs no stored copies of the picture.
#include <cstdlib>

#include "imaging/HSLcolor.h"
#include "paint/PaintEngine.h"
#include "paint/Tools.h"

bool PaintEngine::RoomForAnotherStroke() {
    if (ws_.StrokeNumber < Workspace::kMaxStrokeNumber) return true;
    host_.Warning(kPaintingTitle, kTooManyStrokesText);
    return false;
}

// After an undo or redo the modal tools end and the picture counts as changed.
void PaintEngine::EndHistoryStep() {
    EndModalTools(ws_);
    UpdatePictureCursor(ws_);
    ws_.PictureModified = true;
    host_.ToolStateChanged();
}

void PaintEngine::UndoStroke() {
    if (ws_.StrokeNumber == 0) return;
    if (ws_.BlendEdges) RenderEdges(1);

    const int n = ws_.StrokeNumber;
    int16_t* stroke = ws_.PaintMask.data();
    for (int y = 0; y <= maxY(); ++y) {
        for (int x = 0; x <= maxX(); ++x) {
            int16_t& s = stroke[x + Workspace::kMaskWidth * y];
            if (s == n) {
                s = static_cast<int16_t>(-n);
                ws_.Picture1.setPixel(x, y, ws_.Picture2.pixel(x, y));
            } else if (s < 0 && s > -n) {
                // Left over from strokes undone and then painted over.
                s = 0;
            }
        }
    }
    host_.RefreshPicture();
    if (ws_.BlendEdges) RenderEdges(2);

    ws_.StrokeNumber = n - 1;
    if (ws_.StrokeNumber == 0) ws_.UndoEnabled = false;
    ws_.RedoEnabled = true;
    EndHistoryStep();
}

void PaintEngine::RedoStroke() {
    if (!RoomForAnotherStroke()) return;
    int last = ws_.CurrentColor;
    bool more = false;
    const int n = ++ws_.StrokeNumber;
    int16_t* stroke = ws_.PaintMask.data();
    const int16_t* color = stroke + Workspace::kMaskPlane;

    // Column by column: a box without a reference keeps the RefLum of the
    // box loaded before it, so the order of loading matters.
    for (int x = 0; x <= maxX(); ++x) {
        for (int y = 0; y <= maxY(); ++y) {
            const int at = x + Workspace::kMaskWidth * y;
            if (stroke[at] == -n) {
                stroke[at] = static_cast<int16_t>(n);
                const int k = std::abs(color[at]);
                if (k != last) {
                    last = k;
                    LoadDrawColor(ws_, k);
                }
                RecolorPixel(x, y);
            } else if (stroke[at] < -n) {
                more = true;
            }
        }
    }
    host_.RefreshPicture();

    if (last != ws_.CurrentColor && BoxReference(last) != 0) {
        // Back to the selected box; a missing reference reads as black.
        const HSLcolor::HSL paint = HSLcolor::RGBToHSL(HSLcolor::SplitColor(BoxColor(ws_.CurrentColor)));
        ws_.PaintHue = paint.hue;
        ws_.PaintSat = paint.sat;
        ws_.PaintLum = paint.lum;
        ws_.RefLum = HSLcolor::RGBToHSL(HSLcolor::SplitColor(BoxReference(ws_.CurrentColor))).lum;
    }
    RenderEdges(0);

    ws_.UndoEnabled = true;
    ws_.RedoEnabled = more;
    EndHistoryStep();
}

void PaintEngine::ClearAll() {
    if (ws_.StrokeNumber == 0) return;
    int16_t* stroke = ws_.PaintMask.data();
    for (int y = 0; y <= maxY(); ++y) {
        for (int x = 0; x <= maxX(); ++x) {
            int16_t& s = stroke[x + Workspace::kMaskWidth * y];
            if (s > 0) s = static_cast<int16_t>(-s);
        }
    }
    // The photo every other restore uses: the fitted, possibly cropped and
    // brightness-adjusted one, so the view and the later erases agree.
    ws_.Picture1 = ws_.Picture2;
    host_.RefreshPicture();
    ws_.StrokeNumber = 0;
    ws_.UndoEnabled = false;
    ws_.RedoEnabled = true;
    host_.ToolStateChanged();
}
