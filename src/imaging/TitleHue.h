#pragma once
#include <cstddef>
#include <cstdint>

// The title screen's colour cycle: every redraw turns each background pixel's
// hue a little further round the wheel, keeping saturation and luminance.
//
// The turn is always applied to the background as first drawn, never to the
// previous redraw: RGBToHSL floors the hue, so turning the turned pixels again
// and again would lose up to a step per redraw and the cycle would never come
// round. Worked from the original, 128 redraws give back the exact picture.
namespace TitleHue {

// Hue steps per redraw; 128 redraws make one full turn of 256 steps.
inline constexpr int kStep = 2;
inline constexpr int kFullTurn = 256;

// One pixel: hue H of RGBToHSL becomes (H + turn) modulo 256, then back
// through HSLToRGB with the same saturation and luminance. Only the low
// 24 bits of the colour count.
int32_t TurnHue(int32_t color, int turn);

// out[i] = TurnHue(original[i], turn) for every pixel.
void TurnHues(const int32_t* original, int32_t* out, size_t count, int turn);

// The turn of the next redraw: kStep further, modulo 256.
constexpr int NextTurn(int turn) { return (turn + kStep) % kFullTurn; }

} // namespace TitleHue
