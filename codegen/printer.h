#pragma once

#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

namespace vrl_codegen {

/// Prints templates with named holes: "$name$" becomes the value of `name`, "$$" a dollar sign.
class printer {
public:
    using values = std::vector<std::pair<std::string, std::string>>;

    /// The holes that every later template may name. Inner scopes hide outer ones.
    void push(values scope) { m_scopes.push_back(std::move(scope)); }
    void pop() { m_scopes.pop_back(); }

    /// Throws `std::logic_error` for a hole that nobody fills: a misspelt name must not end in the output.
    void print(const std::string& text, const values& holes = {});

    /// What was printed, laid out.
    std::string text() const;
    /// What was printed as it stands: a part of a larger text.
    const std::string& fragment() const { return m_text; }

private:
    const std::string& value_of(const std::string& name, const values& holes) const;

    std::vector<values> m_scopes;
    std::string m_text;
};

/// Fills holes for as long as it lives.
class printer_scope {
public:
    printer_scope(printer& out, printer::values holes) : m_out(out) { m_out.push(std::move(holes)); }
    printer_scope(const printer_scope&) = delete;
    printer_scope& operator=(const printer_scope&) = delete;
    ~printer_scope() { m_out.pop(); }

private:
    printer& m_out;
};

}  // namespace vrl_codegen
