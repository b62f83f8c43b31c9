#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/scanner.h"

namespace {

using namespace qbxV2;
using reading_paths::join;
using reading_paths::printable;
using namespace std::string_literals;

std::string copied(const std::string& document, eqbx_whitespace mode = EQBX_WS_PRESERVE) {
    return reading_paths::on_all_paths(document, [mode](c_read& source, bool use_runs) {
        std::string log;
        reading_paths::RecordingErrors errors(&log);
        c_xml xml(source, errors, true);
        xml.use_runs(use_runs);
        c_xml_local scope;
        std::string name;
        std::string out = "previous";
        xml.get_element_name(&scope, &name);
        const bool result = xml.get_any_element(name, &out, mode, false);
        return join({result ? "true " : "false ", printable(out), log});
    });
}

std::string nested(const std::string& document, eqbx_whitespace mode = EQBX_WS_PRESERVE) {
    return reading_paths::on_all_paths(document, [mode](c_read& source, bool use_runs) {
        c_error errors;
        c_xml xml(source, errors, true);
        xml.use_runs(use_runs);
        c_xml_local scope;
        std::string name;
        std::string value = "previous";
        std::string end = "previous";
        bool is_empty = false;
        xml.get_element_name(&scope, &name);
        xml.skip_start_tag(&is_empty);
        const bool result = xml.get_nested_element_value(&value, &end, mode, false);
        return join({result ? "true " : "false ", printable(value), " end ", end});
    });
}

struct Copy {
    const char* why;
    const char* document;
    const char* outcome;
};
void PrintTo(const Copy& c, std::ostream* os) { *os << c.why << ": " << c.document; }

class AnyElement : public testing::TestWithParam<Copy> {};
TEST_P(AnyElement, IsWrittenBackAsText) { EXPECT_EQ(copied(GetParam().document), GetParam().outcome); }

INSTANTIATE_TEST_SUITE_P(
    Whole, AnyElement,
    testing::Values(
        Copy{"an empty element", "<a/>", "true <a/>"},
        Copy{"declarations come first", "<a b='1' xmlns:p=\"u\" c=\"2\" xmlns='v'/>",
             "true <a xmlns:p=\"u\" xmlns='v' b='1' c=\"2\"/>"},
        Copy{"values stay raw", "<a b='&lt;&u;'>&amp;&u;</a>", "true <a b='&lt;&u;'>&amp;&u;</a>"},
        Copy{"nested tags stay as they are", "<a><b  c = '>/' ><d/></b ></a>",
             "true <a><b  c = '>/' ><d/></b></a>"},
        Copy{"what stands between / and > goes", "<a><b/ x></a>", "true <a><b/></a>"},
        Copy{"white space before a tag goes", "<a> <b/>\n</a>", "true <a><b/></a>"},
        Copy{"white space of text stays", "<a> x <b/> y\n</a>", "true <a> x <b/> y\\x0A</a>"},
        Copy{"comments and instructions go", "<a>x<!-- c -->y<?p?>z</a>", "true <a>xyz</a>"},
        Copy{"a CDATA section stays", "<a>x<![CDATA[<&]]]>y</a>", "true <a>x<![CDATA[<&]]]>y</a>"},
        Copy{"of other markup the two characters go", "<a><!xyz></a>", "true <a>yz></a>"},
        Copy{"an empty name is a name", "<a><></></a>", "true <a><></></a>"},
        Copy{"bytes from 0x80", "<a>\xC3\xA9<b c='\xC3\xA9'/></a>",
             "true <a>\\xC3\\xA9<b c='\\xC3\\xA9'/></a>"}));

INSTANTIATE_TEST_SUITE_P(Broken, AnyElement,
                         testing::Values(Copy{"another end tag", "<a></b>", "false <a>"},
                                         Copy{"another end tag within", "<a><b></c></b></a>", "false <a><b>"},
                                         Copy{"the end in the content", "<a>x", "false <a>x"},
                                         Copy{"the end in white space", "<a> ", "false <a> "},
                                         Copy{"the end in a tag", "<a><b c='", "false <a><b c='"},
                                         Copy{"the end behind <", "<a><", "false <a>"},
                                         Copy{"the end behind <!", "<a><!", "false <a>"},
                                         Copy{"the end in a comment", "<a><!-- ", "false <a>"},
                                         Copy{"the end in an instruction", "<a><? ", "false <a>"},
                                         Copy{"the end in an end tag", "<a></a", "false <a>"},
                                         Copy{"white space behind <", "<a>< b></a>", "false <a>"},
                                         Copy{"a bad CDATA opening", "<a><![CDAT[x]]></a>", "false <a>"},
                                         Copy{"something behind the name of an end tag", "<a></a x>",
                                              "false <a>"}));

TEST(AnyElementNames, AreComparedBehindANulToo) {
    EXPECT_EQ(copied("<a><b\0c>x</b\0c></a>"s), "true <a><b\\x00c>x</b\\x00c></a>");
    EXPECT_EQ(copied("<a><b\0c></b\0d></a>"s), "false <a><b\\x00c>");
}

TEST(AnyElementModes, ApplyToTextPieces) {
    EXPECT_EQ(copied("<a> x \n y <b> </b></a>", EQBX_WS_COLLAPSE), "true <a>x y<b></b></a>");
    EXPECT_EQ(copied("<a>x <b/> y</a>", EQBX_WS_COLLAPSE), "true <a>x<b/>y</a>") << "each piece by itself";
    EXPECT_EQ(copied("<a>\tx\n<b/></a>", EQBX_WS_REPLACE), "true <a> x <b/></a>");
}

TEST(AnyElementDepth, NeedsNoStack) {
    std::string text;
    constexpr int k_depth = 100000;
    for (int i = 0; i < k_depth; ++i) text += "<a>";
    for (int i = 0; i < k_depth; ++i) text += "</a>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    c_xml_local scope;
    std::string name;
    std::string out;
    xml.get_element_name(&scope, &name);
    EXPECT_TRUE(xml.get_any_element(name, &out, EQBX_WS_PRESERVE, false));
    EXPECT_EQ(out, text);
}

TEST(NestedElementValue, IsTheContentUpToAnEndTag) {
    EXPECT_EQ(nested("<a>x<b c='1'>y</b><d/> z</a>rest"), "true x<b c='1'>y</b><d/> z end a");
    EXPECT_EQ(nested("<a></b>"), "true  end b");
    EXPECT_EQ(nested("<a> <b/> </a>"), "true <b/> end a");
    EXPECT_EQ(nested("<a b='gone'>&lt;</a>"), "true &lt; end a");
    EXPECT_EQ(nested("<a> x  y </a>", EQBX_WS_COLLAPSE), "true x y end a");
}

TEST(NestedElementValue, FailsAtTheEndOfInputAndForAWrongEndTagWithin) {
    EXPECT_EQ(nested("<a>x"), "false x end ");
    EXPECT_EQ(nested("<a><b></c></a>"), "false <b> end ");
}

}  // namespace
