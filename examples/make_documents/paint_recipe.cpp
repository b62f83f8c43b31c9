#include "examples/make_documents/building.h"
#include "examples/make_documents/documents.h"

namespace examples {
namespace {

/// Forest Products Laboratory Natural Finish, USDA Forest Service Research Note FPL-046 (1964): to make five
/// gallons of the cedar color, one pint each of two pigments ground in linseed oil. By volume, 8 pints to the
/// gallon: each is 1 part of 40.
constexpr double k_share_of_a_pint = 1.0 / 40.0;

void add_colorant(vrl_v2::ColorSpaceRecipeType& recipe, const std::wstring& name, const std::wstring& part) {
    must(recipe.append_ColorantElement());
    vrl_v2::ColorantElementType& element = recipe.back_ColorantElement();
    vrl_v2::ColorantElementType_Colorant& colorant = element.get_Colorant();
    must(colorant.set_Name(name));
    must(colorant.set_Manufacturer(L"any"));
    must(colorant.set_PartNumber(part));
    colorant.get_Density().setnil_Density();  // the note measures by volume and gives none
    must(element.set_Contribution(k_share_of_a_pint));
}

void add_recipe(vrl_v2::ColorType& color) {
    auto& recipe = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceRecipe);
    must(recipe.set_Name(L"Cedar, shares by volume"));
    recipe.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    // Colour Index generic names: both are earths of iron and manganese oxides.
    add_colorant(recipe, L"burnt sienna, color in oil", L"C.I. Pigment Brown 7");
    add_colorant(recipe, L"raw umber, color in oil", L"C.I. Pigment Brown 7");
    vrl_v2::BaseElementType& base = recipe.get_BaseElement();
    must(base.get_Base().set_Name(L"boiled linseed oil with mineral spirits, wax and preservative"));
    must(base.get_Base().set_Manufacturer(L"any"));
    must(base.get_Base().set_PartNumber(L"FPL-046"));
    must(base.set_Contribution(1 - 2 * k_share_of_a_pint));
}

}  // namespace

vrl_v2::Vrl paint_recipe() {
    vrl_v2::Vrl document;
    describe(document, L"Paint recipe", L"A penetrating finish for wood siding, cedar color")
        .set_Comments(
            L"Forest Products Laboratory Natural Finish, USDA Forest Service Research Note FPL-046.");
    vrl_v2::PaletteType& palette = add_palette(document, L"Natural finishes for wood");
    vrl_v2::ColorSetType& set = add_color_set(palette, L"Siding");
    vrl_v2::ColorType& color = add_color(set, L"Cedar");
    add_recipe(color);
    must(color.get_Substrate().get_SubstrateWood().set_WoodType(L"western redcedar"));
    return document;
}

}  // namespace examples
