#include <cmath>
#include <string>

#include "examples/make_documents/building.h"
#include "examples/make_documents/cie_tables.h"
#include "examples/make_documents/documents.h"
#include "examples/make_documents/spectra.h"

namespace examples {
namespace {

using tristimulus_conditions = vrl_v2::ColorSpaceSpecificationEmissiveTristimulus;

void add_spectrum(vrl_v2::ColorType& color, const spectrum& light) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceEmissiveSpectral);
    space.get_ColorSpaceSpecificationEmissiveSpectral().setnil_ColorSpaceSpecificationEmissiveSpectral();
    for (std::size_t i = 0; i < light.values.size(); ++i) {
        must(space.append_EmissiveSpectralPoint());
        vrl_v2::EmissiveSpectralPointType& point = space.back_EmissiveSpectralPoint();
        must(point.set_Wavelength(light.wavelength(i)));
        must(point.set_EmissiveSpectralPointType(rounded(light.values[i], 4)));
    }
}

void add_chromaticity(vrl_v2::ColorType& color, const xyz& light) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceEmissiveCIExyY);
    space.get_ColorSpaceSpecificationEmissiveTristimulus()
        .setnil_ColorSpaceSpecificationEmissiveTristimulus();
    const double sum = light.x + light.y + light.z;
    must(space.set_X(rounded(light.x / sum, 5)));
    must(space.set_Y(rounded(light.y / sum, 5)));
    must(space.set_CapY(rounded(light.y, 4)));
}

/// A source with its spectrum and what follows from it. The caller says in the result what light it is.
tristimulus_conditions& add_source(vrl_v2::ColorSetType& set, const std::wstring& name,
                                   const spectrum& light) {
    vrl_v2::ColorType& color = add_color(set, name);
    add_spectrum(color, light);
    const xyz tristimulus = light_tristimulus(light);
    auto& space = add_xyz_of_light(color, tristimulus);
    add_chromaticity(color, tristimulus);
    // A mutable reference to the specification makes it present; as it is nil still, a new one replaces it.
    tristimulus_conditions conditions;
    computed(conditions);
    must(conditions.set_EmissiveType(L"Emissive_Spot"));
    must(conditions.set_EmissiveMode(L"EmissiveMode_NA"));
    must(conditions.set_FieldOfView(L"FieldOfView_2_Degree"));
    return space.assign_ColorSpaceSpecificationEmissiveTristimulus(conditions);
}

void add_temperature_source(vrl_v2::ColorSetType& set, const std::wstring& name, double kelvin,
                            const spectrum& light) {
    must(add_source(set, name, light)
             .get_IlluminationOptions()
             .set_ColorTemperature(static_cast<unsigned>(std::lround(kelvin))));
}

void add_illuminant(vrl_v2::ColorSetType& set, const std::wstring& name, const spectrum& light) {
    must(add_source(set, L"Illuminant " + name, light)
             .get_IlluminationOptions()
             .get_Illuminant()
             .set_Illuminant(L"Illuminant_" + name));
}

void add_blackbodies(vrl_v2::PaletteType& palette) {
    vrl_v2::ColorSetType& set = add_color_set(palette, L"Blackbodies");
    for (const int kelvin : {2000, 2856, 3000, 4000, 5000, 6500, 10000}) {
        add_temperature_source(set, std::to_wstring(kelvin) + L" K", kelvin, blackbody(kelvin));
    }
}

void add_daylight_series(vrl_v2::PaletteType& palette) {
    vrl_v2::ColorSetType& set = add_color_set(palette, L"Daylight");
    for (const int nominal : {5000, 5500, 6000, 6500, 7000, 7500}) {
        const double kelvin = daylight_kelvin(nominal);
        add_temperature_source(set, L"D" + std::to_wstring(nominal / 100), kelvin, daylight(kelvin));
    }
}

void add_standard_illuminants(vrl_v2::PaletteType& palette) {
    vrl_v2::ColorSetType& set = add_color_set(palette, L"Standard illuminants");
    add_illuminant(set, L"A", illuminant_a());
    add_illuminant(set, L"C", {k_first, 2 * k_step, k_illuminant_c});
    add_illuminant(set, L"D50", daylight(daylight_kelvin(5000)));
    add_illuminant(set, L"D65", daylight(daylight_kelvin(6500)));
    add_illuminant(set, L"E", equal_energy());
    add_illuminant(set, L"F2", {k_first, k_step, k_fluorescent_2});
    add_illuminant(set, L"F7", {k_first, k_step, k_fluorescent_7});
    add_illuminant(set, L"F11", {k_first, k_step, k_fluorescent_11});
}

}  // namespace

vrl_v2::Vrl light_sources() {
    vrl_v2::Vrl document;
    describe(document, L"Light sources",
             L"Spectra and chromaticities of the light under which colors are judged")
        .set_Comments(
            L"Blackbodies by Planck's law; daylight, illuminants and observer by CIE 15:2004. "
            L"Wavelengths in nanometers, XYZ scaled to Y = 100, observer of 2 degrees.");
    vrl_v2::PaletteType& palette = add_palette(document, L"Light sources");
    add_blackbodies(palette);
    add_daylight_series(palette);
    add_standard_illuminants(palette);
    return document;
}

}  // namespace examples
