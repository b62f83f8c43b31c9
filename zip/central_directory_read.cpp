#include <algorithm>
#include <array>

#include "zip/bytes.h"
#include "zip/central_directory.h"
#include "zip/exception.h"
#include "zip/growth.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

using ZipArchiveLib::LoadNumber16;
using ZipArchiveLib::LoadNumber32;

namespace {

constexpr std::uint32_t k_signatureSize = 4;
constexpr std::uint16_t k_zip64Count = 0xFFFF;
constexpr std::uint32_t k_zip64Number = 0xFFFFFFFF;

}  // namespace

void CZipCentralDir::Read(bool exhaustive) {
    ReadEndRecord();
    RefuseZip64();
    m_storage->SetLastVolume(m_info->thisDisk);
    LocateDirectory();
    m_info->existsOnDisk = true;
    m_storage->ChangeVolume(m_info->directoryDisk);
    if (m_info->directorySize != 0) ReadHeaders(exhaustive);
}

void CZipCentralDir::ReadEndRecord() {
    const std::int64_t position = m_storage->FindSignature(k_endSignature, k_searchDistance);
    if (position < 0) Raise(CZipException::badStructure);
    m_info->endRecordPosition = static_cast<std::uint32_t>(position);
    m_storage->Seek(m_info->endRecordPosition + k_signatureSize);
    std::array<std::uint8_t, k_endSize - k_signatureSize> record;
    m_storage->Read(record.data(), record.size(), true);
    m_info->thisDisk = LoadNumber16(record.data());
    m_info->directoryDisk = LoadNumber16(&record[2]);
    m_info->entriesOnThisDisk = LoadNumber16(&record[4]);
    m_info->totalEntries = LoadNumber16(&record[6]);
    m_info->directorySize = LoadNumber32(&record[8]);
    m_info->directoryOffset = LoadNumber32(&record[12]);
    m_info->comment.Allocate(LoadNumber16(&record[16]));
    m_storage->Read(m_info->comment.GetBuffer(), m_info->comment.GetSize(), true);
}

// Numbers that say "look into the ZIP64 record" are ordinary ones where there is no such record.
// (APPNOTE 4.4.1.4)
void CZipCentralDir::RefuseZip64() const {
    const bool suspicious = m_info->entriesOnThisDisk == k_zip64Count ||
                            m_info->totalEntries == k_zip64Count || m_info->directorySize == k_zip64Number ||
                            m_info->directoryOffset == k_zip64Number;
    if (!suspicious) return;
    const std::uint32_t end = m_info->endRecordPosition;
    if (m_storage->FindSignature(k_zip64LocatorSignature, end, end) >= 0) Raise(CZipException::zip64);
}

void CZipCentralDir::LocateDirectory() {
    const std::uint64_t pastDirectory = std::uint64_t{m_info->directoryOffset} + m_info->directorySize;
    if (!m_storage->IsSegmented()) {
        if (m_info->endRecordPosition < pastDirectory) Raise(CZipException::badStructure);
        if (m_storage->GetBytesBefore() == 0 && m_info->thisDisk == 0)
            m_storage->SetBytesBefore(static_cast<std::uint32_t>(m_info->endRecordPosition - pastDirectory));
    }
    if ((m_info->directorySize == 0) != (m_info->totalEntries == 0)) Raise(CZipException::badStructure);
}

void CZipCentralDir::ReadHeaders(bool exhaustive) {
    m_storage->Seek(m_info->directoryOffset);
    for (unsigned i = 0; i < m_info->totalEntries; ++i)
        if (!ReadHeader(false)) Raise(CZipException::badStructure);
    if (exhaustive) ReadSurplusHeaders();
    SortHeaders();
    if (m_info->findFastEnabled) BuildFindArray(m_info->findCaseSensitive);
}

bool CZipCentralDir::ReadHeader(bool signatureRead) {
    ZipArchiveLib::PushBack(m_headers, std::make_unique<CZipFileHeader>(), m_storage->GetArchivePath());
    return m_headers.back()->ReadCentral(*m_storage, *m_settings, signatureRead);
}

void CZipCentralDir::ReadSurplusHeaders() {
    const std::uint32_t before = m_storage->GetCurrentVolume() == 0 ? m_storage->GetBytesBefore() : 0;
    while (m_headers.size() < k_mostEntries &&
           m_storage->GetPosition() + before != m_info->endRecordPosition) {
        std::array<std::uint8_t, k_signatureSize> signature;
        m_storage->Read(signature.data(), k_signatureSize, true);
        if (!std::equal(signature.begin(), signature.end(), std::begin(k_centralSignature))) return;
        if (!ReadHeader(true)) Raise(CZipException::badStructure);
    }
}

void CZipCentralDir::SortHeaders() {
    const auto isBefore = [](const auto& first, const auto& second) {
        if (first->GetDiskStart() != second->GetDiskStart())
            return first->GetDiskStart() < second->GetDiskStart();
        return first->GetOffset() < second->GetOffset();
    };
    std::sort(m_headers.begin(), m_headers.end(), isBefore);
    const auto samePlace =
        std::adjacent_find(m_headers.begin(), m_headers.end(),
                           [&](const auto& first, const auto& second) { return !isBefore(first, second); });
    if (samePlace != m_headers.end()) Raise(CZipException::badStructure);
}
