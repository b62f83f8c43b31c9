#include "runtime/byte_scan.h"

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <string>

#include "runtime/utf8_decoder.h"

namespace {

using namespace qbxV2::detail;

/// Text in a block of exact size.
struct Bytes {
    explicit Bytes(const std::string& text) : block(new unsigned char[text.size()]), size(text.size()) {
        std::memcpy(block.get(), text.data(), size);
    }
    const unsigned char* begin() const { return block.get(); }
    const unsigned char* end() const { return block.get() + size; }
    std::unique_ptr<unsigned char[]> block;
    std::size_t size;
};

/// Where a scan of "aaa...X..." stops, for each byte X and for places within and across blocks of sixteen.
template <class Scan, class Passes>
void expect_stops(Scan scan, Passes passes) {
    for (const std::size_t at : {0U, 1U, 14U, 15U, 16U, 17U, 40U}) {
        for (int c = 0; c < 256; ++c) {
            std::string text(at, 'a');
            text += static_cast<char>(c);
            text += "aaaaaaaaaaaaaaaaaaaa";
            const Bytes bytes(text);
            const auto reached = static_cast<std::size_t>(scan(bytes.begin(), bytes.end()) - bytes.begin());
            EXPECT_EQ(reached, passes(c) ? text.size() : at) << "byte " << c << " at " << at;
        }
    }
}

bool is_printable(int c) { return (c >= 0x20 && c < 0x7F) || c == '\t' || c == '\n'; }

TEST(ByteScan, TextStopsAtMarkupAndAtWhatHasToBeDecoded) {
    expect_stops([](const auto* p, const auto* end) { return scan_text(p, end, false, false).end; },
                 [](int c) { return is_printable(c) && c != '<' && c != '&'; });
    expect_stops([](const auto* p, const auto* end) { return scan_text(p, end, true, true).end; },
                 [](int c) { return is_printable(c) && c != '<'; });
}

TEST(ByteScan, AValueStopsAtItsOwnQuoteOnly) {
    expect_stops([](const auto* p, const auto* end) { return scan_value(p, end, '"', false).end; },
                 [](int c) { return is_printable(c) && c != '"'; });
    expect_stops([](const auto* p, const auto* end) { return scan_value(p, end, '\'', false).end; },
                 [](int c) { return is_printable(c) && c != '\''; });
}

TEST(ByteScan, UpToStopsAtOneByteAndAtCr) {
    expect_stops([](const auto* p, const auto* end) { return scan_up_to(p, end, ']', false).end; },
                 [](int c) { return c < 0x80 && c != ']' && c != '\r'; });
}

TEST(ByteScan, ANameEndsAtTheFirstByteThatIsNoNameCharacterOfAscii) {
    expect_stops([](const auto* p, const auto* end) { return end_of_plain_name(p, end); },
                 [](int c) { return byte_is(static_cast<unsigned char>(c), cc_plain_name); });
}

TEST(ByteScan, FindSpaceFindsEachKindOfWhiteSpace) {
    expect_stops([](const auto* p, const auto* end) { return find_space(p, end); },
                 [](int c) { return !byte_is(static_cast<unsigned char>(c), cc_space); });
}

TEST(ByteScan, CountsTheLineFeedsThatItPasses) {
    const Bytes bytes("a\nb\n\nccccccccccccccccccccccccccccc\nd<\n");
    EXPECT_EQ(scan_text(bytes.begin(), bytes.end(), false, false).line_feeds, 4U);
    EXPECT_EQ(scan_value(bytes.begin(), bytes.end(), '"', false).line_feeds, 5U);
    EXPECT_EQ(scan_up_to(bytes.begin(), bytes.end(), 'd', false).line_feeds, 4U);
}

TEST(ByteScan, PrintableAsciiIsFrom20To7F) {
    for (std::size_t size = 1; size < 20; ++size) {
        for (std::size_t at = 0; at < size; ++at) {
            for (int c = 0; c < 256; ++c) {
                std::string text(size, ' ');
                text[at] = static_cast<char>(c);
                const Bytes bytes(text);
                ASSERT_EQ(is_printable_ascii(reinterpret_cast<const char*>(bytes.begin()), size),
                          c >= 0x20 && c < 0x80)
                    << c << " at " << at << " of " << size;
            }
        }
    }
    EXPECT_TRUE(is_printable_ascii("", 0));
}

/// The bytes that the decoder makes of `<.` and a sequence, less these two, when all of it passes as one
/// character.
bool decoder_passes(const std::string& sequence) {
    const std::string text = "<." + sequence;
    qbxV2::c_read_string source(text);
    qbxV2::c_error errors;
    qbxV2::c_get_as_utf8 getter(source, errors);
    std::string out;
    for (int c = getter.get(); c != -1; c = getter.get()) out += static_cast<char>(c);
    return out == text;
}

TEST(PlainUtf8Length, NeverCoversWhatTheDecoderWouldChange) {
    const unsigned char interesting[] = {0x00, 0x41, 0x7F, 0x80, 0x85, 0x8F,
                                         0x90, 0x9F, 0xA0, 0xA8, 0xBF, 0xC0};
    for (int lead = 0x80; lead < 256; ++lead) {
        for (const unsigned char second : interesting) {
            for (const unsigned char third : interesting) {
                for (const unsigned char fourth : interesting) {
                    const std::string text{static_cast<char>(lead), static_cast<char>(second),
                                           static_cast<char>(third), static_cast<char>(fourth)};
                    const Bytes bytes(text);
                    const std::size_t length = plain_utf8_length(bytes.begin(), bytes.end());
                    ASSERT_LE(length, text.size());
                    if (length != 0) {
                        EXPECT_TRUE(decoder_passes(text.substr(0, length)));
                    }
                }
            }
        }
    }
}

TEST(PlainUtf8Length, CoversWellFormedSequencesThatAreComplete) {
    for (const std::string text : {"\xC3\xA9", "\xE0\xA0\x80", "\xE2\x82\xAC", "\xED\x9F\xBF", "\xEF\xBF\xBD",
                                   "\xF0\x90\x80\x80", "\xF4\x8F\xBF\xBF"}) {
        const Bytes whole(text);
        EXPECT_EQ(plain_utf8_length(whole.begin(), whole.end()), text.size());
        for (std::size_t size = 1; size < text.size(); ++size) {
            const Bytes cut(text.substr(0, size));
            EXPECT_EQ(plain_utf8_length(cut.begin(), cut.end()), 0U);
        }
    }
}

TEST(PlainUtf8Length, LeavesLineEndsToTheDecoder) {
    for (const std::string text : {"\xC2\x85", "\xE2\x80\xA8"}) {
        const Bytes bytes(text);
        EXPECT_EQ(plain_utf8_length(bytes.begin(), bytes.end()), 0U);
    }
}

}  // namespace
