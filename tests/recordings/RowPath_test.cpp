#include "recordings/RowPath.h"

#include "platform/base/PropertyValue.h"

#include "ui/tree/DisplayWalk.h"
#include "ui/tree/OrvaneModelNode.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

PropertyValue listOf(std::initializer_list<const char*> cells)
{
    PropertyValue list = PropertyValue::newArray();
    for (const char* cell : cells)
        list.asArray()->append(PropertyValue::dictionaryOf({
            {"PCI",  cell     },
            {"RSRP", "-90 dBm"}
        }));
    return list;
}

PropertyValue exampleDisplay()
{
    return PropertyValue::dictionaryOf({
        {"Serving",    PropertyValue::dictionaryOf({{"PCI", "7"}, {"Ec/Io", "-9 dB"}})},
        {"Neighbours", listOf({"11", "12"})                                           },
        {"State",      "Idle"                                                         },
        {"Count",      PropertyValue::integer(3)                                      }
    });
}

// "PATH=TEXT" of each row.
std::vector<std::string> rowsOf(const PropertyValue& display, std::string_view path)
{
    std::vector<std::string> rows;
    RowPath(path).forEachRow(display, [&rows](std::string_view found, const PropertyValue& row) {
        rows.push_back(std::string(found) + "=" + displayText(row));
    });
    return rows;
}

TEST(RowPathTest, NamesARow)
{
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Serving/PCI"), ElementsAre("/Serving/PCI=7"));
    EXPECT_THAT(rowsOf(exampleDisplay(), "/State"), ElementsAre("/State=Idle"));
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Neighbours/1/PCI"), ElementsAre("/Neighbours/1/PCI=12"));
}

TEST(RowPathTest, SlashesMayBeMissingDoubledOrTrailing)
{
    for (const char* path : {"Serving/PCI", "//Serving//PCI", "/Serving/PCI/"})
        EXPECT_THAT(rowsOf(exampleDisplay(), path), ElementsAre("/Serving/PCI=7")) << path;
    EXPECT_EQ(RowPath("Serving//PCI/").text(), "/Serving/PCI");
}

TEST(RowPathTest, NamesOfRowsMayHoldSlashes)
{
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Serving/Ec/Io"), ElementsAre("/Serving/Ec/Io=-9 dB"));
    const PropertyValue odd = PropertyValue::dictionaryOf({
        {"/a//b/", PropertyValue::dictionaryOf({{"", "1"}, {"/", "2"}, {"c", "3"}})}
    });
    EXPECT_THAT(rowsOf(odd, "/a/b/c"), ElementsAre("/a/b/c=3"));
    EXPECT_THAT(rowsOf(odd, "/"), ElementsAre("/a/b=1", "/a/b=2", "/a/b/c=3"));
}

TEST(RowPathTest, NamesNothingThatIsNotThere)
{
    for (const char* path : {"/Nowhere", "/Serving/PC", "/Serving/PCI/more", "/Neighbours/2/PCI",
                             "/Neighbours/01/PCI", "/*/*/*/*"})
        EXPECT_THAT(rowsOf(exampleDisplay(), path), IsEmpty()) << path;
    EXPECT_THAT(rowsOf(PropertyValue::newDictionary(), "/"), IsEmpty());
}

TEST(RowPathTest, AGroupStandsForAllItsRows)
{
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Serving"),
                ElementsAre("/Serving/PCI=7", "/Serving/Ec/Io=-9 dB"));
    EXPECT_THAT(rowsOf(exampleDisplay(), "/"),
                ElementsAre("/Serving/PCI=7", "/Serving/Ec/Io=-9 dB", "/Neighbours/0/PCI=11",
                            "/Neighbours/0/RSRP=-90 dBm", "/Neighbours/1/PCI=12",
                            "/Neighbours/1/RSRP=-90 dBm", "/State=Idle", "/Count=(unknown)"));
}

TEST(RowPathTest, AnAsteriskStandsForAnyName)
{
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Neighbours/*/PCI"),
                ElementsAre("/Neighbours/0/PCI=11", "/Neighbours/1/PCI=12"));
    EXPECT_THAT(rowsOf(exampleDisplay(), "/*/PCI"), ElementsAre("/Serving/PCI=7"));
    EXPECT_THAT(rowsOf(exampleDisplay(), "/Neighbours/*").size(), ::testing::Eq(4U));
    EXPECT_TRUE(RowPath("/Neighbours/*/PCI").isPattern());
    EXPECT_TRUE(RowPath("*").isPattern());
    for (const char* path : {"/", "/a", "/a*", "/*a", "/a/*b/c*"})
        EXPECT_FALSE(RowPath(path).isPattern()) << path;
}

TEST(RowPathTest, PathsAreThoseOfTheTreeThatIsShown)
{
    const PropertyValue sorted = PropertyValue::dictionaryOf({
        {"_sorted",   "_sorted"                                               },
        {"02;Second", "2"                                                     },
        {"01;First",  PropertyValue::dictionaryOf({{"01;Row", "1"}})          },
        {"03;a;b",    PropertyValue::arrayOf({"x", PropertyValue::newArray()})}
    });
    EXPECT_THAT(rowsOf(sorted, "/"), ElementsAre("/First/01;Row=1", "/Second=2", "/03;a;b/0=x"));
    for (const PropertyValue& display : {sorted, exampleDisplay()}) {
        PathDictionary paths;
        OrvaneModelNode::makeTreeFromObject(display, paths);
        RowPath("/").forEachRow(display, [&paths](std::string_view path, const PropertyValue& row) {
            const NodePointer node = paths.at(path);
            ASSERT_NE(node, nullptr) << path;
            EXPECT_EQ(*node->value(), displayText(row));
        });
    }
}

} // namespace
} // namespace orvane
