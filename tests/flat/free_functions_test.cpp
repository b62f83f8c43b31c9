#include <cctype>
#include <stdexcept>

#include "runtime/values.h"
#include "tests/flat/reported_null.h"

/// The functions without an object: texts, characters, constants.
namespace vrl_flat_driver {
namespace {

class FlatFreeFunctions : public testing::Test {
protected:
    void SetUp() override { listen_for_nulls(); }
};

TEST_F(FlatFreeFunctions, AnswerAsTheFunctionsBehindThem) {
    for (const char* const text : {"", "-00.10", "12.", "1.5e3", "1.5", "true", "0", "false", "TRUE", "1e5",
                                   "1e", "+0", "-007", "1.0", "INF", "Gr\xC3\xBCn", "\xE2\x82\xAC\xE2\x82"}) {
        EXPECT_EQ(CSharp_fraction_digits(text), qbxV2::fraction_digits(text)) << text;
        EXPECT_EQ(CSharp_total_digits(text), qbxV2::total_digits(text)) << text;
        EXPECT_EQ(CSharp_length(text), qbxV2::length(text)) << text;
        EXPECT_EQ(CSharp_is_valid_bool(text), qbxV2::is_valid_bool(text) ? 1 : 0) << text;
        EXPECT_EQ(CSharp_is_valid_float(text), qbxV2::is_valid_float(text) ? 1 : 0) << text;
        EXPECT_EQ(CSharp_is_valid_integer(text), qbxV2::is_valid_integer(text) ? 1 : 0) << text;
        for (const std::uint32_t length : {0U, 1U, 4U, 5U}) {
            EXPECT_EQ(CSharp_is_min_length_ok(text, length), qbxV2::is_min_length_ok(text, length) ? 1 : 0);
            EXPECT_EQ(CSharp_is_max_length_ok(text, length), qbxV2::is_max_length_ok(text, length) ? 1 : 0);
        }
    }
    EXPECT_EQ(CSharp_total_digits("-00.10"), 4);
    EXPECT_EQ(CSharp_fraction_digits("1.5e3"), 2);
    EXPECT_EQ(CSharp_length("Gr\xC3\xBCn"), 4U);
    expect_no_message();
}

TEST_F(FlatFreeFunctions, ReportANullText) {
    using of_text = int32_t (*)(const char*);
    for (const of_text function :
         {of_text(&CSharp_fraction_digits), of_text(&CSharp_total_digits), of_text(&CSharp_is_valid_bool),
          of_text(&CSharp_is_valid_float), of_text(&CSharp_is_valid_integer),
          of_text(&CSharp_c_binary_is_valid_base64), of_text(&CSharp_c_binary_is_valid_hex),
          of_text(&CSharp_c_decimal_is_valid), of_text(&CSharp_c_duration_is_valid__SWIG_0)}) {
        EXPECT_EQ(function(nullptr), 0);
        expect_message("null string");
    }
    EXPECT_EQ(CSharp_length(nullptr), 0U);
    expect_message("null string");
    EXPECT_EQ(CSharp_is_min_length_ok(nullptr, 0), 0);
    expect_message("null string");
    EXPECT_EQ(CSharp_is_max_length_ok(nullptr, 9), 0);
    expect_message("null string");
}

TEST_F(FlatFreeFunctions, DescribeEveryCode) {
    for (int code = -1; code <= 1010; ++code) {
        EXPECT_EQ(CSharp_get_error_description(code),
                  qbxV2::get_error_description(static_cast<qbxV2::eqbx_error>(code)));
    }
}

TEST_F(FlatFreeFunctions, CompareAPartOfAText) {
    EXPECT_EQ(CSharp_stringncompare("hello world", "world", 6, 5), 0);
    EXPECT_EQ(CSharp_stringncompare("hello world", "world", 6, 500), 0) << "at most so many";
    EXPECT_NE(CSharp_stringncompare("hello world", "world", 6, 4), 0);
    EXPECT_EQ(CSharp_stringncompare("hello", "", 5, 1), 0) << "at the very end nothing is left";
    expect_no_message();
    EXPECT_EQ(CSharp_stringncompare(nullptr, "world", 0, 5), 0);
    expect_message("null string");
    EXPECT_EQ(CSharp_stringncompare("hello", nullptr, 0, 5), 0);
    expect_message("null string");
}

TEST_F(FlatFreeFunctions, LetTheNativeErrorOfAComparisonBehindTheEndPass) {
    EXPECT_THROW(CSharp_stringncompare("hello", "world", 6, 5), std::out_of_range);
    expect_no_message();
}

TEST_F(FlatFreeFunctions, ClassifyCharacters) {
    for (int c = -300; c <= 300; ++c) {
        const bool ascii = c >= 1 && c <= 127;
        const auto expected = [&](int (*test)(int)) { return ascii && test(c) != 0 ? 1 : 0; };
        EXPECT_EQ(CSharp_xisalnum(c), expected(std::isalnum)) << c;
        EXPECT_EQ(CSharp_xisalpha(c), expected(std::isalpha)) << c;
        EXPECT_EQ(CSharp_xisdigit(c), expected(std::isdigit)) << c;
        EXPECT_EQ(CSharp_xisprint(c), expected(std::isprint)) << c;
        EXPECT_EQ(CSharp_xisspace(c), expected(std::isspace)) << c;
        EXPECT_EQ(CSharp_xisxdigit(c), expected(std::isxdigit)) << c;
    }
}

TEST_F(FlatFreeFunctions, TellTheBuildSettings) {
    EXPECT_EQ(CSharp_QBXNULL_get(), 0);
    EXPECT_EQ(CSharp_QBX_ATOFLOAT_MODE_DEFAULT_get(), 0);
    EXPECT_EQ(CSharp_QBX_ATOFLOAT_MODE_USE_FACET_get(), 1);
    EXPECT_EQ(CSharp_QBX_ATOFLOAT_MODE_IOSTREAM_get(), 2);
    EXPECT_EQ(CSharp_QBX_ATOFLOAT_MODE_SIMPLE_get(), 3);
    EXPECT_EQ(CSharp_QBX_ATOFLOAT_MODE_get(), 0);
    EXPECT_EQ(CSharp_QBX_NARROW_UNICODE_STRINGS_get(), 0);
    EXPECT_EQ(CSharp_QBX_USE_EXCEPTIONS_get(), 0);
    EXPECT_EQ(CSharp_QBX_VALIDATE_PATTERNS_get(), 1);
    EXPECT_EQ(CSharp_QBX_WANT_DECIMAL_FLOAT_SET_get(), 1);
    EXPECT_EQ(CSharp_QBX_WANT_DLL_get(), 0);
    EXPECT_EQ(CSharp_QBX_WANT_GEN_IMPORT_DLL_get(), 0);
    EXPECT_EQ(CSharp_QBX_XML_STRICT_get(), 1);
}

}  // namespace
}  // namespace vrl_flat_driver
