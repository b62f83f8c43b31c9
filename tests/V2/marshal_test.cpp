#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <fstream>
#include <locale>
#include <sstream>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/V2/writing.h"
#include "tests/temporary_folder.h"

namespace {

using namespace vrl_v2;
using vrl_test::complete;
using vrl_test::k_declaration;
using vrl_test::k_namespaces;
using vrl_test::write_inner_element;

const std::string k_minimal = k_declaration + "<Vrl:Vrl" + k_namespaces +
                              ">\n"
                              "\t<Vrl:Preamble>\n"
                              "\t\t<Vrl:Header>\n"
                              "\t\t\t<Vrl:Creator>maker</Vrl:Creator>\n"
                              "\t\t\t<Vrl:CreatorVersion>1</Vrl:CreatorVersion>\n"
                              "\t\t\t<Vrl:ChangeHistory>2024-01-02T03:04:05Z</Vrl:ChangeHistory>\n"
                              "\t\t\t<Vrl:Purpose>test</Vrl:Purpose>\n"
                              "\t\t\t<Vrl:ReadSDKInformation>\n"
                              "\t\t\t\t<Vrl:SDKName>Vrl2-QBX-3.7.6</Vrl:SDKName>\n"
                              "\t\t\t\t<Vrl:SDKVersion>1.0</Vrl:SDKVersion>\n"
                              "\t\t\t</Vrl:ReadSDKInformation>\n"
                              "\t\t</Vrl:Header>\n"
                              "\t</Vrl:Preamble>\n"
                              "</Vrl:Vrl>\n";

std::string text_of(const Vrl& document) {
    std::string text;
    EXPECT_EQ(document.marshal(&text), 0);
    return text;
}

TEST(WrittenDocument, IsExactToTheByte) {
    Vrl document;
    complete(document);
    EXPECT_EQ(text_of(document), k_minimal);
}

TEST(WrittenDocument, IsTheSameThroughAllOverloads) {
    Vrl document;
    complete(document);
    std::ostringstream os;
    EXPECT_EQ(document.marshal(os), 0);
    EXPECT_EQ(os.str(), k_minimal);
    const vrl_test::temporary_folder folder;
    const std::string path = folder.path("a.vrl");
    EXPECT_EQ(document.marshal(path.c_str()), 0);
    EXPECT_EQ(folder.bytes("a.vrl"), k_minimal) << "line feeds, in the text mode of this system";
}

TEST(WrittenDocument, CanBeWrittenTwice) {
    Vrl document;
    complete(document);
    EXPECT_EQ(text_of(document), text_of(document));
    EXPECT_FALSE(document.get_Preamble().get_Header().isset_WriteSDKInformation()) << "marshal only looks";
}

TEST(WrittenColor, IsExactToTheByte) {
    ColorSpaceCMYK space;
    complete(space);
    space.set_Comments(L"c");
    space.set_UniqueID(L"u");
    space.set_Name(L"n");
    complete(space.get_CustomAttribute(0));
    space.get_SpotColor(0).set_Name(L"gold");
    space.get_SpotColor(0).set_Percentage(12.5);
    std::string text;
    ASSERT_EQ(space.marshal(&text), 0);
    EXPECT_EQ(text, k_declaration + "<Vrl:ColorSpaceCMYK" + k_namespaces +
                        " Comments=\"c\" UniqueID=\"u\" Name=\"n\">\n"
                        "\t<Vrl:CustomAttribute>\n"
                        "\t\t<Vrl:Name>key</Vrl:Name>\n"
                        "\t\t<Vrl:ValueChoice>\n"
                        "\t\t\t<Vrl:StringValue>value</Vrl:StringValue>\n"
                        "\t\t</Vrl:ValueChoice>\n"
                        "\t</Vrl:CustomAttribute>\n"
                        "\t<Vrl:ChangeHistory>2024-01-02T03:04:05Z</Vrl:ChangeHistory>\n"
                        "\t<Vrl:ColorSpaceSpecificationSpectrumGeneric>\n"
                        "\t\t<Vrl:DeviceFilter>Filter_None</Vrl:DeviceFilter>\n"
                        "\t\t<Vrl:DevicePolarization>false</Vrl:DevicePolarization>\n"
                        "\t\t<Vrl:ChangeHistory>2024-01-02T03:04:05Z</Vrl:ChangeHistory>\n"
                        "\t\t<Vrl:Spectrum>Spectrum_Reflectance</Vrl:Spectrum>\n"
                        "\t</Vrl:ColorSpaceSpecificationSpectrumGeneric>\n"
                        "\t<Vrl:Cyan>10</Vrl:Cyan>\n"
                        "\t<Vrl:Magenta>20</Vrl:Magenta>\n"
                        "\t<Vrl:Yellow>30</Vrl:Yellow>\n"
                        "\t<Vrl:Black>40</Vrl:Black>\n"
                        "\t<Vrl:SpotColor>\n"
                        "\t\t<Vrl:Name>gold</Vrl:Name>\n"
                        "\t\t<Vrl:Percentage>12.5</Vrl:Percentage>\n"
                        "\t</Vrl:SpotColor>\n"
                        "</Vrl:ColorSpaceCMYK>\n");
}

TEST(WrittenElement, WithoutContentHasTwoTagsOnTwoLines) {
    EXPECT_EQ(write_inner_element(OwnerType(), "Vrl:Owner").text, "<Vrl:Owner>\n</Vrl:Owner>\n");
    SubstrateFilm film;
    std::string text;
    EXPECT_EQ(film.marshal(&text), 0);
    EXPECT_EQ(text, k_declaration + "<Vrl:SubstrateFilm" + k_namespaces + ">\n</Vrl:SubstrateFilm>\n");
}

TEST(WrittenElement, WithTextStandsOnOneLine) {
    Averaging averaging;
    averaging.set_AveragingValue(5);
    averaging.set_Averaging(true);
    EXPECT_EQ(write_inner_element(averaging, "Vrl:Averaging").text,
              "<Vrl:Averaging AveragingValue=\"5\">true</Vrl:Averaging>\n");
    ProfileFile file;
    file.set_ProfileName(L"p");
    qbxV2::c_binary bytes;
    bytes.from_base64("TWFu");
    file.set_ProfileFile(bytes);
    EXPECT_EQ(write_inner_element(file, "Vrl:F").text, "<Vrl:F ProfileName=\"p\">TWFu</Vrl:F>\n");
}

// Intended: no text is written as an empty element, which reading then refuses.
TEST(WrittenElement, WithoutItsOptionalTextIsEmpty) {
    Averaging averaging;
    averaging.set_AveragingValue(5);
    const std::string text = "<Vrl:Averaging AveragingValue=\"5\"></Vrl:Averaging>\n";
    EXPECT_EQ(write_inner_element(averaging, "Vrl:Averaging").text, text);
    Averaging read;
    EXPECT_EQ(vrl_test::read_element(read, text).code, 35);
    GlossCompensation gloss;
    gloss.set_CompensationValue(0.5);
    const std::string gloss_text = "<Vrl:G CompensationValue=\"0.5\"></Vrl:G>\n";
    EXPECT_EQ(write_inner_element(gloss, "Vrl:G").text, gloss_text);
    GlossCompensation read_gloss;
    EXPECT_EQ(vrl_test::read_element(read_gloss, gloss_text).code, 35);
}

TEST(WrittenElement, OmitsWhatIsNotPresent) {
    ColorSpaceCMYKType space;
    complete(space);
    space.set_Name(L"n");
    space.unset_Name();
    EXPECT_EQ(write_inner_element(space, "Vrl:X").text.substr(0, 8), "<Vrl:X>\n");
    SubstratePaperType paper;
    paper.set_PaperType(L"t");
    paper.get_Color();
    paper.unset_PaperType();
    paper.unset_Color();
    EXPECT_EQ(write_inner_element(paper, "Vrl:X").text, "<Vrl:X>\n</Vrl:X>\n");
}

// Intended: this one attribute is written whatever its presence says.
TEST(WrittenElement, AlwaysTellsTheScaleOfAnAxis) {
    FloatingPointValueType value;
    value.set_AxisNominalMax(1);
    value.set_AxisNominalMin(0);
    value.set_FloatingPointValueType(0.5);
    const std::string text =
        "<Vrl:X AxisNominalMax=\"1\" AxisNominalMin=\"0.0\" AxisNominalScale=\"Scale_Linear\">0.5</Vrl:X>\n";
    EXPECT_EQ(write_inner_element(value, "Vrl:X").text, text);
    value.set_AxisNominalScale(L"Scale_Log");
    value.unset_AxisNominalScale();
    EXPECT_NE(write_inner_element(value, "Vrl:X").text.find("AxisNominalScale=\"Scale_Log\""),
              std::string::npos)
        << "what is in storage";
}

TEST(WrittenValue, HasTheFormOfItsType) {
    DeviceSettings settings;
    settings.set_Aperture(2147483647u);
    settings.set_LensPosition(-2147483647 - 1);
    settings.set_GlassCompensation(false);
    settings.set_FleetTuner(true);
    EXPECT_EQ(write_inner_element(settings, "Vrl:X").text,
              "<Vrl:X>\n\t<Vrl:Aperture>2147483647</Vrl:Aperture>\n"
              "\t<Vrl:LensPosition>-2147483648</Vrl:LensPosition>\n"
              "\t<Vrl:GlassCompensation>false</Vrl:GlassCompensation>\n"
              "\t<Vrl:FleetTuner>true</Vrl:FleetTuner>\n</Vrl:X>\n");
}

TEST(WrittenValue, HasFourteenDigits) {
    const auto text = [](double value) {
        FunctionType function;
        function.set_Result(value);
        const std::string whole = write_inner_element(function, "F").text;
        const std::size_t start = whole.find("<Vrl:Result>") + 12;
        return whole.substr(start, whole.find("</Vrl:Result>") - start);
    };
    EXPECT_EQ(text(1.0 / 3.0), "0.33333333333333");
    EXPECT_EQ(text(0.0), "0.0");
    EXPECT_EQ(text(-0.0), "-0.0");
    EXPECT_EQ(text(1e20), "1e+20");
    EXPECT_EQ(text(0.00001), "1e-05");
    EXPECT_EQ(text(-INFINITY), "-INF");
    EXPECT_EQ(text(NAN), "NaN");
}

TEST(WrittenValue, IsEscapedAlikeInAttributesAndBodies) {
    ColorSpaceNCSType space;
    space.set_Name(L"\"<a>&'\"\x00E9");
    space.set_ColorName(L"\"<a>&'\"\x00E9");
    space.append_ChangeHistory(vrl_test::time());
    space.get_ColorSpaceSpecificationSpectrumGeneric().setnil_ColorSpaceSpecificationSpectrumGeneric();
    const std::string text = write_inner_element(space, "Vrl:X").text;
    const std::string escaped = "&quot;&lt;a>&amp;&apos;&quot;\xC3\xA9";
    EXPECT_NE(text.find("<Vrl:X Name=\"" + escaped + "\">"), std::string::npos) << text;
    EXPECT_NE(text.find("<Vrl:ColorName>" + escaped + "</Vrl:ColorName>"), std::string::npos) << text;
}

TEST(WrittenRevision, StandsAsItIs) {
    Revision revision;
    revision.append_any("<x:a xmlns:x='urn:x'>1 &amp; 2</x:a>");
    revision.append_any("<b>\n</b>");
    EXPECT_EQ(write_inner_element(revision, "Vrl:Revision").text,
              "<Vrl:Revision>\n\t<x:a xmlns:x='urn:x'>1 &amp; 2</x:a>\n\t<b>\n</b>\n</Vrl:Revision>\n");
    EXPECT_EQ(write_inner_element(Revision(), "Vrl:Revision").code, 46);
}

/// A writer that writes no white space of its own.
class compact_writer : public qbxV2::c_xml_writer {
public:
    explicit compact_writer(std::ostream& os) : c_xml_writer(os, include_xml_decl, "\t", "\n") {}
    void nest() override { ++nested; }
    const char* endl() override { return ""; }
    int nested = 0;
};

TEST(Writer, OfASubclassSaysHowLinesBeginAndEnd) {
    Vrl document;
    complete(document);
    std::ostringstream os;
    compact_writer out(os);
    EXPECT_EQ(document.marshal(out, "Vrl:Vrl"), 0);
    std::string expected = k_minimal;
    std::erase(expected, '\t');
    std::erase(expected, '\n');
    expected.insert(k_declaration.size() - 1, "\n");  // the declaration is written by the constructor
    EXPECT_EQ(os.str(), expected);
    EXPECT_EQ(out.nested, std::count(k_minimal.begin(), k_minimal.end(), '\t'));
}

TEST(Writer, AddsNamespacesAndLocationsToTheOutermostElementAlone) {
    OwnerType owner;
    owner.get_Person(0).set_Name(L"n");
    complete(owner.get_CustomAttribute(0));
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.add_namespace("x", "urn:x");
    out.add_schema_location("urn:vrl:document/v2", "vrl.xsd");
    EXPECT_EQ(owner.marshal(out, "Vrl:Owner"), 0);
    EXPECT_EQ(owner.marshal(out, "Vrl:Owner"), 0);
    const std::string content =
        "<Vrl:CustomAttribute><Vrl:Name>key</Vrl:Name><Vrl:ValueChoice><Vrl:StringValue>value</"
        "Vrl:StringValue>"
        "</Vrl:ValueChoice></Vrl:CustomAttribute><Vrl:Person><Vrl:Name>n</Vrl:Name></Vrl:Person></Vrl:Owner>";
    EXPECT_EQ(os.str(),
              "<Vrl:Owner xmlns:Vrl=\"urn:vrl:document/v2\" xmlns:x=\"urn:x\""
              " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\""
              " xsi:schemaLocation=\"urn:vrl:document/v2 vrl.xsd\">" +
                  content + "<Vrl:Owner>" + content);
}

TEST(Writer, KeepsAnOtherMapThatWasSelectedBefore) {
    static constexpr qbxV2::s_ns_map other[] = {{1000, "o", "urn:o"}, {0, nullptr, nullptr}};
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "", "");
    out.conditionally_select_ns_map(other);
    EXPECT_EQ(SubstrateFilm().marshal(out, "Vrl:S"), 0);
    EXPECT_EQ(os.str(),
              "<Vrl:S xmlns:o=\"urn:o\" xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\"></Vrl:S>");
}

struct german : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

TEST(Writer, WritesNumbersWithAPointWhateverTheLocaleOfTheStream) {
    const std::locale local(std::locale::classic(), new german);
    std::ostringstream os;
    os.imbue(local);
    os << 1234.5;
    ASSERT_EQ(os.str(), "1.234,5");
    os.str("");
    DeviceSettings settings;
    settings.set_LensPosition(-1234567);
    settings.get_GlossCompensation().set_CompensationValue(1234.5);
    qbxV2::c_xml_writer out(os, "", "");
    EXPECT_EQ(settings.marshal(out, "X"), 0);
    EXPECT_EQ(os.str(),
              "<X><Vrl:LensPosition>-1234567</Vrl:LensPosition>"
              "<Vrl:GlossCompensation CompensationValue=\"1234.5\"></Vrl:GlossCompensation></X>");
}

TEST(Writer, LeavesTheShapeThatACallerGaveTheStream) {
    DeviceSettings settings;
    settings.set_LensPosition(255);
    std::ostringstream os;
    os << std::hex;
    qbxV2::c_xml_writer out(os, "", "");
    EXPECT_EQ(settings.marshal(out, "X"), 0);
    EXPECT_EQ(os.str(), "<X><Vrl:LensPosition>ff</Vrl:LensPosition></X>");
    EXPECT_TRUE(os.flags() & std::ios_base::hex);
}

/// Takes so many bytes and no more.
class small_buffer : public std::stringbuf {
public:
    explicit small_buffer(std::size_t room) : m_room(room) {}

protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override {
        const std::size_t taken = std::min(static_cast<std::size_t>(length), m_room);
        m_room -= taken;
        return std::stringbuf::xsputn(text, static_cast<std::streamsize>(taken));
    }

private:
    std::size_t m_room;
};

TEST(Writer, HandsTheStreamsExceptionToTheCaller) {
    Vrl document;
    complete(document);
    for (unsigned i = 0; i < 100; ++i) complete(document.get_Color(i));
    std::string whole;
    ASSERT_EQ(document.marshal(&whole), 0);
    ASSERT_GT(whole.size(), 50000u) << "more than the writer keeps";
    for (const std::size_t room : {std::size_t(0), k_declaration.size(), k_declaration.size() + 1,
                                   std::size_t(40000), whole.size() - 1}) {
        small_buffer buffer(room);
        std::ostream os(&buffer);
        os.exceptions(std::ios_base::badbit | std::ios_base::failbit);
        EXPECT_THROW(document.marshal(os), std::ios_base::failure) << room;
        EXPECT_EQ(buffer.str(), whole.substr(0, room)) << "as far as it goes, and nothing twice";
    }
    small_buffer buffer(whole.size());
    std::ostream os(&buffer);
    os.exceptions(std::ios_base::badbit | std::ios_base::failbit);
    EXPECT_EQ(document.marshal(os), 0);
    EXPECT_EQ(buffer.str(), whole);
}

// Intended: a stream that fails in silence goes unnoticed.
TEST(Writer, DoesNotLookAtTheStateOfTheStream) {
    Vrl document;
    complete(document);
    small_buffer buffer(100);
    std::ostream os(&buffer);
    EXPECT_EQ(document.marshal(os), 0);
    EXPECT_FALSE(os);
}

}  // namespace
