#include "telephonyd/modem/ManagedModem.h"

#include "platform/base/TelephonyConstants.h"
#include "telephonyd/modem/FollowedModem.h"
#include "telephonyd/support/HandModemService.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::AllOf;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;

TEST(ManagedModemTest, AModemIsReadFromItsProperties)
{
    const auto modems = managedModemsIn(objectsOf({
        {"/Modem/0", "490154203237518", 1U << 14}
    }));
    ASSERT_THAT(modems, SizeIs(1));
    EXPECT_EQ(modems[0].path, "/Modem/0");
    EXPECT_EQ(modems[0].id, "490154203237518");
    EXPECT_EQ(modems[0].maker, "Maker");
    EXPECT_EQ(modems[0].model, "Model");
    EXPECT_EQ(modems[0].stateName(), "registered");
    EXPECT_EQ(modems[0].diagnosticPort(), "/dev/ttyUSB0");
    ASSERT_THAT(modems[0].ports, SizeIs(2));
    EXPECT_FALSE(modems[0].ports[1].isDiagnostic);
}

TEST(ManagedModemTest, WithoutAnEquipmentIdentifierTheDevicesOneIsTheId)
{
    const auto modems = managedModemsIn(objectsOf({
        {"/Modem/0", "", 0}
    }));
    ASSERT_THAT(modems, SizeIs(1));
    EXPECT_EQ(modems[0].id, "device-/Modem/0");
}

TEST(ManagedModemTest, WhatIsMissingOrOfAnotherTypeStaysEmpty)
{
    EXPECT_THAT(managedModemsIn({}), IsEmpty());
    EXPECT_THAT(managedModemsIn("text"), IsEmpty());
    EXPECT_THAT(managedModemsIn(PropertyValue::dictionaryOf({
                    {"/Bearer/0", PropertyValue::newDictionary()},
                    {"/Text",     "text"                        },
    })),
                IsEmpty());
    const auto odd = PropertyValue::dictionaryOf({
        {"EquipmentIdentifier", PropertyValue::integer(1)                                   },
        {"State",               "registered"                                                },
        {"Ports",               PropertyValue::arrayOf({"x", PropertyValue::arrayOf({"y"})})},
    });
    const auto modems = managedModemsIn(PropertyValue::dictionaryOf({
        {"/Modem/0",
         PropertyValue::dictionaryOf({{"org.freedesktop.ModemManager1.Modem", odd}})}
    }));
    ASSERT_THAT(modems, SizeIs(1));
    EXPECT_EQ(modems[0].id, "");
    EXPECT_EQ(modems[0].stateName(), "unknown");
    EXPECT_EQ(modems[0].diagnosticPort(), "");
    EXPECT_FALSE(modems[0].technology());
}

TEST(ManagedModemTest, TheTechnologyComesFromTheAccessTechnologies)
{
    const auto technologyOf = [](std::uint32_t bits) {
        ManagedModem modem;
        modem.accessTechnologies = bits;
        return modem.technology().value_or("");
    };
    for (const unsigned bit : {14U, 16U, 17U})
        EXPECT_EQ(technologyOf(1U << bit), kTSLogChannelTechnology_Varnel_LTE) << bit;
    for (unsigned bit = 1; bit <= 9; ++bit)
        EXPECT_EQ(technologyOf(1U << bit), kTSLogChannelTechnology_Varnel_GSM) << bit;
    for (unsigned bit = 10; bit <= 13; ++bit)
        EXPECT_EQ(technologyOf(1U << bit), kTSLogChannelTechnology_Varnel_CDMA) << bit;
    for (const std::uint32_t bits : {0U, 1U, 1U << 15, 1U << 18})
        EXPECT_EQ(technologyOf(bits), "") << bits;
    EXPECT_EQ(technologyOf(1U << 14 | 1U << 15), kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(technologyOf(1U << 14 | 1U << 5), kTSLogChannelTechnology_Varnel_LTE);
}

TEST(ManagedModemTest, TheListSaysWhatCanBeShownAndWhatToDoOtherwise)
{
    auto modems = managedModemsIn(objectsOf({
        {"/Modem/0", "1", 1U << 14},
        {"/Modem/1", "2", 0       }
    }));
    modems[1].ports.clear();
    EXPECT_EQ(modemListText(modems),
              "ID: 1\nmaker: Maker\nmodel: Model\nstate: registered\ntechnology: lte\n"
              "ports: /dev/ttyUSB0 (diagnostic), /dev/ttyUSB1\n"
              "log codes: shown by telephonyd --modem=1\n"
              "\n"
              "ID: 2\nmaker: Maker\nmodel: Model\nstate: registered\ntechnology: unknown\n"
              "ports: unknown\n"
              "log codes: not shown: ModemManager lists no diagnostic port; if you know its "
              "device, run telephonyd --port DEVICE\n");
    EXPECT_THAT(modemListText({}), HasSubstr("knows no modem: plug one in"));
    modems.pop_back();
    EXPECT_EQ(modemListJson(modems),
              R"({"id":"1","maker":"Maker","model":"Model","state":"registered",)"
              R"("technology":"lte","log codes":"shown by telephonyd --modem=1",)"
              R"("ports":[{"device":"/dev/ttyUSB0","diagnostic":true},)"
              R"({"device":"/dev/ttyUSB1","diagnostic":false}]})"
              "\n");
    EXPECT_EQ(modemListJson({}), "");
}

TEST(ChosenModemTest, AModemIsChosenByItsIdOrAsTheOnlyOne)
{
    const auto one = managedModemsIn(objectsOf({
        {"/Modem/0", "1", 0}
    }));
    const auto two = managedModemsIn(objectsOf({
        {"/Modem/0", "1", 0},
        {"/Modem/1", "2", 0}
    }));
    std::string error;
    EXPECT_EQ(chosenModem(one, "", error).value_or(ManagedModem()).id, "1");
    EXPECT_EQ(chosenModem(two, "2", error).value_or(ManagedModem()).id, "2");
    EXPECT_EQ(error, "");
    EXPECT_FALSE(chosenModem({}, "", error));
    EXPECT_THAT(error, HasSubstr("knows no modem: plug one in"));
    EXPECT_FALSE(chosenModem(two, "", error));
    EXPECT_THAT(error, AllOf(HasSubstr("several modems"),
                             HasSubstr("1 (Maker Model), 2 (Maker Model) as --modem=ID")));
    EXPECT_FALSE(chosenModem(one, "3", error));
    EXPECT_THAT(error, HasSubstr("no modem \"3\", but 1 (Maker Model)"));
}

class FollowedModemTest : public testing::Test
{
protected:
    void start()
    {
        modem.setChangedCallback([this] { ++changes; });
        modem.start([this](const auto& error) { answers.push_back(error); });
    }

    HandModemService service;
    FollowedModem modem{service, ""};
    std::vector<std::optional<std::string>> answers;
    int changes = 0;
};

TEST_F(FollowedModemTest, ItIsFollowedAsItChangesGoesAndComesBack)
{
    start();
    EXPECT_THAT(answers, IsEmpty());
    service.answer(objectsOf({
        {"/Modem/0", "1", 1U << 14}
    }));
    EXPECT_THAT(answers, ElementsAre(std::nullopt));
    EXPECT_EQ(modem.diagnosticPort(), "/dev/ttyUSB0");
    EXPECT_EQ(modem.technology(), kTSLogChannelTechnology_Varnel_LTE);

    service.changed();
    service.answer(objectsOf({
        {"/Modem/0", "1", 1U << 5}
    }));
    EXPECT_EQ(modem.technology(), kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(changes, 1);

    service.changed();
    service.answer(objectsOf({}));
    EXPECT_FALSE(modem.isPresent());
    EXPECT_EQ(modem.diagnosticPort(), "");
    EXPECT_FALSE(modem.technology());
    EXPECT_EQ(changes, 2);

    // Another modem is not it.
    service.changed();
    service.answer(objectsOf({
        {"/Modem/1", "2", 1U << 14}
    }));
    EXPECT_FALSE(modem.isPresent());
    service.changed();
    service.answer(objectsOf({
        {"/Modem/1", "2", 1U << 14},
        {"/Modem/2", "1", 1U << 14}
    }));
    EXPECT_TRUE(modem.isPresent());
    EXPECT_EQ(changes, 3);
    EXPECT_THAT(answers, SizeIs(1));
}

TEST_F(FollowedModemTest, ChangesWhileTheServiceIsAskedAreAskedForOnceMore)
{
    start();
    service.changed();
    service.changed();
    EXPECT_THAT(service.questions, SizeIs(1));
    service.answer(objectsOf({
        {"/Modem/0", "1", 1U << 14}
    }));
    EXPECT_THAT(service.questions, SizeIs(1));
    service.answer(objectsOf({
        {"/Modem/0", "1", 1U << 5}
    }));
    EXPECT_THAT(service.questions, IsEmpty());
    EXPECT_EQ(modem.technology(), kTSLogChannelTechnology_Varnel_GSM);
}

TEST_F(FollowedModemTest, AServiceThatCannotBeAskedIsToldAndOneThatEndsIsAnAbsence)
{
    start();
    service.fail("it is not running");
    ASSERT_THAT(answers, SizeIs(1));
    EXPECT_EQ(answers[0], "ModemManager cannot be asked: it is not running");
    service.changed();
    service.answer(objectsOf({
        {"/Modem/0", "1", 1U << 14}
    }));
    EXPECT_TRUE(modem.isPresent());
    service.changed();
    service.fail("it is not running");
    EXPECT_FALSE(modem.isPresent());
}

} // namespace
} // namespace orvane
