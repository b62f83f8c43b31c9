#include "runtime/cracked_name.h"

#include <cstring>

namespace qbxV2 {

void c_cracked_name::set(c_xml_local* scope, const std::string& name) {
    m_full_name = name;
    const char* const begin = m_full_name.data();
    const void* const colon = std::memchr(begin, ':', m_full_name.size());
    m_has_prefix = colon != nullptr;
    const std::size_t prefix_size =
        m_has_prefix ? static_cast<std::size_t>(static_cast<const char*>(colon) - begin) : 0;
    m_local_at = m_has_prefix ? prefix_size + 1 : 0;
    m_ns_id = scope->find_namespace_id(begin, prefix_size);
    m_parts_made = false;
}

void c_cracked_name::make_parts() const {
    m_local_name.assign(m_full_name, m_local_at, std::string::npos);
    m_ns_prefix.assign(m_full_name, 0, m_has_prefix ? m_local_at - 1 : 0);
    m_parts_made = true;
}

const std::string& c_cracked_name::get_local_name() const {
    if (!m_parts_made) make_parts();
    return m_local_name;
}

const std::string& c_cracked_name::get_ns_prefix() const {
    if (!m_parts_made) make_parts();
    return m_ns_prefix;
}

}  // namespace qbxV2
