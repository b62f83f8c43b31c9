#include <utility>

#include "V2/archive_source.h"
#include "V2/block_file.h"
#include "V2/descriptor_file.h"
#include "V2/document_file.h"
#include "V2/file_access.h"
#include "V2/file_outcome.h"
#include "V2/reporting_reader.h"

namespace vrl_v2 {
namespace {

using qbxV2::eqbx_error;

/// How archives begin: with an entry, with their end when they have none, or with the marker of volumes.
/// (APPNOTE 4.3.7, 4.3.16, 8.5.4)
bool looks_packed(std::string_view bytes) {
    constexpr std::size_t k_signature = 4;
    const std::string_view begin = bytes.substr(0, k_signature);
    return begin == std::string_view("PK\3\4") || begin == std::string_view("PK\5\6") ||
           begin == std::string_view("PK\7\10");
}

bool is_packed(document_source& source, const load_options& options) {
    if (options.format != file_format::automatic) return options.format == file_format::packed;
    return looks_packed(source.peek());
}

load_result failed_load(file_outcome outcome) {
    load_result result;
    static_cast<file_outcome&>(result) = std::move(outcome);
    return result;
}

file_outcome outcome_of(const std::vector<load_report>& reports, bool limit_exceeded) {
    const load_report& first = reports.front();
    file_outcome outcome =
        failed(limit_exceeded ? file_failure::limit_exceeded : file_failure::bad_document, first.message);
    outcome.code = first.code;
    outcome.line = first.line;
    outcome.item = first.item;
    if (reports.size() > 1) {
        outcome.message += " (and " + std::to_string(reports.size() - 1) + " more)";
    }
    return outcome;
}

/// Reads the document, then judges the source: only what came from a good one is handed over.
load_result read_document(document_source& source, const load_options& options) {
    auto document = std::make_unique<Vrl>();
    reporting_reader reader(source, options);
    const eqbx_error code = document->unmarshal(reader);
    if (code != qbxV2::EQBX_NO_ERROR && reader.reports().empty()) reader.note(code);
    source.finish();
    if (!source.problem()) return failed_load(source.problem());
    load_result result;
    result.reports = std::move(reader.reports());
    if (result.reports.empty()) {
        result.document = std::move(document);
    } else {
        static_cast<file_outcome&>(result) = outcome_of(result.reports, reader.is_limit_exceeded());
    }
    return result;
}

load_result read_archive(CZipAbstractFile& file, const load_options& options) {
    archive_source source(file, options);
    return read_document(source, options);
}

load_result read_archive(std::string_view bytes, const load_options& options) {
    if (bytes.size() > 0xFFFFFFFF) {
        return failed_load(
            failed(file_failure::limit_exceeded, "an archive of 4 GB and more cannot be read"));
    }
    block_file file(bytes);
    return read_archive(file, options);
}

/// An archive that comes from where nobody can go back to its end: it is held as it is packed. What holds for
/// the text holds for that all the more.
load_result read_held_archive(document_source& source, const load_options& options) {
    const std::string bytes = source.take_all(options.max_unpacked_size);
    return source.problem() ? read_archive(bytes, options) : failed_load(source.problem());
}

load_result read_descriptor(int descriptor, const load_options& options, const file_access& access) {
    {
        descriptor_source source(access.files, descriptor, options.progress);
        if (!is_packed(source, options)) return read_document(source, options);
        if (!source.can_seek()) return read_held_archive(source, options);
    }
    descriptor_file file(access.files, descriptor);
    load_result result = read_archive(file, options);
    return file.call_error() == 0 ? std::move(result)
                                  : failed_load(failed_call(k_cannot_be_read, file.call_error()));
}

load_result placed(load_result result, const std::string& name) {
    place(result, name);
    return result;
}

}  // namespace

const file_access& file_access::system() {
    static const file_access access{vrl_platform::native_file_descriptors(),
                                    vrl_platform::native_file_exchange()};
    return access;
}

load_result load_document(const std::filesystem::path& path, const load_options& options,
                          const file_access& access) {
    const vrl_platform::io_result opened = access.exchange.open(path);
    if (opened.value < 0) {
        return placed(failed_load(failed_opening("cannot be opened", opened.error)), as_text(path));
    }
    // Closed however the reading ends; a file that was only read has nothing to lose by it.
    struct closing {
        const file_access& access;
        int descriptor;
        ~closing() { access.files.close(descriptor); }
    };
    const auto descriptor = static_cast<int>(opened.value);
    const closing guard{access, descriptor};
    return placed(read_descriptor(descriptor, options, access), as_text(path));
}

load_result load_document(const std::filesystem::path& path, const load_options& options) {
    return load_document(path, options, file_access::system());
}

load_result load_document(std::istream& stream, const load_options& options) {
    stream_source source(stream, options.progress);
    if (!is_packed(source, options)) return placed(read_document(source, options), {});
    return placed(read_held_archive(source, options), {});
}

load_result load_document_from_memory(std::string_view bytes, const load_options& options) {
    memory_source source(bytes, options.progress);
    if (!is_packed(source, options)) return placed(read_document(source, options), {});
    return placed(read_archive(bytes, options), {});
}

load_result load_document_from_memory(const void* bytes, std::size_t size, const load_options& options) {
    return load_document_from_memory(std::string_view(static_cast<const char*>(bytes), size), options);
}

}  // namespace vrl_v2
