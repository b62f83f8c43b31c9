#include <gtest/gtest.h>

#include <iterator>
#include <optional>
#include <string>
#include <utility>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::read_element;

/// A reader that stands on the first element of a text.
class standing_reader : public vrl_test::recording_reader {
public:
    explicit standing_reader(const std::string& xml) : recording_reader(xml, vrl_test::refuse) {
        set_ns_map(document_namespaces());  // before the scope, which takes over what is in force by then
        m_scope.emplace(*this);
        qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
        get_element_event(nullptr, &error, &name);
    }
    std::string name;

private:
    std::optional<qbxV2::c_xml_reader_local> m_scope;
};

/// The state of a group behind the reading of an empty element: it is chosen before the object is read.
template <class Group>
int state_behind(const std::string& element_name) {
    const std::string xml = empty_element(element_name);
    standing_reader reader(xml);
    if (!Group::is_member(reader, reader.name)) return -1;
    Group group;
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    group.unmarshal(reader, &reader.name, &error);
    return group.getchosen();
}

constexpr const char* k_color_spaces[] = {"ColorSpaceRecipe",
                                          "ColorSpaceTINTARA",
                                          "ColorSpaceGeneric",
                                          "ColorSpaceEmissiveGeneric",
                                          "ColorSpaceDensity",
                                          "ColorSpaceRGB",
                                          "ColorSpaceSRGB",
                                          "ColorSpaceAdobeRGB",
                                          "ColorSpaceAdobeWideGamutRGB",
                                          "ColorSpaceSpectral",
                                          "ColorSpaceEmissiveSpectral",
                                          "ColorSpaceCIELab",
                                          "ColorSpaceCIELCh",
                                          "ColorSpaceCIEXYZ",
                                          "ColorSpaceEmissiveCIEXYZ",
                                          "ColorSpaceCIExyY",
                                          "ColorSpaceEmissiveCIExyY",
                                          "ColorSpaceCIELuv",
                                          "ColorSpaceHSL",
                                          "ColorSpaceHSV",
                                          "ColorSpaceCMYK",
                                          "ColorSpaceTINTARAQuadravive",
                                          "ColorSpaceYUV",
                                          "ColorSpaceYIQ",
                                          "ColorSpaceYBR",
                                          "ColorSpaceNCS",
                                          "ColorSpaceMunsell"};
constexpr const char* k_functions[] = {
    "FunctionGeneric",       "FunctionDE",      "FunctionMeanDE",         "FunctionDE94",
    "FunctionDE2000",        "FunctionDECMC",   "FunctionStdDevX",        "FunctionStdDevY",
    "FunctionStdDevZ",       "FunctionStdDevL", "FunctionStdDevA",        "FunctionStdDevB",
    "FunctionStdDevC",       "FunctionStdDevH", "FunctionAverageStdDevL", "FunctionAverageStdDevA",
    "FunctionAverageStdDevB"};
constexpr const char* k_substrates[] = {"SubstratePaper",   "SubstrateGeneric", "SubstrateMetal",
                                        "SubstratePlastic", "SubstrateWood",    "SubstrateVinyl",
                                        "SubstrateTile",    "SubstrateFilm",    "SubstrateTextile"};

TEST(Group, NumbersItsMembersByElement) {
    for (std::size_t i = 0; i < std::size(k_color_spaces); ++i) {
        // The two that need a name report its absence before they are empty; the state is theirs by then.
        EXPECT_EQ(state_behind<sg_ColorSpace>(k_color_spaces[i]), static_cast<int>(i)) << k_color_spaces[i];
    }
    for (std::size_t i = 0; i < std::size(k_functions); ++i) {
        EXPECT_EQ(state_behind<sg_Function>(k_functions[i]), static_cast<int>(i) + 1) << k_functions[i];
    }
    for (std::size_t i = 0; i < std::size(k_substrates); ++i) {
        EXPECT_EQ(state_behind<sg_Substrate>(k_substrates[i]), static_cast<int>(i)) << k_substrates[i];
    }
    EXPECT_EQ(state_behind<sg_Sample>("SampleSpot"), 0);
    EXPECT_EQ(state_behind<sg_Sample>("SampleTarget"), 1);
}

// Intended: the number of "none" leaves one number between it and the last member that is never used.
TEST(NewGroup, HoldsNothingUnderTheNumberBehindTheUnusedOne) {
    EXPECT_EQ(sg_ColorSpace().getchosen(), 28);
    EXPECT_EQ(sg_Function().getchosen(), 19);
    EXPECT_EQ(sg_Sample().getchosen(), 3);
    EXPECT_EQ(sg_Substrate().getchosen(), 10);
    EXPECT_FALSE(sg_ColorSpace().is_occurs_ok());
}

TEST(Group, HoldsOneObject) {
    sg_Substrate group;
    group.get_SubstratePaper().set_PaperType(L"coated");
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_SubstratePaper);
    EXPECT_TRUE(group.is_occurs_ok());
    EXPECT_EQ(group.get_SubstratePaper().get_PaperType(), L"coated") << "the same object again";
    group.get_SubstrateFilm();
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_SubstrateFilm);
    EXPECT_EQ(group.get_SubstratePaper().get_PaperType(), L"") << "made new";
}

TEST(Group, LooksAtAMemberThatItDoesNotHoldWithoutMoving) {
    sg_Substrate group;
    const sg_Substrate& looked_at = group;
    EXPECT_EQ(looked_at.get_SubstratePaper().get_PaperType(), L"") << "the default object: none is there";
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_none);
    group.get_SubstrateFilm().set_FilmType(L"f");
    EXPECT_EQ(looked_at.get_SubstratePaper().get_PaperType(), L"");
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_SubstrateFilm);
}

TEST(Group, AssignsThroughTheMutableGetter) {
    SubstratePaperType paper;
    paper.set_PaperType(L"coated");
    sg_Substrate group;
    group.get_SubstrateFilm();
    SubstratePaperType& mine = group.assign_SubstratePaper(paper);
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_SubstratePaper);
    EXPECT_EQ(&mine, &group.get_SubstratePaper());
    EXPECT_EQ(mine.get_PaperType(), L"coated");
    EXPECT_NE(&mine, &paper);
}

TEST(Group, IsLeftEmptyByReset) {
    sg_Substrate group;
    group.get_SubstrateFilm();
    group.reset();
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_none);
}

TEST(Group, WritesItsMemberUnderTheMembersName) {
    sg_Substrate group;
    group.get_SubstratePaper();
    const std::string text = "<Vrl:SubstratePaper>\n</Vrl:SubstratePaper>\n";
    EXPECT_EQ(vrl_test::write_inner_element(group, "Vrl:Anything").text, text);
    EXPECT_EQ(vrl_test::write_inner_element(group, "").text, text);
}

TEST(Group, WithoutMemberIsNotWritten) {
    for (const auto& result :
         {vrl_test::write_element(sg_ColorSpace(), "Vrl:X"), vrl_test::write_element(sg_Function(), "Vrl:X"),
          vrl_test::write_element(sg_Sample(), "Vrl:X"), vrl_test::write_element(sg_Substrate(), "Vrl:X")}) {
        EXPECT_EQ(result.code, 46);
        EXPECT_EQ(result.text, "");
    }
}

TEST(Group, WithoutMemberInAListStopsWritingBehindItsSiblings) {
    ColorType color;
    complete(color);
    color.append_ColorSpace();
    EXPECT_TRUE(color.is_occurs_ok());
    const auto result = vrl_test::write_element(color, "Vrl:Color");
    EXPECT_EQ(result.code, 46);
    const std::string last = "\t</Vrl:ColorSpaceCMYK>\n";
    ASSERT_GT(result.text.size(), last.size());
    EXPECT_EQ(result.text.substr(result.text.size() - last.size()), last);
}

TEST(GroupMembership, LeavesTheEventOfAStrangerAsItWas) {
    for (const char* name : {"ColorSpace", "Cyan", "SubstratePaper", "Nonsense"}) {
        const std::string xml = empty_element(name);
        standing_reader reader(xml);
        const int event = reader.get_current_event();
        EXPECT_FALSE(sg_ColorSpace::is_member(reader, reader.name)) << name;
        EXPECT_EQ(reader.get_current_event(), event) << name;
    }
}

TEST(GroupMembership, IncludesTheHeadOfFunctionsAlone) {
    const auto is_member = [](const std::string& name, auto group) {
        const std::string xml = empty_element(name);
        standing_reader reader(xml);
        return decltype(group)::is_member(reader, reader.name);
    };
    EXPECT_TRUE(is_member("Function", sg_Function()));
    EXPECT_FALSE(is_member("ColorSpace", sg_ColorSpace()));
    EXPECT_FALSE(is_member("Substrate", sg_Substrate()));
    EXPECT_FALSE(is_member("Sample", sg_Sample()));
}

TEST(GroupMembership, IsForStartsOfElementsOnly) {
    const std::string xml = "<Vrl:a></Vrl:a>";
    standing_reader reader(xml);
    std::string attribute;
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    EXPECT_FALSE(reader.get_attribute_event(nullptr, &error, &attribute));
    reader.get_element_event(nullptr, &error, &reader.name);
    ASSERT_EQ(reader.get_current_event(), qbxV2::EQXP_END_TAG);
    EXPECT_FALSE(sg_ColorSpace::is_member(reader, reader.name));
    EXPECT_EQ(reader.get_current_event(), qbxV2::EQXP_END_TAG);
}

TEST(ReadGroup, PassesOverAStrangerThatItIsGiven) {
    const std::string xml = "<Vrl:r><Vrl:Nonsense a=\"1\"><Vrl:x/>text</Vrl:Nonsense><Vrl:Next/></Vrl:r>";
    standing_reader reader(xml);
    std::string attribute;
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    reader.get_attribute_event(nullptr, &error, &attribute);
    reader.get_element_event(nullptr, &error, &reader.name);
    sg_Substrate group;
    group.get_SubstratePaper();
    EXPECT_TRUE(group.unmarshal(reader, &reader.name, &error));
    EXPECT_EQ(error, 0);
    EXPECT_EQ(group.getchosen(), sg_Substrate::chosen_none);
    EXPECT_EQ(reader.name, "Vrl:Next");
}

TEST(ReadGroup, ReportsAStrangerThatHasNoEnd) {
    const std::string xml = "<Vrl:Nonsense><Vrl:x/>";
    standing_reader reader(xml);
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    sg_Substrate group;
    EXPECT_FALSE(group.unmarshal(reader, &reader.name, &error));
    EXPECT_EQ(error, 10);
}

TEST(ReadGroup, MakesThePlainTypeClass) {
    ColorType color;
    ASSERT_EQ(read_element(color, vrl_test::color()).code, 0);
    EXPECT_EQ(color.get_ColorSpace(0).get_ColorSpaceCMYK().getid(), ColorSpaceCMYKType::id);
    const ColorSpaceType& held = color.get_ColorSpace(0).get_ColorSpaceCMYK();
    EXPECT_EQ(dynamic_cast<const ColorSpaceCMYK*>(&held), nullptr);
}

TEST(ReadGroup, KeepsAnEntryThatFailed) {
    ColorType color;
    const std::string xml = element("Color", vrl_test::history() + vrl_test::cmyk("x"), " ColorName=\"c\"");
    EXPECT_EQ(read_element(color, xml).code, 35);
    ASSERT_EQ(color.size_ColorSpace(), 1u);
    EXPECT_EQ(color.get_ColorSpace(0).getchosen(), sg_ColorSpace::chosen_ColorSpaceCMYK);
    EXPECT_EQ(color.get_ColorSpace(0).get_ColorSpaceCMYK().get_Yellow(), 30.0);
}

}  // namespace
