#include "zip/aes_context.h"

#include <algorithm>

namespace {

void Encrypt(const aes128_ctx& key, std::size_t size, std::uint8_t* to, const std::uint8_t* from) {
    aes128_encrypt(&key, size, to, from);
}
void Encrypt(const aes192_ctx& key, std::size_t size, std::uint8_t* to, const std::uint8_t* from) {
    aes192_encrypt(&key, size, to, from);
}
void Encrypt(const aes256_ctx& key, std::size_t size, std::uint8_t* to, const std::uint8_t* from) {
    aes256_encrypt(&key, size, to, from);
}

}  // namespace

CZipAesContext::CZipAesContext(const std::uint8_t* key, std::uint32_t keySize) {
    if (keySize == AES128_KEY_SIZE)
        aes128_set_encrypt_key(&m_key.emplace<aes128_ctx>(), key);
    else if (keySize == AES192_KEY_SIZE)
        aes192_set_encrypt_key(&m_key.emplace<aes192_ctx>(), key);
    else
        aes256_set_encrypt_key(&m_key.emplace<aes256_ctx>(), key);
}

void CZipAesContext::DrawStream() {
    std::array<std::uint8_t, k_streamSize> counters = {};
    for (std::size_t block = 0; block < k_blocks; ++block) {
        std::uint64_t counter = ++m_counter;
        for (std::size_t i = 0; i < sizeof counter; ++i, counter >>= 8)
            counters.at(block * AES_BLOCK_SIZE + i) = static_cast<std::uint8_t>(counter);
    }
    std::visit([&](const auto& key) { Encrypt(key, k_streamSize, m_stream.data(), counters.data()); }, m_key);
    m_used = 0;
}

void CZipAesContext::Apply(std::uint8_t* bytes, std::size_t size) {
    while (size != 0) {
        if (m_used == k_streamSize) DrawStream();
        const std::size_t count = std::min(size, k_streamSize - m_used);
        const std::uint8_t* stream = m_stream.data() + m_used;
        for (std::size_t i = 0; i < count; ++i) bytes[i] ^= stream[i];
        m_used += count;
        bytes += count;
        size -= count;
    }
}
