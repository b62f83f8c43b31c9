#include "platform/code_page.h"

#include <algorithm>
#include <array>
#include <iterator>

namespace vrl_platform {
namespace {

constexpr char32_t k_replacement = 0xFFFD;

// The upper half of code page 437; the lower half is ASCII.
constexpr std::array<char16_t, 128> k_oem_upper = {
    // clang-format off
    0x00C7, 0x00FC, 0x00E9, 0x00E2, 0x00E4, 0x00E0, 0x00E5, 0x00E7,
    0x00EA, 0x00EB, 0x00E8, 0x00EF, 0x00EE, 0x00EC, 0x00C4, 0x00C5,
    0x00C9, 0x00E6, 0x00C6, 0x00F4, 0x00F6, 0x00F2, 0x00FB, 0x00F9,
    0x00FF, 0x00D6, 0x00DC, 0x00A2, 0x00A3, 0x00A5, 0x20A7, 0x0192,
    0x00E1, 0x00ED, 0x00F3, 0x00FA, 0x00F1, 0x00D1, 0x00AA, 0x00BA,
    0x00BF, 0x2310, 0x00AC, 0x00BD, 0x00BC, 0x00A1, 0x00AB, 0x00BB,
    0x2591, 0x2592, 0x2593, 0x2502, 0x2524, 0x2561, 0x2562, 0x2556,
    0x2555, 0x2563, 0x2551, 0x2557, 0x255D, 0x255C, 0x255B, 0x2510,
    0x2514, 0x2534, 0x252C, 0x251C, 0x2500, 0x253C, 0x255E, 0x255F,
    0x255A, 0x2554, 0x2569, 0x2566, 0x2560, 0x2550, 0x256C, 0x2567,
    0x2568, 0x2564, 0x2565, 0x2559, 0x2558, 0x2552, 0x2553, 0x256B,
    0x256A, 0x2518, 0x250C, 0x2588, 0x2584, 0x258C, 0x2590, 0x2580,
    0x03B1, 0x00DF, 0x0393, 0x03C0, 0x03A3, 0x03C3, 0x00B5, 0x03C4,
    0x03A6, 0x0398, 0x03A9, 0x03B4, 0x221E, 0x03C6, 0x03B5, 0x2229,
    0x2261, 0x00B1, 0x2265, 0x2264, 0x2320, 0x2321, 0x00F7, 0x2248,
    0x00B0, 0x2219, 0x00B7, 0x221A, 0x207F, 0x00B2, 0x25A0, 0x00A0,
    // clang-format on
};

bool is_oem(std::uint32_t page) { return page == code_page::oem || page == code_page::oem_437; }
bool is_utf_8(std::uint32_t page) { return page == code_page::ansi || page == code_page::utf_8; }

void append_utf_8(std::string& out, char32_t c) {
    const auto put = [&out](char32_t unit) { out.push_back(static_cast<char>(unit)); };
    if (c < 0x80) {
        put(c);
    } else if (c < 0x800) {
        put(0xC0 | (c >> 6));
        put(0x80 | (c & 0x3F));
    } else {
        put(0xE0 | (c >> 12));
        put(0x80 | ((c >> 6) & 0x3F));
        put(0x80 | (c & 0x3F));
    }
}

struct sequence_form {
    unsigned length;
    char32_t lead_bits;
    char32_t least;
};

// The forms of RFC 3629, section 3. A length of 0 is no lead byte.
sequence_form form_of(unsigned char lead) {
    if (lead < 0x80) return {1, lead, 0};
    if (lead >= 0xC2 && lead <= 0xDF) return {2, lead & 0x1FU, 0x80};
    if (lead >= 0xE0 && lead <= 0xEF) return {3, lead & 0x0FU, 0x800};
    if (lead >= 0xF0 && lead <= 0xF4) return {4, lead & 0x07U, 0x10000};
    return {0, 0, 0};
}

// The next character, or U+FFFD for one byte that begins none; `at` moves past it.
char32_t next_utf_8(const std::string& text, std::size_t& at) {
    const sequence_form form = form_of(static_cast<unsigned char>(text[at]));
    if (form.length == 0 || text.size() - at < form.length) {
        ++at;
        return k_replacement;
    }
    char32_t c = form.lead_bits;
    for (unsigned i = 1; i < form.length; ++i) {
        const auto byte = static_cast<unsigned char>(text[at + i]);
        if ((byte & 0xC0) != 0x80) {
            ++at;
            return k_replacement;
        }
        c = (c << 6) | (byte & 0x3FU);
    }
    if (c < form.least || c > 0x10FFFF || (c >= 0xD800 && c <= 0xDFFF)) {
        ++at;
        return k_replacement;
    }
    at += form.length;
    return c;
}

char oem_from_character(char32_t c) {
    if (c < 0x80) return static_cast<char>(c);
    const auto* const found = std::find(k_oem_upper.begin(), k_oem_upper.end(), c);
    if (found == k_oem_upper.end()) return '?';
    return static_cast<char>(0x80 + std::distance(k_oem_upper.begin(), found));
}

std::string utf_8_from_oem(const std::string& text) {
    std::string out;
    out.reserve(text.size());
    for (const char c : text) {
        const auto byte = static_cast<unsigned char>(c);
        append_utf_8(out, byte < 0x80 ? byte : k_oem_upper.at(byte - 0x80U));
    }
    return out;
}

std::string oem_from_utf_8(const std::string& text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) out.push_back(oem_from_character(next_utf_8(text, at)));
    return out;
}

}  // namespace

std::string convert_code_page(const std::string& text, std::uint32_t from, std::uint32_t to) {
    if (is_oem(from) && is_utf_8(to)) return utf_8_from_oem(text);
    if (is_utf_8(from) && is_oem(to)) return oem_from_utf_8(text);
    return text;
}

}  // namespace vrl_platform
