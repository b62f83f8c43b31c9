#pragma once

#include <cstdint>
#include <string>

#include "zip/auto_buffer.h"

/// How names and comments of an archive are coded.
struct CZipStringSettings {
    static constexpr std::uint32_t defaultNameCodePage = 1;

    bool storeNameInExtraData = false;
    std::uint32_t nameCodePage = defaultNameCodePage;
    std::uint32_t commentCodePage = 0;

    void Reset() { *this = CZipStringSettings(); }
    /// What a reader takes a name for that comes without a word about its code page.
    static std::uint32_t DefaultNameCodePage(std::uint8_t system) { return system == 0 ? 1 : 0; }
};

namespace ZipArchiveLib {

/// A stored name as text of the system, with backslashes between its parts.
std::string DecodeName(const CZipAutoBuffer& stored, std::uint32_t codePage);

/// Text of the system in a code page, with slashes. (APPNOTE 4.4.17.1)
std::string EncodeName(const std::string& name, std::uint32_t codePage);

}  // namespace ZipArchiveLib
