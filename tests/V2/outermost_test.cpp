#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/writing.h"

/// Which classes declare the namespaces when a writer starts with them, and which can be documents.
namespace {

using namespace vrl_v2;
using vrl_test::complete;

/// A class without the step: what a writer that starts with it puts out, up to the end of the first tag.
struct first_tag {
    const char* name;
    std::function<std::string()> written;
    std::string expected;
};
void PrintTo(const first_tag& c, std::ostream* os) { *os << c.name; }

template <class T>
first_tag start(const char* name, const std::function<void(T&)>& prepare, const std::string& expected) {
    const auto written = [prepare] {
        T object;
        prepare(object);
        const std::string text = vrl_test::write_element(object, "Vrl:X").text;
        return text.substr(0, text.find('>') + 1);
    };
    return {name, written, expected};
}

std::string case_name(const testing::TestParamInfo<first_tag>& c) { return c.param.name; }

#define START(type, statements, expected) \
    start<type>(                          \
        #type, [](type& o) { statements; }, expected)

class WithoutDeclarations : public testing::TestWithParam<first_tag> {};

TEST_P(WithoutDeclarations, HasNoneInItsTag) { EXPECT_EQ(GetParam().written(), GetParam().expected); }

INSTANTIATE_TEST_SUITE_P(
    Classes, WithoutDeclarations,
    testing::Values(
        START(Averaging, o.set_AveragingValue(2), "<Vrl:X AveragingValue=\"2\">"),
        START(AxisValueChoice, o.set_AxisStringValue(L"v"), "<Vrl:X>"),
        START(Base, (o.set_Name(L"n"), o.set_Manufacturer(L"m"), o.set_PartNumber(L"p")), "<Vrl:X>"),
        START(ColorAndFinish, (o.set_Finish(L"Finish_Matte"), o.get_ColorSpaceSpectral()), "<Vrl:X>"),
        START(ColorName, (o.set_PrefixName(L""), o.set_BaseName(L""), o.set_SuffixName(L"")), "<Vrl:X>"),
        START(Colorant, o.set_Name(L"n"), "<Vrl:X>"),
        START(ColorantElement, (o.get_Colorant().set_Name(L"n"), o.set_Contribution(1)), "<Vrl:X>"),
        START(ColorantElementType_Colorant,
              (o.set_Name(L"n"), o.set_Manufacturer(L"m"), o.set_PartNumber(L"p"),
               o.get_Density().set_Density(1)),
              "<Vrl:X>"),
        START(CustomAttributeType_ValueChoice, o.set_IntegerValue(1), "<Vrl:X>"),
        START(CustomAttributes, o.get_CustomAttribute(), "<Vrl:X>"),
        START(Density, o.set_Density(1), "<Vrl:X>"),
        START(DeviceFilter, o.set_DeviceFilter(L"Filter_None"), "<Vrl:X>"),
        START(DevicePolarization, o.set_DevicePolarization(true), "<Vrl:X>"),
        START(DeviceSettings, o.set_FleetTuner(true), "<Vrl:X>"),
        START(GlossCompensation, o.set_CompensationValue(1), "<Vrl:X CompensationValue=\"1\">"),
        START(Header, complete(o), "<Vrl:X>"),
        START(Illuminant, o.set_Illuminant(L"Illuminant_A"), "<Vrl:X>"),
        START(Parameters, (o.set_Name(L"n"), o.get_ValueChoice().set_Double(1)), "<Vrl:X>"),
        START(ParentColorSpace, complete(o.get_ColorSpace().get_ColorSpaceCMYK()), "<Vrl:X>"),
        START(Person, o.set_Name(L"n"), "<Vrl:X>"), START(Preamble, complete(o.get_Header()), "<Vrl:X>"),
        START(Process, o.set_Name(L"n"), "<Vrl:X>"), START(ProfileChoice, o.set_ProfileURI(L"u"), "<Vrl:X>"),
        START(ProfileFile, o.set_ProfileFile(qbxV2::c_binary()), "<Vrl:X>"),
        START(ProfileType_Parameters, (o.set_Name(L"n"), o.get_ValueChoice().set_DoubleValue(1)), "<Vrl:X>"),
        START(ProfileType_Parameters_ValueChoice, o.set_DoubleValue(1), "<Vrl:X>"),
        START(Recipe, o.append_ColorantElement(), "<Vrl:X>"),
        START(Revision, o.append_any("<a/>"), "<Vrl:X>"),
        START(SDKVersion, o.set_SDKVersion(L"1"), "<Vrl:X>"),
        START(Specification, (o.set_SampleWidth(1), o.set_SampleHeight(1)), "<Vrl:X>"),
        START(ValueChoice, o.set_Double(1), "<Vrl:X>"), START(Version, o.set_Version(L"v"), "<Vrl:X>"),
        START(WhitePointChromaticity, (o.set_CoordinateX(0.3), o.set_CoordinateY(0.3)), "<Vrl:X>"),
        // A group has no tag of its own: what it holds is a named type, which declares.
        START(sg_ColorSpace, complete(o.get_ColorSpaceCMYK()),
              "<Vrl:ColorSpaceCMYK" + vrl_test::k_namespaces + ">"),
        START(sg_Function, o.get_FunctionDE(), "<Vrl:FunctionDE" + vrl_test::k_namespaces + ">"),
        START(sg_Sample,
              (o.get_SampleTarget().set_Target(L"Target_Custom"),
               o.get_SampleTarget().get_Substrate().get_SubstrateTile()),
              "<Vrl:SampleTarget" + vrl_test::k_namespaces + ">"),
        START(sg_Substrate, o.get_SubstrateTile(), "<Vrl:SubstrateTile" + vrl_test::k_namespaces + ">")),
    case_name);

class WithDeclarations : public testing::TestWithParam<first_tag> {};

TEST_P(WithDeclarations, HasThemBehindItsName) {
    EXPECT_EQ(GetParam().written(), "<Vrl:X" + vrl_test::k_namespaces + GetParam().expected);
}

INSTANTIATE_TEST_SUITE_P(
    Classes, WithDeclarations,
    testing::Values(START(Vrl, complete(o), ">"), START(ColorType, complete(o), " ColorName=\"c\">"),
                    START(OwnerType, o.clear_Person(), ">"), START(CustomAttributeType, complete(o), ">"),
                    START(DeviceFilterType, o.set_DeviceFilterType(L"Filter_None"), ">"),
                    START(SpectrumType, o.set_SpectrumType(L"Spectrum_Custom"), ">"),
                    START(GeometryChoiceType, o.set_Angle(45), ">"),
                    START(IlluminationOptionsType, o.set_ColorTemperature(1), ">"),
                    START(Standard, complete(o), ">"),
                    START(Measurement, (complete(o.get_Device()), complete(o.get_Color())), ">"),
                    START(ColorSpaceCMYK, complete(o), ">"), START(ColorSpaceCMYKType, complete(o), ">"),
                    START(SubstrateTile, o.unset_TileType(), ">"),
                    START(CollectionColorSpaceSpecification, o.reset(), ">"),
                    START(Function, o.unset_Result(), ">"),
                    START(SDKType, (o.set_SDKName(L"n"), o.get_SDKVersion()), ">"),
                    START(ColorSpaceSpecificationSpectrumGeneric, complete(o), ">")),
    case_name);

TEST(NamedTypeInside, DeclaresWhereNothingBeforeItDid) {
    Header header;
    complete(header);
    complete(header.get_CustomAttribute(0));
    complete(header.get_CustomAttribute(1));
    const std::string text = vrl_test::write_element(header, "Vrl:Header").text;
    const std::string start = "<Vrl:Header>\n\t<Vrl:CustomAttribute" + vrl_test::k_namespaces + ">\n";
    EXPECT_EQ(text.substr(0, start.size()), start);
    EXPECT_EQ(text.find("xmlns", start.size()), std::string::npos) << "once a writer";
}

template <class T>
concept is_a_document = requires(T t, std::ostream& os, std::string* text, const char* path,
                                 qbxV2::c_xml_reader& reader, qbxV2::eqbx_error* error) {
    t.marshal(os);
    t.marshal(text);
    t.marshal(path);
    t.unmarshal(reader);
    t.unmarshal(*text);
    t.unmarshal(path, 1u);
    t.unmarshal(path);
    T(*text, error);
    T(path, 1u, error);
    T(path, error);
};
template <class T>
concept has_any_of_a_document = requires(T t, std::string* text) {
    t.marshal(text);
}
|| requires(T t, std::string* text) { t.unmarshal(*text); };

TEST(ElementClass, CanBeADocumentUnlessItIsOneOfFourHeads) {
    EXPECT_TRUE(is_a_document<Vrl>);
    EXPECT_TRUE(is_a_document<Standard>);
    EXPECT_TRUE(is_a_document<Measurement>);
    EXPECT_TRUE(is_a_document<ColorSpaceCMYK>);
    EXPECT_TRUE(is_a_document<SubstratePaper>);
    EXPECT_TRUE(is_a_document<SampleSpot>);
    EXPECT_TRUE(is_a_document<Function>) << "a head, and offers them";
    EXPECT_TRUE(is_a_document<FunctionDECMC>);
    EXPECT_TRUE(is_a_document<CollectionColorSpaceSpecification>);
    EXPECT_TRUE(is_a_document<ColorSpaceSpecificationSpectrum>);
    EXPECT_TRUE(is_a_document<ColorSpaceSpecificationEmissive>);
    EXPECT_TRUE(is_a_document<ColorSpaceSpecificationEmissiveTristimulus>);
    EXPECT_FALSE(has_any_of_a_document<ColorSpace>);
    EXPECT_FALSE(has_any_of_a_document<Substrate>);
    EXPECT_FALSE(has_any_of_a_document<Sample>);
    EXPECT_FALSE(has_any_of_a_document<ColorSpaceSpecification>);
}

TEST(TypeClass, IsNoDocument) {
    EXPECT_FALSE(has_any_of_a_document<ColorType>);
    EXPECT_FALSE(has_any_of_a_document<ColorSpaceCMYKType>);
    EXPECT_FALSE(has_any_of_a_document<Preamble>);
    EXPECT_FALSE(has_any_of_a_document<DeviceFilter>) << "nillable, but local";
    EXPECT_FALSE(has_any_of_a_document<SDKVersion>);
}

}  // namespace
