#pragma once

#include <cstdint>
#include <iosfwd>
#include <memory>
#include <string>
#include <string_view>

#include "V2/document_file.h"
#include "platform/file_descriptors.h"
#include "runtime/byte_source.h"

/// Where the text of a document comes from: piece by piece, with a word about progress after each, and with
/// a record of what went wrong, since the reader above sees no more than an end.
namespace vrl_v2 {

/// How much is fetched at once.
inline constexpr std::size_t k_window = 64 * 1024;

/// One pass, from the first byte to the last. It cannot be rewound: the document is read once.
class document_source : public qbxV2::c_read {
public:
    document_source(const document_source&) = delete;
    document_source& operator=(const document_source&) = delete;

    int read() final;
    bool fill_run() final;
    /// Ends the input: what is gone cannot be had again.
    void rewind() final;

    /// The first piece, which stays to be read. Empty when there is none.
    std::string_view peek();
    /// All that is left, the first piece included, instead of reading it. Asks whether to go on after each
    /// piece, with nothing done yet. Fails as soon as there are more bytes than `most`.
    std::string take_all(std::uint64_t most);
    /// Behind the reading: reads on as far as that serves to check the source itself.
    void finish();
    /// What kept the source from delivering all; no failure if nothing did.
    const file_outcome& problem() const { return m_problem; }

protected:
    explicit document_source(const progress_callback& progress) : m_progress(progress) {}

    /// The next bytes, valid until the next call; empty at the end and after `fail`.
    virtual std::string_view fetch() = 0;
    /// Whether what the document does not need is to be read all the same.
    virtual bool reads_to_the_end() const { return false; }
    /// All has been fetched.
    virtual void check_end() {}

    void fail(file_outcome problem);
    bool has_failed() const { return !m_problem; }
    void set_total(std::uint64_t bytes) { m_total = bytes; }
    std::uint64_t fetched() const { return m_fetched; }

private:
    bool advance();
    void tell_progress();

    const progress_callback& m_progress;
    std::uint64_t m_fetched = 0;
    std::uint64_t m_total = 0;
    std::string_view m_peeked;
    bool m_has_peeked = false;
    bool m_ended = false;
    file_outcome m_problem;
};

/// A file that is open for reading, by descriptor, from its first byte.
class descriptor_source : public document_source {
public:
    /// Borrows the descriptor.
    descriptor_source(vrl_platform::file_descriptors& files, int descriptor,
                      const progress_callback& progress);

    /// Not so for a pipe.
    bool can_seek() const { return m_can_seek; }

protected:
    std::string_view fetch() override;

private:
    vrl_platform::file_descriptors& m_files;
    int m_descriptor;
    bool m_can_seek = false;
    std::unique_ptr<char[]> m_window;
};

/// A stream from where it stands, without the stream's own formatting or state.
class stream_source : public document_source {
public:
    stream_source(std::istream& stream, const progress_callback& progress);

protected:
    std::string_view fetch() override;

private:
    std::istream& m_stream;
    std::unique_ptr<char[]> m_window;
};

/// Bytes in memory, where they stand.
class memory_source : public document_source {
public:
    memory_source(std::string_view bytes, const progress_callback& progress);

protected:
    std::string_view fetch() override;

private:
    std::string_view m_rest;
    std::size_t m_piece;
};

}  // namespace vrl_v2
