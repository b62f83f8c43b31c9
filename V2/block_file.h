#pragma once

#include <string_view>

#include "zip/abstract_file.h"

namespace vrl_v2 {

/// Bytes in memory as the file of an archive that is only read. As in a file on disk one can seek beyond the
/// end, and there is nothing to read there: what a damaged archive points to is the same wherever it lies.
///
/// Failure   CZipException with EFBIG for positions above 32 bits, EINVAL for those before the begin, EBADF
///           for every attempt to change something.
class block_file : public CZipAbstractFile {
public:
    /// Borrows the bytes, 4 GB at most.
    explicit block_file(std::string_view bytes) : m_bytes(bytes) {}

    /// The file stays what it is.
    bool Open(const std::string& path, unsigned flags, bool throwOnError) override;
    void Close() override {}
    void Flush() override {}
    std::uint32_t GetPosition() const override { return m_position; }
    std::uint32_t Seek(std::int64_t offset, SeekOrigin origin) override;
    std::uint32_t GetLength() const override { return static_cast<std::uint32_t>(m_bytes.size()); }
    void SetLength(std::uint64_t length) override;
    std::string GetFilePath() const override { return {}; }
    std::uint32_t Read(void* buffer, std::uint32_t count) override;
    void Write(const void* buffer, std::uint32_t count) override;
    bool IsClosed() const override { return false; }

private:
    std::string_view m_bytes;
    std::uint32_t m_position = 0;
};

}  // namespace vrl_v2
