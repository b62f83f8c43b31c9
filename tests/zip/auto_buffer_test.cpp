#include "zip/auto_buffer.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace {

TEST(AutoBuffer, BeginsWithoutStorage) {
    const CZipAutoBuffer buffer;
    EXPECT_EQ(buffer.GetBuffer(), nullptr);
    EXPECT_EQ(buffer.GetSize(), 0U);
    EXPECT_FALSE(buffer.IsAllocated());
}

TEST(AutoBuffer, AllocateZeroOnStorageLeavesANullPointer) {
    CZipAutoBuffer buffer(10);
    ASSERT_NE(buffer.GetBuffer(), nullptr);
    EXPECT_EQ(buffer.Allocate(0), nullptr);
    EXPECT_EQ(buffer.GetBuffer(), nullptr);
    EXPECT_EQ(buffer.GetSize(), 0U);
}

TEST(AutoBuffer, TheSameSizeKeepsStorageAndBytes) {
    CZipAutoBuffer buffer;
    buffer.Assign("abcd", 4);
    const std::uint8_t* before = buffer.GetBuffer();
    EXPECT_EQ(buffer.Allocate(4), before);
    EXPECT_EQ(buffer.GetBuffer()[3], 'd');
}

TEST(AutoBuffer, TheSameSizeIsZeroedWhenAskedFor) {
    CZipAutoBuffer buffer;
    buffer.Assign("abcd", 4);
    buffer.Allocate(4, true);
    EXPECT_TRUE(std::all_of(buffer.GetBuffer(), buffer.GetBuffer() + 4, [](auto byte) { return byte == 0; }));
}

TEST(AutoBuffer, AnotherSizeIsAllocatedAnewAndZeroedWhenAskedFor) {
    CZipAutoBuffer buffer(4);
    buffer.Allocate(100, true);
    EXPECT_EQ(buffer.GetSize(), 100U);
    EXPECT_TRUE(
        std::all_of(buffer.GetBuffer(), buffer.GetBuffer() + 100, [](auto byte) { return byte == 0; }));
}

TEST(AutoBuffer, ReleaseFreesAndClears) {
    CZipAutoBuffer buffer(4);
    buffer.Release();
    EXPECT_EQ(buffer.GetBuffer(), nullptr);
    EXPECT_EQ(buffer.GetSize(), 0U);
}

TEST(AutoBuffer, CopiesAreDeep) {
    CZipAutoBuffer first;
    first.Assign("abc", 3);
    const CZipAutoBuffer second(first);
    CZipAutoBuffer third(7);
    third = first;
    first.GetBuffer()[0] = 'x';
    EXPECT_EQ(second.GetBuffer()[0], 'a');
    EXPECT_EQ(third.GetBuffer()[0], 'a');
    EXPECT_EQ(third.GetSize(), 3U);
    EXPECT_NE(second.GetBuffer(), first.GetBuffer());
}

TEST(AutoBuffer, AssigningToItselfChangesNothing) {
    CZipAutoBuffer buffer;
    buffer.Assign("abc", 3);
    const CZipAutoBuffer& same = buffer;
    buffer = same;
    EXPECT_EQ(buffer.GetSize(), 3U);
    EXPECT_EQ(buffer.GetBuffer()[2], 'c');
}

TEST(AutoBuffer, MovingHandsOverTheStorage) {
    CZipAutoBuffer first;
    first.Assign("abc", 3);
    const std::uint8_t* storage = first.GetBuffer();
    const CZipAutoBuffer second(std::move(first));
    EXPECT_EQ(second.GetBuffer(), storage);
    EXPECT_EQ(second.GetSize(), 3U);
}

}  // namespace
