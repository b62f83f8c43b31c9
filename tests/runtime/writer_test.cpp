#include "runtime/writer.h"

#include <gtest/gtest.h>

#include <locale>
#include <sstream>
#include <streambuf>
#include <string>
#include <utility>
#include <vector>

#include "runtime/namespaces.h"
#include "tests/runtime/writer_trial.h"

namespace {

using qbxV2::c_xml_writer;
using qbxV2::eqbx_error;
using qbxV2::eqbx_error_type;
using qbxV2::s_ns_map;
using vrl_test::asking_writer;
using vrl_test::k_map;
using vrl_test::trial;

constexpr s_ns_map k_other_map[] = {{1000, "b", "urn:b"}, {0, nullptr, nullptr}};
constexpr s_ns_map k_long_map[] = {{1000, "a", "urn:a"},
                                   {1001, "", "urn:default"},
                                   {1002, "c", "urn:c"},
                                   {0, "d", nullptr},
                                   {5, "e", "urn:e"}};
const std::string k_xsi = " xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\"";

TEST(WriterDeclaration, FollowsTheFlags) {
    const std::string start = "<?xml version=\"1.0\" encoding=\"UTF-8\"";
    const std::vector<std::pair<int, std::string>> rows = {
        {0, ""},
        {c_xml_writer::include_xml_decl, start + "?>NL"},
        {c_xml_writer::include_standalone, start + " standalone=\"yes\"?>NL"},
        {c_xml_writer::include_xml_decl | c_xml_writer::include_standalone,
         start + " standalone=\"yes\"?>NL"},
        {4, ""},
        {5, start + "?>NL"}};
    for (const auto& [flags, text] : rows) {
        std::ostringstream os;
        const c_xml_writer out(os, flags, "TAB", "NL");
        EXPECT_EQ(os.str(), text) << flags;
    }
}

TEST(WriterDeclaration, IsNotWrittenWithoutFlags) {
    std::ostringstream os;
    const c_xml_writer out(os, "TAB", "NL");
    EXPECT_EQ(os.str(), "");
}

TEST(WriterDeclaration, HasFlagsOfFixedValues) {
    EXPECT_EQ(c_xml_writer::include_xml_decl, 1);
    EXPECT_EQ(c_xml_writer::include_standalone, 2);
}

struct german : std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
};

TEST(Writer, LeavesTheStreamInTheClassicLocale) {
    std::ostringstream os;
    os.imbue(std::locale(std::locale::classic(), new german));
    {
        const c_xml_writer out(os, "\t", "\n");
        EXPECT_EQ(os.getloc(), std::locale::classic());
    }
    EXPECT_EQ(os.getloc(), std::locale::classic()) << "behind its end, too";
    os << 1.5;
    EXPECT_EQ(os.str(), "1.5");
}

TEST(WriterIndentation, StartsAtNothingAndStaysThere) {
    trial t;
    t.out.undent();
    t.out.undent();
    EXPECT_EQ(&t.out(true), &t.os);
    EXPECT_EQ(t.os.str(), "") << "nothing is written at level 0";
    t.out.indent();
    t.out(true) << "x";
    EXPECT_EQ(t.os.str(), "\tx") << "and undoing nothing left the level at 0";
}

TEST(WriterIndentation, IsOneTabForEachLevelWhereALineBegins) {
    trial t;
    t.out.indent();
    t.out.indent();
    EXPECT_EQ(&t.out(false), &t.os);
    t.out(false) << "a";
    t.out(true) << "b";
    t.out.undent();
    t.out(true) << "c";
    EXPECT_EQ(t.os.str(), "a\t\tb\tc");
}

TEST(WriterIndentation, IsOneTabWhereItIsAskedForAlone) {
    trial t;
    t.out.nest();
    EXPECT_EQ(t.os.str(), "\t");
}

TEST(WriterLineEnd, IsGivenAndNotWritten) {
    std::ostringstream os;
    c_xml_writer out(os, "\t", "NL");
    EXPECT_STREQ(out.endl(), "NL");
    EXPECT_EQ(os.str(), "");
}

TEST(Writer, AsksASubclassForIndentAndLineEnd) {
    std::ostringstream os;
    asking_writer out(os);
    out.indent();
    out.indent();
    out(true) << "x" << out.endl();
    EXPECT_EQ(os.str(), "..x|");
}

TEST(NamespaceAttributes, AskForALineEndThatIsNotWritten) {
    std::ostringstream os;
    asking_writer out(os);
    out.conditionally_select_ns_map(k_map);
    out.conditionally_write_ns_attrs(true);
    EXPECT_EQ(out.ends, 1);
    EXPECT_EQ(os.str(), " xmlns:a=\"urn:a\"" + k_xsi) << "the start tag stays open, on its line";
    out.conditionally_write_ns_attrs(true);
    EXPECT_EQ(out.ends, 1);
}

TEST(NamespaceAttributes, AreWrittenOnce) {
    trial t;
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\"" + k_xsi);
    EXPECT_EQ(t.attributes(), "");
    t.out.add_namespace("x", "urn:x");
    EXPECT_EQ(t.attributes(), "");
    t.out.reenable_namespace_map_output();
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\" xmlns:x=\"urn:x\"" + k_xsi)
        << "all of it, and what came since";
    EXPECT_EQ(t.attributes(), "");
}

TEST(NamespaceAttributes, HaveTheMapThatWasSelectedFirst) {
    trial t;
    t.out.conditionally_select_ns_map(k_other_map);
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\"" + k_xsi);
    t.out.conditionally_select_ns_map(k_other_map);
    t.out.reenable_namespace_map_output();
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\"" + k_xsi) << "for the life of the writer";
}

TEST(NamespaceAttributes, HaveEachRowUpToOneWithoutUri) {
    std::ostringstream os;
    c_xml_writer out(os, "", "");
    out.conditionally_select_ns_map(k_long_map);
    out.conditionally_write_ns_attrs(false);
    EXPECT_EQ(os.str(), " xmlns:a=\"urn:a\" xmlns=\"urn:default\" xmlns:c=\"urn:c\"");
}

TEST(NamespaceAttributes, HaveTheAddedOnesInOrder) {
    trial t;
    t.out.add_namespace("y", "urn:y");
    t.out.add_default_namespace("urn:d");
    t.out.add_namespace("x", "urn:x");
    t.out.add_namespace("a", "urn:again");
    EXPECT_EQ(t.attributes(false),
              " xmlns:a=\"urn:a\" xmlns:y=\"urn:y\" xmlns=\"urn:d\" xmlns:x=\"urn:x\" xmlns:a=\"urn:again\"");
}

TEST(NamespaceAttributes, HaveTheSchemaInstanceWhereItIsNeeded) {
    EXPECT_EQ(trial().attributes(false), " xmlns:a=\"urn:a\"");
    trial with_location;
    with_location.out.add_schema_location("urn:a", "a.xsd");
    EXPECT_EQ(with_location.attributes(false),
              " xmlns:a=\"urn:a\"" + k_xsi + " xsi:schemaLocation=\"urn:a a.xsd\"");
    trial without_namespace;
    without_namespace.out.add_no_namespace_schema_location("n.xsd");
    EXPECT_EQ(without_namespace.attributes(false),
              " xmlns:a=\"urn:a\"" + k_xsi + " xsi:noNamespaceSchemaLocation=\"n.xsd\"");
}

TEST(SchemaLocations, StandInOneAttribute) {
    trial t;
    t.out.add_schema_location("urn:a", "a.xsd");
    t.out.add_schema_location("urn:b", "b.xsd");
    t.out.add_no_namespace_schema_location("n.xsd");
    EXPECT_EQ(t.attributes(),
              " xmlns:a=\"urn:a\"" + k_xsi + " xsi:schemaLocation=\"urn:a a.xsd urn:b b.xsd  n.xsd\"")
        << "a later one without namespace stands as it is";
}

// Intended: a first location without namespace speaks for the whole document.
TEST(SchemaLocations, BehindAFirstOneWithoutNamespaceAreIgnored) {
    trial t;
    t.out.add_no_namespace_schema_location("n.xsd");
    t.out.add_schema_location("urn:a", "a.xsd");
    t.out.add_no_namespace_schema_location("m.xsd");
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\"" + k_xsi + " xsi:noNamespaceSchemaLocation=\"n.xsd\"");
}

TEST(NamespaceAttributes, AreNotEscaped) {
    trial t;
    t.out.add_namespace("x", "urn:x?a=1&b=<2>'");
    t.out.add_schema_location("urn:a&b", "a.xsd?x&y");
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\" xmlns:x=\"urn:x?a=1&b=<2>'\"" + k_xsi +
                                  " xsi:schemaLocation=\"urn:a&b a.xsd?x&y\"");
}

TEST(NamespaceAttributes, KeepAZeroByteThatACallerPutIn) {
    const std::string zero(1, '\0');
    trial t;
    t.out.add_namespace("x" + zero + "y", "urn:" + zero + "x");
    t.out.add_schema_location("urn:" + zero, zero + "a.xsd");
    EXPECT_EQ(t.attributes(), " xmlns:a=\"urn:a\" xmlns:x" + zero + "y=\"urn:" + zero + "x\"" + k_xsi +
                                  " xsi:schemaLocation=\"urn:" + zero + " " + zero + "a.xsd\"");
    trial alone;
    alone.out.add_no_namespace_schema_location("a" + zero + "b");
    EXPECT_EQ(alone.attributes(),
              " xmlns:a=\"urn:a\"" + k_xsi + " xsi:noNamespaceSchemaLocation=\"a" + zero + "b\"");
}

TEST(NamespacePrefix, IsTheMapsBeforeAnAddedOne) {
    trial t;
    t.out.add_namespace("z", "urn:a");
    t.out.add_namespace("x", "urn:x");
    t.out.add_namespace("y", "urn:x");
    t.out.add_default_namespace("urn:d");
    EXPECT_STREQ(t.out.get_namespace_prefix("urn:a"), "a");
    EXPECT_STREQ(t.out.get_namespace_prefix("urn:x"), "x") << "the first of two";
    EXPECT_STREQ(t.out.get_namespace_prefix("urn:d"), "");
    EXPECT_EQ(t.out.get_namespace_prefix("urn:unknown"), nullptr);
    EXPECT_EQ(t.out.get_namespace_prefix("urn:"), nullptr) << "compared whole";
    EXPECT_EQ(t.out.get_namespace_prefix(""), nullptr);
}

TEST(ExpectedIdentity, IsSetReadAndCleared) {
    trial t;
    EXPECT_EQ(t.out.get_expected_class_identity(), nullptr);
    static const char id[] = "type";
    t.out.set_expected_class_identity(id);
    EXPECT_EQ(t.out.get_expected_class_identity(), id);
    t.out.clear_expected_class_identity();
    EXPECT_EQ(t.out.get_expected_class_identity(), nullptr);
}

std::string message(const c_xml_writer& out) {
    std::string text = "before";
    EXPECT_EQ(&out.get_error_message(&text), &text);
    return text;
}

TEST(WriterError, IsNoneInANewWriter) {
    const trial t;
    EXPECT_EQ(message(t.out), "No Error");
    EXPECT_EQ(t.out.get_error_item_name(), "");
}

TEST(WriterError, IsToldWithItsItem) {
    trial t;
    EXPECT_EQ(t.out.handle_error(qbxV2::EQBX_BAD_CHOICE, "Vrl:AxisValueChoice", "Vrl", 1), 7);
    EXPECT_EQ(message(t.out), "'Vrl:AxisValueChoice'-Inappropriate choice option selected");
    EXPECT_EQ(t.out.get_error_item_name(), "Vrl:AxisValueChoice");
    t.out.handle_error(qbxV2::EQBX_TYPE_NOT_SET, "Vrl:Other", "Vrl", 1);
    EXPECT_EQ(message(t.out), "'Vrl:Other'-Type not set") << "the last one counts";
}

TEST(WriterError, HasAnEmptyTextWhereTheCodeIsUnknown) {
    trial t;
    EXPECT_EQ(t.out.handle_error(static_cast<eqbx_error>(999), "item", "Vrl", 1), 999);
    EXPECT_EQ(message(t.out), "'item'-");
}

// Intended: the name is cleared before it is replaced, and not replaced by itself.
TEST(WriterError, LosesItsItemWhereItIsHandedBack) {
    trial t;
    t.out.handle_error(qbxV2::EQBX_BAD_CHOICE, "item", "Vrl", 1);
    t.out.handle_error(qbxV2::EQBX_TYPE_NOT_SET, t.out.get_error_item_name(), "Vrl", 1);
    EXPECT_EQ(message(t.out), "''-Type not set");
}

TEST(WriterError, IsNotInTheRecordOfTheScanner) {
    trial t;
    t.out.handle_error(qbxV2::EQBX_BAD_CHOICE, "item", "Vrl", 1);
    eqbx_error_type type = qbxV2::EQBX_ET_NOTE;
    eqbx_error error = qbxV2::EQBX_USER_ERROR_1;
    int line = -7;
    EXPECT_FALSE(t.out.get_error_info(&type, &error, &line));
    EXPECT_EQ(type, qbxV2::EQBX_ET_NOTE);
    EXPECT_EQ(error, 1000);
    EXPECT_EQ(line, -7);
}

class judging_writer : public c_xml_writer {
public:
    judging_writer(std::ostream& os, eqbx_error verdict) : c_xml_writer(os, "\t", "\n"), m_verdict(verdict) {}
    eqbx_error user_handle_error(eqbx_error error) override {
        asked.push_back(error);
        return m_verdict;
    }
    std::vector<int> asked;

private:
    eqbx_error m_verdict;
};

TEST(WriterError, CanBeForgivenByASubclass) {
    std::ostringstream os;
    judging_writer out(os, qbxV2::EQBX_NO_ERROR);
    EXPECT_EQ(out.handle_error(qbxV2::EQBX_BAD_CHOICE, "item", "Vrl", 1), 0);
    EXPECT_EQ(out.asked, std::vector<int>{7});
    EXPECT_EQ(message(out), "No Error");
    EXPECT_EQ(out.get_error_item_name(), "item");
}

TEST(WriterError, CanBeReplacedByASubclass) {
    std::ostringstream os;
    judging_writer out(os, qbxV2::EQBX_USER_ERROR_1);
    EXPECT_EQ(out.handle_error(qbxV2::EQBX_BAD_CHOICE, "item", "Vrl", 1), 1000);
    EXPECT_EQ(message(out), "'item'-User defined error 1");
}

class placing_writer : public c_xml_writer {
public:
    explicit placing_writer(std::ostream& os) : c_xml_writer(os, "\t", "\n") {}
    eqbx_error user_handle_error(eqbx_error error, const std::string& item, const char* file,
                                 int line) override {
        told = item + "@" + file + ":" + std::to_string(line);
        said_meanwhile = get_error_item_name();
        return error;
    }
    std::string told;
    std::string said_meanwhile;
};

TEST(WriterError, TellsASubclassItsPlace) {
    std::ostringstream os;
    placing_writer out(os);
    EXPECT_EQ(out.handle_error(qbxV2::EQBX_BAD_CHOICE, "item", "V2/file.cpp", 42), 7);
    EXPECT_EQ(out.told, "item@V2/file.cpp:42");
    EXPECT_EQ(out.said_meanwhile, "item") << "the item is noted before the subclass is asked";
}

/// A buffer that notes each request, and takes nothing.
class failing_buffer : public std::streambuf {
public:
    int syncs = 0;

protected:
    int_type overflow(int_type) override { return traits_type::eof(); }
    std::streamsize xsputn(const char*, std::streamsize) override { return 0; }
    int sync() override {
        ++syncs;
        return 0;
    }
};

TEST(Writer, DoesNotNoticeThatItsStreamFails) {
    failing_buffer buffer;
    std::ostream os(&buffer);
    {
        c_xml_writer out(os, c_xml_writer::include_xml_decl, "\t", "\n");
        EXPECT_TRUE(os.bad());
        out.conditionally_select_ns_map(k_map);
        out.conditionally_write_ns_attrs(true);
        out(true) << "x";
        EXPECT_EQ(message(out), "No Error");
    }
    EXPECT_EQ(buffer.syncs, 0) << "and its end does not flush";
}

TEST(Writer, WritesNothingAtItsEnd) {
    std::ostringstream os;
    {
        c_xml_writer out(os, "\t", "\n");
        out.indent();
        out(false) << "<open>";
    }
    EXPECT_EQ(os.str(), "<open>");
}

}  // namespace
