// Copying entries, replacing them, and archives in volumes.

#include <gtest/gtest.h>

#include <cerrno>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::Call;
using zip_test::CodeOf;
using zip_test::RawArchive;
using zip_test::RawEntry;
using zip_test::ScratchFolder;
using zip_test::World;

constexpr char k_password[] = "barn red";

Bytes Contents(CZipArchive& archive, std::uint16_t index) {
    if (!archive.OpenEntry(index)) return "not opened";
    Bytes bytes(archive.GetEntryHeader(index)->GetUncompressedSize(), '\0');
    bytes.resize(archive.ReadEntry(bytes.data(), static_cast<std::uint32_t>(bytes.size())));
    return archive.CloseEntry() == 1 ? bytes : "not closed";
}

class Copying : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipArchive source{world.environment};
    CZipArchive archive{world.environment};

    void OpenSource(const Bytes& bytes) {
        source.Open(folder.Write("source.zip", bytes).c_str(), CZipStorage::openReadOnly);
    }
    void Reopen() {
        archive.Close();
        archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
        archive.SetPassword(k_password);
        archive.GetCentralDir().SetIgnoredChecks(0);
    }
};

struct Copied {
    const char* file;
    const char* contents;
};
void PrintTo(const Copied& c, std::ostream* os) { *os << c.file; }

class CopiedEntry : public Copying, public testing::WithParamInterface<std::tuple<Copied, int>> {};

TEST_P(CopiedEntry, HasTheSameBytesWithoutThePassword) {
    const auto& [copied, volumeSize] = GetParam();
    OpenSource(zip_test::ReadData(copied.file));
    archive.Open((folder / "a.zip").c_str(),
                 volumeSize == 0 ? CZipStorage::create : CZipStorage::createSegmented, volumeSize);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0));
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0, "dir\\copy"));
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    Reopen();
    ASSERT_EQ(archive.GetCount(), 2);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), source.GetEntryHeader(0)->GetFileName());
    EXPECT_EQ(archive.GetEntryHeader(1)->GetFileName(), "dir\\copy");
    EXPECT_EQ(archive.GetEntryHeader(0)->GetCompressedSize(), source.GetEntryHeader(0)->GetCompressedSize());
    EXPECT_EQ(archive.GetEntryHeader(0)->GetEncryptionMethod(),
              source.GetEntryHeader(0)->GetEncryptionMethod());
    EXPECT_EQ(Contents(archive, 0), zip_test::ReadData(copied.contents));
    EXPECT_EQ(Contents(archive, 1), zip_test::ReadData(copied.contents));
}

INSTANTIATE_TEST_SUITE_P(Archives, CopiedEntry,
                         testing::Combine(testing::Values(Copied{"stored.zip", "document.txt"},
                                                          Copied{"deflated.zip", "document.txt"},
                                                          Copied{"bzip2.zip", "document.txt"},
                                                          Copied{"traditional.zip", "document.txt"},
                                                          Copied{"aes256.zip", "document.txt"},
                                                          Copied{"aes256-short.zip", "short.txt"}),
                                          testing::Values(0, 200, 100000)));

TEST_F(Copying, FromVolumesGivesAPlainEntry) {
    folder.Write("source.z01", zip_test::ReadData("segmented.z01"));
    folder.Write("source.z02", zip_test::ReadData("segmented.z02"));
    OpenSource(zip_test::ReadData("segmented.zip"));
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0));
    Reopen();
    EXPECT_FALSE(archive.GetEntryHeader(0)->HasDataDescriptor());
    EXPECT_EQ(Contents(archive, 0), zip_test::ReadData("document.txt"));
}

TEST_F(Copying, WritesTheKnownCrcIntoALocalHeaderBesideADescriptor) {
    OpenSource(zip_test::ReadData("traditional.zip"));
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0));
    archive.Close();
    EXPECT_EQ(folder.Read("a.zip").substr(14, 12),
              zip_test::Number32(source.GetEntryHeader(0)->GetCrc()) + Bytes(8, '\0'));
}

TEST_F(Copying, KeepsTheSystemOrTakesThisArchives) {
    RawEntry entry = RawEntry::Stored("a", "text");
    entry.madeBy = 0x0314;
    entry.attributes = (0x8000U | 0444) << 16;
    OpenSource(RawArchive::Of({entry}).Build());
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0, {}, CZipArchive::k_noIndex, true));
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0, {}, CZipArchive::k_noIndex, false));
    EXPECT_EQ(archive.GetEntryHeader(0)->GetSystem(), 3);
    EXPECT_EQ(archive.GetEntryHeader(1)->GetSystem(), 0);
    EXPECT_EQ(archive.GetEntryHeader(1)->GetAttributes(), 0x21U);
    archive.Close();
}

TEST_F(Copying, OfAnUnknownSystemGoesByTheName) {
    RawEntry entry = RawEntry::Stored("a/", "");
    entry.madeBy = 0x1314;
    OpenSource(RawArchive::Of({entry}).Build());
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0));
    EXPECT_EQ(archive.GetEntryHeader(0)->GetAttributes(), 0x10U);
    archive.Close();
}

TEST_F(Copying, KeepsExtraFields) {
    RawEntry entry = RawEntry::Stored("a", "text");
    entry.localExtra = zip_test::ExtraRecord(0x5455, "local");
    entry.centralExtra = zip_test::ExtraRecord(0x5455, "cent");
    OpenSource(RawArchive::Of({entry}).Build());
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0));
    archive.Close();
    const Bytes bytes = folder.Read("a.zip");
    EXPECT_NE(bytes.find("local"), Bytes::npos);
    EXPECT_NE(bytes.find("cent"), Bytes::npos);
}

TEST_F(Copying, IsRefusedWhereTheStateForbidsIt) {
    EXPECT_FALSE(archive.CopyEntryFrom(source, 0)) << "both closed";
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    EXPECT_FALSE(archive.CopyEntryFrom(source, 0)) << "source closed";
    OpenSource(zip_test::ReadData("stored.zip"));
    EXPECT_FALSE(archive.CopyEntryFrom(source, 1)) << "no such entry";
    EXPECT_FALSE(archive.CopyEntryFrom(source, 0, {}, 0)) << "nothing to replace";
    EXPECT_FALSE(archive.CopyEntryFrom(archive, 0)) << "itself";
    source.OpenEntry(0);
    EXPECT_FALSE(archive.CopyEntryFrom(source, 0)) << "source busy";
    source.CloseEntry(nullptr, true);
    archive.SetCopyBufferSize(0);
    EXPECT_FALSE(archive.CopyEntryFrom(source, 0)) << "no buffer";
    archive.SetCopyBufferSize(7);
    EXPECT_TRUE(archive.CopyEntryFrom(source, 0));
    EXPECT_EQ(Contents(archive, 0), zip_test::ReadData("document.txt"));
}

TEST_F(Copying, ABadLocalHeaderRaises101) {
    RawEntry entry = RawEntry::Stored("a", "text");
    entry.localCrc = 1;
    OpenSource(RawArchive::Of({entry}).Build());
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    EXPECT_EQ(CodeOf([&] { archive.CopyEntryFrom(source, 0); }), 101);
}

class Replacing : public Copying {
protected:
    static constexpr const char* k_names[] = {"first", "second", "third"};
    void SetUp() override {
        archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
        for (const char* name : k_names) archive.AddFile(folder.Write(name, Old(name)).c_str());
    }
    static Bytes Old(const std::string& name) { return name + zip_test::SampleText(3000); }
    bool Replace(std::uint16_t index, const Bytes& data, int level = -1, unsigned flags = 7) {
        CZipNewFile file;
        file.path = folder.Write("new", data);
        file.replacedIndex = index;
        file.level = level;
        file.smartFlags = flags;
        return archive.AddFile(file);
    }
    void ExpectAll(std::uint16_t replaced, const Bytes& data) {
        ASSERT_EQ(archive.GetCount(), 3);
        for (std::uint16_t i = 0; i < 3; ++i) {
            EXPECT_TRUE(Contents(archive, i) == (i == replaced ? data : Old(k_names[i]))) << i;
            EXPECT_EQ(archive.GetEntryHeader(i)->GetFileName(), i == replaced ? "new" : k_names[i]);
        }
    }
};

struct Replacement {
    const char* why;
    std::uint16_t index;
    Bytes data;
    int level;
    const char* password;
    std::uint8_t encryption;
    std::uint32_t copyBuffer;
};
void PrintTo(const Replacement& c, std::ostream* os) { *os << c.why << ", entry " << c.index; }

class ReplacedEntry
    : public Replacing,
      public testing::WithParamInterface<std::tuple<Replacement, std::uint16_t, std::uint32_t>> {};

TEST_P(ReplacedEntry, TakesThePlaceAndTheOthersStay) {
    const auto& [replacement, index, copyBuffer] = GetParam();
    archive.SetPassword(replacement.password);
    archive.SetEncryptionMethod(replacement.encryption);
    archive.SetCopyBufferSize(copyBuffer);
    ASSERT_TRUE(Replace(index, replacement.data, replacement.level));
    EXPECT_EQ(archive.GetEntryHeader(index)->IsEncrypted(), replacement.password != nullptr);
    Reopen();
    ExpectAll(index, replacement.data);
    const Bytes bytes = folder.Read("a.zip");
    EXPECT_EQ(archive.GetStorage().GetBytesBefore(), 0U) << "no gaps";
    // Each entry begins where the one before ends.
    std::uint32_t expected = 0;
    for (std::uint16_t i = 0; i < 3; ++i) {
        CZipFileHeader& header = *archive.GetEntryHeader(i);
        EXPECT_EQ(header.GetOffset(), expected);
        expected = header.GetOffset() + 30 + header.GetLocalFileNameSize() + (header.IsAes() ? 11 : 0) +
                   header.GetCompressedSize() + header.GetDescriptorSize(false);
    }
    EXPECT_EQ(archive.GetCentralDir().GetInfo().directoryOffset, expected);
}

INSTANTIATE_TEST_SUITE_P(
    Replacements, ReplacedEntry,
    testing::Combine(testing::Values(Replacement{"smaller", 0, "tiny and small", -1, nullptr, 0, 0},
                                     Replacement{"larger", 0, zip_test::Noise(200000), -1, nullptr, 0, 0},
                                     Replacement{"stored", 0, zip_test::Noise(10000), 0, nullptr, 0, 0},
                                     Replacement{"stored and empty", 0, "", 0, nullptr, 0, 0},
                                     Replacement{"stored with AES", 0, zip_test::Noise(5000), 0, k_password,
                                                 3, 0},
                                     Replacement{"stored with traditional encryption", 0, "0123456789", 0,
                                                 k_password, 0, 0},
                                     Replacement{"deflated with AES", 0, zip_test::SampleText(9000), -1,
                                                 k_password, 1, 0}),
                     testing::Values(0, 1, 2), testing::Values(1000U, 65536U)));

TEST_F(Replacing, InAnExistingArchiveBehindAStub) {
    archive.Close();
    folder.Write("b.zip", "a stub of some bytes");
    archive.Open((folder / "b.zip").c_str(), CZipStorage::createAppend);
    for (const char* name : k_names) archive.AddFile((folder / name).c_str());
    archive.Close();
    archive.Open((folder / "b.zip").c_str(), CZipStorage::openExisting);
    ASSERT_TRUE(Replace(1, zip_test::Noise(100000)));
    ASSERT_TRUE(Replace(1, "short now"));
    archive.Close();
    archive.Open((folder / "b.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetStorage().GetBytesBefore(), 20U);
    ExpectAll(1, "short now");
}

TEST_F(Replacing, AndThenAddingGoesToTheEnd) {
    ASSERT_TRUE(Replace(0, "short now"));
    ASSERT_TRUE(archive.AddFile(folder.Write("fourth", "the fourth").c_str()));
    Reopen();
    ASSERT_EQ(archive.GetCount(), 4);
    EXPECT_EQ(Contents(archive, 0), "short now");
    EXPECT_EQ(Contents(archive, 3), "the fourth");
}

TEST_F(Replacing, ByACopy) {
    OpenSource(zip_test::ReadData("aes256.zip"));
    ASSERT_TRUE(archive.CopyEntryFrom(source, 0, "new", 1));
    Reopen();
    ExpectAll(1, zip_test::ReadData("document.txt"));
}

TEST_F(Replacing, ByAFolder) {
    std::filesystem::create_directory(folder / "dir");
    CZipNewFile file;
    file.path = folder / "dir";
    file.replacedIndex = 1;
    ASSERT_TRUE(archive.AddFile(file));
    Reopen();
    EXPECT_EQ(archive.GetEntryHeader(1)->GetFileName(), "dir\\");
    EXPECT_TRUE(Contents(archive, 2) == Old("third"));
}

TEST_F(Replacing, StagesInATemporaryFileThatIsDeleted) {
    ASSERT_TRUE(Replace(0, "short now"));
    ASSERT_EQ(world.names.temporaryFiles.size(), 1U);
    EXPECT_FALSE(std::filesystem::exists(world.names.temporaryFiles[0]));
    ASSERT_TRUE(Replace(0, "short now", 0));
    EXPECT_EQ(world.names.temporaryFiles.size(), 1U) << "a stored entry has a size that is known";
}

TEST_F(Replacing, WithoutRoomForATemporaryFileStores) {
    world.names.failTemporary = true;
    ASSERT_TRUE(Replace(0, "some text that is stored"));
    EXPECT_EQ(archive.GetEntryHeader(0)->GetMethod(), 0);
    Reopen();
    ExpectAll(0, "some text that is stored");
}

TEST_F(Replacing, WithSmartFlag8StoresWhatCompressionMakesLarger) {
    const Bytes noise = zip_test::Noise(5000);
    ASSERT_TRUE(Replace(1, noise, -1, 24));
    EXPECT_EQ(archive.GetEntryHeader(1)->GetMethod(), 0);
    ASSERT_TRUE(Replace(1, zip_test::SampleText(5000), -1, 24));
    EXPECT_EQ(archive.GetEntryHeader(1)->GetMethod(), 8);
    EXPECT_TRUE(world.names.temporaryFiles.empty());
    Reopen();
    ExpectAll(1, zip_test::SampleText(5000));
}

TEST_F(Replacing, IsRefusedWithoutSuchAnEntryAndOnVolumes) {
    EXPECT_FALSE(Replace(3, "text"));
    EXPECT_FALSE(archive.OpenNewEntry(CZipFileHeader(), 0, nullptr, 3));
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::createSegmented, 10000);
    archive.AddFile((folder / "first").c_str());
    EXPECT_FALSE(Replace(0, "text"));
}

TEST_F(Replacing, ASourceThatChangesItsSizeMeanwhileRaises100) {
    folder.Write("new", "0123456789");
    CZipNewFile file;
    file.path = folder / "new";
    file.replacedIndex = 0;
    file.level = 0;
    file.bufferSize = 10;
    // The copy that makes room reads first; the last read is the source's.
    world.files.FallShortAt(1, {Call::read});
    EXPECT_EQ(CodeOf([&] { archive.AddFile(file); }), 100);
    archive.Close(1);
}

class Stopper : public CZipProgressCallback {
public:
    bool Advance(std::uint64_t /*bytes*/) override { return false; }
};

TEST_F(Replacing, StoppedByACallbackLeavesTheArchiveUnfinishedAndTheCodeIs105) {
    Stopper stopper;
    archive.SetCallback(CZipCallbackType::moveData, &stopper);
    EXPECT_EQ(CodeOf([&] { Replace(0, "short now"); }), 105);
    archive.Close(1);

    archive.SetCallback(CZipCallbackType::moveData, nullptr);
    SetUp();
    archive.SetCallback(CZipCallbackType::add, &stopper);
    EXPECT_EQ(CodeOf([&] { Replace(0, "short now", 0); }), 105);
    archive.Close(1);
}

TEST_F(Replacing, BeyondWhat32BitsHoldIsRefused) {
    std::filesystem::resize_file(folder / "a.zip", 0xFFFFFF00);
    EXPECT_EQ(CodeOf([&] { Replace(0, zip_test::Noise(4000), 0); }), EFBIG);
    archive.Close(1);
}

class InVolumes : public Copying, public testing::WithParamInterface<std::tuple<int, int>> {
protected:
    Bytes text = zip_test::SampleText(4000);
    Bytes noise = zip_test::Noise(500);

    void Write(int volumeSize, const char* password = nullptr) {
        archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, volumeSize);
        archive.SetPassword(password);
        folder.Write("text", text);
        folder.Write("noise", noise);
        std::filesystem::create_directory(folder / "dir");
        EXPECT_TRUE(archive.AddFile((folder / "text").c_str()));
        EXPECT_TRUE(archive.AddFile((folder / "dir").c_str()));
        EXPECT_TRUE(archive.AddFile((folder / "noise").c_str(), 0));
    }
    void ExpectAll() {
        ASSERT_EQ(archive.GetCount(), 3);
        EXPECT_TRUE(Contents(archive, 2) == noise);
        EXPECT_TRUE(Contents(archive, 0) == text);
        EXPECT_EQ(Contents(archive, 1), "");
    }
};

TEST_P(InVolumes, OfAnySizeArchivesAreWrittenAndRead) {
    const auto& [volumeSize, encryption] = GetParam();
    archive.SetEncryptionMethod(static_cast<std::uint8_t>(encryption));
    Write(volumeSize, k_password);
    for (std::uint16_t i = 0; i < 3; ++i) EXPECT_TRUE(archive.GetEntryHeader(i)->HasDataDescriptor());
    Reopen();
    EXPECT_EQ(archive.GetStorage().IsSegmented(), volumeSize < 1000000);
    EXPECT_EQ(archive.GetEntryHeader(0)->HasDataDescriptor(), volumeSize < 1000000 || encryption == 0);
    ExpectAll();
    EXPECT_EQ(std::filesystem::exists(folder / "a.z01"), volumeSize < 1000000);
}

INSTANTIATE_TEST_SUITE_P(Sizes, InVolumes,
                         testing::Combine(testing::Values(20, 77, 333, 1000, 1000000),
                                          testing::Values(255, 0, 3)));

using OnOneVolume = InVolumes;

TEST_F(OnOneVolume, ASplitArchiveBecomesExactlyThePlainOne) {
    Write(1000000);
    archive.Close();
    const Bytes made = folder.Read("a.zip");
    archive.Open((folder / "b.zip").c_str(), CZipStorage::create);
    for (const char* name : {"text", "dir"}) archive.AddFile((folder / name).c_str());
    archive.AddFile((folder / "noise").c_str(), 0);
    archive.Close();
    EXPECT_TRUE(made == folder.Read("b.zip"));
}

TEST_F(OnOneVolume, WhatFitsOnlyWithoutMarkerAndDescriptorsBecomesPlainToo) {
    Write(1000000);
    archive.Close();
    const auto whole = static_cast<int>(folder.Read("a.zip").size());
    for (const int size : {whole, whole - 1}) {
        std::filesystem::remove(folder / "a.zip");
        Write(size);
        Reopen();
        EXPECT_EQ(archive.GetStorage().IsSegmented(), size < whole) << size;
        ExpectAll();
        archive.Close();
    }
}

TEST_F(OnOneVolume, AVolumeThatCannotBeMappedStaysSegmented) {
    Write(1000000);
    world.files.FailAt(0, ENOMEM, {Call::map});
    archive.Close();
    EXPECT_EQ(folder.Read("a.zip").substr(0, 4), "PK\7\x8");
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_TRUE(archive.GetEntryHeader(0)->HasDataDescriptor());
    ExpectAll();
}

TEST_F(OnOneVolume, AFailureInTheAttemptEndsTheSegmentsAndIsTold) {
    Write(1000000);
    archive.GetEntryHeader(2)->SetComment(std::string(65536, 'c'));
    EXPECT_EQ(CodeOf([&] { archive.Close(); }), 110);
    archive.Close(1);
    archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, 1000000);
    archive.AddFile((folder / "text").c_str());
    archive.GetStorage().SetBufferSizes(1, 1);
    // The removal leaves room in the buffer for the headers; the flush on closing is what fails.
    world.files.FailAt(0, ENOSPC, {Call::write});
    EXPECT_EQ(CodeOf([&] { archive.Close(); }), ENOSPC);
    archive.Close(1);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(OnOneVolume, AutoFlushWaitsForTheEndOfTheVolumes) {
    archive.SetAutoFlush(true);
    Write(1000);
    Reopen();
    ExpectAll();
}

TEST_F(OnOneVolume, AnEmptySplitArchiveIsAnEndRecord) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, 1000);
    archive.Close();
    EXPECT_EQ(folder.Read("a.zip"), "PK\5\6" + Bytes(18, '\0'));
}

TEST_F(Copying, TheDirectoryOfAnArchiveInVolumesTellsEachPlace) {
    for (const char* part : {"z01", "z02"})
        folder.Write(std::string("a.") + part, zip_test::ReadData(std::string("segmented.") + part));
    archive.Open(folder.Write("a.zip", zip_test::ReadData("segmented.zip")).c_str(),
                 CZipStorage::openReadOnly);
    const CZipDirectoryInfo& info = archive.GetCentralDir().GetInfo();
    EXPECT_EQ(info.thisDisk, 2);
    EXPECT_EQ(info.directoryDisk, 2);
    EXPECT_EQ(info.entriesOnThisDisk, 2);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetDiskStart(), 0);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetOffset(), 4U);
    EXPECT_EQ(archive.GetEntryHeader(1)->GetDiskStart(), 2);
}

TEST_F(Copying, ADiskNumberAboveZeroOnOneFileEndsInSplitMode) {
    RawArchive raw = RawArchive::Of({RawEntry::Stored("a", "text")});
    raw.disk = 3;
    raw.directoryDisk = 3;
    raw.entries[0].disk = 3;
    archive.Open(folder.Write("a.zip", raw.Build()).c_str(), CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetStorage().GetSegmentation(), CZipStorage::split);
    EXPECT_EQ(archive.GetStorage().GetCurrentVolume(), 3);
    EXPECT_EQ(Contents(archive, 0), "text");
    archive.Close();
    raw.directoryDisk = 1;
    EXPECT_EQ(
        CodeOf([&] { archive.Open(folder.Write("a.zip", raw.Build()).c_str(), CZipStorage::openReadOnly); }),
        ENOENT);
    archive.Close(1);
}

// Disks that can be taken out, as far as the engine sees.
class Disks : public CZipVolumeCallback {
public:
    explicit Disks(const ScratchFolder& folder) : m_folder(folder) {}
    bool RequestVolume(Request& request) override {
        if (m_inserted != 0) std::filesystem::rename(m_folder / "a.zip", Disk(m_inserted));
        m_inserted = request.volume;
        if (std::filesystem::exists(Disk(m_inserted)))
            std::filesystem::rename(Disk(m_inserted), m_folder / "a.zip");
        return true;
    }
    int Inserted() const { return m_inserted; }

private:
    std::string Disk(int number) const { return m_folder / ("disk" + std::to_string(number)); }
    const ScratchFolder& m_folder;
    int m_inserted = 0;
};

// They have room for what has not been written to them.
class DiskRoom : public zip_test::FakeVolumes {
public:
    explicit DiskRoom(const ScratchFolder& folder) : m_folder(folder) { removable = true; }
    std::optional<std::uint64_t> free_space(const std::string& /*path*/) override {
        const auto used = std::filesystem::file_size(m_folder / "a.zip");
        return used >= 1000 ? 0 : 1000 - used;
    }

private:
    const ScratchFolder& m_folder;
};

TEST_F(Copying, ASpannedArchiveIsWrittenAndReadDiskByDisk) {
    const Bytes noise = zip_test::Noise(3000);
    folder.Write("noise", noise);
    Disks disks(folder);
    DiskRoom room(folder);
    const CZipEnvironment environment{world.files, world.names, room, world.clock, world.pool};
    CZipArchive spanned(environment);
    spanned.SetVolumeCallbacks(&disks, nullptr);
    spanned.GetStorage().SetBufferSizes(16, 64);
    spanned.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, -1);
    ASSERT_TRUE(spanned.AddFile((folder / "noise").c_str(), 0));
    spanned.Close();
    EXPECT_EQ(disks.Inserted(), 4);

    spanned.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_EQ(spanned.GetStorage().GetSegmentation(), CZipStorage::spanned);
    spanned.GetCentralDir().SetIgnoredChecks(0);
    EXPECT_TRUE(Contents(spanned, 0) == noise);
    spanned.Close();
}

// A disk on which others write, too: when the descriptors have gone, the room for the directory has as well.
TEST_F(OnOneVolume, AVolumeThatFillsUpDuringTheAttemptRaises101) {
    class EmptyDisks : public Disks {
    public:
        EmptyDisks(const ScratchFolder& place, World& around) : Disks(place), m_world(around) {}
        bool RequestVolume(Request& request) override {
            m_world.volumes.space = 100000;
            return Disks::RequestVolume(request);
        }

    private:
        World& m_world;
    };
    EmptyDisks disks(folder, world);
    world.volumes.removable = true;
    archive.SetVolumeCallbacks(&disks, nullptr);
    archive.GetStorage().SetBufferSizes(100, 100);
    archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, CZipStorage::k_spannedVolumeSize);
    ASSERT_TRUE(archive.AddFile(folder.Write("text", text).c_str()));
    world.volumes.space = 0;
    EXPECT_EQ(CodeOf([&] { archive.Close(); }), 101);
    EXPECT_EQ(disks.Inserted(), 2);
    archive.Close(1);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

}  // namespace
