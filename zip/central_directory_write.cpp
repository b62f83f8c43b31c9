#include <algorithm>
#include <array>
#include <cerrno>

#include "zip/bytes.h"
#include "zip/central_directory.h"
#include "zip/exception.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

using ZipArchiveLib::StoreNumber16;
using ZipArchiveLib::StoreNumber32;

std::uint64_t CZipCentralDir::GetDirectorySize() {
    std::uint64_t size = 0;
    for (const auto& header : m_headers) size += header->GetCentralRecordSize(*m_storage);
    return size;
}

void CZipCentralDir::Write() {
    if (m_info->existsOnDisk) return;
    if (m_info->comment.GetSize() >= k_fieldLimit) Raise(CZipException::fieldTooLong);
    m_info->totalEntries = GetCount();
    bool madeSingle = false;
    if (m_storage->IsSegmented()) {
        const std::uint64_t needed = GetDirectorySize() + k_endSize + m_info->comment.GetSize();
        if (needed > ZipArchiveLib::k_largestNumber) Raise(EFBIG);
        madeSingle = m_storage->GetCurrentVolume() == 0 && TryMakeSingleVolume(needed);
        if (!madeSingle) m_storage->AssureFree(static_cast<std::uint32_t>(needed));
    } else {
        m_storage->SeekToEnd();
    }
    try {
        WriteHeaders();
        WriteEndRecord();
        if (madeSingle && m_storage->GetCurrentVolume() != 0) Raise(CZipException::badStructure);
    } catch (...) {
        if (madeSingle) EndSingleVolume();
        throw;
    }
    m_info->existsOnDisk = true;
}

// The failure that has led here is the one to tell; another one on the way adds nothing.
void CZipCentralDir::EndSingleVolume() {
    m_info->thisDisk = 0;
    try {
        m_storage->FinishSplit();
    } catch (const CZipException&) {
        m_info->existsOnDisk = false;
    }
}

bool CZipCentralDir::TryMakeSingleVolume(std::uint64_t needed) {
    std::vector<CZipEntryExtent> entries;
    std::uint64_t given = sizeof k_segmentSignature;
    for (const auto& header : m_headers) {
        const bool keeps = header->GetEncryptionMethod() == CZipEncryption::traditional;
        entries.push_back({header->GetOffset(), header->GetFlags(), header->GetStoredCrc(),
                           header->GetCompressedSize(), header->GetUncompressedSize(), keeps});
        if (!keeps) given += CZipStorage::k_descriptorSize;
    }
    if (needed > m_storage->GetFreeVolumeSpace() + given) return false;
    if (!m_storage->RemoveDataDescriptors(entries)) return false;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        m_headers[i]->SetPlace(0, entries[i].offset);
        m_headers[i]->SetFlags(entries[i].flags);
    }
    return true;
}

void CZipCentralDir::WriteHeaders() {
    m_info->thisDisk = m_storage->GetCurrentVolume();
    m_info->directoryDisk = m_info->thisDisk;
    m_info->directoryOffset = m_storage->GetPosition();
    m_info->directorySize = 0;
    m_info->entriesOnThisDisk = 0;
    for (const auto& header : m_headers) {
        const std::uint32_t size = header->GetCentralRecordSize(*m_storage);
        header->WriteCentral(*m_storage);
        m_info->directorySize += size;
        ++m_info->entriesOnThisDisk;
        if (m_storage->GetCurrentVolume() == m_info->thisDisk) continue;
        m_info->thisDisk = m_storage->GetCurrentVolume();
        m_info->entriesOnThisDisk = 1;
        if (header != m_headers.front()) continue;
        m_info->directoryDisk = m_info->thisDisk;
        m_info->directoryOffset = m_storage->GetPosition() - size;
    }
}

void CZipCentralDir::WriteEndRecord() {
    const std::uint32_t size = k_endSize + m_info->comment.GetSize();
    m_storage->AssureFree(size);
    if (m_storage->GetCurrentVolume() != m_info->thisDisk) {
        m_info->thisDisk = m_storage->GetCurrentVolume();
        m_info->entriesOnThisDisk = 0;
        if (m_headers.empty()) {
            m_info->directoryDisk = m_info->thisDisk;
            m_info->directoryOffset = m_storage->GetPosition();
        }
    }
    CZipAutoBuffer record(size);
    std::uint8_t* out = record.GetBuffer();
    std::copy(std::begin(k_endSignature), std::end(k_endSignature), out);
    StoreNumber16(out + 4, m_info->thisDisk);
    StoreNumber16(out + 6, m_info->directoryDisk);
    StoreNumber16(out + 8, m_info->entriesOnThisDisk);
    StoreNumber16(out + 10, m_info->totalEntries);
    StoreNumber32(out + 12, m_info->directorySize);
    StoreNumber32(out + 16, m_info->directoryOffset);
    StoreNumber16(out + 20, static_cast<std::uint16_t>(m_info->comment.GetSize()));
    std::copy_n(m_info->comment.GetBuffer(), m_info->comment.GetSize(), out + k_endSize);
    const std::uint32_t position = m_storage->GetPosition();
    m_storage->Write(record.GetBuffer(), size, true);
    m_info->endRecordPosition = position;
}
