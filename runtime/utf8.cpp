#include "runtime/utf8.h"

#include <algorithm>

namespace qbxV2 {
namespace {

bool is_between(unsigned value, unsigned low, unsigned high) { return value >= low && value <= high; }

/// The bytes of a sequence by its lead byte's bit pattern; 0 for a byte that leads none.
int length_from_lead_byte(unsigned lead) {
    if (lead < 0x80) return 1;
    if ((lead & 0xE0U) == 0xC0) return 2;
    if ((lead & 0xF0U) == 0xE0) return 3;
    if ((lead & 0xF8U) == 0xF0) return 4;
    return 0;
}

}  // namespace

bool is_valid_utf8_char_sequence(const char* s) {
    const unsigned lead = static_cast<unsigned char>(s[0]);
    if (lead <= 0x7F) return true;
    if (is_between(lead, 0xC2, 0xDF) || is_between(lead, 0xE1, 0xEC) || is_between(lead, 0xEE, 0xEF) ||
        is_between(lead, 0xF1, 0xF3)) {
        return true;
    }
    const unsigned second = static_cast<unsigned char>(s[1]);
    switch (lead) {
        case 0xE0:
            return is_between(second, 0xA0, 0xBF);
        case 0xED:
            return is_between(second, 0x80, 0x9F);
        case 0xF0:
            return is_between(second, 0x90, 0xBF);
        case 0xF4:
            return is_between(second, 0x80, 0x8F);
        default:
            return false;
    }
}

char* unicode_char_to_utf8(int code, char* buffer) {
    const auto value = static_cast<unsigned>(code);
    char* out = buffer;
    const auto put = [&out](unsigned byte) { *out++ = static_cast<char>(static_cast<unsigned char>(byte)); };
    const auto put_continuation = [&](unsigned shift) { put(0x80U | ((value >> shift) & 0x3FU)); };
    if (code < 0x80) {
        put(value);
    } else if (code <= 0x7FF) {
        put(0xC0U | (value >> 6));
        put_continuation(0);
    } else if (code <= 0xFFFF) {
        put(0xE0U | (value >> 12));
        put_continuation(6);
        put_continuation(0);
    } else {
        put(0xF0U | (value >> 18));
        put_continuation(12);
        put_continuation(6);
        put_continuation(0);
    }
    *out = '\0';
    return buffer;
}

bool utf8_to_unicode_char(char* s, int* code) {
    const unsigned lead = static_cast<unsigned char>(*s);
    const int length = length_from_lead_byte(lead);
    if (length == 0) {
        *code = -1;
        return false;
    }
    *code = static_cast<int>(length == 1 ? lead : lead & (0x7FU >> length));
    for (int i = 1; i < length; ++i) {
        const unsigned byte = static_cast<unsigned char>(s[i]);
        if ((byte & 0xC0U) != 0x80) return false;
        *code = (*code << 6) | static_cast<int>(byte & 0x3FU);
    }
    return true;
}

void bswap(void* a, void* b, std::size_t n) {
    auto* const bytes = static_cast<unsigned char*>(a);
    std::swap_ranges(bytes, bytes + n, static_cast<unsigned char*>(b));
}

}  // namespace qbxV2
