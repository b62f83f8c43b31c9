#include <algorithm>
#include <array>
#include <cstring>

#include "zip/bytes.h"
#include "zip/exception.h"
#include "zip/file_header.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

using ZipArchiveLib::LoadNumber16;
using ZipArchiveLib::LoadNumber32;
using ZipArchiveLib::StoreNumber16;
using ZipArchiveLib::StoreNumber32;

namespace {

constexpr std::uint8_t k_writerVersion = 46;
constexpr std::uint16_t k_comparedFlags = 0x0F;

// What deflate's levels tell about themselves. (APPNOTE 4.4.4, bits 1 and 2)
std::uint16_t DeflateFlags(int level) {
    switch (level) {
        case 1:
            return 6;
        case 2:
            return 4;
        case 8:
        case 9:
            return 2;
        default:
            return 0;
    }
}

}  // namespace

bool CZipFileHeader::CheckLocal(CZipStorage& storage, std::uint32_t ignoredChecks) {
    storage.ChangeVolume(m_diskStart);
    const std::uint16_t volume = storage.GetCurrentVolume();
    storage.Seek(m_offset);
    std::array<std::uint8_t, k_localSize> record;
    storage.Read(record.data(), k_localSize, true);
    if (!std::equal(std::begin(k_localSignature), std::end(k_localSignature), record.data())) return false;

    const std::uint16_t flags = LoadNumber16(&record[k_localFlagsAt]);
    const bool flagsAgree = ((flags ^ m_flags) & k_comparedFlags) == 0;
    if ((ignoredChecks & CZipChecks::flags) == 0 && !flagsAgree) return false;

    m_localFileNameSize = LoadNumber16(&record[26]);
    storage.Seek(m_localFileNameSize, CZipAbstractFile::current);
    CZipAutoBuffer extra(LoadNumber16(&record[28]));
    storage.Read(extra.GetBuffer(), extra.GetSize(), false);
    if (!m_localExtra.Parse(extra.GetBuffer(), extra.GetSize())) return false;

    std::uint16_t method = LoadNumber16(&record[8]);
    if (!CheckLocalAesRecord(flags, method)) return false;
    if ((ignoredChecks & CZipChecks::method) == 0 && method != m_method) return false;
    return CheckLocalNumbers(record.data(), ignoredChecks) && storage.GetCurrentVolume() == volume;
}

bool CZipFileHeader::CheckLocalNumbers(const std::uint8_t* record, std::uint32_t ignoredChecks) {
    const std::uint32_t crc = LoadNumber32(record + k_localCrcAt);
    m_localCompressedSize = LoadNumber32(record + k_localCrcAt + 4);
    m_localUncompressedSize = LoadNumber32(record + k_localCrcAt + 8);
    if (HasDataDescriptor() || (ignoredChecks & (CZipChecks::sizes | CZipChecks::localCrc)) != 0) return true;
    return crc == m_crc && (m_localCompressedSize == 0 || m_localCompressedSize == m_compressedSize) &&
           m_localUncompressedSize == m_uncompressedSize;
}

bool CZipFileHeader::CheckDescriptor(CZipStorage& storage) const {
    std::array<std::uint8_t, CZipStorage::k_descriptorSize> record;
    constexpr std::uint32_t signatureSize = sizeof k_segmentSignature;
    storage.Read(record.data(), signatureSize, false);
    // The signature is not required of a writer. (APPNOTE 4.3.9.3)
    const bool isSigned =
        std::equal(std::begin(k_segmentSignature), std::end(k_segmentSignature), record.data());
    std::uint8_t* numbers = record.data() + signatureSize;
    if (isSigned) {
        storage.Read(numbers, 12, false);
    } else {
        std::memcpy(numbers, record.data(), signatureSize);
        storage.Read(numbers + signatureSize, 8, false);
    }
    return LoadNumber32(numbers) == GetStoredCrc() && LoadNumber32(numbers + 4) == m_compressedSize &&
           LoadNumber32(numbers + 8) == m_uncompressedSize;
}

void CZipFileHeader::SetVersionNeeded() {
    m_madeByVersion = k_writerVersion;
    if (m_method == bzip2)
        m_versionNeeded = 46;
    else
        m_versionNeeded = IsDirectory() ? 10 : 20;
}

void CZipFileHeader::Prepare(int level, bool segmented) {
    m_internalAttributes = 0;
    SetVersionNeeded();
    m_aesVersion2 = IsAes() && m_uncompressedSize < aesVersion2Below;
    m_localCompressedSize = m_compressedSize;
    m_localUncompressedSize = m_uncompressedSize;
    m_crc = m_compressedSize = m_uncompressedSize = 0;
    m_flags = m_method == deflated ? DeflateFlags(level) : 0;
    if (segmented || m_encryptionMethod == CZipEncryption::traditional) m_flags |= k_descriptorFlag;
    if (IsEncrypted()) m_flags |= k_encryptedFlag;
}

void CZipFileHeader::PrepareCopy(bool segmented) {
    m_internalAttributes = 0;
    SetVersionNeeded();
    // WriteLocal adds the encryption header, which these sizes have already.
    m_localCompressedSize = m_compressedSize - CZipEncryption::HeaderSize(m_encryptionMethod);
    m_localUncompressedSize = m_uncompressedSize;
    // Traditional encryption tells by this bit what its last header byte is checked against.
    if (m_encryptionMethod == CZipEncryption::traditional) return;
    m_flags =
        static_cast<std::uint16_t>(segmented ? m_flags | k_descriptorFlag : m_flags & ~k_descriptorFlag);
}

std::uint32_t CZipFileHeader::GetLocalRecordSize(const CZipStorage& storage) {
    StoreName();
    CZipExtraField extra = m_localExtra;
    WriteAesRecord(extra);
    const std::uint64_t extraSize = extra.GetTotalSize();
    if (m_storedName.GetSize() >= k_fieldLimit || extraSize >= k_fieldLimit)
        CZipException::Raise(CZipException::fieldTooLong, storage.GetArchivePath());
    return k_localSize + m_storedName.GetSize() + static_cast<std::uint32_t>(extraSize);
}

void CZipFileHeader::WriteLocal(CZipStorage& storage) {
    if (HasDataDescriptor()) {
        m_localCompressedSize = 0;
        if (!IsAes()) m_localUncompressedSize = 0;
    } else {
        m_localCompressedSize += CZipEncryption::HeaderSize(m_encryptionMethod);
    }
    CZipAutoBuffer record(GetLocalRecordSize(storage));
    const std::uint32_t nameSize = m_storedName.GetSize();
    CZipExtraField extra = m_localExtra;
    WriteAesRecord(extra);

    std::uint8_t* out = record.GetBuffer();
    std::copy(std::begin(k_localSignature), std::end(k_localSignature), out);
    StoreNumber16(out + 4, m_versionNeeded);
    StoreNumber16(out + k_localFlagsAt, m_flags);
    StoreNumber16(out + 8, GetWireMethod());
    StoreNumber16(out + 10, m_modificationTime);
    StoreNumber16(out + 12, m_modificationDate);
    StoreNumber32(out + k_localCrcAt, GetStoredCrc());
    StoreNumber32(out + k_localCrcAt + 4, m_localCompressedSize);
    StoreNumber32(out + k_localCrcAt + 8, m_localUncompressedSize);
    StoreNumber16(out + 26, static_cast<std::uint16_t>(nameSize));
    StoreNumber16(out + 28, static_cast<std::uint16_t>(extra.GetTotalSize()));
    std::copy_n(m_storedName.GetBuffer(), nameSize, out + k_localSize);
    extra.Store(out + k_localSize + nameSize);

    storage.Write(record.GetBuffer(), record.GetSize(), true);
    m_localFileNameSize = static_cast<std::uint16_t>(nameSize);
    SetPlace(storage.GetCurrentVolume(), storage.GetPosition() - record.GetSize());
}

void CZipFileHeader::UpdateLocal(CZipStorage& storage) {
    m_localCompressedSize = m_compressedSize;
    m_localUncompressedSize = m_uncompressedSize;
    std::array<std::uint8_t, 12> numbers;
    StoreNumber32(numbers.data(), GetStoredCrc());
    StoreNumber32(&numbers[4], m_localCompressedSize);
    StoreNumber32(&numbers[8], m_localUncompressedSize);
    storage.Flush();
    const std::uint32_t position = storage.GetPosition();
    storage.Seek(m_offset + k_localCrcAt);
    storage.Write(numbers.data(), numbers.size(), true);
    storage.Flush();
    storage.Seek(position);
}

std::uint32_t CZipFileHeader::GetDescriptorSize(bool segmented) const {
    if (!HasDataDescriptor()) return 0;
    return segmented || IsEncrypted() ? CZipStorage::k_descriptorSize : 12;
}

void CZipFileHeader::WriteDescriptor(CZipStorage& storage) const {
    const std::uint32_t size = GetDescriptorSize(storage.IsSegmented());
    std::array<std::uint8_t, CZipStorage::k_descriptorSize> record;
    std::copy(std::begin(k_segmentSignature), std::end(k_segmentSignature), record.data());
    StoreNumber32(&record[4], GetStoredCrc());
    StoreNumber32(&record[8], m_compressedSize);
    StoreNumber32(&record[12], m_uncompressedSize);
    storage.Write(record.data() + record.size() - size, size, true);
}
