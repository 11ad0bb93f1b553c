#include "processes/support/ChildProcess.h"
#include "support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <chrono>
#include <csignal>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using ::testing::HasSubstr;

// A message bus to which programs can connect and which never says anything.
class SilentBus
{
public:
    explicit SilentBus(const std::string& path) : _socket(::socket(AF_UNIX, SOCK_STREAM, 0))
    {
        sockaddr_un address{};
        address.sun_family = AF_UNIX;
        std::strncpy(address.sun_path, path.c_str(), sizeof address.sun_path - 1);
        EXPECT_EQ(::bind(_socket, reinterpret_cast<const sockaddr*>(&address), sizeof address), 0);
        EXPECT_EQ(::listen(_socket, 10), 0);
    }
    ~SilentBus() { ::close(_socket); }
    SilentBus(const SilentBus&) = delete;
    SilentBus& operator=(const SilentBus&) = delete;

private:
    int _socket;
};

// The viewer's last work is to write a preference and to tell other programs of it.
class EndOfProgramTest : public ::testing::Test
{
protected:
    EndOfProgramTest()
    {
        std::filesystem::create_directory(directory.path() + "/orvane-preferences");
    }

    // Starts the viewer, ends it by a signal and returns what it has said on standard error.
    std::string errorsOfEnd(const std::vector<std::string>& environment)
    {
        std::vector<std::string> all = {"XDG_CONFIG_HOME=" + directory.path()};
        all.insert(all.end(), environment.begin(), environment.end());
        ChildProcess viewer({ORVANE_PROGRAM, "--ui", "json", "--log", "stderr", "--ports",
                             directory.path() + "/ports"},
                            all);
        EXPECT_TRUE(viewer.waitForText("Connecting"));
        const auto start = std::chrono::steady_clock::now();
        viewer.sendSignal(SIGTERM);
        EXPECT_EQ(viewer.waitForEnd(), 0);
        // Two times half a second, and what a busy machine adds.
        EXPECT_LT(std::chrono::steady_clock::now() - start, 10s);
        return viewer.errors();
    }

    TemporaryDirectory directory;
    const std::string file = directory.path() + "/orvane-preferences/home-screen.ini";
};

TEST_F(EndOfProgramTest, DoesNotWaitForASessionBusThatDoesNotAnswer)
{
    const SilentBus bus(directory.path() + "/bus");
    EXPECT_THAT(errorsOfEnd({"DBUS_SESSION_BUS_ADDRESS=unix:path=" + directory.path() + "/bus"}),
                HasSubstr("the session bus does not answer"));
    std::ifstream written(file);
    EXPECT_TRUE(written.good()) << "the preference comes before the notice";
}

TEST_F(EndOfProgramTest, DoesNotWaitForAnotherProgramsLockOnThePreferences)
{
    std::ofstream(file + ".lock") << ::getpid() << "\ntest_processes\n"; // by a live program
    EXPECT_THAT(errorsOfEnd({}), HasSubstr("home-screen.ini are not written: the file is in use"));
}

TEST_F(EndOfProgramTest, DoesNotWaitForAPipeInThePlaceOfThePreferences)
{
    ASSERT_EQ(::mkfifo(file.c_str(), 0600), 0);
    errorsOfEnd({});
    EXPECT_TRUE(std::filesystem::is_fifo(file));
}

} // namespace
} // namespace orvane
