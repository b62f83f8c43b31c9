#pragma once

namespace qbxV2 {

/// What an event call of the reader found. Values from EQXP_FIRST_TOKEN up are tokens of `s_event_map` rows.
enum eqxp_xml_event : int {
    EQXP_END_OF_MESSAGE = 0,  ///< the input ended where an element could start
    EQXP_UNKNOWN_ITEM = 1,    ///< a name that the table does not hold
    EQXP_ERROR_EVENT = 2,     ///< an error event too; the scanner uses EQXP_ERROR only
    EQXP_ERROR = 3,           ///< a failure; its report, if there is one, is in the error record
    EQXP_START_TAG_END = 4,   ///< the ">" of a start tag with a body
    EQXP_TEXT = 5,            ///< character data or a CDATA section; the text is in the name argument
    EQXP_END_TAG = 6,         ///< an end tag, or the "/>" of an empty element
    EQXP_NAME = 7,            ///< the name of a start tag, or of an attribute
    EQXP_XSI_TYPE = 8,
    EQXP_XSI_NIL = 9,
    EQXP_XSI_SCHEMA_LOCATION = 10,
    EQXP_XSI_NO_NAMESPACE_SCHEMA_LOCATION = 11,
    EQXP_FIRST_TOKEN = 12
};

}  // namespace qbxV2
