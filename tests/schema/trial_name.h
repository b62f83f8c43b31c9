#pragma once

#include <cctype>
#include <string>

namespace schema_tests {

/// "a hue angle" as the name of a test case: "AHueAngle".
inline std::string trial_name(const std::string& sentence) {
    std::string name;
    bool starts_word = true;
    for (const char c : sentence) {
        const auto byte = static_cast<unsigned char>(c);
        if (std::isalnum(byte) == 0) {
            starts_word = starts_word || c != '\'';
            continue;
        }
        name += starts_word ? static_cast<char>(std::toupper(byte)) : c;
        starts_word = false;
    }
    return name;
}

}  // namespace schema_tests
