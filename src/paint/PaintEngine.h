#pragma once
#include <string>

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

// The painting engine: roller, recolour rendering, undo and redo, and the
// edge tools, all working on one workspace. Positions are work-picture pixels.
class PaintEngine {
public:
    PaintEngine(Workspace& ws, PaintHost& host) : ws_(ws), host_(host) {}

    // --- The work picture's mouse handlers (X, Y as floats in pixels) ---
    void MouseDown(int button, float x, float y);
    void MouseMove(int buttons, float x, float y);
    void MouseUp(int button, float x, float y);

    // --- Roller ---
    void RollerAt(int x, int y);
    bool PaintPixel(int x, int y);
    void UpdateMatchColor(int x, int y);

    // --- Rendering ---
    void RecolorPixel(int x, int y);
    void RepaintColor(int i);
    void RenderEdges(int mode);
    void BlendOutsidePixel(int x, int y, int i);
    void BlendBoundaryPixel(int& a, int& b);
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
    Workspace& ws_;
    PaintHost& host_;
};
