#pragma once

#include <cstdint>

/// A block of bytes that owns its storage. Copies are deep.
class CZipAutoBuffer {
public:
    CZipAutoBuffer() = default;
    explicit CZipAutoBuffer(std::uint32_t size, bool zero = false) { Allocate(size, zero); }
    CZipAutoBuffer(const CZipAutoBuffer& other);
    CZipAutoBuffer(CZipAutoBuffer&& other) noexcept;
    CZipAutoBuffer& operator=(const CZipAutoBuffer& other);
    CZipAutoBuffer& operator=(CZipAutoBuffer&& other) noexcept;
    virtual ~CZipAutoBuffer() { Release(); }

    /// Gives the block another size. Its bytes are lost and not set, or zero when asked for.
    ///
    /// A block that has this size already stays as it is (zeroed when asked for). Otherwise the old storage
    /// is gone before the new is asked for: std::bad_alloc leaves an empty block. Size 0 leaves a null
    /// pointer.
    std::uint8_t* Allocate(std::uint32_t size, bool zero = false);
    void Release();

    /// Takes over a copy of these bytes.
    void Assign(const void* bytes, std::uint32_t size);

    std::uint8_t* GetBuffer() { return m_data; }
    const std::uint8_t* GetBuffer() const { return m_data; }
    std::uint32_t GetSize() const { return m_size; }
    bool IsAllocated() const { return m_data != nullptr; }

private:
    std::uint8_t* m_data = nullptr;
    std::uint32_t m_size = 0;
};
