#include "LogGenerator/VRNLogGenerator2.h"

#include "LogGenerator/StateKeys.h"
#include "LogGenerator/support/PacketBuilder.h"
#include "LogGenerator/support/RecordingSection.h"
#include "platform/base/PropertyValue.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::MatchesRegex;

constexpr const char* kTemplate = R"(<plist><dict>
  <key>Group</key><dict><key>Lamp</key><dict><key>Label</key><string>text</string></dict></dict>
  <key>Doors</key><array/>
  <key>Nobody's</key><array><string>a</string><dict/></array>
</dict></plist>)";

class VRNLogGenerator2Test : public ::testing::Test
{
protected:
    VRNLogGenerator2Test()
    {
        services.memoryResources.put("Test.plist", kTemplate);
        auto made = std::make_shared<RecordingClassIndex>();
        index = made.get();
        lamp = &index->add("Lamp", {0xB0C0, 0xFF0002});
        doors = &index->add("Doors", {0xB0C0}, PropertyValue::Type::Array);
        services.log.lines.clear();
        generator = std::make_unique<VRNLogGenerator2>();
        generator->initWithPListName("Test", std::move(made));
    }

    // Sends an exactly sized copy, so that the address sanitizer sees one byte too many.
    void send(const Bytes& message)
    {
        const Bytes exact(message.begin(), message.end());
        generator->updateState(state, exact);
    }
    // The messages gathered so far. Moves them into the state.
    Bytes gathered()
    {
        generator->generateLogUsingState(state);
        return *state[kDisplayStateKey].asData();
    }
    void showDisplay()
    {
        generator->getDisplayFromState(state);
        services.log.lines.clear();
    }

    TestServices services;
    PropertyDictionary state;
    RecordingClassIndex* index;
    RecordingSection* lamp;
    RecordingSection* doors;
    std::unique_ptr<VRNLogGenerator2> generator;
};

Bytes wrapped(const Bytes& message)
{
    Bytes bytes = {0x81, 0x55};
    bytes.insert(bytes.end(), message.begin(), message.end());
    return bytes;
}

} // namespace

TEST_F(VRNLogGenerator2Test, InitAndEndAreLogged)
{
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("Creating VRNLogGenerator2 object with 0x.+"),
                            MatchesRegex("Creating Log object: 0x.+"), "Class Index: 1"));
    services.log.lines.clear();
    generator.reset();
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("VRN_GSMLogGenerator is destructed 0x.+")));
    EXPECT_THAT(services.console.lines, ElementsAre("Deallocing ClassIndex"));
}

TEST_F(VRNLogGenerator2Test, AMessageGoesToAllSubscribersInOrder)
{
    std::vector<std::string> order;
    lamp->onCall = [&] { order.emplace_back("lamp"); };
    doors->onCall = [&] { order.emplace_back("doors"); };
    const Bytes message = PacketBuilder(0xB0C0, 20).put8(19, 7);
    send(message);
    EXPECT_THAT(order, ElementsAre("lamp", "doors"));
    EXPECT_EQ(lamp->calls[0].data, message);
    EXPECT_EQ(lamp->calls[0].logCode, 0xB0C0U);
}

TEST_F(VRNLogGenerator2Test, ASectionThatListsACodeTwiceIsCalledTwice)
{
    RecordingSection& twice = index->add("Twice", {7, 7});
    send(PacketBuilder(7, 13));
    EXPECT_EQ(twice.calls.size(), 2U);
}

TEST_F(VRNLogGenerator2Test, AMessageOf12BytesIsIgnoredSilently)
{
    showDisplay();
    const Bytes whole = PacketBuilder(0xB0C0, 13);
    for (std::size_t size = 0; size < 13; ++size)
        send(Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size)));
    EXPECT_THAT(lamp->calls, IsEmpty());
    EXPECT_THAT(services.log.lines, IsEmpty());
    send(whole);
    EXPECT_EQ(lamp->calls.size(), 1U);
}

TEST_F(VRNLogGenerator2Test, ACodeWithoutSubscribersDoesNothing)
{
    showDisplay();
    send(PacketBuilder(0xB0C1, 13));
    EXPECT_THAT(lamp->calls, IsEmpty());
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(VRNLogGenerator2Test, AMessageOfAnotherTypeIsReportedAndGatheredAllTheSame)
{
    showDisplay();
    const Bytes message = PacketBuilder(0xB0C0, 13).put8(0, 2);
    send(message);
    EXPECT_THAT(services.log.errors(), ElementsAre("Invalid log type: 2. Dropping."));
    EXPECT_THAT(lamp->calls, IsEmpty());
    EXPECT_EQ(gathered(), message);
}

TEST_F(VRNLogGenerator2Test, TypesAreReportedInHexadecimal)
{
    showDisplay();
    for (const std::uint32_t type : {0U, 0x80U, 0xFEU})
        send(PacketBuilder(0xB0C0, 13).put8(0, type));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Invalid log type: 0. Dropping.", "Invalid log type: 80. Dropping.",
                            "Invalid log type: fe. Dropping."));
}

TEST_F(VRNLogGenerator2Test, TheServersItemsHaveExtendedCodes)
{
    send(PacketBuilder(0xFF0002, 13));
    ASSERT_EQ(lamp->calls.size(), 1U);
    EXPECT_EQ(lamp->calls[0].logCode, 16711682U);
    EXPECT_THAT(doors->calls, IsEmpty());
    // The modem's code with that number is a different code.
    send(PacketBuilder(2, 13));
    EXPECT_EQ(lamp->calls.size(), 1U);
}

TEST_F(VRNLogGenerator2Test, AWrappedMessageIsRoutedWithoutAndGatheredWithItsWrapper)
{
    const Bytes message = PacketBuilder(0xB0C0, 20);
    send(wrapped(message));
    ASSERT_EQ(lamp->calls.size(), 1U);
    EXPECT_EQ(lamp->calls[0].data, message);
    EXPECT_EQ(gathered(), wrapped(message));
}

TEST_F(VRNLogGenerator2Test, LengthIsTestedBeforeUnwrapping)
{
    send(wrapped(PacketBuilder(0xB0C0, 11)));
    ASSERT_EQ(lamp->calls.size(), 1U);
    EXPECT_EQ(lamp->calls[0].data.size(), 11U);
    send(wrapped(PacketBuilder(0xB0C0, 10)));
    EXPECT_EQ(lamp->calls.size(), 1U);
}

TEST_F(VRNLogGenerator2Test, OnlyOneWrapperIsRemoved)
{
    showDisplay();
    send(wrapped(wrapped(PacketBuilder(0xB0C0, 20))));
    EXPECT_THAT(services.log.errors(), ElementsAre("Invalid log type: 81. Dropping."));
}

TEST_F(VRNLogGenerator2Test, WhatASectionThrowsPassesAndTheMessageIsNotGathered)
{
    lamp->onCall = [] { throw std::runtime_error("bad"); };
    EXPECT_THROW(send(PacketBuilder(0xB0C0, 13)), std::runtime_error);
    EXPECT_THAT(doors->calls, IsEmpty());
    EXPECT_EQ(gathered(), Bytes());
}

TEST_F(VRNLogGenerator2Test, TheCallThatBuildsTheDisplayGivesNone)
{
    EXPECT_FALSE(generator->getDisplayFromState(state));
    ASSERT_TRUE(state[kDisplayKey]);
    EXPECT_EQ(generator->getDisplayFromState(state).asDictionary(),
              state[kDisplayKey].asDictionary());
}

TEST_F(VRNLogGenerator2Test, TheFirstMessageBuildsTheDisplaySoThatTheFirstGenerationGivesIt)
{
    send(PacketBuilder(1, 13));
    EXPECT_EQ(generator->generateLogUsingState(state).asDictionary(),
              state[kDisplayKey].asDictionary());
}

TEST_F(VRNLogGenerator2Test, TheDisplayIsALiveCopyOfTheTemplateInItsOrder)
{
    generator->getDisplayFromState(state);
    EXPECT_EQ(state[kDisplayKey].description(),
              "{Group = {Lamp = {Label = text}}; Doors = (); Nobody's = (a, {})}");
    EXPECT_EQ(state[kDisplayKey], state[kTemplateKey]);
    state[kDisplayKey]["Group"]["Lamp"].asDictionary()->set("Label", "changed");
    EXPECT_EQ(state[kTemplateKey]["Group"]["Lamp"]["Label"], PropertyValue("text"));
    EXPECT_EQ(state[kExtraInfoKey], PropertyValue::newDictionary());
}

TEST_F(VRNLogGenerator2Test, SectionsAreGivenTheirPartsOfTheDisplay)
{
    generator->getDisplayFromState(state);
    EXPECT_EQ(lamp->rows().get(), state[kDisplayKey]["Group"]["Lamp"].asDictionary());
    EXPECT_EQ(doors->list().get(), state[kDisplayKey]["Doors"].asArray());
}

TEST_F(VRNLogGenerator2Test, ASectionThatTheTemplateLacksHasNoPart)
{
    services.memoryResources.put("Test.plist", "<plist><dict/></plist>");
    generator->getDisplayFromState(state);
    EXPECT_EQ(lamp->rows(), nullptr);
    send(PacketBuilder(0xB0C0, 13));
    EXPECT_EQ(lamp->calls.size(), 1U);
}

TEST_F(VRNLogGenerator2Test, APartOfTheWrongKindIsReportedOnceAndTheRestIsShown)
{
    services.memoryResources.put(
        "Test.plist",
        "<plist><dict><key>Lamp</key><array/><key>Doors</key><array/></dict></plist>");
    send(PacketBuilder(0xB0C0, 13));
    send(PacketBuilder(0xB0C0, 13));
    EXPECT_EQ(services.log.errors().size(), 1U);
    EXPECT_EQ(lamp->rows(), nullptr);
    EXPECT_TRUE(doors->list());
}

TEST_F(VRNLogGenerator2Test, BuildingTheDisplayIsLogged)
{
    services.log.lines.clear();
    generator->getDisplayFromState(state);
    EXPECT_THAT(services.log.warnings(),
                ElementsAre(MatchesRegex("Initialized class index: 0x.+, Self: 0x.+"),
                            "Dictionary = 1", "String = 0", "Lamp", "Doors"));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(VRNLogGenerator2Test, AMissingTemplateIsReportedAndTriedAgain)
{
    generator = std::make_unique<VRNLogGenerator2>();
    generator->initWithPListName("Missing", std::make_shared<RecordingClassIndex>());
    EXPECT_FALSE(generator->getDisplayFromState(state));
    EXPECT_FALSE(generator->generateLogUsingState(state));
    EXPECT_EQ(services.log.errors(),
              std::vector<std::string>(2, "Cannot load template for display"));
    EXPECT_FALSE(state[kDisplayKey]);
    services.memoryResources.put("Missing.plist", kTemplate);
    generator->getDisplayFromState(state);
    EXPECT_TRUE(generator->getDisplayFromState(state));
}

TEST_F(VRNLogGenerator2Test, ATemplateThatIsNoDictionaryCountsAsMissing)
{
    services.memoryResources.put("Test.plist", "<plist><array/></plist>");
    EXPECT_FALSE(generator->getDisplayFromState(state));
    EXPECT_EQ(services.log.count("Cannot load template for display"), 1U);
    EXPECT_FALSE(state[kTemplateKey]);
}

TEST_F(VRNLogGenerator2Test, ATemplateInTheStateIsTakenInsteadOfTheResource)
{
    state.set(kTemplateKey, PropertyValue::dictionaryOf({
                                {"Mine", "text"}
    }));
    generator->getDisplayFromState(state);
    EXPECT_EQ(state[kDisplayKey].description(), "{Mine = text}");
}

TEST_F(VRNLogGenerator2Test, ProcessingATemplateCopiesTextsListsAndGroups)
{
    const PropertyValue object = PropertyValue::arrayOf({
        "text", PropertyValue::dictionaryOf({{"Lamp", PropertyValue::newDictionary()}}
         )
    });
    const PropertyValue live = generator->processTemplate(object);
    EXPECT_EQ(live, object);
    EXPECT_NE(live.asArray(), object.asArray());
    EXPECT_EQ(lamp->rows().get(), (*live.asArray())[1]["Lamp"].asDictionary());
}

TEST_F(VRNLogGenerator2Test, ATemplateOfAnotherTypeGivesNothingAndIsReported)
{
    services.log.lines.clear();
    EXPECT_FALSE(generator->processTemplate(PropertyValue::integer(1)));
    EXPECT_THAT(
        services.log.lines,
        ElementsAre(RecordingLog::Line{LogPriority::Error, "Received an object of unknown type"},
                    RecordingLog::Line{LogPriority::Warning, "Processing the template"}));
    for (const PropertyValue& other :
         {PropertyValue::boolean(true), PropertyValue::real(1), PropertyValue::data({1}),
          PropertyValue::date({1}), PropertyValue()})
        EXPECT_FALSE(generator->processTemplate(other)) << other.description();
}

TEST_F(VRNLogGenerator2Test, ATemplateThatHoldsSuchAValueThrows)
{
    services.memoryResources.put("Test.plist",
                                 "<plist><dict><key>Key</key><integer>1</integer></dict></plist>");
    EXPECT_THROW(generator->getDisplayFromState(state), std::invalid_argument);
    EXPECT_FALSE(state[kDisplayKey]);
    EXPECT_THROW(generator->processTemplate(PropertyValue::arrayOf({PropertyValue::integer(1)})),
                 std::invalid_argument);
}

TEST_F(VRNLogGenerator2Test, PrintingATreeReportsWhatIsNoTemplateObject)
{
    services.log.lines.clear();
    VRNLogGenerator2::printDict(PropertyValue::dictionaryOf({
        {"a", "text"                                             },
        {"b", PropertyValue::arrayOf({PropertyValue::integer(1)})},
        {"c", PropertyValue::boolean(true)                       }
    }));
    EXPECT_EQ(services.log.errors(),
              std::vector<std::string>(2, "Received an object of unknown type"));
    services.log.lines.clear();
    VRNLogGenerator2::printDict(PropertyValue::newArray());
    VRNLogGenerator2::printDict("text");
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(VRNLogGenerator2Test, AGenerationMovesTheMessagesIntoTheStateAndRecordsASnapshot)
{
    const Bytes message = PacketBuilder(0xB0C0, 13);
    send(message);
    generator->generateLogUsingState(state);
    EXPECT_EQ(*state[kDisplayStateKey].asData(), message);
    const PropertyValue& snapshot = (*state[kHistoryKey].asArray())[0];
    EXPECT_EQ(*snapshot["DisplayState"].asData(), message);
    EXPECT_EQ(snapshot["Display"], state[kDisplayKey]);
    EXPECT_EQ(gathered(), Bytes());
}

TEST_F(VRNLogGenerator2Test, SnapshotsKeepWhatWasShownThen)
{
    send(PacketBuilder(1, 13));
    generator->generateLogUsingState(state);
    lamp->rows()->set("Label", "changed");
    EXPECT_EQ((*state[kHistoryKey].asArray())[0]["Display"]["Group"]["Lamp"]["Label"],
              PropertyValue("text"));
}

TEST_F(VRNLogGenerator2Test, TheStartCommandListsBothKindsOfCodes)
{
    EXPECT_EQ(generator->getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (45248); SetTsExtraCodes = (2)}");
    EXPECT_TRUE((*generator->getStartCommand()["SetVarnelLogCodes"].asArray())[0].asInteger());
}

TEST_F(VRNLogGenerator2Test, ExtendedCodesBeginAt16711680)
{
    index->add("Edges", {0xFEFFFF, 0xFF0000, 0xFFFFFF});
    EXPECT_EQ(generator->getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (45248, 16711679); "
              "SetTsExtraCodes = (2, 0, 65535)}");
}

TEST_F(VRNLogGenerator2Test, WithoutAnIndexTheDisplayIsShownAndNoCodeAskedFor)
{
    generator = std::make_unique<VRNLogGenerator2>();
    generator->initWithPListName("Test", nullptr);
    EXPECT_EQ(services.log.warnings().back(), "Class Index: 0");
    send(PacketBuilder(0xB0C0, 13));
    EXPECT_TRUE(generator->generateLogUsingState(state));
    EXPECT_EQ(generator->getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (); SetTsExtraCodes = ()}");
}

TEST_F(VRNLogGenerator2Test, WithoutInitEveryOperationYieldsNothing)
{
    VRNLogGenerator2 bare;
    bare.updateState(state, PacketBuilder(0xB0C0, 13).bytes());
    EXPECT_FALSE(bare.getDisplayFromState(state));
    EXPECT_FALSE(bare.generateLogUsingState(state));
    EXPECT_TRUE(state.empty());
    EXPECT_EQ(bare.getStartCommand().description(),
              "{SetState = Streaming; SetVarnelLogCodes = (); SetTsExtraCodes = ()}");
    EXPECT_EQ(bare.getSaveContentsFromState(state).asArray()->size(), 1U); // a version report
    EXPECT_EQ(bare.processTemplate("text"), PropertyValue("text"));
}

} // namespace orvane
