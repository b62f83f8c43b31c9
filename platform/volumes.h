#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace vrl_platform {

/// Drives and the volumes in them. POSIX has file systems and no drives: nothing there is removable
/// or takes a label.
class volumes {
public:
    volumes() = default;
    volumes(const volumes&) = delete;
    volumes& operator=(const volumes&) = delete;
    virtual ~volumes() = default;

    virtual bool is_removable(const std::string& path) = 0;
    /// Bytes that the process may still write into the folder's file system.
    virtual std::optional<std::uint64_t> free_space(const std::string& folder) = 0;
    virtual bool set_label(const std::string& path, const std::string& label) = 0;
};

/// The system's own volumes. Lives as long as the process.
volumes& native_volumes();

}  // namespace vrl_platform
