#include "zip/random_pool.h"

#include <nettle/sha1.h>

#include <algorithm>

#include "platform/c_random.h"

namespace {

constexpr std::size_t k_drawSize = 8;
constexpr std::size_t k_setupMixes = 20;

std::uint32_t LoadBigEndian(const std::uint8_t* at) {
    return (std::uint32_t{at[0]} << 24) | (std::uint32_t{at[1]} << 16) | (std::uint32_t{at[2]} << 8) | at[3];
}

void StoreBigEndian(std::uint8_t* at, std::uint32_t value) {
    for (unsigned i = 0; i < 4; ++i) at[i] = static_cast<std::uint8_t>(value >> (24 - 8 * i));
}

// Each step of 20 bytes becomes the compression of the 64 bytes from there on, chained to the step before it.
void Mix(CZipRandomPool::Half& half) {
    for (std::size_t step = 0; step < half.size(); step += SHA1_DIGEST_SIZE) {
        const std::size_t before = step == 0 ? half.size() - SHA1_DIGEST_SIZE : step - SHA1_DIGEST_SIZE;
        std::array<std::uint32_t, 5> state;
        for (std::size_t i = 0; i < state.size(); ++i) state[i] = LoadBigEndian(&half[before + 4 * i]);
        std::array<std::uint8_t, SHA1_BLOCK_SIZE> block;
        for (std::size_t i = 0; i < block.size(); ++i) block[i] = half[(step + i) % half.size()];
        nettle_sha1_compress(state.data(), block.data());
        for (std::size_t i = 0; i < state.size(); ++i) StoreBigEndian(&half[step + 4 * i], state[i]);
    }
}

}  // namespace

CZipRandomPool::CZipRandomPool(vrl_platform::entropy_source& entropy, vrl_platform::clock& clock)
    : m_entropy(entropy), m_clock(clock) {
    Update();
    for (std::size_t i = 0; i < k_setupMixes; ++i) Mix(m_first);
    Update();
}

void CZipRandomPool::Draw() {
    std::array<std::uint8_t, k_drawSize> drawn;
    for (std::size_t at = 0; at < m_first.size(); at += drawn.size()) {
        if (!m_entropy.fill(drawn.data(), drawn.size())) {
            vrl_platform::c_random random(m_clock.now());
            for (std::uint8_t& byte : m_first) byte = static_cast<std::uint8_t>(random.next());
            return;
        }
        std::copy_n(drawn.begin(), std::min(drawn.size(), m_first.size() - at), m_first.begin() + at);
    }
}

void CZipRandomPool::Update() {
    m_second = m_first;
    Draw();
    for (std::size_t i = 0; i < m_first.size(); ++i) m_first[i] ^= static_cast<std::uint8_t>(~m_second[i]);
    Mix(m_first);
    Mix(m_second);
    m_position = 0;
}

void CZipRandomPool::Read(std::uint8_t* out, std::size_t size) {
    while (size != 0) {
        if (m_position == m_second.size()) Update();
        const std::size_t taken = std::min(size, m_second.size() - m_position);
        out = std::copy_n(m_second.begin() + m_position, taken, out);
        m_position += taken;
        size -= taken;
    }
}
