// What both compressors have in common.

#include "zip/compressor.h"

#include <gtest/gtest.h>

#include <new>

#include "raw_archive.h"
#include "zip/bzip2_compressor.h"
#include "zip/deflate_compressor.h"
#include "zip/file_header.h"
#include "zip/mem_file.h"
#include "zip/storage.h"

namespace {

using zip_test::Bytes;
using zip_test::CodeOf;
using zip_test::World;
using ZipArchiveLib::CBzip2Compressor;
using ZipArchiveLib::CDeflateCompressor;

// Opens the parts that only derived classes see.
template <class Compressor>
class Opened : public Compressor {
public:
    using Compressor::AllocateFor;
    using Compressor::Compressor;
    using Compressor::FreeFor;
    void* Opaque() { return this->GetOpaque(); }
};

template <class Compressor>
class BothCompressors : public testing::Test {
protected:
    World world;
    CZipMemFile file{65536};
    CZipStorage storage{world.environment};
    CZipFileHeader header;

    static constexpr std::uint16_t Method() {
        return std::is_same_v<Compressor, CBzip2Compressor> ? CZipFileHeader::bzip2
                                                            : CZipFileHeader::deflated;
    }
    void SetUp() override {
        storage.Open(file, CZipStorage::create);
        header.SetMethod(Method());
    }
    // Compresses in pieces and gives the stream.
    Bytes Compress(Compressor& compressor, const Bytes& data, std::size_t piece, int level = -1) {
        file.SetLength(0);
        header.SetCrc(0);
        header.SetCompressedSize(0);
        compressor.BeginCompression(level, header, nullptr);
        for (std::size_t at = 0; at < data.size(); at += piece) {
            const std::size_t size = std::min(piece, data.size() - at);
            compressor.Compress(data.data() + at, static_cast<std::uint32_t>(size));
        }
        compressor.EndCompression(false);
        storage.Flush();
        return {reinterpret_cast<const char*>(file.GetData()), file.GetLength()};
    }
    void Begin(Compressor& compressor, const Bytes& stream, std::size_t uncompressed) {
        file.SetLength(0);
        file.Write(stream.data(), static_cast<std::uint32_t>(stream.size()));
        file.SeekToBegin();
        header.SetCompressedSize(static_cast<std::uint32_t>(stream.size()));
        header.SetUncompressedSize(static_cast<std::uint32_t>(uncompressed));
        compressor.BeginDecompression(header, nullptr);
    }
    // Reads in pieces until nothing comes any more.
    Bytes Decompress(Compressor& compressor, std::size_t piece) {
        Bytes all;
        Bytes buffer(piece, '\0');
        while (const std::uint32_t got =
                   compressor.Decompress(buffer.data(), static_cast<std::uint32_t>(piece)))
            all.append(buffer, 0, got);
        return all;
    }
};

using Kinds = testing::Types<CDeflateCompressor, CBzip2Compressor>;
TYPED_TEST_SUITE(BothCompressors, Kinds);

TYPED_TEST(BothCompressors, GiveBackWhatTheyTook) {
    TypeParam compressor(this->storage);
    for (const std::size_t size : {0U, 1U, 2U, 1000U, 131072U, 400000U}) {
        for (const Bytes& data : {zip_test::SampleText(size), zip_test::Noise(size), Bytes(size, 'z')}) {
            for (const std::size_t piece : {777U, 65536U}) {
                const Bytes stream = this->Compress(compressor, data, piece);
                EXPECT_EQ(this->header.GetCrc(), zip_test::Crc32(data));
                EXPECT_EQ(this->header.GetCompressedSize(), stream.size());
                EXPECT_EQ(this->header.GetUncompressedSize(), data.size());
                this->Begin(compressor, stream, data.size());
                EXPECT_EQ(compressor.GetUncompressedLeft(), data.size());
                ASSERT_TRUE(this->Decompress(compressor, piece) == data) << size;
                EXPECT_EQ(compressor.GetCrc(), zip_test::Crc32(data));
                EXPECT_EQ(compressor.GetUncompressedLeft(), 0U);
                compressor.EndDecompression(false);
                EXPECT_EQ(compressor.GetAllocationCount(), 0U);
            }
        }
    }
}

TYPED_TEST(BothCompressors, ReadingJustTheDeclaredSizeAndOneByteMoreIsInOrder) {
    TypeParam compressor(this->storage);
    for (std::size_t size = 1; size < 300; size += 7) {
        const Bytes data = zip_test::Noise(size) + zip_test::SampleText(3 * size) + Bytes(size, 'x');
        const Bytes stream = this->Compress(compressor, data, 100);
        this->Begin(compressor, stream, data.size());
        Bytes out(data.size(), '\0');
        EXPECT_EQ(compressor.Decompress(out.data(), static_cast<std::uint32_t>(out.size())), out.size());
        EXPECT_EQ(out, data);
        EXPECT_EQ(compressor.Decompress(out.data(), 1), 0U) << size;
        EXPECT_EQ(compressor.GetCompressedLeft(), 0U);
        compressor.EndDecompression(false);
    }
}

// Every way in which the ends of blocks can cut the stream and its end.
TYPED_TEST(BothCompressors, WorkWithBuffersOfAnySize) {
    const Bytes data = zip_test::SampleText(500);
    for (const std::uint32_t size : {1U, 2U, 3U, 7U, 64U}) {
        TypeParam compressor(this->storage);
        typename TypeParam::COptions options;
        options.bufferSize = size;
        compressor.ApplyOptions(options);
        const Bytes stream = this->Compress(compressor, data, 33);
        this->Begin(compressor, stream, data.size());
        Bytes out(data.size(), '\0');
        EXPECT_EQ(compressor.Decompress(out.data(), static_cast<std::uint32_t>(out.size())), out.size());
        EXPECT_EQ(out, data);
        EXPECT_EQ(compressor.Decompress(out.data(), 1), 0U) << size;
        compressor.EndDecompression(false);
    }
}

TYPED_TEST(BothCompressors, ZeroBytesAskedForLeaveTheStreamAlone) {
    TypeParam compressor(this->storage);
    const Bytes stream = this->Compress(compressor, "some text", 100);
    this->Begin(compressor, stream, 9);
    char byte = 0;
    EXPECT_EQ(compressor.Decompress(&byte, 0), 0U);
    EXPECT_EQ(compressor.GetCompressedLeft(), stream.size());
    EXPECT_EQ(this->file.GetPosition(), 0U);
}

TYPED_TEST(BothCompressors, AStreamThatEndsAheadOfTheDeclaredSizeIsShort) {
    TypeParam compressor(this->storage);
    const Bytes stream = this->Compress(compressor, "some text", 100);
    this->Begin(compressor, stream, 20);
    char buffer[20];
    EXPECT_EQ(compressor.Decompress(buffer, 20), 9U);
    EXPECT_EQ(compressor.Decompress(buffer, 11), 0U);
    EXPECT_EQ(compressor.GetUncompressedLeft(), 11U);
    compressor.EndDecompression(false);
}

TYPED_TEST(BothCompressors, AStreamThatGoesOnBeyondTheDeclaredSizeRaises101) {
    TypeParam compressor(this->storage);
    const Bytes data = zip_test::SampleText(100000);
    const Bytes stream = this->Compress(compressor, data, 1000);
    for (const std::size_t declared : {0U, 9U, 99999U}) {
        this->Begin(compressor, stream, declared);
        Bytes out(declared + 1, '\0');
        EXPECT_EQ(compressor.Decompress(out.data(), static_cast<std::uint32_t>(declared)), declared);
        EXPECT_EQ(CodeOf([&] { compressor.Decompress(out.data(), 1); }), 101);
        compressor.EndDecompression(true);
        EXPECT_EQ(compressor.GetAllocationCount(), 0U);
    }
}

TYPED_TEST(BothCompressors, CompressedBytesThatAreNotThereRaise101) {
    TypeParam compressor(this->storage);
    const Bytes data = zip_test::Noise(1000);
    const Bytes stream = this->Compress(compressor, data, 1000);
    this->Begin(compressor, stream, data.size());
    this->file.SetLength(500);
    this->file.SeekToBegin();
    Bytes out(1000, '\0');
    EXPECT_EQ(CodeOf([&] { compressor.Decompress(out.data(), 1000); }), 101);
    compressor.EndDecompression(true);
}

TYPED_TEST(BothCompressors, GivenUpInTheMiddleTheyHoldNothing) {
    for (const bool tracks : {true, false}) {
        TypeParam compressor(this->storage);
        typename TypeParam::COptions options;
        options.trackLibraryAllocations = tracks;
        compressor.ApplyOptions(options);
        compressor.BeginCompression(6, this->header, nullptr);
        compressor.Compress("some text", 9);
        EXPECT_EQ(compressor.GetAllocationCount() != 0, tracks);
        compressor.EndCompression(true);
        EXPECT_EQ(compressor.GetAllocationCount(), 0U);

        this->Begin(compressor, Bytes(100, 'x'), 100);
        EXPECT_EQ(compressor.GetAllocationCount() != 0, tracks);
        compressor.EndDecompression(true);
        EXPECT_EQ(compressor.GetAllocationCount(), 0U);

        // Two begins without an end, and a destructor in the middle.
        compressor.BeginCompression(6, this->header, nullptr);
        compressor.BeginCompression(6, this->header, nullptr);
        this->Begin(compressor, Bytes(100, 'x'), 100);
    }
}

TYPED_TEST(BothCompressors, TrackedAllocationsAreListedUntilTheyAreFreed) {
    Opened<TypeParam> compressor(this->storage);
    void* first = Opened<TypeParam>::AllocateFor(compressor.Opaque(), 3, 4);
    void* second = Opened<TypeParam>::AllocateFor(compressor.Opaque(), 1, 1);
    EXPECT_EQ(compressor.GetAllocationCount(), 2U);
    Opened<TypeParam>::FreeFor(compressor.Opaque(), first);
    EXPECT_EQ(compressor.GetAllocationCount(), 1U);
    static_cast<void>(second);  // the compressor's destructor frees it
}

TYPED_TEST(BothCompressors, UntrackedAllocationsGoStraightToTheHeap) {
    Opened<TypeParam> compressor(this->storage);
    typename TypeParam::COptions options;
    options.trackLibraryAllocations = false;
    compressor.ApplyOptions(options);
    EXPECT_EQ(compressor.Opaque(), nullptr);
    void* block = Opened<TypeParam>::AllocateFor(nullptr, 3, 4);
    EXPECT_NE(block, nullptr);
    EXPECT_EQ(compressor.GetAllocationCount(), 0U);
    Opened<TypeParam>::FreeFor(nullptr, block);
    EXPECT_EQ(Opened<TypeParam>::AllocateFor(nullptr, SIZE_MAX, 2), nullptr);
}

TYPED_TEST(BothCompressors, HaveOptionsWithTheseDefaults) {
    const TypeParam compressor(this->storage);
    const auto* options = dynamic_cast<const typename TypeParam::COptions*>(compressor.GetOptions());
    ASSERT_NE(options, nullptr);
    EXPECT_EQ(options->bufferSize, 0x20000U);
    EXPECT_TRUE(options->trackLibraryAllocations);
}

TYPED_TEST(BothCompressors, ABufferSizeOfZeroMeansTheDefault) {
    TypeParam compressor(this->storage);
    typename TypeParam::COptions options;
    options.bufferSize = 0;
    compressor.ApplyOptions(options);
    const Bytes data = zip_test::SampleText(1000);
    const Bytes stream = this->Compress(compressor, data, 1000);
    this->Begin(compressor, stream, data.size());
    EXPECT_EQ(this->Decompress(compressor, 1000), data);
}

TYPED_TEST(BothCompressors, OptionsOfTheOtherKindAreNotTaken) {
    TypeParam compressor(this->storage);
    std::unique_ptr<CZipCompressor::COptions> other;
    if constexpr (std::is_same_v<TypeParam, CBzip2Compressor>)
        other = CDeflateCompressor::COptions().Clone();
    else
        other = CBzip2Compressor::COptions().Clone();
    other->bufferSize = 5;
    compressor.ApplyOptions(*other);
    EXPECT_EQ(compressor.GetOptions()->bufferSize, 0x20000U);
}

TYPED_TEST(BothCompressors, AFailureNamesTheFileOrNothingWhenTheStorageIsClosed) {
    const zip_test::ScratchFolder folder;
    CZipStorage own(this->world.environment);
    const TypeParam compressor(own);
    own.Open(folder / "a.zip", CZipStorage::create, 0);
    for (const std::string& expected : {folder / "a.zip", std::string()}) {
        try {
            compressor.CheckLibraryResult(-99);
            FAIL();
        } catch (const CZipException& exception) {
            EXPECT_EQ(exception.GetCode(), 100);
            EXPECT_EQ(exception.GetPath(), expected);
        }
        own.Close(true);
    }
}

struct LibraryResult {
    int result;
    int code;
    bool acceptable;
};
void PrintTo(const LibraryResult& c, std::ostream* os) { *os << c.result; }

void ExpectResult(const CZipCompressor& compressor, const LibraryResult& expected) {
    EXPECT_EQ(compressor.MapLibraryResult(expected.result), expected.code);
    EXPECT_EQ(compressor.IsResultAcceptable(expected.result), expected.acceptable);
    EXPECT_EQ(CodeOf([&] { compressor.CheckLibraryResult(expected.result); }),
              expected.acceptable ? 0 : expected.code);
}

class ZlibResult : public testing::TestWithParam<LibraryResult> {};
TEST_P(ZlibResult, BecomesThisCode) {
    CZipStorage storage(CZipEnvironment::System());
    ExpectResult(CDeflateCompressor(storage), GetParam());
}
INSTANTIATE_TEST_SUITE_P(
    Table, ZlibResult,
    testing::Values(LibraryResult{Z_VERSION_ERROR, 507, false}, LibraryResult{Z_BUF_ERROR, 506, false},
                    LibraryResult{Z_MEM_ERROR, 505, false}, LibraryResult{Z_DATA_ERROR, 504, false},
                    LibraryResult{Z_STREAM_ERROR, 503, false}, LibraryResult{Z_ERRNO, 502, false},
                    LibraryResult{Z_STREAM_END, 500, false}, LibraryResult{Z_NEED_DICT, 501, true},
                    LibraryResult{Z_OK, 100, true}, LibraryResult{-77, 100, false}));

class Bzip2Result : public testing::TestWithParam<LibraryResult> {};
TEST_P(Bzip2Result, BecomesThisCode) {
    CZipStorage storage(CZipEnvironment::System());
    ExpectResult(CBzip2Compressor(storage), GetParam());
}
INSTANTIATE_TEST_SUITE_P(
    Table, Bzip2Result,
    testing::Values(LibraryResult{BZ_SEQUENCE_ERROR, 600, false}, LibraryResult{BZ_PARAM_ERROR, 601, false},
                    LibraryResult{BZ_MEM_ERROR, 602, false}, LibraryResult{BZ_DATA_ERROR, 603, false},
                    LibraryResult{BZ_DATA_ERROR_MAGIC, 604, false}, LibraryResult{BZ_IO_ERROR, 605, false},
                    LibraryResult{BZ_UNEXPECTED_EOF, 606, false}, LibraryResult{BZ_OUTBUFF_FULL, 607, false},
                    LibraryResult{BZ_CONFIG_ERROR, 608, false}, LibraryResult{BZ_OK, 100, true},
                    LibraryResult{BZ_RUN_OK, 100, true}, LibraryResult{BZ_FLUSH_OK, 100, true},
                    LibraryResult{BZ_FINISH_OK, 100, true}, LibraryResult{BZ_STREAM_END, 100, false},
                    LibraryResult{-77, 100, false}));

TEST(Bzip2Library, AnInternalAssertionRaises609) {
    EXPECT_EQ(CodeOf([] { bz_internal_error(1007); }), 609);
}

}  // namespace
