#include <algorithm>
#include <stdexcept>

#include "bench/packers/packer.h"
#include "zip/zip_archive.h"

namespace bench {
namespace {

/// This library's ZIP engine.
class packing final : public archive_packer {
public:
    packing() : archive_packer(".engine.zip") {}

protected:
    void pack(const std::string& bytes, const std::string& path) override {
        CZipArchive archive;
        archive.Open(path.c_str(), CZipStorage::create);
        CZipFileHeader header;
        header.SetFileName(k_entry_name);
        if (!archive.OpenNewEntry(header, k_level)) throw std::runtime_error("no entry was begun");
        for (std::size_t done = 0; done < bytes.size(); done += k_piece) {
            archive.WriteNewEntry(bytes.data() + done,
                                  static_cast<std::uint32_t>(std::min(k_piece, bytes.size() - done)));
        }
        archive.CloseNewEntry();
        archive.Close();
    }
};

class unpacking final : public archive_unpacker {
protected:
    std::size_t unpack(const std::string& path) override {
        CZipArchive archive;
        archive.Open(path.c_str(), CZipStorage::openReadOnly);
        archive.OpenEntry(0);
        std::size_t all = 0;
        while (const std::uint32_t got = archive.ReadEntry(place_of_piece(), k_piece)) all += got;
        if (archive.CloseEntry() != 1) throw std::runtime_error(path + ": damaged");
        archive.Close();
        return all;
    }
};

}  // namespace

std::unique_ptr<contender> engine_pack() { return std::make_unique<packing>(); }
std::unique_ptr<contender> engine_unpack() { return std::make_unique<unpacking>(); }

}  // namespace bench
