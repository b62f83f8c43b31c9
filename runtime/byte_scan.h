#pragma once

#include <cstddef>

#include "runtime/byte_blocks.h"
#include "runtime/character_class.h"

namespace qbxV2::detail {

/// The length of the UTF-8 sequence at `p`, when it is complete and passes through the decoder unchanged;
/// else 0. U+0085 and U+2028 become line feeds there, so they don't count. Source: Unicode, table 3-7
/// Well-Formed UTF-8 Byte Sequences.
std::size_t plain_utf8_length(const unsigned char* p, const unsigned char* end);

/// Behind the sequences of that kind that begin at `p`.
const unsigned char* skip_plain_utf8(const unsigned char* p, const unsigned char* end);

inline bool is_plain_name_start(unsigned char c) { return c < 0x80 && byte_is(c, cc_name_start); }

/// Behind the ASCII name characters that begin at `p`.
inline const unsigned char* end_of_plain_name(const unsigned char* p, const unsigned char* end) {
    p = skip_blocks<name_stop>(p, end);
    while (p != end && byte_is(*p, cc_plain_name)) ++p;
    return p;
}

/// At the first white space from `p` on.
inline const unsigned char* find_space(const unsigned char* p, const unsigned char* end) {
    p = skip_blocks<space_stop>(p, end);
    while (p != end && !byte_is(*p, cc_space)) ++p;
    return p;
}

/// Whether all bytes are from 0x20 to 0x7F.
bool is_printable_ascii(const char* s, std::size_t size);

/// How far a run goes, and the line feeds in it.
struct s_scan {
    const unsigned char* end;
    unsigned line_feeds;
};

/// Scans bytes of a class, line feeds and, with `utf8`, whole UTF-8 sequences. `also` is one more byte that
/// passes.
template <class Stop>
s_scan scan_run(const unsigned char* p, const unsigned char* end, unsigned mask, unsigned char also,
                bool utf8) {
    unsigned line_feeds = 0;
    for (;;) {
        p = skip_blocks<Stop>(p, end);
        while (p != end && byte_is(*p, mask)) ++p;
        if (p == end) break;
        if (*p == '\n') {
            ++line_feeds;
            ++p;
        } else if (*p == also) {
            ++p;
        } else {
            const unsigned char* const behind = utf8 ? skip_plain_utf8(p, end) : p;
            if (behind == p) break;
            p = behind;
        }
    }
    return {p, line_feeds};
}

/// Scans character data: up to "<", "&" unless it passes, CR and control characters. Line feeds pass, and
/// with `utf8` whole UTF-8 sequences.
inline s_scan scan_text(const unsigned char* p, const unsigned char* end, bool ampersand_passes, bool utf8) {
    return scan_run<text_stop>(p, end, cc_text, ampersand_passes ? '&' : '\n', utf8);
}

/// Scans an attribute value in the same way: up to `quote`, CR and control characters.
inline s_scan scan_value(const unsigned char* p, const unsigned char* end, unsigned char quote, bool utf8) {
    return scan_run<value_stop>(p, end, cc_value, quote == '"' ? '\'' : '"', utf8);
}

/// Scans ASCII, and with `utf8` whole UTF-8 sequences, up to `stop` or CR.
s_scan scan_up_to(const unsigned char* p, const unsigned char* end, unsigned char stop, bool utf8);

}  // namespace qbxV2::detail
