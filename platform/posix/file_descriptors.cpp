#include "platform/file_descriptors.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace vrl_platform {
namespace {

// Linux moves at most 0x7FFFF000 bytes in one call, other systems fail above INT_MAX.
constexpr std::size_t k_largest_transfer = 0x40000000;

io_result failure() { return {-1, errno}; }

io_result outcome(std::int64_t value) { return value < 0 ? failure() : io_result{value, 0}; }

int open_flags(const open_request& request) {
    // Without O_NONBLOCK the opening of a named pipe would wait for somebody at its other end.
    int flags = O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
    if (request.read && request.write)
        flags |= O_RDWR;
    else if (request.write)
        flags |= O_WRONLY;
    else
        flags |= O_RDONLY;
    if (request.create) flags |= O_CREAT;
    return flags;
}

// A writer that lets nobody else write, and whoever lets nobody read, is alone; readers that
// let nobody write stand each other.
int lock_operation(const open_request& request) {
    switch (request.sharing) {
        case share_mode::deny_none:
            return 0;
        case share_mode::deny_write:
            return request.write ? LOCK_EX : LOCK_SH;
        case share_mode::deny_read:
        case share_mode::deny_all:
            break;
    }
    return LOCK_EX;
}

int refusal(int descriptor, const open_request& request) {
    struct stat status {};
    if (::fstat(descriptor, &status) != 0) return errno;
    if (S_ISDIR(status.st_mode)) return EISDIR;
    const int lock = lock_operation(request);
    // File systems without locks share everything; only a lock that another one holds refuses.
    if (lock != 0 && ::flock(descriptor, lock | LOCK_NB) != 0 && errno == EWOULDBLOCK) return EACCES;
    // Only now: a file that somebody else holds is not emptied.
    if (request.truncate && ::ftruncate(descriptor, 0) != 0) return errno;
    return 0;
}

class posix_file_descriptors : public file_descriptors {
public:
    io_result open(const std::string& path, const open_request& request) override {
        const int descriptor = ::open(path.c_str(), open_flags(request), 0666);
        if (descriptor < 0) return failure();
        const int error = refusal(descriptor, request);
        if (error == 0) return {descriptor, 0};
        ::close(descriptor);
        return {-1, error};
    }

    io_result close(int descriptor) override { return outcome(::close(descriptor)); }

    io_result read(int descriptor, void* buffer, std::size_t count) override {
        std::size_t done = 0;
        while (done < count) {
            const ssize_t got = ::read(descriptor, static_cast<char*>(buffer) + done,
                                       std::min(count - done, k_largest_transfer));
            if (got == 0) break;
            if (got < 0 && errno == EINTR) continue;
            if (got < 0) return {static_cast<std::int64_t>(done), errno};
            done += static_cast<std::size_t>(got);
        }
        return {static_cast<std::int64_t>(done), 0};
    }

    io_result write(int descriptor, const void* buffer, std::size_t count) override {
        std::size_t done = 0;
        while (done < count) {
            const ssize_t put = ::write(descriptor, static_cast<const char*>(buffer) + done,
                                        std::min(count - done, k_largest_transfer));
            if (put < 0 && errno == EINTR) continue;
            if (put < 0) return {static_cast<std::int64_t>(done), errno};
            done += static_cast<std::size_t>(put);
        }
        return {static_cast<std::int64_t>(done), 0};
    }

    io_result seek(int descriptor, std::int64_t offset, seek_origin origin) override {
        const int whence = origin == seek_origin::begin     ? SEEK_SET
                           : origin == seek_origin::current ? SEEK_CUR
                                                            : SEEK_END;
        return outcome(::lseek(descriptor, static_cast<off_t>(offset), whence));
    }

    io_result resize(int descriptor, std::int64_t length) override {
        return outcome(::ftruncate(descriptor, static_cast<off_t>(length)));
    }

    io_result commit(int descriptor) override { return outcome(::fsync(descriptor)); }

    void* map(int descriptor, std::size_t length) override {
        void* view = ::mmap(nullptr, length, PROT_READ | PROT_WRITE, MAP_SHARED, descriptor, 0);
        return view == MAP_FAILED ? nullptr : view;
    }

    void unmap(void* view, std::size_t length) override { ::munmap(view, length); }
};

}  // namespace

file_descriptors& native_file_descriptors() {
    static posix_file_descriptors files;
    return files;
}

}  // namespace vrl_platform
