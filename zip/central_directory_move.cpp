#include <algorithm>
#include <cerrno>

#include "zip/bytes.h"
#include "zip/central_directory.h"
#include "zip/exception.h"
#include "zip/storage.h"

// From the end that lies in the direction of the move, so that no byte is overwritten before it has been
// moved.
void CZipCentralDir::MoveBytes(std::uint32_t from, std::uint32_t end, std::int64_t distance) {
    if (distance == 0 || from >= end) return;
    if (static_cast<std::int64_t>(end) + distance + m_storage->GetBytesBefore() >
        static_cast<std::int64_t>(ZipArchiveLib::k_largestNumber))
        Raise(EFBIG);
    CZipAutoBuffer buffer(std::min(m_copyBufferSize, end - from));
    if (distance > 0) {
        for (std::uint32_t behind = end; behind > from;) {
            const std::uint32_t size = std::min(buffer.GetSize(), behind - from);
            behind -= size;
            MoveBlock(behind, size, distance, buffer);
        }
        return;
    }
    for (std::uint32_t at = from; at < end;) {
        const std::uint32_t size = std::min(buffer.GetSize(), end - at);
        MoveBlock(at, size, distance, buffer);
        at += size;
    }
    m_storage->Truncate(static_cast<std::uint32_t>(end + distance));
}

void CZipCentralDir::MoveBlock(std::uint32_t from, std::uint32_t size, std::int64_t distance,
                               CZipAutoBuffer& buffer) {
    m_storage->Seek(from);
    m_storage->Read(buffer.GetBuffer(), size, true);
    m_storage->Seek(static_cast<std::uint32_t>(from + distance));
    m_storage->Write(buffer.GetBuffer(), size, true);
    m_storage->Flush();
    const auto callback = m_callbacks->find(CZipCallbackType::moveData);
    if (callback == m_callbacks->end() || callback->second->Advance(size)) return;
    // Some entries have moved and others not: there is no way back.
    Raise(CZipException::stoppedUnfinished);
}
