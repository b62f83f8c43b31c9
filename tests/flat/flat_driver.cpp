#include "tests/flat/flat_driver.h"

#include <cstdint>
#include <cstring>
#include <sstream>

namespace vrl_flat_driver {
namespace {

std::uint32_t length_in_bytes(const void* text) {
    std::uint32_t length = 0;
    std::memcpy(&length, static_cast<const char*>(text) - sizeof length, sizeof length);
    return length;
}

}  // namespace

std::string taken_text(char16_t* text) {
    if (text == nullptr) return "(null)";
    const std::wstring wide(text, text + length_in_bytes(text) / sizeof(char16_t));
    vrl_free_string(text);
    std::string utf8;
    return qbxV2::convert(&utf8, wide);
}

std::string taken_text(char* bytes) {
    if (bytes == nullptr) return "(null)";
    std::string text(bytes, length_in_bytes(bytes));
    vrl_free_string(bytes);
    return text;
}

std::string written(const qbxV2::c_datetime& value) { return value.get_as_string(); }

std::string written(const qbxV2::c_binary& value) {
    std::ostringstream os;
    value.out_base64(os);
    return os.str();
}

std::u16string utf16(const std::string& text) {
    std::wstring wide;
    qbxV2::vtostring(wide, text);
    return {wide.begin(), wide.end()};
}

std::shared_ptr<void> date_or_bytes(const std::string& text) {
    if (qbxV2::c_datetime::is_valid(text)) {
        return {CSharp_new_c_datetime__SWIG_1(text.c_str()), &CSharp_delete_c_datetime};
    }
    auto* const bytes = new qbxV2::c_binary();
    bytes->from_base64(text);
    return {bytes, [](void* object) { delete static_cast<qbxV2::c_binary*>(object); }};
}

}  // namespace vrl_flat_driver
