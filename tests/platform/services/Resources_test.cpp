#include "platform/services/Resources.h"

#include "platform/services/FileSystem.h"

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

} // namespace
} // namespace orvane
