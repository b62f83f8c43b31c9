#include "zip/central_directory.h"

#include "zip/exception.h"
#include "zip/growth.h"
#include "zip/storage.h"

void CZipCentralDir::Raise(int code) const { CZipException::Raise(code, m_storage->GetArchivePath()); }

void CZipCentralDir::Init(CZipStorage& storage, CZipCallbacks& callbacks, CZipStringSettings& settings) {
    m_storage = &storage;
    m_callbacks = &callbacks;
    m_settings = &settings;
    Close();
    m_ignoredChecks = CZipChecks::ignoredAtFirst;
}

void CZipCentralDir::Close() {
    m_open = nullptr;
    m_findArray.clear();
    m_headers.clear();
    m_info = std::make_shared<CZipDirectoryInfo>();
}

void CZipCentralDir::OpenEntry(std::uint16_t index) {
    CZipFileHeader& header = GetHeader(index);
    if (!header.CheckLocal(*m_storage, m_ignoredChecks)) Raise(CZipException::badStructure);
    m_open = &header;
}

void CZipCentralDir::CloseEntry(bool checkDescriptor, std::uint32_t unread) {
    CZipFileHeader* header = m_open;
    m_open = nullptr;
    if (!checkDescriptor || (m_ignoredChecks & CZipChecks::descriptor) != 0 || !header->HasDataDescriptor())
        return;
    if (unread != 0) m_storage->Seek(unread, CZipAbstractFile::current);
    if (!header->CheckDescriptor(*m_storage)) Raise(CZipException::badStructure);
}

void CZipCentralDir::RemoveFromDisk() {
    if (!m_info->existsOnDisk) return;
    if (m_storage->IsSegmented()) Raise(CZipException::generic);
    m_storage->Truncate(m_info->directoryOffset);
    m_info->existsOnDisk = false;
}

CZipFileHeader& CZipCentralDir::Insert(const CZipFileHeader& header, std::uint16_t replaced) {
    const bool replaces = IsValidIndex(replaced);
    auto copy = std::make_unique<CZipFileHeader>(header);
    if (replaces) {
        m_findArray.clear();
        m_headers[replaced] = std::move(copy);
        return *m_headers[replaced];
    }
    CZipFileHeader& added = *ZipArchiveLib::PushBack(m_headers, std::move(copy), m_storage->GetArchivePath());
    if (m_info->findFastEnabled) InsertIntoFindArray(static_cast<std::uint16_t>(m_headers.size() - 1));
    return added;
}

CZipFileHeader& CZipCentralDir::AddNewEntry(const CZipFileHeader& header, std::uint16_t replaced, int level) {
    RemoveFromDisk();
    CZipFileHeader prepared = header;
    prepared.Prepare(level, m_storage->IsSegmented());
    if (IsValidIndex(replaced)) {
        MakeRoom(replaced, std::uint64_t{prepared.GetLocalRecordSize(*m_storage)} +
                               header.GetCompressedSize() +
                               CZipEncryption::Overhead(prepared.GetEncryptionMethod()) +
                               prepared.GetDescriptorSize(false));
    } else if (!m_storage->IsSegmented()) {
        m_storage->SeekToEnd();
    }
    m_open = &Insert(prepared, replaced);
    m_open->WriteLocal(*m_storage);
    return *m_open;
}

CZipFileHeader& CZipCentralDir::AddCopiedEntry(const CZipFileHeader& header, std::uint16_t replaced) {
    RemoveFromDisk();
    CZipFileHeader prepared = header;
    prepared.PrepareCopy(m_storage->IsSegmented());
    if (IsValidIndex(replaced)) {
        MakeRoom(replaced, std::uint64_t{prepared.GetLocalRecordSize(*m_storage)} +
                               header.GetCompressedSize() + prepared.GetDescriptorSize(false));
    } else if (!m_storage->IsSegmented()) {
        m_storage->SeekToEnd();
    }
    m_open = &Insert(prepared, replaced);
    m_open->WriteLocal(*m_storage);
    return *m_open;
}

void CZipCentralDir::CloseNewEntry(bool afterException) {
    CZipFileHeader* header = m_open;
    m_open = nullptr;
    m_info->existsOnDisk = false;
    if (afterException || header == nullptr) return;
    if (header->HasDataDescriptor())
        header->WriteDescriptor(*m_storage);
    else if (!m_storage->IsSegmented())
        header->UpdateLocal(*m_storage);
    m_storage->Flush();
}

void CZipCentralDir::RemoveLastEntry() {
    const std::uint32_t offset = m_headers.back()->GetOffset();
    m_open = nullptr;
    RemoveFromFindArray(static_cast<std::uint16_t>(m_headers.size() - 1), false);
    m_headers.pop_back();
    m_info->existsOnDisk = false;
    m_storage->Truncate(offset);
}

void CZipCentralDir::MakeRoom(std::uint16_t replaced, std::uint64_t size) {
    const bool isLast = replaced + std::size_t{1} == m_headers.size();
    const std::uint32_t begin = m_headers[replaced]->GetOffset();
    m_storage->Flush();
    const std::uint32_t end = m_storage->GetLength();
    if (isLast) return m_storage->Truncate(begin);
    const std::uint32_t next = m_headers[replaced + std::size_t{1}]->GetOffset();
    const std::int64_t distance = static_cast<std::int64_t>(begin + size) - next;
    MoveBytes(next, end, distance);
    for (std::size_t i = replaced + std::size_t{1}; i < m_headers.size(); ++i) {
        CZipFileHeader& moved = *m_headers[i];
        moved.SetPlace(moved.GetDiskStart(), static_cast<std::uint32_t>(moved.GetOffset() + distance));
    }
    m_storage->Seek(begin);
}
