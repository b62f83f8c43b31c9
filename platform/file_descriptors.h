#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace vrl_platform {

/// What others may do with a file while it is open here. Advisory where the system knows no share modes:
/// it then holds between those who open files through this interface.
enum class share_mode { deny_all, deny_write, deny_read, deny_none };

enum class seek_origin { begin, current, end };

struct open_request {
    bool read = false;
    bool write = false;
    bool create = false;
    bool truncate = false;
    share_mode sharing = share_mode::deny_none;
};

/// The outcome of one operation. `error` is an errno value, 0 when nothing went wrong.
///
/// Shape    `value` is the descriptor, the count or the position asked for; -1 where there is none.
///          A transfer that broke off has both: the count that was moved and the error that ended it.
struct io_result {
    std::int64_t value = -1;
    int error = 0;
};

/// Files by descriptor: the calls that everything above makes, so that a test can stand in for the system.
///
/// Paths    narrow, in the system's 8-bit code page (UTF-8 on POSIX).
/// Failure  by value; nothing here throws.
/// Threads  calls on different descriptors are independent.
class file_descriptors {
public:
    file_descriptors() = default;
    file_descriptors(const file_descriptors&) = delete;
    file_descriptors& operator=(const file_descriptors&) = delete;
    virtual ~file_descriptors() = default;

    /// Opens a file, in binary mode, for owner, group and others as the process's mask lets it.
    /// EACCES when another opening denies the access; a folder is refused.
    virtual io_result open(const std::string& path, const open_request& request) = 0;
    virtual io_result close(int descriptor) = 0;

    /// Reads until `count` bytes are there, the file ends or an error comes.
    virtual io_result read(int descriptor, void* buffer, std::size_t count) = 0;
    /// Writes until `count` bytes are gone or an error comes.
    virtual io_result write(int descriptor, const void* buffer, std::size_t count) = 0;

    /// The new position from the begin of the file.
    virtual io_result seek(int descriptor, std::int64_t offset, seek_origin origin) = 0;
    virtual io_result resize(int descriptor, std::int64_t length) = 0;
    /// Returns when the file's bytes have reached the device.
    virtual io_result commit(int descriptor) = 0;

    /// Shows the first `length` bytes of a file opened for reading and writing as memory; changes go to
    /// the file. Null when that cannot be had.
    virtual void* map(int descriptor, std::size_t length) = 0;
    virtual void unmap(void* view, std::size_t length) = 0;
};

/// The system's own files. Lives as long as the process.
file_descriptors& native_file_descriptors();

}  // namespace vrl_platform
