#pragma once

#include <cstddef>

#include "platform/api.h"

namespace qbxV2 {

/// Tells from the first two bytes whether a UTF-8 sequence can be valid: no stray continuation byte, no
/// overlong form, no surrogate, nothing above U+10FFFF. Bytes behind the second are not looked at, and for
/// the lead bytes that admit every continuation (C2-DF, E1-EC, EE-EF, F1-F3) neither is the second. Source:
/// Unicode, table 3-7 Well-Formed UTF-8 Byte Sequences.
VRL_API bool is_valid_utf8_char_sequence(const char* s);

/// Writes the UTF-8 form of `code` and a NUL to `buffer`, which holds at least five bytes, and returns
/// `buffer`. No range check; a surrogate is encoded like any other value.
VRL_API char* unicode_char_to_utf8(int code, char* buffer);

/// Decodes one character of one to four bytes; `s` is only read. False with `*code` -1 for a byte that leads
/// no sequence; false with `*code` partly built where a continuation byte is missing. Overlong forms pass.
VRL_API bool utf8_to_unicode_char(char* s, int* code);

/// Exchanges `n` bytes of two buffers.
VRL_API void bswap(void* a, void* b, std::size_t n);

}  // namespace qbxV2
