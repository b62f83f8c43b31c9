#include "runtime/wrapping_number.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

namespace {

using qbxV2::detail::wrapping_int;
using qbxV2::detail::wrapping_unsigned;

template <typename Number>
Number summed(const std::string& digits) {
    Number number;
    for (const char c : digits) number.append_digit(c);
    return number;
}

TEST(WrappingInt, NotesTheOverflowAndGoesOn) {
    EXPECT_EQ(summed<wrapping_int>("2147483647").value(), INT32_MAX);
    EXPECT_FALSE(summed<wrapping_int>("2147483647").overflow());
    EXPECT_EQ(summed<wrapping_int>("2147483648").value(), INT32_MIN);
    EXPECT_TRUE(summed<wrapping_int>("2147483648").overflow());
    EXPECT_EQ(summed<wrapping_int>("42949672960").value(), 0);
    EXPECT_TRUE(summed<wrapping_int>("42949672960").overflow());
}

TEST(WrappingInt, NegatesTheLeastValueIntoItself) {
    wrapping_int number = summed<wrapping_int>("2147483648");
    number.negate();
    EXPECT_EQ(number.value(), INT32_MIN);
}

TEST(WrappingUnsigned, NotesTheOverflowAndGoesOn) {
    EXPECT_EQ(summed<wrapping_unsigned>("4294967295").value(), UINT32_MAX);
    EXPECT_FALSE(summed<wrapping_unsigned>("4294967295").overflow());
    EXPECT_EQ(summed<wrapping_unsigned>("4294967296").value(), 0U);
    EXPECT_TRUE(summed<wrapping_unsigned>("4294967296").overflow());
    EXPECT_EQ(summed<wrapping_unsigned>("4294967300").value(), 4U);
    EXPECT_TRUE(summed<wrapping_unsigned>("4294967300").overflow());
}

TEST(WrappingNumbers, ZerosEqualSingleSteps) {
    for (std::uint64_t count = 0; count < 40; ++count) {
        wrapping_int many = summed<wrapping_int>("7");
        wrapping_unsigned many_unsigned = summed<wrapping_unsigned>("7");
        many.append_zeros(count);
        many_unsigned.append_zeros(count);
        const std::string digits = std::string("7").append(count, '0');
        EXPECT_EQ(many.value(), summed<wrapping_int>(digits).value()) << count;
        EXPECT_EQ(many.overflow(), summed<wrapping_int>(digits).overflow()) << count;
        EXPECT_EQ(many_unsigned.value(), summed<wrapping_unsigned>(digits).value()) << count;
        EXPECT_EQ(many_unsigned.overflow(), summed<wrapping_unsigned>(digits).overflow()) << count;
    }
}

TEST(WrappingNumbers, AnyNumberOfZerosEndsSoon) {
    wrapping_int number = summed<wrapping_int>("1");
    number.append_zeros(UINT64_MAX);
    EXPECT_EQ(number.value(), 0);
    EXPECT_TRUE(number.overflow());
}

}  // namespace
