#include "runtime/list_tokeniser.h"

#include "runtime/character_class.h"

namespace qbxV2 {
namespace {

bool is_space_at(const std::string& s, std::size_t i) {
    return detail::byte_is(static_cast<unsigned char>(s[i]), detail::cc_space);
}

}  // namespace

void c_xml_list_tokeniser::set(const std::string& value) {
    m_value = value;
    m_cursor = 0;
}

bool c_xml_list_tokeniser::get(std::string* item) {
    while (m_cursor < m_value.size() && is_space_at(m_value, m_cursor)) ++m_cursor;
    if (m_cursor == m_value.size()) return false;
    const std::size_t start = m_cursor;
    while (m_cursor < m_value.size() && !is_space_at(m_value, m_cursor)) ++m_cursor;
    item->assign(m_value, start, m_cursor - start);
    return true;
}

}  // namespace qbxV2
