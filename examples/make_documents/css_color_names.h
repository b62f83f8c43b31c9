#pragma once

#include <vector>

namespace examples {

/// A named color of CSS and its value in sRGB, as 0xRRGGBB.
struct css_color {
    const wchar_t* name;
    unsigned value;
};

/// CSS Color Module Level 4 (W3C), section 6.1 "Named Colors": 148 names, here by the level of CSS in which
/// each one came. The two spellings of gray are two names.
extern const std::vector<css_color> k_css_level_1;  ///< 16: the basic colors, of HTML 4
extern const std::vector<css_color> k_css_level_2;  ///< 1: orange (CSS 2 revision 1)
extern const std::vector<css_color> k_css_level_3;  ///< 130: those of SVG 1.0
extern const std::vector<css_color> k_css_level_4;  ///< 1: rebeccapurple

}  // namespace examples
