#include "platform/text_encoding.h"

#include <cstddef>
#include <cstdint>

namespace vrl_platform {
namespace {

bool is_high_surrogate(std::uint32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
bool is_low_surrogate(std::uint32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

void append_utf8(std::string& out, std::uint32_t code) {
    const auto put = [&out](std::uint32_t byte) { out.push_back(static_cast<char>(byte)); };
    if (code < 0x80) {
        put(code);
    } else if (code < 0x800) {
        put(0xC0 | (code >> 6));
        put(0x80 | (code & 0x3F));
    } else if (code < 0x10000) {
        put(0xE0 | (code >> 12));
        put(0x80 | ((code >> 6) & 0x3F));
        put(0x80 | (code & 0x3F));
    } else {
        put(0xF0 | ((code >> 18) & 0x07));
        put(0x80 | ((code >> 12) & 0x3F));
        put(0x80 | ((code >> 6) & 0x3F));
        put(0x80 | (code & 0x3F));
    }
}

}  // namespace

std::string utf8_from_wide(const std::wstring& text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        auto code = static_cast<std::uint32_t>(text[i]);
        if (is_high_surrogate(code) && i + 1 < text.size() &&
            is_low_surrogate(static_cast<std::uint32_t>(text[i + 1]))) {
            code = (((code & 0x3FF) + 64) << 10) + (static_cast<std::uint32_t>(text[i + 1]) & 0x3FF);
            ++i;
        }
        append_utf8(out, code);
    }
    return out;
}

std::wstring wide_from_code_page(const std::string& text) {
    std::wstring out;
    out.reserve(text.size());
    const auto byte_at = [&text](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    for (std::size_t i = 0; i < text.size();) {
        const std::uint32_t lead = byte_at(i);
        std::size_t length = 1;
        std::uint32_t code = lead;
        if (lead >= 0xF0 && lead < 0xF8) {
            length = 4;
            code = lead & 0x07;
        } else if (lead >= 0xE0 && lead < 0xF0) {
            length = 3;
            code = lead & 0x0F;
        } else if (lead >= 0xC0 && lead < 0xE0) {
            length = 2;
            code = lead & 0x1F;
        } else if (lead >= 0x80) {
            return out;
        }
        if (i + length > text.size()) return out;
        for (std::size_t k = 1; k < length; ++k) {
            if ((byte_at(i + k) & 0xC0) != 0x80) return out;
            code = (code << 6) | (byte_at(i + k) & 0x3FU);
        }
        i += length;
        if (code > 0xFFFF) {
            out.push_back(static_cast<wchar_t>(0xD800 + ((code - 0x10000) >> 10)));
            out.push_back(static_cast<wchar_t>(0xDC00 + (code & 0x3FF)));
        } else {
            out.push_back(static_cast<wchar_t>(code));
        }
    }
    return out;
}

}  // namespace vrl_platform
