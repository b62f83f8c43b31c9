#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "V2/Vrl.h"

namespace vrl_test {
namespace {

/// A subclass may watch its stream, so nothing is gathered for it: each value goes to the stream at once.
class watching_writer : public qbxV2::c_xml_writer {
public:
    explicit watching_writer(std::ostream& os)
        : c_xml_writer(os, c_xml_writer::include_xml_decl, "\t", "\n"), m_os(os) {}
    void nest() override {
        ++m_nested;
        if (m_os.tellp() != m_last) ++m_grown;
        m_last = m_os.tellp();
        c_xml_writer::nest();
    }
    bool was_written_to_at_once() const { return m_nested > 5 && m_grown == m_nested; }

private:
    std::ostream& m_os;
    std::streampos m_last = 0;
    int m_nested = 0;
    int m_grown = 0;
};

class WritingPaths : public testing::TestWithParam<const char*> {};

TEST_P(WritingPaths, GatheredAndStreamedTextIsTheSame) {
    vrl_v2::Vrl document;
    ASSERT_EQ(document.unmarshal((VRL_DOCUMENTS "/" + std::string(GetParam())).c_str()), 0);
    std::ostringstream gathered;
    ASSERT_EQ(document.marshal(gathered), 0);
    std::ostringstream streamed;
    watching_writer out(streamed);
    ASSERT_EQ(document.marshal(out, "Vrl:Vrl"), 0);
    EXPECT_TRUE(out.was_written_to_at_once());
    EXPECT_EQ(streamed.str(), gathered.str());
}

INSTANTIATE_TEST_SUITE_P(Documents, WritingPaths,
                         testing::Values("css_named_colors.vrl", "every_element.vrl", "light_sources.vrl",
                                         "paint_recipe.vrl", "process_inks.vrl", "quality_control.vrl",
                                         "reflectance_palette.vrl"));

}  // namespace
}  // namespace vrl_test
