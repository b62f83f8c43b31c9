#include "runtime/big_int.h"

#include <gtest/gtest.h>

#include <climits>
#include <cmath>
#include <iterator>
#include <random>
#include <sstream>
#include <vector>

namespace {

using qbxV2::c_big_int;

struct Parsed {
    const char* text;
    const char* value;
};
void PrintTo(const Parsed& c, std::ostream* os) { *os << "'" << c.text << "'"; }

class BigIntParsing : public testing::TestWithParam<Parsed> {};
TEST_P(BigIntParsing, KeepsANormalisedText) {
    const char* const text = GetParam().text;
    EXPECT_EQ(c_big_int(text).get_as_string(), GetParam().value);
    EXPECT_EQ(c_big_int(std::string(text)).get_as_string(), GetParam().value);
    c_big_int from_pointer("99");
    from_pointer = text;
    EXPECT_EQ(from_pointer.get_as_string(), GetParam().value);
    c_big_int from_string("99");
    from_string = std::string(text);
    EXPECT_EQ(from_string.get_as_string(), GetParam().value);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, BigIntParsing,
    testing::Values(Parsed{"", "0"}, Parsed{"0", "0"}, Parsed{"-0", "0"}, Parsed{"000", "0"},
                    Parsed{"abc", "0"}, Parsed{"-x", "0"}, Parsed{"+", "0"}, Parsed{"-", "0"},
                    Parsed{"+007", "7"}, Parsed{"-007", "-7"}, Parsed{"12ab", "12"}, Parsed{"00x5", "0"},
                    Parsed{"+-5", "0"}, Parsed{"--5", "0"}, Parsed{" 5", "0"}, Parsed{"1 2", "1"},
                    Parsed{"5\xB2", "5"},
                    Parsed{"123456789012345678901234567890", "123456789012345678901234567890"}));

TEST(BigInt, IsZeroByDefault) { EXPECT_EQ(c_big_int().get_as_string(), "0"); }

TEST(BigInt, TakesNumbers) {
    EXPECT_EQ(c_big_int(0).get_as_string(), "0");
    EXPECT_EQ(c_big_int(-5L).get_as_string(), "-5");
    EXPECT_EQ(c_big_int(7U).get_as_string(), "7");
    EXPECT_EQ(c_big_int(2147483647L).get_as_string(), "2147483647");
    EXPECT_EQ(c_big_int(-2147483647L - 1).get_as_string(), "-2147483648");
    c_big_int value(1);
    value = 0;
    EXPECT_EQ(value.get_as_string(), "0");
    value = -12L;
    EXPECT_EQ(value.get_as_string(), "-12");
}

TEST(BigInt, ANullTextIsTheEmptyText) {
    const char* const null = nullptr;
    EXPECT_EQ(c_big_int(null).get_as_string(), "0");
    c_big_int value(5);
    value = null;
    EXPECT_EQ(value.get_as_string(), "0");
}

TEST(BigInt, CopiesAreIndependent) {
    const c_big_int a("-5");
    c_big_int b(a);
    c_big_int c;
    c = b;
    b = 7;
    EXPECT_EQ(a.get_as_string() + b.get_as_string() + c.get_as_string(), "-57-5");
}

TEST(BigInt, ATakenValueIsStillANumber) {
    std::vector<c_big_int> values = {c_big_int(5)};
    const c_big_int taken = *std::make_move_iterator(values.begin());
    EXPECT_EQ(taken.text(), "5");
    EXPECT_EQ(values[0].text(), "5");
}

TEST(BigInt, Swaps) {
    c_big_int a(1);
    c_big_int b(2);
    a.swap(b);
    EXPECT_EQ(a, 2);
    swap(a, b);
    EXPECT_EQ(a, 1);
}

TEST(BigInt, StreamsItsText) {
    std::ostringstream os;
    os << c_big_int("-0012") << ' ' << c_big_int();
    EXPECT_EQ(os.str(), "-12 0");
}

struct Got {
    const char* text;
    long value;
    bool overflow;
};
void PrintTo(const Got& c, std::ostream* os) { *os << c.text; }

class BigIntGet : public testing::TestWithParam<Got> {};
TEST_P(BigIntGet, CountsIn32Bits) {
    for (bool overflow : {false, true}) {
        EXPECT_EQ(c_big_int(GetParam().text).get(&overflow), GetParam().value);
        EXPECT_EQ(overflow, GetParam().overflow);
    }
    EXPECT_EQ(c_big_int(GetParam().text).get(nullptr), GetParam().value);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, BigIntGet,
    testing::Values(Got{"0", 0, false}, Got{"-1", -1, false}, Got{"2147483647", 2147483647L, false},
                    Got{"-2147483647", -2147483647L, false}, Got{"2147483648", -2147483647L - 1, true},
                    // Intended: representable, and yet an overflow.
                    Got{"-2147483648", -2147483647L - 1, true}, Got{"4294967295", -1, true},
                    Got{"4294967296", 0, true}, Got{"-4294967301", -5, true},
                    Got{"10000000000", 1410065408L, true}, Got{"2147483650", -2147483646L, true}));

TEST(BigInt, BecomesADouble) {
    EXPECT_EQ(c_big_int().get_as_float(), 0.0);
    EXPECT_EQ(c_big_int("-123456789012345").get_as_float(), -123456789012345.0);
    // Beyond 53 bits each step rounds, so the last bit need not be the nearest one.
    double sum = 0.0;
    for (const char c : std::string("12345678901234567890")) sum = sum * 10.0 + (c - '0');
    EXPECT_EQ(c_big_int("-12345678901234567890").get_as_float(), -sum);
    EXPECT_EQ(c_big_int(std::string(400, '9')).get_as_float(), HUGE_VAL);
    EXPECT_EQ(c_big_int("-" + std::string(400, '9')).get_as_float(), -HUGE_VAL);
}

/// What each of the two cores answers; all operators follow from them.
struct Compared {
    const char* why;
    const char* a;
    const char* s;
    bool equal;
    bool above;
};
void PrintTo(const Compared& c, std::ostream* os) { *os << c.why << ": " << c.a << " and '" << c.s << "'"; }

template <typename Text>
void expect_operators(const c_big_int& a, const Text& s, bool equal, bool above) {
    const bool below = !equal && !above;
    EXPECT_EQ(a == s, equal);
    EXPECT_EQ(a != s, !equal);
    EXPECT_EQ(a > s, above);
    EXPECT_EQ(a >= s, equal || above);
    EXPECT_EQ(a < s, below);
    EXPECT_EQ(a <= s, !above);
    EXPECT_EQ(s == a, equal);
    EXPECT_EQ(s != a, !equal);
    EXPECT_EQ(s < a, above);
    EXPECT_EQ(s <= a, equal || above);
    EXPECT_EQ(s > a, below);
    EXPECT_EQ(s >= a, !above);
}

class BigIntAgainstText : public testing::TestWithParam<Compared> {};
TEST_P(BigIntAgainstText, AnswersOnBothSides) {
    const Compared& c = GetParam();
    expect_operators(c_big_int(c.a), c.s, c.equal, c.above);
    expect_operators(c_big_int(c.a), std::string(c.s), c.equal, c.above);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, BigIntAgainstText,
    testing::Values(
        Compared{"the same", "5", "5", true, false}, Compared{"zeros in front", "5", "0005", true, false},
        Compared{"plus in front", "5", "+5", true, false}, Compared{"both", "5", "+005", true, false},
        Compared{"negative the same", "-5", "-5", true, false},
        Compared{"negative zeros in front", "-5", "-0005", true, false},
        Compared{"less digits", "5", "10", false, false}, Compared{"more digits", "10", "5", false, true},
        Compared{"a digit lower", "19", "20", false, false},
        Compared{"a digit higher", "20", "19", false, true},
        Compared{"zeros do not count as digits", "10", "0005", false, true},
        Compared{"negative, more digits in the text", "-5", "-10", false, true},
        Compared{"negative, more digits in the value", "-10", "-5", false, false},
        Compared{"negative, a digit lower", "-5", "-3", false, false},
        Compared{"negative, a digit higher", "-3", "-5", false, true},
        Compared{"signs differ", "5", "-5", false, true}, Compared{"signs differ", "-5", "5", false, false},
        Compared{"negative against zero", "-5", "0", false, false},
        Compared{"zero against negative", "0", "-5", false, true}, Compared{"zero", "0", "0", true, false},
        Compared{"zero", "0", "000", true, false}, Compared{"plus zero", "0", "+0", true, false},
        Compared{"minus zero", "0", "-0", true, false}, Compared{"minus zero", "0", "-000", true, false},
        Compared{"minus zero with a rest that is no digit", "0", "-0x", true, false},
        Compared{"minus, zero, value", "0", "-05", false, true},
        Compared{"positive, minus zero", "1", "-0", false, true},
        Compared{"negative, minus zero", "-1", "-0", false, false},
        Compared{"positive, plus zero", "1", "+0", false, true},
        Compared{"positive, zero", "1", "0", false, true},
        Compared{"a sign alone is zero", "0", "+", true, false},
        Compared{"a sign alone is zero", "1", "+", false, true},
        Compared{"a minus alone is below zero", "0", "-", false, true},
        Compared{"negative, a minus alone", "-5", "-", false, false},
        // Intended: what stands behind the digits takes part as it is.
        Compared{"a rest counts as a digit", "5", "5x", false, false},
        Compared{"a rest counts as a digit", "50", "5x", false, false},
        // Intended: the empty text equals nothing, and nothing is above it.
        Compared{"the empty text", "5", "", false, false}, Compared{"the empty text", "0", "", false, false},
        Compared{"the empty text", "-5", "", false, false},
        Compared{"beyond any machine number", "99999999999999999999999", "99999999999999999999998", false,
                 true}));

TEST(BigIntAgainstNull, StandsForZero) {
    const char* const null = nullptr;
    expect_operators(c_big_int(0), null, true, false);
    expect_operators(c_big_int(5), null, false, true);
    expect_operators(c_big_int(-5), null, false, false);
}

TEST(BigIntAgainstText, TakesALiteralZero) {
    EXPECT_TRUE(c_big_int(0) == 0);
    EXPECT_TRUE(c_big_int(5) > 0);
    EXPECT_TRUE(c_big_int(5) == 5);
}

TEST(BigIntAgainstBigInt, IsOrderedLikeTheNumbers) {
    std::mt19937 random(12);
    for (int round = 0; round < 5000; ++round) {
        const int a = static_cast<int>(random() % 2001) - 1000;
        const int b = random() % 10 == 0 ? a : static_cast<int>(random() % 2001) - 1000;
        const c_big_int big_a(a);
        const c_big_int big_b(b);
        ASSERT_EQ(big_a == big_b, a == b) << a << " " << b;
        ASSERT_EQ(big_a != big_b, a != b) << a << " " << b;
        ASSERT_EQ(big_a < big_b, a < b) << a << " " << b;
        ASSERT_EQ(big_a <= big_b, a <= b) << a << " " << b;
        ASSERT_EQ(big_a > big_b, a > b) << a << " " << b;
        ASSERT_EQ(big_a >= big_b, a >= b) << a << " " << b;
        const std::string text = std::to_string(b);
        ASSERT_EQ(big_a < text, a < b) << a << " " << b;
        ASSERT_EQ(text < big_a, b < a) << a << " " << b;
    }
}

}  // namespace
