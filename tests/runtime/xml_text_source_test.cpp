#include "runtime/xml_text_source.h"

#include <gtest/gtest.h>

#include "reading_paths.h"

namespace {

using namespace qbxV2;
using reading_paths::join;
using reading_paths::printable;

/// Reads `<.` and then lets `act` read on; tells what it gave, what follows, and the reports.
template <class Act>
std::string reading(const std::string& text, Act act) {
    return reading_paths::on_all_paths(join({"<.", text}), [&](c_read& source, bool use_runs) {
        std::string log;
        reading_paths::RecordingErrors errors(&log);
        c_get_for_xml getter(source, errors, true);
        getter.use_runs(use_runs);
        getter.get();
        getter.get();
        const std::string result = act(getter);
        const int next = getter.get();
        const std::string shown = next < 0 ? "end" : printable(std::string(1, static_cast<char>(next)));
        return join({result, " then ", shown, log, " line ", std::to_string(getter.get_line_num())});
    });
}

std::string truth(bool result) { return result ? "true" : "false"; }

std::string non_ws(const std::string& text) {
    return reading(text, [](c_get_for_xml& g) { return std::to_string(g.get_non_ws()); });
}

TEST(GetNonWs, SkipsEveryKindOfWhiteSpace) {
    EXPECT_EQ(non_ws(" \t\r\n\v\fab"), "97 then b line 2");
    EXPECT_EQ(non_ws("ab"), "97 then b line 1");
    EXPECT_EQ(non_ws("\r\n\r\n\n\r<b"), "60 then b line 5");
    EXPECT_EQ(non_ws(" \x01"
                     "b"),
              "1 then b line 1");
    EXPECT_EQ(non_ws(" \xC3\xA9"
                     "b"),
              "195 then \\xA9 line 1");
    EXPECT_EQ(non_ws("\r\n"), "-1 then end line 2");
    EXPECT_EQ(non_ws(""), "-1 then end line 1");
    EXPECT_EQ(non_ws("\n\xC2\x85"
                     "b"),
              "98 then end line 3");
    EXPECT_EQ(non_ws("\r\n\xC2\x85"
                     "bc"),
              "98 then c line 3");
}

TEST(ReadSpecifiedString, ConsumesTheCharacterAtFault) {
    const auto read = [](const std::string& text, const char* s) {
        return reading(text, [s](c_get_for_xml& g) { return truth(g.read_specified_string_from_input(s)); });
    };
    EXPECT_EQ(read("abc", "ab"), "true then c line 1");
    EXPECT_EQ(read("axc", "ab"), "false then c line 1");
    EXPECT_EQ(read("abc", ""), "true then a line 1");
    EXPECT_EQ(read("a", "ab"), "false then end line 1");
}

TEST(GetSimpleQuotedValue, NeedsTheSameQuoteAtBothEnds) {
    const auto quoted = [](const std::string& text) {
        return reading(text, [](c_get_for_xml& g) {
            std::string value = "previous";
            const bool result = g.get_simple_quoted_value(&value);
            return join({truth(result), " ", printable(value)});
        });
    };
    EXPECT_EQ(quoted(" 'a\"b\nc'd"), "true a\"b\\x0Ac then d line 2");
    EXPECT_EQ(quoted("\"a'b\"d"), "true a'b then d line 1");
    EXPECT_EQ(quoted("''d"), "true  then d line 1");
    EXPECT_EQ(quoted("xyz"), "false  then y line 1");
    EXPECT_EQ(quoted("'abc"), "false abc then end line 1");
}

TEST(SkipComment, EndsAtGreaterThanBehindTwoDashes) {
    const auto skip = [](const std::string& text) {
        return reading(text, [](c_get_for_xml& g) { return truth(g.skip_comment()); });
    };
    EXPECT_EQ(skip(" a\n--><b"), "true then < line 2");
    EXPECT_EQ(skip("--><b"), "true then < line 1");
    EXPECT_EQ(skip("-><b"), "false then end line 1");
    EXPECT_EQ(skip("-- -><!-- --><b"), "true then < line 1");
    EXPECT_EQ(skip("---><b"), "true then < !2/8@1: End of comment not Well-Formed line 1");
    EXPECT_EQ(skip("-----><b"), "true then < !2/8@1: End of comment not Well-Formed line 1");
    EXPECT_EQ(skip("a--\xC3\xA9-->b"), "true then b line 1");
}

TEST(SkipPI, EndsAtQuestionMarkAndGreaterThan) {
    const auto skip = [](const std::string& text) {
        return reading(text, [](c_get_for_xml& g) { return truth(g.skip_PI()); });
    };
    EXPECT_EQ(skip("a > ? >\n?"
                   "?><b"),
              "true then < line 2");
    EXPECT_EQ(skip("?>b"), "true then b line 1");
    EXPECT_EQ(skip(">b"), "false then end line 1");
}

TEST(MoveToStartTagEnd, PassesOverQuotedStretches) {
    const auto move = [](const std::string& text) {
        return reading(text, [](c_get_for_xml& g) {
            bool is_empty = false;
            const bool result = g.move_to_start_tag_end(&is_empty);
            return join({truth(result), is_empty ? " empty" : ""});
        });
    };
    EXPECT_EQ(move(" a='>' b=\"/>'\" >c"), "true then c line 1");
    EXPECT_EQ(move("/>c"), "true empty then c line 1");
    EXPECT_EQ(move(" / \n >c"), "true empty then c line 2");
    EXPECT_EQ(move("/xy>c"),
              "false empty then c !1/12@1: Illegal character(s) after / at end of tag - x line 1");
    EXPECT_EQ(move("/x"),
              "false empty then end !1/12@1: Illegal character(s) after / at end of tag - x line 1");
    EXPECT_EQ(move("a='>"), "false then end line 1");
    EXPECT_EQ(move(""), "false then end line 1");
    // Intended: behind the "/" the end of input counts as success.
    EXPECT_EQ(move("/ "), "true empty then end line 1");
    EXPECT_EQ(reading(">c", [](c_get_for_xml& g) { return truth(g.move_to_start_tag_end(nullptr)); }),
              "true then c line 1");
    EXPECT_EQ(reading("/>c", [](c_get_for_xml& g) { return truth(g.move_to_start_tag_end(nullptr)); }),
              "true then c line 1");
}

TEST(ReadEndTag, ComparesTheNameExactly) {
    const auto read = [](const std::string& text, const std::string& name) {
        return reading(text, [&](c_get_for_xml& g) { return truth(g.read_end_tag(name)); });
    };
    EXPECT_EQ(read("</ab>c", "ab"), "true then c line 1");
    EXPECT_EQ(read(" \n</ab\n>c", "ab"), "true then c line 3");
    EXPECT_EQ(read("</ab>c", "a"), "false then > line 1");
    EXPECT_EQ(read("</a>c", "ab"), "false then c line 1");
    EXPECT_EQ(read("<ab>c", "ab"), "false then b line 1");
    EXPECT_EQ(read("x", "ab"), "false then end line 1");
    EXPECT_EQ(read("</\xC3\xA9>c", "\xC3\xA9"), "true then c line 1");
    EXPECT_EQ(read("</a\nb>c", "a\nb"), "true then c line 2") << "any text is a name to this comparison";
    EXPECT_EQ(read("</>c", ""), "true then c line 1");
}

struct Added {
    const char* why;
    eqbx_whitespace mode;
    bool ws_for_char_refs;
    bool from_char_ref;
    const char* outcome;
};
void PrintTo(const Added& a, std::ostream* os) { *os << a.why; }

class AddCharWsp : public testing::TestWithParam<Added> {};

TEST_P(AddCharWsp, FollowsTheMode) {
    const Added& a = GetParam();
    c_read_memory source(nullptr, 0);
    c_error errors;
    c_get_for_xml getter(source, errors, a.ws_for_char_refs);
    getter.set_ws_mode(a.mode);
    std::string text;
    for (const char c : {' ', 'x', '\t', '\n', ' ', 'y', ' '}) getter.add_char_wsp(&text, c, a.from_char_ref);
    EXPECT_EQ(printable(text), a.outcome);
    if (!a.from_char_ref) {
        std::string at_once;
        const std::string all = " x\t\n y ";
        getter.set_ws_mode(a.mode);
        getter.add_chars_wsp(&at_once, all.data(), all.data() + 3);
        getter.add_chars_wsp(&at_once, all.data() + 3, all.data() + all.size());
        EXPECT_EQ(at_once, text);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Modes, AddCharWsp,
    testing::Values(Added{"preserve", EQBX_WS_PRESERVE, true, false, " x\\x09\\x0A y "},
                    Added{"replace", EQBX_WS_REPLACE, true, false, " x   y "},
                    Added{"collapse", EQBX_WS_COLLAPSE, true, false, "x y"},
                    Added{"preserve, from references", EQBX_WS_PRESERVE, true, true, " x\\x09\\x0A y "},
                    Added{"replace, from references", EQBX_WS_REPLACE, true, true, " x   y "},
                    Added{"collapse, from references", EQBX_WS_COLLAPSE, true, true, "x y"},
                    Added{"replace, references exempt", EQBX_WS_REPLACE, false, true, " x\\x09\\x0A y "},
                    Added{"collapse, references exempt but for the space itself", EQBX_WS_COLLAPSE, false,
                          true, "x\\x09\\x0A y"},
                    Added{"replace, other characters while references are exempt", EQBX_WS_REPLACE, false,
                          false, " x   y "}));

TEST(AddCharWspPending, SpaceIsForgottenByResetAndByANewMode) {
    c_read_memory source(nullptr, 0);
    c_error errors;
    c_get_for_xml getter(source, errors, true);
    std::string text = "a";
    getter.set_ws_mode(EQBX_WS_COLLAPSE);
    getter.add_char_wsp(&text, ' ', false);
    getter.reset_ws_mode();
    getter.add_char_wsp(&text, 'b', false);
    getter.add_char_wsp(&text, ' ', false);
    getter.set_ws_mode(EQBX_WS_COLLAPSE);
    getter.add_char_wsp(&text, 'c', false);
    getter.add_char_wsp(&text, ' ', false);
    getter.add_char_wsp(&text, 'd', false);
    EXPECT_EQ(text, "abc d");
}

TEST(TextSourceRewind, GoesBackToPreservingWhiteSpace) {
    const std::string document = "<a";
    c_read_string source(document);
    c_error errors;
    c_get_for_xml getter(source, errors, true);
    getter.set_ws_mode(EQBX_WS_COLLAPSE);
    getter.rewind();
    std::string text;
    getter.add_char_wsp(&text, ' ', false);
    EXPECT_EQ(text, " ");
}

}  // namespace
