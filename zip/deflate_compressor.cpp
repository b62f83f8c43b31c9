#include "zip/deflate_compressor.h"

#include <algorithm>
#include <cstring>
#include <utility>

#include "zip/exception.h"
#include "zip/file_header.h"

namespace ZipArchiveLib {
namespace {

// Raw deflate with the largest window: ZIP has headers of its own. (zlib.h, deflateInit2)
constexpr int k_rawWindowBits = -15;
constexpr int k_memoryLevel = 8;

}  // namespace

std::unique_ptr<CZipCompressor::COptions> CDeflateCompressor::COptions::Clone() const {
    return std::make_unique<COptions>(*this);
}

void CDeflateCompressor::ApplyOptions(const CZipCompressor::COptions& options) {
    if (const auto* own = dynamic_cast<const COptions*>(&options)) m_options = *own;
}

bool CDeflateCompressor::SupportsMethod(std::uint16_t method) const {
    return method == CZipFileHeader::stored || method == CZipFileHeader::deflated;
}

bool CDeflateCompressor::IsDeflated() const { return m_header->GetMethod() == CZipFileHeader::deflated; }

void CDeflateCompressor::PrepareStream() {
    ReleaseLibrary();
    ClearTotals();
    m_stream = {};
    m_stream.zalloc = [](voidpf opaque, uInt items, uInt size) { return AllocateFor(opaque, items, size); };
    m_stream.zfree = FreeFor;
    m_stream.opaque = GetOpaque();
}

void CDeflateCompressor::BeginCompression(int level, CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareStream();
    CBaseLibCompressor::BeginCompression(level, header, cryptograph);
    EmptyOutput();
    if (!IsDeflated()) return;
    CheckLibraryResult(
        deflateInit2(&m_stream, level, Z_DEFLATED, k_rawWindowBits, k_memoryLevel, Z_DEFAULT_STRATEGY));
    m_library = Library::deflating;
}

void CDeflateCompressor::BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareStream();
    CBaseLibCompressor::BeginDecompression(header, cryptograph);
    if (!IsDeflated()) return;
    CheckLibraryResult(inflateInit2(&m_stream, k_rawWindowBits));
    m_library = Library::inflating;
}

void CDeflateCompressor::EmptyOutput() {
    WritePending();
    m_stream.next_out = m_buffer.GetBuffer();
    m_stream.avail_out = m_buffer.GetSize();
}

void CDeflateCompressor::Compress(const void* buffer, std::uint32_t size) {
    const auto* bytes = static_cast<const Bytef*>(buffer);
    CountIn(size);
    m_header->SetCrc(static_cast<std::uint32_t>(crc32(m_header->GetCrc(), bytes, size)));
    m_stream.next_in = const_cast<Bytef*>(bytes);
    m_stream.avail_in = size;
    while (m_stream.avail_in != 0) {
        if (m_stream.avail_out == 0) EmptyOutput();
        if (IsDeflated())
            Deflate(Z_NO_FLUSH);
        else
            StoreInput();
    }
}

void CDeflateCompressor::Deflate(int flush) {
    const uInt before = m_stream.avail_out;
    const int result = deflate(&m_stream, flush);
    m_finished = result == Z_STREAM_END;
    if (!m_finished) CheckLibraryResult(result);
    const uInt produced = before - m_stream.avail_out;
    m_compressedLeft += produced;
    CountOut(produced);
}

void CDeflateCompressor::StoreInput() {
    const uInt size = std::min(m_stream.avail_in, m_stream.avail_out);
    std::memcpy(m_stream.next_out, m_stream.next_in, size);
    m_stream.next_in += size;
    m_stream.avail_in -= size;
    m_stream.next_out += size;
    m_stream.avail_out -= size;
    m_compressedLeft += size;
    CountOut(size);
}

void CDeflateCompressor::FinishDeflating() {
    m_stream.avail_in = 0;
    while (!m_finished) {
        if (m_stream.avail_out == 0) EmptyOutput();
        Deflate(Z_FINISH);
    }
}

void CDeflateCompressor::EndCompression(bool afterException) {
    if (!afterException) {
        if (IsDeflated()) FinishDeflating();
        WritePending();
        if (std::exchange(m_library, Library::closed) == Library::deflating)
            CheckLibraryResult(deflateEnd(&m_stream));
        StoreTotals();
    }
    ReleaseLibrary();
    m_buffer.Release();
}

std::uint32_t CDeflateCompressor::Decompress(void* buffer, std::uint32_t size) {
    if (m_finished || size == 0) return 0;
    m_stream.next_out = static_cast<Bytef*>(buffer);
    const std::uint32_t allowance = std::min(size, m_uncompressedLeft);
    m_stream.avail_out = allowance;
    if (!IsDeflated())
        TakeStored();
    else if (allowance != 0)
        Inflate();
    else
        LetStreamEnd();
    return allowance - m_stream.avail_out;
}

bool CDeflateCompressor::FillInput() {
    if (m_stream.avail_in == 0) {
        m_stream.avail_in = ReadBlock();
        m_stream.next_in = m_buffer.GetBuffer();
    }
    return m_stream.avail_in != 0;
}

void CDeflateCompressor::TakeStored() {
    // Once even with no room, so that a cryptograph sees what stands behind the declared size.
    do {
        if (!FillInput()) return;
        const uInt size = std::min(m_stream.avail_in, m_stream.avail_out);
        const std::uint8_t* from = m_stream.next_out;
        std::memcpy(m_stream.next_out, m_stream.next_in, size);
        m_stream.next_in += size;
        m_stream.avail_in -= size;
        m_stream.next_out += size;
        m_stream.avail_out -= size;
        CountDelivered(from);
    } while (m_stream.avail_out != 0);
}

void CDeflateCompressor::CountDelivered(const std::uint8_t* from) {
    const auto size = static_cast<std::uint32_t>(m_stream.next_out - from);
    m_crc = static_cast<std::uint32_t>(crc32(m_crc, from, size));
    m_uncompressedLeft -= size;
}

// One call of the inflater. False when it can get no further with what it has.
bool CDeflateCompressor::InflateStep() {
    const std::uint8_t* from = m_stream.next_out;
    const int result = inflate(&m_stream, Z_SYNC_FLUSH);
    CountDelivered(from);
    m_finished = result == Z_STREAM_END;
    if (m_finished) return true;
    if (result == Z_BUF_ERROR || result == Z_NEED_DICT) return false;
    CheckLibraryResult(result);
    return true;
}

void CDeflateCompressor::Inflate() {
    while (m_stream.avail_out != 0 && !m_finished) {
        FillInput();
        if (InflateStep()) continue;
        if (m_stream.avail_in != 0 || m_compressedLeft == 0) FinishInput();
    }
}

// The entry's bytes are used up ahead of its declared size: it is short, unless its stream waits only for a
// byte that was never meant to be there.
void CDeflateCompressor::FinishInput() {
    InflateDummy();
    m_finished = true;
}

// Some inflaters want one byte beyond a raw stream before they see its end. It serves them alone: with no
// room for output nothing can come of it. (zlib.h, up to 1.2.3: "an extra dummy byte")
bool CDeflateCompressor::InflateDummy() {
    Bytef dummy = 0;
    Bytef nowhere = 0;
    Bytef* const out = std::exchange(m_stream.next_out, &nowhere);
    const uInt room = std::exchange(m_stream.avail_out, 0);
    m_stream.next_in = &dummy;
    m_stream.avail_in = 1;
    const int result = inflate(&m_stream, Z_SYNC_FLUSH);
    m_stream.next_out = out;
    m_stream.avail_out = room;
    m_stream.avail_in = 0;
    return result == Z_STREAM_END;
}

// All declared bytes have been delivered, and one more is asked for: the stream must end here.
void CDeflateCompressor::LetStreamEnd() {
    while (FillInput() && InflateStep() && !m_finished && m_stream.avail_in == 0) continue;
    if (m_finished || !m_options.verifyStreamEnd) return;
    m_finished = inflate(&m_stream, Z_SYNC_FLUSH) == Z_STREAM_END ||
                 (m_stream.avail_in == 0 && m_compressedLeft == 0 && InflateDummy());
    if (!m_finished) Raise(CZipException::badStructure);
}

void CDeflateCompressor::EndDecompression(bool afterException) {
    if (!afterException && std::exchange(m_library, Library::closed) == Library::inflating)
        CheckLibraryResult(inflateEnd(&m_stream));
    ReleaseLibrary();
    m_buffer.Release();
}

// Tracked allocations are simply freed, whatever state the library has left them in.
void CDeflateCompressor::ReleaseLibrary() {
    const Library library = std::exchange(m_library, Library::closed);
    if (m_stream.opaque == nullptr) {
        if (library == Library::deflating) deflateEnd(&m_stream);
        if (library == Library::inflating) inflateEnd(&m_stream);
    }
    FreeAllocations();
    m_stream = {};
}

int CDeflateCompressor::MapLibraryResult(int result) const {
    switch (result) {
        case Z_VERSION_ERROR:
            return CZipException::zlibRelease;
        case Z_BUF_ERROR:
            return CZipException::zlibBuffer;
        case Z_MEM_ERROR:
            return CZipException::zlibMemory;
        case Z_DATA_ERROR:
            return CZipException::zlibData;
        case Z_STREAM_ERROR:
            return CZipException::zlibStream;
        case Z_ERRNO:
            return CZipException::zlibErrno;
        case Z_STREAM_END:
            return CZipException::zlibStreamEnd;
        case Z_NEED_DICT:
            return CZipException::zlibNeedDictionary;
        default:
            return CZipException::generic;
    }
}

bool CDeflateCompressor::IsResultAcceptable(int result) const {
    return result == Z_OK || result == Z_NEED_DICT;
}

}  // namespace ZipArchiveLib
