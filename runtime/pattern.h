#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"

struct _xmlRegexp;  // NOLINT(bugprone-reserved-identifier): the name that libxml2 gives it

namespace qbxV2 {

/// A compiled regular expression of XML Schema (Part 2, appendix F), anchored at both ends.
///
/// Errors   nothing is reported. A bad expression matches no text; a failure of the engine while matching
/// counts as a
///          match.
/// Threads  immutable once built: one object may serve any number of threads at a time.
/// Cost     compiling allocates, matching too. Backtracking grows with the text.
class VRL_API c_regex {
public:
    /// `pattern` is UTF-8.
    c_regex(const std::string& pattern);
    c_regex(const c_regex&) = delete;
    c_regex& operator=(const c_regex&) = delete;
    virtual ~c_regex();

    /// `text` is UTF-8 and ends at its first zero byte.
    [[nodiscard]] bool is_match(const std::string& text) const;

private:
    _xmlRegexp* m_compiled;
};

/// A pattern facet.
class VRL_API c_pattern : public c_regex {
public:
    /// A null pointer counts as the empty pattern.
    c_pattern(const char* pattern);

    [[nodiscard]] bool is_match(const std::string& text) const;
    /// For wide text, which goes through `convert`.
    [[nodiscard]] bool is_match(const std::wstring& text) const;
};

/// Stands for a value without a pattern facet: every text matches.
class VRL_API c_pattern_null {
public:
    c_pattern_null() = default;
    explicit c_pattern_null(const char* /*pattern*/) {}

    [[nodiscard]] bool is_match(const std::string& /*text*/) const { return true; }
    [[nodiscard]] bool is_match(const std::wstring& /*text*/) const { return true; }
};

/// The one pattern of the document format: a date-time must have a time part and a zone.
inline constexpr char k_date_time_pattern[] = ".+T.+(Z|[+\\-].+)";

/// For a text that has passed `c_datetime::is_valid`: whether it matches `k_date_time_pattern`, told from its
/// end without the engine. For any other text the answer means nothing.
[[nodiscard]] VRL_API bool has_time_and_zone(const std::string& text);
[[nodiscard]] VRL_API bool has_time_and_zone(const char* text, std::size_t size);

}  // namespace qbxV2
