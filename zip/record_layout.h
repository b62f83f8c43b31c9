#pragma once

#include <cstdint>

/// The marks that records begin with. (APPNOTE 4.3)
inline constexpr std::uint8_t k_localSignature[4] = {'P', 'K', 3, 4};
inline constexpr std::uint8_t k_centralSignature[4] = {'P', 'K', 1, 2};
inline constexpr std::uint8_t k_endSignature[4] = {'P', 'K', 5, 6};
inline constexpr std::uint8_t k_zip64LocatorSignature[4] = {'P', 'K', 6, 7};
/// Before a data descriptor, and at the begin of a segmented archive.
inline constexpr std::uint8_t k_segmentSignature[4] = {'P', 'K', 7, 8};

/// The sizes of the fixed parts. (APPNOTE 4.3.7, 4.3.12, 4.3.16)
inline constexpr std::uint32_t k_localSize = 30;
inline constexpr std::uint32_t k_centralSize = 46;
inline constexpr std::uint32_t k_endSize = 22;

/// Where the flags and, one behind the other, CRC and both sizes stand in a local header.
inline constexpr std::uint32_t k_localFlagsAt = 6;
inline constexpr std::uint32_t k_localCrcAt = 14;

/// General purpose bits. (APPNOTE 4.4.4)
inline constexpr std::uint16_t k_encryptedFlag = 0x01;
inline constexpr std::uint16_t k_descriptorFlag = 0x08;

/// What a 16-bit length field cannot hold any more.
inline constexpr std::uint32_t k_fieldLimit = 65536;
