// Records of archives in volumes, where a volume ends: laid out by hand, since the engine writes none that
// are cut there.

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::Number16;
using zip_test::Number32;
using zip_test::RawEntry;
using zip_test::ScratchFolder;

// One entry and its directory on the volumes "a.z01" and "a.zip", cut where the test says.
class RecordsOnVolumes : public testing::Test {
protected:
    ScratchFolder folder;
    CZipArchive archive;
    const RawEntry entry = RawEntry::Stored("name", "text");
    const Bytes local = entry.Local();
    const Bytes central = entry.Central(0);

    // Everything in front of the end record is cut at `cut`.
    void Write(std::size_t cut) {
        const Bytes all = local + central;
        folder.Write("a.z01", all.substr(0, cut));
        const bool directoryIsFirst = cut > local.size();
        const std::size_t offset = directoryIsFirst ? local.size() : local.size() - cut;
        folder.Write("a.zip", all.substr(cut) + "PK\5\6" + Number16(1) + Number16(directoryIsFirst ? 0 : 1) +
                                  Number16(1) + Number16(1) +
                                  Number32(static_cast<std::uint32_t>(central.size())) +
                                  Number32(static_cast<std::uint32_t>(offset)) + Number16(0));
    }
    void Open() { archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly); }
};

TEST_F(RecordsOnVolumes, ACentralRecordMayEndWithItsVolumeAndBeginWithTheNext) {
    for (const std::size_t cut : {local.size(), local.size() + central.size()}) {
        Write(cut);
        Open();
        EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "name");
        ASSERT_TRUE(archive.OpenEntry(0));
        Bytes text(4, '\0');
        EXPECT_EQ(archive.ReadEntry(text.data(), 4), 4U);
        EXPECT_EQ(text, "text");
        EXPECT_EQ(archive.CloseEntry(), 1);
        archive.Close();
    }
}

TEST_F(RecordsOnVolumes, ACentralRecordThatRunsOverAVolumesEndIsRefused) {
    for (std::size_t cut = local.size() + 1; cut < local.size() + central.size(); ++cut) {
        Write(cut);
        EXPECT_EQ(CodeOf([&] { Open(); }), 101) << cut;
        archive.Close(1);
    }
}

TEST_F(RecordsOnVolumes, ALocalHeaderThatRunsOverAVolumesEndIsRefused) {
    const std::size_t headerSize = local.size() - 4;
    for (std::size_t cut = 1; cut <= local.size(); ++cut) {
        Write(cut);
        Open();
        EXPECT_EQ(CodeOf([&] { EXPECT_TRUE(archive.OpenEntry(0)); }), cut < headerSize ? 101 : 0) << cut;
        archive.Close(1);
    }
}

TEST_F(RecordsOnVolumes, AFailureNamesTheArchiveAndNotTheVolume) {
    Write(local.size() + 46);
    try {
        Open();
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), 101);
        EXPECT_EQ(exception.GetPath(), folder / "a.zip");
    }
    Bytes bad = local;
    bad[0] = 'X';
    archive.Close(1);
    Write(local.size());
    folder.Write("a.z01", bad);
    Open();
    try {
        archive.OpenEntry(0);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), 101);
        EXPECT_EQ(exception.GetPath(), folder / "a.zip") << "read from a.z01";
    }
}

}  // namespace
