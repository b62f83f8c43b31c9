#include "runtime/stream_state.h"

#include <gtest/gtest.h>

#include <iomanip>
#include <sstream>

namespace {

using qbxV2::detail::prints_plainly;

TEST(PrintsPlainly, HoldsForAFreshStream) {
    std::ostringstream os;
    EXPECT_TRUE(prints_plainly(os));
    os << std::right << std::boolalpha << std::unitbuf << std::setfill('x') << std::setprecision(3);
    EXPECT_TRUE(prints_plainly(os)) << "none of these changes the text of a number without width";
}

TEST(PrintsPlainly, EndsWithEverythingThatShapesNumbers) {
    using manipulator = std::ios_base& (*)(std::ios_base&);
    const manipulator shapes[] = {std::hex,      std::oct,       std::fixed,    std::scientific,
                                  std::hexfloat, std::left,      std::internal, std::showpos,
                                  std::showbase, std::showpoint, std::uppercase};
    for (const manipulator shape : shapes) {
        std::ostringstream os;
        os << shape;
        EXPECT_FALSE(prints_plainly(os));
    }
    std::ostringstream wide;
    wide << std::setw(3);
    EXPECT_FALSE(prints_plainly(wide));
    std::ostringstream foreign;
    foreign.imbue(std::locale(std::locale::classic(), new std::numpunct<char>));
    EXPECT_FALSE(prints_plainly(foreign));
}

}  // namespace
