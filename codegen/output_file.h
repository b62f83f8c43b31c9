#pragma once

#include <filesystem>
#include <string>

namespace vrl_codegen {

/// Writes a file, with the folders that it needs. One that says the same already is left alone, time stamp
/// and all: what didn't change isn't built again. Throws `std::runtime_error` when it can't be written.
void write_if_changed(const std::filesystem::path& path, const std::string& text);

}  // namespace vrl_codegen
