#include "codegen/emit.h"
#include "codegen/layout.h"
#include "codegen/plan_members.h"

namespace vrl_codegen {

std::string comment(const std::string& text, const std::string& indent) {
    std::string lines;
    std::string line = indent + "///";
    std::size_t start = 0;
    while (start < text.size()) {
        std::size_t end = text.find(' ', start);
        if (end == std::string::npos) end = text.size();
        const std::string word = text.substr(start, end - start);
        if (line.size() + 1 + word.size() > k_line_length) {
            lines += line + "\n";
            line = indent + "///";
        }
        line += " " + word;
        start = end + 1;
    }
    return text.empty() ? std::string() : lines + line + "\n";
}

std::string quoted(const std::string& text) { return "\"" + text + "\""; }

std::string number_of_units(const std::string& text) { return std::to_string(text.size()); }

std::string result_type(const value_plan& value) { return value.parameter; }

std::string join(const std::vector<std::string>& parts, const std::string& separator) {
    std::string joined;
    for (const std::string& part : parts) {
        if (!joined.empty()) joined += separator;
        joined += part;
    }
    return joined;
}

std::string enumerator(const std::string& member, const std::string& literal) {
    return member + "_" + identifier(literal);
}

}  // namespace vrl_codegen
