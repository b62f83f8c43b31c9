#include <minizip/unzip.h>
#include <minizip/zip.h>

#include <algorithm>
#include <stdexcept>

#include "bench/packers/packer.h"

namespace bench {
namespace {

void need(bool well) {
    if (!well) throw std::runtime_error("minizip failed");
}

class packing final : public archive_packer {
public:
    packing() : archive_packer(".minizip.zip") {}

protected:
    void pack(const std::string& bytes, const std::string& path) override {
        const zipFile archive = zipOpen(path.c_str(), APPEND_STATUS_CREATE);
        need(archive != nullptr);
        const zip_fileinfo info{};
        need(zipOpenNewFileInZip(archive, k_entry_name, &info, nullptr, 0, nullptr, 0, nullptr, Z_DEFLATED,
                                 k_level) == ZIP_OK);
        for (std::size_t done = 0; done < bytes.size(); done += k_piece) {
            need(zipWriteInFileInZip(archive, bytes.data() + done,
                                     static_cast<unsigned>(std::min(k_piece, bytes.size() - done))) ==
                 ZIP_OK);
        }
        need(zipCloseFileInZip(archive) == ZIP_OK);
        need(zipClose(archive, nullptr) == ZIP_OK);
    }
};

class unpacking final : public archive_unpacker {
protected:
    std::size_t unpack(const std::string& path) override {
        const unzFile archive = unzOpen(path.c_str());
        need(archive != nullptr);
        need(unzGoToFirstFile(archive) == UNZ_OK && unzOpenCurrentFile(archive) == UNZ_OK);
        std::size_t all = 0;
        int got = 0;
        while ((got = unzReadCurrentFile(archive, place_of_piece(), k_piece)) > 0)
            all += static_cast<std::size_t>(got);
        need(got == 0 && unzCloseCurrentFile(archive) == UNZ_OK);
        need(unzClose(archive) == UNZ_OK);
        return all;
    }
};

}  // namespace

std::unique_ptr<contender> minizip_pack() { return std::make_unique<packing>(); }
std::unique_ptr<contender> minizip_unpack() { return std::make_unique<unpacking>(); }

}  // namespace bench
