#include "runtime/error.h"

#include <gtest/gtest.h>

#include <exception>
#include <type_traits>
#include <vector>

#include "runtime/utf8_decoder.h"

namespace {

using namespace qbxV2;

struct Report {
    eqbx_error_type type;
    eqbx_error code;
    std::string source_id;
    int line;
    std::string message;
};

class Recording : public c_error {
public:
    void report_error(eqbx_error_type type, eqbx_error code, const char* source_id, int line,
                      const char* message) override {
        reports.push_back({type, code, source_id == nullptr ? "(null)" : source_id, line, message});
    }
    std::vector<Report> reports;
};

class NamedSource : public c_read_string {
public:
    NamedSource(const std::string& text, const char* name) : c_read_string(text), m_name(name) {}
    const char* get_source_id() override { return m_name; }

private:
    const char* m_name;
};

TEST(Error, AFreshRecordHasNoErrorAndLeavesTheArgumentsOfGetErrorInfoAlone) {
    const c_error errors;
    eqbx_error_type type = EQBX_ET_WARNING;
    eqbx_error code = EQBX_BAD_DTD;
    int line = 77;
    EXPECT_FALSE(errors.get_error_info(&type, &code, &line));
    EXPECT_EQ(type, EQBX_ET_WARNING);
    EXPECT_EQ(code, EQBX_BAD_DTD);
    EXPECT_EQ(line, 77);
    EXPECT_FALSE(errors.is_errored());
    EXPECT_FALSE(errors.is_fatal_errored());
    EXPECT_EQ(errors.get_last_error(), EQBX_NO_ERROR);
    EXPECT_EQ(errors.get_last_error_type(), EQBX_ET_NONE);
}

struct Severity {
    const char* why;
    eqbx_error_type type;
    bool errored;
    bool fatal;
};
void PrintTo(const Severity& s, std::ostream* os) { *os << s.why; }

class ErrorSeverity : public testing::TestWithParam<Severity> {};

TEST_P(ErrorSeverity, RaisesItsCountsAndIsRecorded) {
    Recording errors;
    errors.error(GetParam().type, EQBX_BAD_COMMENT, "file", 12, "text");
    EXPECT_EQ(errors.is_errored(), GetParam().errored);
    EXPECT_EQ(errors.is_fatal_errored(), GetParam().fatal);
    eqbx_error_type type = EQBX_ET_NONE;
    eqbx_error code = EQBX_NO_ERROR;
    int line = 0;
    ASSERT_TRUE(errors.get_error_info(&type, &code, &line));
    EXPECT_EQ(type, GetParam().type);
    EXPECT_EQ(code, EQBX_BAD_COMMENT);
    EXPECT_EQ(line, 12);
    ASSERT_EQ(errors.reports.size(), 1U);
    EXPECT_EQ(errors.reports[0].source_id, "file");
    EXPECT_EQ(errors.reports[0].message, "text");
}

INSTANTIATE_TEST_SUITE_P(All, ErrorSeverity,
                         testing::Values(Severity{"fatal", EQBX_ET_FATAL, true, true},
                                         Severity{"error", EQBX_ET_ERROR, true, false},
                                         Severity{"warning", EQBX_ET_WARNING, false, false},
                                         Severity{"note", EQBX_ET_NOTE, false, false},
                                         Severity{"none", EQBX_ET_NONE, false, false},
                                         Severity{"any other value behaves like none",
                                                  static_cast<eqbx_error_type>(9), false, false}));

TEST(Error, AWarningAfterAnErrorOverwritesTheLastErrorButNotTheCount) {
    c_error errors;
    errors.error(EQBX_ET_ERROR, EQBX_NOT_WELL_FORMED, "first");
    errors.error(EQBX_ET_WARNING, EQBX_BAD_COMMENT, "second");
    EXPECT_EQ(errors.get_last_error(), EQBX_BAD_COMMENT);
    EXPECT_EQ(errors.get_last_error_type(), EQBX_ET_WARNING);
    EXPECT_TRUE(errors.is_errored());
}

TEST(Error, NothingIsRecordedOrReportedAfterAFatalReport) {
    for (const eqbx_error_type later :
         {EQBX_ET_FATAL, EQBX_ET_ERROR, EQBX_ET_WARNING, EQBX_ET_NOTE, EQBX_ET_NONE}) {
        Recording errors;
        errors.error(EQBX_ET_FATAL, EQBX_BAD_DTD, nullptr, 3, "fatal");
        errors.error(later, EQBX_BAD_COMMENT, nullptr, 4, "later");
        EXPECT_EQ(errors.get_last_error(), EQBX_BAD_DTD);
        EXPECT_EQ(errors.get_last_error_type(), EQBX_ET_FATAL);
        EXPECT_EQ(errors.reports.size(), 1U);
    }
}

TEST(Error, WithoutAGetterTheSourceIsNullAndTheLineMinusOne) {
    Recording errors;
    errors.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "text");
    ASSERT_EQ(errors.reports.size(), 1U);
    EXPECT_EQ(errors.reports[0].source_id, "(null)");
    EXPECT_EQ(errors.reports[0].line, -1);
}

TEST(Error, TheInnermostLiveGetterIsNamedInReports) {
    const std::string text = "<\n\na";
    NamedSource outer_source(text, "outer");
    NamedSource inner_source(text, "inner");
    Recording errors;
    {
        c_get_as_utf8 outer(outer_source, errors);
        outer.get();
        outer.get();
        {
            c_get_as_utf8 inner(inner_source, errors);
            errors.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "a");
        }
        errors.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "b");
        outer.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, std::string("c"));
    }
    errors.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "d");
    ASSERT_EQ(errors.reports.size(), 4U);
    EXPECT_EQ(errors.reports[0].source_id, "inner");
    EXPECT_EQ(errors.reports[0].line, 1);
    EXPECT_EQ(errors.reports[1].source_id, "outer");
    EXPECT_EQ(errors.reports[1].line, 2);
    EXPECT_EQ(errors.reports[2].source_id, "outer");
    EXPECT_EQ(errors.reports[2].message, "c");
    EXPECT_EQ(errors.reports[3].line, -1);
}

TEST(Error, CopiesCarryTheWholeRecord) {
    const std::string text = "<";
    NamedSource source(text, "named");
    Recording errors;
    c_get_as_utf8 getter(source, errors);
    errors.error(EQBX_ET_ERROR, EQBX_NOT_WELL_FORMED, "text");
    const c_error copy = errors;
    eqbx_error_type type = EQBX_ET_NONE;
    eqbx_error code = EQBX_NO_ERROR;
    int line = 0;
    ASSERT_TRUE(copy.get_error_info(&type, &code, &line));
    EXPECT_EQ(code, EQBX_NOT_WELL_FORMED);
    EXPECT_EQ(line, 1);
    EXPECT_TRUE(copy.is_errored());
    Recording assigned;
    static_cast<c_error&>(assigned) = errors;
    assigned.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "the getter came along");
    EXPECT_EQ(assigned.reports.back().source_id, "named");
}

TEST(GetterErrorBinder, ASecondBindDoesNothing) {
    const std::string text = "<";
    c_read_string source(text);
    c_error errors;
    c_error other;
    c_get_as_utf8 first(source, other);
    c_get_as_utf8 second(source, other);
    c_getter_error_binder binder(errors);
    EXPECT_EQ(binder.get_new_getter(), nullptr);
    binder.bind(&first);
    binder.bind(&second);
    EXPECT_EQ(binder.get_new_getter(), &first);
    EXPECT_EQ(binder.get_old_getter(), nullptr);
}

TEST(GetterErrorBinder, UnboundItLeavesTheRecordAlone) {
    const std::string text = "<";
    NamedSource source(text, "kept");
    Recording errors;
    c_get_as_utf8 getter(source, errors);
    { c_getter_error_binder unused(errors); }
    errors.error(EQBX_ET_NOTE, EQBX_BAD_COMMENT, "text");
    EXPECT_EQ(errors.reports[0].source_id, "kept");
}

TEST(QbxException, HoldsACodeAndGivesItsText) {
    const c_qbx_exception exception(EQBX_BAD_DTD);
    const c_qbx_exception copy = exception;
    EXPECT_EQ(copy.get_error(), EQBX_BAD_DTD);
    EXPECT_STREQ(copy.what(), "Badly formed DTD");
}

TEST(QbxReaderException, AddsALine) {
    const c_qbx_reader_exception exception(EQBX_UNEXPECTED_END, 7);
    EXPECT_EQ(exception.get_line(), 7);
    EXPECT_EQ(exception.get_error(), EQBX_UNEXPECTED_END);
    const c_qbx_exception& base = exception;
    EXPECT_STREQ(base.what(), "Unexpected end of message");
}

TEST(QbxException, DerivesFromNoStandardException) {
    EXPECT_FALSE((std::is_base_of_v<std::exception, c_qbx_exception>));
    EXPECT_FALSE((std::is_base_of_v<std::exception, c_qbx_reader_exception>));
}

TEST(QbxException, TheLibraryIsBuiltWithoutThem) { EXPECT_EQ(QBX_USE_EXCEPTIONS, 0); }

}  // namespace
