#pragma once

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "runtime/byte_source.h"
#include "runtime/error.h"

/// Every way that bytes can take into the reader, so that one input can be read on all of them and the
/// outcomes compared. All sources hold their bytes in heap blocks of exact size, where a sanitizer sees one
/// byte too far.
namespace reading_paths {

/// A source as a caller would write one: nothing but `read` and `rewind`.
class ReadOnlySource : public qbxV2::c_read {
public:
    explicit ReadOnlySource(const std::string& bytes);
    int read() override;
    void rewind() override { m_next = 0; }

private:
    std::unique_ptr<unsigned char[]> m_bytes;
    std::size_t m_size;
    std::size_t m_next = 0;
};

/// A source that publishes its bytes in runs of a fixed length, each in a block of its own.
class ChunkSource : public qbxV2::c_read {
public:
    ChunkSource(const std::string& bytes, std::size_t run_length)
        : m_bytes(bytes), m_run_length(run_length) {}
    int read() override;
    void rewind() override;
    bool fill_run() override;

private:
    std::string m_bytes;
    std::size_t m_run_length;
    std::size_t m_next = 0;
    std::unique_ptr<unsigned char[]> m_chunk;
};

/// Memory of exact size under a `c_read_memory`.
class ExactMemory {
public:
    explicit ExactMemory(const std::string& bytes);
    qbxV2::c_read_memory source() const { return {m_bytes.get(), m_size}; }
    const char* data() const { return m_bytes.get(); }
    std::size_t size() const { return m_size; }

private:
    std::unique_ptr<char[]> m_bytes;
    std::size_t m_size;
};

/// Writes every report down as " !type/code@line: message".
class RecordingErrors : public qbxV2::c_error {
public:
    explicit RecordingErrors(std::string* log) : m_log(log) {}
    void report_error(qbxV2::eqbx_error_type type, qbxV2::eqbx_error code, const char* source_id, int line,
                      const char* message) override;

private:
    std::string* m_log;
};

/// Reads from `source`, with runs or without, and tells what it met.
using Walk = std::function<std::string(qbxV2::c_read& source, bool use_runs)>;

/// The outcome of `walk` on `bytes`, after checking that it is the same on every path.
std::string on_all_paths(const std::string& bytes, const Walk& walk);

/// Numbers that are the same on every machine and in every run.
class Random {
public:
    explicit Random(unsigned long long seed) : m_state(seed * 2654435761U + 1) {}
    /// From 0 to `limit` - 1.
    std::size_t below(std::size_t limit);

private:
    unsigned long long m_state;
};

/// The parts in one text.
std::string join(std::initializer_list<std::string_view> parts);

/// The text with the bytes that cannot be printed as \xNN.
std::string printable(const std::string& text);

}  // namespace reading_paths
