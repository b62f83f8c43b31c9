#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

#include "tests/schema/document_judge.h"
#include "tests/schema/fragments.h"
#include "tests/schema/trial_name.h"

namespace schema_tests {
namespace {

/// Where a value stands ("%" in the document), what is accepted there and what isn't.
struct value_trial {
    const char* what;
    std::string document;
    std::vector<const char*> accepted;
    std::vector<const char*> refused;

    std::string with(const std::string& value) const {
        const std::size_t at = document.find('%');
        return document.substr(0, at) + value + document.substr(at + 1);
    }

    /// How libxml2 names the element or attribute that holds the value.
    std::string place() const {
        const std::string ahead = document.substr(0, document.find('%'));
        if (ahead.back() == '"') {
            const std::size_t start = ahead.find_last_of(' ') + 1;
            return "attribute '" + ahead.substr(start, ahead.find('=', start) - start) + "'";
        }
        const std::size_t start = ahead.find(':', ahead.find_last_of('<')) + 1;
        return "}" + ahead.substr(start, ahead.find_first_of(" >", start) - start) + "':";
    }
};

void PrintTo(const value_trial& t, std::ostream* out) { *out << t.what; }

class Values : public testing::TestWithParam<value_trial> {};

std::string name_of(const testing::TestParamInfo<value_trial>& info) { return trial_name(info.param.what); }

TEST_P(Values, OfTheTableAreAccepted) {
    for (const char* value : GetParam().accepted) {
        EXPECT_EQ(complaints(GetParam().with(value)), "") << GetParam().what << " '" << value << "'";
    }
}

TEST_P(Values, OutsideTheTableAreRefusedAtTheirPlace) {
    for (const char* value : GetParam().refused) {
        const std::string said = complaints(GetParam().with(value));
        EXPECT_NE(said.find(GetParam().place()), std::string::npos)
            << GetParam().what << " '" << value << "' said: " << said;
    }
}

std::string de94(const std::string& l) {
    return outermost("FunctionDE94",
                     element("Param_l", l) + element("Param_c", "1") + element("Param_h", "1"));
}

std::string settings(const std::string& content) {
    return outermost("Measurement",
                     element("Device", element("Manufacturer") + element("Model") + element("SerialNumber") +
                                           element("DeviceSettings", content)) +
                         color(lab(50)));
}

std::string profile(const std::string& content) {
    return outermost("ColorSpaceSpecification", element("Profile", content, "Direction=\"Profile_Both\"") +
                                                    nil("DeviceFilter") + nil("DevicePolarization") +
                                                    change_history());
}

std::string colorant(const std::string& density, const std::string& contribution) {
    return color_space(
        "Recipe", "SpectrumGeneric",
        element("ColorantElement", element("Colorant", element("Name", "n") + element("Manufacturer", "m") +
                                                           element("PartNumber", "p") + density) +
                                       element("Contribution", contribution)));
}

std::string lch(const std::string& l, const std::string& h) {
    return color_space("CIELCh", "SpectrumTristimulus",
                       element("L", l) + element("C", "150") + element("H", h));
}

std::string yiq(const std::string& i) {
    return color_space("YIQ", "SpectrumGeneric", element("Y", "0") + element("I", i) + element("Q", "0"));
}

const std::string k_other_inks = element("Magenta", "0") + element("Yellow", "0") + element("Black", "0");

INSTANTIATE_TEST_SUITE_P(
    Numbers, Values,
    testing::Values(
        value_trial{"the coverage with an ink",
                    color_space("CMYK", "SpectrumGeneric", element("Cyan", "%") + k_other_inks),
                    {"0", "100", "100.0", "1e2", " 50 "},
                    {"-0.1", "100.0000001", "", "ten", "1,5"}},
        value_trial{"a hue angle", lch("50", "%"), {"0", "359.999"}, {"360", "360.0", "-1"}},
        value_trial{"the lightness of L*C*h", lch("%", "0"), {"0", "100"}, {"100.1", "-0.1"}},
        value_trial{"the lightness of L*a*b* reaches further",
                    color_space("CIELab", "SpectrumTristimulus",
                                element("L", "%") + element("A", "-150") + element("B", "150")),
                    {"0", "100.1", "150"},
                    {"150.1", "-0.1"}},
        value_trial{"the color difference I", yiq("%"), {"-0.5957", "0.5957"}, {"-0.5958", "0.5958"}},
        value_trial{"a reflectance: the ends are refused",
                    color_space("Spectral", "SpectrumSpectral",
                                element("ReflectancePoint", "%", "Wavelength=\"400\"")),
                    {"-0.999", "0", "9.999"},
                    {"-1", "-1.0", "10", "10.0"}},
        value_trial{"a wavelength",
                    color_space("EmissiveSpectral", "EmissiveSpectral",
                                element("EmissiveSpectralPoint", "-1e9", "Wavelength=\"%\"")),
                    {"0.001", "400"},
                    {"0", "-400", ""}},
        value_trial{"the weight of a color difference has no upper end", de94("%"), {"0", "1e300"}, {"-0.1"}},
        value_trial{
            "a colorant's share", colorant(element("Density", "1"), "%"), {"0", "1"}, {"1.1", "-0.1"}},
        value_trial{"a colorant's density", colorant(element("Density", "%"), "1"), {"0.1"}, {"0", "-1", ""}},
        value_trial{
            "an angle has no range",
            tristimulus_specification(element("IlluminationOptions", element("ColorTemperature", "5000")) +
                                      element("FieldOfView", "FieldOfView_2_Degree") +
                                      element("GeometryChoice", element("Angle", "%"))),
            {"-720", "45", "INF", "NaN"},
            {"", "45deg"}},
        value_trial{"an aperture",
                    settings(element("Aperture", "%")),
                    {"0", "2147483647"},
                    {"2147483648", "-1", "1.5"}},
        value_trial{"a lens position",
                    settings(element("LensPosition", "%")),
                    {"-2147483648", "2147483647"},
                    {"-2147483649", "2147483648", "0.5"}},
        value_trial{"how many readings are averaged",
                    settings(element("Averaging", "true", "AveragingValue=\"%\"")),
                    {"2", "99"},
                    {"1", "100", "-2", "2.5"}}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(
    Words, Values,
    testing::Values(
        value_trial{
            "a finish",
            outermost("ColorSpaceTINTARA",
                      change_history() + element("FamilyName") +
                          element("ColorName",
                                  element("PrefixName") + element("BaseName") + element("SuffixName")) +
                          element("Page") + element("Gamut", "Gamut_QUAdravive") +
                          element("ColorAndFinish",
                                  element("Finish", "%") +
                                      element("ColorSpaceSpectral",
                                              change_history() +
                                                  nil("ColorSpaceSpecificationSpectrumSpectral") +
                                                  element("ReflectancePoint", "0", "Wavelength=\"400\"")))),
            {"Finish_Coated", "Finish_Uncoated", "Finish_Matte"},
            {"", "finish_coated", "Finish_Glossy", " Finish_Matte"}},
        value_trial{"a density status",
                    color_space("Density", "SpectrumGeneric",
                                element("Density", "-1", "DensityStatus=\"%\" DensityFilter=\"Filter_A\"")),
                    {"Status_A", "Status_DIN-NB"},
                    {"Status_B", ""}},
        value_trial{"a target",
                    outermost("SampleTarget", element("SubstrateVinyl") + element("Target", "%")),
                    {"Target_IT8.7/1", "Target_Custom"},
                    {"Target_IT8.7/5"}},
        value_trial{"a boolean",
                    settings(element("FleetTuner", "%")),
                    {"true", "false", "1", "0"},
                    {"TRUE", "yes", ""}},
        value_trial{"averaging that isn't told to be on or off",
                    settings(element("Averaging", "%", "AveragingValue=\"2\"")),
                    {"false"},
                    {""}},
        value_trial{"a name needs a character, if only a blank",
                    outermost("SubstrateGeneric", element("Type", "%")),
                    {"x", " "},
                    {""}},
        value_trial{"a profile parameter's name has exactly one character",
                    profile(element("ProfileChoice", element("ProfileURI", "u")) +
                            element("Parameters",
                                    element("Name", "%") + element("ValueChoice", element("StringValue")))),
                    {"a", "\xC3\xA4", " "},
                    {"", "ab"}},
        value_trial{"blanks don't make a function's name",
                    outermost("FunctionGeneric", element("Name", "%")),
                    {" x "},
                    {""}},
        value_trial{"a profile's bytes",
                    profile(element("ProfileChoice", element("ProfileFile", "%"))),
                    {"", "QUJD", "QUJDRA==", "QU JD"},
                    {"QU*D", "QUJ"}}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(
    DatesAndTimes, Values,
    testing::Values(value_trial{
        "a moment has a time and a time zone",
        outermost("ColorSpaceNCS", element("ChangeHistory", "%") +
                                       nil("ColorSpaceSpecificationSpectrumGeneric") + element("ColorName")),
        {"2024-01-02T03:04:05Z", "2024-01-02T03:04:05.678+01:00", "-0001-01-02T03:04:05-05:30"},
        {"2024-01-02", "2024-01-02Z", "2024-01-02T03:04:05", "2024-13-02T03:04:05Z", ""}}),
    &name_of);

}  // namespace
}  // namespace schema_tests
