#include "runtime/namespaces.h"

#include <climits>
#include <cstring>

namespace qbxV2 {
namespace {

constexpr char k_xsi_uri[] = "http://www.w3.org/2001/XMLSchema-instance";
constexpr char k_xml_uri[] = "http://www.w3.org/XML/1998/namespace";
constexpr char k_xml_prefix[] = "xml";

}  // namespace

int c_enumerated_namespaces::add_namespace(const char* uri) {
    int id = k_ns_not_found;
    if (m_ids.find(uri, &id)) return id;
    id = m_next_id;
    if (m_next_id < INT_MAX) ++m_next_id;
    store(uri, id);
    return id;
}

void c_enumerated_namespaces::add_namespace(const char* uri, int id) {
    int known = k_ns_not_found;
    if (!m_ids.find(uri, &known)) store(uri, id);
    if (id >= m_next_id && id < INT_MAX) m_next_id = id + 1;
}

int c_enumerated_namespaces::find_namespace(const std::string& uri) const {
    int id = k_ns_not_found;
    m_ids.find(uri.c_str(), &id);
    return id;
}

const char* c_enumerated_namespaces::find_namespace_from_id(int id) const {
    const auto found = m_first_with_id.find(id);
    return found == m_first_with_id.end() ? nullptr : m_ids.key_at(found->second);
}

void c_enumerated_namespaces::store(const char* uri, int id) {
    m_first_with_id.emplace(id, m_ids.size());
    m_ids.add(uri, id);
}

void c_enumerated_namespaces::clear() {
    m_ids.clear();
    m_first_with_id.clear();
    m_next_id = k_ns_first_free;
    store(k_xsi_uri, k_ns_xsi);
    store(k_xml_uri, k_ns_xml);
}

void c_xml_local::add_namespace(const char* prefix, int id) {
    m_ids.add(prefix, id);
    m_effective = this;
}

int c_xml_local::find_namespace_id(const char* prefix, std::size_t length) const {
    if (length == 3 && std::memcmp(prefix, k_xml_prefix, 3) == 0) return k_ns_xml;
    for (const c_xml_local* scope = m_effective; scope != nullptr; scope = scope->outer()) {
        int id = k_ns_not_found;
        if (scope->m_ids.find(prefix, length, &id)) return id;
    }
    return k_ns_not_found;
}

const char* c_xml_local::find_own_prefix(int id) const {
    for (std::size_t i = 0; i < m_ids.size(); ++i) {
        if (m_ids.value_at(i) == id) return m_ids.key_at(i);
    }
    return nullptr;
}

const char* c_xml_local::find_namespace_prefix(int id) const {
    if (id == k_ns_xml) return k_xml_prefix;
    for (const c_xml_local* scope = m_effective; scope != nullptr; scope = scope->outer()) {
        if (const char* const prefix = scope->find_own_prefix(id)) return prefix;
    }
    return nullptr;
}

const char* c_xml_local::find_first_namespace_prefix(int id) const {
    if (id == k_ns_xml) return k_xml_prefix;
    const char* outermost = nullptr;
    for (const c_xml_local* scope = m_effective; scope != nullptr; scope = scope->outer()) {
        if (const char* const prefix = scope->find_own_prefix(id)) outermost = prefix;
    }
    return outermost;
}

}  // namespace qbxV2
