// The work picture's mouse handlers: they dispatch to the roller, the eraser,
// the chalk line, the reference step and the pickup click.
#include <algorithm>
#include <cmath>

#include "paint/PaintEngine.h"
#include "paint/Tools.h"

namespace {

// A mouse position taken to the nearest whole pixel, ties to even, kept in
// the 16-bit range the handlers store positions in.
int Whole(float v) {
    const double r = std::nearbyint(static_cast<double>(v));
    if (!(r >= -32768.0)) return -32768;
    if (r > 32767.0) return 32767;
    return static_cast<int>(r);
}

} // namespace

void PaintEngine::MouseDown(int button, float X, float Y) {
    if (ws_.LoadingPicture || !ws_.PictureLoaded) return;
    const int x = Whole(X);
    const int y = Whole(Y);
    if (!Inside(x, y)) return;
    strokeOpen_ = false;

    if (button == kRightButton) {
        if (ws_.SetReferenceMode || ws_.PickupLabelVisible) {
            EndModalTools(ws_);
            UpdatePictureCursor(ws_);
            host_.ToolStateChanged();
            return;
        }
        if (!RoomForAnotherStroke()) return;
        ws_.Cursor = PictureCursor::Eraser;
        host_.ToolStateChanged();
        if (ws_.BlendEdges) RenderEdges(1);
        EraseAt(x, y);
        return;
    }
    if (ws_.PickupLabelVisible) {
        PickupClick(x, y);
        return;
    }
    if (BoxColor(ws_.CurrentColor) == kButtonFace) {
        host_.Warning(kPaintingTitle, kNoPaintColorText);
        return;
    }
    // The reference is sampled on a cross of five pixels, so its centre
    // stays one pixel inside the picture.
    int rx = std::max(x, 1);
    if (rx == maxX()) rx = innerMaxX();
    int ry = std::max(y, 1);
    if (ry == maxY()) ry = innerMaxY();
    if (BoxReference(ws_.CurrentColor) == 0 || ws_.SetReferenceMode) {
        if (!ReferenceStep(rx, ry)) return;
    }
    if (button != kLeftButton) return;
    if (ws_.ChalkLineMode) {
        ws_.ChalkStartX = ws_.ChalkEndX = static_cast<int16_t>(x);
        ws_.ChalkStartY = ws_.ChalkEndY = static_cast<int16_t>(y);
        return;
    }
    BeginRollerStroke(x, y);
}

void PaintEngine::BeginRollerStroke(int x, int y) {
    if (!RoomForAnotherStroke()) return;
    if (ws_.BlendEdges) RenderEdges(2);
    ++ws_.StrokeNumber;
    for (int i = 0; i < Workspace::kPlaneCount; ++i)
        ws_.MatchColor[static_cast<size_t>(i)] = static_cast<float>(ws_.Plane(x, y, i));
    ws_.StrokeLeft = ws_.StrokeRight = static_cast<int16_t>(x);
    ws_.StrokeTop = ws_.StrokeBottom = static_cast<int16_t>(y);
    // The seed needs no colour test and leaves the match colour and stroke box alone.
    if (ws_.Stroke(x, y) < 1 || !ws_.ProtectPaint) {
        ws_.Stroke(x, y) = static_cast<int16_t>(ws_.StrokeNumber);
        ws_.ColorPlane(x, y) = ws_.CurrentColor;
        RecolorPixel(x, y);
    }
    RollerAt(x, y);
    ws_.RedoEnabled = false;
    strokeOpen_ = true;
    host_.ToolStateChanged();
}

void PaintEngine::MouseMove(int buttons, float X, float Y) {
    if (ws_.LoadingPicture || ws_.IgnoreUntilMouseUp) return;
    if (!ws_.PictureLoaded) {
        if (ws_.Cursor != PictureCursor::Default) {
            ws_.Cursor = PictureCursor::Default;
            host_.ToolStateChanged();
        }
        return;
    }
    const int x = Whole(X);
    const int y = Whole(Y);
    if (ws_.PickupLabelVisible) {
        // Live preview of what a click would take; outside, the label keeps its colour.
        if (Inside(x, y) && ws_.PickupLabelColor != ws_.Picture1.pixel(x, y)) {
            ws_.PickupLabelColor = ws_.Picture1.pixel(x, y);
            host_.ToolStateChanged();
        }
        return;
    }
    if (BoxReference(ws_.CurrentColor) == 0) return;
    if (buttons == kRightButton) {
        EraseAt(x, y);
    } else if (buttons == kLeftButton) {
        if (ws_.ChalkLineMode)
            FollowChalkLine(x, y);
        else
            RollerAt(x, y);
    }
}

void PaintEngine::MouseUp(int button, float X, float Y) {
    if (!ws_.PictureLoaded) return;
    if (ws_.IgnoreUntilMouseUp) {
        ws_.IgnoreUntilMouseUp = false;
        return;
    }
    if (button == kLeftButton) {
        const bool closing = strokeOpen_;
        strokeOpen_ = false;
        if (ws_.ChalkLineMode) {
            // Only a line that was begun is stored; a refused press leaves none.
            if (ws_.ChalkStartX >= 0 && ws_.ChalkStartY >= 0) CommitChalkLine(Whole(X), Whole(Y));
            return;
        }
        if (closing) {
            ws_.UndoEnabled = true;
            host_.ToolStateChanged();
            if (ws_.ExpandEdges) ExpandEdges();
        }
    }
    if (button == kRightButton) {
        UpdatePictureCursor(ws_);
        host_.ToolStateChanged();
    }
    if (ws_.BlendEdges) RenderEdges(2);
}
