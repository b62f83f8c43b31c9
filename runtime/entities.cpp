#include "runtime/entities.h"

#include <cstring>

namespace qbxV2 {

c_entity_name_reader::~c_entity_name_reader() = default;

int c_get_with_entities::get_with_entities() {
    if (get_error_handler().is_fatal_errored()) return -1;
    while (!m_frames.empty() && m_frames.back().unget.empty() && *m_frames.back().cursor == '\0')
        close_frame();
    if (m_frames.empty()) return get_normalised();
    s_frame& frame = m_frames.back();
    if (!frame.unget.empty()) return frame.unget.get();
    // Intended: bytes from 0x80 are negative here, unlike those of the decoder.
    return static_cast<signed char>(*frame.cursor++);
}

void c_get_with_entities::unget(int c) {
    if (m_frames.empty()) {
        c_get_as_utf8::unget(c);
    } else {
        m_frames.back().unget.unget(c);
    }
}

void c_get_with_entities::rewind() {
    for (s_frame& frame : m_frames) keep_text(&frame);
    m_general.clear();
    m_parameter.clear();
    m_expanded = 0;
    c_get_as_utf8::rewind();
}

void c_get_with_entities::add_general_entity(const char* name, const char* value) {
    define(&m_general, name, value);
}

void c_get_with_entities::add_parameter_entity(const char* name, const char* value) {
    define(&m_parameter, name, value);
}

void c_get_with_entities::define(entity_table* table, const char* name, const char* value) {
    const char* old = nullptr;
    if (table->find(name, &old) && m_open.count(old) != 0) {
        for (s_frame& frame : m_frames) {
            if (frame.start == old) keep_text(&frame);
        }
    }
    table->add(name, value);
}

/// The table is about to free a text that is still being read: the frame goes on with a copy.
void c_get_with_entities::keep_text(s_frame* frame) {
    const bool is_read_out = *frame->cursor == '\0';
    const std::size_t size = std::strlen(frame->start) + 1;
    std::unique_ptr<char[]> copy(new char[size]);
    std::memcpy(copy.get(), frame->start, size);
    m_open.erase(frame->start);
    m_open.insert(copy.get());
    frame->cursor =
        copy.get() + (is_read_out ? static_cast<std::ptrdiff_t>(size - 1) : frame->cursor - frame->start);
    frame->start = copy.get();
    m_kept_texts.push_back(std::move(copy));
}

bool c_get_with_entities::set_input_entity_value(const char* value) {
    if (m_open.count(value) != 0) return refuse_recursion(value);
    if (!admit_entity_text(value)) return false;
    // What ended while the reference was read lies beneath what it refers to, with nothing left to read.
    for (; !m_ended_in_reference.empty(); m_ended_in_reference.pop_back()) {
        m_frames.push_back(s_frame{"", m_ended_in_reference.back(), c_unget_buffer()});
    }
    m_frames.push_back(s_frame{value, value, c_unget_buffer()});
    m_open.insert(value);
    block_runs(block_entity, true);
    return true;
}

void c_get_with_entities::close_frame() {
    const char* const start = m_frames.back().start;
    m_frames.pop_back();
    if (m_in_reference) {
        m_ended_in_reference.push_back(start);
    } else {
        m_open.erase(start);
    }
    if (!m_frames.empty()) return;
    if (!m_in_reference) m_kept_texts.clear();
    block_runs(block_entity, false);
}

void c_get_with_entities::end_reference() {
    m_in_reference = false;
    for (const char* const start : m_ended_in_reference) m_open.erase(start);
    m_ended_in_reference.clear();
    if (m_frames.empty()) m_kept_texts.clear();
}

bool c_get_with_entities::admit_entity_text(const char* value) {
    const std::size_t size = std::strlen(value);
    if (m_expanded <= m_max_expansion && size <= m_max_expansion - m_expanded) {
        m_expanded += size;
        return true;
    }
    m_has_exceeded_expansion = true;
    error(EQBX_ET_FATAL, EQBX_BAD_DTD,
          "Entity expansion exceeds the limit of " + std::to_string(m_max_expansion) + " bytes");
    return false;
}

bool c_get_with_entities::refuse_recursion(const char* value) {
    error(EQBX_ET_FATAL, EQBX_BAD_DTD, std::string("Recursive entity definition for: ") + value);
    return false;
}

}  // namespace qbxV2
