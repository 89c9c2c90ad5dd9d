// The recently-used list of results: its order, its eviction and its tolerance-equal keys.
#include "platform/base/zyrtl/zyrtlCache.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using ResultCache =
    zyrtl::cache<double, double, zyrtl::default_value<double, double>, zyrtl::equal_to<double>>;

TEST(zyrtlCache, evictsTheLeastRecentlyUsedEntryAndRefreshingMovesToTheFront) {
    ResultCache cache;
    for (int key = 0; key < 200; ++key)
        cache[key] = key * 10.0;
    EXPECT_EQ(cache[0], 0.0);    // a hit saves the oldest entry and moves it to the front
    EXPECT_EQ(cache[198], 1980); // with its stored value
    EXPECT_TRUE(cache.has(1));   // has() changes no order: 1 stays the least recently used
    EXPECT_EQ(cache[200], 0.0);  // the 201st value starts at the default
    EXPECT_EQ(cache.size(), 200u);
    EXPECT_FALSE(cache.has(1));
    std::vector<double> keys;
    for (const auto& entry : cache.entries())
        keys.push_back(entry.first);
    EXPECT_EQ((std::vector<double>{keys[0], keys[1], keys[2], keys[3], keys.back()}),
              (std::vector<double>{200, 198, 0, 199, 2}));
}

TEST(zyrtlCache, keysWithinTheHostsPointToleranceShareAnEntry) {
    const HsGeTol saved = HsGeContext::gTol;
    const struct {
        double tolerance, probe;
        bool shared;
    } cases[] = {{1e-10, 1.0 + 1e-11, true}, {1e-10, 1.0 - 1e-11, true}, {1e-10, 1.0 + 1e-9, false},
                 {0.5, 1.5, true},           {0.5, 0.5, true},           {0.5, 1.5000001, false}};
    for (const auto& c : cases) {
        HsGeContext::gTol.setEqualPoint(c.tolerance);
        ResultCache cache;
        cache[1.0] = 7;
        EXPECT_EQ(cache[c.probe], c.shared ? 7.0 : 0.0) << c.tolerance << " " << c.probe;
        EXPECT_EQ(cache.entries().back().first, 1.0) << "a hit keeps the key it was stored under";
    }
    ResultCache cache; // 0.8 apart: two entries, both within tolerance of 1.4
    cache[1.0] = 10;
    cache[1.8] = 18;
    EXPECT_EQ(cache[1.4], 18); // the most recently used answers
    EXPECT_EQ(cache[1.0], 10);
    EXPECT_EQ(cache[1.4], 10);
    HsGeContext::gTol = saved;
}

} // namespace
