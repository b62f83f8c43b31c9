#include "zip/file_helpers.h"
#include "zip/zip_archive.h"

bool CZipArchive::IsSupported(std::uint16_t method) const {
    return method == CZipFileHeader::stored || method == CZipFileHeader::deflated ||
           method == CZipFileHeader::bzip2;
}

bool CZipArchive::OpenEntry(std::uint16_t index) {
    if (IsClosed() || !m_directory.IsValidIndex(index) || m_state != idle || m_storage.IsNewSegmented())
        return false;
    m_directory.OpenEntry(index);
    CZipFileHeader& header = m_directory.GetHeader(index);
    if (!IsSupported(header.GetMethod())) {
        m_directory.CloseEntry(false);
        return false;
    }
    BeginDecoding(header);
    MakeCompressor(header.GetMethod());
    m_compressor->BeginDecompression(header, m_cryptograph.get());
    m_state = reading;
    return true;
}

void CZipArchive::BeginDecoding(CZipFileHeader& header) {
    if (!header.IsEncrypted()) {
        m_cryptograph.reset();
        return;
    }
    MakeCryptograph(header.GetEncryptionMethod());
    if (m_password.GetSize() == 0 || !m_cryptograph->BeginDecode(m_password, header, m_storage))
        CZipException::Raise(CZipException::badPassword, m_storage.GetFilePath());
}

std::uint32_t CZipArchive::ReadEntry(void* buffer, std::uint32_t size) {
    if (m_state != reading || buffer == nullptr || size == 0) return 0;
    return m_compressor->Decompress(buffer, size);
}

int CZipArchive::CloseEntry(const char* targetPath, bool afterException) {
    if (m_state != reading) return 0;
    int result = 1;
    if (afterException) {
        m_compressor->EndDecompression(true);
        m_directory.CloseEntry(false);
    } else {
        CZipFileHeader& header = *m_directory.GetOpenHeader();
        if (m_compressor->GetUncompressedLeft() != 0)
            result = -1;
        else
            CheckCrc(header);
        const std::uint32_t unread = m_compressor->GetCompressedLeft();
        m_compressor->EndDecompression(false);
        if (targetPath != nullptr && !DressTarget(targetPath, header)) result = -2;
        if (m_cryptograph) m_cryptograph->EndDecode(header, m_storage);
        m_directory.CloseEntry(true, unread);
    }
    m_state = idle;
    m_cryptograph.reset();
    return result;
}

void CZipArchive::CheckCrc(const CZipFileHeader& header) const {
    if ((m_directory.GetIgnoredChecks() & CZipChecks::crc) != 0 || header.IsAesVersion2()) return;
    if (m_compressor->GetCrc() != header.GetCrc())
        CZipException::Raise(CZipException::badCrc, m_storage.GetFilePath());
}

bool CZipArchive::DressTarget(const char* path, const CZipFileHeader& header) const {
    const bool timed = ZipArchiveLib::SetFileTime(m_environment, path, header.GetTime());
    return m_environment.names.set_attributes(path, header.GetAttributes()) && timed;
}
