#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"
#include "tests/temporary_folder.h"

/// The way into a document: its outermost element, its namespaces, the overloads.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::forgive;
using vrl_test::outermost;
using vrl_test::preamble;
using vrl_test::read_document;

TEST(Document, WithAPreambleAloneIsValid) {
    Vrl document;
    EXPECT_EQ(document.unmarshal(vrl_test::document()), 0);
    const Header& header = document.get_Preamble().get_Header();
    EXPECT_EQ(header.get_Creator(), L"maker");
    EXPECT_EQ(header.get_CreatorVersion(), L"1");
    EXPECT_EQ(header.get_Purpose(), L"test");
    ASSERT_EQ(header.size_ChangeHistory(), 1u);
    EXPECT_EQ(header.get_ChangeHistory(0).get_as_string(), vrl_test::k_time);
    EXPECT_EQ(document.size_Color(), 0u);
}

TEST(Document, TakesItsListsInOneOrderOnly) {
    const std::string palette = element("Palette", vrl_test::history(), " PaletteName=\"p\"");
    const std::string color = vrl_test::color();
    const std::string control = vrl_test::quality_control();
    const struct {
        std::string content;
        int code;
    } rows[] = {{color + color + palette + palette + control + control, 0},
                {color + control, 0},
                {palette + color, 10},
                {control + palette, 10},
                {control + color, 10},
                {color + palette + color, 10}};
    for (const auto& row : rows) {
        Vrl document;
        EXPECT_EQ(document.unmarshal(vrl_test::document(row.content)), row.code) << row.content.substr(0, 20);
    }
    Vrl document;
    EXPECT_EQ(document.unmarshal(outermost("Vrl", color + preamble())), 21) << "the preamble comes first";
}

TEST(Document, IsTheSameThroughAllOverloads) {
    const std::string xml = vrl_test::rich_document();
    const vrl_test::temporary_folder folder;
    folder.write("a.vrl", xml);
    const std::string path = folder.path("a.vrl");

    std::string texts[7];
    auto note = [&texts, i = 0](const Vrl& document, int code) mutable {
        EXPECT_EQ(code, 0);
        EXPECT_EQ(document.marshal(&texts[i++]), 0);
    };
    Vrl a;
    note(a, a.unmarshal(xml));
    Vrl b;
    note(b, b.unmarshal(xml.data(), static_cast<unsigned>(xml.size())));
    Vrl c;
    note(c, c.unmarshal(path.c_str()));
    Vrl d;
    note(d, read_document(d, xml).code);
    qbxV2::eqbx_error error = qbxV2::EQBX_FILE_NOT_OPENED;
    const Vrl e(xml, &error);
    note(e, error);
    error = qbxV2::EQBX_FILE_NOT_OPENED;
    const Vrl f(xml.data(), static_cast<unsigned>(xml.size()), &error);
    note(f, error);
    error = qbxV2::EQBX_FILE_NOT_OPENED;
    const Vrl g(path.c_str(), &error);
    note(g, error);
    for (const std::string& text : texts) EXPECT_EQ(text, texts[0]);
    EXPECT_NE(texts[0].find("<Vrl:SubstratePaper>"), std::string::npos);
}

TEST(Document, ThatIsNotThereIsNotOpened) {
    Vrl document;
    EXPECT_EQ(document.unmarshal("/nonexistent/a.vrl"), 1);
    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    const Vrl made("/nonexistent/a.vrl", &error);
    EXPECT_EQ(error, 1);
    const ColorSpaceCMYK space("/nonexistent/a.vrl", &error);
    EXPECT_EQ(error, 1);
    const vrl_test::temporary_folder folder;
    EXPECT_EQ(document.unmarshal(folder.path("").c_str()), 1) << "a folder is no file";
}

TEST(Document, ThatIsEmptyEndsUnexpectedly) {
    Vrl document;
    EXPECT_EQ(document.unmarshal(std::string()), 34);
    EXPECT_EQ(document.unmarshal("", 0u), 34);
    EXPECT_EQ(document.unmarshal(std::string("  \n ")), 34);
    EXPECT_EQ(document.unmarshal(vrl_test::k_declaration), 34);
}

TEST(Document, WithAnotherOutermostElementIsNotFound) {
    for (const std::string& xml :
         {outermost("Color", preamble()), outermost("vrl", preamble()), std::string("<Vrl/>"),
          std::string("<Vrl:Vrl/>"), std::string("<x:Vrl xmlns:x=\"urn:vrl:document/v1\"/>"),
          std::string("<Vrl xmlns=\"urn:vrl:document/v2/\"/>")}) {
        Vrl document;
        const auto result = read_document(document, xml);
        if (xml == "<Vrl:Vrl/>") continue;  // the recording reader knows the prefix
        EXPECT_EQ(result.code, 16) << xml;
        EXPECT_EQ(Vrl().unmarshal(xml), 16) << xml;
    }
    EXPECT_EQ(Vrl().unmarshal(std::string("<Vrl:Vrl/>")), 16) << "an undeclared prefix is no namespace";
}

TEST(Document, WithAnotherOutermostElementIsReadAllTheSameWhereTheHandlerForgives) {
    Vrl document;
    const auto result = read_document(document, outermost("Other", preamble() + vrl_test::color()), forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.codes(), std::vector<int>{16});
    EXPECT_EQ(result.items(), std::vector<std::string>{"Vrl:Other"});
    EXPECT_EQ(document.size_Color(), 1u);
}

TEST(Document, KnowsItsNamespaceByAnyPrefixAndByNone) {
    const std::string uri = "urn:vrl:document/v2";
    const std::string body =
        "<P:Preamble><P:Header><P:Creator>c</P:Creator><P:CreatorVersion>1</P:CreatorVersion>"
        "<P:ChangeHistory>2024-01-02T03:04:05Z</P:ChangeHistory><P:Purpose>p</P:Purpose>"
        "</P:Header></P:Preamble>";
    const auto renamed = [](std::string text, const std::string& prefix) {
        for (std::size_t at = text.find("P:"); at != std::string::npos; at = text.find("P:", at)) {
            text.replace(at, 2, prefix);
            at += prefix.size();
        }
        return text;
    };
    const std::string content = renamed(body, "x:");
    EXPECT_EQ(Vrl().unmarshal("<x:Vrl xmlns:x=\"" + uri + "\">" + content + "</x:Vrl>"), 0);
    EXPECT_EQ(Vrl().unmarshal("<Vrl xmlns=\"" + uri + "\">" + renamed(body, "") + "</Vrl>"), 0);
    EXPECT_EQ(Vrl().unmarshal("<x:Vrl xmlns:x=\"" + uri + "\">" + body + "</x:Vrl>"), 21)
        << "names of no namespace are strangers";
}

TEST(Document, MayRebindItsPrefixInside) {
    const std::string owner = "<o:Owner xmlns:o=\"urn:vrl:document/v2\"><o:Company>c</o:Company></o:Owner>";
    Vrl document;
    EXPECT_EQ(document.unmarshal(outermost("Vrl", preamble(owner))), 0);
    EXPECT_EQ(document.get_Preamble().get_Owner().get_Company(0), L"c");
    const std::string stranger =
        "<Vrl:Owner xmlns:Vrl=\"urn:other\"><Vrl:Company>c</Vrl:Company></Vrl:Owner>";
    EXPECT_EQ(Vrl().unmarshal(outermost("Vrl", preamble(stranger))), 10);
}

TEST(Document, MayHaveItsRootFollowedByAnything) {
    EXPECT_EQ(Vrl().unmarshal(vrl_test::document() + "<!-- c --><?pi?> text <more"), 0);
}

TEST(ElementDocument, IsReadByItsClass) {
    ColorSpaceCMYK space;
    EXPECT_EQ(space.unmarshal(outermost("ColorSpaceCMYK", vrl_test::cmyk_content())), 0);
    EXPECT_EQ(space.get_Black(), 40.0);
    EXPECT_EQ(space.unmarshal(outermost("ColorSpaceRGB", vrl_test::cmyk_content())), 16);
    Standard standard;
    EXPECT_EQ(standard.unmarshal(outermost("Standard", vrl_test::device() + vrl_test::color())), 0);
    EXPECT_EQ(standard.get_Color().get_ColorName(), L"c");
    Measurement measurement;
    EXPECT_EQ(measurement.unmarshal(outermost("Measurement", vrl_test::device() + vrl_test::color())), 0);
    FunctionDECMC function;
    EXPECT_EQ(
        function.unmarshal(outermost("FunctionDECMC", element("Param_l", "1") + element("Param_c", "2"))), 0);
    EXPECT_EQ(function.get_Param_c(), 2.0);
    Function head;
    EXPECT_EQ(head.unmarshal(outermost("Function", element("Result", "1"))), 0)
        << "as a document it needs no type: its class is known";
    EXPECT_EQ(head.get_Result(), 1.0);
}

TEST(UsedObject, IsAppendedToAndOverwritten) {
    Vrl document;
    const std::string xml = vrl_test::document(vrl_test::color("a"));
    EXPECT_EQ(document.unmarshal(xml), 0);
    EXPECT_EQ(document.unmarshal(vrl_test::document(vrl_test::color("b"))), 0);
    ASSERT_EQ(document.size_Color(), 2u);
    EXPECT_EQ(document.get_Color(1).get_ColorName(), L"b");
    EXPECT_EQ(document.get_Preamble().get_Header().size_ChangeHistory(), 2u);
    EXPECT_EQ(document.get_Preamble().get_Header().get_Creator(), L"maker");
}

TEST(UsedObject, ReportsEveryAttributeThatIsSet) {
    ColorSpaceCMYK space;
    const std::string xml =
        outermost("ColorSpaceCMYK", vrl_test::cmyk_content(), " Name=\"a\" Comments=\"b\" UniqueID=\"c\"");
    EXPECT_EQ(space.unmarshal(xml), 0);
    EXPECT_EQ(space.unmarshal(xml), 3);
    const auto result = read_document(space, xml, forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.codes(), (std::vector<int>{3, 3, 3}));
    EXPECT_EQ(result.items(), (std::vector<std::string>{"Name", "Comments", "UniqueID"}));
}

TEST(SeededElement, IsOverwrittenByWhatAFileSays) {
    Vrl document;
    const std::string information =
        element("ReadSDKInformation", element("SDKName", "other") + element("SDKVersion", "9"));
    EXPECT_EQ(document.unmarshal(outermost("Vrl", element("Preamble", vrl_test::header(information)))), 0);
    const SDKType& read = document.get_Preamble().get_Header().get_ReadSDKInformation();
    EXPECT_EQ(read.get_SDKName(), L"other");
    EXPECT_EQ(read.get_SDKVersion().get_SDKVersion(), L"9");
}

TEST(FailedReading, LeavesWhatWasReadSoFar) {
    Vrl document;
    const std::string xml = vrl_test::document(vrl_test::color("a") + vrl_test::color("b", "<Vrl:x/>"));
    EXPECT_EQ(document.unmarshal(xml), 10);
    EXPECT_EQ(document.get_Preamble().get_Header().get_Creator(), L"maker");
    ASSERT_EQ(document.size_Color(), 2u) << "an entry is there before it is read";
    EXPECT_EQ(document.get_Color(1).get_ColorName(), L"b");
    EXPECT_EQ(document.get_Color(1).size_ColorSpace(), 1u);

    qbxV2::eqbx_error error = qbxV2::EQBX_NO_ERROR;
    const Vrl made(xml, &error);
    EXPECT_EQ(error, 10);
    EXPECT_EQ(made.size_Color(), 2u) << "the constructor keeps its object alive";
}

TEST(FailedReading, ReturnsWhatTheHandlerMadeOfTheFirstReport) {
    Vrl document;
    const std::string xml = vrl_test::document("<Vrl:x/>");
    const auto result =
        read_document(document, xml, [](const vrl_test::report&) { return qbxV2::EQBX_USER_ERROR_6; });
    EXPECT_EQ(result.code, 1005);
    EXPECT_EQ(result.codes(), std::vector<int>{10});
}

}  // namespace
