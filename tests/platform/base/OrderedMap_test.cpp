#include "platform/base/OrderedMap.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <random>

namespace orvane
{
namespace
{

using Map = OrderedMap<int>;

std::vector<std::string> keysOf(const Map& map)
{
    std::vector<std::string> keys;
    for (const auto& [key, value] : map)
        keys.push_back(key);
    return keys;
}

TEST(OrderedMapTest, NewMapIsEmpty)
{
    Map map;
    EXPECT_TRUE(map.empty());
    EXPECT_EQ(map.size(), 0U);
    EXPECT_EQ(map.find("key"), nullptr);
    map.remove("key");
    EXPECT_TRUE(map.empty());
}

TEST(OrderedMapTest, KeysStayInTheOrderInWhichTheyWereFirstStored)
{
    Map map;
    map["zebra"] = 1;
    map["ant"] = 2;
    map["moth"] = 3;
    map["zebra"] = 4;
    EXPECT_EQ(keysOf(map), (std::vector<std::string>{"zebra", "ant", "moth"}));
    EXPECT_EQ(*map.find("zebra"), 4);
}

TEST(OrderedMapTest, RemovedKeyComesBackAtTheEnd)
{
    Map map;
    map["a"] = 1;
    map["b"] = 2;
    map.remove("a");
    EXPECT_EQ(map.find("a"), nullptr);
    map["a"] = 3;
    EXPECT_EQ(keysOf(map), (std::vector<std::string>{"b", "a"}));
}

TEST(OrderedMapTest, KeysAreComparedByteByByte)
{
    Map map;
    map[""] = 1;
    map[std::string_view("a\0b", 3)] = 2;
    map["a"] = 3;
    map["A"] = 4;
    EXPECT_EQ(map.size(), 4U);
    EXPECT_EQ(*map.find(""), 1);
    EXPECT_EQ(*map.find(std::string_view("a\0b", 3)), 2);
}

TEST(OrderedMapTest, ClearedMapTakesKeysAgain)
{
    for (const int count : {3, 100}) {
        Map map;
        for (int i = 0; i < count; ++i)
            map[std::to_string(i)] = i;
        map.clear();
        EXPECT_TRUE(map.empty());
        EXPECT_EQ(map.find("1"), nullptr);
        map["1"] = 5;
        EXPECT_EQ(*map.find("1"), 5);
        EXPECT_EQ(map.size(), 1U);
    }
}

// A map of 32 keys or more has an index. It must behave the same above and below that size.
TEST(OrderedMapTest, MapsOfEverySizeFindAndRemoveWhatTheyHold)
{
    for (int size = 28; size <= 36; ++size) {
        Map map;
        for (int i = 0; i < size; ++i)
            map["key " + std::to_string(i)] = i;
        for (int removed = 0; removed < size; ++removed) {
            Map copy = map;
            copy.remove("key " + std::to_string(removed));
            ASSERT_EQ(copy.size(), static_cast<std::size_t>(size - 1));
            for (int i = 0; i < size; ++i) {
                const int* const found = copy.find("key " + std::to_string(i));
                ASSERT_EQ(found != nullptr, i != removed) << size << ' ' << i;
                if (found) {
                    EXPECT_EQ(*found, i);
                }
            }
        }
    }
}

// Compared with a plain list that is searched from start to end.
TEST(OrderedMapTest, AnySequenceOfChangesKeepsOrderAndValues)
{
    std::mt19937 random(1);
    Map map;
    std::vector<Map::Entry> expected;
    for (int step = 0; step < 5000; ++step) {
        const std::string key = std::to_string(random() % 60);
        const auto entry = std::find_if(expected.begin(), expected.end(),
                                        [&key](const auto& each) { return each.first == key; });
        if (random() % 3 == 0) {
            map.remove(key);
            if (entry != expected.end())
                expected.erase(entry);
        } else {
            map[key] = step;
            if (entry != expected.end())
                entry->second = step;
            else
                expected.emplace_back(key, step);
        }
        ASSERT_TRUE(std::equal(map.begin(), map.end(), expected.begin(), expected.end())) << step;
    }
    EXPECT_GT(map.size(), 32U);
}

} // namespace
} // namespace orvane
