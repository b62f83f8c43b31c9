#include "examples/colorimetry.h"

#include <algorithm>
#include <cmath>

namespace examples {
namespace {

const double k_pi = std::acos(-1.0);

double linear_light(double encoded) {
    return encoded <= 0.04045 ? encoded / 12.92 : std::pow((encoded + 0.055) / 1.055, 2.4);
}

double encoded_light(double linear) {
    const double light = std::clamp(linear, 0.0, 1.0);
    return light <= 0.0031308 ? 12.92 * light : 1.055 * std::pow(light, 1 / 2.4) - 0.055;
}

// The cube root, with a straight line near black: CIE 15:2004, section 8.2.1.
constexpr double k_delta = 6.0 / 29.0;

double lightness_root(double t) {
    return t > k_delta * k_delta * k_delta ? std::cbrt(t) : t / (3 * k_delta * k_delta) + 4.0 / 29.0;
}

double inverse_lightness_root(double f) {
    return f > k_delta ? f * f * f : 3 * k_delta * k_delta * (f - 4.0 / 29.0);
}

}  // namespace

xyz to_xyz(const rgb& color) {
    const double r = linear_light(color.r);
    const double g = linear_light(color.g);
    const double b = linear_light(color.b);
    return {506752.0 / 1228815.0 * r + 87881.0 / 245763.0 * g + 12673.0 / 70218.0 * b,
            87098.0 / 409605.0 * r + 175762.0 / 245763.0 * g + 12673.0 / 175545.0 * b,
            7918.0 / 409605.0 * r + 87881.0 / 737289.0 * g + 1001167.0 / 1053270.0 * b};
}

rgb to_srgb(const xyz& color) {
    const double r = 12831.0 / 3959.0 * color.x - 329.0 / 214.0 * color.y - 1974.0 / 3959.0 * color.z;
    const double g =
        -851781.0 / 878810.0 * color.x + 1648619.0 / 878810.0 * color.y + 36519.0 / 878810.0 * color.z;
    const double b = 705.0 / 12673.0 * color.x - 2585.0 / 12673.0 * color.y + 705.0 / 667.0 * color.z;
    return {encoded_light(r), encoded_light(g), encoded_light(b)};
}

lab to_lab(const xyz& color, const xyz& white) {
    const double fx = lightness_root(color.x / white.x);
    const double fy = lightness_root(color.y / white.y);
    const double fz = lightness_root(color.z / white.z);
    return {116 * fy - 16, 500 * (fx - fy), 200 * (fy - fz)};
}

xyz to_xyz(const lab& color, const xyz& white) {
    const double fy = (color.l + 16) / 116;
    return {white.x * inverse_lightness_root(fy + color.a / 500), white.y * inverse_lightness_root(fy),
            white.z * inverse_lightness_root(fy - color.b / 200)};
}

lch to_lch(const lab& color) {
    constexpr double neutral = 1e-9;  // what rounding leaves of a chroma of 0
    const double chroma = std::hypot(color.a, color.b);
    if (chroma < neutral) return {color.l, 0, 0};
    const double degrees = std::atan2(color.b, color.a) * 180 / k_pi;
    return {color.l, chroma, degrees < 0 ? degrees + 360 : degrees};
}

lab to_lab(const lch& color) {
    const double angle = color.h * k_pi / 180;
    return {color.l, color.c * std::cos(angle), color.c * std::sin(angle)};
}

double rounded(double value, int decimals) {
    const double scale = std::pow(10.0, decimals);
    return std::round(value * scale) / scale + 0.0;  // -0 + 0 is 0
}

}  // namespace examples
