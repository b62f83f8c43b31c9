#include "zip/extra_field.h"

#include <gtest/gtest.h>

#include "raw_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::ExtraRecord;

bool Parse(CZipExtraField& field, const Bytes& bytes) {
    return field.Parse(reinterpret_cast<const std::uint8_t*>(bytes.data()),
                       static_cast<std::uint32_t>(bytes.size()));
}

Bytes Stored(const CZipExtraField& field) {
    Bytes bytes(field.GetTotalSize(), '\0');
    field.Store(reinterpret_cast<std::uint8_t*>(bytes.data()));
    return bytes;
}

TEST(ExtraField, ParsesAndStoresTheSameRecords) {
    CZipExtraField field;
    const Bytes bytes =
        ExtraRecord(0x5455, "abc") + ExtraRecord(0x9901, "") + ExtraRecord(1, Bytes(300, 'x'));
    ASSERT_TRUE(Parse(field, bytes));
    EXPECT_EQ(field.GetCount(), 3U);
    EXPECT_EQ(field.GetAt(0).id, 0x5455);
    EXPECT_EQ(field.GetAt(0).data.GetSize(), 3U);
    EXPECT_EQ(Stored(field), bytes);
}

TEST(ExtraField, NothingIsAFieldWithoutRecords) {
    CZipExtraField field;
    EXPECT_TRUE(Parse(field, ""));
    EXPECT_EQ(field.GetTotalSize(), 0U);
}

struct BadField {
    const char* why;
    Bytes bytes;
};
void PrintTo(const BadField& c, std::ostream* os) { *os << c.why; }

class UnreadableExtraField : public testing::TestWithParam<BadField> {};
TEST_P(UnreadableExtraField, IsRefused) {
    CZipExtraField field;
    EXPECT_FALSE(Parse(field, GetParam().bytes));
}
INSTANTIATE_TEST_SUITE_P(Fields, UnreadableExtraField,
                         testing::Values(BadField{"one byte", "a"}, BadField{"three bytes", "abc"},
                                         BadField{"a size above what remains", Bytes("\1\0\5\0abcd", 8)},
                                         BadField{"three bytes behind a record",
                                                  ExtraRecord(1, "a") + "abc"}));

TEST(ExtraField, FindsAndRemovesByNumber) {
    CZipExtraField field;
    ASSERT_TRUE(Parse(field, ExtraRecord(1, "a") + ExtraRecord(2, "b") + ExtraRecord(1, "c")));
    ASSERT_NE(field.Find(1), nullptr);
    EXPECT_EQ(field.Find(1)->data.GetBuffer()[0], 'a');
    EXPECT_EQ(field.Find(3), nullptr);
    field.Remove(1);
    EXPECT_EQ(Stored(field), ExtraRecord(2, "b"));
    field.Clear();
    EXPECT_EQ(field.GetCount(), 0U);
}

TEST(ExtraField, CopiesAreDeep) {
    CZipExtraField first;
    first.Add(1, 2);
    CZipExtraField second(first);
    second.Add(2, 0);
    const CZipExtraField& same = first;
    first = same;
    EXPECT_EQ(first.GetCount(), 1U);
    EXPECT_EQ(second.GetCount(), 2U);
    EXPECT_NE(first.Find(1), second.Find(1));
}

}  // namespace
