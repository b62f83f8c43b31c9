#include <algorithm>

#include "zip/exception.h"
#include "zip/storage.h"

namespace {

constexpr int k_signatureSize = 4;

}  // namespace

std::int64_t CZipStorage::FindSignature(const std::uint8_t (&signature)[4], std::uint32_t distance) {
    return FindSignature(signature, distance, m_file->GetLength());
}

std::int64_t CZipStorage::FindSignature(const std::uint8_t (&signature)[4], std::uint32_t distance,
                                        std::uint32_t before) {
    const std::int64_t end = std::min(before, m_file->GetLength());
    return SearchBlocks(signature, end, std::max<std::int64_t>(end - distance, 0));
}

std::int64_t CZipStorage::SearchBlocks(const std::uint8_t (&signature)[4], std::int64_t end,
                                       std::int64_t stop) {
    CZipAutoBuffer buffer(m_searchBufferSize);
    int wanted = k_signatureSize - 1;
    while (end > stop) {
        const auto size = static_cast<std::uint32_t>(std::min<std::int64_t>(end - stop, m_searchBufferSize));
        end -= size;
        m_file->Seek(end, CZipAbstractFile::begin);
        if (m_file->Read(buffer.GetBuffer(), size) != size) Raise(CZipException::badStructure);
        for (std::uint32_t at = size; at-- > 0;) {
            const std::uint8_t byte = buffer.GetBuffer()[at];
            // No step back is needed after a mismatch: the signatures repeat none of their bytes.
            if (byte != signature[wanted]) wanted = k_signatureSize - 1;
            if (byte == signature[wanted] && wanted-- == 0) return end + at;
        }
    }
    return -1;
}
