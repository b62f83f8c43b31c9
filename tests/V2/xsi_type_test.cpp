#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

/// The one element whose class is told by `xsi:type`, the identity that writing it arms, and the factories.
namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::read_element;
using vrl_test::tolerance;

constexpr const char* k_function_types[] = {"FunctionGenericType",        "FunctionDEType",
                                            "FunctionMeanDEType",         "FunctionDE94Type",
                                            "FunctionDE2000Type",         "FunctionDEcmcType",
                                            "FunctionStdDevXType",        "FunctionStdDevYType",
                                            "FunctionStdDevZType",        "FunctionStdDevLType",
                                            "FunctionStdDevAType",        "FunctionStdDevBType",
                                            "FunctionStdDevCType",        "FunctionStdDevHType",
                                            "FunctionAverageStdDevLType", "FunctionAverageStdDevAType",
                                            "FunctionAverageStdDevBType"};

/// What the class of that name needs beside what it inherits.
std::string required_of(const std::string& type) {
    if (type == "FunctionGenericType") return element("Name", "n");
    std::string parameters;
    if (type == "FunctionDE94Type" || type == "FunctionDE2000Type" || type == "FunctionDEcmcType") {
        parameters = element("Param_l", "2") + element("Param_c", "1");
    }
    if (type == "FunctionDE94Type" || type == "FunctionDE2000Type") parameters += element("Param_h", "1");
    return parameters;
}

TEST(Function, HasTheClassThatItsTypeNames) {
    for (const char* type : k_function_types) {
        ToleranceType read;
        const std::string attribute = std::string(" xsi:type=\"Vrl:") + type + "\"";
        const std::string xml = tolerance(element("Function", required_of(type), attribute));
        ASSERT_EQ(read_element(read, xml).code, 0) << type;
        ASSERT_EQ(read.get_Function().getchosen(), sg_Function::chosen_Function) << type;
        EXPECT_STREQ(read.get_Function().get_Function().getid(), type);
        const auto again = vrl_test::write_inner_element(read, "Vrl:Tolerance");
        EXPECT_EQ(again.code, 0) << type;
        const std::string start = "<Vrl:Tolerance>\n\t<Vrl:Function" + attribute + ">\n";
        EXPECT_EQ(again.text.substr(0, start.size()), start);
    }
}

TEST(Function, FindsItsTypeThroughAnyPrefixOfTheNamespace) {
    for (const char* attributes :
         {" xmlns:f=\"urn:vrl:document/v2\" xsi:type=\"f:FunctionDEType\"",
          " xmlns=\"urn:vrl:document/v2\" xsi:type=\"FunctionDEType\"",
          " xmlns:i=\"http://www.w3.org/2001/XMLSchema-instance\" i:type=\"Vrl:FunctionDEType\""}) {
        ToleranceType read;
        EXPECT_EQ(read_element(read, tolerance(empty_element("Function", attributes))).code, 0) << attributes;
        EXPECT_STREQ(read.get_Function().get_Function().getid(), "FunctionDEType") << attributes;
    }
}

// Intended: this code does not go through the error handler, so no handler can forgive it.
TEST(Function, OfNoKnownTypeIsRefusedWhateverTheHandlerSays) {
    for (const char* attribute :
         {"", " xsi:type=\"Vrl:Nonsense\"", " xsi:type=\"Vrl:FunctionType\"",
          " xsi:type=\"Vrl:SubstratePaperType\"", " xsi:type=\"FunctionDEType\"",
          " xmlns:f=\"urn:other\" xsi:type=\"f:FunctionDEType\"", " xsi:type=\"f:FunctionDEType\"",
          " xsi:type=\"\"", " xsi:nil=\"true\"", " type=\"Vrl:FunctionDEType\""}) {
        ToleranceType read;
        const auto result =
            read_element(read, tolerance(empty_element("Function", attribute)), vrl_test::forgive);
        EXPECT_EQ(result.code, 44) << attribute;
        EXPECT_TRUE(result.reports.empty()) << attribute;
        EXPECT_EQ(read.get_Function().getchosen(), sg_Function::chosen_none) << attribute;
    }
}

TEST(XsiType, IsPassedOverOnOtherElements) {
    ToleranceType read;
    EXPECT_EQ(read_element(read, tolerance(empty_element("FunctionDE", " xsi:type=\"Vrl:Nonsense\""))).code,
              0);
    EXPECT_EQ(read.get_Function().getchosen(), sg_Function::chosen_FunctionDE);
    OwnerType owner;
    EXPECT_EQ(read_element(owner, empty_element("Owner", " xsi:type=\"Vrl:FunctionDEType\"")).code, 0);
}

TEST(XsiType, IsNotWrittenUnderAMembersOwnName) {
    ToleranceType object;
    object.get_Function().get_FunctionDE();
    EXPECT_EQ(vrl_test::write_inner_element(object, "Vrl:Tolerance").text,
              "<Vrl:Tolerance>\n\t<Vrl:FunctionDE>\n\t</Vrl:FunctionDE>\n</Vrl:Tolerance>\n");
}

TEST(XsiType, IsNotWrittenForTheHeadsOwnClass) {
    ToleranceType object;
    object.get_Function().get_Function().set_Result(1.5);
    EXPECT_EQ(vrl_test::write_inner_element(object, "Vrl:Tolerance").text,
              "<Vrl:Tolerance>\n\t<Vrl:Function>\n\t\t<Vrl:Result>1.5</Vrl:Result>\n"
              "\t</Vrl:Function>\n</Vrl:Tolerance>\n");
}

// Intended: an object of the head's own class leaves the expectation armed, for the next different class.
TEST(XsiType, StaysArmedBehindTheHeadsOwnClassForTheNextDifferentOne) {
    Standard standard;
    complete(standard);
    standard.get_Tolerance(0).get_Function().get_Function();
    standard.get_Tolerance(1).get_Function().get_FunctionDE();
    standard.get_Tolerance(2).get_Function().get_FunctionDE();
    const auto result = vrl_test::write_inner_element(standard, "Vrl:Standard");
    ASSERT_EQ(result.code, 0);
    EXPECT_NE(
        result.text.find("\t<Vrl:Tolerance>\n\t\t<Vrl:Function>\n\t\t</Vrl:Function>\n\t</Vrl:Tolerance>\n"
                         "\t<Vrl:Tolerance>\n"
                         "\t\t<Vrl:FunctionDE xsi:type=\"Vrl:FunctionDEType\">\n\t\t</Vrl:FunctionDE>\n"
                         "\t</Vrl:Tolerance>\n"
                         "\t<Vrl:Tolerance>\n\t\t<Vrl:FunctionDE>\n\t\t</Vrl:FunctionDE>\n"),
        std::string::npos)
        << result.text;
}

TEST(XsiType, StaysArmedAcrossFamilies) {
    ColorQualityControlType control;
    control.append_ChangeHistory(vrl_test::time());
    StandardAndMeasurementType& pair = control.get_StandardAndMeasurement(0);
    complete(pair.get_Standard());
    pair.get_Standard().get_Tolerance(0).get_Function().get_Function();
    SampleSpotType& sample = control.get_PhysicalSample().get_Sample().get_SampleSpot();
    sample.get_Substrate().get_SubstratePaper();
    sample.get_Specification().set_SampleWidth(1);
    sample.get_Specification().set_SampleHeight(2);
    const auto result = vrl_test::write_inner_element(control, "Vrl:C");
    ASSERT_EQ(result.code, 0);
    EXPECT_NE(
        result.text.find("<Vrl:SampleSpot xsi:type=\"Vrl:SampleSpotType\">\n\t\t\t<Vrl:SubstratePaper>\n"),
        std::string::npos)
        << result.text;
}

TEST(XsiType, IsDisarmedByBeingWritten) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.conditionally_select_ns_map(document_namespaces());
    out.conditionally_write_ns_attrs(true);
    out.set_expected_class_identity(SubstrateType::id);
    os.str("");
    EXPECT_EQ(SubstrateFilmType().marshal(out, "Vrl:a"), 0);
    EXPECT_EQ(out.get_expected_class_identity(), nullptr);
    EXPECT_EQ(SubstrateFilmType().marshal(out, "Vrl:b"), 0);
    EXPECT_EQ(os.str(), "<Vrl:a xsi:type=\"Vrl:SubstrateFilmType\"></Vrl:a><Vrl:b></Vrl:b>");
}

TEST(XsiType, OfAnElementClassIsItsTypes) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.conditionally_select_ns_map(document_namespaces());
    out.conditionally_write_ns_attrs(true);
    out.set_expected_class_identity(SubstrateFilmType::id);
    os.str("");
    EXPECT_EQ(SubstrateFilm().marshal(out, "Vrl:a"), 0);
    EXPECT_EQ(out.get_expected_class_identity(), SubstrateFilmType::id) << "equal: stays as it was";
    EXPECT_EQ(os.str(), "<Vrl:a></Vrl:a>");
}

TEST(XsiType, StandsBetweenNamespacesAndAttributes) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.set_expected_class_identity(ColorSpaceType::id);
    ColorSpaceCMYKType space;
    complete(space);
    space.set_Name(L"n");
    EXPECT_EQ(space.marshal(out, "Vrl:a"), 0);
    const std::string start =
        "<Vrl:a" + vrl_test::k_namespaces + " xsi:type=\"Vrl:ColorSpaceCMYKType\" Name=\"n\">";
    EXPECT_EQ(os.str().substr(0, start.size()), start);
}

TEST(XsiType, IsNotWrittenForAClassOutsideTheFamilies) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.set_expected_class_identity(SubstrateFilmType::id);
    EXPECT_EQ(OwnerType().marshal(out, "Vrl:a"), 0);
    EXPECT_EQ(out.get_expected_class_identity(), SubstrateFilmType::id);
    EXPECT_EQ(os.str(), "<Vrl:a" + vrl_test::k_namespaces + "></Vrl:a>");
}

template <class Head>
std::string made(const std::string& name, int ns_id = k_document_namespace_id) {
    const std::unique_ptr<Head> object(Head::factory(ns_id, name));
    return object == nullptr ? "" : object->getid();
}

TEST(Factory, MakesTheClassOfThatName) {
    for (const char* type : k_function_types) EXPECT_EQ(made<FunctionType>(type), type);
    for (const char* type : {"ColorSpaceCMYKType", "ColorSpaceRecipeType", "ColorSpaceMunsellType"}) {
        EXPECT_EQ(made<ColorSpaceType>(type), type);
    }
    for (const char* type : {"SubstratePaperType", "SubstrateTextileType"}) {
        EXPECT_EQ(made<SubstrateType>(type), type);
    }
    for (const char* type : {"SampleSpotType", "SampleTargetType"}) EXPECT_EQ(made<SampleType>(type), type);
    for (const char* type :
         {"ColorSpaceSpecificationSpectrumType", "ColorSpaceSpecificationEmissiveType",
          "ColorSpaceSpecificationSpectrumGenericType", "ColorSpaceSpecificationEmissiveSpectralType"}) {
        EXPECT_EQ(made<ColorSpaceSpecificationType>(type), type);
    }
    EXPECT_EQ(made<ColorSpaceSpecificationSpectrumType>("ColorSpaceSpecificationSpectrumTristimulusType"),
              "ColorSpaceSpecificationSpectrumTristimulusType");
    EXPECT_EQ(made<ColorSpaceSpecificationEmissiveType>("ColorSpaceSpecificationEmissiveGenericType"),
              "ColorSpaceSpecificationEmissiveGenericType");
}

TEST(Factory, DoesNotMakeTheHead) {
    EXPECT_EQ(made<FunctionType>("FunctionType"), "");
    EXPECT_EQ(made<ColorSpaceType>("ColorSpaceType"), "");
    EXPECT_EQ(made<SubstrateType>("SubstrateType"), "");
    EXPECT_EQ(made<SampleType>("SampleType"), "");
    EXPECT_EQ(made<ColorSpaceSpecificationType>("ColorSpaceSpecificationType"), "");
    EXPECT_EQ(made<ColorSpaceSpecificationSpectrumType>("ColorSpaceSpecificationSpectrumType"), "");
    EXPECT_EQ(made<ColorSpaceSpecificationEmissiveType>("ColorSpaceSpecificationEmissiveType"), "");
}

TEST(Factory, MakesNothingOfAStranger) {
    EXPECT_EQ(made<FunctionType>("SubstratePaperType"), "");
    EXPECT_EQ(made<FunctionType>(""), "");
    EXPECT_EQ(made<FunctionType>("FunctionDE94"), "") << "an element is no type";
    EXPECT_EQ(made<FunctionType>("functionde94type"), "");
    EXPECT_EQ(made<ColorSpaceSpecificationSpectrumType>("ColorSpaceSpecificationEmissiveGenericType"), "");
    for (const int ns_id : {0, 1, 5, 999, 1001}) EXPECT_EQ(made<FunctionType>("FunctionDEType", ns_id), "");
}

}  // namespace
