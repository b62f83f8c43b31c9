#include "runtime/text_cursor.h"

#include <gtest/gtest.h>

namespace {

using qbxV2::detail::is_ascii_digit;
using qbxV2::detail::text_cursor;

TEST(TextCursor, StepsOnlyOverWhatIsAskedFor) {
    text_cursor cursor("-12.", 4);
    EXPECT_FALSE(cursor.accept('+'));
    EXPECT_TRUE(cursor.accept_sign());
    EXPECT_EQ(cursor.rest(), 3U);
    EXPECT_FALSE(cursor.accept_digits(3));
    EXPECT_EQ(cursor.rest(), 3U);
    EXPECT_TRUE(cursor.accept_digits(2));
    EXPECT_TRUE(cursor.accept('.'));
    EXPECT_TRUE(cursor.at_end());
    EXPECT_FALSE(cursor.accept('\0'));
    EXPECT_FALSE(cursor.accept_digits(1));
    EXPECT_EQ(cursor.skip_digits(), 0U);
}

TEST(TextCursor, TellsAMinusFromAPlus) {
    text_cursor plus("+1", 2);
    EXPECT_FALSE(plus.accept_sign());
    EXPECT_EQ(plus.rest(), 1U);
    text_cursor none("1", 1);
    EXPECT_FALSE(none.accept_sign());
    EXPECT_EQ(none.rest(), 1U);
}

TEST(TextCursor, AddsDigitsUpModulo32Bits) {
    text_cursor cursor("4294967297x", 11);
    std::uint32_t value = 9;
    EXPECT_EQ(cursor.read_digits(value), 10U);
    EXPECT_EQ(value, 1U);
    EXPECT_EQ(cursor.read_digits(value), 0U);
    EXPECT_EQ(value, 0U);
}

TEST(TextCursor, AMantissaHasADigitAndAtMostOnePoint) {
    for (const std::string text : {"1", "1.", ".5", "1.5"}) {
        text_cursor cursor(text.data(), text.size());
        EXPECT_TRUE(cursor.accept_mantissa() && cursor.at_end()) << text;
    }
    for (const std::string text : {"", ".", "x", "1.2.3", "1x"}) {
        text_cursor cursor(text.data(), text.size());
        EXPECT_FALSE(cursor.accept_mantissa() && cursor.at_end()) << text;
    }
}

TEST(IsAsciiDigit, TakesTenBytes) {
    int count = 0;
    for (int c = -128; c < 128; ++c) count += is_ascii_digit(static_cast<char>(c)) ? 1 : 0;
    EXPECT_EQ(count, 10);
    EXPECT_TRUE(is_ascii_digit('0') && is_ascii_digit('9'));
}

}  // namespace
