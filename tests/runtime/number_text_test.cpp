#include "runtime/number_text.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <climits>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <random>

namespace {

using namespace qbxV2;

std::uint64_t bits_of(double value) {
    std::uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    return bits;
}

double from_bits(std::uint64_t bits) {
    double value = 0;
    std::memcpy(&value, &bits, sizeof value);
    return value;
}

std::string printed(const char* format, double value) {
    char text[1600];
    return std::string(text, static_cast<std::size_t>(std::snprintf(text, sizeof text, format, value)));
}

std::string formatted(double value) {
    std::string text = "=";
    append_double(text, value);
    return text.substr(1);
}

std::string formatted_float(float value) {
    std::string text = "=";
    append_float(text, value);
    return text.substr(1);
}

TEST(TextToDouble, KnowsTheNamesOfXml) {
    EXPECT_TRUE(std::isnan(text_to_double("NaN")));
    EXPECT_EQ(text_to_double("INF"), std::numeric_limits<double>::infinity());
    EXPECT_EQ(text_to_double("-INF"), -std::numeric_limits<double>::infinity());
}

struct DoubleText {
    const char* text;
    double value;
};
void PrintTo(const DoubleText& c, std::ostream* os) { *os << "'" << c.text << "'"; }

class TextToDoubleTable : public testing::TestWithParam<DoubleText> {};
TEST_P(TextToDoubleTable, GivesWhatTheBeginningGives) {
    const std::string text = GetParam().text;
    EXPECT_EQ(bits_of(text_to_double(text)), bits_of(GetParam().value));
    EXPECT_EQ(bits_of(text_to_double(text.data(), text.size())), bits_of(GetParam().value));
}
INSTANTIATE_TEST_SUITE_P(
    Texts, TextToDoubleTable,
    testing::Values(DoubleText{"", 0.0}, DoubleText{"0", 0.0}, DoubleText{"-0", -0.0}, DoubleText{"1.5", 1.5},
                    DoubleText{"+1.5", 1.5}, DoubleText{"1.", 1.0}, DoubleText{".5", 0.5},
                    DoubleText{"-.5E-3", -5e-4}, DoubleText{" \t\n1.5", 1.5}, DoubleText{"1.5x", 1.5},
                    DoubleText{"1e", 1.0}, DoubleText{"1,5", 1.0}, DoubleText{"x", 0.0}, DoubleText{"-", 0.0},
                    DoubleText{".", 0.0}, DoubleText{"0x10", 16.0}, DoubleText{"1e999", HUGE_VAL},
                    DoubleText{"-1e999", -HUGE_VAL}, DoubleText{"1e-999", 0.0}, DoubleText{"-1e-999", -0.0},
                    DoubleText{"4.9e-324", 5e-324}, DoubleText{"2.4e-324", 0.0},
                    DoubleText{"2.5e-324", 5e-324}, DoubleText{"1.7976931348623157e308", DBL_MAX},
                    DoubleText{"1.7976931348623159e308", HUGE_VAL},
                    DoubleText{"2.2250738585072011e-308", 2.2250738585072011e-308}));

TEST(TextToDouble, AZeroByteEndsTheText) {
    EXPECT_EQ(text_to_double(std::string("1\0005", 3)), 1.0);
    EXPECT_TRUE(std::isnan(text_to_double(std::string("NaN\0x", 5))));
}

TEST(TextToDouble, ReadsABlockWithoutTerminator) {
    const char block[] = {'1', '.', '2', '5', '9'};
    EXPECT_EQ(text_to_double(block, 4), 1.25);
    EXPECT_EQ(text_to_double(block, 2), 1.0);
    const char signed_block[] = {'+', '1', '2', '9'};
    EXPECT_EQ(text_to_double(signed_block, 3), 12.0);
}

TEST(TextToDouble, TextsLongerThanAnyNumberAreReadWhole) {
    EXPECT_EQ(text_to_double("0." + std::string(300, '0') + "1"), 1e-301);
    EXPECT_EQ(text_to_double("+0." + std::string(300, '0') + "1"), 1e-301);
    EXPECT_EQ(text_to_double("1" + std::string(5000, '0') + "e-5000"), 1.0);
    EXPECT_EQ(text_to_double(std::string(100000, '9')), HUGE_VAL);
}

void expect_same_as_atof(const std::string& text) {
    const double defined = std::atof(text.c_str());
    const double value = text_to_double(text);
    if (std::isnan(defined)) {
        ASSERT_TRUE(std::isnan(value)) << text;
    } else {
        ASSERT_EQ(bits_of(value), bits_of(defined)) << text;
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeOnRandomNumbers) {
    std::mt19937_64 random(3);
    for (int round = 0; round < 20000; ++round) {
        const double value = from_bits(random());
        expect_same_as_atof(printed("%.17g", value));
        expect_same_as_atof(printed("%.14g", value));
        const double small = static_cast<double>(random() % 1000000) / 1000.0;
        expect_same_as_atof(printed("%.3f", small));
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeAtTheEndsOfTheRange) {
    for (const char* base :
         {"1.7976931348623157e308", "2.2250738585072014e-308", "4.9406564584124654e-324"}) {
        for (int step = -40; step <= 40; ++step) {
            const double value = from_bits(bits_of(std::atof(base)) + static_cast<std::uint64_t>(step));
            if (std::isnan(value)) continue;
            expect_same_as_atof(printed("%.17g", value));
            expect_same_as_atof(printed("%.25g", value));
            expect_same_as_atof(printed("%.1100f", value));
        }
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeOnLongDigitsNearHalfWayPoints) {
    std::mt19937_64 random(4);
    for (int round = 0; round < 3000; ++round) {
        // A whole number of 54 bits lies half-way between two doubles; digits far behind decide.
        const std::uint64_t half_way = (std::uint64_t{1} << 53) + (random() >> 11) * 2 + 1;
        const std::string digits = std::to_string(half_way);
        expect_same_as_atof(digits);
        expect_same_as_atof(digits + ".000000000000000000000000000000000000000000001");
        expect_same_as_atof(digits + std::string(random() % 800, '0'));
        expect_same_as_atof(digits.substr(0, digits.size() - 1) +
                            ".9999999999999999999999999999999999999999");
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeOnDecimalsOfEveryLengthWithThePointAtEveryPlace) {
    std::mt19937_64 random(6);
    for (std::size_t length = 1; length <= 21; ++length) {
        for (int round = 0; round < 40; ++round) {
            std::string digits;
            while (digits.size() < length) digits += static_cast<char>('0' + random() % 10);
            expect_same_as_atof(digits);
            for (std::size_t place = 0; place <= length; ++place) {
                std::string text = digits;
                text.insert(place, 1, '.');
                expect_same_as_atof(text);
                expect_same_as_atof("-" + text);
            }
        }
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeAroundTheLargestWholeNumberThatADoubleHoldsExactly) {
    for (std::uint64_t whole = (std::uint64_t{1} << 53) - 20; whole <= (std::uint64_t{1} << 53) + 20;
         ++whole) {
        const std::string digits = std::to_string(whole);
        for (std::size_t place = 0; place <= digits.size(); ++place) {
            std::string text = digits;
            text.insert(place, 1, '.');
            expect_same_as_atof(text);
            expect_same_as_atof("-" + text);
        }
    }
}

TEST(TextToDouble, FastAndDefinedWayAgreeOnRubbish) {
    const char alphabet[] = "0123456789012345678901234567890.eE+-xXpPaFinfNaN(), \t";
    std::mt19937 random(5);
    for (int round = 0; round < 50000; ++round) {
        std::string text;
        for (auto i = random() % 14; i > 0; --i) text += alphabet[random() % (sizeof alphabet - 1)];
        if (text == "NaN" || text == "INF" || text == "-INF") continue;
        expect_same_as_atof(text);
    }
}

TEST(WithDecimalMark, ReplacesTheFirstPointByAComma) {
    EXPECT_EQ(detail::with_decimal_mark("1.5.2", ","), "1,5.2");
    EXPECT_EQ(detail::with_decimal_mark("15", ","), "15");
    EXPECT_EQ(detail::with_decimal_mark(std::string(1000, '1') + ".5", ","), std::string(1000, '1') + ",5");
}

TEST(WithDecimalMark, LeavesTheTextToOtherMarks) {
    EXPECT_EQ(detail::with_decimal_mark("1.5", "."), "1.5");
    EXPECT_EQ(detail::with_decimal_mark("1.5", ""), "1.5");
}

struct IntText {
    const char* text;
    int as_int;
    unsigned long as_unsigned;
};
void PrintTo(const IntText& c, std::ostream* os) { *os << "'" << c.text << "'"; }

class WholeNumbers : public testing::TestWithParam<IntText> {};
TEST_P(WholeNumbers, AreReadIn32Bits) {
    const std::string text = GetParam().text;
    EXPECT_EQ(text_to_int(text), GetParam().as_int);
    EXPECT_EQ(text_to_unsigned_long(text), GetParam().as_unsigned);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, WholeNumbers,
    testing::Values(
        IntText{"", 0, 0}, IntText{"0", 0, 0}, IntText{"-007", -7, 4294967289UL}, IntText{"+42", 42, 42},
        IntText{" \t\n\v\f\r42x", 42, 42}, IntText{"x", 0, 0}, IntText{"- 1", 0, 0}, IntText{"1.9", 1, 1},
        IntText{"2147483647", INT_MAX, 2147483647UL}, IntText{"2147483648", INT_MAX, 2147483648UL},
        IntText{"-2147483648", INT_MIN, 2147483648UL}, IntText{"-2147483649", INT_MIN, 2147483647UL},
        IntText{"4294967295", INT_MAX, 4294967295UL}, IntText{"4294967296", INT_MAX, 4294967295UL},
        IntText{"-1", -1, 4294967295UL}, IntText{"-4294967296", INT_MIN, 4294967295UL},
        IntText{"99999999999999999999999999", INT_MAX, 4294967295UL},
        IntText{"-99999999999999999999999999", INT_MIN, 4294967295UL}));

TEST(WholeNumbers, AgreeWithTheStandardLibraryWithinTheRange) {
    std::mt19937 random(6);
    for (int round = 0; round < 5000; ++round) {
        const std::string text = std::to_string(static_cast<std::int32_t>(random()));
        ASSERT_EQ(text_to_int(text), std::atoi(text.c_str())) << text;
        const std::string positive = std::to_string(random());
        ASSERT_EQ(text_to_unsigned_long(positive), std::strtoul(positive.c_str(), nullptr, 10)) << positive;
    }
}

TEST(WholeNumbers, ReadABlockWithoutTerminator) {
    const char block[] = {'1', '2', '3'};
    EXPECT_EQ(text_to_int(block, 2), 12);
    EXPECT_EQ(text_to_unsigned_long(block, 2), 12UL);
    EXPECT_EQ(text_to_int(block, 0), 0);
}

TEST(TextToBool, OnlyTwoTextsAreTrue) {
    for (const char* text : {"true", "1"}) EXPECT_TRUE(text_to_bool(text)) << text;
    for (const char* text : {"false", "0", "", "TRUE", "2", " true", "true "})
        EXPECT_FALSE(text_to_bool(text)) << text;
}

struct FormattedDouble {
    double value;
    const char* text;
};
void PrintTo(const FormattedDouble& c, std::ostream* os) { *os << c.text; }

class FormatDouble : public testing::TestWithParam<FormattedDouble> {};
TEST_P(FormatDouble, WritesFourteenDigits) { EXPECT_EQ(formatted(GetParam().value), GetParam().text); }
INSTANTIATE_TEST_SUITE_P(
    Values, FormatDouble,
    testing::Values(FormattedDouble{std::numeric_limits<double>::quiet_NaN(), "NaN"},
                    FormattedDouble{-std::numeric_limits<double>::quiet_NaN(), "NaN"},
                    FormattedDouble{std::numeric_limits<double>::signaling_NaN(), "NaN"},
                    FormattedDouble{HUGE_VAL, "INF"}, FormattedDouble{-HUGE_VAL, "-INF"},
                    FormattedDouble{0.0, "0.0"}, FormattedDouble{-0.0, "-0.0"}, FormattedDouble{1.0, "1"},
                    FormattedDouble{-1.0, "-1"}, FormattedDouble{0.1, "0.1"}, FormattedDouble{100.0, "100"},
                    FormattedDouble{1234.5, "1234.5"}, FormattedDouble{1e20, "1e+20"},
                    FormattedDouble{0.00001, "1e-05"}, FormattedDouble{0.0001, "0.0001"},
                    FormattedDouble{0.00012, "0.00012"}, FormattedDouble{1.0 / 3.0, "0.33333333333333"},
                    FormattedDouble{2.0 / 3.0, "0.66666666666667"}, FormattedDouble{1e13, "10000000000000"},
                    FormattedDouble{1e14, "1e+14"}, FormattedDouble{99999999999999.0, "99999999999999"},
                    FormattedDouble{99999999999999.5, "1e+14"}, FormattedDouble{1e100, "1e+100"},
                    FormattedDouble{1e-100, "1e-100"}, FormattedDouble{5e-324, "4.9406564584125e-324"},
                    FormattedDouble{DBL_MAX, "1.7976931348623e+308"}, FormattedDouble{-1.5e-7, "-1.5e-07"},
                    FormattedDouble{0.5, "0.5"}, FormattedDouble{54.29, "54.29"},
                    FormattedDouble{0.1 + 0.2, "0.3"}, FormattedDouble{0.99999999999999989, "1"},
                    FormattedDouble{9.9999999999999991e22, "1e+23"}));

void expect_same_as_printf(double value) {
    if (value == 0.0 || !std::isfinite(value)) return;
    ASSERT_EQ(formatted(value), printed("%.14g", value)) << printed("%.25g", value);
    ASSERT_EQ(formatted(-value), printed("%.14g", -value)) << printed("%.25g", -value);
}

TEST(FormatDoubleEverywhere, EqualsPrintfOnRandomBits) {
    std::mt19937_64 random(7);
    for (int round = 0; round < 60000; ++round) expect_same_as_printf(from_bits(random() >> 1));
}

TEST(FormatDoubleEverywhere, EqualsPrintfOnShortDecimals) {
    std::mt19937_64 random(8);
    for (int round = 0; round < 60000; ++round) {
        const auto whole = static_cast<double>(random() % 1000000000000ULL);
        expect_same_as_printf(whole / std::pow(10.0, static_cast<double>(random() % 16)));
        expect_same_as_printf(std::nextafter(whole / 1e6, 0.0));
        expect_same_as_printf(std::nextafter(whole / 1e6, 1e300));
    }
}

TEST(FormatDoubleEverywhere, EqualsPrintfOnTiesOfFifteenDigits) {
    std::mt19937_64 random(9);
    for (int round = 0; round < 40000; ++round) {
        const std::uint64_t digits = (100000000000000ULL + random() % 900000000000000ULL) / 10 * 10 + 5;
        const std::string text =
            std::to_string(digits) + "e" + std::to_string(static_cast<int>(random() % 40) - 30);
        const double value = std::atof(text.c_str());
        expect_same_as_printf(value);
        expect_same_as_printf(std::nextafter(value, 0.0));
        expect_same_as_printf(std::nextafter(value, 1e300));
    }
}

TEST(FormatDoubleEverywhere, EqualsPrintfAtPowersAndDenormals) {
    for (int exponent = -1074; exponent <= 1023; ++exponent) {
        const double value = std::ldexp(1.0, exponent);
        expect_same_as_printf(value);
        expect_same_as_printf(std::nextafter(value, 0.0));
        expect_same_as_printf(std::nextafter(value, HUGE_VAL));
    }
    for (int exponent = -323; exponent <= 308; ++exponent) {
        const double value = std::atof(("1e" + std::to_string(exponent)).c_str());
        for (int step = -3; step <= 3; ++step) {
            expect_same_as_printf(from_bits(bits_of(value) + static_cast<std::uint64_t>(step)));
        }
    }
    std::mt19937_64 random(10);
    for (int round = 0; round < 5000; ++round)
        expect_same_as_printf(from_bits(random() >> (12 + random() % 50)));
}

TEST(FormatGeneral, EqualsPrintfAtEveryPrecision) {
    std::mt19937_64 random(16);
    for (int precision = 1; precision <= 17; ++precision) {
        const std::string format = "%." + std::to_string(precision) + "g";
        for (int round = 0; round < 3000; ++round) {
            const double any = from_bits(random());
            const double near_one =
                std::ldexp(static_cast<double>(random() >> 11), static_cast<int>(random() % 90) - 90);
            const double tie = static_cast<double>(random() % 100000) + 0.5;
            for (const double value : {any, near_one, tie, -tie}) {
                if (value == 0.0 || !std::isfinite(value)) continue;
                char text[k_number_text_size];
                ASSERT_EQ(std::string(text, format_general(text, value, precision)),
                          printed(format.c_str(), value));
            }
        }
    }
}

TEST(FormatFloat, WritesSevenDigits) {
    EXPECT_EQ(formatted_float(16777216.0F), "1.677722e+07");
    EXPECT_EQ(formatted_float(0.1F), "0.1");
    EXPECT_EQ(formatted_float(1.0F / 3.0F), "0.3333333");
    EXPECT_EQ(formatted_float(100.0F), "100");
    EXPECT_EQ(formatted_float(0.0F), "0.0");
    EXPECT_EQ(formatted_float(-0.0F), "-0.0");
    EXPECT_EQ(formatted_float(std::numeric_limits<float>::infinity()), "INF");
    EXPECT_EQ(formatted_float(-std::numeric_limits<float>::infinity()), "-INF");
    EXPECT_EQ(formatted_float(std::numeric_limits<float>::quiet_NaN()), "NaN");
}

TEST(FormatFloat, EqualsPrintfOnRandomBits) {
    std::mt19937 random(11);
    for (int round = 0; round < 60000; ++round) {
        const auto bits = static_cast<std::uint32_t>(random());
        float value = 0;
        std::memcpy(&value, &bits, sizeof value);
        if (value == 0.0F || !std::isfinite(value)) continue;
        ASSERT_EQ(formatted_float(value), printed("%.7g", static_cast<double>(value)));
    }
}

TEST(AppendWholeNumbers, GiveDecimalDigits) {
    std::string text;
    append_int(text, INT_MIN);
    text += ' ';
    append_int(text, 0);
    text += ' ';
    append_unsigned(text, UINT_MAX);
    EXPECT_EQ(text, "-2147483648 0 4294967295");
}

}  // namespace
