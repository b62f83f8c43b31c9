#include "zip/crc32_cryptograph.h"

#include <zlib.h>

#include "platform/c_random.h"
#include "zip/encryption.h"
#include "zip/file_header.h"
#include "zip/storage.h"

namespace {

constexpr std::uint32_t k_multiplier = 134775813;
constexpr unsigned k_randomBytes = 10;

using EncryptionHeader = std::array<std::uint8_t, CZipEncryption::traditionalHeaderSize>;

// One step of the CRC-32, without the complements that a whole CRC begins and ends with.
std::uint32_t CrcStep(std::uint32_t crc, std::uint8_t byte) {
    static const z_crc_t* const table = get_crc_table();
    return static_cast<std::uint32_t>(table[(crc ^ byte) & 0xFF]) ^ (crc >> 8);
}

}  // namespace

bool CZipCrc32Cryptograph::CanHandle(std::uint8_t method) const {
    return method == CZipEncryption::traditional;
}

void CZipCrc32Cryptograph::InitKeys(const CZipAutoBuffer& password) {
    m_keys = {305419896, 591751049, 878082192};
    for (std::uint32_t i = 0; i < password.GetSize(); ++i) UpdateKeys(password.GetBuffer()[i]);
}

void CZipCrc32Cryptograph::UpdateKeys(std::uint8_t plain) {
    m_keys[0] = CrcStep(m_keys[0], plain);
    m_keys[1] = (m_keys[1] + (m_keys[0] & 0xFF)) * k_multiplier + 1;
    m_keys[2] = CrcStep(m_keys[2], static_cast<std::uint8_t>(m_keys[1] >> 24));
}

std::uint8_t CZipCrc32Cryptograph::KeyByte() const {
    const std::uint32_t low = (m_keys[2] & 0xFFFF) | 2;
    return static_cast<std::uint8_t>((low * (low ^ 1)) >> 8);
}

void CZipCrc32Cryptograph::Decode(std::uint8_t* buffer, std::uint32_t size) {
    for (std::uint32_t i = 0; i < size; ++i) {
        buffer[i] ^= KeyByte();
        UpdateKeys(buffer[i]);
    }
}

void CZipCrc32Cryptograph::Encode(std::uint8_t* buffer, std::uint32_t size) {
    for (std::uint32_t i = 0; i < size; ++i) {
        const std::uint8_t key = KeyByte();
        UpdateKeys(buffer[i]);
        buffer[i] ^= key;
    }
}

void CZipCrc32Cryptograph::BeginEncode(const CZipAutoBuffer& password, CZipFileHeader& header,
                                       CZipStorage& storage) {
    InitKeys(password);
    // Intended: entries that begin in the same second share these bytes.
    vrl_platform::c_random random(m_clock.now());
    EncryptionHeader bytes = {};
    for (unsigned i = 0; i < k_randomBytes; ++i) {
        const unsigned drawn = random.next();
        const auto shifted = static_cast<std::uint8_t>(drawn >> 6);
        bytes.at(i) = shifted != 0 ? shifted : static_cast<std::uint8_t>(drawn);
    }
    // The time and not the CRC: an entry enciphered here has a data descriptor, its CRC is not known yet.
    bytes[10] = static_cast<std::uint8_t>(header.GetModificationTime());
    bytes[11] = static_cast<std::uint8_t>(header.GetModificationTime() >> 8);
    Encode(bytes.data(), bytes.size());
    storage.Write(bytes.data(), bytes.size(), true);
    header.SetCompressedSize(header.GetCompressedSize() + CZipEncryption::traditionalHeaderSize);
}

bool CZipCrc32Cryptograph::BeginDecode(const CZipAutoBuffer& password, CZipFileHeader& header,
                                       CZipStorage& storage) {
    InitKeys(password);
    EncryptionHeader bytes = {};
    storage.Read(bytes.data(), bytes.size(), false);
    Decode(bytes.data(), bytes.size());
    const std::uint32_t expected =
        header.HasDataDescriptor() ? header.GetModificationTime() >> 8U : header.GetCrc() >> 24;
    return bytes.back() == expected;
}
