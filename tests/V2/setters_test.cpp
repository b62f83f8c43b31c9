#include <gtest/gtest.h>

#include <functional>
#include <limits>
#include <ostream>

#include "tests/V2/documents.h"

namespace {

using namespace vrl_v2;

constexpr double k_nan = std::numeric_limits<double>::quiet_NaN();
constexpr double k_infinity = std::numeric_limits<double>::infinity();

/// A call of a setter and the code that it has to give.
struct setting {
    const char* what;
    std::function<int()> call;
    int code;
};
void PrintTo(const setting& s, std::ostream* os) { *os << s.what; }

template <class T>
T& fresh() {
    static T object;
    object.reset();
    return object;
}

class Setter : public testing::TestWithParam<setting> {};

TEST_P(Setter, AnswersWithTheFacetThatRefuses) { EXPECT_EQ(GetParam().call(), GetParam().code); }

#define SET(type, member, value, code)                                                                \
    setting {                                                                                         \
#type "::set_" #member "(" #value ")", [] { return fresh<type>().set_##member(value); }, code \
    }

INSTANTIATE_TEST_SUITE_P(
    Percentages, Setter,
    testing::Values(SET(ColorSpaceCMYKType, Black, 0.0, 0), SET(ColorSpaceCMYKType, Black, -0.0, 0),
                    SET(ColorSpaceCMYKType, Black, 100.0, 0), SET(ColorSpaceCMYKType, Black, 100.0000001, 36),
                    SET(ColorSpaceCMYKType, Black, -1.0, 37), SET(ColorSpaceCMYKType, Black, k_nan, 37),
                    SET(ColorSpaceCMYKType, Black, k_infinity, 36),
                    SET(ColorSpaceCMYKType, Black, -k_infinity, 37)));

INSTANTIATE_TEST_SUITE_P(
    OpenEnds, Setter,
    testing::Values(
        SET(ColorSpaceCIELChType, H, 0.0, 0), SET(ColorSpaceCIELChType, H, 359.999, 0),
        SET(ColorSpaceCIELChType, H, 360.0, 36), SET(ColorSpaceHSLType, Hue, 0.0, 0),
        SET(ColorSpaceHSLType, Hue, 360.0, 36), SET(ColorSpaceHSVType, Hue, 0.0, 0),
        SET(ColorSpaceHSVType, Hue, 360.0, 36), SET(ReflectancePointType, ReflectancePointType, -1.0, 37),
        SET(ReflectancePointType, ReflectancePointType, 10.0, 36),
        SET(ReflectancePointType, ReflectancePointType, -0.999, 0),
        SET(ReflectancePointType, ReflectancePointType, 9.999, 0),
        SET(ReflectancePointType, ReflectancePointType, k_nan, 37),
        SET(ReflectancePointType, Wavelength, 0.0, 37), SET(ReflectancePointType, Wavelength, 1e-300, 0),
        SET(EmissiveSpectralPointType, Wavelength, 0.0, 37), SET(Density, Density, 0.0, 37),
        SET(Density, Density, k_nan, 37), SET(Base, Density, 0.0, 37), SET(Colorant, Density, 0.0, 37)));

// Intended: the range of L differs between the spaces.
INSTANTIATE_TEST_SUITE_P(
    LightnessDiffersBetweenSpaces, Setter,
    testing::Values(SET(ColorSpaceCIELabType, L, 150.0, 0), SET(ColorSpaceCIELabType, L, 150.5, 36),
                    SET(ColorSpaceCIELChType, L, 100.0, 0), SET(ColorSpaceCIELChType, L, 100.5, 36),
                    SET(ColorSpaceCIELuvType, L, 100.0, 0), SET(ColorSpaceCIELuvType, L, 100.5, 36)));

INSTANTIATE_TEST_SUITE_P(
    NoUpperBound, Setter,
    testing::Values(SET(FunctionDE94Type, Param_l, -0.1, 37), SET(FunctionDE94Type, Param_l, 1e300, 0),
                    SET(FunctionDE94Type, Param_l, k_infinity, 0), SET(FunctionDE94Type, Param_l, k_nan, 37),
                    SET(ColorantElement, Contribution, 1e9, 0), SET(ColorantElement, Contribution, -0.1, 37),
                    SET(ColorantElementType, Contribution, 1.0, 0),
                    SET(ColorantElementType, Contribution, 1.0001, 36),
                    SET(BaseElementType, Contribution, 1e9, 0)));

INSTANTIATE_TEST_SUITE_P(NoFacet, Setter,
                         testing::Values(SET(FunctionType, Result, k_nan, 0),
                                         SET(FunctionType, Result, -k_infinity, 0),
                                         SET(SubstratePaperType, PaperThickness, -5.0, 0),
                                         SET(DensityType, DensityType, -5.0, 0),
                                         SET(EmissiveSpectralPointType, EmissiveSpectralPointType, -5.0, 0),
                                         SET(LimitsType, HighTolerance, k_nan, 0)));

INSTANTIATE_TEST_SUITE_P(
    WholeNumbers, Setter,
    testing::Values(SET(Averaging, AveragingValue, 1, 37), SET(Averaging, AveragingValue, 2, 0),
                    SET(Averaging, AveragingValue, 99, 0), SET(Averaging, AveragingValue, 100, 36),
                    SET(DeviceSettings, Aperture, 0u, 0), SET(DeviceSettings, Aperture, 2147483647u, 0),
                    SET(DeviceSettings, Aperture, 2147483648u, 36),
                    SET(DeviceSettings, Aperture, 4294967295u, 36),
                    SET(DeviceSettings, LensPosition, std::numeric_limits<int>::min(), 0),
                    SET(DeviceSettings, LensPosition, std::numeric_limits<int>::max(), 0),
                    SET(CustomAttributeType_ValueChoice, IntegerValue, std::numeric_limits<int>::min(), 0),
                    SET(CustomAttributeType_ValueChoice, IntegerValue, std::numeric_limits<int>::max(), 0),
                    SET(IlluminationOptionsType, ColorTemperature, 2147483647u, 0),
                    SET(IlluminationOptionsType, ColorTemperature, 2147483648u, 36)));

INSTANTIATE_TEST_SUITE_P(
    Lengths, Setter,
    testing::Values(
        SET(ProfileType_Parameters, Name, L"", 20), SET(ProfileType_Parameters, Name, L"a", 0),
        SET(ProfileType_Parameters, Name, L"ab", 19), SET(CustomAttributeType, Name, L"", 20),
        SET(CustomAttributeType, Name, L"k", 0), SET(SpotColorType, Name, L"", 20),
        SET(ColorSpaceMunsellType, ColorName, L"", 20), SET(ColorSpaceMunsellType, CollectionName, L"", 20),
        SET(ColorSpaceNCSType, ColorName, L"", 0), SET(SubstrateGenericType, Type, L"", 20),
        SET(Process, Name, L"", 20), SET(FunctionGenericType, Name, L"", 20),
        SET(Colorant, Manufacturer, L"", 20), SET(ColorantElementType_Colorant, PartNumber, L"", 20),
        SET(Base, Name, L"", 20), SET(ColorName, PrefixName, L"", 0), SET(ColorName, BaseName, L"", 0),
        SET(ColorName, SuffixName, L"", 0), SET(Person, Name, L"", 0), SET(Parameters, Name, L"", 0)));

INSTANTIATE_TEST_SUITE_P(Literals, Setter,
                         testing::Values(SET(ColorAndFinish, Finish, L"Finish_Coated", 0),
                                         SET(ColorAndFinish, Finish, L"Finish_Uncoated", 0),
                                         SET(ColorAndFinish, Finish, L"Finish_Matte", 0),
                                         SET(ColorAndFinish, Finish, L"Finish_Gloss", 38),
                                         SET(ColorAndFinish, Finish, L"finish_matte", 38),
                                         SET(ColorAndFinish, Finish, L"", 38),
                                         SET(ColorAndFinish, Finish, L"Finish_Matte ", 38),
                                         SET(SampleTargetType, Target, L"Target_IT8.7/4", 0),
                                         SET(DensityType, DensityStatus, L"Status_DIN-NB", 0),
                                         SET(DensityType, DensityFilter, L"Status_A", 38)));

TEST(RefusedValue, LeavesValueAndPresenceAsTheyWere) {
    SpotColorType spot;
    spot.set_Name(L"n");
    EXPECT_EQ(spot.set_Percentage(101.0), 36);
    EXPECT_FALSE(spot.is_occurs_ok()) << "still not present";
    EXPECT_EQ(spot.get_Percentage(), 0.0);
    EXPECT_EQ(spot.set_Percentage(50.0), 0);
    EXPECT_TRUE(spot.is_occurs_ok());
    EXPECT_EQ(spot.set_Percentage(-1.0), 37);
    EXPECT_EQ(spot.set_Percentage(k_nan), 37);
    EXPECT_TRUE(spot.is_occurs_ok());
    EXPECT_EQ(spot.get_Percentage(), 50.0);

    Process process;
    EXPECT_EQ(process.set_Thickness(-1.0), 37);
    EXPECT_FALSE(process.isset_Thickness());
    EXPECT_EQ(process.set_Thickness(1.0), 0);
    process.unset_Thickness();
    EXPECT_EQ(process.set_Thickness(-1.0), 37);
    EXPECT_FALSE(process.isset_Thickness());
    EXPECT_EQ(process.get_Thickness(), 1.0);
}

TEST(SetterAlone, CountsTheLengthInStoredUnits) {
    ProfileType_Parameters parameters;
    const std::wstring pair{static_cast<wchar_t>(0xD83C), static_cast<wchar_t>(0xDFA8)};
    EXPECT_EQ(parameters.set_Name(pair), 19) << "one character, two units";
}

// Intended: a date and time without zone is only refused by the reader.
TEST(SetterAlone, TakesADateThatTheReaderRefuses) {
    const qbxV2::c_datetime no_zone("2024-01-02T03:04:05");
    ColorType color;
    EXPECT_EQ(color.append_ChangeHistory(no_zone), 0);
    EXPECT_EQ(color.set_ChangeHistory(0, no_zone), 0);
    EXPECT_EQ(color.insert_ChangeHistory(0, no_zone), 0);
    EXPECT_EQ(color.size_ChangeHistory(), 2u);
    EXPECT_EQ(color.set_ChangeHistory(1, qbxV2::c_datetime("2024-01-02")), 0) << "no time either";
    SampleSpotType sample;
    EXPECT_EQ(sample.set_ProductionDate(no_zone), 0);
    EXPECT_TRUE(sample.isset_ProductionDate());
    CalibrationStateType state;
    EXPECT_EQ(state.set_CalibrationDateTime(no_zone), 0);
    EXPECT_TRUE(state.isset_CalibrationDateTime());
    ProfileType profile;
    EXPECT_EQ(profile.set_Created(qbxV2::c_datetime()), 0);
}

}  // namespace
