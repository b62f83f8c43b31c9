#include "raw_archive.h"

#include <bzlib.h>
#include <zlib.h>

#include <stdexcept>

namespace zip_test {

Bytes Number16(std::uint32_t value) {
    return {static_cast<char>(value & 0xFF), static_cast<char>((value >> 8) & 0xFF)};
}

Bytes Number32(std::uint32_t value) { return Number16(value & 0xFFFF) + Number16(value >> 16); }

std::uint32_t Crc32(const Bytes& data) {
    return static_cast<std::uint32_t>(
        crc32(0, reinterpret_cast<const Bytef*>(data.data()), static_cast<uInt>(data.size())));
}

Bytes Deflated(const Bytes& data, int level) {
    z_stream stream = {};
    if (deflateInit2(&stream, level, Z_DEFLATED, -15, 8, Z_DEFAULT_STRATEGY) != Z_OK)
        throw std::runtime_error("zlib");
    Bytes out(deflateBound(&stream, data.size()) + 16, '\0');
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(data.data()));
    stream.avail_in = static_cast<uInt>(data.size());
    stream.next_out = reinterpret_cast<Bytef*>(out.data());
    stream.avail_out = static_cast<uInt>(out.size());
    const int result = deflate(&stream, Z_FINISH);
    out.resize(stream.total_out);
    deflateEnd(&stream);
    if (result != Z_STREAM_END) throw std::runtime_error("zlib");
    return out;
}

Bytes Bzip2ed(const Bytes& data) {
    Bytes out(data.size() + data.size() / 100 + 600, '\0');
    auto size = static_cast<unsigned>(out.size());
    const int result = BZ2_bzBuffToBuffCompress(out.data(), &size, const_cast<char*>(data.data()),
                                                static_cast<unsigned>(data.size()), 6, 0, 0);
    if (result != BZ_OK) throw std::runtime_error("bzip2");
    out.resize(size);
    return out;
}

Bytes ExtraRecord(std::uint16_t id, const Bytes& data) {
    return Number16(id) + Number16(static_cast<std::uint32_t>(data.size())) + data;
}

RawEntry RawEntry::Stored(const std::string& name, const Bytes& data) {
    RawEntry entry;
    entry.name = name;
    entry.data = data;
    entry.crc = Crc32(data);
    entry.uncompressed = static_cast<std::uint32_t>(data.size());
    return entry;
}

RawEntry RawEntry::DeflatedEntry(const std::string& name, const Bytes& data) {
    RawEntry entry = Stored(name, data);
    entry.data = Deflated(data);
    entry.method = 8;
    return entry;
}

RawEntry RawEntry::Bzip2Entry(const std::string& name, const Bytes& data) {
    RawEntry entry = Stored(name, data);
    entry.data = Bzip2ed(data);
    entry.method = 12;
    return entry;
}

Bytes RawEntry::Local() const {
    const auto size = static_cast<std::uint32_t>(data.size());
    return localSignature + Number16(needed) + Number16(localFlags.value_or(flags)) +
           Number16(localMethod.value_or(method)) + Number16(time) + Number16(date) +
           Number32(localCrc.value_or(crc)) + Number32(localCompressed.value_or(compressed.value_or(size))) +
           Number32(localUncompressed.value_or(uncompressed)) +
           Number16(static_cast<std::uint32_t>(name.size())) +
           Number16(static_cast<std::uint32_t>(localExtra.size())) + name + localExtra + data + descriptor;
}

Bytes RawEntry::Central(std::uint32_t place) const {
    return centralSignature + Number16(madeBy) + Number16(needed) + Number16(flags) + Number16(method) +
           Number16(time) + Number16(date) + Number32(crc) +
           Number32(compressed.value_or(static_cast<std::uint32_t>(data.size()))) + Number32(uncompressed) +
           Number16(static_cast<std::uint32_t>(name.size())) +
           Number16(static_cast<std::uint32_t>(centralExtra.size())) +
           Number16(static_cast<std::uint32_t>(comment.size())) + Number16(disk) + Number16(0) +
           Number32(attributes) + Number32(offset.value_or(place)) + name + centralExtra + comment;
}

RawArchive RawArchive::Of(std::vector<RawEntry> entries) {
    RawArchive archive;
    archive.entries = std::move(entries);
    return archive;
}

Bytes RawArchive::Build() const {
    Bytes locals;
    Bytes directory;
    for (const RawEntry& entry : entries) {
        directory += entry.Central(static_cast<std::uint32_t>(locals.size()));
        locals += entry.Local();
    }
    const auto count = static_cast<std::uint16_t>(entries.size());
    const Bytes end = Bytes("PK\5\6") + Number16(disk) + Number16(directoryDisk) +
                      Number16(entriesHere.value_or(count)) + Number16(total.value_or(count)) +
                      Number32(size.value_or(static_cast<std::uint32_t>(directory.size()))) +
                      Number32(offset.value_or(static_cast<std::uint32_t>(locals.size()))) +
                      Number16(commentSize.value_or(static_cast<std::uint16_t>(comment.size())));
    return stub + locals + directory + beforeEnd + end + comment + trailer;
}

}  // namespace zip_test
