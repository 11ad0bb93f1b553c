// `telephonyd --modem` and `--list-modems`, with ModemManager itself and with a stand-in for it.

#include "modems/BusTest.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace orvane
{
namespace
{

using testing::AllOf;
using testing::HasSubstr;
using testing::Not;

constexpr const char* kModemInterface = "org.freedesktop.ModemManager1.Modem";
constexpr const char* kLte = "16384";
constexpr const char* kUmts = "32";
constexpr const char* kLteCodes = R"(["0xB0C1", "0xB0C2", "0xB179", "0xB17F", "0xB180", "0xB186"])";

// A stand-in (python3-dbusmock) whose modems a test makes.
class StandInTest : public BusTest
{
protected:
    StandInTest()
        // Debian's Python, which sees Debian's packages.
        : _manager(run({"/usr/bin/python3", "-m", "dbusmock", "--session", "--is-object-manager",
                        "org.freedesktop.ModemManager1", kManager,
                        "org.freedesktop.DBus.ObjectManager"}))
    {
        EXPECT_TRUE(PretendModem::waitUntil(
            [this] { return list().find("knows no modem") != std::string::npos; }));
    }

    // The name below /dev of what the link leads to.
    static std::string portName(const PretendModem& phone)
    {
        return std::filesystem::canonical(phone.path()).string().substr(5);
    }
    static std::string portsValue(const std::string& port)
    {
        return "'Ports': <[('" + port + "', uint32 4), ('ttyNONE', uint32 3)]>";
    }
    void addModem(const std::string& path, const std::string& id, const std::string& port)
    {
        EXPECT_TRUE(call(kManager, "org.freedesktop.DBus.Mock.AddObject",
                         {path, kModemInterface,
                          "{'EquipmentIdentifier': <'" + id +
                              "'>, 'Manufacturer': <'Maker'>, 'Model': <'Model'>, 'State': <8>, "
                              "'AccessTechnologies': <uint32 " +
                              kLte + ">, " + portsValue(port) + "}",
                          "@a(ssss) []"}));
    }
    void update(const std::string& properties)
    {
        EXPECT_TRUE(call(kModem, "org.freedesktop.DBus.Mock.UpdateProperties",
                         {kModemInterface, "{" + properties + "}"}));
    }

private:
    std::unique_ptr<ChildProcess> _manager;
};

TEST_F(StandInTest, AModemIsServedByItsIdWithItsPortAndTechnology)
{
    const PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop"});
    addModem(kModem, "490154203237518", portName(phone));
    EXPECT_THAT(list(), AllOf(HasSubstr("ID: 490154203237518\n"), HasSubstr("technology: lte\n"),
                              HasSubstr("/dev/" + portName(phone) + " (diagnostic)"),
                              HasSubstr("shown by telephonyd --modem=490154203237518\n")));
    for (const char* option : {"--modem", "--modem=490154203237518"}) {
        const auto server = telephonydOnBus({option});
        ASSERT_TRUE(server->waitForError(" answers\n")) << server->errors();
        const auto program = viewer();
        EXPECT_TRUE(program->waitForText("\"name\":\"Physical Cell ID\""));
        EXPECT_THAT(program->errors(), Not(HasSubstr("No response"))) << "nothing is probed";
        EXPECT_EQ(phone.codes(), kLteCodes);
        expectNormalEnd(*server);
        EXPECT_EQ(phone.codes(), "[]");
    }
}

TEST_F(StandInTest, AnotherTechnologyBringsTheViewerToIt)
{
    const PretendModem phone = modem("lte-drive.dlf", {"--speed", "20", "--loop"});
    addModem(kModem, "1", portName(phone));
    const auto server = telephonydOnBus({"--modem"});
    ASSERT_TRUE(server->waitForError("Serving in"));
    const auto program = viewer();
    EXPECT_TRUE(phone.waitForCodes(kLteCodes));
    update(std::string("'AccessTechnologies': <uint32 ") + kUmts + ">");
    EXPECT_TRUE(
        PretendModem::waitUntil([&] { return phone.codes().find("0x4005") != std::string::npos; }));
    EXPECT_THAT(phone.codes(), Not(HasSubstr("0xB")));
    EXPECT_TRUE(server->waitForError("info: The modem serves umts\n"));
    expectNormalEnd(*server);
}

TEST_F(StandInTest, AModemThatComesBackUnderAnotherNameIsServedThere)
{
    auto phone =
        std::make_unique<PretendModem>(directory.path(), testDataPath("lte-drive.dlf"),
                                       std::vector<std::string>{"--speed", "20", "--loop"});
    addModem(kModem, "1", portName(*phone));
    const auto server = telephonydOnBus({"--modem=1"});
    ASSERT_TRUE(server->waitForError("Serving in"));
    const auto program = viewer();
    EXPECT_TRUE(phone->waitForCodes(kLteCodes));
    // The new one is there before the old one goes, so that its name is another one.
    const TemporaryDirectory elsewhere;
    const PretendModem next(elsewhere.path(), testDataPath("lte-drive.dlf"),
                            {"--speed", "20", "--loop"});
    EXPECT_NE(portName(*phone), portName(next));
    phone.reset();
    update(portsValue(portName(next)));
    EXPECT_TRUE(next.waitForCodes(kLteCodes));
    expectNormalEnd(*server);
    EXPECT_EQ(next.codes(), "[]");
}

TEST_F(StandInTest, AModemThatCannotBeChosenEndsTheServerWithOneLine)
{
    const auto refusal = [this](const std::string& option) {
        const auto server = telephonydOnBus({option});
        EXPECT_EQ(server->waitForEnd(), 1);
        return server->errors();
    };
    EXPECT_THAT(refusal("--modem"), HasSubstr("telephonyd: ModemManager knows no modem"));
    addModem(kModem, "1", "ttyABSENT");
    EXPECT_THAT(refusal("--modem"), HasSubstr("cannot open /dev/ttyABSENT: No such file"));
    addModem("/org/freedesktop/ModemManager1/Modem/1", "2", "ttyABSENT");
    EXPECT_THAT(
        refusal("--modem"),
        HasSubstr("there are several modems: give one of 1 (Maker Model), 2 (Maker Model)"));
    EXPECT_THAT(refusal("--modem=3"), HasSubstr("knows no modem \"3\", but 1 (Maker Model)"));
}

TEST_F(BusTest, WithoutModemManagerItIsSaidWhatToDo)
{
    EXPECT_EQ(list(), "telephonyd: ModemManager cannot be asked: it is not running; start it, or "
                      "name the diagnostic port with --port DEVICE\n");
}

// Debian's ModemManager with a modem that answers to AT commands.
TEST_F(BusTest, TheRealModemManagersModemIsListed)
{
    const std::string socket = "orvane-" + std::to_string(::getpid());
    const auto phone = run({"/usr/bin/python3", PRETEND_AT_MODEM, socket});
    ASSERT_TRUE(phone->waitForText("listening"));
    auto manager = run({"ModemManager", "--test-session", "--test-enable", "--test-no-udev",
                        "--test-no-suspend-resume", "--test-no-qrtr", "--log-level=ERR"});
    const auto waitForList = [this](const std::string& text) {
        return PretendModem::waitUntil([&] { return list().find(text) != std::string::npos; });
    };
    ASSERT_TRUE(waitForList("knows no modem"));
    EXPECT_TRUE(call(kManager, "org.freedesktop.ModemManager1.Test.SetProfile",
                     {"profile", "generic", "['abstract:" + socket + "']"}));
    EXPECT_TRUE(waitForList("state: disabled; enable it with mmcli -m "));
    EXPECT_THAT(list(), AllOf(HasSubstr("ID: 490154203237518\n"), HasSubstr("maker: Pretended\n"),
                              HasSubstr("ModemManager lists no diagnostic port")));
    EXPECT_TRUE(call(kModem, "org.freedesktop.ModemManager1.Modem.Enable", {"true"}));
    EXPECT_TRUE(waitForList("technology: lte\n"));
    EXPECT_THAT(list({"--json"}), HasSubstr(R"("state":"registered","technology":"lte")"));
    manager.reset();
    EXPECT_TRUE(waitForList("it is not running"));
}

} // namespace
} // namespace orvane
