// The whole-picture edge pass: blends the borders between colours and between
// paint and photo (mode 2), or draws them plain again (mode 1). A border pixel
// that touches a box without a colour or a reference is put back to the
// photo, as the box's own pixels show it.
#include <cmath>
#include <cstdlib>

#include "paint/PaintEngine.h"

namespace {

// Outside colour of an unpainted pixel: the first neighbour (left, right, up,
// down) with a colour box above 0 decides; it counts only while painted.
int OutsideBox(const int16_t* stroke, const int16_t* color, int at) {
    for (const int n : {at - 1, at + 1, at - Workspace::kMaskWidth, at + Workspace::kMaskWidth}) {
        if (color[n] > 0) return stroke[n] < 1 ? 0 : color[n];
    }
    return 0;
}

// Other colour next to a painted pixel: the first neighbour whose colour plane
// differs from its own (an unpainted neighbour gives 0).
int BoundaryBox(const int16_t* color, int at) {
    const int16_t own = color[at];
    for (const int n : {at - 1, at + 1, at - Workspace::kMaskWidth, at + Workspace::kMaskWidth}) {
        if (color[n] != own) return std::abs(color[n]);
    }
    return 0;
}

} // namespace

void PaintEngine::RenderEdges(int mode) {
    if (mode == 0) mode = ws_.BlendEdges ? 2 : 1;
    const int lastX = innerMaxX();
    const int lastY = innerMaxY();
    const int16_t* stroke = ws_.PaintMask.data();
    const int16_t* color = stroke + Workspace::kMaskPlane;
    int loaded = -1;  // box last loaded by a plain redraw; loading it again changes nothing

    for (int x = 1; x <= lastX; ++x) {
        for (int y = 1; y <= lastY; ++y) {
            const int at = x + Workspace::kMaskWidth * y;
            if (stroke[at] < 1) {
                const int k = OutsideBox(stroke, color, at);
                if (k == 0) continue;
                if (mode == 1 || (mode == 2 && !Drawable(k))) {
                    ws_.Picture1.setPixel(x, y, ws_.Picture2.pixel(x, y));
                } else if (mode == 2) {
                    BlendOutsidePixel(x, y, k);
                    RecolorPixel(x, y);
                    loaded = -1;
                }
            } else {
                int k = BoundaryBox(color, at);
                if (k == 0) continue;
                int own = color[at];
                // A box that cannot be drawn shows the photo; blending with
                // it would mix in the button face and a black reference.
                if (mode == 2 && Drawable(own) && Drawable(k)) {
                    BlendBoundaryPixel(own, k);
                    RecolorPixel(x, y);
                    loaded = -1;
                } else if (mode == 1 && Drawable(own)) {
                    own = std::abs(own);
                    if (own != loaded) {
                        LoadDrawColor(ws_, own);
                        loaded = own;
                    }
                    RecolorPixel(x, y);
                } else if (mode == 1 || mode == 2) {
                    ws_.Picture1.setPixel(x, y, ws_.Picture2.pixel(x, y));
                }
            }
        }
    }
    host_.RefreshPicture();
    LoadDrawColor(ws_, ws_.CurrentColor);
}
