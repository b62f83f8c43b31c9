#pragma once

#include <filesystem>
#include <string>

#include "platform/file_descriptors.h"

namespace vrl_platform {

/// A file that was made beside the one whose place it is to take.
struct replacement {
    /// Open for writing, for the calls of `file_descriptors`; -1 when `error` tells why there is none.
    int descriptor = -1;
    /// An errno value. EINVAL for a target that is neither a file nor a folder.
    int error = 0;
    std::filesystem::path path;
    /// The file to be replaced, or the name to be given: where links led to.
    std::filesystem::path target;
    /// Where both stand.
    std::filesystem::path folder;
};

/// Whole files by path, in the system's own encoding: opening one, and putting a new one in another's place.
///
/// Failure  by errno value, 0 for success; nothing here throws except for memory, and from `replace` on
/// nothing
///          does: what has been done must not look undone.
class file_exchange {
public:
    file_exchange() = default;
    file_exchange(const file_exchange&) = delete;
    file_exchange& operator=(const file_exchange&) = delete;
    virtual ~file_exchange() = default;

    /// Opens a file for reading, for the calls of `file_descriptors`. EISDIR for a folder.
    virtual io_result open(const std::filesystem::path& path) = 0;
    /// Makes an empty file of a new name in the target's folder, with the target's mode and owner as far as
    /// that can be had; where the group cannot be had, the group's rights are no more than everybody's.
    /// Refuses a target that is there and is no file, or that may not be written.
    virtual replacement create_beside(const std::filesystem::path& target) = 0;
    /// Gives the closed file `from` the name `to`, in one step; what had that name is gone.
    virtual int replace(const std::filesystem::path& from, const std::filesystem::path& to) noexcept = 0;
    virtual int remove(const std::filesystem::path& path) noexcept = 0;
    /// Returns when the names in a folder have reached the device, or when the system has no such flush.
    virtual int commit_folder(const std::filesystem::path& folder) noexcept = 0;
};

/// A path of UTF-16 units, or of whole code points where `wchar_t` has room for them, whatever the locale.
std::filesystem::path path_from_wide(const std::wstring& path);

/// The system's own. Lives as long as the process.
file_exchange& native_file_exchange();

}  // namespace vrl_platform
