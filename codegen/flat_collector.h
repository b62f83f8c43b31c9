#pragma once

#include <string>
#include <utility>
#include <vector>

#include "codegen/flat_functions.h"
#include "codegen/printer.h"

namespace vrl_codegen {

/// Collects the functions of one class, from templates with the class as $C$.
class flat_collector {
public:
    explicit flat_collector(printer::values holes) : m_holes(std::move(holes)) {}

    void add(const std::string& family, const std::string& name, const std::string& result,
             const std::string& parameters, const std::string& body, const printer::values& holes = {}) {
        m_functions.push_back(
            {family, fill("CSharp_" + name, holes), result, fill(parameters, holes), fill(body, holes)});
    }
    /// A call of one member function on the object `o` of class $C$.
    void call(const std::string& family, const std::string& name, const std::string& result,
              const std::string& more_parameters, const std::string& expression,
              const printer::values& holes = {}) {
        add(family, name, result, "void* self" + more_parameters,
            "call<$C$>(self, [&]($C$& o) -> decltype(auto) { return " + expression + "; })", holes);
    }

    std::vector<flat_function> take() { return std::move(m_functions); }

private:
    std::string fill(const std::string& text, const printer::values& holes) const {
        printer out;
        const printer_scope scope(out, m_holes);
        out.print(text, holes);
        return out.fragment();
    }

    printer::values m_holes;
    std::vector<flat_function> m_functions;
};

}  // namespace vrl_codegen
