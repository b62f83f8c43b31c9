#include "runtime/attribute_buffer.h"

namespace qbxV2 {

std::size_t c_attribute_buffer::behind_text(std::size_t position) const {
    const std::size_t nul = m_bytes.find('\0', position);
    return nul == std::string::npos ? m_bytes.size() : nul + 1;
}

int c_entity_name_reader_for_attribute_data::get() {
    const unsigned char c = m_buffer.current();
    if (c == 0) return -1;
    m_buffer.advance();
    return c;
}

void c_entity_name_reader_for_attribute_data::unget(int c) {
    if (c != -1 && m_buffer.position() != 0) m_buffer.set_position(m_buffer.position() - 1);
}

}  // namespace qbxV2
