#include "codegen/plan_tokens.h"

namespace vrl_codegen {

std::string token_table::add(const std::string& name) {
    if (m_known.insert(name).second) {
        m_tokens.push_back({name, k_first_token + static_cast<unsigned>(m_tokens.size())});
    }
    return name;
}

}  // namespace vrl_codegen
