/// Checks a color document and saves it under another name: packed where that ends in ".vrlz", plain where it
/// ends in ".vrl". Tells everything that is wrong with a document that it refuses.
///
///     convert_document from to

#include <V2/document_file.h>

#include <iostream>

namespace {

/// All that is wrong at once, not the first mistake alone.
vrl_v2::load_result load_and_tell(const char* path) {
    vrl_v2::load_options options;
    options.collect_reports = true;
    vrl_v2::load_result loaded = vrl_v2::load_document(path, options);
    if (!loaded) std::cerr << loaded.message << '\n';
    for (const vrl_v2::load_report& report : loaded.reports) {
        std::cerr << "  line " << report.line << ": " << report.message << '\n';
    }
    return loaded;
}

/// Until the new file is whole and on the disk, the old one stays what it is.
bool save_and_tell(const vrl_v2::Vrl& document, const char* path) {
    vrl_v2::save_options options;
    options.compression_level = 9;
    options.progress = [](std::uint64_t bytes, std::uint64_t) {
        std::cout << "  " << bytes << " bytes written\n";
        return true;  // false would cancel
    };
    const vrl_v2::save_result saved = vrl_v2::save_document(document, path, options);
    if (!saved) std::cerr << saved.message << '\n';
    return static_cast<bool>(saved);
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: convert_document from to\n";
        return 2;
    }
    const vrl_v2::load_result loaded = load_and_tell(argv[1]);
    return loaded && save_and_tell(*loaded.document, argv[2]) ? 0 : 1;
}
