#include "tests/driver/model_driver.h"

#include <cstdlib>
#include <iostream>
#include <sstream>

namespace vrl_driver {
namespace {

template <class T>
std::string streamed(const T& value) {
    std::ostringstream os;
    os << value;
    return os.str();
}

}  // namespace

const class_description& find_class(const std::string& name) {
    for (const class_description& c : classes()) {
        if (name == c.name) return c;
    }
    std::cerr << "no class " << name << '\n';
    std::abort();
}

void from_text(const std::string& text, double& value) { value = qbxV2::text_to_double(text); }
void from_text(const std::string& text, bool& value) { value = qbxV2::text_to_bool(text); }
void from_text(const std::string& text, int& value) { value = static_cast<int>(std::stoll(text)); }
void from_text(const std::string& text, unsigned& value) { value = static_cast<unsigned>(std::stoll(text)); }
void from_text(const std::string& text, unsigned char& value) {
    value = static_cast<unsigned char>(std::stoll(text));
}
void from_text(const std::string& text, std::wstring& value) { qbxV2::vtostring(value, text); }
void from_text(const std::string& text, qbxV2::c_datetime& value) { value = text; }
void from_text(const std::string& text, qbxV2::c_binary& value) { value.from_base64(text); }

std::string to_text(double value) { return streamed(qbxV2::c_as_xml<double>(value)); }
std::string to_text(bool value) { return value ? "true" : "false"; }
std::string to_text(int value) { return std::to_string(value); }
std::string to_text(unsigned value) { return std::to_string(value); }
std::string to_text(unsigned char value) { return std::to_string(value); }
std::string to_text(const std::wstring& value) {
    std::string text;
    return qbxV2::convert(&text, value);
}
std::string to_text(const qbxV2::c_datetime& value) { return value.get_as_string(); }
std::string to_text(const qbxV2::c_binary& value) {
    std::ostringstream os;
    value.out_base64(os);
    return os.str();
}

}  // namespace vrl_driver
