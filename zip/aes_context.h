#pragma once

#include <nettle/aes.h>

#include <array>
#include <cstddef>
#include <cstdint>
#include <variant>

/// AES in counter mode as ZIP archives use it: the counter begins with 1, its low byte comes first, and only
/// its first 8 bytes count. The key stream is drawn for many blocks at once. Source   FIPS 197; the WinZip
/// AES specification, "Encrypted file data".
class CZipAesContext {
public:
    /// A key of 16, 24 or 32 bytes.
    CZipAesContext(const std::uint8_t* key, std::uint32_t keySize);

    /// Enciphers or deciphers in place, which is the same.
    void Apply(std::uint8_t* bytes, std::size_t size);

private:
    static constexpr std::size_t k_blocks = 64;
    static constexpr std::size_t k_streamSize = k_blocks * AES_BLOCK_SIZE;

    void DrawStream();

    std::variant<aes128_ctx, aes192_ctx, aes256_ctx> m_key;
    std::uint64_t m_counter = 0;
    std::array<std::uint8_t, k_streamSize> m_stream = {};
    std::size_t m_used = k_streamSize;
};
