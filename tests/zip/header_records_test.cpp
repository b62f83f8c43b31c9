// The extra records that the engine reads and writes itself: names and code pages, and AES.

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::ExtraRecord;
using zip_test::Number16;
using zip_test::Number32;
using zip_test::RawArchive;
using zip_test::RawEntry;

constexpr std::uint16_t k_names = 0x5A4C;
constexpr std::uint16_t k_aes = 0x9901;

struct Opened {
    Bytes bytes;
    std::unique_ptr<CZipMemFile> file;
    CZipArchive archive;
    int code = 0;

    explicit Opened(const RawEntry& entry, const CZipStringSettings& settings = {})
        : bytes(RawArchive::Of({entry}).Build()),
          file(std::make_unique<CZipMemFile>(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0)) {
        archive.SetStringSettings(settings);
        code = CodeOf([&] { archive.Open(*file, CZipStorage::openReadOnly); });
    }
    CZipFileHeader& Header() { return *archive.GetEntryHeader(0); }
};

RawEntry WithNames(const Bytes& data) {
    RawEntry entry = RawEntry::Stored("\x81", "");
    entry.centralExtra = ExtraRecord(k_names, data);
    return entry;
}

TEST(NamesRecord, IsNotNeededForTheSystemsOwnCodePage) {
    Opened opened(RawEntry::Stored("\x81", ""));
    EXPECT_EQ(opened.Header().GetNameCodePage(), 1U);
    EXPECT_EQ(opened.Header().GetFileName(), "\xC3\xBC");
}

TEST(NamesRecord, OtherSystemsHaveAnsiNames) {
    RawEntry entry = RawEntry::Stored("\xC3\xBC", "");
    entry.madeBy = 0x0314;
    Opened opened(entry);
    EXPECT_EQ(opened.Header().GetNameCodePage(), 0U);
    EXPECT_EQ(opened.Header().GetFileName(), "\xC3\xBC");
}

TEST(NamesRecord, ACodePageOfTheSettingsHoldsForAllSystems) {
    CZipStringSettings settings;
    settings.nameCodePage = 437;
    settings.commentCodePage = 1;
    RawEntry entry = RawEntry::Stored("\x81", "");
    entry.madeBy = 0x0314;
    entry.comment = "\x81";
    Opened opened(entry, settings);
    EXPECT_EQ(opened.Header().GetNameCodePage(), 437U);
    EXPECT_EQ(opened.Header().GetFileName(), "\xC3\xBC");
    EXPECT_EQ(opened.Header().GetComment(), "\xC3\xBC");
}

TEST(NamesRecord, GivesACodePage) {
    Opened opened(WithNames(Bytes("\1\1", 2) + Number32(0)));
    EXPECT_EQ(opened.Header().GetNameCodePage(), 0U);
    EXPECT_EQ(opened.Header().GetFileName(), "\x81");
    EXPECT_FALSE(opened.Header().IsNameInExtra());
}

TEST(NamesRecord, GivesTheTrueNameInItsCodePage) {
    Opened opened(WithNames(Bytes("\1\3", 2) + Number32(65001) + "d/\xE4\xB8\xAD"));
    EXPECT_EQ(opened.Header().GetFileName(), "d\\\xE4\xB8\xAD");
    EXPECT_TRUE(opened.Header().IsNameInExtra());
}

TEST(NamesRecord, GivesACommentCodePageBehindTheName) {
    RawEntry entry = WithNames(Bytes("\1\7", 2) + Number32(0) + "name" + Number32(1));
    entry.comment = "\x81";
    Opened opened(entry);
    EXPECT_EQ(opened.Header().GetFileName(), "name");
    EXPECT_EQ(opened.Header().GetCommentCodePage(), 1U);
    EXPECT_EQ(opened.Header().GetComment(), "\xC3\xBC");
}

TEST(NamesRecord, ANameWithoutACodePageIsNotRead) {
    Opened opened(WithNames(Bytes("\1\2", 2) + "name"));
    EXPECT_EQ(opened.Header().GetFileName(), "\xC3\xBC");
}

TEST(NamesRecord, OfALaterVersionIsIgnored) {
    Opened opened(WithNames(Bytes("\2\3", 2) + Number32(0) + "name"));
    EXPECT_EQ(opened.code, 0);
    EXPECT_EQ(opened.Header().GetFileName(), "\xC3\xBC");
}

TEST(NamesRecord, OfVersion0IsRead) {
    Opened opened(WithNames(Bytes("\0\3", 2) + Number32(0) + "name"));
    EXPECT_EQ(opened.Header().GetFileName(), "name");
}

struct BadRecord {
    const char* why;
    Bytes data;
};
void PrintTo(const BadRecord& c, std::ostream* os) { *os << c.why; }

class BadNamesRecord : public testing::TestWithParam<BadRecord> {};
TEST_P(BadNamesRecord, FailsTheCentralRecord) { EXPECT_EQ(Opened(WithNames(GetParam().data)).code, 101); }
INSTANTIATE_TEST_SUITE_P(Records, BadNamesRecord,
                         testing::Values(BadRecord{"no bytes", ""}, BadRecord{"no flags", "\1"},
                                         BadRecord{"too few bytes for a name code page", "\1\1abc"},
                                         BadRecord{"too few bytes for a comment code page", "\1\4abc"},
                                         BadRecord{"room for one code page of two",
                                                   Bytes("\1\5", 2) + Number32(0) + "abc"}));

struct WrittenNames {
    const char* why;
    std::uint8_t system;
    bool nameInExtra;
    std::uint32_t nameCodePage;
    std::uint32_t commentCodePage;
    const char* name;
    Bytes record;
};
void PrintTo(const WrittenNames& c, std::ostream* os) { *os << c.why; }

class WrittenNamesRecord : public testing::TestWithParam<WrittenNames> {};
TEST_P(WrittenNamesRecord, Is) {
    CZipFileHeader header;
    header.SetSystem(GetParam().system);
    header.SetFileName(GetParam().name);
    CZipStringSettings settings;
    settings.storeNameInExtraData = GetParam().nameInExtra;
    settings.nameCodePage = GetParam().nameCodePage;
    settings.commentCodePage = GetParam().commentCodePage;
    header.SetStrings(settings);
    CZipMemFile file;
    CZipStorage storage(CZipEnvironment::System());
    storage.Open(file, CZipStorage::create);
    header.WriteCentral(storage);
    storage.Flush();
    const Bytes bytes(reinterpret_cast<const char*>(file.GetData()), file.GetLength());
    const auto nameSize = static_cast<std::uint8_t>(bytes[28]);
    const Bytes expected = GetParam().record.empty() ? "" : ExtraRecord(k_names, GetParam().record);
    EXPECT_EQ(bytes.substr(46U + nameSize), expected);
    EXPECT_EQ(header.GetCentralExtra().GetCount(), 0U) << "the record is dropped again";
}
INSTANTIATE_TEST_SUITE_P(
    Records, WrittenNamesRecord,
    testing::Values(
        WrittenNames{"not for the default of DOS", 0, false, 1, 0, "n", ""},
        WrittenNames{"not for the default of others", 3, false, 0, 0, "n", ""},
        WrittenNames{"for another code page", 0, false, 0, 0, "n", Bytes("\1\1", 2) + Number32(0)},
        WrittenNames{"for DOS's code page on another system", 3, false, 1, 0, "n",
                     Bytes("\1\1", 2) + Number32(1)},
        WrittenNames{"for a comment code page", 0, false, 1, 437, "n", Bytes("\1\4", 2) + Number32(437)},
        WrittenNames{"for both code pages", 0, false, 0, 437, "n",
                     Bytes("\1\5", 2) + Number32(0) + Number32(437)},
        WrittenNames{"with a name", 0, true, 0, 0, "\xE4\xB8\xAD",
                     Bytes("\1\3", 2) + Number32(0) + "\xE4\xB8\xAD"},
        WrittenNames{"with a name and a comment code page", 0, true, 1, 1, "\xC3\xBC",
                     Bytes("\1\7", 2) + Number32(1) + "\x81" + Number32(1)},
        WrittenNames{"an empty name drops its flag", 0, true, 1, 0, "", ""}));

TEST(NamesRecord, ATrueNameLeavesOnlyWhatOthersCanReadInTheRecord) {
    CZipFileHeader header;
    header.SetFileName("\xE4\xB8\xAD");
    CZipStringSettings settings;
    settings.storeNameInExtraData = true;
    settings.nameCodePage = 0;
    header.SetStrings(settings);
    CZipMemFile file;
    CZipStorage storage(CZipEnvironment::System());
    storage.Open(file, CZipStorage::create);
    header.WriteLocal(storage);
    storage.Flush();
    EXPECT_EQ(Bytes(reinterpret_cast<const char*>(file.GetData()) + 30, file.GetLength() - 30), "?");
    EXPECT_EQ(header.GetFileName(), "\xE4\xB8\xAD");
}

TEST(NamesRecord, SurvivesTheRewritingOfADirectory) {
    const RawEntry entry = WithNames(Bytes("\1\3", 2) + Number32(0) + "d/\xE4\xB8\xAD");
    Bytes bytes = RawArchive::Of({entry}).Build();
    CZipMemFile file;
    file.Write(bytes.data(), static_cast<std::uint32_t>(bytes.size()));
    CZipArchive archive;
    archive.Open(file, CZipStorage::openExisting);
    archive.OpenNewEntry(CZipFileHeader(), 0);
    archive.CloseNewEntry();
    archive.Close();
    archive.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetFileName(), "d\\\xE4\xB8\xAD");
}

Bytes AesData(std::uint32_t version, std::uint32_t vendor, char strength, std::uint32_t method) {
    return Number16(version) + Number16(vendor) + Bytes(1, strength) + Number16(method);
}

RawEntry WithAes(const Bytes& central, const Bytes& local, std::uint16_t flags = 1) {
    RawEntry entry;
    entry.method = 99;
    entry.flags = flags;
    entry.data = Bytes(40, 'x');
    entry.uncompressed = 12;
    entry.centralExtra = ExtraRecord(k_aes, central);
    entry.localExtra = ExtraRecord(k_aes, local);
    return entry;
}

TEST(AesRecord, GivesMethodStrengthAndVersionAndIsRemoved) {
    const Bytes data = AesData(2, 0x4541, 3, 8);
    Opened opened(WithAes(data, data));
    EXPECT_EQ(opened.Header().GetEncryptionMethod(), 3);
    EXPECT_EQ(opened.Header().GetMethod(), 8);
    EXPECT_TRUE(opened.Header().IsAesVersion2());
    EXPECT_TRUE(opened.Header().IsAes());
    EXPECT_EQ(opened.Header().GetCentralExtra().GetCount(), 0U);
    // The local header is in order: it is the password that is missing.
    EXPECT_EQ(CodeOf([&] { opened.archive.OpenEntry(0); }), 112);
    EXPECT_EQ(opened.Header().GetLocalExtra().GetCount(), 0U);
}

TEST(AesRecord, MayBeLongerThanItNeedsToBe) {
    const Bytes data = AesData(1, 0x4541, 1, 0) + "more";
    Opened opened(WithAes(data, data));
    EXPECT_EQ(opened.Header().GetEncryptionMethod(), 1);
    EXPECT_FALSE(opened.Header().IsAesVersion2());
}

class BadAesRecord : public testing::TestWithParam<BadRecord> {};

TEST_P(BadAesRecord, IsIgnoredInTheCentralRecord) {
    Opened opened(WithAes(GetParam().data, GetParam().data));
    ASSERT_EQ(opened.code, 0);
    EXPECT_EQ(opened.Header().GetMethod(), 99);
    EXPECT_EQ(opened.Header().GetEncryptionMethod(), 0);
    EXPECT_EQ(opened.Header().GetCentralExtra().GetCount(), 1U);
}

TEST_P(BadAesRecord, FailsTheLocalHeader) {
    Opened opened(WithAes(AesData(1, 0x4541, 1, 8), GetParam().data));
    EXPECT_EQ(CodeOf([&] { opened.archive.OpenEntry(0); }), 101);
}

INSTANTIATE_TEST_SUITE_P(Records, BadAesRecord,
                         testing::Values(BadRecord{"six bytes", AesData(1, 0x4541, 1, 8).substr(0, 6)},
                                         BadRecord{"version 0", AesData(0, 0x4541, 1, 8)},
                                         BadRecord{"version 3", AesData(3, 0x4541, 1, 8)},
                                         BadRecord{"another vendor", AesData(1, 0x4542, 1, 8)},
                                         BadRecord{"strength 0", AesData(1, 0x4541, 0, 8)},
                                         BadRecord{"strength 4", AesData(1, 0x4541, 4, 8)}));

TEST(AesRecord, WithoutEncryptionIsNotRead) {
    const Bytes data = AesData(1, 0x4541, 1, 8);
    Opened opened(WithAes(data, data, 0));
    EXPECT_EQ(opened.Header().GetMethod(), 99);
    EXPECT_EQ(opened.Header().GetEncryptionMethod(), 255);
    EXPECT_FALSE(opened.archive.OpenEntry(0)) << "a method that is not supported";
}

TEST(AesRecord, LocalAndCentralMustAgree) {
    const Bytes data = AesData(1, 0x4541, 1, 8);
    for (const Bytes& other :
         {AesData(2, 0x4541, 1, 8), AesData(1, 0x4541, 2, 8), AesData(1, 0x4541, 1, 12)}) {
        Opened opened(WithAes(data, other));
        EXPECT_EQ(CodeOf([&] { opened.archive.OpenEntry(0); }), 101);
    }
    RawEntry none = WithAes(data, data);
    none.localExtra.clear();
    Opened opened(none);
    EXPECT_EQ(CodeOf([&] { opened.archive.OpenEntry(0); }), 101);
}

TEST(AesRecord, InTheLocalHeaderAloneFails) {
    RawEntry entry = WithAes(AesData(1, 0x4541, 1, 8), AesData(1, 0x4541, 1, 8));
    entry.centralExtra.clear();
    Opened opened(entry);
    EXPECT_EQ(CodeOf([&] { opened.archive.OpenEntry(0); }), 101);
}

}  // namespace
