#include "V2/frame/text_blocks.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace vrl_v2::frame {
namespace {

constexpr std::size_t k_block_size = 64 * 1024;

}  // namespace

void text_blocks::add_block() {
    // Nothing is read that was not put there, so nothing has to be zero first, as std::make_unique would have
    // it.
    m_blocks.push_back(std::unique_ptr<char[]>(new char[k_block_size]));
    char* const block = m_blocks.back().get();
    setp(block, block + k_block_size);
}

text_blocks::int_type text_blocks::overflow(int_type c) {
    if (traits_type::eq_int_type(c, traits_type::eof())) return traits_type::not_eof(c);
    add_block();
    return sputc(traits_type::to_char_type(c));
}

std::streamsize text_blocks::xsputn(const char* text, std::streamsize length) {
    for (auto left = static_cast<std::size_t>(length); left != 0;) {
        if (pptr() == epptr()) add_block();
        const std::size_t piece = std::min(left, static_cast<std::size_t>(epptr() - pptr()));
        std::memcpy(pptr(), text, piece);
        pbump(static_cast<int>(piece));
        text += piece;
        left -= piece;
    }
    return length;
}

std::string text_blocks::take() {
    std::string all;
    if (m_blocks.empty()) return all;
    const auto in_last = static_cast<std::size_t>(pptr() - pbase());
    all.reserve((m_blocks.size() - 1) * k_block_size + in_last);
    setp(nullptr, nullptr);
    std::vector<std::unique_ptr<char[]>> blocks = std::exchange(m_blocks, {});
    for (std::unique_ptr<char[]>& block : blocks) {
        all.append(block.get(), &block == &blocks.back() ? in_last : k_block_size);
        block.reset();
    }
    return all;
}

}  // namespace vrl_v2::frame
