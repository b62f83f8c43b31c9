#include "runtime/decimal.h"

#include <gtest/gtest.h>

#include <climits>
#include <limits>
#include <locale>
#include <sstream>

namespace {

using qbxV2::c_decimal;

std::string text(const c_decimal& value) {
    std::ostringstream os;
    os << value;
    EXPECT_EQ(os.str(), value.get_as_string());
    return os.str();
}

struct Parsed {
    const char* why;
    const char* text;
    const char* value;
};
void PrintTo(const Parsed& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class DecimalParsing : public testing::TestWithParam<Parsed> {};
TEST_P(DecimalParsing, TakesWhatCanBeRead) {
    const char* const in = GetParam().text;
    EXPECT_EQ(text(c_decimal(in)), GetParam().value);
    EXPECT_EQ(text(c_decimal(std::string(in))), GetParam().value);
    c_decimal from_pointer("-9.9");
    from_pointer = in;
    EXPECT_EQ(text(from_pointer), GetParam().value);
    c_decimal from_string("-9.9");
    from_string = std::string(in);
    EXPECT_EQ(text(from_string), GetParam().value);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, DecimalParsing,
    testing::Values(
        Parsed{"nothing", "", "0"}, Parsed{"a zero whole part is left out", "0.50", ".50"},
        Parsed{"trailing zeros stay", "1.50", "1.50"}, Parsed{"minus zero keeps its sign", "-0", "-0"},
        Parsed{"a point alone at the end", "1.", "1"}, Parsed{"plus is dropped", "+1.5", "1.5"},
        Parsed{"minus one half", "-0.5", "-.5"}, Parsed{"no whole part", ".5", ".5"},
        Parsed{"zeros in front", "007.5", "7.5"}, Parsed{"zero fraction", "0.0", ".0"},
        Parsed{"a rest is ignored", "12ab.5", "12"}, Parsed{"a rest is ignored", "1.5x7", "1.5"},
        Parsed{"a second point is a rest", "1.2.3", "1.2"}, Parsed{"an exponent is a rest", "1.5e3", "1.5"},
        Parsed{"rubbish", "abc", "0"},
        Parsed{"any length", "123456789012345678901234567890.0987654321",
               "123456789012345678901234567890.0987654321"},
        // Intended: the whole part is parsed with the rules for integers, which take a sign of their own.
        Parsed{"a second sign", "--5", "--5"}, Parsed{"plus and minus", "+-5", "-5"},
        Parsed{"a second sign hides the point", "--5.5", "--5"}));

TEST(Decimal, IsZeroByDefault) { EXPECT_EQ(text(c_decimal()), "0"); }

TEST(Decimal, ANullTextIsTheEmptyText) {
    const char* const null = nullptr;
    EXPECT_EQ(text(c_decimal(null)), "0");
    c_decimal value("1.5");
    value = null;
    EXPECT_EQ(text(value), "0");
}

struct Scaled {
    long value;
    int scale;
    const char* text;
};
void PrintTo(const Scaled& c, std::ostream* os) { *os << c.value << " scale " << c.scale; }

class DecimalFromScaled : public testing::TestWithParam<Scaled> {};
TEST_P(DecimalFromScaled, IsValueTimesTenToMinusScale) {
    EXPECT_EQ(text(c_decimal(GetParam().value, GetParam().scale)), GetParam().text);
    c_decimal value("-9.9");
    value.set_scaled(GetParam().value, GetParam().scale);
    EXPECT_EQ(text(value), GetParam().text);
}
INSTANTIATE_TEST_SUITE_P(Values, DecimalFromScaled,
                         testing::Values(Scaled{12345, 2, "123.45"}, Scaled{5, 3, ".005"},
                                         Scaled{-12, -2, "-1200"}, Scaled{0, 0, "0"}, Scaled{0, 2, ".00"},
                                         Scaled{7, 0, "7"}, Scaled{-5, 1, "-.5"}, Scaled{100, 2, "1.00"},
                                         Scaled{0, -3, "0"}, Scaled{2147483647L, 9, "2.147483647"},
                                         Scaled{2147483647L, 10, ".2147483647"},
                                         Scaled{-2147483647L - 1, 0, "-2147483648"},
                                         Scaled{-2147483647L - 1, 1, "-214748364.8"},
                                         Scaled{1, 40, ".0000000000000000000000000000000000000001"},
                                         Scaled{1, -28, "10000000000000000000000000000"}));

TEST(Decimal, ConstructorsOfTheInterfaceCompile) {
    EXPECT_EQ(text(c_decimal(12345, 2)), "123.45");
    EXPECT_EQ(text(c_decimal(1.5, 2)), "1.50");
    EXPECT_EQ(text(c_decimal(1.5, 2U)), "1.50");
    EXPECT_EQ(text(c_decimal(1.5F, 1)), "1.5");
    EXPECT_EQ(text(c_decimal(5L)), "5");
    EXPECT_EQ(text(c_decimal(0)), "0");
    EXPECT_EQ(text(c_decimal(1.5)), "1.500000000000000");
    c_decimal value;
    value = 2.5;
    EXPECT_EQ(text(value), "2.500000000000000");
    value = 3;
    EXPECT_EQ(text(value), "3.000000000000000");
    value = 0;
    EXPECT_EQ(text(value), ".000000000000000");
    value.set(1.25);
    EXPECT_EQ(text(value), "1.250000000000000");
    value.set_scaled(12);
    EXPECT_EQ(text(value), "12");
}

TEST(Decimal, TakesEveryPairOfNumbersThatNamesAConstructor) {
    EXPECT_EQ(text(c_decimal(12345L, 2)), "123.45");
    EXPECT_EQ(text(c_decimal(12345U, 2)), "123.45");
    EXPECT_EQ(text(c_decimal(12345, 2L)), "123.45");
    EXPECT_EQ(text(c_decimal(5, sizeof(char))), ".5");
    EXPECT_EQ(text(c_decimal(1.5, 2L)), "1.50");
    EXPECT_EQ(text(c_decimal(1.5, sizeof(char))), "1.5");
    EXPECT_EQ(text(c_decimal(1.5F, 2U)), "1.50");
    EXPECT_EQ(text(c_decimal(5, 2U)), "5.00") << "an unsigned int is a precision";
    EXPECT_EQ(text(c_decimal(5L, 2U)), "5.00");
}

TEST(DecimalDeathTest, EndsTheProcessWhenZerosPassThirtyBytes) {
    EXPECT_EQ(text(c_decimal(0, -28)).size(), 1U);
    EXPECT_DEATH(c_decimal(1, -29), "");
    EXPECT_DEATH(c_decimal(0, -29), "");
    EXPECT_DEATH(c_decimal(12, -28), "");
    EXPECT_DEATH(c_decimal(1, INT_MIN), "");
    c_decimal value;
    EXPECT_DEATH(value.set_scaled(-1, -1000000), "");
}

TEST(DecimalFromDouble, KeepsAllDigitsOfThePrecision) {
    EXPECT_EQ(text(c_decimal(1.5, 2)), "1.50");
    EXPECT_EQ(text(c_decimal(1.5, 6)), "1.500000");
    EXPECT_EQ(text(c_decimal(-0.125, 2)), "-.12");
    EXPECT_EQ(text(c_decimal(1.5, 0)), "2");
    EXPECT_EQ(text(c_decimal(1e300, 0)).size(), 301U);
}

TEST(DecimalFromDouble, CapsThePrecisionAtFifteen) {
    EXPECT_EQ(text(c_decimal(1.5, 99)), "1.500000000000000");
    EXPECT_EQ(text(c_decimal(1.5, 15)), "1.500000000000000");
    EXPECT_EQ(text(c_decimal(1.5, -1)), "1.500000000000000");
    c_decimal value;
    value.set(0.5, UINT_MAX);
    EXPECT_EQ(text(value), ".500000000000000");
}

TEST(DecimalFromDouble, HasRoomForTheLargestDouble) {
    const std::string digits = text(c_decimal(-std::numeric_limits<double>::max(), 15));
    EXPECT_EQ(digits.size(), 1U + 309 + 1 + 15);
    EXPECT_EQ(digits.substr(0, 8), "-1797693");
}

// Intended: nothing guards against values without digits.
TEST(DecimalFromDouble, InfinityAndNaNAreZero) {
    EXPECT_EQ(text(c_decimal(std::numeric_limits<double>::infinity(), 2)), "0");
    EXPECT_EQ(text(c_decimal(-std::numeric_limits<double>::infinity(), 2)), "-0");
    EXPECT_EQ(c_decimal(std::numeric_limits<double>::quiet_NaN(), 2).get_as_float(), 0.0);
}

TEST(Decimal, SetIntegralLeavesTheFraction) {
    c_decimal value("1.25");
    value.set_integral(-7);
    EXPECT_EQ(text(value), "-7.25");
    value.set_integral(0);
    EXPECT_EQ(text(value), ".25");
    value.set_integral(-2147483647L - 1);
    EXPECT_EQ(text(value), "-2147483648.25");
}

TEST(Decimal, GetIntegralHasTheSign) {
    bool overflow = true;
    EXPECT_EQ(c_decimal("-12.5").get_integral(&overflow), -12);
    EXPECT_FALSE(overflow);
    EXPECT_EQ(c_decimal("2147483648").get_integral(&overflow), -2147483647L - 1);
    EXPECT_TRUE(overflow);
    EXPECT_EQ(c_decimal("-2147483648").get_integral(&overflow), -2147483647L - 1);
    EXPECT_TRUE(overflow);
    EXPECT_EQ(c_decimal("7").get_integral(nullptr), 7);
}

TEST(Decimal, SetFractionalPadsOrCutsToTheDigits) {
    c_decimal value("1.9");
    value.set_fractional(123, 5);
    EXPECT_EQ(text(value), "1.00123");
    value.set_fractional(12345, 3);
    EXPECT_EQ(text(value), "1.123");
    value.set_fractional(12345, 5);
    EXPECT_EQ(text(value), "1.12345");
    value.set_fractional(0, 2);
    EXPECT_EQ(text(value), "1.00");
    value.set_fractional(7, 0);
    EXPECT_EQ(text(value), "1");
    value.set_fractional(4294967295UL, 12);
    EXPECT_EQ(text(value), "1.004294967295");
}

struct Fractional {
    const char* text;
    int digits;
    unsigned long value;
    bool overflow;
};
void PrintTo(const Fractional& c, std::ostream* os) { *os << c.text << " digits " << c.digits; }

class DecimalGetFractional : public testing::TestWithParam<Fractional> {};
TEST_P(DecimalGetFractional, CountsInUnsigned32Bits) {
    for (bool overflow : {false, true}) {
        EXPECT_EQ(c_decimal(GetParam().text).get_fractional(GetParam().digits, &overflow), GetParam().value);
        EXPECT_EQ(overflow, GetParam().overflow);
    }
    EXPECT_EQ(c_decimal(GetParam().text).get_fractional(GetParam().digits, nullptr), GetParam().value);
}
INSTANTIATE_TEST_SUITE_P(
    Values, DecimalGetFractional,
    testing::Values(Fractional{"1.5", 4, 5000, false}, Fractional{"1.5", 0, 0, false},
                    Fractional{"1.5", -3, 0, false}, Fractional{"1.12345", 3, 123, false},
                    Fractional{"1", 4, 0, false}, Fractional{"1.0012", 4, 12, false},
                    Fractional{"0.4294967295", 10, 4294967295UL, false},
                    Fractional{"0.4294967296", 10, 0, true}, Fractional{"0.429496730", 10, 4, true},
                    Fractional{"0.429496729", 10, 4294967290UL, false},
                    Fractional{"0.9999999999", 10, 1410065407UL, true}, Fractional{"0.5", INT_MAX, 0, true},
                    Fractional{"0", INT_MAX, 0, false}));

struct GotScaled {
    const char* text;
    int scale;
    long value;
    bool overflow;
};
void PrintTo(const GotScaled& c, std::ostream* os) { *os << c.text << " scale " << c.scale; }

class DecimalGetScaled : public testing::TestWithParam<GotScaled> {};
TEST_P(DecimalGetScaled, CutsOffWhatDoesNotCount) {
    for (bool overflow : {false, true}) {
        EXPECT_EQ(c_decimal(GetParam().text).get_scaled(GetParam().scale, &overflow), GetParam().value);
        EXPECT_EQ(overflow, GetParam().overflow);
    }
    EXPECT_EQ(c_decimal(GetParam().text).get_scaled(GetParam().scale, nullptr), GetParam().value);
}
INSTANTIATE_TEST_SUITE_P(
    Values, DecimalGetScaled,
    testing::Values(GotScaled{"123.456", 2, 12345, false}, GotScaled{"123.456", -1, 12, false},
                    GotScaled{"123.456", 5, 12345600, false}, GotScaled{"123.999", 0, 123, false},
                    GotScaled{"129.9", -1, 12, false}, GotScaled{"123", -3, 0, false},
                    GotScaled{"123", -4, 0, false}, GotScaled{"123", INT_MIN, 0, false},
                    GotScaled{"-123.456", 1, -1234, false}, GotScaled{"--56", -1, -5, false},
                    GotScaled{"+-56.7", 0, -56, false}, GotScaled{"2147483647", 0, 2147483647L, false},
                    GotScaled{"2147483648", 0, -2147483647L - 1, true},
                    GotScaled{"-2147483648", 0, -2147483647L - 1, true},
                    GotScaled{"21474836.48", 2, -2147483647L - 1, true},
                    GotScaled{"3", 9, -1294967296L, true}, GotScaled{"1", INT_MAX, 0, true},
                    GotScaled{"0", INT_MAX, 0, false}));

TEST(Decimal, BecomesADoubleByAddingDigits) {
    EXPECT_EQ(c_decimal("123.5").get_as_float(), 123.5);
    EXPECT_EQ(c_decimal("-.25").get_as_float(), -0.25);
    EXPECT_EQ(c_decimal("7").get_as_float(), 7.0);
    // The last bits follow from the order of the sum.
    double expected = 0.0;
    double factor = 0.1;
    for (const int digit : {1, 2, 3, 4, 5, 6, 7, 8, 9}) {
        expected += digit * factor;
        factor /= 10.0;
    }
    EXPECT_EQ(c_decimal("0.123456789").get_as_float(), expected);
}

struct Verdict {
    const char* text;
    bool valid;
};
void PrintTo(const Verdict& c, std::ostream* os) { *os << "'" << c.text << "'"; }

class DecimalIsValid : public testing::TestWithParam<Verdict> {};
TEST_P(DecimalIsValid, TakesASignAndAMantissa) {
    EXPECT_EQ(c_decimal::is_valid(GetParam().text), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(Texts, DecimalIsValid,
                         testing::Values(Verdict{"1", true}, Verdict{"+1.", true}, Verdict{"-.5", true},
                                         Verdict{"1.5", true}, Verdict{"", false}, Verdict{".", false},
                                         Verdict{"-", false}, Verdict{"1e5", false}, Verdict{"INF", false},
                                         Verdict{"NaN", false}, Verdict{"1.2.3", false}, Verdict{" 1", false},
                                         Verdict{"1 ", false}, Verdict{"--1", false}));

TEST(Decimal, Swaps) {
    c_decimal a("-1.5");
    c_decimal b("2");
    a.swap(b);
    EXPECT_EQ(text(a) + " " + text(b), "2 -1.5");
    swap(a, b);
    EXPECT_EQ(text(a) + " " + text(b), "-1.5 2");
}

struct Compared {
    const char* why;
    const char* a;
    const char* b;
    bool equal;
    bool above;
};
void PrintTo(const Compared& c, std::ostream* os) { *os << c.why << ": " << c.a << " and " << c.b; }

class DecimalComparison : public testing::TestWithParam<Compared> {};
TEST_P(DecimalComparison, FollowsTheTwoCores) {
    const Compared& c = GetParam();
    const c_decimal a(c.a);
    const c_decimal b(c.b);
    EXPECT_EQ(a == b, c.equal);
    EXPECT_EQ(a != b, !c.equal);
    EXPECT_EQ(a > b, c.above);
    EXPECT_EQ(a >= b, c.equal || c.above);
    EXPECT_EQ(a < b, !c.equal && !c.above);
    EXPECT_EQ(a <= b, !c.above);
}
INSTANTIATE_TEST_SUITE_P(
    Values, DecimalComparison,
    testing::Values(Compared{"trailing zeros do not matter", "1.5", "1.50", true, false},
                    Compared{"trailing zeros do not matter", "1", "1.00", true, false},
                    Compared{"trailing zeros do not matter", "-1.500", "-1.5", true, false},
                    Compared{"a digit lower", "1.4", "1.5", false, false},
                    Compared{"a digit higher", "1.5", "1.4", false, true},
                    Compared{"an earlier digit decides", "1.31", "1.299", false, true},
                    Compared{"the whole part decides", "2.1", "1.9", false, true},
                    Compared{"the whole part decides", "1.9", "2.1", false, false},
                    Compared{"negative whole part", "-2.1", "-1.9", false, false},
                    Compared{"negative whole part", "-1.9", "-2.1", false, true},
                    Compared{"negative digits", "-1.5", "-1.4", false, false},
                    Compared{"negative digits", "-1.4", "-1.5", false, true},
                    Compared{"signs differ", "1", "-2", false, true},
                    Compared{"signs differ", "-2", "1", false, false},
                    // Intended: minus zero and zero differ, and zero is above.
                    Compared{"minus zero", "-0", "0", false, false},
                    Compared{"minus zero", "0", "-0", false, true},
                    // Intended: the longer of two fractions that begin alike is the lower one.
                    Compared{"longer is lower", "0.25", "0.2", false, false},
                    Compared{"longer is lower", "0.2", "0.25", false, true},
                    Compared{"longer is lower", "0", "0.5", false, true},
                    Compared{"longer is lower", "0.5", "0", false, false},
                    Compared{"longer is lower, zeros between", "0.2", "0.2001", false, true},
                    Compared{"negative, longer is lower", "-0.25", "-0.2", false, true},
                    Compared{"negative, longer is lower", "-0.2", "-0.25", false, false}));

}  // namespace
