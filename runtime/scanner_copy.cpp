#include "runtime/character_class.h"
#include "runtime/open_elements.h"
#include "runtime/scanner.h"

namespace qbxV2 {
namespace {

void append_end_tag(const std::string& name, std::string* out) {
    out->append("</");
    out->append(name);
    out->push_back('>');
}

}  // namespace

bool c_xml::get_any_element(const std::string& name, std::string* out, eqbx_whitespace mode, bool) {
    out->clear();
    m_getter.set_ws_mode(mode);
    return copy_element(name, out);
}

bool c_xml::get_nested_element_value(std::string* value, std::string* end_name, eqbx_whitespace mode, bool) {
    value->clear();
    end_name->clear();
    m_getter.set_ws_mode(mode);
    m_attributes.clear();
    m_ns_attributes.clear();
    std::string text;
    for (;;) {
        switch (get_nested_piece(&text)) {
            case piece::text:
                value->append(text);
                break;
            case piece::start_tag:
                if (!copy_element(text, value)) return false;
                break;
            case piece::end_tag:
                *end_name = text;
                return true;
            case piece::error:
                return false;
        }
    }
}

/// Appends an element from behind its name to its end, with all that is in it.
bool c_xml::copy_element(const std::string& name, std::string* out) {
    detail::c_open_elements open;
    std::string text = name;
    bool is_empty = false;
    if (!copy_start_tag(text, out, &is_empty)) return false;
    if (!is_empty) open.push(text);
    while (!open.empty()) {
        switch (get_nested_piece(&text)) {
            case piece::text:
                out->append(text);
                break;
            case piece::start_tag:
                if (!copy_start_tag(text, out, &is_empty)) return false;
                if (!is_empty) open.push(text);
                break;
            case piece::end_tag:
                if (!open.top_is(text)) return false;
                append_end_tag(text, out);
                open.pop();
                break;
            case piece::error:
                return false;
        }
    }
    return true;
}

void c_xml::copy_attributes(c_attribute_buffer* buffer, std::string* out) {
    for (buffer->set_position(0); !buffer->is_used_up();) {
        const char* const name = buffer->text_at(buffer->position());
        buffer->set_position(buffer->behind_text(buffer->position()));
        const char* const quoted = buffer->text_at(buffer->position());
        buffer->set_position(buffer->behind_text(buffer->position()));
        out->push_back(' ');
        out->append(name);
        out->push_back('=');
        out->append(quoted);
        if (*quoted != '\0') out->push_back(*quoted);
    }
    buffer->clear();
}

/// Appends a start tag: what was read ahead of its attributes, then the rest as it stands.
bool c_xml::copy_start_tag(const std::string& name, std::string* out, bool* is_empty) {
    out->push_back('<');
    out->append(name);
    copy_attributes(&m_ns_attributes, out);
    copy_attributes(&m_attributes, out);
    int quote = 0;
    for (;;) {
        const int c = m_getter.get();
        if (c == -1) return false;
        if (quote == 0 && (c == '>' || c == '/')) {
            *is_empty = c == '/';
            break;
        }
        if (c == quote) {
            quote = 0;
        } else if (quote == 0 && (c == '"' || c == '\'')) {
            quote = c;
        }
        out->push_back(static_cast<char>(c));
    }
    if (*is_empty) {
        out->push_back('/');
        for (int c = 0; c != '>' && c != -1;) c = m_getter.get();
    }
    out->push_back('>');
    return true;
}

/// The next piece of an element's content as it stands: a stretch of text, or the name of a tag.
c_xml::piece c_xml::get_nested_piece(std::string* text) {
    text->clear();
    int c = m_getter.get();
    for (; detail::is_space(c); c = m_getter.get()) m_getter.add_char_wsp(text, c, false);
    if (c == '<') {
        text->clear();
        return get_nested_markup(text);
    }
    if (c == -1 && text->empty()) return piece::error;
    for (; c != '<' && c != -1; c = m_getter.get()) {
        m_getter.add_char_wsp(text, c, false);
        m_getter.add_text_run(text, false);
    }
    m_getter.unget(c);
    return piece::text;
}

/// From behind a "<".
c_xml::piece c_xml::get_nested_markup(std::string* text) {
    const int c = m_getter.get();
    if (c == -1 || detail::is_space(c)) return piece::error;
    if (c == '!') return get_nested_declaration(text);
    if (c == '?') return m_getter.skip_PI() ? piece::text : piece::error;
    if (c != '/') {
        m_getter.unget(get_nested_name(c, text));
        return piece::start_tag;
    }
    int behind = get_nested_name(m_getter.get(), text);
    if (detail::is_space(behind)) behind = m_getter.get_non_ws();
    return behind == '>' ? piece::end_tag : piece::error;
}

/// From behind "<!": keeps a CDATA section as it is; a comment vanishes, and of anything else the two
/// characters.
c_xml::piece c_xml::get_nested_declaration(std::string* text) {
    const int c = m_getter.get();
    if (c == '-' && m_getter.get() == '-') return m_getter.skip_comment() ? piece::text : piece::error;
    if (c != '[') return piece::text;
    text->assign("<![CDATA[");
    if (!m_getter.get_cdata(text)) return piece::error;
    text->append("]]>");
    return piece::text;
}

/// Reads a tag's name that begins with `c`, and the value behind it, which is the result.
int c_xml::get_nested_name(int c, std::string* name) {
    for (; c != -1 && c != '>' && c != '/' && !detail::is_space(c); c = m_getter.get()) {
        name->push_back(static_cast<char>(c));
    }
    return c;
}

}  // namespace qbxV2
