#pragma once

#include <cstdint>
#include <iosfwd>
#include <memory>
#include <streambuf>
#include <string>

#include "V2/document_file.h"
#include "platform/file_descriptors.h"
#include "zip/zip_archive.h"

/// Where the text of a document goes: piece by piece, with a word about progress after each, and with a
/// record of what went wrong, since a stream above would only stop.
namespace vrl_v2 {

enum class line_ends { lf, cr_lf };

class document_output : public std::streambuf {
public:
    /// Hands on what still waits. False after any failure. std::bad_alloc, which the stream above would have
    /// swallowed, comes out here.
    bool finish();
    /// No failure as long as all that came has been handed on.
    const file_outcome& problem() const { return m_problem; }

protected:
    document_output(line_ends ends, const progress_callback& progress);

    /// Takes the next bytes over, or calls `fail`.
    virtual void put(const char* bytes, std::size_t size) = 0;
    void fail(file_outcome problem);

    int_type overflow(int_type c) override;
    std::streamsize xsputn(const char* text, std::streamsize length) override;

private:
    bool has_failed() const { return !m_problem; }
    void add(const char* bytes, std::size_t size);
    void add_lines(const char* text, const char* end);
    void hand_on();
    void put_what_waits();
    void tell_progress();

    line_ends m_ends;
    const progress_callback& m_progress;
    std::unique_ptr<char[]> m_buffer;
    std::size_t m_used = 0;
    std::uint64_t m_done = 0;
    bool m_out_of_memory = false;
    file_outcome m_problem;
};

/// To an open file. Borrows the descriptor.
class descriptor_output : public document_output {
public:
    descriptor_output(vrl_platform::file_descriptors& files, int descriptor, line_ends ends,
                      const progress_callback& progress)
        : document_output(ends, progress), m_files(files), m_descriptor(descriptor) {}

protected:
    void put(const char* bytes, std::size_t size) override;

private:
    vrl_platform::file_descriptors& m_files;
    int m_descriptor;
};

/// To a caller's stream.
class stream_output : public document_output {
public:
    stream_output(std::ostream& stream, line_ends ends, const progress_callback& progress)
        : document_output(ends, progress), m_stream(stream) {}

protected:
    void put(const char* bytes, std::size_t size) override;

private:
    std::ostream& m_stream;
};

/// Behind the end of a string.
class string_output : public document_output {
public:
    string_output(std::string& bytes, line_ends ends, const progress_callback& progress)
        : document_output(ends, progress), m_bytes(bytes) {}

protected:
    void put(const char* bytes, std::size_t size) override { m_bytes.append(bytes, size); }

private:
    std::string& m_bytes;
};

/// Into the entry of an archive that is being written.
class archive_output : public document_output {
public:
    archive_output(CZipArchive& archive, line_ends ends, const progress_callback& progress)
        : document_output(ends, progress), m_archive(archive) {}

protected:
    void put(const char* bytes, std::size_t size) override;

private:
    CZipArchive& m_archive;
};

}  // namespace vrl_v2
