#pragma once

#include <cstddef>
#include <string>
#include <unordered_map>

#include "platform/api.h"
#include "runtime/repository.h"

namespace qbxV2 {

/// The ids of namespaces that have a meaning of their own. 1000 and up are handed out in order of first
/// sight.
enum : int {
    k_ns_not_found = 0,  ///< an undeclared prefix, or no default namespace in scope
    k_ns_none = 1,       ///< no namespace: `xmlns=""`, and every unprefixed attribute
    k_ns_xml = 2,        ///< the prefix "xml", which needs no declaration
    k_ns_xsi = 5,        ///< the XML Schema instance namespace
    k_ns_first_free = 1000
};

/// A row of the table of namespaces that a document format knows. A row with a null URI ends the table.
struct s_ns_map {
    int id;
    const char* prefix;
    const char* uri;
};

/// Namespace URIs and their ids, for one document.
class VRL_API c_enumerated_namespaces {
public:
    c_enumerated_namespaces() { clear(); }

    /// The id of `uri`; a new one gets the next free id.
    int add_namespace(const char* uri);
    /// Stores a new URI with this id. A known one keeps its old id. Either way the next free id becomes `id`
    /// + 1 when it is not above `id` already.
    void add_namespace(const char* uri, int id);
    /// The id, or 0.
    int find_namespace(const std::string& uri) const;
    /// The URI, or null. Valid until the table changes.
    const char* find_namespace_from_id(int id) const;
    /// Back to the two namespaces that every document knows, with 1000 as next free id.
    void clear();

private:
    void store(const char* uri, int id);

    int m_next_id = k_ns_first_free;
    c_repository<int> m_ids;
    std::unordered_map<int, std::size_t> m_first_with_id;
};

/// One scope of prefix declarations, mostly that of one open element. A child finds what its parents declare.
///
/// A parent must outlive its children. A scope without declarations allocates nothing, and costs a look-up
/// nothing.
class VRL_API c_xml_local {
public:
    c_xml_local() = default;
    /// Makes a child of `parent`, not a copy of it.
    c_xml_local(const c_xml_local& parent) : m_parent(&parent), m_effective(parent.m_effective) {}
    c_xml_local& operator=(const c_xml_local&) = delete;

    /// Adds or replaces a prefix of this scope; the empty one is that of the default namespace.
    void add_namespace(const char* prefix, int id);
    /// Removes this scope's own declarations.
    void clear() {
        if (!m_ids.empty()) m_ids.clear();
    }
    /// The id of the innermost declaration of `prefix`, or 0. "xml" is always 2.
    int find_namespace_id(const std::string& prefix) const {
        return find_namespace_id(prefix.data(), prefix.size());
    }
    int find_namespace_id(const char* prefix, std::size_t length) const;
    /// The innermost prefix declared for `id`, or null. Id 2 gives "xml". Valid until the scope changes.
    const char* find_namespace_prefix(int id) const;
    /// The outermost one.
    const char* find_first_namespace_prefix(int id) const;

private:
    const c_xml_local* outer() const { return m_parent != nullptr ? m_parent->m_effective : nullptr; }
    const char* find_own_prefix(int id) const;

    const c_xml_local* m_parent = nullptr;
    const c_xml_local* m_effective = nullptr;
    c_repository<int> m_ids;
};

}  // namespace qbxV2
