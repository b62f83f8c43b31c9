#pragma once

#include <iosfwd>
#include <string>
#include <type_traits>

#include "platform/api.h"

namespace qbxV2 {

/// An XML Schema integer of any length, kept as text: an optional "-", digits without leading zeros, and "0"
/// for zero. It does no arithmetic; its use is to be compared with text that has not been converted.
///
/// Parsing (constructors and assignments from text) never fails: one sign and leading zeros are skipped,
/// digits are taken up to the first other character, and no digit at all means 0. So "+007" is 7, "12ab" is
/// 12, "-0" and "x" are 0. A null pointer counts as the empty text. Values are plain data; separate objects
/// are independent.
class VRL_API c_big_int {
public:
    c_big_int();
    c_big_int(const c_big_int& other) = default;
    c_big_int(const std::string& text);
    c_big_int(long value);
    c_big_int(const char* text);
    /// Any other integer, as `long`: so that a plain 0 is a number and no null text.
    template <typename Integer, std::enable_if_t<std::is_integral_v<Integer>, int> = 0>
    c_big_int(Integer value) : c_big_int(static_cast<long>(value)) {}
    ~c_big_int() = default;

    c_big_int& operator=(const c_big_int& other) = default;
    c_big_int& operator=(const std::string& text);
    c_big_int& operator=(long value);
    c_big_int& operator=(const char* text);
    template <typename Integer, std::enable_if_t<std::is_integral_v<Integer>, int> = 0>
    c_big_int& operator=(Integer value) {
        return *this = static_cast<long>(value);
    }

    /// The value in 32-bit arithmetic, wrapped when it does not fit. `*overflow` (may be null) says whether
    /// that happened; -2147483648 counts as not fitting.
    long get(bool* overflow) const;
    /// The nearest that summing the digits in double arithmetic gives; infinite for a very long value.
    double get_as_float() const;
    std::string get_as_string() const { return m_text; }
    /// The text, owned by this object and valid until it changes.
    const std::string& text() const { return m_text; }

    void swap(c_big_int& other) noexcept { m_text.swap(other.m_text); }

private:
    std::string m_text;
};

inline void swap(c_big_int& a, c_big_int& b) noexcept { a.swap(b); }

VRL_API std::ostream& operator<<(std::ostream& os, const c_big_int& value);

VRL_API bool operator==(const c_big_int& a, const c_big_int& b);
VRL_API bool operator!=(const c_big_int& a, const c_big_int& b);
VRL_API bool operator<(const c_big_int& a, const c_big_int& b);
VRL_API bool operator<=(const c_big_int& a, const c_big_int& b);
VRL_API bool operator>(const c_big_int& a, const c_big_int& b);
VRL_API bool operator>=(const c_big_int& a, const c_big_int& b);

/// Comparisons with text: an optional sign and digits, which `is_valid_integer` has checked before. The text
/// is not parsed and nothing is allocated (but for a text that begins "-0"). What stands behind the digits
/// takes part as it is. A null text stands for "0". Intended: an empty text is neither equal to any value nor
/// below it, and so above every one.
VRL_API bool operator==(const c_big_int& a, const std::string& s);
VRL_API bool operator!=(const c_big_int& a, const std::string& s);
VRL_API bool operator<(const c_big_int& a, const std::string& s);
VRL_API bool operator<=(const c_big_int& a, const std::string& s);
VRL_API bool operator>(const c_big_int& a, const std::string& s);
VRL_API bool operator>=(const c_big_int& a, const std::string& s);
VRL_API bool operator==(const std::string& s, const c_big_int& a);
VRL_API bool operator!=(const std::string& s, const c_big_int& a);
VRL_API bool operator<(const std::string& s, const c_big_int& a);
VRL_API bool operator<=(const std::string& s, const c_big_int& a);
VRL_API bool operator>(const std::string& s, const c_big_int& a);
VRL_API bool operator>=(const std::string& s, const c_big_int& a);
VRL_API bool operator==(const c_big_int& a, const char* s);
VRL_API bool operator!=(const c_big_int& a, const char* s);
VRL_API bool operator<(const c_big_int& a, const char* s);
VRL_API bool operator<=(const c_big_int& a, const char* s);
VRL_API bool operator>(const c_big_int& a, const char* s);
VRL_API bool operator>=(const c_big_int& a, const char* s);
VRL_API bool operator==(const char* s, const c_big_int& a);
VRL_API bool operator!=(const char* s, const c_big_int& a);
VRL_API bool operator<(const char* s, const c_big_int& a);
VRL_API bool operator<=(const char* s, const c_big_int& a);
VRL_API bool operator>(const char* s, const c_big_int& a);
VRL_API bool operator>=(const char* s, const c_big_int& a);

}  // namespace qbxV2
