#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "fuzz/finding.h"
#include "zip/zip_archive.h"

// Opens an archive and reads all of its entries, each within bounds. Read in one go and in small steps, an
// entry is the same.

namespace {

/// Enough for everything that can go wrong, and not so much that an input takes long.
constexpr std::uint32_t k_most_bytes = 1 << 20;
constexpr std::uint16_t k_most_entries = 20;

struct outcome {
    std::string bytes;
    int code = 0;
    int closed = -3;

    bool operator==(const outcome& other) const {
        return bytes == other.bytes && code == other.code && closed == other.closed;
    }
};

outcome read_entry(CZipArchive& archive, std::uint16_t index, std::uint32_t step) {
    outcome read;
    std::vector<char> window(step);
    try {
        if (!archive.OpenEntry(index)) return read;
        std::uint32_t got = 0;
        do {
            got = archive.ReadEntry(window.data(), step);
            if (got > step) fuzz::report_finding("more than asked for");
            read.bytes.append(window.data(), got);
        } while (got != 0 && read.bytes.size() < k_most_bytes);
        if (read.bytes.size() < k_most_bytes) read.closed = archive.CloseEntry();
    } catch (const CZipException& exception) {
        read.code = exception.GetCode();
    }
    archive.CloseEntry(nullptr, true);
    return read;
}

void judge(CZipArchive& archive, std::uint16_t index) {
    const CZipFileHeader& header = *archive.GetEntryHeader(index);
    const std::uint32_t declared = header.GetUncompressedSize();
    const outcome whole = read_entry(archive, index, 65536);
    if (whole.bytes.size() > declared) fuzz::report_finding("an entry beyond its declared size");
    if (whole.closed == 1 && whole.bytes.size() != declared)
        fuzz::report_finding("a whole entry that is short");
    // Damage is met at a place that depends on the steps; what is whole is not.
    const outcome by_steps = read_entry(archive, index, 777);
    if ((whole.closed == 1) != (by_steps.closed == 1))
        fuzz::report_finding("whole in one way of reading only");
    if (whole.closed == 1)
        fuzz::require_equal("read by steps, against read at once", by_steps.bytes, whole.bytes);
}

void read_all(std::string bytes, bool exhaustive, std::uint32_t checks) {
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    CZipArchive archive;
    archive.SetExhaustiveRead(exhaustive);
    try {
        archive.Open(file, CZipStorage::openReadOnly);
        archive.GetCentralDir().SetIgnoredChecks(checks);
        const std::uint16_t count = std::min(archive.GetCount(), k_most_entries);
        for (std::uint16_t i = 0; i < count; ++i) {
            CZipFileHeader& header = *archive.GetEntryHeader(i);
            archive.FindEntry(header.GetFileName());
            static_cast<void>(header.GetComment());
            static_cast<void>(header.GetTime());
            static_cast<void>(header.IsDirectory());
            archive.SetPassword(i % 2 == 0 ? "secret" : nullptr);
            judge(archive, i);
        }
        archive.Close();
    } catch (const CZipException&) {
        archive.Close(1);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    read_all(bytes, false, CZipChecks::ignoredAtFirst);
    read_all(bytes, true, 0xFFFFFFFF);
    return 0;
}
