#include <gtest/gtest.h>

#include <cerrno>

#include "support.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

namespace {

using zip_test::Bytes;
using zip_test::Call;
using zip_test::CodeOf;
using zip_test::CurrentFolder;
using zip_test::ScratchFolder;
using zip_test::World;

// Answers as told and remembers what it was asked.
class Volumes : public CZipVolumeCallback {
public:
    std::function<bool(Request&)> answer = [](Request&) { return true; };
    std::vector<Request> asked;

    bool RequestVolume(Request& request) override {
        asked.push_back(request);
        return answer(request);
    }
};

class StorageVolumes : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    Volumes callback;
    CZipStorage storage{world.environment};

    void Write(const Bytes& bytes, bool atOnce = false) {
        storage.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()), atOnce);
    }
    Bytes Read(std::uint32_t size, bool atOnce = false) {
        Bytes bytes(size, '\0');
        bytes.resize(storage.Read(bytes.data(), size, atOnce));
        return bytes;
    }
    void OpenSplit(int volumeSize) {
        storage.Open(folder / "a.zip", CZipStorage::createSegmented, volumeSize);
    }
    // Four volumes: "abc", "def", "gh", "ijk".
    void OpenFour(std::uint16_t volume = 0) {
        folder.Write("a.z01", "abc");
        folder.Write("a.z02", "def");
        folder.Write("a.z03", "gh");
        storage.Open(folder.Write("a.zip", "ijk"), CZipStorage::openReadOnly, 1);
        storage.SetLastVolume(3);
        storage.ChangeVolume(volume);
    }
    void MakeSpanned() {
        world.volumes.removable = true;
        world.volumes.space = 100;
        storage.SetCallbacks(&callback, nullptr);
    }
};

TEST_F(StorageVolumes, ASplitArchiveBeginsWithTheMarker) {
    OpenSplit(1000);
    EXPECT_TRUE(storage.IsNewSegmented());
    EXPECT_EQ(storage.GetVolumeSize(), 1000);
    storage.Flush();
    EXPECT_EQ(folder.Read("a.z01"), "PK\7\x8");
}

TEST_F(StorageVolumes, BlocksAreCutAtTheVolumesEnd) {
    OpenSplit(10);
    Write("abcdefghijklmnopqrs");
    EXPECT_EQ(storage.GetCurrentVolume(), 2);
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.z01"),
              "PK\7\x8"
              "abcdef");
    EXPECT_EQ(folder.Read("a.z02"), "ghijklmnop");
    EXPECT_EQ(folder.Read("a.zip"), "qrs");
    EXPECT_EQ(folder.Names(), (std::vector<std::string>{"a.z01", "a.z02", "a.zip"}));
}

TEST_F(StorageVolumes, UnbreakableBlocksGoToTheNextVolumeWhole) {
    OpenSplit(10);
    Write("abcdefgh", true);
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    Write("ij", true);
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.z01"), "PK\7\x8");
    EXPECT_EQ(folder.Read("a.zip"), "abcdefghij");
}

TEST_F(StorageVolumes, AFirstRecordIsNeverRefusedHoweverSmallTheVolumes) {
    OpenSplit(2);
    Write("abcdef", true);
    Write("ghijk", true);
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.z01"), "PK\7\x8");
    EXPECT_EQ(folder.Read("a.z02"), "abcdef");
    EXPECT_EQ(folder.Read("a.zip"), "ghijk");
}

TEST_F(StorageVolumes, AssureFreeGoesOnOnlyWhenItMust) {
    OpenSplit(10);
    EXPECT_EQ(storage.GetFreeVolumeSpace(), 6U);
    storage.AssureFree(6);
    EXPECT_EQ(storage.GetCurrentVolume(), 0);
    storage.AssureFree(7);
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    EXPECT_EQ(storage.GetFreeVolumeSpace(), 10U);
    storage.AssureFree(25);
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    EXPECT_EQ(storage.GetFreeVolumeSpace(), 25U);
}

TEST_F(StorageVolumes, AtVolumeZeroTheArchiveBecomesPlain) {
    OpenSplit(1000);
    Write("abc");
    storage.FinishSplit();
    EXPECT_EQ(storage.GetSegmentation(), 0);
    EXPECT_FALSE(storage.IsNewSegmented());
    EXPECT_EQ(folder.Names(), std::vector<std::string>{"a.zip"});
    storage.Close(true);
}

TEST_F(StorageVolumes, AboveVolumeZeroItStaysSplit) {
    OpenSplit(5);
    Write("abc");
    storage.FinishSplit();
    EXPECT_EQ(storage.GetSegmentation(), 2);
    EXPECT_EQ(storage.GetLastVolume(), 1);
    storage.ChangeVolume(0);
    EXPECT_EQ(Read(5),
              "PK\7\x8"
              "a");
    storage.Close(true);
}

TEST_F(StorageVolumes, TheFinishedArchiveTakesTheNameGivenAndReplacesWhatHasIt) {
    folder.Write("a.zip", "old");
    OpenSplit(1000);
    Write("abc");
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"),
              "PK\7\x8"
              "abc");
}

TEST_F(StorageVolumes, ACallbackMayKeepTheFileThatHasTheName) {
    folder.Write("a.zip", "old");
    storage.SetCallbacks(nullptr, &callback);
    OpenSplit(1000);
    callback.answer = [](auto&) { return false; };
    EXPECT_EQ(CodeOf([&] { storage.Close(false); }), 104);
    EXPECT_EQ(folder.Read("a.zip"), "old");
    EXPECT_EQ(callback.asked.back().code, CZipVolumeCallback::nameExists);
    storage.Close(true);
}

TEST_F(StorageVolumes, WhatHasTheNameAndCannotBeDeletedRaises115) {
    folder.Write("a.zip", "old");
    OpenSplit(1000);
    world.names.failRemove = true;
    EXPECT_EQ(CodeOf([&] { storage.Close(false); }), 115);
    storage.Close(true);
}

TEST_F(StorageVolumes, ALastVolumeThatCannotBeRenamedRaises116) {
    OpenSplit(1000);
    world.names.failRename = true;
    EXPECT_EQ(CodeOf([&] { storage.Close(false); }), 116);
    storage.Close(true);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(StorageVolumes, AnArchiveNamedLikeItsFirstVolumeIsNotDeleted) {
    storage.Open(folder / "a.z01", CZipStorage::createSegmented, 1000);
    Write("abc");
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.z01"),
              "PK\7\x8"
              "abc");
}

TEST_F(StorageVolumes, APathWithoutAFolderMeansTheCurrentOne) {
    const CurrentFolder current(folder.Path());
    storage.SetCallbacks(nullptr, &callback);
    storage.Open("a.zip", CZipStorage::createSegmented, 5);
    EXPECT_EQ(callback.asked[0].path, "./a.z01");
    Write("abc");
    storage.Close(false);
    EXPECT_EQ(folder.Names(), (std::vector<std::string>{"a.z01", "a.zip"}));
}

TEST_F(StorageVolumes, VolumesFromTheHundredthOnHaveLongerNumbers) {
    OpenSplit(1);
    Write(Bytes(101, 'x'));
    EXPECT_EQ(storage.GetCurrentVolume(), 101);
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.z09"), "x");
    EXPECT_EQ(folder.Read("a.z99"), "x");
    EXPECT_EQ(folder.Read("a.z100"), "x");
    EXPECT_EQ(folder.Read("a.z101"), "x");
    EXPECT_EQ(folder.Read("a.zip"), "x");
}

TEST_F(StorageVolumes, ASplitCallbackIsToldAndMayChangeTheName) {
    storage.SetCallbacks(nullptr, &callback);
    callback.answer = [&](auto& request) {
        if (request.volume == 2) request.path = folder / "other";
        return true;
    };
    OpenSplit(10);
    Write("abcdefgh", true);
    ASSERT_EQ(callback.asked.size(), 2U);
    EXPECT_EQ(callback.asked[0].code, CZipVolumeCallback::writeVolume);
    EXPECT_EQ(callback.asked[0].bytesNeeded, 4U);
    EXPECT_EQ(callback.asked[0].path, folder / "a.z01");
    EXPECT_EQ(callback.asked[0].volume, 1);
    EXPECT_EQ(callback.asked[1].bytesNeeded, 8U);
    EXPECT_EQ(callback.asked[1].path, folder / "a.z02");
    EXPECT_EQ(callback.asked[1].volume, 2);
    storage.Flush();
    EXPECT_EQ(folder.Read("other"), "abcdefgh");
    storage.Close(true);
}

TEST_F(StorageVolumes, ACallbackThatSaysNoRaises104WithThePath) {
    storage.SetCallbacks(nullptr, &callback);
    callback.answer = [](auto&) { return false; };
    try {
        OpenSplit(10);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), 104);
        EXPECT_EQ(exception.GetPath(), folder / "a.z01");
    }
    EXPECT_TRUE(storage.IsClosed());
}

TEST_F(StorageVolumes, AnExistingFileIsAskedAboutWithCode2) {
    folder.Write("a.z01", "old");
    storage.SetCallbacks(nullptr, &callback);
    callback.answer = [&](auto& request) {
        if (request.code == CZipVolumeCallback::nameExists) std::filesystem::remove(folder / "a.z01");
        return true;
    };
    OpenSplit(10);
    ASSERT_EQ(callback.asked.size(), 2U);
    EXPECT_EQ(callback.asked[1].code, CZipVolumeCallback::nameExists);
    storage.Close(true);
}

TEST_F(StorageVolumes, AFileThatCannotBeCreatedIsAskedAboutWithCode4) {
    storage.SetCallbacks(nullptr, &callback);
    world.files.FailAt(0, EACCES, {Call::open});
    OpenSplit(10);
    ASSERT_EQ(callback.asked.size(), 2U);
    EXPECT_EQ(callback.asked[1].code, CZipVolumeCallback::cannotCreate);
    storage.Close(true);
}

TEST_F(StorageVolumes, WithoutACallbackAFailureToCreateIsItsErrno) {
    world.files.FailAt(0, EACCES, {Call::open});
    EXPECT_EQ(CodeOf([&] { OpenSplit(10); }), EACCES);
    EXPECT_TRUE(storage.IsClosed());
}

// Volumes that are made and lost at once, so that there can be many.
class NowhereFiles : public vrl_platform::file_descriptors {
public:
    using io_result = vrl_platform::io_result;
    io_result open(const std::string& /*path*/, const vrl_platform::open_request& /*request*/) override {
        m_position = 0;
        return {1, 0};
    }
    io_result close(int /*descriptor*/) override { return {0, 0}; }
    io_result read(int /*descriptor*/, void* /*buffer*/, std::size_t /*count*/) override { return {0, 0}; }
    io_result write(int /*descriptor*/, const void* /*buffer*/, std::size_t count) override {
        m_position += static_cast<std::int64_t>(count);
        return {static_cast<std::int64_t>(count), 0};
    }
    io_result seek(int /*descriptor*/, std::int64_t /*offset*/,
                   vrl_platform::seek_origin /*origin*/) override {
        return {m_position, 0};
    }
    io_result resize(int /*descriptor*/, std::int64_t /*length*/) override { return {0, 0}; }
    io_result commit(int /*descriptor*/) override { return {0, 0}; }
    void* map(int /*descriptor*/, std::size_t /*length*/) override { return nullptr; }
    void unmap(void* /*view*/, std::size_t /*length*/) override {}

private:
    std::int64_t m_position = 0;
};

struct VolumeLimit {
    const char* name;
    int volumeSize;
    std::uint16_t lastVolume;
};
void PrintTo(const VolumeLimit& c, std::ostream* os) { *os << c.name; }

class StorageVolumeLimit : public testing::TestWithParam<VolumeLimit> {};

TEST_P(StorageVolumeLimit, IsToldByCode108) {
    const ScratchFolder folder;
    NowhereFiles files;
    World world;
    Volumes callback;
    world.volumes.removable = true;
    // A removable disk has room for four bytes, and none once they are written.
    callback.answer = [&](auto&) {
        world.volumes.space = 4;
        return true;
    };
    const CZipEnvironment environment{files, world.names, world.volumes, world.clock, world.pool};
    CZipStorage storage(environment);
    storage.SetCallbacks(&callback, nullptr);
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, GetParam().volumeSize);
    const int code = CodeOf([&] {
        for (;;) {
            world.volumes.space = 0;
            storage.Flush();
            storage.Write("abcd", 4, true);
        }
    });
    EXPECT_EQ(code, 108);
    EXPECT_EQ(storage.GetCurrentVolume(), GetParam().lastVolume);
    EXPECT_FALSE(storage.IsClosed());
    storage.Close(true);
}

INSTANTIATE_TEST_SUITE_P(OfVolumes, StorageVolumeLimit,
                         testing::Values(VolumeLimit{"Split65535", 4, 65534},
                                         VolumeLimit{"Spanned999", -1, 998}),
                         [](const auto& row) { return std::string(row.param.name); });

TEST_F(StorageVolumes, ASpannedArchiveWithoutACallbackRaises103) {
    world.volumes.removable = true;
    EXPECT_EQ(CodeOf([&] { storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1); }), 103);
    EXPECT_TRUE(storage.IsClosed());
}

TEST_F(StorageVolumes, ASpannedArchiveOnADriveThatIsNotRemovableRaises107) {
    storage.SetCallbacks(&callback, nullptr);
    EXPECT_EQ(CodeOf([&] { storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1); }), 107);
    EXPECT_TRUE(storage.IsClosed());
}

TEST_F(StorageVolumes, ASpannedArchiveHasOnePathAndLabels) {
    MakeSpanned();
    world.volumes.space = 8;
    int disks = 0;
    callback.answer = [&](auto&) {
        if (disks++ > 0) std::filesystem::rename(folder / "a.zip", folder / ("disk" + std::to_string(disks)));
        return true;
    };
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1);
    EXPECT_EQ(storage.GetSegmentation(), 1);
    Write("abcd");
    Write("efg");
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    EXPECT_EQ(world.volumes.given, (std::vector<std::string>{"pkback# 001", "pkback# 002"}));
    EXPECT_EQ(callback.asked[1].path, folder / "a.zip");
    EXPECT_EQ(callback.asked[1].volume, 2);
    storage.Close(false);
    EXPECT_EQ(folder.Read("disk2"),
              "PK\7\x8"
              "abcd");
    EXPECT_EQ(folder.Read("a.zip"), "efg");
}

TEST_F(StorageVolumes, ALabelThatCannotBeSetIsAskedAboutWithCode2) {
    MakeSpanned();
    world.volumes.labels = false;
    callback.answer = [&](auto& request) {
        world.volumes.labels = request.code == CZipVolumeCallback::nameExists;
        return true;
    };
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1);
    ASSERT_EQ(callback.asked.size(), 2U);
    EXPECT_EQ(callback.asked[1].code, CZipVolumeCallback::nameExists);
    storage.Close(true);
}

TEST_F(StorageVolumes, ASpannedArchiveWhoseCallbackWentAwayRaises114) {
    MakeSpanned();
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1);
    storage.SetCallbacks(nullptr, nullptr);
    EXPECT_EQ(CodeOf([&] { storage.AssureFree(1000); }), 114);
    storage.Close(true);
}

TEST_F(StorageVolumes, AMarkerMayNeedSeveralDisks) {
    MakeSpanned();
    world.volumes.space = 0;
    callback.answer = [&](auto&) {
        std::filesystem::remove(folder / "a.zip");
        if (callback.asked.size() == 3) world.volumes.space = 100;
        return true;
    };
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, -1);
    EXPECT_EQ(callback.asked.size(), 3U);
    EXPECT_EQ(storage.GetCurrentVolume(), 0);
    storage.Close(true);
}

struct LastVolume {
    const char* name;
    int volumeSize;
    std::uint16_t disk;
    bool removable;
    int segmentation;
};
void PrintTo(const LastVolume& c, std::ostream* os) { *os << c.name; }

class StorageDecision : public testing::TestWithParam<LastVolume> {};

TEST_P(StorageDecision, FollowsFromTheDiskNumber) {
    const ScratchFolder folder;
    World world;
    Volumes callback;
    world.volumes.removable = GetParam().removable;
    CZipStorage storage(world.environment);
    storage.SetCallbacks(&callback, nullptr);
    storage.Open(folder.Write("a.zip", "abc"), CZipStorage::openReadOnly, GetParam().volumeSize);
    storage.SetLastVolume(GetParam().disk);
    EXPECT_EQ(storage.GetSegmentation(), GetParam().segmentation);
    EXPECT_EQ(storage.GetCurrentVolume(), GetParam().disk);
    EXPECT_EQ(storage.GetLastVolume(), GetParam().disk);
}

INSTANTIATE_TEST_SUITE_P(OnSegmentation, StorageDecision,
                         testing::Values(LastVolume{"Disk0", 0, 0, false, 0},
                                         LastVolume{"Disk0WithVolumeSize", 1, 0, false, 0},
                                         LastVolume{"Disk3OnAFixedDrive", 0, 3, false, 2},
                                         LastVolume{"Disk3OnARemovableDrive", 0, 3, true, 1},
                                         LastVolume{"Disk3WithVolumeSize", 1, 3, true, 2}),
                         [](const auto& row) { return std::string(row.param.name); });

TEST_F(StorageVolumes, ASpannedArchiveToReadWithoutACallbackRaises103) {
    world.volumes.removable = true;
    storage.Open(folder.Write("a.zip", "abc"), CZipStorage::openReadOnly, 0);
    EXPECT_EQ(CodeOf([&] { storage.SetLastVolume(1); }), 103);
}

TEST_F(StorageVolumes, ADiskNumberThatMeansClosedIsRefused) {
    storage.Open(folder.Write("a.zip", "abc"), CZipStorage::openReadOnly, 0);
    EXPECT_EQ(CodeOf([&] { storage.SetLastVolume(65535); }), 101);
}

TEST_F(StorageVolumes, ReadsGoOverVolumes) {
    OpenFour();
    EXPECT_EQ(storage.GetLastVolumeExtension(), "zip");
    EXPECT_EQ(Read(2), "ab");
    EXPECT_EQ(Read(8), "cdefghij");
    EXPECT_EQ(storage.GetCurrentVolume(), 3);
    EXPECT_EQ(CodeOf([&] { Read(2); }), 101);
}

TEST_F(StorageVolumes, AnUnbreakableReadMayBeginOnTheNextVolumeButNotGoOver) {
    OpenFour();
    EXPECT_EQ(Read(3, true), "abc");
    EXPECT_EQ(Read(3, true), "def");
    EXPECT_EQ(CodeOf([&] { Read(3, true); }), 101);
}

TEST_F(StorageVolumes, AVolumeThatYieldsNothingRaises101) {
    OpenFour();
    folder.Write("a.z02", "");
    EXPECT_EQ(CodeOf([&] { Read(5); }), 101);
    storage.ChangeVolume(0);
    storage.Seek(3);
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
}

TEST_F(StorageVolumes, AMissingVolumeRaisesItsErrno) {
    OpenFour();
    std::filesystem::remove(folder / "a.z02");
    EXPECT_EQ(CodeOf([&] { Read(5); }), ENOENT);
}

TEST_F(StorageVolumes, SeeksWalkForwardOverVolumes) {
    OpenFour();
    storage.Seek(4);
    EXPECT_EQ(storage.GetCurrentVolume(), 1);
    EXPECT_EQ(Read(1), "e");
    storage.Seek(2, CZipAbstractFile::current);
    EXPECT_EQ(Read(1), "h");
    storage.Seek(0);
    EXPECT_EQ(storage.GetCurrentVolume(), 2);
    EXPECT_EQ(Read(1), "g");
    EXPECT_EQ(CodeOf([&] { storage.Seek(100); }), 101);
}

TEST_F(StorageVolumes, ChangingToThePresentVolumeOrInAPlainArchiveDoesNothing) {
    OpenFour(1);
    Read(1);
    storage.ChangeVolume(1);
    EXPECT_EQ(Read(1), "e");
    storage.Close(true);
    storage.Open(folder.Write("b.zip", "abc"), CZipStorage::openReadOnly, 0);
    storage.SetLastVolume(0);
    storage.ChangeVolume(7);
    EXPECT_EQ(storage.GetCurrentVolume(), 0);
    EXPECT_EQ(Read(3), "abc");
}

TEST_F(StorageVolumes, ASplitCallbackIsAskedWhenReading) {
    storage.SetCallbacks(nullptr, &callback);
    OpenFour();
    callback.asked.clear();
    storage.ChangeVolume(1);
    storage.ChangeVolume(3);
    ASSERT_EQ(callback.asked.size(), 2U);
    EXPECT_EQ(callback.asked[0].code, CZipVolumeCallback::readVolume);
    EXPECT_EQ(callback.asked[0].volume, 2);
    EXPECT_EQ(callback.asked[0].path, folder / "a.z02");
    EXPECT_EQ(callback.asked[1].volume, -1);
    EXPECT_EQ(callback.asked[1].path, folder / "a.zip");
}

TEST_F(StorageVolumes, AMissingVolumeIsAskedAboutWithCode5) {
    storage.SetCallbacks(nullptr, &callback);
    OpenFour();
    std::filesystem::rename(folder / "a.z02", folder / "moved");
    callback.asked.clear();
    callback.answer = [&](auto& request) {
        if (callback.asked.size() == 3) request.path = folder / "moved";
        return callback.asked.size() < 4;
    };
    storage.ChangeVolume(1);
    ASSERT_EQ(callback.asked.size(), 3U);
    EXPECT_EQ(callback.asked[1].code, CZipVolumeCallback::fileMissing);
    EXPECT_EQ(Read(3), "def");
    callback.answer = [](auto&) { return false; };
    EXPECT_EQ(CodeOf([&] { storage.ChangeVolume(2); }), 104);
}

TEST_F(StorageVolumes, SpannedVolumesAreAskedForAndKeepThePath) {
    MakeSpanned();
    storage.Open(folder.Write("a.zip", "second"), CZipStorage::openReadOnly, 0);
    storage.SetLastVolume(1);
    EXPECT_EQ(storage.GetSegmentation(), 1);
    callback.answer = [&](auto&) {
        folder.Write("a.zip", "first");
        return true;
    };
    storage.ChangeVolume(0);
    EXPECT_EQ(callback.asked[0].code, CZipVolumeCallback::readVolume);
    EXPECT_EQ(Read(5), "first");
    storage.SetCallbacks(nullptr, nullptr);
    EXPECT_EQ(CodeOf([&] { storage.ChangeVolume(1); }), 114);
    storage.SetCallbacks(&callback, nullptr);
    callback.answer = [](auto&) { return false; };
    EXPECT_EQ(CodeOf([&] { storage.ChangeVolume(1); }), 104);
}

// Two entries of a local header of 30 bytes, 5 bytes of data and a descriptor each, and one whose descriptor
// stays.
class DescriptorRemoval : public testing::TestWithParam<bool> {
protected:
    static Bytes Header(char mark) {
        Bytes header = Bytes("PK\3\4") + Bytes(26, mark);
        header[6] = '\x08';
        header[7] = '\0';
        return header;
    }
    static Bytes Entry(char mark) { return Header(mark) + Bytes(5, mark) + "PK\7\x8" + Bytes(12, mark); }
    static Bytes Patched(char mark) {
        Bytes header = Header(mark);
        header[6] = '\0';
        header.replace(14, 12, Bytes("\1\0\0\0\2\0\0\0\3\0\0\0", 12));
        return header + Bytes(5, mark);
    }
};

TEST_P(DescriptorRemoval, ClosesUpTheEntriesAndPatchesTheirHeaders) {
    const ScratchFolder folder;
    const World world;
    CZipStorage storage(world.environment);
    storage.Open(folder / "a.zip", CZipStorage::createSegmented, 10000);
    const Bytes all = Entry('a') + Entry('b') + Entry('c');
    storage.Write(all.data(), static_cast<std::uint32_t>(all.size()), false);
    if (GetParam()) storage.Flush();
    std::vector<CZipEntryExtent> entries = {
        {4, 8, 1, 2, 3, false}, {55, 9, 1, 2, 3, true}, {106, 8, 1, 2, 3, false}};
    ASSERT_TRUE(storage.RemoveDataDescriptors(entries));
    EXPECT_EQ(entries[0].offset, 0U);
    EXPECT_EQ(entries[1].offset, 35U);
    EXPECT_EQ(entries[2].offset, 86U);
    EXPECT_EQ(entries[0].flags, 0);
    EXPECT_EQ(entries[1].flags, 9);
    storage.Write("end", 3, true);
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"), Patched('a') + Entry('b') + Patched('c') + "end");
}

INSTANTIATE_TEST_SUITE_P(InTheBufferAndInTheFile, DescriptorRemoval, testing::Bool());

TEST_F(StorageVolumes, AFileThatCannotBeMappedKeepsItsDescriptors) {
    OpenSplit(10000);
    Write("abc");
    storage.Flush();
    world.files.FailAt(0, ENOMEM, {Call::map});
    std::vector<CZipEntryExtent> none;
    EXPECT_FALSE(storage.RemoveDataDescriptors(none));
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"),
              "PK\7\x8"
              "abc");
}

TEST_F(StorageVolumes, OfAnEmptyArchiveTheMarkerAloneGoes) {
    OpenSplit(10000);
    std::vector<CZipEntryExtent> none;
    EXPECT_TRUE(storage.RemoveDataDescriptors(none));
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"), "");
}

}  // namespace
