#include "zip/base_lib_compressor.h"

#include <algorithm>
#include <cerrno>
#include <cstdint>
#include <cstdlib>
#include <new>

#include "zip/bytes.h"
#include "zip/file_header.h"

namespace ZipArchiveLib {

bool CBaseLibCompressor::TracksAllocations() const {
    const auto* options = dynamic_cast<const COptions*>(GetOptions());
    return options != nullptr && options->trackLibraryAllocations;
}

void* CBaseLibCompressor::GetOpaque() { return TracksAllocations() ? this : nullptr; }

void* CBaseLibCompressor::AllocateFor(void* opaque, std::size_t items, std::size_t size) {
    if (size != 0 && items > SIZE_MAX / size) return nullptr;
    // A block of nothing may be null, which the libraries take for a failure.
    void* block = std::malloc(std::max<std::size_t>(items * size, 1));
    if (opaque == nullptr || block == nullptr) return block;
    try {
        static_cast<CBaseLibCompressor*>(opaque)->m_allocations.push_back(block);
    } catch (const std::bad_alloc&) {
        // The libraries are C: they hear of it by the null pointer.
        std::free(block);
        return nullptr;
    }
    return block;
}

void CBaseLibCompressor::FreeFor(void* opaque, void* block) {
    if (opaque != nullptr) {
        auto& allocations = static_cast<CBaseLibCompressor*>(opaque)->m_allocations;
        const auto found = std::find(allocations.begin(), allocations.end(), block);
        if (found != allocations.end()) allocations.erase(found);
    }
    std::free(block);
}

void CBaseLibCompressor::FreeAllocations() {
    for (void* block : m_allocations) std::free(block);
    m_allocations.clear();
}

void CBaseLibCompressor::ClearTotals() {
    m_finished = false;
    m_totalIn = m_totalOut = 0;
}

void CBaseLibCompressor::CountIn(std::uint32_t size) {
    m_totalIn += size;
    if (m_totalIn > k_largestNumber) Raise(EFBIG);
}

void CBaseLibCompressor::CountOut(std::uint32_t size) {
    m_totalOut += size;
    if (m_totalOut > k_largestNumber) Raise(EFBIG);
}

// The header already holds the size of the encryption header.
void CBaseLibCompressor::StoreTotals() {
    const std::uint64_t compressed = m_header->GetCompressedSize() + m_totalOut;
    if (compressed + CZipEncryption::aesAuthenticationSize > k_largestNumber) Raise(EFBIG);
    m_header->SetCompressedSize(static_cast<std::uint32_t>(compressed));
    m_header->SetUncompressedSize(static_cast<std::uint32_t>(m_totalIn));
}

}  // namespace ZipArchiveLib
