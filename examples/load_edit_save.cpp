/// Loads a color document, lists it, edits it, saves it under another name, and loads that again.
///
///     load_edit_save [--color] document.vrl saved.vrl

#include <V2/Vrl.h>
#include <runtime/values.h>
#include <runtime/xml_reader.h>

#include <iostream>
#include <string>
#include <vector>

#include "examples/listing.h"

namespace {

bool failed(const char* step, qbxV2::eqbx_error error) {
    if (error == qbxV2::EQBX_NO_ERROR) return false;
    std::cerr << step << ": " << qbxV2::get_error_description(error) << '\n';
    return true;
}

std::wstring wide(const std::string& text) {
    std::wstring units;
    return qbxV2::convert(&units, text);
}

/// A note in the header, and a color of our own: setters that have a range say so by their result.
qbxV2::eqbx_error edit(vrl_v2::Vrl& document) {
    const qbxV2::c_datetime now("2024-06-01T09:30:00+02:00");
    vrl_v2::Header& header = document.get_Preamble().get_Header();
    header.set_Comments(L"Neutral gray added.");
    header.append_ChangeHistory(now);

    document.append_Color();
    vrl_v2::ColorType& gray = document.back_Color();
    gray.set_ColorName(L"neutral gray");
    gray.append_ChangeHistory(now);
    gray.append_ColorSpace();
    vrl_v2::ColorSpaceCIELabType& lab = gray.back_ColorSpace().get_ColorSpaceCIELab();
    lab.append_ChangeHistory(now);
    lab.get_ColorSpaceSpecificationSpectrumTristimulus().setnil_ColorSpaceSpecificationSpectrumTristimulus();
    lab.set_A(0);
    lab.set_B(0);
    return lab.set_L(50);
}

bool same_content(const vrl_v2::Vrl& a, const vrl_v2::Vrl& b) {
    return a.writeString().getXmlDocument() == b.writeString().getXmlDocument();
}

}  // namespace

int main(int argc, char** argv) {
    std::vector<std::string> arguments(argv + 1, argv + argc);
    const bool color = !arguments.empty() && arguments.front() == "--color";
    if (color) arguments.erase(arguments.begin());
    if (arguments.size() != 2) {
        std::cerr << "usage: load_edit_save [--color] document.vrl saved.vrl\n";
        return 2;
    }

    vrl_v2::Vrl document;
    if (failed("load", document.loadFile(wide(arguments[0])))) return 1;
    examples::print_document(std::cout, document, color);

    if (failed("edit", edit(document))) return 1;
    if (failed("save", document.writeFile(wide(arguments[1])))) return 1;

    vrl_v2::Vrl again;
    if (failed("load again", again.loadFile(wide(arguments[1])))) return 1;
    if (again.size_Color() != document.size_Color() || !same_content(document, again)) {
        std::cerr << arguments[1] << " is not what was saved\n";
        return 1;
    }
    std::cout << "  edited, saved, loaded again: equal\n";
    return 0;
}
