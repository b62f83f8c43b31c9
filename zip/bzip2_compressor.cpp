#include "zip/bzip2_compressor.h"

#include <zlib.h>

#include <algorithm>
#include <utility>

#include "zip/exception.h"
#include "zip/file_header.h"

extern "C" void bz_internal_error(int /*number*/) { CZipException::Raise(CZipException::bzip2Assertion); }

namespace ZipArchiveLib {
namespace {

constexpr int k_silent = 0;
constexpr int k_defaultWorkFactor = 0;

int BlockSizeFromLevel(int level) {
    if (level == -1) return 6;
    return level == 0 ? 1 : level;
}

}  // namespace

std::unique_ptr<CZipCompressor::COptions> CBzip2Compressor::COptions::Clone() const {
    return std::make_unique<COptions>(*this);
}

void CBzip2Compressor::ApplyOptions(const CZipCompressor::COptions& options) {
    if (const auto* own = dynamic_cast<const COptions*>(&options)) m_options = *own;
}

bool CBzip2Compressor::SupportsMethod(std::uint16_t method) const { return method == CZipFileHeader::bzip2; }

void CBzip2Compressor::PrepareStream() {
    ReleaseLibrary();
    ClearTotals();
    m_stream = {};
    m_stream.bzalloc = [](void* opaque, int items, int size) {
        return AllocateFor(opaque, static_cast<std::size_t>(items), static_cast<std::size_t>(size));
    };
    m_stream.bzfree = FreeFor;
    m_stream.opaque = GetOpaque();
}

void CBzip2Compressor::BeginCompression(int level, CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareStream();
    CBaseLibCompressor::BeginCompression(level, header, cryptograph);
    EmptyOutput();
    CheckLibraryResult(
        BZ2_bzCompressInit(&m_stream, BlockSizeFromLevel(level), k_silent, k_defaultWorkFactor));
    m_library = Library::compressing;
}

void CBzip2Compressor::BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareStream();
    CBaseLibCompressor::BeginDecompression(header, cryptograph);
    CheckLibraryResult(BZ2_bzDecompressInit(&m_stream, k_silent, m_options.smallMemoryDecompression ? 1 : 0));
    m_library = Library::decompressing;
}

void CBzip2Compressor::EmptyOutput() {
    WritePending();
    m_stream.next_out = reinterpret_cast<char*>(m_buffer.GetBuffer());
    m_stream.avail_out = m_buffer.GetSize();
}

void CBzip2Compressor::Compress(const void* buffer, std::uint32_t size) {
    const auto* bytes = static_cast<const Bytef*>(buffer);
    CountIn(size);
    m_header->SetCrc(static_cast<std::uint32_t>(crc32(m_header->GetCrc(), bytes, size)));
    m_stream.next_in = const_cast<char*>(static_cast<const char*>(buffer));
    m_stream.avail_in = size;
    while (m_stream.avail_in != 0) {
        if (m_stream.avail_out == 0) EmptyOutput();
        Run(BZ_RUN);
    }
}

void CBzip2Compressor::Run(int action) {
    const unsigned before = m_stream.avail_out;
    const int result = BZ2_bzCompress(&m_stream, action);
    m_finished = result == BZ_STREAM_END;
    if (!m_finished) CheckLibraryResult(result);
    const unsigned produced = before - m_stream.avail_out;
    m_compressedLeft += produced;
    CountOut(produced);
}

void CBzip2Compressor::FinishCompressing() {
    m_stream.avail_in = 0;
    while (!m_finished) {
        if (m_stream.avail_out == 0) EmptyOutput();
        Run(BZ_FINISH);
    }
}

void CBzip2Compressor::EndCompression(bool afterException) {
    if (!afterException) {
        FinishCompressing();
        WritePending();
        m_library = Library::closed;
        CheckLibraryResult(BZ2_bzCompressEnd(&m_stream));
        StoreTotals();
    }
    ReleaseLibrary();
    m_buffer.Release();
}

std::uint32_t CBzip2Compressor::Decompress(void* buffer, std::uint32_t size) {
    if (m_finished || size == 0) return 0;
    const std::uint32_t allowance = std::min(size, m_uncompressedLeft);
    m_stream.next_out = static_cast<char*>(buffer);
    m_stream.avail_out = allowance;
    while (!m_finished) {
        if (m_stream.avail_in == 0) {
            m_stream.avail_in = ReadBlock();
            m_stream.next_in = reinterpret_cast<char*>(m_buffer.GetBuffer());
        }
        if (!DecompressStep()) break;
        if (allowance != 0 && m_stream.avail_out == 0) break;
    }
    const std::uint32_t delivered = allowance - m_stream.avail_out;
    if (delivered == 0 && !m_finished) Raise(CZipException::badStructure);
    return delivered;
}

// One call of the library. False when it can get no further with what it has.
bool CBzip2Compressor::DecompressStep() {
    const char* const from = m_stream.next_out;
    const unsigned inBefore = m_stream.avail_in;
    const int result = BZ2_bzDecompress(&m_stream);
    const auto size = static_cast<std::uint32_t>(m_stream.next_out - from);
    m_crc = static_cast<std::uint32_t>(crc32(m_crc, reinterpret_cast<const Bytef*>(from), size));
    m_uncompressedLeft -= size;
    m_finished = result == BZ_STREAM_END;
    if (!m_finished) CheckLibraryResult(result);
    return size != 0 || inBefore != m_stream.avail_in;
}

void CBzip2Compressor::EndDecompression(bool afterException) {
    if (!afterException && std::exchange(m_library, Library::closed) == Library::decompressing)
        CheckLibraryResult(BZ2_bzDecompressEnd(&m_stream));
    ReleaseLibrary();
    m_buffer.Release();
}

// Tracked allocations are simply freed, whatever state the library has left them in.
void CBzip2Compressor::ReleaseLibrary() {
    const Library library = std::exchange(m_library, Library::closed);
    if (m_stream.opaque == nullptr) {
        if (library == Library::compressing) BZ2_bzCompressEnd(&m_stream);
        if (library == Library::decompressing) BZ2_bzDecompressEnd(&m_stream);
    }
    FreeAllocations();
    m_stream = {};
}

int CBzip2Compressor::MapLibraryResult(int result) const {
    switch (result) {
        case BZ_SEQUENCE_ERROR:
            return CZipException::bzip2Sequence;
        case BZ_PARAM_ERROR:
            return CZipException::bzip2Parameter;
        case BZ_MEM_ERROR:
            return CZipException::bzip2Memory;
        case BZ_DATA_ERROR:
            return CZipException::bzip2Data;
        case BZ_DATA_ERROR_MAGIC:
            return CZipException::bzip2Magic;
        case BZ_IO_ERROR:
            return CZipException::bzip2Io;
        case BZ_UNEXPECTED_EOF:
            return CZipException::bzip2UnexpectedEnd;
        case BZ_OUTBUFF_FULL:
            return CZipException::bzip2OutputFull;
        case BZ_CONFIG_ERROR:
            return CZipException::bzip2Configuration;
        default:
            return CZipException::generic;
    }
}

bool CBzip2Compressor::IsResultAcceptable(int result) const {
    return result == BZ_OK || result == BZ_RUN_OK || result == BZ_FLUSH_OK || result == BZ_FINISH_OK;
}

}  // namespace ZipArchiveLib
