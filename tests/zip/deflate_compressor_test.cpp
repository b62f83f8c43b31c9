#include "zip/deflate_compressor.h"

#include <gtest/gtest.h>

#include "raw_archive.h"
#include "zip/cryptograph.h"
#include "zip/file_header.h"
#include "zip/mem_file.h"
#include "zip/storage.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using ZipArchiveLib::CDeflateCompressor;

class Deflate : public testing::Test {
protected:
    CZipMemFile file{65536};
    CZipStorage storage{CZipEnvironment::System()};
    CZipFileHeader header;
    CDeflateCompressor compressor{storage};

    void SetUp() override { storage.Open(file, CZipStorage::create); }
    Bytes Written() {
        storage.Flush();
        return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
    }
    void Begin(const Bytes& stream, std::size_t uncompressed,
               std::uint16_t method = CZipFileHeader::deflated) {
        file.SetLength(0);
        file.Write(stream.data(), static_cast<std::uint32_t>(stream.size()));
        file.SeekToBegin();
        header.SetMethod(method);
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

TEST_F(Deflate, HandlesStoredAndDeflated) {
    EXPECT_TRUE(compressor.SupportsMethod(0));
    EXPECT_TRUE(compressor.SupportsMethod(8));
    EXPECT_FALSE(compressor.SupportsMethod(12));
    EXPECT_FALSE(compressor.SupportsMethod(9));
    EXPECT_EQ(compressor.GetOptions()->GetType(), 1);
}

TEST_F(Deflate, WritesTheStreamThatZlibWrites) {
    const Bytes data = zip_test::SampleText(50000);
    for (const int level : {-1, 1, 5, 9}) {
        file.SetLength(0);
        header.SetCompressedSize(0);
        compressor.BeginCompression(level, header, nullptr);
        compressor.Compress(data.data(), static_cast<std::uint32_t>(data.size()));
        compressor.EndCompression(false);
        EXPECT_TRUE(Written() == zip_test::Deflated(data, level)) << level;
    }
}

TEST_F(Deflate, AnEmptyEntryHasTheTwoBytesOfAnEmptyStream) {
    compressor.BeginCompression(-1, header, nullptr);
    compressor.EndCompression(false);
    EXPECT_EQ(Written(), Bytes("\3\0", 2));
    EXPECT_EQ(header.GetCrc(), 0U);
    EXPECT_EQ(header.GetCompressedSize(), 2U);
    EXPECT_EQ(header.GetUncompressedSize(), 0U);
}

TEST_F(Deflate, AnEmptyStreamIsReadToItsEnd) {
    Begin(Bytes("\3\0", 2), 0);
    EXPECT_EQ(Read(1), "");
    EXPECT_EQ(compressor.GetCompressedLeft(), 0U);
}

TEST_F(Deflate, StoredBytesGoThroughAsTheyAre) {
    const Bytes data = zip_test::Noise(300000);
    header.SetMethod(CZipFileHeader::stored);
    compressor.BeginCompression(0, header, nullptr);
    EXPECT_EQ(compressor.GetAllocationCount(), 0U) << "no library is asked";
    compressor.Compress(data.data(), static_cast<std::uint32_t>(data.size()));
    compressor.EndCompression(false);
    EXPECT_TRUE(Written() == data);
    EXPECT_EQ(header.GetCompressedSize(), data.size());
    EXPECT_EQ(header.GetUncompressedSize(), data.size());
    EXPECT_EQ(header.GetCrc(), zip_test::Crc32(data));

    Begin(data, data.size(), CZipFileHeader::stored);
    EXPECT_EQ(compressor.GetAllocationCount(), 0U);
    Bytes all = Read(1000);
    all += Read(299000);
    all += Read(1);
    EXPECT_TRUE(all == data);
    EXPECT_EQ(compressor.GetCrc(), zip_test::Crc32(data));
}

TEST_F(Deflate, CompressedSizeIsAddedToWhatTheHeaderHolds) {
    header.SetCompressedSize(12);
    compressor.BeginCompression(-1, header, nullptr);
    compressor.EndCompression(false);
    EXPECT_EQ(header.GetCompressedSize(), 14U);
}

TEST_F(Deflate, AStoredEntryWithTooFewBytesIsShort) {
    Begin("abc", 5, CZipFileHeader::stored);
    EXPECT_EQ(Read(5), "abc");
    EXPECT_EQ(Read(2), "");
    EXPECT_EQ(compressor.GetUncompressedLeft(), 2U);
}

TEST_F(Deflate, AStoredEntryWithTooManyBytesGivesThoseDeclared) {
    Begin("abcde", 3, CZipFileHeader::stored);
    EXPECT_EQ(Read(5), "abc");
    EXPECT_EQ(Read(1), "");
}

TEST_F(Deflate, AStoredEntryIsReadNoFurtherThanAskedFor) {
    CDeflateCompressor::COptions options;
    options.bufferSize = 4;
    compressor.ApplyOptions(options);
    Begin("abcd", 4, CZipFileHeader::stored);
    header.SetCompressedSize(8);
    header.SetUncompressedSize(8);
    compressor.BeginDecompression(header, nullptr);
    EXPECT_EQ(Read(4), "abcd") << "what is missing behind it is the next read's matter";
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
    compressor.EndDecompression(true);
}

// The compressed bytes end ahead of the stream. Whatever stands behind them in the file is not read, nothing
// made up is delivered, and the entry is short.
TEST_F(Deflate, AStreamCutAtAnyByteIsShortAndNeverReadPastItsEntry) {
    const Bytes data = zip_test::SampleText(300) + zip_test::Noise(50);
    const Bytes stream = zip_test::Deflated(data);
    for (std::size_t cut = 0; cut + 1 < stream.size(); ++cut) {
        Begin(stream, data.size());
        header.SetCompressedSize(static_cast<std::uint32_t>(cut));
        compressor.BeginDecompression(header, nullptr);
        Bytes all;
        ASSERT_EQ(CodeOf([&] {
                      for (Bytes got = Read(64); !got.empty(); got = Read(64)) all += got;
                  }),
                  0)
            << cut;
        EXPECT_EQ(all, data.substr(0, all.size())) << cut;
        EXPECT_EQ(compressor.GetUncompressedLeft(), data.size() - all.size());
        EXPECT_LE(file.GetPosition(), cut);
        compressor.EndDecompression(false);
    }
}

TEST_F(Deflate, WithoutTheCheckOfItsEndAStreamMayGoOn) {
    CDeflateCompressor::COptions options;
    EXPECT_TRUE(options.verifyStreamEnd);
    options.verifyStreamEnd = false;
    compressor.ApplyOptions(options);
    Begin(zip_test::Deflated("some text"), 4);
    EXPECT_EQ(Read(4), "some");
    EXPECT_EQ(Read(1), "");
}

TEST_F(Deflate, EmptyBlocksBehindTheDataAreNotTheEnd) {
    // A final block that is missing, and then one behind any number of empty stored blocks.
    z_stream stream = {};
    ASSERT_EQ(deflateInit2(&stream, 6, Z_DEFLATED, -15, 8, Z_DEFAULT_STRATEGY), Z_OK);
    Bytes bytes(1000, '\0');
    Bytes text = "some text";
    stream.next_in = reinterpret_cast<Bytef*>(text.data());
    stream.avail_in = 9;
    stream.next_out = reinterpret_cast<Bytef*>(bytes.data());
    stream.avail_out = 1000;
    for (int i = 0; i < 20; ++i) deflate(&stream, Z_FULL_FLUSH);
    const std::size_t open = stream.total_out;
    deflate(&stream, Z_FINISH);
    const std::size_t closed = stream.total_out;
    deflateEnd(&stream);

    Begin(bytes.substr(0, closed), 9);
    EXPECT_EQ(Read(9), text);
    EXPECT_EQ(Read(1), "");
    Begin(bytes.substr(0, open), 9);
    EXPECT_EQ(Read(9), text);
    EXPECT_EQ(CodeOf([&] { Read(1); }), 101);
}

TEST_F(Deflate, BytesThatAreNoStreamRaise504) {
    Begin(Bytes("\x07\xFF\xFF\xFF", 4), 100);
    EXPECT_EQ(CodeOf([&] { Read(100); }), 504);
    compressor.EndDecompression(true);
    EXPECT_EQ(compressor.GetAllocationCount(), 0U);
}

TEST_F(Deflate, ALevelThatZlibDoesNotKnowRaises503) {
    EXPECT_EQ(CodeOf([&] { compressor.BeginCompression(17, header, nullptr); }), 503);
}

// Turns every byte round, so that it shows what has passed through it.
class Inverter : public CZipCryptograph {
public:
    bool BeginDecode(const CZipAutoBuffer& /*password*/, CZipFileHeader& /*header*/,
                     CZipStorage& /*storage*/) override {
        return true;
    }
    void BeginEncode(const CZipAutoBuffer& /*password*/, CZipFileHeader& /*header*/,
                     CZipStorage& /*storage*/) override {}
    void Decode(std::uint8_t* buffer, std::uint32_t size) override { Encode(buffer, size); }
    void Encode(std::uint8_t* buffer, std::uint32_t size) override {
        for (std::uint32_t i = 0; i < size; ++i) buffer[i] = static_cast<std::uint8_t>(~buffer[i]);
    }
};

TEST_F(Deflate, EveryBlockPassesThroughTheCryptographOnce) {
    const Bytes data = zip_test::Noise(300000);
    Inverter inverter;
    compressor.BeginCompression(-1, header, &inverter);
    compressor.Compress(data.data(), static_cast<std::uint32_t>(data.size()));
    compressor.EndCompression(false);
    Bytes inverted = zip_test::Deflated(data, -1);
    for (char& c : inverted) c = static_cast<char>(~c);
    EXPECT_TRUE(Written() == inverted);

    file.SeekToBegin();
    compressor.BeginDecompression(header, &inverter);
    EXPECT_TRUE(Read(300000) == data);
}

TEST(Cryptograph, HasABaseThatHandlesNothingAndEndsWithoutAWord) {
    CZipStorage storage(CZipEnvironment::System());
    CZipFileHeader header;
    Inverter inverter;
    EXPECT_FALSE(inverter.CanHandle(0));
    EXPECT_NO_THROW(inverter.EndDecode(header, storage));
    EXPECT_NO_THROW(inverter.EndEncode(header, storage));
}

TEST(DeflateOptions, AreCloned) {
    CDeflateCompressor::COptions options;
    options.verifyStreamEnd = false;
    options.bufferSize = 7;
    const auto clone = options.Clone();
    EXPECT_EQ(clone->GetType(), 1);
    EXPECT_EQ(clone->bufferSize, 7U);
    EXPECT_FALSE(dynamic_cast<CDeflateCompressor::COptions&>(*clone).verifyStreamEnd);
}

}  // namespace
