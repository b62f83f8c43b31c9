#include <gtest/gtest.h>

#include "reader_on_text.h"

namespace {

using namespace qbxV2;
using reader_on_text::k_ns_map;
using reader_on_text::Reading;

TEST(ReaderNamespaces, OfTheFormatGetItsIdsAndMappingsTheNextOnes) {
    Reading r("<p:a/><b/>");
    r.reader.add_namespace_mapping("p", "mapped");
    r.reader.add_namespace_mapping("V", "doc");
    r.reader.add_default_namespace_mapping("default");
    EXPECT_EQ(r.reader.find_enumerated_namespace("mapped"), 0) << "nothing happens before set_ns_map";
    for (int i = 0; i < 2; ++i) {
        r.reader.set_ns_map(k_ns_map);
        EXPECT_EQ(r.reader.find_enumerated_namespace("doc"), 1000);
        EXPECT_EQ(r.reader.find_enumerated_namespace("mapped"), 1001);
        EXPECT_EQ(r.reader.find_enumerated_namespace("default"), 1002);
    }
    c_xml_reader_local scope(r.reader);
    r.start_tag();
    EXPECT_EQ(r.reader.get_ns_id(), 1001);
    r.element();
    EXPECT_EQ(r.reader.get_ns_id(), 1002);
    EXPECT_EQ(r.reader.get_ns_id(&scope, "V:x"), 1000);
}

TEST(ReaderNamespaces, HaveToBeSetAgainAfterARewind) {
    Reading r("<V:one xmlns:V='doc'/>");
    r.element();
    EXPECT_EQ(r.reader.get_ns_id(), 1000);
    r.reader.rewind();
    EXPECT_EQ(r.reader.find_enumerated_namespace("doc"), 0);
    r.reader.set_ns_map(k_ns_map);
    r.element();
    EXPECT_EQ(r.reader.get_ns_id(), 1000);
}

TEST(GetNamespace, ResolvesThePrefixFromTheCurrentScope) {
    Reading r("<a xmlns:p='u' xmlns='v'><b xmlns=''/></a>");
    std::string out;
    EXPECT_EQ(r.reader.get_namespace("q:x", &out), " ");
    EXPECT_EQ(out, c_xml_reader::k_namespace_not_found);
    EXPECT_EQ(r.reader.get_namespace("x", &out), " ");
    r.element();
    EXPECT_EQ(&r.reader.get_namespace("p:x", &out), &out);
    EXPECT_EQ(out, "u");
    EXPECT_EQ(r.reader.get_namespace("x", &out), "v");
    EXPECT_EQ(r.reader.get_namespace("xml:x", &out), "http://www.w3.org/XML/1998/namespace");
    r.reader.skip_start_tag(nullptr);
    c_xml_reader_local scope(r.reader);
    r.element();
    EXPECT_EQ(r.reader.get_namespace("x", &out), "");
    EXPECT_EQ(r.reader.get_namespace("p:x", &out), "u");
}

struct QName {
    const char* name;
    bool valid;
};
void PrintTo(const QName& q, std::ostream* os) { *os << "'" << q.name << "'"; }

class ValidQName : public testing::TestWithParam<QName> {};

TEST_P(ValidQName, NeedsANamespaceAndAsciiLetters) {
    Reading r("<a xmlns:p='u' xmlns:_='u' xmlns:\xC3\xA9='u' xmlns:1='u'/>");
    r.element();
    EXPECT_EQ(r.reader.is_valid_qname(GetParam().name), GetParam().valid);
}

INSTANTIATE_TEST_SUITE_P(Names, ValidQName,
                         testing::Values(QName{"p:x", true}, QName{"p:x.y-z_1", true}, QName{"_:_", true},
                                         QName{"xml:lang", true}, QName{"p:", false}, QName{"q:x", false},
                                         QName{"x", false}, QName{"", false}, QName{"p:1", false},
                                         QName{"p:-x", false}, QName{"p:x y", false},
                                         QName{"p:\xC3\xA9", false}, QName{"\xC3\xA9:x", false},
                                         QName{"1:x", false}, QName{":x", false}, QName{"p::x", true},
                                         QName{"p:::x", false}, QName{"p:x:y", false}));

TEST(ValidQNameDefault, WithoutAPrefixNeedsADefaultNamespace) {
    Reading r("<a xmlns='u'/>");
    EXPECT_FALSE(r.reader.is_valid_qname("x"));
    r.element();
    EXPECT_TRUE(r.reader.is_valid_qname("x"));
    EXPECT_FALSE(r.reader.is_valid_qname(""));
}

}  // namespace
