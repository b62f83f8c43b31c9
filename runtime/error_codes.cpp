#include "runtime/error_codes.h"

namespace qbxV2 {
namespace {

struct description {
    eqbx_error code;
    const char* text;
};

constexpr description k_descriptions[] = {
    {EQBX_NO_ERROR, "No Error"},
    {EQBX_FILE_NOT_OPENED, "Unable to open file"},
    {EQBX_ALL_CARDINALITY_VIOLATED, "Violation of xs:all cardinality constraints"},
    {EQBX_ATTRIBUTE_ALREADY_READ, "Attribute has already been read"},
    {EQBX_ATTRIBUTES_IN_ANONYMOUS_COMPOSITOR, "Attributes found in anonymous compositor"},
    {EQBX_BADLY_FORMED, "XML badly formed"},
    {EQBX_BAD_CHAR_ENCODING, "XML character encoding not supported"},
    {EQBX_BAD_CHOICE, "Inappropriate choice option selected"},
    {EQBX_BAD_COMMENT, "Badly formed comment"},
    {EQBX_BAD_DTD, "Badly formed DTD"},
    {EQBX_BAD_END_OF_ELEMENT, "Bad end of element"},
    {EQBX_BAD_START_TAG_END, "Bad start tag end"},
    {EQBX_BAD_END_TAG, "Syntax error in end tag"},
    {EQBX_BAD_XML_DECL, "Bad XML Decl spec"},
    {EQBX_BAD_XML_VERSION, "Unsupported XML version"},
    {EQBX_ENCODING_MISMATCH, "Mis-match between specified char encoding and read bytes"},
    {EQBX_ELEMENT_NOT_FOUND, "Element not found"},
    {EQBX_EXTERNAL_ENTITY, "Reference to external entity"},
    {EQBX_FRACTION_DIGITS_EXCEEDED, "Fraction digits exceeded"},
    {EQBX_LENGTH_TOO_LONG, "Length too long"},
    {EQBX_LENGTH_TOO_SHORT, "Length too short"},
    {EQBX_MANDATORY_ELEMENT_MISSING, "Mandatory element missing"},
    {EQBX_NO_PATTERN_MATCHED, "No pattern matched"},
    {EQBX_NOT_WELL_FORMED, "Not well formed"},
    {EQBX_RECURSIVE_ENTITY, "Recursive entity definition"},
    {EQBX_REQUIRED_ATTRIBUTE_MISSING, "Required attribute(s) missing"},
    {EQBX_MAX_OCCURS_EXCEEDED, "Element instances exceeds maxOccurs"},
    {EQBX_TOTAL_DIGITS_EXCEEDED, "Total digits exceeded"},
    {EQBX_ATTRIBUTE_VALUE_UNREADABLE, "Unable to read attribute value"},
    {EQBX_ELEMENT_VALUE_UNREADABLE, "Unable to read element value"},
    {EQBX_UNKNOWN_ALL_ELEMENT, "Unknown element in xs:all"},
    {EQBX_UNKNOWN_ELEMENT, "Unknown element in complexContent"},
    {EQBX_UNEXPECTED_EMPTY_ELEMENT, "Unexpected empty element"},
    {EQBX_UNEXPECTED_ENTITY, "Unexpected entity"},
    {EQBX_UNEXPECTED_END, "Unexpected end of message"},
    {EQBX_VALUE_BAD_FORMAT, "Invalid value format for this type"},
    {EQBX_VALUE_TOO_LARGE, "Value greater than specified maximum"},
    {EQBX_VALUE_TOO_SMALL, "Value less than specified minimum"},
    {EQBX_VALUE_NOT_ENUMERATED, "Value does not match enumerations"},
    {EQBX_UNEXPECTED_ATTRIBUTE, "Unexpected attribute"},
    {EQBX_NILLED_BODY_NOT_EMPTY, "Nilled element body not empty"},
    {EQBX_ENTITY_NOT_FOUND, "Entity not found"},
    {EQBX_UNDEFINED_ERROR, "Undefined error"},
    {EQBX_VALUE_NOT_FIXED, "Value does not match specified fixed constraint"},
    {EQBX_UNKNOWN_XSI_TYPE, "Unknown xsi:type"},
    {EQBX_TYPE_NOT_SET, "Type not set"},
    {EQBX_OCCURS_ERROR_ON_MARSHAL, "min/max occurs error on marshaling"},
    {EQBX_USER_ERROR_1, "User defined error 1"},
    {EQBX_USER_ERROR_2, "User defined error 2"},
    {EQBX_USER_ERROR_3, "User defined error 3"},
    {EQBX_USER_ERROR_4, "User defined error 4"},
    {EQBX_USER_ERROR_5, "User defined error 5"},
    {EQBX_USER_ERROR_6, "User defined error 6"},
    {EQBX_USER_ERROR_7, "User defined error 7"},
    {EQBX_USER_ERROR_8, "User defined error 8"},
    {EQBX_USER_ERROR_9, "User defined error 9"},
};

}  // namespace

const char* get_error_description(eqbx_error code) {
    for (const description& row : k_descriptions) {
        if (row.code == code) return row.text;
    }
    return "";
}

}  // namespace qbxV2
