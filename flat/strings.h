#pragma once

#include <cstddef>
#include <string>

namespace vrl_flat {

/// A text for the caller, who frees it: laid out as flat/vrl_flat_base.h tells. Null when there is no memory.
char16_t* new_text(const std::wstring& text);
char* new_text(const std::string& bytes);

/// Zero-terminated UTF-16 as a wide string; null gives the empty one.
std::wstring wide(const char16_t* text);

}  // namespace vrl_flat
