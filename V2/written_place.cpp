#include "V2/written_place.h"

#include <utility>

namespace vrl_v2 {

written_place::int_type written_place::overflow(int_type c) {
    if (!traits_type::eq_int_type(c, traits_type::eof())) take(traits_type::to_char_type(c));
    return traits_type::not_eof(c);
}

std::streamsize written_place::xsputn(const char* text, std::streamsize length) {
    for (std::streamsize i = 0; i < length; ++i) take(text[i]);
    return length;
}

void written_place::take(char c) {
    if (!m_in_tag) {
        m_in_tag = c == '<';
        m_tag.clear();
    } else if (m_quote != '\0') {
        if (c == m_quote) m_quote = '\0';
    } else if (c == '>') {
        end_tag();
        m_in_tag = false;
    } else {
        if (c == '"' || c == '\'') m_quote = c;
        m_tag += c;
    }
}

void written_place::end_tag() {
    if (m_tag.empty() || m_tag[0] == '?' || m_tag[0] == '!') return;
    if (m_tag[0] == '/') {
        if (!m_open.empty()) m_open.pop_back();
        return;
    }
    open(m_tag.substr(0, m_tag.find_first_of(" \t\r\n/")));
    if (m_tag.back() == '/') m_open.pop_back();
}

void written_place::open(const std::string& name) {
    element opened;
    opened.name = name;
    if (!m_open.empty()) {
        ++m_open.back().children;
        opened.number = ++m_open.back().names[name];
    }
    m_open.push_back(std::move(opened));
}

std::string written_place::path() const {
    std::string path;
    for (const element& open : m_open) {
        path += '/' + open.name;
        if (&open != &m_open.front()) path += '[' + std::to_string(open.number) + ']';
    }
    return path.empty() ? "/" : path;
}

std::string written_place::description() const {
    if (m_open.empty()) return "the outermost element lacks something";
    const int child = m_open.back().children + 1;
    return "child number " + std::to_string(child) + " of " + path() + " lacks something";
}

}  // namespace vrl_v2
