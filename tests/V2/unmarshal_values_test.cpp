#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// Simple values in documents: white space, form, facets, and what a forgiving handler keeps.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::forgive;
using vrl_test::history;
using vrl_test::read_element;

/// An element of some class, and the code of reading it.
struct reading {
    std::function<int(const std::string&)> read;
    std::string xml;
    int code;
};
void PrintTo(const reading& r, std::ostream* os) { *os << r.xml; }

template <class T>
reading row(const std::string& xml, int code) {
    return {[](const std::string& text) {
                T object;
                return read_element(object, text).code;
            },
            xml, code};
}

class ReadValue : public testing::TestWithParam<reading> {};

TEST_P(ReadValue, GivesItsCode) { EXPECT_EQ(GetParam().read(GetParam().xml), GetParam().code); }

reading black(const std::string& text, int code) {
    return row<ColorSpaceCMYKType>(vrl_test::cmyk(text), code);
}

INSTANTIATE_TEST_SUITE_P(Numbers, ReadValue,
                         testing::Values(black("0", 0), black("-0", 0), black("100", 0),
                                         black("100.0000001", 36), black("-1", 37), black("1e1", 0),
                                         black(".5", 0), black("5.", 0), black("+5", 0), black(" \n5\t", 0),
                                         black("NaN", 37), black("INF", 36), black("-INF", 37), black("", 35),
                                         black("x", 35), black("5 5", 35), black("1e", 35), black("0x10", 35),
                                         black("inf", 35), black("5%", 35), black("1,5", 35),
                                         black("<![CDATA[5]]>", 0), black("<!-- c -->5<?pi?>", 0),
                                         black("&#53;", 0), black("<Vrl:x/>", 10), black("5<Vrl:x/>", 10),
                                         black("&undefined;", 29)));

reading setting(const std::string& name, const std::string& text, int code) {
    return row<DeviceSettings>(element("DeviceSettings", element(name, text)), code);
}

INSTANTIATE_TEST_SUITE_P(
    WholeNumbers, ReadValue,
    testing::Values(setting("Aperture", "0", 0), setting("Aperture", "-0", 0),
                    setting("Aperture", "2147483647", 0), setting("Aperture", "2147483648", 36),
                    setting("Aperture", "-1", 37), setting("Aperture", "00000000000000000007", 0),
                    setting("Aperture", "100000000000000000000000000000000", 36),
                    setting("Aperture", "-100000000000000000000000000000000", 37),
                    setting("Aperture", "1.0", 35), setting("Aperture", "", 35),
                    setting("Aperture", " 5 ", 0), setting("LensPosition", "-2147483648", 0),
                    setting("LensPosition", "-2147483649", 37), setting("LensPosition", "2147483647", 0),
                    setting("LensPosition", "2147483648", 36), setting("LensPosition", "+5", 0),
                    setting("LensPosition", "x", 35)));

reading custom(const std::string& option, const std::string& text, int code) {
    return row<CustomAttributeType_ValueChoice>(element("ValueChoice", element(option, text)), code);
}
reading temperature(const std::string& text, int code) {
    return row<IlluminationOptionsType>(element("I", element("ColorTemperature", text)), code);
}

INSTANTIATE_TEST_SUITE_P(
    Options, ReadValue,
    testing::Values(custom("IntegerValue", "2147483647", 0), custom("IntegerValue", "2147483648", 36),
                    custom("IntegerValue", "-2147483648", 0), custom("IntegerValue", "-2147483649", 37),
                    custom("DoubleValue", "NaN", 0), custom("DoubleValue", "x", 35),
                    custom("StringValue", "", 0), temperature("0", 0), temperature("2147483647", 0),
                    temperature("2147483648", 36), temperature("-1", 37), temperature("4294967295", 36)));

INSTANTIATE_TEST_SUITE_P(Booleans, ReadValue,
                         testing::Values(setting("FleetTuner", "true", 0), setting("FleetTuner", "false", 0),
                                         setting("FleetTuner", "1", 0), setting("FleetTuner", "0", 0),
                                         setting("FleetTuner", " true ", 0),
                                         setting("FleetTuner", "TRUE", 35), setting("FleetTuner", "", 35),
                                         setting("FleetTuner", "2", 35)));

reading changed(const std::string& time, int code) {
    return row<PaletteType>(element("Palette", element("ChangeHistory", time), " PaletteName=\"p\""), code);
}

INSTANTIATE_TEST_SUITE_P(Times, ReadValue,
                         testing::Values(changed("2024-01-02T03:04:05Z", 0),
                                         changed("2024-01-02T03:04:05+01:00", 0),
                                         changed("2024-01-02T03:04:05-01:00", 0),
                                         changed(" 2024-01-02T03:04:05.25Z\n", 0),
                                         changed("2024-01-02T03:04:05", 22), changed("2024-01-02", 35),
                                         changed("03:04:05Z", 35), changed("", 35), changed("now", 35)));

reading parameter_name(const std::string& name, int code) {
    return row<ProfileType_Parameters>(
        element("P", element("Name", name) + element("ValueChoice", element("DoubleValue", "1"))), code);
}

INSTANTIATE_TEST_SUITE_P(
    Lengths, ReadValue,
    testing::Values(parameter_name("", 20), parameter_name("a", 0), parameter_name("ab", 19),
                    parameter_name(" ", 0), parameter_name(" a", 19), parameter_name("\xC3\xA9", 0),
                    parameter_name("\xF0\x9F\x8E\xA8", 0),
                    row<CustomAttributeType>(element("C", element("Name", "")), 20),
                    row<SubstrateGenericType>(element("S", element("Type", "")), 20),
                    row<SubstrateGenericType>(element("S", empty_element("Type")), 20),
                    row<SubstrateGenericType>(element("S", element("Type", " ")), 0),
                    row<GeometryChoiceType>(element("G", element("UnknownGeometry", "")), 20),
                    row<ColorName>(element("C", empty_element("PrefixName") + element("BaseName", "") +
                                                    empty_element("SuffixName")),
                                   0)));

reading finish(const std::string& text, int code) {
    return row<ColorAndFinish>(
        element("C", element("Finish", text) +
                         element("ColorSpaceSpectral",
                                 history() +
                                     element("ColorSpaceSpecificationSpectrumSpectral",
                                             vrl_test::spectrum_generic_content() +
                                                 element("GeometryChoice", element("Angle", "45"))) +
                                     element("ReflectancePoint", "0.5", " Wavelength=\"400\""))),
        code);
}

INSTANTIATE_TEST_SUITE_P(Literals, ReadValue,
                         testing::Values(finish("Finish_Coated", 0), finish("Finish_Uncoated", 0),
                                         finish("Finish_Matte", 0), finish("Finish_Gloss", 38),
                                         finish("finish_matte", 38), finish("", 38),
                                         // An enumeration is text: its white space counts.
                                         finish(" Finish_Matte", 38), finish("Finish_Matte\n", 38),
                                         row<SpectrumType>(element("S", "Spectrum_Custom"), 0),
                                         row<SpectrumType>(element("S", " Spectrum_Custom"), 38),
                                         row<SpectrumType>(element("S", ""), 38),
                                         row<SpectrumType>(empty_element("S"), 38)));

INSTANTIATE_TEST_SUITE_P(
    TextOfElements, ReadValue,
    testing::Values(row<Density>(element("D", " 1.5 "), 0), row<Density>(element("D", "0"), 37),
                    row<Density>(element("D", "-1"), 37), row<Density>(element("D", "x"), 35),
                    row<Density>(element("D", "&undefined;"), 29),
                    row<DevicePolarization>(element("D", "1"), 0),
                    row<DevicePolarization>(element("D", ""), 35),
                    row<ReflectancePointType>(element("P", "-1", " Wavelength=\"400\""), 37),
                    row<ReflectancePointType>(element("P", "10", " Wavelength=\"400\""), 36),
                    row<ReflectancePointType>(element("P", "9.99", " Wavelength=\"400\""), 0),
                    row<SDKVersion>(element("V", ""), 0), row<SDKVersion>(element("V", " 1 "), 0),
                    row<ProfileFile>(element("F", "TWFu"), 0), row<ProfileFile>(element("F", " TWFu\n"), 0),
                    row<ProfileFile>(element("F", "TWF*"), 35),
                    row<Averaging>(empty_element("A", " AveragingValue=\"2\""), 35),
                    row<GlossCompensation>(element("G", "", " CompensationValue=\"1\""), 35)));

TEST(ReadText, KeepsItsWhiteSpace) {
    Person person;
    EXPECT_EQ(read_element(person, element("Person", element("Name", "  a \n b\t"))).code, 0);
    EXPECT_EQ(person.get_Name(), L"  a \n b\t");
    SDKVersion version;
    EXPECT_EQ(read_element(version, element("V", " 1 ")).code, 0);
    EXPECT_EQ(version.get_SDKVersion(), L" 1 ");
    ProfileFile file;
    EXPECT_EQ(read_element(file, element("F", "TWFu", " ProfileName=\" p \"")).code, 0);
    EXPECT_EQ(file.get_ProfileName(), L" p ");
}

// Intended: three elements collapse their white space, and no others.
TEST(ReadText, LosesItsWhiteSpaceInThreeElements) {
    FunctionGenericType function;
    EXPECT_EQ(read_element(function, element("F", element("Name", " a \n b "))).code, 0);
    EXPECT_EQ(function.get_Name(), L"a b");
    ProfileChoice profile;
    EXPECT_EQ(read_element(profile, element("P", element("ProfileURI", "\t u  v "))).code, 0);
    EXPECT_EQ(profile.get_ProfileURI(), L"u v");
    Version version;
    EXPECT_EQ(
        read_element(version, element("V", element("Version", " 1  2 ") + element("Predecessor", " 1  2 ")))
            .code,
        0);
    EXPECT_EQ(version.get_Version(), L" 1  2 ");
    EXPECT_EQ(version.get_Predecessor(0), L"1 2");

    FunctionGenericType blank;
    EXPECT_EQ(read_element(blank, element("F", element("Name", "  "))).code, 20) << "nothing is left of it";
}

TEST(ReadText, IsUtf16) {
    Person person;
    const std::string text = "\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8E\xA8&#x1F3A8;&amp;";
    EXPECT_EQ(read_element(person, element("Person", element("Name", text))).code, 0);
    const wchar_t expected[] = {0xE9, 0x20AC, 0xD83C, 0xDFA8, 0xD83C, 0xDFA8, L'&', 0};
    EXPECT_EQ(person.get_Name(), expected);
}

// Intended: a simple child has no class that would look at attributes.
TEST(SimpleChild, MayHaveAnyAttributes) {
    Person person;
    const std::string attributes = " nonsense=\"1\" xsi:nil=\"true\" a=\"&undefined;\"";
    const auto result = read_element(person, element("Person", element("Name", "n", attributes) +
                                                                   empty_element("ContactInfo", attributes)));
    EXPECT_EQ(result.code, 0);
    EXPECT_TRUE(result.reports.empty());
    EXPECT_EQ(person.get_Name(), L"n");
    EXPECT_TRUE(person.isset_ContactInfo());
    EXPECT_EQ(person.get_ContactInfo(), L"");
}

TEST(SimpleChild, IsReportedByItsName) {
    ColorSpaceCMYKType space;
    const auto result = read_element(space, vrl_test::cmyk("x"));
    EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Black"});
}

TEST(UnreadableValue, HasTheReadersCodeAloneAndOneOfItsOwnInAList) {
    Person person;
    EXPECT_EQ(read_element(person, element("Person", element("Name", "<Vrl:x/>"))).code, 10);
    EXPECT_EQ(read_element(person, element("Person", element("Name", "&undefined;"))).code, 29);
    EXPECT_EQ(read_element(person, "<Vrl:Person><Vrl:Name/").code, 34)
        << "an end of input there counts as an empty value; what follows is missed";
    OwnerType owner;
    EXPECT_EQ(read_element(owner, element("Owner", element("Company", "<Vrl:x/>"))).code, 29);
    EXPECT_EQ(owner.size_Company(), 1u) << "an entry is there before it is read";
}

TEST(UnreadableValue, StaysUnset) {
    Person person;
    const auto result = read_element(
        person, element("Person", element("Name", "&undefined;") + element("ContactInfo", "c")), forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.reports.front().code, 29);
    EXPECT_FALSE(person.is_occurs_ok());
    Density density;
    EXPECT_EQ(read_element(density, element("D", "&undefined;"), forgive).reports.front().code, 29);
    EXPECT_FALSE(density.is_occurs_ok());
}

TEST(RefusedValue, IsKeptWhereTheHandlerForgives) {
    ColorSpaceCMYK space;
    const std::string xml = vrl_test::outermost("ColorSpaceCMYK", vrl_test::cmyk_content("150"));
    const auto result = vrl_test::read_document(space, xml, forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.codes(), std::vector<int>{36});
    EXPECT_EQ(space.get_Black(), 150.0);
    std::string text;
    EXPECT_EQ(space.marshal(&text), 0);
    EXPECT_NE(text.find("<Vrl:Black>150</Vrl:Black>"), std::string::npos);
    EXPECT_EQ(space.set_Black(space.get_Black()), 36) << "the setter would not take it";
}

TEST(RefusedValue, IsInStorageEvenWhereReadingStops) {
    ColorSpaceCMYKType space;
    EXPECT_EQ(read_element(space, vrl_test::cmyk("150")).code, 36);
    EXPECT_EQ(space.get_Black(), 150.0) << "ranges of numbers are checked behind storing";
    Density density;
    EXPECT_EQ(read_element(density, element("D", "-2")).code, 37);
    EXPECT_EQ(density.get_Density(), -2.0);
    EXPECT_FALSE(density.is_occurs_ok()) << "but not present";
    DeviceSettings settings;
    EXPECT_EQ(read_element(settings, element("D", element("Aperture", "2147483648"))).code, 36);
    EXPECT_EQ(settings.get_Aperture(), 0u) << "those of whole numbers before";
    SubstrateGenericType substrate;
    substrate.set_Type(L"before");
    EXPECT_EQ(read_element(substrate, element("S", element("Type", ""))).code, 20);
    EXPECT_EQ(substrate.get_Type(), L"before") << "lengths, too";
    ColorAndFinish finish;
    EXPECT_EQ(read_element(finish, element("C", element("Finish", "x"))).code, 38);
    EXPECT_EQ(finish.get_Finish(), L"x") << "literals behind";
}

TEST(RefusedValue, OfNoFormIsStoredAsFarAsItGoes) {
    ColorSpaceCMYKType space;
    const auto result = read_element(space, vrl_test::cmyk("12x"), forgive);
    EXPECT_EQ(result.codes(), std::vector<int>{35});
    EXPECT_EQ(space.get_Black(), 12.0);
    DeviceSettings settings;
    EXPECT_EQ(read_element(settings, element("D", element("FleetTuner", "yes")), forgive).codes(),
              std::vector<int>{35});
    EXPECT_TRUE(settings.isset_FleetTuner());
    EXPECT_FALSE(settings.get_FleetTuner()) << "neither true nor 1";
    ProfileType_Parameters parameters;
    const auto name = read_element(
        parameters, element("P", element("Name", "ab") + element("ValueChoice", element("DoubleValue", "1"))),
        forgive);
    EXPECT_EQ(name.codes(), std::vector<int>{19});
    EXPECT_EQ(parameters.get_Name(), L"ab");
}

TEST(SecondReading, GivesTheTextOfAnEarlierOne) {
    Averaging averaging;
    EXPECT_EQ(read_element(averaging, element("A", "true", " AveragingValue=\"2\"")).code, 0);
    EXPECT_EQ(read_element(averaging, element("A", "0"), forgive).codes(), std::vector<int>{})
        << "a required attribute may be there from before";
    EXPECT_FALSE(averaging.get_Averaging());
}

}  // namespace
