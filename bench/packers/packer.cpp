#include "bench/packers/packer.h"

#include <zlib.h>

#include <cstdio>
#include <stdexcept>

#include "zip/zip_archive.h"

namespace bench {
namespace {

/// Throws unless the archive's first entry is `bytes`.
void need_packed(const std::string& path, const std::string& bytes) {
    CZipArchive archive;
    archive.Open(path.c_str(), CZipStorage::openReadOnly);
    if (!archive.OpenEntry(0)) throw std::runtime_error(path + ": no entry");
    const CZipFileHeader& header = *archive.GetEntryHeader(0);
    if (header.GetUncompressedSize() != bytes.size() || header.GetCrc() != crc_of(bytes))
        throw std::runtime_error(path + ": another document");
    std::string piece(k_piece, '\0');
    while (archive.ReadEntry(piece.data(), k_piece) != 0) continue;
    if (archive.CloseEntry() != 1) throw std::runtime_error(path + ": damaged");
}

}  // namespace

char* place_of_piece() {
    constexpr std::size_t k_page = 4096;
    alignas(k_page) static char place[k_piece];
    return place;
}

std::uint32_t crc_of(const std::string& bytes) {
    return static_cast<std::uint32_t>(
        crc32_z(0, reinterpret_cast<const Bytef*>(bytes.data()), static_cast<z_size_t>(bytes.size())));
}

void archive_packer::prepare(const document& input) { m_path = input.path + m_suffix; }

std::size_t archive_packer::finish(const document& input) {
    if (!m_checked) need_packed(m_path, input.bytes);
    m_checked = true;
    std::remove(m_path.c_str());
    return input.bytes.size();
}

std::size_t archive_unpacker::finish(const document& input) {
    if (m_unpacked != input.bytes.size()) throw std::runtime_error(m_path + ": not all of it was unpacked");
    return m_unpacked;
}

}  // namespace bench
