#include "runtime/as_text.h"

#include <gtest/gtest.h>

#include <cmath>
#include <iomanip>
#include <limits>
#include <locale>
#include <random>
#include <sstream>

#include "runtime/binary.h"

namespace {

using namespace qbxV2;

template <typename Text>
std::string streamed(const Text& text) {
    std::ostringstream os;
    os << text;
    return os.str();
}

std::wstring units(std::initializer_list<unsigned int> list) {
    std::wstring text;
    for (const unsigned int unit : list) text.push_back(static_cast<wchar_t>(unit));
    return text;
}

/// Numbers with a decimal comma and grouped by three.
class comma_numbers : public std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

std::locale comma_locale() { return {std::locale::classic(), new comma_numbers}; }

TEST(AsXml, BooleansAreWords) {
    EXPECT_EQ(streamed(c_as_xml<bool>(true)), "true");
    EXPECT_EQ(streamed(c_as_xml<bool>(false)), "false");
}

TEST(AsBoolDigit, BooleansAreDigits) {
    EXPECT_EQ(streamed(c_as_bool_digit<bool>(true)), "1");
    EXPECT_EQ(streamed(c_as_bool_digit<bool>(false)), "0");
}

struct DoubleText {
    double value;
    const char* text;
};
void PrintTo(const DoubleText& c, std::ostream* os) { *os << c.text; }

class DoubleAsXml : public testing::TestWithParam<DoubleText> {};
TEST_P(DoubleAsXml, HasFourteenDigits) {
    EXPECT_EQ(streamed(c_as_xml<double>(GetParam().value)), GetParam().text);
}
INSTANTIATE_TEST_SUITE_P(Values, DoubleAsXml,
                         testing::Values(DoubleText{std::numeric_limits<double>::quiet_NaN(), "NaN"},
                                         DoubleText{std::numeric_limits<double>::signaling_NaN(), "NaN"},
                                         DoubleText{-HUGE_VAL, "-INF"}, DoubleText{-0.0, "-0.0"},
                                         DoubleText{0.0, "0.0"}, DoubleText{HUGE_VAL, "INF"},
                                         DoubleText{1.0, "1"}, DoubleText{0.1, "0.1"},
                                         DoubleText{100.0, "100"}, DoubleText{1234.5, "1234.5"},
                                         DoubleText{1e20, "1e+20"}, DoubleText{0.00001, "1e-05"},
                                         DoubleText{1.0 / 3.0, "0.33333333333333"}));

struct FloatText {
    float value;
    const char* text;
};
void PrintTo(const FloatText& c, std::ostream* os) { *os << c.text; }

class FloatAsXml : public testing::TestWithParam<FloatText> {};
TEST_P(FloatAsXml, HasSevenDigits) {
    EXPECT_EQ(streamed(c_as_xml<float>(GetParam().value)), GetParam().text);
}
INSTANTIATE_TEST_SUITE_P(Values, FloatAsXml,
                         testing::Values(FloatText{std::numeric_limits<float>::quiet_NaN(), "NaN"},
                                         FloatText{-std::numeric_limits<float>::infinity(), "-INF"},
                                         FloatText{-0.0F, "-0.0"}, FloatText{0.0F, "0.0"},
                                         FloatText{std::numeric_limits<float>::infinity(), "INF"},
                                         FloatText{16777216.0F, "1.677722e+07"}, FloatText{0.1F, "0.1"},
                                         FloatText{100.0F, "100"}));

TEST(NumbersAsXml, LeaveTheStreamAsItWas) {
    std::ostringstream os;
    os.precision(3);
    os << c_as_xml<double>(1.0 / 3.0) << ' ' << c_as_xml<float>(0.1F) << ' ';
    EXPECT_EQ(os.precision(), 3);
    os << std::fixed << c_as_xml<double>(0.5) << ' ' << c_as_xml<float>(0.5F);
    EXPECT_EQ(os.precision(), 3);
    EXPECT_EQ(os.flags() & std::ios::floatfield, std::ios::fixed);
    EXPECT_EQ(os.str(), "0.33333333333333 0.1 0.50000000000000 0.5000000");
}

TEST(NumbersAsXml, FollowTheStreamWhereItWasShaped) {
    std::ostringstream os;
    os << std::showpos << c_as_xml<double>(1.5) << std::noshowpos << ' ' << std::setw(6)
       << c_as_xml<double>(1.5);
    os << std::setw(5) << c_as_xml<double>(0.0) << std::uppercase << c_as_xml<double>(1e20);
    EXPECT_EQ(os.str(), "+1.5    1.5  0.01E+20");
}

TEST(NumbersAsXml, FollowTheLocaleOfTheStream) {
    std::ostringstream os;
    os.imbue(comma_locale());
    os << c_as_xml<double>(1234.5) << ' ' << c_as_xml<float>(0.5F) << ' ' << c_as_xml<double>(0.0);
    EXPECT_EQ(os.str(), "1.234,5 0,5 0.0");
    os.str("");
    os.imbue(std::locale::classic());
    os << c_as_xml<double>(1234.5);
    EXPECT_EQ(os.str(), "1234.5");
}

TEST(NumbersAsXml, EqualTheStreamsOwnOutput) {
    std::mt19937_64 random(14);
    std::ostringstream own;
    own.precision(14);
    std::ostringstream ours;
    for (int round = 0; round < 5000; ++round) {
        const double value =
            std::ldexp(static_cast<double>(random() >> 11), static_cast<int>(random() % 200) - 150);
        if (value == 0.0) continue;
        own.str("");
        ours.str("");
        own << value;
        ours << c_as_xml<double>(value);
        ASSERT_EQ(ours.str(), own.str());
    }
}

struct EscapedText {
    const char* why;
    std::wstring in;
    std::string out;
};
void PrintTo(const EscapedText& c, std::ostream* os) { *os << c.why; }

class WideAsXml : public testing::TestWithParam<EscapedText> {};
TEST_P(WideAsXml, IsEscapedUtf8) {
    EXPECT_EQ(streamed(c_as_xml<std::wstring>(GetParam().in)), GetParam().out);
    std::string buffer = "kept ";
    append_escaped(buffer, GetParam().in);
    EXPECT_EQ(buffer, "kept " + GetParam().out);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, WideAsXml,
    testing::Values(EscapedText{"nothing", L"", ""}, EscapedText{"ASCII", L"Barn Red", "Barn Red"},
                    EscapedText{"markup", L"a<b>&c", "a&lt;b>&amp;c"},
                    EscapedText{"quotes", L"\"'", "&quot;&apos;"},
                    EscapedText{"markup at both ends", L"<x&", "&lt;x&amp;"},
                    EscapedText{"control characters stay", units({1, 9, 10, 13, 127}), "\x01\t\n\r\x7F"},
                    EscapedText{"zero stays", units({'a', 0, 'b'}), std::string("a\0b", 3)},
                    EscapedText{"two bytes", units({0x80, 0x7FF}), "\xC2\x80\xDF\xBF"},
                    EscapedText{"three bytes", units({0x800, 0xFFFF}), "\xE0\xA0\x80\xEF\xBF\xBF"},
                    EscapedText{"a pair", units({'<', 0xD83D, 0xDE00, '>'}), "&lt;\xF0\x9F\x98\x80>"},
                    EscapedText{"a low surrogate alone", units({0xDC00, 'x'}), "\xED\xB0\x80x"}));

// Intended: no error is raised, and what was fine up to there is written.
TEST(WideAsXml, EndsAtAHighSurrogateWithoutPartner) {
    EXPECT_EQ(streamed(c_as_xml<std::wstring>(units({'a', 0xD83D, 'x', 'b', 'c'}))), "a");
    EXPECT_EQ(streamed(c_as_xml<std::wstring>(units({'a', 0xD83D}))), "a");
    EXPECT_EQ(streamed(c_as_xml<std::wstring>(units({'a', 0xD83D, 0xD83D, 0xDE00}))), "a");
}

TEST(WideAsXml, TakesAWholeCodePointInOneElement) {
    if constexpr (sizeof(wchar_t) == 4) {
        EXPECT_EQ(streamed(c_as_xml<std::wstring>(units({'a', 0x1F600, '<'}))), "a\xF0\x9F\x98\x80&lt;");
    } else {
        EXPECT_EQ(streamed(c_as_xml<std::wstring>(units({'a', 0xD83D, 0xDE00, '<'}))),
                  "a\xF0\x9F\x98\x80&lt;");
    }
}

TEST(WideAsXml, IsNotPaddedToAWidth) {
    std::ostringstream os;
    os << std::setw(10) << c_as_xml<std::wstring>(std::wstring(L"ab"));
    EXPECT_EQ(os.str(), "ab");
}

TEST(NarrowAsXml, IsReadInTheCodePageOfTheSystem) {
    EXPECT_EQ(streamed(c_as_xml<std::string>(std::string("a<b>&\"'"))), "a&lt;b>&amp;&quot;&apos;");
    // Outside Windows that code page is UTF-8.
    EXPECT_EQ(streamed(c_as_xml<std::string>(std::string("\xC3\xA9\xF0\x9F\x98\x80"))),
              "\xC3\xA9\xF0\x9F\x98\x80");
}

TEST(WideAsAscii, HasAPointForEveryOtherUnit) {
    EXPECT_EQ(streamed(c_as_ascii<std::wstring>(std::wstring(L"a<b&"))), "a<b&");
    EXPECT_EQ(streamed(c_as_ascii<std::wstring>(units({'a', 0x7F, 0x80, 0xFFFF, 'b'}))), "a\x7F..b");
    EXPECT_EQ(streamed(c_as_ascii<std::wstring>(units({0xD83D, 0xDE00}))), "..");
    if constexpr (sizeof(wchar_t) == 4) {
        EXPECT_EQ(streamed(c_as_ascii<std::wstring>(units({0x1F600}))), "..");
    }
}

TEST(NarrowAsEscaped, KeepsBytes) {
    EXPECT_EQ(streamed(c_as_escaped<std::string>(std::string("a<b>&\"'c\xFF\xC3"))),
              "a&lt;b>&amp;&quot;&apos;c\xFF\xC3");
    EXPECT_EQ(streamed(c_as_escaped<std::string>(std::string())), "");
    std::string buffer = "kept ";
    append_escaped(buffer, std::string("<x"));
    EXPECT_EQ(buffer, "kept &lt;x");
}

TEST(BinaryAsText, HasTwoForms) {
    const unsigned char data[] = {0x0A, 0xFF};
    const c_binary value(data, 2);
    EXPECT_EQ(streamed(c_as_base64<c_binary>(value)), "Cv8=");
    EXPECT_EQ(streamed(c_as_hex<c_binary>(value)), "0AFF");
}

TEST(AsText, OperatorsReturnTheStream) {
    std::ostringstream os;
    const std::wstring wide = L"<";
    const std::string narrow = "<";
    os << c_as_xml(wide) << c_as_xml(narrow) << c_as_escaped(narrow) << c_as_ascii(wide) << c_as_xml(true)
       << '.';
    EXPECT_EQ(os.str(), "&lt;&lt;&lt;<true.");
}

}  // namespace
