#include "runtime/values.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

using namespace qbxV2;

// What callers store in containers and copy about: plain values.
template <typename Value>
constexpr bool is_plain = std::is_default_constructible_v<Value>&& std::is_copy_constructible_v<Value>&&
                              std::is_copy_assignable_v<Value> &&
                          !std::is_polymorphic_v<Value>;

TEST(Values, TheChiefHeaderGivesEveryClassAsAPlainValue) {
    EXPECT_TRUE(is_plain<c_big_int> && is_plain<c_decimal> && is_plain<c_binary> && is_plain<c_duration>);
    EXPECT_TRUE(is_plain<c_date> && is_plain<c_datetime> && is_plain<c_time> && is_plain<c_gday>);
    EXPECT_TRUE(is_plain<c_gmonth> && is_plain<c_gmonthday> && is_plain<c_gyear> && is_plain<c_gyearmonth>);
    EXPECT_TRUE(is_plain<c_datetime_base> && is_plain<c_any_info> && is_plain<c_empty> &&
                is_plain<c_pattern_null>);
}

TEST(Values, APatternOwnsItsExpression) {
    EXPECT_TRUE(std::has_virtual_destructor_v<c_regex>);
    EXPECT_FALSE(std::is_copy_constructible_v<c_pattern>);
    EXPECT_TRUE((std::is_base_of_v<c_regex, c_pattern>));
    const c_pattern from_literal = "a";
    EXPECT_TRUE(from_literal.is_match(std::string("a")));
}

TEST(Values, EmptyHasNothing) { EXPECT_TRUE(std::is_empty_v<c_empty>); }

}  // namespace
