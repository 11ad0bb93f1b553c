#include "platform/Resources.h"

#include "platform/FileSystem.h"

#include "support/PropertyListBytes.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <filesystem>
#include <gtest/gtest.h>

namespace orvane
{
namespace
{

class ResourcesTest : public testing::Test
{
protected:
    void put(const std::string& fileName, std::string_view text)
    {
        ASSERT_TRUE(writeFile(directory.path() + "/" + fileName, bytesOf(text)));
    }

    TestServices services;
    TemporaryDirectory directory;
    DirectoryResources resources{directory.path()};
};

TEST_F(ResourcesTest, ResourceIsFoundByNameAndType)
{
    put("LTE.plist", "content");
    put("LTE.ui", "other content");
    EXPECT_EQ(resources.load("LTE", "plist"), bytesOf("content"));
    EXPECT_EQ(resources.load("LTE", "ui"), bytesOf("other content"));
    EXPECT_FALSE(resources.load("lte", "plist"));
    EXPECT_FALSE(resources.load("LTE", ""));
    EXPECT_FALSE(resources.load("", "plist"));
    EXPECT_FALSE(resources.load("missing", "plist"));
}

TEST_F(ResourcesTest, PathsOfATypeAreSorted)
{
    for (const char* name : {"b.plist", "a.plist", "B.plist", "c.ui", "plist", "d.plist.old"})
        put(name, "");
    EXPECT_EQ(
        resources.pathsOfType("plist"),
        (std::vector<std::string>{directory.path() + "/B.plist", directory.path() + "/a.plist",
                                  directory.path() + "/b.plist"}));
    EXPECT_EQ(resources.pathsOfType("ui"), std::vector<std::string>{directory.path() + "/c.ui"});
    EXPECT_TRUE(resources.pathsOfType("other").empty());
}

TEST_F(ResourcesTest, MissingDirectoryHasNoResources)
{
    const DirectoryResources missing(directory.path() + "/missing");
    EXPECT_FALSE(missing.load("LTE", "plist"));
    EXPECT_TRUE(missing.pathsOfType("plist").empty());
}

TEST_F(ResourcesTest, DictionaryIsLoadedInEitherFormat)
{
    put("Text.plist", xmlList("<dict><key>Cells</key><array/></dict>"));
    EXPECT_EQ(loadDictionaryResource(resources, "Text").description(), "{Cells = ()}");

    BinaryListBuilder binary;
    const std::size_t key = binary.ascii("Cells");
    const std::size_t value = binary.boolean(true);
    binary.dictionary({key}, {value});
    ASSERT_TRUE(writeFile(directory.path() + "/Binary.plist", binary.bytes()));
    EXPECT_EQ(loadDictionaryResource(resources, "Binary").description(), "{Cells = true}");
    EXPECT_TRUE(services.log.lines.empty());
}

TEST_F(ResourcesTest, MissingDictionaryIsAbsentWithoutALine)
{
    EXPECT_TRUE(loadDictionaryResource(resources, "Missing").isAbsent());
    EXPECT_TRUE(services.log.lines.empty());
}

TEST_F(ResourcesTest, UnreadableDictionaryIsAbsentAndTheReasonIsLogged)
{
    put("Broken.plist", "<plist>\n<dict>");
    EXPECT_TRUE(loadDictionaryResource(resources, "Broken").isAbsent());
    EXPECT_EQ(services.log.errors(),
              std::vector<std::string>{"Resource \"Broken\" cannot be read: no element found at "
                                       "line 2, column 7"});
}

TEST_F(ResourcesTest, ResourceThatIsNoDictionaryIsAbsent)
{
    put("Array.plist", xmlList("<array/>"));
    put("Text.plist", xmlList("<string>text</string>"));
    EXPECT_TRUE(loadDictionaryResource(resources, "Array").isAbsent());
    EXPECT_TRUE(loadDictionaryResource(resources, "Text").isAbsent());
}

} // namespace
} // namespace orvane
