#include "zip/attributes.h"

#include <array>

#include "platform/file_names.h"
#include "zip/exception.h"

namespace ZipArchiveLib {
namespace {

namespace dos = vrl_platform::file_attribute;

constexpr std::uint32_t k_unixFolder = 0x4000;
constexpr std::uint32_t k_unixFolderAndSearch = 0x4049;
constexpr std::uint32_t k_unixFile = 0x8000;
constexpr std::uint32_t k_ownerRead = 0400;
constexpr std::uint32_t k_ownerWrite = 0200;
constexpr std::uint32_t k_ownerExecute = 0100;
constexpr std::uint32_t k_macintoshMask = 0x11;

// `toDos` tells the direction.
using Conversion = std::uint32_t (*)(std::uint32_t attributes, bool toDos);

std::uint32_t Same(std::uint32_t attributes, bool /*toDos*/) { return attributes; }

std::uint32_t Macintosh(std::uint32_t attributes, bool /*toDos*/) { return attributes & k_macintoshMask; }

std::uint32_t UnixFromDos(std::uint32_t attributes) {
    std::uint32_t mode = 0664;
    const bool readOnly = (attributes & dos::read_only) != 0;
    const bool hidden = (attributes & dos::hidden) != 0;
    if (readOnly && hidden)
        mode = 0;
    else if (readOnly)
        mode = 0444;
    else if (hidden)
        mode = 0220;
    return mode | ((attributes & dos::folder) != 0 ? k_unixFolderAndSearch : k_unixFile);
}

std::uint32_t DosFromUnix(std::uint32_t mode) {
    std::uint32_t attributes = 0;
    if ((mode & k_unixFolder) != 0)
        attributes |= dos::folder;
    else if ((mode & k_ownerExecute) == 0)
        attributes |= dos::archive;
    if ((mode & k_ownerWrite) == 0) attributes |= dos::read_only;
    if ((mode & k_ownerRead) == 0) attributes |= dos::hidden;
    return attributes;
}

std::uint32_t Unix(std::uint32_t attributes, bool toDos) {
    return toDos ? DosFromUnix(attributes) : UnixFromDos(attributes);
}

constexpr std::array<Conversion, 11> k_conversions = {Same, nullptr,   nullptr, Unix,    nullptr, nullptr,
                                                      Same, Macintosh, nullptr, nullptr, Same};

}  // namespace

bool IsValidSystem(std::uint8_t system) {
    return system < k_conversions.size() && k_conversions.at(system) != nullptr;
}

std::uint32_t ConvertAttributes(std::uint32_t attributes, std::uint8_t from, std::uint8_t to) {
    if (from == to) return attributes;
    if (!IsValidSystem(from) || !IsValidSystem(to))
        CZipException::Raise(CZipException::noAttributeConversion);
    return k_conversions.at(to)(k_conversions.at(from)(attributes, true), false);
}

}  // namespace ZipArchiveLib
