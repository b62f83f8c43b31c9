#include "runtime/binary.h"

#include <gtest/gtest.h>

#include <iomanip>
#include <random>
#include <sstream>
#include <stdexcept>

#include "runtime/as_text.h"

namespace {

using qbxV2::c_binary;

c_binary bytes(const std::string& text) {
    return {reinterpret_cast<const unsigned char*>(text.data()), static_cast<unsigned int>(text.size())};
}

std::string base64(const c_binary& value) {
    std::ostringstream os;
    value.out_base64(os);
    std::string appended = "=";
    value.append_base64(appended);
    EXPECT_EQ("=" + os.str(), appended);
    return os.str();
}

std::string hex(const c_binary& value) {
    std::ostringstream os;
    value.out_hex(os);
    return os.str();
}

c_binary decoded(const std::string& text) {
    c_binary value = bytes("left over");
    value.from_base64(text);
    return value;
}

struct Coded {
    std::string bytes;
    const char* text;
};
void PrintTo(const Coded& c, std::ostream* os) { *os << c.text; }

class Base64 : public testing::TestWithParam<Coded> {};
TEST_P(Base64, IsWrittenAndReadBack) {
    EXPECT_EQ(base64(bytes(GetParam().bytes)), GetParam().text);
    EXPECT_EQ(decoded(GetParam().text), bytes(GetParam().bytes));
    EXPECT_TRUE(c_binary::is_valid_base64(GetParam().text));
}
INSTANTIATE_TEST_SUITE_P(Groups, Base64,
                         testing::Values(Coded{"", ""}, Coded{"M", "TQ=="}, Coded{"Ma", "TWE="},
                                         Coded{"Man", "TWFu"}, Coded{"Many", "TWFueQ=="},
                                         Coded{std::string(3, '\0'), "AAAA"}, Coded{"\xFB\xEF\xBE", "++++"},
                                         Coded{"\xFF\xFF\xFF", "////"}));

// Intended: the place where a line break would be written is never reached.
TEST(Base64Output, NeverBreaksALine) {
    const std::string text = base64(bytes(std::string(300, 'x')));
    EXPECT_EQ(text.size(), 400U);
    EXPECT_EQ(text.find('\n'), std::string::npos);
    EXPECT_EQ(base64(bytes(std::string(100000, 'x'))).find('\n'), std::string::npos);
}

TEST(Base64Output, ComesBackWhateverTheSize) {
    std::mt19937 random(13);
    for (const std::size_t size : {1U, 2U, 3U, 100U, 3071U, 3072U, 3073U, 3074U, 3075U, 6144U, 10000U}) {
        std::string text(size, '\0');
        for (char& c : text) c = static_cast<char>(random());
        const std::string encoded = base64(bytes(text));
        EXPECT_EQ(encoded.size(), (size + 2) / 3 * 4);
        EXPECT_TRUE(c_binary::is_valid_base64(encoded));
        EXPECT_EQ(decoded(encoded), bytes(text));
    }
}

TEST(Base64Input, SkipsWhatIsNoDigit) {
    EXPECT_EQ(decoded("T W\nFu"), bytes("Man"));
    EXPECT_EQ(decoded("=T=W*F\xFFu="), bytes("Man"));
    EXPECT_EQ(decoded("TWE="), bytes("Ma"));
    EXPECT_EQ(decoded("==="), bytes(""));
}

TEST(Base64Input, MakesBytesOfDigitsLeftOver) {
    EXPECT_EQ(decoded("T"), bytes("L"));  // 010011 and two zero bits
    EXPECT_EQ(decoded("TW"), bytes("M"));
    EXPECT_EQ(decoded("TWE"), bytes("Ma"));
    EXPECT_EQ(decoded("TWFuT"), bytes("ManL"));
}

struct Verdict {
    const char* why;
    std::string text;
    bool valid;
};
void PrintTo(const Verdict& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class IsValidBase64 : public testing::TestWithParam<Verdict> {};
TEST_P(IsValidBase64, LooksAtGroupsAndPadding) {
    const std::string& text = GetParam().text;
    EXPECT_EQ(c_binary::is_valid_base64(text), GetParam().valid);
    EXPECT_EQ(c_binary::is_valid_base64(text.data(), text.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, IsValidBase64,
    testing::Values(
        Verdict{"nothing", "", true}, Verdict{"one padding", "TWE=", true},
        Verdict{"two paddings", "TQ==", true}, Verdict{"a whole group", "TWFu", true},
        Verdict{"blanks between", "T W F u", true}, Verdict{"line ends between", "TW\r\n\tFu", true},
        Verdict{"white space behind", "TWFu\n", true}, Verdict{"one digit", "T", false},
        Verdict{"three paddings", "a===", false}, Verdict{"padding missing", "TW", false},
        Verdict{"padding missing", "TWE", false}, Verdict{"a digit behind padding", "ab=c", false},
        Verdict{"padding too much", "TWFu=", false}, Verdict{"padding too much", "TWFu==", false},
        Verdict{"a strange character first", "*abc", false},
        Verdict{"a strange character for padding", "abc*", false},
        Verdict{"a strange character inside", "ab*def", false},
        Verdict{"padding in the middle", "TQ==TQ==", false}, Verdict{"one blank", " ", false},
        Verdict{"a top bit", "TWF\xF5", false}, Verdict{"a zero byte", std::string("TWF\0", 4), false},
        // Intended: white space alone passes from two characters on.
        Verdict{"blanks alone", "  ", true}, Verdict{"blanks alone", " \n\t ", true},
        // Intended: white space behind the first "=" counts as padding.
        Verdict{"a blank as padding", "ab= ", true},
        Verdict{"a line end that is one too much", "abc=\n", false}));

TEST(Hex, IsWrittenInUpperCase) {
    EXPECT_EQ(hex(bytes("\x0A\xFF")), "0AFF");
    EXPECT_EQ(hex(bytes("")), "");
    EXPECT_EQ(hex(bytes(std::string(5000, '\x5C'))).size(), 10000U);
}

TEST(HexOutput, PutsTheFlagsBackAndLeavesTheFill) {
    for (const auto flags : {std::ios::dec, std::ios::oct, std::ios::dec | std::ios::showpos}) {
        std::ostringstream os;
        os.flags(flags);
        os.fill('*');
        bytes("\x0A\xFF").out_hex(os);
        EXPECT_EQ(os.str(), "0AFF");
        EXPECT_EQ(os.flags(), flags);
        EXPECT_EQ(os.fill(), '0');
    }
}

TEST(HexOutput, FollowsTheStreamWhereItWasShaped) {
    std::ostringstream os;
    os << std::showbase;
    bytes("\x0A\xFF").out_hex(os);
    EXPECT_EQ(os.str(), "0XA0XFF");
}

TEST(HexInput, TakesPairs) {
    c_binary value = bytes("left over");
    value.from_hex("0aFf");
    EXPECT_EQ(value, bytes("\x0A\xFF"));
    value.from_hex("0aF");
    EXPECT_EQ(value, bytes("\x0A"));
    value.from_hex("0");
    EXPECT_EQ(value.size(), 0U);
    value.from_hex("");
    EXPECT_EQ(value.size(), 0U);
    value.from_hex("zz!!");
    EXPECT_EQ(value.size(), 2U);
}

TEST(HexInput, TakesBackEveryByte) {
    std::string all;
    for (int i = 0; i < 256; ++i) all.push_back(static_cast<char>(i));
    c_binary value;
    value.from_hex(hex(bytes(all)));
    EXPECT_EQ(value, bytes(all));
}

class IsValidHex : public testing::TestWithParam<Verdict> {};
TEST_P(IsValidHex, TakesPairsOfDigits) {
    const std::string& text = GetParam().text;
    EXPECT_EQ(c_binary::is_valid_hex(text), GetParam().valid);
    EXPECT_EQ(c_binary::is_valid_hex(text.data(), text.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(Texts, IsValidHex,
                         testing::Values(Verdict{"nothing", "", true}, Verdict{"both cases", "0aFF", true},
                                         Verdict{"odd", "0", false}, Verdict{"no digit", "0G", false},
                                         Verdict{"a blank", "0 ", false},
                                         Verdict{"a top bit", "0\xB2", false}));

TEST(Binary, KeepsACopy) {
    unsigned char source[] = {1, 2, 3};
    c_binary value(source, 3);
    source[0] = 9;
    EXPECT_EQ(value[0], 1);
    EXPECT_EQ(value.size(), 3U);
    value.set(source, 1);
    EXPECT_EQ(value.size(), 1U);
    EXPECT_EQ(value[0], 9);
    value.set(nullptr, 0);
    EXPECT_EQ(value.size(), 0U);
}

TEST(Binary, TakesAPartOfItself) {
    c_binary value = bytes("abcdef");
    value.set(value.data() + 2, 3);
    EXPECT_EQ(value, bytes("cde"));
}

TEST(Binary, RefusesAnImpossibleSize) {
    c_binary value = bytes("abc");
    const unsigned char byte = 0;
    EXPECT_THROW(value.set(&byte, 0x80000000U), std::length_error);
    EXPECT_EQ(value, bytes("abc"));
}

TEST(Binary, GetCopiesNoMoreThanThereIs) {
    unsigned char out[4] = {9, 9, 9, 9};
    EXPECT_EQ(bytes("ab").get(out, 4), out);
    EXPECT_EQ(out[1], 'b');
    EXPECT_EQ(out[2], 9);
    bytes("cd").get(out, 1);
    EXPECT_EQ(out[0], 'c');
    EXPECT_EQ(out[1], 'b');
    EXPECT_EQ(c_binary().get(out, 4), out);
    EXPECT_EQ(out[0], 'c');
}

TEST(Binary, AtRaisesAnError) {
    c_binary value = bytes("ab");
    value.at(1) = 'x';
    EXPECT_EQ(std::as_const(value).at(1), 'x');
    try {
        value.at(2);
        FAIL() << "no error";
    } catch (const std::out_of_range& error) {
        EXPECT_STREQ(error.what(), "invalid vector<T> subscript");
    }
    EXPECT_THROW(static_cast<void>(std::as_const(value).at(2)), std::out_of_range);
    EXPECT_THROW(static_cast<void>(std::as_const(value).at(0xFFFFFFFFU)), std::out_of_range);
}

TEST(Binary, GrowsByBytes) {
    c_binary value;
    value += 'a';
    value += 0xFF;
    EXPECT_EQ(value, bytes("a\xFF"));
    value[0] = 'b';
    EXPECT_EQ(std::as_const(value)[0], 'b');
}

TEST(Binary, ComparesSizesAndBytes) {
    EXPECT_TRUE(bytes("ab") == bytes("ab"));
    EXPECT_TRUE(bytes("ab") != bytes("ac"));
    EXPECT_TRUE(bytes("ab") != bytes("abc"));
    EXPECT_TRUE(c_binary() == bytes(""));
    const unsigned char data[] = {'a', 'b'};
    EXPECT_TRUE(bytes("ab").equal(data, 2));
    EXPECT_FALSE(bytes("ab").equal(data, 1));
    EXPECT_TRUE(c_binary().equal(nullptr, 0));
}

TEST(Binary, CopiesAndSwaps) {
    c_binary a = bytes("a");
    qbxV2::tc_binary b = a;
    b += 'b';
    EXPECT_EQ(a, bytes("a"));
    a.swap(b);
    EXPECT_EQ(a, bytes("ab"));
    swap(a, b);
    EXPECT_EQ(a, bytes("a"));
}

}  // namespace
