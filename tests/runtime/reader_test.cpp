#include "runtime/reader.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

#include "reading_paths.h"
#include "runtime/xml_reader.h"

namespace {

using namespace qbxV2;
using reading_paths::join;

constexpr s_ns_map k_ns_map[] = {{1000, "V", "doc"}, {0, nullptr, nullptr}};
constexpr s_event_map k_map[] = {{1000, "one", 3, 14}, {1000, "other", 5, 15}, {1, "one", 3, 16},
                                 {1000, "one", 3, 17}, {1, "on", 2, 18},       {0, nullptr, 0, 0}};
constexpr s_event_map k_empty_map[] = {{0, nullptr, 0, 0}};
#define XSI "xmlns:i='http://www.w3.org/2001/XMLSchema-instance' "

/// A reader on a text, with the namespaces of the document format.
struct Reading {
    explicit Reading(const std::string& document) : text(document), source(text), reader(source) {
        reader.set_ns_map(k_ns_map);
    }
    int element(const s_event_map* map = k_map) {
        error = EQBX_NO_ERROR;
        reader.get_element_event(map, &error, &name);
        return reader.get_current_event();
    }
    bool attribute(const s_event_map* map = k_map) { return reader.get_attribute_event(map, &error, &name); }
    int event() const { return reader.get_current_event(); }

    std::string text;
    c_read_string source;
    c_xml_reader reader;
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    std::string value;
    bool is_empty = false;
};

struct Ending {
    const char* text;
    bool is_plain;
};
void PrintTo(const Ending& e, std::ostream* os) { *os << e.text; }

class EndEvent : public testing::TestWithParam<Ending> {};

TEST_P(EndEvent, IsTakenInItsPlainestFormAndLeavesEverythingAsTheNextEventWould) {
    const auto at_the_end_of_a_value = [](Reading& r) {
        ASSERT_EQ(r.element(), 14);
        while (r.attribute()) r.reader.skip_attribute_value();
        ASSERT_TRUE(r.reader.get_element_value(&r.value, EQBX_WS_COLLAPSE, true));
        r.error = EQBX_NO_ERROR;
    };
    const std::string document = std::string("<V:one xmlns:V='doc'>1\n2") + GetParam().text;
    Reading taken(document);
    Reading awaited(document);
    at_the_end_of_a_value(taken);
    at_the_end_of_a_value(awaited);
    const int before = taken.event();

    EXPECT_EQ(taken.reader.take_end_event("V:one"), GetParam().is_plain);
    if (!GetParam().is_plain) {
        EXPECT_EQ(taken.event(), before);
        taken.element();
    }
    awaited.element();
    for (int events = 0; events < 3; ++events) {
        EXPECT_EQ(taken.event(), awaited.event());
        EXPECT_EQ(taken.error, awaited.error);
        EXPECT_EQ(taken.reader.get_line_no(), awaited.reader.get_line_no());
        taken.element();
        awaited.element();
    }
}

INSTANTIATE_TEST_SUITE_P(Endings, EndEvent,
                         testing::Values(Ending{"</V:one>", true}, Ending{"</V:one>\n<V:other/>", true},
                                         Ending{"</V:one>tail", true}, Ending{"</V:one >", false},
                                         Ending{"</V:one\n>", false}, Ending{"</V:other>", false},
                                         Ending{"</V:on>", false}, Ending{"</V:one2>", false},
                                         Ending{"<V:one/>", false}, Ending{"</V:one", false},
                                         Ending{"</", false}));

struct Token {
    const char* why;
    const char* document;
    int event;
};
void PrintTo(const Token& t, std::ostream* os) { *os << t.why; }

class ElementToken : public testing::TestWithParam<Token> {};

TEST_P(ElementToken, IsThatOfTheFirstRowThatMatches) {
    Reading r(GetParam().document);
    EXPECT_EQ(r.element(), GetParam().event);
    EXPECT_EQ(r.error, EQBX_NO_ERROR);
    EXPECT_EQ(r.reader.is_current_event_tokenisable(), GetParam().event == 1 || GetParam().event >= 12);
    Reading ranged(GetParam().document);
    ranged.reader.get_element_event(k_map, k_map + 5, &ranged.error, &ranged.name);
    EXPECT_EQ(ranged.event(), GetParam().event);
}

INSTANTIATE_TEST_SUITE_P(
    Names, ElementToken,
    testing::Values(Token{"a prefix of the document namespace", "<V:one xmlns:V='doc'/>", 14},
                    Token{"any prefix of it", "<x:other xmlns:x='doc'/>", 15},
                    Token{"the default namespace", "<one xmlns='doc'/>", 14},
                    Token{"no default namespace", "<one/>", 16},
                    Token{"an undeclared default namespace", "<one xmlns=''/>", 16},
                    Token{"a shorter name", "<on/>", 18},
                    Token{"a longer name", "<ones/>", EQXP_UNKNOWN_ITEM},
                    Token{"the case counts", "<One/>", EQXP_UNKNOWN_ITEM},
                    Token{"another namespace", "<one xmlns='other'/>", EQXP_UNKNOWN_ITEM},
                    Token{"an undeclared prefix", "<q:one/>", EQXP_UNKNOWN_ITEM},
                    Token{"an empty local name", "<V: xmlns:V='doc'/>", EQXP_UNKNOWN_ITEM},
                    Token{"an element of the instance namespace", "<i:nil " XSI "/>", EQXP_XSI_NIL},
                    Token{"the instance namespace as the default one",
                          "<type xmlns='http://www.w3.org/2001/XMLSchema-instance'/>", EQXP_XSI_TYPE}));

class AttributeToken : public testing::TestWithParam<Token> {};

TEST_P(AttributeToken, IsThatOfTheFirstRowThatMatches) {
    for (const s_event_map* const map : {k_map, k_empty_map}) {
        Reading r(GetParam().document);
        r.element(nullptr);
        EXPECT_EQ(r.event(), EQXP_NAME);
        ASSERT_TRUE(r.attribute(map));
        EXPECT_EQ(r.error, EQBX_NO_ERROR);
        const bool is_token = GetParam().event >= EQXP_FIRST_TOKEN;
        EXPECT_EQ(r.event(),
                  map == k_empty_map && is_token ? static_cast<int>(EQXP_UNKNOWN_ITEM) : GetParam().event);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Names, AttributeToken,
    testing::Values(
        Token{"without a prefix it has no namespace", "<a one='1'/>", 16},
        Token{"under a default namespace too", "<a xmlns='doc' one='1'/>", 16},
        Token{"with a prefix it has that namespace", "<a xmlns:V='doc' V:one='1'/>", 14},
        Token{"an undeclared prefix", "<a q:one='1'/>", EQXP_UNKNOWN_ITEM},
        Token{"the instance namespace is no default for attributes",
              "<a xmlns='http://www.w3.org/2001/XMLSchema-instance' nil='1'/>", EQXP_UNKNOWN_ITEM},
        Token{"xsi:type", "<a " XSI "i:type='1'/>", EQXP_XSI_TYPE},
        Token{"xsi:nil", "<a " XSI "i:nil='1'/>", EQXP_XSI_NIL},
        Token{"xsi:schemaLocation", "<a " XSI "i:schemaLocation='1'/>", EQXP_XSI_SCHEMA_LOCATION},
        Token{"xsi:noNamespaceSchemaLocation", "<a " XSI "i:noNamespaceSchemaLocation='1'/>",
              EQXP_XSI_NO_NAMESPACE_SCHEMA_LOCATION},
        Token{"xsi:foo", "<a " XSI "i:foo='1'/>", EQXP_UNKNOWN_ITEM},
        Token{"xsi: in no other namespace", "<a xmlns:xsi='u' xsi:nil='1'/>", EQXP_UNKNOWN_ITEM}));

TEST(Tokenise, AnEmptyTableOrRangeKnowsNothing) {
    Reading r("<one/>");
    EXPECT_EQ(r.element(k_empty_map), EQXP_UNKNOWN_ITEM);
    r.reader.restore_event(EQXP_NAME);
    r.reader.tokenise(k_map, k_map, EQXP_ELEMENT);
    EXPECT_EQ(r.event(), EQXP_UNKNOWN_ITEM);
    r.reader.tokenise(nullptr, nullptr, EQXP_ELEMENT);
    EXPECT_EQ(r.event(), EQXP_UNKNOWN_ITEM);
    r.reader.tokenise(k_map, EQXP_ELEMENT);
    EXPECT_EQ(r.event(), 16);
    r.reader.tokenise(k_map + 2, k_map + 3, EQXP_ELEMENT);
    EXPECT_EQ(r.event(), 16);
    r.reader.tokenise(k_map + 3, k_map + 5, EQXP_ELEMENT);
    EXPECT_EQ(r.event(), EQXP_UNKNOWN_ITEM);
}

TEST(ElementEvent, WithoutATableIsTheBareName) {
    Reading r("<V:one xmlns:V='doc' b='1'>x</V:one>");
    EXPECT_EQ(r.element(nullptr), EQXP_NAME);
    EXPECT_EQ(r.name, "V:one");
    EXPECT_EQ(r.reader.get_full_name(), "V:one");
    EXPECT_EQ(r.reader.get_local_name(), "one");
    EXPECT_TRUE(r.reader.get_has_ns_prefix());
    EXPECT_EQ(r.reader.get_ns_id(), 1000);
    EXPECT_EQ(r.reader.get_element_ns_id(), 1000);
    EXPECT_EQ(r.reader.get_cracked_name().get_ns_prefix(), "V");
    EXPECT_TRUE(r.reader.is_current_event_tokenisable());
}

TEST(ElementEvent, LeavesTheErrorAloneWhereThereIsNone) {
    Reading r("<a>x</a>");
    r.error = EQBX_USER_ERROR_1;
    for (const int event : {EQXP_NAME, EQXP_TEXT, EQXP_END_TAG}) {
        r.reader.get_element_event(nullptr, &r.error, &r.name);
        EXPECT_EQ(r.event(), event);
        EXPECT_EQ(r.error, EQBX_USER_ERROR_1);
        EXPECT_EQ(r.reader.is_current_event_tokenisable(), event == EQXP_NAME);
        if (event == EQXP_NAME) r.reader.skip_start_tag(nullptr);
    }
}

TEST(ElementEvent, AtTheEndOfInputIsUnexpectedEnd) {
    Reading r("");
    EXPECT_EQ(r.element(), EQXP_END_OF_MESSAGE);
    EXPECT_EQ(r.error, EQBX_UNEXPECTED_END);
}

TEST(ElementEvent, OfAFailureHasTheLastErrorOfTheRecord) {
    Reading r(" <1>");
    EXPECT_EQ(r.element(), EQXP_ERROR);
    EXPECT_EQ(r.error, EQBX_NOT_WELL_FORMED);
    EXPECT_EQ(r.reader.get_error(), EQBX_NOT_WELL_FORMED);
}

// Intended: where the scanner makes no report there is no error to hand out.
TEST(ElementEvent, OfAFailureWithoutAReportHasNoError) {
    Reading r("<!x>");
    EXPECT_EQ(r.element(), EQXP_ERROR);
    EXPECT_EQ(r.error, EQBX_NO_ERROR);
}

TEST(ElementEvent, ForgetsTheDeclarationsOfTheTagBefore) {
    Reading r("<r><V:one xmlns:V='doc'/><V:one/></r>");
    r.element();
    r.attribute();
    c_xml_reader_local scope(r.reader);
    EXPECT_EQ(r.element(), 14);
    r.attribute();
    EXPECT_EQ(r.element(), EQXP_UNKNOWN_ITEM) << "siblings don't see each other's declarations";
}

TEST(AttributeEvent, TellsHowATagWithoutAttributesEnds) {
    Reading empty("<a/>");
    empty.element();
    empty.error = EQBX_USER_ERROR_1;
    EXPECT_FALSE(empty.attribute());
    EXPECT_EQ(empty.error, EQBX_NO_ERROR);
    EXPECT_EQ(empty.event(), EQXP_END_TAG);
    Reading open("<a>");
    open.element();
    EXPECT_FALSE(open.attribute());
    EXPECT_EQ(open.event(), EQXP_START_TAG_END);
}

TEST(AttributeEvent, OfABrokenTagIsAnError) {
    Reading r("<a !>");
    r.element();
    EXPECT_TRUE(r.attribute());
    EXPECT_EQ(r.event(), EQXP_ERROR);
    EXPECT_EQ(r.error, EQBX_NOT_WELL_FORMED);
}

TEST(AfterAFatalReport, EveryEventCallEndsWithAnError) {
    Reading r("<a b='1' c=>x</a><d/>");
    EXPECT_EQ(r.element(), EQXP_ERROR);
    EXPECT_EQ(r.error, EQBX_NOT_WELL_FORMED);
    for (int i = 0; i < 2; ++i) {
        EXPECT_TRUE(r.attribute());
        EXPECT_EQ(r.event(), EQXP_ERROR);
        EXPECT_EQ(r.error, EQBX_NOT_WELL_FORMED);
        EXPECT_EQ(r.element(), EQXP_END_OF_MESSAGE);
        EXPECT_EQ(r.error, EQBX_UNEXPECTED_END);
        r.error = EQBX_NO_ERROR;
        r.reader.get_known_element_event(k_map, &r.error, &r.name);
        EXPECT_EQ(r.error, EQBX_UNEXPECTED_END);
        r.reader.rewind();
    }
}

struct SimpleValue {
    const char* document;
    const char* outcome;
};
void PrintTo(const SimpleValue& v, std::ostream* os) { *os << v.document; }

class SimpleTypeValue : public testing::TestWithParam<SimpleValue> {};

TEST_P(SimpleTypeValue, IsReadToBehindTheElement) {
    const std::string outcome =
        reading_paths::on_all_paths(GetParam().document, [](c_read& source, bool use_runs) {
            c_xml_reader reader(source);
            reader.use_runs(use_runs);
            eqbx_error error = EQBX_NO_ERROR;
            std::string name;
            std::string value = "previous";
            bool is_empty = false;
            reader.get_element_event(nullptr, &error, &name);
            const bool read = reader.get_simple_type_value(name, EQBX_WS_COLLAPSE, &value, &error, &is_empty);
            EXPECT_EQ(reader.get_current_event(), EQXP_NAME) << "the event stays";
            std::string log = join(
                {read ? "true " : "false ", std::to_string(error), " '", value, is_empty ? "' empty" : "'"});
            if (read) {
                reader.get_element_event(nullptr, &error, &name);
                log += join({" then ", name});
            }
            return log;
        });
    EXPECT_EQ(outcome, GetParam().outcome);
}

INSTANTIATE_TEST_SUITE_P(
    Documents, SimpleTypeValue,
    testing::Values(SimpleValue{"<a b='1'> 1  2 </a><z/>", "true 0 '1 2' then z"},
                    SimpleValue{"<a/><z/>", "true 0 '' empty then z"},
                    SimpleValue{"<a></a><z/>", "true 0 '' then z"},
                    SimpleValue{"<a>1&lt;</a><z/>", "true 0 '1<' then z"},
                    SimpleValue{"<a>1<b/></a>", "false 10 '1'"}, SimpleValue{"<a>1</b>", "false 10 '1'"},
                    SimpleValue{"<a>1", "false 29 '1'"}, SimpleValue{"<a>1&u;</a>", "false 29 '1&u;'"},
                    SimpleValue{"<a /x>1</a>", "false 11 '' empty"}, SimpleValue{"<a !", "false 11 ''"}));

class ElementUrValue : public testing::TestWithParam<SimpleValue> {};

TEST_P(ElementUrValue, IsTheContentAsText) {
    const std::string outcome =
        reading_paths::on_all_paths(GetParam().document, [](c_read& source, bool use_runs) {
            c_xml_reader reader(source);
            reader.use_runs(use_runs);
            eqbx_error error = EQBX_NO_ERROR;
            std::string name;
            std::string value = "previous";
            bool is_empty = false;
            reader.get_element_event(nullptr, &error, &name);
            const bool read = reader.get_element_ur_value(name, &value, &error, &is_empty);
            return join({read ? "true " : "false ", std::to_string(error), " '", value,
                         is_empty ? "' empty" : "'", " event ", std::to_string(reader.get_current_event())});
        });
    EXPECT_EQ(outcome, GetParam().outcome);
}

INSTANTIATE_TEST_SUITE_P(Documents, ElementUrValue,
                         testing::Values(SimpleValue{"<a> x <b c='1'>y</b></a>",
                                                     "true 0 ' x <b c='1'>y</b>' event 6"},
                                         SimpleValue{"<a/>", "true 0 '' empty event 7"},
                                         SimpleValue{"<a>x</b>", "false 10 'x' event 6"},
                                         SimpleValue{"<a>x", "false 29 'x' event 7"},
                                         SimpleValue{"<a /x>", "false 11 '' empty event 7"}));

TEST(NestedElementValue, SetsTheEventOnSuccessOnly) {
    Reading r("<a>x<b/></a>");
    r.element();
    r.reader.skip_start_tag(nullptr);
    EXPECT_TRUE(r.reader.get_nested_element_value(&r.value, &r.name, EQBX_WS_PRESERVE, false));
    EXPECT_EQ(r.value, "x<b/>");
    EXPECT_EQ(r.event(), EQXP_END_TAG);
    r.reader.restore_event(99);
    EXPECT_FALSE(r.reader.get_nested_element_value(&r.value, &r.name, EQBX_WS_PRESERVE, false));
    EXPECT_EQ(r.event(), 99);
}

constexpr s_known_elements k_known[] = {{1, "known", 5}, {1000, "known", 5}, {0, nullptr, 0}};

struct Known {
    const char* why;
    const char* body;
    const s_event_map* map;
    int event;
    eqbx_error error;
    const char* name;
};
void PrintTo(const Known& k, std::ostream* os) { *os << k.why; }

class KnownElementEvent : public testing::TestWithParam<Known> {};

TEST_P(KnownElementEvent, SkipsWhatNobodyKnows) {
    Reading r(join({"<r xmlns:V='doc'>", GetParam().body, "</r>"}));
    r.element();
    r.attribute();
    c_xml_reader_local scope(r.reader);
    const c_known_elements_selector selector(r.reader, k_known);
    r.error = EQBX_NO_ERROR;
    r.reader.get_known_element_event(GetParam().map, &r.error, &r.name);
    EXPECT_EQ(r.event(), GetParam().event);
    EXPECT_EQ(r.error, GetParam().error);
    EXPECT_EQ(r.name, GetParam().name);
}

INSTANTIATE_TEST_SUITE_P(
    Bodies, KnownElementEvent,
    testing::Values(
        Known{"a name of the table", "<V:one/>", k_map, 14, EQBX_NO_ERROR, "V:one"},
        Known{"behind unknown ones", "<x>y<z/></x><w/><V:one/>", k_map, 14, EQBX_NO_ERROR, "V:one"},
        Known{"a known one", "<x/><known/>", k_map, EQXP_UNKNOWN_ITEM, EQBX_NO_ERROR, "known"},
        Known{"a known one in the document namespace", "<V:known/>", k_map, EQXP_UNKNOWN_ITEM, EQBX_NO_ERROR,
              "V:known"},
        Known{"without a table", "<V:one/><known/>", nullptr, EQXP_NAME, EQBX_NO_ERROR, "known"},
        Known{"an end tag", "<x/>", k_map, EQXP_END_TAG, EQBX_NO_ERROR, "r"},
        Known{"text", "<x/>text", k_map, EQXP_TEXT, EQBX_NO_ERROR, "text"},
        Known{"an unknown one that is not well-formed", "<x><y></x>", k_map, EQXP_UNKNOWN_ITEM,
              EQBX_BADLY_FORMED, "x"},
        Known{"an unknown one with a bad tag", "<x /y>", k_map, EQXP_UNKNOWN_ITEM, EQBX_BADLY_FORMED, "x"},
        Known{"a broken one", "<1>", k_map, EQXP_ERROR, EQBX_NOT_WELL_FORMED, ""}));

TEST(KnownElements, AreSelectedForAScope) {
    Reading r("<a/>");
    EXPECT_EQ(r.reader.get_known_elements(), nullptr);
    {
        const c_known_elements_selector outer(r.reader, k_known);
        {
            const c_known_elements_selector inner(r.reader, k_known + 1);
            EXPECT_EQ(r.reader.get_known_elements(), k_known + 1);
        }
        EXPECT_EQ(r.reader.get_known_elements(), k_known);
    }
    EXPECT_EQ(r.reader.get_known_elements(), nullptr);
    r.reader.set_known_elements(k_known);
    EXPECT_EQ(r.reader.get_known_elements(), k_known);
}

TEST(KnownElements, WithoutATableOfThemEveryUnknownElementIsSkipped) {
    Reading r("<x/><one/>");
    r.reader.get_known_element_event(k_map, &r.error, &r.name);
    EXPECT_EQ(r.event(), 16);
}

TEST(ReaderLocal, NestsLikeAStack) {
    Reading r("<a/>");
    c_xml_reader_local* const root = r.reader.get_reader_local();
    {
        c_xml_reader_local outer(r.reader);
        outer.add_namespace("p", 1234);
        EXPECT_EQ(r.reader.get_reader_local(), &outer);
        {
            const c_xml_reader_local inner(r.reader);
            EXPECT_EQ(r.reader.get_reader_local(), &inner);
            EXPECT_EQ(inner.find_namespace_id("p"), 1234);
        }
        EXPECT_EQ(r.reader.get_reader_local(), &outer);
        r.reader.set_reader_local(root);
        EXPECT_EQ(r.reader.get_reader_local(), root);
    }
    EXPECT_EQ(r.reader.get_reader_local(), root);
    { c_xml_reader_local loose; }
    EXPECT_EQ(r.reader.get_reader_local(), root);
}

TEST(ReaderForwards, XsiAndNamedAttributesWithTheCurrentScope) {
    Reading r("<a " XSI "i:type='V:T' xmlns:V='doc' b='1'/>");
    r.element();
    int ns_id = 0;
    EXPECT_TRUE(r.reader.get_xsi_type(&ns_id, &r.value));
    EXPECT_EQ(ns_id, 1000);
    EXPECT_EQ(r.value, "T");
    EXPECT_TRUE(r.reader.is_xsi_attribute("i:anything"));
    EXPECT_FALSE(r.reader.is_xsi_attribute("b"));
    EXPECT_TRUE(r.reader.get_named_attribute(0, "b", &r.value));
    EXPECT_EQ(r.value, "1");
}

TEST(ReaderDepth, IsTheNumberOfNamesOnTheStack) {
    Reading r("<a/>");
    EXPECT_EQ(r.reader.depth(), 0U);
    EXPECT_EQ(r.reader.get_max_depth(), 2000U);
    {
        const c_string_stack_node a(r.reader.get_element_name_stack(), "a");
        const c_string_stack_node b(r.reader.get_element_name_stack(), "b");
        EXPECT_EQ(r.reader.depth(), 2U);
        EXPECT_EQ(r.reader.get_element_name_stack().get_stack_size(), 4U);
    }
    EXPECT_EQ(r.reader.depth(), 0U);
    r.reader.set_max_depth(7);
    EXPECT_EQ(r.reader.get_max_depth(), 7U);
}

TEST(ReaderBuffers, AreThreeDifferentOnesOfTheReaders) {
    Reading r("<a/>");
    EXPECT_NE(&r.reader.element_name_buffer(), &r.reader.value_buffer());
    EXPECT_NE(&r.reader.element_name_buffer(), &r.reader.attribute_name_buffer());
    EXPECT_NE(&r.reader.value_buffer(), &r.reader.attribute_name_buffer());
    EXPECT_EQ(r.reader.value_buffer(), "");
}

TEST(ReaderMemory, ReadsBorrowedBytes) {
    const reading_paths::ExactMemory memory("<one/>");
    c_xml_reader_memory reader(memory.data(), memory.size());
    EXPECT_TRUE(reader.is_open());
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    reader.get_element_event(k_map, &error, &name);
    EXPECT_EQ(reader.get_current_event(), 16);
    EXPECT_EQ(reader.get_source_id(), nullptr);
}

TEST(ReaderFile, ReadsByPathByWidePathAndByStream) {
    const std::string path = (std::filesystem::temp_directory_path() / "vrl_reader_test.xml").string();
    std::ofstream(path, std::ios::binary) << "<one/>";
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    c_xml_reader_file by_path(path.c_str());
    c_xml_reader_file by_wide_path(std::wstring(path.begin(), path.end()).c_str());
    c_xml_reader_file by_stream(std::fopen(path.c_str(), "rb"));
    for (c_xml_reader_file* const reader : {&by_path, &by_wide_path, &by_stream}) {
        EXPECT_TRUE(reader->is_open());
        reader->get_element_event(k_map, &error, &name);
        EXPECT_EQ(reader->get_current_event(), 16);
    }
    EXPECT_EQ(by_path.get_source_id(), path);
    EXPECT_EQ(by_wide_path.get_source_id(), path);
    EXPECT_STREQ(by_stream.get_source_id(), "");
    std::filesystem::remove(path);
}

TEST(ReaderFile, AMissingOneIsNotOpenAndHasNoElement) {
    c_xml_reader_file reader("no/such/file.vrl");
    EXPECT_FALSE(reader.is_open());
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    reader.get_element_event(k_map, &error, &name);
    EXPECT_EQ(error, EQBX_UNEXPECTED_END);
}

TEST(Enumerations, HaveTheirNumbers) {
    EXPECT_EQ(EQXP_END_OF_MESSAGE, 0);
    EXPECT_EQ(EQXP_UNKNOWN_ITEM, 1);
    EXPECT_EQ(EQXP_ERROR_EVENT, 2);
    EXPECT_EQ(EQXP_ERROR, 3);
    EXPECT_EQ(EQXP_START_TAG_END, 4);
    EXPECT_EQ(EQXP_TEXT, 5);
    EXPECT_EQ(EQXP_END_TAG, 6);
    EXPECT_EQ(EQXP_NAME, 7);
    EXPECT_EQ(EQXP_XSI_TYPE, 8);
    EXPECT_EQ(EQXP_XSI_NIL, 9);
    EXPECT_EQ(EQXP_XSI_SCHEMA_LOCATION, 10);
    EXPECT_EQ(EQXP_XSI_NO_NAMESPACE_SCHEMA_LOCATION, 11);
    EXPECT_EQ(EQXP_FIRST_TOKEN, 12);
    EXPECT_EQ(EQXP_ATTRIBUTE, 0);
    EXPECT_EQ(EQXP_ELEMENT, 1);
    EXPECT_EQ(EQBX_WS_PRESERVE, 0);
    EXPECT_EQ(EQBX_WS_REPLACE, 1);
    EXPECT_EQ(EQBX_WS_COLLAPSE, 2);
}

}  // namespace
