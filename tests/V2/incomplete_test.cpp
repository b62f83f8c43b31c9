#include <gtest/gtest.h>

#include <fstream>
#include <sstream>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"
#include "tests/temporary_folder.h"

/// What is refused on writing, with 46, and what stands behind the refusal.
namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::k_declaration;
using vrl_test::k_namespaces;
using vrl_test::write_inner_element;

const std::string k_up_to_preamble = "<Vrl:Vrl" + k_namespaces + ">\n\t<Vrl:Preamble>\n";

TEST(IncompleteDocument, StopsInsideThePreamble) {
    Vrl document;
    EXPECT_TRUE(document.is_occurs_ok());
    std::ostringstream os;
    EXPECT_EQ(document.marshal(os), 46);
    EXPECT_EQ(os.str(), k_declaration + k_up_to_preamble);
}

TEST(IncompleteDocument, NeedsEachOfFourInItsHeader) {
    for (int missing = 0; missing < 4; ++missing) {
        Vrl document;
        Header& header = document.get_Preamble().get_Header();
        if (missing != 0) header.set_Creator(L"maker");
        if (missing != 1) header.set_CreatorVersion(L"1");
        if (missing != 2) header.append_ChangeHistory(vrl_test::time());
        if (missing != 3) header.set_Purpose(L"test");
        std::string text;
        EXPECT_EQ(document.marshal(&text), 46) << missing;
    }
    Vrl document;
    complete(document);
    std::string text;
    EXPECT_EQ(document.marshal(&text), 0) << "with empty lists";
}

TEST(IncompleteDocument, LeavesATextAlone) {
    std::string text = "before";
    EXPECT_EQ(Vrl().marshal(&text), 46);
    EXPECT_EQ(text, "before");
}

TEST(IncompleteDocument, LeavesNoFileBehind) {
    const vrl_test::temporary_folder folder;
    folder.write("a.vrl", "an earlier document");
    EXPECT_EQ(Vrl().marshal(folder.path("a.vrl").c_str()), 46);
    EXPECT_TRUE(folder.is_empty());
}

TEST(IncompleteDocument, IsRefusedInTheMiddleWithItsFileGone) {
    Vrl document;
    complete(document);
    complete(document.get_Color(0));
    document.get_Color(0).append_ColorSpace();
    const vrl_test::temporary_folder folder;
    EXPECT_EQ(document.marshal(folder.path("a.vrl").c_str()), 46);
    EXPECT_TRUE(folder.is_empty());
}

TEST(WritingToAPath, NeedsAPlaceForTheFile) {
    Vrl document;
    complete(document);
    const vrl_test::temporary_folder folder;
    EXPECT_EQ(document.marshal(folder.path("nowhere/a.vrl").c_str()), 1);
    EXPECT_EQ(document.marshal(folder.path(".").c_str()), 1) << "a folder is no file";
    EXPECT_EQ(Vrl().marshal(folder.path("nowhere/a.vrl").c_str()), 1) << "before anything is looked at";
}

TEST(WritingToAPath, ReplacesWhatWasThere) {
    Vrl document;
    complete(document);
    const vrl_test::temporary_folder folder;
    folder.write("a.xml", std::string(100000, 'x'));
    EXPECT_EQ(document.marshal(folder.path("a.xml").c_str()), 0) << "whatever its extension";
    std::string text;
    document.marshal(&text);
    EXPECT_EQ(folder.bytes("a.xml"), text);
}

TEST(IncompleteElement, IsRefusedBeforeAnythingOfItIsWritten) {
    EXPECT_EQ(write_inner_element(ColorType(), "Vrl:Color").text, "");
    EXPECT_EQ(write_inner_element(ColorType(), "Vrl:Color").code, 46);
    EXPECT_EQ(write_inner_element(Density(), "Vrl:Density").text, "");
    EXPECT_EQ(write_inner_element(Density(), "Vrl:Density").code, 46);
}

TEST(IncompleteElement, StopsItsParentsBehindWhatIsOut) {
    PaletteType palette;
    palette.set_PaletteName(L"p");
    palette.append_ChangeHistory(vrl_test::time());
    palette.get_ColorSet(0).set_ColorSetName(L"s");
    const auto result = write_inner_element(palette, "Vrl:Palette");
    EXPECT_EQ(result.code, 46);
    EXPECT_EQ(result.text,
              "<Vrl:Palette PaletteName=\"p\">\n"
              "\t<Vrl:ChangeHistory>2024-01-02T03:04:05Z</Vrl:ChangeHistory>\n");
}

TEST(IncompleteElement, LeavesTheIndentationRaised) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "\t", "\n");
    EXPECT_EQ(Vrl().marshal(out, "Vrl:Vrl"), 46);
    EXPECT_EQ(os.str(), k_up_to_preamble);
    os.str("");
    out(true) << "x";
    EXPECT_EQ(os.str(), "\t\tx");
}

class counting_writer : public qbxV2::c_xml_writer {
public:
    explicit counting_writer(std::ostream& os) : c_xml_writer(os, "\t", "\n") {}
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error) override {
        ++asked;
        return qbxV2::EQBX_NO_ERROR;
    }
    int asked = 0;
};

TEST(IncompleteElement, IsNotForTheHandlerToForgive) {
    std::ostringstream os;
    counting_writer out(os);
    EXPECT_EQ(Vrl().marshal(out, "Vrl:Vrl"), 46);
    EXPECT_EQ(out.asked, 0);
    std::string message;
    EXPECT_EQ(out.get_error_message(&message), "No Error");
}

TEST(IncompleteElement, LacksAColorSpace) {
    ColorType color;
    color.set_ColorName(L"c");
    color.append_ChangeHistory(vrl_test::time());
    EXPECT_EQ(write_inner_element(color, "Vrl:Color").code, 46);
    EXPECT_EQ(write_inner_element(color, "Vrl:Color").text, "");
}

TEST(IncompleteElement, LacksAGroupsMember) {
    ToleranceType tolerance;
    EXPECT_EQ(write_inner_element(tolerance, "Vrl:Tolerance").code, 46);
    tolerance.get_Function();
    EXPECT_EQ(write_inner_element(tolerance, "Vrl:Tolerance").code, 46) << "present, but with no member";
    tolerance.get_Function().get_FunctionDE();
    EXPECT_EQ(write_inner_element(tolerance, "Vrl:Tolerance").code, 0);

    SampleTargetType sample;
    sample.set_Target(L"Target_Custom");
    EXPECT_EQ(write_inner_element(sample, "Vrl:SampleTarget").code, 46);
    sample.get_Substrate().get_SubstrateTile();
    EXPECT_EQ(write_inner_element(sample, "Vrl:SampleTarget").code, 0);

    PhysicalSampleType physical;
    EXPECT_EQ(write_inner_element(physical, "Vrl:PhysicalSample").code, 46);
    physical.get_Sample().assign_SampleTarget(sample);
    EXPECT_EQ(write_inner_element(physical, "Vrl:PhysicalSample").code, 0);

    ParentColorSpace parent;
    EXPECT_EQ(write_inner_element(parent, "Vrl:ParentColorSpace").code, 46);
    complete(parent.get_ColorSpace().get_ColorSpaceCMYK());
    EXPECT_EQ(write_inner_element(parent, "Vrl:ParentColorSpace").code, 0);
}

TEST(IncompleteElement, HasAnOptionalGroupThatIsPresentAndEmpty) {
    ColorType color;
    complete(color);
    color.get_Substrate();
    const auto result = write_inner_element(color, "Vrl:Color");
    EXPECT_EQ(result.code, 46);
    EXPECT_NE(result.text.find("</Vrl:ColorSpaceCMYK>\n"), std::string::npos);
    color.unset_Substrate();
    EXPECT_EQ(write_inner_element(color, "Vrl:Color").code, 0);
}

TEST(IncompleteElement, LacksARequiredChoice) {
    AxisType axis;
    axis.set_AxisName(L"a");
    EXPECT_EQ(write_inner_element(axis, "Vrl:Axis").code, 46);
    axis.get_AxisValueChoice();
    EXPECT_EQ(write_inner_element(axis, "Vrl:Axis").code, 46) << "present, but nothing chosen";
    axis.get_AxisValueChoice().set_AxisStringValue(L"v");
    EXPECT_EQ(write_inner_element(axis, "Vrl:Axis").code, 0);
}

// Intended: a missing filter is no error on reading, but it always is written.
TEST(IncompleteElement, WasReadWithoutADeviceFilter) {
    ColorSpaceSpecificationSpectrumGenericType specification;
    const std::string xml = vrl_test::element("X", vrl_test::polarization() + vrl_test::history() +
                                                       vrl_test::element("Spectrum", "Spectrum_Reflectance"));
    ASSERT_EQ(vrl_test::read_element(specification, xml).code, 0);
    EXPECT_TRUE(specification.is_occurs_ok());
    const auto refused = write_inner_element(specification, "Vrl:X");
    EXPECT_EQ(refused.code, 46);
    EXPECT_EQ(refused.text, "<Vrl:X>\n");
    specification.get_DeviceFilter().setnil_DeviceFilter();
    EXPECT_EQ(write_inner_element(specification, "Vrl:X").code, 0);
    specification.get_DeviceFilter().set_DeviceFilter(L"Filter_None");
    EXPECT_EQ(write_inner_element(specification, "Vrl:X").code, 0);
}

/// Whether a class offers presence accessors for a member.
template <class T>
concept has_filter_presence = requires(T t) {
    t.isset_DeviceFilter();
}
|| requires(T t) { t.unset_DeviceFilter(); };
template <class T>
concept has_black_presence = requires(T t) {
    t.isset_Black();
}
|| requires(T t) { t.unset_Black(); };

TEST(RequiredMember, HasNoAccessorsOfPresence) {
    EXPECT_FALSE(has_filter_presence<ColorSpaceSpecificationSpectrumGenericType>);
    EXPECT_FALSE(has_black_presence<ColorSpaceCMYKType>);
}

}  // namespace
