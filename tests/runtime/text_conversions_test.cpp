#include "runtime/text_conversions.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>

namespace {

using qbxV2::convert;
using qbxV2::ct_qname;
using qbxV2::make_qname;
using qbxV2::vtostring;

std::string narrow(const std::wstring& in) {
    std::string out = "left over";
    return convert(&out, in);
}

std::wstring wide(const std::string& in) {
    std::wstring out = L"left over";
    return vtostring(out, in);
}

/// Wide text from UTF-16 units, which a literal with escapes would not keep apart on every system.
std::wstring units(std::initializer_list<unsigned int> list) {
    std::wstring text;
    for (const unsigned int unit : list) text.push_back(static_cast<wchar_t>(unit));
    return text;
}

TEST(FloatZero, IsZero) {
    EXPECT_EQ(qbxV2::float_zero(), 0.0);
    EXPECT_FALSE(std::signbit(qbxV2::float_zero()));
}

struct WideToUtf8 {
    const char* why;
    std::wstring in;
    std::string out;
};
void PrintTo(const WideToUtf8& c, std::ostream* os) { *os << c.why; }

class Convert : public testing::TestWithParam<WideToUtf8> {};
TEST_P(Convert, GivesUtf8) { EXPECT_EQ(narrow(GetParam().in), GetParam().out); }
INSTANTIATE_TEST_SUITE_P(
    Units, Convert,
    testing::Values(WideToUtf8{"the empty text", L"", ""}, WideToUtf8{"ASCII", L"Barn Red", "Barn Red"},
                    WideToUtf8{"markup is not escaped", L"<&>'\"", "<&>'\""},
                    WideToUtf8{"the last of one byte", units({0x7F}), "\x7F"},
                    WideToUtf8{"the first of two bytes", units({0x80}), "\xC2\x80"},
                    WideToUtf8{"the last of two bytes", units({0x7FF}), "\xDF\xBF"},
                    WideToUtf8{"the first of three bytes", units({0x800}), "\xE0\xA0\x80"},
                    WideToUtf8{"the last of three bytes", units({0xFFFF}), "\xEF\xBF\xBF"},
                    WideToUtf8{"a pair is one character", units({0xD83D, 0xDE00}), "\xF0\x9F\x98\x80"},
                    WideToUtf8{"the first pair", units({0xD800, 0xDC00}), "\xF0\x90\x80\x80"},
                    WideToUtf8{"the last pair", units({0xDBFF, 0xDFFF}), "\xF4\x8F\xBF\xBF"},
                    WideToUtf8{"a low surrogate alone", units({0xDC00, 'x'}), "\xED\xB0\x80x"},
                    WideToUtf8{"ASCII on both sides", units({'a', 0xE9, 'b'}),
                               "a\xC3\xA9"
                               "b"},
                    WideToUtf8{"an element of 0 vanishes", units({'a', 0, 'b', 0}), "ab"},
                    WideToUtf8{"a high surrogate in last place is kept", units({'a', 0xD83D}),
                               "a\xED\xA0\xBD"}));

// Intended: unlike escaping, conversion goes on behind a high surrogate without its partner, one element
// later.
TEST(ConvertToUtf8, LosesTheElementBehindALoneHighSurrogate) {
    EXPECT_EQ(narrow(units({'a', 0xD83D, 'x', 'b', 'c'})),
              "a\xED\xA0\xBD"
              "bc");
    EXPECT_EQ(narrow(units({0xD83D, 0xD83D, 0xDE00})), "\xED\xA0\xBD\xED\xB8\x80");
}

TEST(ConvertToUtf8, TakesAWholeCodePointInOneElement) {
    if constexpr (sizeof(wchar_t) == 4) {
        EXPECT_EQ(narrow(units({0x1F600})), "\xF0\x9F\x98\x80");
    } else {
        EXPECT_EQ(narrow(units({0xD83D, 0xDE00})), "\xF0\x9F\x98\x80");
    }
}

TEST(ConvertToUtf8, ReturnsItsOutput) {
    std::string out;
    EXPECT_EQ(&convert(&out, L"x"), &out);
}

struct Utf8ToWide {
    const char* why;
    std::string in;
    std::wstring out;
};
void PrintTo(const Utf8ToWide& c, std::ostream* os) { *os << c.why; }

class VToString : public testing::TestWithParam<Utf8ToWide> {};
TEST_P(VToString, GivesUnitsUpToTheFirstFault) {
    EXPECT_EQ(wide(GetParam().in), GetParam().out);
    std::wstring out;
    EXPECT_EQ(convert(&out, GetParam().in), GetParam().out);
}
INSTANTIATE_TEST_SUITE_P(
    Bytes, VToString,
    testing::Values(
        Utf8ToWide{"the empty text", "", L""}, Utf8ToWide{"ASCII", "Barn Red", L"Barn Red"},
        Utf8ToWide{"a zero byte is a character", std::string("a\0b", 3), units({'a', 0, 'b'})},
        Utf8ToWide{"two bytes", "\xC2\x80\xDF\xBF", units({0x80, 0x7FF})},
        Utf8ToWide{"three bytes", "\xE0\xA0\x80\xEF\xBF\xBF", units({0x800, 0xFFFF})},
        Utf8ToWide{"four bytes are a pair", "\xF0\x9F\x98\x80", units({0xD83D, 0xDE00})},
        Utf8ToWide{"the first and last pair", "\xF0\x90\x80\x80\xF4\x8F\xBF\xBF",
                   units({0xD800, 0xDC00, 0xDBFF, 0xDFFF})},
        Utf8ToWide{"an overlong form is taken", "\xC1\x81", units({'A'})},
        Utf8ToWide{"a continuation byte leads nothing",
                   "ab\x80"
                   "cd",
                   L"ab"},
        Utf8ToWide{"0xF8 leads nothing", "ab\xF8\x80\x80\x80\x80", L"ab"},
        Utf8ToWide{"0xFF leads nothing", "ab\xFF", L"ab"},
        Utf8ToWide{"cut inside two bytes", "ab\xC3", L"ab"},
        Utf8ToWide{"cut inside three bytes", "ab\xE2\x82", L"ab"},
        Utf8ToWide{"cut inside four bytes", "ab\xF0\x9F\x98", L"ab"},
        Utf8ToWide{"broken inside three bytes", "ab\xE2\x82zcd", L"ab"},
        Utf8ToWide{"surrogates of three bytes each are a pair", "\xED\xA0\xBD\xED\xB8\x80x",
                   units({0xD83D, 0xDE00, 'x'})},
        Utf8ToWide{"a low surrogate alone is a unit", "\xED\xB8\x80x", units({0xDE00, 'x'})},
        Utf8ToWide{"a high surrogate at the end is dropped", "ab\xED\xA0\xBD", L"ab"},
        Utf8ToWide{"a high surrogate before a character ends the text", "ab\xED\xA0\xBDxy", L"ab"},
        Utf8ToWide{"a high surrogate before a pair of four bytes ends the text",
                   "ab\xED\xA0\xBD\xF0\x9F\x98\x80", L"ab"},
        Utf8ToWide{"two high surrogates end the text", "ab\xED\xA0\xBD\xED\xA0\xBD\xED\xB8\x80", L"ab"}));

TEST(VToStringWide, ReadsABlockWithoutTerminator) {
    const char block[] = {'a', '\xC3', '\xA9'};
    std::wstring out;
    EXPECT_EQ(vtostring(out, block, 3), units({'a', 0xE9}));
    EXPECT_EQ(vtostring(out, block, 2), L"a");
    EXPECT_EQ(vtostring(out, block, 0), L"");
}

/// The conversion as it is defined, one character at a time.
std::wstring wide_by_steps(const std::string& in) {
    std::wstring out;
    std::uint32_t pending = 0;
    for (std::size_t at = 0; at < in.size();) {
        const auto byte = [&in](std::size_t i) { return std::uint32_t{static_cast<unsigned char>(in[i])}; };
        std::size_t count = 1;
        std::uint32_t value = byte(at);
        if (byte(at) >= 0xF8) return out;
        if (byte(at) >= 0xF0)
            count = 4, value &= 7;
        else if (byte(at) >= 0xE0)
            count = 3, value &= 15;
        else if (byte(at) >= 0xC0)
            count = 2, value &= 31;
        else if (byte(at) >= 0x80)
            return out;
        if (at + count > in.size()) return out;
        for (std::size_t i = 1; i < count; ++i) {
            if (byte(at + i) >> 6 != 2) return out;
            value = value * 64 + (byte(at + i) & 63);
        }
        at += count;
        if (pending != 0) {
            if (value < 0xDC00 || value > 0xDFFF) return out;
            out += {static_cast<wchar_t>(pending), static_cast<wchar_t>(value)};
            pending = 0;
        } else if (value >= 0xD800 && value <= 0xDBFF) {
            pending = value;
        } else if (value > 0xFFFF) {
            const std::uint32_t above = value - 0x10000;
            out += {static_cast<wchar_t>(0xD800 + above / 1024), static_cast<wchar_t>(0xDC00 + above % 1024)};
        } else {
            out += static_cast<wchar_t>(value);
        }
    }
    return out;
}

TEST(VToStringWide, FastAndDefinedWayAgreeOnRandomText) {
    const std::string pieces[] = {"a",
                                  "plain text ",
                                  std::string(1, '\0'),
                                  "\xC3\xA9",
                                  "\xE2\x82\xAC",
                                  "\xF0\x9F\x98\x80",
                                  "\xED\xA0\xBD\xED\xB8\x80",
                                  "\xED\xB8\x80",
                                  "\x80",
                                  "\xE2",
                                  "\xED\xA0\xBD",
                                  "\xF7\xBF\xBF\xBF"};
    std::mt19937 random(1);
    for (int round = 0; round < 20000; ++round) {
        std::string text;
        // Faults are rare, so that text behind long sound beginnings is tried too.
        for (auto i = random() % 12; i > 0; --i) text += pieces[random() % (random() % 8 == 0 ? 12 : 8)];
        ASSERT_EQ(wide(text), wide_by_steps(text)) << testing::PrintToString(text);
    }
}

TEST(VToStringWide, GivesLongTextsTheSameWherePiecesMeet) {
    // Long texts are converted piece by piece; what is not ASCII may stand on either side of each seam, or
    // across it.
    for (const char* const piece :
         {"", "x", "\xC3\xA9", "\xF0\x9F\x98\x80", "\xED\xA0\xBD\xED\xB8\x80", "\x80"}) {
        for (std::size_t before = 2040; before <= 2056; ++before) {
            for (const std::size_t start : {before, before + 2048}) {
                const std::string text = std::string(start, 'a') + piece + std::string(3000, 'b');
                ASSERT_EQ(wide(text), wide_by_steps(text))
                    << testing::PrintToString(piece) << " at " << start;
                ASSERT_EQ(wide(text.substr(0, start)), std::wstring(start, L'a'));
            }
        }
    }
}

TEST(ConvertToUtf8, TakesBackWhatVToStringGave) {
    for (std::uint32_t code = 1; code < 0x110000; code += 7) {
        if (code >= 0xD800 && code < 0xE000) continue;
        const std::wstring in = code > 0xFFFF
                                    ? units({0xD800 + ((code - 0x10000) >> 10), 0xDC00 + (code & 0x3FF)})
                                    : units({code});
        ASSERT_EQ(wide(narrow(in)), in) << code;
    }
}

TEST(VToStringNarrow, Copies) {
    std::string out = "left over";
    EXPECT_EQ(&vtostring(out, std::string("a\xFF", 2)), &out);
    EXPECT_EQ(out, "a\xFF");
}

// Intended: the output is cleared before the input is looked at.
TEST(VToStringNarrow, EmptiesAStringConvertedIntoItself) {
    std::string text = "gone";
    vtostring(text, text);
    EXPECT_EQ(text, "");
}

TEST(MakeQName, StringIsTheNameAsItStands) {
    std::string narrow_name = "old";
    make_qname(&narrow_name, "Vrl:Color", "urn:x", "Color");
    EXPECT_EQ(narrow_name, "Vrl:Color");
    std::wstring wide_name = L"old";
    make_qname(&wide_name, "Vrl:F\xC3\xA4rg", "urn:x", "Color");
    EXPECT_EQ(wide_name, units({'V', 'r', 'l', ':', 'F', 0xE4, 'r', 'g'}));
}

TEST(MakeQName, QNameIsNamespaceAndLocalPart) {
    ct_qname<std::string> narrow_name;
    make_qname(&narrow_name, "Vrl:Color", "urn:x", "Color");
    EXPECT_EQ(narrow_name.get_namespace(), "urn:x");
    EXPECT_EQ(narrow_name.get_local_part(), "Color");
    ct_qname<std::wstring> wide_name;
    make_qname(&wide_name, "Vrl:Color", "urn:\xC3\xA4", "F\xC3\xA4rg");
    EXPECT_EQ(wide_name.get_namespace(), "urn:\xC3\xA4");
    EXPECT_EQ(wide_name.get_local_part(), units({'F', 0xE4, 'r', 'g'}));
}

TEST(MakeQName, TakesItsOwnPartsAsInput) {
    std::string name = "Vrl:Color";
    make_qname(&name, name, "", "");
    EXPECT_EQ(name, "Vrl:Color");
    ct_qname<std::string> pair;
    pair.set_namespace("urn:x");
    pair.set_local_part("Color");
    make_qname(&pair, "", pair.get_namespace(), pair.get_local_part());
    EXPECT_EQ(pair.get_namespace(), "urn:x");
    EXPECT_EQ(pair.get_local_part(), "Color");
}

}  // namespace
