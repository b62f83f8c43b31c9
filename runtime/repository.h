#pragma once

#include <cstddef>
#include <cstring>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

namespace qbxV2 {

/// How a repository keeps its values: plain values are copied.
template <class T>
class c_rep_ops {
public:
    static T store(T value) { return value; }
    static void release(T) {}
};

/// Text is kept as a private NUL-terminated copy.
template <>
class c_rep_ops<const char*> {
public:
    static const char* store(const char* value) {
        const std::size_t size = std::strlen(value) + 1;
        char* const copy = new char[size];
        std::memcpy(copy, value, size);
        return copy;
    }
    static void release(const char* value) { delete[] value; }
};

/// A list of pairs of a string key and a value, in order of insertion. Keys are compared as byte strings.
///
/// Adding a known key replaces its value in place. Look-up is linear while the list is short, which it nearly
/// always is; a long one gets an index, so that a document with very many names stays linear.
template <class T, class Ops = c_rep_ops<T>>
class c_repository {
public:
    c_repository() = default;
    c_repository(const c_repository&) = delete;
    c_repository& operator=(const c_repository&) = delete;

    virtual void clear() {
        for (const entry& e : m_entries) Ops::release(e.value);
        m_entries.clear();
        m_index.reset();
    }
    virtual ~c_repository() {
        for (const entry& e : m_entries) Ops::release(e.value);
    }

    bool empty() const { return m_entries.empty(); }
    std::size_t size() const { return m_entries.size(); }
    const char* key_at(std::size_t i) const { return m_entries[i].key.c_str(); }
    T value_at(std::size_t i) const { return m_entries[i].value; }

    bool find(const char* key, T* value) const { return find(key, std::strlen(key), value); }
    bool find(const char* key, std::size_t length, T* value) const {
        const std::size_t at = position(key, length);
        if (at == k_none) return false;
        *value = m_entries[at].value;
        return true;
    }

    void add(const char* key, T value) {
        const std::size_t at = position(key, std::strlen(key));
        const T stored = Ops::store(value);
        if (at != k_none) {
            Ops::release(m_entries[at].value);
            m_entries[at].value = stored;
            return;
        }
        m_entries.push_back(entry{key, stored});
        if (m_index) {
            m_index->emplace(key, m_entries.size() - 1);
        } else if (m_entries.size() > k_longest_unindexed) {
            build_index();
        }
    }

private:
    struct entry {
        std::string key;
        T value;
    };
    using index = std::unordered_map<std::string, std::size_t>;
    static constexpr std::size_t k_none = static_cast<std::size_t>(-1);
    static constexpr std::size_t k_longest_unindexed = 16;

    std::size_t position(const char* key, std::size_t length) const {
        if (m_index) {
            const auto found = m_index->find(std::string(key, length));
            return found == m_index->end() ? k_none : found->second;
        }
        for (std::size_t i = 0; i < m_entries.size(); ++i) {
            const std::string& candidate = m_entries[i].key;
            if (candidate.size() == length && std::memcmp(candidate.data(), key, length) == 0) return i;
        }
        return k_none;
    }

    void build_index() {
        m_index = std::make_unique<index>();
        for (std::size_t i = 0; i < m_entries.size(); ++i) m_index->emplace(m_entries[i].key, i);
    }

    std::vector<entry> m_entries;
    std::unique_ptr<index> m_index;
};

}  // namespace qbxV2
