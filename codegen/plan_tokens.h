#pragma once

#include <set>
#include <string>
#include <vector>

#include "codegen/class_plan.h"

namespace vrl_codegen {

/// The runtime's own tokens end below this number.
inline constexpr unsigned k_first_token = 14;

/// One number for each XML name in each of its two roles, in order of first use.
class token_table {
public:
    std::string attribute(const std::string& name) { return add("a_" + name); }
    std::string element(const std::string& name) { return add("e_" + name); }
    const std::vector<token_plan>& tokens() const { return m_tokens; }

private:
    std::string add(const std::string& name);

    std::set<std::string> m_known;
    std::vector<token_plan> m_tokens;
};

}  // namespace vrl_codegen
