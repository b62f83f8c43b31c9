#include <gtest/gtest.h>

#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::forgive;
using vrl_test::read_element;
using vrl_test::write_element;
using vrl_test::write_inner_element;

const std::string k_nil = " xsi:nil=\"true\"";

/// What all twelve nillable classes do alike.
template <class T>
class Nillable : public testing::Test {};

#define NILLABLE(type)                                                   \
    struct of_##type {                                                   \
        using object = type;                                             \
        static constexpr const char* name = #type;                       \
        static void set_nil(object& t) { t.setnil_##type(); }            \
        static bool is_nil(const object& t) { return t.isnil_##type(); } \
    }

NILLABLE(Density);
NILLABLE(DeviceFilter);
NILLABLE(DevicePolarization);
NILLABLE(SDKVersion);
NILLABLE(Standard);
NILLABLE(ParentColorSpace);
NILLABLE(ColorSpaceSpecificationSpectrumGeneric);
NILLABLE(ColorSpaceSpecificationSpectrumSpectral);
NILLABLE(ColorSpaceSpecificationSpectrumTristimulus);
NILLABLE(ColorSpaceSpecificationEmissiveGeneric);
NILLABLE(ColorSpaceSpecificationEmissiveSpectral);
NILLABLE(ColorSpaceSpecificationEmissiveTristimulus);

using all_nillable =
    testing::Types<of_Density, of_DeviceFilter, of_DevicePolarization, of_SDKVersion, of_Standard,
                   of_ParentColorSpace, of_ColorSpaceSpecificationSpectrumGeneric,
                   of_ColorSpaceSpecificationSpectrumSpectral, of_ColorSpaceSpecificationSpectrumTristimulus,
                   of_ColorSpaceSpecificationEmissiveGeneric, of_ColorSpaceSpecificationEmissiveSpectral,
                   of_ColorSpaceSpecificationEmissiveTristimulus>;

class nillable_name {
public:
    template <class T>
    static std::string GetName(int) {
        return T::name;
    }
};

TYPED_TEST_SUITE(Nillable, all_nillable, nillable_name);

TYPED_TEST(Nillable, NeedsNothingElseToBeWritten) {
    typename TypeParam::object object;
    EXPECT_FALSE(TypeParam::is_nil(object));
    EXPECT_FALSE(object.is_occurs_ok());
    TypeParam::set_nil(object);
    EXPECT_TRUE(TypeParam::is_nil(object));
    EXPECT_TRUE(object.is_occurs_ok());
    const auto result = write_inner_element(object, "Vrl:X");
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.text, "<Vrl:X xsi:nil=\"true\"/>\n");
}

TYPED_TEST(Nillable, IsReadInTheFormInWhichItIsWritten) {
    for (const std::string& xml : {empty_element("X", k_nil), element("X", "", k_nil)}) {
        typename TypeParam::object object;
        const auto result = read_element(object, xml);
        EXPECT_EQ(result.code, 0) << xml;
        EXPECT_TRUE(result.reports.empty()) << xml;
        EXPECT_TRUE(TypeParam::is_nil(object)) << xml;
    }
}

TYPED_TEST(Nillable, WithContentIsABadEnd) {
    for (const std::string& content : {std::string("1"), std::string("Filter_None"), vrl_test::device()}) {
        typename TypeParam::object object;
        EXPECT_EQ(read_element(object, element("X", content, k_nil)).code, 10) << content;
        EXPECT_TRUE(TypeParam::is_nil(object));
    }
}

TYPED_TEST(Nillable, TakesTwoWordsForTrueAndEverythingElseForFalse) {
    for (const auto& [text, nil] : {std::pair{"true", true},
                                    {"1", true},
                                    {" true ", true},
                                    {"\t1\n", true},
                                    {"false", false},
                                    {"0", false},
                                    {"", false},
                                    {"TRUE", false},
                                    {"yes", false}}) {
        typename TypeParam::object object;
        const std::string attribute = std::string(" xsi:nil=\"") + text + "\"";
        read_element(object, empty_element("X", attribute), forgive);
        EXPECT_EQ(TypeParam::is_nil(object), nil) << text;
    }
}

TYPED_TEST(Nillable, TakesTheLastOfTwoFlagsWithoutAReport) {
    typename TypeParam::object object;
    const auto result = read_element(object, empty_element("X", " xsi:nil=\"false\" xsi:nil=\"true\""));
    EXPECT_EQ(result.code, 0);
    EXPECT_TRUE(TypeParam::is_nil(object));
}

TYPED_TEST(Nillable, ReportsAFlagThatCannotBeRead) {
    typename TypeParam::object object;
    const std::string xml = empty_element("X", " xsi:nil=\"&nothing;\"");
    EXPECT_EQ(read_element(object, xml).code, 28);
    read_element(object, xml, forgive);
    EXPECT_FALSE(TypeParam::is_nil(object));
}

TYPED_TEST(Nillable, KeepsAFlagThatReadingDoesNotMention) {
    typename TypeParam::object object;
    TypeParam::set_nil(object);
    EXPECT_EQ(read_element(object, empty_element("X")).code, 0) << "reading does not reset the object";
    EXPECT_TRUE(TypeParam::is_nil(object));
    read_element(object, empty_element("X", " xsi:nil=\"false\""), forgive);
    EXPECT_FALSE(TypeParam::is_nil(object));
}

TEST(EmptyNillable, ThatIsNotNilIsReadAsItsContentDemands) {
    const auto code = [](auto object, const std::string& xml) { return read_element(object, xml).code; };
    for (const std::string& xml : {empty_element("X"), element("X", "")}) {
        EXPECT_EQ(code(Density(), xml), 35) << xml;
        EXPECT_EQ(code(DevicePolarization(), xml), 35) << xml;
        EXPECT_EQ(code(DeviceFilter(), xml), 38) << xml;
        EXPECT_EQ(code(SDKVersion(), xml), 0) << xml;
        EXPECT_EQ(code(Standard(), xml), 32) << xml;
        EXPECT_EQ(code(ParentColorSpace(), xml), 0) << xml;
        EXPECT_EQ(code(ColorSpaceSpecificationSpectrumGeneric(), xml), 32) << xml;
        EXPECT_EQ(code(ColorSpaceSpecificationEmissiveTristimulus(), xml), 32) << xml;
    }
}

TEST(NilledElement, KeepsItsAttributesInFrontOfTheFlag) {
    DeviceFilter filter;
    filter.set_CustomOrPartial(L"c");
    filter.setnil_DeviceFilter();
    EXPECT_EQ(write_inner_element(filter, "Vrl:DeviceFilter").text,
              "<Vrl:DeviceFilter CustomOrPartial=\"c\" xsi:nil=\"true\"/>\n");
    DeviceFilter read;
    EXPECT_EQ(
        read_element(read, empty_element("DeviceFilter", " CustomOrPartial=\"c\" xsi:nil=\"true\"")).code, 0);
    EXPECT_EQ(read.get_CustomOrPartial(), L"c");
    EXPECT_TRUE(read.isnil_DeviceFilter());

    ColorSpaceSpecificationSpectrumGeneric specification;
    specification.set_Comments(L"c");
    specification.set_UniqueID(L"u");
    specification.setnil_ColorSpaceSpecificationSpectrumGeneric();
    EXPECT_EQ(write_element(specification, "Vrl:X").text,
              "<Vrl:X" + vrl_test::k_namespaces + " Comments=\"c\" UniqueID=\"u\" xsi:nil=\"true\"/>\n");
}

TEST(NilledElement, DeclaresTheNamespacesWhereItStandsOutermost) {
    Standard standard;
    standard.setnil_Standard();
    std::string text;
    EXPECT_EQ(standard.marshal(&text), 0);
    EXPECT_EQ(text,
              vrl_test::k_declaration + "<Vrl:Standard" + vrl_test::k_namespaces + " xsi:nil=\"true\"/>\n");
    Standard read;
    EXPECT_EQ(read.unmarshal(text), 0);
    EXPECT_TRUE(read.isnil_Standard());
}

TEST(NilledElement, IsWrittenWithoutWhatItHolds) {
    Standard standard;
    complete(standard);
    standard.setnil_Standard();
    EXPECT_EQ(write_inner_element(standard, "Vrl:Standard").text, "<Vrl:Standard xsi:nil=\"true\"/>\n");
    EXPECT_EQ(standard.get_Color().get_ColorName(), L"c") << "setting nil sets nothing else";
    Density density;
    density.set_Density(1.5);
    density.setnil_Density();
    EXPECT_EQ(write_inner_element(density, "Vrl:Density").text, "<Vrl:Density xsi:nil=\"true\"/>\n");
    EXPECT_EQ(density.get_Density(), 1.5);
}

TEST(NilledElement, IsNilNoMoreOnceAValueIsSet) {
    Density density;
    density.setnil_Density();
    EXPECT_EQ(density.set_Density(0.0), 37);
    EXPECT_TRUE(density.isnil_Density()) << "a refused value changes nothing";
    EXPECT_EQ(density.set_Density(1.5), 0);
    EXPECT_FALSE(density.isnil_Density());

    DeviceFilter filter;
    filter.setnil_DeviceFilter();
    EXPECT_EQ(filter.set_DeviceFilter(L"nonsense"), 38);
    EXPECT_TRUE(filter.isnil_DeviceFilter());
    EXPECT_EQ(filter.set_DeviceFilter(L"Filter_None"), 0);
    EXPECT_FALSE(filter.isnil_DeviceFilter());
    EXPECT_EQ(filter.get_DeviceFilter(), L"Filter_None");

    DevicePolarization polarization;
    polarization.setnil_DevicePolarization();
    EXPECT_EQ(polarization.set_DevicePolarization(true), 0);
    EXPECT_FALSE(polarization.isnil_DevicePolarization());

    SDKVersion version;
    version.setnil_SDKVersion();
    EXPECT_EQ(version.set_SDKVersion(L"2"), 0);
    EXPECT_FALSE(version.isnil_SDKVersion());
}

TEST(NilledElement, IsRefusedWithTextThatItsTypeWouldTake) {
    Density density;
    const auto result = read_element(density, element("Density", "1.5", " xsi:nil=\"1\""), vrl_test::refuse);
    EXPECT_EQ(result.code, 10);
    EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Density"});
    EXPECT_EQ(density.get_Density(), 0.0) << "the text was not looked at";
}

TEST(NilledElement, StandsInsideADocument) {
    Vrl document;
    const std::string space =
        element("ColorSpaceCMYK", empty_element("ParentColorSpace", k_nil) + vrl_test::history() +
                                      empty_element("ColorSpaceSpecificationSpectrumGeneric", k_nil) +
                                      vrl_test::inks());
    const std::string xml =
        vrl_test::document(element("Color", vrl_test::history() + space, " ColorName=\"c\""));
    EXPECT_EQ(document.unmarshal(xml), 0);
    const ColorSpaceCMYKType& read = document.get_Color(0).get_ColorSpace(0).get_ColorSpaceCMYK();
    EXPECT_TRUE(read.isset_ParentColorSpace());
    EXPECT_TRUE(read.get_ParentColorSpace().isnil_ParentColorSpace());
    EXPECT_TRUE(
        read.get_ColorSpaceSpecificationSpectrumGeneric().isnil_ColorSpaceSpecificationSpectrumGeneric());
    EXPECT_EQ(read.get_Black(), 40.0);
    std::string text;
    ASSERT_EQ(document.marshal(&text), 0);
    Vrl again;
    EXPECT_EQ(again.unmarshal(text), 0);
    std::string second;
    EXPECT_EQ(again.marshal(&second), 0);
    EXPECT_EQ(second, text);
}

TEST(NilFlag, IsPassedOverWhereTheClassHasNone) {
    OwnerType owner;
    EXPECT_EQ(read_element(owner, element("Owner", element("Company", "c"), k_nil)).code, 0);
    EXPECT_EQ(owner.size_Company(), 1u);
    SpectrumType spectrum;
    EXPECT_EQ(read_element(spectrum, element("Spectrum", "Spectrum_Custom", k_nil)).code, 0);
    EXPECT_EQ(spectrum.get_SpectrumType(), L"Spectrum_Custom");
    DeviceFilterType filter;
    EXPECT_EQ(read_element(filter, empty_element("DeviceFilter", k_nil)).code, 38)
        << "the type is not nillable";
    CollectionColorSpaceSpecificationType collection;
    EXPECT_EQ(
        read_element(collection, element("CollectionColorSpaceSpecification",
                                         empty_element("ColorSpaceSpecificationSpectrumGeneric", k_nil)))
            .code,
        32)
        << "a collection holds types, not nillable elements";
}

}  // namespace
