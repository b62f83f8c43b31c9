#include "runtime/xml_text_source.h"

#include <cstring>

#include "runtime/byte_scan.h"
#include "runtime/character_class.h"

namespace qbxV2 {

using detail::byte_is;
using detail::is_name_char;
using detail::is_space;

namespace {

/// From here on a text gets the memory for its rest at once: growing by doubling touches three times as much.
constexpr std::size_t k_long_text = 64 * 1024;

}  // namespace

void c_get_for_xml::rewind() {
    set_ws_mode(EQBX_WS_PRESERVE);
    c_get_with_entities::rewind();
}

int c_get_for_xml::skip_ws_and_get() {
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
    for (;;) {
        s_byte_run run;
        if (open_run(&run)) {
            const detail::s_scan scan =
                detail::scan_value(run.next, run.end, static_cast<unsigned char>(quote), run_may_hold_utf8());
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
            const unsigned char* const p = detail::end_of_plain_name(run.next, run.end);
            name->append(reinterpret_cast<const char*>(run.next), static_cast<std::size_t>(p - run.next));
            take_run(p);
        }
        const int c = get();
        if (!is_name_char(c)) return c;
        name->push_back(static_cast<char>(c));
    }
}

bool c_get_for_xml::read_end_tag(const std::string& name) {
    if (take_end_tag(name)) return true;
    if (get_non_ws() != '<' || get() != '/') return false;
    for (const char expected : name) {
        if (get() != static_cast<unsigned char>(expected)) return false;
    }
    return get_non_ws() == '>';
}

bool c_get_for_xml::take_end_tag(const std::string& name) {
    s_byte_run run;
    const std::size_t size = name.size();
    if (!open_run(&run) || static_cast<std::size_t>(run.end - run.next) < size + 3) return false;
    const unsigned char* const p = run.next;
    if (p[0] != '<' || p[1] != '/' || p[size + 2] != '>' || std::memcmp(p + 2, name.data(), size) != 0)
        return false;
    if (!detail::is_printable_ascii(name.data(), size)) return false;
    take_run(p + size + 3);
    return true;
}

bool c_get_for_xml::is_at_tag() {
    s_byte_run run;
    if (!open_run(&run) || run.end - run.next < 2 || run.next[0] != '<') return false;
    const unsigned char behind = run.next[1];
    if (behind != '/' && !byte_is(behind, detail::cc_plain_name)) return false;
    note_look_ahead(run.next + 2);
    return true;
}

bool c_get_for_xml::take_name(std::string* name) {
    s_byte_run run;
    if (!open_run(&run) || !detail::is_plain_name_start(*run.next)) return false;
    const unsigned char* const p = detail::end_of_plain_name(run.next, run.end);
    // A line feed counts once more when it is pushed back, so that is left to `get`.
    if (p == run.end || *p >= 0x80 || *p == '\r' || *p == '\n') return false;
    name->assign(reinterpret_cast<const char*>(run.next), static_cast<std::size_t>(p - run.next));
    take_run(p);
    note_look_ahead(p + 1);
    return true;
}

bool c_get_for_xml::take_attribute(std::string* bytes) {
    s_byte_run run;
    if (!open_run(&run)) return false;
    const unsigned char* p = run.next;
    while (p != run.end && *p == ' ') ++p;
    const unsigned char* const name = p;
    if (p == run.end || *p == 'x' || !detail::is_plain_name_start(*p)) return false;
    const unsigned char* const equals = detail::end_of_plain_name(p, run.end);
    if (run.end - equals < 2 || *equals != '=') return false;
    const unsigned char quote = equals[1];
    if (quote != '"' && quote != '\'') return false;
    const detail::s_scan value = detail::scan_value(equals + 2, run.end, quote, run_may_hold_utf8());
    if (value.end == run.end || *value.end != quote) return false;
    // The text as written has the layout that is wanted, but for the two NULs.
    const std::size_t at = bytes->size();
    bytes->append(reinterpret_cast<const char*>(name), static_cast<std::size_t>(value.end + 1 - name));
    (*bytes)[at + static_cast<std::size_t>(equals - name)] = '\0';
    bytes->back() = '\0';
    take_run(value.end + 1, value.line_feeds);
    return true;
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
    const auto* p = reinterpret_cast<const unsigned char*>(from);
    const auto* const end = reinterpret_cast<const unsigned char*>(to);
    for (;;) {
        for (; p != end && byte_is(*p, detail::cc_space); ++p) m_pending_space = true;
        if (p == end) return;
        const unsigned char* const word_end = detail::find_space(p, end);
        if (m_pending_space && !s->empty()) s->push_back(' ');
        m_pending_space = false;
        s->append(reinterpret_cast<const char*>(p), static_cast<std::size_t>(word_end - p));
        p = word_end;
    }
}

void c_get_for_xml::make_room_up_to_tag(std::string* s, const s_byte_run& run) {
    const auto left = static_cast<std::size_t>(run.end - run.next);
    const void* const tag = std::memchr(run.next, '<', left);
    const auto more =
        tag == nullptr ? left : static_cast<std::size_t>(static_cast<const unsigned char*>(tag) - run.next);
    s->reserve(s->size() + more);
}

void c_get_for_xml::add_text_run(std::string* s, bool stop_at_ampersand) {
    s_byte_run run;
    if (!open_run(&run)) return;
    const detail::s_scan scan = detail::scan_text(run.next, run.end, !stop_at_ampersand, run_may_hold_utf8());
    if (s->size() >= k_long_text && s->capacity() - s->size() < static_cast<std::size_t>(scan.end - run.next))
        make_room_up_to_tag(s, run);
    add_chars_wsp(s, reinterpret_cast<const char*>(run.next), reinterpret_cast<const char*>(scan.end));
    take_run(scan.end, scan.line_feeds);
}

}  // namespace qbxV2
