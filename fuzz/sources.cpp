#include "fuzz/sources.h"

#include <algorithm>

namespace fuzz {

exact_memory::exact_memory(const std::uint8_t* data, std::size_t size)
    : m_bytes(new char[size]), m_size(size) {
    std::copy_n(data, size, m_bytes.get());
}

int one_byte_source::read() {
    return m_next == m_bytes.size() ? -1 : static_cast<unsigned char>(m_bytes.data()[m_next++]);
}

int short_run_source::read() { return m_run.next == m_run.end && !fill_run() ? -1 : *m_run.next++; }

void short_run_source::rewind() {
    m_next = 0;
    m_run = s_run();
}

bool short_run_source::fill_run() {
    const std::size_t size = std::min(m_run_length, m_bytes.size() - m_next);
    if (size == 0) return false;
    m_block.reset(new unsigned char[size]);
    std::copy_n(m_bytes.data() + m_next, size, m_block.get());
    m_next += size;
    m_run.begin = m_run.next = m_block.get();
    m_run.end = m_run.begin + size;
    return true;
}

}  // namespace fuzz
