#include "platform/file_names.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>

namespace vrl_platform {
namespace {

constexpr mode_t k_all_read = S_IRUSR | S_IRGRP | S_IROTH;
constexpr mode_t k_all_write = S_IWUSR | S_IWGRP | S_IWOTH;

mode_t with_access(mode_t mode, bool granted, mode_t owner, mode_t all) {
    return granted ? (mode | owner) : (mode & ~all);
}

class posix_file_names : public file_names {
public:
    std::optional<unsigned> attributes(const std::string& path) override {
        struct stat status {};
        if (::stat(path.c_str(), &status) != 0) return std::nullopt;
        unsigned bits = 0;
        if (S_ISDIR(status.st_mode))
            bits |= file_attribute::folder;
        else if ((status.st_mode & S_IXUSR) == 0)
            bits |= file_attribute::archive;
        if ((status.st_mode & S_IWUSR) == 0) bits |= file_attribute::read_only;
        if ((status.st_mode & S_IRUSR) == 0) bits |= file_attribute::hidden;
        return bits;
    }

    bool set_attributes(const std::string& path, unsigned bits) override {
        struct stat status {};
        if (::stat(path.c_str(), &status) != 0) return false;
        mode_t mode = status.st_mode & 07777;
        mode = with_access(mode, (bits & file_attribute::read_only) == 0, S_IWUSR, k_all_write);
        mode = with_access(mode, (bits & file_attribute::hidden) == 0, S_IRUSR, k_all_read);
        return ::chmod(path.c_str(), mode) == 0;
    }

    std::optional<std::int64_t> modification_time(const std::string& path) override {
        struct stat status {};
        if (::stat(path.c_str(), &status) != 0) return std::nullopt;
        return static_cast<std::int64_t>(status.st_mtime);
    }

    bool set_modification_time(const std::string& path, std::int64_t time) override {
        timespec times[2] = {};
        times[0].tv_nsec = UTIME_OMIT;
        times[1].tv_sec = static_cast<time_t>(time);
        return ::utimensat(AT_FDCWD, path.c_str(), times, 0) == 0;
    }

    existence exists(const std::string& path) override {
        struct stat status {};
        if (::stat(path.c_str(), &status) != 0) return existence::absent;
        return S_ISDIR(status.st_mode) ? existence::folder : existence::file;
    }

    bool is_enterable_folder(const std::string& path) override {
        return exists(path) == existence::folder && ::access(path.c_str(), X_OK) == 0;
    }

    bool remove(const std::string& path) override { return ::unlink(path.c_str()) == 0; }

    bool rename(const std::string& from, const std::string& to) override {
        struct stat status {};
        if (::lstat(to.c_str(), &status) == 0) return false;
        return ::rename(from.c_str(), to.c_str()) == 0;
    }

    std::string temporary_folder() override {
        const char* named = std::getenv("TMPDIR");
        std::string folder = named != nullptr && *named != '\0' ? named : "/tmp";
        while (folder.size() > 1 && folder.back() == '/') folder.pop_back();
        return folder;
    }

    std::optional<std::string> make_temporary_file(const std::string& folder,
                                                   const std::string& prefix) override {
        // The six X are what mkstemp puts a name of its own in place of.
        std::string path = folder + "/" + prefix + "XXXXXX";
        const int descriptor = ::mkstemp(path.data());
        if (descriptor < 0) return std::nullopt;
        ::close(descriptor);
        return path;
    }
};

}  // namespace

file_names& native_file_names() {
    static posix_file_names names;
    return names;
}

char path_separator() { return '/'; }

}  // namespace vrl_platform
