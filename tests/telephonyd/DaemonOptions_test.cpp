#include "telephonyd/DaemonOptions.h"

#include "platform/base/TelephonyConstants.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::HasSubstr;

DaemonOptions parsed(std::vector<std::string> arguments)
{
    const std::vector<std::string> scenarios = {"lte", "other"};
    return parseDaemonOptions(arguments, scenarios);
}

TEST(DaemonOptionsTest, ASimulatedPhoneIsLteUnlessNamed)
{
    EXPECT_EQ(parsed({"--demo"}).demo, "lte");
    EXPECT_EQ(parsed({"--demo=other"}).demo, "other");
    EXPECT_FALSE(parsed({"--demo"}).error);
    EXPECT_FALSE(parsed({"--demo"}).replay);
}

TEST(DaemonOptionsTest, ARecordingIsSentAtItsOwnPaceOnceUnlessSaid)
{
    const DaemonOptions plain = parsed({"--replay", "a.dlf"});
    EXPECT_FALSE(plain.error);
    EXPECT_EQ(plain.replay, "a.dlf");
    EXPECT_EQ(plain.speed, 1.0);
    EXPECT_FALSE(plain.loops);
    EXPECT_FALSE(plain.technology);
    EXPECT_EQ(plain.log.target, LogChoice::Target::Syslog);

    const DaemonOptions full = parsed({"--replay=a.dlf", "--loop", "--speed", "2.5", "--technology",
                                       "umts", "--ports", "/tmp/x", "--log", "none"});
    EXPECT_FALSE(full.error);
    EXPECT_EQ(full.speed, 2.5);
    EXPECT_TRUE(full.loops);
    EXPECT_EQ(full.technology, kTSLogChannelTechnology_Varnel_GSM);
    EXPECT_EQ(full.ports, "/tmp/x");

    EXPECT_FALSE(parsed({"--replay=a.dlf", "--speed=max"}).speed);
    EXPECT_EQ(parsed({"--replay=a.dlf", "--speed=0.001"}).speed, 0.001);
    EXPECT_EQ(parsed({"--replay=a.dlf", "--speed=1000"}).speed, 1000.0);
}

TEST(DaemonOptionsTest, TypedMessagesAreOfLteUnlessNamed)
{
    EXPECT_EQ(parsed({"--messages"}).messages, kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_EQ(parsed({"--messages=cdma"}).messages, kTSLogChannelTechnology_Varnel_CDMA);
    EXPECT_FALSE(parsed({"--messages"}).error);
    EXPECT_FALSE(parsed({"--messages"}).demo);
}

TEST(DaemonOptionsTest, AModemIsServedThroughItsDiagnosticPort)
{
    const DaemonOptions plain = parsed({"--port", "/dev/ttyUSB0"});
    EXPECT_FALSE(plain.error);
    EXPECT_EQ(plain.port, "/dev/ttyUSB0");
    EXPECT_FALSE(plain.technology);
    EXPECT_EQ(parsed({"--port=/dev/ttyUSB0", "--technology=utran"}).technology,
              kTSLogChannelTechnology_Varnel_UTRAN2);
}

TEST(DaemonOptionsTest, AModemIsFoundByItsIdOrAsTheOnlyOne)
{
    EXPECT_EQ(parsed({"--modem"}).modem, "");
    EXPECT_EQ(parsed({"--modem=490154203237518"}).modem, "490154203237518");
    EXPECT_FALSE(parsed({"--modem"}).usesSessionBus);
    EXPECT_TRUE(parsed({"--modem", "--bus", "session"}).usesSessionBus);
    const DaemonOptions both = parsed({"--modem=1", "--port=/dev/ttyUSB0", "--technology=lte"});
    EXPECT_FALSE(both.error);
    EXPECT_EQ(both.port, "/dev/ttyUSB0");
    EXPECT_TRUE(parsed({"--list-modems"}).listsModems);
    EXPECT_TRUE(parsed({"--list-modems", "--json"}).listsAsJson);
}

TEST(DaemonOptionsTest, MistakesAreNamedWithWhatToDo)
{
    const struct {
        std::vector<std::string> arguments;
        const char* error;
    } cases[] = {
        {{},                                    "give --demo=SCENARIO, --replay FILE, --messages=NAME, --modem or --port"},
        {{"--demo", "--replay=x"},              "exclude each other: give one"                                           },
        {{"--demo=nope"},                       "--demo takes lte or other"                                              },
        {{"--demo", "--messages"},              "exclude each other: give one"                                           },
        {{"--messages", "--replay=x"},          "exclude each other: give one"                                           },
        {{"--messages=gsm"},                    "--messages takes lte, umts, utran or cdma, not \"gsm\""                 },
        {{"--messages=cellmonitor"},            "--messages takes lte"                                                   },
        {{"--messages", "--loop"},              "--loop is for a recording"                                              },
        {{"--demo", "--loop"},                  "--loop is for a recording"                                              },
        {{"--demo", "--speed=1"},               "--speed is for a recording"                                             },
        {{"--demo", "--technology=lte"},        "--technology is for a recording or a modem"                             },
        {{"--replay="},                         "--replay needs the name of a file"                                      },
        {{"--replay=x", "--speed=0"},           "give a number from 0.001 to 1000 or max"                                },
        {{"--replay=x", "--speed=1000.5"},      "--speed \"1000.5\" is unusable"                                         },
        {{"--replay=x", "--speed="},            "--speed \"\" is unusable"                                               },
        {{"--replay=x", "--speed=nan"},         "--speed \"nan\" is unusable"                                            },
        {{"--replay=x", "--technology=gsm"},    "--technology takes lte, umts"                                           },
        {{"--demo", "--ports="},                "--ports needs the name of a directory"                                  },
        {{"--demo", "--log=file"},              "--log takes"                                                            },
        {{"--demo", "--log-level=loud"},        "--log-level takes"                                                      },
        {{"--demo", "x.dlf"},                   "\"x.dlf\" is not an option: give a recording as --replay FILE"          },
        {{"--port="},                           "--port needs the name of a device"                                      },
        {{"--modem", "--demo"},                 "exclude each other: give one"                                           },
        {{"--modem", "--json"},                 "--json is for a list"                                                   },
        {{"--port=x", "--bus=session"},         "--bus is for modems"                                                    },
        {{"--modem", "--bus=x"},                "--bus"                                                                  },
        {{"--list-modems", "--technology=lte"}, "--technology is for a recording or a modem"                             },
        {{"--port=x", "--demo"},                "exclude each other: give one"                                           },
        {{"--port=x", "--loop"},                "--loop is for a recording"                                              },
        {{"--demos"},                           "unknown option --demos"                                                 },
    };
    for (const auto& each : cases)
        EXPECT_THAT(parsed(each.arguments).error.value_or("no error"), HasSubstr(each.error));
}

TEST(DaemonOptionsTest, HelpAndVersionNeedNothingElse)
{
    EXPECT_TRUE(parsed({"--help", "x"}).wantsHelp);
    EXPECT_TRUE(parsed({"--version"}).wantsVersion);
    EXPECT_FALSE(parsed({"--version"}).error);
    const std::vector<std::string> scenarios = {"lte", "other"};
    for (const char* option :
         {"--demo", "--replay", "--messages", "--technology", "--speed", "--loop", "--port ",
          "--ports", "--log ", "--log-level", "lte or other"})
        EXPECT_THAT(daemonHelp(scenarios), HasSubstr(option));
}

} // namespace
} // namespace orvane
