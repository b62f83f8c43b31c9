#include "runtime/xml_text_source.h"

namespace qbxV2 {

// XML 1.0, production 23 XMLDecl, read loosely: what is between the parts need not be white space.

bool c_get_for_xml::read_xml_decl() {
    if (!read_version()) return false;
    int c = get_non_ws();
    return read_encoding(&c) && read_standalone(&c) && c == '?' && get() == '>';
}

bool c_get_for_xml::read_version() {
    std::string value;
    if (get_non_ws() != 'v' || !read_specified_string_from_input("ersion") || get_non_ws() != '=' ||
        !get_simple_quoted_value(&value)) {
        error(EQBX_ET_ERROR, EQBX_BAD_XML_DECL, "Version not present in XML Decl");
        return false;
    }
    if (value == "1.0" || value == "1.1") return true;
    error(EQBX_ET_ERROR, EQBX_BAD_XML_VERSION, "XML version " + value + " not understood");
    return false;
}

/// Reads a part of the declaration whose first letter is in `*c`, and leaves the next character there.
c_get_for_xml::pseudo_value c_get_for_xml::read_pseudo_value(int* c, const char* rest_of_name,
                                                             std::string* value) {
    if (!read_specified_string_from_input(rest_of_name)) return pseudo_value::bad;
    *c = get_non_ws();
    if (*c != '=') return pseudo_value::none;
    return get_simple_quoted_value(value) ? pseudo_value::read : pseudo_value::bad;
}

bool c_get_for_xml::read_encoding(int* c) {
    if (*c != 'e') return true;
    std::string value;
    const pseudo_value result = read_pseudo_value(c, "ncoding", &value);
    if (result != pseudo_value::read) return result == pseudo_value::none;
    if (!set_encoding(value.c_str())) return false;
    *c = get_non_ws();
    return true;
}

bool c_get_for_xml::read_standalone(int* c) {
    if (*c != 's') return true;
    std::string value;
    const pseudo_value result = read_pseudo_value(c, "tandalone", &value);
    if (result != pseudo_value::read) return result == pseudo_value::none;
    if (value == "no") {
        error(EQBX_ET_ERROR, EQBX_BAD_XML_DECL, "XML Document is not standalone");
        return false;
    }
    *c = get_non_ws();
    return true;
}

}  // namespace qbxV2
