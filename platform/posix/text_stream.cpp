#include "platform/text_stream.h"

#include <cstring>
#include <fstream>
#include <streambuf>

#include "platform/text_encoding.h"

namespace vrl_platform {
namespace {

/// Puts a CR before each LF on its way into a file. Nothing is held back: each call writes through to the
/// file's own buffer.
class crlf_buffer : public std::streambuf {
public:
    explicit crlf_buffer(const std::string& path) {
        m_file.open(path, std::ios_base::out | std::ios_base::trunc | std::ios_base::binary);
    }
    bool is_open() const { return m_file.is_open(); }

protected:
    int_type overflow(int_type c) override {
        if (traits_type::eq_int_type(c, traits_type::eof())) return traits_type::not_eof(c);
        const char one = traits_type::to_char_type(c);
        return xsputn(&one, 1) == 1 ? c : traits_type::eof();
    }

    std::streamsize xsputn(const char* text, std::streamsize length) override {
        const char* const end = text + length;
        for (const char* from = text; from != end;) {
            const auto rest = static_cast<std::size_t>(end - from);
            const void* const found = std::memchr(from, '\n', rest);
            const char* const line_end = found == nullptr ? end : static_cast<const char*>(found);
            if (m_file.sputn(from, line_end - from) != line_end - from) return from - text;
            from = line_end;
            if (found == nullptr) break;
            if (m_file.sputn("\r\n", 2) != 2) return from - text;
            ++from;
        }
        return length;
    }

    int sync() override { return m_file.pubsync(); }

private:
    std::filebuf m_file;
};

class crlf_file : public std::ostream {
public:
    explicit crlf_file(const std::string& path) : std::ostream(nullptr), m_buffer(path) {
        rdbuf(&m_buffer);
        if (!m_buffer.is_open()) setstate(std::ios_base::failbit);
    }

private:
    crlf_buffer m_buffer;
};

}  // namespace

std::unique_ptr<std::ostream> create_crlf_file(const std::wstring& path) {
    return std::make_unique<crlf_file>(utf8_from_wide(path));
}

}  // namespace vrl_platform
