#include <gtest/gtest.h>

#include <ios>
#include <locale>
#include <sstream>
#include <string>
#include <utility>

#include "runtime/writer.h"
#include "tests/runtime/writer_trial.h"

/// Pieces that wait in the writer until the stream is called.
namespace {

using qbxV2::c_xml_writer;
using vrl_test::asking_writer;
using vrl_test::trial;

TEST(WriterGathering, LetsTheStreamBeUsedInBetween) {
    trial t;
    t.out.open_element();
    t.out.put("a");
    t.out(false) << "b";
    t.out.put("c", 1);
    t.out.indent();
    t.out.put_indent();
    t.out.nest();
    t.out.put_line_end();
    t.out.close_element();
    EXPECT_EQ(t.os.str(), "abc\t\t\n") << "pieces come out in the order in which they went in";
}

TEST(WriterGathering, EndsWithTheOutermostElement) {
    trial t;
    t.out.open_element();
    t.out.open_element();
    t.out.put("x");
    t.out.close_element();
    t.out.put("y");
    t.out.close_element();
    EXPECT_FALSE(t.out.is_gathering());
    EXPECT_EQ(t.os.str(), "xy");
    t.out.put("z");
    EXPECT_EQ(t.os.str(), "xyz");
}

TEST(WriterGathering, KeepsNoMoreThanABufferful) {
    trial t;
    t.out.open_element();
    const std::string piece(1000, 'x');
    for (int i = 0; i < 100; ++i) t.out.put(piece.data(), piece.size());
    EXPECT_GT(t.os.str().size(), 50000u);
    t.out.close_element();
    EXPECT_EQ(t.os.str(), std::string(100000, 'x'));
}

TEST(WriterGathering, IsLeftToASubclassToRefuse) {
    std::ostringstream os;
    asking_writer out(os);
    out.open_element();
    EXPECT_FALSE(out.is_gathering()) << "it waits to be asked";
    out.indent();
    out.put_indent();
    out.put("x");
    out.put_line_end();
    out.close_element();
    EXPECT_EQ(os.str(), ".x|");
}

/// Fails once, then takes everything.
class failing_once : public std::stringbuf {
protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override {
        return std::exchange(m_fails, false) ? 0 : std::stringbuf::xsputn(text, length);
    }

private:
    bool m_fails = true;
};

TEST(WriterGathering, HandsNothingOverTwiceToAStreamThatThrows) {
    failing_once buffer;
    std::ostream os(&buffer);
    os.exceptions(std::ios_base::badbit);
    c_xml_writer out(os, "\t", "\n");
    out.open_element();
    out.put("a");
    EXPECT_THROW(out.close_element(), std::ios_base::failure);
    EXPECT_FALSE(out.is_gathering());
    os.clear();
    out.open_element();
    out.put("b");
    out.close_element();
    EXPECT_EQ(buffer.str(), "b");
}

TEST(WriterGathering, IsAbandonedWithoutASecondException) {
    failing_once buffer;
    std::ostream os(&buffer);
    os.exceptions(std::ios_base::badbit);
    c_xml_writer out(os, "\t", "\n");
    out.open_element();
    out.open_element();
    out.put("a");
    out.abandon_element();
    EXPECT_TRUE(out.is_gathering()) << "the outer one is open";
    out.abandon_element();
    EXPECT_FALSE(out.is_gathering());
    EXPECT_EQ(buffer.str(), "");
    os.clear();
    out.open_element();
    out.put("b");
    out.abandon_element();
    EXPECT_EQ(buffer.str(), "b") << "what waits goes out where it can";
}

TEST(WriterGathering, IsLeftToAStreamOfAnotherShape) {
    const auto gathers = [](void (*shape)(std::ostream&)) {
        trial t;
        shape(t.os);
        t.out.open_element();
        const bool result = t.out.is_gathering();
        t.out.close_element();
        return result;
    };
    EXPECT_TRUE(gathers([](std::ostream&) {}));
    EXPECT_FALSE(gathers([](std::ostream& os) { os.setf(std::ios::hex, std::ios::basefield); }));
    EXPECT_FALSE(gathers([](std::ostream& os) { os.precision(3); })) << "seconds would have more digits";
    EXPECT_FALSE(gathers([](std::ostream& os) {
        os.imbue(std::locale(std::locale::classic(), new std::numpunct<char>));
    })) << "a locale that came behind the writer shapes numbers too";
}

}  // namespace
