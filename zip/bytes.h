#pragma once

#include <cstdint>

namespace ZipArchiveLib {

/// Numbers in records stand with their low byte first. (APPNOTE 4.4.1.1)
inline void StoreNumber16(std::uint8_t* at, std::uint16_t value) {
    at[0] = static_cast<std::uint8_t>(value);
    at[1] = static_cast<std::uint8_t>(value >> 8);
}

inline void StoreNumber32(std::uint8_t* at, std::uint32_t value) {
    StoreNumber16(at, static_cast<std::uint16_t>(value));
    StoreNumber16(at + 2, static_cast<std::uint16_t>(value >> 16));
}

inline std::uint16_t LoadNumber16(const std::uint8_t* at) {
    return static_cast<std::uint16_t>(at[0] | (at[1] << 8));
}

inline std::uint32_t LoadNumber32(const std::uint8_t* at) {
    return LoadNumber16(at) | (static_cast<std::uint32_t>(LoadNumber16(at + 2)) << 16);
}

/// The largest size and offset that a record can hold.
inline constexpr std::uint64_t k_largestNumber = 0xFFFFFFFF;

}  // namespace ZipArchiveLib
