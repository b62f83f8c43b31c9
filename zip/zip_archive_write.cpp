#include <algorithm>

#include "zip/file_helpers.h"
#include "zip/zip_archive.h"

namespace {

constexpr int k_defaultLevel = -1;
constexpr int k_strongestLevel = 9;

}  // namespace

bool CZipArchive::CanBeginEntry(std::uint16_t replacedIndex) const {
    if (IsClosed() || m_state != idle || m_storage.IsReadOnly()) return false;
    if (m_storage.IsSegmented() && !m_storage.IsNewSegmented()) return false;
    if (GetCount() == CZipCentralDir::k_mostEntries) return false;
    if (replacedIndex == k_noIndex) return true;
    return m_directory.IsValidIndex(replacedIndex) && !m_storage.IsSegmented();
}

bool CZipArchive::OpenNewEntry(const CZipFileHeader& given, int level, const char* sourcePath,
                               std::uint16_t replacedIndex) {
    if (!CanBeginEntry(replacedIndex)) return false;
    CZipFileHeader header = given;
    if (sourcePath != nullptr) {
        const auto attributes = m_environment.names.attributes(sourcePath);
        if (!attributes) return false;
        header.SetSystem(m_systemCompatibility);
        header.SetAttributes(*attributes);
        header.SetTime(ZipArchiveLib::GetFileTime(m_environment, sourcePath).time);
    } else {
        header.SetSystem(m_systemCompatibility);
        if (header.GetModificationTime() == 0 && header.GetModificationDate() == 0)
            header.SetTime(m_environment.clock.now());
    }
    header.SetStrings(m_stringSettings);

    const bool isFolder = header.IsDirectory();
    std::string name = header.GetFileName();
    if (isFolder && (name.empty() || (name.back() != '\\' && name.back() != '/'))) name += '\\';
    if (name.empty()) name = "file" + std::to_string(GetCount());
    header.SetFileName(name);

    if (level < k_defaultLevel || level > k_strongestLevel) level = k_defaultLevel;
    const bool enciphers = m_password.GetSize() != 0 && m_encryptionMethod != CZipEncryption::none;
    header.SetEncryptionMethod(enciphers ? m_encryptionMethod : CZipEncryption::none);
    MakeCryptograph(header.GetEncryptionMethod());
    header.SetMethod(level == 0 || isFolder ? CZipFileHeader::stored : m_compressionMethod);
    MakeCompressor(header.GetMethod());

    CZipFileHeader& added = m_directory.AddNewEntry(header, replacedIndex, level);
    if (m_cryptograph) m_cryptograph->BeginEncode(m_password, added, m_storage);
    m_compressor->BeginCompression(level, added, m_cryptograph.get());
    m_state = writing;
    return true;
}

bool CZipArchive::WriteNewEntry(const void* buffer, std::uint32_t size) {
    if (m_state != writing) return false;
    if (size != 0) m_compressor->Compress(buffer, size);
    return true;
}

bool CZipArchive::CloseNewEntry(bool afterException) {
    if (m_state != writing) return false;
    m_compressor->EndCompression(afterException);
    if (!afterException && m_cryptograph) m_cryptograph->EndEncode(*m_directory.GetOpenHeader(), m_storage);
    m_directory.CloseNewEntry(afterException);
    m_state = idle;
    m_cryptograph.reset();
    if (!afterException && m_autoFlush && !m_storage.IsSegmented()) {
        m_directory.Write();
        m_storage.Flush();
    }
    return true;
}

bool CZipArchive::CopyEntryFrom(CZipArchive& source, std::uint16_t index, const std::string& name,
                                std::uint16_t replacedIndex, bool keepSystem) {
    if (&source == this || source.IsClosed() || source.m_state != idle || !CanBeginEntry(replacedIndex))
        return false;
    if (!source.m_directory.IsValidIndex(index) || source.m_storage.IsNewSegmented() || m_copyBufferSize == 0)
        return false;
    source.m_directory.OpenEntry(index);
    CZipFileHeader header = source.m_directory.GetHeader(index);
    if (!name.empty()) header.SetFileName(name);
    if (!keepSystem) header.ConvertToSystem(m_systemCompatibility);

    m_directory.AddCopiedEntry(header, replacedIndex);
    m_copyBuffer.Allocate(m_copyBufferSize);
    for (std::uint32_t left = header.GetCompressedSize(); left != 0;) {
        const std::uint32_t size = std::min(left, m_copyBuffer.GetSize());
        source.m_storage.Read(m_copyBuffer.GetBuffer(), size, false);
        m_storage.Write(m_copyBuffer.GetBuffer(), size, false);
        left -= size;
    }
    m_copyBuffer.Release();
    source.m_directory.CloseEntry(false);
    m_directory.CloseNewEntry(false);
    return true;
}
