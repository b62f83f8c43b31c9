#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"
#include "runtime/entities.h"

namespace qbxV2 {

/// The attributes of one start tag as they were written: name, NUL, the opening quote, the raw value, NUL,
/// and so on; one more NUL at the end closes the buffer. Values keep their references until they are asked
/// for.
///
/// A NUL within a value ends it early, and what is behind it is then taken for a name. That follows from the
/// layout; no position ever leaves the buffer.
class VRL_API c_attribute_buffer {
public:
    c_attribute_buffer() { m_bytes.reserve(150); }

    void clear() {
        m_bytes.clear();
        m_position = 0;
    }
    bool empty() const { return m_bytes.empty(); }
    std::string& bytes() { return m_bytes; }
    const std::string& bytes() const { return m_bytes; }

    std::size_t position() const { return m_position; }
    void set_position(std::size_t position) { m_position = position; }

    /// Whether no name stands at the read position.
    bool is_used_up() const { return is_end(m_position); }
    bool is_end(std::size_t position) const { return position + 1 >= m_bytes.size(); }
    /// The NUL-terminated text at `position`, and the position behind its NUL.
    const char* text_at(std::size_t position) const { return m_bytes.c_str() + position; }
    std::size_t behind_text(std::size_t position) const {
        const std::size_t nul = m_bytes.find('\0', position);
        return nul == std::string::npos ? m_bytes.size() : nul + 1;
    }

    /// The character at the read position; NUL at the end.
    unsigned char current() const { return static_cast<unsigned char>(m_bytes.c_str()[m_position]); }
    /// Moves on by one, at most to the end.
    void advance() {
        if (m_position < m_bytes.size()) ++m_position;
    }

private:
    std::string m_bytes;
    std::size_t m_position = 0;
};

/// References within an attribute value: from the buffer's read position to the NUL.
class VRL_API c_entity_name_reader_for_attribute_data : public c_entity_name_reader {
public:
    explicit c_entity_name_reader_for_attribute_data(c_attribute_buffer& buffer)
        : c_entity_name_reader(false), m_buffer(buffer) {}
    int get() override;
    void unget(int c) override;

private:
    c_attribute_buffer& m_buffer;
};

}  // namespace qbxV2
