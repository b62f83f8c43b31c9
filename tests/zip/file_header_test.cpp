#include "zip/file_header.h"

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/mem_file.h"
#include "zip/storage.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::Number16;
using zip_test::Number32;
using zip_test::World;

std::uint32_t NumberAt(const Bytes& bytes, std::size_t at, unsigned width) {
    std::uint32_t value = 0;
    for (unsigned i = width; i-- > 0;) value = (value << 8) | static_cast<std::uint8_t>(bytes.at(at + i));
    return value;
}

class FileHeader : public testing::Test {
protected:
    World world;
    CZipMemFile file;
    CZipStorage storage{world.environment};
    CZipFileHeader header;

    void SetUp() override { storage.Open(file, CZipStorage::create); }
    Bytes Written() {
        storage.Flush();
        return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
    }
};

TEST_F(FileHeader, ANewOneHasTheseFields) {
    EXPECT_EQ(header.GetFlags(), 0);
    EXPECT_EQ(header.GetMethod(), 8);
    EXPECT_EQ(header.GetEncryptionMethod(), 255);
    EXPECT_FALSE(header.IsEncrypted());
    EXPECT_EQ(header.GetNameCodePage(), 1U);
    EXPECT_EQ(header.GetCommentCodePage(), 0U);
    EXPECT_EQ(header.GetFileName(), "");
    EXPECT_FALSE(header.IsNameInExtra());
    EXPECT_FALSE(header.IsAesVersion2());
}

struct Preparation {
    const char* why;
    int level;
    std::uint16_t method;
    std::uint8_t encryption;
    bool segmented;
    std::uint32_t attributes;
    std::uint16_t flags;
    std::uint16_t needed;
};
void PrintTo(const Preparation& c, std::ostream* os) { *os << c.why; }

class PreparedHeader : public testing::TestWithParam<Preparation> {};
TEST_P(PreparedHeader, HasTheseFlagsAndThisVersion) {
    CZipFileHeader header;
    header.SetMethod(GetParam().method);
    header.SetEncryptionMethod(GetParam().encryption);
    header.SetAttributes(GetParam().attributes);
    header.SetCrc(1);
    header.SetCompressedSize(2);
    header.SetUncompressedSize(3);
    header.Prepare(GetParam().level, GetParam().segmented);
    EXPECT_EQ(header.GetFlags(), GetParam().flags);
    EXPECT_EQ(header.GetVersionNeeded(), GetParam().needed);
    EXPECT_EQ(header.GetMadeByVersion(), 46);
    EXPECT_EQ(header.GetInternalAttributes(), 0);
    EXPECT_EQ(header.GetCrc(), 0U);
    EXPECT_EQ(header.GetCompressedSize(), 0U);
    EXPECT_EQ(header.GetUncompressedSize(), 0U);
}

INSTANTIATE_TEST_SUITE_P(
    Flags, PreparedHeader,
    testing::Values(Preparation{"the default level", -1, 8, 255, false, 0x20, 0, 20},
                    Preparation{"level 0", 0, 8, 255, false, 0x20, 0, 20},
                    Preparation{"level 1", 1, 8, 255, false, 0x20, 6, 20},
                    Preparation{"level 2", 2, 8, 255, false, 0x20, 4, 20},
                    Preparation{"level 3", 3, 8, 255, false, 0x20, 0, 20},
                    Preparation{"level 7", 7, 8, 255, false, 0x20, 0, 20},
                    Preparation{"level 8", 8, 8, 255, false, 0x20, 2, 20},
                    Preparation{"level 9", 9, 8, 255, false, 0x20, 2, 20},
                    Preparation{"levels are deflate's alone", 9, 12, 255, false, 0x20, 0, 46},
                    Preparation{"stored", 0, 0, 255, false, 0x20, 0, 20},
                    Preparation{"a folder", 0, 0, 255, false, 0x10, 0, 10},
                    Preparation{"segmented", -1, 8, 255, true, 0x20, 8, 20},
                    Preparation{"traditional encryption", -1, 8, 0, false, 0x20, 9, 20},
                    Preparation{"AES", -1, 8, 3, false, 0x20, 1, 20},
                    Preparation{"AES, segmented, level 1", 1, 8, 1, true, 0x20, 15, 20}));

TEST_F(FileHeader, LocalHeaderHasThePublishedLayout) {
    header.SetFileName("dir\\a.txt");
    header.SetTime(1700000000);
    header.GetLocalExtra().Add(0x1234, 2);
    header.Prepare(-1, false);
    storage.Write("123", 3, false);
    header.WriteLocal(storage);
    EXPECT_EQ(Written(), Bytes("123PK\3\4") + Number16(20) + Number16(0) + Number16(8) +
                             Number16(header.GetModificationTime()) + Number16(header.GetModificationDate()) +
                             Number32(0) + Number32(0) + Number32(0) + Number16(9) + Number16(6) +
                             "dir/a.txt" + zip_test::ExtraRecord(0x1234, Bytes(2, '\0')));
    EXPECT_EQ(header.GetOffset(), 3U);
    EXPECT_EQ(header.GetDiskStart(), 0);
    EXPECT_EQ(header.GetLocalFileNameSize(), 9);
}

struct PresetSizes {
    const char* why;
    std::uint8_t encryption;
    bool segmented;
    std::uint32_t compressed;
    std::uint32_t uncompressed;
};
void PrintTo(const PresetSizes& c, std::ostream* os) { *os << c.why; }

class LocalSizes : public testing::TestWithParam<PresetSizes> {};
TEST_P(LocalSizes, AreThosePresetWithTheEncryptionHeaderOrNone) {
    const World world;
    CZipMemFile file;
    CZipStorage storage(world.environment);
    storage.Open(file, CZipStorage::create);
    CZipFileHeader header;
    header.SetEncryptionMethod(GetParam().encryption);
    header.SetCompressedSize(100);
    header.SetUncompressedSize(200);
    header.Prepare(-1, GetParam().segmented);
    header.WriteLocal(storage);
    storage.Flush();
    const Bytes bytes(reinterpret_cast<const char*>(file.GetData()), file.GetLength());
    EXPECT_EQ(NumberAt(bytes, 18, 4), GetParam().compressed);
    EXPECT_EQ(NumberAt(bytes, 22, 4), GetParam().uncompressed);
}
INSTANTIATE_TEST_SUITE_P(
    Presets, LocalSizes,
    testing::Values(PresetSizes{"plain", 255, false, 100, 200}, PresetSizes{"AES-128", 1, false, 110, 200},
                    PresetSizes{"AES-192", 2, false, 114, 200}, PresetSizes{"AES-256", 3, false, 118, 200},
                    PresetSizes{"traditional has a descriptor", 0, false, 0, 0},
                    PresetSizes{"segmented has a descriptor", 255, true, 0, 0},
                    PresetSizes{"AES with a descriptor keeps the known size", 3, true, 0, 200}));

TEST_F(FileHeader, UpdatingWritesCrcAndSizesIntoTheLocalHeaderAndReturns) {
    storage.Write("123", 3, false);
    header.SetFileName("a");
    header.Prepare(-1, false);
    header.WriteLocal(storage);
    storage.Write("data", 4, false);
    header.SetCrc(0x11223344);
    header.SetCompressedSize(4);
    header.SetUncompressedSize(7);
    header.UpdateLocal(storage);
    storage.Write("more", 4, false);
    const Bytes bytes = Written();
    EXPECT_EQ(NumberAt(bytes, 3 + 14, 4), 0x11223344U);
    EXPECT_EQ(NumberAt(bytes, 3 + 18, 4), 4U);
    EXPECT_EQ(NumberAt(bytes, 3 + 22, 4), 7U);
    EXPECT_EQ(bytes.substr(34), "datamore");
}

TEST_F(FileHeader, DescriptorOfAnEncipheredEntryIsSigned) {
    header.SetEncryptionMethod(CZipEncryption::traditional);
    header.Prepare(-1, false);
    header.SetCrc(1);
    header.SetCompressedSize(2);
    header.SetUncompressedSize(3);
    header.WriteDescriptor(storage);
    EXPECT_EQ(Written(), "PK\7\x8" + Number32(1) + Number32(2) + Number32(3));
}

TEST_F(FileHeader, DescriptorOfAPlainEntryIsNotSigned) {
    header.SetFlags(8);
    header.SetCrc(1);
    header.SetCompressedSize(2);
    header.SetUncompressedSize(3);
    header.WriteDescriptor(storage);
    EXPECT_EQ(Written(), Number32(1) + Number32(2) + Number32(3));
}

TEST_F(FileHeader, DescriptorOfAnEntryWithoutStoredCrcHasZero) {
    header.SetEncryptionMethod(CZipEncryption::aes256);
    header.Prepare(-1, true);
    EXPECT_TRUE(header.IsAesVersion2());
    header.SetCrc(1);
    header.WriteDescriptor(storage);
    EXPECT_EQ(Written(), "PK\7\x8" + Bytes(12, '\0'));
}

TEST_F(FileHeader, CentralRecordHasThePublishedLayout) {
    header.SetFileName("dir\\a.txt");
    header.SetTime(1700000000);
    header.SetAttributes(0x20);
    header.SetComment("note");
    header.GetCentralExtra().Add(0x1234, 1);
    header.Prepare(9, false);
    header.SetCrc(0x11223344);
    header.SetCompressedSize(5);
    header.SetUncompressedSize(6);
    header.SetPlace(0, 77);
    header.WriteCentral(storage);
    EXPECT_EQ(Written(), "PK\1\2" + Number16(46) + Number16(20) + Number16(2) + Number16(8) +
                             Number16(header.GetModificationTime()) + Number16(header.GetModificationDate()) +
                             Number32(0x11223344) + Number32(5) + Number32(6) + Number16(9) + Number16(5) +
                             Number16(4) + Number16(0) + Number16(0) + Number32(0x81B40020) + Number32(77) +
                             "dir/a.txt" + zip_test::ExtraRecord(0x1234, Bytes(1, '\0')) + "note");
    EXPECT_EQ(header.GetCentralRecordSize(storage), file.GetLength());
}

TEST_F(FileHeader, DecodingFreesTheStoredNameAndWritingTheDecodedOne) {
    header.SetFileName("a");
    header.Prepare(-1, false);
    header.WriteLocal(storage);
    EXPECT_EQ(header.GetStoredName().GetSize(), 1U);
    EXPECT_EQ(header.GetFileName(), "a");
    EXPECT_EQ(header.GetStoredName().GetSize(), 0U);
}

TEST_F(FileHeader, NamesAreWrittenInTheirCodePageWithSlashes) {
    header.SetFileName("d\\\xC3\xBC");
    header.Prepare(-1, false);
    header.WriteLocal(storage);
    EXPECT_EQ(Written().substr(30), "d/\x81");
    EXPECT_EQ(header.GetFileName(), "d\\\xC3\xBC");
}

struct TooLong {
    const char* why;
    std::uint32_t name;
    std::uint32_t comment;
    std::uint32_t extra;
    int code;
};
void PrintTo(const TooLong& c, std::ostream* os) { *os << c.why; }

class FieldLength : public testing::TestWithParam<TooLong> {};
TEST_P(FieldLength, IsRefusedFrom65536On) {
    const World world;
    CZipMemFile file(65536);
    CZipStorage storage(world.environment);
    storage.Open(file, CZipStorage::create);
    CZipFileHeader header;
    header.SetFileName(std::string(GetParam().name, 'n'));
    header.SetComment(std::string(GetParam().comment, 'c'));
    if (GetParam().extra != 0) header.GetCentralExtra().Add(1, GetParam().extra - 4);
    EXPECT_EQ(CodeOf([&] { header.WriteCentral(storage); }), GetParam().code);
    if (GetParam().code == 0) {
        storage.Flush();
        EXPECT_EQ(file.GetLength(), 46 + GetParam().name + GetParam().comment + GetParam().extra);
    }
}
INSTANTIATE_TEST_SUITE_P(InCentralRecords, FieldLength,
                         testing::Values(TooLong{"a name of 65535", 65535, 0, 0, 0},
                                         TooLong{"a name of 65536", 65536, 0, 0, 110},
                                         TooLong{"a comment of 65535", 1, 65535, 0, 0},
                                         TooLong{"a comment of 65536", 1, 65536, 0, 110},
                                         TooLong{"an extra field of 65535", 1, 0, 65535, 0},
                                         TooLong{"an extra field of 65536", 1, 0, 65536, 110}));

TEST_F(FileHeader, ALocalNameOrExtraFieldTooLongRaises110) {
    header.SetFileName(std::string(65536, 'n'));
    EXPECT_EQ(CodeOf([&] { header.WriteLocal(storage); }), 110);
    header.SetFileName("a");
    header.GetLocalExtra().Add(1, 65535);
    EXPECT_EQ(CodeOf([&] { header.WriteLocal(storage); }), 110);
}

TEST_F(FileHeader, CommentsAreKeptInTheirCodePage) {
    CZipStringSettings settings;
    settings.commentCodePage = 1;
    header.SetStrings(settings);
    header.SetComment("\xC3\xBC");
    EXPECT_EQ(header.GetStoredComment().GetSize(), 1U);
    EXPECT_EQ(header.GetComment(), "\xC3\xBC");
}

TEST_F(FileHeader, CopiesAreWholeAndApart) {
    header.SetFileName("a");
    header.SetComment("c");
    header.GetLocalExtra().Add(1, 1);
    header.SetCrc(7);
    CZipFileHeader copy(header);
    copy.SetFileName("b");
    copy.GetLocalExtra().Clear();
    EXPECT_EQ(header.GetFileName(), "a");
    EXPECT_EQ(header.GetLocalExtra().GetCount(), 1U);
    EXPECT_EQ(copy.GetCrc(), 7U);
    EXPECT_EQ(copy.GetComment(), "c");
    const CZipFileHeader& same = copy;
    copy = same;
    EXPECT_EQ(copy.GetFileName(), "b");
}

TEST_F(FileHeader, DataSizeIsWithoutWhatEncryptionAdds) {
    header.SetCompressedSize(100);
    EXPECT_EQ(header.GetDataSize(), 100U);
    header.SetEncryptionMethod(CZipEncryption::aes256);
    EXPECT_EQ(header.GetDataSize(), 72U);
    header.SetCompressedSize(27);
    EXPECT_EQ(CodeOf([&] { static_cast<void>(header.GetDataSize()); }), 101);
}

}  // namespace
