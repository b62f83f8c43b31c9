#include "V2/frame/text_blocks.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>

namespace {

using vrl_v2::frame::text_blocks;

constexpr std::size_t k_block_size = 64 * 1024;

std::string numbered_text(std::size_t size) {
    std::string text;
    for (unsigned i = 0; text.size() < size; ++i) text += std::to_string(i) + ' ';
    text.resize(size);
    return text;
}

TEST(TextBlocks, GiveNothingWhereNothingWasPut) {
    text_blocks blocks;
    EXPECT_EQ(blocks.take(), "");
}

TEST(TextBlocks, JoinWhatWasPutInPiecesOfAnySize) {
    for (const std::size_t size : {std::size_t{1}, k_block_size - 1, k_block_size, k_block_size + 1,
                                   3 * k_block_size, 3 * k_block_size + 5}) {
        const std::string text = numbered_text(size);
        for (const std::size_t piece : {std::size_t{1}, std::size_t{1000}, k_block_size, size}) {
            text_blocks blocks;
            std::ostream os(&blocks);
            for (std::size_t at = 0; at < size; at += piece) os << text.substr(at, piece);
            ASSERT_TRUE(os.good());
            ASSERT_EQ(blocks.take(), text) << size << " in pieces of " << piece;
        }
    }
}

TEST(TextBlocks, TakeCharactersOneByOne) {
    const std::string text = numbered_text(k_block_size + 10);
    text_blocks blocks;
    for (const char c : text) ASSERT_EQ(blocks.sputc(c), c);
    EXPECT_EQ(blocks.take(), text);
}

TEST(TextBlocks, StartAnewBehindATake) {
    text_blocks blocks;
    std::ostream os(&blocks);
    os << numbered_text(k_block_size + 10);
    blocks.take();
    EXPECT_EQ(blocks.take(), "");
    os << "again";
    EXPECT_EQ(blocks.take(), "again");
}

}  // namespace
