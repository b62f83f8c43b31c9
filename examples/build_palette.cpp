/// Builds a palette from nothing and writes it.
///
///     build_palette palette.vrl

#include <V2/Vrl.h>
#include <runtime/values.h>
#include <runtime/xml_reader.h>

#include <iostream>
#include <string>

namespace {

const qbxV2::c_datetime k_made("2024-01-15T12:00:00Z");

/// The header's four members that a document cannot do without.
void describe(vrl_v2::Vrl& document) {
    vrl_v2::Header& header = document.get_Preamble().get_Header();
    header.set_Creator(L"build_palette");
    header.set_CreatorVersion(L"1.0");
    header.set_Purpose(L"Paints for a garden shed");
    header.append_ChangeHistory(k_made);
}

/// A color with one value. How it was measured is not known, which the value says by a nil specification.
qbxV2::eqbx_error add_color(vrl_v2::ColorSetType& set, const wchar_t* name, double l, double a, double b) {
    set.append_Color();
    vrl_v2::ColorType& color = set.back_Color();
    color.set_ColorName(name);
    color.append_ChangeHistory(k_made);
    color.append_ColorSpace();
    vrl_v2::ColorSpaceCIELabType& lab = color.back_ColorSpace().get_ColorSpaceCIELab();
    lab.append_ChangeHistory(k_made);
    lab.get_ColorSpaceSpecificationSpectrumTristimulus().setnil_ColorSpaceSpecificationSpectrumTristimulus();
    if (const qbxV2::eqbx_error error = lab.set_L(l)) return error;
    if (const qbxV2::eqbx_error error = lab.set_A(a)) return error;
    return lab.set_B(b);
}

qbxV2::eqbx_error build(vrl_v2::Vrl& document) {
    describe(document);
    document.append_Palette();
    vrl_v2::PaletteType& palette = document.back_Palette();
    palette.set_PaletteName(L"Garden shed");
    palette.append_ChangeHistory(k_made);
    palette.append_ColorSet();
    vrl_v2::ColorSetType& set = palette.back_ColorSet();
    set.set_ColorSetName(L"Walls and trim");
    set.append_ChangeHistory(k_made);
    if (const qbxV2::eqbx_error error = add_color(set, L"Barn Red", 35.2, 44.1, 27.9)) return error;
    if (const qbxV2::eqbx_error error = add_color(set, L"Harbor Blue", 41.6, -4.3, -28.5)) return error;
    return add_color(set, L"Chalk", 93.0, -0.4, 3.1);
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: build_palette palette.vrl\n";
        return 2;
    }
    std::wstring path;
    qbxV2::convert(&path, argv[1]);
    vrl_v2::Vrl document;
    qbxV2::eqbx_error error = build(document);
    if (error == qbxV2::EQBX_NO_ERROR) error = document.writeFile(path);
    std::cout << argv[1] << ": " << qbxV2::get_error_description(error) << '\n';
    return error == qbxV2::EQBX_NO_ERROR ? 0 : 1;
}
