#include "zip/storage.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "support.h"
#include "zip/mem_file.h"
#include "zip/record_layout.h"

namespace {

using zip_test::Bytes;
using zip_test::Call;
using zip_test::CodeOf;
using zip_test::ScratchFolder;
using zip_test::World;

class Storage : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipStorage storage{world.environment};

    void Write(const Bytes& bytes, bool atOnce = false) {
        storage.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()), atOnce);
    }
    Bytes Read(std::uint32_t size, bool atOnce = false) {
        Bytes bytes(size, '\0');
        bytes.resize(storage.Read(bytes.data(), size, atOnce));
        return bytes;
    }
    // An archive of one volume, opened for reading up to the point where its end record has been understood.
    void OpenWhole(const Bytes& bytes, int mode = CZipStorage::openReadOnly) {
        storage.Open(folder.Write("a.zip", bytes), mode, 0);
        storage.SetLastVolume(0);
    }
};

TEST_F(Storage, BeginsClosed) {
    EXPECT_TRUE(storage.IsClosed());
    EXPECT_FALSE(storage.HasFile());
    EXPECT_EQ(storage.GetCurrentVolume(), 65535);
    EXPECT_EQ(storage.GetWriteBufferSize(), 65536U);
    EXPECT_EQ(storage.GetSearchBufferSize(), 32768U);
}

struct Opening {
    const char* name;
    int mode;
    int volumeSize;
    std::uint16_t volume;
    int segmentation;
    bool readOnly;
};
void PrintTo(const Opening& c, std::ostream* os) { *os << c.name; }

class StorageOpening : public testing::TestWithParam<Opening> {};

TEST_P(StorageOpening, HasThisState) {
    const ScratchFolder folder;
    const World world;
    CZipStorage storage(world.environment);
    folder.Write("a.zip", "old");
    storage.Open(folder / "a.zip", GetParam().mode, GetParam().volumeSize);
    EXPECT_EQ(storage.GetCurrentVolume(), GetParam().volume);
    EXPECT_EQ(storage.GetSegmentation(), GetParam().segmentation);
    EXPECT_EQ(storage.IsReadOnly(), GetParam().readOnly);
    EXPECT_EQ(storage.GetArchivePath(), folder / "a.zip");
    EXPECT_FALSE(storage.IsStream());
}

INSTANTIATE_TEST_SUITE_P(Modes, StorageOpening,
                         testing::Values(Opening{"Existing", 0, 0, 65535, 3, false},
                                         Opening{"ExistingWithVolumeSize", 0, 1, 65535, 4, false},
                                         Opening{"ReadOnly", 1, 0, 65535, 3, true},
                                         Opening{"ReadOnlyWithVolumeSize", 1, 1, 65535, 4, true},
                                         Opening{"Create", 2, 0, 0, 0, false},
                                         Opening{"CreateSplit", 3, 1000, 0, 2, false},
                                         Opening{"CreateAppend", 4, 0, 0, 0, false}),
                         [](const auto& row) { return std::string(row.param.name); });

TEST_F(Storage, AModeThatIsNoneRaises100) {
    EXPECT_EQ(CodeOf([&] { storage.Open(folder / "a.zip", 5, 0); }), 100);
    EXPECT_TRUE(storage.IsClosed());
}

TEST_F(Storage, AFailedOpeningRaisesErrnoAndStaysClosed) {
    EXPECT_EQ(CodeOf([&] { storage.Open(folder / "none.zip", CZipStorage::openReadOnly, 0); }), ENOENT);
    EXPECT_TRUE(storage.IsClosed());
    EXPECT_FALSE(storage.HasFile());
    EXPECT_EQ(CodeOf([&] { storage.Open(folder / "none.zip", CZipStorage::createAppend, 0); }), ENOENT);
    EXPECT_TRUE(storage.IsClosed());
}

TEST_F(Storage, WritesAreGatheredUntilTheBufferIsFull) {
    storage.SetBufferSizes(8, 8);
    storage.Open(folder / "a.zip", CZipStorage::create, 0);
    Write("12345678");
    EXPECT_EQ(folder.Read("a.zip"), "");
    EXPECT_EQ(storage.GetPosition(), 8U);
    Write("9");
    EXPECT_EQ(folder.Read("a.zip"), "12345678");
    Write(Bytes(20, 'x'));
    storage.Flush();
    EXPECT_EQ(folder.Read("a.zip"), "123456789" + Bytes(20, 'x'));
    EXPECT_EQ(storage.GetPosition(), 29U);
}

TEST_F(Storage, CloseWritesWhatIsGatheredAndForgetsEverything) {
    storage.Open(folder / "a.zip", CZipStorage::create, 0);
    Write("abc");
    EXPECT_EQ(storage.Close(false), folder / "a.zip");
    EXPECT_EQ(folder.Read("a.zip"), "abc");
    EXPECT_TRUE(storage.IsClosed());
    EXPECT_FALSE(storage.HasFile());
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Storage, CloseAfterAnExceptionWritesNothingMore) {
    storage.Open(folder / "a.zip", CZipStorage::create, 0);
    Write("abc");
    storage.Close(true);
    EXPECT_EQ(folder.Read("a.zip"), "");
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Storage, AFailingFlushOnCloseLeavesItOpenForAnotherCloseAfterException) {
    storage.Open(folder / "a.zip", CZipStorage::create, 0);
    Write("abc");
    world.files.FailAt(0, ENOSPC, {Call::write});
    EXPECT_EQ(CodeOf([&] { storage.Close(false); }), ENOSPC);
    EXPECT_TRUE(storage.HasFile());
    storage.Close(true);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Storage, AFailingCommitOrCloseLeavesNothingOpen) {
    for (const Call call : {Call::commit, Call::close}) {
        world.files.Heal();
        storage.Open(folder / "a.zip", CZipStorage::create, 0);
        world.files.FailAt(0, EIO, {call});
        EXPECT_EQ(CodeOf([&] { storage.Close(false); }), EIO);
        EXPECT_TRUE(storage.IsClosed());
        EXPECT_EQ(world.files.OpenCount(), 0U);
    }
}

TEST_F(Storage, ReadOnlyFilesAreNotCommitted) {
    OpenWhole("abc");
    world.files.FailAt(0, EIO, {Call::commit});
    storage.Close(false);
    EXPECT_FALSE(world.files.HasFailed());
}

TEST_F(Storage, ReadingPastTheEndRaises101EvenWhenPartIsThere) {
    OpenWhole("abc");
    EXPECT_EQ(CodeOf([&] { Read(4); }), 101);
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
    storage.Seek(0);
    EXPECT_EQ(Read(3), "abc");
    EXPECT_EQ(CodeOf([&] { Read(1, true); }), 101);
    EXPECT_EQ(Read(0), "");
}

TEST_F(Storage, TheCodeComesWithThePath) {
    OpenWhole("abc");
    try {
        Read(4);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetPath(), folder / "a.zip");
    }
}

TEST_F(Storage, AppendingCountsFromTheEndOfWhatIsThere) {
    folder.Write("a.zip", "stub");
    storage.Open(folder / "a.zip", CZipStorage::createAppend, 0);
    EXPECT_EQ(storage.GetBytesBefore(), 4U);
    EXPECT_EQ(storage.GetPosition(), 0U);
    Write("abc");
    EXPECT_EQ(storage.GetPosition(), 3U);
    storage.Flush();
    EXPECT_EQ(storage.GetLength(), 3U);
    storage.Seek(1);
    EXPECT_EQ(Read(2), "bc");
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"), "stubabc");
    EXPECT_EQ(storage.GetBytesBefore(), 0U);
}

TEST_F(Storage, SeeksFromCurrentAndEnd) {
    OpenWhole("abcdef");
    storage.Seek(2);
    storage.Seek(2, CZipAbstractFile::current);
    EXPECT_EQ(Read(1), "e");
    storage.Seek(0, CZipAbstractFile::end);
    EXPECT_EQ(storage.GetPosition(), 6U);
}

TEST_F(Storage, OffsetsWithTheTopBitSetAreReached) {
    OpenWhole("abc");
    std::filesystem::resize_file(folder / "a.zip", 0x90000000);
    storage.Seek(0x8FFFFFFF);
    EXPECT_EQ(storage.GetPosition(), 0x8FFFFFFFU);
    EXPECT_EQ(Read(1), Bytes(1, '\0'));
    storage.Seek(0xA0000000);
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
}

TEST_F(Storage, AnOffsetThatWrapsIsRefused) {
    OpenWhole("abc");
    storage.SetBytesBefore(2);
    EXPECT_EQ(CodeOf([&] { storage.Seek(0xFFFFFFFF); }), EFBIG);
}

TEST_F(Storage, WritingBeyond32BitsIsRefused) {
    storage.Open(folder / "a.zip", CZipStorage::create, 0);
    std::filesystem::resize_file(folder / "a.zip", 0xFFFFFFFE);
    storage.SeekToEnd();
    Write("a");
    storage.Flush();
    Write("b");
    EXPECT_EQ(CodeOf([&] { storage.Flush(); }), EFBIG);
    EXPECT_EQ(CodeOf([&] { static_cast<void>(storage.GetPosition()); }), EFBIG);
    storage.Close(true);
}

TEST_F(Storage, TruncateCutsAndGoesThere) {
    folder.Write("a.zip", "stub");
    storage.Open(folder / "a.zip", CZipStorage::createAppend, 0);
    Write("abcdef");
    storage.Truncate(2);
    EXPECT_EQ(storage.GetPosition(), 2U);
    Write("X");
    storage.Close(false);
    EXPECT_EQ(folder.Read("a.zip"), "stubabX");
}

TEST_F(Storage, ACallersFileIsNeitherClosedNorDivided) {
    CZipMemFile file;
    storage.Open(file, CZipStorage::create);
    EXPECT_TRUE(storage.IsStream());
    EXPECT_EQ(storage.GetSegmentation(), 0);
    Write("abc");
    EXPECT_EQ(storage.Close(false), "");
    EXPECT_FALSE(file.IsClosed());
    EXPECT_EQ(file.GetLength(), 3U);

    storage.Open(file, CZipStorage::createAppend);
    EXPECT_EQ(storage.GetBytesBefore(), 3U);
    storage.Close(true);
    storage.Open(file, CZipStorage::openReadOnly);
    EXPECT_TRUE(storage.IsReadOnly());
    EXPECT_TRUE(storage.IsClosed());
    EXPECT_EQ(CodeOf([&] { storage.SetLastVolume(1); }), 101);
    storage.Close(true);
    EXPECT_EQ(CodeOf([&] { storage.Open(file, CZipStorage::createSegmented); }), 100);
}

TEST_F(Storage, ASeekFarBeyondACallersFileDoesNotMakeItGrow) {
    CZipMemFile file;
    file.Write("abc", 3);
    storage.Open(file, CZipStorage::openReadOnly);
    storage.SetLastVolume(0);
    EXPECT_EQ(CodeOf([&] { storage.Seek(0x7FFFFFFF); }), 101);
    EXPECT_EQ(file.GetBufferSize(), 1024U);
}

struct Search {
    const char* why;
    Bytes bytes;
    std::uint32_t distance;
    std::int64_t position;
};
void PrintTo(const Search& c, std::ostream* os) { *os << c.why; }

class SignatureSearch : public testing::TestWithParam<std::tuple<Search, std::uint32_t>> {};

TEST_P(SignatureSearch, FindsTheLastOneInReach) {
    const auto& [search, blockSize] = GetParam();
    const ScratchFolder folder;
    const World world;
    CZipStorage storage(world.environment);
    storage.SetBufferSizes(16, blockSize);
    storage.Open(folder.Write("a.zip", search.bytes), CZipStorage::openReadOnly, 0);
    EXPECT_EQ(storage.FindSignature(k_endSignature, search.distance), search.position);
}

INSTANTIATE_TEST_SUITE_P(Files, SignatureSearch,
                         testing::Combine(testing::Values(Search{"at the end", "abcPK\5\6", 100, 3},
                                                          Search{"at the begin", "PK\5\6abc", 100, 0},
                                                          Search{"the last of two", "PK\5\6-PK\5\6-", 100, 5},
                                                          Search{"just in reach", "PK\5\6abc", 7, 0},
                                                          Search{"just out of reach", "PK\5\6abc", 6, -1},
                                                          Search{"after a mismatch that begins another match",
                                                                 "PK\5\6\5\6\6", 100, 0},
                                                          Search{"half of it in front", "K\5\6PK\5\6K\5\6",
                                                                 100, 3},
                                                          Search{"not there", "PK\5PK\6", 100, -1},
                                                          Search{"shorter than a signature", "PK", 100, -1},
                                                          Search{"nothing", "", 100, -1}),
                                          // Every way in which the ends of blocks can cut a signature.
                                          testing::Values(1U, 2U, 3U, 4U, 5U, 7U, 64U)));

TEST_F(Storage, AShortBlockInASearchRaises101) {
    OpenWhole(Bytes(100, 'x'));
    world.files.FallShortAt(0, {Call::read});
    EXPECT_EQ(CodeOf([&] { storage.FindSignature(k_endSignature, 100); }), 101);
}

TEST_F(Storage, ASearchCanBeginBeforeAPosition) {
    OpenWhole("PK\6\7--PK\6\7");
    EXPECT_EQ(storage.FindSignature(k_zip64LocatorSignature, 100), 6);
    EXPECT_EQ(storage.FindSignature(k_zip64LocatorSignature, 100, 6), 0);
}

}  // namespace
