#include <zip.h>

#include <stdexcept>

#include "bench/packers/packer.h"

namespace bench {
namespace {

void need(bool well) {
    if (!well) throw std::runtime_error("libzip failed");
}

class packing final : public archive_packer {
public:
    packing() : archive_packer(".libzip.zip") {}

protected:
    void pack(const std::string& bytes, const std::string& path) override {
        zip_t* const archive = zip_open(path.c_str(), ZIP_CREATE | ZIP_TRUNCATE, nullptr);
        need(archive != nullptr);
        zip_source_t* const source = zip_source_buffer(archive, bytes.data(), bytes.size(), 0);
        const zip_int64_t index = zip_file_add(archive, k_entry_name, source, 0);
        need(index == 0);
        need(zip_set_file_compression(archive, 0, ZIP_CM_DEFLATE, k_level) == 0);
        need(zip_close(archive) == 0);
    }
};

class unpacking final : public archive_unpacker {
protected:
    std::size_t unpack(const std::string& path) override {
        zip_t* const archive = zip_open(path.c_str(), ZIP_RDONLY, nullptr);
        need(archive != nullptr);
        zip_file_t* const file = zip_fopen_index(archive, 0, 0);
        need(file != nullptr);
        std::size_t all = 0;
        zip_int64_t got = 0;
        while ((got = zip_fread(file, place_of_piece(), k_piece)) > 0) all += static_cast<std::size_t>(got);
        need(got == 0 && zip_fclose(file) == 0);
        zip_discard(archive);
        return all;
    }
};

}  // namespace

std::unique_ptr<contender> libzip_pack() { return std::make_unique<packing>(); }
std::unique_ptr<contender> libzip_unpack() { return std::make_unique<unpacking>(); }

}  // namespace bench
