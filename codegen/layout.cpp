#include "codegen/layout.h"

#include <algorithm>
#include <optional>
#include <vector>

namespace vrl_codegen {
namespace {

constexpr std::size_t k_indent = 4;
constexpr std::size_t k_none = std::string::npos;

/// A pair of brackets. One that isn't closed on its line ends behind the line's last character.
struct bracket {
    std::size_t open;
    std::size_t close;
    std::size_t depth;
};

bool is_word(char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '_';
}

/// One line of C++: what is a literal, what a comment, and which brackets belong together.
class code_line {
public:
    explicit code_line(const std::string& text) : m_text(text), m_depth(text.size(), 0) {
        for (std::size_t i = 0; i < m_text.size(); ++i) i = scan(i);
    }

    const std::string& text() const { return m_text; }
    bool has_comment() const { return m_has_comment; }
    const std::vector<bracket>& brackets() const { return m_brackets; }
    std::size_t indent() const { return std::min(m_text.find_first_not_of(' '), m_text.size()); }

    /// The first place from `from` on where `word` stands in exactly `depth` brackets.
    std::size_t find(const std::string& word, std::size_t depth, std::size_t from) const {
        std::size_t at = m_text.find(word, from);
        while (at != k_none && m_depth[at] != depth) at = m_text.find(word, at + 1);
        return at;
    }

private:
    std::size_t scan(std::size_t i) {
        const char c = m_text[i];
        if (c == '"' || c == '\'') return scan_literal(i);
        if (c == '/' && m_text.compare(i, 2, "//") == 0) {
            m_has_comment = true;
            std::fill(m_depth.begin() + static_cast<std::ptrdiff_t>(i), m_depth.end(), k_none);
            return m_text.size();
        }
        const bool angle = c == '<' && i > 0 && is_word(m_text[i - 1]);
        if (c == '(' || c == '[' || c == '{' || angle) {
            m_depth[i] = m_open.size();
            m_open.push_back(m_brackets.size());
            m_brackets.push_back({i, m_text.size(), m_depth[i]});
        } else if (closes(i)) {
            m_brackets[m_open.back()].close = i;
            m_open.pop_back();
            m_depth[i] = m_open.size();
        } else {
            m_depth[i] = m_open.size();
        }
        return i;
    }

    bool closes(std::size_t i) const {
        if (m_open.empty()) return false;
        const char open = m_text[m_brackets[m_open.back()].open];
        const char c = m_text[i];
        return (open == '(' && c == ')') || (open == '[' && c == ']') || (open == '{' && c == '}') ||
               (open == '<' && c == '>');
    }

    /// The last character of the literal.
    std::size_t scan_literal(std::size_t first) {
        std::size_t i = first;
        do {
            m_depth[i] = k_none;
            i += m_text[i] == '\\' ? 2 : 1;
        } while (i < m_text.size() && m_text[i] != m_text[first]);
        if (i < m_text.size()) m_depth[i] = k_none;
        return i;
    }

    std::string m_text;
    std::vector<std::size_t> m_depth;  ///< brackets around each character; k_none in literals and comments
    std::vector<bracket> m_brackets;
    std::vector<std::size_t> m_open;
    bool m_has_comment = false;
};

class layouter {
public:
    void put(const std::string& text) {
        if (text.size() <= k_line_length || !split(code_line(text))) add(text);
    }

    std::string take() { return std::move(m_text); }

private:
    bool split(const code_line& line) {
        const std::size_t indent = line.indent();
        if (line.has_comment() || line.text()[indent] == '#') return false;
        return split_body(line) || split_head(line) || split_expression(line) || split_bracket(line) ||
               split_result(line) || split_assignment(line);
    }

    /// "f() { a; b; }": the braces of a body have blanks inside, those of a list have none.
    bool split_body(const code_line& line) {
        const std::string& text = line.text();
        for (const bracket& body : line.brackets()) {
            if (text.compare(body.open, 2, "{ ") != 0 || body.close == text.size()) continue;
            const std::string indent(line.indent(), ' ');
            put(text.substr(0, body.open + 1));
            std::size_t from = body.open + 2;
            while (from < body.close) {
                const std::size_t end = std::min(line.find("; ", body.depth + 1, from), body.close);
                put(indent + std::string(k_indent, ' ') + text.substr(from, end + 1 - from));
                from = end + 2;
            }
            put(indent + text.substr(body.close));
            return true;
        }
        return false;
    }

    /// The bases of a class and the initializers of a constructor.
    bool split_head(const code_line& line) {
        const std::size_t colon = line.find(" : ", 0, 0);
        if (colon == k_none) return false;
        put(line.text().substr(0, colon));
        put(std::string(line.indent() + k_indent, ' ') + line.text().substr(colon + 1));
        return true;
    }

    bool split_expression(const code_line& line) {
        static const std::string word = "return ";
        const bool returns = line.text().compare(line.indent(), word.size(), word) == 0;
        const std::size_t first = line.indent() + (returns ? word.size() : 0);
        const std::vector<std::string> parts = parts_of(line, first, line.text().size(), 0);
        if (parts.size() < 2) return false;
        fill(line.text().substr(0, first), parts);
        return true;
    }

    /// The last outermost bracket that opens on the line and holds something.
    bool split_bracket(const code_line& line) {
        std::optional<bracket> last;
        for (const bracket& found : line.brackets()) {
            if (found.depth == 0 && found.open < k_line_length && found.close > found.open + 1) last = found;
        }
        if (!last) return false;
        const std::string& text = line.text();
        const std::size_t first = last->open + 1;
        std::vector<std::string> parts = parts_of(line, first, last->close, 1);
        parts.back() += text.substr(last->close);
        const std::size_t indent = line.indent() + k_indent;
        const bool is_list = text[last->open] == '{' && first > indent;
        if (!is_list && fits(first, parts)) {
            fill(text.substr(0, first), parts);
        } else {
            if (first <= indent) return false;
            put(text.substr(0, first));
            fill(std::string(indent, ' '), parts);
        }
        return true;
    }

    /// What a function returns, on a line ahead of its name.
    bool split_result(const code_line& line) {
        const std::size_t arguments = line.find("(", 0, 0);
        if (arguments == k_none) return false;
        const std::size_t name = line.text().rfind(' ', arguments);
        if (name == k_none || name <= line.indent()) return false;
        put(line.text().substr(0, name));
        put(std::string(line.indent(), ' ') + line.text().substr(name + 1));
        return true;
    }

    bool split_assignment(const code_line& line) {
        const std::size_t sign = line.find(" = ", 0, 0);
        if (sign == k_none) return false;
        put(line.text().substr(0, sign + 2));
        put(std::string(line.indent() + k_indent, ' ') + line.text().substr(sign + 3));
        return true;
    }

    /// The text from `first` to `last`, cut behind what separates its parts.
    static std::vector<std::string> parts_of(const code_line& line, std::size_t first, std::size_t last,
                                             std::size_t depth) {
        std::vector<std::string> parts;
        std::size_t from = first;
        while (true) {
            std::size_t end = k_none;
            std::size_t next = k_none;
            for (const std::string& separator : {std::string(", "), std::string("&& "), std::string("|| ")}) {
                const std::size_t at = line.find(separator, depth, from);
                if (at >= last || at >= end) continue;
                end = at + separator.size() - 1;
                next = at + separator.size();
            }
            if (end == k_none) break;
            parts.push_back(line.text().substr(from, end - from));
            from = next;
        }
        parts.push_back(line.text().substr(from, last - from));
        return parts;
    }

    /// A list among the parts can be broken in its turn.
    static bool fits(std::size_t column, const std::vector<std::string>& parts) {
        return std::all_of(parts.begin(), parts.end(), [column](const std::string& part) {
            return column + part.size() <= k_line_length || part.front() == '{';
        });
    }

    /// As many parts on each line as it takes, but a line for each field that is named; the lines behind the
    /// first start below the first part.
    void fill(const std::string& prefix, const std::vector<std::string>& parts) {
        const std::string indent(prefix.size(), ' ');
        std::string line = prefix + parts.front();
        for (std::size_t i = 1; i < parts.size(); ++i) {
            if (parts[i].front() != '.' && line.size() + 1 + parts[i].size() <= k_line_length) {
                line.append(" ").append(parts[i]);
            } else {
                put(line);
                line = indent + parts[i];
            }
        }
        put(line);
    }

    void add(const std::string& line) {
        if (line.empty() && m_blank) return;
        m_blank = line.empty();
        m_text.append(line).append("\n");
    }

    std::string m_text;
    bool m_blank = false;
};

}  // namespace

std::string lay_out(const std::string& text) {
    layouter out;
    for (std::size_t from = 0; from < text.size();) {
        const std::size_t end = std::min(text.find('\n', from), text.size());
        out.put(text.substr(from, end - from));
        from = end + 1;
    }
    std::string laid_out = out.take();
    if (!text.empty() && text.back() != '\n') laid_out.pop_back();
    return laid_out;
}

}  // namespace vrl_codegen
