#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/PacketBuilder.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::MatchesRegex;

// A template that shows its own name.
std::string templateNamed(const std::string& name)
{
    return "<plist><dict><key>" + name + "</key><dict/></dict></plist>";
}

class UTRANLogGeneratorTest : public ::testing::Test
{
protected:
    void put(const std::string& name)
    {
        services.memoryResources.put(name + ".plist", templateNamed(name));
    }
    // The name that the chosen template shows.
    std::string chosen()
    {
        generator = UTRANLogGenerator::generator();
        PropertyDictionary state;
        static_cast<void>(generator->generateLogUsingState(state));
        const PropertyDictionary* display = state[kDisplayKey].asDictionary();
        return display ? display->begin()->first : "(none)";
    }

    TestServices services;
    std::unique_ptr<LogGenerator> generator;
};

} // namespace

TEST_F(UTRANLogGeneratorTest, TakesTheTemplateWhosePathHoldsItsWord)
{
    put("LTE");
    put("MyUTRANLayout");
    put("VRN_GSM");
    EXPECT_EQ(chosen(), "MyUTRANLayout");
}

TEST_F(UTRANLogGeneratorTest, LetterCaseDoesNotMatter)
{
    put("LTE");
    put("some-utran-template");
    EXPECT_EQ(chosen(), "some-utran-template");
    services.memoryResources.put("UtRaN2.plist", templateNamed("UtRaN2"));
    EXPECT_EQ(chosen(), "UtRaN2");
}

TEST_F(UTRANLogGeneratorTest, OfTwoMatchesTheFirstInListingOrderWins)
{
    put("B-UTRAN");
    put("A-UTRAN");
    EXPECT_EQ(chosen(), "A-UTRAN");
}

TEST_F(UTRANLogGeneratorTest, TheWholePathCountsFoldersIncluded)
{
    const TemporaryDirectory directory;
    const std::string folder = directory.path() + "/utran";
    std::filesystem::create_directory(folder);
    std::ofstream(folder + "/Another.plist") << templateNamed("Another");
    std::ofstream(folder + "/UTRAN.plist") << templateNamed("UTRAN");
    DirectoryResources resources(folder);
    Services::current().setResources(&resources);
    EXPECT_EQ(chosen(), "Another");
}

TEST_F(UTRANLogGeneratorTest, OnlyTheLastDotEndsTheName)
{
    put("UTRAN.v2");
    EXPECT_EQ(chosen(), "UTRAN.v2");
}

TEST_F(UTRANLogGeneratorTest, ShipsATemplateOfItsOwn)
{
    services.useShippedResources();
    EXPECT_EQ(chosen(), "Serving Cell Info");
}

TEST_F(UTRANLogGeneratorTest, TellsOfItsCreationAfterItsBase)
{
    put("UTRAN");
    generator = UTRANLogGenerator::generator();
    EXPECT_EQ(services.log.lines.back(),
              (RecordingLog::Line{LogPriority::Error, "Created UTRANLogGenerator object"}));
    EXPECT_EQ(services.log.count("Class Index: 1"), 1U);
}

TEST_F(UTRANLogGeneratorTest, ItsEndIsLoggedByItsBaseAlone)
{
    put("UTRAN");
    generator = UTRANLogGenerator::generator();
    services.log.lines.clear();
    generator.reset();
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("VRN_GSMLogGenerator is destructed 0x.+")));
}

TEST_F(UTRANLogGeneratorTest, AsksForAllItsCodes)
{
    put("UTRAN");
    generator = UTRANLogGenerator::generator();
    EXPECT_EQ(generator->getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (53472, 53474, 53258, 53262, 53260); "
              "SetTsExtraCodes = (1, 2, 0)}");
}

TEST_F(UTRANLogGeneratorTest, WithoutATemplateItIsLeftWithoutABaseAndSaysNothing)
{
    generator = UTRANLogGenerator::generator();
    ASSERT_TRUE(generator);
    EXPECT_THAT(services.log.lines, IsEmpty());
    put("LTE");
    put("UTRA");
    generator = UTRANLogGenerator::generator();
    ASSERT_TRUE(generator);
    // Only the first one's end is told.
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("VRN_GSMLogGenerator is destructed 0x.+")));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UTRANLogGeneratorTest, WithoutATemplateEveryOperationYieldsNothing)
{
    generator = UTRANLogGenerator::generator();
    PropertyDictionary state;
    generator->updateState(state, PacketBuilder(0xD0E0, 15).bytes());
    EXPECT_FALSE(generator->generateLogUsingState(state));
    EXPECT_FALSE(generator->generateLogUsingState(state));
    EXPECT_TRUE(state.empty());
    EXPECT_EQ(generator->getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (); SetTsExtraCodes = ()}");
}

} // namespace orvane
