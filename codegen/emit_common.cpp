#include <algorithm>

#include "codegen/emit.h"
#include "codegen/layout.h"

namespace vrl_codegen {

std::string filled(const std::string& text, const std::string& prefix) {
    std::string lines;
    std::string line;
    for (std::size_t start = 0; start < text.size();) {
        const std::size_t end = std::min(text.find(' ', start), text.size());
        const std::string word = text.substr(start, end - start);
        if (!line.empty() && line.size() + 1 + word.size() > k_line_length) {
            lines.append(line).append("\n");
            line.clear();
        }
        line.append(line.empty() ? prefix : " ").append(word);
        start = end + 1;
    }
    return text.empty() ? std::string() : lines.append(line).append("\n");
}

std::string comment(const std::string& text, const std::string& indent) {
    return filled(text, std::string(indent).append("/// "));
}

std::string quoted(const std::string& text) {
    std::string literal = "\"";
    for (const char c : text) {
        if (c == '"' || c == '\\') literal.push_back('\\');
        literal.push_back(c);
    }
    return literal.append("\"");
}

std::string wide_quoted(const std::string& text) { return std::string("L").append(quoted(text)); }

std::string join(const std::vector<std::string>& parts, const std::string& separator) {
    std::string joined;
    for (const std::string& part : parts) {
        if (!joined.empty()) joined += separator;
        joined += part;
    }
    return joined;
}

std::string braced(const row_range& names) {
    return std::string("{")
        .append(std::to_string(names.first))
        .append(", ")
        .append(std::to_string(names.last))
        .append("}");
}

void print_row(printer& out, const std::string& namespace_id, const std::string& name,
               const std::string& token) {
    out.print("    {$namespace$, \"$name$\", $length$, token::$token$},\n",
              {{"namespace", namespace_id},
               {"name", name},
               {"length", std::to_string(name.size())},
               {"token", token}});
}

}  // namespace vrl_codegen
