#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/xml_text_source.h"

namespace qbxV2 {

/// What the reading of a DTD needs beyond single characters.
class VRL_API c_dtd_util {
public:
    explicit c_dtd_util(c_get_for_xml& getter) : m_getter(getter) {}

    int get() { return m_getter.get(); }
    void unget(int c) { m_getter.unget(c); }
    c_get_for_xml& getter() { return m_getter; }

    /// Skips white space and appends a word to `out`, up to white space, ">" or the end. Parameter entities
    /// are read in place. False at the end of input.
    bool get_entity_value(std::string* out);
    /// Skips white space and reads an entity's literal value. Parameter entities are read in place and
    /// character references resolved; references to general entities stay. The end of input ends the value.
    /// False without an opening quote.
    bool get_quoted_entity_value(std::string* out);
    /// Makes a parameter entity the input, from behind its "%". An unknown one is reported,
    /// EQBX_ENTITY_NOT_FOUND, and passed over. False after a fatal report.
    bool select_parameter_entity();

private:
    c_get_for_xml& m_getter;
};

/// Reads a document type declaration and takes from its internal subset nothing but entity definitions.
class VRL_API c_internal_dtd {
public:
    explicit c_internal_dtd(c_get_for_xml& getter) : m_getter(getter) {}

    /// From behind "<!DOCTYPE" to behind its ">". False at the end of input and after a fatal EQBX_BAD_DTD.
    bool read_doctype_decl();
    void reset() {}

private:
    bool read_markup();
    bool read_end_of_subset();
    bool read_entity_declaration();
    bool read_entity_definition();
    bool read_external_definition(c_dtd_util& util, std::string* keyword);
    void skip_declaration();
    bool refuse(const char* text, int c);

    c_get_for_xml& m_getter;
};

}  // namespace qbxV2
