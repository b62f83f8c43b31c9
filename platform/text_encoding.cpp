#include "platform/text_encoding.h"

#include <cstddef>
#include <cstdint>

#include "platform/utf_characters.h"

namespace vrl_platform {

std::string utf8_from_wide(const std::wstring& text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        std::uint32_t code = code_of(text[i]);
        if (is_high_surrogate(code) && i + 1 < text.size() && is_low_surrogate(code_of(text[i + 1]))) {
            code = from_surrogates(code, code_of(text[++i]));
        }
        append_utf8(out, code);
    }
    return out;
}

std::wstring wide_from_code_page(const std::string& text) {
    std::wstring out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size();) {
        std::uint32_t code = 0;
        const std::size_t length = read_utf8_sequence(text.data(), text.size(), i, code);
        if (length == 0) return out;
        i += length;
        if (code > 0xFFFF) {
            out.push_back(static_cast<wchar_t>(high_surrogate_of(code)));
            out.push_back(static_cast<wchar_t>(low_surrogate_of(code)));
        } else {
            out.push_back(static_cast<wchar_t>(code));
        }
    }
    return out;
}

}  // namespace vrl_platform
