#include "examples/swatch.h"

#include <cmath>
#include <optional>

#include "examples/colorimetry.h"

namespace examples {
namespace {

/// Emitted light as bright as the display goes, so that lamps and displays both show their hue.
rgb shown_light(const xyz& light) {
    if (!(light.y > 0)) return {0, 0, 0};
    const double brightest = 0.8;
    return to_srgb({brightest * light.x / light.y, brightest, brightest * light.z / light.y});
}

/// The value as sRGB. One that is relative to a white of its own is shown relative to the display's white.
std::optional<rgb> shown(const vrl_v2::sg_ColorSpace& space) {
    using group = vrl_v2::sg_ColorSpace;
    switch (space.getchosen()) {
        case group::chosen_ColorSpaceSRGB: {
            const auto& v = space.get_ColorSpaceSRGB();
            return rgb{v.get_Red(), v.get_Green(), v.get_Blue()};
        }
        case group::chosen_ColorSpaceCIELab: {
            const auto& v = space.get_ColorSpaceCIELab();
            return to_srgb(to_xyz(lab{v.get_L(), v.get_A(), v.get_B()}, k_white_d65));
        }
        case group::chosen_ColorSpaceCIELCh: {
            const auto& v = space.get_ColorSpaceCIELCh();
            return to_srgb(to_xyz(to_lab(lch{v.get_L(), v.get_C(), v.get_H()}), k_white_d65));
        }
        case group::chosen_ColorSpaceEmissiveCIEXYZ: {
            const auto& v = space.get_ColorSpaceEmissiveCIEXYZ();
            return shown_light({v.get_X(), v.get_Y(), v.get_Z()});
        }
        default:
            return std::nullopt;
    }
}

std::string cells(const rgb& color) {
    std::string text = "\x1b[48;2";
    for (const double component : {color.r, color.g, color.b}) {
        text += ';' + std::to_string(std::lround(component * 255));
    }
    return text + "m  \x1b[0m";
}

}  // namespace

std::string swatch(const vrl_v2::ColorType& color) {
    for (unsigned i = 0; i < color.size_ColorSpace(); ++i) {
        if (const std::optional<rgb> found = shown(color.get_ColorSpace(i))) return cells(*found);
    }
    return "  ";
}

}  // namespace examples
