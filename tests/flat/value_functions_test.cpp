#include <array>
#include <cstdint>
#include <cstring>
#include <string>

#include "V2/Vrl.h"
#include "tests/flat/flat_driver.h"
#include "tests/flat/reported_null.h"

/// The value classes of the runtime through their C functions.
namespace vrl_flat_driver {
namespace {

class FlatValues : public testing::Test {
protected:
    void SetUp() override { listen_for_nulls(); }
};

/// What a new object says of itself; it is freed.
std::string told(void* made, char* (*as_string)(void*), void (*destroy)(void*)) {
    std::string text = taken_text(as_string(made));
    destroy(made);
    return text;
}
std::string told_integer(void* made) {
    return told(made, &CSharp_c_big_int_get_as_string, &CSharp_delete_c_big_int);
}
std::string told_decimal(void* made) {
    return told(made, &CSharp_c_decimal_get_as_string, &CSharp_delete_c_decimal);
}

TEST_F(FlatValues, MakeIntegers) {
    EXPECT_EQ(told_integer(CSharp_new_c_big_int__SWIG_0()), "0");
    EXPECT_EQ(told_integer(CSharp_new_c_big_int__SWIG_2("+007")), "7");
    EXPECT_EQ(told_integer(CSharp_new_c_big_int__SWIG_4(-2147483647 - 1)), "-2147483648");
    void* const big = CSharp_new_c_big_int__SWIG_2("12345678901234567890");
    EXPECT_EQ(told_integer(CSharp_new_c_big_int__SWIG_1(big)), "12345678901234567890");
    EXPECT_DOUBLE_EQ(CSharp_c_big_int_get_as_float(big), 12345678901234567890.0);
    CSharp_delete_c_big_int(big);
    expect_no_message();
    EXPECT_EQ(CSharp_new_c_big_int__SWIG_1(nullptr), nullptr);
    expect_message("qbxV2::c_big_int const & type is null");
    EXPECT_EQ(CSharp_new_c_big_int__SWIG_2(nullptr), nullptr);
    expect_message("null string");
}

TEST_F(FlatValues, TellWhetherAnIntegerOverflows) {
    const auto overflows = [](const char* text) {
        void* const big = CSharp_new_c_big_int__SWIG_2(text);
        uint8_t overflow = 7;
        CSharp_c_big_int_get(big, &overflow);
        CSharp_delete_c_big_int(big);
        return overflow;
    };
    EXPECT_EQ(overflows("2147483647"), 0) << "the flag is cleared";
    EXPECT_EQ(overflows("2147483648"), 1);
    EXPECT_EQ(overflows("-2147483648"), 1);
}

TEST_F(FlatValues, SwapAndReportANullOneToSwapWith) {
    void* const one = CSharp_new_c_big_int__SWIG_4(1);
    void* const two = CSharp_new_c_big_int__SWIG_4(2);
    CSharp_c_big_int_swap(one, two);
    EXPECT_EQ(CSharp_c_big_int_get(one, nullptr), 2);
    EXPECT_EQ(CSharp_c_big_int_get(two, nullptr), 1);
    CSharp_c_big_int_swap(one, nullptr);
    expect_message("qbxV2::c_big_int & type is null");
    CSharp_delete_c_big_int(one);
    CSharp_delete_c_big_int(two);

    void* const decimal = CSharp_new_c_decimal__SWIG_5(1);
    void* const other = CSharp_new_c_decimal__SWIG_5(2);
    CSharp_c_decimal_swap(decimal, other);
    EXPECT_EQ(CSharp_c_decimal_get_integral(decimal, nullptr), 2);
    CSharp_c_decimal_swap(decimal, nullptr);
    expect_message("qbxV2::c_decimal & type is null");
    CSharp_delete_c_decimal(decimal);
    CSharp_delete_c_decimal(other);

    const uint8_t byte = 9;
    void* const bytes = CSharp_new_c_binary__SWIG_0();
    void* const more = CSharp_new_c_binary__SWIG_2(&byte, 1);
    CSharp_c_binary_swap(bytes, more);
    EXPECT_EQ(CSharp_c_binary_size(bytes), 1U);
    EXPECT_EQ(CSharp_c_binary_size(more), 0U);
    CSharp_c_binary_swap(bytes, nullptr);
    expect_message("qbxV2::c_binary & type is null");
    CSharp_delete_c_binary(bytes);
    CSharp_delete_c_binary(more);
}

TEST_F(FlatValues, MakeDecimals) {
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_0()), "0");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_2("0.50")), ".50");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_4(12345, 2)), "123.45");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_4(-12, -2)), "-1200");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_5(-12)), "-12") << "scale 0";
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_6(1.5, 2)), "1.50");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_6(1.5, 99)), "1.500000000000000");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_7(1.5)), "1.500000000000000") << "precision 15";
    void* const one = CSharp_new_c_decimal__SWIG_2("1.5");
    EXPECT_EQ(told_decimal(CSharp_new_c_decimal__SWIG_1(one)), "1.5");
    EXPECT_EQ(CSharp_c_decimal_get_as_float(one), 1.5);
    CSharp_delete_c_decimal(one);
    EXPECT_EQ(CSharp_c_decimal_is_valid("1."), 1);
    EXPECT_EQ(CSharp_c_decimal_is_valid("1e5"), 0);
    expect_no_message();
    EXPECT_EQ(CSharp_new_c_decimal__SWIG_1(nullptr), nullptr);
    expect_message("qbxV2::c_decimal const & type is null");
    EXPECT_EQ(CSharp_new_c_decimal__SWIG_2(nullptr), nullptr);
    expect_message("null string");
}

TEST_F(FlatValues, SetDecimalsWithTheDefaultsOfTheirShorterForms) {
    void* const value = CSharp_new_c_decimal__SWIG_0();
    const auto text = [&] { return taken_text(CSharp_c_decimal_get_as_string(value)); };
    CSharp_c_decimal_set__SWIG_0(value, 1.25, 3);
    EXPECT_EQ(text(), "1.250");
    CSharp_c_decimal_set__SWIG_1(value, 1.25);
    EXPECT_EQ(text(), "1.250000000000000");
    CSharp_c_decimal_set_scaled__SWIG_0(value, 5, 3);
    EXPECT_EQ(text(), ".005");
    CSharp_c_decimal_set_scaled__SWIG_1(value, 5);
    EXPECT_EQ(text(), "5");
    CSharp_c_decimal_set_fractional(value, 123, 5);
    EXPECT_EQ(text(), "5.00123");
    CSharp_c_decimal_set_integral(value, -7);
    EXPECT_EQ(text(), "-7.00123");
    CSharp_delete_c_decimal(value);
}

TEST_F(FlatValues, GetThePartsOfADecimal) {
    void* const value = CSharp_new_c_decimal__SWIG_2("123.456");
    uint8_t overflow = 7;
    EXPECT_EQ(CSharp_c_decimal_get_scaled(value, 2, &overflow), 12345);
    EXPECT_EQ(overflow, 0);
    EXPECT_EQ(CSharp_c_decimal_get_scaled(value, -1, nullptr), 12);
    overflow = 7;
    EXPECT_EQ(CSharp_c_decimal_get_fractional(value, 4, &overflow), 4560U);
    EXPECT_EQ(overflow, 0);
    CSharp_c_decimal_get_fractional(value, 12, &overflow);
    EXPECT_EQ(overflow, 1);
    EXPECT_EQ(CSharp_c_decimal_get_integral(value, &overflow), 123);
    EXPECT_EQ(overflow, 0);
    CSharp_delete_c_decimal(value);
}

TEST_F(FlatValues, HoldBytes) {
    const std::array<uint8_t, 3> given = {0, 0x80, 0xFF};
    void* const value = CSharp_new_c_binary__SWIG_2(given.data(), 3);
    EXPECT_EQ(CSharp_c_binary_size(value), 3U);
    EXPECT_EQ(CSharp_c_binary_equal(value, given.data(), 3), 1);
    EXPECT_EQ(CSharp_c_binary_equal(value, given.data(), 2), 0);
    void* const copy = CSharp_new_c_binary__SWIG_1(value);
    CSharp_c_binary_append(copy, 0xFE);
    const std::array<uint8_t, 4> longer = {0, 0x80, 0xFF, 0xFE};
    EXPECT_EQ(CSharp_c_binary_equal(copy, longer.data(), 4), 1);
    CSharp_c_binary_set(copy, nullptr, 0);
    EXPECT_EQ(CSharp_c_binary_size(copy), 0U);
    CSharp_delete_c_binary(copy);
    CSharp_delete_c_binary(value);
    EXPECT_EQ(CSharp_c_binary_is_valid_base64("TWE="), 1);
    EXPECT_EQ(CSharp_c_binary_is_valid_base64("TW"), 0);
    EXPECT_EQ(CSharp_c_binary_is_valid_hex("0aFF"), 1);
    EXPECT_EQ(CSharp_c_binary_is_valid_hex("0G"), 0);
    expect_no_message();
    EXPECT_EQ(CSharp_new_c_binary__SWIG_1(nullptr), nullptr);
    expect_message("qbxV2::c_binary const & type is null");
    CSharp_c_binary_append(nullptr, 1);
    expect_message("qbxV2::c_binary & type is null");
}

TEST_F(FlatValues, DescribeAnElementOfAnyName) {
    const auto texts = [](void* info) {
        std::string all = taken_text(CSharp_c_any_info_get_namespace(info)) + "|";
        all += taken_text(CSharp_c_any_info_get_name(info)) + "|";
        all += taken_text(CSharp_c_any_info_get_value(info));
        return all;
    };
    void* const whole = CSharp_new_c_any_info__SWIG_1("urn:x", "note", "<note/>");
    EXPECT_EQ(texts(whole), "urn:x|note|<note/>");
    CSharp_c_any_info_set_namespace(whole, "urn:y");
    CSharp_c_any_info_set_name(whole, "n");
    CSharp_c_any_info_set_value(whole, "<n/>");
    EXPECT_EQ(texts(whole), "urn:y|n|<n/>");
    for (const auto set :
         {&CSharp_c_any_info_set_namespace, &CSharp_c_any_info_set_name, &CSharp_c_any_info_set_value}) {
        set(whole, nullptr);
        expect_message("null string");
        set(nullptr, "x");
        expect_message("qbxV2::c_any_info & type is null");
    }
    EXPECT_EQ(texts(whole), "urn:y|n|<n/>");
    CSharp_delete_c_any_info(whole);

    void* const named = CSharp_new_c_any_info__SWIG_2("urn:x", "note");
    EXPECT_EQ(texts(named), "urn:x|note|");
    CSharp_delete_c_any_info(named);
    void* const bare = CSharp_new_c_any_info__SWIG_3("urn:x");
    EXPECT_EQ(texts(bare), "urn:x||");
    CSharp_delete_c_any_info(bare);
    void* const nothing = CSharp_new_c_any_info__SWIG_0();
    EXPECT_EQ(texts(nothing), "||");
    CSharp_delete_c_any_info(nothing);

    for (void* const made :
         {CSharp_new_c_any_info__SWIG_1(nullptr, "", ""), CSharp_new_c_any_info__SWIG_2("", nullptr),
          CSharp_new_c_any_info__SWIG_3(nullptr)}) {
        EXPECT_EQ(made, nullptr);
    }
    EXPECT_EQ(g_reported.calls, 3);
    EXPECT_EQ(g_reported.message, "null string");
}

TEST_F(FlatValues, MatchPatterns) {
    void* const pattern = CSharp_new_c_pattern("[a-c]+");
    EXPECT_EQ(CSharp_c_pattern_is_match__SWIG_0(pattern, "abc"), 1);
    EXPECT_EQ(CSharp_c_pattern_is_match__SWIG_0(pattern, "abcd"), 0) << "anchored at both ends";
    EXPECT_EQ(CSharp_c_pattern_is_match__SWIG_0(pattern, nullptr), 0);
    expect_message("null string");
    CSharp_delete_c_pattern(pattern);
    void* const bad = CSharp_new_c_pattern("(");
    EXPECT_EQ(CSharp_c_pattern_is_match__SWIG_0(bad, ""), 0);
    CSharp_delete_c_pattern(bad);
    EXPECT_EQ(CSharp_new_c_pattern(nullptr), nullptr);
    expect_message("null string");
}

TEST_F(FlatValues, TakeEveryTextWhereThereIsNoPattern) {
    for (const char* const ignored : {"[a-c]+", "(", "", static_cast<const char*>(nullptr)}) {
        void* const pattern = CSharp_new_c_pattern_null(ignored);
        ASSERT_NE(pattern, nullptr);
        EXPECT_EQ(CSharp_c_pattern_null_is_match__SWIG_0(pattern, ""), 1);
        EXPECT_EQ(CSharp_c_pattern_null_is_match__SWIG_0(pattern, "anything"), 1);
        expect_no_message();
        EXPECT_EQ(CSharp_c_pattern_null_is_match__SWIG_0(pattern, nullptr), 0);
        expect_message("null string");
        CSharp_delete_c_pattern_null(pattern);
    }
}

TEST_F(FlatValues, HoldTheResultOfWriting) {
    void* const result = CSharp_new_XMLDocumentResult(u"Gr\u00FCn", 46);
    EXPECT_EQ(taken_text(CSharp_XMLDocumentResult_getXmlDocument(result)), "Gr\xC3\xBCn");
    EXPECT_EQ(CSharp_XMLDocumentResult_getEqbxError(result), 46);
    CSharp_delete_XMLDocumentResult(result);
    void* const empty = CSharp_new_XMLDocumentResult(nullptr, 0);
    EXPECT_EQ(taken_text(CSharp_XMLDocumentResult_getXmlDocument(empty)), "");
    CSharp_delete_XMLDocumentResult(empty);
    expect_no_message();
}

TEST_F(FlatValues, IncludeTwoThatCanOnlyBeMade) {
    void* const empty = CSharp_new_c_empty();
    EXPECT_NE(empty, nullptr);
    CSharp_delete_c_empty(empty);
    // No function frees it: remembered, so that no leak is seen.
    static void* const base = CSharp_new_c_datetime_base();
    EXPECT_NE(base, nullptr);
}

TEST_F(FlatValues, GiveAPairForAnElementBeyondSixteenBits) {
    // The model's texts hold units; a caller in C++ may leave whole characters in them.
    vrl_v2::Header header;
    header.set_Creator(
        L"a\x1D11E"
        L"b");
    char16_t* const text = CSharp_Header_get_Creator(&header);
    std::uint32_t bytes = 0;
    std::memcpy(&bytes, reinterpret_cast<const char*>(text) - sizeof bytes, sizeof bytes);
    EXPECT_EQ(std::u16string(text, bytes / sizeof(char16_t)), u"a\U0001D11Eb");
    EXPECT_EQ(text[4], 0);
    vrl_free_string(text);
}

TEST_F(FlatValues, PassHalfAPairThroughAsItIs) {
    void* const header = CSharp_new_Header__SWIG_0();
    const std::u16string halves = {u'a', char16_t(0xD834), u'b', char16_t(0xDD1E)};
    EXPECT_EQ(CSharp_Header_set_Creator(header, halves.c_str()), 0);
    char16_t* const text = CSharp_Header_get_Creator(header);
    EXPECT_EQ(std::u16string(text, 4), halves);
    EXPECT_EQ(text[4], 0);
    vrl_free_string(text);
    CSharp_delete_Header(header);
}

}  // namespace
}  // namespace vrl_flat_driver
