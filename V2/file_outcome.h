#pragma once

#include <filesystem>
#include <string>

#include "V2/document_file.h"

/// How failures of files are told.
namespace vrl_v2 {

/// A failure with the code that goes with it.
file_outcome failed(file_failure failure, const std::string& what);
/// A system call that failed on the way, with an errno value.
file_outcome failed_call(const std::string& what, int error);
/// A file that could not be opened or made, with an errno value.
file_outcome failed_opening(const std::string& what, int error);
/// What a ZIP engine's exception means that does not come from a call of the system. `what` is what was
/// tried.
file_outcome failed_archive(const std::string& what, int code);

/// Puts the name of the file, if there is one, and the line, if there is one, before a message.
void place(file_outcome& outcome, const std::string& name);

/// A path as UTF-8.
std::string as_text(const std::filesystem::path& path);

}  // namespace vrl_v2
