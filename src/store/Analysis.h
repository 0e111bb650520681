#pragma once
#include <cstdint>
#include <functional>

#include "paint/Workspace.h"

namespace store {

// What the analysis adds up besides the planes: pixel visits and the
// rounded averages of the raw photo's red, green and blue.
struct PhotoAverages {
    int32_t pixelCount = 0;
    int32_t red = 0;
    int32_t green = 0;
    int32_t blue = 0;
};

// Builds PixelPlanes and PixelLuma from ws.Picture2 and clears both mask
// planes: the smoothing passes (interior, then top row, then left column),
// the averages, and the contrast step of planes 0..2 around the averages.
// Leaves RefLum at the floor of the average luma, StrokeNumber at 0 and Undo
// and Redo disabled. Row 0 and column 0 start from 0 for every photo, so one
// photo always gives the same planes.
//
// `yieldAndContinue` runs before each column of the interior pass and of the
// contrast step; when it returns false the analysis stops at once and
// returns false, leaving a partly built analysis.
bool AnalysePhoto(Workspace& ws, const std::function<bool()>& yieldAndContinue,
                  PhotoAverages* averages = nullptr);

// The hue wave of plane 4 for a hue and luminance on the 0..255 scales.
int32_t HueWave(float hue, float lum);

} // namespace store
