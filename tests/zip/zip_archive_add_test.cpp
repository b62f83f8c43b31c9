// Adding files, and entries without a file.

#include <gtest/gtest.h>

#include <cerrno>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::Call;
using zip_test::CodeOf;
using zip_test::ScratchFolder;
using zip_test::World;
namespace Smart = CZipSmartFlags;

class Adding : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipArchive archive{world.environment};

    void SetUp() override { archive.Open((folder / "a.zip").c_str(), CZipStorage::create); }
    CZipFileHeader& Last() {
        return *archive.GetEntryHeader(static_cast<std::uint16_t>(archive.GetCount() - 1));
    }
    bool Add(const std::string& path, int level = -1, bool fullPath = false,
             unsigned flags = Smart::forDocuments) {
        return archive.AddFile(path.c_str(), level, fullPath, flags);
    }
    Bytes Contents(std::uint16_t index) {
        if (!archive.OpenEntry(index)) return "not opened";
        Bytes bytes(archive.GetEntryHeader(index)->GetUncompressedSize(), '\0');
        bytes.resize(archive.ReadEntry(bytes.data(), static_cast<std::uint32_t>(bytes.size())));
        return archive.CloseEntry() == 1 ? bytes : "not closed";
    }
    void Reopen() {
        archive.Close();
        archive.Open((folder / "a.zip").c_str(), CZipStorage::openExisting);
    }
};

TEST_F(Adding, TakesContentsTimeAttributesAndTheLastPartOfThePath) {
    const std::string path = folder.Write("dir/document.txt", zip_test::SampleText(200000));
    world.names.set_modification_time(path, 1234567890);
    world.names.set_attributes(path, 0x21);
    ASSERT_TRUE(Add(path));
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    EXPECT_EQ(Last().GetFileName(), "document.txt");
    EXPECT_EQ(Last().GetTime(), 1234567890);
    EXPECT_EQ(Last().GetAttributes(), 0x21U);
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_EQ(Last().GetSystem(), 0);
    EXPECT_EQ(Last().GetMadeByVersion(), 46);
    EXPECT_EQ(Last().GetEncryptionMethod(), 255);
    EXPECT_EQ(Last().GetComment(), "");
    EXPECT_EQ(Last().GetCentralExtra().GetCount(), 0U);
    Reopen();
    EXPECT_TRUE(Contents(0) == zip_test::SampleText(200000));
}

TEST_F(Adding, IsRefusedWhereTheStateForbidsIt) {
    const std::string path = folder.Write("f", "text");
    archive.Close();
    EXPECT_FALSE(Add(path)) << "closed";
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    EXPECT_FALSE(Add(path)) << "read-only";
    archive.Close();
    SetUp();
    archive.SetCopyBufferSize(0);
    EXPECT_FALSE(Add(path)) << "no copy buffer";
    archive.SetCopyBufferSize(65536);
    EXPECT_FALSE(archive.AddFile(path.c_str(), -1, false, 7, 0)) << "no buffer to read into";
    archive.OpenNewEntry(CZipFileHeader(), -1);
    EXPECT_FALSE(Add(path)) << "an entry is open";
    EXPECT_FALSE(archive.OpenNewEntry(CZipFileHeader(), -1)) << "an entry is open";
    archive.CloseNewEntry();
    EXPECT_TRUE(Add(path));
}

TEST_F(Adding, AFinishedSegmentedArchiveTakesNothingMore) {
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::createSegmented, 60);
    Add(folder.Write("f", "text"));
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::openExisting);
    ASSERT_TRUE(archive.GetStorage().IsSegmented());
    EXPECT_FALSE(Add(folder / "f"));
    EXPECT_FALSE(archive.OpenNewEntry(CZipFileHeader(), -1));
}

TEST_F(Adding, AnArchiveTakes65535Entries) {
    archive.Close();
    zip_test::RawArchive raw;
    raw.entries.assign(65534, zip_test::RawEntry::Stored("n", "x"));
    archive.Open(folder.Write("a.zip", raw.Build()).c_str(), CZipStorage::openExisting);
    const std::string path = folder.Write("f", "text");
    EXPECT_TRUE(Add(path));
    EXPECT_FALSE(Add(path));
    EXPECT_FALSE(archive.OpenNewEntry(CZipFileHeader(), -1));
    EXPECT_FALSE(archive.OpenNewEntry(CZipFileHeader(), 0, nullptr, 3)) << "not even in another's place";
    Reopen();
    EXPECT_EQ(archive.GetCount(), 65535);
    EXPECT_EQ(Contents(65534), "text");
}

TEST_F(Adding, WhatCannotBeFoundOrOpenedFails) {
    EXPECT_FALSE(Add(folder / "none"));
    EXPECT_FALSE(Add(""));
    EXPECT_FALSE(Add("/"));
    EXPECT_FALSE(Add("///"));
    const std::string path = folder.Write("f", "text");
    world.files.FailAt(1, EACCES, {Call::open});
    EXPECT_FALSE(Add(path)) << "measured, but not opened";
    EXPECT_EQ(archive.GetCount(), 0);
}

TEST_F(Adding, TrailingSeparatorsAreCut) {
    EXPECT_TRUE(Add(folder.Write("f", "text") + "//"));
    EXPECT_EQ(Last().GetFileName(), "f");
    EXPECT_FALSE(Add(folder / "none" + "/")) << "only the cut name counts";
    EXPECT_FALSE(Add(folder / "f" + "\\")) << "a backslash is a part of the name here";
}

struct EntryName {
    const char* why;
    bool fullPath;
    bool removeDrive;
    const char* root;
    const char* name;
};
void PrintTo(const EntryName& c, std::ostream* os) { *os << c.why; }

class NamedEntry : public Adding, public testing::WithParamInterface<EntryName> {};
TEST_P(NamedEntry, IsNamedFromThePath) {
    const std::string path = folder.Write("Dir/sub/f.txt", "text");
    const std::string place = folder.Path().string();
    const auto filled = [&](std::string text, char separator) {
        const std::size_t at = text.find('@');
        if (at == std::string::npos) return text;
        std::string shown = place;
        std::replace(shown.begin(), shown.end(), '/', separator);
        return text.replace(at, 1, shown);
    };
    archive.SetRemoveDriveLetter(GetParam().removeDrive);
    archive.SetRootPath(filled(GetParam().root, '/'));
    ASSERT_TRUE(Add(path, -1, GetParam().fullPath));
    std::string expected = filled(GetParam().name, '\\');
    if (GetParam().fullPath && GetParam().removeDrive) expected.erase(0, 1);
    EXPECT_EQ(Last().GetFileName(), expected);
}
INSTANTIATE_TEST_SUITE_P(
    Names, NamedEntry,
    testing::Values(EntryName{"the last part", false, true, "", "f.txt"},
                    EntryName{"the whole path without its root", true, true, "", "@\\Dir\\sub\\f.txt"},
                    EntryName{"the whole path as it is", true, false, "", "@\\Dir\\sub\\f.txt"},
                    EntryName{"below a root", false, true, "@/Dir", "sub\\f.txt"},
                    EntryName{"below a root with separators", false, true, "@/Dir//", "sub\\f.txt"},
                    EntryName{"below a root in other case", false, true, "@/dIR", "sub\\f.txt"},
                    EntryName{"below a root that ends in the middle of a part", false, true, "@/Di", "f.txt"},
                    EntryName{"below a root that does not match", false, true, "@/else", "f.txt"},
                    EntryName{"the whole path, whatever the root", true, true, "@/Dir",
                              "@\\Dir\\sub\\f.txt"}));

TEST_F(Adding, ARootInOtherCaseDoesNotMatchACaseSensitiveArchive) {
    archive.SetCaseSensitive(true);
    archive.SetRootPath(folder / "dir");
    ASSERT_TRUE(Add(folder.Write("Dir/f", "text")));
    EXPECT_EQ(Last().GetFileName(), "f");
}

TEST_F(Adding, ANameThatIsGivenIsTaken) {
    CZipNewFile file;
    file.path = folder.Write("f", "text");
    file.name = "dir\\other";
    ASSERT_TRUE(archive.AddFile(file));
    Reopen();
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "dir\\other");
    EXPECT_NE(folder.Read("a.zip").find("dir/other"), Bytes::npos) << "stored with slashes";
}

TEST_F(Adding, AFolderIsAnEntryWithoutDataAndWithABackslash) {
    std::filesystem::create_directory(folder / "dir");
    ASSERT_TRUE(Add(folder / "dir"));
    EXPECT_EQ(Last().GetFileName(), "dir\\");
    EXPECT_TRUE(Last().IsDirectory());
    EXPECT_EQ(Last().GetMethod(), 0);
    EXPECT_EQ(Last().GetVersionNeeded(), 10);
    EXPECT_EQ(Last().GetCompressedSize(), 0U);
    Reopen();
    EXPECT_TRUE(archive.GetEntryHeader(0)->IsDirectory());
    EXPECT_EQ(Contents(0), "");
}

TEST_F(Adding, SmartFlag1LeavesFoldersWithoutAPassword) {
    std::filesystem::create_directory(folder / "dir");
    archive.SetPassword("barn red");
    ASSERT_TRUE(Add(folder / "dir", -1, false, Smart::plainFolders));
    EXPECT_FALSE(Last().IsEncrypted());
    EXPECT_EQ(archive.GetPassword().GetSize(), 8U);
    ASSERT_TRUE(Add(folder / "dir", -1, false, 0));
    EXPECT_TRUE(Last().IsEncrypted());
    ASSERT_TRUE(Add(folder.Write("f", "text"), -1, false, Smart::plainFolders));
    EXPECT_TRUE(Last().IsEncrypted());
}

TEST_F(Adding, SmartFlag2LeavesEmptyFilesWithoutAPassword) {
    folder.Write("empty", "");
    folder.Write("f", "x");
    archive.SetPassword("barn red");
    ASSERT_TRUE(Add(folder / "empty", -1, false, Smart::plainEmptyFiles));
    EXPECT_FALSE(Last().IsEncrypted());
    ASSERT_TRUE(Add(folder / "f", -1, false, Smart::plainEmptyFiles));
    EXPECT_TRUE(Last().IsEncrypted());
    ASSERT_TRUE(Add(folder / "empty", -1, false, 0));
    EXPECT_TRUE(Last().IsEncrypted());
    EXPECT_EQ(archive.GetPassword().GetSize(), 8U);
}

struct SmallFile {
    const char* why;
    std::size_t size;
    int level;
    unsigned flags;
    std::uint16_t method;
};
void PrintTo(const SmallFile& c, std::ostream* os) { *os << c.why; }

class SmartStoring : public Adding, public testing::WithParamInterface<SmallFile> {};
TEST_P(SmartStoring, ChoosesTheMethod) {
    ASSERT_TRUE(
        Add(folder.Write("f", Bytes(GetParam().size, 'x')), GetParam().level, false, GetParam().flags));
    EXPECT_EQ(Last().GetMethod(), GetParam().method);
    EXPECT_EQ(Contents(0), Bytes(GetParam().size, 'x'));
}
INSTANTIATE_TEST_SUITE_P(Files, SmartStoring,
                         testing::Values(SmallFile{"3 bytes", 3, -1, 4, 0},
                                         SmallFile{"no bytes", 0, -1, 4, 0}, SmallFile{"4 bytes", 4, 9, 4, 0},
                                         SmallFile{"5 bytes", 5, -1, 4, 8},
                                         SmallFile{"3 bytes without the flag", 3, -1, 3, 8},
                                         SmallFile{"no bytes without the flag", 0, -1, 0, 8},
                                         SmallFile{"level 0", 100, 0, 0, 0},
                                         SmallFile{"a level that is none is the default", 100, 10, 7, 8},
                                         SmallFile{"another one", 100, -2, 7, 8}));

TEST_F(Adding, ASourceWhoseSizeCannotBeLearnedKeepsItsLevelAndItsPassword) {
    const std::string path = folder.Write("f", "");
    archive.SetPassword("barn red");
    world.files.denied.push_back(path);
    ASSERT_TRUE(Add(path));
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_TRUE(Last().IsEncrypted());
}

// An archive that is written locks its file, so that its size cannot be learned; it can be read all the same,
// and its first bytes still wait in the write buffer.
TEST_F(Adding, AnArchiveThatIsItsOwnSourceHasAnEntryWithoutData) {
    ASSERT_TRUE(Add(folder / "a.zip"));
    EXPECT_EQ(Last().GetFileName(), "a.zip");
    EXPECT_EQ(Last().GetUncompressedSize(), 0U);
    EXPECT_EQ(Last().GetCrc(), 0U);
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_EQ(Last().GetCompressedSize(), 2U);
    Reopen();
    EXPECT_EQ(Contents(0), "");
}

TEST_F(Adding, TheFirstShortReadEndsTheFile) {
    const std::string path = folder.Write("f", "0123456789");
    world.files.FallShortAt(0, {Call::read});
    ASSERT_TRUE(archive.AddFile(path.c_str(), 0, false, 7, 10));
    EXPECT_EQ(Last().GetUncompressedSize(), 5U);
    EXPECT_EQ(Contents(0), "01234");
}

TEST_F(Adding, AFileOfWholeBuffersIsReadToItsEnd) {
    ASSERT_TRUE(archive.AddFile(folder.Write("f", "01234567").c_str(), 0, false, 7, 4));
    EXPECT_EQ(Contents(0), "01234567");
}

TEST_F(Adding, ASourceAbove32BitsIsRefusedWithACode) {
    std::filesystem::resize_file(folder.Write("f", ""), 0x100000000);
    EXPECT_EQ(CodeOf([&] { Add(folder / "f"); }), EFBIG);
}

TEST_F(Adding, AFailingReadIsItsErrno) {
    const std::string path = folder.Write("f", "0123456789");
    world.files.FailAt(0, EIO, {Call::read});
    EXPECT_EQ(CodeOf([&] { Add(path); }), EIO);
    archive.Close(1);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

// Stops or lets pass, and counts.
class Progress : public CZipProgressCallback {
public:
    std::uint64_t bytes = 0;
    std::uint64_t stopAt = UINT64_MAX;
    bool Advance(std::uint64_t count) override {
        bytes += count;
        return bytes < stopAt;
    }
};

TEST_F(Adding, AProgressCallbackIsToldEveryBlock) {
    Progress progress;
    archive.SetCallback(CZipCallbackType::add, &progress);
    ASSERT_TRUE(archive.AddFile(folder.Write("f", Bytes(1000, 'x')).c_str(), -1, false, 7, 100));
    EXPECT_EQ(progress.bytes, 1000U);
    archive.SetCallback(CZipCallbackType::add, nullptr);
    Add(folder / "f");
    EXPECT_EQ(progress.bytes, 1000U);
}

TEST_F(Adding, StoppedByACallbackTheArchiveIsAsItWasAndTheCodeIs106) {
    ASSERT_TRUE(Add(folder.Write("f", "first")));
    Progress progress;
    progress.stopAt = 300;
    archive.SetCallback(CZipCallbackType::add, &progress);
    folder.Write("g", zip_test::Noise(1000000));
    EXPECT_EQ(CodeOf([&] { archive.AddFile((folder / "g").c_str(), -1, false, 7, 100); }), 106);
    archive.SetCallback(CZipCallbackType::add, nullptr);
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    EXPECT_EQ(archive.GetCount(), 1);
    ASSERT_TRUE(Add(folder.Write("h", "third")));
    Reopen();
    ASSERT_EQ(archive.GetCount(), 2);
    EXPECT_EQ(Contents(0), "first");
    EXPECT_EQ(Contents(1), "third");
}

TEST_F(Adding, StoppedByACallbackASegmentedArchiveIsUnfinishedAndTheCodeIs105) {
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::createSegmented, 1000);
    Progress progress;
    progress.stopAt = 300;
    archive.SetCallback(CZipCallbackType::add, &progress);
    folder.Write("g", zip_test::Noise(5000));
    EXPECT_EQ(CodeOf([&] { archive.AddFile((folder / "g").c_str(), -1, false, 7, 100); }), 105);
    archive.Close(1);
}

TEST_F(Adding, SmartFlag8StoresWhatCompressionMakesLarger) {
    const Bytes noise = zip_test::Noise(100000);
    folder.Write("noise", noise);
    ASSERT_TRUE(Add(folder.Write("text", zip_test::SampleText(1000)), -1, false, 8));
    EXPECT_EQ(Last().GetMethod(), 8);
    ASSERT_TRUE(Add(folder / "noise", -1, false, 8));
    ASSERT_EQ(archive.GetCount(), 2);
    EXPECT_EQ(Last().GetMethod(), 0);
    EXPECT_EQ(Last().GetCompressedSize(), noise.size());
    ASSERT_TRUE(Add(folder / "noise", -1, false, 0));
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_GT(Last().GetCompressedSize(), noise.size());
    Reopen();
    ASSERT_EQ(archive.GetCount(), 3);
    EXPECT_EQ(Contents(0), zip_test::SampleText(1000));
    EXPECT_TRUE(Contents(1) == noise);
    EXPECT_TRUE(Contents(2) == noise);
}

TEST_F(Adding, SmartFlag8CountsWithoutWhatEncryptionAdds) {
    archive.SetPassword("barn red");
    archive.SetEncryptionMethod(CZipEncryption::aes256);
    // Deflated to 19 bytes, with encryption to 47: the first counts.
    ASSERT_TRUE(Add(folder.Write("f", "aaaaaaaaaaaaaaaaaaaaaaaaa"), -1, false, 8));
    EXPECT_EQ(Last().GetMethod(), 8);
    ASSERT_TRUE(Add(folder.Write("g", zip_test::Noise(100)), -1, false, 8));
    EXPECT_EQ(Last().GetMethod(), 0);
    EXPECT_EQ(Last().GetCompressedSize(), 128U);
}

TEST_F(Adding, SmartFlag8NeedsTheSizeAndALevel) {
    const std::string path = folder.Write("f", zip_test::Noise(1000));
    world.files.denied.push_back(path);
    ASSERT_TRUE(Add(path, -1, false, 8));
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_GT(Last().GetCompressedSize(), 1000U);
    world.files.denied.clear();
    ASSERT_TRUE(Add(path, 0, false, 8));
    EXPECT_EQ(Last().GetMethod(), 0);
}

TEST_F(Adding, SmartFlag8WithAutoFlushLeavesOneDirectory) {
    archive.SetAutoFlush(true);
    ASSERT_TRUE(Add(folder.Write("f", zip_test::Noise(1000)), -1, false, 8));
    archive.Close();
    EXPECT_EQ(folder.Read("a.zip").size(), 30 + 1 + 1000 + 46 + 1 + 22U);
}

class StagedAdding : public Adding, public testing::WithParamInterface<unsigned> {
protected:
    void SetUp() override {
        world.names.temporaryFolder = folder / "tmp";
        std::filesystem::create_directory(folder / "tmp");
        archive.Open((folder / "a.zip").c_str(), CZipStorage::createSegmented, 700);
    }
    bool InMemory() const { return (GetParam() & Smart::stageInMemory) != 0; }
};

TEST_P(StagedAdding, OnVolumesTriesFirstAndThenCopiesOrStores) {
    const Bytes noise = zip_test::Noise(2000);
    const Bytes text = zip_test::SampleText(2000);
    ASSERT_TRUE(Add(folder.Write("text", text), -1, false, GetParam()));
    EXPECT_EQ(Last().GetMethod(), 8);
    ASSERT_TRUE(Add(folder.Write("noise", noise), -1, false, GetParam()));
    EXPECT_EQ(Last().GetMethod(), 0);
    EXPECT_EQ(world.names.temporaryFiles.size(), InMemory() ? 0U : 2U);
    EXPECT_TRUE(std::filesystem::is_empty(folder / "tmp"));
    Reopen();
    ASSERT_EQ(archive.GetCount(), 2);
    archive.GetCentralDir().SetIgnoredChecks(0);
    EXPECT_TRUE(Contents(0) == text);
    EXPECT_TRUE(Contents(1) == noise);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "text");
}

TEST_P(StagedAdding, TakesOverPasswordMethodsOptionsAndRoot) {
    archive.SetPassword("barn red");
    archive.SetEncryptionMethod(CZipEncryption::aes128);
    archive.SetCompressionMethod(12);
    ZipArchiveLib::CBzip2Compressor::COptions options;
    options.bufferSize = 50;
    archive.SetCompressorOptions(options);
    archive.SetRootPath(folder.Path().string());
    const Bytes text = zip_test::SampleText(3000);
    ASSERT_TRUE(Add(folder.Write("dir/text", text), -1, false, GetParam()));
    Reopen();
    archive.SetPassword("barn red");
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "dir\\text");
    EXPECT_EQ(archive.GetEntryHeader(0)->GetMethod(), 12);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetEncryptionMethod(), 1);
    archive.GetCentralDir().SetIgnoredChecks(0);
    EXPECT_TRUE(Contents(0) == text);
}

INSTANTIATE_TEST_SUITE_P(OnDiskAndInMemory, StagedAdding, testing::Values(8U, 24U));

TEST_P(StagedAdding, AFailureLeavesNoTemporaryFile) {
    folder.Write("text", zip_test::SampleText(2000));
    world.files.FailAt(0, EIO, {Call::read});
    EXPECT_EQ(CodeOf([&] { Add(folder / "text", -1, false, GetParam()); }), EIO);
    archive.Close(1);
    EXPECT_TRUE(std::filesystem::is_empty(folder / "tmp"));
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Adding, WithoutRoomForATemporaryFileStagingIsSkipped) {
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::createSegmented, 700);
    world.volumes.space = 10;
    ASSERT_TRUE(Add(folder.Write("noise", zip_test::Noise(2000)), -1, false, 8));
    EXPECT_EQ(Last().GetMethod(), 8);
    EXPECT_TRUE(world.names.temporaryFiles.empty());
}

TEST_F(Adding, AStagingArchiveGoesToTheTemporaryPathWhenItHasRoom) {
    std::filesystem::create_directory(folder / "staging");
    archive.SetTemporaryPath(folder / "staging");
    archive.Close();
    archive.Open((folder / "s.zip").c_str(), CZipStorage::createSegmented, 700);
    ASSERT_TRUE(Add(folder.Write("text", zip_test::SampleText(2000)), -1, false, 8));
    ASSERT_EQ(world.names.temporaryFiles.size(), 1U);
    EXPECT_EQ(world.names.temporaryFiles[0].rfind(folder / "staging/ZAR", 0), 0U);
}

class NewEntry : public Adding {
protected:
    CZipFileHeader header;
};

TEST_F(NewEntry, WithoutANameIsCalledAfterTheNumberOfEntries) {
    ASSERT_TRUE(archive.OpenNewEntry(header, -1));
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetFileName(), "file0");
    archive.OpenNewEntry(header, -1);
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetFileName(), "file1");
}

TEST_F(NewEntry, WithoutATimeHasThePresentOne) {
    archive.OpenNewEntry(header, -1);
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetTime(), world.clock.time);
    header.SetTime(1234567890);
    archive.OpenNewEntry(header, -1);
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetTime(), 1234567890);
}

TEST_F(NewEntry, WithASourceTakesItsTimeAndAttributes) {
    const std::string path = folder.Write("f", "not read");
    world.names.set_modification_time(path, 1234567890);
    world.names.set_attributes(path, 0x21);
    header.SetFileName("name");
    ASSERT_TRUE(archive.OpenNewEntry(header, -1, path.c_str()));
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetTime(), 1234567890);
    EXPECT_EQ(Last().GetAttributes(), 0x21U);
    EXPECT_FALSE(archive.OpenNewEntry(header, -1, (folder / "none").c_str()));
    EXPECT_EQ(archive.GetCount(), 1);
}

TEST_F(NewEntry, AFolderGetsASeparatorAndIsStored) {
    header.SetAttributes(0x10);
    header.SetFileName("dir");
    ASSERT_TRUE(archive.OpenNewEntry(header, 9));
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetFileName(), "dir\\");
    EXPECT_EQ(Last().GetMethod(), 0);
    header.SetFileName("dir2/");
    archive.OpenNewEntry(header, 9);
    archive.CloseNewEntry();
    EXPECT_EQ(Last().GetFileName(), "dir2\\");
}

TEST_F(NewEntry, IsWrittenInParts) {
    EXPECT_FALSE(archive.WriteNewEntry("x", 1));
    EXPECT_FALSE(archive.CloseNewEntry());
    ASSERT_TRUE(archive.OpenNewEntry(header, -1));
    EXPECT_EQ(archive.GetState(), CZipArchive::writing);
    EXPECT_TRUE(archive.WriteNewEntry("some ", 5));
    EXPECT_TRUE(archive.WriteNewEntry("", 0));
    EXPECT_TRUE(archive.WriteNewEntry("text", 4));
    EXPECT_TRUE(archive.CloseNewEntry());
    EXPECT_EQ(Contents(0), "some text");
}

TEST_F(NewEntry, EnciphersOnlyWithAPasswordAndAMethod) {
    const auto encryption = [&] {
        archive.OpenNewEntry(header, -1);
        archive.CloseNewEntry();
        return Last().GetEncryptionMethod();
    };
    EXPECT_EQ(encryption(), 255);
    archive.SetPassword("barn red");
    EXPECT_EQ(encryption(), 0) << "traditional is the default";
    archive.SetEncryptionMethod(CZipEncryption::aes256);
    EXPECT_EQ(encryption(), 3);
    EXPECT_EQ(archive.GetCryptograph(), nullptr);
    archive.SetEncryptionMethod(CZipEncryption::none);
    EXPECT_EQ(encryption(), 255);
    archive.SetEncryptionMethod(CZipEncryption::aes256);
    archive.SetPassword("");
    EXPECT_EQ(encryption(), 255);
}

TEST_F(NewEntry, ANameThatIsTooLongRaises110) {
    header.SetFileName(std::string(65536, 'n'));
    EXPECT_EQ(CodeOf([&] { archive.OpenNewEntry(header, -1); }), 110);
    archive.Close(1);
}

TEST_F(NewEntry, StringSettingsHoldForNewEntries) {
    CZipStringSettings settings;
    settings.storeNameInExtraData = true;
    settings.nameCodePage = 65001;
    archive.SetStringSettings(settings);
    header.SetFileName("\xE4\xB8\xAD");
    archive.OpenNewEntry(header, -1);
    archive.CloseNewEntry();
    Reopen();
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "\xE4\xB8\xAD");
    EXPECT_EQ(archive.GetEntryHeader(0)->GetNameCodePage(), 65001U);
}

TEST_F(NewEntry, AfterAnExceptionIsForgotten) {
    archive.OpenNewEntry(header, -1);
    archive.WriteNewEntry("text", 4);
    EXPECT_TRUE(archive.CloseNewEntry(true));
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    EXPECT_EQ(archive.GetCentralDir().GetOpenHeader(), nullptr);
    archive.Close(1);
}

}  // namespace
