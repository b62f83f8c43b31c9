#include "examples/make_documents/every_part.h"

namespace examples {
namespace {

using group = vrl_v2::sg_ColorSpace;

template <class Space>
Space& add_named(vrl_v2::ColorType& color, Space& (group::*member)()) {
    Space& space = add_space(color, member);
    must(space.set_Name(L"of the example"));
    return space;
}

/// A space whose specification is of the generic kind, which is left nil.
template <class Space>
Space& add_generic(vrl_v2::ColorType& color, Space& (group::*member)()) {
    Space& space = add_named(color, member);
    space.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    return space;
}

/// A space whose specification is that of tristimulus values, which is left nil.
template <class Space>
Space& add_tristimulus(vrl_v2::ColorType& color, Space& (group::*member)()) {
    Space& space = add_named(color, member);
    space.get_ColorSpaceSpecificationSpectrumTristimulus()
        .setnil_ColorSpaceSpecificationSpectrumTristimulus();
    return space;
}

template <class Rgb>
void add_rgb(vrl_v2::ColorType& color, Rgb& (group::*member)()) {
    Rgb& space = add_tristimulus(color, member);
    must(space.set_Red(0.25));
    must(space.set_Green(0.5));
    must(space.set_Blue(0.75));
    must(space.set_Alpha(1));
    must(space.set_ColorDepth(L"ColorDepth_16"));
}

template <class Space>
void add_xyz_values(Space& space) {
    must(space.set_X(0.25));
    must(space.set_Y(0.2));
    must(space.set_Z(0.3));
}

template <class Space>
void add_axes(Space& space) {
    must(space.append_Axis());
    must(space.back_Axis().set_AxisName(L"grain"));
    vrl_v2::FloatingPointValueType& value =
        space.back_Axis().get_AxisValueChoice().get_AxisFloatingPointValue();
    must(value.set_AxisNominalMax(100));
    must(value.set_AxisNominalMin(1));
    must(value.set_AxisNominalScale(L"Scale_Log"));
    must(value.set_FloatingPointValueType(10));
    must(space.append_Axis());
    must(space.back_Axis().set_AxisName(L"sheen"));
    must(space.back_Axis().get_AxisValueChoice().set_AxisStringValue(L"eggshell"));
}

template <class Inks>
void add_inks(Inks& space) {
    must(space.set_Cyan(80));
    must(space.set_Magenta(20));
    must(space.set_Yellow(10));
    must(space.set_Black(5));
    must(space.append_SpotColor());
    must(space.back_SpotColor().set_Name(L"Varnish"));
    must(space.back_SpotColor().set_Percentage(50));
}

void fill_spectrum(vrl_v2::ColorSpaceSpectralType& space) {
    space.get_ColorSpaceSpecificationSpectrumSpectral().setnil_ColorSpaceSpecificationSpectrumSpectral();
    must(space.append_ReflectancePoint());
    must(space.back_ReflectancePoint().set_Wavelength(550));
    must(space.back_ReflectancePoint().set_ReflectancePointType(0.4));
}

void add_displays_and_video(vrl_v2::ColorType& color) {
    add_rgb(color, &group::get_ColorSpaceRGB);
    add_rgb(color, &group::get_ColorSpaceSRGB);
    add_rgb(color, &group::get_ColorSpaceAdobeRGB);
    add_rgb(color, &group::get_ColorSpaceAdobeWideGamutRGB);
    auto& hsl = add_generic(color, &group::get_ColorSpaceHSL);
    must(hsl.set_Hue(210));
    must(hsl.set_Saturation(0.5));
    must(hsl.set_Lightness(0.5));
    auto& hsv = add_generic(color, &group::get_ColorSpaceHSV);
    must(hsv.set_Hue(210));
    must(hsv.set_Saturation(0.67));
    must(hsv.set_Value(0.75));
    auto& yuv = add_generic(color, &group::get_ColorSpaceYUV);
    must(yuv.set_Y(0.45));
    must(yuv.set_U(0.1));
    must(yuv.set_V(-0.2));
    auto& yiq = add_generic(color, &group::get_ColorSpaceYIQ);
    must(yiq.set_Y(0.45));
    must(yiq.set_I(-0.2));
    must(yiq.set_Q(0.02));
    auto& ybr = add_generic(color, &group::get_ColorSpaceYBR);
    must(ybr.set_Y(0.45));
    must(ybr.set_B(0.7));
    must(ybr.set_R(0.4));
}

void add_colorimetry(vrl_v2::ColorType& color) {
    add_xyz_values(add_tristimulus(color, &group::get_ColorSpaceCIEXYZ));
    auto& xyy = add_tristimulus(color, &group::get_ColorSpaceCIExyY);
    must(xyy.set_X(0.25));
    must(xyy.set_Y(0.26));
    must(xyy.set_CapY(0.2));
    auto& lab = add_tristimulus(color, &group::get_ColorSpaceCIELab);
    must(lab.set_L(52));
    must(lab.set_A(-3));
    must(lab.set_B(-39));
    auto& lch = add_tristimulus(color, &group::get_ColorSpaceCIELCh);
    must(lch.set_L(52));
    must(lch.set_C(39));
    must(lch.set_H(265));
    auto& luv = add_tristimulus(color, &group::get_ColorSpaceCIELuv);
    must(luv.set_L(52));
    must(luv.set_U(-29));
    must(luv.set_V(-61));
}

void add_light(vrl_v2::ColorType& color) {
    auto& spectrum = add_named(color, &group::get_ColorSpaceEmissiveSpectral);
    spectrum.get_ColorSpaceSpecificationEmissiveSpectral().setnil_ColorSpaceSpecificationEmissiveSpectral();
    must(spectrum.append_EmissiveSpectralPoint());
    must(spectrum.back_EmissiveSpectralPoint().set_Wavelength(550));
    must(spectrum.back_EmissiveSpectralPoint().set_EmissiveSpectralPointType(1200));
    auto& tristimulus = add_named(color, &group::get_ColorSpaceEmissiveCIEXYZ);
    tristimulus.get_ColorSpaceSpecificationEmissiveTristimulus()
        .setnil_ColorSpaceSpecificationEmissiveTristimulus();
    add_xyz_values(tristimulus);
    auto& chromaticity = add_named(color, &group::get_ColorSpaceEmissiveCIExyY);
    chromaticity.get_ColorSpaceSpecificationEmissiveTristimulus()
        .setnil_ColorSpaceSpecificationEmissiveTristimulus();
    must(chromaticity.set_X(0.3127));
    must(chromaticity.set_Y(0.329));
    must(chromaticity.set_CapY(80));
    auto& generic = add_named(color, &group::get_ColorSpaceEmissiveGeneric);
    generic.get_ColorSpaceSpecificationEmissiveGeneric().setnil_ColorSpaceSpecificationEmissiveGeneric();
    add_axes(generic);
}

void add_printing(vrl_v2::ColorType& color) {
    add_inks(add_generic(color, &group::get_ColorSpaceCMYK));
    auto& six = add_generic(color, &group::get_ColorSpaceTINTARAQuadravive);
    add_inks(six);
    must(six.set_Orange(0));
    must(six.set_Green(15));
    auto& density = add_generic(color, &group::get_ColorSpaceDensity);
    must(density.append_Density());
    must(density.back_Density().set_DensityStatus(L"Status_T"));
    must(density.back_Density().set_DensityFilter(L"Filter_Red"));
    must(density.back_Density().set_DensityType(1.4));
}

void add_recipe(vrl_v2::ColorType& color) {
    auto& recipe = add_generic(color, &group::get_ColorSpaceRecipe);
    must(recipe.append_ColorantElement());
    vrl_v2::ColorantElementType_Colorant& colorant = recipe.back_ColorantElement().get_Colorant();
    add_custom_attribute(colorant);
    must(colorant.set_Name(L"phthalocyanine blue"));
    must(colorant.set_Manufacturer(L"any"));
    must(colorant.set_PartNumber(L"PB 15:3"));
    must(colorant.get_Density().set_Density(1.6));
    must(recipe.back_ColorantElement().set_Contribution(0.1));
    vrl_v2::BaseElementType& base = recipe.get_BaseElement();
    add_custom_attribute(base.get_Base());
    must(base.get_Base().set_Name(L"white base"));
    must(base.get_Base().set_Manufacturer(L"any"));
    must(base.get_Base().set_PartNumber(L"W 1"));
    must(base.get_Base().set_Density(1.3));
    must(base.set_Contribution(0.9));
}

void fill(vrl_v2::ColorantElement& element) {
    vrl_v2::Colorant& colorant = element.get_Colorant();
    must(colorant.append_CustomAttributes());
    vrl_v2::CustomAttributeType& attribute = colorant.back_CustomAttributes().get_CustomAttribute();
    must(attribute.set_Name(L"Lightfast"));
    must(attribute.get_ValueChoice().set_IntegerValue(8));
    must(colorant.set_Name(L"reflex blue"));
    must(colorant.set_Manufacturer(L"any"));
    must(colorant.set_PartNumber(L"R 1"));
    must(colorant.set_Density(1.1));
    must(element.set_Contribution(12.5));
}

void add_collections(vrl_v2::ColorType& color) {
    auto& tintara = add_named(color, &group::get_ColorSpaceTINTARA);
    must(tintara.set_FamilyName(L"Blues"));
    must(tintara.get_ColorName().set_PrefixName(L"T"));
    must(tintara.get_ColorName().set_BaseName(L"300"));
    must(tintara.get_ColorName().set_SuffixName(L"C"));
    must(tintara.set_Page(L"3"));
    must(tintara.set_Gamut(L"Gamut_sRGB"));
    must(tintara.get_Recipe().append_ColorantElement());
    fill(tintara.get_Recipe().back_ColorantElement());
    must(tintara.append_ColorAndFinish());
    must(tintara.back_ColorAndFinish().set_Finish(L"Finish_Coated"));
    vrl_v2::ColorSpaceSpectralType& coated = tintara.back_ColorAndFinish().get_ColorSpaceSpectral();
    date(coated);
    fill_spectrum(coated);
    must(add_generic(color, &group::get_ColorSpaceNCS).set_ColorName(L"S 2050-B"));
    auto& munsell = add_generic(color, &group::get_ColorSpaceMunsell);
    must(munsell.set_CollectionName(L"Munsell Book of Color"));
    must(munsell.set_ColorName(L"2.5PB 5/8"));
}

/// What every value can have: remarks, an identifier, and the value from which it was computed.
void add_derived(vrl_v2::ColorType& color) {
    auto& spectrum = add_named(color, &group::get_ColorSpaceSpectral);
    must(spectrum.set_Comments(L"estimated"));
    must(spectrum.set_UniqueID(L"value-1"));
    add_custom_attribute(spectrum);
    auto& parent = spectrum.get_ParentColorSpace().get_ColorSpace().get_ColorSpaceNCS();
    date(parent);
    parent.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    must(parent.set_ColorName(L"S 2050-B"));
    fill_spectrum(spectrum);
}

}  // namespace

void add_every_color_space(vrl_v2::ColorType& color) {
    add_derived(color);
    add_displays_and_video(color);
    add_colorimetry(color);
    add_light(color);
    add_printing(color);
    add_recipe(color);
    add_collections(color);
    add_axes(add_generic(color, &group::get_ColorSpaceGeneric));
}

void fill_plain(vrl_v2::ColorType& color, const std::wstring& name) {
    must(color.set_ColorName(name));
    date(color);
    add_lab(color, {52, -3, -39});
}

}  // namespace examples
