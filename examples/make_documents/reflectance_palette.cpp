#include "examples/make_documents/building.h"
#include "examples/make_documents/documents.h"
#include "examples/make_documents/spectra.h"
#include "examples/make_documents/test_color_samples.h"

namespace examples {
namespace {

constexpr double k_palette_first = 400;
constexpr double k_palette_step = 10;
constexpr std::size_t k_palette_points = 31;

void add_reflectance(vrl_v2::ColorType& color, const spectrum& reflectance) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceSpectral);
    space.get_ColorSpaceSpecificationSpectrumSpectral().setnil_ColorSpaceSpecificationSpectrumSpectral();
    for (std::size_t i = 0; i < reflectance.values.size(); ++i) {
        must(space.append_ReflectancePoint());
        vrl_v2::ReflectancePointType& point = space.back_ReflectancePoint();
        must(point.set_Wavelength(reflectance.wavelength(i)));
        must(point.set_ReflectancePointType(reflectance.values[i]));
    }
}

void add_munsell(vrl_v2::ColorType& color, const std::wstring& notation) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceMunsell);
    space.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    must(space.set_CollectionName(L"Munsell Book of Color"));
    must(space.set_ColorName(notation));
}

void add_sample(vrl_v2::ColorSetType& set, const test_color_sample& sample, const spectrum& light) {
    const spectrum reflectance{k_palette_first, k_palette_step, sample.reflectance};
    const spectrum diffuser{k_palette_first, k_palette_step, std::vector<double>(k_palette_points, 1.0)};
    const xyz tristimulus = material_tristimulus(reflectance, light);
    vrl_v2::ColorType& color = add_color(set, sample.appearance);
    must(color.set_ColorNumber(std::to_wstring(set.size_Color())));
    add_reflectance(color, reflectance);
    add_munsell(color, sample.munsell);
    add_xyz(color, tristimulus);
    add_lab(color, to_lab(tristimulus, material_tristimulus(diffuser, light)));
}

void add_conditions(vrl_v2::PaletteType& palette) {
    auto& collection = palette.get_CollectionColorSpaceSpecification();
    auto& spectra = collection.get_ColorSpaceSpecificationSpectrumSpectral();
    computed(spectra);
    must(spectra.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    must(spectra.get_GeometryChoice().set_UnknownGeometry(L"as in CIE 13.3-1995, table 1"));
    auto& colors = collection.get_ColorSpaceSpecificationSpectrumTristimulus();
    computed(colors);
    must(colors.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    seen_under(colors, L"Illuminant_D65");
}

}  // namespace

vrl_v2::Vrl reflectance_palette() {
    vrl_v2::Vrl document;
    describe(document, L"Reflectance palette", L"Test colors for judging how light sources render colors")
        .set_Comments(
            L"Test color samples 1 to 14 of CIE 13.3-1995, 400 to 700 nm in steps of 10. XYZ and Lab "
            L"by summation over these, D65, observer of 2 degrees.");
    vrl_v2::PaletteType& palette = add_palette(document, L"CIE test color samples");
    add_conditions(palette);
    const spectrum d65 = daylight(daylight_kelvin(6500));
    vrl_v2::ColorSetType& set = add_color_set(palette, L"Samples 1 to 14");
    for (const test_color_sample& sample : k_test_color_samples) add_sample(set, sample, d65);
    return document;
}

}  // namespace examples
