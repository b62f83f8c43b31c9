#include <gtest/gtest.h>

#include <string>
#include <utility>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::forgive;
using vrl_test::read_element;
using vrl_test::write_inner_element;

TEST(NewChoice, HasMadeNoChoice) {
    EXPECT_EQ(AxisValueChoice().getchosen(), 2);
    EXPECT_EQ(ProfileChoice().getchosen(), 2);
    EXPECT_EQ(ValueChoice().getchosen(), 2);
    EXPECT_EQ(CustomAttributeType_ValueChoice().getchosen(), 3);
    EXPECT_EQ(ProfileType_Parameters_ValueChoice().getchosen(), 3);
    EXPECT_EQ(GeometryChoiceType().getchosen(), 3);
    EXPECT_EQ(IlluminationOptionsType().getchosen(), 3);
    EXPECT_FALSE(GeometryChoiceType().is_occurs_ok());
}

TEST(Choice, NumbersItsOptionsFromZero) {
    AxisValueChoice axis;
    axis.get_AxisFloatingPointValue();
    EXPECT_EQ(axis.getchosen(), 0);
    EXPECT_TRUE(axis.is_occurs_ok());
    axis.set_AxisStringValue(L"v");
    EXPECT_EQ(axis.getchosen(), 1);

    ProfileChoice profile;
    profile.get_ProfileFile();
    EXPECT_EQ(profile.getchosen(), 0);
    profile.set_ProfileURI(L"u");
    EXPECT_EQ(profile.getchosen(), 1);

    ValueChoice value;
    value.set_Double(1);
    EXPECT_EQ(value.getchosen(), 0);
    value.set_String(L"s");
    EXPECT_EQ(value.getchosen(), 1);

    CustomAttributeType_ValueChoice custom;
    custom.set_DoubleValue(1);
    EXPECT_EQ(custom.getchosen(), 0);
    custom.set_IntegerValue(1);
    EXPECT_EQ(custom.getchosen(), 1);
    custom.set_StringValue(L"s");
    EXPECT_EQ(custom.getchosen(), 2);

    ProfileType_Parameters_ValueChoice parameter;
    parameter.set_DoubleValue(1);
    EXPECT_EQ(parameter.getchosen(), 0);
    parameter.set_IntegerValue(1);
    EXPECT_EQ(parameter.getchosen(), 1);
    parameter.set_StringValue(L"s");
    EXPECT_EQ(parameter.getchosen(), 2);

    GeometryChoiceType geometry;
    geometry.set_SphereGeometry(L"Sphere_Included");
    EXPECT_EQ(geometry.getchosen(), 0);
    geometry.set_Angle(45);
    EXPECT_EQ(geometry.getchosen(), 1);
    geometry.set_UnknownGeometry(L"g");
    EXPECT_EQ(geometry.getchosen(), 2);

    IlluminationOptionsType light;
    light.get_Illuminant();
    EXPECT_EQ(light.getchosen(), 0);
    light.get_WhitePointChromaticity();
    EXPECT_EQ(light.getchosen(), 1);
    light.set_ColorTemperature(5000);
    EXPECT_EQ(light.getchosen(), 2);
}

TEST(Choice, KeepsTheOptionThatIsCurrent) {
    AxisValueChoice axis;
    axis.get_AxisFloatingPointValue().set_AxisNominalMax(5);
    EXPECT_EQ(axis.get_AxisFloatingPointValue().get_AxisNominalMax(), 5.0);
    axis.set_AxisStringValue(L"v");
    EXPECT_EQ(axis.get_AxisStringValue(), L"v");
    EXPECT_EQ(axis.get_AxisFloatingPointValue().get_AxisNominalMax(), 0.0) << "made new after another option";
}

TEST(Choice, AssignsThroughTheMutableGetter) {
    Illuminant illuminant;
    illuminant.set_Illuminant(L"Illuminant_D65");
    IlluminationOptionsType light;
    light.set_ColorTemperature(6500);
    Illuminant& mine = light.assign_Illuminant(illuminant);
    EXPECT_EQ(light.getchosen(), IlluminationOptionsType::chosen_Illuminant);
    EXPECT_EQ(&mine, &light.get_Illuminant());
    EXPECT_EQ(mine.get_Illuminant(), L"Illuminant_D65");
}

TEST(Choice, LooksAtAnOptionThatIsNotCurrentWithoutMoving) {
    IlluminationOptionsType light;
    light.set_ColorTemperature(6500);
    const IlluminationOptionsType& looked_at = light;
    EXPECT_EQ(looked_at.get_Illuminant().get_Illuminant(), L"");
    EXPECT_EQ(looked_at.get_WhitePointChromaticity().get_CoordinateX(), 0.0);
    EXPECT_EQ(light.getchosen(), IlluminationOptionsType::chosen_ColorTemperature);
}

// Intended: the setter of an option moves the choice before it checks the value.
TEST(Choice, MovesBeforeTheValueIsChecked) {
    GeometryChoiceType geometry;
    geometry.set_Angle(45);
    EXPECT_EQ(geometry.set_UnknownGeometry(L""), 20);
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_UnknownGeometry);
    EXPECT_EQ(geometry.get_UnknownGeometry(), L"");

    geometry.set_UnknownGeometry(L"text");
    EXPECT_EQ(geometry.set_SphereGeometry(L"Sphere_Nonsense"), 38);
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_SphereGeometry);
    EXPECT_EQ(geometry.get_SphereGeometry(), L"");
    EXPECT_EQ(geometry.getenum_SphereGeometry(), 0);

    IlluminationOptionsType light;
    light.get_Illuminant();
    EXPECT_EQ(light.set_ColorTemperature(2147483648u), 36);
    EXPECT_EQ(light.getchosen(), IlluminationOptionsType::chosen_ColorTemperature);
    EXPECT_EQ(light.get_ColorTemperature(), 0u);
}

TEST(Choice, KeepsAValueWhereTheNewOneIsRefusedForTheSameOption) {
    GeometryChoiceType geometry;
    geometry.set_UnknownGeometry(L"text");
    EXPECT_EQ(geometry.set_UnknownGeometry(L""), 20);
    EXPECT_EQ(geometry.get_UnknownGeometry(), L"text");
}

TEST(Choice, IsNotMovedByANumberOutsideTheEnumeration) {
    GeometryChoiceType geometry;
    geometry.set_Angle(45);
    EXPECT_FALSE(geometry.setenum_SphereGeometry(static_cast<GeometryChoiceType::Eenum_SphereGeometry>(3)));
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_Angle);
    EXPECT_TRUE(geometry.setenum_SphereGeometry(static_cast<GeometryChoiceType::Eenum_SphereGeometry>(2)));
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_SphereGeometry);
    EXPECT_EQ(geometry.get_SphereGeometry(), L"Sphere_Excluded");
}

TEST(Choice, WithAnAttributeKeepsItThroughAllOptions) {
    IlluminationOptionsType light;
    EXPECT_EQ(light.set_Description(L"d"), 0);
    light.set_ColorTemperature(6500);
    EXPECT_EQ(write_inner_element(light, "Vrl:X").text,
              "<Vrl:X Description=\"d\">\n\t<Vrl:ColorTemperature>6500</Vrl:ColorTemperature>\n</Vrl:X>\n");
    light.get_WhitePointChromaticity();
    EXPECT_TRUE(light.isset_Description());

    IlluminationOptionsType read;
    const std::string xml =
        element("IlluminationOptions", element("ColorTemperature", "6500"), " Description=\"d\"");
    EXPECT_EQ(read_element(read, xml).code, 0);
    EXPECT_EQ(read.get_Description(), L"d");
    EXPECT_EQ(read.get_ColorTemperature(), 6500u);
}

TEST(Choice, WithoutAChoiceIsNotWritten) {
    for (const auto& result : {write_inner_element(AxisValueChoice(), "Vrl:X"),
                               write_inner_element(IlluminationOptionsType(), "Vrl:X")}) {
        EXPECT_EQ(result.code, 46);
        EXPECT_EQ(result.text, "");
    }
}

/// Opens the step behind the cardinality test.
template <class Choice>
struct opened : Choice {
    using Choice::marshal_child_elements;
};

/// Notes what it is told, and answers as it is told.
class noting_writer : public qbxV2::c_xml_writer {
public:
    noting_writer(std::ostream& os, qbxV2::eqbx_error reply) : c_xml_writer(os, "\t", "\n"), m_reply(reply) {}
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error error, const std::string& item, const char* file,
                                        int line) override {
        noted = std::to_string(error) + " " + item + " " + file + (line > 0 ? " line" : " nowhere");
        return m_reply;
    }
    std::string noted;

private:
    qbxV2::eqbx_error m_reply;
};

template <class Choice>
void expect_impossible_state(const std::string& note) {
    std::ostringstream os;
    noting_writer refusing(os, qbxV2::EQBX_USER_ERROR_3);
    EXPECT_EQ(opened<Choice>().marshal_child_elements(refusing), 1002);
    EXPECT_EQ(refusing.noted, note);
    noting_writer forgiving(os, qbxV2::EQBX_NO_ERROR);
    EXPECT_EQ(opened<Choice>().marshal_child_elements(forgiving), 0);
    EXPECT_EQ(os.str(), "");
}

TEST(Choice, InAnImpossibleStateAsksTheWritersHandler) {
    expect_impossible_state<AxisValueChoice>("7 Vrl:AxisValueChoice V2/common.cpp line");
    expect_impossible_state<ProfileChoice>("7 Vrl:ProfileChoice V2/common.cpp line");
    expect_impossible_state<CustomAttributeType_ValueChoice>(
        "7 Vrl:CustomAttributeType_ValueChoice V2/common.cpp line");
    expect_impossible_state<ProfileType_Parameters_ValueChoice>(
        "7 Vrl:ProfileType_Parameters_ValueChoice V2/common.cpp line");
    expect_impossible_state<GeometryChoiceType>("7 Vrl:GeometryChoiceType V2/device.cpp line");
    expect_impossible_state<IlluminationOptionsType>(
        "7 Vrl:IlluminationOptionsType V2/color_space_specification.cpp line");
    expect_impossible_state<ValueChoice>("7 Vrl:ValueChoice V2/quality_control.cpp line");
}

TEST(ReadChoice, TakesTheOptionThatIsThere) {
    CustomAttributeType_ValueChoice value;
    EXPECT_EQ(read_element(value, element("ValueChoice", element("IntegerValue", " -7 "))).code, 0);
    EXPECT_EQ(value.getchosen(), 1);
    EXPECT_EQ(value.get_IntegerValue(), -7);
    EXPECT_EQ(read_element(value, element("ValueChoice", element("StringValue", " s "))).code, 0);
    EXPECT_EQ(value.getchosen(), 2) << "a second reading chooses anew";
    EXPECT_EQ(value.get_StringValue(), L" s ");
}

TEST(ReadChoice, HasMovedWhereTheValueIsRefused) {
    GeometryChoiceType geometry;
    EXPECT_EQ(read_element(geometry, element("GeometryChoice", element("SphereGeometry", "x"))).code, 38);
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_SphereGeometry);
    EXPECT_EQ(geometry.get_SphereGeometry(), L"x") << "stored before it is checked";
}

TEST(ReadChoice, ReportsWhatIsNoOption) {
    GeometryChoiceType geometry;
    const auto refused = read_element(geometry, element("GeometryChoice", element("Cyan", "1")));
    EXPECT_EQ(refused.code, 31);
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_none);
    const auto forgiven = read_element(geometry, element("GeometryChoice", element("Cyan", "1")), forgive);
    EXPECT_EQ(forgiven.code, 0);
    EXPECT_EQ(forgiven.codes(), (std::vector<int>{31, 10})) << "the body ends, and so does the element";
    EXPECT_EQ(geometry.getchosen(), GeometryChoiceType::chosen_none);
}

TEST(ReadChoice, ReportsThatItIsEmpty) {
    for (const std::string& xml : {empty_element("GeometryChoice"), element("GeometryChoice", "")}) {
        GeometryChoiceType geometry;
        EXPECT_EQ(read_element(geometry, xml).code, 32) << xml;
        IlluminationOptionsType light;
        EXPECT_EQ(read_element(light, xml).code, 32) << xml;
    }
}

TEST(ReadChoice, AllowsOneOptionOnly) {
    GeometryChoiceType geometry;
    const std::string xml = element("GeometryChoice", element("Angle", "1") + element("Angle", "2"));
    EXPECT_EQ(read_element(geometry, xml).code, 10);
    EXPECT_EQ(geometry.get_Angle(), 1.0);
}

}  // namespace
