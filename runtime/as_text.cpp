#include "runtime/as_text.h"

#include <array>
#include <cmath>
#include <cstdint>
#include <ostream>
#include <string_view>

#include "platform/text_encoding.h"
#include "platform/utf_characters.h"
#include "runtime/binary.h"
#include "runtime/number_text.h"
#include "runtime/stream_state.h"

namespace qbxV2 {
namespace {

constexpr std::streamsize k_float_digits = 7;
constexpr std::streamsize k_double_digits = 14;

std::ostream& write(std::ostream& os, std::string_view text) {
    return os.write(text.data(), static_cast<std::streamsize>(text.size()));
}

/// The reference that stands for `code` in markup; empty if it stands for itself. ">" does.
std::string_view reference_for(std::uint32_t code) {
    switch (code) {
        case '"':
            return "&quot;";
        case '\'':
            return "&apos;";
        case '&':
            return "&amp;";
        case '<':
            return "&lt;";
        default:
            return {};
    }
}

constexpr std::array<bool, 0x80> make_plain_codes() {
    std::array<bool, 0x80> table{};
    for (bool& is_plain : table) is_plain = true;
    for (const char c : {'"', '\'', '&', '<'}) table[static_cast<unsigned char>(c)] = false;
    return table;
}

/// The ASCII characters that stand for themselves.
constexpr std::array<bool, 0x80> k_plain_codes = make_plain_codes();

bool is_plain(std::uint32_t code) { return code < k_plain_codes.size() && k_plain_codes[code]; }

/// Appends the plain elements from `at` on and returns the place of the first other one.
std::size_t append_plain_run(std::string& out, const wchar_t* text, std::size_t at, std::size_t size) {
    std::size_t end = at;
    while (end != size && is_plain(vrl_platform::code_of(text[end]))) ++end;
    const std::size_t before = out.size();
    out.resize(before + (end - at));
    for (char* to = out.data() + before; at != end; ++at) *to++ = static_cast<char>(text[at]);
    return end;
}

bool is_zero_or_not_finite(double value) { return value == 0.0 || !std::isfinite(value); }

/// Writes a number that has no text of its own through the stream's operator.
template <typename Number>
std::ostream& stream_number(std::ostream& os, Number value, std::streamsize digits) {
    const std::streamsize precision = os.precision(digits);
    os << value;
    os.precision(precision);
    return os;
}

}  // namespace

std::ostream& operator<<(std::ostream& os, const c_as_xml<bool>& text) {
    return os << (text.get() ? "true" : "false");
}

std::ostream& operator<<(std::ostream& os, const c_as_bool_digit<bool>& text) {
    return os << (text.get() ? "1" : "0");
}

std::ostream& operator<<(std::ostream& os, const c_as_xml<float>& text) {
    const float value = text.get();
    const bool is_special = is_zero_or_not_finite(static_cast<double>(value));
    if (!is_special && !detail::prints_plainly(os)) return stream_number(os, value, k_float_digits);
    std::array<char, k_number_text_size> out;
    return os << std::string_view(out.data(), format_float(out.data(), value));
}

std::ostream& operator<<(std::ostream& os, const c_as_xml<double>& text) {
    const double value = text.get();
    if (!is_zero_or_not_finite(value) && !detail::prints_plainly(os)) {
        return stream_number(os, value, k_double_digits);
    }
    std::array<char, k_number_text_size> out;
    return os << std::string_view(out.data(), format_double(out.data(), value));
}

std::ostream& operator<<(std::ostream& os, const c_as_xml<std::wstring>& text) {
    std::string out;
    append_escaped(out, text.get());
    return write(os, out);
}

std::ostream& operator<<(std::ostream& os, const c_as_xml<std::string>& text) {
    const std::wstring wide = vrl_platform::wide_from_code_page(text.get());
    return os << c_as_xml<std::wstring>(wide);
}

std::ostream& operator<<(std::ostream& os, const c_as_ascii<std::wstring>& text) {
    std::string out;
    for (const wchar_t element : text.get()) {
        const auto code = vrl_platform::code_of(element);
        if (code < 0x80) {
            out.push_back(static_cast<char>(code));
        } else {
            out.append(code > 0xFFFF ? 2 : 1, '.');
        }
    }
    return write(os, out);
}

std::ostream& operator<<(std::ostream& os, const c_as_escaped<std::string>& text) {
    std::string out;
    append_escaped(out, text.get());
    return write(os, out);
}

std::ostream& operator<<(std::ostream& os, const c_as_base64<c_binary>& text) {
    text.get().out_base64(os);
    return os;
}

std::ostream& operator<<(std::ostream& os, const c_as_hex<c_binary>& text) {
    text.get().out_hex(os);
    return os;
}

void append_escaped(std::string& out, const std::wstring& text) {
    const std::size_t size = text.size();
    for (std::size_t at = 0; at < size;) {
        at = append_plain_run(out, text.data(), at, size);
        if (at == size) return;
        auto code = vrl_platform::code_of(text[at++]);
        if (vrl_platform::is_high_surrogate(code)) {
            // Intended: a high surrogate without its partner ends the text, and no error is raised.
            if (at == size) return;
            const auto low = vrl_platform::code_of(text[at++]);
            if (!vrl_platform::is_low_surrogate(low)) return;
            code = vrl_platform::from_surrogates(code, low);
        }
        const std::string_view reference = reference_for(code);
        if (reference.empty()) {
            vrl_platform::append_utf8(out, code);
        } else {
            out.append(reference);
        }
    }
}

void append_escaped(std::string& out, const std::string& text) {
    std::size_t done = 0;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const std::string_view reference = reference_for(static_cast<unsigned char>(text[at]));
        if (reference.empty()) continue;
        out.append(text, done, at - done).append(reference);
        done = at + 1;
    }
    out.append(text, done);
}

}  // namespace qbxV2
