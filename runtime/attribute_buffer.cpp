#include "runtime/attribute_buffer.h"

namespace qbxV2 {

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
