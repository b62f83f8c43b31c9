#include "zip/file_helpers.h"

#include <algorithm>

#include "zip/bytes.h"
#include "zip/exception.h"
#include "zip/file.h"

namespace ZipArchiveLib {

FileTime GetFileTime(const CZipEnvironment& environment, const std::string& path) {
    const auto time = environment.names.modification_time(path);
    if (time && *time != -1) return {*time, true};
    return {environment.clock.now(), false};
}

std::optional<std::uint32_t> GetFileSize(const CZipEnvironment& environment, const std::string& path) {
    CZipFile file(environment.files);
    if (!file.Open(path, CZipFile::openMeasured, false)) return std::nullopt;
    try {
        return file.GetLength();
    } catch (const CZipException&) {
        return std::nullopt;
    }
}

int FileExists(const CZipEnvironment& environment, const std::string& path) {
    switch (environment.names.exists(path)) {
        case vrl_platform::existence::folder:
            return -1;
        case vrl_platform::existence::file:
            return 1;
        case vrl_platform::existence::absent:
            break;
    }
    return 0;
}

bool IsDirectory(const CZipEnvironment& environment, const std::string& path) {
    return environment.names.is_enterable_folder(path);
}

bool SetFileTime(const CZipEnvironment& environment, const std::string& path, std::int64_t time) {
    return environment.names.set_modification_time(path, time == -1 ? environment.clock.now() : time);
}

bool RemoveFile(const CZipEnvironment& environment, const std::string& path, bool throwOnError) {
    const bool removed = environment.names.remove(path);
    if (!removed && throwOnError) CZipException::Raise(CZipException::cannotDelete, path);
    return removed;
}

bool RenameFile(const CZipEnvironment& environment, const std::string& from, const std::string& to,
                bool throwOnError) {
    const bool renamed = environment.names.rename(from, to);
    if (!renamed && throwOnError) CZipException::Raise(CZipException::cannotRename, from);
    return renamed;
}

std::uint32_t GetFreeSpace(const CZipEnvironment& environment, const std::string& folder) {
    auto space = environment.volumes.free_space(folder);
    if (!space) space = environment.volumes.free_space(folder + vrl_platform::path_separator());
    return static_cast<std::uint32_t>(std::min(space.value_or(0), k_largestNumber));
}

std::optional<std::string> MakeTemporaryFile(const CZipEnvironment& environment,
                                             const std::string& wantedFolder, std::uint32_t size) {
    for (const std::string& folder : {wantedFolder, environment.names.temporary_folder()}) {
        if (folder.empty() || GetFreeSpace(environment, folder) < size) continue;
        auto path = environment.names.make_temporary_file(folder, "ZAR");
        if (path) return path;
    }
    return std::nullopt;
}

}  // namespace ZipArchiveLib
