#pragma once

#include "platform/file_descriptors.h"
#include "zip/abstract_file.h"

namespace vrl_v2 {

/// A file that is open already, as the ZIP engine wants to see it. Borrows the descriptor.
///
/// Failure   CZipException with the errno of the call; EFBIG for positions above 32 bits. Some errno values
///           are codes of the engine, too (EDQUOT is 122 on Linux): `call_error` is never in doubt.
class descriptor_file : public CZipAbstractFile {
public:
    descriptor_file(vrl_platform::file_descriptors& files, int descriptor)
        : m_files(files), m_descriptor(descriptor) {}

    /// The file stays what it is.
    bool Open(const std::string& path, unsigned flags, bool throwOnError) override;
    void Close() override {}
    /// Nothing is held back here; whether the disk has it is the owner's business.
    void Flush() override {}
    std::uint32_t GetPosition() const override;
    std::uint32_t Seek(std::int64_t offset, SeekOrigin origin) override;
    std::uint32_t GetLength() const override;
    void SetLength(std::uint64_t length) override;
    std::string GetFilePath() const override { return {}; }
    std::uint32_t Read(void* buffer, std::uint32_t count) override;
    void Write(const void* buffer, std::uint32_t count) override;
    bool IsClosed() const override { return false; }

    /// The errno of the first call of the system that failed; 0 when none did.
    int call_error() const { return m_call_error; }

private:
    [[noreturn]] void raise_call(int error) const;
    std::uint32_t move(std::int64_t offset, vrl_platform::seek_origin origin) const;

    vrl_platform::file_descriptors& m_files;
    int m_descriptor;
    mutable int m_call_error = 0;
};

}  // namespace vrl_v2
