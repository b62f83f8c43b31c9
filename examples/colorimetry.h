#pragma once

/// The little colorimetry that the examples need. The library itself stores values and computes none.
///
/// Tristimulus values are relative to a white of Y = 1. The observer is the CIE 1931 one (2 degrees).
namespace examples {

struct rgb {
    double r, g, b;
};  ///< sRGB as encoded: 0 to 1
struct xyz {
    double x, y, z;
};
struct lab {
    double l, a, b;
};
struct lch {
    double l, c, h;
};  ///< h in degrees: from 0, less than 360

/// The white of sRGB, x = 0.3127 and y = 0.3290 (IEC 61966-2-1, table 1).
inline constexpr xyz k_white_d65{0.3127 / 0.3290, 1.0, (1.0 - 0.3127 - 0.3290) / 0.3290};

/// IEC 61966-2-1, section 5.2. The matrix is the unrounded one, as in the sample code of CSS Color Module
/// Level 4, so that grays come out without any chroma.
xyz to_xyz(const rgb& color);
/// The inverse. What lies outside the gamut is clipped.
rgb to_srgb(const xyz& color);

/// CIE 15:2004, section 8.2.1.
lab to_lab(const xyz& color, const xyz& white);
xyz to_xyz(const lab& color, const xyz& white);
/// The polar form of the same. The hue of a neutral color is 0.
lch to_lch(const lab& color);
lab to_lab(const lch& color);

/// `value` with that many decimals, and never "-0": figures that are computed are published rounded, and so
/// come out alike on every machine.
double rounded(double value, int decimals);

}  // namespace examples
