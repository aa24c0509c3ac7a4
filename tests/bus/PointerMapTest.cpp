// SPDX-License-Identifier: Apache-2.0
#include <EditorModel/bus/detail/PointerMap.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <map>
#include <memory>

namespace {

using PubSub::Details::PointerMap;

static_assert(noexcept(PointerMap<int>().remove(nullptr)));

const void* address(quintptr value)
{
    return reinterpret_cast<const void*>(value * 16);
}

TEST(PointerMap, FindsNothingWhereNothingWasAdded)
{
    PointerMap<int> map;
    EXPECT_TRUE(map.isEmpty());
    EXPECT_EQ(map.find(address(1)), nullptr);
    EXPECT_EQ(map.find(nullptr), nullptr);
    EXPECT_FALSE(map.remove(address(1)));
    map.add(address(1)) = 3;
    EXPECT_EQ(map.find(nullptr), nullptr);
    EXPECT_EQ(map.find(address(2)), nullptr);
    EXPECT_EQ(*map.find(address(1)), 3);
}

TEST(PointerMap, ARemovedValueComesBackAsDefault)
{
    PointerMap<int> map;
    map.add(address(1)) = 3;
    EXPECT_TRUE(map.remove(address(1)));
    EXPECT_EQ(map.add(address(1)), 0);
}

TEST(PointerMap, KeepsValuesThatCanOnlyBeMoved)
{
    PointerMap<std::unique_ptr<quintptr>> map;
    for (quintptr i = 1; i != 1000; ++i) {
        map.add(address(i)) = std::make_unique<quintptr>(i);
    }
    for (quintptr i = 1; i != 1000; ++i) {
        ASSERT_EQ(**map.find(address(i)), i);
    }
}

RC_GTEST_PROP(PointerMap, HoldsWhatAnOrderedMapHolds, ())
{
    PointerMap<int> map;
    std::map<quintptr, int> model;
    // Few addresses for collisions and repeated removals, in runs long enough to grow and to shrink.
    const auto steps = *rc::gen::container<std::vector<std::pair<bool, quintptr>>>(
        rc::gen::pair(rc::gen::arbitrary<bool>(), rc::gen::inRange<quintptr>(1, 200)));
    int value = 0;
    for (const auto& [adds, key] : steps) {
        if (adds) {
            map.add(address(key)) = ++value;
            model[key] = value;
        } else {
            RC_ASSERT(map.remove(address(key)) == (model.erase(key) == 1));
        }
    }
    std::map<quintptr, int> found;
    map.forEach(
        [&](const void* key, int held) { found.emplace(reinterpret_cast<quintptr>(key) / 16, held); });
    RC_ASSERT(found == model);
    RC_ASSERT(map.size() == model.size());
    for (quintptr key = 1; key != 200; ++key) {
        const int* held = map.find(address(key));
        RC_ASSERT((held != nullptr) == (model.count(key) == 1));
    }
}

TEST(PointerMap, ShrinksAfterManyAreGone)
{
    PointerMap<int> map;
    for (quintptr i = 1; i != 5000; ++i) {
        map.add(address(i)) = int(i);
    }
    for (quintptr i = 1; i != 4990; ++i) {
        ASSERT_TRUE(map.remove(address(i)));
    }
    for (quintptr i = 4990; i != 5000; ++i) {
        ASSERT_EQ(*map.find(address(i)), int(i));
    }
    EXPECT_EQ(map.size(), 10u);
}

} // namespace
