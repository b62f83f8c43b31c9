#include <algorithm>
#include <ostream>
#include <utility>

#include "V2/descriptor_file.h"
#include "V2/document_file.h"
#include "V2/document_writer.h"
#include "V2/file_access.h"
#include "V2/file_outcome.h"
#include "V2/replaced_file.h"
#include "zip/bytes.h"
#include "zip/mem_file.h"

namespace vrl_v2 {
namespace {

constexpr char k_plain_suffix[] = ".vrl";
constexpr char k_packed_suffix[] = ".vrlz";
constexpr char k_unnamed[] = "document";
constexpr char k_cannot_be_written[] = "the packed document cannot be written";
/// APPNOTE 4.6.9: the name of an entry in UTF-8, beside the one in a code page.
constexpr std::uint16_t k_unicode_path = 0x7075;
constexpr std::uint32_t k_archive_attribute = 0x20;
/// A packed document in memory grows by this much at a time.
constexpr std::uint32_t k_grow_step = 1 << 20;

/// ASCII case is ignored, and nothing else.
bool is_suffix(const std::string& suffix, const char* expected) {
    if (suffix.size() != std::strlen(expected)) return false;
    for (std::size_t i = 0; i < suffix.size(); ++i) {
        const char c = suffix[i];
        if ((c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c) != expected[i]) return false;
    }
    return true;
}

/// `automatic` for a suffix that is none of the two. A name that is all suffix has one, too.
file_format format_of(const std::filesystem::path& path) {
    const std::string name = as_text(path.filename());
    const std::size_t dot = name.rfind('.');
    const std::string suffix = dot == std::string::npos ? std::string() : name.substr(dot);
    if (is_suffix(suffix, k_packed_suffix)) return file_format::packed;
    return is_suffix(suffix, k_plain_suffix) ? file_format::plain : file_format::automatic;
}

std::string entry_name(const std::filesystem::path& path) {
    const std::string name = as_text(path.filename());
    const std::string stem = name.substr(0, name.rfind('.'));
    return (stem.empty() ? k_unnamed : stem) + std::string(k_plain_suffix);
}

/// One character for each that ASCII does not have.
std::string ascii_of(const std::string& name) {
    std::string ascii;
    for (const char c : name) {
        const auto byte = static_cast<unsigned char>(c);
        const bool goes_on = (byte & 0xC0) == 0x80;
        if (!goes_on) ascii += byte < 0x80 && c != '\\' ? c : '_';
    }
    return ascii;
}

void add_unicode_path(CZipExtraField& extra, const std::string& ascii, const std::string& name) {
    constexpr std::uint8_t k_version = 1;
    constexpr std::uint32_t k_head = 5;
    CZipExtraRecord& record = extra.Add(k_unicode_path, k_head + static_cast<std::uint32_t>(name.size()));
    std::uint8_t* const out = record.data.GetBuffer();
    const auto* const bytes = reinterpret_cast<const Bytef*>(ascii.data());
    out[0] = k_version;
    ZipArchiveLib::StoreNumber32(
        out + 1, static_cast<std::uint32_t>(crc32(0, bytes, static_cast<uInt>(ascii.size()))));
    std::copy(name.begin(), name.end(), out + k_head);
}

/// Names are stored in a code page that few have; so what is not ASCII stands beside them in UTF-8.
CZipFileHeader entry_header(const std::string& name) {
    CZipFileHeader header;
    const std::string ascii = ascii_of(name);
    header.SetFileName(ascii);
    header.SetAttributes(k_archive_attribute);
    if (ascii != name) {
        add_unicode_path(header.GetLocalExtra(), ascii, name);
        add_unicode_path(header.GetCentralExtra(), ascii, name);
    }
    return header;
}

/// One deflated entry, its text with the line ends of files.
file_outcome write_packed(const Vrl& document, CZipAbstractFile& file, const std::string& name,
                          const save_options& options) {
    try {
        CZipArchive archive;
        archive.Open(file, CZipStorage::create);
        archive.SetCompressionMethod(CZipFileHeader::deflated);
        archive.OpenNewEntry(entry_header(name), options.compression_level);
        archive_output out(archive, line_ends::cr_lf, options.progress);
        file_outcome outcome = write_document(document, out);
        if (outcome) {
            archive.CloseNewEntry();
            archive.Close();
        } else {
            archive.Close(1);
        }
        return outcome;
    } catch (const CZipException& exception) {
        return failed_archive(k_cannot_be_written, exception.GetCode());
    }
}

file_outcome write_packed(const Vrl& document, std::string& bytes, const save_options& options) {
    CZipMemFile file(k_grow_step);
    file_outcome outcome = write_packed(document, file, std::string(k_unnamed) + k_plain_suffix, options);
    if (outcome) bytes.assign(reinterpret_cast<const char*>(file.GetData()), file.GetLength());
    return outcome;
}

file_outcome copy_to(std::ostream& stream, const std::string& bytes) {
    const progress_callback none;
    stream_output out(stream, line_ends::lf, none);
    out.sputn(bytes.data(), static_cast<std::streamsize>(bytes.size()));
    out.finish();
    return out.problem();
}

file_outcome write_to(replaced_file& file, const Vrl& document, file_format format, const std::string& name,
                      const save_options& options, const file_access& access) {
    if (format == file_format::packed) {
        descriptor_file archive(access.files, file.descriptor());
        const file_outcome outcome = write_packed(document, archive, name, options);
        return archive.call_error() == 0 ? outcome : failed_call(k_cannot_be_written, archive.call_error());
    }
    descriptor_output out(access.files, file.descriptor(), line_ends::cr_lf, options.progress);
    return write_document(document, out);
}

file_outcome save_to(const std::filesystem::path& path, const Vrl& document, const save_options& options,
                     const file_access& access) {
    const file_format format = options.format == file_format::automatic ? format_of(path) : options.format;
    if (format == file_format::automatic) {
        return failed(file_failure::unknown_format,
                      "the name tells no format; expected it to end in .vrl or .vrlz");
    }
    replaced_file file(path, access);
    if (!file.problem()) return file.problem();
    file_outcome outcome = write_to(file, document, format, entry_name(path), options, access);
    return outcome ? file.commit() : outcome;
}

save_result result_of(file_outcome outcome, const std::string& name) {
    place(outcome, name);
    save_result result;
    static_cast<file_outcome&>(result) = std::move(outcome);
    return result;
}

}  // namespace

save_result save_document(const Vrl& document, const std::filesystem::path& path, const save_options& options,
                          const file_access& access) {
    // Whatever takes memory comes before the file takes its place: afterwards nothing may throw.
    const std::string name = as_text(path);
    return result_of(save_to(path, document, options, access), name);
}

save_result save_document(const Vrl& document, const std::filesystem::path& path,
                          const save_options& options) {
    return save_document(document, path, options, file_access::system());
}

save_result save_document(const Vrl& document, std::ostream& stream, const save_options& options) {
    file_outcome outcome;
    if (options.format == file_format::packed) {
        std::string bytes;
        outcome = write_packed(document, bytes, options);
        if (outcome) outcome = copy_to(stream, bytes);
    } else {
        stream_output out(stream, line_ends::lf, options.progress);
        outcome = write_document(document, out);
    }
    return result_of(std::move(outcome), {});
}

save_result save_document_to_memory(const Vrl& document, std::string& bytes, const save_options& options) {
    std::string made;
    file_outcome outcome;
    if (options.format == file_format::packed) {
        outcome = write_packed(document, made, options);
    } else {
        string_output out(made, line_ends::lf, options.progress);
        outcome = write_document(document, out);
    }
    if (outcome) bytes = std::move(made);
    return result_of(std::move(outcome), {});
}

}  // namespace vrl_v2
