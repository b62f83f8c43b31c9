#include "flat/strings.h"

#include <algorithm>
#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <cstring>

#include "flat/vrl_flat_base.h"
#include "platform/loaded_symbols.h"
#include "platform/utf_characters.h"

namespace vrl_flat {
namespace {

constexpr std::size_t k_length_size = sizeof(std::uint32_t);
// Runtimes round the size of a block up to this.
constexpr std::size_t k_granule = 16;

/// The bytes ahead of a text, 0 until they are decided.
std::atomic<std::size_t> g_prefix{0};

std::size_t prefix() {
    std::size_t bytes = g_prefix.load(std::memory_order_relaxed);
    if (bytes == 0) {
        // Classic Mono frees a text from its length on, .NET from a whole pointer ahead of the text.
        bytes = vrl_platform::process_offers("mono_free_bstr") ? k_length_size : sizeof(void*);
        g_prefix.store(bytes, std::memory_order_relaxed);
    }
    return bytes;
}

/// Room for `length` bytes and a zero unit; the length is written, the text is not.
char* allocate(std::size_t length) {
    if (length > UINT32_MAX) return nullptr;
    const std::size_t ahead = prefix();
    const std::size_t needed = ahead + length + sizeof(char16_t);
    const std::size_t size = (needed + k_granule - 1) / k_granule * k_granule;
    auto* const block = static_cast<char*>(std::malloc(size));
    if (block == nullptr) return nullptr;
    char* const text = block + ahead;
    const auto counted = static_cast<std::uint32_t>(length);
    std::memcpy(text - k_length_size, &counted, k_length_size);
    std::memset(text + length, 0, sizeof(char16_t));
    return text;
}

/// Room for `count` units of UTF-16.
char16_t* allocate_units(std::size_t count) {
    return reinterpret_cast<char16_t*>(allocate(count * sizeof(char16_t)));
}

bool is_beyond_one_unit(wchar_t c) { return vrl_platform::code_of(c) > 0xFFFF; }

/// The text with a pair of units for an element above 0xFFFF.
char16_t* new_text_with_pairs(const std::wstring& text) {
    const auto pairs = std::count_if(text.begin(), text.end(), is_beyond_one_unit);
    char16_t* const made = allocate_units(text.size() + static_cast<std::size_t>(pairs));
    if (made == nullptr) return nullptr;
    char16_t* to = made;
    for (const wchar_t c : text) {
        const std::uint32_t code = vrl_platform::code_of(c);
        if (is_beyond_one_unit(c)) {
            *to++ = static_cast<char16_t>(vrl_platform::high_surrogate_of(code));
            *to++ = static_cast<char16_t>(vrl_platform::low_surrogate_of(code));
        } else {
            *to++ = static_cast<char16_t>(code);
        }
    }
    return made;
}

}  // namespace

char16_t* new_text(const std::wstring& text) {
    char16_t* const made = allocate_units(text.size());
    if (made == nullptr) return nullptr;
    // The model's own texts are of single units: one pass without a branch, which is done in blocks.
    const wchar_t* const from = text.data();
    const std::size_t size = text.size();
    std::uint32_t bits = 0;
    for (std::size_t i = 0; i < size; ++i) {
        bits |= static_cast<std::uint32_t>(from[i]);
        made[i] = static_cast<char16_t>(from[i]);
    }
    if (bits <= 0xFFFF) return made;
    vrl_free_string(made);
    return new_text_with_pairs(text);
}

char* new_text(const std::string& bytes) {
    char* const made = allocate(bytes.size());
    if (made != nullptr) std::copy(bytes.begin(), bytes.end(), made);
    return made;
}

std::wstring wide(const char16_t* text) {
    if (text == nullptr) return {};
    return {text, text + std::char_traits<char16_t>::length(text)};
}

}  // namespace vrl_flat

extern "C" {

void vrl_free_string(void* text) {
    // The block begins ahead of the text.
    if (text != nullptr) std::free(static_cast<char*>(text) - vrl_flat::prefix());  // NOLINT(*-unix.Malloc)
}

void vrl_set_string_prefix(int32_t bytes) {
    const auto wanted = static_cast<std::size_t>(bytes);
    if (wanted == vrl_flat::k_length_size || wanted == sizeof(std::uint64_t)) {
        vrl_flat::g_prefix.store(wanted, std::memory_order_relaxed);
    }
}

}  // extern "C"
