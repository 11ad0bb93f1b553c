#include "ui/tree/OrvaneModelNode.h"

#include "support/AllocationMeter.h"
#include "ui/tree/DisplayWalk.h"

#include "platform/base/PropertyValue.h"

#include "platform/base/ArrayLock.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <thread>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class OrvaneModelNodeTest : public ::testing::Test
{
protected:
    NodePointer make(const PropertyValue& value)
    {
        paths.clear();
        return OrvaneModelNode::makeTreeFromObject(value, paths);
    }
    static std::vector<std::string> namesOf(const NodePointer& node)
    {
        std::vector<std::string> names;
        for (const NodePointer& child : *node->childNodes())
            names.push_back(child->displayName());
        return names;
    }

    PathDictionary paths;
};

} // namespace

TEST_F(OrvaneModelNodeTest, TheRootIsNamedOrvaneAndStoredUnderTheSlash)
{
    const NodePointer root = make(PropertyValue::newDictionary());
    EXPECT_EQ(root->displayName(), "Orvane");
    EXPECT_EQ(paths.at("/"), root);
}

TEST_F(OrvaneModelNodeTest, AnEmptyDictionaryIsAGroupWithoutChildren)
{
    const NodePointer root = make(PropertyValue::newDictionary());
    ASSERT_NE(root->childNodes(), nullptr);
    EXPECT_THAT(*root->childNodes(), IsEmpty());
    EXPECT_EQ(root->value(), nullptr);
}

TEST_F(OrvaneModelNodeTest, AStringIsALeafWithoutChildNodes)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"Cell Identity", "1234"}
    }));
    const NodePointer leaf = paths.at("/Cell Identity");
    EXPECT_EQ(leaf->childNodes(), nullptr);
    EXPECT_EQ(*leaf->value(), "1234");
    EXPECT_EQ(root->childNodes()->front(), leaf);
}

TEST_F(OrvaneModelNodeTest, SortedKeysAreSortedAndCutAtTheirSeparator)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"c",       "1"      },
        {"b;X",     "2"      },
        {"_sorted", "_sorted"},
        {"a;Y",     "3"      }
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("Y", "X", "c"));
    for (const char* path : {"/", "/Y", "/X", "/c"})
        EXPECT_NE(paths.at(path), nullptr) << path;
    for (const char* path : {"", "Y", "/b;X", "/b", "/Y/", "//Y", "/Z"})
        EXPECT_EQ(paths.at(path), nullptr) << path;
}

TEST_F(OrvaneModelNodeTest, SortingIsByCharactersNotByNumbers)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"2;X",     ""},
        {"10;Y",    ""},
        {"_sorted", ""}
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("Y", "X"));
}

TEST_F(OrvaneModelNodeTest, SortingTellsCapitalsFromSmallLetters)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"a;Y",     ""},
        {"B;X",     ""},
        {"_sorted", ""}
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("X", "Y"));
}

TEST_F(OrvaneModelNodeTest, AnyValueUnderSortedSorts)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"b",       ""                       },
        {"a",       ""                       },
        {"_sorted", PropertyValue::integer(0)}
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("a", "b"));
}

TEST_F(OrvaneModelNodeTest, AKeyWithTwoSeparatorsIsKeptWhole)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"a;b;c",   ""},
        {";",       ""},
        {"_sorted", ""}
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("", "a;b;c"));
}

TEST_F(OrvaneModelNodeTest, UnsortedKeysKeepTheirOrderAndAreNeverCut)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"b;X", ""},
        {"a;Y", ""}
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("b;X", "a;Y"));
}

TEST_F(OrvaneModelNodeTest, ArrayElementsAreNamedByTheirNumber)
{
    make(PropertyValue::dictionaryOf({
        {"List", PropertyValue::arrayOf({"a", "b", "c"})}
    }));
    EXPECT_THAT(namesOf(paths.at("/List")), ElementsAre("0", "1", "2"));
    EXPECT_EQ(*paths.at("/List/2")->value(), "c");
}

TEST_F(OrvaneModelNodeTest, AnythingElseIsALeafOfTheUnknownValue)
{
    make(PropertyValue::dictionaryOf({
        {"number",  PropertyValue::integer(7)   },
        {"real",    PropertyValue::real(0.5)    },
        {"boolean", PropertyValue::boolean(true)},
        {"data",    PropertyValue::data({1, 2}) },
        {"date",    PropertyValue::date({})     },
    }));
    for (const char* path : {"/number", "/real", "/boolean", "/data", "/date"}) {
        ASSERT_NE(paths.at(path)->value(), nullptr) << path;
        EXPECT_EQ(*paths.at(path)->value(), "(unknown)") << path;
    }
}

TEST_F(OrvaneModelNodeTest, NoDisplayIsALeafOfTheUnknownValue)
{
    const NodePointer root = make(PropertyValue());
    EXPECT_EQ(*root->value(), "(unknown)");
    EXPECT_EQ(paths.at("/"), root);
}

TEST_F(OrvaneModelNodeTest, OfSiblingsWithOneNameTheLaterIsFoundByPathAndBothAreShown)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"1;X",     "first" },
        {"2;X",     "second"},
        {"_sorted", ""      }
    }));
    EXPECT_THAT(namesOf(root), ElementsAre("X", "X"));
    EXPECT_EQ(*paths.at("/X")->value(), "second");
}

TEST_F(OrvaneModelNodeTest, ANameMayHoldSlashesAndBeEmpty)
{
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {"a/b", "slash"                                        },
        {"a",   PropertyValue::dictionaryOf({{"c", "nested"}}) },
        {"",    PropertyValue::dictionaryOf({{"d", "unnamed"}})},
        {"/e/", "slashes"                                      }
    }));
    EXPECT_EQ(*paths.at("/a/b")->value(), "slash");
    EXPECT_EQ(*paths.at("/a/c")->value(), "nested");
    EXPECT_EQ(*paths.at("/d")->value(), "unnamed");
    EXPECT_EQ(*paths.at("/e")->value(), "slashes");
    EXPECT_EQ(paths.at("/"), root);
}

TEST_F(OrvaneModelNodeTest, ALongNameIsCutAtTheEndOfACharacter)
{
    const std::string tooLong(kLongestName + 1, 'x');
    const std::string accented = std::string(kLongestName - 1, 'y') + "\u00E9";
    const NodePointer root = make(PropertyValue::dictionaryOf({
        {tooLong,  "1"},
        {accented, "2"}
    }));
    EXPECT_THAT(namesOf(root),
                ElementsAre(std::string(kLongestName, 'x'), std::string(kLongestName - 1, 'y')));
    EXPECT_EQ(*paths.at("/" + std::string(kLongestName, 'x'))->value(), "1");
}

TEST_F(OrvaneModelNodeTest, ALongNameAboveManyRowsCostsNoMoreThanAShortOne)
{
    if (!AllocationMeter::isAvailable)
        GTEST_SKIP() << "the address sanitizer keeps operator new";
    const auto bytesWith = [this](const std::string& name) {
        const PropertyValue rows = PropertyValue::newDictionary();
        for (int i = 0; i < 20'000; ++i)
            rows.asDictionary()->set(std::to_string(i), "value");
        const PropertyValue display = PropertyValue::dictionaryOf({
            {name, rows}
        });
        const AllocationMeter meter;
        make(display);
        EXPECT_NE(paths.at("/" + std::string(shownName(name)) + "/19999"), nullptr);
        return meter.peakBytes();
    };
    EXPECT_LT(bytesWith(std::string(50'000, 'n')), bytesWith("n") + 100'000);
}

TEST_F(OrvaneModelNodeTest, ANodeOutlivesItsTree)
{
    NodePointer leaf;
    {
        make(PropertyValue::dictionaryOf({
            {"a", "kept"}
        }));
        leaf = paths.at("/a");
        paths.clear();
    }
    EXPECT_EQ(*leaf->value(), "kept");
}

TEST_F(OrvaneModelNodeTest, ANestedArrayLeavesTheArrayLockHeldByTheThreadThatNested)
{
    const auto othersCanLock = [] {
        bool locked = false;
        std::thread other([&locked] {
            locked = ArrayLock::tryLock();
            if (locked)
                ArrayLock::unlock();
        });
        other.join();
        return locked;
    };
    make(PropertyValue::arrayOf({"flat"}));
    EXPECT_TRUE(othersCanLock());
    make(PropertyValue::arrayOf({PropertyValue::arrayOf({"nested"})}));
    EXPECT_FALSE(othersCanLock());
    ArrayLock::unlock();
    EXPECT_TRUE(othersCanLock());
}

TEST(PathByAppending, JoinsWithExactlyOneSeparator)
{
    const struct {
        const char* path;
        const char* component;
        const char* joined;
    } kCases[] = {
        {"/",   "x",   "/x"    },
        {"/x",  "y",   "/x/y"  },
        {"/x/", "y",   "/x/y"  },
        {"/x",  "/y/", "/x/y"  },
        {"/x",  "a/b", "/x/a/b"},
        {"/x",  "",    "/x"    },
        {"/",   "",    "/"     },
    };
    for (const auto& join : kCases)
        EXPECT_EQ(pathByAppending(join.path, join.component), join.joined);
}

} // namespace orvane
