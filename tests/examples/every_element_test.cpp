#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "tests/examples/declarations.h"

namespace vrl_test {
namespace {

TEST(EveryElement, UsesEachElementAndAttributeThatTheSchemaDeclares) {
    declarations format(VRL_SCHEMA);
    ASSERT_GT(format.count(), 400U);
    ASSERT_NO_THROW(format.use(VRL_DOCUMENTS "/every_element.vrl"));
    EXPECT_EQ(format.unused(), std::vector<std::string>());
}

// The judge itself: what a smaller document leaves out, it tells.
TEST(EveryElement, IsNotWhatAPaintRecipeIs) {
    declarations format(VRL_SCHEMA);
    ASSERT_NO_THROW(format.use(VRL_DOCUMENTS "/paint_recipe.vrl"));
    const std::vector<std::string> unused = format.unused();
    EXPECT_EQ(std::count(unused.begin(), unused.end(), "color.xsd: ColorType/UniqueID"), 1);
    EXPECT_EQ(std::count(unused.begin(), unused.end(), "color.xsd: ColorType/ColorName"), 0);
}

}  // namespace
}  // namespace vrl_test
