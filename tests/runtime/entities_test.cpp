#include "runtime/entities.h"

#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/attribute_buffer.h"
#include "runtime/scanner.h"
#include "scan_trace.h"

namespace {

using namespace qbxV2;
using reading_paths::RecordingErrors;

/// A getter on a text, behind the two characters that tell the encoding.
struct Getter {
    explicit Getter(const std::string& behind)
        : text("<." + behind), source(text), errors(&log), get(source, errors) {
        get.get();
        get.get();
    }
    std::string rest() {
        std::string all;
        for (int c = get.get(); c != -1; c = get.get()) all += static_cast<char>(c);
        return all;
    }
    std::string text;
    c_read_string source;
    std::string log;
    RecordingErrors errors;
    c_get_with_entities get;
};

TEST(GetWithEntities, ReadsAnEntityBeforeTheInputGoesOn) {
    Getter g("z");
    EXPECT_TRUE(g.get.set_input_entity_value("ab"));
    EXPECT_TRUE(g.get.set_input_entity_value("c"));
    EXPECT_EQ(g.get.get_entity_stack_depth(), 2U);
    EXPECT_EQ(g.rest(), "cabz");
    EXPECT_EQ(g.get.get_entity_stack_depth(), 0U);
}

// Intended: a frame is dropped on the read behind its last byte.
TEST(GetWithEntities, AnEntityIsOpenUntilTheReadBehindItsLastByte) {
    Getter g("z");
    const char* const text = "a";
    g.get.set_input_entity_value(text);
    EXPECT_EQ(g.get.get(), 'a');
    EXPECT_EQ(g.get.get_entity_stack_depth(), 1U);
    EXPECT_EQ(g.get.get(), 'z');
    EXPECT_EQ(g.get.get_entity_stack_depth(), 0U);
    EXPECT_TRUE(g.get.set_input_entity_value(text)) << "it may be opened again";
}

// Intended: bytes from 0x80 come out negative.
TEST(GetWithEntities, BytesFrom0x80OfEntityTextAreNegative) {
    Getter g("\xC3\xA9");
    g.get.set_input_entity_value("\xC3\xA9");
    EXPECT_EQ(g.get.get(), -61);
    EXPECT_EQ(g.get.get(), -87);
    EXPECT_EQ(g.get.get(), 0xC3);
    EXPECT_EQ(g.get.get(), 0xA9);
}

TEST(GetWithEntities, LineEndsOfEntityTextCountNoLinesAndStayAsTheyAre) {
    Getter g("\n");
    g.get.set_input_entity_value("\r\n\n");
    EXPECT_EQ(g.get.get(), '\r');
    EXPECT_EQ(g.get.get(), '\n');
    EXPECT_EQ(g.get.get(), '\n');
    EXPECT_EQ(g.get.get_line_num(), 1);
    EXPECT_EQ(g.get.get(), '\n');
    EXPECT_EQ(g.get.get_line_num(), 2);
}

TEST(GetWithEntities, PushesBackOntoTheInnermostOpenEntity) {
    Getter g("z");
    g.get.unget('y');
    g.get.set_input_entity_value("a");
    EXPECT_EQ(g.get.get(), 'a');
    g.get.unget('a');
    g.get.unget(-1);
    EXPECT_EQ(g.get.get_entity_stack_depth(), 1U);
    EXPECT_EQ(g.get.get(), -1);
    EXPECT_EQ(g.get.get(), 'a');
    EXPECT_EQ(g.get.get(), 'y');
    EXPECT_EQ(g.get.get(), 'z');
}

TEST(GetWithEntities, TheSameValueMayNotBeOpenTwice) {
    Getter g("z");
    const std::string a = "same";
    const std::string b = "same";
    EXPECT_TRUE(g.get.set_input_entity_value(a.c_str()));
    EXPECT_TRUE(g.get.set_input_entity_value(b.c_str())) << "values are told apart by place, not by text";
    EXPECT_EQ(g.log, "");
    EXPECT_FALSE(g.get.set_input_entity_value(a.c_str()));
    EXPECT_EQ(g.log, " !0/9@1: Recursive entity definition for: same");
    EXPECT_EQ(g.get.get(), -1) << "a fatal report ends entity text too";
}

TEST(GetWithEntities, HoldsTwoTablesInWhichTheLastDefinitionWins) {
    Getter g("");
    g.get.add_general_entity("e", "1");
    g.get.add_general_entity("e", "2");
    g.get.add_parameter_entity("p", "3");
    const char* value = nullptr;
    EXPECT_TRUE(g.get.get_general_entity("e", &value));
    EXPECT_STREQ(value, "2");
    EXPECT_FALSE(g.get.get_general_entity("p", &value));
    EXPECT_TRUE(g.get.get_parameter_entity("p", &value));
    EXPECT_STREQ(value, "3");
    EXPECT_FALSE(g.get.get_parameter_entity("e", &value));
    g.get.rewind();
    EXPECT_FALSE(g.get.get_general_entity("e", &value));
    EXPECT_FALSE(g.get.get_parameter_entity("p", &value));
}

TEST(GetWithEntities, AnEntityThatIsRedefinedWhileOpenIsReadToTheEndOfItsOldText) {
    Getter g("z");
    const char* value = nullptr;
    g.get.add_general_entity("e", "old text");
    g.get.get_general_entity("e", &value);
    g.get.set_input_entity_value(value);
    EXPECT_EQ(g.get.get(), 'o');
    g.get.unget('O');
    g.get.add_general_entity("e", "new");
    g.get.get_general_entity("e", &value);
    EXPECT_TRUE(g.get.set_input_entity_value(value));
    EXPECT_EQ(g.rest(), "newOld textz");
    EXPECT_EQ(g.log, "");
}

TEST(GetWithEntities, AParameterEntityMayRedefineItself) {
    EXPECT_EQ(scan_trace::events(
                  "<!DOCTYPE a [<!ENTITY % p '<!ENTITY &#37; p \"x\"><!ENTITY e \"1\">'> %p;]><a>&e;</a>"),
              "<a> '1' </a> EOF");
}

// Intended: the stack outlasts a rewind.
TEST(GetWithEntities, AnOpenEntityOutlastsARewind) {
    Getter g("z");
    const char* value = nullptr;
    g.get.add_general_entity("e", "abc");
    g.get.get_general_entity("e", &value);
    g.get.set_input_entity_value(value);
    EXPECT_EQ(g.get.get(), 'a');
    g.get.rewind();
    EXPECT_EQ(g.get.get_entity_stack_depth(), 1U);
    EXPECT_EQ(g.rest(), "bc<.z");
}

TEST(EntityExpansion, IsLimitedForInputAndForValuesTogether) {
    for (const std::size_t limit : {11U, 12U}) {
        const bool fits = limit == 12;
        std::string log;
        const std::string text = "<!DOCTYPE a [<!ENTITY e '1234'>]><a b='&e;'>&e;&e;</a>";
        c_read_string source(text);
        RecordingErrors errors(&log);
        c_xml xml(source, errors, true);
        xml.set_max_entity_expansion(limit);
        c_xml_local scope;
        std::string name;
        bool is_empty = false;
        ASSERT_EQ(xml.get_element_name(&scope, &name), EQXP_NAME);
        ASSERT_EQ(xml.get_attribute_name(&name, false), EQXP_NAME);
        EXPECT_TRUE(xml.get_attribute_value(&name, EQBX_WS_PRESERVE));
        EXPECT_TRUE(xml.skip_start_tag(&is_empty));
        EXPECT_EQ(xml.get_element_value(&name, EQBX_WS_PRESERVE, true), fits);
        EXPECT_EQ(log, fits ? "" : " !0/9@1: Entity expansion exceeds the limit of 11 bytes");
        EXPECT_EQ(xml.has_exceeded_entity_expansion(), !fits);
    }
}

TEST(EntityExpansion, IsLimitedWithinValues) {
    std::string log;
    const std::string text = "<!DOCTYPE a [<!ENTITY e '&f;.&f;'><!ENTITY f '1234'>]><a b='&e;'/>";
    c_read_string source(text);
    RecordingErrors errors(&log);
    c_xml xml(source, errors, true);
    xml.set_max_entity_expansion(14);
    c_xml_local scope;
    std::string name;
    ASSERT_EQ(xml.get_element_name(&scope, &name), EQXP_NAME);
    ASSERT_EQ(xml.get_attribute_name(&name, false), EQXP_NAME);
    EXPECT_FALSE(xml.get_attribute_value(&name, EQBX_WS_PRESERVE));
    EXPECT_EQ(log, " !0/9@1: Entity expansion exceeds the limit of 14 bytes");
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_END_OF_MESSAGE);
}

TEST(EntityExpansion, StartsOverWithARewind) {
    Getter g("z");
    g.get.set_max_entity_expansion(3);
    EXPECT_TRUE(g.get.admit_entity_text("abc"));
    g.get.rewind();
    EXPECT_TRUE(g.get.admit_entity_text("abc"));
    EXPECT_FALSE(g.get.admit_entity_text("a"));
}

TEST(EntityExpansion, ALimitBelowWhatWasDeliveredAlreadyAdmitsNothing) {
    Getter g("z");
    EXPECT_TRUE(g.get.admit_entity_text("abc"));
    g.get.set_max_entity_expansion(2);
    EXPECT_FALSE(g.get.admit_entity_text("a"));
}

TEST(EntityNameReaders, StepBackUnlessAtTheStartOrTheEnd) {
    const char* const text = "a\xC3";
    const char* cursor = text;
    c_entity_name_reader_for_entity for_entity(text, &cursor);
    std::size_t index = 0;
    c_entity_name_reader_for_c_str for_c_str(text, &index);
    c_attribute_buffer buffer;
    buffer.bytes().append(text, 3);
    c_entity_name_reader_for_attribute_data for_attribute(buffer);
    for (c_entity_name_reader* reader :
         {static_cast<c_entity_name_reader*>(&for_entity), static_cast<c_entity_name_reader*>(&for_c_str),
          static_cast<c_entity_name_reader*>(&for_attribute)}) {
        EXPECT_FALSE(reader->is_input_mode());
        reader->unget('x');
        EXPECT_EQ(reader->get(), 'a') << "nothing before the start";
        EXPECT_EQ(reader->get(), 0xC3);
        EXPECT_EQ(reader->get(), -1);
        EXPECT_EQ(reader->get(), -1);
        reader->unget(-1);
        EXPECT_EQ(reader->get(), -1) << "the end is not stepped back over";
        reader->unget(0xC3);
        EXPECT_EQ(reader->get(), 0xC3);
    }
}

TEST(EntityNameReaders, OfTheInputReadAndPushBackThere) {
    Getter g("ab");
    c_entity_name_reader_for_c_get reader(g.get, true);
    EXPECT_TRUE(reader.is_input_mode());
    EXPECT_EQ(reader.get(), 'a');
    reader.unget('x');
    EXPECT_EQ(g.get.get(), 'x');
    EXPECT_EQ(reader.get(), 'b');
}

TEST(CallersEntities, CanBeDefinedBeforeReading) {
    const std::string text = "<a b='&e;'>&e;</a>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    xml.add_general_entity("e", "1");
    xml.add_parameter_entity("e", "2");
    c_xml_local scope;
    std::string name;
    xml.get_element_name(&scope, &name);
    xml.get_attribute_name(&name, false);
    EXPECT_TRUE(xml.get_attribute_value(&name, EQBX_WS_PRESERVE));
    EXPECT_EQ(name, "1");
    xml.rewind();
    xml.get_element_name(&scope, &name);
    xml.get_attribute_name(&name, false);
    EXPECT_FALSE(xml.get_attribute_value(&name, EQBX_WS_PRESERVE)) << "a rewind forgets them";
}

}  // namespace
