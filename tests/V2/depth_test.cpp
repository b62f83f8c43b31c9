#include <gtest/gtest.h>

#include <memory>
#include <ostream>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// The two recursions of the format, as deep as reading admits: a color on a substrate that has a color, and
/// a color space whose parent is a color space.
namespace {

using namespace vrl_v2;

/// Colors, one on the other's substrate: each is two open elements.
std::string nested_colors(unsigned levels) {
    std::string start;
    std::string end;
    for (unsigned i = 1; i < levels; ++i) {
        start +=
            "<Vrl:Color ColorName=\"c\">" + vrl_test::history() + vrl_test::cmyk() + "<Vrl:SubstratePaper>";
        end += "</Vrl:SubstratePaper></Vrl:Color>";
    }
    return vrl_test::document(start + vrl_test::color("innermost") + end);
}

/// Color spaces, one the other's parent: each is two open elements.
std::string nested_spaces(unsigned levels) {
    std::string start;
    std::string end;
    const std::string rest = vrl_test::history() + vrl_test::spectrum_generic() + vrl_test::inks();
    for (unsigned i = 1; i < levels; ++i) {
        start += "<Vrl:ColorSpaceCMYK><Vrl:ParentColorSpace>";
        end += "</Vrl:ParentColorSpace>" + rest + "</Vrl:ColorSpaceCMYK>";
    }
    return vrl_test::document(
        vrl_test::element("Color", vrl_test::history() + start + vrl_test::cmyk() + end, " ColorName=\"c\""));
}

struct nesting {
    const char* name;
    std::string (*document)(unsigned levels);
};
void PrintTo(const nesting& n, std::ostream* os) { *os << n.name; }

class Deep : public testing::TestWithParam<nesting> {};

int read(Vrl& document, const std::string& xml, unsigned max_depth, const vrl_test::answer& reply) {
    vrl_test::recording_reader reader(xml, reply);
    if (max_depth != 0) reader.set_max_depth(max_depth);
    return document.unmarshal(reader);
}

TEST_P(Deep, DocumentOfAThousandElementsIsReadWrittenCopiedAndFreed) {
    const std::string xml = GetParam().document(490);
    auto document = std::make_unique<Vrl>();
    ASSERT_EQ(read(*document, xml, 0, vrl_test::refuse), 0);
    std::string text;
    ASSERT_EQ(document->marshal(&text), 0);
    auto copy = std::make_unique<Vrl>(*document);
    document.reset();
    std::string copied_text;
    ASSERT_EQ(copy->marshal(&copied_text), 0);
    EXPECT_EQ(copied_text, text);
    Vrl assigned;
    assigned = *copy;
    copy->reset();
    Vrl again;
    ASSERT_EQ(again.unmarshal(text), 0);
    std::string again_text;
    ASSERT_EQ(again.marshal(&again_text), 0);
    EXPECT_EQ(again_text, text);
    ASSERT_EQ(assigned.marshal(&copied_text), 0);
    EXPECT_EQ(copied_text, text);
}

TEST_P(Deep, DocumentAtTheReadersLimitStandsEverythingThatReadingAdmits) {
    // The deepest that the default admits.
    const unsigned levels = (qbxV2::c_xml_reader::k_default_max_depth - 10) / 2;
    auto document = std::make_unique<Vrl>();
    ASSERT_EQ(document->unmarshal(GetParam().document(levels)), 0);
    std::string text;
    ASSERT_EQ(document->marshal(&text), 0);
    const auto copy = std::make_unique<Vrl>(*document);
    document.reset();
    std::string copied_text;
    ASSERT_EQ(copy->marshal(&copied_text), 0);
    EXPECT_EQ(copied_text.size(), text.size());
}

TEST_P(Deep, DocumentBeyondTheReadersLimitIsRefused) {
    const unsigned levels = qbxV2::c_xml_reader::k_default_max_depth;
    auto document = std::make_unique<Vrl>();
    EXPECT_EQ(read(*document, GetParam().document(levels), 0, vrl_test::refuse), 5);
    EXPECT_EQ(document->size_Color(), 1u) << "what was read so far stays";
    EXPECT_EQ(Vrl().unmarshal(GetParam().document(levels)), 5);
}

// A limit that a handler could lift would be none.
TEST_P(Deep, DocumentBeyondTheReadersLimitIsRefusedWhateverTheHandlerSays) {
    const unsigned levels = qbxV2::c_xml_reader::k_default_max_depth;
    auto document = std::make_unique<Vrl>();
    EXPECT_EQ(read(*document, GetParam().document(levels), 0, vrl_test::forgive), 5);
}

TEST_P(Deep, DocumentIsMeasuredByTheLimitThatACallerSets) {
    const std::string xml = GetParam().document(10);
    int limit = 0;
    for (int code = 5; code == 5; ++limit) {
        Vrl document;
        code = read(document, xml, static_cast<unsigned>(limit + 1), vrl_test::refuse);
        ASSERT_TRUE(code == 0 || code == 5) << code;
    }
    EXPECT_GT(limit, 15) << "two open elements a level";
    EXPECT_LT(limit, 30);

    const std::string deeper = GetParam().document(1200);
    auto document = std::make_unique<Vrl>();
    EXPECT_EQ(read(*document, deeper, 0, vrl_test::refuse), 5);
    document->reset();
    EXPECT_EQ(read(*document, deeper, 4000, vrl_test::refuse), 0);
}

TEST_P(Deep, NonsenseIsNoDeeperThanItsLimit) {
    std::string xml;
    for (int i = 0; i < 100000; ++i) xml += "<Vrl:Stranger>";
    Vrl document;
    EXPECT_EQ(document.unmarshal(vrl_test::document(xml)), 10);
    EXPECT_EQ(read(document, vrl_test::document(xml), 0, vrl_test::forgive), 0);
}

INSTANTIATE_TEST_SUITE_P(Recursions, Deep,
                         testing::Values(nesting{"Colors", &nested_colors},
                                         nesting{"ColorSpaces", &nested_spaces}),
                         [](const testing::TestParamInfo<nesting>& n) { return std::string(n.param.name); });

// What stands in a revision is text, however deep it nests.
TEST(DeepRevision, IsNotMeasuredByTheLimit) {
    std::string start;
    std::string end;
    for (unsigned i = 0; i < 100000; ++i) {
        start += "<a>";
        end += "</a>";
    }
    Revision revision;
    ASSERT_EQ(vrl_test::read_element(revision, vrl_test::element("Revision", start + end)).code, 0);
    std::string text;
    revision.get_any(0, nullptr, nullptr, &text);
    EXPECT_EQ(text, start + end);
}

}  // namespace
