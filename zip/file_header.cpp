#include "zip/file_header.h"

#include "platform/code_page.h"
#include "platform/file_names.h"
#include "zip/attributes.h"
#include "zip/exception.h"
#include "zip/record_layout.h"
#include "zip/time_stamp.h"

using ZipArchiveLib::ConvertAttributes;
using ZipArchiveLib::IsValidSystem;
namespace SystemId = ZipArchiveLib::SystemId;
namespace file_attribute = vrl_platform::file_attribute;

CZipFileHeader::CZipFileHeader(const CZipFileHeader& other) { *this = other; }

CZipFileHeader& CZipFileHeader::operator=(const CZipFileHeader& other) {
    if (this == &other) return *this;
    m_madeByVersion = other.m_madeByVersion;
    m_system = other.m_system;
    m_versionNeeded = other.m_versionNeeded;
    m_flags = other.m_flags;
    m_method = other.m_method;
    m_modificationTime = other.m_modificationTime;
    m_modificationDate = other.m_modificationDate;
    m_crc = other.m_crc;
    m_compressedSize = other.m_compressedSize;
    m_uncompressedSize = other.m_uncompressedSize;
    m_diskStart = other.m_diskStart;
    m_internalAttributes = other.m_internalAttributes;
    m_localCompressedSize = other.m_localCompressedSize;
    m_localUncompressedSize = other.m_localUncompressedSize;
    m_offset = other.m_offset;
    m_localExtra = other.m_localExtra;
    m_centralExtra = other.m_centralExtra;
    m_externalAttributes = other.m_externalAttributes;
    m_localFileNameSize = other.m_localFileNameSize;
    m_encryptionMethod = other.m_encryptionMethod;
    m_aesVersion2 = other.m_aesVersion2;
    m_storedName = other.m_storedName;
    m_fileName = other.m_fileName ? std::make_unique<std::string>(*other.m_fileName) : nullptr;
    m_nameInExtra = other.m_nameInExtra;
    m_nameCodePage = other.m_nameCodePage;
    m_commentCodePage = other.m_commentCodePage;
    m_comment = other.m_comment;
    return *this;
}

bool CZipFileHeader::HasDataDescriptor() const { return (m_flags & k_descriptorFlag) != 0; }

std::uint32_t CZipFileHeader::GetDataSize(const std::string& archivePath) const {
    const std::uint32_t overhead = CZipEncryption::Overhead(m_encryptionMethod);
    if (m_compressedSize < overhead) CZipException::Raise(CZipException::badStructure, archivePath);
    return m_compressedSize - overhead;
}

void CZipFileHeader::SetPlace(std::uint16_t disk, std::uint32_t offset) {
    m_diskStart = disk;
    m_offset = offset;
}

void CZipFileHeader::SetStrings(const CZipStringSettings& settings) {
    GetFileName();
    m_nameInExtra = settings.storeNameInExtraData;
    m_nameCodePage = settings.nameCodePage;
    m_commentCodePage = settings.commentCodePage;
}

const std::string& CZipFileHeader::GetFileName() const {
    if (!m_fileName) {
        m_fileName = std::make_unique<std::string>(ZipArchiveLib::DecodeName(m_storedName, m_nameCodePage));
        m_storedName.Release();
    }
    return *m_fileName;
}

void CZipFileHeader::SetFileName(const std::string& name) {
    m_fileName = std::make_unique<std::string>(name);
    m_storedName.Release();
}

// The name as the records hold it. One whose true text travels in the extra field stands in the records
// as a reader takes it that knows nothing about that.
void CZipFileHeader::StoreName() {
    if (!m_fileName) return;
    const std::uint32_t page =
        m_nameInExtra ? CZipStringSettings::DefaultNameCodePage(m_system) : m_nameCodePage;
    const std::string encoded = ZipArchiveLib::EncodeName(*m_fileName, page);
    m_storedName.Assign(encoded.data(), static_cast<std::uint32_t>(encoded.size()));
    if (!m_nameInExtra) m_fileName.reset();
}

std::string CZipFileHeader::GetComment() const {
    return vrl_platform::convert_code_page(
        std::string(reinterpret_cast<const char*>(m_comment.GetBuffer()), m_comment.GetSize()),
        m_commentCodePage, vrl_platform::code_page::ansi);
}

void CZipFileHeader::SetComment(const std::string& comment) {
    const std::string encoded =
        vrl_platform::convert_code_page(comment, vrl_platform::code_page::ansi, m_commentCodePage);
    m_comment.Assign(encoded.data(), static_cast<std::uint32_t>(encoded.size()));
}

std::int64_t CZipFileHeader::GetTime() const {
    return ZipArchiveLib::TimeFromTimeStamp({m_modificationTime, m_modificationDate});
}

void CZipFileHeader::SetTime(std::int64_t time) {
    const ZipArchiveLib::TimeStamp stamp = ZipArchiveLib::TimeStampFromTime(time);
    m_modificationTime = stamp.time;
    m_modificationDate = stamp.date;
}

std::uint32_t CZipFileHeader::GetAttributes() const {
    const std::string& name = GetFileName();
    const bool namedAsFolder = !name.empty() && (name.back() == '\\' || name.back() == '/');
    if (!IsValidSystem(m_system)) return namedAsFolder ? file_attribute::folder : file_attribute::archive;
    const std::uint32_t word =
        m_system == SystemId::unix_ ? m_externalAttributes >> 16 : m_externalAttributes & 0xFFFF;
    if (word == 0 && namedAsFolder) return file_attribute::folder;
    return ConvertAttributes(word, m_system, SystemId::dos);
}

void CZipFileHeader::SetAttributes(std::uint32_t attributes) {
    const std::uint32_t mode = ConvertAttributes(attributes, SystemId::dos, SystemId::unix_);
    const std::uint32_t low = m_system == SystemId::unix_
                                  ? attributes & file_attribute::folder
                                  : ConvertAttributes(attributes, SystemId::dos, m_system) & 0xFFFF;
    m_externalAttributes = (mode << 16) | low;
}

bool CZipFileHeader::IsDirectory() const { return (GetAttributes() & file_attribute::folder) != 0; }

void CZipFileHeader::ConvertToSystem(std::uint8_t system) {
    if (system == m_system) return;
    const std::uint32_t attributes = GetAttributes();
    m_system = system;
    SetAttributes(attributes);
}
