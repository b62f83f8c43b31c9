// The engine's archives against archives that were laid out without it: tests/data/zip/README.md.

#include <gtest/gtest.h>

#include "support.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::ReadData;
using zip_test::ScratchFolder;
using zip_test::World;

constexpr char k_password[] = "barn red";

class GoldenArchive : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipArchive archive{world.environment};

    std::string Source(const std::string& name) {
        std::string path = folder.Write(name, ReadData(name));
        world.names.set_modification_time(path, world.clock.time);
        return path;
    }
    void Add(const std::string& name, int level = -1) {
        EXPECT_TRUE(archive.AddFile(Source(name).c_str(), level));
    }
    // What a reader gets of an entry.
    static Bytes Contents(CZipArchive& reader, std::uint16_t index) {
        EXPECT_TRUE(reader.OpenEntry(index));
        Bytes bytes(reader.GetEntryHeader(index)->GetUncompressedSize(), '\0');
        EXPECT_EQ(reader.ReadEntry(bytes.data(), static_cast<std::uint32_t>(bytes.size())), bytes.size());
        char more = 0;
        EXPECT_EQ(reader.ReadEntry(&more, 1), 0U);
        EXPECT_EQ(reader.CloseEntry(), 1);
        return bytes;
    }
};

struct Golden {
    const char* name;
    const char* file;
    const char* source;
    int level;
    std::uint16_t method;
    std::uint8_t encryption;
};
void PrintTo(const Golden& c, std::ostream* os) { *os << c.file; }

class GoldenSingle : public GoldenArchive, public testing::WithParamInterface<Golden> {
protected:
    bool IsEnciphered() const { return GetParam().encryption != CZipEncryption::none; }
};

TEST_P(GoldenSingle, IsWrittenByteByByte) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.SetCompressionMethod(GetParam().method));
    if (IsEnciphered()) archive.SetPassword(k_password);
    archive.SetEncryptionMethod(GetParam().encryption);
    Add(GetParam().source, GetParam().level);
    archive.Close();
    EXPECT_TRUE(folder.Read("a.zip") == ReadData(GetParam().file));
}

TEST_P(GoldenSingle, IsRead) {
    archive.Open(folder.Write("a.zip", ReadData(GetParam().file)).c_str(), CZipStorage::openReadOnly);
    if (IsEnciphered()) archive.SetPassword(k_password);
    ASSERT_EQ(archive.GetCount(), 1);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), GetParam().source);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetEncryptionMethod(), GetParam().encryption);
    EXPECT_EQ(Contents(archive, 0), ReadData(GetParam().source));
}

INSTANTIATE_TEST_SUITE_P(
    Archives, GoldenSingle,
    testing::Values(Golden{"Stored", "stored.zip", "document.txt", 0, 8, 255},
                    Golden{"Deflated", "deflated.zip", "document.txt", -1, 8, 255},
                    Golden{"Bzip2", "bzip2.zip", "document.txt", -1, 12, 255},
                    Golden{"Traditional", "traditional.zip", "document.txt", -1, 8, 0},
                    Golden{"Aes128", "aes128.zip", "document.txt", -1, 8, 1},
                    Golden{"Aes192", "aes192.zip", "document.txt", -1, 8, 2},
                    Golden{"Aes256", "aes256.zip", "document.txt", -1, 8, 3},
                    Golden{"Aes256AndBzip2", "aes256-bzip2.zip", "document.txt", -1, 12, 3},
                    Golden{"Aes256WithoutStoredCrc", "aes256-short.zip", "short.txt", -1, 8, 3}),
    [](const auto& row) { return std::string(row.param.name); });

TEST_F(GoldenArchive, SegmentedWithDataDescriptors) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, 1000);
    Add("document.txt", 0);
    Add("short.txt", 0);
    archive.Close();
    EXPECT_TRUE(folder.Read("a.z01") == ReadData("segmented.z01"));
    EXPECT_TRUE(folder.Read("a.z02") == ReadData("segmented.z02"));
    EXPECT_TRUE(folder.Read("a.zip") == ReadData("segmented.zip"));

    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    archive.GetCentralDir().SetIgnoredChecks(0);
    ASSERT_EQ(archive.GetCount(), 2);
    EXPECT_EQ(Contents(archive, 1), ReadData("short.txt"));
    EXPECT_EQ(Contents(archive, 0), ReadData("document.txt"));
}

TEST_F(GoldenArchive, WithAStubInFront) {
    archive.Open(folder.Write("a.zip", "MZ this is a stub\r\n").c_str(), CZipStorage::createAppend);
    Add("document.txt");
    archive.Close();
    EXPECT_TRUE(folder.Read("a.zip") == ReadData("stub-in-front.zip"));

    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetStorage().GetBytesBefore(), 19U);
    EXPECT_EQ(Contents(archive, 0), ReadData("document.txt"));
}

TEST_F(GoldenArchive, WithTheLongestComment) {
    archive.Open(folder.Write("a.zip", ReadData("longest-comment-before.zip")).c_str(),
                 CZipStorage::openExisting);
    Add("short.txt", 0);
    archive.Close();
    EXPECT_TRUE(folder.Read("a.zip") == ReadData("longest-comment.zip"));

    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetCentralDir().GetInfo().comment.GetSize(), 65535U);
    EXPECT_EQ(Contents(archive, 1), ReadData("short.txt"));
}

}  // namespace
