#pragma once

#include <limits>
#include <string>
#include <string_view>
#include <type_traits>

#include "runtime/error_codes.h"
#include "runtime/values.h"

/// The facets of simple values. A setter asks `check`; the reader asks the same object, in its own order.
namespace vrl_v2::frame {

using qbxV2::eqbx_error;

struct no_limits {
    template <class T>
    constexpr eqbx_error check(const T&) const {
        return qbxV2::EQBX_NO_ERROR;
    }
};

/// Bounds of a number. The comparisons are stated so that NaN fails the first one there is.
class range {
public:
    constexpr range from(double low) const { return with_low(low, false); }
    constexpr range above(double low) const { return with_low(low, true); }
    constexpr range to(double high) const { return with_high(high, false); }
    constexpr range below(double high) const { return with_high(high, true); }

    constexpr eqbx_error check_low(double v) const {
        if (!m_has_low) return qbxV2::EQBX_NO_ERROR;
        const bool holds = m_low_is_open ? v > m_low : v >= m_low;
        return holds ? qbxV2::EQBX_NO_ERROR : qbxV2::EQBX_VALUE_TOO_SMALL;
    }
    constexpr eqbx_error check_high(double v) const {
        if (!m_has_high) return qbxV2::EQBX_NO_ERROR;
        const bool holds = m_high_is_open ? m_high > v : m_high >= v;
        return holds ? qbxV2::EQBX_NO_ERROR : qbxV2::EQBX_VALUE_TOO_LARGE;
    }
    constexpr eqbx_error check(double v) const {
        const eqbx_error low = check_low(v);
        return low != qbxV2::EQBX_NO_ERROR ? low : check_high(v);
    }

private:
    constexpr range with_low(double low, bool open) const {
        range r = *this;
        r.m_low = low;
        r.m_has_low = true;
        r.m_low_is_open = open;
        return r;
    }
    constexpr range with_high(double high, bool open) const {
        range r = *this;
        r.m_high = high;
        r.m_has_high = true;
        r.m_high_is_open = open;
        return r;
    }

    double m_low = 0.0;
    double m_high = 0.0;
    bool m_has_low = false;
    bool m_has_high = false;
    bool m_low_is_open = false;
    bool m_high_is_open = false;
};

/// Bounds of a whole number, as digits: the reader compares text, so that no digit string is too long.
struct whole {
    const char* low;
    const char* high;

    /// What a setter can be given is within a C++ type already; 64 bits hold all of them.
    eqbx_error check(long long v) const;
    /// The text of a document against the bounds, digit by digit.
    eqbx_error check_low(const std::string& digits) const;
    eqbx_error check_high(const std::string& digits) const;
};

/// Bounds of a text's length, in stored units for a setter.
struct length {
    unsigned min = 0;
    unsigned max = std::numeric_limits<unsigned>::max();

    eqbx_error check(const std::wstring& text) const {
        if (text.size() < min) return qbxV2::EQBX_LENGTH_TOO_SHORT;
        return text.size() > max ? qbxV2::EQBX_LENGTH_TOO_LONG : qbxV2::EQBX_NO_ERROR;
    }
};

/// The legal texts of an enumeration, in schema order: number 1 is the first.
class literals {
public:
    template <std::size_t n>
    constexpr explicit literals(const std::wstring_view (&texts)[n]) : m_texts(texts), m_count(n) {}

    /// The number of the first equal literal, 0 when there is none.
    int number_of(const std::wstring& text) const {
        for (std::size_t i = 0; i < m_count; ++i) {
            if (text == m_texts[i]) return static_cast<int>(i) + 1;
        }
        return 0;
    }
    /// Null for a number outside the list.
    const std::wstring_view* text_of(int number) const {
        return number >= 1 && static_cast<std::size_t>(number) <= m_count ? &m_texts[number - 1] : nullptr;
    }
    eqbx_error check(const std::wstring& text) const {
        return number_of(text) != 0 ? qbxV2::EQBX_NO_ERROR : qbxV2::EQBX_VALUE_NOT_ENUMERATED;
    }

private:
    const std::wstring_view* m_texts;
    std::size_t m_count;
};

/// Limits of a text whose white space is collapsed on reading, as few texts' is.
template <class Limits>
struct collapsed : Limits {};

template <class Limits>
struct is_collapsed : std::false_type {};
template <class Limits>
struct is_collapsed<collapsed<Limits>> : std::true_type {};

}  // namespace vrl_v2::frame
