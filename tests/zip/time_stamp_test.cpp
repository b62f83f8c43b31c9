#include "zip/time_stamp.h"

#include <gtest/gtest.h>

#include "support.h"

namespace {

struct Stamp {
    const char* why;
    std::int64_t time;
    std::uint16_t date;
    std::uint16_t clock;
};
void PrintTo(const Stamp& c, std::ostream* os) { *os << c.why; }

constexpr std::uint16_t Date(int year, int month, int day) {
    return static_cast<std::uint16_t>(((year - 1980) << 9) | (month << 5) | day);
}
constexpr std::uint16_t Clock(int hour, int minute, int second) {
    return static_cast<std::uint16_t>((hour << 11) | (minute << 5) | (second / 2));
}

class TimeStamps : public testing::TestWithParam<Stamp> {
protected:
    const zip_test::ScratchFolder folder;  // sets the time zone
};

class WrittenTimeStamp : public TimeStamps {};
TEST_P(WrittenTimeStamp, Is) {
    const ZipArchiveLib::TimeStamp stamp = ZipArchiveLib::TimeStampFromTime(GetParam().time);
    EXPECT_EQ(stamp.date, GetParam().date);
    EXPECT_EQ(stamp.time, GetParam().clock);
}
INSTANTIATE_TEST_SUITE_P(
    Times, WrittenTimeStamp,
    testing::Values(Stamp{"an even second", 1700000000, Date(2023, 11, 14), Clock(22, 13, 20)},
                    Stamp{"an odd second is rounded down", 1700000001, Date(2023, 11, 14), Clock(22, 13, 20)},
                    Stamp{"the last second of 1979 has the year field 0", 315532799, Date(1980, 12, 31),
                          Clock(23, 59, 58)},
                    Stamp{"1980 has the year field 0", 315532800, Date(1980, 1, 1), 0},
                    Stamp{"1981 has the year field 1", 347155200, Date(1981, 1, 1), 0},
                    Stamp{"1970 has the year field 0", 0, Date(1980, 1, 1), 0},
                    Stamp{"2107 is the last year", 4354819199, Date(2107, 12, 31), Clock(23, 59, 58)},
                    Stamp{"a later year is not wrapped", 4354819200, Date(2107, 1, 1), 0}));

class ReadTimeStamp : public TimeStamps {};
TEST_P(ReadTimeStamp, Is) {
    EXPECT_EQ(ZipArchiveLib::TimeFromTimeStamp({GetParam().clock, GetParam().date}), GetParam().time);
}
INSTANTIATE_TEST_SUITE_P(Stamps, ReadTimeStamp,
                         testing::Values(Stamp{"an even second", 1700000000, Date(2023, 11, 14),
                                               Clock(22, 13, 20)},
                                         Stamp{"the first day", 315532800, Date(1980, 1, 1), 0},
                                         Stamp{"month and day 0 are carried over", 312768000, 0, 0},
                                         Stamp{"every bit set is carried over", 4362710642, 0xFFFF, 0xFFFF}));

TEST(TimeStamp, ATimeThatCannotBeToldGivesZeros) {
    const ZipArchiveLib::TimeStamp stamp = ZipArchiveLib::TimeStampFromTime(INT64_MAX);
    EXPECT_EQ(stamp.date, 0);
    EXPECT_EQ(stamp.time, 0);
}

}  // namespace
