#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <unordered_set>
#include <vector>

#include "platform/api.h"
#include "runtime/repository.h"
#include "runtime/utf8_decoder.h"

namespace qbxV2 {

/// A getter that delivers the text of entities as input, and holds the tables of general and parameter
/// entities.
class VRL_API c_get_with_entities : public c_get_as_utf8 {
public:
    /// What the entities of one document may deliver in bytes, unless `set_max_entity_expansion` says
    /// otherwise.
    static constexpr std::size_t k_default_max_entity_expansion = std::size_t{64} << 20;

    c_get_with_entities(c_read& source, c_error& errors) : c_get_as_utf8(source, errors) {}

    /// The next value. Bytes of entity text from 0x80 come as negative values; they count no lines.
    int get() {
        int c;
        return get_plain(&c) ? c : get_with_entities();
    }
    /// Pushes a value back, onto the innermost open entity if there is one.
    void unget(int c);
    /// Back to the start: empties both tables. Entities that are open stay open and deliver the rest of their
    /// text.
    void rewind();

    /// Defines an entity; the last definition of a name wins. An open entity is read to the end of its old
    /// text.
    void add_general_entity(const char* name, const char* value);
    void add_parameter_entity(const char* name, const char* value);
    /// The value, owned by the table: valid until the name is defined again.
    bool get_general_entity(const char* name, const char** value) const {
        return m_general.find(name, value);
    }
    bool get_parameter_entity(const char* name, const char** value) const {
        return m_parameter.find(name, value);
    }

    /// Makes a value the next input; it must stay unchanged until it is read. False after a fatal
    /// EQBX_BAD_DTD report: when this very value is open already, or when the limit of entity text is
    /// exceeded.
    bool set_input_entity_value(const char* value);
    std::size_t get_entity_stack_depth() const { return m_frames.size(); }

    /// Stands for the reading of one reference, from behind its "&" or "%". An entity whose text ends within
    /// the reference counts as open for what it refers to: "&a" as the whole text of `a` is a recursion like
    /// "&a;".
    class c_reference {
    public:
        explicit c_reference(c_get_with_entities& getter) : m_getter(getter) {
            m_getter.m_in_reference = true;
        }
        c_reference(const c_reference&) = delete;
        c_reference& operator=(const c_reference&) = delete;
        ~c_reference() { m_getter.end_reference(); }

    private:
        c_get_with_entities& m_getter;
    };

    /// Limits the bytes that entities may deliver in one document, as input and within values together.
    void set_max_entity_expansion(std::size_t bytes) { m_max_expansion = bytes; }
    /// Counts the bytes of an entity value that is about to be delivered. False after a fatal EQBX_BAD_DTD
    /// report.
    bool admit_entity_text(const char* value);
    /// Whether the limit has refused something: its report alone cannot be told from that of a bad DTD.
    bool has_exceeded_entity_expansion() const { return m_has_exceeded_expansion; }
    /// The fatal report of an entity that contains itself. Always false.
    bool refuse_recursion(const char* value);

private:
    struct s_frame {
        const char* cursor;
        const char* start;
        c_unget_buffer unget;
    };
    using entity_table = c_repository<const char*>;

    int get_with_entities();
    void define(entity_table* table, const char* name, const char* value);
    void keep_text(s_frame* frame);
    void close_frame();
    void end_reference();

    std::vector<s_frame> m_frames;
    std::vector<const char*> m_ended_in_reference;
    bool m_in_reference = false;
    std::unordered_set<const char*> m_open;
    entity_table m_general;
    entity_table m_parameter;
    std::vector<std::unique_ptr<char[]>> m_kept_texts;
    std::size_t m_expanded = 0;
    std::size_t m_max_expansion = k_default_max_entity_expansion;
    bool m_has_exceeded_expansion = false;
};

/// Where the characters of a reference come from, from behind its "&". In input mode an entity's text becomes
/// input; otherwise it is expanded into the output.
class VRL_API c_entity_name_reader {
public:
    explicit c_entity_name_reader(bool input_mode) : m_input_mode(input_mode) {}
    c_entity_name_reader(const c_entity_name_reader&) = delete;
    c_entity_name_reader& operator=(const c_entity_name_reader&) = delete;
    virtual ~c_entity_name_reader();
    /// The next value, or -1.
    virtual int get() = 0;
    /// Takes the last value back.
    virtual void unget(int c) = 0;
    bool is_input_mode() const { return m_input_mode; }

private:
    bool m_input_mode;
};

/// From the input itself.
class VRL_API c_entity_name_reader_for_c_get : public c_entity_name_reader {
public:
    c_entity_name_reader_for_c_get(c_get_with_entities& getter, bool input_mode)
        : c_entity_name_reader(input_mode), m_getter(getter) {}
    int get() override { return m_getter.get(); }
    void unget(int c) override { m_getter.unget(c); }

private:
    c_get_with_entities& m_getter;
};

/// From a NUL-terminated text, by a cursor of the caller's that moves along.
class VRL_API c_entity_name_reader_for_entity : public c_entity_name_reader {
public:
    /// `cursor` stands within the text that begins at `start`.
    c_entity_name_reader_for_entity(const char* start, const char** cursor)
        : c_entity_name_reader(false), m_start(start), m_cursor(cursor) {}
    int get() override { return **m_cursor == '\0' ? -1 : static_cast<unsigned char>(*(*m_cursor)++); }
    void unget(int c) override {
        if (c != -1 && *m_cursor != m_start) --*m_cursor;
    }

private:
    const char* m_start;
    const char** m_cursor;
};

/// From a NUL-terminated text, by an index of the caller's that moves along.
class VRL_API c_entity_name_reader_for_c_str : public c_entity_name_reader {
public:
    c_entity_name_reader_for_c_str(const char* text, std::size_t* index)
        : c_entity_name_reader(false), m_text(text), m_index(index) {}
    int get() override {
        return m_text[*m_index] == '\0' ? -1 : static_cast<unsigned char>(m_text[(*m_index)++]);
    }
    void unget(int c) override {
        if (c != -1 && *m_index != 0) --*m_index;
    }

private:
    const char* m_text;
    std::size_t* m_index;
};

}  // namespace qbxV2
