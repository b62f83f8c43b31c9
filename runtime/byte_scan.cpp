#include "runtime/byte_scan.h"

#include <cstdint>
#include <cstring>

namespace qbxV2::detail {
namespace {

bool is_continuation(unsigned char c) { return (c & 0xC0U) == 0x80; }

bool is_plain_two(const unsigned char* p) { return is_continuation(p[1]) && !(p[0] == 0xC2 && p[1] == 0x85); }

bool is_plain_three(const unsigned char* p) {
    if (!is_continuation(p[1]) || !is_continuation(p[2])) return false;
    if (p[0] == 0xE0 && p[1] < 0xA0) return false;
    if (p[0] == 0xED && p[1] > 0x9F) return false;
    return !(p[0] == 0xE2 && p[1] == 0x80 && p[2] == 0xA8);
}

bool is_plain_four(const unsigned char* p) {
    if (!is_continuation(p[1]) || !is_continuation(p[2]) || !is_continuation(p[3])) return false;
    if (p[0] == 0xF0 && p[1] < 0x90) return false;
    return !(p[0] == 0xF4 && p[1] > 0x8F);
}

}  // namespace

std::size_t plain_utf8_length(const unsigned char* p, const unsigned char* end) {
    const auto left = static_cast<std::size_t>(end - p);
    if (p[0] < 0xC2 || p[0] > 0xF4) return 0;
    if (p[0] < 0xE0) return left >= 2 && is_plain_two(p) ? 2 : 0;
    if (p[0] < 0xF0) return left >= 3 && is_plain_three(p) ? 3 : 0;
    return left >= 4 && is_plain_four(p) ? 4 : 0;
}

const unsigned char* skip_plain_utf8(const unsigned char* p, const unsigned char* end) {
    while (p != end && *p >= 0x80) {
        const std::size_t length = plain_utf8_length(p, end);
        if (length == 0) break;
        p += length;
    }
    return p;
}

bool is_printable_ascii(const char* s, std::size_t size) {
    constexpr std::uint64_t k_high_bits = 0x8080808080808080;
    constexpr std::uint64_t k_spaces = 0x2020202020202020;
    std::uint64_t bad = 0;
    // A byte below 0x20 borrows from its neighbour, but then the answer is no anyway.
    for (; size >= sizeof bad; size -= sizeof bad, s += sizeof bad) {
        std::uint64_t bytes;
        std::memcpy(&bytes, s, sizeof bytes);
        bad |= bytes | (bytes - k_spaces);
    }
    for (; size != 0; --size, ++s) {
        const auto c = static_cast<unsigned char>(*s);
        if (c < 0x20 || c >= 0x80) return false;
    }
    return (bad & k_high_bits) == 0;
}

s_scan scan_up_to(const unsigned char* p, const unsigned char* end, unsigned char stop, bool utf8) {
    unsigned line_feeds = 0;
    while (p != end && *p != stop && *p != '\r') {
        if (*p < 0x80) {
            if (*p == '\n') ++line_feeds;
            ++p;
            continue;
        }
        const unsigned char* const behind = utf8 ? skip_plain_utf8(p, end) : p;
        if (behind == p) break;
        p = behind;
    }
    return {p, line_feeds};
}

}  // namespace qbxV2::detail
