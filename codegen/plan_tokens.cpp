#include "codegen/plan_tokens.h"

namespace vrl_codegen {

std::string token_table::add(const std::string& token) {
    if (m_known.emplace(token, true).second) m_names.push_back(token);
    return token;
}

}  // namespace vrl_codegen
