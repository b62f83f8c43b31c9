#pragma once

#include <cstdint>

/// The encryption methods of an entry by number. (APPNOTE 6.1, and the WinZip AES specification)
namespace CZipEncryption {

inline constexpr std::uint8_t traditional = 0;
inline constexpr std::uint8_t aes128 = 1;
inline constexpr std::uint8_t aes192 = 2;
inline constexpr std::uint8_t aes256 = 3;
inline constexpr std::uint8_t none = 255;

/// Bytes that go before the data; CZipException 100 for a number that is no method.
std::uint32_t HeaderSize(std::uint8_t method);
/// Bytes that the data grows by, those before and those behind it; CZipException 100 as above.
std::uint32_t Overhead(std::uint8_t method);

inline bool IsAes(std::uint8_t method) { return method >= aes128 && method <= aes256; }

/// 8, 12 or 16 bytes.
inline std::uint32_t AesSaltSize(std::uint8_t method) { return 4U + 4U * method; }
/// 16, 24 or 32 bytes.
inline std::uint32_t AesKeySize(std::uint8_t method) { return 8U + 8U * method; }
inline constexpr std::uint32_t aesVerifierSize = 2;
inline constexpr std::uint32_t aesAuthenticationSize = 10;

inline constexpr std::uint32_t traditionalHeaderSize = 12;

}  // namespace CZipEncryption
