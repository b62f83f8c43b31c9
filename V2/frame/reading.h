#pragma once

#include <cstddef>
#include <string>
#include <type_traits>

#include "V2/frame/limits.h"
#include "V2/frame/storage.h"
#include "runtime/xml_reader.h"

/// The reading protocol, once for all classes. A generated `unmarshal_` function lists members in schema
/// order; everything that has to be decided on the way is decided here.
///
/// To report a code means: ask the reader's error handler. Its zero lets reading go on at the next
/// statement as if the check had passed; anything else ends the whole reading with what it returned.
namespace vrl_v2::frame {

using qbxV2::c_xml_reader;
using qbxV2::s_event_map;

/// The rows [first, last) of a class's table: the names that may follow at one position of its content.
struct names_between {
    unsigned char first;
    unsigned char last;
};

/// The namespace id of a substitution group's row, which matches no name: a group has a table of its own.
inline constexpr int k_group_row = -1;

/// What the helpers below share: the reader, the place for the result, and whether a report has ended it.
/// Reports carry the generated source's name and the line of the call there.
class reporting {
public:
    reporting(c_xml_reader& reader, eqbx_error* error, const char* source)
        : m_reader(reader), m_error(error), m_source(source) {}

    /// True when reading goes on.
    bool report(eqbx_error code, const std::string& item, int line);
    bool stopped() const { return m_stopped; }

    /// Checks, converts and stores one text, in the order that its type has: form, then what is tested on
    /// the text, then storing, then what is tested on the stored value. So a handler that lets reading go
    /// on keeps a value that the setter would refuse. True when reading goes on.
    bool store(const std::string& text, double& value, no_limits, const std::string& item, int line);
    bool store(const std::string& text, double& value, const range& limits, const std::string& item,
               int line);
    bool store(const std::string& text, bool& value, no_limits, const std::string& item, int line);
    bool store(const std::string& text, int& value, const whole& limits, const std::string& item, int line);
    bool store(const std::string& text, unsigned& value, const whole& limits, const std::string& item,
               int line);
    bool store(const std::string& text, unsigned char& value, const whole& limits, const std::string& item,
               int line);
    bool store(const std::string& text, std::wstring& value, no_limits, const std::string& item, int line);
    bool store(const std::string& text, std::wstring& value, const length& limits, const std::string& item,
               int line);
    bool store(const std::string& text, std::wstring& value, const literals& limits, const std::string& item,
               int line);
    bool store(const std::string& text, qbxV2::c_datetime& value, no_limits, const std::string& item,
               int line);
    bool store(const std::string& text, qbxV2::c_binary& value, no_limits, const std::string& item, int line);

protected:
    void stop(eqbx_error code) {
        *m_error = code;
        m_stopped = true;
    }

    /// Text keeps its white space unless its limits say otherwise; everything else is collapsed.
    template <class T, class Limits>
    static constexpr qbxV2::eqbx_whitespace white_space(const T&, const Limits&) {
        return std::is_same<T, std::wstring>::value && !is_collapsed<Limits>::value ? qbxV2::EQBX_WS_PRESERVE
                                                                                    : qbxV2::EQBX_WS_COLLAPSE;
    }

    c_xml_reader& m_reader;
    eqbx_error* m_error;
    const char* m_source;
    bool m_stopped = false;

private:
    bool expect(bool holds, eqbx_error code, const std::string& item, int line) {
        return holds || report(code, item, line);
    }
    bool expect(eqbx_error code, const std::string& item, int line) {
        return code == qbxV2::EQBX_NO_ERROR || report(code, item, line);
    }
    bool expect_whole(const std::string& text, const whole& limits, const std::string& item, int line);
};

/// One attribute of a class: which one it is, and its value.
class attribute_reader : public reporting {
public:
    template <std::size_t n>
    attribute_reader(c_xml_reader& reader, const std::string& name, eqbx_error* error, const char* source,
                     const s_event_map (&rows)[n])
        : reporting(reader, error, source), m_name(name) {
        find(rows, rows + n);
    }

    /// The row of the current attribute, or -1.
    int which() const { return m_which; }
    /// Whether it is `xsi:nil`, which no table has to list.
    bool is_nil() const { return m_reader.get_current_event() == qbxV2::EQXP_XSI_NIL; }

    template <class T, class Limits>
    bool read(single<T>& member, const Limits& limits, int line = __builtin_LINE()) {
        if (member.set && !report(qbxV2::EQBX_ATTRIBUTE_ALREADY_READ, m_name, line)) return false;
        std::string& text = m_reader.value_buffer();
        if (!take_value(text, white_space(member.value, limits), line)) return !stopped();
        if (!store(text, member.value, limits, m_name, line)) return false;
        member.set = true;
        return true;
    }

    /// No duplicate test, and any text but "true" and "1" means false.
    bool read_nil(bool& nil, int line = __builtin_LINE());

private:
    void find(const s_event_map* first, const s_event_map* last);
    bool take_value(std::string& text, qbxV2::eqbx_whitespace mode, int line);

    const std::string& m_name;
    int m_which = -1;
};

/// Whether all required attributes have been there.
class required_attributes : public reporting {
public:
    required_attributes(c_xml_reader& reader, const char* source) : reporting(reader, &m_result, source) {}

    template <class T>
    void need(const single<T>& member, const char* name, int line = __builtin_LINE()) {
        if (!stopped() && !member.set) report(qbxV2::EQBX_REQUIRED_ATTRIBUTE_MISSING, name, line);
    }
    eqbx_error result() const { return m_result; }

private:
    eqbx_error m_result = qbxV2::EQBX_NO_ERROR;
};

/// The children of one element, in schema order. After a report has ended the reading, every call does
/// nothing.
///
/// `rows` has a row for each child element of the class, in order (a substitution group's row matches no
/// name); `next[i]` says which names may follow an entry of child `i`.
class children_reader : public reporting {
public:
    template <std::size_t n>
    children_reader(c_xml_reader& reader, std::string* name, eqbx_error* error, const char* source,
                    const s_event_map (&rows)[n], const names_between (&next)[n])
        : reporting(reader, error, source), m_name(name), m_rows(rows), m_next(next) {}

    /// Names the event by this class's table. A derived class does so only while an element is there.
    void begin(names_between first);
    void begin_derived(names_between first);

    template <class T, class Limits>
    void required(unsigned i, single<T>& member, const Limits& limits, int line = __builtin_LINE()) {
        if (stopped()) return;
        if (is_at(i)) {
            read_single(i, member, limits, line);
        } else {
            report_missing(i, line);
        }
    }
    template <class T, class Limits>
    void optional(unsigned i, single<T>& member, const Limits& limits, int line = __builtin_LINE()) {
        if (!stopped() && is_at(i)) read_single(i, member, limits, line);
    }
    template <class T>
    void required(unsigned i, child<T>& member, int line = __builtin_LINE()) {
        if (stopped()) return;
        if (is_at(i)) {
            read_child(i, member, line);
        } else {
            report_missing(i, line);
        }
    }
    template <class T>
    void optional(unsigned i, child<T>& member, int line = __builtin_LINE()) {
        if (!stopped() && is_at(i)) read_child(i, member, line);
    }

    template <class T, class Limits>
    void repeated_values(unsigned i, list<T>& member, const Limits& limits, int line = __builtin_LINE()) {
        while (!stopped() && is_at(i)) {
            T& entry = member.append();
            eqbx_error error = qbxV2::EQBX_NO_ERROR;
            if (take_text(white_space(entry, limits), &error)) {
                store(m_reader.value_buffer(), entry, limits, *m_name, line);
            } else {
                report(qbxV2::EQBX_ELEMENT_VALUE_UNREADABLE, *m_name, line);
            }
            advance(i, line);
        }
    }
    template <class T>
    void repeated(unsigned i, list<T>& member, int line = __builtin_LINE()) {
        while (!stopped() && is_at(i)) {
            if (!finish_object(member.append().unmarshal(m_reader, *m_name))) return;
            advance(i, line);
        }
    }
    /// With a minimum of one, the first look reports what is missing.
    template <class T, class Limits>
    void at_least_one_value(unsigned i, list<T>& member, const Limits& limits, int line = __builtin_LINE()) {
        if (!stopped() && !is_at(i)) report_missing(i, line);
        repeated_values(i, member, limits, line);
    }
    template <class T>
    void at_least_one(unsigned i, list<T>& member, int line = __builtin_LINE()) {
        if (!stopped() && !is_at(i)) report_missing(i, line);
        repeated(i, member, line);
    }

    /// A substitution group names the event by its own table; behind it this class's table holds again.
    template <class Group>
    void group(unsigned i, child<Group>& member) {
        if (stopped() || !Group::is_member(m_reader, *m_name)) return;
        if (!finish_group(member.storage().unmarshal(m_reader, m_name, m_error))) return;
        member.mark_set();
        name_event(m_next[i]);
    }
    template <class Group>
    void groups(unsigned i, list<Group>& member) {
        while (!stopped() && Group::is_member(m_reader, *m_name)) {
            if (!finish_group(member.append().unmarshal(m_reader, m_name, m_error))) return;
            name_event(m_next[i]);
        }
    }

    /// Behind the last element: a list that needs an entry and has none is reported once more, under the
    /// name of the class's own type.
    void lists_filled(bool filled, const char* type_name, int line = __builtin_LINE());

    // The options of a choice.
    int which() const;
    template <class T, class Limits>
    void option_value(T& value, const Limits& limits, int line = __builtin_LINE()) {
        eqbx_error error = qbxV2::EQBX_NO_ERROR;
        if (take_text(white_space(value, limits), &error)) {
            if (!store(m_reader.value_buffer(), value, limits, *m_name, line)) return;
        } else if (!report(error, *m_name, line)) {
            return;
        }
        advance_in_choice(line);
    }
    template <class T>
    void option_object(T& object, int line = __builtin_LINE()) {
        if (finish_object(object.unmarshal(m_reader, *m_name))) advance_in_choice(line);
    }
    void no_option(int line = __builtin_LINE());

    /// What `unmarshal_body` returns.
    bool done() const { return !stopped(); }

private:
    bool is_at(unsigned i) const { return m_reader.get_current_event() == m_rows[i].token; }
    bool at_element() const { return m_reader.is_current_event_tokenisable(); }
    void name_event(names_between names);
    void advance(unsigned i, int line);
    void advance_in_choice(int line);
    void advance_to(const s_event_map* first, const s_event_map* last, int line);
    bool take_text(qbxV2::eqbx_whitespace mode, eqbx_error* error);
    void report_missing(unsigned i, int line);
    bool finish_object(eqbx_error result);
    bool finish_group(bool read);

    template <class T, class Limits>
    void read_single(unsigned i, single<T>& member, const Limits& limits, int line) {
        eqbx_error error = qbxV2::EQBX_NO_ERROR;
        if (take_text(white_space(member.value, limits), &error)) {
            if (!store(m_reader.value_buffer(), member.value, limits, *m_name, line)) return;
            member.set = true;
        } else if (!report(error, *m_name, line)) {
            return;
        }
        advance(i, line);
    }
    template <class T>
    void read_child(unsigned i, child<T>& member, int line) {
        if (!finish_object(member.storage().unmarshal(m_reader, *m_name))) return;
        member.mark_set();
        advance(i, line);
    }

    std::string* m_name;
    const s_event_map* m_rows;
    const names_between* m_next;
};

/// The content of an element that takes elements of any name and keeps them as text.
class any_reader : public reporting {
public:
    any_reader(c_xml_reader& reader, std::string* name, eqbx_error* error, const char* source)
        : reporting(reader, error, source), m_name(name) {}

    void read(list<qbxV2::c_any_info>& entries, int line = __builtin_LINE());
    bool done() const { return !stopped(); }

private:
    void read_entry(qbxV2::c_any_info& entry, int line);

    std::string* m_name;
};

/// The text of an element that has attributes and no children.
class text_reader : public reporting {
public:
    text_reader(c_xml_reader& reader, const std::string& name, eqbx_error* error, const char* source)
        : reporting(reader, error, source), m_name(name) {}

    template <class T, class Limits>
    bool read(single<T>& member, const Limits& limits, bool has_content, int line = __builtin_LINE()) {
        std::string& text = m_reader.value_buffer();
        if (!take_text(text, white_space(member.value, limits), has_content, line)) return !stopped();
        if (!store(text, member.value, limits, m_name, line)) return false;
        member.set = true;
        return true;
    }

private:
    bool take_text(std::string& text, qbxV2::eqbx_whitespace mode, bool has_content, int line);

    const std::string& m_name;
};

}  // namespace vrl_v2::frame
