#pragma once
#include <array>
#include <cmath>
#include <cstdint>
#include <vector>

#include "paint/ColorBox.h"
#include "paint/Picture.h"

// The three paint kinds of the roller: how far the match colour may drift and
// how wide the tolerance windows are.
enum class PaintKind { Dry, Normal, Wet };

// What the work picture's mouse pointer shows. The window maps each to a shape.
enum class PictureCursor { Default, NoDrop, WideRoller, NarrowRoller, ChalkLine, SetReference, Pickup, Eraser };

// The one workspace of the program: the work picture and the photo, the
// analysis planes, the paint mask, the drawing colour, the stroke counter and
// the tool and option state. The engine changes it; the window shows it.
struct Workspace {
    static constexpr int kWidth = 400;          // work picture
    static constexpr int kHeight = 300;
    static constexpr int kMaskWidth = 401;      // PaintMask bounds 0..400, 0..300, 0..1
    static constexpr int kMaskHeight = 301;
    static constexpr int kMaskPlane = kMaskWidth * kMaskHeight;
    static constexpr int kPlaneWidth = 641;     // PixelPlanes bounds 0..640, 0..480, 0..5
    static constexpr int kPlaneHeight = 481;
    static constexpr int kPlaneSize = kPlaneWidth * kPlaneHeight;
    static constexpr int kPlaneCount = 6;
    static constexpr int32_t kMaxStrokeNumber = 32767; // the stroke plane is 16 bits

    Workspace();

    // --- Pictures ---
    Picture Picture1{kWidth, kHeight};  // the work picture the user sees and paints
    Picture Picture2{kWidth, kHeight};  // the untouched fitted photo
    Picture Image1{kWidth, kHeight};    // the fitted photo as first drawn (clear all redraws it)

    float MaxX = 399.0f;
    float MaxY = 299.0f;
    int WholeMaxX() const { return static_cast<int>(std::lrint(MaxX)); }
    int WholeMaxY() const { return static_cast<int>(std::lrint(MaxY)); }

    // --- Paint mask: plane 0 strokes, plane 1 colour boxes; x fastest, plane 0 first ---
    std::vector<int16_t> PaintMask;
    int16_t& Stroke(int x, int y) { return PaintMask[static_cast<size_t>(x + kMaskWidth * y)]; }
    int16_t Stroke(int x, int y) const { return PaintMask[static_cast<size_t>(x + kMaskWidth * y)]; }
    int16_t& ColorPlane(int x, int y) { return PaintMask[static_cast<size_t>(x + kMaskWidth * y + kMaskPlane)]; }
    int16_t ColorPlane(int x, int y) const { return PaintMask[static_cast<size_t>(x + kMaskWidth * y + kMaskPlane)]; }
    void ClearMask();

    // --- Photo analysis ---
    std::vector<int32_t> PixelPlanes;   // 641 x 481 x 6
    std::vector<int32_t> PixelLuma;     // 641 x 481
    int32_t& Plane(int x, int y, int p) { return PixelPlanes[static_cast<size_t>(x + kPlaneWidth * y + kPlaneSize * p)]; }
    int32_t Plane(int x, int y, int p) const { return PixelPlanes[static_cast<size_t>(x + kPlaneWidth * y + kPlaneSize * p)]; }
    int32_t& Luma(int x, int y) { return PixelLuma[static_cast<size_t>(x + kPlaneWidth * y)]; }
    int32_t Luma(int x, int y) const { return PixelLuma[static_cast<size_t>(x + kPlaneWidth * y)]; }

    // --- Roller matching ---
    std::array<int32_t, 6> PlaneTolerance{18, 18, 18, 12, 12, 12};
    std::array<float, 6> MatchColor{};
    int32_t MatchWeight = 50;
    PaintKind Kind = PaintKind::Normal;

    // --- Drawing colour ---
    float PaintHue = 0.0f;
    float PaintSat = 0.0f;
    float PaintLum = 0.0f;
    float RefLum = 0.0f;

    // --- Colour boxes (1..12) ---
    ColorBoxes Boxes;

    // --- Stroke counter and stroke box ---
    int32_t StrokeNumber = 0;
    int16_t StrokeLeft = 0;
    int16_t StrokeTop = 0;
    int16_t StrokeRight = 0;
    int16_t StrokeBottom = 0;

    // --- Tool and mode state ---
    bool PictureLoaded = false;
    bool LoadingPicture = false;
    int16_t CurrentColor = 1;
    int16_t PickupIndex = 0;
    bool SetReferenceMode = false;
    bool ChalkLineMode = false;
    bool WideRoller = true;
    bool IgnoreUntilMouseUp = false;
    int16_t ChalkStartX = -1;
    int16_t ChalkStartY = -1;
    int16_t ChalkEndX = 0;
    int16_t ChalkEndY = 0;
    bool PictureModified = false;

    // The pickup tool is on while its label is shown over box PickupIndex;
    // the label's colour previews what a click would take.
    bool PickupLabelVisible = false;
    int32_t PickupLabelColor = kButtonFace;

    // Enabled state of the Undo and Redo toolbar buttons (the Edit menu follows them).
    bool UndoEnabled = false;
    bool RedoEnabled = false;

    PictureCursor Cursor = PictureCursor::Default;

    // --- Options: mirrors of the window's check boxes, read when painting ---
    bool BlendEdges = true;
    bool ExpandEdges = true;
    bool ProtectPaint = true;
    bool AutoCrop = false;
    bool LoadWithPicture = true;
};

// Makes box i the drawing colour: hue, saturation and luminance of its paint
// colour, and RefLum from its reference when it has one (else RefLum stays).
void LoadDrawColor(Workspace& ws, int i);

// Tolerances of the six planes: nearest(1.5 n) for the colour planes 0..2,
// n for luminance, hue wave and saturation.
void SetTolerance(Workspace& ws, int n);
