#include "zip/random_pool.h"

#include <gtest/gtest.h>

#include "support.h"

namespace {

using zip_test::Bytes;
using zip_test::FixedClock;
using zip_test::FixedEntropy;

Bytes Read(CZipRandomPool& pool, std::size_t size) {
    Bytes bytes(size, '\0');
    pool.Read(reinterpret_cast<std::uint8_t*>(bytes.data()), size);
    return bytes;
}

TEST(RandomPool, GivesTheSameForTheSameEntropy) {
    FixedClock clock;
    FixedEntropy one;
    FixedEntropy two;
    CZipRandomPool first(one, clock);
    CZipRandomPool second(two, clock);
    EXPECT_EQ(Read(first, 1000), Read(second, 1000));
}

TEST(RandomPool, DoesNotDependOnTheSizesThatAreRead) {
    FixedClock clock;
    FixedEntropy one;
    FixedEntropy two;
    CZipRandomPool first(one, clock);
    CZipRandomPool second(two, clock);
    Bytes pieces;
    for (std::size_t size = 0; pieces.size() < 1000; ++size) pieces += Read(second, size);
    EXPECT_EQ(Read(first, pieces.size()), pieces);
}

TEST(RandomPool, IsFilledAnewAfter260Bytes) {
    FixedClock clock;
    FixedEntropy entropy;
    CZipRandomPool pool(entropy, clock);
    const Bytes first = Read(pool, CZipRandomPool::k_halfSize);
    const Bytes second = Read(pool, CZipRandomPool::k_halfSize);
    EXPECT_NE(first, second);
    EXPECT_NE(first.substr(0, 16), first.substr(16, 16));
}

TEST(RandomPool, WithoutEntropyFollowsFromTheClock) {
    FixedEntropy none;
    none.available = false;
    FixedClock clock;
    CZipRandomPool first(none, clock);
    CZipRandomPool same(none, clock);
    ++clock.time;
    CZipRandomPool later(none, clock);
    const Bytes bytes = Read(first, 100);
    EXPECT_EQ(Read(same, 100), bytes);
    EXPECT_NE(Read(later, 100), bytes);
}

// Computed with a model of the pool that shares no code with it: tests/data/zip/make_archives.py.
TEST(RandomPool, BeginsWithTheBytesOfTheModel) {
    FixedClock clock;
    FixedEntropy entropy;
    CZipRandomPool pool(entropy, clock);
    EXPECT_EQ(Read(pool, 600), zip_test::ReadData("random_pool.bin"));
}

TEST(RandomPool, OfTheProcessDiffersFromTheLastRead) {
    CZipRandomPool& pool = CZipEnvironment::System().pool;
    EXPECT_NE(Read(pool, 16), Read(pool, 16));
}

}  // namespace
