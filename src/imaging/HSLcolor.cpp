#include "imaging/HSLcolor.h"

#include <cmath>

namespace HSLcolor {

RGB SplitColor(int32_t color) {
    const auto v = static_cast<uint32_t>(color);
    return RGB{static_cast<int32_t>(v & 0xFFu), static_cast<int32_t>((v >> 8) & 0xFFu),
               static_cast<int32_t>((v >> 16) & 0xFFu)};
}

float Max3(float a, float b, float c) {
    if (a <= b) return b >= c ? b : c;
    return a > c ? a : c;
}

float Min3(float a, float b, float c) {
    if (a >= b) return b <= c ? b : c;
    return a <= c ? a : c;
}

HSL RGBToHSL(int32_t red, int32_t green, int32_t blue) {
    const float r = static_cast<float>(red / 255.0);
    const float g = static_cast<float>(green / 255.0);
    const float b = static_cast<float>(blue / 255.0);
    const float max = Max3(r, g, b);
    const float min = Min3(r, g, b);
    const float l = static_cast<float>((static_cast<double>(max) + min) / 2.0);

    float s = 0.0f;
    float h = 0.0f;
    if (max != min) {
        const double spread = static_cast<double>(max) - min;
        if (l <= 0.5f)
            s = static_cast<float>(spread / (static_cast<double>(max) + min));
        else
            s = static_cast<float>(spread / (2.0 - max - min));
        const float d = static_cast<float>(spread);
        if (r == max)
            h = static_cast<float>((static_cast<double>(g) - b) / d);
        else if (g == max)
            h = static_cast<float>(2.0 + (static_cast<double>(b) - r) / d);
        else
            h = static_cast<float>(4.0 + (static_cast<double>(r) - g) / d);
    }

    // A negative hue gains 256 through the AND, so h just below 0 gives 255.
    const auto hue = static_cast<int32_t>(std::floor(h / 6.0 * 255.0)) & 255;
    HSL out;
    out.hue = static_cast<float>(hue);
    out.sat = static_cast<float>(std::floor(s * 255.0));
    out.lum = static_cast<float>(std::floor(l * 255.0));
    return out;
}

namespace {
int32_t ToByte(float fraction) {
    return static_cast<int32_t>(std::nearbyint(fraction * 255.0));
}
} // namespace

RGB HSLToRGB(float hue, float sat, float lum) {
    float h = static_cast<float>(hue / 255.0 * 6.0);
    const float s = static_cast<float>(sat / 255.0);
    const float l = static_cast<float>(lum / 255.0);
    if (h > 5.0f) h = static_cast<float>(h - 6.0);
    if (s == 0.0f) return RGB{ToByte(l), ToByte(l), ToByte(l)};

    float m1;
    if (l <= 0.5f)
        m1 = static_cast<float>((1.0 - s) * l);
    else
        m1 = static_cast<float>(l - (1.0 - l) * s);
    const float m2 = static_cast<float>(2.0 * l - m1);
    const double d = static_cast<double>(m2) - m1; // deliberately kept in double
    const double hd = h;

    float r, g, b;
    if (h < 0.0f) {
        r = m2; g = m1; b = static_cast<float>(m1 - d * hd);
    } else if (h < 1.0f) {
        r = m2; g = static_cast<float>(m1 + d * hd); b = m1;
    } else if (h < 2.0f) {
        r = static_cast<float>(m1 - d * (hd - 2.0)); g = m2; b = m1;
    } else if (h < 3.0f) {
        r = m1; g = m2; b = static_cast<float>(m1 + d * (hd - 2.0));
    } else if (h < 4.0f) {
        r = m1; g = static_cast<float>(m1 - d * (hd - 4.0)); b = m2;
    } else {
        r = static_cast<float>(m1 + d * (hd - 4.0)); g = m1; b = m2;
    }
    return RGB{ToByte(r), ToByte(g), ToByte(b)};
}

} // namespace HSLcolor
