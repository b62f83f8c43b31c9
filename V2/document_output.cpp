#include "V2/document_output.h"

#include <algorithm>
#include <cerrno>
#include <cstring>
#include <exception>
#include <new>
#include <ostream>
#include <utility>

#include "V2/file_outcome.h"

namespace vrl_v2 {
namespace {

constexpr std::size_t k_buffer = 32 * 1024;

}  // namespace

document_output::document_output(line_ends ends, const progress_callback& progress)
    : m_ends(ends), m_progress(progress), m_buffer(std::make_unique<char[]>(k_buffer)) {}

document_output::int_type document_output::overflow(int_type c) {
    if (traits_type::eq_int_type(c, traits_type::eof())) return traits_type::not_eof(c);
    const char one = traits_type::to_char_type(c);
    return xsputn(&one, 1) == 1 ? c : traits_type::eof();
}

std::streamsize document_output::xsputn(const char* text, std::streamsize length) {
    const char* const end = text + length;
    if (m_ends == line_ends::lf) {
        add(text, static_cast<std::size_t>(length));
    } else {
        add_lines(text, end);
    }
    return has_failed() ? 0 : length;
}

void document_output::add_lines(const char* text, const char* end) {
    while (text != end) {
        const void* const found = std::memchr(text, '\n', static_cast<std::size_t>(end - text));
        const char* const line_end = found == nullptr ? end : static_cast<const char*>(found);
        add(text, static_cast<std::size_t>(line_end - text));
        if (found == nullptr) return;
        add("\r\n", 2);
        text = line_end + 1;
    }
}

void document_output::add(const char* bytes, std::size_t size) {
    while (size != 0 && !has_failed()) {
        const std::size_t taken = std::min(size, k_buffer - m_used);
        std::memcpy(m_buffer.get() + m_used, bytes, taken);
        m_used += taken;
        bytes += taken;
        size -= taken;
        if (m_used == k_buffer) hand_on();
    }
}

void document_output::put_what_waits() {
    try {
        put(m_buffer.get(), m_used);
    } catch (const std::bad_alloc&) {
        m_out_of_memory = true;
        fail(failed(file_failure::system_error, "out of memory"));
    } catch (const std::exception& thrown) {
        fail(failed(file_failure::system_error, std::string("writing failed: ") + thrown.what()));
    } catch (...) {
        fail(failed(file_failure::system_error, "writing failed"));
    }
}

void document_output::hand_on() {
    put_what_waits();
    m_done += m_used;
    m_used = 0;
    if (!has_failed()) tell_progress();
}

void document_output::tell_progress() {
    if (!m_progress) return;
    bool go_on = false;
    try {
        go_on = m_progress(m_done, 0);
    } catch (...) {
        go_on = false;
    }
    if (!go_on) fail(failed(file_failure::cancelled, "cancelled"));
}

bool document_output::finish() {
    if (!has_failed()) hand_on();
    if (m_out_of_memory) throw std::bad_alloc();
    return !has_failed();
}

void document_output::fail(file_outcome problem) {
    if (!has_failed()) m_problem = std::move(problem);
}

void descriptor_output::put(const char* bytes, std::size_t size) {
    const auto written = m_files.write(m_descriptor, bytes, size);
    if (written.value == static_cast<std::int64_t>(size)) return;
    fail(failed_call("writing failed", written.error != 0 ? written.error : ENOSPC));
}

void stream_output::put(const char* bytes, std::size_t size) {
    if (m_stream.write(bytes, static_cast<std::streamsize>(size))) return;
    fail(failed(file_failure::system_error, "writing failed: the stream takes no more"));
}

void archive_output::put(const char* bytes, std::size_t size) {
    try {
        m_archive.WriteNewEntry(bytes, static_cast<std::uint32_t>(size));
    } catch (const CZipException& exception) {
        fail(failed_archive("the packed document cannot be written", exception.GetCode()));
    }
}

}  // namespace vrl_v2
