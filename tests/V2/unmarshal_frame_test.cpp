#include <gtest/gtest.h>

#include <functional>
#include <ostream>
#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// The frame around one element: its attributes, its end, and where reports say they were raised.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::forgive;
using vrl_test::history;
using vrl_test::read_element;

std::string color_with(const std::string& attributes, const std::string& tail = "") {
    return element("Color", history() + vrl_test::cmyk() + tail, attributes);
}

TEST(Attribute, OfNoKnownNameIsUnexpected) {
    for (const char* attribute : {" color=\"x\"", " Name=\"x\"", " Vrl:UniqueID=\"x\"", " xml:lang=\"en\"",
                                  " xmlns:y=\"urn:y\" y:UniqueID=\"x\"", " z:UniqueID=\"x\""}) {
        ColorType color;
        const auto result = read_element(color, color_with(std::string(" ColorName=\"c\"") + attribute));
        EXPECT_EQ(result.code, 39) << attribute;
        EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Color"}) << "the item is the element";
    }
}

TEST(Attribute, OfNoKnownNameIsPassedOverWhereTheHandlerForgives) {
    ColorType color;
    const auto result =
        read_element(color, color_with(" a=\"&undefined;\" ColorName=\"c\" b=\"2\" UniqueID=\"u\""), forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.codes(), (std::vector<int>{39, 39}));
    EXPECT_EQ(color.get_ColorName(), L"c");
    EXPECT_EQ(color.get_UniqueID(), L"u");
}

TEST(Attribute, OfNoKnownNameIsUnexpectedOnEveryKindOfElement) {
    const auto code = [](auto object, const std::string& name) {
        return read_element(object, empty_element(name, " nonsense=\"1\"")).code;
    };
    EXPECT_EQ(code(Vrl(), "Vrl"), 39);
    EXPECT_EQ(code(OwnerType(), "Owner"), 39) << "one without attributes, accepted empty";
    EXPECT_EQ(code(Preamble(), "Preamble"), 39);
    EXPECT_EQ(code(Revision(), "Revision"), 39);
    EXPECT_EQ(code(Density(), "Density"), 39) << "simple content";
    EXPECT_EQ(code(GeometryChoiceType(), "GeometryChoice"), 39) << "a choice";
    EXPECT_EQ(code(FunctionDE94Type(), "FunctionDE94"), 39) << "a derived class";
    EXPECT_EQ(code(Standard(), "Standard"), 39) << "nillable";
}

TEST(Attribute, OfTheSchemaInstanceNamespaceIsPassedOverAnywhere) {
    const std::string hints =
        " xsi:schemaLocation=\"urn:vrl:document/v2 vrl.xsd\" xsi:noNamespaceSchemaLocation=\"x.xsd\""
        " xsi:type=\"Vrl:Anything\" xsi:foo=\"1\"";
    Vrl document;
    const std::string xml =
        vrl_test::outermost("Vrl", vrl_test::preamble() + color_with(" ColorName=\"c\"" + hints), hints);
    EXPECT_EQ(document.unmarshal(xml), 0);
    EXPECT_EQ(document.get_Color(0).get_ColorName(), L"c");
    Averaging averaging;
    const auto result =
        read_element(averaging, element("Averaging", "true", hints + " AveragingValue=\"5\""));
    EXPECT_EQ(result.code, 0);
    EXPECT_TRUE(result.reports.empty());
    EXPECT_EQ(read_element(averaging,
                           empty_element("Averaging",
                                         " xmlns:i=\"http://www.w3.org/2001/XMLSchema-instance\""
                                         " i:anything=\"1\""),
                           forgive)
                  .count(39),
              0);
}

TEST(Attribute, ThatStandsTwiceIsReported) {
    ColorType color;
    const std::string xml = color_with(" ColorName=\"a\" ColorName=\"b\"");
    const auto refused = read_element(color, xml);
    EXPECT_EQ(refused.code, 3);
    EXPECT_EQ(refused.items(), std::vector<std::string>{"ColorName"});
    EXPECT_EQ(color.get_ColorName(), L"a");
    ColorType second;
    EXPECT_EQ(read_element(second, xml, forgive).codes(), std::vector<int>{3});
    EXPECT_EQ(second.get_ColorName(), L"b") << "read again";
}

TEST(Attribute, ThatIsRequiredAndMissingIsReported) {
    const auto expect = [](auto object, const std::string& xml, const std::vector<std::string>& items) {
        decltype(object) again;
        EXPECT_EQ(read_element(object, xml).code, 25) << xml;
        const auto result = read_element(again, xml, forgive);
        std::vector<std::string> missing;
        for (const auto& report : result.reports) {
            if (report.code == 25) missing.push_back(report.item);
        }
        EXPECT_EQ(missing, items) << xml;
    };
    expect(Averaging(), element("Averaging", "true"), {"AveragingValue"});
    expect(ColorSetType(), element("ColorSet", history()), {"ColorSetName"});
    expect(ColorType(), color_with(""), {"ColorName"});
    expect(PaletteType(), element("Palette", history()), {"PaletteName"});
    expect(ColorSpaceGenericType(), empty_element("ColorSpaceGeneric"), {"Name"});
    expect(ColorSpaceEmissiveGenericType(), empty_element("ColorSpaceEmissiveGeneric"), {"Name"});
    expect(DensityType(), element("Density", "1"), {"DensityStatus", "DensityFilter"});
    expect(EmissiveSpectralPointType(), element("P", "1"), {"Wavelength"});
    expect(ReflectancePointType(), element("P", "1"), {"Wavelength"});
    expect(FloatingPointValueType(), element("V", "1"), {"AxisNominalMax", "AxisNominalMin"});
    expect(GlossCompensation(), element("G", "true"), {"CompensationValue"});
    expect(ProfileType(), empty_element("Profile"), {"Direction"});
}

TEST(Attribute, NamedNameIsOptionalOnTheOtherColorSpaces) {
    ColorSpaceCMYKType space;
    EXPECT_EQ(read_element(space, vrl_test::cmyk()).code, 0);
    EXPECT_FALSE(space.isset_Name());
    ColorSpaceGenericType generic;
    const std::string axis = element(
        "Axis", element("AxisName", "a") + element("AxisValueChoice", element("AxisStringValue", "v")));
    const std::string content = history() + vrl_test::spectrum_generic() + axis;
    EXPECT_EQ(read_element(generic, element("ColorSpaceGeneric", content)).code, 25);
    EXPECT_EQ(read_element(generic, element("ColorSpaceGeneric", content, " Name=\"n\"")).code, 0);
}

TEST(Attribute, ThatCannotBeReadIsReported) {
    ColorType color;
    const std::string xml = color_with(" ColorName=\"&undefined;\"");
    const auto refused = read_element(color, xml);
    EXPECT_EQ(refused.code, 28);
    EXPECT_EQ(refused.items(), std::vector<std::string>{"ColorName"});
    ColorType forgiven;
    const auto result = read_element(forgiven, xml, forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.reports.front().code, 28);
    EXPECT_EQ(result.reports.back().code, 25) << "its value stays unset, so it is missing";
    EXPECT_EQ(forgiven.size_ColorSpace(), 1u);
}

TEST(Attribute, IsCheckedLikeAChild) {
    const struct {
        const char* attributes;
        int code;
    } rows[] = {{" AveragingValue=\"2\"", 0},
                {" AveragingValue=\" 99 \"", 0},
                {" AveragingValue=\"1\"", 37},
                {" AveragingValue=\"100\"", 36},
                {" AveragingValue=\"x\"", 35},
                {" AveragingValue=\"\"", 35},
                {" AveragingValue=\"2.0\"", 35},
                {" AveragingValue=\"-3\"", 37},
                {" AveragingValue=\"99999999999999999999999999\"", 36}};
    for (const auto& row : rows) {
        Averaging averaging;
        EXPECT_EQ(read_element(averaging, element("Averaging", "1", row.attributes)).code, row.code)
            << row.attributes;
    }
    ReflectancePointType point;
    EXPECT_EQ(read_element(point, element("P", "1", " Wavelength=\"0\"")).code, 37);
    DensityType density;
    EXPECT_EQ(read_element(density, element("D", "1", " DensityStatus=\"Status_Z\"")).code, 38);
    CalibrationStateType state;
    const auto code = [&state](const std::string& time) {
        state.reset();
        return read_element(state,
                            element("C", "CalibrationState_NA", " CalibrationDateTime=\"" + time + "\""))
            .code;
    };
    EXPECT_EQ(code("2024-01-02T03:04:05"), 22);
    EXPECT_EQ(code("2024-01-02"), 35);
    EXPECT_EQ(code(" 2024-01-02T03:04:05+01:00 "), 0);
}

TEST(Attribute, KeepsWhatAForgivingHandlerLetsIn) {
    DensityType density;
    const auto result = read_element(
        density, element("D", "1", " DensityStatus=\"Status_Z\" DensityFilter=\"Filter_A\""), forgive);
    EXPECT_EQ(result.codes(), std::vector<int>{38});
    EXPECT_EQ(density.get_DensityStatus(), L"Status_Z");
    EXPECT_EQ(density.getenum_DensityStatus(), 0);
    EXPECT_TRUE(density.is_occurs_ok());
}

TEST(Attribute, KeepsItsWhiteSpaceWhereItIsText) {
    ColorType color;
    EXPECT_EQ(read_element(color, color_with(" ColorName=\"  a  b\tc&#10;d \"")).code, 0);
    EXPECT_EQ(color.get_ColorName(), L"  a  b\tc\nd ");
}

TEST(End, OfAnotherNameIsBad) {
    const auto refused = [](const std::string& xml) {
        Preamble preamble;
        return read_element(preamble, xml);
    };
    const auto result = refused("<Vrl:Preamble>" + vrl_test::header() + "</Vrl:Other>");
    EXPECT_EQ(result.code, 10);
    EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Preamble"}) << "the element that is open";
    EXPECT_EQ(refused("<Vrl:Preamble>" + vrl_test::header() + "</Preamble>").code, 10);
    Density density;
    EXPECT_EQ(read_element(density, "<Vrl:Density>1</Vrl:Density2>").code, 10);
    EXPECT_EQ(read_element(density, "<Vrl:Density>1<Vrl:x/></Vrl:Density>").code, 10);
    EXPECT_EQ(read_element(density, "<Vrl:Density>1</Vrl:Density >").code, 0);
}

TEST(End, OfAnotherNameIsBadBehindNoContentToo) {
    OwnerType owner;
    EXPECT_EQ(read_element(owner, "<Vrl:Owner></Vrl:Other>").code, 10) << "though it may be empty";
    Standard standard;
    EXPECT_EQ(read_element(standard, "<Vrl:Standard xsi:nil=\"true\"></Vrl:Other>").code, 10);
    Density density;
    EXPECT_EQ(read_element(density, "<Vrl:Density xsi:nil=\"true\"></Vrl:Other>").code, 10);
    SDKVersion version;
    EXPECT_EQ(read_element(version, "<Vrl:SDKVersion></Vrl:Other>").code, 10);
}

TEST(End, IsBadWhereAStrangerStands) {
    Vrl document;
    const auto result = vrl_test::read_document(document, vrl_test::document("<Vrl:Stranger/>"));
    EXPECT_EQ(result.code, 10);
    EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Vrl"});
    OwnerType owner;
    EXPECT_EQ(read_element(owner, element("Owner", "text")).code, 10) << "text where elements are";
    EXPECT_EQ(read_element(owner, element("Owner", "<!-- c --> <?pi?>\n")).code, 0);
    EXPECT_EQ(read_element(owner, element("Owner", element("Company", "c") + "text")).code, 10);
}

// Intended: nothing is skipped. What stands behind the stranger's name is read on as its parents' content,
// and ends them one by one.
TEST(Stranger, IsNotSkippedWhereTheHandlerForgives) {
    Vrl document;
    const std::string inside = element("Stranger", vrl_test::color("inside"));
    const auto result = vrl_test::read_document(
        document, vrl_test::document(vrl_test::color("a", inside) + vrl_test::color("b")), forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.codes(), (std::vector<int>{10, 10}));
    EXPECT_EQ(result.items(), (std::vector<std::string>{"Vrl:Color", "Vrl:Vrl"}));
    ASSERT_EQ(document.size_Color(), 1u);
    EXPECT_EQ(document.get_Color(0).size_ColorSpace(), 1u);
}

TEST(Report, TellsWhereInTheLibraryItWasRaised) {
    const auto file_of = [](auto object, const std::string& xml) {
        const auto result = read_element(object, xml);
        EXPECT_EQ(result.reports.size(), 1u);
        EXPECT_GT(result.reports.at(0).line, 0);
        return result.reports.at(0).file;
    };
    EXPECT_EQ(file_of(ColorSpaceCMYKType(), vrl_test::cmyk("x")), "V2/color_space.cpp");
    EXPECT_EQ(file_of(ColorType(), color_with("")), "V2/color.cpp");
    EXPECT_EQ(file_of(Preamble(), empty_element("Preamble")), "V2/document.cpp");
    EXPECT_EQ(file_of(Averaging(), element("A", "x", " AveragingValue=\"2\"")), "V2/device.cpp");
    EXPECT_EQ(file_of(FunctionDE94Type(), element("F", element("Param_l", "-1"))), "V2/quality_control.cpp");
    EXPECT_EQ(file_of(SubstrateGenericType(), element("S", element("Type", ""))), "V2/substrate.cpp");
    EXPECT_EQ(file_of(SpectrumType(), element("S", "x")), "V2/color_space_specification.cpp");
    EXPECT_EQ(file_of(Person(), element("P", element("ContactInfo", "x"))), "V2/common.cpp");
    Vrl document;
    const auto result = vrl_test::read_document(document, "<other/>");
    EXPECT_EQ(result.reports.at(0).file, "V2/document.cpp");
    EXPECT_GT(result.reports.at(0).line, 0);
}

}  // namespace
