#include "zip/extra_field.h"

#include <algorithm>

#include "zip/bytes.h"
#include "zip/growth.h"

namespace {

constexpr std::uint32_t k_recordHeadSize = 4;

}  // namespace

CZipExtraField::CZipExtraField(const CZipExtraField& other) { *this = other; }

CZipExtraField& CZipExtraField::operator=(const CZipExtraField& other) {
    if (this == &other) return *this;
    m_records.clear();
    m_records.reserve(other.m_records.size());
    for (const auto& record : other.m_records)
        m_records.push_back(std::make_unique<CZipExtraRecord>(*record));
    return *this;
}

bool CZipExtraField::Parse(const std::uint8_t* bytes, std::uint32_t size) {
    m_records.clear();
    while (size != 0) {
        if (size < k_recordHeadSize) return false;
        const std::uint16_t dataSize = ZipArchiveLib::LoadNumber16(bytes + 2);
        if (dataSize > size - k_recordHeadSize) return false;
        Add(ZipArchiveLib::LoadNumber16(bytes), 0).data.Assign(bytes + k_recordHeadSize, dataSize);
        bytes += k_recordHeadSize + dataSize;
        size -= k_recordHeadSize + dataSize;
    }
    return true;
}

std::uint64_t CZipExtraField::GetTotalSize() const {
    std::uint64_t total = 0;
    for (const auto& record : m_records) total += k_recordHeadSize + record->data.GetSize();
    return total;
}

void CZipExtraField::Store(std::uint8_t* out) const {
    for (const auto& record : m_records) {
        const std::uint32_t size = record->data.GetSize();
        ZipArchiveLib::StoreNumber16(out, record->id);
        ZipArchiveLib::StoreNumber16(out + 2, static_cast<std::uint16_t>(size));
        out = std::copy_n(record->data.GetBuffer(), size, out + k_recordHeadSize);
    }
}

CZipExtraRecord& CZipExtraField::Add(std::uint16_t id, std::uint32_t dataSize) {
    auto record = std::make_unique<CZipExtraRecord>();
    record->id = id;
    record->data.Allocate(dataSize, true);
    return *ZipArchiveLib::PushBack(m_records, std::move(record));
}

const CZipExtraRecord* CZipExtraField::Find(std::uint16_t id) const {
    for (const auto& record : m_records)
        if (record->id == id) return record.get();
    return nullptr;
}

void CZipExtraField::Remove(std::uint16_t id) {
    m_records.erase(std::remove_if(m_records.begin(), m_records.end(),
                                   [id](const auto& record) { return record->id == id; }),
                    m_records.end());
}
