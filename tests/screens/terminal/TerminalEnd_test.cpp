#include "screens/terminal/VirtualTerminal.h"
#include "support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <csignal>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{
namespace
{

TEST(TerminalEndTest, TheTerminalIsRestoredBeforeAnythingThatMayTakeTime)
{
    const TemporaryDirectory directory;
    const std::string preferences = directory.path() + "/orvane-preferences";
    std::filesystem::create_directory(preferences);
    const std::string pipe = preferences + "/home-screen.ini";
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    VirtualTerminal viewer({ORVANE_PROGRAM, "--demo", "--ui", "terminal", "--log", "none"},
                           {"TERM=xterm-256color", "XDG_CONFIG_HOME=" + directory.path(),
                            "XDG_STATE_HOME=" + directory.path()});
    ASSERT_TRUE(viewer.waitFor("Serving Cell Info"));
    EXPECT_TRUE(viewer.isOnOtherScreen());
    viewer.sendSignal(SIGTERM);
    // Nobody can open the pipe for writing before the viewer waits at its other end.
    int writer = -1;
    ASSERT_TRUE(viewer.waitUntil([&] {
        writer = ::open(pipe.c_str(), O_WRONLY | O_NONBLOCK | O_CLOEXEC);
        return writer >= 0;
    }));
    EXPECT_TRUE(viewer.waitUntil([&] { return !viewer.isOnOtherScreen(); }));
    EXPECT_TRUE(viewer.isInLineMode());
    EXPECT_EQ(viewer.waitForEnd(), 0);
    ::close(writer);
}

} // namespace
} // namespace orvane
