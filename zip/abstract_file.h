#pragma once

#include <cstdint>
#include <string>

/// A file of bytes, wherever it lies.
///
/// Failure  CZipException, from every operation that says so.
/// Range    positions and lengths are those that an archive can hold: what lies above 32 bits is refused.
class CZipAbstractFile {
public:
    /// How a file is opened, as a bit mask.
    enum OpenFlags : unsigned {
        modeRead = 1,
        modeWrite = 2,
        shareDenyWrite = 4,
        shareDenyRead = 8,
        shareDenyNone = 16,
        modeCreate = 32,
        modeNoTruncate = 64,
    };
    enum SeekOrigin : int { begin = 0, current = 1, end = 2 };

    CZipAbstractFile() = default;
    CZipAbstractFile(const CZipAbstractFile&) = delete;
    CZipAbstractFile& operator=(const CZipAbstractFile&) = delete;

    /// An open file is closed first. On failure raises if `throwOnError`, else false.
    virtual bool Open(const std::string& path, unsigned flags, bool throwOnError) = 0;
    virtual void Close() = 0;
    virtual void Flush() = 0;
    virtual std::uint32_t GetPosition() const = 0;
    /// Gives the new position.
    virtual std::uint32_t Seek(std::int64_t offset, SeekOrigin origin) = 0;
    virtual std::uint32_t GetLength() const = 0;
    virtual void SetLength(std::uint64_t length) = 0;
    virtual std::uint32_t SeekToBegin() { return Seek(0, begin); }
    virtual std::uint32_t SeekToEnd() { return Seek(0, end); }
    virtual std::string GetFilePath() const = 0;
    /// Gives the number of bytes read; fewer than `count` at the end of the file.
    virtual std::uint32_t Read(void* buffer, std::uint32_t count) = 0;
    virtual void Write(const void* buffer, std::uint32_t count) = 0;
    virtual bool IsClosed() const = 0;
    virtual ~CZipAbstractFile() = default;
};
