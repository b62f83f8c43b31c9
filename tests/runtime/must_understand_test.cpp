#include "runtime/must_understand.h"

#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/reader.h"

namespace {

using namespace qbxV2;

struct Value {
    const char* text;
    eqbx_must_understand meaning;
};
void PrintTo(const Value& v, std::ostream* os) { *os << "'" << v.text << "'"; }

class BoolMustUnderstand : public testing::TestWithParam<Value> {};
TEST_P(BoolMustUnderstand, IsAnXmlSchemaBoolean) {
    EXPECT_EQ(bool_must_understand(GetParam().text), GetParam().meaning);
}
INSTANTIATE_TEST_SUITE_P(
    Values, BoolMustUnderstand,
    testing::Values(Value{"1", EQBX_MUST_UNDERSTAND_YES}, Value{"true", EQBX_MUST_UNDERSTAND_YES},
                    Value{"0", EQBX_MUST_UNDERSTAND_NO}, Value{"false", EQBX_MUST_UNDERSTAND_NO},
                    Value{"TRUE", EQBX_MUST_UNDERSTAND_INVALID}, Value{"", EQBX_MUST_UNDERSTAND_INVALID},
                    Value{" 1", EQBX_MUST_UNDERSTAND_INVALID}));

TEST(BoolMustUnderstandValues, AreZeroOneAndTwo) {
    EXPECT_EQ(EQBX_MUST_UNDERSTAND_NO, 0);
    EXPECT_EQ(EQBX_MUST_UNDERSTAND_INVALID, 1);
    EXPECT_EQ(EQBX_MUST_UNDERSTAND_YES, 2);
}

struct Scan {
    const char* why;
    const char* document;
    eqbx_must_understand answer;
};
void PrintTo(const Scan& s, std::ostream* os) { *os << s.why << ": " << s.document; }

class HasMustUnderstand : public testing::TestWithParam<Scan> {};

TEST_P(HasMustUnderstand, ScansTheDocumentAndGoesBackToItsStart) {
    const std::string outcome =
        reading_paths::on_all_paths(GetParam().document, [](c_read& source, bool use_runs) {
            c_xml_reader reader(source);
            reader.use_runs(use_runs);
            const c_xml_reader_local* const scope = reader.get_reader_local();
            const eqbx_must_understand answer = has_must_understand(reader, "m", "mu", bool_must_understand);
            EXPECT_EQ(reader.get_reader_local(), scope) << "all temporary scopes are closed";
            return std::to_string(answer);
        });
    EXPECT_EQ(outcome, std::to_string(GetParam().answer));
}

INSTANTIATE_TEST_SUITE_P(
    Documents, HasMustUnderstand,
    testing::Values(
        Scan{"on the root element", "<a xmlns:p='m' p:mu='1'/>", EQBX_MUST_UNDERSTAND_YES},
        Scan{"nowhere", "<a xmlns:p='m'><b c='1'>x</b></a>", EQBX_MUST_UNDERSTAND_NO},
        Scan{"a no goes on", "<a xmlns:p='m' p:mu='0'><b p:mu='false'/><c p:mu='true'/></a>",
             EQBX_MUST_UNDERSTAND_YES},
        Scan{"an answer but no ends the scan", "<a xmlns:p='m' p:mu='1'><b></c></a>",
             EQBX_MUST_UNDERSTAND_YES},
        Scan{"a value that is no boolean", "<a xmlns:p='m' p:mu='x'/>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"a value that cannot be read", "<a xmlns:p='m' p:mu='&u;'/>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"another namespace", "<a xmlns:p='n' p:mu='1'/>", EQBX_MUST_UNDERSTAND_NO},
        Scan{"another name", "<a xmlns:p='m' p:mux='1'/>", EQBX_MUST_UNDERSTAND_NO},
        Scan{"without a prefix the default namespace counts", "<a xmlns='m' mu='1'/>",
             EQBX_MUST_UNDERSTAND_YES},
        Scan{"an inner declaration counts", "<a xmlns:p='n'><b xmlns:p='m'><c p:mu='1'/></b></a>",
             EQBX_MUST_UNDERSTAND_YES},
        Scan{"an inner declaration ends with its element", "<a xmlns:p='n'><b xmlns:p='m'/><c p:mu='1'/></a>",
             EQBX_MUST_UNDERSTAND_NO},
        Scan{"a wrong end tag", "<a><b></c></a>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"the end of input", "<a><b/>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"a broken tag", "<a><b c=d/></a>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"a bad end of a tag", "<a><b !></a>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"markup without a report", "<a><!x></a>", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"no root element", " x", EQBX_MUST_UNDERSTAND_INVALID},
        Scan{"nothing", "", EQBX_MUST_UNDERSTAND_INVALID}));

TEST(HasMustUnderstandReader, IsBackAtTheStartAfterAnElementButNotWithoutOne) {
    const std::string text = " x<a xmlns:p='m'><b/></a>";
    c_read_string source(text);
    c_xml_reader reader(source);
    c_xml_reader_local scope(reader);
    EXPECT_EQ(has_must_understand(reader, "m", "mu", bool_must_understand), EQBX_MUST_UNDERSTAND_INVALID);
    EXPECT_EQ(reader.get_current_event(), EQXP_TEXT);
    EXPECT_EQ(has_must_understand(reader, "m", "mu", bool_must_understand), EQBX_MUST_UNDERSTAND_NO);
    EXPECT_EQ(reader.get_current_event(), EQXP_NAME);
    std::string name;
    EXPECT_EQ(reader.get_element_name(&scope, &name), EQXP_TEXT);
}

TEST(HasMustUnderstandReader, RefusesADocumentDeeperThanTheLimit) {
    const std::string text = "<a xmlns:p='m'><a><a p:mu='1'></a></a></a>";
    for (const unsigned limit : {1U, 2U}) {
        c_read_string source(text);
        c_xml_reader reader(source);
        reader.set_max_depth(limit);
        EXPECT_EQ(has_must_understand(reader, "m", "mu", bool_must_understand),
                  limit == 2 ? EQBX_MUST_UNDERSTAND_YES : EQBX_MUST_UNDERSTAND_INVALID);
    }
}

TEST(HasMustUnderstandReader, EndsInTimeHoweverManyNamespacesThereAre) {
    std::string text = "<a";
    for (int i = 0; i < 20000; ++i) text += " xmlns:p" + std::to_string(i) + "='u" + std::to_string(i) + "'";
    for (int i = 0; i < 20000; ++i) text += " p" + std::to_string(i) + ":mu='1'";
    text += "/>";
    c_read_string source(text);
    c_xml_reader reader(source);
    EXPECT_EQ(has_must_understand(reader, "m", "mu", bool_must_understand), EQBX_MUST_UNDERSTAND_NO);
}

struct Root {
    const char* why;
    const char* document;
    bool found;
    const char* ns;
};
void PrintTo(const Root& r, std::ostream* os) { *os << r.why; }

class InstanceNamespace : public testing::TestWithParam<Root> {};

TEST_P(InstanceNamespace, IsThatOfTheRootElementAndTheReaderIsBackAtTheStart) {
    const std::string text = GetParam().document;
    c_read_string source(text);
    c_xml_reader reader(source);
    std::string ns = "previous";
    EXPECT_EQ(get_instance_namespace(reader, &ns), GetParam().found);
    EXPECT_EQ(ns, GetParam().ns);
    EXPECT_EQ(reader.get_line_no(), 1);
    EXPECT_EQ(source.read(), text.empty() ? -1 : text[0]);
}

INSTANTIATE_TEST_SUITE_P(
    Documents, InstanceNamespace,
    testing::Values(Root{"a prefix", "<?xml version='1.0'?>\n<p:a xmlns:p='u'/>", true, "u"},
                    Root{"a default namespace", "<a xmlns='u'/>", true, "u"},
                    Root{"no namespace", "<a xmlns=''/>", true, ""},
                    Root{"an undeclared prefix", "<q:a/>", false, " "},
                    Root{"no default namespace", "<a/>", false, " "},
                    Root{"no element", " x", false, "previous"}, Root{"nothing", "", false, "previous"}));

}  // namespace
