#include "runtime/error_codes.h"

#include <gtest/gtest.h>

#include <iterator>

namespace {

using namespace qbxV2;

struct CodeText {
    int code;
    const char* text;
};
void PrintTo(const CodeText& c, std::ostream* os) { *os << c.code << ": '" << c.text << "'"; }

class ErrorDescription : public testing::TestWithParam<CodeText> {};

TEST_P(ErrorDescription, IsTheTextOfTheCode) {
    EXPECT_STREQ(get_error_description(static_cast<eqbx_error>(GetParam().code)), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    AllCodes, ErrorDescription,
    testing::Values(
        CodeText{0, "No Error"}, CodeText{1, "Unable to open file"},
        CodeText{2, "Violation of xs:all cardinality constraints"},
        CodeText{3, "Attribute has already been read"},
        CodeText{4, "Attributes found in anonymous compositor"}, CodeText{5, "XML badly formed"},
        CodeText{6, "XML character encoding not supported"},
        CodeText{7, "Inappropriate choice option selected"}, CodeText{8, "Badly formed comment"},
        CodeText{9, "Badly formed DTD"}, CodeText{10, "Bad end of element"},
        CodeText{11, "Bad start tag end"}, CodeText{12, "Syntax error in end tag"},
        CodeText{13, "Bad XML Decl spec"}, CodeText{14, "Unsupported XML version"},
        CodeText{15, "Mis-match between specified char encoding and read bytes"},
        CodeText{16, "Element not found"}, CodeText{17, "Reference to external entity"},
        CodeText{18, "Fraction digits exceeded"}, CodeText{19, "Length too long"},
        CodeText{20, "Length too short"}, CodeText{21, "Mandatory element missing"},
        CodeText{22, "No pattern matched"}, CodeText{23, "Not well formed"},
        CodeText{24, "Recursive entity definition"}, CodeText{25, "Required attribute(s) missing"},
        CodeText{26, "Element instances exceeds maxOccurs"}, CodeText{27, "Total digits exceeded"},
        CodeText{28, "Unable to read attribute value"}, CodeText{29, "Unable to read element value"},
        CodeText{30, "Unknown element in xs:all"}, CodeText{31, "Unknown element in complexContent"},
        CodeText{32, "Unexpected empty element"}, CodeText{33, "Unexpected entity"},
        CodeText{34, "Unexpected end of message"}, CodeText{35, "Invalid value format for this type"},
        CodeText{36, "Value greater than specified maximum"},
        CodeText{37, "Value less than specified minimum"}, CodeText{38, "Value does not match enumerations"},
        CodeText{39, "Unexpected attribute"}, CodeText{40, "Nilled element body not empty"},
        CodeText{41, "Entity not found"}, CodeText{42, "Undefined error"},
        CodeText{43, "Value does not match specified fixed constraint"}, CodeText{44, "Unknown xsi:type"},
        CodeText{45, "Type not set"}, CodeText{46, "min/max occurs error on marshaling"},
        CodeText{1000, "User defined error 1"}, CodeText{1001, "User defined error 2"},
        CodeText{1002, "User defined error 3"}, CodeText{1003, "User defined error 4"},
        CodeText{1004, "User defined error 5"}, CodeText{1005, "User defined error 6"},
        CodeText{1006, "User defined error 7"}, CodeText{1007, "User defined error 8"},
        CodeText{1008, "User defined error 9"}));

INSTANTIATE_TEST_SUITE_P(UnknownCodesGiveTheEmptyText, ErrorDescription,
                         testing::Values(CodeText{47, ""}, CodeText{999, ""}, CodeText{1009, ""},
                                         CodeText{-1, ""}));

constexpr eqbx_error k_from_0[] = {EQBX_NO_ERROR,
                                   EQBX_FILE_NOT_OPENED,
                                   EQBX_ALL_CARDINALITY_VIOLATED,
                                   EQBX_ATTRIBUTE_ALREADY_READ,
                                   EQBX_ATTRIBUTES_IN_ANONYMOUS_COMPOSITOR,
                                   EQBX_BADLY_FORMED,
                                   EQBX_BAD_CHAR_ENCODING,
                                   EQBX_BAD_CHOICE,
                                   EQBX_BAD_COMMENT,
                                   EQBX_BAD_DTD,
                                   EQBX_BAD_END_OF_ELEMENT,
                                   EQBX_BAD_START_TAG_END,
                                   EQBX_BAD_END_TAG,
                                   EQBX_BAD_XML_DECL,
                                   EQBX_BAD_XML_VERSION,
                                   EQBX_ENCODING_MISMATCH,
                                   EQBX_ELEMENT_NOT_FOUND,
                                   EQBX_EXTERNAL_ENTITY,
                                   EQBX_FRACTION_DIGITS_EXCEEDED,
                                   EQBX_LENGTH_TOO_LONG,
                                   EQBX_LENGTH_TOO_SHORT,
                                   EQBX_MANDATORY_ELEMENT_MISSING,
                                   EQBX_NO_PATTERN_MATCHED,
                                   EQBX_NOT_WELL_FORMED,
                                   EQBX_RECURSIVE_ENTITY,
                                   EQBX_REQUIRED_ATTRIBUTE_MISSING,
                                   EQBX_MAX_OCCURS_EXCEEDED,
                                   EQBX_TOTAL_DIGITS_EXCEEDED,
                                   EQBX_ATTRIBUTE_VALUE_UNREADABLE,
                                   EQBX_ELEMENT_VALUE_UNREADABLE,
                                   EQBX_UNKNOWN_ALL_ELEMENT,
                                   EQBX_UNKNOWN_ELEMENT,
                                   EQBX_UNEXPECTED_EMPTY_ELEMENT,
                                   EQBX_UNEXPECTED_ENTITY,
                                   EQBX_UNEXPECTED_END,
                                   EQBX_VALUE_BAD_FORMAT,
                                   EQBX_VALUE_TOO_LARGE,
                                   EQBX_VALUE_TOO_SMALL,
                                   EQBX_VALUE_NOT_ENUMERATED,
                                   EQBX_UNEXPECTED_ATTRIBUTE,
                                   EQBX_NILLED_BODY_NOT_EMPTY,
                                   EQBX_ENTITY_NOT_FOUND,
                                   EQBX_UNDEFINED_ERROR,
                                   EQBX_VALUE_NOT_FIXED,
                                   EQBX_UNKNOWN_XSI_TYPE,
                                   EQBX_TYPE_NOT_SET,
                                   EQBX_OCCURS_ERROR_ON_MARSHAL};
constexpr eqbx_error k_from_1000[] = {EQBX_USER_ERROR_1, EQBX_USER_ERROR_2, EQBX_USER_ERROR_3,
                                      EQBX_USER_ERROR_4, EQBX_USER_ERROR_5, EQBX_USER_ERROR_6,
                                      EQBX_USER_ERROR_7, EQBX_USER_ERROR_8, EQBX_USER_ERROR_9};
constexpr eqbx_error_type k_severities[] = {EQBX_ET_FATAL, EQBX_ET_ERROR, EQBX_ET_WARNING, EQBX_ET_NOTE,
                                            EQBX_ET_NONE};

template <class Enum, std::size_t N>
void expect_numbers_from(int first, const Enum (&in_order)[N]) {
    for (const Enum value : in_order) EXPECT_EQ(static_cast<int>(value), first++);
}

TEST(ErrorCodes, HaveTheirNumbers) {
    EXPECT_EQ(std::size(k_from_0) + std::size(k_from_1000), 56U);
    expect_numbers_from(0, k_from_0);
    expect_numbers_from(1000, k_from_1000);
    expect_numbers_from(0, k_severities);
}

}  // namespace
