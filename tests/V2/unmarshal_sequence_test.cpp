#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"

/// The children of an element: which must be there, in which order, and where reading is lenient.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::empty_element;
using vrl_test::forgive;
using vrl_test::history;
using vrl_test::outcome;
using vrl_test::read_element;

using texts = std::vector<std::string>;

/// The items of all reports of one code.
texts items_of(const outcome& result, int code) {
    texts items;
    for (const auto& report : result.reports) {
        if (report.code == code) items.push_back(report.item);
    }
    return items;
}

TEST(Sequence, MissesEachRequiredElementByName) {
    const auto missed = [](auto object, const std::string& content) {
        return read_element(object, element("X", content)).items();
    };
    EXPECT_EQ(missed(Person(), element("ContactInfo", "c")), texts{"Vrl:Name"});
    EXPECT_EQ(missed(DeviceType(), element("Model", "m")), texts{"Vrl:Manufacturer"});
    EXPECT_EQ(missed(DeviceType(), element("Manufacturer", "m") + element("SerialNumber", "s")),
              texts{"Vrl:Model"});
    EXPECT_EQ(missed(DeviceType(), element("Manufacturer", "m") + element("Model", "m")),
              texts{"Vrl:SerialNumber"});
    EXPECT_EQ(missed(Preamble(), empty_element("Owner")), texts{"Vrl:Header"});
    EXPECT_EQ(missed(AxisType(), element("AxisName", "a")), texts{"Vrl:AxisValueChoice"});
    EXPECT_EQ(missed(SDKType(), element("SDKName", "n")), texts{"Vrl:SDKVersion"});
    EXPECT_EQ(missed(ColorSpaceCMYKType(), history() + vrl_test::spectrum_generic() + element("Cyan", "1")),
              texts{"Vrl:Magenta"});
}

// Intended: a name that is out of its order is no name that may follow, so everything behind is missed.
TEST(Sequence, InTheWrongOrderIsMissedFromTheFirstGapDown) {
    ColorSpaceCMYKType space;
    const std::string xml = element("ColorSpaceCMYK", history() + vrl_test::spectrum_generic() +
                                                          element("Cyan", "1") + element("Yellow", "3") +
                                                          element("Magenta", "2") + element("Black", "4"));
    EXPECT_EQ(read_element(space, xml).code, 21);
    ColorSpaceCMYKType forgiven;
    const outcome result = read_element(forgiven, xml, forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(items_of(result, 21), (texts{"Vrl:Magenta", "Vrl:Yellow", "Vrl:Black"}));
    EXPECT_EQ(items_of(result, 10), texts{"Vrl:ColorSpaceCMYK"});
    EXPECT_EQ(forgiven.get_Cyan(), 1.0);
    EXPECT_FALSE(forgiven.is_occurs_ok());
}

TEST(Sequence, StartingWithALaterElementIsMissedAltogether) {
    ColorSpaceCMYKType space;
    const outcome result = read_element(space, element("ColorSpaceCMYK", element("Black", "4")), forgive);
    EXPECT_EQ(items_of(result, 21),
              (texts{"Vrl:ChangeHistory", "Vrl:ColorSpaceType", "Vrl:ColorSpaceSpecificationSpectrumGeneric",
                     "Vrl:Cyan", "Vrl:Magenta", "Vrl:Yellow", "Vrl:Black"}));
    EXPECT_EQ(result.code, 0);
}

TEST(List, ThatNeedsAnEntryIsMissedAtItsPlaceAndAtTheEnd) {
    Header header;
    const std::string content =
        element("Creator", "c") + element("CreatorVersion", "1") + element("Purpose", "p");
    EXPECT_EQ(read_element(header, element("Header", content)).items(), texts{"Vrl:ChangeHistory"});

    PaletteType palette;
    const outcome result =
        read_element(palette, element("Palette", element("ColorSet", ""), " PaletteName=\"p\""), forgive);
    EXPECT_EQ(result.reports.front().item, "Vrl:ChangeHistory");
    EXPECT_EQ(items_of(result, 21), (texts{"Vrl:ChangeHistory", "Vrl:PaletteType"}));
}

TEST(List, OfTheHeaderIsMissedTwiceUnderTheHeadersName) {
    Header header;
    const outcome result = read_element(header, element("Header", "<Vrl:x/>"), forgive);
    EXPECT_EQ(items_of(result, 21),
              (texts{"Vrl:Creator", "Vrl:CreatorVersion", "Vrl:ChangeHistory", "Vrl:Purpose", "Vrl:Header"}));
}

// Intended: the colour spaces of a colour have no report at their place, only the one at the end.
TEST(List, OfColorSpacesIsMissedAtTheEndAlone) {
    ColorType color;
    const std::string xml = element("Color", history(), " ColorName=\"c\"");
    const outcome refused = read_element(color, xml);
    EXPECT_EQ(refused.code, 21);
    EXPECT_EQ(refused.items(), texts{"Vrl:ColorType"});
    color.reset();
    EXPECT_EQ(read_element(color, xml, forgive).items(), texts{"Vrl:ColorType"});
    color.reset();
    const outcome both = read_element(
        color, element("Color", vrl_test::empty_element("SubstratePaper"), " ColorName=\"c\""), forgive);
    EXPECT_EQ(items_of(both, 21), (texts{"Vrl:ChangeHistory", "Vrl:ColorType"})) << "one for both lists";
}

TEST(List, ThatNeedsAnEntryIsMissedUnderTheNameOfItsType) {
    const auto last_item = [](auto object, const std::string& content) {
        const outcome result = read_element(object, element("X", content), forgive);
        return result.reports.empty() ? std::string() : items_of(result, 21).back();
    };
    const std::string head = history() + vrl_test::spectrum_generic();
    EXPECT_EQ(last_item(ColorSpaceDensityType(), head), "Vrl:ColorSpaceDensityType");
    EXPECT_EQ(last_item(ColorSpaceRecipeType(), head), "Vrl:ColorSpaceRecipeType");
    EXPECT_EQ(last_item(Recipe(), "<Vrl:x/>"), "Vrl:Recipe");
    EXPECT_EQ(last_item(ColorQualityControlType(), history() + empty_element("PhysicalSample")),
              "Vrl:ColorQualityControlType");
}

TEST(List, IsReadInOrder) {
    OwnerType owner;
    const std::string xml =
        element("Owner", element("Person", element("Name", "p")) + element("Copyright", "a") +
                             element("Copyright", "b") + element("Company", "c") + element("Company", "d"));
    EXPECT_EQ(read_element(owner, xml).code, 0);
    ASSERT_EQ(owner.size_Copyright(), 2u);
    EXPECT_EQ(owner.get_Copyright(1), L"b");
    ASSERT_EQ(owner.size_Company(), 2u);
    EXPECT_EQ(owner.get_Company(0), L"c");
    EXPECT_EQ(read_element(owner, element("Owner", element("Company", "c") + element("Copyright", "a"))).code,
              10);
}

TEST(Element, OfOneOccurrenceStandsOnce) {
    DeviceType device;
    const std::string twice = element("Device", element("Manufacturer", "a") + element("Manufacturer", "b"));
    EXPECT_EQ(read_element(device, twice).code, 21) << "Model is missed";
    Person person;
    const std::string info = element("ContactInfo", "c");
    EXPECT_EQ(read_element(person, element("Person", element("Name", "n") + info + info)).code, 10);
}

TEST(Element, OfAnotherNamespaceIsAStranger) {
    Person person;
    const std::string other = "<o:Name xmlns:o=\"urn:other\">n</o:Name>";
    EXPECT_EQ(read_element(person, element("Person", other)).items(), texts{"Vrl:Name"});
    EXPECT_EQ(read_element(person, element("Person", "<Name>n</Name>")).items(), texts{"Vrl:Name"});
    EXPECT_EQ(
        read_element(person, element("Person", "<o:Name xmlns:o=\"urn:vrl:document/v2\">n</o:Name>")).code,
        0);
}

// Intended: what a group holds is demanded on writing only.
TEST(RequiredGroup, MayBeAbsentOnReading) {
    const auto read_and_write = [](auto object, const std::string& content) {
        EXPECT_EQ(read_element(object, element("X", content)).code, 0) << content;
        EXPECT_FALSE(object.is_occurs_ok());
        return vrl_test::write_inner_element(object, "Vrl:X").code;
    };
    EXPECT_EQ(read_and_write(ToleranceType(), element("PrimaryIlluminant", "Illuminant_A")), 46);
    EXPECT_EQ(read_and_write(PhysicalSampleType(), element("Coating", "c")), 46);
    EXPECT_EQ(read_and_write(SampleTargetType(), element("Target", "Target_Custom")), 46);
    EXPECT_EQ(read_and_write(ParentColorSpace(), ""), 46);
}

TEST(DeviceFilter, MayBeAbsentOnReading) {
    ColorSpaceSpecificationSpectrumGenericType specification;
    const std::string content = vrl_test::polarization() + history() + element("Spectrum", "Spectrum_Custom");
    EXPECT_EQ(read_element(specification, element("X", content)).code, 0);
    EXPECT_EQ(
        read_element(specification, element("X", history() + element("Spectrum", "Spectrum_Custom"))).items(),
        texts{"Vrl:DevicePolarization"})
        << "unlike its neighbour";
}

TEST(Substrate, MayHaveNoChildSaveTheGenericOne) {
    ColorType color;
    const auto code = [&color](const std::string& substrate) {
        color.reset();
        return read_element(color, vrl_test::color("c", substrate)).code;
    };
    for (const char* name : {"SubstratePaper", "SubstrateMetal", "SubstratePlastic", "SubstrateWood",
                             "SubstrateVinyl", "SubstrateTile", "SubstrateFilm", "SubstrateTextile"}) {
        EXPECT_EQ(code(empty_element(name)), 0) << name;
        EXPECT_EQ(code(element(name, "")), 0) << name;
        EXPECT_TRUE(color.isset_Substrate()) << name;
    }
    EXPECT_EQ(code(empty_element("SubstrateGeneric")), 32);
    EXPECT_EQ(code(element("SubstrateGeneric", element("PartNumber", "p"))), 21);
    EXPECT_EQ(code(element("SubstrateGeneric", element("Type", "t"))), 0);
    for (const char* head : {"Substrate", "ColorSpace", "Sample"}) {
        EXPECT_EQ(code(empty_element(head)), 10) << head << " cannot stand in a document";
    }
}

TEST(Revision, KeepsElementsOfAnyNameAsText) {
    Revision revision;
    const std::string xml =
        element("Revision",
                "<a x='1'> t <b/></a>\n <y:c xmlns:y=\"urn:y\">&amp;</y:c><Vrl:Owner/><d xmlns=\"urn:d\"/>");
    ASSERT_EQ(read_element(revision, xml).code, 0);
    ASSERT_EQ(revision.size_any(), 4u);
    const struct {
        std::string ns;
        std::string name;
    } expected[] = {{qbxV2::c_xml_reader::k_namespace_not_found, "a"},
                    {"urn:y", "y:c"},
                    {"urn:vrl:document/v2", "Vrl:Owner"},
                    {"urn:d", "d"}};
    for (unsigned i = 0; i < 4; ++i) {
        std::string ns;
        std::string name;
        std::string value;
        revision.get_any(i, &ns, &name, &value);
        EXPECT_EQ(ns, expected[i].ns) << i;
        EXPECT_EQ(name, expected[i].name) << i;
        EXPECT_EQ(value.find("<" + expected[i].name), 0u) << value;
    }
    std::string value;
    revision.get_any(1, nullptr, nullptr, &value);
    EXPECT_EQ(value, "<y:c xmlns:y=\"urn:y\">&amp;</y:c>") << "references stay as they are";
}

TEST(Revision, RoundTripsItsText) {
    Revision revision;
    revision.append_any("<x:a xmlns:x=\"urn:x\" k='&lt;'>1 &amp; 2<x:b>c</x:b></x:a>");
    const std::string first = vrl_test::write_inner_element(revision, "Vrl:Revision").text;
    Revision again;
    ASSERT_EQ(read_element(again, first).code, 0);
    EXPECT_EQ(vrl_test::write_inner_element(again, "Vrl:Revision").text, first);
}

TEST(Revision, WithContentButNoElementIsMissed) {
    Revision revision;
    const outcome refused = read_element(revision, element("Revision", "text"));
    EXPECT_EQ(refused.code, 21);
    EXPECT_EQ(refused.items(), texts{"Vrl:"});
    const outcome forgiven = read_element(revision, element("Revision", "text"), forgive);
    EXPECT_EQ(forgiven.codes(), (std::vector<int>{21, 10}));
    EXPECT_EQ(revision.size_any(), 0u);
}

TEST(Revision, ThatIsEmptyIsReadAndNotWritten) {
    for (const std::string& xml :
         {empty_element("Revision"), element("Revision", ""), element("Revision", " <!-- nothing --> ")}) {
        Revision revision;
        EXPECT_EQ(read_element(revision, xml).code, 0) << xml;
        EXPECT_EQ(vrl_test::write_inner_element(revision, "Vrl:Revision").code, 46);
    }
}

TEST(Revision, ThatCannotBeReadIsReported) {
    Revision revision;
    const outcome result = read_element(revision, element("Revision", "<a><b></a>"));
    EXPECT_EQ(result.code, 29);
    EXPECT_EQ(result.items(), texts{"a"});
    EXPECT_EQ(revision.size_any(), 1u) << "an entry is there before it is read";
}

// Intended: two elements of one name have different types, by their place.
TEST(Colorant, OfARecipeNeedsItsNameAloneAndThatOfAColorantElementAllFour) {
    const std::string name = element("Name", "n");
    const auto missed = [](auto object, const std::string& content) {
        return items_of(read_element(object, element("Colorant", content), forgive), 21);
    };
    EXPECT_EQ(missed(Colorant(), name), texts{});
    EXPECT_EQ(missed(ColorantElementType_Colorant(), name),
              (texts{"Vrl:Manufacturer", "Vrl:PartNumber", "Vrl:Density"}));
    EXPECT_EQ(missed(Colorant(), element("Manufacturer", "m")), texts{"Vrl:Name"});

    Colorant colorant;
    colorant.set_Name(L"n");
    EXPECT_TRUE(colorant.is_occurs_ok());
    ColorantElementType_Colorant other;
    other.set_Name(L"n");
    other.set_Manufacturer(L"m");
    other.set_PartNumber(L"p");
    EXPECT_FALSE(other.is_occurs_ok());
    other.get_Density().setnil_Density();
    EXPECT_TRUE(other.is_occurs_ok()) << "its density is an element of its own, which may be nil";
}

TEST(Head, OfAPaletteAndOfASetAndOfAColorIsTheSame) {
    const std::string head =
        element("CustomAttribute",
                element("Name", "k") + element("ValueChoice", element("StringValue", "v"))) +
        history() + history() + empty_element("Owner") + element("SemanticAssociation", "a") +
        element("SemanticAssociation", "b");
    const auto expect = [&head](auto object, const std::string& attribute, const std::string& tail) {
        ASSERT_EQ(read_element(object, element("X", head + tail, attribute)).code, 0) << attribute;
        EXPECT_EQ(object.size_CustomAttribute(), 1u);
        EXPECT_EQ(object.size_ChangeHistory(), 2u);
        EXPECT_TRUE(object.isset_Owner());
        EXPECT_EQ(object.size_SemanticAssociation(), 2u);
    };
    expect(PaletteType(), " PaletteName=\"p\"", "");
    expect(ColorSetType(), " ColorSetName=\"s\"", empty_element("SubstrateTile"));
    expect(ColorType(), " ColorName=\"c\"", vrl_test::cmyk() + empty_element("SubstrateTile"));
}

}  // namespace
