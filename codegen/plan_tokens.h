#pragma once

#include <map>
#include <string>
#include <vector>

namespace vrl_codegen {

/// One number for each XML name in each of its two roles, in order of first use.
class token_table {
public:
    std::string attribute(const std::string& name) { return add("a_" + name); }
    std::string element(const std::string& name) { return add("e_" + name); }
    const std::vector<std::string>& names() const { return m_names; }

private:
    std::string add(const std::string& token);

    std::map<std::string, bool> m_known;
    std::vector<std::string> m_names;
};

}  // namespace vrl_codegen
