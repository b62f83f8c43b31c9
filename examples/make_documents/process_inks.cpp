#include <vector>

#include "examples/make_documents/building.h"
#include "examples/make_documents/documents.h"

namespace examples {
namespace {

/// A solid: its inks in percent, and the aim for its color on white backing.
struct solid {
    const wchar_t* name;
    double cyan, magenta, yellow, black;
    lab aim;
};

/// ISO 12647-2:2004/Amd 1:2007, table 2: solids on paper types 1 and 2, measured on white backing.
const std::vector<solid> k_primaries = {
    {L"Cyan", 100, 0, 0, 0, {55, -37, -50}},
    {L"Magenta", 0, 100, 0, 0, {48, 74, -3}},
    {L"Yellow", 0, 0, 100, 0, {89, -5, 93}},
    {L"Black", 0, 0, 0, 100, {16, 0, 0}},
};

/// The same table: two solids one upon the other, in the order cyan, magenta, yellow.
const std::vector<solid> k_overprints = {
    {L"Red", 0, 100, 100, 0, {47, 68, 48}},
    {L"Green", 100, 0, 100, 0, {50, -65, 27}},
    {L"Blue", 100, 100, 0, 0, {24, 22, -46}},
};

/// ISO 12647-2:2004/Amd 1:2007, table 1: paper type 1, gloss coated, 115 grams a square meter.
constexpr lab k_paper{95, 0, -2};

/// Solid ink density of sheet-fed offset on coated paper, status T: GRACoL 7 (IDEAlliance).
struct ink_density {
    const wchar_t* filter;
    double density;
};
const std::vector<ink_density> k_densities = {
    {L"Filter_Cyan", 1.40}, {L"Filter_Magenta", 1.50}, {L"Filter_Yellow", 1.05}, {L"Filter_Visual", 1.70}};

void add_density(vrl_v2::ColorType& color, const ink_density& reading) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceDensity);
    space.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    must(space.append_Density());
    vrl_v2::DensityType& density = space.back_Density();
    must(density.set_DensityStatus(L"Status_T"));
    must(density.set_DensityFilter(reading.filter));
    must(density.set_DensityType(reading.density));
}

vrl_v2::ColorType& add_solid(vrl_v2::ColorSetType& set, const solid& ink) {
    vrl_v2::ColorType& color = add_color(set, ink.name);
    add_cmyk(color, ink.cyan, ink.magenta, ink.yellow, ink.black);
    add_lab(color, ink.aim);
    return color;
}

void add_paper(vrl_v2::ColorSetType& set) {
    vrl_v2::SubstratePaperType& paper = set.get_Substrate().get_SubstratePaper();
    must(paper.set_PaperType(L"type 1: gloss coated, 115 grams a square meter"));
    vrl_v2::ColorType& color = paper.get_Color();
    must(color.set_ColorName(L"Paper type 1"));
    date(color);
    add_lab(color, k_paper);
}

/// ISO 13655: D50, 2 degrees, 45/0 geometry, no polarization.
void add_conditions(vrl_v2::PaletteType& palette) {
    auto& collection = palette.get_CollectionColorSpaceSpecification();
    auto& densities = collection.get_ColorSpaceSpecificationSpectrumGeneric();
    measured_unfiltered(densities);
    must(densities.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    must(densities.get_GeometryChoice().set_Angle(45));
    must(densities.set_DensityStatus(L"Status_T"));
    auto& colors = collection.get_ColorSpaceSpecificationSpectrumTristimulus();
    measured_unfiltered(colors);
    must(colors.get_Spectrum().set_SpectrumType(L"Spectrum_Reflectance"));
    seen_under(colors, L"Illuminant_D50");
    must(colors.get_GeometryChoice().set_Angle(45));
}

}  // namespace

vrl_v2::Vrl process_inks() {
    vrl_v2::Vrl document;
    describe(document, L"Process inks", L"Aims for the solids of sheet-fed offset printing on coated paper")
        .set_Comments(
            L"Lab: ISO 12647-2:2004/Amd 1:2007, paper type 1, white backing. Densities: GRACoL 7, "
            L"status T.");
    vrl_v2::PaletteType& palette = add_palette(document, L"Offset on gloss coated paper");
    add_conditions(palette);
    vrl_v2::ColorSetType& primaries = add_color_set(palette, L"Primaries");
    for (std::size_t i = 0; i < k_primaries.size(); ++i) {
        add_density(add_solid(primaries, k_primaries[i]), k_densities[i]);
    }
    add_paper(primaries);
    vrl_v2::ColorSetType& overprints = add_color_set(palette, L"Overprints");
    for (const solid& ink : k_overprints) add_solid(overprints, ink);
    add_paper(overprints);
    return document;
}

}  // namespace examples
