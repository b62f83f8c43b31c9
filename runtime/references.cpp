#include "runtime/references.h"

#include <unordered_set>
#include <vector>

#include "runtime/character_class.h"
#include "runtime/scanner.h"
#include "runtime/utf8.h"

namespace qbxV2 {
namespace detail {

bool read_reference_name(c_entity_name_reader& reader, int first, std::string* name) {
    name->clear();
    int c = first;
    for (; is_name_char(c); c = reader.get()) name->push_back(static_cast<char>(c));
    if (c == ';') return true;
    reader.unget(c);
    return false;
}

char predefined_entity(const std::string& name) {
    if (name == "lt") return '<';
    if (name == "gt") return '>';
    if (name == "amp") return '&';
    if (name == "apos") return '\'';
    if (name == "quot") return '"';
    return '\0';
}

}  // namespace detail

namespace {

/// Intended: one below the last plane's end; U+100001 and up are refused.
constexpr unsigned k_last_code_point = 0x100000;

unsigned digit_value(int c) {
    if (c >= '0' && c <= '9') return static_cast<unsigned>(c - '0');
    return static_cast<unsigned>((c >= 'a' ? c - 'a' : c - 'A') + 10);
}

void append_unknown(const std::string& name, bool closed, std::string* out) {
    out->push_back('&');
    out->append(name);
    if (closed) out->push_back(';');
}

}  // namespace

bool c_get_for_xml::insert_character_entity(c_entity_name_reader& reader, std::string* out) {
    int c = reader.get();
    const bool hexadecimal = c == 'x';
    const unsigned digit_class = hexadecimal ? detail::cc_hex : detail::cc_digit;
    const unsigned base = hexadecimal ? 16 : 10;
    if (hexadecimal) {
        c = reader.get();
    } else if (!detail::value_is(c, digit_class)) {
        return false;
    }
    bool has_digits = false;
    unsigned value = 0;
    for (; detail::value_is(c, digit_class); c = reader.get()) {
        has_digits = true;
        if (value <= k_last_code_point) value = value * base + digit_value(c);
    }
    if (c != ';') reader.unget(c);
    if (!has_digits || value > k_last_code_point) return false;
    if (value == 0x85 || value == 0x2028) value = '\n';
    if (value <= 127) {
        add_char_wsp(out, static_cast<int>(value), true);
    } else {
        // Intended: past the white-space mode, like the predefined entities.
        char bytes[5];
        out->append(unicode_char_to_utf8(static_cast<int>(value), bytes));
    }
    return true;
}

/// Expands a reference from behind its "&". A general entity becomes input in input mode, else its text goes
/// to `out`. False for an unknown entity, which then stands in `out` as it was written, and for a bad
/// character reference.
bool c_xml::expand_reference(c_entity_name_reader& reader, std::string* out) {
    const char* value = nullptr;
    if (!reader.is_input_mode()) {
        return resolve_reference(reader, out, &value) && (value == nullptr || expand_inline(value, out));
    }
    const c_get_with_entities::c_reference reference(m_getter);
    if (!resolve_reference(reader, out, &value)) return false;
    // Intended: true after a recursion too. Its fatal report has ended the input.
    if (value != nullptr) m_getter.set_input_entity_value(value);
    return true;
}

/// Reads a reference and appends what stands for it. For a general entity, `*value` becomes its text instead.
bool c_xml::resolve_reference(c_entity_name_reader& reader, std::string* out, const char** value) {
    const int c = reader.get();
    if (c == '#') return m_getter.insert_character_entity(reader, out);
    const bool closed = detail::read_reference_name(reader, c, &m_entity_name);
    if (const char predefined = detail::predefined_entity(m_entity_name)) {
        // Intended: past the white-space mode. A space that is held back comes out behind it.
        out->push_back(predefined);
        return true;
    }
    if (m_getter.get_general_entity(m_entity_name.c_str(), value)) return true;
    append_unknown(m_entity_name, closed, out);
    return false;
}

/// Walks the text of an entity and, on a stack of its own, of those that it refers to.
bool c_xml::expand_inline(const char* value, std::string* out) {
    struct s_text {
        const char* start;
        const char* cursor;
    };
    std::vector<s_text> texts;
    std::unordered_set<const char*> open;
    const auto enter = [&](const char* text) {
        if (!open.insert(text).second) return m_getter.refuse_recursion(text);
        texts.push_back(s_text{text, text});
        return m_getter.admit_entity_text(text);
    };
    // Intended: the character right behind a nested reference is dropped.
    const auto drop_one = [&] {
        if (!texts.empty() && *texts.back().cursor != '\0') ++texts.back().cursor;
    };
    if (!enter(value)) return false;
    while (!texts.empty()) {
        s_text& text = texts.back();
        if (*text.cursor == '\0') {
            open.erase(text.start);
            texts.pop_back();
            drop_one();
            continue;
        }
        const char c = *text.cursor++;
        // Intended: a percent sign counts as the start of a reference too.
        if (c != '&' && c != '%') {
            m_getter.add_char_wsp(out, static_cast<unsigned char>(c), false);
            continue;
        }
        c_entity_name_reader_for_entity reader(text.start, &text.cursor);
        const char* nested = nullptr;
        if (!resolve_reference(reader, out, &nested)) return false;
        if (nested == nullptr) {
            drop_one();
        } else if (!enter(nested)) {
            return false;
        }
    }
    return true;
}

}  // namespace qbxV2
