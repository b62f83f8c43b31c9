#include "examples/color_space_text.h"

#include <runtime/values.h>

#include <cstdio>
#include <initializer_list>

namespace examples {
namespace {

using group = vrl_v2::sg_ColorSpace;

std::string values(const char* space, std::initializer_list<double> numbers) {
    std::string text = space;
    for (const double number : numbers) text += ' ' + number_text(number);
    return text;
}

template <class Rgb>
std::string rgb_text(const char* space, const Rgb& v) {
    return values(space, {v.get_Red(), v.get_Green(), v.get_Blue()});
}

std::string points_text(const char* what, unsigned points, double first, double last) {
    return std::string(what) + ' ' + std::to_string(points) + " points, " + number_text(first) + " to " +
           number_text(last) + " nm";
}

std::string spectrum_text(const vrl_v2::ColorSpaceSpectralType& v) {
    const unsigned n = v.size_ReflectancePoint();
    if (n == 0) return "reflectance";
    return points_text("reflectance", n, v.get_ReflectancePoint(0).get_Wavelength(),
                       v.get_ReflectancePoint(n - 1).get_Wavelength());
}

std::string spectrum_text(const vrl_v2::ColorSpaceEmissiveSpectralType& v) {
    const unsigned n = v.size_EmissiveSpectralPoint();
    if (n == 0) return "emission";
    return points_text("emission", n, v.get_EmissiveSpectralPoint(0).get_Wavelength(),
                       v.get_EmissiveSpectralPoint(n - 1).get_Wavelength());
}

std::string density_text(const vrl_v2::ColorSpaceDensityType& v) {
    std::string text = "density";
    for (unsigned i = 0; i < v.size_Density(); ++i) {
        text += ' ' + narrow(v.get_Density(i).get_DensityFilter()) + ' ' +
                number_text(v.get_Density(i).get_DensityType());
    }
    return text;
}

std::string recipe_text(const vrl_v2::ColorSpaceRecipeType& v) {
    std::string text = "recipe";
    for (unsigned i = 0; i < v.size_ColorantElement(); ++i) {
        const vrl_v2::ColorantElementType& part = v.get_ColorantElement(i);
        text += " " + number_text(100 * part.get_Contribution()) + " % " +
                narrow(part.get_Colorant().get_Name()) + ',';
    }
    if (!v.isset_BaseElement()) return text.substr(0, text.size() - 1);
    return text + " in " + narrow(v.get_BaseElement().get_Base().get_Name());
}

template <class Generic>
std::string axes_text(const Generic& v) {
    std::string text = narrow(v.get_Name());
    for (unsigned i = 0; i < v.size_Axis(); ++i) {
        const vrl_v2::AxisValueChoice& value = v.get_Axis(i).get_AxisValueChoice();
        text += ' ' + narrow(v.get_Axis(i).get_AxisName()) + ' ';
        text += value.getchosen() == vrl_v2::AxisValueChoice::chosen_AxisStringValue
                    ? narrow(value.get_AxisStringValue())
                    : number_text(value.get_AxisFloatingPointValue().get_FloatingPointValueType());
    }
    return text;
}

std::string cmyk_text(const vrl_v2::ColorSpaceCMYKType& v) {
    return values("CMYK", {v.get_Cyan(), v.get_Magenta(), v.get_Yellow(), v.get_Black()});
}

std::string six_inks_text(const vrl_v2::ColorSpaceTINTARAQuadraviveType& v) {
    return values("Quadravive", {v.get_Cyan(), v.get_Magenta(), v.get_Yellow(), v.get_Black(), v.get_Orange(),
                                 v.get_Green()});
}

/// Spaces of devices and of printing.
std::string device_space_text(const group& space) {
    switch (space.getchosen()) {
        case group::chosen_ColorSpaceRGB:
            return rgb_text("RGB", space.get_ColorSpaceRGB());
        case group::chosen_ColorSpaceSRGB:
            return rgb_text("sRGB", space.get_ColorSpaceSRGB());
        case group::chosen_ColorSpaceAdobeRGB:
            return rgb_text("Adobe RGB", space.get_ColorSpaceAdobeRGB());
        case group::chosen_ColorSpaceAdobeWideGamutRGB:
            return rgb_text("wide gamut RGB", space.get_ColorSpaceAdobeWideGamutRGB());
        case group::chosen_ColorSpaceHSL: {
            const auto& v = space.get_ColorSpaceHSL();
            return values("HSL", {v.get_Hue(), v.get_Saturation(), v.get_Lightness()});
        }
        case group::chosen_ColorSpaceHSV: {
            const auto& v = space.get_ColorSpaceHSV();
            return values("HSV", {v.get_Hue(), v.get_Saturation(), v.get_Value()});
        }
        case group::chosen_ColorSpaceYUV: {
            const auto& v = space.get_ColorSpaceYUV();
            return values("YUV", {v.get_Y(), v.get_U(), v.get_V()});
        }
        case group::chosen_ColorSpaceYIQ: {
            const auto& v = space.get_ColorSpaceYIQ();
            return values("YIQ", {v.get_Y(), v.get_I(), v.get_Q()});
        }
        case group::chosen_ColorSpaceYBR: {
            const auto& v = space.get_ColorSpaceYBR();
            return values("YBR", {v.get_Y(), v.get_B(), v.get_R()});
        }
        case group::chosen_ColorSpaceCMYK:
            return cmyk_text(space.get_ColorSpaceCMYK());
        case group::chosen_ColorSpaceTINTARAQuadravive:
            return six_inks_text(space.get_ColorSpaceTINTARAQuadravive());
        case group::chosen_ColorSpaceDensity:
            return density_text(space.get_ColorSpaceDensity());
        default:
            return "(no value)";
    }
}

/// Spaces that are measured, and those derived from them.
std::string colorimetric_space_text(const group& space) {
    switch (space.getchosen()) {
        case group::chosen_ColorSpaceSpectral:
            return spectrum_text(space.get_ColorSpaceSpectral());
        case group::chosen_ColorSpaceEmissiveSpectral:
            return spectrum_text(space.get_ColorSpaceEmissiveSpectral());
        case group::chosen_ColorSpaceCIEXYZ: {
            const auto& v = space.get_ColorSpaceCIEXYZ();
            return values("XYZ", {v.get_X(), v.get_Y(), v.get_Z()});
        }
        case group::chosen_ColorSpaceEmissiveCIEXYZ: {
            const auto& v = space.get_ColorSpaceEmissiveCIEXYZ();
            return values("XYZ of light", {v.get_X(), v.get_Y(), v.get_Z()});
        }
        case group::chosen_ColorSpaceCIExyY: {
            const auto& v = space.get_ColorSpaceCIExyY();
            return values("xyY", {v.get_X(), v.get_Y(), v.get_CapY()});
        }
        case group::chosen_ColorSpaceEmissiveCIExyY: {
            const auto& v = space.get_ColorSpaceEmissiveCIExyY();
            return values("xyY of light", {v.get_X(), v.get_Y(), v.get_CapY()});
        }
        case group::chosen_ColorSpaceCIELab: {
            const auto& v = space.get_ColorSpaceCIELab();
            return values("Lab", {v.get_L(), v.get_A(), v.get_B()});
        }
        case group::chosen_ColorSpaceCIELCh: {
            const auto& v = space.get_ColorSpaceCIELCh();
            return values("LCh", {v.get_L(), v.get_C(), v.get_H()});
        }
        case group::chosen_ColorSpaceCIELuv: {
            const auto& v = space.get_ColorSpaceCIELuv();
            return values("Luv", {v.get_L(), v.get_U(), v.get_V()});
        }
        default:
            return device_space_text(space);
    }
}

}  // namespace

std::string color_space_text(const vrl_v2::sg_ColorSpace& space) {
    switch (space.getchosen()) {
        case group::chosen_ColorSpaceRecipe:
            return recipe_text(space.get_ColorSpaceRecipe());
        case group::chosen_ColorSpaceTINTARA:
            return "TINTARA " + narrow(space.get_ColorSpaceTINTARA().get_ColorName().get_BaseName());
        case group::chosen_ColorSpaceNCS:
            return "NCS " + narrow(space.get_ColorSpaceNCS().get_ColorName());
        case group::chosen_ColorSpaceMunsell:
            return "Munsell " + narrow(space.get_ColorSpaceMunsell().get_ColorName());
        case group::chosen_ColorSpaceGeneric:
            return axes_text(space.get_ColorSpaceGeneric());
        case group::chosen_ColorSpaceEmissiveGeneric:
            return axes_text(space.get_ColorSpaceEmissiveGeneric());
        default:
            return colorimetric_space_text(space);
    }
}

std::string number_text(double value) {
    char text[32];
    std::snprintf(text, sizeof text, "%.5g", value);
    return text;
}

std::string narrow(const std::wstring& text) {
    std::string utf8;
    return qbxV2::convert(&utf8, text);
}

}  // namespace examples
