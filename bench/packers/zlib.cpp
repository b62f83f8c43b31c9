#include <zlib.h>

#include <algorithm>
#include <stdexcept>

#include "bench/packers/packer.h"
#include "zip/zip_archive.h"

namespace bench {
namespace {

// As archives have it: raw, with the largest window. (zlib.h, deflateInit2)
constexpr int k_window_bits = -15;
constexpr int k_memory_level = 8;

void need(bool well) {
    if (!well) throw std::runtime_error("zlib failed");
}

Bytef* bytes_of(std::string& text) { return reinterpret_cast<Bytef*>(text.data()); }
Bytef* bytes_of(const std::string& text) {
    return const_cast<Bytef*>(reinterpret_cast<const Bytef*>(text.data()));
}

/// Deflate and CRC-32 of memory into memory: what every archive costs at least.
class deflating final : public contender {
public:
    void prepare(const document& input) override {
        m_packed.resize(compressBound(static_cast<uLong>(input.bytes.size())));
    }

    void run(const document& input) override {
        z_stream stream{};
        need(deflateInit2(&stream, Z_DEFAULT_COMPRESSION, Z_DEFLATED, k_window_bits, k_memory_level,
                          Z_DEFAULT_STRATEGY) == Z_OK);
        stream.next_out = bytes_of(m_packed);
        stream.avail_out = static_cast<uInt>(m_packed.size());
        uLong crc = 0;
        for (std::size_t done = 0; done < input.bytes.size(); done += k_piece) {
            stream.next_in = bytes_of(input.bytes) + done;
            stream.avail_in = static_cast<uInt>(std::min(k_piece, input.bytes.size() - done));
            crc = crc32(crc, stream.next_in, stream.avail_in);
            need(deflate(&stream, Z_NO_FLUSH) == Z_OK);
        }
        need(deflate(&stream, Z_FINISH) == Z_STREAM_END);
        need(deflateEnd(&stream) == Z_OK);
        m_crc = crc;
    }

    std::size_t finish(const document& input) override {
        need(m_crc == crc_of(input.bytes));
        return input.bytes.size();
    }

private:
    std::string m_packed;
    uLong m_crc = 0;
};

/// Inflate and CRC-32 from memory, piece by piece.
class inflating final : public contender {
public:
    /// The compressed stream of the packed file.
    void prepare(const document& input) override {
        CZipArchive archive;
        archive.Open(packed_path(input).c_str(), CZipStorage::openReadOnly);
        need(archive.OpenEntry(0));
        m_packed.resize(archive.GetEntryHeader(0)->GetDataSize());
        archive.GetStorage().Read(m_packed.data(), static_cast<std::uint32_t>(m_packed.size()), false);
        archive.Close(1);
    }

    void run(const document&) override {
        z_stream stream{};
        need(inflateInit2(&stream, k_window_bits) == Z_OK);
        stream.next_in = bytes_of(m_packed);
        stream.avail_in = static_cast<uInt>(m_packed.size());
        m_crc = 0;
        auto* const piece = reinterpret_cast<Bytef*>(place_of_piece());
        int result = Z_OK;
        while (result != Z_STREAM_END) {
            stream.next_out = piece;
            stream.avail_out = k_piece;
            result = inflate(&stream, Z_SYNC_FLUSH);
            need(result == Z_OK || result == Z_STREAM_END);
            m_crc = crc32(m_crc, piece, k_piece - stream.avail_out);
        }
        m_unpacked = stream.total_out;
        need(inflateEnd(&stream) == Z_OK);
    }

    std::size_t finish(const document& input) override {
        need(m_unpacked == input.bytes.size() && m_crc == crc_of(input.bytes));
        return input.bytes.size();
    }

private:
    std::string m_packed;
    std::size_t m_unpacked = 0;
    uLong m_crc = 0;
};

}  // namespace

std::unique_ptr<contender> zlib_deflate() { return std::make_unique<deflating>(); }
std::unique_ptr<contender> zlib_inflate() { return std::make_unique<inflating>(); }

}  // namespace bench
