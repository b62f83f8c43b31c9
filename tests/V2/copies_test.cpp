#include <gtest/gtest.h>

#include <memory>
#include <utility>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::element;

std::string text_of(const Vrl& document) {
    std::string text;
    EXPECT_EQ(document.marshal(&text), 0);
    return text;
}

Vrl rich() {
    Vrl document;
    EXPECT_EQ(document.unmarshal(vrl_test::rich_document()), 0);
    return document;
}

TEST(Copy, IsDeep) {
    Vrl document = rich();
    const std::string before = text_of(document);
    const Vrl copy(document);
    EXPECT_EQ(text_of(copy), before);
    document.get_Color(0).set_ColorName(L"changed");
    document.get_Color(0).get_ColorSpace(0).get_ColorSpaceCMYK().set_Black(1);
    document.get_Palette(0).get_ColorSet(0).clear_Color();
    document.get_Preamble().get_Header().set_Purpose(L"changed");
    document.clear_ColorQualityControl();
    EXPECT_EQ(text_of(copy), before);
}

TEST(Copy, OutlivesItsSource) {
    auto source = std::make_unique<Vrl>(rich());
    const std::string before = text_of(*source);
    const Vrl copy(*source);
    source.reset();
    EXPECT_EQ(text_of(copy), before);
}

TEST(Copy, OfARootHasItsPreamblePresent) {
    Preamble preamble;
    Vrl document;
    document.assign_Preamble(preamble);
    const Vrl copy(document);
    EXPECT_TRUE(copy.is_occurs_ok());
    EXPECT_TRUE(copy.get_Preamble().is_occurs_ok()) << "Header too: a required object is assigned";
    EXPECT_FALSE(copy.get_Preamble().get_Header().isset_ReadSDKInformation()) << "the source has none";
}

// Intended: a copy goes the way of the accessors, so required members become present.
TEST(Copy, HasRequiredMembersPresentWhereTheSourceHasNot) {
    const DeviceType device;
    EXPECT_FALSE(device.is_occurs_ok());
    EXPECT_TRUE(DeviceType(device).is_occurs_ok());
    const FunctionDE94Type function;
    EXPECT_FALSE(function.is_occurs_ok());
    const FunctionDE94Type copy(function);
    EXPECT_TRUE(copy.is_occurs_ok()) << "the defaults pass their facets";
    EXPECT_EQ(copy.get_Param_l(), 2.0);
    const Preamble preamble;
    EXPECT_FALSE(preamble.is_occurs_ok());
    EXPECT_TRUE(Preamble(preamble).is_occurs_ok());
    const WhitePointChromaticity white;
    EXPECT_TRUE(WhitePointChromaticity(white).is_occurs_ok());
}

TEST(Copy, LeavesARequiredValueBehindThatFailsItsFacet) {
    const SpotColorType spot;
    const SpotColorType copy(spot);
    EXPECT_FALSE(copy.is_occurs_ok()) << "the empty name is too short; the percentage passes";
    SpotColorType named(copy);
    named.set_Name(L"n");
    EXPECT_TRUE(named.is_occurs_ok());
    EXPECT_FALSE(DensityType(DensityType()).is_occurs_ok()) << "the empty text is no literal";
    EXPECT_FALSE(ReflectancePointType(ReflectancePointType()).is_occurs_ok()) << "no wavelength of 0";
}

TEST(Copy, LosesAValueThatOnlyAForgivingReaderLetIn) {
    ColorSpaceCMYKType space;
    const std::string xml = element("ColorSpaceCMYK", vrl_test::cmyk_content("150"));
    EXPECT_EQ(vrl_test::read_element(space, xml, vrl_test::forgive).code, 0);
    EXPECT_EQ(space.get_Black(), 150.0);
    const ColorSpaceCMYKType copy(space);
    EXPECT_EQ(copy.get_Black(), 0.0);
    EXPECT_EQ(copy.get_Yellow(), 30.0);
    EXPECT_FALSE(copy.is_occurs_ok());
}

TEST(Copy, TakesAnOptionalMemberOnlyWherePresent) {
    FloatingPointValueType value;
    value.set_AxisNominalScale(L"Scale_Log");
    EXPECT_EQ(FloatingPointValueType(value).get_AxisNominalScale(), L"Scale_Log");
    EXPECT_TRUE(FloatingPointValueType(value).isset_AxisNominalScale());
    value.unset_AxisNominalScale();
    EXPECT_EQ(FloatingPointValueType(value).get_AxisNominalScale(), L"Scale_Linear") << "the default again";
    EXPECT_FALSE(FloatingPointValueType(value).isset_AxisNominalScale());

    Preamble preamble;
    preamble.get_Owner().append_Company(L"company");
    preamble.unset_Owner();
    const Preamble copy(preamble);
    EXPECT_FALSE(copy.isset_Owner());
    EXPECT_EQ(copy.get_Owner().size_Company(), 0u);

    ColorType color;
    color.get_Substrate().get_SubstratePaper();
    EXPECT_TRUE(ColorType(color).isset_Substrate());
    color.unset_Substrate();
    EXPECT_FALSE(ColorType(color).isset_Substrate());
}

TEST(Copy, KeepsTheOrderOfLists) {
    OwnerType owner;
    for (const wchar_t* text : {L"a", L"b", L"c"}) owner.append_Company(text);
    const OwnerType copy(owner);
    ASSERT_EQ(copy.size_Company(), 3u);
    EXPECT_EQ(copy.get_Company(0), L"a");
    EXPECT_EQ(copy.get_Company(2), L"c");
    EXPECT_NE(&copy.get_Company(0), &owner.get_Company(0));
}

TEST(Copy, OfAChoiceKeepsStateAndAttribute) {
    IlluminationOptionsType options;
    options.set_Description(L"d");
    options.set_ColorTemperature(6504);
    const IlluminationOptionsType copy(options);
    EXPECT_EQ(copy.getchosen(), IlluminationOptionsType::chosen_ColorTemperature);
    EXPECT_EQ(copy.get_ColorTemperature(), 6504u);
    EXPECT_EQ(copy.get_Description(), L"d");
    EXPECT_EQ(IlluminationOptionsType(IlluminationOptionsType()).getchosen(),
              IlluminationOptionsType::chosen_none);
}

TEST(Copy, OfAChoiceMovesEvenWhereTheValueIsRefused) {
    GeometryChoiceType choice;
    EXPECT_EQ(choice.set_UnknownGeometry(L""), 20);
    const GeometryChoiceType copy(choice);
    EXPECT_EQ(copy.getchosen(), GeometryChoiceType::chosen_UnknownGeometry);
    EXPECT_EQ(copy.get_UnknownGeometry(), L"");
}

TEST(Copy, OfAGroupKeepsTheClassUnderTheHeadElement) {
    ToleranceType tolerance;
    const std::string xml =
        element("Tolerance", element("Function", element("Param_l", "2") + element("Param_c", "1"),
                                     " xsi:type=\"Vrl:FunctionDEcmcType\""));
    ASSERT_EQ(vrl_test::read_element(tolerance, xml).code, 0);
    const ToleranceType copy(tolerance);
    ASSERT_EQ(copy.get_Function().getchosen(), sg_Function::chosen_Function);
    EXPECT_STREQ(copy.get_Function().get_Function().getid(), FunctionDEcmcType::id);
    EXPECT_EQ(vrl_test::write_element(copy, "Vrl:Tolerance").text,
              vrl_test::write_element(tolerance, "Vrl:Tolerance").text);
    EXPECT_NE(&copy.get_Function().get_Function(), &tolerance.get_Function().get_Function());
}

template <class T>
void expect_nil_is_copied(void (T::*set_nil)(), bool (T::*is_nil)() const) {
    T object;
    (object.*set_nil)();
    EXPECT_TRUE((T(object).*is_nil)());
    T assigned;
    assigned = object;
    EXPECT_TRUE((assigned.*is_nil)());
    T swapped;
    swapped.swap(object);
    EXPECT_TRUE((swapped.*is_nil)());
    EXPECT_FALSE((object.*is_nil)());
    swapped.reset();
    EXPECT_FALSE((swapped.*is_nil)());
}

TEST(Copy, CarriesTheNilFlag) {
#define NIL(type) expect_nil_is_copied<type>(&type::setnil_##type, &type::isnil_##type)
    NIL(Density);
    NIL(DeviceFilter);
    NIL(DevicePolarization);
    NIL(SDKVersion);
    NIL(Standard);
    NIL(ParentColorSpace);
    NIL(ColorSpaceSpecificationSpectrumGeneric);
    NIL(ColorSpaceSpecificationSpectrumSpectral);
    NIL(ColorSpaceSpecificationSpectrumTristimulus);
    NIL(ColorSpaceSpecificationEmissiveGeneric);
    NIL(ColorSpaceSpecificationEmissiveSpectral);
    NIL(ColorSpaceSpecificationEmissiveTristimulus);
#undef NIL
}

TEST(Assignment, ReplacesEverything) {
    Vrl document = rich();
    Vrl other;
    complete(other);
    other.append_Palette();
    other = document;
    EXPECT_EQ(text_of(other), text_of(document));
    document = Vrl();
    EXPECT_EQ(document.size_Color(), 0u);
    EXPECT_FALSE(document.get_Preamble().get_Header().is_occurs_ok());
}

TEST(Assignment, ToItselfIsSafe) {
    Vrl document = rich();
    const std::string before = text_of(document);
    Vrl& same = document;
    document = same;
    EXPECT_EQ(text_of(document), before);
}

TEST(Assignment, ReturnsItsTarget) {
    ColorType a;
    const ColorType b;
    EXPECT_EQ(&(a = b), &a);
}

TEST(Swap, ExchangesEverything) {
    Vrl a = rich();
    Vrl b;
    complete(b);
    const std::string first = text_of(a);
    const std::string second = text_of(b);
    a.swap(b);
    EXPECT_EQ(text_of(a), second);
    EXPECT_EQ(text_of(b), first);
    a.swap(a);
    EXPECT_EQ(text_of(a), second);
}

TEST(Swap, ExchangesPresence) {
    ColorSpaceCMYKType a;
    complete(a);
    a.set_Name(L"a");
    ColorSpaceCMYKType b;
    a.swap(b);
    EXPECT_FALSE(a.is_occurs_ok());
    EXPECT_FALSE(a.isset_Name());
    EXPECT_TRUE(b.is_occurs_ok());
    EXPECT_TRUE(b.isset_Name());
}

TEST(Reset, GivesANewObject) {
    ColorType color;
    complete(color);
    color.get_Substrate().get_SubstratePaper().get_Color();
    color.reset();
    EXPECT_FALSE(color.is_occurs_ok());
    EXPECT_EQ(color.get_ColorName(), L"");
    EXPECT_EQ(color.size_ColorSpace(), 0u);
    EXPECT_EQ(color.size_ChangeHistory(), 0u);
    EXPECT_FALSE(color.isset_Substrate());

    Vrl document = rich();
    document.reset();
    Vrl fresh;
    complete(document);
    complete(fresh);
    EXPECT_EQ(text_of(document), text_of(fresh));
}

TEST(Clone, HasTheDynamicClass) {
    FunctionDE94Type function;
    function.set_Param_l(7);
    const FunctionType& base = function;
    const std::unique_ptr<FunctionType> copy(base.clone());
    EXPECT_EQ(copy->getid(), FunctionDE94Type::id);
    ASSERT_NE(dynamic_cast<FunctionDE94Type*>(copy.get()), nullptr);
    EXPECT_EQ(dynamic_cast<FunctionDE94Type&>(*copy).get_Param_l(), 7.0);
}

TEST(Clone, OfAnElementClassIsOfItsTypeClass) {
    ColorSpaceCMYK space;
    complete(space);
    const ColorSpaceType& base = space;
    const std::unique_ptr<ColorSpaceType> copy(base.clone());
    EXPECT_EQ(copy->getid(), ColorSpaceCMYKType::id);
    EXPECT_EQ(dynamic_cast<ColorSpaceCMYK*>(copy.get()), nullptr);
    EXPECT_NE(dynamic_cast<ColorSpaceCMYKType*>(copy.get()), nullptr);
}

TEST(Identity, IsComparedByPointer) {
    const ColorSpaceCMYKType space;
    EXPECT_STREQ(ColorSpaceCMYKType::id, "ColorSpaceCMYKType");
    EXPECT_STREQ(space.getid(), "ColorSpaceCMYKType");
    EXPECT_TRUE(space.has_id(ColorSpaceCMYKType::id));
    EXPECT_TRUE(space.has_id(ColorSpaceType::id)) << "of a base, too";
    EXPECT_FALSE(space.has_id(ColorSpaceSRGBType::id));
    EXPECT_FALSE(space.has_id(nullptr));
    const std::string equal_text = "ColorSpaceType";
    EXPECT_FALSE(space.has_id(equal_text.c_str()));
    const ColorSpaceCMYK as_element;
    EXPECT_EQ(as_element.getid(), ColorSpaceCMYKType::id) << "an element class has its type's identity";
    EXPECT_TRUE(as_element.has_id(ColorSpaceType::id));
    const ColorSpaceType head;
    EXPECT_FALSE(head.has_id(ColorSpaceCMYKType::id));
    const ColorSpaceSpecificationEmissiveSpectralType specification;
    EXPECT_TRUE(specification.has_id(ColorSpaceSpecificationEmissiveType::id));
    EXPECT_TRUE(specification.has_id(ColorSpaceSpecificationType::id));
    EXPECT_FALSE(specification.has_id(ColorSpaceSpecificationSpectrumType::id));
}

}  // namespace
