#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include "zip/auto_buffer.h"

/// One record of an extra field. (APPNOTE 4.5.1)
struct CZipExtraRecord {
    static constexpr std::uint16_t aes = 0x9901;
    static constexpr std::uint16_t names = 0x5A4C;  ///< the engine's own: code pages and the true name

    std::uint16_t id = 0;
    CZipAutoBuffer data;
};

/// The list of extra records of a header, which owns them.
class CZipExtraField {
public:
    CZipExtraField() = default;
    CZipExtraField(const CZipExtraField& other);
    CZipExtraField(CZipExtraField&&) = default;
    CZipExtraField& operator=(const CZipExtraField& other);
    CZipExtraField& operator=(CZipExtraField&&) = default;
    ~CZipExtraField() = default;

    /// Replaces the list. False when a record is cut off: then the header that holds it is unreadable.
    [[nodiscard]] bool Parse(const std::uint8_t* bytes, std::uint32_t size);
    /// The bytes of all records, four more each than their data. Not limited here.
    std::uint64_t GetTotalSize() const;
    /// Writes `GetTotalSize()` bytes.
    void Store(std::uint8_t* out) const;

    CZipExtraRecord& Add(std::uint16_t id, std::uint32_t dataSize);
    /// The first record of this id; null when there is none.
    const CZipExtraRecord* Find(std::uint16_t id) const;
    void Remove(std::uint16_t id);
    void Clear() { m_records.clear(); }
    std::size_t GetCount() const { return m_records.size(); }
    const CZipExtraRecord& GetAt(std::size_t index) const { return *m_records[index]; }

private:
    std::vector<std::unique_ptr<CZipExtraRecord>> m_records;
};
