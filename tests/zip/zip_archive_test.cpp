// Opening, reading and closing.

#include "zip/zip_archive.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "raw_archive.h"
#include "zip/attributes.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::RawArchive;
using zip_test::RawEntry;
using zip_test::ScratchFolder;
using zip_test::World;

constexpr char k_password[] = "barn red";

class Archive : public testing::Test {
protected:
    ScratchFolder folder;
    World world;
    CZipArchive archive{world.environment};

    void Open(const RawArchive& raw, int mode = CZipStorage::openReadOnly) {
        archive.Open(folder.Write("a.zip", raw.Build()).c_str(), mode);
    }
    void OpenText(const Bytes& text) { Open(RawArchive::Of({RawEntry::DeflatedEntry("a", text)})); }
    void OpenData(const std::string& name) {
        archive.Open(folder.Write("a.zip", zip_test::ReadData(name)).c_str(), CZipStorage::openReadOnly);
    }
    Bytes Read(std::uint32_t size) {
        Bytes bytes(size, '\0');
        bytes.resize(archive.ReadEntry(bytes.data(), size));
        return bytes;
    }
    // Writes one entry in parts, without a source.
    void Write(const CZipFileHeader& header, const Bytes& data, int level = -1) {
        ASSERT_TRUE(archive.OpenNewEntry(header, level));
        ASSERT_TRUE(archive.WriteNewEntry(data.data(), static_cast<std::uint32_t>(data.size())));
        ASSERT_TRUE(archive.CloseNewEntry());
    }
};

TEST_F(Archive, BeginsWithTheseProperties) {
    EXPECT_TRUE(archive.IsClosed());
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    EXPECT_TRUE(archive.GetRemoveDriveLetter());
    EXPECT_FALSE(archive.GetExhaustiveRead());
    EXPECT_FALSE(archive.GetCaseSensitive());
    EXPECT_EQ(archive.GetCompare(), &ZipArchiveLib::CompareNamesWithoutCase);
    EXPECT_FALSE(archive.GetAutoFlush());
    EXPECT_EQ(archive.GetRootPath(), "");
    EXPECT_EQ(archive.GetTemporaryPath(), "");
    EXPECT_EQ(archive.GetPassword().GetSize(), 0U);
    EXPECT_EQ(archive.GetSystemCompatibility(), 0);
    EXPECT_EQ(archive.GetEncryptionMethod(), 0);
    EXPECT_EQ(archive.GetCompressionMethod(), 8);
    EXPECT_EQ(archive.GetCopyBufferSize(), 65536U);
    EXPECT_FALSE(archive.GetStringSettings().storeNameInExtraData);
    EXPECT_EQ(archive.GetStringSettings().nameCodePage, 1U);
    EXPECT_EQ(archive.GetStringSettings().commentCodePage, 0U);
    EXPECT_EQ(archive.GetCompressorOptions(1), nullptr);
    EXPECT_EQ(archive.GetCompressorOptions(2), nullptr);
    EXPECT_EQ(archive.GetCryptograph(), nullptr);
    EXPECT_EQ(archive.GetCompressor(), nullptr);
}

TEST_F(Archive, OpenOnAnOpenObjectReturnsFalseAndChangesNothing) {
    OpenText("text");
    EXPECT_FALSE(archive.Open("/no/such/file", CZipStorage::openReadOnly));
    CZipMemFile file;
    EXPECT_FALSE(archive.Open(file, CZipStorage::create));
    EXPECT_EQ(archive.GetCount(), 1);
    EXPECT_TRUE(archive.OpenEntry(0));
    EXPECT_FALSE(archive.Open("/no/such/file", CZipStorage::openReadOnly));
    EXPECT_EQ(Read(4), "text");
}

TEST_F(Archive, AMissingFileRaisesItsErrnoAndTheObjectStaysClosed) {
    EXPECT_EQ(CodeOf([&] { archive.Open((folder / "none.zip").c_str(), CZipStorage::openReadOnly); }),
              ENOENT);
    EXPECT_TRUE(archive.IsClosed());
    OpenText("text");
    EXPECT_FALSE(archive.IsClosed());
}

TEST_F(Archive, PathsEndAtTheFirstZeroByte) {
    folder.Write("C", RawArchive::Of({RawEntry::Stored("a", "text")}).Build());
    const zip_test::CurrentFolder current(folder.Path());
    static constexpr char16_t wide[] = u"C:\\data\\a.vrlz";
    archive.Open(reinterpret_cast<const char*>(wide), CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetStorage().GetArchivePath(), "C");
    EXPECT_EQ(archive.GetCount(), 1);
}

TEST_F(Archive, EntriesAreReadInPartsAndInAnyOrder) {
    const Bytes text = zip_test::SampleText(200000);
    Open(RawArchive::Of(
        {RawEntry::DeflatedEntry("a", text), RawEntry::Bzip2Entry("b", text), RawEntry::Stored("c", text)}));
    for (const int number : {2, 0, 1, 0}) {
        const auto index = static_cast<std::uint16_t>(number);
        ASSERT_TRUE(archive.OpenEntry(index));
        EXPECT_EQ(archive.GetState(), CZipArchive::reading);
        Bytes all;
        for (Bytes part = Read(1000); !part.empty(); part = Read(1000)) all += part;
        EXPECT_TRUE(all == text);
        EXPECT_EQ(archive.CloseEntry(), 1);
        EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    }
    archive.Close();
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Archive, OpenEntryIsRefusedWhereTheStateForbidsIt) {
    EXPECT_FALSE(archive.OpenEntry(0)) << "closed";
    OpenText("text");
    EXPECT_FALSE(archive.OpenEntry(1)) << "no such entry";
    EXPECT_FALSE(archive.OpenEntry(65535)) << "no such entry";
    EXPECT_TRUE(archive.OpenEntry(0));
    EXPECT_FALSE(archive.OpenEntry(0)) << "an entry is open";
    EXPECT_EQ(Read(4), "text");
    EXPECT_EQ(archive.CloseEntry(), 1);
    archive.Close();

    archive.Open((folder / "b.zip").c_str(), CZipStorage::create);
    Write(CZipFileHeader(), "text");
    ASSERT_TRUE(archive.OpenNewEntry(CZipFileHeader(), -1));
    EXPECT_FALSE(archive.OpenEntry(0)) << "an entry is being written";
    archive.Close();

    archive.Open((folder / "c.zip").c_str(), CZipStorage::createSegmented, 10000);
    Write(CZipFileHeader(), "text");
    EXPECT_FALSE(archive.OpenEntry(0)) << "volumes are being written";
}

TEST_F(Archive, EntriesOfANewArchiveCanBeReadAtOnce) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    Write(CZipFileHeader(), "first");
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(5), "first");
    EXPECT_EQ(archive.CloseEntry(), 1);
    Write(CZipFileHeader(), "second");
    archive.Close();
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    ASSERT_TRUE(archive.OpenEntry(1));
    EXPECT_EQ(Read(6), "second");
}

TEST_F(Archive, ReadEntryGivesNothingWithoutAnEntryABufferOrASize) {
    char byte = 0;
    EXPECT_EQ(archive.ReadEntry(&byte, 1), 0U);
    OpenText("text");
    EXPECT_EQ(archive.ReadEntry(&byte, 1), 0U);
    archive.OpenEntry(0);
    EXPECT_EQ(archive.ReadEntry(&byte, 0), 0U);
    EXPECT_EQ(archive.ReadEntry(nullptr, 1), 0U);
    EXPECT_EQ(archive.ReadEntry(&byte, 1), 1U);
}

TEST_F(Archive, CloseEntryWithoutAnOpenEntryGives0) {
    EXPECT_EQ(archive.CloseEntry(), 0);
    OpenText("text");
    EXPECT_EQ(archive.CloseEntry(), 0);
}

TEST_F(Archive, AMethodThatIsNotSupportedIsNotOpened) {
    for (const int method : {1, 6, 9, 14, 93, 95, 98, 99}) {
        RawEntry entry = RawEntry::Stored("a", "text");
        entry.method = static_cast<std::uint16_t>(method);
        Open(RawArchive::Of({entry}));
        EXPECT_FALSE(archive.OpenEntry(0)) << method;
        char byte = 0;
        EXPECT_EQ(archive.ReadEntry(&byte, 1), 0U);
        EXPECT_EQ(archive.CloseEntry(), 0);
        archive.Close();
    }
}

TEST_F(Archive, ATruncatedEntryGivesMinus1AndNoException) {
    RawEntry entry = RawEntry::DeflatedEntry("a", "some text");
    entry.uncompressed = 20;
    Open(RawArchive::Of({entry}));
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(20), "some text");
    EXPECT_EQ(Read(11), "");
    EXPECT_EQ(archive.CloseEntry(), -1);
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
}

TEST_F(Archive, AStreamThatEndsEarlyGivesMinus1) {
    const Bytes text = zip_test::SampleText(500);
    RawEntry entry = RawEntry::DeflatedEntry("a", text);
    entry.data.resize(entry.data.size() / 2);
    Open(RawArchive::Of({entry, RawEntry::Stored("b", "\x4B\x4C\x4D")}));
    ASSERT_TRUE(archive.OpenEntry(0));
    const Bytes got = Read(500);
    EXPECT_LT(got.size(), 500U);
    EXPECT_EQ(got, text.substr(0, got.size()));
    EXPECT_EQ(archive.CloseEntry(), -1);
}

TEST_F(Archive, AnEntryLeftInTheMiddleGivesMinus1) {
    OpenText("some text");
    archive.OpenEntry(0);
    Read(4);
    EXPECT_EQ(archive.CloseEntry(), -1);
}

TEST_F(Archive, AnEntryThatIsNotReadGivesMinus1HoweverLongItClaimsToBe) {
    RawEntry entry = RawEntry::Stored("a", "text");
    entry.compressed = entry.uncompressed = 0xF0000000;
    Bytes bytes = RawArchive::Of({entry}).Build();
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    archive.Open(file, CZipStorage::openReadOnly);
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(archive.CloseEntry(), -1);
}

TEST_F(Archive, AnotherCrcRaises102UnlessTheCheckIsOff) {
    RawEntry entry = RawEntry::DeflatedEntry("a", "some text");
    ++entry.crc;
    Open(RawArchive::Of({entry}));
    archive.OpenEntry(0);
    Read(9);
    EXPECT_EQ(CodeOf([&] { archive.CloseEntry(); }), 102);
    archive.Close(1);

    Open(RawArchive::Of({entry}));
    archive.GetCentralDir().SetIgnoredChecks(CZipChecks::crc);
    archive.OpenEntry(0);
    Read(9);
    EXPECT_EQ(archive.CloseEntry(), 1);
}

TEST_F(Archive, ABadStreamRaisesTheLibrarysCode) {
    RawEntry entry = RawEntry::Stored("a", "\x07\xFF\xFF\xFF");
    entry.method = 8;
    Open(RawArchive::Of({entry}));
    archive.OpenEntry(0);
    EXPECT_EQ(CodeOf([&] { Read(4); }), 504);
    EXPECT_EQ(archive.CloseEntry(nullptr, true), 1);
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
}

TEST_F(Archive, TimeAndAttributesGoToTheTarget) {
    RawEntry entry = RawEntry::Stored("a", "text");
    entry.attributes = 0x21;
    Open(RawArchive::Of({entry}));
    const std::string target = folder.Write("target", "text");
    archive.OpenEntry(0);
    Read(4);
    EXPECT_EQ(archive.CloseEntry(target.c_str()), 1);
    EXPECT_EQ(world.names.modification_time(target), archive.GetEntryHeader(0)->GetTime());
    EXPECT_EQ(world.names.attributes(target), 0x21U);
}

TEST_F(Archive, ATargetThatTakesNeitherGivesMinus2) {
    for (const int failing : {0, 1, 2}) {
        OpenText("text");
        const std::string target = failing == 0 ? folder / "none" : folder.Write("target", "text");
        world.names.failTime = failing == 1;
        world.names.failAttributes = failing == 2;
        archive.OpenEntry(0);
        Read(4);
        EXPECT_EQ(archive.CloseEntry(target.c_str()), -2) << failing;
        archive.Close();
    }
}

struct Encipherment {
    const char* file;
    std::uint8_t method;
};
void PrintTo(const Encipherment& c, std::ostream* os) { *os << c.file; }

class EncipheredEntry : public Archive, public testing::WithParamInterface<Encipherment> {};

TEST_P(EncipheredEntry, NeedsItsPassword) {
    OpenData(GetParam().file);
    EXPECT_EQ(CodeOf([&] { archive.OpenEntry(0); }), 112) << "no password";
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    archive.SetPassword("barn ree");
    EXPECT_EQ(CodeOf([&] { archive.OpenEntry(0); }), 112) << "a wrong one";
    archive.SetPassword(k_password);
    EXPECT_TRUE(archive.OpenEntry(0));
    EXPECT_TRUE(archive.GetCryptograph()->CanHandle(GetParam().method));
    EXPECT_EQ(Read(5000), zip_test::ReadData("document.txt"));
    EXPECT_EQ(Read(1), "");
    EXPECT_EQ(archive.CloseEntry(), 1);
    EXPECT_EQ(archive.GetCryptograph(), nullptr);
}

INSTANTIATE_TEST_SUITE_P(Methods, EncipheredEntry,
                         testing::Values(Encipherment{"traditional.zip", 0}, Encipherment{"aes128.zip", 1},
                                         Encipherment{"aes192.zip", 2}, Encipherment{"aes256.zip", 3},
                                         Encipherment{"aes256-bzip2.zip", 3}));

// Damages one byte behind the local header of an archive of one entry and tells what reading it raises.
class DamagedEntry : public Archive {
protected:
    int CodeWithDamage(const std::string& file, const std::string& name, int fromEnd) {
        Bytes bytes = zip_test::ReadData(file);
        const std::size_t data = 30 + name.size() + 11;
        archive.Open(folder.Write("b.zip", bytes).c_str(), CZipStorage::openReadOnly);
        const std::size_t size = archive.GetEntryHeader(0)->GetCompressedSize();
        archive.Close();
        const std::size_t at = data + size - static_cast<std::size_t>(fromEnd);
        bytes[at] = static_cast<char>(bytes[at] ^ 0x10);
        archive.Open(folder.Write("b.zip", bytes).c_str(), CZipStorage::openReadOnly);
        archive.SetPassword(k_password);
        const int code = CodeOf([&] {
            archive.OpenEntry(0);
            while (!Read(100).empty()) continue;
            archive.CloseEntry();
        });
        archive.Close(1);
        return code;
    }
};

TEST_F(DamagedEntry, OfAesVersion2Raises119AfterItsBytesHaveBeenDelivered) {
    // Stored inside, so that no compressor notices.
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    archive.SetPassword(k_password);
    archive.SetEncryptionMethod(CZipEncryption::aes256);
    CZipFileHeader header;
    header.SetUncompressedSize(9);
    Write(header, "some text", 0);
    archive.Close();
    Bytes bytes = folder.Read("a.zip");
    const std::size_t data = 30 + 5 + 11 + 18;
    bytes[data] = static_cast<char>(bytes[data] ^ 1);
    archive.Open(folder.Write("a.zip", bytes).c_str(), CZipStorage::openReadOnly);
    archive.SetPassword(k_password);
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(9), "rome text");
    EXPECT_EQ(CodeOf([&] { archive.CloseEntry(); }), 119);
}

TEST_F(DamagedEntry, OfAesWithAChangedAuthenticationCodeAloneRaises119) {
    for (const int fromEnd : {1, 5, 10}) {
        EXPECT_EQ(CodeWithDamage("aes256.zip", "document.txt", fromEnd), 119);
        EXPECT_EQ(CodeWithDamage("aes256-short.zip", "short.txt", fromEnd), 119);
    }
}

TEST_F(DamagedEntry, OfAesVersion1Raises102WhenTheCrcIsFirst) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    archive.SetPassword(k_password);
    archive.SetEncryptionMethod(CZipEncryption::aes128);
    CZipFileHeader header;
    header.SetUncompressedSize(20);
    Write(header, "twenty bytes of text", 0);
    archive.Close();
    Bytes bytes = folder.Read("a.zip");
    const std::size_t data = 30 + 5 + 11 + 10;
    bytes[data] = static_cast<char>(bytes[data] ^ 1);
    archive.Open(folder.Write("a.zip", bytes).c_str(), CZipStorage::openReadOnly);
    archive.SetPassword(k_password);
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(20), "uwenty bytes of text");
    EXPECT_EQ(CodeOf([&] { archive.CloseEntry(); }), 102);
    EXPECT_EQ(archive.CloseEntry(nullptr, true), 1) << "the flag spares both checks";
}

TEST_F(Archive, AnAesEntryOf19BytesHasNoStoredCrcAndOneOf20Has) {
    for (const std::uint32_t size : {0U, 19U, 20U}) {
        archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
        archive.SetPassword(k_password);
        archive.SetEncryptionMethod(CZipEncryption::aes192);
        CZipFileHeader header;
        header.SetUncompressedSize(size);
        Write(header, Bytes(size, 'x'));
        archive.Close();
        archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
        archive.SetPassword(k_password);
        EXPECT_EQ(archive.GetEntryHeader(0)->GetCrc(), size < 20 ? 0 : zip_test::Crc32(Bytes(size, 'x')));
        EXPECT_EQ(archive.GetEntryHeader(0)->IsAesVersion2(), size < 20);
        ASSERT_TRUE(archive.OpenEntry(0));
        EXPECT_EQ(Read(20).size(), size);
        EXPECT_EQ(archive.CloseEntry(), 1);
        archive.Close();
    }
}

TEST_F(Archive, AnEncipheredEntryTooSmallForItsHeadersRaises101) {
    RawEntry entry = RawEntry::Stored("a", Bytes(12, 'x'));
    entry.flags = 1;
    entry.compressed = 11;
    Open(RawArchive::Of({entry}));
    archive.SetPassword(k_password);
    int code = 0;
    for (int i = 0; i < 5000 && code != 101; ++i) {
        archive.SetPassword(std::to_string(i).c_str());
        code = CodeOf([&] { archive.OpenEntry(0); });
    }
    EXPECT_EQ(code, 101);
    try {
        archive.OpenEntry(0);
        FAIL();
    } catch (const CZipException& exception) {
        EXPECT_EQ(exception.GetPath(), folder / "a.zip");
    }
}

TEST_F(Archive, PasswordsAreTakenAsTheyAreAndClearedByEveryOpen) {
    OpenText("text");
    EXPECT_TRUE(archive.SetPassword("p\xC3\xBC"));
    EXPECT_EQ(archive.GetPassword().GetSize(), 3U);
    archive.OpenEntry(0);
    EXPECT_FALSE(archive.SetPassword("other"));
    EXPECT_FALSE(archive.SetEncryptionMethod(1));
    Read(4);
    archive.CloseEntry();
    EXPECT_EQ(archive.GetPassword().GetSize(), 3U);
    EXPECT_TRUE(archive.SetPassword(nullptr));
    EXPECT_EQ(archive.GetPassword().GetSize(), 0U);
    archive.SetPassword("again");
    archive.Close();
    OpenText("text");
    EXPECT_EQ(archive.GetPassword().GetSize(), 0U);
}

TEST_F(Archive, TheRootPathIsClearedByEveryOpen) {
    archive.SetRootPath("/some/root/");
    EXPECT_EQ(archive.GetRootPath(), "/some/root");
    OpenText("text");
    EXPECT_EQ(archive.GetRootPath(), "");
}

TEST_F(Archive, EncryptionMethodsAreThoseThatThereAre) {
    for (const int method : {0, 1, 2, 3, 255}) {
        EXPECT_TRUE(archive.SetEncryptionMethod(static_cast<std::uint8_t>(method)));
        EXPECT_EQ(archive.GetEncryptionMethod(), method);
    }
    EXPECT_FALSE(archive.SetEncryptionMethod(4));
    EXPECT_EQ(archive.GetEncryptionMethod(), 255);
}

TEST_F(Archive, CompressionMethodsAre8And12) {
    EXPECT_TRUE(archive.SetCompressionMethod(12));
    for (const int method : {0, 1, 9, 99, 65535}) {
        EXPECT_FALSE(archive.SetCompressionMethod(static_cast<std::uint16_t>(method)));
        EXPECT_EQ(archive.GetCompressionMethod(), 12);
    }
    EXPECT_TRUE(archive.SetCompressionMethod(8));
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    archive.OpenNewEntry(CZipFileHeader(), -1);
    EXPECT_FALSE(archive.SetCompressionMethod(12));
    EXPECT_EQ(archive.GetCompressionMethod(), 8);
    archive.Close();
}

TEST_F(Archive, NewEntriesCopyTheSystemOfTheFirstOne) {
    for (const int system : {0, 3, 6, 7, 10, 19, 255}) {
        RawEntry entry = RawEntry::Stored("a", "text");
        entry.madeBy = static_cast<std::uint16_t>((system << 8) | 20);
        Open(RawArchive::Of({entry}), CZipStorage::openExisting);
        const int expected = ZipArchiveLib::IsValidSystem(static_cast<std::uint8_t>(system)) ? system : 0;
        EXPECT_EQ(archive.GetSystemCompatibility(), expected);
        Write(CZipFileHeader(), "more");
        EXPECT_EQ(archive.GetEntryHeader(1)->GetSystem(), expected);
        archive.Close();
    }
    archive.Open((folder / "b.zip").c_str(), CZipStorage::create);
    EXPECT_EQ(archive.GetSystemCompatibility(), 0);
}

TEST_F(Archive, SystemsAreThoseWhoseAttributesAreKnown) {
    EXPECT_TRUE(archive.SetSystemCompatibility(3));
    EXPECT_FALSE(archive.SetSystemCompatibility(4));
    EXPECT_EQ(archive.GetSystemCompatibility(), 3);
}

TEST_F(Archive, CompressorOptionsReachTheCompressors) {
    ZipArchiveLib::CDeflateCompressor::COptions deflate;
    deflate.bufferSize = 100;
    ZipArchiveLib::CBzip2Compressor::COptions bzip2;
    bzip2.bufferSize = 200;
    archive.SetCompressorOptions(deflate);
    archive.SetCompressorOptions(bzip2);
    EXPECT_EQ(archive.GetCompressorOptions(1)->bufferSize, 100U);
    EXPECT_EQ(archive.GetCompressorOptions(2)->bufferSize, 200U);
    Open(RawArchive::Of({RawEntry::DeflatedEntry("a", "text"), RawEntry::Bzip2Entry("b", "text")}));
    archive.OpenEntry(0);
    EXPECT_EQ(archive.GetCompressor()->GetOptions()->bufferSize, 100U);
    EXPECT_EQ(Read(4), "text");
    archive.CloseEntry();
    archive.OpenEntry(1);
    EXPECT_EQ(archive.GetCompressor()->GetOptions()->bufferSize, 200U);
    EXPECT_EQ(Read(4), "text");
}

TEST_F(Archive, ACompressorIsKeptAsLongAsItHandlesTheMethod) {
    Open(RawArchive::Of({RawEntry::DeflatedEntry("a", "text"), RawEntry::Stored("b", "text"),
                         RawEntry::Bzip2Entry("c", "text")}));
    archive.MakeCompressor(8);
    const CZipCompressor* deflate = archive.GetCompressor();
    archive.MakeCompressor(0);
    EXPECT_EQ(archive.GetCompressor(), deflate);
    archive.MakeCompressor(12);
    EXPECT_TRUE(archive.GetCompressor()->SupportsMethod(12));
    archive.MakeCompressor(9);
    EXPECT_EQ(archive.GetCompressor(), nullptr);
}

TEST_F(Archive, ACryptographIsKeptAsLongAsItHandlesTheMethod) {
    archive.MakeCryptograph(1);
    const CZipCryptograph* aes = archive.GetCryptograph();
    ASSERT_NE(aes, nullptr);
    archive.MakeCryptograph(3);
    EXPECT_EQ(archive.GetCryptograph(), aes);
    archive.MakeCryptograph(0);
    EXPECT_TRUE(archive.GetCryptograph()->CanHandle(0));
    archive.MakeCryptograph(7);
    EXPECT_TRUE(archive.GetCryptograph()->CanHandle(0)) << "every other value is traditional";
    archive.MakeCryptograph(255);
    EXPECT_EQ(archive.GetCryptograph(), nullptr);
}

TEST_F(Archive, CloseOnAClosedObjectDoesNothing) {
    EXPECT_NO_THROW(archive.Close());
    EXPECT_NO_THROW(archive.Close(1));
}

TEST_F(Archive, CloseAfterAFailedOpeningLetsGoOfTheFile) {
    EXPECT_EQ(
        CodeOf([&] { archive.Open(folder.Write("a.zip", "no archive").c_str(), CZipStorage::openReadOnly); }),
        101);
    EXPECT_TRUE(archive.IsClosed());
    EXPECT_EQ(world.files.OpenCount(), 1U);
    archive.Close();
    EXPECT_EQ(world.files.OpenCount(), 1U) << "without the flag nothing happens";
    archive.Close(1);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Archive, CloseEndsAnOpenEntry) {
    OpenText("text");
    archive.OpenEntry(0);
    archive.Close();
    EXPECT_EQ(archive.GetState(), CZipArchive::idle);
    archive.Open((folder / "b.zip").c_str(), CZipStorage::create);
    archive.OpenNewEntry(CZipFileHeader(), -1);
    archive.WriteNewEntry("text", 4);
    archive.Close();
    archive.Open((folder / "b.zip").c_str(), CZipStorage::openReadOnly);
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(5), "text");
}

TEST_F(Archive, CloseAfterAnExceptionLeavesNoDirectory) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    Write(CZipFileHeader(), "text");
    archive.OpenNewEntry(CZipFileHeader(), -1);
    archive.Close(1);
    const Bytes left = folder.Read("a.zip");
    EXPECT_EQ(left.substr(0, 4), "PK\3\4");
    EXPECT_EQ(left.find("PK\5\6"), Bytes::npos);
    EXPECT_EQ(CodeOf([&] { archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly); }), 101);
}

TEST_F(Archive, AFlagOtherThan1WritesTheDirectoryAllTheSame) {
    // The storage hears of the exception, too, and drops what waits in its buffer: here the last byte.
    archive.GetStorage().SetBufferSizes(1, 1);
    for (const int flag : {1, 2}) {
        archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
        Write(CZipFileHeader(), "text");
        archive.Close(flag);
        EXPECT_EQ(folder.Read("a.zip").find("PK\1\2") != Bytes::npos, flag == 2);
    }
}

TEST_F(Archive, CloseResetsTheStringSettings) {
    CZipStringSettings settings;
    settings.nameCodePage = 0;
    archive.SetStringSettings(settings);
    OpenText("text");
    EXPECT_EQ(archive.GetStringSettings().nameCodePage, 0U);
    archive.Close();
    EXPECT_EQ(archive.GetStringSettings().nameCodePage, 1U);
}

TEST_F(Archive, CloseGivesTheFileTheTimeOfItsNewestEntry) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    for (const std::int64_t time : {1000000000, 1600000000, 1500000000}) {
        CZipFileHeader header;
        header.SetTime(time);
        Write(header, "text");
    }
    archive.Close(0, true);
    EXPECT_EQ(world.names.modification_time(folder / "a.zip"), 1600000000);
}

TEST_F(Archive, WithoutEntriesTheFileKeepsItsTime) {
    archive.Open((folder / "a.zip").c_str(), CZipStorage::create);
    archive.Close();
    world.names.set_modification_time(folder / "a.zip", 1234567890);
    archive.Open((folder / "a.zip").c_str(), CZipStorage::openReadOnly);
    archive.Close(0, true);
    EXPECT_EQ(world.names.modification_time(folder / "a.zip"), 1234567890);
}

TEST_F(Archive, ADestructorWritesNoDirectory) {
    {
        CZipArchive other(world.environment);
        other.Open((folder / "a.zip").c_str(), CZipStorage::create);
        other.OpenNewEntry(CZipFileHeader(), 0);
        other.WriteNewEntry("text", 4);
        other.CloseNewEntry();
    }
    EXPECT_EQ(folder.Read("a.zip").find("PK\1\2"), Bytes::npos);
    EXPECT_EQ(world.files.OpenCount(), 0U);
}

TEST_F(Archive, GetEntryHeaderGivesNullWhenClosedOrWithoutSuchAnEntry) {
    EXPECT_EQ(archive.GetEntryHeader(0), nullptr);
    OpenText("text");
    EXPECT_NE(archive.GetEntryHeader(0), nullptr);
    EXPECT_EQ(archive.GetEntryHeader(1), nullptr);
    EXPECT_EQ(archive.GetEntryHeader(65535), nullptr);
}

TEST_F(Archive, AnArchiveBehindAnotherFileOpensInMemory) {
    CZipMemFile file;
    archive.Open(file, CZipStorage::create);
    Write(CZipFileHeader(), "text");
    archive.Close();
    archive.Open(file, CZipStorage::openReadOnly);
    ASSERT_TRUE(archive.OpenEntry(0));
    EXPECT_EQ(Read(5), "text");
    EXPECT_EQ(archive.CloseEntry(), 1);
}

// Uses the factories to see what passes.
class CountingArchive : public CZipArchive {
public:
    using CZipArchive::CZipArchive;
    int compressors = 0;
    int cryptographs = 0;
    void MakeCompressor(std::uint16_t method) override {
        ++compressors;
        CZipArchive::MakeCompressor(method);
    }
    void MakeCryptograph(std::uint8_t method) override {
        ++cryptographs;
        CZipArchive::MakeCryptograph(method);
    }
};

TEST_F(Archive, ItsFactoriesCanBeOverridden) {
    CountingArchive counting(world.environment);
    counting.Open(folder.Write("a.zip", zip_test::ReadData("aes128.zip")).c_str(), CZipStorage::openReadOnly);
    counting.SetPassword(k_password);
    ASSERT_TRUE(counting.OpenEntry(0));
    EXPECT_EQ(counting.compressors, 1);
    EXPECT_EQ(counting.cryptographs, 1);
    counting.Close(1);
}

}  // namespace
