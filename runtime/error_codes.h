#pragma once

#include "platform/api.h"

namespace qbxV2 {

/// The result of every operation that can fail, in the runtime and in the model: 0 is success.
/// 1 to 46 are the library's own; 1000 to 1008 are free for a caller's `user_handle_error`.
/// The text of each code is what `get_error_description` answers.
enum eqbx_error : int {
    EQBX_NO_ERROR = 0,                            ///< No Error
    EQBX_FILE_NOT_OPENED = 1,                     ///< Unable to open file
    EQBX_ALL_CARDINALITY_VIOLATED = 2,            ///< Violation of xs:all cardinality constraints
    EQBX_ATTRIBUTE_ALREADY_READ = 3,              ///< Attribute has already been read
    EQBX_ATTRIBUTES_IN_ANONYMOUS_COMPOSITOR = 4,  ///< Attributes found in anonymous compositor
    EQBX_BADLY_FORMED = 5,                        ///< XML badly formed
    EQBX_BAD_CHAR_ENCODING = 6,                   ///< XML character encoding not supported
    EQBX_BAD_CHOICE = 7,                          ///< Inappropriate choice option selected
    EQBX_BAD_COMMENT = 8,                         ///< Badly formed comment
    EQBX_BAD_DTD = 9,                             ///< Badly formed DTD
    EQBX_BAD_END_OF_ELEMENT = 10,                 ///< Bad end of element
    EQBX_BAD_START_TAG_END = 11,                  ///< Bad start tag end
    EQBX_BAD_END_TAG = 12,                        ///< Syntax error in end tag
    EQBX_BAD_XML_DECL = 13,                       ///< Bad XML Decl spec
    EQBX_BAD_XML_VERSION = 14,                    ///< Unsupported XML version
    EQBX_ENCODING_MISMATCH = 15,           ///< Mis-match between specified char encoding and read bytes
    EQBX_ELEMENT_NOT_FOUND = 16,           ///< Element not found
    EQBX_EXTERNAL_ENTITY = 17,             ///< Reference to external entity
    EQBX_FRACTION_DIGITS_EXCEEDED = 18,    ///< Fraction digits exceeded
    EQBX_LENGTH_TOO_LONG = 19,             ///< Length too long
    EQBX_LENGTH_TOO_SHORT = 20,            ///< Length too short
    EQBX_MANDATORY_ELEMENT_MISSING = 21,   ///< Mandatory element missing
    EQBX_NO_PATTERN_MATCHED = 22,          ///< No pattern matched
    EQBX_NOT_WELL_FORMED = 23,             ///< Not well formed
    EQBX_RECURSIVE_ENTITY = 24,            ///< Recursive entity definition
    EQBX_REQUIRED_ATTRIBUTE_MISSING = 25,  ///< Required attribute(s) missing
    EQBX_MAX_OCCURS_EXCEEDED = 26,         ///< Element instances exceeds maxOccurs
    EQBX_TOTAL_DIGITS_EXCEEDED = 27,       ///< Total digits exceeded
    EQBX_ATTRIBUTE_VALUE_UNREADABLE = 28,  ///< Unable to read attribute value
    EQBX_ELEMENT_VALUE_UNREADABLE = 29,    ///< Unable to read element value
    EQBX_UNKNOWN_ALL_ELEMENT = 30,         ///< Unknown element in xs:all
    EQBX_UNKNOWN_ELEMENT = 31,             ///< Unknown element in complexContent
    EQBX_UNEXPECTED_EMPTY_ELEMENT = 32,    ///< Unexpected empty element
    EQBX_UNEXPECTED_ENTITY = 33,           ///< Unexpected entity
    EQBX_UNEXPECTED_END = 34,              ///< Unexpected end of message
    EQBX_VALUE_BAD_FORMAT = 35,            ///< Invalid value format for this type
    EQBX_VALUE_TOO_LARGE = 36,             ///< Value greater than specified maximum
    EQBX_VALUE_TOO_SMALL = 37,             ///< Value less than specified minimum
    EQBX_VALUE_NOT_ENUMERATED = 38,        ///< Value does not match enumerations
    EQBX_UNEXPECTED_ATTRIBUTE = 39,        ///< Unexpected attribute
    EQBX_NILLED_BODY_NOT_EMPTY = 40,       ///< Nilled element body not empty
    EQBX_ENTITY_NOT_FOUND = 41,            ///< Entity not found
    EQBX_UNDEFINED_ERROR = 42,             ///< Undefined error
    EQBX_VALUE_NOT_FIXED = 43,             ///< Value does not match specified fixed constraint
    EQBX_UNKNOWN_XSI_TYPE = 44,            ///< Unknown xsi:type
    EQBX_TYPE_NOT_SET = 45,                ///< Type not set
    EQBX_OCCURS_ERROR_ON_MARSHAL = 46,     ///< min/max occurs error on marshaling
    EQBX_USER_ERROR_1 = 1000,              ///< User defined error 1
    EQBX_USER_ERROR_2 = 1001,              ///< User defined error 2
    EQBX_USER_ERROR_3 = 1002,              ///< User defined error 3
    EQBX_USER_ERROR_4 = 1003,              ///< User defined error 4
    EQBX_USER_ERROR_5 = 1004,              ///< User defined error 5
    EQBX_USER_ERROR_6 = 1005,              ///< User defined error 6
    EQBX_USER_ERROR_7 = 1006,              ///< User defined error 7
    EQBX_USER_ERROR_8 = 1007,              ///< User defined error 8
    EQBX_USER_ERROR_9 = 1008,              ///< User defined error 9
};

/// How bad a report of the scanner is, and so which counts of `c_error` it raises.
enum eqbx_error_type : int {
    EQBX_ET_FATAL = 0,    ///< fatal and error count; the input ends here for good
    EQBX_ET_ERROR = 1,    ///< error count
    EQBX_ET_WARNING = 2,  ///< warning count
    EQBX_ET_NOTE = 3,     ///< warning and note count
    EQBX_ET_NONE = 4,     ///< no count; any value above behaves like this one
};

/// The text of a code, never null. An unknown code gives the empty string. Any thread.
VRL_API const char* get_error_description(eqbx_error code);

}  // namespace qbxV2
