#include "V2/archive_source.h"

#include "V2/file_outcome.h"

namespace vrl_v2 {
namespace {

constexpr int k_entry_is_whole = 1;
/// Smaller texts harm nobody, however well they are packed.
constexpr std::uint64_t k_free_of_ratio = std::uint64_t{1} << 20;

file_outcome bad_archive(const std::string& why) {
    return failed(file_failure::bad_archive, std::string(k_cannot_be_read) + ": " + why);
}

}  // namespace

archive_source::archive_source(CZipAbstractFile& file, const load_options& options)
    : document_source(options.progress), m_options(options), m_window(std::make_unique<char[]>(k_window)) {
    try {
        open(file);
    } catch (const CZipException& exception) {
        fail_with(exception);
    }
}

void archive_source::fail_with(const CZipException& exception) {
    fail(failed_archive(k_cannot_be_read, exception.GetCode()));
}

void archive_source::open(CZipAbstractFile& file) {
    m_archive.Open(file, CZipStorage::openReadOnly);
    // The engine forgives data descriptors that lie; a document's does not have to.
    m_archive.GetCentralDir().SetIgnoredChecks(0);
    const CZipFileHeader* const header = m_archive.GetEntryHeader(0);
    if (header == nullptr) {
        fail(bad_archive("the archive has no entries"));
        return;
    }
    admit(*header);
    if (has_failed() || m_archive.OpenEntry(0)) return;
    fail(bad_archive("it is packed by method " + std::to_string(header->GetMethod()) +
                     "; expected deflate (8), bzip2 (12) or stored (0)"));
}

void archive_source::admit(const CZipFileHeader& header) {
    m_declared = header.GetUncompressedSize();
    m_packed = header.GetDataSize();
    set_total(m_declared);
    if (m_declared > m_options.max_unpacked_size) {
        refuse_size();
    } else if (!is_within_ratio(m_declared, m_packed)) {
        refuse_ratio();
    }
}

bool archive_source::is_within_ratio(std::uint64_t unpacked, std::uint64_t packed) const {
    return unpacked <= k_free_of_ratio || unpacked <= packed * m_options.max_ratio;
}

void archive_source::refuse_size() {
    fail(failed(file_failure::limit_exceeded, "the packed document would unpack to " +
                                                  std::to_string(m_declared) + " bytes; allowed are " +
                                                  std::to_string(m_options.max_unpacked_size)));
}

void archive_source::refuse_ratio() {
    fail(failed(file_failure::limit_exceeded, "the packed document would unpack to more than " +
                                                  std::to_string(m_options.max_ratio) +
                                                  " times its packed size"));
}

std::string_view archive_source::fetch() {
    if (has_failed()) return {};
    try {
        const std::uint32_t got = m_archive.ReadEntry(m_window.get(), k_window);
        // A declared packed size can be a lie, too: what counts is how much of it has been used up.
        const std::uint32_t used = m_packed - m_archive.GetCompressor()->GetUnusedInput();
        if (!is_within_ratio(fetched() + got, used)) {
            refuse_ratio();
            return {};
        }
        return {m_window.get(), got};
    } catch (const CZipException& exception) {
        fail_with(exception);
        return {};
    }
}

void archive_source::check_end() {
    if (fetched() != m_declared) {
        fail(bad_archive("it ends after " + std::to_string(fetched()) + " of " + std::to_string(m_declared) +
                         " bytes"));
        return;
    }
    try {
        char more = 0;
        if (m_archive.ReadEntry(&more, 1) != 0) {
            fail(bad_archive("it goes on behind its declared size"));
        } else if (const std::uint32_t unused = m_archive.GetCompressor()->GetUnusedInput()) {
            fail(bad_archive("it is packed in " + std::to_string(unused) + " bytes less than declared"));
        } else if (m_archive.CloseEntry() != k_entry_is_whole) {
            fail(bad_archive("the entry is not whole"));
        } else {
            m_archive.Close();
        }
    } catch (const CZipException& exception) {
        fail_with(exception);
    }
}

}  // namespace vrl_v2
