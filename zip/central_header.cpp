#include <algorithm>
#include <array>

#include "zip/bytes.h"
#include "zip/exception.h"
#include "zip/file_header.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

using ZipArchiveLib::LoadNumber16;
using ZipArchiveLib::LoadNumber32;
using ZipArchiveLib::StoreNumber16;
using ZipArchiveLib::StoreNumber32;

bool CZipFileHeader::ReadCentral(CZipStorage& storage, const CZipStringSettings& settings,
                                 bool signatureRead) {
    std::array<std::uint8_t, k_centralSize> record;
    const std::uint32_t skipped = signatureRead ? sizeof k_centralSignature : 0;
    std::copy(std::begin(k_centralSignature), std::end(k_centralSignature), record.data());
    storage.Read(record.data() + skipped, k_centralSize - skipped, true);
    if (!std::equal(std::begin(k_centralSignature), std::end(k_centralSignature), record.data()))
        return false;
    const std::uint16_t volume = storage.GetCurrentVolume();

    m_madeByVersion = record[4];
    m_system = record[5];
    m_versionNeeded = LoadNumber16(&record[6]);
    m_flags = LoadNumber16(&record[8]);
    m_method = LoadNumber16(&record[10]);
    m_modificationTime = LoadNumber16(&record[12]);
    m_modificationDate = LoadNumber16(&record[14]);
    m_crc = LoadNumber32(&record[16]);
    m_compressedSize = LoadNumber32(&record[20]);
    m_uncompressedSize = LoadNumber32(&record[24]);
    m_diskStart = LoadNumber16(&record[34]);
    m_internalAttributes = LoadNumber16(&record[36]);
    m_externalAttributes = LoadNumber32(&record[38]);
    m_offset = LoadNumber32(&record[42]);
    m_encryptionMethod =
        (m_flags & k_encryptedFlag) != 0 ? CZipEncryption::traditional : CZipEncryption::none;

    m_fileName.reset();
    m_storedName.Allocate(LoadNumber16(&record[28]));
    storage.Read(m_storedName.GetBuffer(), m_storedName.GetSize(), true);
    m_nameCodePage = settings.nameCodePage == CZipStringSettings::defaultNameCodePage
                         ? CZipStringSettings::DefaultNameCodePage(m_system)
                         : settings.nameCodePage;
    if (settings.commentCodePage != 0) m_commentCodePage = settings.commentCodePage;

    CZipAutoBuffer extra(LoadNumber16(&record[30]));
    storage.Read(extra.GetBuffer(), extra.GetSize(), true);
    if (!m_centralExtra.Parse(extra.GetBuffer(), extra.GetSize()) || !ReadNamesRecord()) return false;
    ReadCentralAesRecord();

    m_comment.Allocate(LoadNumber16(&record[32]));
    storage.Read(m_comment.GetBuffer(), m_comment.GetSize(), true);
    return storage.GetCurrentVolume() == volume;
}

void CZipFileHeader::DropCentralRecords() {
    m_centralExtra.Remove(CZipExtraRecord::aes);
    m_centralExtra.Remove(CZipExtraRecord::names);
}

void CZipFileHeader::AddCentralRecords() {
    DropCentralRecords();
    WriteAesRecord(m_centralExtra);
    WriteNamesRecord();
}

std::uint32_t CZipFileHeader::GetCentralRecordSize(const CZipStorage& storage) {
    StoreName();
    AddCentralRecords();
    const std::uint64_t extraSize = m_centralExtra.GetTotalSize();
    DropCentralRecords();
    if (m_comment.GetSize() >= k_fieldLimit || m_storedName.GetSize() >= k_fieldLimit ||
        extraSize >= k_fieldLimit)
        CZipException::Raise(CZipException::fieldTooLong, storage.GetArchivePath());
    return k_centralSize + m_storedName.GetSize() + static_cast<std::uint32_t>(extraSize) +
           m_comment.GetSize();
}

void CZipFileHeader::WriteCentral(CZipStorage& storage) {
    CZipAutoBuffer record(GetCentralRecordSize(storage));
    AddCentralRecords();
    std::uint8_t* out = record.GetBuffer();
    std::copy(std::begin(k_centralSignature), std::end(k_centralSignature), out);
    out[4] = m_madeByVersion;
    out[5] = m_system;
    StoreNumber16(out + 6, m_versionNeeded);
    StoreNumber16(out + 8, m_flags);
    StoreNumber16(out + 10, GetWireMethod());
    StoreNumber16(out + 12, m_modificationTime);
    StoreNumber16(out + 14, m_modificationDate);
    StoreNumber32(out + 16, GetStoredCrc());
    StoreNumber32(out + 20, m_compressedSize);
    StoreNumber32(out + 24, m_uncompressedSize);
    StoreNumber16(out + 28, static_cast<std::uint16_t>(m_storedName.GetSize()));
    StoreNumber16(out + 30, static_cast<std::uint16_t>(m_centralExtra.GetTotalSize()));
    StoreNumber16(out + 32, static_cast<std::uint16_t>(m_comment.GetSize()));
    StoreNumber16(out + 34, m_diskStart);
    StoreNumber16(out + 36, m_internalAttributes);
    StoreNumber32(out + 38, m_externalAttributes);
    StoreNumber32(out + 42, m_offset);
    out = std::copy_n(m_storedName.GetBuffer(), m_storedName.GetSize(), out + k_centralSize);
    m_centralExtra.Store(out);
    out += m_centralExtra.GetTotalSize();
    std::copy_n(m_comment.GetBuffer(), m_comment.GetSize(), out);
    DropCentralRecords();
    storage.Write(record.GetBuffer(), record.GetSize(), true);
}
