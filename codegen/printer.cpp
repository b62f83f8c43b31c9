#include "codegen/printer.h"

#include <stdexcept>

#include "codegen/layout.h"

namespace vrl_codegen {
namespace {

const std::string* find(const printer::values& holes, const std::string& name) {
    for (const auto& [hole, value] : holes) {
        if (hole == name) return &value;
    }
    return nullptr;
}

}  // namespace

const std::string& printer::value_of(const std::string& name, const values& holes) const {
    if (const std::string* value = find(holes, name)) return *value;
    for (auto scope = m_scopes.rbegin(); scope != m_scopes.rend(); ++scope) {
        if (const std::string* value = find(*scope, name)) return *value;
    }
    throw std::logic_error("a template names the hole '" + name + "', which nobody fills");
}

void printer::print(const std::string& text, const values& holes) {
    std::size_t done = 0;
    while (true) {
        const std::size_t open = text.find('$', done);
        m_text.append(text, done, open - done);
        if (open == std::string::npos) return;
        const std::size_t close = text.find('$', open + 1);
        if (close == std::string::npos) throw std::logic_error("a hole is not closed: " + text.substr(open));
        const std::string name = text.substr(open + 1, close - open - 1);
        m_text += name.empty() ? std::string("$") : value_of(name, holes);
        done = close + 1;
    }
}

std::string printer::text() const { return lay_out(m_text); }

}  // namespace vrl_codegen
