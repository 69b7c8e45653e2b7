#include "SeenHashes.h"
#include "RandomSequence.h"

#include <gtest/gtest.h>

#include <set>

namespace
{

using kareport::SeenHashes;

TEST(SeenHashes, EachIsNewOnce)
{
    SeenHashes seen;
    std::set<std::uint64_t> model;
    RandomNumbers random(7);
    for (int i = 0; i < 20000; ++i) {
        // Many that are the same, and many that differ in their upper bits alone, which ask for the same place.
        const auto hash =
            static_cast<std::uint64_t>(random.below(50)) << 40U | static_cast<std::uint64_t>(random.below(100));
        EXPECT_EQ(seen.add(hash), model.insert(std::max<std::uint64_t>(hash, 1)).second) << hash;
    }
    seen.clear();
    EXPECT_TRUE(seen.add(*model.begin())) << "all are forgotten";
    seen.prepare(0);
}

} // namespace
