#include "runtime/xml_text_source.h"

#include "runtime/byte_scan.h"
#include "runtime/character_class.h"

namespace qbxV2 {

using detail::byte_is;
using detail::is_name_char;
using detail::is_space;

void c_get_for_xml::rewind() {
    set_ws_mode(EQBX_WS_PRESERVE);
    c_get_with_entities::rewind();
}

int c_get_for_xml::get_non_ws() {
    for (;;) {
        s_byte_run run;
        if (open_run(&run)) {
            const unsigned char* p = run.next;
            unsigned line_feeds = 0;
            for (; p != run.end; ++p) {
                if (*p == '\n') {
                    ++line_feeds;
                } else if (*p == '\r' && run.end - p > 2 && p[1] == '\n') {
                    // What follows is read in any case, so the pair can be taken as the one line end that it
                    // is.
                    ++p;
                    ++line_feeds;
                } else if (*p != ' ' && *p != '\t') {
                    break;
                }
            }
            take_run(p, line_feeds);
        }
        const int c = get();
        if (!is_space(c)) return c;
    }
}

bool c_get_for_xml::read_specified_string_from_input(const char* s) {
    for (; *s != '\0'; ++s) {
        if (get() != static_cast<unsigned char>(*s)) return false;
    }
    return true;
}

bool c_get_for_xml::get_simple_quoted_value(std::string* value) {
    value->clear();
    const int quote = get_non_ws();
    return (quote == '"' || quote == '\'') && get_up_to_quote(quote, value);
}

bool c_get_for_xml::get_up_to_quote(int quote, std::string* value) {
    const auto other_quote = static_cast<unsigned char>(quote == '"' ? '\'' : '"');
    for (;;) {
        s_byte_run run;
        if (open_run(&run)) {
            const detail::s_scan scan =
                detail::scan_text(run.next, run.end, detail::cc_value, other_quote, run_may_hold_utf8());
            value->append(reinterpret_cast<const char*>(run.next),
                          static_cast<std::size_t>(scan.end - run.next));
            take_run(scan.end, scan.line_feeds);
        }
        const int c = get();
        if (c == quote) return true;
        if (c == -1) return false;
        value->push_back(static_cast<char>(c));
    }
}

int c_get_for_xml::get_rest_of_name(std::string* name) {
    for (;;) {
        s_byte_run run;
        if (open_run(&run)) {
            const unsigned char* p = run.next;
            while (p != run.end && byte_is(*p, detail::cc_plain_name)) ++p;
            name->append(reinterpret_cast<const char*>(run.next), static_cast<std::size_t>(p - run.next));
            take_run(p);
        }
        const int c = get();
        if (!is_name_char(c)) return c;
        name->push_back(static_cast<char>(c));
    }
}

bool c_get_for_xml::read_end_tag(const std::string& name) {
    if (get_non_ws() != '<' || get() != '/') return false;
    const char* expected = name.c_str();
    const char* const expected_end = expected + name.size();
    s_byte_run run;
    if (open_run(&run)) {
        const unsigned char* p = run.next;
        while (expected != expected_end && p != run.end && *p == static_cast<unsigned char>(*expected) &&
               byte_is(*p, detail::cc_plain_name)) {
            ++p;
            ++expected;
        }
        take_run(p);
    }
    for (; expected != expected_end; ++expected) {
        if (get() != static_cast<unsigned char>(*expected)) return false;
    }
    return get_non_ws() == '>';
}

/// Adds, or with null skips, what comes before `stop` and can be had at once.
void c_get_for_xml::add_run(std::string* s, unsigned char stop) {
    s_byte_run run;
    if (!open_run(&run)) return;
    const detail::s_scan scan = detail::scan_up_to(run.next, run.end, stop, run_may_hold_utf8());
    if (s != nullptr) {
        s->append(reinterpret_cast<const char*>(run.next), static_cast<std::size_t>(scan.end - run.next));
    }
    take_run(scan.end, scan.line_feeds);
}

bool c_get_for_xml::skip_comment() {
    int dashes = 0;
    for (;;) {
        if (dashes == 0) add_run(nullptr, '-');
        const int c = get();
        if (c == -1) return false;
        if (c == '>' && dashes >= 2) break;
        dashes = c != '-' ? 0 : dashes < 3 ? dashes + 1 : dashes;
    }
    if (dashes > 2) error(EQBX_ET_WARNING, EQBX_BAD_COMMENT, "End of comment not Well-Formed");
    return true;
}

bool c_get_for_xml::skip_PI() {
    int previous = 0;
    for (;;) {
        if (previous != '?') add_run(nullptr, '?');
        const int c = get();
        if (c == -1) return false;
        if (c == '>' && previous == '?') return true;
        previous = c;
    }
}

bool c_get_for_xml::get_cdata(std::string* text) {
    if (!read_specified_string_from_input("CDATA[")) return false;
    std::size_t brackets = 0;
    for (;;) {
        if (brackets == 0) add_run(text, ']');
        const int c = get();
        if (c == -1 || (c == '>' && brackets >= 2)) break;
        if (c == ']') {
            ++brackets;
            continue;
        }
        text->append(brackets, ']');
        brackets = 0;
        text->push_back(static_cast<char>(c));
    }
    if (brackets >= 3) text->append(brackets - 2, ']');
    return true;
}

bool c_get_for_xml::move_to_start_tag_end(bool* is_empty) {
    int c = 0;
    for (int quote = 0; c != '/';) {
        c = get();
        if (c == -1) return false;
        if (quote != 0) {
            if (c == quote) quote = 0;
            c = 0;
        } else if (c == '"' || c == '\'') {
            quote = c;
        } else if (c == '>') {
            if (is_empty != nullptr) *is_empty = false;
            return true;
        }
    }
    bool clean = true;
    while ((c = get_non_ws()) != '>' && c != -1) {
        if (!clean) continue;
        clean = false;
        error(EQBX_ET_ERROR, EQBX_BAD_END_TAG,
              std::string("Illegal character(s) after / at end of tag - ") + static_cast<char>(c));
    }
    if (is_empty != nullptr) *is_empty = true;
    return clean;
}

void c_get_for_xml::add_char_wsp(std::string* s, int c, bool from_char_ref) {
    const bool handles_ws = m_ws_for_char_refs || !from_char_ref;
    const int replaced = handles_ws && is_space(c) ? ' ' : c;
    switch (m_ws_mode) {
        case EQBX_WS_PRESERVE:
            s->push_back(static_cast<char>(c));
            break;
        case EQBX_WS_REPLACE:
            s->push_back(static_cast<char>(replaced));
            break;
        case EQBX_WS_COLLAPSE:
            if (replaced == ' ') {
                m_pending_space = true;
                break;
            }
            if (m_pending_space && !s->empty()) s->push_back(' ');
            m_pending_space = false;
            s->push_back(static_cast<char>(c));
            break;
    }
}

void c_get_for_xml::add_chars_wsp(std::string* s, const char* from, const char* to) {
    const std::size_t start = s->size();
    switch (m_ws_mode) {
        case EQBX_WS_PRESERVE:
            s->append(from, to);
            break;
        case EQBX_WS_REPLACE:
            s->append(from, to);
            for (std::size_t i = start; i < s->size(); ++i) {
                if (byte_is(static_cast<unsigned char>((*s)[i]), detail::cc_space)) (*s)[i] = ' ';
            }
            break;
        case EQBX_WS_COLLAPSE:
            collapse(s, from, to);
            break;
    }
}

void c_get_for_xml::collapse(std::string* s, const char* from, const char* to) {
    const auto is_space_at = [](const char* p) {
        return byte_is(static_cast<unsigned char>(*p), detail::cc_space);
    };
    while (from != to) {
        if (is_space_at(from)) {
            m_pending_space = true;
            ++from;
            continue;
        }
        const char* word_end = from + 1;
        while (word_end != to && !is_space_at(word_end)) ++word_end;
        if (m_pending_space && !s->empty()) s->push_back(' ');
        m_pending_space = false;
        s->append(from, word_end);
        from = word_end;
    }
}

void c_get_for_xml::add_text_run(std::string* s, bool stop_at_ampersand) {
    s_byte_run run;
    if (!open_run(&run)) return;
    const auto also = static_cast<unsigned char>(stop_at_ampersand ? '\n' : '&');
    const detail::s_scan scan =
        detail::scan_text(run.next, run.end, detail::cc_text, also, run_may_hold_utf8());
    add_chars_wsp(s, reinterpret_cast<const char*>(run.next), reinterpret_cast<const char*>(scan.end));
    take_run(scan.end, scan.line_feeds);
}

}  // namespace qbxV2
