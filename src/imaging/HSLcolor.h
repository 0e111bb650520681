#pragma once
#include <cstdint>

// Conversions between colour values (red + 256 x green + 65536 x blue) and
// hue / saturation / luminance on a 0..255 scale (255 hue units = one turn).
// Every painted pixel, every roller comparison and every stored reference
// depends on these exact numbers: each intermediate value is a float formed
// once from a double expression, in the order written below.
namespace HSLcolor {

struct RGB {
    int32_t red = 0;
    int32_t green = 0;
    int32_t blue = 0;
};

struct HSL {
    float hue = 0.0f;
    float sat = 0.0f;
    float lum = 0.0f;
};

// Splits a colour value into its three bytes (only the low 24 bits count).
RGB SplitColor(int32_t color);

// Joins red, green and blue into a colour value.
constexpr int32_t JoinColor(int32_t red, int32_t green, int32_t blue) {
    return red + 256 * green + 65536 * blue;
}
inline int32_t JoinColor(const RGB& c) { return JoinColor(c.red, c.green, c.blue); }

// Hue, saturation and luminance are floors of the 0..1 fractions x 255.
HSL RGBToHSL(int32_t red, int32_t green, int32_t blue);
inline HSL RGBToHSL(const RGB& c) { return RGBToHSL(c.red, c.green, c.blue); }

// The way back rounds each channel to the nearest whole number, ties to even.
RGB HSLToRGB(float hue, float sat, float lum);
inline RGB HSLToRGB(const HSL& c) { return HSLToRGB(c.hue, c.sat, c.lum); }

// Largest and smallest of three; equal values resolve as the colour model expects.
float Max3(float a, float b, float c);
float Min3(float a, float b, float c);

} // namespace HSLcolor
