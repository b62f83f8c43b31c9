#include "runtime/text_conversions.h"

#include <algorithm>
#include <cstdint>

#include "platform/utf_characters.h"

namespace qbxV2 {

using vrl_platform::append_utf8;
using vrl_platform::code_of;
using vrl_platform::from_surrogates;
using vrl_platform::high_surrogate_of;
using vrl_platform::is_high_surrogate;
using vrl_platform::is_low_surrogate;
using vrl_platform::low_surrogate_of;
using vrl_platform::read_utf8_sequence;

namespace {

/// Converts from the element at `at` on, appending to `out`.
void append_utf8_from(std::string& out, const std::wstring& in, std::size_t at) {
    while (at < in.size()) {
        auto code = code_of(in[at++]);
        if (is_high_surrogate(code) && at < in.size()) {
            // Intended: the element behind a high surrogate is used up even when it is no low surrogate.
            const auto next = code_of(in[at++]);
            if (is_low_surrogate(next)) code = from_surrogates(code, next);
        }
        // Intended: an element of 0 vanishes.
        if (code != 0) append_utf8(out, code);
    }
}

/// Converts from the byte at `at` on into `units`, which has room for as many units as there are bytes.
/// Returns the number of units.
std::size_t put_units_from(wchar_t* units, const char* in, std::size_t size, std::size_t at) {
    wchar_t* const start = units;
    std::uint32_t pending = 0;
    while (at < size) {
        std::uint32_t code = 0;
        const std::size_t count = read_utf8_sequence(in, size, at, code);
        if (count == 0) break;
        at += count;
        if (pending != 0) {
            if (!is_low_surrogate(code)) break;
            *units++ = static_cast<wchar_t>(pending);
            *units++ = static_cast<wchar_t>(code);
            pending = 0;
        } else if (is_high_surrogate(code)) {
            pending = code;
        } else if (code > 0xFFFF) {
            *units++ = static_cast<wchar_t>(high_surrogate_of(code));
            *units++ = static_cast<wchar_t>(low_surrogate_of(code));
        } else {
            *units++ = static_cast<wchar_t>(code);
        }
    }
    return static_cast<std::size_t>(units - start);
}

constexpr std::size_t k_widened_at_once = 2048;

/// Widens everything in one loop without a way out, which compilers turn into vector code, and says
/// afterwards whether that was right.
bool widen_ascii(wchar_t* units, const char* in, std::size_t size) {
    unsigned char all = 0;
    for (std::size_t i = 0; i < size; ++i) {
        const auto byte = static_cast<unsigned char>(in[i]);
        all |= byte;
        units[i] = static_cast<wchar_t>(byte);
    }
    return all < 0x80;
}

}  // namespace

double float_zero() { return 0.0; }

std::string& convert(std::string* out, const std::wstring& in) {
    // Most texts are ASCII: narrow everything, and do it again from the first element that was none.
    out->resize(in.size());
    char* const bytes = out->data();
    std::size_t plain = 0;
    for (; plain < in.size(); ++plain) {
        const auto code = code_of(in[plain]);
        if (code - 1 >= 0x7F) break;
        bytes[plain] = static_cast<char>(code);
    }
    out->resize(plain);
    append_utf8_from(*out, in, plain);
    return *out;
}

std::wstring& convert(std::wstring* out, const std::string& in) { return vtostring(*out, in); }

std::wstring& vtostring(std::wstring& out, const std::string& in) {
    return vtostring(out, in.data(), in.size());
}

std::wstring& vtostring(std::wstring& out, const char* in, std::size_t size) {
    out.clear();
    out.reserve(size);
    // Most texts are ASCII, and are widened piece by piece: what `resize` fills in is still in the cache when
    // it is written over.
    for (std::size_t at = 0; at < size;) {
        const std::size_t piece = std::min(size - at, k_widened_at_once);
        out.resize(at + piece);
        if (!widen_ascii(out.data() + at, in + at, piece)) {
            while (static_cast<unsigned char>(in[at]) < 0x80) ++at;
            out.resize(size);
            out.resize(at + put_units_from(out.data() + at, in, size, at));
            break;
        }
        at += piece;
    }
    return out;
}

std::string& vtostring(std::string& out, const std::string& in) {
    // Intended: cleared first, so that a string converted into itself ends up empty.
    out.clear();
    out.append(in);
    return out;
}

void make_qname(std::string* out, const std::string& qualified, const std::string& /*uri*/,
                const std::string& /*local_part*/) {
    *out = qualified;
}

void make_qname(std::wstring* out, const std::string& qualified, const std::string& /*uri*/,
                const std::string& /*local_part*/) {
    vtostring(*out, qualified);
}

void make_qname(ct_qname<std::string>* out, const std::string& /*qualified*/, const std::string& uri,
                const std::string& local_part) {
    out->set_namespace(uri);
    out->set_local_part(local_part);
}

void make_qname(ct_qname<std::wstring>* out, const std::string& /*qualified*/, const std::string& uri,
                const std::string& local_part) {
    out->set_namespace(uri);
    std::wstring wide;
    out->set_local_part(vtostring(wide, local_part));
}

}  // namespace qbxV2
