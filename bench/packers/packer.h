#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

#include "bench/packing.h"

namespace bench {

/// All contenders are fed, and give back, so many bytes at a time.
constexpr std::size_t k_piece = 64 * 1024;
/// zlib's default, by its number for those that have another.
constexpr int k_level = 6;
constexpr char k_entry_name[] = "document.vrl";

/// Where all contenders unpack to, piece after piece. One place for all: where a buffer happens to lie
/// decides about some percent of the time.
char* place_of_piece();

std::uint32_t crc_of(const std::string& bytes);

/// Packing a document in memory into an archive on disk. After the first run the archive is unpacked again,
/// so that nobody wins by a bad one.
class archive_packer : public contender {
public:
    void run(const document& input) final { pack(input.bytes, m_path); }
    void prepare(const document& input) final;
    std::size_t finish(const document& input) final;

protected:
    explicit archive_packer(const char* suffix) : m_suffix(suffix) {}
    virtual void pack(const std::string& bytes, const std::string& path) = 0;

private:
    std::string m_suffix;
    std::string m_path;
    bool m_checked = false;
};

/// Unpacking a document from an archive on disk, piece by piece, with its CRC checked, and keeping nothing.
class archive_unpacker : public contender {
public:
    void prepare(const document& input) final { m_path = packed_path(input); }
    void run(const document&) final { m_unpacked = unpack(m_path); }
    std::size_t finish(const document& input) final;

protected:
    /// Gives the number of bytes.
    virtual std::size_t unpack(const std::string& path) = 0;

private:
    std::string m_path;
    std::size_t m_unpacked = 0;
};

}  // namespace bench
