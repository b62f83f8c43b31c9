#include "zip/compressor.h"

#include <algorithm>

#include "zip/cryptograph.h"
#include "zip/exception.h"
#include "zip/file_header.h"
#include "zip/storage.h"

const CZipCompressor::COptions* CZipCompressor::GetOptions() const { return nullptr; }

void CZipCompressor::Raise(int code) const {
    CZipException::Raise(code, m_storage.IsClosed() ? std::string() : m_storage.GetFilePath());
}

void CZipCompressor::CheckLibraryResult(int result) const {
    if (!IsResultAcceptable(result)) Raise(MapLibraryResult(result));
}

void CZipCompressor::PrepareBuffer() {
    const COptions* options = GetOptions();
    const std::uint32_t size = options != nullptr ? options->bufferSize : 0;
    m_buffer.Allocate(size != 0 ? size : COptions::k_defaultBufferSize);
}

void CZipCompressor::BeginCompression(int /*level*/, CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareBuffer();
    m_header = &header;
    m_cryptograph = cryptograph;
    m_uncompressedLeft = m_compressedLeft = m_crc = 0;
}

void CZipCompressor::BeginDecompression(CZipFileHeader& header, CZipCryptograph* cryptograph) {
    PrepareBuffer();
    m_header = &header;
    m_cryptograph = cryptograph;
    m_compressedLeft = header.GetDataSize(m_storage.GetFilePath());
    m_uncompressedLeft = header.GetUncompressedSize();
    m_crc = 0;
}

std::uint32_t CZipCompressor::ReadBlock() {
    const std::uint32_t size = std::min(m_compressedLeft, m_buffer.GetSize());
    if (size == 0) return 0;
    m_storage.Read(m_buffer.GetBuffer(), size, false);
    if (m_cryptograph != nullptr) m_cryptograph->Decode(m_buffer.GetBuffer(), size);
    m_compressedLeft -= size;
    return size;
}

void CZipCompressor::WritePending() {
    if (m_compressedLeft == 0) return;
    if (m_cryptograph != nullptr) m_cryptograph->Encode(m_buffer.GetBuffer(), m_compressedLeft);
    m_storage.Write(m_buffer.GetBuffer(), m_compressedLeft, false);
    m_compressedLeft = 0;
}
