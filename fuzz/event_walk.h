#pragma once

#include <string>

#include "runtime/xml_reader.h"

namespace fuzz {

/// How a walk writes down what it meets: quickly, for comparing, or a line a step, for people.
enum class record { compact, readable };

/// Walks a whole input through a reader and writes down all that it meets: events, names, values, codes and
/// line numbers.
///
/// Which of the reader's calls reads an element is decided by its name and the steps before, so that an input
/// always takes the same way, and a fuzzer can find all of them.
class event_walk {
public:
    event_walk(qbxV2::c_xml_reader& reader, record form) : m_reader(reader), m_form(form) {}

    /// The record of the walk.
    std::string run();

private:
    enum class after { goes_on, ends };

    after read_event();
    void read_element(const std::string& name);
    bool read_attributes();
    void read_attribute();
    void read_content(const std::string& name, bool is_empty);
    unsigned choose(const std::string& name, unsigned count);
    qbxV2::eqbx_whitespace mode() { return static_cast<qbxV2::eqbx_whitespace>(m_steps % 3); }
    void note(const char* what, int result, const std::string& text);

    qbxV2::c_xml_reader& m_reader;
    record m_form;
    std::string m_log;
    std::string m_value;
    unsigned m_steps = 0;
    unsigned m_failures = 0;
    unsigned m_depth = 0;
};

}  // namespace fuzz
