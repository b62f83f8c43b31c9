#pragma once

#include "platform/file_descriptors.h"
#include "zip/abstract_file.h"

/// A file on disk, by its descriptor.
///
/// Failure  CZipException with the errno of the failed call as its code, and the file's path. What lies above
///          32 bits is refused with EFBIG; a write that came out short without an errno is ENOSPC.
class CZipFile : public CZipAbstractFile {
public:
    static constexpr unsigned createNew =
        modeRead | modeWrite | shareDenyWrite | modeCreate;  ///< 39: a new archive
    static constexpr unsigned openExisting = modeRead | modeWrite | shareDenyWrite | modeNoTruncate;  ///< 71
    static constexpr unsigned openReadOnly = modeRead | shareDenyWrite | modeNoTruncate;              ///< 69
    static constexpr unsigned openSource = modeRead | shareDenyNone;     ///< 17: a file to be added
    static constexpr unsigned openMeasured = modeRead | shareDenyWrite;  ///< 5: a file whose size is wanted

    explicit CZipFile(vrl_platform::file_descriptors& files = vrl_platform::native_file_descriptors())
        : m_files(files) {}
    ~CZipFile() override { Abandon(); }

    bool Open(const std::string& path, unsigned flags, bool throwOnError) override;
    void Close() override;
    void Flush() override;
    std::uint32_t GetPosition() const override;
    std::uint32_t Seek(std::int64_t offset, SeekOrigin origin) override;
    std::uint32_t GetLength() const override;
    void SetLength(std::uint64_t length) override;
    std::string GetFilePath() const override { return m_path; }
    std::uint32_t Read(void* buffer, std::uint32_t count) override;
    void Write(const void* buffer, std::uint32_t count) override;
    bool IsClosed() const override { return m_descriptor == -1; }

    /// Closes without a word about failures.
    void Abandon() noexcept;

    /// -1 when closed.
    int GetDescriptor() const { return m_descriptor; }

private:
    std::uint32_t Position(std::int64_t offset, vrl_platform::seek_origin origin) const;

    vrl_platform::file_descriptors& m_files;
    int m_descriptor = -1;
    std::string m_path;
};
