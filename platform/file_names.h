#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace vrl_platform {

/// File attributes as the DOS family numbers them.
namespace file_attribute {
inline constexpr unsigned read_only = 0x01;
inline constexpr unsigned hidden = 0x02;
inline constexpr unsigned folder = 0x10;
inline constexpr unsigned archive = 0x20;
}  // namespace file_attribute

enum class existence { absent, file, folder };

/// Files by name: what can be learned and done without opening them.
///
/// Paths    narrow, in the system's 8-bit code page (UTF-8 on POSIX), with `path_separator` between parts.
/// Failure  an empty optional or false, and nothing else; nothing here throws.
class file_names {
public:
    file_names() = default;
    file_names(const file_names&) = delete;
    file_names& operator=(const file_names&) = delete;
    virtual ~file_names() = default;

    /// The attribute bits. On POSIX they come from the mode: a folder; no owner write is read-only;
    /// no owner read is hidden; a file without owner execute has the archive bit.
    virtual std::optional<unsigned> attributes(const std::string& path) = 0;
    /// On POSIX read-only takes every write bit and hidden every read bit; without them the owner gets
    /// them back. Execute bits stay as they are.
    virtual bool set_attributes(const std::string& path, unsigned attributes) = 0;

    /// Seconds since 1970, UTC.
    virtual std::optional<std::int64_t> modification_time(const std::string& path) = 0;
    /// The access time stays.
    virtual bool set_modification_time(const std::string& path, std::int64_t time) = 0;

    virtual existence exists(const std::string& path) = 0;
    /// Whether the path names a folder that the process could make its current one.
    virtual bool is_enterable_folder(const std::string& path) = 0;

    virtual bool remove(const std::string& path) = 0;
    /// Fails when `to` exists.
    virtual bool rename(const std::string& from, const std::string& to) = 0;

    /// The folder for temporary files, without a separator at its end.
    virtual std::string temporary_folder() = 0;
    /// Makes an empty file of a new name that begins with `prefix`, and returns its path.
    virtual std::optional<std::string> make_temporary_file(const std::string& folder,
                                                           const std::string& prefix) = 0;
};

/// The system's own file names. Lives as long as the process.
file_names& native_file_names();

/// What stands between the parts of a path on this system.
char path_separator();

}  // namespace vrl_platform
