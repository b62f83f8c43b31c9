#include <gtest/gtest.h>

#include <limits>

#include "tests/V2/documents.h"

namespace {

using namespace vrl_v2;

TEST(NewDocument, HasPreambleAndHeaderPresentWithTheReadingLibrary) {
    const Vrl document;
    EXPECT_TRUE(document.is_occurs_ok());
    const Header& header = document.get_Preamble().get_Header();
    ASSERT_TRUE(header.isset_ReadSDKInformation());
    EXPECT_EQ(header.get_ReadSDKInformation().get_SDKName(), L"Vrl2-QBX-3.7.6");
    EXPECT_EQ(header.get_ReadSDKInformation().get_SDKVersion().get_SDKVersion(), L"1.0");
    EXPECT_TRUE(header.get_ReadSDKInformation().is_occurs_ok());
    EXPECT_FALSE(header.isset_WriteSDKInformation());
    EXPECT_TRUE(document.get_Preamble().is_occurs_ok()) << "Header is present";
    EXPECT_FALSE(header.is_occurs_ok()) << "and not complete";
    EXPECT_EQ(document.size_Color(), 0u);
    EXPECT_EQ(document.size_Palette(), 0u);
    EXPECT_EQ(document.size_ColorQualityControl(), 0u);
}

TEST(NewDocument, IsSeededByResetAndByEveryConstructor) {
    const std::wstring library = L"Vrl2-QBX-3.7.6";
    Vrl document;
    document.get_Preamble().get_Header().get_ReadSDKInformation().set_SDKName(L"other");
    document.reset();
    EXPECT_EQ(document.get_Preamble().get_Header().get_ReadSDKInformation().get_SDKName(), library);

    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    const Vrl from_text(std::string("<"), &error);
    EXPECT_NE(error, 0);
    EXPECT_EQ(from_text.get_Preamble().get_Header().get_ReadSDKInformation().get_SDKName(), library);
    const Vrl from_bytes("<", 1u, &error);
    EXPECT_EQ(from_bytes.get_Preamble().get_Header().get_ReadSDKInformation().get_SDKName(), library);
    const Vrl from_path("/nonexistent/a.vrl", &error);
    EXPECT_EQ(error, 1);
    EXPECT_EQ(from_path.get_Preamble().get_Header().get_ReadSDKInformation().get_SDKName(), library);
}

TEST(NewDocument, IsPresentInItsPreambleAfterResetToo) {
    Vrl document;
    document.reset();
    EXPECT_TRUE(document.is_occurs_ok());
    document.get_Preamble();
    EXPECT_TRUE(document.is_occurs_ok());
}

TEST(OptionalValue, KeepsItsTextWhenUnset) {
    ColorSpaceCMYKType space;
    EXPECT_FALSE(space.isset_Name());
    EXPECT_EQ(space.set_Name(L"name"), 0);
    EXPECT_TRUE(space.isset_Name());
    space.unset_Name();
    EXPECT_FALSE(space.isset_Name());
    EXPECT_EQ(space.get_Name(), L"name");
}

TEST(OptionalObject, IsPresentOnceAMutableReferenceWasAskedFor) {
    Preamble preamble;
    EXPECT_FALSE(preamble.isset_Owner());
    std::as_const(preamble).get_Owner();
    EXPECT_FALSE(preamble.isset_Owner());
    preamble.get_Owner();
    EXPECT_TRUE(preamble.isset_Owner());
}

TEST(OptionalObject, StaysAsItIsWhenUnset) {
    Preamble preamble;
    preamble.get_Owner().append_Company(L"company");
    preamble.unset_Owner();
    EXPECT_FALSE(preamble.isset_Owner());
    ASSERT_EQ(std::as_const(preamble).get_Owner().size_Company(), 1u);
    EXPECT_FALSE(preamble.isset_Owner()) << "looking does not make it present";
    EXPECT_EQ(preamble.get_Owner().get_Company(0), L"company");
    EXPECT_TRUE(preamble.isset_Owner());
}

TEST(RequiredObject, IsPresentOnceAMutableReferenceWasAskedFor) {
    Preamble preamble;
    EXPECT_FALSE(preamble.is_occurs_ok());
    std::as_const(preamble).get_Header();
    EXPECT_FALSE(preamble.is_occurs_ok());
    preamble.get_Header();
    EXPECT_TRUE(preamble.is_occurs_ok());
}

TEST(AssignedObject, IsPresentAndACopy) {
    OwnerType owner;
    owner.append_Company(L"company");
    Preamble preamble;
    OwnerType& mine = preamble.assign_Owner(owner);
    EXPECT_TRUE(preamble.isset_Owner());
    EXPECT_EQ(&mine, &preamble.get_Owner());
    EXPECT_NE(&mine, &owner);
    owner.set_Company(0, L"other");
    EXPECT_EQ(mine.get_Company(0), L"company");
}

TEST(AssignedObject, MayBeItself) {
    Preamble preamble;
    preamble.get_Owner().append_Company(L"company");
    preamble.assign_Owner(preamble.get_Owner());
    ASSERT_EQ(preamble.get_Owner().size_Company(), 1u);
    EXPECT_EQ(preamble.get_Owner().get_Company(0), L"company");
}

TEST(RecursiveMember, IsAbsentUntilAskedFor) {
    ColorType color;
    EXPECT_FALSE(color.isset_Substrate());
    // Looking at what isn't there gives the default object instead of following a null pointer.
    EXPECT_EQ(std::as_const(color).get_Substrate().getchosen(), sg_Substrate::chosen_none);
    EXPECT_FALSE(color.isset_Substrate());
    color.get_Substrate().get_SubstratePaper().get_Color().set_ColorName(L"inner");
    EXPECT_TRUE(color.isset_Substrate());
    EXPECT_TRUE(color.get_Substrate().get_SubstratePaper().isset_Color());

    SubstratePaperType paper;
    EXPECT_FALSE(paper.isset_Color());
    EXPECT_EQ(std::as_const(paper).get_Color().get_ColorName(), L"");
    paper.assign_Color(color);
    EXPECT_TRUE(paper.isset_Color());
    paper.unset_Color();
    EXPECT_FALSE(paper.isset_Color());
}

TEST(ObjectList, GrowsWhenAskedForAnEntryBehindItsEnd) {
    Vrl document;
    document.get_Color(5).set_ColorName(L"sixth");
    EXPECT_EQ(document.size_Color(), 6u);
    EXPECT_EQ(document.get_Color(5).get_ColorName(), L"sixth");
    EXPECT_EQ(document.get_Color(4).get_ColorName(), L"");
}

TEST(ObjectList, LooksBehindItsEndWithoutGrowing) {
    const Vrl document;
    EXPECT_EQ(document.get_Color(5).get_ColorName(), L"") << "the default object: no entry is there";
    EXPECT_EQ(document.size_Color(), 0u);
}

std::wstring names(const Vrl& document) {
    std::wstring all;
    for (unsigned i = 0; i < document.size_Color(); ++i) all += document.get_Color(i).get_ColorName() + L",";
    return all;
}

Vrl with_colors(const std::wstring& each) {
    Vrl document;
    for (const wchar_t c : each) {
        EXPECT_EQ(document.append_Color(), 0);
        document.back_Color().set_ColorName(std::wstring(1, c));
    }
    return document;
}

TEST(ObjectList, InsertsBeforeAnEntryAndAppendsBehindTheEnd) {
    Vrl document = with_colors(L"abc");
    EXPECT_EQ(document.insert_Color(1), 0);
    EXPECT_EQ(names(document), L"a,,b,c,");
    EXPECT_EQ(document.insert_Color(99), 0);
    EXPECT_EQ(names(document), L"a,,b,c,,");
    EXPECT_EQ(document.insert_Color(0), 0);
    EXPECT_EQ(names(document), L",a,,b,c,,");
}

TEST(ObjectList, InsertedBehindThreeIsTheFourth) {
    Vrl document = with_colors(L"abc");
    document.insert_Color(99);
    ASSERT_EQ(document.size_Color(), 4u);
    EXPECT_EQ(document.get_Color(3).get_ColorName(), L"");
}

TEST(ObjectList, DeletesAnEntryAndClosesTheGap) {
    Vrl document = with_colors(L"abc");
    document.delete_Color(1);
    EXPECT_EQ(names(document), L"a,c,");
    document.clear_Color();
    EXPECT_EQ(document.size_Color(), 0u);
    document.clear_Color();
    EXPECT_EQ(document.size_Color(), 0u);
}

TEST(ObjectList, StaysInBoundsWhereThereIsNoEntry) {
    Vrl document = with_colors(L"a");
    document.delete_Color(7);
    EXPECT_EQ(names(document), L"a,");
    document.clear_Color();
    document.delete_Color(0);
    EXPECT_EQ(document.size_Color(), 0u);
    document.back_Color().set_ColorName(L"made");
    EXPECT_EQ(names(document), L"made,");
}

TEST(ObjectList, AssignsToAnEntryAndGrowsForIt) {
    Vrl document = with_colors(L"ab");
    ColorType color;
    color.set_ColorName(L"new");
    ColorType& second = document.assign_Color(1, color);
    EXPECT_EQ(&second, &document.get_Color(1));
    EXPECT_EQ(names(document), L"a,new,");
    document.assign_Color(3, color);
    EXPECT_EQ(names(document), L"a,new,,new,");
}

TEST(ObjectList, KeepsEntriesWhereTheyAreWhileItGrows) {
    Vrl document;
    document.append_Color();
    const ColorType* const first = &document.get_Color(0);
    for (int i = 0; i < 100; ++i) document.append_Color();
    EXPECT_EQ(first, &document.get_Color(0));
}

TEST(ValueList, OverwritesAppendsInsertsAndDeletes) {
    OwnerType owner;
    EXPECT_EQ(owner.append_Company(L"a"), 0);
    EXPECT_EQ(owner.set_Company(0, L"b"), 0);
    EXPECT_EQ(owner.size_Company(), 1u);
    EXPECT_EQ(owner.set_Company(9, L"c"), 0) << "behind the end is at the end";
    ASSERT_EQ(owner.size_Company(), 2u);
    EXPECT_EQ(owner.get_Company(1), L"c");
    EXPECT_EQ(owner.insert_Company(1, L"d"), 0);
    EXPECT_EQ(owner.get_Company(1), L"d");
    EXPECT_EQ(owner.insert_Company(99, L"e"), 0);
    ASSERT_EQ(owner.size_Company(), 4u);
    EXPECT_EQ(owner.get_Company(3), L"e");
    owner.delete_Company(0);
    EXPECT_EQ(owner.get_Company(0), L"d");
    owner.clear_Company();
    EXPECT_EQ(owner.size_Company(), 0u);
}

TEST(Enumeration, NumbersItsLiteralsFromOne) {
    ColorAndFinish finish;
    EXPECT_EQ(finish.getenum_Finish(), 0) << "nothing is stored, nothing matches";
    EXPECT_TRUE(finish.setenum_Finish(static_cast<ColorAndFinish::Eenum_Finish>(2)));
    EXPECT_EQ(finish.get_Finish(), L"Finish_Uncoated");
    EXPECT_EQ(finish.getenum_Finish(), 2);
    EXPECT_EQ(finish.set_Finish(L"Finish_Matte"), 0);
    EXPECT_EQ(finish.getenum_Finish(), 3);
}

TEST(Enumeration, RefusesANumberOutsideItsList) {
    ColorAndFinish finish;
    finish.set_Finish(L"Finish_Coated");
    for (const int outside : {0, -1, 4, std::numeric_limits<int>::max()}) {
        EXPECT_FALSE(finish.setenum_Finish(static_cast<ColorAndFinish::Eenum_Finish>(outside))) << outside;
    }
    EXPECT_EQ(finish.get_Finish(), L"Finish_Coated");
}

TEST(Enumeration, OfAClassWithTextIsNamedAfterTheClass) {
    SpectrumType spectrum;
    EXPECT_EQ(spectrum.getenum_SpectrumType(), 0);
    EXPECT_TRUE(spectrum.setenum_SpectrumType(static_cast<SpectrumType::Eenum_SpectrumType>(4)));
    EXPECT_EQ(spectrum.get_SpectrumType(), L"Spectrum_Custom");
    EXPECT_EQ(spectrum.set_SpectrumType(L"Spectrum_Nonsense"), 38);
    EXPECT_EQ(spectrum.get_SpectrumType(), L"Spectrum_Custom");
    Averaging averaging;
    EXPECT_FALSE(averaging.isset_Averaging());
    EXPECT_EQ(averaging.set_Averaging(true), 0);
    EXPECT_TRUE(averaging.isset_Averaging());
    averaging.unset_Averaging();
    EXPECT_TRUE(averaging.get_Averaging());
}

TEST(Default, IsInStorageAndNotPresent) {
    FunctionDE94Type de94;
    EXPECT_EQ(de94.get_Param_l(), 2.0);
    EXPECT_EQ(de94.get_Param_c(), 1.0);
    EXPECT_EQ(de94.get_Param_h(), 1.0);
    EXPECT_FALSE(de94.is_occurs_ok()) << "each still has to be set";
    FunctionDE2000Type de2000;
    EXPECT_EQ(de2000.get_Param_l(), 2.0);
    EXPECT_EQ(de2000.get_Param_c(), 1.0);
    EXPECT_EQ(de2000.get_Param_h(), 1.0);
    EXPECT_FALSE(de2000.is_occurs_ok());
    FunctionDEcmcType cmc;
    EXPECT_EQ(cmc.get_Param_l(), 2.0);
    EXPECT_EQ(cmc.get_Param_c(), 1.0);
    EXPECT_FALSE(cmc.is_occurs_ok());
    cmc.set_Param_l(2.0);
    EXPECT_FALSE(cmc.is_occurs_ok());
    cmc.set_Param_c(1.0);
    EXPECT_TRUE(cmc.is_occurs_ok());
    FloatingPointValueType value;
    EXPECT_EQ(value.get_AxisNominalScale(), L"Scale_Linear");
    EXPECT_FALSE(value.isset_AxisNominalScale());
    EXPECT_EQ(value.getenum_AxisNominalScale(), 1);
}

TEST(Default, IsThereAgainAfterReset) {
    FunctionDE94 de94;
    de94.set_Param_l(7.0);
    de94.reset();
    EXPECT_EQ(de94.get_Param_l(), 2.0);
    EXPECT_FALSE(de94.is_occurs_ok());
}

TEST(AnyList, CopiesOutWhatIsAskedFor) {
    Revision revision;
    EXPECT_FALSE(revision.is_occurs_ok());
    EXPECT_EQ(revision.append_any("<a/>"), 0);
    EXPECT_EQ(revision.insert_any(0, "<b/>"), 0);
    EXPECT_EQ(revision.insert_any(99, "<c/>"), 0);
    ASSERT_EQ(revision.size_any(), 3u);
    EXPECT_TRUE(revision.is_occurs_ok());
    std::string ns = "x";
    std::string name = "x";
    std::string value;
    revision.get_any(0, &ns, &name, &value);
    EXPECT_EQ(ns, "");
    EXPECT_EQ(name, "");
    EXPECT_EQ(value, "<b/>");
    revision.get_any(2, nullptr, nullptr, &value);
    EXPECT_EQ(value, "<c/>");
    revision.delete_any(0);
    revision.get_any(0, nullptr, nullptr, &value);
    EXPECT_EQ(value, "<a/>");
    revision.clear_any();
    EXPECT_EQ(revision.size_any(), 0u);
}

TEST(Wrapper, HoldsOneAttributeAndIsRepeatedByItsOwner) {
    Colorant colorant;
    colorant.get_CustomAttributes(1).get_CustomAttribute().set_Name(L"key");
    EXPECT_EQ(colorant.size_CustomAttributes(), 2u);
    EXPECT_FALSE(colorant.get_CustomAttributes(0).is_occurs_ok());
    EXPECT_TRUE(colorant.get_CustomAttributes(1).is_occurs_ok());
}

}  // namespace
