#pragma once

#include <cstddef>
#include <cstring>
#include <string>

namespace qbxV2 {

/// The names of open elements, NUL-terminated one behind the other in one block. Grown and cut by
/// `c_string_stack_node`.
class c_string_stack {
public:
    /// The size in bytes, NULs included.
    std::size_t get_stack_size() const { return m_bytes.size(); }
    /// The number of names.
    unsigned count() const { return m_count; }

    /// Appends a name and gives its offset.
    std::size_t push(const std::string& name) {
        const std::size_t offset = m_bytes.size();
        m_bytes.append(name.c_str(), std::strlen(name.c_str()) + 1);
        ++m_count;
        return offset;
    }
    /// Cuts the last name, which stands at `offset`.
    void pop(std::size_t offset) {
        m_bytes.resize(offset);
        --m_count;
    }
    /// The name at `offset`, valid until the stack changes.
    const char* at(std::size_t offset) const { return m_bytes.data() + offset; }
    /// Whether the name at `offset` is `text`.
    bool equals(std::size_t offset, const std::string& text) const {
        return std::strlen(at(offset)) == text.size() &&
               std::memcmp(at(offset), text.data(), text.size()) == 0;
    }

private:
    std::string m_bytes;
    unsigned m_count = 0;
};

/// Scope guard for one name on the stack. Nodes end in the reverse order of their beginning.
class c_string_stack_node {
public:
    c_string_stack_node(c_string_stack& stack, const std::string& name)
        : m_stack(stack), m_offset(stack.push(name)) {}
    c_string_stack_node(const c_string_stack_node&) = delete;
    c_string_stack_node& operator=(const c_string_stack_node&) = delete;
    ~c_string_stack_node() { m_stack.pop(m_offset); }

    /// The name, valid until the stack changes.
    const char* get_str() const { return m_stack.at(m_offset); }
    bool operator==(const std::string& text) const { return m_stack.equals(m_offset, text); }
    bool operator!=(const std::string& text) const { return !(*this == text); }

private:
    c_string_stack& m_stack;
    std::size_t m_offset;
};

}  // namespace qbxV2
