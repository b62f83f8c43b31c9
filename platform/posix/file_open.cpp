#include "platform/file_open.h"

#include <sys/stat.h>
#include <unistd.h>

#include "platform/text_encoding.h"

namespace vrl_platform {
namespace {

bool is_folder(std::FILE* file) {
    struct stat about;
    return ::fstat(::fileno(file), &about) == 0 && S_ISDIR(about.st_mode);
}

}  // namespace

std::FILE* open_file(const char* path, const char* mode) {
    std::FILE* const file = std::fopen(path, mode);
    // POSIX opens a folder for reading and refuses every read: it would pass for an empty file.
    if (file == nullptr || !is_folder(file)) return file;
    std::fclose(file);
    return nullptr;
}

std::FILE* open_file(const wchar_t* path, const char* mode) {
    return open_file(utf8_from_wide(path).c_str(), mode);
}

// Not std::remove, which takes an empty folder away, too.
bool remove_file(const std::wstring& path) { return ::unlink(utf8_from_wide(path).c_str()) == 0; }

}  // namespace vrl_platform
