#pragma once

#include "processes/support/ChildProcess.h"
#include "support/Paths.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <csignal>
#include <fstream>
#include <memory>
#include <string>
#include <unistd.h>
#include <vector>

namespace orvane
{

// A modem as a process of its own, on a pseudo-terminal (see pretend-modem).
class PretendModem
{
public:
    PretendModem(const std::string& directory, const std::string& recording,
                 const std::vector<std::string>& options)
        : _link(directory + "/modem"), _trace(directory + "/trace")
    {
        std::vector<std::string> arguments = {"/usr/bin/env", "python3", PRETEND_MODEM, recording,
                                              "--link",       _link,     "--trace",     _trace};
        arguments.insert(arguments.end(), options.begin(), options.end());
        _process = std::make_unique<ChildProcess>(arguments);
        EXPECT_TRUE(_process->waitForText("/dev/"));
    }

    [[nodiscard]] const std::string& path() const { return _link; }
    [[nodiscard]] ChildProcess& process() { return *_process; }
    // What it was asked and did so far, a JSON object a line.
    [[nodiscard]] std::vector<std::string> trace() const
    {
        std::vector<std::string> lines;
        std::ifstream file(_trace);
        for (std::string line; std::getline(file, line);)
            lines.push_back(line);
        return lines;
    }
    // The codes switched on last, as it writes them: ["0xB0C1", ...]. "[]" after it went away.
    [[nodiscard]] std::string codes() const
    {
        std::string codes = "[]";
        for (const std::string& line : trace()) {
            const std::string key = "\"codes\": ";
            const auto at = line.find(key);
            if (at != std::string::npos)
                codes = line.substr(at + key.size(), line.rfind('}') - at - key.size());
            else if (line.find("\"hang-up\"") != std::string::npos)
                codes = "[]";
        }
        return codes;
    }
    // Waits until that is so; the modem's trace is all that a test sees of it.
    [[nodiscard]] bool waitForCodes(const std::string& wanted) const
    {
        return waitUntil([&] { return codes() == wanted; });
    }
    template <typename Done>
    static bool waitUntil(const Done& done)
    {
        for (int i = 0; i < 3000; ++i) {
            if (done())
                return true;
            ::usleep(10'000);
        }
        return false;
    }

private:
    std::string _link;
    std::string _trace;
    std::unique_ptr<ChildProcess> _process;
};

// Programs as a user starts them, in a ports directory of the test's own.
class ModemTest : public ::testing::Test
{
protected:
    std::unique_ptr<ChildProcess> telephonyd(std::vector<std::string> arguments)
    {
        arguments.insert(arguments.begin(), TELEPHONYD_PROGRAM);
        arguments.insert(arguments.end(),
                         {"--ports", ports(), "--log", "stderr", "--log-level", "info"});
        return std::make_unique<ChildProcess>(arguments);
    }
    // One that serves the modem, which has answered.
    std::unique_ptr<ChildProcess> serve(const PretendModem& modem,
                                        const std::vector<std::string>& options = {"--technology",
                                                                                   "lte"})
    {
        std::vector<std::string> arguments = {"--port", modem.path()};
        arguments.insert(arguments.end(), options.begin(), options.end());
        auto server = telephonyd(arguments);
        EXPECT_TRUE(server->waitForError("notice: The modem at " + modem.path() + " answers\n"))
            << server->errors();
        return server;
    }
    std::unique_ptr<ChildProcess> viewer(const std::vector<std::string>& options = {})
    {
        std::vector<std::string> arguments = {ORVANE_PROGRAM, "--ports", ports(), "--ui",  "json",
                                              "--refresh",    "0.1",     "--log", "stderr"};
        arguments.insert(arguments.end(), options.begin(), options.end());
        return std::make_unique<ChildProcess>(arguments);
    }
    PretendModem modem(const std::string& recording, const std::vector<std::string>& options)
    {
        return PretendModem(directory.path(), testDataPath(recording), options);
    }
    static void expectNormalEnd(ChildProcess& program)
    {
        program.sendSignal(SIGTERM);
        EXPECT_EQ(program.waitForEnd(), 0) << program.errors();
    }
    [[nodiscard]] std::string ports() const { return directory.path() + "/ports"; }
    [[nodiscard]] std::string file(const std::string& name) const
    {
        return directory.path() + "/" + name;
    }

    TemporaryDirectory directory;
};

} // namespace orvane
