#pragma once

#include <cstdint>

/// File attributes as the systems that write archives number them. (APPNOTE 4.4.2, 4.4.15)
namespace ZipArchiveLib {

/// The systems whose attributes the engine can tell, by the high byte of "version made by".
namespace SystemId {
inline constexpr std::uint8_t dos = 0;
inline constexpr std::uint8_t unix_ = 3;
inline constexpr std::uint8_t os2 = 6;
inline constexpr std::uint8_t macintosh = 7;
inline constexpr std::uint8_t ntfs = 10;
}  // namespace SystemId

bool IsValidSystem(std::uint8_t system);

/// Attributes of one system as those of another. CZipException 117 when one of the two is not known.
std::uint32_t ConvertAttributes(std::uint32_t attributes, std::uint8_t from, std::uint8_t to);

}  // namespace ZipArchiveLib
