#include "V2/block_file.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <string>

#include "tests/zip/support.h"

namespace {

using vrl_v2::block_file;
using zip_test::CodeOf;

std::string read(block_file& file, std::uint32_t count) {
    std::string got(count, '?');
    got.resize(file.Read(got.data(), count));
    return got;
}

TEST(BlockFile, IsReadFromWhereItStands) {
    block_file file("abcdef");
    EXPECT_TRUE(file.Open("elsewhere", CZipAbstractFile::modeRead, true));
    EXPECT_EQ(file.GetLength(), 6U);
    EXPECT_EQ(read(file, 2), "ab");
    EXPECT_EQ(file.GetPosition(), 2U);
    EXPECT_EQ(file.Seek(1, CZipAbstractFile::current), 3U);
    EXPECT_EQ(read(file, 10), "def");
    EXPECT_EQ(read(file, 10), "");
    EXPECT_EQ(file.Seek(-2, CZipAbstractFile::end), 4U);
    EXPECT_EQ(read(file, 1), "e");
    EXPECT_EQ(file.SeekToBegin(), 0U);
    EXPECT_EQ(file.SeekToEnd(), 6U);
    file.Flush();
    file.Close();
    EXPECT_FALSE(file.IsClosed());
    EXPECT_EQ(file.GetFilePath(), "");
}

TEST(BlockFile, HasNothingBeyondItsEnd) {
    block_file file("abc");
    for (const std::int64_t place : {std::int64_t{3}, std::int64_t{4}, std::int64_t{0xFFFFFFFF}}) {
        EXPECT_EQ(file.Seek(place, CZipAbstractFile::begin), place);
        EXPECT_EQ(read(file, 5), "");
        EXPECT_EQ(file.GetPosition(), place) << "it stays where it was put";
    }
    EXPECT_EQ(file.GetLength(), 3U);
}

TEST(BlockFile, RefusesPositionsThatAnArchiveCannotHave) {
    block_file file("abc");
    file.Seek(1, CZipAbstractFile::begin);
    EXPECT_EQ(CodeOf([&] { file.Seek(-2, CZipAbstractFile::current); }), EINVAL);
    EXPECT_EQ(CodeOf([&] { file.Seek(-1, CZipAbstractFile::begin); }), EINVAL);
    EXPECT_EQ(CodeOf([&] { file.Seek(0xFFFFFFFF, CZipAbstractFile::current); }), EFBIG);
    EXPECT_EQ(CodeOf([&] { file.Seek(INT64_MAX, CZipAbstractFile::end); }), EFBIG);
    EXPECT_EQ(CodeOf([&] { file.Seek(INT64_MIN, CZipAbstractFile::end); }), EINVAL);
    EXPECT_EQ(file.GetPosition(), 1U);
}

TEST(BlockFile, IsNotChanged) {
    block_file file("abc");
    EXPECT_EQ(CodeOf([&] { file.Write("x", 1); }), EBADF);
    EXPECT_EQ(CodeOf([&] { file.SetLength(1); }), EBADF);
    EXPECT_EQ(read(file, 3), "abc");
}

}  // namespace
