#pragma once

#include <cstddef>

#include "zip/abstract_file.h"

/// A file in memory that grows by steps.
///
/// Failure  CZipException 505: no memory, a growth step of 0, a position before the begin or above 32 bits.
class CZipMemFile : public CZipAbstractFile {
public:
    explicit CZipMemFile(std::uint32_t growStep = 1024) : m_growStep(growStep) {}
    /// Works on a caller's block of `size` bytes, all of them data, as long as it need not grow: a block that
    /// must grow is copied first. `growStep` 0 forbids that.
    CZipMemFile(void* block, std::uint32_t size, std::uint32_t growStep);
    ~CZipMemFile() override { Free(); }

    /// Nothing is done: there is nothing to open.
    bool Open(const std::string& path, unsigned flags, bool throwOnError) override;
    void Close() override { Free(); }
    void Flush() override {}
    std::uint32_t GetPosition() const override { return m_position; }
    /// Beyond the data the block grows, and the data's length stays. An origin that is none changes nothing.
    std::uint32_t Seek(std::int64_t offset, SeekOrigin origin) override;
    std::uint32_t GetLength() const override { return m_length; }
    void SetLength(std::uint64_t length) override;
    std::string GetFilePath() const override { return {}; }
    std::uint32_t Read(void* buffer, std::uint32_t count) override;
    void Write(const void* buffer, std::uint32_t count) override;
    bool IsClosed() const override { return m_data == nullptr; }

    const std::uint8_t* GetData() const { return m_data; }
    std::uint32_t GetBufferSize() const { return m_bufferSize; }
    std::uint32_t GetGrowStep() const { return m_growStep; }
    bool OwnsData() const { return m_ownsData; }

private:
    void Free();
    void Grow(std::uint64_t size);

    std::uint32_t m_growStep;
    std::uint32_t m_position = 0;
    std::uint32_t m_bufferSize = 0;
    std::uint32_t m_length = 0;
    std::uint8_t* m_data = nullptr;
    bool m_ownsData = true;
};
