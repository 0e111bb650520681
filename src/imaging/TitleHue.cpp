#include "imaging/TitleHue.h"

#include <cmath>

#include "imaging/HSLcolor.h"

namespace TitleHue {

int32_t TurnHue(int32_t color, int turn) {
    HSLcolor::HSL hsl = HSLcolor::RGBToHSL(HSLcolor::SplitColor(color));
    // The hue is already whole; the sum is rounded as the modulo would.
    const auto turned = static_cast<int32_t>(std::lrint(static_cast<double>(hsl.hue) + turn));
    hsl.hue = static_cast<float>(((turned % kFullTurn) + kFullTurn) % kFullTurn);
    return HSLcolor::JoinColor(HSLcolor::HSLToRGB(hsl));
}

void TurnHues(const int32_t* original, int32_t* out, size_t count, int turn) {
    for (size_t i = 0; i < count; ++i) out[i] = TurnHue(original[i], turn);
}

} // namespace TitleHue
