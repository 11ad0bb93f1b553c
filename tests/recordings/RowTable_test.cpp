#include "recordings/RowTable.h"

#include "support/AllocationMeter.h"
#include "ui/tree/DisplayWalk.h"

#include "platform/base/PropertyValue.h"
#include "ui/tree/DisplayWalk.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

PropertyValue display(std::initializer_list<std::pair<std::string_view, PropertyValue>> entries)
{
    return PropertyValue::dictionaryOf(entries);
}

PropertyValue group(std::initializer_list<const char*> names)
{
    PropertyValue made = PropertyValue::newDictionary();
    for (const char* name : names)
        made.asDictionary()->set(name, name);
    return made;
}

std::vector<std::string> orderedPaths(const RowTable& table)
{
    std::vector<std::string> paths;
    for (const std::size_t row : table.order())
        paths.push_back(table.rows()[row].path);
    return paths;
}

// The texts of the rows: "-" for an absent row, and "!" after a changed one.
std::vector<std::string> shown(const RowTable& table)
{
    std::vector<std::string> texts;
    for (const std::size_t i : table.order()) {
        const RowTable::Row& row = table.rows()[i];
        texts.push_back((table.isPresent(row) ? displayText(row.value) : "-") +
                        (row.hasChanged ? "!" : ""));
    }
    return texts;
}

TEST(RowTableTest, FollowsWhatTheRowsShow)
{
    RowTable table({"/a", "/b"});
    EXPECT_THAT(shown(table), ElementsAre("-", "-"));
    table.take(display({
        {"a", "1"}
    }));
    EXPECT_THAT(shown(table), ElementsAre("1!", "-"));
    table.take(display({
        {"b", "2"},
        {"a", "1"}
    }));
    EXPECT_THAT(shown(table), ElementsAre("1", "2!"));
    table.take(display({
        {"a", ""}
    }));
    EXPECT_THAT(shown(table), ElementsAre("!", "-!"));
    table.take(display({
        {"a", ""}
    }));
    EXPECT_THAT(shown(table), ElementsAre("", "-"));
    table.take(display({
        {"a", "" },
        {"b", "2"}
    }));
    EXPECT_THAT(shown(table), ElementsAre("", "2!"));
}

TEST(RowTableTest, WithoutPathsHasEveryRow)
{
    RowTable table({});
    table.take(display({
        {"a", "1"              },
        {"g", group({"x", "y"})}
    }));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/a", "/g/x", "/g/y"));
}

TEST(RowTableTest, RowsStandInTheOrderOfThePathsAskedFor)
{
    RowTable table({"/z", "/g", "/h/*", "/a"});
    table.take(display({
        {"a", "1"              },
        {"g", group({"x", "y"})},
        {"h", group({"x"})     },
        {"z", "2"              }
    }));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/z", "/g/x", "/g/y", "/h/x", "/a"));
}

TEST(RowTableTest, ANewRowStandsBehindTheOneThatIsShownBeforeIt)
{
    RowTable table({});
    table.take(display({
        {"g", group({"b"})},
        {"h", group({"x"})}
    }));
    table.take(display({
        {"g", group({"a", "b", "c"})},
        {"h", group({"x", "y"})     }
    }));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/g/a", "/g/b", "/g/c", "/h/x", "/h/y"));
}

TEST(RowTableTest, APathIsOneRowHoweverOftenItIsAskedFor)
{
    RowTable table({"/a", "/*", "//a"});
    table.take(display({
        {"a", "1"},
        {"b", "2"}
    }));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/a", "/b"));
}

TEST(RowTableTest, OfRowsWithOnePathTheLaterCounts)
{
    RowTable table({});
    table.take(display({
        {"_sorted", ""      },
        {"1;a",     "first" },
        {"2;a",     "second"}
    }));
    EXPECT_THAT(shown(table), ElementsAre("second!"));
}

TEST(RowTableTest, KnowsThePathsThatNeverOccurred)
{
    RowTable table({"/a", "/nowhere", "/*/nothing", "/g"});
    EXPECT_THAT(table.missingPaths(), ElementsAre("/a", "/nowhere", "/*/nothing", "/g"));
    table.take(display({
        {"a", "1"         },
        {"g", group({"x"})}
    }));
    table.take(display({}));
    EXPECT_THAT(table.missingPaths(), ElementsAre("/nowhere", "/*/nothing"));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/a", "/nowhere", "/g/x"))
        << "a row of its own, but for what turned out to be a group";
}

TEST(RowTableTest, NoDisplayHasNoRows)
{
    RowTable table({});
    table.take(PropertyValue());
    EXPECT_THAT(table.rows(), ElementsAre(::testing::Field(&RowTable::Row::lastPeriod, 0U)));
    EXPECT_THAT(shown(table), ElementsAre("-"));
    EXPECT_THAT(RowTable({"/*"}).rows(), IsEmpty());
}

// A quadratic table would take hours for these.
TEST(RowTableTest, HundredsOfThousandsOfRowsCostWhatTheyAre)
{
    constexpr int kRows = 300'000;
    const PropertyValue many = PropertyValue::newDictionary();
    for (int i = 0; i < kRows; ++i)
        many.asDictionary()->set(std::to_string(i), "value");
    const AllocationMeter meter;
    RowTable table({});
    table.take(many);
    const std::vector<std::size_t> order = table.order();
    ASSERT_EQ(order.size(), kRows);
    EXPECT_EQ(table.rows()[order.front()].path, "/0");
    EXPECT_EQ(table.rows()[order.back()].path, "/" + std::to_string(kRows - 1));
    if (AllocationMeter::isAvailable) {
        EXPECT_LT(meter.peakBytes(), kRows * 400U);
    }
}

TEST(RowTableTest, RowsWithALongPathAreCutAndThoseBeyondTheLongestPathPassedOver)
{
    const std::string name(50'000, 'n');
    PropertyValue deep = PropertyValue::dictionaryOf({
        {"row", "deep"}
    });
    for (std::size_t i = 0; i <= RowPath::kLongest / kLongestName; ++i)
        deep = PropertyValue::dictionaryOf({
            {name, deep}
        });
    RowTable table({});
    table.take(PropertyValue::dictionaryOf({
        {name,   "cut"},
        {"deep", deep }
    }));
    EXPECT_THAT(orderedPaths(table), ElementsAre("/" + name.substr(0, kLongestName)));
}

TEST(RowTableTest, NewRowsOfEachPeriodAreToldAsTheyComeAndGo)
{
    RowTable table({});
    for (int i = 0; i < 3; ++i) {
        const std::string name = std::to_string(i);
        table.take(display({
            {name, "x"}
        }));
    }
    EXPECT_THAT(orderedPaths(table), ElementsAre("/2", "/1", "/0"));
    EXPECT_THAT(shown(table), ElementsAre("x!", "-!", "-"));
}

} // namespace
} // namespace orvane
