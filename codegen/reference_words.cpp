#include "codegen/reference_words.h"

#include <map>
#include <vector>

#include "codegen/reference_plan.h"

namespace vrl_codegen {
namespace {

/// A bound without the zeros behind the point that only tell that it is a number.
std::string number(const std::string& bound) {
    const std::size_t point = bound.find('.');
    if (point == std::string::npos || bound.find_first_not_of('0', point + 1) != std::string::npos)
        return bound;
    return bound.substr(0, point);
}

std::string words_of_range(const facets& limits) {
    if (limits.min_inclusive && limits.max_inclusive) {
        return number(*limits.min_inclusive).append(" to ").append(number(*limits.max_inclusive));
    }
    std::string low;
    if (limits.min_inclusive) low = number(*limits.min_inclusive).append(" or more");
    if (limits.min_exclusive) low = std::string("above ").append(number(*limits.min_exclusive));
    std::string high;
    if (limits.max_inclusive) high = std::string("at most ").append(number(*limits.max_inclusive));
    if (limits.max_exclusive) high = std::string("below ").append(number(*limits.max_exclusive));
    return low.empty() || high.empty() ? low + high : low.append(", ").append(high);
}

std::string characters(unsigned count) {
    return std::to_string(count).append(count == 1 ? " character" : " characters");
}

std::string words_of_length(const facets& limits) {
    if (limits.min_length && limits.min_length == limits.max_length) {
        return std::string("exactly ").append(characters(*limits.min_length));
    }
    if (limits.min_length && limits.max_length) {
        return std::to_string(*limits.min_length).append(" to ").append(characters(*limits.max_length));
    }
    if (limits.min_length) return std::string("at least ").append(characters(*limits.min_length));
    if (limits.max_length) return std::string("at most ").append(characters(*limits.max_length));
    return {};
}

std::string words_of_literals(const facets& limits) {
    std::string words;
    for (const std::string& literal : limits.enumeration) {
        words.append(words.empty() ? "one of " : ", ").append(code(literal));
    }
    return words;
}

}  // namespace

std::string plain(const std::string& text) {
    static const std::string special = "|<>*\\`";
    std::string shown;
    for (const char c : text) {
        if (special.find(c) != std::string::npos) shown.push_back('\\');
        shown.push_back(c);
    }
    return shown;
}

std::string code(const std::string& text) { return std::string("`").append(text).append("`"); }

std::string link_to(const std::string& shown, const std::string& title) {
    return std::string("[").append(shown).append("](#").append(anchor_of(title)).append(")");
}

std::string words_of_type(const std::string& built_in) {
    static const std::map<std::string, std::string> words = {
        {"double", "number"},
        {"string", "text"},
        {"token", "text, white space collapsed"},
        {"anyURI", "URI"},
        {"boolean", "`true` or `false`"},
        {"int", "whole number"},
        {"unsignedInt", "whole number"},
        {"unsignedByte", "whole number"},
        {"dateTime", "date and time"},
        {"base64Binary", "bytes in base64"},
    };
    return words.at(built_in);
}

std::string words_of_values(const facets& limits) {
    if (!limits.enumeration.empty()) return words_of_literals(limits);
    return limits.has_range() ? words_of_range(limits) : words_of_length(limits);
}

std::string words_of_occurrence(const element_declaration& element) {
    return std::to_string(element.min_occurs == 0 ? 0 : 1)
        .append(element.repeated          ? "..n"
                : element.min_occurs == 0 ? "..1"
                                          : "");
}

}  // namespace vrl_codegen
