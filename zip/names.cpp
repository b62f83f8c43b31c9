#include "zip/names.h"

#include <algorithm>

#include "platform/code_page.h"

namespace ZipArchiveLib {

std::string DecodeName(const CZipAutoBuffer& stored, std::uint32_t codePage) {
    const std::string bytes(reinterpret_cast<const char*>(stored.GetBuffer()), stored.GetSize());
    std::string name = vrl_platform::convert_code_page(bytes, codePage, vrl_platform::code_page::ansi);
    std::replace(name.begin(), name.end(), '/', '\\');
    return name;
}

std::string EncodeName(const std::string& name, std::uint32_t codePage) {
    std::string slashed = name;
    std::replace(slashed.begin(), slashed.end(), '\\', '/');
    return vrl_platform::convert_code_page(slashed, vrl_platform::code_page::ansi, codePage);
}

}  // namespace ZipArchiveLib
