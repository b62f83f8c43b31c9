#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>

#include "runtime/byte_source.h"

/// Byte sources for one input, each in heap blocks of exact size, where a sanitizer sees one byte too far.
namespace fuzz {

/// The input in a block of its own.
class exact_memory {
public:
    exact_memory(const std::uint8_t* data, std::size_t size);
    const char* data() const { return m_bytes.get(); }
    std::size_t size() const { return m_size; }

private:
    std::unique_ptr<char[]> m_bytes;
    std::size_t m_size;
};

/// A source as a caller would write one: nothing but `read` and `rewind`.
class one_byte_source : public qbxV2::c_read {
public:
    explicit one_byte_source(const exact_memory& bytes) : m_bytes(bytes) {}
    int read() override;
    void rewind() override { m_next = 0; }

private:
    const exact_memory& m_bytes;
    std::size_t m_next = 0;
};

/// A source that publishes runs of a few bytes, each in a block of its own, as a network buffer might.
class short_run_source : public qbxV2::c_read {
public:
    short_run_source(const exact_memory& bytes, std::size_t run_length)
        : m_bytes(bytes), m_run_length(run_length) {}
    int read() override;
    void rewind() override;
    bool fill_run() override;

private:
    const exact_memory& m_bytes;
    std::size_t m_run_length;
    std::size_t m_next = 0;
    std::unique_ptr<unsigned char[]> m_block;
};

}  // namespace fuzz
