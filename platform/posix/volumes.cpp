#include "platform/volumes.h"

#include <sys/statvfs.h>

namespace vrl_platform {
namespace {

class posix_volumes : public volumes {
public:
    bool is_removable(const std::string& /*path*/) override { return false; }

    std::optional<std::uint64_t> free_space(const std::string& folder) override {
        struct statvfs status {};
        if (::statvfs(folder.c_str(), &status) != 0) return std::nullopt;
        return static_cast<std::uint64_t>(status.f_bavail) * status.f_frsize;
    }

    bool set_label(const std::string& /*path*/, const std::string& /*label*/) override { return false; }
};

}  // namespace

volumes& native_volumes() {
    static posix_volumes all;
    return all;
}

}  // namespace vrl_platform
