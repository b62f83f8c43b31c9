#include "examples/make_documents/building.h"
#include "examples/make_documents/css_color_names.h"
#include "examples/make_documents/documents.h"

namespace examples {
namespace {

void add_srgb(vrl_v2::ColorType& color, const rgb& value) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceSRGB);
    space.get_ColorSpaceSpecificationSpectrumTristimulus()
        .setnil_ColorSpaceSpecificationSpectrumTristimulus();
    must(space.set_Red(value.r));
    must(space.set_Green(value.g));
    must(space.set_Blue(value.b));
    must(space.set_ColorDepth(L"ColorDepth_8"));
}

void add_named_color(vrl_v2::ColorSetType& set, const css_color& named) {
    vrl_v2::ColorType& color = add_color(set, named.name);
    const rgb value{(named.value >> 16) / 255.0, (named.value >> 8 & 0xFF) / 255.0,
                    (named.value & 0xFF) / 255.0};
    const lab visible = to_lab(to_xyz(value), k_white_d65);
    add_srgb(color, value);
    // The colors are a display's light. The type for materials ends at 1, and the Z of white is 1.089.
    add_xyz_of_light(color, to_xyz(value));
    add_lab(color, visible);
    add_lch(color, to_lch(visible));
}

void add_level(vrl_v2::PaletteType& palette, const std::wstring& name, const std::vector<css_color>& colors) {
    vrl_v2::ColorSetType& set = add_color_set(palette, name);
    for (const css_color& color : colors) add_named_color(set, color);
}

/// How all the values were obtained: from the sRGB ones, by formula.
void add_conditions(vrl_v2::PaletteType& palette) {
    auto& collection = palette.get_CollectionColorSpaceSpecification();
    auto& visible = collection.get_ColorSpaceSpecificationSpectrumTristimulus();
    computed(visible);
    must(visible.get_Spectrum().set_SpectrumType(L"Spectrum_Custom"));
    must(visible.get_Spectrum().set_CustomTypeName(L"computed from sRGB, IEC 61966-2-1"));
    seen_under(visible, L"Illuminant_D65");
    auto& light = collection.get_ColorSpaceSpecificationEmissiveTristimulus();
    computed(light);
    must(light.set_Comments(L"relative to the white of the display, whose Y is 1"));
    must(light.set_EmissiveType(L"Emissive_Spot"));
    must(light.set_EmissiveMode(L"EmissiveMode_NA"));
    seen_under(light, L"Illuminant_D65");
}

}  // namespace

vrl_v2::Vrl css_named_colors() {
    vrl_v2::Vrl document;
    describe(document, L"CSS named colors",
             L"The named colors of CSS, for design and for tests of color code")
        .set_Comments(
            L"Names and sRGB values: CSS Color Module Level 4, W3C. XYZ by IEC 61966-2-1, Lab and LCh "
            L"by CIE 15:2004, white point D65, observer of 2 degrees.");
    vrl_v2::PaletteType& palette = add_palette(document, L"CSS named colors");
    add_conditions(palette);
    add_level(palette, L"CSS 1, basic colors", k_css_level_1);
    add_level(palette, L"CSS 2.1", k_css_level_2);
    add_level(palette, L"CSS 3, from SVG 1.0", k_css_level_3);
    add_level(palette, L"CSS 4", k_css_level_4);
    return document;
}

}  // namespace examples
