#include <gtest/gtest.h>

#include <ostream>
#include <string>

#include "tests/schema/document_judge.h"
#include "tests/schema/fragments.h"
#include "tests/schema/trial_name.h"

namespace schema_tests {
namespace {

/// A document, and what is wrong with it: a part of libxml2's complaint, or nothing for a valid one.
struct trial {
    const char* why;
    std::string document;
    const char* complaint = "";
};

void PrintTo(const trial& t, std::ostream* out) { *out << t.why; }

class Structure : public testing::TestWithParam<trial> {};

std::string name_of(const testing::TestParamInfo<trial>& info) { return trial_name(info.param.why); }

TEST_P(Structure, IsJudged) {
    const trial& t = GetParam();
    const std::string said = complaints(t.document);
    if (*t.complaint == '\0') {
        EXPECT_EQ(said, "") << t.document;
    } else {
        EXPECT_NE(said.find(t.complaint), std::string::npos) << t.document << "\nsaid: " << said;
    }
}

const char k_cyan_missing[] =
    "Magenta': This element is not expected. Expected is ( {urn:vrl:document/v2}Cyan";

std::string cmyk(const std::string& inks) { return color_space("CMYK", "SpectrumGeneric", inks); }
const std::string k_inks =
    element("Cyan", "1") + element("Magenta", "2") + element("Yellow", "3") + element("Black", "4");

INSTANTIATE_TEST_SUITE_P(
    Documents, Structure,
    testing::Values(
        trial{"a preamble makes a document", document()},
        trial{"a document starts with its preamble", outermost("Vrl"), "Vrl': Missing child element(s)"},
        trial{"colors, palettes and quality control in their order",
              document(color(lab(50)) + element("Palette", change_history(), "PaletteName=\"p\"") +
                       element("ColorQualityControl",
                               change_history() + element("StandardAndMeasurement", nil("Standard")) +
                                   element("PhysicalSample",
                                           element("SampleSpot",
                                                   element("SubstratePaper") +
                                                       element("Specification",
                                                               element("SampleWidth", "1") +
                                                                   element("SampleHeight", "1"))))))},
        trial{"a color stands ahead of the palettes",
              document(element("Palette", change_history(), "PaletteName=\"p\"") + color(lab(50))),
              "Color': This element is not expected"},
        trial{"a namespace is part of the name", "<Vrl xmlns=\"urn:vrl:document/v1\"/>",
              "No matching global declaration"},
        trial{"an attribute has no prefix",
              document(element("Color", change_history() + lab(50), "Vrl:ColorName=\"c\"")),
              "ColorName' is not allowed"},
        trial{
            "a revision holds elements of any vocabulary",
            outermost("Vrl", element("Preamble",
                                     element("Header",
                                             element("Creator", "me") + element("CreatorVersion", "1") +
                                                 change_history() + element("Purpose") +
                                                 element("Revision", "<a xmlns=\"urn:x\" b=\"1\"/><c/>"))))},
        trial{
            "a revision isn't empty",
            outermost("Vrl", element("Preamble",
                                     element("Header", element("Creator", "me") +
                                                           element("CreatorVersion", "1") + change_history() +
                                                           element("Purpose") + element("Revision")))),
            "Revision': Missing child element(s)"}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(
    Colors, Structure,
    testing::Values(
        trial{"a color has a value", document(color("")), "Color': Missing child element(s)"},
        trial{"a color has a name", document(element("Color", change_history() + lab(50))),
              "The attribute 'ColorName' is required"},
        trial{"a color has a history", document(element("Color", lab(50), "ColorName=\"c\"")),
              "ColorSpaceCIELab': This element is not expected"},
        trial{"a color may have many values and stand on a substrate",
              document(color(lab(50) + lab(60) + element("SubstrateFilm")))},
        trial{"a substrate may have a color of its own",
              document(color(lab(50) + element("SubstrateWood", color(lab(60)))))},
        trial{"a color set may be empty",
              document(element("Palette",
                               change_history() + element("ColorSet", change_history(), "ColorSetName=\"s\""),
                               "PaletteName=\"p\""))},
        trial{"the parts of a name may be empty, but are there",
              outermost("ColorSpaceTINTARA",
                        change_history() + element("FamilyName") +
                            element("ColorName", element("PrefixName") + element("BaseName")) +
                            element("Page") + element("Gamut", "Gamut_CMYK")),
              "ColorName': Missing child element(s). Expected is ( {urn:vrl:document/v2}SuffixName"}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(
    ColorSpaces, Structure,
    testing::Values(
        trial{"a color value alone is a document", cmyk(k_inks)},
        trial{"inks in their order", cmyk(element("Magenta", "2") + element("Cyan", "1")), k_cyan_missing},
        trial{"an ink only once", cmyk(k_inks + element("Black", "4")),
              "Black': This element is not expected"},
        trial{"an unknown element is refused", cmyk(k_inks + element("Purple", "4")),
              "Purple': This element is not expected"},
        trial{"an unknown attribute is refused", color_space("CMYK", "SpectrumGeneric", k_inks, "Nmae=\"n\""),
              "'Nmae' is not allowed"},
        trial{"a generic space needs a name",
              color_space("Generic", "SpectrumGeneric",
                          element("Axis", element("AxisName", "a") +
                                              element("AxisValueChoice", element("AxisStringValue")))),
              "The attribute 'Name' is required"},
        trial{"the head of the color spaces can't occur",
              document(color(element("ColorSpace", change_history()))),
              "The element declaration is abstract"},
        trial{"nor with xsi:type",
              document(color(element("ColorSpace", change_history(), "xsi:type=\"Vrl:ColorSpaceNCSType\""))),
              "The element declaration is abstract"},
        trial{"a substrate is no color space", document(color(element("SubstrateFilm"))),
              "SubstrateFilm': This element is not expected"},
        trial{"a parent may be nil",
              outermost("ColorSpaceNCS", nil("ParentColorSpace") + change_history() +
                                             nil("ColorSpaceSpecificationSpectrumGeneric") +
                                             element("ColorName"))},
        trial{"a parent that isn't nil holds a value",
              outermost("ColorSpaceNCS", element("ParentColorSpace") + change_history() +
                                             nil("ColorSpaceSpecificationSpectrumGeneric") +
                                             element("ColorName")),
              "ParentColorSpace': Missing child element(s)"},
        trial{"a nil element is empty",
              outermost("ColorSpaceNCS",
                        element("ParentColorSpace", lab(50), "xsi:nil=\"true\"") + change_history() +
                            nil("ColorSpaceSpecificationSpectrumGeneric") + element("ColorName")),
              "ParentColorSpace': Neither character nor element content is allowed, because the "
              "element was 'nilled'"},
        trial{"an ink can't be nil", cmyk(nil("Cyan") + k_inks), "Cyan': The element is not 'nillable'"},
        trial{"each space refers to the specification that suits it",
              color_space("CMYK", "SpectrumTristimulus", k_inks),
              "ColorSpaceSpecificationSpectrumTristimulus': This element is not expected"}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(
    Specifications, Structure,
    testing::Values(
        trial{"illumination and field of view are needed",
              tristimulus_specification(element("IlluminationOptions",
                                                element("Illuminant", "Illuminant_D50")) +
                                        element("FieldOfView", "FieldOfView_2_Degree"))},
        trial{"one light, not two",
              tristimulus_specification(element("IlluminationOptions",
                                                element("Illuminant", "Illuminant_D50") +
                                                    element("ColorTemperature", "5000")) +
                                        element("FieldOfView", "FieldOfView_2_Degree")),
              "ColorTemperature': This element is not expected"},
        trial{"the choice has an attribute too",
              tristimulus_specification(element("IlluminationOptions", element("ColorTemperature", "5000"),
                                                "Description=\"warm\"") +
                                        element("FieldOfView", "FieldOfView_10_Degree"))},
        trial{"a choice isn't empty", tristimulus_specification(element("IlluminationOptions")),
              "IlluminationOptions': Missing child element(s)"},
        trial{"the filter is written, if only as nil",
              outermost("ColorSpaceSpecification", nil("DevicePolarization") + change_history()),
              "DevicePolarization': This element is not expected. Expected is one of"},
        trial{"the specifications of a palette can't be nil",
              outermost("CollectionColorSpaceSpecification", nil("ColorSpaceSpecificationEmissiveSpectral")),
              "ColorSpaceSpecificationEmissiveSpectral': The element is not 'nillable'"},
        trial{"a palette may have none", outermost("CollectionColorSpaceSpecification")}),
    &name_of);

const std::string k_de94 = element("Param_l", "2") + element("Param_c", "1") + element("Param_h", "1");

INSTANTIATE_TEST_SUITE_P(
    QualityControl, Structure,
    testing::Values(
        trial{"a function is named by xsi:type",
              outermost("Function", k_de94, "xsi:type=\"Vrl:FunctionDE94Type\"")},
        trial{"a function without xsi:type is refused", outermost("Function"),
              "The type definition is abstract"},
        trial{"the root of the functions can't be named",
              outermost("Function", {}, "xsi:type=\"Vrl:FunctionType\""), "The type definition is abstract"},
        trial{"a type of another group can't be named",
              outermost("Function", {}, "xsi:type=\"Vrl:SubstratePaperType\""), "not validly derived"},
        trial{"an unknown type can't be named", outermost("Function", {}, "xsi:type=\"Vrl:Nonsense\""),
              "does not resolve to a type definition"},
        trial{"the type that is named decides the content",
              outermost("Function", k_de94, "xsi:type=\"Vrl:FunctionDEType\""),
              "Param_l': This element is not expected"},
        trial{"a function under its own element",
              outermost("FunctionDECMC", element("Param_l", "2") + element("Param_c", "1"))},
        trial{"a function without parameters may be empty", outermost("FunctionStdDevX")},
        trial{
            "a measurement may have many functions",
            outermost("Measurement", device() + color(lab(50)) + element("FunctionDE") +
                                         element("Function", k_de94, "xsi:type=\"Vrl:FunctionDE2000Type\""))},
        trial{"a standard may be nil", outermost("Standard", {}, "xsi:nil=\"true\"")},
        trial{"a standard that isn't nil needs a device", outermost("Standard", color(lab(50))),
              "Color': This element is not expected"},
        trial{"a measurement can't be nil", outermost("Measurement", {}, "xsi:nil=\"true\""),
              "Measurement': The element is not 'nillable'"},
        trial{"a tolerance has a function",
              outermost("Standard", device() + color(lab(50)) + element("Tolerance")),
              "Tolerance': Missing child element(s)"}),
    &name_of);

INSTANTIATE_TEST_SUITE_P(Substrates, Structure,
                         testing::Values(trial{"a substrate may be empty", outermost("SubstrateTextile")},
                                         trial{"a generic one tells its kind", outermost("SubstrateGeneric"),
                                               "SubstrateGeneric': Missing child element(s)"},
                                         trial{"weight ahead of kind",
                                               outermost("SubstrateMetal", element("MetalType", "tin") +
                                                                               element("MetalWeight", "1")),
                                               "MetalWeight': This element is not expected"},
                                         trial{"the head of the substrates can't occur",
                                               outermost("Substrate"), "The element declaration is abstract"},
                                         trial{"the head of the samples can't occur", outermost("Sample"),
                                               "The element declaration is abstract"},
                                         trial{"a sample stands on a substrate",
                                               outermost("SampleTarget", element("Target", "Target_ECI2002")),
                                               "Target': This element is not expected"}),
                         &name_of);

INSTANTIATE_TEST_SUITE_P(
    CustomAttributes, Structure,
    testing::Values(
        trial{"a number", outermost("SubstrateTile", custom_attribute(element("DoubleValue", "1.5")))},
        trial{"a text, which may be empty",
              outermost("SubstrateTile", custom_attribute(element("StringValue")))},
        trial{"one value, not two",
              outermost("SubstrateTile",
                        custom_attribute(element("DoubleValue", "1") + element("IntegerValue", "1"))),
              "IntegerValue': This element is not expected"},
        trial{"as many attributes as one likes, but first",
              outermost("SubstrateTile", element("PartNumber") + custom_attribute(element("StringValue"))),
              "CustomAttribute': This element is not expected"}),
    &name_of);

}  // namespace
}  // namespace schema_tests
