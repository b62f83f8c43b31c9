#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// What a caller who steps in at each report gets to see, and what becomes of the document.
namespace {

using namespace vrl_v2;
using vrl_test::element;
using vrl_test::forgive;
using vrl_test::history;
using vrl_test::read_document;
using vrl_test::report;

std::string lines(const std::vector<std::string>& all) {
    std::string text;
    for (const std::string& line : all) text += line + "\n";
    return text;
}

const std::string k_faulty = lines({"<Vrl:Vrl xmlns:Vrl=\"urn:vrl:document/v2\" nonsense=\"1\">",   // 1
                                    "<Vrl:Preamble>",                                               // 2
                                    "<Vrl:Header>",                                                 // 3
                                    "<Vrl:Creator>c</Vrl:Creator>",                                 // 4
                                    "<Vrl:CreatorVersion>1</Vrl:CreatorVersion>",                   // 5
                                    "<Vrl:ChangeHistory>2024-01-02T03:04:05</Vrl:ChangeHistory>",   // 6
                                    "<Vrl:Purpose>p</Vrl:Purpose>",                                 // 7
                                    "</Vrl:Header>",                                                // 8
                                    "</Vrl:Preamble>",                                              // 9
                                    "<Vrl:Color UniqueID=\"u\">",                                   // 10
                                    "<Vrl:ChangeHistory>2024-01-02T03:04:05Z</Vrl:ChangeHistory>",  // 11
                                    "</Vrl:Color>",                                                 // 12
                                    "</Vrl:Vrl>"});                                                 // 13

TEST(Recovery, CollectsEveryReportWithLineAndItem) {
    Vrl document;
    const auto result = read_document(document, k_faulty, forgive);
    EXPECT_EQ(result.code, 0);
    std::vector<std::string> messages;
    for (const report& r : result.reports) messages.push_back(r.message);
    EXPECT_EQ(messages, (std::vector<std::string>{"line:1-'Vrl:Vrl'-Unexpected attribute",
                                                  "line:6-'Vrl:ChangeHistory'-No pattern matched",
                                                  "line:10-'ColorName'-Required attribute(s) missing",
                                                  "line:12-'Vrl:ColorType'-Mandatory element missing"}));
}

TEST(Recovery, KeepsTheDocumentThatItReads) {
    Vrl document;
    read_document(document, k_faulty, forgive);
    EXPECT_EQ(document.get_Preamble().get_Header().get_Purpose(), L"p");
    EXPECT_EQ(document.get_Preamble().get_Header().size_ChangeHistory(), 1u);
    ASSERT_EQ(document.size_Color(), 1u);
    EXPECT_EQ(document.get_Color(0).get_UniqueID(), L"u");
    EXPECT_FALSE(document.get_Color(0).is_occurs_ok());
}

TEST(Recovery, StopsAtTheReportThatItChooses) {
    for (const int stop_at : {39, 22, 25, 21}) {
        Vrl document;
        const auto result = read_document(document, k_faulty, [stop_at](const report& r) {
            return r.code == stop_at ? r.code : qbxV2::EQBX_NO_ERROR;
        });
        EXPECT_EQ(result.code, stop_at);
        EXPECT_EQ(result.reports.back().code, stop_at);
    }
}

TEST(Recovery, ReturnsACodeOfTheCallersOwn) {
    Vrl document;
    const auto result = read_document(document, k_faulty, [](const report& r) {
        return r.code == qbxV2::EQBX_NO_PATTERN_MATCHED ? qbxV2::EQBX_USER_ERROR_9 : qbxV2::EQBX_NO_ERROR;
    });
    EXPECT_EQ(result.code, 1008);
}

class short_handler : public qbxV2::c_xml_reader_memory {
public:
    explicit short_handler(const std::string& text) : c_xml_reader_memory(text.data(), text.size()) {}
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error code) override {
        codes.push_back(code);
        return qbxV2::EQBX_NO_ERROR;
    }
    std::vector<int> codes;
};

TEST(Recovery, CanAskForTheCodeAlone) {
    Vrl document;
    short_handler reader(k_faulty);
    EXPECT_EQ(document.unmarshal(reader), 0);
    EXPECT_EQ(reader.codes, (std::vector<int>{39, 22, 25, 21}));
}

TEST(Reader, TellsTheLastReportWhenReadingHasStopped) {
    Vrl document;
    qbxV2::c_xml_reader_memory reader(k_faulty.data(), k_faulty.size());
    EXPECT_EQ(document.unmarshal(reader), 39);
    std::string message;
    EXPECT_EQ(reader.get_error_message(&message), "line:1-'Vrl:Vrl'-Unexpected attribute");
    EXPECT_EQ(reader.get_error_item_name(), "Vrl:Vrl");
}

TEST(Reader, TellsNoErrorBehindACleanDocument) {
    Vrl document;
    const std::string xml = vrl_test::rich_document();
    qbxV2::c_xml_reader_memory reader(xml.data(), xml.size());
    EXPECT_EQ(document.unmarshal(reader), 0);
    std::string message;
    EXPECT_EQ(reader.get_error_message(&message), "No Error");
}

TEST(BrokenXml, IsReportedWithTheScannersCode) {
    const struct {
        std::string xml;
        int code;
    } rows[] = {{"<Vrl:Vrl a=b/>", 23},
                {"<Vrl:Vrl a/>", 23},
                {vrl_test::document("<>"), 12},
                {vrl_test::document("<1/>"), 23},
                // Faults without a report of the scanner's own: what stands there is no end of the element.
                {vrl_test::document("</>"), 10},
                {vrl_test::document("<!x>"), 10},
                {"</>", 16},
                {"<!x>", 16},
                {"<?xml version=\"1.2\"?><a/>", 14},
                {"<?xml version=\"1.0\" standalone=\"no\"?><a/>", 13},
                {"<?xml encoding=\"UTF-8\"?><a/>", 13},
                {vrl_test::document("<?xml version=\"1.0\"?>"), 13},
                {"<?xml version=\"1.0\" encoding=\"EBCDIC-X\"?><a/>", 6}};
    for (const auto& row : rows) {
        Vrl document;
        EXPECT_EQ(read_document(document, row.xml).code, row.code) << row.xml;
    }
}

// A fatal fault ends the input: every later call says so, and no element comes any more.
TEST(BrokenXml, DeliversNoElementBehindAFatalFault) {
    Vrl document;
    const std::string xml =
        vrl_test::document(vrl_test::color("a") + "<Vrl:Color ColorName=b>" + history() + "</Vrl:Color>");
    const auto result = read_document(document, xml, forgive);
    EXPECT_EQ(document.size_Color(), 1u);
    ASSERT_FALSE(result.reports.empty());
    EXPECT_EQ(result.reports.front().code, 23);
    for (std::size_t i = 1; i < result.reports.size(); ++i) {
        EXPECT_TRUE(result.reports[i].code == 34 || result.reports[i].code == 10 ||
                    result.reports[i].code == 21)
            << result.reports[i].message;
    }
}

TEST(BrokenXml, CanBeForgivenWithinATag) {
    ColorType color;
    const std::string xml = "<Vrl:Color ColorName=\"c\" ?>" + history() + vrl_test::cmyk() + "</Vrl:Color>";
    EXPECT_EQ(vrl_test::read_element(color, xml, forgive).code, 0);
    EXPECT_EQ(color.size_ColorSpace(), 1u);
    OwnerType owner;
    const std::string tag = "<Vrl:Owner ?>" + element("Company", "c") + "</Vrl:Owner>";
    EXPECT_EQ(vrl_test::read_element(owner, tag).code, 23);
    EXPECT_EQ(vrl_test::read_element(owner, tag, forgive).code, 0);
    EXPECT_EQ(owner.size_Company(), 1u) << "a class without attributes, too";
}

TEST(BrokenXml, CanBeForgivenInTheMiddle) {
    ColorSpaceCMYKType space;
    const std::string xml =
        element("ColorSpaceCMYK", history() + vrl_test::spectrum_generic() + "<>" + vrl_test::inks());
    const auto result = vrl_test::read_element(space, xml, forgive);
    ASSERT_FALSE(result.reports.empty());
    EXPECT_EQ(result.reports.front().code, 23);
    EXPECT_EQ(result.code, 0);
}

}  // namespace
