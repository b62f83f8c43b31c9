#include "zip/bzip2_compressor.h"

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/file_header.h"
#include "zip/mem_file.h"
#include "zip/storage.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using ZipArchiveLib::CBzip2Compressor;

class Bzip2 : public testing::Test {
protected:
    CZipMemFile file{65536};
    CZipStorage storage{CZipEnvironment::System()};
    CZipFileHeader header;
    CBzip2Compressor compressor{storage};

    void SetUp() override {
        storage.Open(file, CZipStorage::create);
        header.SetMethod(CZipFileHeader::bzip2);
    }
    Bytes Compress(const Bytes& data, int level) {
        file.SetLength(0);
        header.SetCompressedSize(0);
        compressor.BeginCompression(level, header, nullptr);
        compressor.Compress(data.data(), static_cast<std::uint32_t>(data.size()));
        compressor.EndCompression(false);
        storage.Flush();
        return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
    }
    void Begin(const Bytes& stream, std::size_t uncompressed) {
        file.SetLength(0);
        file.Write(stream.data(), static_cast<std::uint32_t>(stream.size()));
        file.SeekToBegin();
        header.SetCompressedSize(static_cast<std::uint32_t>(stream.size()));
        header.SetUncompressedSize(static_cast<std::uint32_t>(uncompressed));
        compressor.BeginDecompression(header, nullptr);
    }
    Bytes Read(std::uint32_t size) {
        Bytes bytes(size, '\0');
        bytes.resize(compressor.Decompress(bytes.data(), size));
        return bytes;
    }
};

TEST_F(Bzip2, HandlesItsMethodAlone) {
    EXPECT_TRUE(compressor.SupportsMethod(12));
    EXPECT_FALSE(compressor.SupportsMethod(0));
    EXPECT_FALSE(compressor.SupportsMethod(8));
    EXPECT_EQ(compressor.GetOptions()->GetType(), 2);
}

struct Level {
    int level;
    char blockSize;
};
void PrintTo(const Level& c, std::ostream* os) { *os << c.level; }

class Bzip2Level : public Bzip2, public testing::WithParamInterface<Level> {};
TEST_P(Bzip2Level, BecomesThisBlockSize) {
    EXPECT_EQ(Compress("text", GetParam().level)[3], GetParam().blockSize);
}
INSTANTIATE_TEST_SUITE_P(Levels, Bzip2Level,
                         testing::Values(Level{-1, '6'}, Level{0, '1'}, Level{1, '1'}, Level{5, '5'},
                                         Level{9, '9'}));

TEST_F(Bzip2, WritesTheStreamThatBzip2Writes) {
    const Bytes data = zip_test::SampleText(50000);
    EXPECT_TRUE(Compress(data, 6) == zip_test::Bzip2ed(data));
}

TEST_F(Bzip2, ReadsWithSmallMemoryToo) {
    CBzip2Compressor::COptions options;
    EXPECT_FALSE(options.smallMemoryDecompression);
    options.smallMemoryDecompression = true;
    compressor.ApplyOptions(options);
    const Bytes data = zip_test::SampleText(50000);
    Begin(zip_test::Bzip2ed(data), data.size());
    EXPECT_TRUE(Read(50000) == data);
    EXPECT_EQ(Read(1), "");
}

TEST_F(Bzip2, ATruncatedStreamThatDeliversNothingRaises101) {
    const Bytes stream = zip_test::Bzip2ed("some text");
    for (std::size_t cut = 0; cut < 20; ++cut) {
        Begin(stream.substr(0, cut), 9);
        EXPECT_EQ(CodeOf([&] { Read(9); }), 101) << cut;
        compressor.EndDecompression(true);
    }
}

TEST_F(Bzip2, AStreamThatIsCutBehindItsDataIsShortOrRefused) {
    // Blocks of 100,000 bytes, of which the first two are whole.
    const Bytes data = zip_test::SampleText(300000);
    const Bytes stream = Compress(data, 1);
    Begin(stream.substr(0, stream.size() * 3 / 4), data.size());
    const Bytes got = Read(300000);
    EXPECT_TRUE(got == data.substr(0, got.size()));
    EXPECT_GT(got.size(), 0U);
    EXPECT_EQ(compressor.GetUncompressedLeft(), data.size() - got.size());
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
    compressor.EndDecompression(true);
}

TEST_F(Bzip2, BytesThatAreNoStreamRaise604) {
    Begin("no bzip2 at all", 100);
    EXPECT_EQ(CodeOf([&] { Read(100); }), 604);
    compressor.EndDecompression(true);
}

TEST_F(Bzip2, ADamagedStreamRaises603) {
    const Bytes data = zip_test::SampleText(1000);
    Bytes stream = zip_test::Bzip2ed(data);
    stream[12] = static_cast<char>(~stream[12]);
    Begin(stream, data.size());
    EXPECT_EQ(CodeOf([&] {
                  while (!Read(1000).empty()) continue;
              }),
              603);
    compressor.EndDecompression(true);
}

TEST_F(Bzip2, ALevelThatIsNoBlockSizeRaises601) {
    EXPECT_EQ(CodeOf([&] { compressor.BeginCompression(10, header, nullptr); }), 601);
}

TEST(Bzip2Options, AreCloned) {
    CBzip2Compressor::COptions options;
    options.smallMemoryDecompression = true;
    const auto clone = options.Clone();
    EXPECT_EQ(clone->GetType(), 2);
    EXPECT_TRUE(dynamic_cast<CBzip2Compressor::COptions&>(*clone).smallMemoryDecompression);
}

}  // namespace
