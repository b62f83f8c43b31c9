// Archives that were made to do harm, or were damaged. Nothing crashes, hangs or reads outside its buffers,
// and no damage to an entry's data goes unnoticed.

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
using zip_test::ReadData;

constexpr char k_password[] = "barn red";

// An archive on a block of exactly its size.
struct Opened {
    std::vector<char> block;
    CZipMemFile file;
    CZipArchive archive;
    int code;

    explicit Opened(const Bytes& bytes)
        : block(bytes.begin(), bytes.end()),
          file(block.data(), static_cast<std::uint32_t>(block.size()), 0),
          code(CodeOf([&] { archive.Open(file, CZipStorage::openReadOnly); })) {
        if (code == 0)
            archive.SetPassword(k_password);
        else
            archive.Close(1);
    }
    // All of an entry, as a careful reader takes it: the declared size, and one byte more.
    int Read(std::uint16_t index, Bytes& contents) {
        int result = 0;
        const int raised = CodeOf([&] {
            if (!archive.OpenEntry(index)) return;
            std::uint32_t left = archive.GetEntryHeader(index)->GetUncompressedSize();
            std::vector<char> part(4096);
            contents.clear();
            while (left != 0) {
                const std::uint32_t got =
                    archive.ReadEntry(part.data(), std::min(left, static_cast<std::uint32_t>(part.size())));
                if (got == 0) break;
                contents.append(part.data(), got);
                left -= got;
            }
            const std::uint32_t more = archive.ReadEntry(part.data(), 1);
            result = archive.CloseEntry();
            if (more != 0) result = -1;
        });
        if (raised == 0) return result;
        archive.CloseEntry(nullptr, true);
        return raised;
    }
};

TEST(HostileArchive, OverlappingEntriesAreReadEachWithinItsOwnBounds) {
    // The second entry's local header lies in the first one's data.
    const RawEntry inner = RawEntry::Stored("inner", "the inner text");
    const RawEntry outer = RawEntry::Stored("outer", "begin " + inner.Local() + " end");
    const Bytes body = outer.Local();
    const Bytes directory =
        outer.Central(0) + inner.Central(static_cast<std::uint32_t>(body.size() - 4 - inner.Local().size()));
    Opened opened(body + directory + "PK\5\6" + Bytes(4, '\0') + Number16(2) + Number16(2) +
                  Number32(static_cast<std::uint32_t>(directory.size())) +
                  Number32(static_cast<std::uint32_t>(body.size())) + Number16(0));
    ASSERT_EQ(opened.code, 0);
    Bytes contents;
    EXPECT_EQ(opened.Read(0, contents), 1);
    EXPECT_EQ(contents, outer.data);
    EXPECT_EQ(opened.Read(1, contents), 1);
    EXPECT_EQ(contents, "the inner text");
}

TEST(HostileArchive, ManyEntriesOverOneStreamNeedPlacesOfTheirOwn) {
    RawArchive raw = RawArchive::Of({RawEntry::DeflatedEntry("a", Bytes(100000, 'a'))});
    for (int i = 0; i < 100; ++i) {
        raw.entries.push_back(raw.entries[0]);
        raw.entries.back().offset = 0;
    }
    EXPECT_EQ(Opened(raw.Build()).code, 101);
}

struct LyingSize {
    const char* why;
    std::uint32_t compressed;
    std::uint32_t uncompressed;
    bool alsoLocally;
    int result;
};
void PrintTo(const LyingSize& c, std::ostream* os) { *os << c.why; }

class LyingSizes : public testing::TestWithParam<LyingSize> {
protected:
    static int Result(RawEntry entry) {
        const LyingSize& lie = GetParam();
        const std::uint32_t compressed =
            lie.compressed != 0 ? lie.compressed : static_cast<std::uint32_t>(entry.data.size());
        const std::uint32_t uncompressed = lie.uncompressed != 0 ? lie.uncompressed : entry.uncompressed;
        if (!lie.alsoLocally) {
            entry.localCompressed = static_cast<std::uint32_t>(entry.data.size());
            entry.localUncompressed = entry.uncompressed;
        }
        entry.compressed = compressed;
        entry.uncompressed = uncompressed;
        Opened opened(RawArchive::Of({entry}).Build());
        EXPECT_EQ(opened.code, 0);
        Bytes contents;
        return opened.Read(0, contents);
    }
};

TEST_P(LyingSizes, AreFoundOut) {
    EXPECT_EQ(Result(RawEntry::DeflatedEntry("a", zip_test::SampleText(1000))), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(Lies, LyingSizes,
                         testing::Values(LyingSize{"central alone, less", 0, 999, false, 101},
                                         LyingSize{"central alone, more", 0, 1001, false, 101},
                                         LyingSize{"central alone, compressed", 77, 0, false, 101},
                                         LyingSize{"uncompressed one less", 0, 999, true, 101},
                                         LyingSize{"uncompressed one more", 0, 1001, true, -1},
                                         LyingSize{"uncompressed far more", 0, 0xFFFFFFFF, true, -1},
                                         LyingSize{"compressed less", 50, 0, true, -1},
                                         LyingSize{"compressed beyond the file", 5000, 0, true, 101},
                                         LyingSize{"compressed far beyond", 0xFFFFFFFF, 0, true, 101}));

TEST(HostileArchive, ABombOfRatio1000IsReadInPartsWithTheMemoryOfOnePart) {
    const Bytes packed = zip_test::Deflated(Bytes(20000000, '\0'), 9);
    ASSERT_GT(20000000 / packed.size(), 1000U);
    RawEntry entry;
    entry.method = 8;
    entry.data = packed;
    entry.uncompressed = 20000000;
    entry.crc = zip_test::Crc32(Bytes(20000000, '\0'));
    Opened opened(RawArchive::Of({entry}).Build());
    ASSERT_TRUE(opened.archive.OpenEntry(0));
    std::vector<char> part(65536);
    std::uint64_t total = 0;
    while (const std::uint32_t got = opened.archive.ReadEntry(part.data(), 65536)) total += got;
    EXPECT_EQ(total, 20000000U);
    EXPECT_EQ(opened.archive.CloseEntry(), 1);
}

TEST(HostileArchive, ABombThatDeclaresLittleDeliversLittleAndIsRefused) {
    for (const bool bzip2 : {false, true}) {
        RawEntry entry = bzip2 ? RawEntry::Bzip2Entry("a", Bytes(10000000, '\0'))
                               : RawEntry::DeflatedEntry("a", Bytes(10000000, '\0'));
        entry.uncompressed = 100;
        Opened opened(RawArchive::Of({entry}).Build());
        ASSERT_TRUE(opened.archive.OpenEntry(0));
        std::vector<char> part(65536);
        EXPECT_EQ(opened.archive.ReadEntry(part.data(), 65536), 100U);
        EXPECT_EQ(CodeOf([&] { opened.archive.ReadEntry(part.data(), 1); }), 101);
    }
}

TEST(HostileArchive, NamesThatPointUpwardsAreNamesAndNeverFollowed) {
    const zip_test::ScratchFolder folder;
    std::filesystem::create_directory(folder / "inner");
    const std::string target = folder.Write("inner/target", "");
    for (const char* name : {"../escaped", "..\\escaped", "/escaped", "a/../../escaped", "C:/escaped"}) {
        Opened opened(RawArchive::Of({RawEntry::Stored(name, "text")}).Build());
        std::string shown = name;
        std::replace(shown.begin(), shown.end(), '/', '\\');
        EXPECT_EQ(opened.archive.GetEntryHeader(0)->GetFileName(), shown);
        const zip_test::CurrentFolder current(folder / "inner");
        ASSERT_TRUE(opened.archive.OpenEntry(0));
        char buffer[4];
        opened.archive.ReadEntry(buffer, 4);
        EXPECT_EQ(opened.archive.CloseEntry(target.c_str()), 1);
        EXPECT_EQ(folder.Names(), std::vector<std::string>{"inner"});
        EXPECT_EQ(zip_test::ScratchFolder().Names(), std::vector<std::string>{});
    }
}

TEST(HostileArchive, NamesWithZeroBytesKeepThem) {
    const Bytes name("a\0b", 3);
    Opened opened(RawArchive::Of({RawEntry::Stored(name, "text")}).Build());
    EXPECT_EQ(opened.archive.GetEntryHeader(0)->GetFileName(), name);
}

TEST(HostileArchive, TheLongestFieldsAreRead) {
    RawEntry entry = RawEntry::Stored(Bytes(65535, 'n'), "text");
    entry.comment = Bytes(65535, 'c');
    entry.centralExtra = zip_test::ExtraRecord(1, Bytes(65531, 'x'));
    entry.localExtra = zip_test::ExtraRecord(1, Bytes(65531, 'x'));
    Opened opened(RawArchive::Of({entry}).Build());
    Bytes contents;
    EXPECT_EQ(opened.Read(0, contents), 1);
    EXPECT_EQ(contents, "text");
    EXPECT_EQ(opened.archive.GetEntryHeader(0)->GetFileName().size(), 65535U);
}

TEST(HostileArchive, DirectoriesThatPointIntoThemselvesAreRefusedOrBounded) {
    for (std::uint32_t offset = 0; offset < 60; ++offset) {
        RawArchive raw = RawArchive::Of({RawEntry::Stored("a", "text")});
        raw.offset = offset;
        raw.total = 65535;
        raw.entriesHere = 1;
        Opened opened(raw.Build());
        EXPECT_EQ(opened.code, 101) << offset;
    }
}

// A bad password check passes once in 256 times; the data is then what the CRC finds.
struct Victim {
    const char* name;
    Bytes bytes;
    Bytes contents;
};
void PrintTo(const Victim& c, std::ostream* os) { *os << c.name; }

class DamagedArchive : public testing::TestWithParam<Victim> {
protected:
    // Opens and reads everything. Whatever comes of it, what is delivered as sound is what was put in.
    static void ReadAll(const Bytes& bytes, const std::string& where) {
        Opened opened(bytes);
        for (std::uint16_t i = 0; opened.code == 0 && i < opened.archive.GetCount(); ++i) {
            Bytes contents;
            opened.archive.GetEntryHeader(i)->GetTime();
            opened.archive.GetEntryHeader(i)->GetAttributes();
            const bool sound = opened.Read(i, contents) == 1;
            EXPECT_TRUE(!sound || contents == GetParam().contents) << where;
        }
        EXPECT_EQ(CodeOf([&] { opened.archive.Close(); }), 0);
    }
};

TEST_P(DamagedArchive, WholeIsSound) {
    Opened opened(GetParam().bytes);
    Bytes contents;
    EXPECT_EQ(opened.Read(0, contents), 1);
    EXPECT_EQ(contents, GetParam().contents);
}

TEST_P(DamagedArchive, CutAtAnyByteIsRefused) {
    for (std::size_t size = 0; size < GetParam().bytes.size(); ++size)
        EXPECT_EQ(Opened(GetParam().bytes.substr(0, size)).code, 101) << size;
}

TEST_P(DamagedArchive, CutAtItsBeginIsRefusedOrBounded) {
    for (std::size_t at = 1; at < GetParam().bytes.size(); ++at)
        ReadAll(GetParam().bytes.substr(at), "from " + std::to_string(at));
}

TEST_P(DamagedArchive, WithAnyBitFlippedDeliversNothingWrong) {
    for (std::size_t bit = 0; bit < 8 * GetParam().bytes.size(); ++bit) {
        Bytes bytes = GetParam().bytes;
        bytes[bit / 8] = static_cast<char>(bytes[bit / 8] ^ (1 << (bit % 8)));
        ReadAll(bytes, "bit " + std::to_string(bit));
    }
}

TEST_P(DamagedArchive, WithAnyByteOfItSetToTheExtremesDeliversNothingWrong) {
    for (const char value : {'\0', '\xFF', '\x7F'}) {
        for (std::size_t at = 0; at < GetParam().bytes.size(); ++at) {
            Bytes bytes = GetParam().bytes;
            bytes[at] = value;
            ReadAll(bytes, "byte " + std::to_string(at));
        }
    }
}

const Bytes k_text = "some text, some more text, and some text at the end";
RawEntry Described() {
    RawEntry entry = RawEntry::DeflatedEntry("a", k_text);
    entry.flags = 8;
    entry.localCrc = entry.localCompressed = entry.localUncompressed = 0;
    entry.descriptor = "PK\7\x8" + Number32(entry.crc) +
                       Number32(static_cast<std::uint32_t>(entry.data.size())) + Number32(entry.uncompressed);
    return entry;
}

INSTANTIATE_TEST_SUITE_P(
    Small, DamagedArchive,
    testing::Values(
        Victim{"Stored", RawArchive::Of({RawEntry::Stored("a", k_text)}).Build(), k_text},
        Victim{"Deflated", RawArchive::Of({RawEntry::DeflatedEntry("a", k_text)}).Build(), k_text},
        Victim{"Described", RawArchive::Of({Described()}).Build(), k_text},
        Victim{"TwoEntries",
               RawArchive::Of({RawEntry::Stored("a", k_text), RawEntry::DeflatedEntry("b", k_text)}).Build(),
               k_text},
        Victim{"Bzip2", RawArchive::Of({RawEntry::Bzip2Entry("a", k_text)}).Build(), k_text}),
    [](const auto& row) { return std::string(row.param.name); });

// The scheme's key derivation takes its time; one file of each is enough.
class DamagedCiphered : public DamagedArchive {};
TEST_P(DamagedCiphered, CutAtAnyByteIsRefused) {
    for (std::size_t size = 0; size < GetParam().bytes.size(); ++size)
        EXPECT_EQ(Opened(GetParam().bytes.substr(0, size)).code, 101) << size;
}
TEST_P(DamagedCiphered, WithAnyBitFlippedDeliversNothingWrong) {
    for (std::size_t bit = 0; bit < 8 * GetParam().bytes.size(); ++bit) {
        Bytes bytes = GetParam().bytes;
        bytes[bit / 8] = static_cast<char>(bytes[bit / 8] ^ (1 << (bit % 8)));
        ReadAll(bytes, "bit " + std::to_string(bit));
    }
}
INSTANTIATE_TEST_SUITE_P(
    Small, DamagedCiphered,
    testing::Values(Victim{"Aes256", ReadData("aes256-short.zip"), ReadData("short.txt")},
                    Victim{"Traditional", ReadData("traditional.zip"), ReadData("document.txt")}),
    [](const auto& row) { return std::string(row.param.name); });

}  // namespace
