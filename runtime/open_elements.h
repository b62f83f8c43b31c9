#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "runtime/string_stack.h"

namespace qbxV2::detail {

/// The names of the elements that an iterative walk has open, so that no depth of input needs a deep call
/// stack.
class c_open_elements {
public:
    void push(const std::string& name) { m_offsets.push_back(m_names.push(name)); }
    void pop() {
        m_names.pop(m_offsets.back());
        m_offsets.pop_back();
    }
    bool empty() const { return m_offsets.empty(); }
    std::size_t size() const { return m_offsets.size(); }
    const char* top() const { return m_names.at(m_offsets.back()); }
    bool top_is(const std::string& name) const { return m_names.equals(m_offsets.back(), name); }

private:
    c_string_stack m_names;
    std::vector<std::size_t> m_offsets;
};

}  // namespace qbxV2::detail
