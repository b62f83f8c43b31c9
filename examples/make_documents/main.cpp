/// Makes the documents of examples/documents/.
///
///     make_documents folder
///
/// Nothing in them depends on the machine or the day: the same program makes the same bytes everywhere.

#include <runtime/values.h>

#include <exception>
#include <iostream>
#include <string>

#include "examples/make_documents/building.h"
#include "examples/make_documents/documents.h"

namespace {

void write(const vrl_v2::Vrl& document, const std::string& path) {
    std::wstring wide_path;
    examples::must(document.writeFile(qbxV2::convert(&wide_path, path)));
    vrl_v2::Vrl written;  // a file that cannot be opened goes unnoticed on writing, but not on reading
    examples::must(written.loadFile(wide_path));
    std::cout << path << '\n';
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: make_documents folder\n";
        return 2;
    }
    const std::string folder = std::string(argv[1]) + '/';
    try {
        write(examples::css_named_colors(), folder + "css_named_colors.vrl");
        write(examples::process_inks(), folder + "process_inks.vrl");
        write(examples::light_sources(), folder + "light_sources.vrl");
        write(examples::reflectance_palette(), folder + "reflectance_palette.vrl");
        write(examples::paint_recipe(), folder + "paint_recipe.vrl");
        write(examples::quality_control(), folder + "quality_control.vrl");
        write(examples::every_element(), folder + "every_element.vrl");
    } catch (const std::exception& failure) {
        std::cerr << "make_documents: " << failure.what() << '\n';
        return 1;
    }
    return 0;
}
