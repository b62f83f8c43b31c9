#include "zip/attributes.h"

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/zip_archive.h"

namespace {

using zip_test::CodeOf;
using zip_test::RawArchive;
using zip_test::RawEntry;
using ZipArchiveLib::ConvertAttributes;

struct Conversion {
    const char* why;
    std::uint32_t attributes;
    std::uint8_t from;
    std::uint8_t to;
    std::uint32_t result;
};
void PrintTo(const Conversion& c, std::ostream* os) { *os << c.why; }

class AttributeConversion : public testing::TestWithParam<Conversion> {};
TEST_P(AttributeConversion, Gives) {
    EXPECT_EQ(ConvertAttributes(GetParam().attributes, GetParam().from, GetParam().to), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(
    Table, AttributeConversion,
    testing::Values(Conversion{"an ordinary file to Unix", 0x20, 0, 3, 0x8000 | 0664},
                    Conversion{"a read-only file to Unix", 0x21, 0, 3, 0x8000 | 0444},
                    Conversion{"a hidden file to Unix", 0x22, 0, 3, 0x8000 | 0220},
                    Conversion{"a read-only and hidden file to Unix", 0x23, 0, 3, 0x8000},
                    Conversion{"a folder to Unix", 0x10, 0, 3, 0x4000 | 0111 | 0664},
                    Conversion{"a read-only folder to Unix", 0x11, 0, 3, 0x4000 | 0111 | 0444},
                    Conversion{"a file from Unix", 0x8000 | 0644, 3, 0, 0x20},
                    Conversion{"a program from Unix", 0x8000 | 0755, 3, 0, 0x00},
                    Conversion{"a file without owner write from Unix", 0x8000 | 0444, 3, 0, 0x21},
                    Conversion{"a file without owner read from Unix", 0x8000 | 0200, 3, 0, 0x22},
                    Conversion{"a folder from Unix", 0x4000 | 0755, 3, 0, 0x10},
                    Conversion{"a folder without owner write from Unix", 0x4000 | 0555, 3, 0, 0x11},
                    Conversion{"OS/2 is as DOS", 0x27, 6, 0, 0x27},
                    Conversion{"NTFS is as DOS", 0x27, 10, 0, 0x27}, Conversion{"to OS/2", 0x27, 0, 6, 0x27},
                    Conversion{"to NTFS", 0x27, 0, 10, 0x27},
                    Conversion{"Macintosh knows folders and read-only", 0x37, 7, 0, 0x11},
                    Conversion{"to Macintosh", 0x37, 0, 7, 0x11},
                    Conversion{"Unix to NTFS", 0x4000 | 0755, 3, 10, 0x10},
                    Conversion{"NTFS to Unix", 0x21, 10, 3, 0x8000 | 0444},
                    Conversion{"the same system, known", 0xFFFF, 7, 7, 0xFFFF},
                    Conversion{"the same system, unknown", 0xFFFF, 5, 5, 0xFFFF}));

TEST(AttributeConversion, WithASystemThatIsNotKnownRaises117) {
    for (const int system : {1, 2, 4, 5, 8, 9, 11, 19, 255}) {
        const auto unknown = static_cast<std::uint8_t>(system);
        EXPECT_FALSE(ZipArchiveLib::IsValidSystem(unknown));
        EXPECT_EQ(CodeOf([&] { ConvertAttributes(0, unknown, 0); }), 117) << system;
        EXPECT_EQ(CodeOf([&] { ConvertAttributes(0, 0, unknown); }), 117) << system;
    }
    for (const int system : {0, 3, 6, 7, 10})
        EXPECT_TRUE(ZipArchiveLib::IsValidSystem(static_cast<std::uint8_t>(system)));
}

struct HeaderAttributes {
    const char* why;
    std::uint16_t madeBy;
    const char* name;
    std::uint32_t external;
    std::uint32_t attributes;
};
void PrintTo(const HeaderAttributes& c, std::ostream* os) { *os << c.why; }

class ReadAttributes : public testing::TestWithParam<HeaderAttributes> {};
TEST_P(ReadAttributes, Are) {
    RawEntry entry = RawEntry::Stored(GetParam().name, "");
    entry.madeBy = GetParam().madeBy;
    entry.attributes = GetParam().external;
    zip_test::Bytes bytes = RawArchive::Of({entry}).Build();
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    CZipArchive archive;
    archive.Open(file, CZipStorage::openReadOnly);
    EXPECT_EQ(archive.GetEntryHeader(0)->GetAttributes(), GetParam().attributes);
    EXPECT_EQ(archive.GetEntryHeader(0)->IsDirectory(), (GetParam().attributes & 0x10) != 0);
}

INSTANTIATE_TEST_SUITE_P(
    OfEntries, ReadAttributes,
    testing::Values(HeaderAttributes{"DOS takes the low word", 0x0014, "a", 0x81B40021, 0x21},
                    HeaderAttributes{"Unix takes the high word", 0x0314, "a", 0x81240000, 0x21},
                    HeaderAttributes{"a folder of Unix", 0x0314, "a/", 0x41ED0010, 0x10},
                    HeaderAttributes{"no attributes and a slash", 0x0014, "a/", 0, 0x10},
                    HeaderAttributes{"no attributes and a backslash", 0x0014, "a\\", 0, 0x10},
                    HeaderAttributes{"no Unix attributes and a slash", 0x0314, "a/", 0x20, 0x10},
                    HeaderAttributes{"attributes outdo a slash", 0x0014, "a/", 0x20, 0x20},
                    HeaderAttributes{"no attributes and no slash", 0x0014, "a", 0, 0},
                    HeaderAttributes{"an unknown system with a slash", 0x1314, "a/", 0x01, 0x10},
                    HeaderAttributes{"an unknown system without", 0x1314, "a", 0x10, 0x20},
                    HeaderAttributes{"an unknown system of the table", 0x0514, "a", 0x10, 0x20}));

class SetAttributes : public testing::TestWithParam<HeaderAttributes> {};
TEST_P(SetAttributes, FillsBothWords) {
    CZipFileHeader header;
    header.SetSystem(static_cast<std::uint8_t>(GetParam().madeBy));
    header.SetAttributes(GetParam().attributes);
    EXPECT_EQ(header.GetExternalAttributes(), GetParam().external);
}

INSTANTIATE_TEST_SUITE_P(OnHeaders, SetAttributes,
                         testing::Values(HeaderAttributes{"DOS", 0, "", 0x81B40020, 0x20},
                                         HeaderAttributes{"DOS, a folder", 0, "", 0x41FD0010, 0x10},
                                         HeaderAttributes{"Unix has the high word alone", 3, "", 0x81240000,
                                                          0x21},
                                         HeaderAttributes{"Unix, a folder", 3, "", 0x41FD0010, 0x10},
                                         HeaderAttributes{"Macintosh", 7, "", 0x81240001, 0x21},
                                         HeaderAttributes{"NTFS", 10, "", 0x81240021, 0x21}));

TEST(HeaderAttributes, ForASystemThatIsNotKnownRaise117) {
    CZipFileHeader header;
    header.SetSystem(19);
    EXPECT_EQ(CodeOf([&] { header.SetAttributes(0x20); }), 117);
}

TEST(HeaderAttributes, GoOverToAnotherSystem) {
    CZipFileHeader header;
    header.SetAttributes(0x21);
    header.ConvertToSystem(3);
    EXPECT_EQ(header.GetSystem(), 3);
    EXPECT_EQ(header.GetExternalAttributes(), 0x81240000U);
    EXPECT_EQ(header.GetAttributes(), 0x21U);
    header.ConvertToSystem(3);
    EXPECT_EQ(header.GetExternalAttributes(), 0x81240000U);
}

}  // namespace
