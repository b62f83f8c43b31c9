#pragma once

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <iosfwd>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "V2/Vrl.h"
#include "platform/api.h"

/// Whole documents in and out, for new code: nothing is lost on the way, neither an error nor an old file.
///
/// `Vrl::loadFile` and `Vrl::writeFile` are kept as they are, for those who rely on every bit of them. What
/// stands here reads and writes the same two kinds of files:
///
///   plain    the XML text, ".vrl"
///   packed   a ZIP archive whose first entry is the XML text, ".vrlz"
///
/// Failure   by result; nothing here throws for anything that a file, a stream, a disk or a document can do.
///           std::bad_alloc passes; memory that a compressor could not have is a system_error.
/// Threads   calls are independent. Saving only reads the document: several threads may save one at a time.
namespace vrl_v2 {

enum class file_format {
    automatic,  ///< loading: by the first bytes. Saving: by the suffix; plain where there is no path
    plain,
    packed
};

/// What kind of failure it was. In brackets the code that goes with it; for the last two it is the reader's
/// or the model's own, which says more.
enum class file_failure {
    none,            ///< all is well (EQBX_NO_ERROR)
    missing,         ///< there is no such file, or no such folder to save in (EQBX_FILE_NOT_OPENED)
    not_opened,      ///< it is there and could not be opened, or must not be replaced (EQBX_FILE_NOT_OPENED)
    unknown_format,  ///< saving: a suffix that is none of the two (EQBX_USER_ERROR_2)
    bad_archive,     ///< the packed file is damaged, lies, is enciphered or is no archive (EQBX_USER_ERROR_1)
    system_error,    ///< a read or a write failed on the way: a full disk, for instance (EQBX_USER_ERROR_3)
    cancelled,       ///< the progress callback said so (EQBX_USER_ERROR_5)
    limit_exceeded,  ///< a limit of the options, of the reader or of ZIP (EQBX_USER_ERROR_4, or the reader's)
    bad_document     ///< the text is no valid document, or the document is not complete
};

/// What a load or a save came to.
struct file_outcome {
    file_failure failure = file_failure::none;
    qbxV2::eqbx_error code = qbxV2::EQBX_NO_ERROR;
    /// The line of the XML text at fault, from 1; 0 where no line is.
    int line = 0;
    /// The element or attribute at fault, with its prefix; empty where there is none. After a save, the path
    /// of the element below which something is missing, as in "/Vrl:Vrl/Vrl:Palette[2]".
    std::string item;
    /// For people, in UTF-8: which file, where, what is wrong, and what was expected or found. Empty when all
    /// is well. Not for programs: the wording may change.
    std::string message;

    explicit operator bool() const { return failure == file_failure::none; }
};

/// Told about work in progress, after each piece of some 64 KB and once at the end. `total` is 0 where it
/// cannot be known: when saving, and for a stream. False cancels.
///
/// Loading counts bytes of the XML text, out of the file or out of the archive; saving those of the text as
/// it is written, before it is packed. While a packed stream is taken in, before it is unpacked, nothing is
/// done yet: the callback is asked with 0. It must not throw: an exception counts as false.
using progress_callback = std::function<bool(std::uint64_t done, std::uint64_t total)>;

/// One thing that is wrong with a document.
struct load_report {
    qbxV2::eqbx_error code = qbxV2::EQBX_NO_ERROR;
    int line = 0;
    std::string item;
    /// As `file_outcome::message`, without file and line.
    std::string message;
};

struct load_options {
    file_format format = file_format::automatic;

    /// Goes on behind what is wrong, where that is possible, so that all of it can be shown at once. It is
    /// not possible behind damage that the scanner cannot leave behind, nor where the outermost element is
    /// another one. One fault may cause several reports: the first is the one to trust.
    bool collect_reports = false;
    /// Reading ends with this many reports.
    std::size_t max_reports = 1000;

    /// Packed files: the largest text, in bytes, whether declared or found. What comes from a stream or a
    /// pipe and has to be held as it is packed must not be larger either.
    std::uint64_t max_unpacked_size = std::uint64_t{2} << 30;
    /// Packed files: how many times as large as its packed form the text may be, beyond its first MiB.
    /// Deflate reaches some 1030; documents reach 20 to 100.
    unsigned max_ratio = 500;
    /// How many elements may be open at a time.
    unsigned max_depth = qbxV2::c_xml_reader::k_default_max_depth;
    /// What entities may deliver, in bytes.
    std::size_t max_entity_expansion = qbxV2::c_get_with_entities::k_default_max_entity_expansion;

    progress_callback progress;
};

struct [[nodiscard]] load_result : file_outcome {
    /// Null after any failure: there is never half a document.
    std::unique_ptr<Vrl> document;
    /// What is wrong with the document, in the order of the text; without `collect_reports` one at most. The
    /// outcome is that of the first. Empty when the file itself could not be read to its end.
    std::vector<load_report> reports;
};

/// Loads a document from a file of either kind.
///
/// Packed    The archive's first entry is the document, whatever it is called. It is inflated as it is read
///           and never held as a whole. Its CRC, its size and its local header must agree with the archive's
///           directory, and its stream must end where it says; otherwise there is no document, even if all of
///           it could be read.
/// Memory    above the document's own below 1 MB, however large the file. A packed document that comes
///           through a pipe is held as it is packed, as from a stream.
[[nodiscard]] VRL_API load_result load_document(const std::filesystem::path& path,
                                                const load_options& options = {});
/// From where the stream stands; it may be read beyond the end of the document. A packed document is held in
/// memory as it is packed, since an archive is read from its end.
[[nodiscard]] VRL_API load_result load_document(std::istream& stream, const load_options& options = {});
/// From memory, which is only read: text (UTF-8, or what its declaration or byte-order mark says) or a packed
/// file.
[[nodiscard]] VRL_API load_result load_document_from_memory(std::string_view bytes,
                                                            const load_options& options = {});
[[nodiscard]] VRL_API load_result load_document_from_memory(const void* bytes, std::size_t size,
                                                            const load_options& options = {});

/// A path from wide text as this library has it: UTF-16 units, or whole code points where `wchar_t` has room.
/// Whatever the locale; a path made of a std::wstring by itself may depend on it, and then throws.
VRL_API std::filesystem::path path_from_wide(const std::wstring& path);

struct save_options {
    /// `automatic` takes ".vrlz" and ".vrl" in any case; any other suffix is refused.
    file_format format = file_format::automatic;
    /// Packed files: 1 (fast) to 9 (small), 0 stores, -1 is zlib's default. Anything else counts as -1.
    int compression_level = -1;
    progress_callback progress;
};

struct [[nodiscard]] save_result : file_outcome {};

/// Saves a document to a file, which is afterwards either the new document, whole and on the disk, or what it
/// was before.
///
/// Shape     as `Vrl::writeFile` would write it: CR LF at line ends, and `WriteSDKInformation` names this
///           library, in the file only. A packed file has one entry, named after the path's stem and ".vrl".
/// How       Everything goes to a file of a new name in the same folder (".vrl-" and 12 digits), which is
///           flushed to the disk and then takes the target's place in one step; then the folder is flushed.
///           The target's mode, and its owner where the process may, are kept; where its group cannot be, the
///           group gets no rights that not everybody has. A symbolic link stays, and what it leads to is
///           replaced, or made. Other hard links keep the old document; access lists and extended attributes
///           are a new file's. On failure the new file is gone. Only when the process is killed, or the
///           power, it stays behind.
/// Failure   as told at `file_failure`. A document that is not complete is refused (bad_document), and so is
///           one whose `WriteSDKInformation` is there and not complete. A write-protected target is not
///           replaced, nor is a folder or a device (not_opened). If only the flush of the folder fails, the
///           result says so, and the target is the new document.
/// Memory    below 1 MB, however large the document; packing streams.
[[nodiscard]] VRL_API save_result save_document(const Vrl& document, const std::filesystem::path& path,
                                                const save_options& options = {});
/// To where the stream stands. Plain text has LF at line ends here, a packed file what it has on disk. On
/// failure part of the document may have been written. The stream is not flushed. A packed file is made in
/// memory first, since an archive is not written straight through.
[[nodiscard]] VRL_API save_result save_document(const Vrl& document, std::ostream& stream,
                                                const save_options& options = {});
/// To a string, as to a stream. The string is unchanged on failure.
[[nodiscard]] VRL_API save_result save_document_to_memory(const Vrl& document, std::string& bytes,
                                                          const save_options& options = {});

}  // namespace vrl_v2
