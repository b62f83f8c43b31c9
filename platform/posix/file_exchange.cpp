#include "platform/file_exchange.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdint>
#include <cstdio>
#include <string>

#include "platform/clock.h"
#include "platform/entropy.h"
#include "platform/text_encoding.h"

namespace vrl_platform {
namespace {

namespace fs = std::filesystem;

constexpr int k_most_names = 100;
// As many as Linux follows. (path_resolution(7))
constexpr int k_most_links = 40;
constexpr mode_t k_mode_bits = 07777;

/// The file at the end of a chain of links.
fs::path behind_links(const fs::path& path) {
    std::error_code error;
    if (!fs::is_symlink(path, error)) return path;
    fs::path resolved = fs::canonical(path, error);
    return error ? path : resolved;
}

/// The name at the end of a chain of links that leads to no file.
fs::path missing_behind_links(const fs::path& path) {
    fs::path end = path;
    std::error_code error;
    for (int i = 0; i < k_most_links && fs::is_symlink(end, error); ++i) {
        const fs::path next = fs::read_symlink(end, error);
        if (error) break;
        end = end.parent_path() / next;
    }
    return end;
}

fs::path folder_of(const fs::path& path) {
    fs::path folder = path.parent_path();
    return folder.empty() ? fs::path(".") : folder;
}

/// Without entropy names are merely different ones: the opening insists on a new file anyway.
std::uint64_t new_number() {
    static std::atomic<std::uint64_t> count{0};
    std::uint64_t number = 0;
    if (native_entropy().fill(&number, sizeof number)) return number;
    return (static_cast<std::uint64_t>(native_clock().now()) << 24) ^
           (static_cast<std::uint64_t>(::getpid()) << 8) ^ ++count;
}

std::string new_name() {
    char name[32];
    std::snprintf(name, sizeof name, ".vrl-%012llx",
                  static_cast<unsigned long long>(new_number() & 0xFFFFFFFFFFFF));
    return name;
}

/// Why a target that is there must not be replaced; 0 if it may.
int refusal(const fs::path& target, const struct stat& status) {
    if (S_ISDIR(status.st_mode)) return EISDIR;
    if (!S_ISREG(status.st_mode)) return EINVAL;
    return ::faccessat(AT_FDCWD, target.c_str(), W_OK, AT_EACCESS) == 0 ? 0 : errno;
}

/// What the group may do is for another group than the one that was meant: no more than everybody may.
mode_t with_group_as_others(mode_t mode) {
    const mode_t others_as_group = (mode & S_IRWXO) << 3;
    return (mode & ~static_cast<mode_t>(S_IRWXG)) | (mode & others_as_group);
}

/// The owner first: changing it takes some mode bits away.
void dress_like(int descriptor, const struct stat& status) {
    constexpr auto k_keep = static_cast<uid_t>(-1);
    const bool is_owned = ::fchown(descriptor, status.st_uid, status.st_gid) == 0;
    const bool is_of_group = is_owned || ::fchown(descriptor, k_keep, status.st_gid) == 0;
    mode_t mode = status.st_mode & k_mode_bits;
    // Bits that lend the owner's rights are for the old owner's files only.
    if (!is_owned) mode &= ~static_cast<mode_t>(S_ISUID | S_ISGID);
    ::fchmod(descriptor, is_of_group ? mode : with_group_as_others(mode));
}

class posix_file_exchange : public file_exchange {
public:
    io_result open(const fs::path& path) override {
        const int descriptor = ::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY);
        if (descriptor < 0) return {-1, errno};
        struct stat status {};
        const int error = ::fstat(descriptor, &status) != 0 ? errno : S_ISDIR(status.st_mode) ? EISDIR : 0;
        if (error == 0) return {descriptor, 0};
        ::close(descriptor);
        return {-1, error};
    }

    replacement create_beside(const fs::path& given) override {
        replacement made;
        struct stat status {};
        const bool exists = ::stat(given.c_str(), &status) == 0;
        if (!exists && (errno != ENOENT || given.empty())) made.error = errno;
        if (exists) made.error = refusal(given, status);
        if (made.error != 0) return made;
        made.target = exists ? behind_links(given) : missing_behind_links(given);
        made.folder = folder_of(made.target);
        make_file(made, exists ? S_IRUSR | S_IWUSR : 0666);
        if (exists && made.error == 0) dress_like(made.descriptor, status);
        return made;
    }

    int replace(const fs::path& from, const fs::path& to) noexcept override {
        return ::rename(from.c_str(), to.c_str()) == 0 ? 0 : errno;
    }

    int remove(const fs::path& path) noexcept override { return ::unlink(path.c_str()) == 0 ? 0 : errno; }

    int commit_folder(const fs::path& folder) noexcept override {
        const int descriptor = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
        // A folder that may be written and not read has no flush either.
        if (descriptor < 0) return errno == EACCES ? 0 : errno;
        const int error = ::fsync(descriptor) == 0 ? 0 : errno;
        ::close(descriptor);
        return error == EINVAL || error == ENOTSUP ? 0 : error;
    }

private:
    static void make_file(replacement& made, mode_t mode) {
        for (int i = 0; i < k_most_names; ++i) {
            made.path = made.folder / new_name();
            made.descriptor =
                ::open(made.path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOFOLLOW, mode);
            if (made.descriptor >= 0) return;
            if (errno != EEXIST) break;
        }
        made.error = errno;
    }
};

}  // namespace

fs::path path_from_wide(const std::wstring& path) { return {utf8_from_wide(path)}; }

file_exchange& native_file_exchange() {
    static posix_file_exchange exchange;
    return exchange;
}

}  // namespace vrl_platform
