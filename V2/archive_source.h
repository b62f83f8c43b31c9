#pragma once

#include <cstdint>
#include <memory>
#include <string_view>

#include "V2/document_source.h"
#include "zip/zip_archive.h"

namespace vrl_v2 {

/// How messages begin that say why.
inline constexpr char k_cannot_be_read[] = "the packed document cannot be read";

/// The first entry of an archive, inflated piece by piece as the reader asks for it.
///
/// What the archive says about the entry is judged: at the opening (local header against directory, declared
/// sizes against the limits), on the way (limits again, by what really comes), and at the end (length, CRC,
/// end of the stream, data descriptor). Any lie is a problem of this source.
class archive_source : public document_source {
public:
    /// Borrows the archive's file and the options.
    archive_source(CZipAbstractFile& file, const load_options& options);

protected:
    std::string_view fetch() override;
    bool reads_to_the_end() const override { return true; }
    void check_end() override;

private:
    void open(CZipAbstractFile& file);
    void admit(const CZipFileHeader& header);
    bool is_within_ratio(std::uint64_t unpacked, std::uint64_t packed) const;
    void refuse_size();
    void refuse_ratio();
    void fail_with(const CZipException& exception);

    const load_options& m_options;
    CZipArchive m_archive;
    std::uint32_t m_declared = 0;
    std::uint32_t m_packed = 0;
    std::unique_ptr<char[]> m_window;
};

}  // namespace vrl_v2
