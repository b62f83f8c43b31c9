#include <V2/Vrl.h>
#include <iostream>

int main() {
    vrl_v2::Vrl document;
    if (const auto error = document.loadFile(L"examples/documents/css_named_colors.vrl")) {
        std::cerr << qbxV2::get_error_description(error) << '\n';
        return 1;
    }
    for (unsigned p = 0; p < document.size_Palette(); ++p) {
        const vrl_v2::PaletteType& palette = document.get_Palette(p);
        for (unsigned s = 0; s < palette.size_ColorSet(); ++s) {
            const vrl_v2::ColorSetType& set = palette.get_ColorSet(s);
            std::wcout << set.get_ColorSetName() << L": " << set.size_Color() << L" colors\n";
        }
    }
}
