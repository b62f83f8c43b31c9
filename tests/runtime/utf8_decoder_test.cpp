#include "runtime/utf8_decoder.h"

#include <gtest/gtest.h>

#include "reading_paths.h"

namespace {

using namespace qbxV2;
using reading_paths::join;
using reading_paths::on_all_paths;
using reading_paths::printable;
using reading_paths::RecordingErrors;
using namespace std::string_literals;

/// All values of an input up to the first -1, as text, with the line at the end and the reports. Continues
/// behind the -1 for `more` values.
std::string decoded(const std::string& bytes, int more = 0, const char* encoding = nullptr) {
    return on_all_paths(bytes, [=](c_read& source, bool use_runs) {
        std::string log;
        RecordingErrors errors(&log);
        c_get_as_utf8 getter(source, errors);
        getter.use_runs(use_runs);
        std::string text;
        int c = getter.get();
        if (encoding != nullptr && !getter.set_encoding(encoding)) log += " refused";
        for (; c != -1; c = getter.get()) text += static_cast<char>(c);
        std::string result = printable(text) + "|" + std::to_string(getter.get_line_num()) + log;
        for (int i = 0; i < more; ++i) {
            c = getter.get();
            result += join({" ", std::to_string(c)});
        }
        return result;
    });
}

std::string in_utf16(const std::string& ascii, bool big_endian) {
    std::string bytes;
    for (const char c : ascii) bytes += big_endian ? std::string{'\0', c} : std::string{c, '\0'};
    return bytes;
}

constexpr char k_unrecognised[] = " !0/6@1: Unrecognised character encoding";

struct Input {
    const char* why;
    std::string bytes;
    std::string outcome;
};
void PrintTo(const Input& i, std::ostream* os) { *os << i.why; }

class Utf8Decoder : public testing::TestWithParam<Input> {};

TEST_P(Utf8Decoder, DeliversUtf8) { EXPECT_EQ(decoded(GetParam().bytes), GetParam().outcome); }

INSTANTIATE_TEST_SUITE_P(
    Detection, Utf8Decoder,
    testing::Values(
        Input{"an empty source is the end, without a report", "", "|1"}, Input{"a single byte", "<", "<|1"},
        Input{"UTF-8 without a mark", "<a/>", "<a/>|1"},
        Input{"UTF-8 with a mark", "\xEF\xBB\xBF<a/>", "<a/>|1"},
        Input{"a mark and nothing else", "\xEF\xBB\xBF", "|1"},
        Input{"the byte behind the mark is not looked at", "\xEF\xBB\xBFx", "x|1"},
        Input{"the byte behind the mark is not decoded", "\xEF\xBB\xBF\x80<", "\\x80<|1"},
        Input{"a cut mark", "\xEF\xBB", "|1"s + k_unrecognised},
        Input{"a wrong mark", "\xEF\xBB\xBE<", "|1"s + k_unrecognised},
        Input{"white space may come first", " \t<a", " \\x09<a|1"},
        Input{"a form feed counts as white space", "\f<", "\\x0C<|1"},
        Input{"UTF-16 LE without a mark", in_utf16("<a/>", false), "<a/>|1"},
        Input{"UTF-16 LE with a mark", "\xFF\xFE" + in_utf16("<a/>", false), "<a/>|1"},
        Input{"UTF-16 BE without a mark", in_utf16("<a/>", true), "<a/>|1"},
        Input{"UTF-16 BE with a mark", "\xFE\xFF" + in_utf16("<a/>", true), "<a/>|1"},
        Input{"UTF-16 BE may begin with white space", in_utf16("\n<", true), "\\x0A<|2"},
        Input{"a marked UTF-16 LE text must begin with ASCII", "\xFF\xFE\xE9\0"s, "|1"s + k_unrecognised},
        Input{"nor may it begin with NUL", "\xFF\xFE\0\0"s, "|1"s + k_unrecognised},
        Input{"a marked UTF-16 BE text must begin with ASCII", "\xFE\xFF\x20\xAC"s, "|1"s + k_unrecognised},
        Input{"a marked UTF-16 text may begin with any ASCII", "\xFE\xFF\0x"s, "x|1"},
        Input{"a wrong LE mark", "\xFF\xFD<\0"s, "|1"s + k_unrecognised},
        Input{"a wrong BE mark", "\xFE\xFE\0<"s, "|1"s + k_unrecognised},
        Input{"a letter first", "x", "|1"s + k_unrecognised},
        Input{"a NUL and a letter", "\0x"s, "|1"s + k_unrecognised},
        Input{"a byte from 0x80 first", "\xC3\xA9", "|1"s + k_unrecognised}));

INSTANTIATE_TEST_SUITE_P(
    Sequences, Utf8Decoder,
    testing::Values(Input{"two, three and four bytes", "<\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80>",
                          "<\\xC3\\xA9\\xE2\\x82\\xAC\\xF0\\x9F\\x98\\x80>|1"},
                    Input{"cut by the end of input", "<a\xE2\x82", "<a|1"},
                    Input{"a stray continuation byte", "<a\x80", "<a|1"},
                    Input{"an overlong form", "<a\xC0\xBC", "<a|1"},
                    Input{"a surrogate in UTF-8", "<a\xED\xA0\x80", "<a|1"},
                    Input{"above the last plane", "<a\xF4\x90\x80\x80", "<a|1"},
                    Input{"five bytes", "<a\xF8\x88\x80\x80\x80", "<a|1"},
                    Input{"six bytes", "<a\xFC\x84\x80\x80\x80\x80", "<a|1"},
                    Input{"a second byte that is not looked at", "<a\xC3<b", "<a\\xC3<b|1"},
                    Input{"a third byte is not looked at", "<a\xE2\x82<b", "<a\\xE2\\x82<b|1"},
                    Input{"a NUL within a sequence ends it early", "<a\xE2\0\x82x"s, "<a\\xE2x|1"},
                    Input{"NUL is a character", "<a\0b"s, "<a\\x00b|1"},
                    Input{"DEL is a character", "<\x7F", "<\\x7F|1"}));

INSTANTIATE_TEST_SUITE_P(
    LineEnds, Utf8Decoder,
    testing::Values(Input{"CR LF counts as one line", "<\r\na", "<\\x0Aa|2"},
                    Input{"CR", "<\ra", "<\\x0Aa|2"}, Input{"LF", "<\na", "<\\x0Aa|2"},
                    Input{"CR CR LF LF", "<\r\r\n\na", "<\\x0A\\x0A\\x0Aa|4"},
                    Input{"CR LF at the end", "<\r\n", "<\\x0A|2"},
                    Input{"CR at the start", "\r\n<", "\\x0A<|2"},
                    Input{"next line in UTF-8", "<\xC2\x85x", "<\\x0Ax|2"},
                    Input{"line separator in UTF-8", "<\xE2\x80\xA8x", "<\\x0Ax|2"},
                    Input{"a next line behind CR is swallowed too", "<\r\xC2\x85x", "<\\x0Ax|2"},
                    Input{"in UTF-16", in_utf16("<\r\na\rb\n", false), "<\\x0Aa\\x0Ab\\x0A|4"},
                    Input{"next line and line separator in UTF-16", "<\0\x85\0\x28\x20"s, "<\\x0A\\x0A|3"}));

INSTANTIATE_TEST_SUITE_P(
    Utf16, Utf8Decoder,
    testing::Values(Input{"a surrogate pair, LE", "<\0\x3D\xD8\x00\xDE>\0"s, "<\\xF0\\x9F\\x98\\x80>|1"},
                    Input{"a surrogate pair, BE", "\0<\xD8\x3D\xDE\x00\0>"s, "<\\xF0\\x9F\\x98\\x80>|1"},
                    Input{"a low surrogate alone passes", "\0<\xDE\x00\0>"s, "<\\xED\\xB8\\x80>|1"},
                    Input{"a high surrogate without a low one", "\0<\xD8\x3D\0>"s, "<|1"s + k_unrecognised},
                    Input{"a high surrogate at the end", "\0<\xD8\x3D"s, "<|1"},
                    Input{"a high surrogate and half a unit", "\0<\xD8\x3D\xDE"s, "<|1"},
                    Input{"half a unit at the end", "\0<\0"s, "<|1"}));

TEST(Utf8DecoderErrors, ReadingMayGoOnBehindABadSequence) {
    EXPECT_EQ(decoded("<a\x80"
                      "b",
                      2),
              "<a|1 98 -1");
    EXPECT_EQ(decoded("<a\xF8\x88\x80\x80\x80"
                      "b",
                      2),
              "<a|1 98 -1");
}

TEST(Utf8DecoderErrors, AFatalReportIsTheEndForEver) {
    EXPECT_EQ(decoded("xyz", 3), "|1"s + k_unrecognised + " -1 -1 -1");
    EXPECT_EQ(decoded("\0<\xD8\x3D\0>\0a"s, 2), "<|1"s + k_unrecognised + " -1 -1");
}

// Intended: in second place, right behind the byte that the encoding was told from, a bad sequence is no end
// of input.
TEST(Utf8DecoderErrors, ABadSequenceInSecondPlaceIsNul) {
    EXPECT_EQ(decoded("<\x80"
                      "b"),
              "<\\x00b|1");
    EXPECT_EQ(decoded("<\xC0\xBC"
                      "b"),
              "<\\x00\\xBCb|1");
}

constexpr char k_mismatch[] = " !0/15@1: Mis-match between specfied encoding and byte format refused";
constexpr char k_unknown[] = " !0/6@1: Unknown character encoding specified refused";

struct Declared {
    const char* name;
    const char* detected;
    std::string bytes;
    std::string outcome;
};
void PrintTo(const Declared& d, std::ostream* os) { *os << d.name << " in " << d.detected; }

class DeclaredEncoding : public testing::TestWithParam<Declared> {};

TEST_P(DeclaredEncoding, IsCheckedAgainstTheDetectedOne) {
    EXPECT_EQ(decoded(GetParam().bytes, 0, GetParam().name), GetParam().outcome);
}

const std::string k_latin = "<.\xE9\x85\x7F\x80";
const std::string k_pair_le = "<\0\x3D\xD8\x00\xDE"s;
const std::string k_pair_be = "\0<\xD8\x3D\xDE\x00"s;

INSTANTIATE_TEST_SUITE_P(
    Names, DeclaredEncoding,
    testing::Values(Declared{"ISO-10646-UCS-2", "UTF-16 LE", k_pair_le, "<\\xED\\xA0\\xBD\\xED\\xB8\\x80|1"},
                    Declared{"iso-10646-ucs-2", "UTF-16 BE", k_pair_be, "<\\xED\\xA0\\xBD\\xED\\xB8\\x80|1"},
                    Declared{"ISO-10646-UCS-2", "UTF-16 BE, half a unit", "\0<\0"s, "<|1"},
                    Declared{"ISO-10646-UCS-2", "UTF-8", "<a", "<|1"s + k_mismatch},
                    Declared{"ISO-8859-1", "UTF-8", k_latin, "<.\\xC3\\xA9\\x0A\\x7F\\xC2\\x80|2"},
                    Declared{"iso-8859-1", "UTF-8", k_latin, "<.\\xC3\\xA9\\x0A\\x7F\\xC2\\x80|2"},
                    Declared{"ISO-8859-1", "UTF-16 LE", k_pair_le, "<|1"s + k_mismatch},
                    Declared{"US-ASCII", "UTF-8, and bytes above 127 are read as ISO-8859-1", k_latin,
                             "<.\\xC3\\xA9\\x0A\\x7F\\xC2\\x80|2"},
                    Declared{"US-ASCII", "UTF-16 BE", k_pair_be, "<|1"s + k_mismatch},
                    Declared{"UTF-8", "UTF-8", "<\xC3\xA9", "<\\xC3\\xA9|1"},
                    Declared{"utf-8", "UTF-8", "<\xC3\xA9", "<\\xC3\\xA9|1"},
                    Declared{"Utf-8", "UTF-16 LE", k_pair_le, "<|1"s + k_mismatch},
                    Declared{"UTF-16", "UTF-16 LE", k_pair_le, "<\\xF0\\x9F\\x98\\x80|1"},
                    Declared{"utf-16", "UTF-16 BE", k_pair_be, "<\\xF0\\x9F\\x98\\x80|1"},
                    Declared{"UTF-16", "UTF-8", "<a", "<|1"s + k_mismatch},
                    Declared{"UTF-32", "UTF-8", "<a", "<|1"s + k_unknown},
                    Declared{"UTF-8 ", "UTF-8", "<a", "<|1"s + k_unknown},
                    Declared{"UTF", "UTF-8", "<a", "<|1"s + k_unknown},
                    Declared{"", "UTF-8", "<a", "<|1"s + k_unknown}));

TEST(DeclaredEncodingMode, HasBecomeSingleByteEvenWhereItIsRefused) {
    const std::string bytes = in_utf16("<a", true);
    c_read_string source(bytes);
    c_error errors;
    c_get_as_utf8 getter(source, errors);
    EXPECT_EQ(getter.get_encoding(), ENCODING_UNKNOWN);
    getter.get();
    EXPECT_EQ(getter.get_encoding(), ENCODING_UTF16_BE);
    EXPECT_FALSE(getter.set_encoding("ISO-8859-1"));
    EXPECT_EQ(getter.get_encoding(), ENCODING_8BIT);
}

// Intended: a name is checked against the mode in force, which the name before may have changed.
TEST(DeclaredEncodingMode, ASecondDeclarationContradictsTheModeThatTheFirstOneSet) {
    for (const char* const name : {"ISO-8859-1", "US-ASCII", "ISO-10646-UCS-2"}) {
        const bool wide = name[4] == '1';
        const std::string bytes = wide ? in_utf16("<a", false) : "<a";
        std::string log;
        RecordingErrors errors(&log);
        c_read_string source(bytes);
        c_get_as_utf8 getter(source, errors);
        getter.get();
        EXPECT_TRUE(getter.set_encoding(name)) << name;
        EXPECT_FALSE(getter.set_encoding(name)) << name;
        EXPECT_EQ(log, " !0/15@1: Mis-match between specfied encoding and byte format") << name;
    }
}

TEST(DeclaredEncodingMode, BeforeTheFirstByteEveryNameIsAMismatch) {
    for (const char* const name : {"ISO-10646-UCS-2", "ISO-8859-1", "US-ASCII", "UTF-8", "UTF-16"}) {
        const std::string bytes = "<a";
        c_read_string source(bytes);
        c_error errors;
        c_get_as_utf8 getter(source, errors);
        EXPECT_FALSE(getter.set_encoding(name)) << name;
        EXPECT_EQ(errors.get_last_error(), EQBX_ENCODING_MISMATCH) << name;
    }
}

TEST(Utf8DecoderUnget, GivesBackTheLastValueFirst) {
    EXPECT_EQ(on_all_paths("<ab",
                           [](c_read& source, bool use_runs) {
                               c_error errors;
                               c_get_as_utf8 getter(source, errors);
                               getter.use_runs(use_runs);
                               getter.get();
                               getter.unget('z');
                               getter.unget(-1);
                               getter.unget('<');
                               std::string log;
                               for (int i = 0; i < 6; ++i) log += std::to_string(getter.get()) + " ";
                               return log;
                           }),
              "60 -1 122 97 98 -1 ");
}

// Intended: the counter counts what passes `get`.
TEST(Utf8DecoderUnget, ALineFeedThatIsReadAgainCountsTwice) {
    EXPECT_EQ(on_all_paths("<a\nb",
                           [](c_read& source, bool use_runs) {
                               c_error errors;
                               c_get_as_utf8 getter(source, errors);
                               getter.use_runs(use_runs);
                               while (getter.get() != '\n') {
                               }
                               getter.unget('\n');
                               std::string log = std::to_string(getter.get_line_num());
                               log += join({" ", std::to_string(getter.get())});
                               log += join({" ", std::to_string(getter.get_line_num())});
                               return join({log, " ", std::to_string(getter.get())});
                           }),
              "2 10 3 98");
}

// Intended: it looks like the second half of CR LF.
TEST(Utf8DecoderUnget, ALineFeedPushedBackRightBehindCrIsSwallowed) {
    EXPECT_EQ(on_all_paths("<a\rb",
                           [](c_read& source, bool use_runs) {
                               c_error errors;
                               c_get_as_utf8 getter(source, errors);
                               getter.use_runs(use_runs);
                               while (getter.get() != '\n') {
                               }
                               getter.unget('\n');
                               const int next = getter.get();
                               return std::to_string(next) + " line " + std::to_string(getter.get_line_num());
                           }),
              "98 line 2");
}

TEST(UngetBuffer, HoldsThreeValuesAndLosesAFourth) {
    c_unget_buffer buffer;
    EXPECT_TRUE(buffer.empty());
    for (const int c : {1, 2, 3, 4}) buffer.unget(c);
    const c_unget_buffer copy = buffer;
    EXPECT_EQ(buffer.get(), 3);
    EXPECT_EQ(buffer.get(), 2);
    EXPECT_EQ(buffer.get(), 1);
    EXPECT_TRUE(buffer.empty());
    EXPECT_EQ(buffer.get(), -1);
    EXPECT_FALSE(copy.empty());
    buffer.unget(5);
    buffer.clear();
    EXPECT_TRUE(buffer.empty());
}

TEST(Utf8DecoderRewind, StartsOverWithDetectionAndLineOne) {
    EXPECT_EQ(on_all_paths("<\n\xE9>",
                           [](c_read& source, bool use_runs) {
                               std::string log;
                               RecordingErrors errors(&log);
                               c_get_as_utf8 getter(source, errors);
                               getter.use_runs(use_runs);
                               getter.get();
                               getter.set_encoding("ISO-8859-1");
                               getter.get();
                               getter.get();
                               getter.unget('x');
                               getter.rewind();
                               log += join({" line ", std::to_string(getter.get_line_num())});
                               EXPECT_EQ(getter.get_encoding(), ENCODING_UNKNOWN);
                               for (int c = getter.get(); c != -1; c = getter.get())
                                   log += join({" ", std::to_string(c)});
                               return log + " line " + std::to_string(getter.get_line_num());
                           }),
              " line 1 60 10 line 2");
}

TEST(Utf8DecoderRewind, LeavesTheErrorRecordSoThatAFatalReportStays) {
    const std::string bytes = "xyz";
    c_read_string source(bytes);
    c_error errors;
    c_get_as_utf8 getter(source, errors);
    getter.get();
    getter.rewind();
    EXPECT_EQ(getter.get(), -1);
    EXPECT_TRUE(errors.is_fatal_errored());
}

TEST(Utf8DecoderRuns, AreClosedWhileSomethingStandsBetweenTheBytesAndTheValues) {
    const std::string bytes = "<ab\rcd";
    c_read_string source(bytes);
    c_error errors;
    c_get_as_utf8 getter(source, errors);
    c_get_as_utf8::s_byte_run run{nullptr, nullptr};
    EXPECT_FALSE(getter.open_run(&run)) << "the encoding is not known yet";
    getter.get();
    EXPECT_FALSE(getter.open_run(&run)) << "the second byte was read with the first";
    getter.get();
    ASSERT_TRUE(getter.open_run(&run));
    EXPECT_EQ(std::string(run.next, run.end), "b\rcd");
    getter.take_run(run.next + 1);
    getter.unget('z');
    EXPECT_FALSE(getter.open_run(&run)) << "a value is pushed back";
    getter.get();
    EXPECT_EQ(getter.get(), '\n');
    EXPECT_FALSE(getter.open_run(&run)) << "a line feed would belong to the CR";
    getter.get();
    EXPECT_TRUE(getter.open_run(&run));
    getter.use_runs(false);
    EXPECT_FALSE(getter.open_run(&run)) << "switched off";
    getter.use_runs(true);
    errors.error(EQBX_ET_FATAL, EQBX_BAD_DTD, "the end");
    EXPECT_FALSE(getter.open_run(&run)) << "the input has ended";
}

TEST(Utf8DecoderRuns, ShareOnePositionWithTheSource) {
    const std::string bytes = "<abc<d/>";
    c_read_string source(bytes);
    {
        c_error errors;
        c_get_as_utf8 getter(source, errors);
        for (int i = 0; i < 4; ++i) getter.get();
    }
    EXPECT_EQ(source.read(), '<');
}

}  // namespace
