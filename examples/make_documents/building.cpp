#include "examples/make_documents/building.h"

#include <runtime/xml_reader.h>

#include <stdexcept>

namespace examples {

void must(qbxV2::eqbx_error result) {
    if (result != qbxV2::EQBX_NO_ERROR) throw std::runtime_error(qbxV2::get_error_description(result));
}

qbxV2::c_datetime made_on() { return qbxV2::c_datetime("2024-01-15T12:00:00Z"); }

vrl_v2::Header& describe(vrl_v2::Vrl& document, const std::wstring& name, const std::wstring& purpose) {
    vrl_v2::Header& header = document.get_Preamble().get_Header();
    must(header.set_Creator(L"make_documents"));
    must(header.set_CreatorVersion(L"1.0"));
    must(header.set_Purpose(purpose));
    must(header.set_Name(name));
    date(header);
    return header;
}

vrl_v2::PaletteType& add_palette(vrl_v2::Vrl& document, const std::wstring& name) {
    must(document.append_Palette());
    vrl_v2::PaletteType& palette = document.back_Palette();
    must(palette.set_PaletteName(name));
    date(palette);
    return palette;
}

vrl_v2::ColorSetType& add_color_set(vrl_v2::PaletteType& palette, const std::wstring& name) {
    must(palette.append_ColorSet());
    vrl_v2::ColorSetType& set = palette.back_ColorSet();
    must(set.set_ColorSetName(name));
    date(set);
    return set;
}

vrl_v2::ColorType& add_color(vrl_v2::ColorSetType& set, const std::wstring& name) {
    must(set.append_Color());
    vrl_v2::ColorType& color = set.back_Color();
    must(color.set_ColorName(name));
    date(color);
    return color;
}

void add_lab(vrl_v2::ColorType& color, const lab& value) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCIELab);
    space.get_ColorSpaceSpecificationSpectrumTristimulus()
        .setnil_ColorSpaceSpecificationSpectrumTristimulus();
    must(space.set_L(rounded(value.l, 4)));
    must(space.set_A(rounded(value.a, 4)));
    must(space.set_B(rounded(value.b, 4)));
}

void add_lch(vrl_v2::ColorType& color, const lch& value) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCIELCh);
    space.get_ColorSpaceSpecificationSpectrumTristimulus()
        .setnil_ColorSpaceSpecificationSpectrumTristimulus();
    const double hue = rounded(value.h, 4);
    must(space.set_L(rounded(value.l, 4)));
    must(space.set_C(rounded(value.c, 4)));
    must(space.set_H(hue < 360 ? hue : 0));
}

void add_xyz(vrl_v2::ColorType& color, const xyz& value) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCIEXYZ);
    space.get_ColorSpaceSpecificationSpectrumTristimulus()
        .setnil_ColorSpaceSpecificationSpectrumTristimulus();
    must(space.set_X(rounded(value.x, 6)));
    must(space.set_Y(rounded(value.y, 6)));
    must(space.set_Z(rounded(value.z, 6)));
}

vrl_v2::ColorSpaceEmissiveCIEXYZType& add_xyz_of_light(vrl_v2::ColorType& color, const xyz& value) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceEmissiveCIEXYZ);
    space.get_ColorSpaceSpecificationEmissiveTristimulus()
        .setnil_ColorSpaceSpecificationEmissiveTristimulus();
    must(space.set_X(rounded(value.x, 6)));
    must(space.set_Y(rounded(value.y, 6)));
    must(space.set_Z(rounded(value.z, 6)));
    return space;
}

void add_cmyk(vrl_v2::ColorType& color, double cyan, double magenta, double yellow, double black) {
    auto& space = add_space(color, &vrl_v2::sg_ColorSpace::get_ColorSpaceCMYK);
    space.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    must(space.set_Cyan(cyan));
    must(space.set_Magenta(magenta));
    must(space.set_Yellow(yellow));
    must(space.set_Black(black));
}

void add_function_by_type(vrl_v2::Measurement& measurement, const std::string& type,
                          const std::string& content) {
    std::string text;
    must(measurement.marshal(&text));
    text.insert(text.rfind("</Vrl:Measurement>"),
                "<Vrl:Function xsi:type=\"Vrl:" + type + "\">" + content + "</Vrl:Function>");
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    vrl_v2::Measurement completed(text, &error);
    must(error);
    measurement.swap(completed);
}

}  // namespace examples
