#include <cstring>

#include "flat/convention.h"

namespace vrl_flat {

void replace_identity(char const*& identity, const char* text) {
    if (text == nullptr) {
        identity = nullptr;
        return;
    }
    const std::size_t size = std::strlen(text) + 1;
    auto* const copied = new char[size];
    std::memcpy(copied, text, size);
    identity = copied;
}

}  // namespace vrl_flat
