#include "V2/document_source.h"

#include <algorithm>
#include <exception>
#include <istream>
#include <new>
#include <streambuf>
#include <utility>

#include "V2/file_outcome.h"

namespace vrl_v2 {

using vrl_platform::seek_origin;

int document_source::read() {
    if (m_run.next == m_run.end && !fill_run()) return -1;
    return *m_run.next++;
}

bool document_source::fill_run() { return advance(); }

void document_source::rewind() {
    m_ended = true;
    m_run = {};
}

std::string_view document_source::peek() {
    if (!m_has_peeked) m_peeked = fetch();
    m_has_peeked = true;
    return m_peeked;
}

bool document_source::advance() {
    if (m_ended) return false;
    const std::string_view bytes = m_has_peeked ? m_peeked : fetch();
    m_has_peeked = false;
    if (bytes.empty()) {
        m_ended = true;
        return false;
    }
    m_run.begin = reinterpret_cast<const unsigned char*>(bytes.data());
    m_run.next = m_run.begin;
    m_run.end = m_run.begin + bytes.size();
    m_fetched += bytes.size();
    tell_progress();
    return !has_failed();
}

std::string document_source::take_all(std::uint64_t most) {
    std::string all;
    for (std::string_view piece = peek(); !piece.empty(); piece = fetch()) {
        all += piece;
        if (all.size() > most) {
            fail(failed(file_failure::limit_exceeded,
                        "the packed document has more than " + std::to_string(most) + " bytes itself"));
        } else {
            tell_progress();
        }
        if (has_failed()) break;
    }
    return all;
}

void document_source::tell_progress() {
    if (!m_progress) return;
    bool go_on = false;
    try {
        go_on = m_progress(m_fetched, m_total);
    } catch (...) {
        go_on = false;
    }
    if (!go_on) fail(failed(file_failure::cancelled, "cancelled"));
}

void document_source::fail(file_outcome problem) {
    if (has_failed()) return;
    m_problem = std::move(problem);
    m_ended = true;
    m_run = {};
}

void document_source::finish() {
    if (reads_to_the_end()) {
        while (advance()) continue;
    }
    if (!has_failed()) check_end();
    if (!has_failed()) tell_progress();
}

descriptor_source::descriptor_source(vrl_platform::file_descriptors& files, int descriptor,
                                     const progress_callback& progress)
    : document_source(progress),
      m_files(files),
      m_descriptor(descriptor),
      m_window(std::make_unique<char[]>(k_window)) {
    // What cannot seek has no size that could be told.
    const auto size = m_files.seek(m_descriptor, 0, seek_origin::end);
    if (size.value < 0) return;
    m_can_seek = true;
    set_total(static_cast<std::uint64_t>(size.value));
    const auto begin = m_files.seek(m_descriptor, 0, seek_origin::begin);
    if (begin.value != 0) fail(failed_call("cannot be read", begin.error));
}

std::string_view descriptor_source::fetch() {
    if (has_failed()) return {};
    const auto got = m_files.read(m_descriptor, m_window.get(), k_window);
    if (got.error != 0) {
        fail(failed_call("reading failed", got.error));
        return {};
    }
    return {m_window.get(), static_cast<std::size_t>(got.value)};
}

stream_source::stream_source(std::istream& stream, const progress_callback& progress)
    : document_source(progress), m_stream(stream), m_window(std::make_unique<char[]>(k_window)) {}

std::string_view stream_source::fetch() {
    if (has_failed()) return {};
    if (!m_stream.good() || m_stream.rdbuf() == nullptr) {
        fail(failed(file_failure::not_opened, "the stream cannot be read"));
        return {};
    }
    try {
        const std::streamsize got = m_stream.rdbuf()->sgetn(m_window.get(), k_window);
        return {m_window.get(), static_cast<std::size_t>(got)};
    } catch (const std::bad_alloc&) {
        throw;
    } catch (const std::exception& thrown) {
        fail(failed(file_failure::system_error, std::string("reading the stream failed: ") + thrown.what()));
        return {};
    } catch (...) {
        fail(failed(file_failure::system_error, "reading the stream failed"));
        return {};
    }
}

memory_source::memory_source(std::string_view bytes, const progress_callback& progress)
    : document_source(progress), m_rest(bytes), m_piece(progress ? k_window : bytes.size()) {
    set_total(bytes.size());
}

std::string_view memory_source::fetch() {
    const std::string_view piece = m_rest.substr(0, m_piece);
    m_rest.remove_prefix(piece.size());
    return piece;
}

}  // namespace vrl_v2
