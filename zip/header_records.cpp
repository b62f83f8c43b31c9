#include <algorithm>

#include "zip/bytes.h"
#include "zip/file_header.h"
#include "zip/record_layout.h"

using ZipArchiveLib::LoadNumber16;
using ZipArchiveLib::LoadNumber32;
using ZipArchiveLib::StoreNumber16;
using ZipArchiveLib::StoreNumber32;

namespace {

// The engine's record: version, flags, then what the flags tell, in this order.
constexpr std::uint8_t k_namesVersion = 1;
constexpr std::uint8_t k_firstUnknownNamesVersion = 2;
constexpr std::uint8_t k_hasNameCodePage = 1;
constexpr std::uint8_t k_hasName = 2;
constexpr std::uint8_t k_hasCommentCodePage = 4;
constexpr std::uint32_t k_namesHeadSize = 2;
constexpr std::uint32_t k_codePageSize = 4;

constexpr std::uint16_t k_aesVendor = 0x4541;
constexpr std::uint32_t k_aesRecordSize = 7;

}  // namespace

bool CZipFileHeader::ReadNamesRecord() {
    const CZipExtraRecord* record = m_centralExtra.Find(CZipExtraRecord::names);
    if (record == nullptr) return true;
    const std::uint8_t* at = record->data.GetBuffer();
    std::uint32_t left = record->data.GetSize();
    if (left == 0) return false;
    if (at[0] >= k_firstUnknownNamesVersion) return true;
    if (left < k_namesHeadSize) return false;
    const std::uint8_t flags = at[1];
    at += k_namesHeadSize;
    left -= k_namesHeadSize;

    if ((flags & k_hasNameCodePage) != 0) {
        if (left < k_codePageSize) return false;
        m_nameCodePage = LoadNumber32(at);
        at += k_codePageSize;
        left -= k_codePageSize;
    }
    const std::uint32_t behindName = (flags & k_hasCommentCodePage) != 0 ? k_codePageSize : 0;
    if (left < behindName) return false;
    constexpr std::uint8_t nameAndPage = k_hasNameCodePage | k_hasName;
    if ((flags & nameAndPage) == nameAndPage) {
        m_storedName.Assign(at, left - behindName);
        at += left - behindName;
        GetFileName();
        m_nameInExtra = true;
    }
    if (behindName != 0) m_commentCodePage = LoadNumber32(at);
    return true;
}

bool CZipFileHeader::NeedsNamesRecord() const {
    return m_nameInExtra || m_commentCodePage != 0 ||
           m_nameCodePage != CZipStringSettings::DefaultNameCodePage(m_system);
}

void CZipFileHeader::WriteNamesRecord() {
    if (m_nameInExtra && GetFileName().empty()) m_nameInExtra = false;
    if (!NeedsNamesRecord()) return;
    std::uint8_t flags = 0;
    std::string name;
    if (m_nameInExtra) {
        flags = k_hasNameCodePage | k_hasName;
        name = ZipArchiveLib::EncodeName(GetFileName(), m_nameCodePage);
    } else if (m_nameCodePage != CZipStringSettings::DefaultNameCodePage(m_system)) {
        flags = k_hasNameCodePage;
    }
    if (m_commentCodePage != 0) flags |= k_hasCommentCodePage;

    const std::uint32_t size = k_namesHeadSize + ((flags & k_hasNameCodePage) != 0 ? k_codePageSize : 0) +
                               static_cast<std::uint32_t>(name.size()) +
                               (m_commentCodePage != 0 ? k_codePageSize : 0);
    std::uint8_t* out = m_centralExtra.Add(CZipExtraRecord::names, size).data.GetBuffer();
    out[0] = k_namesVersion;
    out[1] = flags;
    out += k_namesHeadSize;
    if ((flags & k_hasNameCodePage) != 0) {
        StoreNumber32(out, m_nameCodePage);
        out += k_codePageSize;
    }
    out = std::copy(name.begin(), name.end(), out);
    if (m_commentCodePage != 0) StoreNumber32(out, m_commentCodePage);
}

struct CZipFileHeader::AesRecord {
    std::uint16_t version;
    std::uint8_t strength;
    std::uint16_t method;
};

bool CZipFileHeader::ParseAesRecord(const CZipExtraRecord& record, AesRecord& out) {
    if (record.data.GetSize() < k_aesRecordSize) return false;
    const std::uint8_t* at = record.data.GetBuffer();
    out = {LoadNumber16(at), at[4], LoadNumber16(at + 5)};
    return (out.version == 1 || out.version == 2) && LoadNumber16(at + 2) == k_aesVendor &&
           CZipEncryption::IsAes(out.strength);
}

void CZipFileHeader::ReadCentralAesRecord() {
    if (m_method != wireAes || !IsEncrypted()) return;
    const CZipExtraRecord* record = m_centralExtra.Find(CZipExtraRecord::aes);
    AesRecord aes = {};
    if (record == nullptr || !ParseAesRecord(*record, aes)) return;
    m_encryptionMethod = aes.strength;
    m_method = aes.method;
    m_aesVersion2 = aes.version == 2;
    m_centralExtra.Remove(CZipExtraRecord::aes);
}

bool CZipFileHeader::CheckLocalAesRecord(std::uint16_t localFlags, std::uint16_t& localMethod) {
    const bool isWireAes = localMethod == wireAes && (localFlags & k_encryptedFlag) != 0;
    const CZipExtraRecord* record = isWireAes ? m_localExtra.Find(CZipExtraRecord::aes) : nullptr;
    if (record == nullptr) return !IsAes();
    AesRecord aes = {};
    if (!ParseAesRecord(*record, aes)) return false;
    if (aes.strength != m_encryptionMethod || (aes.version == 2) != m_aesVersion2) return false;
    localMethod = aes.method;
    m_localExtra.Remove(CZipExtraRecord::aes);
    return true;
}

void CZipFileHeader::WriteAesRecord(CZipExtraField& extra) const {
    if (!IsAes()) return;
    std::uint8_t* out = extra.Add(CZipExtraRecord::aes, k_aesRecordSize).data.GetBuffer();
    StoreNumber16(out, m_aesVersion2 ? 2 : 1);
    StoreNumber16(out + 2, k_aesVendor);
    out[4] = m_encryptionMethod;
    StoreNumber16(out + 5, m_method);
}
