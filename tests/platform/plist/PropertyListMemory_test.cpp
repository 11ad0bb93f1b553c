#include "platform/plist/PropertyListMemory.h"

#include "support/AllocationMeter.h"
#include "support/PropertyListBytes.h"

#include <algorithm>
#include <functional>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

// A list may take this much memory, plus this much for each of its bytes.
constexpr std::size_t kAllowance = std::size_t{64} << 20;
constexpr std::size_t kBytesAByte = 20;

struct Cost {
    std::size_t listBytes;
    std::size_t peakBytes;
    std::size_t allocations;
    std::string error;
};

Cost costOf(const Bytes& list)
{
    const AllocationMeter meter;
    const PropertyListResult result = readPropertyList(list);
    return {list.size(), meter.peakBytes(), meter.allocations(), result.error};
}

void expectBounded(const Cost& cost, const char* name)
{
    EXPECT_LE(cost.peakBytes, kAllowance + kBytesAByte * cost.listBytes) << name;
    // Each allocation takes 32 bytes or more, so steps are bounded likewise.
    EXPECT_LE(cost.allocations, (kAllowance + kBytesAByte * cost.listBytes) / 32) << name;
}

class PropertyListMemoryTest : public ::testing::Test
{
protected:
    void SetUp() override
    {
        if (!AllocationMeter::isAvailable)
            GTEST_SKIP() << "allocations cannot be counted in this build";
    }
};

// Fills a list that refers `spread` times to the same object.
struct Hostile {
    const char* name;
    std::function<void(BinaryListBuilder& list, std::size_t spread)> fill;
};

const Hostile kHostile[] = {
    {"empty dictionaries",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t empty = list.dictionary({}, {});
         list.array(BinaryListBuilder::References(spread, empty));
     }},
    {"empty arrays",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t empty = list.array({});
         list.array(BinaryListBuilder::References(spread, empty));
     }},
    {"dictionaries of one entry",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t key = list.ascii("a key of 16 byte");
         const std::size_t inner = list.dictionary({key}, {key});
         list.array(BinaryListBuilder::References(spread, inner));
     }},
    {"texts just too long for their place",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t text = list.ascii(std::string(16, 'x'));
         list.array(BinaryListBuilder::References(spread, text));
     }},
    {"texts of UTF-16 that grow",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t text = list.utf16(std::u16string(6, u'\u20AC'));
         list.array(BinaryListBuilder::References(spread, text));
     }},
    {"data of one byte",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t data = list.data({1});
         list.array(BinaryListBuilder::References(spread, data));
     }},
    {"large numbers",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t number =
             list.raw(Bytes{0x14, 0x7F, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1});
         list.array(BinaryListBuilder::References(spread, number));
     }},
    {"booleans",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t flag = list.boolean(true);
         list.array(BinaryListBuilder::References(spread, flag));
     }},
    {"one key in a large dictionary",
     [](BinaryListBuilder& list, std::size_t spread) {
         const std::size_t key = list.ascii("a key of 16 byte");
         list.dictionary(BinaryListBuilder::References(spread, key),
                         BinaryListBuilder::References(spread, key));
     }},
    {"arrays in arrays",
     [](BinaryListBuilder& list, std::size_t spread) {
         std::size_t inner = list.array({});
         while (spread > 1) {
             inner = list.array(BinaryListBuilder::References(16, inner));
             spread /= 16;
         }
     }},
    {"large dictionaries, many times",
     [](BinaryListBuilder& list, std::size_t spread) {
         BinaryListBuilder::References keys;
         for (int i = 0; i < 64; ++i)
             keys.push_back(list.ascii("a key of 16 byte " + std::to_string(i)));
         const std::size_t dictionary = list.dictionary(keys, keys);
         list.array(BinaryListBuilder::References(spread / 64 + 1, dictionary));
     }},
};

TEST_F(PropertyListMemoryTest, AListOfAMegabyteStaysWithinItsBoundWhateverItRefersTo)
{
    std::size_t highest = 0;
    for (const Hostile& hostile : kHostile) {
        BinaryListBuilder list(4, 1);
        // A filler that nothing refers to makes the list larger, and its bound with it.
        list.data(Bytes(std::size_t{1} << 20, 0));
        hostile.fill(list, 1000000);
        const Cost cost = costOf(list.bytes());
        expectBounded(cost, hostile.name);
        highest = std::max(highest, cost.peakBytes);
    }
    EXPECT_GT(highest, kAllowance / 2); // something was measured
}

TEST_F(PropertyListMemoryTest, AnExpandingListIsRefusedBeforeItTakesTheMemory)
{
    BinaryListBuilder list(4, 1);
    list.data(Bytes(std::size_t{1} << 20, 0));
    std::size_t last = list.dictionary({}, {});
    for (int i = 0; i < 30; ++i)
        last = list.array(BinaryListBuilder::References(10, last));
    const Cost cost = costOf(list.bytes());
    expectBounded(cost, "expanding");
    EXPECT_FALSE(cost.error.empty());
}

TEST_F(PropertyListMemoryTest, AListOfShortElementsStaysWithinItsBound)
{
    const struct {
        const char* name;
        const char* element;
        const char* container;
    } cases[] = {
        {"empty arrays",       "<array/>",           "array"},
        {"empty dictionaries", "<dict/>",            "array"},
        {"large numbers",      "<real>1e999</real>", "array"},
        {"one key",            "<key/><true/>",      "dict" },
    };
    for (const auto& each : cases) {
        std::string text;
        while (text.size() < std::size_t{8} << 20)
            text += each.element;
        const std::string container = each.container;
        const Bytes list = bytesOf(xmlList("<" + container + ">" + text + "</" + container + ">"));
        const Cost cost = costOf(list);
        expectBounded(cost, each.name);
        if (!cost.error.empty()) {
            EXPECT_TRUE(cost.error.starts_with("too many values for the length of the list"))
                << cost.error;
        }
    }
}

TEST_F(PropertyListMemoryTest, ManySmallObjectsStayWithinTheBound)
{
    // As many objects as fit, in order and in reverse.
    for (const bool isReversed : {false, true}) {
        BinaryListBuilder list(3, 3);
        BinaryListBuilder::References all;
        for (std::size_t i = 0; i < 140000; ++i)
            all.push_back(list.boolean(true));
        list.array(all);
        if (isReversed)
            std::reverse(list.offsets.begin(), list.offsets.end() - 1);
        const Cost cost = costOf(list.bytes());
        EXPECT_EQ(cost.error, "");
        EXPECT_LE(cost.peakBytes, kBytesAByte * cost.listBytes);
    }
}

TEST_F(PropertyListMemoryTest, DistinctEntriesOfALargeListAreRead)
{
    // As a real writer makes it of many cells. A large list is read.
    BinaryListBuilder list(3, 3);
    BinaryListBuilder::References cells;
    for (int i = 0; i < 60000; ++i) {
        const std::size_t key = list.ascii("k");
        const std::size_t value = list.integer(i, 4);
        cells.push_back(list.dictionary({key}, {value}));
    }
    list.array(cells);
    const Cost cost = costOf(list.bytes());
    EXPECT_EQ(cost.error, "");
    EXPECT_LE(cost.peakBytes, kBytesAByte * cost.listBytes);
}

} // namespace
} // namespace orvane
