#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"
#include "runtime/namespaces.h"

namespace qbxV2 {

/// A qualified name, cut at its first colon, with the id of its namespace.
///
/// The parts are found at once; the strings of local name and prefix are made when first asked for.
/// References that the accessors return are valid until the next `set`.
class VRL_API c_cracked_name {
public:
    c_cracked_name() = default;
    c_cracked_name(c_xml_local* scope, const std::string& name) { set(scope, name); }

    /// Cuts up `name`; its prefix, or the default namespace, is looked up from `scope`.
    void set(c_xml_local* scope, const std::string& name);

    const std::string& get_full_name() const { return m_full_name; }
    bool get_has_ns_prefix() const { return m_has_prefix; }
    /// The id of the prefix, or of the default namespace; 0 when there is none.
    int get_ns_id() const { return m_ns_id; }
    /// The id that the name has as an element's: 1 where an unprefixed name meets no default namespace.
    int get_element_ns_id() const { return m_ns_id != k_ns_not_found || m_has_prefix ? m_ns_id : k_ns_none; }
    const std::string& get_local_name() const;
    const std::string& get_ns_prefix() const;

    /// The local name where it stands in the full name.
    const char* local_name_data() const { return m_full_name.data() + m_local_at; }
    std::size_t local_name_size() const { return m_full_name.size() - m_local_at; }

private:
    std::string m_full_name;
    std::size_t m_local_at = 0;
    int m_ns_id = k_ns_not_found;
    bool m_has_prefix = false;
    mutable bool m_parts_made = true;
    mutable std::string m_local_name;
    mutable std::string m_ns_prefix;

    void make_parts() const;
};

}  // namespace qbxV2
