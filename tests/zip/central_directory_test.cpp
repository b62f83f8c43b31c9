#include "zip/central_directory.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::Number16;
using zip_test::Number32;
using zip_test::RawArchive;
using zip_test::RawEntry;
using zip_test::ScratchFolder;
using zip_test::World;

RawArchive TwoEntries() {
    return RawArchive::Of({RawEntry::Stored("a", "first"), RawEntry::Stored("b", "second")});
}

class DirectoryReading : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipArchive archive{world.environment};

    int Open(const Bytes& bytes) {
        const std::string path = folder.Write("a.zip", bytes);
        return CodeOf([&] { archive.Open(path.c_str(), CZipStorage::openReadOnly); });
    }
    Bytes Contents(std::uint16_t index) {
        if (!archive.OpenEntry(index)) return "not opened";
        Bytes bytes(archive.GetEntryHeader(index)->GetUncompressedSize(), '\0');
        bytes.resize(archive.ReadEntry(bytes.data(), static_cast<std::uint32_t>(bytes.size())));
        return archive.CloseEntry() == 1 ? bytes : "not closed";
    }
};

TEST_F(DirectoryReading, GivesEveryFieldOfTheEndRecord) {
    RawArchive raw = TwoEntries();
    raw.comment = "a comment";
    ASSERT_EQ(Open(raw.Build()), 0);
    const CZipDirectoryInfo& info = archive.GetCentralDir().GetInfo();
    EXPECT_EQ(info.endRecordPosition, raw.Build().size() - 22 - 9);
    EXPECT_EQ(info.thisDisk, 0);
    EXPECT_EQ(info.directoryDisk, 0);
    EXPECT_EQ(info.entriesOnThisDisk, 2);
    EXPECT_EQ(info.totalEntries, 2);
    EXPECT_EQ(info.directorySize, 94U);
    EXPECT_EQ(info.directoryOffset, 73U);
    EXPECT_TRUE(info.existsOnDisk);
    EXPECT_EQ(Bytes(reinterpret_cast<const char*>(info.comment.GetBuffer()), info.comment.GetSize()),
              "a comment");
    EXPECT_EQ(archive.GetCentralDir().GetIgnoredChecks(), 0x100U);
}

TEST_F(DirectoryReading, GivesEveryFieldOfARecord) {
    RawEntry entry = RawEntry::DeflatedEntry("name", "some text");
    entry.madeBy = 0x0A2D;
    entry.needed = 21;
    entry.flags = 0x0806;
    entry.attributes = 0x81B40020;
    entry.comment = "note";
    entry.centralExtra = zip_test::ExtraRecord(0x5455, "abcde");
    entry.localExtra = zip_test::ExtraRecord(0x5455, "abcdefghi");
    RawArchive raw = TwoEntries();
    raw.entries.push_back(entry);
    ASSERT_EQ(Open(raw.Build()), 0);
    CZipFileHeader& header = *archive.GetEntryHeader(2);
    EXPECT_EQ(header.GetMadeByVersion(), 0x2D);
    EXPECT_EQ(header.GetSystem(), 0x0A);
    EXPECT_EQ(header.GetVersionNeeded(), 21);
    EXPECT_EQ(header.GetFlags(), 0x0806);
    EXPECT_EQ(header.GetMethod(), 8);
    EXPECT_EQ(header.GetModificationTime(), entry.time);
    EXPECT_EQ(header.GetModificationDate(), entry.date);
    EXPECT_EQ(header.GetCrc(), entry.crc);
    EXPECT_EQ(header.GetCompressedSize(), entry.data.size());
    EXPECT_EQ(header.GetUncompressedSize(), 9U);
    EXPECT_EQ(header.GetDiskStart(), 0);
    EXPECT_EQ(header.GetInternalAttributes(), 0);
    EXPECT_EQ(header.GetExternalAttributes(), 0x81B40020);
    EXPECT_EQ(header.GetOffset(), 73U);
    EXPECT_EQ(header.GetCentralExtra().GetAt(0).data.GetSize(), 5U);
    EXPECT_EQ(header.GetComment(), "note");
    EXPECT_EQ(header.GetFileName(), "name");
    ASSERT_TRUE(archive.OpenEntry(2));
    EXPECT_EQ(header.GetLocalCompressedSize(), entry.data.size());
    EXPECT_EQ(header.GetLocalUncompressedSize(), 9U);
    EXPECT_EQ(header.GetLocalFileNameSize(), 4);
    EXPECT_EQ(header.GetLocalExtra().GetAt(0).data.GetSize(), 9U);
}

TEST_F(DirectoryReading, AStubInFrontShiftsAllOffsets) {
    for (const std::size_t size : {1U, 1000U, 70000U}) {
        RawArchive raw = TwoEntries();
        raw.stub = zip_test::Noise(size);
        ASSERT_EQ(Open(raw.Build()), 0);
        EXPECT_EQ(archive.GetStorage().GetBytesBefore(), size);
        EXPECT_EQ(archive.GetEntryHeader(0)->GetOffset(), 0U);
        EXPECT_EQ(Contents(0), "first");
        EXPECT_EQ(Contents(1), "second");
        archive.Close();
    }
}

TEST_F(DirectoryReading, TheLargestCommentIsFound) {
    RawArchive raw = TwoEntries();
    raw.comment = Bytes(65535, 'c');
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCentralDir().GetInfo().comment.GetSize(), 65535U);
}

TEST_F(DirectoryReading, ATrailerIsFoundUpTo65557BytesFromTheEnd) {
    RawArchive raw = TwoEntries();
    raw.trailer = Bytes(65535, 't');
    EXPECT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(Contents(1), "second");
    archive.Close();
    raw.trailer += 't';
    EXPECT_EQ(Open(raw.Build()), 101);
    archive.Close(1);
}

TEST_F(DirectoryReading, EntriesStandInTheOrderOfTheFileAndNotOfTheDirectory) {
    const RawEntry first = RawEntry::Stored("a", "first");
    const RawEntry second = RawEntry::Stored("b", "second");
    const Bytes locals = first.Local() + second.Local();
    const Bytes directory =
        second.Central(static_cast<std::uint32_t>(first.Local().size())) + first.Central(0);
    ASSERT_EQ(Open(locals + directory + "PK\5\6" + Bytes(4, '\0') + Number16(2) + Number16(2) +
                   Number32(static_cast<std::uint32_t>(directory.size())) +
                   Number32(static_cast<std::uint32_t>(locals.size())) + Number16(0)),
              0);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "a");
    EXPECT_EQ(archive.GetEntryHeader(1)->GetFileName(), "b");
}

TEST_F(DirectoryReading, TwoEntriesAtTheSamePlaceAreRefused) {
    RawArchive raw = TwoEntries();
    raw.entries[1].offset = 0;
    EXPECT_EQ(Open(raw.Build()), 101);
}

TEST_F(DirectoryReading, TheSameOffsetOnAnotherDiskIsAnotherPlace) {
    RawArchive raw = TwoEntries();
    raw.entries[1].offset = 0;
    raw.entries[1].disk = 1;
    EXPECT_EQ(Open(raw.Build()), 0);
}

TEST_F(DirectoryReading, AnArchiveWithoutEntriesOpens) {
    ASSERT_EQ(Open(RawArchive().Build()), 0);
    EXPECT_EQ(archive.GetCount(), 0);
    EXPECT_EQ(archive.GetEntryHeader(0), nullptr);
    EXPECT_FALSE(archive.OpenEntry(0));
}

TEST_F(DirectoryReading, DirectoriesAreReadAsFarAsTheCountSays) {
    RawArchive raw = TwoEntries();
    raw.total = 1;
    raw.entriesHere = 1;
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCount(), 1);
}

TEST_F(DirectoryReading, ExhaustivelyTheyAreReadToTheEndRecord) {
    RawArchive raw = TwoEntries();
    raw.stub = "stub";
    raw.total = 1;
    raw.entriesHere = 1;
    archive.SetExhaustiveRead(true);
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCount(), 2);
    EXPECT_EQ(Contents(1), "second");
    archive.Close();
    // Up to what is no record.
    raw.beforeEnd = "else";
    raw.size = 94 + 4;
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCount(), 2);
    archive.Close();
    raw.beforeEnd = "PK\1\2 and no record";
    raw.size = 94 + 18;
    EXPECT_EQ(Open(raw.Build()), 101);
    archive.Close(1);
}

TEST_F(DirectoryReading, ExhaustivelyNoMoreEntriesAreTakenThanIndexesCanTell) {
    RawArchive raw;
    raw.entries.assign(65537, RawEntry::Stored("n", "x"));
    raw.total = raw.entriesHere = 2;
    archive.SetExhaustiveRead(true);
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCount(), 65535);
}

struct BadDirectory {
    const char* why;
    std::function<void(RawArchive&)> spoil;
    int code;
};
void PrintTo(const BadDirectory& c, std::ostream* os) { *os << c.why; }

class RefusedDirectory : public testing::TestWithParam<BadDirectory> {};
TEST_P(RefusedDirectory, RaisesThisCodeWithThePath) {
    const ScratchFolder folder;
    RawArchive raw = TwoEntries();
    GetParam().spoil(raw);
    const std::string path = folder.Write("a.zip", raw.Build());
    CZipArchive archive;
    try {
        archive.Open(path.c_str(), CZipStorage::openReadOnly);
        EXPECT_EQ(GetParam().code, 0);
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetCode(), GetParam().code);
        EXPECT_EQ(exception.GetPath(), path);
    }
    archive.Close(1);
    EXPECT_TRUE(archive.IsClosed());
    EXPECT_EQ(archive.GetCount(), 0);
}

INSTANTIATE_TEST_SUITE_P(
    Directories, RefusedDirectory,
    testing::Values(
        BadDirectory{"the comment is cut off", [](auto& raw) { raw.commentSize = 1; }, 101},
        BadDirectory{"the directory ends behind the end record", [](auto& raw) { raw.size = 95; }, 101},
        BadDirectory{"offset and size wrap together", [](auto& raw) { raw.offset = 0xFFFFFFF0; }, 101},
        BadDirectory{"no size and entries", [](auto& raw) { raw.size = 0, raw.offset = 167; }, 101},
        BadDirectory{"a size and no entries", [](auto& raw) { raw.total = 0; }, 101},
        BadDirectory{"more entries than there are", [](auto& raw) { raw.total = 3; }, 101},
        BadDirectory{"a wrong signature", [](auto& raw) { raw.entries[1].centralSignature = "PK\1\3"; }, 101},
        BadDirectory{"an unreadable extra field", [](auto& raw) { raw.entries[0].centralExtra = "abc"; },
                     101},
        BadDirectory{"the size is too small", [](auto& raw) { raw.size = 90; }, 101},
        BadDirectory{"65535 entries here and a locator",
                     [](auto& raw) { raw.entriesHere = 65535, raw.beforeEnd = "PK\6\7", raw.size = 98; },
                     120},
        BadDirectory{"65535 entries in all and a locator",
                     [](auto& raw) { raw.total = 65535, raw.beforeEnd = "PK\6\7", raw.size = 98; }, 120},
        BadDirectory{"a size of all ones and a locator",
                     [](auto& raw) { raw.size = 0xFFFFFFFF, raw.beforeEnd = "PK\6\7"; }, 120},
        BadDirectory{"an offset of all ones and a locator far away",
                     [](auto& raw) { raw.offset = 0xFFFFFFFF, raw.stub = "PK\6\7" + Bytes(100000, 'x'); },
                     120},
        BadDirectory{"a size of all ones and no locator", [](auto& raw) { raw.size = 0xFFFFFFFF; }, 101},
        BadDirectory{"an offset of all ones and no locator", [](auto& raw) { raw.offset = 0xFFFFFFFF; }, 101},
        BadDirectory{"a locator alone", [](auto& raw) { raw.beforeEnd = "PK\6\7", raw.size = 98; }, 0},
        BadDirectory{"65535 entries here and no locator", [](auto& raw) { raw.entriesHere = 65535; }, 0}));

TEST_F(DirectoryReading, WithoutAnEndRecordRaises101) {
    EXPECT_EQ(Open(""), 101);
    archive.Close(1);
    EXPECT_EQ(Open("no archive at all"), 101);
    archive.Close(1);
    EXPECT_EQ(Open("PK\5\6"), 101);
    archive.Close(1);
}

TEST_F(DirectoryReading, AnArchiveWith65535EntriesAndNoLocatorIsAnOrdinaryOne) {
    RawArchive raw;
    raw.entries.assign(65535, RawEntry::Stored("n", "x"));
    ASSERT_EQ(Open(raw.Build()), 0);
    EXPECT_EQ(archive.GetCount(), 65535);
    EXPECT_EQ(Contents(0), "x");
    EXPECT_EQ(Contents(65534), "x");
    EXPECT_EQ(archive.GetEntryHeader(65535), nullptr);
}

TEST_F(DirectoryReading, HeadersReadBeforeAFailureStayUntilTheArchiveIsClosed) {
    RawArchive raw = TwoEntries();
    raw.entries[1].centralSignature = "PK\1\3";
    ASSERT_EQ(Open(raw.Build()), 101);
    EXPECT_EQ(archive.GetCount(), 2);
    archive.Close(1);
    EXPECT_EQ(archive.GetCount(), 0);
}

struct LocalLie {
    const char* why;
    std::function<void(RawEntry&)> spoil;
    std::uint32_t ignored;
    bool opens;
};
void PrintTo(const LocalLie& c, std::ostream* os) { *os << c.why << ", ignoring " << c.ignored; }

class LocalHeader : public testing::TestWithParam<LocalLie> {};
TEST_P(LocalHeader, IsCheckedAgainstTheCentralRecord) {
    RawArchive raw = TwoEntries();
    GetParam().spoil(raw.entries[0]);
    Bytes bytes = raw.Build();
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    CZipArchive archive;
    archive.Open(file, CZipStorage::openReadOnly);
    archive.GetCentralDir().SetIgnoredChecks(GetParam().ignored);
    const std::uint16_t index = archive.FindEntry("a");
    EXPECT_EQ(CodeOf([&] { EXPECT_TRUE(archive.OpenEntry(index)); }), GetParam().opens ? 0 : 101);
    EXPECT_EQ(archive.GetState(), GetParam().opens ? CZipArchive::reading : CZipArchive::idle);
}

INSTANTIATE_TEST_SUITE_P(
    Lies, LocalHeader,
    testing::Values(
        LocalLie{"all is well", [](auto&) {}, 0x100, true},
        LocalLie{"a wrong signature", [](auto& entry) { entry.localSignature = "PK\3\5"; }, 0xFFF, false},
        LocalLie{"another method", [](auto& entry) { entry.localMethod = 8; }, 0x100, false},
        LocalLie{"another method", [](auto& entry) { entry.localMethod = 8; }, 0x02, true},
        LocalLie{"another CRC", [](auto& entry) { entry.localCrc = 1; }, 0x100, false},
        LocalLie{"another CRC", [](auto& entry) { entry.localCrc = 1; }, 0x08, true},
        LocalLie{"another CRC", [](auto& entry) { entry.localCrc = 1; }, 0x04, true},
        LocalLie{"another CRC", [](auto& entry) { entry.localCrc = 1; }, 0x01, false},
        LocalLie{"another CRC and a descriptor", [](auto& entry) { entry.localCrc = 1, entry.flags = 8; },
                 0x100, true},
        LocalLie{"another compressed size", [](auto& entry) { entry.localCompressed = 4; }, 0x100, false},
        LocalLie{"another compressed size", [](auto& entry) { entry.localCompressed = 4; }, 0x04, true},
        LocalLie{"another compressed size and a descriptor",
                 [](auto& entry) { entry.localCompressed = 4, entry.flags = 8; }, 0x100, true},
        LocalLie{"a compressed size of 0", [](auto& entry) { entry.localCompressed = 0; }, 0x100, true},
        LocalLie{"an uncompressed size of 0", [](auto& entry) { entry.localUncompressed = 0; }, 0x100, false},
        LocalLie{"both sizes 0", [](auto& entry) { entry.localCompressed = 0, entry.localUncompressed = 0; },
                 0x100, false},
        LocalLie{"another uncompressed size", [](auto& entry) { entry.localUncompressed = 4; }, 0x04, true},
        LocalLie{"a low flag", [](auto& entry) { entry.localFlags = 2; }, 0x100, false},
        LocalLie{"a low flag", [](auto& entry) { entry.localFlags = 2; }, 0x10, true},
        LocalLie{"the descriptor flag", [](auto& entry) { entry.localFlags = 8; }, 0x100, false},
        LocalLie{"a high flag", [](auto& entry) { entry.localFlags = 0x0810; }, 0x100, true},
        LocalLie{"an unreadable extra field", [](auto& entry) { entry.localExtra = "abc"; }, 0xFFF, false},
        LocalLie{"an extra field of its own",
                 [](auto& entry) { entry.localExtra = "\1\1\1\1" + Bytes(256, 'x'); }, 0x100, false},
        LocalLie{"an offset elsewhere", [](auto& entry) { entry.offset = 1; }, 0xFFF, false},
        LocalLie{"an offset far away", [](auto& entry) { entry.offset = 0xFFFFFF00; }, 0xFFF, false}));

TEST(LocalName, IsSkippedAndNotCompared) {
    RawEntry entry = RawEntry::Stored("central", "text");
    Bytes local = entry.Local();
    local.replace(30, 7, "l/../l!");
    const Bytes directory = entry.Central(0);
    Bytes bytes = local + directory + "PK\5\6" + Bytes(4, '\0') + Number16(1) + Number16(1) +
                  Number32(static_cast<std::uint32_t>(directory.size())) +
                  Number32(static_cast<std::uint32_t>(local.size())) + Number16(0);
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    CZipArchive archive;
    archive.Open(file, CZipStorage::openReadOnly);
    EXPECT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "central");
}

struct Descriptor {
    const char* why;
    Bytes bytes;
    int code;
};
void PrintTo(const Descriptor& c, std::ostream* os) { *os << c.why; }

class DataDescriptor : public testing::TestWithParam<Descriptor> {
protected:
    static int Close(const Bytes& descriptor, std::uint32_t ignored) {
        RawEntry entry = RawEntry::Stored("a", "text");
        entry.flags = 8;
        entry.descriptor = descriptor;
        Bytes bytes = RawArchive::Of({entry}).Build();
        CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
        CZipArchive archive;
        archive.Open(file, CZipStorage::openReadOnly);
        archive.GetCentralDir().SetIgnoredChecks(ignored);
        EXPECT_TRUE(archive.OpenEntry(0));
        char buffer[5];
        EXPECT_EQ(archive.ReadEntry(buffer, 5), 4U);
        return CodeOf([&] { EXPECT_EQ(archive.CloseEntry(), 1); });
    }
};
TEST_P(DataDescriptor, IsComparedWhenTheCheckIsOn) { EXPECT_EQ(Close(GetParam().bytes, 0), GetParam().code); }
TEST_P(DataDescriptor, IsNotComparedAtFirst) {
    EXPECT_EQ(Close(GetParam().bytes, CZipChecks::ignoredAtFirst), 0);
}

const Bytes k_crc = Number32(zip_test::Crc32("text"));
INSTANTIATE_TEST_SUITE_P(
    Descriptors, DataDescriptor,
    testing::Values(Descriptor{"signed", "PK\7\x8" + k_crc + Number32(4) + Number32(4), 0},
                    Descriptor{"not signed", k_crc + Number32(4) + Number32(4), 0},
                    Descriptor{"another CRC", "PK\7\x8" + Number32(1) + Number32(4) + Number32(4), 101},
                    Descriptor{"another compressed size", "PK\7\x8" + k_crc + Number32(5) + Number32(4), 101},
                    Descriptor{"another uncompressed size", k_crc + Number32(4) + Number32(5), 101}));

class DirectoryWriting : public testing::Test {
protected:
    CZipMemFile file;
    CZipArchive archive;

    void Add(const std::string& name, const Bytes& data) {
        CZipFileHeader header;
        header.SetFileName(name);
        header.SetTime(1700000000);
        ASSERT_TRUE(archive.OpenNewEntry(header, 0));
        archive.WriteNewEntry(data.data(), static_cast<std::uint32_t>(data.size()));
        ASSERT_TRUE(archive.CloseNewEntry());
    }
    Bytes Written() const { return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()}; }
};

TEST_F(DirectoryWriting, AnEmptyArchiveIsAnEndRecord) {
    archive.Open(file, CZipStorage::create);
    archive.Close();
    EXPECT_EQ(Written(), "PK\5\6" + Bytes(18, '\0'));
}

TEST_F(DirectoryWriting, AnUnchangedArchiveIsNotWritten) {
    RawArchive raw = TwoEntries();
    raw.comment = "kept";
    const Bytes bytes = raw.Build() + "trailer";
    file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
    archive.Open(file, CZipStorage::openExisting);
    archive.Close();
    EXPECT_EQ(Written(), bytes);
}

TEST_F(DirectoryWriting, ANewEntryTakesTheDirectorysPlaceAndTheCommentIsWrittenBack) {
    RawArchive raw = TwoEntries();
    raw.comment = "kept";
    const Bytes bytes = raw.Build() + "trailer";
    file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
    archive.Open(file, CZipStorage::openExisting);
    EXPECT_TRUE(archive.GetCentralDir().GetInfo().existsOnDisk);
    Add("c", "third");
    EXPECT_FALSE(archive.GetCentralDir().GetInfo().existsOnDisk);
    EXPECT_EQ(archive.GetEntryHeader(2)->GetOffset(), 73U);
    archive.Close();
    EXPECT_EQ(Written().substr(0, 73), bytes.substr(0, 73));
    EXPECT_EQ(Written().substr(Written().size() - 6), Number16(4) + "kept");

    archive.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetCount(), 3);
    EXPECT_EQ(archive.GetEntryHeader(2)->GetFileName(), "c");
}

TEST_F(DirectoryWriting, EntriesBehindAStubKeepTheirOffsets) {
    RawArchive raw = TwoEntries();
    raw.stub = "a stub";
    const Bytes bytes = raw.Build();
    file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
    archive.Open(file, CZipStorage::openExisting);
    Add("c", "third");
    archive.Close();
    archive.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetStorage().GetBytesBefore(), 6U);
    char buffer[6] = {};
    ASSERT_TRUE(archive.OpenEntry(2));
    EXPECT_EQ(archive.ReadEntry(buffer, 5), 5U);
    EXPECT_STREQ(buffer, "third");
}

TEST_F(DirectoryWriting, AutoFlushWritesTheDirectoryAfterEveryEntry) {
    archive.SetAutoFlush(true);
    archive.Open(file, CZipStorage::create);
    Add("a", "first");
    CZipArchive second;
    second.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(second.GetCount(), 1);
    second.Close(1);
    Add("b", "second");
    archive.Close(1);
    second.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(second.GetCount(), 2);
}

TEST_F(DirectoryWriting, AnOverlongFieldRaises110OnClose) {
    archive.Open(file, CZipStorage::create);
    Add("a", "first");
    archive.GetEntryHeader(0)->SetComment(std::string(65536, 'c'));
    EXPECT_EQ(CodeOf([&] { archive.Close(); }), 110);
    archive.Close(1);
    EXPECT_TRUE(archive.IsClosed());
}

TEST_F(DirectoryWriting, AnOverlongCommentOfTheArchiveRaises110) {
    archive.Open(file, CZipStorage::create);
    archive.GetCentralDir().GetInfo().comment.Allocate(65536, true);
    EXPECT_EQ(CodeOf([&] { archive.Close(); }), 110);
    archive.GetCentralDir().GetInfo().comment.Allocate(65535, true);
    archive.Close();
    EXPECT_EQ(file.GetLength(), 22U + 65535);
}

TEST_F(DirectoryWriting, AnOverlongFieldNamesTheArchive) {
    const ScratchFolder folder;
    const std::string path = folder / "a.zip";
    archive.Open(path.c_str(), CZipStorage::create);
    Add("a", "first");
    archive.GetEntryHeader(0)->SetComment(std::string(65536, 'c'));
    CZipFileHeader overlong;
    overlong.SetFileName(std::string(65536, 'n'));
    for (const auto& action : {std::function<void()>([&] { archive.OpenNewEntry(overlong, 0); }),
                               std::function<void()>([&] { archive.Close(); })}) {
        try {
            action();
            ADD_FAILURE();
        } catch (const CZipException& exception) {
            EXPECT_EQ(exception.GetCode(), 110);
            EXPECT_EQ(exception.GetPath(), path);
        }
    }
    archive.Close(1);
}

TEST(DirectoryInformation, CanBeShared) {
    CZipStorage storage(CZipEnvironment::System());
    CZipCallbacks callbacks;
    CZipStringSettings settings;
    CZipCentralDir first;
    CZipCentralDir second;
    first.Init(storage, callbacks, settings);
    second.Init(storage, callbacks, settings);
    EXPECT_EQ(first.GetShareCount(), 1);
    second.Share(first);
    EXPECT_EQ(first.GetShareCount(), 2);
    first.GetInfo().totalEntries = 7;
    EXPECT_EQ(second.GetInfo().totalEntries, 7);
    second.Close();
    EXPECT_EQ(first.GetShareCount(), 1);
    EXPECT_EQ(first.GetInfo().totalEntries, 7);
}

class Finding : public DirectoryWriting {
protected:
    void SetUp() override {
        archive.Open(file, CZipStorage::create);
        for (const char* name : {"delta", "Alpha", "dir\\beta", "GAMMA", "alpha"}) Add(name, "");
    }
};

TEST_F(Finding, YieldsTheIndexOr65535) {
    CZipCentralDir& directory = archive.GetCentralDir();
    EXPECT_EQ(directory.FindEntry("delta", true), 0);
    EXPECT_EQ(directory.FindEntry("dir\\beta", true), 2);
    EXPECT_EQ(directory.FindEntry("alpha", true), 4);
    EXPECT_EQ(directory.FindEntry("gamma", true), 65535);
    EXPECT_EQ(directory.FindEntry("", true), 65535);
    EXPECT_EQ(directory.FindEntry("zzz", true), 65535);
}

TEST_F(Finding, WithoutRegardToCaseTakesTheFirst) {
    CZipCentralDir& directory = archive.GetCentralDir();
    EXPECT_EQ(directory.FindEntry("ALPHA", false), 1);
    EXPECT_EQ(directory.FindEntry("gamma", false), 3);
    EXPECT_EQ(directory.FindEntry("DIR\\Beta", false), 2);
    EXPECT_EQ(directory.GetInfo().compare, &ZipArchiveLib::CompareNamesWithoutCase);
}

TEST_F(Finding, ThroughTheArchiveUsesItsCase) {
    EXPECT_FALSE(archive.GetCaseSensitive());
    EXPECT_EQ(archive.FindEntry("GAMMA"), 3);
    EXPECT_EQ(archive.FindEntry("gamma"), 3);
    archive.SetCaseSensitive(true);
    EXPECT_EQ(archive.FindEntry("gamma"), 65535);
    EXPECT_EQ(archive.GetCompare(), &ZipArchiveLib::CompareNames);
    archive.Close(1);
    EXPECT_EQ(archive.FindEntry("GAMMA"), 65535);
}

TEST_F(Finding, TheArrayIsBuiltOnDemandAndKeptInOrderByInsertion) {
    CZipCentralDir& directory = archive.GetCentralDir();
    EXPECT_EQ(directory.GetFindCount(), 0U);
    EXPECT_FALSE(directory.GetInfo().findFastEnabled);
    directory.EnableFindFast(true, true);
    EXPECT_EQ(directory.GetFindCount(), 5U);
    Add("before", "");
    Add("zulu", "");
    EXPECT_EQ(directory.GetFindCount(), 7U);
    EXPECT_EQ(directory.FindEntry("before", true), 5);
    EXPECT_EQ(directory.FindEntry("zulu", true), 6);
    EXPECT_EQ(directory.FindEntry("delta", true), 0);
    directory.EnableFindFast(false, true);
    EXPECT_EQ(directory.GetFindCount(), 0U);
}

TEST_F(Finding, RemovalRewritesTheIndexesAboveWhenAskedTo) {
    CZipCentralDir& directory = archive.GetCentralDir();
    directory.EnableFindFast(true, true);
    const auto indexes = [&] {
        std::vector<int> all;
        for (std::size_t i = 0; i < directory.GetFindCount(); ++i)
            all.push_back(directory.GetFindRecord(i).index);
        return all;
    };
    // By their names: Alpha, GAMMA, alpha, delta, dir\beta.
    EXPECT_EQ(indexes(), (std::vector<int>{1, 3, 4, 0, 2}));
    EXPECT_EQ(directory.GetFindRecord(0).header, &directory.GetHeader(1));
    directory.RemoveFromFindArray(1, false);
    EXPECT_EQ(indexes(), (std::vector<int>{3, 4, 0, 2}));
    directory.RemoveFromFindArray(3, true);
    EXPECT_EQ(indexes(), (std::vector<int>{3, 0, 2}));
    directory.EnableFindFast(true, true);
    directory.RemoveLastEntry();
    EXPECT_EQ(directory.GetFindCount(), 4U);
    EXPECT_EQ(directory.FindEntry("alpha", true), 65535);
    EXPECT_EQ(directory.FindEntry("GAMMA", true), 3);
}

TEST_F(Finding, TheArrayIsBuiltOnReadingWhereItIsEnabled) {
    archive.Close();
    for (const bool enabled : {false, true}) {
        CZipStorage storage(CZipEnvironment::System());
        CZipCallbacks callbacks;
        CZipStringSettings settings;
        CZipCentralDir directory;
        storage.Open(file, CZipStorage::openReadOnly);
        directory.Init(storage, callbacks, settings);
        directory.GetInfo().findFastEnabled = enabled;
        directory.Read(false);
        EXPECT_EQ(directory.GetFindCount(), enabled ? 5U : 0U);
        EXPECT_EQ(directory.FindEntry("DIR\\beta", false), 2);
        storage.Close(true);
    }
}

TEST(NameComparison, WithoutCaseFoldsAsciiLettersAlone) {
    EXPECT_EQ(ZipArchiveLib::CompareNamesWithoutCase("ABZ[", "abz["), 0);
    EXPECT_NE(ZipArchiveLib::CompareNamesWithoutCase("\xC3\x84", "\xC3\xA4"), 0);
    EXPECT_LT(ZipArchiveLib::CompareNames("A", "a"), 0);
    EXPECT_LT(ZipArchiveLib::CompareNames("a", "b"), 0);
}

}  // namespace
