#include "LogGenerator/C2K/C2KTest.h"

#include "LogGenerator/C2K/C2KDecoders.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/services/FileSystem.h"
#include "support/Paths.h"

namespace orvane
{

namespace
{

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::SizeIs;

class C2KLogGeneratorTest : public C2KTest
{
protected:
    const Bytes& gathered()
    {
        generator.generateLogUsingState(state);
        return *state[kDisplayStateKey].asData();
    }
};

Bytes summary() { return PacketBuilder(0x1183, 50).put16(13, 100); }

Bytes wrapped(const Bytes& message)
{
    Bytes whole = {0x81, 0x33};
    whole.insert(whole.end(), message.begin(), message.end());
    return whole;
}

} // namespace

TEST_F(C2KLogGeneratorTest, TheStartCommandHasExactlyTwoEntriesAndTheCodesInOrder)
{
    EXPECT_EQ(generator.getStartCommand(),
              PropertyValue::dictionaryOf({
                  {"SetState",          "Streaming"                                 },
                  {"SetVarnelLogCodes",
                   PropertyValue::arrayOf(
                       {PropertyValue::integer(4234), PropertyValue::integer(4483),
                        PropertyValue::integer(4498), PropertyValue::integer(4790),
                        PropertyValue::integer(4508), PropertyValue::integer(4509),
                        PropertyValue::integer(4734), PropertyValue::integer(4943)})}
    }));
}

TEST_F(C2KLogGeneratorTest, TheFactoryMakesIt)
{
    const auto made = LogGenerator::generatorFromTechnology(kTSLogChannelTechnology_Varnel_CDMA);
    EXPECT_NE(dynamic_cast<C2KLogGenerator*>(made.get()), nullptr);
}

TEST_F(C2KLogGeneratorTest, ATemplateBecomesADisplayAndALookup)
{
    const PropertyValue displayTemplate = PropertyValue::dictionaryOf({
        {"_sorted",        "_sorted"                                                           },
        {"01;A",           PropertyValue::dictionaryOf({{"x", "kOne"}, {"y", "kTwo"}})         },
        {"02;B",           PropertyValue::dictionaryOf({{"_sorted", "_sorted"}, {"z", "kOne"}})},
        {"ignored number", PropertyValue::integer(1)                                           },
        {"ignored array",  PropertyValue::newArray()                                           }
    });
    const PropertyValue display = PropertyValue::newDictionary();
    const PropertyValue lookup = PropertyValue::newDictionary();
    C2KLogGenerator::processTemplate(*displayTemplate.asDictionary(), display,
                                     *lookup.asDictionary());
    EXPECT_EQ(display,
              PropertyValue::dictionaryOf({
                  {"_sorted", "_sorted"                                                       },
                  {"01;A",    PropertyValue::dictionaryOf({{"x", ""}, {"y", ""}})             },
                  {"02;B",    PropertyValue::dictionaryOf({{"_sorted", "_sorted"}, {"z", ""}})}
    }));
    ASSERT_THAT(lookup["kOne"].asArray()->elements(), SizeIs(2));
    const PropertyValue& second = (*lookup["kOne"].asArray())[1];
    EXPECT_EQ(second["key"], PropertyValue("z"));
    EXPECT_EQ(second["dict"].asDictionary(), display["02;B"].asDictionary()) << "shared";
    EXPECT_EQ(services.log.count("Processing the template"), 3U);

    const C2KPublisher publisher(lookup);
    publisher.publish("kOne", "1");
    EXPECT_EQ(display["01;A"]["x"], PropertyValue("1")) << "one key feeds several rows";
    EXPECT_EQ(display["02;B"]["z"], PropertyValue("1"));
    publisher.publish("kUnheard", "2");
}

TEST_F(C2KLogGeneratorTest, PublishingStopsAtTheFirstBadEntry)
{
    const PropertyValue first = PropertyValue::newDictionary();
    const PropertyValue last = PropertyValue::newDictionary();
    const auto entry = [](const PropertyValue& row, const PropertyValue& dictionary) {
        return PropertyValue::dictionaryOf({
            {"key",  row       },
            {"dict", dictionary}
        });
    };
    for (const PropertyValue& bad :
         {entry("row", "no dictionary"), entry(PropertyValue::integer(1), last)}) {
        const PropertyValue lookup = PropertyValue::dictionaryOf({
            {"k", PropertyValue::arrayOf({entry("row", first), bad, entry("row", last)})}
        });
        C2KPublisher(lookup).publish("k", "value");
        EXPECT_EQ(first["row"], PropertyValue("value"));
        EXPECT_TRUE(last.asDictionary()->empty());
    }
}

TEST_F(C2KLogGeneratorTest, ShortPacketsAreIgnoredAndUnknownOnesChangeNothing)
{
    send(PacketBuilder(0x1183, 12));
    send(PacketBuilder(0x1184, 13));
    EXPECT_THAT(services.log.lines, IsEmpty());
    EXPECT_THAT(gathered(), IsEmpty());
}

TEST_F(C2KLogGeneratorTest, AWrappedPacketIsDecodedAndKeptWithoutItsWrapper)
{
    send(wrapped(summary()));
    EXPECT_EQ(row("kChannel"), "100");
    EXPECT_EQ(gathered(), summary());
}

TEST_F(C2KLogGeneratorTest, AnotherTypeIsCalledDroppedAndDecodedAllTheSame)
{
    send(PacketBuilder(0x1183, 50).put8(0, 2).put16(13, 100));
    EXPECT_THAT(services.log.errors(), ElementsAre("Invalid log type: 2. Dropping."));
    EXPECT_EQ(row("kChannel"), "100");
}

TEST_F(C2KLogGeneratorTest, AServerItemMatchesNoCode)
{
    send(PacketBuilder(0x1183, 50).put8(0, 0xFF).put16(13, 100));
    EXPECT_THAT(services.log.errors(), ElementsAre("Invalid log type: ff. Dropping."));
    EXPECT_EQ(row("kChannel"), "");
    EXPECT_THAT(gathered(), IsEmpty());
}

TEST_F(C2KLogGeneratorTest, ARejectedPacketOfAKnownCodeIsKept)
{
    const Bytes rejected = PacketBuilder(0x1183, 51);
    send(rejected);
    EXPECT_EQ(gathered(), rejected);
    EXPECT_THAT(gathered(), IsEmpty()) << "gathered anew from each display on";
}

TEST_F(C2KLogGeneratorTest, AWrappedPacketOfThirteenBytesIsShorterThanItsHeaderAndHarmless)
{
    Bytes packet(13, 0);
    packet[0] = 0x81;
    packet[2] = 1;
    packet[5] = 0x83;
    packet[6] = 0x11;
    send(packet);
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x1183 is 11 bytes long but should be 50 bytes."));
}

TEST_F(C2KLogGeneratorTest, TheDisplayIsTheSameObjectOnEveryRequest)
{
    const PropertyValue first = generator.generateLogUsingState(state);
    const PropertyValue second = generator.generateLogUsingState(state);
    EXPECT_NE(first.asDictionary(), nullptr);
    EXPECT_EQ(first.asDictionary(), second.asDictionary());
    EXPECT_THAT(state[kHistoryKey].asArray()->elements(), SizeIs(2));
}

TEST_F(C2KLogGeneratorTest, WithoutATemplateNothingIsCachedAndPacketsAreKept)
{
    TestServices without;
    PropertyDictionary fresh;
    const Bytes packet = summary();
    generator.updateState(fresh, packet);
    EXPECT_FALSE(fresh.contains(kTemplateKey));
    EXPECT_FALSE(fresh.contains(kDisplayKey));
    EXPECT_EQ(generator.generateLogUsingState(fresh), PropertyValue());
    EXPECT_EQ(without.log.count("Cannot load C2K template for display"), 2U);
    EXPECT_EQ(*fresh[kDisplayStateKey].asData(), packet);
}

TEST_F(C2KLogGeneratorTest, TheShippedTemplateShowsEveryStateKeyInAnOrderedGroup)
{
    services.useShippedResources();
    PropertyDictionary fresh;
    const PropertyValue display = C2KLogGenerator::getDisplayFromState(fresh);
    ASSERT_NE(display.asDictionary(), nullptr);
    EXPECT_TRUE(display["_sorted"]);
    for (const auto& [name, group] : *display.asDictionary())
        if (group.asDictionary()) {
            EXPECT_TRUE(group["_sorted"]) << name;
        }
    for (const auto& [key, value] : *state["Lookup"].asDictionary())
        EXPECT_TRUE(fresh["Lookup"][key]) << key;
}

TEST(C2KRecordingTest, AnEveningIsShownThroughTheShippedTemplate)
{
    TestServices services;
    services.useShippedResources();
    const auto file = readFile(testDataPath("cdma-evening.dlf"));
    ASSERT_TRUE(file);
    C2KLogGenerator generator;
    generator.init();
    PropertyDictionary state;
    // Items end to end, their length first; the version report of 161 bytes is the first.
    for (std::size_t at = 161; at + 12 <= file->size();) {
        const std::size_t length = PacketView(*file).unsignedAt(at, 2).value_or(0);
        Bytes message = {1};
        const auto begin = file->begin() + static_cast<std::ptrdiff_t>(at);
        message.insert(message.end(), begin, begin + static_cast<std::ptrdiff_t>(length));
        generator.updateState(state, message);
        at += length;
    }
    const PropertyValue& display = state[kDisplayKey];
    for (const char* group : {"01;1x", "02;1xEV-DO", "03;System Identity", "04;Data Rates"})
        for (const auto& [row, value] : *display[group].asDictionary())
            EXPECT_NE(value, PropertyValue("")) << group << " " << row;
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

} // namespace orvane
