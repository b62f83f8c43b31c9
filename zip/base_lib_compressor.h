#pragma once

#include <cstddef>
#include <vector>

#include "zip/compressor.h"

namespace ZipArchiveLib {

/// What the wrappers of both libraries share: memory for the library, totals, the end of the stream.
class CBaseLibCompressor : public CZipCompressor {
public:
    class COptions : public CZipCompressor::COptions {
    public:
        /// Remember the library's allocations, so that an entry given up in the middle leaves none behind
        /// without asking the library.
        bool trackLibraryAllocations = true;
    };

    ~CBaseLibCompressor() override { FreeAllocations(); }
    std::size_t GetAllocationCount() const { return m_allocations.size(); }

protected:
    explicit CBaseLibCompressor(CZipStorage& storage) : CZipCompressor(storage) {}

    /// What the library's hooks pass back to us: null when allocations are not tracked.
    void* GetOpaque();
    static void* AllocateFor(void* opaque, std::size_t items, std::size_t size);
    static void FreeFor(void* opaque, void* block);
    void FreeAllocations();

    /// Sets the begin of an entry.
    void ClearTotals();
    /// Counts bytes in; those of the entry must fit its record.
    void CountIn(std::uint32_t size);
    void CountOut(std::uint32_t size);
    /// Puts both totals into the header.
    void StoreTotals();

    bool m_finished = false;

private:
    bool TracksAllocations() const;

    std::vector<void*> m_allocations;
    std::uint64_t m_totalIn = 0;
    std::uint64_t m_totalOut = 0;
};

}  // namespace ZipArchiveLib
