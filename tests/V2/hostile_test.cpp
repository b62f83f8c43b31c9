#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "tests/V2/documents.h"
#include "tests/V2/reading.h"

/// Damaged documents: each is refused with a code, or read; nothing crashes, and nothing goes on for ever.
namespace {

using namespace vrl_v2;

/// The bytes in a block of exactly their size, so that a byte too far shows.
class exact_block {
public:
    exact_block(const std::string& text, std::size_t size) : m_bytes(new char[size]), m_size(size) {
        text.copy(m_bytes.get(), size);
    }
    const char* data() const { return m_bytes.get(); }
    std::size_t size() const { return m_size; }

private:
    std::unique_ptr<char[]> m_bytes;
    std::size_t m_size;
};

/// Forgives everything, up to a number of reports that no finite document of this size needs.
class patient_reader : public qbxV2::c_xml_reader_memory {
public:
    patient_reader(const char* data, std::size_t size) : c_xml_reader_memory(data, size) {}
    qbxV2::eqbx_error user_handle_error(qbxV2::eqbx_error code) override {
        ++reports;
        return reports < k_patience ? qbxV2::EQBX_NO_ERROR : code;
    }
    static constexpr int k_patience = 10000;
    int reports = 0;
};

int reports_of_a_patient_reader(const std::string& xml, std::size_t max_expansion = 100000) {
    const exact_block block(xml, xml.size());
    patient_reader reader(block.data(), block.size());
    reader.set_max_entity_expansion(max_expansion);
    Vrl document;
    document.unmarshal(reader);
    return reader.reports;
}

/// One document with most kinds of content, in few bytes.
std::string dense_document() {
    return vrl_test::k_declaration +
           vrl_test::document(
               vrl_test::color("&#65;&amp;b", vrl_test::element("SubstratePaper",
                                                                vrl_test::element("PaperThickness", "0.1"))) +
               vrl_test::quality_control(vrl_test::tolerance(
                   "<!-- c --><?p i?>" +
                   vrl_test::empty_element("Function", " xsi:type='Vrl:FunctionDEType'"))));
}

TEST(TruncatedDocument, IsRefusedAtEveryByte) {
    const std::string xml = dense_document();
    ASSERT_EQ(Vrl().unmarshal(xml), 0);
    for (std::size_t size = 0; size < xml.size(); ++size) {
        const exact_block block(xml, size);
        Vrl document;
        EXPECT_NE(document.unmarshal(block.data(), static_cast<unsigned>(size)), 0) << size;
    }
}

TEST(TruncatedDocument, IsReadToItsEndByAHandlerThatForgivesEverything) {
    const std::string xml = dense_document();
    for (std::size_t size = 0; size < xml.size(); ++size) {
        const exact_block block(xml, size);
        patient_reader reader(block.data(), size);
        Vrl document;
        document.unmarshal(reader);
        EXPECT_LT(reader.reports, patient_reader::k_patience) << size;
    }
}

TEST(TruncatedDocument, LeavesAnObjectThatCanBeUsed) {
    const std::string xml = dense_document();
    for (std::size_t size = 0; size < xml.size(); size += 7) {
        const exact_block block(xml, size);
        Vrl document;
        document.unmarshal(block.data(), static_cast<unsigned>(size));
        Vrl copy(document);
        std::string text;
        const int code = copy.marshal(&text);
        EXPECT_TRUE(code == 0 || code == 46) << size;
    }
}

TEST(DamagedDocument, IsReadOrRefusedWithAnyByteChanged) {
    const std::string xml = dense_document();
    for (const char other : {'<', '>', '"', '&', '/', 'x', ' ', '\0', '\xFF'}) {
        for (std::size_t at = 0; at < xml.size(); at += 3) {
            std::string damaged = xml;
            damaged[at] = other;
            const exact_block block(damaged, damaged.size());
            Vrl document;
            document.unmarshal(block.data(), static_cast<unsigned>(block.size()));
            patient_reader reader(block.data(), block.size());
            Vrl second;
            second.unmarshal(reader);
            ASSERT_LT(reader.reports, patient_reader::k_patience) << at << " " << int{other};
        }
    }
}

TEST(DamagedDocument, IsReadOrRefusedWithAnyByteGone) {
    const std::string xml = dense_document();
    for (std::size_t at = 0; at < xml.size(); ++at) {
        std::string damaged = xml;
        damaged.erase(at, 1);
        const exact_block block(damaged, damaged.size());
        patient_reader reader(block.data(), block.size());
        Vrl document;
        document.unmarshal(reader);
        ASSERT_LT(reader.reports, patient_reader::k_patience) << at;
    }
}

/// Everything that a reading shows: its code, and each report with line and item.
std::string trace(const std::string& xml, bool use_runs, const vrl_test::answer& reply) {
    const exact_block block(xml, xml.size());
    vrl_test::recording_reader reader(block.data(), block.size(), reply);
    reader.use_runs(use_runs);
    Vrl document;
    std::string text = std::to_string(document.unmarshal(reader));
    for (const auto& report : reader.reports()) text += "\n" + report.message;
    return text + "\n" + std::to_string(document.size_Color());
}

// A run of bytes and one character at a time are two ways through the same scanner.
TEST(DamagedDocument, IsReadAlikeOnBothPaths) {
    const std::string xml = dense_document();
    const std::string bytes("<>\"&/x \0\xFF\n\r", 11);
    std::size_t turn = 0;
    for (std::size_t at = 0; at < xml.size(); at += 5) {
        std::string changed = xml;
        changed[at] = bytes[turn++ % bytes.size()];
        for (const std::string& damaged : {xml.substr(0, at), xml.substr(at), changed}) {
            // Each answer forgives a little longer, and then no more: no report may go on for ever.
            for (const int patience : {0, 1, 5}) {
                const auto reply = [patience, seen = 0](const vrl_test::report& r) mutable {
                    return seen++ < patience ? qbxV2::EQBX_NO_ERROR : r.code;
                };
                ASSERT_EQ(trace(damaged, true, reply), trace(damaged, false, reply)) << damaged;
            }
        }
    }
}

TEST(Fragment, IsReadToItsEnd) {
    for (const char* text : {" ",
                             " text",
                             "<",
                             "<a",
                             "</",
                             "</>",
                             "</a>",
                             "<!x>",
                             "<!",
                             "<!-",
                             "<!--",
                             "<!-- -->",
                             "<?",
                             "<?x",
                             "<?xml",
                             "<?xml version=\"1.0\"",
                             "<![CDATA[",
                             "<![CDATA[]]>",
                             "<!DOCTYPE",
                             "<!DOCTYPE a [",
                             "<!DOCTYPE a [<!ENTITY",
                             "<Vrl:Vrl",
                             "<Vrl:Vrl ",
                             "<Vrl:Vrl /",
                             "<Vrl:Vrl a",
                             "<Vrl:Vrl a=",
                             "<Vrl:Vrl a='1'",
                             "<Vrl:Vrl a='1' /",
                             "<Vrl:Vrl a='1' ?>",
                             "<Vrl:Vrl / >",
                             "<Vrl:Vrl>&",
                             "<Vrl:Vrl>&a",
                             "<Vrl:Vrl>&#",
                             "<Vrl:Vrl>&#x110000;",
                             "<Vrl:Vrl>&#0;",
                             "<Vrl:Vrl xsi:nil='",
                             "<Vrl:Vrl xmlns:Vrl='&'/>",
                             "\xEF\xBB\xBF",
                             "\xFF\xFE",
                             "\xFE\xFF",
                             "<Vrl:Preamble><Vrl:Header><Vrl:Creator"}) {
        const exact_block block(text, std::char_traits<char>::length(text));
        EXPECT_NE(Vrl().unmarshal(block.data(), static_cast<unsigned>(block.size())), 0) << text;
        EXPECT_LT(reports_of_a_patient_reader(text), 100) << text;
    }
}

TEST(Hostile, AttributesOfOneTagAreReadInTheirNumber) {
    std::string attributes;
    for (int i = 0; i < 20000; ++i) attributes += " a" + std::to_string(i) + "=\"1\"";
    Vrl document;
    const std::string xml = vrl_test::outermost("Vrl", vrl_test::preamble(), attributes);
    EXPECT_EQ(document.unmarshal(xml), 39);
    const auto result = vrl_test::read_document(document, xml, vrl_test::forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(result.count(39), 20000);
}

/// Entities of which each is ten of the one before: e0 has ten bytes, e5 a million.
std::string multiplying_entities(int count) {
    std::string dtd = "<!DOCTYPE Vrl [<!ENTITY e0 \"0123456789\">";
    for (int i = 1; i < count; ++i) {
        std::string ten;
        for (int k = 0; k < 10; ++k) ten += "&e" + std::to_string(i - 1) + ";";
        dtd += "<!ENTITY e" + std::to_string(i) + " \"" + ten + "\">";
    }
    return dtd + "]>";
}

TEST(Hostile, EntitiesThatMultiplyAreStopped) {
    const std::string dtd = multiplying_entities(12);
    const std::string in_attribute =
        dtd + vrl_test::document(vrl_test::element("Palette", vrl_test::history(), " PaletteName=\"&e11;\""));
    const std::string in_text =
        dtd + vrl_test::outermost("Vrl", vrl_test::preamble(vrl_test::element(
                                             "Owner", vrl_test::element("Company", "&e11;"))));
    for (const std::string& xml : {in_attribute, in_text}) {
        qbxV2::c_xml_reader_memory reader(xml.data(), xml.size());
        reader.set_max_entity_expansion(100000);
        EXPECT_NE(Vrl().unmarshal(reader), 0);
    }
    for (const std::string& xml : {in_attribute, in_text}) {
        EXPECT_LT(reports_of_a_patient_reader(xml), patient_reader::k_patience);
    }
}

TEST(Hostile, EntitiesWithinTheLimitAreRead) {
    const std::string xml =
        multiplying_entities(5) +
        vrl_test::outermost(
            "Vrl", vrl_test::preamble(vrl_test::element("Owner", vrl_test::element("Company", "&e4;"))));
    Vrl document;
    EXPECT_EQ(document.unmarshal(xml), 0);
    EXPECT_EQ(document.get_Preamble().get_Owner().get_Company(0).size(), 100000u);
}

TEST(Hostile, EntityOfItselfIsStopped) {
    for (const char* value : {"&e;", "&f;", "&e", "x&e;x"}) {
        const std::string dtd =
            std::string("<!DOCTYPE Vrl [<!ENTITY e \"") + value + "\"><!ENTITY f \"&e;\">]>";
        const std::string xml =
            dtd + vrl_test::outermost("Vrl", vrl_test::preamble(vrl_test::element(
                                                 "Owner", vrl_test::element("Company", "&e;"))));
        EXPECT_NE(Vrl().unmarshal(xml), 0) << value;
        EXPECT_LT(reports_of_a_patient_reader(xml), patient_reader::k_patience) << value;
    }
}

// The fault stands in the value, behind a start tag that was taken in whole: the tag has no end any more.
TEST(Hostile, EntityOfItselfInAnAttributeIsStopped) {
    for (const char* value : {"&e;", "&f;", "&e", "x&e;x"}) {
        const std::string dtd =
            std::string("<!DOCTYPE Vrl [<!ENTITY e \"") + value + "\"><!ENTITY f \"&e;\">]>";
        for (const char* attributes : {" PaletteName=\"&e;\"", " PaletteName=\"&e;\" UniqueID=\"u\""}) {
            const std::string xml =
                dtd + vrl_test::document(vrl_test::element("Palette", vrl_test::history(), attributes));
            EXPECT_NE(Vrl().unmarshal(xml), 0) << value;
            EXPECT_LT(reports_of_a_patient_reader(xml), patient_reader::k_patience) << value;
        }
    }
}

TEST(Hostile, SiblingsAreReadInTheirNumber) {
    std::string colors;
    for (int i = 0; i < 2000; ++i) colors += "<Vrl:Color/>";
    Vrl document;
    const auto result = vrl_test::read_document(document, vrl_test::document(colors), vrl_test::forgive);
    EXPECT_EQ(result.code, 0);
    EXPECT_EQ(document.size_Color(), 2000u);
    EXPECT_EQ(result.count(25), 2000);
    EXPECT_EQ(result.count(32), 2000);
}

}  // namespace
