#include "codegen/layout.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>

namespace {

using vrl_codegen::k_line_length;
using vrl_codegen::lay_out;

struct layout_case {
    const char* why;
    std::string text;
    std::string laid_out;
};

void PrintTo(const layout_case& c, std::ostream* os) { *os << c.why; }

layout_case stays(const char* why, const std::string& text) { return {why, text, text}; }

class Layout : public testing::TestWithParam<layout_case> {};

TEST_P(Layout, BreaksAtTheOutermostPlaceThatHelps) {
    EXPECT_EQ(lay_out(GetParam().text), GetParam().laid_out);
}

TEST_P(Layout, LeavesAloneWhatItHasLaidOut) { EXPECT_EQ(lay_out(GetParam().laid_out), GetParam().laid_out); }

const layout_case k_lines[] = {
    stays("the longest line that fits", std::string(k_line_length, 'n') + "\n"),
    stays("one word that is too long", std::string(k_line_length + 1, 'n') + "\n"),
    stays("a blank line", "a\n\nb\n"),
    stays("nothing", ""),
    {"doubled blank lines become one", "a\n\n\n\nb\n", "a\n\nb\n"},
    stays("a last line without an end", "a\nb"),
};
INSTANTIATE_TEST_SUITE_P(Lines, Layout, testing::ValuesIn(k_lines));

const layout_case k_what_is_never_broken[] = {
    stays("a comment", R"(
    /// The first of many words, (and then more of them), && so on, || so forth, until the end of the line is far.
)"),
    stays("a line with a comment at its end", R"(
    first_of_many_names(second_of_many_names, third_of_many_names, fourth_of_many_names);  ///< "fifth", (sixth)
)"),
    stays("an include", R"(
#include "first_of_many_folders/(second_of_many_folders, third_of_many_folders, fourth_of_many_folders)/file.h"
)"),
    stays("a literal", R"(
"a text that goes on, (and on), && on, || on, { on; }, on = on, : on, and doesn't end before the line ends "
)"),
    stays("a literal with an escaped quote", R"(
"a text with \" in it that goes on, (and on), && on, || on, and on, and doesn't end before the line ends ..."
)"),
};
INSTANTIATE_TEST_SUITE_P(WhatIsNeverBroken, Layout, testing::ValuesIn(k_what_is_never_broken));

const layout_case k_bodies[] = {
    {"a body gets lines of its own", R"(
bool ColorSpaceAdobeWideGamutRGBType::isset_ColorSpaceSpecificationSpectrum() const { return m_ColorSpace.is_set(); }
)",
     R"(
bool ColorSpaceAdobeWideGamutRGBType::isset_ColorSpaceSpecificationSpectrum() const {
    return m_ColorSpace.is_set();
}
)"},
    {"a line for each statement", R"(
    void write(const char* text) { first.append("; ", 2); second.append(text, first.size(), first.capacity()); third(); }
)",
     R"(
    void write(const char* text) {
        first.append("; ", 2);
        second.append(text, first.size(), first.capacity());
        third();
    }
)"},
    {"what follows the body follows its brace", R"(
        m.set = [](void* o, const std::string& t) { return static_cast<DeviceFilter*>(o)->set_DeviceFilter(text_of(t)); };
)",
     R"(
        m.set = [](void* o, const std::string& t) {
            return static_cast<DeviceFilter*>(o)->set_DeviceFilter(text_of(t));
        };
)"},
    {"the head of a body may be too long itself", R"(
bool ColorSpaceMunsellType::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, int* error) { return false; }
)",
     R"(
bool ColorSpaceMunsellType::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                                 int* error) {
    return false;
}
)"},
};
INSTANTIATE_TEST_SUITE_P(Bodies, Layout, testing::ValuesIn(k_bodies));

const layout_case k_heads[] = {
    {"bases go to the next line", R"(
class VRL_API ColorSpaceSpecificationSpectrumTristimulusType : public ColorSpaceSpecificationSpectrumGenericType {
)",
     R"(
class VRL_API ColorSpaceSpecificationSpectrumTristimulusType
    : public ColorSpaceSpecificationSpectrumGenericType {
)"},
    {"initializers too", R"(
ColorSpaceSpecificationSpectrum::ColorSpaceSpecificationSpectrum(Spectrum const& other) : ColorSpaceType(other) {
)",
     R"(
ColorSpaceSpecificationSpectrum::ColorSpaceSpecificationSpectrum(Spectrum const& other)
    : ColorSpaceType(other) {
)"},
    {"what a function returns goes ahead of its name", R"(
ColorSpaceSpecificationSpectrumTristimulus const& ColorSpaceHSLType::get_ColorSpaceSpecificationSpectrumTristimulus();
)",
     R"(
ColorSpaceSpecificationSpectrumTristimulus const&
ColorSpaceHSLType::get_ColorSpaceSpecificationSpectrumTristimulus();
)"},
    {"and the rest may need breaking again", R"(
SpecificationSpectrumTristimulus& ColorSpaceCIEXYZType::assign_ColorSpaceSpecificationSpectrumTristimulusOfPalette(ColorSpace const& value) {
)",
     R"(
SpecificationSpectrumTristimulus&
ColorSpaceCIEXYZType::assign_ColorSpaceSpecificationSpectrumTristimulusOfPalette(ColorSpace const& value) {
)"},
};
INSTANTIATE_TEST_SUITE_P(Heads, Layout, testing::ValuesIn(k_heads));

const layout_case k_expressions[] = {
    {"as many terms on a line as fit, below the first one",
     R"(
    return m_CustomAttribute.set && m_ColorSpaceSpecification.is_set() && !m_ChangeHistory.empty() && m_Description.set;
)",
     R"(
    return m_CustomAttribute.set && m_ColorSpaceSpecification.is_set() && !m_ChangeHistory.empty() &&
           m_Description.set;
)"},
    {"terms in brackets, below the bracket", R"(
    return m_nil || (m_CustomAttribute.set && m_ColorSpaceSpecification.is_set() && !m_ChangeHistory.empty() && m_Text.set);
)",
     R"(
    return m_nil ||
           (m_CustomAttribute.set && m_ColorSpaceSpecification.is_set() && !m_ChangeHistory.empty() &&
            m_Text.set);
)"},
    {"what is assigned goes below", R"(
constexpr ColorSpaceSpecificationSpectrumTristimulusType::Eenum_FieldOfView k_the_usual_field = FieldOfView_2_Degree;
)",
     R"(
constexpr ColorSpaceSpecificationSpectrumTristimulusType::Eenum_FieldOfView k_the_usual_field =
    FieldOfView_2_Degree;
)"},
};
INSTANTIATE_TEST_SUITE_P(Expressions, Layout, testing::ValuesIn(k_expressions));

const layout_case k_brackets[] = {
    {"arguments are filled in behind their bracket", R"(
    frame::children_reader in(reader, name, error, k_source, k_CustomAttributeType_children, k_CustomAttributeType_next);
)",
     R"(
    frame::children_reader in(reader, name, error, k_source, k_CustomAttributeType_children,
                              k_CustomAttributeType_next);
)"},
    {"or below it, if one is too long for that", R"(
CustomAttributeType_ValueChoice& CustomAttributeType_ValueChoice::operator=(CustomAttributeType_ValueChoice const& other) {
)",
     R"(
CustomAttributeType_ValueChoice& CustomAttributeType_ValueChoice::operator=(
    CustomAttributeType_ValueChoice const& other) {
)"},
    {"lists always below", R"(
constexpr std::wstring_view k_DensityStatusKind_texts[] = {L"Status_A", L"Status_E", L"Status_(T, I)_", L"Status_SpectralX"};
)",
     R"(
constexpr std::wstring_view k_DensityStatusKind_texts[] = {
    L"Status_A", L"Status_E", L"Status_(T, I)_", L"Status_SpectralX"};
)"},
    {"a list that is all of the line, behind its bracket", R"(
    {k_document_namespace_id, "ColorSpaceSpecificationSpectrumTristimulus", 42, token::e_ColorSpaceSpecificationSpectrum},
)",
     R"(
    {k_document_namespace_id, "ColorSpaceSpecificationSpectrumTristimulus", 42,
     token::e_ColorSpaceSpecificationSpectrum},
)"},
    {"fields with names, one on a line", R"(
    return frame::marshal(*this, out, name, {.declares_namespaces = true, .id = SampleTargetType::id, .xsi_type = "Vrl:SampleTargetType", .x = 1});
)",
     R"(
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true,
                           .id = SampleTargetType::id,
                           .xsi_type = "Vrl:SampleTargetType",
                           .x = 1});
)"},
    {"template arguments hold together", R"(
        m.set = static_cast<std::map<std::string, std::wstring>*>(set_the_value)(value_of<std::pair<int, long>>(text), 1);
)",
     R"(
        m.set = static_cast<std::map<std::string, std::wstring>*>(set_the_value)(
            value_of<std::pair<int, long>>(text), 1);
)"},
    {"a bracket in a literal is none", R"(
    first_of_many_functions('(', "second ( of many", '\'', "\"]", third_of_many_arguments, fourth_of_many_arguments);
)",
     R"(
    first_of_many_functions('(', "second ( of many", '\'', "\"]", third_of_many_arguments,
                            fourth_of_many_arguments);
)"},
    {"an arrow closes nothing", R"(
        m.make = a_function_that_makes_members([](void* o) -> void*, the_second_argument, the_third_argument_of_all);
)",
     R"(
        m.make = a_function_that_makes_members([](void* o) -> void*, the_second_argument,
                                               the_third_argument_of_all);
)"},
};
INSTANTIATE_TEST_SUITE_P(Brackets, Layout, testing::ValuesIn(k_brackets));

}  // namespace
