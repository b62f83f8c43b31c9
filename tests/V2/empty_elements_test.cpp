#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// Which classes accept an element without content: the self-closed form and the two forms with an end tag.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::empty_element;

struct empty_case {
    const char* name;
    std::function<vrl_test::outcome(const std::string& xml, const vrl_test::answer& reply)> read;
    const char* attributes;
    int code;
};
void PrintTo(const empty_case& c, std::ostream* os) { *os << c.name; }

template <class T>
empty_case row(const char* name, int code, const char* attributes = "") {
    return {name,
            [](const std::string& xml, const vrl_test::answer& reply) {
                T object;
                return vrl_test::read_element(object, xml, reply);
            },
            attributes, code};
}
#define ACCEPTS(type) row<type>(#type, 0)
#define REFUSES(type) row<type>(#type, 32)
#define REFUSES_WITH(type, attributes) row<type>(#type, 32, attributes)

class Empty : public testing::TestWithParam<empty_case> {};

TEST_P(Empty, ElementGivesTheSameCodeInAllItsForms) {
    const empty_case& c = GetParam();
    for (const std::string& xml :
         {empty_element("X", c.attributes), element("X", "", c.attributes),
          element("X", " \n ", c.attributes), element("X", "<!-- c --><?pi?>", c.attributes)}) {
        const auto result = c.read(xml, vrl_test::refuse);
        EXPECT_EQ(result.code, c.code) << xml;
        const std::vector<std::string> items(c.code == 0 ? 0 : 1, "Vrl:X");
        EXPECT_EQ(result.items(), items) << xml;
    }
}

TEST_P(Empty, ElementIsReportedOnceWhereTheHandlerForgives) {
    const empty_case& c = GetParam();
    for (const std::string& xml : {empty_element("X", c.attributes), element("X", "", c.attributes)}) {
        const auto result = c.read(xml, vrl_test::forgive);
        EXPECT_EQ(result.code, 0) << xml;
        EXPECT_EQ(result.reports.size(), c.code == 0 ? 0u : 1u) << "its body is not looked at: " << xml;
    }
}

std::string case_name(const testing::TestParamInfo<empty_case>& c) { return c.param.name; }

INSTANTIATE_TEST_SUITE_P(Accepted, Empty,
                         testing::Values(ACCEPTS(CollectionColorSpaceSpecificationType),
                                         ACCEPTS(CollectionColorSpaceSpecification), ACCEPTS(ColorAndFinish),
                                         ACCEPTS(CustomAttributes), ACCEPTS(DeviceSettings),
                                         ACCEPTS(OwnerType), ACCEPTS(Parameters), ACCEPTS(ParentColorSpace),
                                         ACCEPTS(Person), ACCEPTS(Process), ACCEPTS(ProfileType_Parameters),
                                         ACCEPTS(Recipe), ACCEPTS(Revision), ACCEPTS(Version)),
                         case_name);

INSTANTIATE_TEST_SUITE_P(
    AcceptedFunctions, Empty,
    testing::Values(ACCEPTS(FunctionType), ACCEPTS(FunctionDEType), ACCEPTS(FunctionMeanDEType),
                    ACCEPTS(FunctionStdDevXType), ACCEPTS(FunctionStdDevYType), ACCEPTS(FunctionStdDevZType),
                    ACCEPTS(FunctionStdDevLType), ACCEPTS(FunctionStdDevAType), ACCEPTS(FunctionStdDevBType),
                    ACCEPTS(FunctionStdDevCType), ACCEPTS(FunctionStdDevHType),
                    ACCEPTS(FunctionAverageStdDevLType), ACCEPTS(FunctionAverageStdDevAType),
                    ACCEPTS(FunctionAverageStdDevBType), ACCEPTS(Function), ACCEPTS(FunctionDE)),
    case_name);

INSTANTIATE_TEST_SUITE_P(AcceptedSubstrates, Empty,
                         testing::Values(ACCEPTS(SubstrateType), ACCEPTS(SubstratePaperType),
                                         ACCEPTS(SubstrateMetalType), ACCEPTS(SubstratePlasticType),
                                         ACCEPTS(SubstrateWoodType), ACCEPTS(SubstrateVinylType),
                                         ACCEPTS(SubstrateTileType), ACCEPTS(SubstrateFilmType),
                                         ACCEPTS(SubstrateTextileType), ACCEPTS(Substrate),
                                         ACCEPTS(SubstrateFilm)),
                         case_name);

INSTANTIATE_TEST_SUITE_P(
    Refused, Empty,
    testing::Values(
        REFUSES(AxisType), REFUSES(AxisValueChoice), REFUSES(Base), REFUSES(BaseElementType),
        REFUSES(ColorName), REFUSES_WITH(ColorSetType, " ColorSetName=\"n\""),
        REFUSES_WITH(ColorType, " ColorName=\"n\""), REFUSES(Colorant), REFUSES(ColorantElement),
        REFUSES(ColorantElementType), REFUSES(ColorantElementType_Colorant), REFUSES(ColorQualityControlType),
        REFUSES(CustomAttributeType), REFUSES(CustomAttributeType_ValueChoice), REFUSES(DeviceType),
        REFUSES(GeometryChoiceType), REFUSES(Header), REFUSES(IlluminationOptionsType), REFUSES(LimitsType),
        REFUSES(Measurement), REFUSES_WITH(PaletteType, " PaletteName=\"n\""), REFUSES(PhysicalSampleType),
        REFUSES(PlatformType), REFUSES(Preamble), REFUSES(ProfileChoice),
        REFUSES_WITH(ProfileType, " Direction=\"Profile_Both\""), REFUSES(ProfileType_Parameters_ValueChoice),
        REFUSES(SDKType), REFUSES(Specification), REFUSES(SpotColorType), REFUSES(Standard),
        REFUSES(StandardAndMeasurementType), REFUSES(ToleranceType), REFUSES(ValueChoice), REFUSES(Vrl),
        REFUSES(WhitePointChromaticity)),
    case_name);

INSTANTIATE_TEST_SUITE_P(RefusedDerived, Empty,
                         testing::Values(REFUSES(FunctionGenericType), REFUSES(FunctionDE94Type),
                                         REFUSES(FunctionDE2000Type), REFUSES(FunctionDEcmcType),
                                         REFUSES(FunctionDECMC), REFUSES(SubstrateGenericType),
                                         REFUSES(SubstrateGeneric), REFUSES(SampleType),
                                         REFUSES(SampleSpotType), REFUSES(SampleTargetType),
                                         REFUSES(SampleTarget)),
                         case_name);

INSTANTIATE_TEST_SUITE_P(
    RefusedColorSpaces, Empty,
    testing::Values(
        REFUSES(ColorSpaceType), REFUSES(ColorSpace), REFUSES(ColorSpaceRecipeType),
        REFUSES(ColorSpaceTINTARAType), REFUSES_WITH(ColorSpaceGenericType, " Name=\"n\""),
        REFUSES_WITH(ColorSpaceEmissiveGenericType, " Name=\"n\""), REFUSES(ColorSpaceDensityType),
        REFUSES(ColorSpaceRGBType), REFUSES(ColorSpaceSRGBType), REFUSES(ColorSpaceAdobeRGBType),
        REFUSES(ColorSpaceAdobeWideGamutRGBType), REFUSES(ColorSpaceSpectralType),
        REFUSES(ColorSpaceEmissiveSpectralType), REFUSES(ColorSpaceCIELabType), REFUSES(ColorSpaceCIELChType),
        REFUSES(ColorSpaceCIEXYZType), REFUSES(ColorSpaceEmissiveCIEXYZType), REFUSES(ColorSpaceCIExyYType),
        REFUSES(ColorSpaceEmissiveCIExyYType), REFUSES(ColorSpaceCIELuvType), REFUSES(ColorSpaceHSLType),
        REFUSES(ColorSpaceHSVType), REFUSES(ColorSpaceCMYKType), REFUSES(ColorSpaceCMYK),
        REFUSES(ColorSpaceTINTARAQuadraviveType), REFUSES(ColorSpaceYUVType), REFUSES(ColorSpaceYIQType),
        REFUSES(ColorSpaceYBRType), REFUSES(ColorSpaceNCSType), REFUSES(ColorSpaceMunsellType)),
    case_name);

INSTANTIATE_TEST_SUITE_P(
    RefusedSpecifications, Empty,
    testing::Values(
        REFUSES(ColorSpaceSpecificationType), REFUSES(ColorSpaceSpecification),
        REFUSES(ColorSpaceSpecificationSpectrumType), REFUSES(ColorSpaceSpecificationSpectrum),
        REFUSES(ColorSpaceSpecificationEmissiveType), REFUSES(ColorSpaceSpecificationEmissive),
        REFUSES(ColorSpaceSpecificationSpectrumGenericType), REFUSES(ColorSpaceSpecificationSpectrumGeneric),
        REFUSES(ColorSpaceSpecificationSpectrumSpectral), REFUSES(ColorSpaceSpecificationSpectrumTristimulus),
        REFUSES(ColorSpaceSpecificationEmissiveGeneric), REFUSES(ColorSpaceSpecificationEmissiveSpectral),
        REFUSES(ColorSpaceSpecificationEmissiveTristimulus)),
    case_name);

TEST(EmptyElement, HasNoneOfItsRequiredChildrenMissed) {
    Person person;
    EXPECT_EQ(vrl_test::read_element(person, empty_element("Person")).code, 0);
    EXPECT_FALSE(person.is_occurs_ok()) << "the test is made on writing";
    EXPECT_EQ(vrl_test::read_element(person, element("Person", element("ContactInfo", "c"))).code, 21);
}

TEST(EmptyElement, StandsInADocument) {
    Vrl document;
    EXPECT_EQ(document.unmarshal(vrl_test::outermost("Vrl", vrl_test::preamble(empty_element("Owner")))), 0);
    EXPECT_TRUE(document.get_Preamble().isset_Owner());
    EXPECT_EQ(document.unmarshal(vrl_test::outermost("Vrl", empty_element("Preamble"))), 32);
    EXPECT_EQ(document.unmarshal(vrl_test::outermost("Vrl", element("Preamble", ""))), 32);
    EXPECT_EQ(document.unmarshal(vrl_test::outermost("Vrl", "")), 32);
}

}  // namespace
