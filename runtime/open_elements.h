#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace qbxV2::detail {

/// The names of the elements that an iterative walk has open, so that no depth of input needs a deep call
/// stack. Names are compared whole: one that holds a NUL is a name like any other.
class c_open_elements {
public:
    void push(const std::string& name) {
        m_starts.push_back(m_names.size());
        m_names += name;
    }
    void pop() {
        m_names.resize(m_starts.back());
        m_starts.pop_back();
    }
    bool empty() const { return m_starts.empty(); }
    std::size_t size() const { return m_starts.size(); }
    std::string top() const { return m_names.substr(m_starts.back()); }
    bool top_is(const std::string& name) const {
        return m_names.compare(m_starts.back(), std::string::npos, name) == 0;
    }

private:
    std::string m_names;
    std::vector<std::size_t> m_starts;
};

}  // namespace qbxV2::detail
