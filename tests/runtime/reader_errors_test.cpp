#include <gtest/gtest.h>

#include "reader_on_text.h"
#include "reading_paths.h"

namespace {

using namespace qbxV2;
using reader_on_text::Reading;
using reading_paths::join;

class Recovering : public c_xml_reader {
public:
    using c_xml_reader::c_xml_reader;
    eqbx_error user_handle_error(eqbx_error code, const std::string& item_name, const char* source_file,
                                 int source_line) override {
        seen =
            join({std::to_string(code), " ", item_name, " ", source_file, ":", std::to_string(source_line)});
        return answer == EQBX_UNDEFINED_ERROR
                   ? c_xml_reader::user_handle_error(code, item_name, source_file, source_line)
                   : answer;
    }
    eqbx_error user_handle_error(eqbx_error code) override {
        seen += " and " + std::to_string(code);
        return one_argument_answer;
    }
    std::string seen;
    eqbx_error answer = EQBX_UNDEFINED_ERROR;
    eqbx_error one_argument_answer = EQBX_NO_ERROR;
};

TEST(HandleError, ByDefaultReturnsTheCodeAndKeepsItWithTheItem) {
    Reading r("<a>\n\n<b/></a>");
    EXPECT_EQ(r.reader.get_error_message(&r.value), "No Error");
    EXPECT_EQ(r.reader.handle_error(EQBX_MANDATORY_ELEMENT_MISSING, "Vrl:Revision", "x.cpp", 3),
              EQBX_MANDATORY_ELEMENT_MISSING);
    EXPECT_EQ(r.reader.get_error_item_name(), "Vrl:Revision");
    EXPECT_EQ(&r.reader.get_error_message(&r.value), &r.value);
    EXPECT_EQ(r.value, "line:1-'Vrl:Revision'-Mandatory element missing");
    r.start_tag();
    r.element();
    EXPECT_EQ(r.reader.get_error_message(&r.value), "line:3-'Vrl:Revision'-Mandatory element missing")
        << "the line is that of the input now";
    EXPECT_EQ(r.reader.get_error(), EQBX_NO_ERROR) << "the scanner's record is another one";
}

TEST(HandleError, AnUnknownCodeHasNoText) {
    Reading r("<a/>");
    r.reader.handle_error(static_cast<eqbx_error>(999), "i", "", 0);
    EXPECT_EQ(r.reader.get_error_message(&r.value), "line:1-'i'-");
}

// Intended: the reader's own item name, handed back in, comes out empty.
TEST(HandleError, ItsOwnItemNameComesOutEmpty) {
    Reading r("<a/>");
    r.reader.handle_error(EQBX_BAD_CHOICE, "item", "", 0);
    r.reader.handle_error(EQBX_BAD_CHOICE, r.reader.get_error_item_name(), "", 0);
    EXPECT_EQ(r.reader.get_error_item_name(), "");
    EXPECT_EQ(r.reader.get_error_message(&r.value), "line:1-''-Inappropriate choice option selected");
}

TEST(UserHandleError, SeesEverythingAndItsAnswerIsTheResult) {
    const std::string text = "<a/>";
    c_read_string source(text);
    Recovering reader(source);
    std::string message;
    reader.answer = EQBX_USER_ERROR_9;
    EXPECT_EQ(reader.handle_error(EQBX_BAD_CHOICE, "item", "file.cpp", 12), EQBX_USER_ERROR_9);
    EXPECT_EQ(reader.seen, "7 item file.cpp:12");
    EXPECT_EQ(reader.get_error_message(&message), "line:1-'item'-User defined error 9");
    reader.answer = EQBX_UNDEFINED_ERROR;
    reader.one_argument_answer = EQBX_BAD_DTD;
    EXPECT_EQ(reader.handle_error(EQBX_BAD_CHOICE, "item", "file.cpp", 13), EQBX_BAD_DTD);
    EXPECT_EQ(reader.seen, "7 item file.cpp:13 and 7");
}

TEST(UserHandleError, AZeroClearsTheErrorAndKeepsTheItemName) {
    const std::string text = "<a/>";
    c_read_string source(text);
    Recovering reader(source);
    std::string message;
    reader.answer = EQBX_NO_ERROR;
    EXPECT_EQ(reader.handle_error(EQBX_BAD_CHOICE, "item", "file.cpp", 12), EQBX_NO_ERROR);
    EXPECT_EQ(reader.get_error_message(&message), "No Error");
    EXPECT_EQ(reader.get_error_item_name(), "item");
}

TEST(ReaderErrorInfo, IsThatOfTheScannersRecord) {
    Reading r("<a/>\n<1>");
    eqbx_error_type type = EQBX_ET_NONE;
    eqbx_error code = EQBX_NO_ERROR;
    int line = 0;
    EXPECT_FALSE(r.reader.get_error_info(&type, &code, &line));
    r.start_tag();
    r.element();
    ASSERT_TRUE(r.reader.get_error_info(&type, &code, &line));
    EXPECT_EQ(type, EQBX_ET_ERROR);
    EXPECT_EQ(code, EQBX_NOT_WELL_FORMED);
    EXPECT_EQ(line, 2);
}

}  // namespace
