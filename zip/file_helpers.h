#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "zip/environment.h"

/// What the engine asks about files that it has not opened as an archive. Paths are the system's.
namespace ZipArchiveLib {

/// The modification time; the present, and `valid` false, when there is none.
struct FileTime {
    std::int64_t time;
    bool valid;
};
FileTime GetFileTime(const CZipEnvironment& environment, const std::string& path);

/// By opening the file and measuring it. Nothing when that fails or the size needs more than 32 bits.
std::optional<std::uint32_t> GetFileSize(const CZipEnvironment& environment, const std::string& path);

/// -1 for a folder, 1 for a file, 0 when there is nothing of that name.
int FileExists(const CZipEnvironment& environment, const std::string& path);

/// Whether the path names a folder that can be entered.
bool IsDirectory(const CZipEnvironment& environment, const std::string& path);

/// A time of -1 means now.
bool SetFileTime(const CZipEnvironment& environment, const std::string& path, std::int64_t time);

/// False on failure, or CZipException 115 when asked for.
bool RemoveFile(const CZipEnvironment& environment, const std::string& path, bool throwOnError);

/// False on failure, or CZipException 116 when asked for; a target that exists is a failure.
bool RenameFile(const CZipEnvironment& environment, const std::string& from, const std::string& to,
                bool throwOnError);

/// The free space for a file of the folder, cut at what 32 bits hold; 0 when it cannot be learned.
std::uint32_t GetFreeSpace(const CZipEnvironment& environment, const std::string& folder);

/// Makes an empty temporary file in a folder with room for `size` bytes: the wanted one, or the system's.
std::optional<std::string> MakeTemporaryFile(const CZipEnvironment& environment,
                                             const std::string& wantedFolder, std::uint32_t size);

}  // namespace ZipArchiveLib
