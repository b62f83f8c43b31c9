#pragma once

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace qbxV2::detail {

#if defined(__SSE2__)

// Sixteen bytes at once. Each test gives 0xFF where a byte stops the scan. It may stop at a byte that the
// byte-wise test lets pass; the caller looks at that byte itself.

using block = __m128i;

inline block all(int c) { return _mm_set1_epi8(static_cast<char>(c)); }
inline block equal(block v, int c) { return _mm_cmpeq_epi8(v, all(c)); }
inline block up_to(block v, int limit) { return _mm_cmpeq_epi8(_mm_min_epu8(v, all(limit)), v); }
inline block between(block v, int first, int last) {
    return up_to(_mm_sub_epi8(v, all(first)), last - first);
}
/// Below 0x20, DEL, and from 0x80.
inline block not_printable(block v) { return _mm_or_si128(_mm_cmplt_epi8(v, all(0x20)), equal(v, 0x7F)); }

struct text_stop {
    static block stops(block v) {
        return _mm_or_si128(not_printable(v), _mm_or_si128(equal(v, '<'), equal(v, '&')));
    }
};
struct value_stop {
    static block stops(block v) {
        return _mm_or_si128(not_printable(v), _mm_or_si128(equal(v, '"'), equal(v, '\'')));
    }
};
struct name_stop {
    static block stops(block v) {
        const block letter = between(_mm_or_si128(v, all(0x20)), 'a', 'z');
        const block digit_or_colon = between(v, '0', ':');
        const block mark = _mm_or_si128(between(v, '-', '.'), equal(v, '_'));
        return _mm_xor_si128(_mm_or_si128(_mm_or_si128(letter, digit_or_colon), mark), all(0xFF));
    }
};
struct space_stop {
    static block stops(block v) { return _mm_or_si128(between(v, '\t', '\r'), equal(v, ' ')); }
};

/// Moves on while whole blocks are left and no byte stops.
template <class Stop>
const unsigned char* skip_blocks(const unsigned char* p, const unsigned char* end) {
    while (end - p >= 16) {
        const block v = _mm_loadu_si128(reinterpret_cast<const block*>(p));
        const auto found = static_cast<unsigned>(_mm_movemask_epi8(Stop::stops(v)));
        if (found != 0) return p + __builtin_ctz(found);
        p += 16;
    }
    return p;
}

#else

struct text_stop {};
struct value_stop {};
struct name_stop {};
struct space_stop {};

template <class Stop>
const unsigned char* skip_blocks(const unsigned char* p, const unsigned char*) {
    return p;
}

#endif

}  // namespace qbxV2::detail
