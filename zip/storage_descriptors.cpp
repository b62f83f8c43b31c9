#include <cstring>

#include "zip/bytes.h"
#include "zip/file_helpers.h"
#include "zip/record_layout.h"
#include "zip/storage.h"

namespace {

using ZipArchiveLib::StoreNumber16;
using ZipArchiveLib::StoreNumber32;

// Moves the entries of a volume together and gives the volume's new size.
std::uint32_t CloseUp(std::uint8_t* bytes, std::uint32_t size, std::vector<CZipEntryExtent>& entries) {
    std::uint32_t removed = sizeof k_segmentSignature;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        CZipEntryExtent& entry = entries[i];
        const std::uint32_t next = i + 1 < entries.size() ? entries[i + 1].offset : size;
        std::uint32_t length = next - entry.offset;
        std::uint8_t* header = bytes + entry.offset;
        if (!entry.keepsDescriptor) {
            length -= CZipStorage::k_descriptorSize;
            entry.flags &= static_cast<std::uint16_t>(~k_descriptorFlag);
            StoreNumber16(header + k_localFlagsAt, entry.flags);
            StoreNumber32(header + k_localCrcAt, entry.crc);
            StoreNumber32(header + k_localCrcAt + 4, entry.compressedSize);
            StoreNumber32(header + k_localCrcAt + 8, entry.uncompressedSize);
        }
        std::memmove(header - removed, header, length);
        entry.offset -= removed;
        if (!entry.keepsDescriptor) removed += CZipStorage::k_descriptorSize;
    }
    return size - removed;
}

}  // namespace

bool CZipStorage::RemoveDataDescriptors(std::vector<CZipEntryExtent>& entries) {
    if (m_bytesWritten == 0) {
        m_bytesInBuffer = CloseUp(m_writeBuffer.GetBuffer(), m_bytesInBuffer, entries);
        return true;
    }
    Flush();
    const std::uint32_t size = m_file->GetLength();
    void* view = m_environment.files.map(m_internalFile.GetDescriptor(), size);
    if (view == nullptr) return false;
    const std::uint32_t left = CloseUp(static_cast<std::uint8_t*>(view), size, entries);
    m_environment.files.unmap(view, size);
    m_file->SetLength(left);
    m_file->SeekToEnd();
    m_bytesWritten = left;
    if (m_segmentation == spanned) m_freeSpace = ZipArchiveLib::GetFreeSpace(m_environment, Folder());
    return true;
}
