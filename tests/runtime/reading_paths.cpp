#include "reading_paths.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>

namespace reading_paths {

ReadOnlySource::ReadOnlySource(const std::string& bytes)
    : m_bytes(new unsigned char[bytes.size()]), m_size(bytes.size()) {
    std::memcpy(m_bytes.get(), bytes.data(), bytes.size());
}

int ReadOnlySource::read() { return m_next == m_size ? -1 : m_bytes[m_next++]; }

int ChunkSource::read() { return m_run.next == m_run.end && !fill_run() ? -1 : *m_run.next++; }

void ChunkSource::rewind() {
    m_next = 0;
    m_run = s_run();
}

bool ChunkSource::fill_run() {
    const std::size_t size = std::min(m_run_length, m_bytes.size() - m_next);
    if (size == 0) return false;
    m_chunk.reset(new unsigned char[size]);
    std::memcpy(m_chunk.get(), m_bytes.data() + m_next, size);
    m_next += size;
    m_run.begin = m_run.next = m_chunk.get();
    m_run.end = m_run.begin + size;
    return true;
}

ExactMemory::ExactMemory(const std::string& bytes) : m_bytes(new char[bytes.size()]), m_size(bytes.size()) {
    std::memcpy(m_bytes.get(), bytes.data(), bytes.size());
}

void RecordingErrors::report_error(qbxV2::eqbx_error_type type, qbxV2::eqbx_error code, const char*, int line,
                                   const char* message) {
    *m_log += join({" !", std::to_string(type), "/", std::to_string(code), "@", std::to_string(line), ": ",
                    printable(message)});
}

std::string on_all_paths(const std::string& bytes, const Walk& walk) {
    ReadOnlySource read_only(bytes);
    std::string expected = walk(read_only, true);
    const auto compare = [&](const std::string& path, const std::string& outcome) {
        EXPECT_EQ(outcome, expected) << "read " << path << ", against byte by byte: " << printable(bytes);
    };
    const ExactMemory memory(bytes);
    qbxV2::c_read_memory with_runs = memory.source();
    compare("from memory with runs", walk(with_runs, true));
    qbxV2::c_read_memory without_runs = memory.source();
    compare("from memory without runs", walk(without_runs, false));
    for (const std::size_t length : {1U, 2U, 3U, 7U}) {
        ChunkSource chunks(bytes, length);
        compare(join({"in runs of ", std::to_string(length)}), walk(chunks, true));
    }
    return expected;
}

std::size_t Random::below(std::size_t limit) {
    // Knuth's MMIX constants.
    m_state = m_state * 6364136223846793005ULL + 1442695040888963407ULL;
    return static_cast<std::size_t>(m_state >> 33) % limit;
}

std::string join(std::initializer_list<std::string_view> parts) {
    std::string all;
    for (const std::string_view part : parts) all.append(part);
    return all;
}

std::string printable(const std::string& text) {
    static const char k_hex[] = "0123456789ABCDEF";
    std::string out;
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte >= 0x20 && byte < 0x7F) {
            out += c;
        } else {
            out += "\\x";
            out += k_hex[byte >> 4];
            out += k_hex[byte & 15];
        }
    }
    return out;
}

}  // namespace reading_paths
