#pragma once

#include <cstddef>

#include "runtime/character_class.h"

namespace qbxV2::detail {

/// The length of the UTF-8 sequence at `p`, when it is complete and passes through the decoder unchanged;
/// else 0. Source: Unicode, table 3-7 Well-Formed UTF-8 Byte Sequences. U+0085 and U+2028 become line feeds,
/// so they don't count.
std::size_t plain_utf8_length(const unsigned char* p, const unsigned char* end);

/// How far a run of text goes, and the line feeds in it.
struct s_scan {
    const unsigned char* end;
    unsigned line_feeds;
};

/// Scans bytes of a class, line feeds and, with `utf8`, whole UTF-8 sequences. `also` is one more byte that
/// passes.
s_scan scan_text(const unsigned char* p, const unsigned char* end, unsigned mask, unsigned char also,
                 bool utf8);

/// Scans ASCII up to `stop`, CR or, without `utf8`, anything from 0x80.
s_scan scan_up_to(const unsigned char* p, const unsigned char* end, unsigned char stop, bool utf8);

}  // namespace qbxV2::detail
