#include "zip/mem_file.h"

#include <gtest/gtest.h>

#include "support.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;

constexpr auto k_noSuchOrigin = static_cast<CZipAbstractFile::SeekOrigin>(9);

Bytes Contents(const CZipMemFile& file) {
    return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
}

void Write(CZipMemFile& file, const Bytes& bytes) {
    file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
}

TEST(MemFile, OpenAlwaysSucceedsAndDoesNothing) {
    CZipMemFile file;
    EXPECT_TRUE(file.Open("/no/such/place", 0, true));
    EXPECT_TRUE(file.IsClosed());
    EXPECT_EQ(file.GetFilePath(), "");
    file.Flush();
}

TEST(MemFile, GrowsInStepsUntilTheWantedSizeFits) {
    CZipMemFile file(1024);
    Write(file, Bytes(1, 'a'));
    EXPECT_EQ(file.GetBufferSize(), 1024U);
    Write(file, Bytes(1024, 'b'));
    EXPECT_EQ(file.GetBufferSize(), 2048U);
    EXPECT_EQ(file.GetLength(), 1025U);
}

TEST(MemFile, ReadsWhatThereIs) {
    CZipMemFile file;
    Write(file, "abcdef");
    file.SeekToBegin();
    char buffer[10] = {};
    EXPECT_EQ(file.Read(buffer, 4), 4U);
    EXPECT_EQ(file.GetPosition(), 4U);
    EXPECT_EQ(file.Read(buffer, 10), 2U);
    EXPECT_EQ(file.Read(buffer, 10), 0U);
}

TEST(MemFile, SeekAboveTheDataGrowsTheBufferButNotTheData) {
    CZipMemFile file(100);
    Write(file, "abc");
    EXPECT_EQ(file.Seek(250, CZipAbstractFile::begin), 250U);
    EXPECT_EQ(file.GetBufferSize(), 300U);
    EXPECT_EQ(file.GetLength(), 3U);
    char byte = 0;
    EXPECT_EQ(file.Read(&byte, 1), 0U);
}

TEST(MemFile, BytesLeftOutBySeekingAheadAreZero) {
    CZipMemFile file(8);
    Write(file, "ab");
    file.Seek(4, CZipAbstractFile::begin);
    Write(file, "c");
    EXPECT_EQ(Contents(file), Bytes("ab\0\0c", 5));
}

TEST(MemFile, SeeksFromAllThreeOrigins) {
    CZipMemFile file;
    Write(file, "abcdef");
    EXPECT_EQ(file.Seek(2, CZipAbstractFile::begin), 2U);
    EXPECT_EQ(file.Seek(3, CZipAbstractFile::current), 5U);
    EXPECT_EQ(file.Seek(-1, CZipAbstractFile::current), 4U);
    EXPECT_EQ(file.Seek(-6, CZipAbstractFile::end), 0U);
    EXPECT_EQ(file.SeekToEnd(), 6U);
}

TEST(MemFile, AnUnknownOriginGivesThePresentPosition) {
    CZipMemFile file;
    Write(file, "abc");
    EXPECT_EQ(file.Seek(1, k_noSuchOrigin), 3U);
    EXPECT_EQ(file.GetPosition(), 3U);
}

TEST(MemFile, APositionThatCannotBeRaises505) {
    CZipMemFile file;
    Write(file, "abc");
    EXPECT_EQ(CodeOf([&] { file.Seek(-4, CZipAbstractFile::end); }), 505);
    EXPECT_EQ(CodeOf([&] { file.Seek(-4, CZipAbstractFile::current); }), 505);
    EXPECT_EQ(CodeOf([&] { file.Seek(-1, CZipAbstractFile::begin); }), 505);
    EXPECT_EQ(CodeOf([&] { file.Seek(0x100000000, CZipAbstractFile::begin); }), 505);
    EXPECT_EQ(CodeOf([&] { file.Seek(0xFFFFFFFF, CZipAbstractFile::current); }), 505);
    EXPECT_EQ(file.GetPosition(), 3U);
}

TEST(MemFile, AGrowStepOfZeroRaises505) {
    CZipMemFile file(0);
    EXPECT_EQ(CodeOf([&] { Write(file, "a"); }), 505);
    EXPECT_EQ(CodeOf([&] { file.Seek(1, CZipAbstractFile::begin); }), 505);
}

TEST(MemFile, SetLengthWithinTheBufferSetsPositionAndLength) {
    CZipMemFile file;
    Write(file, "abcdef");
    file.SetLength(2);
    EXPECT_EQ(file.GetLength(), 2U);
    EXPECT_EQ(file.GetPosition(), 2U);
    file.SetLength(1000);
    EXPECT_EQ(file.GetLength(), 1000U);
    EXPECT_EQ(file.GetPosition(), 1000U);
}

// Intended: a length above the buffer makes room and leaves position and length where they are.
TEST(MemFile, SetLengthAboveTheBufferOnlyGrowsTheBuffer) {
    CZipMemFile file(100);
    Write(file, "abc");
    file.SetLength(150);
    EXPECT_EQ(file.GetBufferSize(), 200U);
    EXPECT_EQ(file.GetLength(), 3U);
    EXPECT_EQ(file.GetPosition(), 3U);
}

TEST(MemFile, ALengthAbove32BitsRaises505) {
    CZipMemFile file;
    EXPECT_EQ(CodeOf([&] { file.SetLength(0x100000000); }), 505);
}

TEST(MemFile, CloseFreesAndZeroesAll) {
    CZipMemFile file;
    Write(file, "abc");
    EXPECT_FALSE(file.IsClosed());
    file.Close();
    EXPECT_TRUE(file.IsClosed());
    EXPECT_EQ(file.GetLength(), 0U);
    EXPECT_EQ(file.GetPosition(), 0U);
    EXPECT_EQ(file.GetBufferSize(), 0U);
    EXPECT_EQ(file.GetGrowStep(), 0U);
}

TEST(MemFile, ACallersBlockIsUsedInPlaceAndCopiedWhenItMustGrow) {
    char block[] = {'a', 'b', 'c'};
    CZipMemFile file(block, sizeof block, 16);
    EXPECT_FALSE(file.OwnsData());
    file.Seek(1, CZipAbstractFile::begin);
    Write(file, "X");
    EXPECT_EQ(block[1], 'X');
    file.SeekToEnd();
    Write(file, "d");
    EXPECT_TRUE(file.OwnsData());
    EXPECT_EQ(Contents(file), "aXcd");
    EXPECT_EQ(Bytes(block, 3), "aXc");
}

TEST(MemFile, ACallersBlockWithoutAGrowStepCannotGrow) {
    char block[] = {'a', 'b', 'c'};
    CZipMemFile file(block, sizeof block, 0);
    file.SeekToEnd();
    EXPECT_EQ(CodeOf([&] { Write(file, "d"); }), 505);
}

}  // namespace
