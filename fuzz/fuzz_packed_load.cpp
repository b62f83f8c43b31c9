#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

#include "V2/document_file.h"
#include "fuzz/finding.h"
#include "zip/zip_archive.h"

// A packed document through the modern door, against the same document unpacked first and loaded from memory.
// What is loaded can be saved, packed and loaded again.

namespace {

using vrl_v2::file_failure;
using vrl_v2::load_result;

vrl_v2::load_options options(bool collect) {
    vrl_v2::load_options asked;
    asked.format = vrl_v2::file_format::packed;
    asked.collect_reports = collect;
    asked.max_reports = 100;
    asked.max_unpacked_size = 1 << 20;
    asked.max_entity_expansion = 1 << 16;
    return asked;
}

/// The first entry, if the engine finds nothing wrong with it.
std::optional<std::string> unpacked(std::string bytes) {
    CZipMemFile file(bytes.data(), static_cast<std::uint32_t>(bytes.size()), 0);
    CZipArchive archive;
    try {
        archive.Open(file, CZipStorage::openReadOnly);
        archive.GetCentralDir().SetIgnoredChecks(0);
        if (!archive.OpenEntry(0)) return std::nullopt;
        const std::uint32_t size = archive.GetEntryHeader(0)->GetUncompressedSize();
        if (size > options(false).max_unpacked_size) return std::nullopt;
        std::string text(size, '\0');
        char more = 0;
        if (archive.ReadEntry(text.data(), size) != size || archive.ReadEntry(&more, 1) != 0)
            return std::nullopt;
        if (archive.CloseEntry() != 1) return std::nullopt;
        return text;
    } catch (const CZipException&) {
        return std::nullopt;
    }
}

void require_same(const load_result& packed, const load_result& plain) {
    if (packed.failure != plain.failure || packed.code != plain.code || packed.line != plain.line ||
        packed.item != plain.item || packed.reports.size() != plain.reports.size()) {
        fuzz::report_finding("packed: " + packed.message + "\nplain: " + plain.message);
    }
}

void save_and_load_again(const vrl_v2::Vrl& document) {
    vrl_v2::save_options packing;
    packing.format = vrl_v2::file_format::packed;
    std::string bytes;
    if (!save_document_to_memory(document, bytes, packing)) return;
    const load_result again = vrl_v2::load_document_from_memory(bytes);
    if (again.failure == file_failure::bad_archive) fuzz::report_finding("own archive: " + again.message);
    std::string text;
    if (!save_document_to_memory(document, text)) fuzz::report_finding("packed and not written plain");
    std::string text_again;
    if (again && save_document_to_memory(*again.document, text_again))
        fuzz::require_equal("saved again, against saved", text_again, text);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    const load_result packed = vrl_v2::load_document_from_memory(bytes, options(false));
    if (static_cast<bool>(packed) != (packed.document != nullptr)) fuzz::report_finding("half a document");
    const load_result collected = vrl_v2::load_document_from_memory(bytes, options(true));
    if (packed.failure != collected.failure || packed.code != collected.code || packed.line != collected.line)
        fuzz::report_finding("collecting: " + collected.message + "\nat once: " + packed.message);
    if (packed.failure == file_failure::limit_exceeded && packed.reports.empty()) return 0;

    const std::optional<std::string> text = unpacked(bytes);
    if (text.has_value() == (packed.failure == file_failure::bad_archive))
        fuzz::report_finding("the engine judges otherwise: " + packed.message);
    if (!text) return 0;
    vrl_v2::load_options plain = options(false);
    plain.format = vrl_v2::file_format::plain;
    require_same(packed, vrl_v2::load_document_from_memory(*text, plain));
    if (packed) save_and_load_again(*packed.document);
    return 0;
}
