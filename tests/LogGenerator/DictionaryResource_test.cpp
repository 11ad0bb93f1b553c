#include "LogGenerator/DictionaryResource.h"

#include "platform/services/FileSystem.h"
#include "platform/services/Resources.h"

#include "support/PropertyListBytes.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

class DictionaryResourceTest : public testing::Test
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

TEST_F(DictionaryResourceTest, DictionaryIsLoadedInEitherFormat)
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

TEST_F(DictionaryResourceTest, MissingDictionaryIsAbsentWithoutALine)
{
    EXPECT_TRUE(loadDictionaryResource(resources, "Missing").isAbsent());
    EXPECT_TRUE(services.log.lines.empty());
}

TEST_F(DictionaryResourceTest, UnreadableDictionaryIsAbsentAndTheReasonIsLogged)
{
    put("Broken.plist", "<plist>\n<dict>");
    EXPECT_TRUE(loadDictionaryResource(resources, "Broken").isAbsent());
    EXPECT_EQ(services.log.errors(),
              std::vector<std::string>{"Resource \"Broken\" cannot be read: no element found at "
                                       "line 2, column 7"});
}

TEST_F(DictionaryResourceTest, ResourceThatIsNoDictionaryIsAbsent)
{
    put("Array.plist", xmlList("<array/>"));
    put("Text.plist", xmlList("<string>text</string>"));
    EXPECT_TRUE(loadDictionaryResource(resources, "Array").isAbsent());
    EXPECT_TRUE(loadDictionaryResource(resources, "Text").isAbsent());
}

} // namespace
} // namespace orvane
