#include "codegen/output_file.h"

#include <fstream>
#include <sstream>
#include <stdexcept>

namespace vrl_codegen {
namespace {

bool says(const std::filesystem::path& path, const std::string& text) {
    std::ifstream file(path, std::ios::binary);
    std::ostringstream present;
    present << file.rdbuf();
    return file.is_open() && present.str() == text;
}

}  // namespace

void write_if_changed(const std::filesystem::path& path, const std::string& text) {
    if (says(path, text)) return;
    if (path.has_parent_path()) std::filesystem::create_directories(path.parent_path());
    std::ofstream file(path, std::ios::binary);
    file << text << std::flush;
    if (!file) throw std::runtime_error("cannot write " + path.string());
}

}  // namespace vrl_codegen
