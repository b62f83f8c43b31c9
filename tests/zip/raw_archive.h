#pragma once

#include <optional>

#include "support.h"

/// Archives laid out by hand, so that every field can be a lie.
namespace zip_test {

Bytes Number16(std::uint32_t value);
Bytes Number32(std::uint32_t value);
std::uint32_t Crc32(const Bytes& data);
/// The raw deflate stream of some data.
Bytes Deflated(const Bytes& data, int level = 6);
Bytes Bzip2ed(const Bytes& data);
Bytes ExtraRecord(std::uint16_t id, const Bytes& data);

struct RawEntry {
    std::string name = "a.txt";
    /// As it stands in the archive.
    Bytes data;
    std::uint16_t madeBy = 0x0014;
    std::uint16_t needed = 20;
    std::uint16_t flags = 0;
    std::uint16_t method = 0;
    std::uint16_t time = 0xB1AA;
    std::uint16_t date = 0x576E;
    std::uint32_t crc = 0;
    std::uint32_t uncompressed = 0;
    std::optional<std::uint32_t> compressed;  ///< else the size of the data
    std::uint16_t disk = 0;
    std::uint32_t attributes = 0;
    std::optional<std::uint32_t> offset;  ///< else where the local header is
    Bytes localExtra;
    Bytes centralExtra;
    Bytes comment;
    /// Behind the data.
    Bytes descriptor;
    std::optional<std::uint16_t> localFlags;
    std::optional<std::uint16_t> localMethod;
    std::optional<std::uint32_t> localCrc;
    std::optional<std::uint32_t> localCompressed;
    std::optional<std::uint32_t> localUncompressed;
    Bytes localSignature = "PK\3\4";
    Bytes centralSignature = "PK\1\2";

    static RawEntry Stored(const std::string& name, const Bytes& data);
    static RawEntry DeflatedEntry(const std::string& name, const Bytes& data);
    static RawEntry Bzip2Entry(const std::string& name, const Bytes& data);

    Bytes Local() const;
    Bytes Central(std::uint32_t place) const;
};

struct RawArchive {
    Bytes stub;
    std::vector<RawEntry> entries;
    Bytes beforeEnd;  ///< between the directory and the end record
    Bytes comment;
    Bytes trailer;
    std::uint16_t disk = 0;
    std::uint16_t directoryDisk = 0;
    std::optional<std::uint16_t> entriesHere;
    std::optional<std::uint16_t> total;
    std::optional<std::uint32_t> size;
    std::optional<std::uint32_t> offset;  ///< else from the end of the stub
    std::optional<std::uint16_t> commentSize;

    static RawArchive Of(std::vector<RawEntry> entries);
    Bytes Build() const;
};

}  // namespace zip_test
