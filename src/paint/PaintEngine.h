#pragma once
#include <array>
#include <cmath>
#include <cstdint>
#include <string>
#include <vector>

#include "paint/Workspace.h"

// What the painting engine needs from the window, and nothing more.
class PaintHost {
public:
    virtual ~PaintHost() = default;
    // Picture1 changed: show it once (never called per pixel).
    virtual void RefreshPicture() = 0;
    // Tool state in the workspace changed (Undo/Redo enabling, the pickup
    // label, the cursor, the colour boxes): bring the window up to date.
    virtual void ToolStateChanged() = 0;
    // A warning with an exclamation icon and an OK button.
    virtual void Warning(const std::string& title, const std::string& text) = 0;
    // Lets the user interface breathe between long steps.
    virtual void PumpEvents() = 0;
    // Selects box `index` as a press on it would (ends a running rename first).
    virtual void SelectColorBox(int index) = 0;
};

// Mouse buttons as the handlers receive them (a combination while moving).
inline constexpr int kLeftButton = 1;
inline constexpr int kRightButton = 2;
inline constexpr int kMiddleButton = 4;

// The program's words for the painting warnings.
inline constexpr const char* kPaintingTitle = "Warning - Painting Picture";
inline constexpr const char* kNoPaintColorText = "No Paint color has been set yet.";
inline constexpr const char* kSetReferenceTitle = "Warning - Set Reference";
inline constexpr const char* kNotRepaintedText = "This area is not re-painted.";
inline constexpr const char* kTooManyStrokesText =
    "No more strokes can be painted on this picture.\r\n"
    "Please use Undo or Clear All before painting again.";

// The painting engine: roller, recolour rendering, undo and redo, and the
// edge tools, all working on one workspace. Positions are work-picture pixels.
class PaintEngine {
public:
    PaintEngine(Workspace& ws, PaintHost& host) : ws_(ws), host_(host) {}

    // --- The work picture's mouse handlers (X, Y as floats in pixels) ---
    // A press outside the 400 x 300 picture does nothing; moves and releases
    // outside it are clipped wherever they would touch a pixel.
    void MouseDown(int button, float x, float y);
    void MouseMove(int buttons, float x, float y);
    void MouseUp(int button, float x, float y);

    // --- Roller ---
    // One application: rings 1..20 (wide) or 1..5 (narrow) around (x, y),
    // then one refresh.
    void RollerAt(int x, int y);
    // Tries to paint one pixel with CurrentColor; true when it was painted.
    bool PaintPixel(int x, int y);

    // --- Rendering ---
    // Draws (x, y) of Picture1 from the drawing colour and the photo's luma.
    void RecolorPixel(int x, int y);
    // Redraws every painted pixel of box |i| (nothing while it has no reference).
    void RepaintColor(int i);
    // Edge pass: 0 = as the Blend Edges option says, 1 = plain, 2 = blend.
    void RenderEdges(int mode);
    void RefreshAll();  // the refresh command: photo, every box, edge pass

    // --- Undo and redo ---
    void UndoStroke();
    void RedoStroke();
    void ClearAll();

    // --- Edge tools, reference and pickup ---
    void ExpandEdges();
    void EraseAt(int x, int y);
    void DrawChalkLine(bool erase, bool commit);

private:
    // Pulls MatchColor toward the planes of (x, y) by MatchWeight.
    void UpdateMatchColor(int x, int y);
    // Drawing colours of the blend pass: an unpainted pixel toward box i, and
    // the boundary between boxes |a| and |b| (both made positive).
    void BlendOutsidePixel(int x, int y, int i);
    void BlendBoundaryPixel(int& a, int& b);

    // Press steps that hand over to the other tools.
    bool ReferenceStep(int x, int y);   // false: the press ends here
    void PickupClick(int x, int y);
    void BeginRollerStroke(int x, int y);
    void CommitChalkLine(int x, int y);
    void FollowChalkLine(int x, int y);

    // False (after telling the user) when one more stroke number would not
    // fit the 16-bit stroke plane.
    bool RoomForAnotherStroke();
    void EndHistoryStep();
    bool Inside(int x, int y) const { return x >= 0 && y >= 0 && x <= maxX() && y <= maxY(); }
    int maxX() const { return ws_.WholeMaxX(); }
    int maxY() const { return ws_.WholeMaxY(); }
    // The last column and row inside the picture's one-pixel border.
    int innerMaxX() const { return static_cast<int>(std::lrint(ws_.MaxX - 1.0)); }
    int innerMaxY() const { return static_cast<int>(std::lrint(ws_.MaxY - 1.0)); }
    // Colours of box i; a box index outside 1..12 (a damaged mask) reads as empty.
    int32_t BoxColor(int i) const;
    int32_t BoxReference(int i) const;
    // Box |i| can be drawn: it has a colour and a reference.
    bool Drawable(int i) const;

    // The colour RecolorPixel draws for a luma, under the drawing colour.
    int32_t RecolorValue(int32_t lum);

    Workspace& ws_;
    PaintHost& host_;

    // A roller stroke was begun by the last press: its release closes it.
    bool strokeOpen_ = false;

    // RecolorPixel depends only on the luma and the four drawing-colour
    // values, so results are kept per luma until the drawing colour changes.
    struct RecolorCache {
        std::array<float, 4> key{-1.0f, -1.0f, -1.0f, -1.0f};
        uint32_t generation = 1;
        std::array<uint32_t, 256> stamp{};
        std::array<int32_t, 256> color{};
    };
    RecolorCache cache_;

    // Pixels that edge expansion adds, written only once the pass is over.
    std::vector<int32_t> grown_;
};
