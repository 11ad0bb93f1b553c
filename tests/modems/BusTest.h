#pragma once

#include "modems/ModemTest.h"

#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// Tests with a session bus of their own, on which ModemManager, or a stand-in, has its name.
class BusTest : public ModemTest
{
protected:
    BusTest()
        : _bus(std::make_unique<ChildProcess>(std::vector<std::string>{
              "/usr/bin/env", "dbus-daemon", "--session", "--nofork", "--print-address=1"}))
    {
        const auto address = _bus->waitForText("unix:");
        EXPECT_TRUE(address) << _bus->errors();
        _environment = {"DBUS_SESSION_BUS_ADDRESS=" + address.value_or("")};
    }

    std::unique_ptr<ChildProcess> run(std::vector<std::string> arguments) const
    {
        if (arguments.front().find('/') == std::string::npos)
            arguments.insert(arguments.begin(), "/usr/bin/env");
        return std::make_unique<ChildProcess>(arguments, _environment);
    }
    std::unique_ptr<ChildProcess> telephonydOnBus(std::vector<std::string> arguments)
    {
        arguments.insert(arguments.begin(), TELEPHONYD_PROGRAM);
        arguments.insert(arguments.end(), {"--bus", "session", "--ports", ports(), "--log",
                                           "stderr", "--log-level", "info"});
        return run(arguments);
    }
    // Calls a method of an object of ModemManager's name; returns whether it was answered.
    bool call(const std::string& object, const std::string& method,
              const std::vector<std::string>& arguments)
    {
        std::vector<std::string> all = {
            "gdbus", "call", "--session", "-d",  "org.freedesktop.ModemManager1",
            "-o",    object, "-m",        method};
        all.insert(all.end(), arguments.begin(), arguments.end());
        return run(all)->waitForEnd() == 0;
    }
    // What `telephonyd --list-modems` says.
    std::string list(std::vector<std::string> options = {})
    {
        options.insert(options.begin(), {TELEPHONYD_PROGRAM, "--list-modems", "--bus", "session"});
        const auto program = run(options);
        program->waitForEnd();
        std::string text = program->errors();
        for (const std::string& line : program->lines())
            text += line + "\n";
        return text;
    }

    static constexpr const char* kManager = "/org/freedesktop/ModemManager1";
    static constexpr const char* kModem = "/org/freedesktop/ModemManager1/Modem/0";

private:
    std::unique_ptr<ChildProcess> _bus;
    std::vector<std::string> _environment;
};

} // namespace orvane
